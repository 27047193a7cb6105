// KvCCbActualInterface: the actual interface of one use of a code block: the instance of
// the block's function that one call id (one partition) runs, with the instance's name.
#ifndef HUL_PLATFORM_VIEW_KVCCBACTUALINTERFACE_H
#define HUL_PLATFORM_VIEW_KVCCBACTUALINTERFACE_H

#include "platform/support/HulPlatformExport.h"
#include "platform/support/WmCXString.h"

#include <utility>

class KvCCodeBlock;
class KvCIvCallId;

// Made and owned by KvCIvData; not copied.
class HUL_PLATFORM_API KvCCbActualInterface {
public:
  KvCCbActualInterface(KvCCodeBlock* block, KvCIvCallId* id, WmCXString instanceName)
      : codeBlock(block), callId(id), name(std::move(instanceName)) {}
  KvCCbActualInterface(const KvCCbActualInterface&) = delete;
  KvCCbActualInterface& operator=(const KvCCbActualInterface&) = delete;

  KvCCodeBlock* getCodeBlock() const { return codeBlock; }
  KvCIvCallId* getCallId() const { return callId; }
  const WmCXString& getName() const { return name; }

private:
  KvCCodeBlock* codeBlock;
  KvCIvCallId* callId;
  WmCXString name;
};

#endif
