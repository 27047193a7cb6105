// KvCCodeBlockId: the handle of a code block, as the partition database and the function
// symbol (its own code block accessor) name it.
#ifndef HUL_PLATFORM_VIEW_KVCCODEBLOCKID_H
#define HUL_PLATFORM_VIEW_KVCCODEBLOCKID_H

#include "platform/support/HulPlatformExport.h"
#include "platform/view/KvCCodeBlock.h"

// Made and owned by KvCIvData together with its block; not copied.
class HUL_PLATFORM_API KvCCodeBlockId {
public:
  explicit KvCCodeBlockId(KvCParamSymbol* function) : block(function) {}
  KvCCodeBlockId(const KvCCodeBlockId&) = delete;
  KvCCodeBlockId& operator=(const KvCCodeBlockId&) = delete;

  // Never null.
  KvCCodeBlock* getCodeBlock() { return &block; }

private:
  KvCCodeBlock block;
};

#endif
