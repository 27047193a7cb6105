// KvCIvFcnReuseTools: the reuse relations of the view's blocks: for a block of a reuse
// group, the group's master block (whose generated code the group shares) and the
// master's partition. Reads the relations the blocks carry; keeps no state of its own.
#ifndef HUL_PLATFORM_VIEW_KVCIVFCNREUSETOOLS_H
#define HUL_PLATFORM_VIEW_KVCIVFCNREUSETOOLS_H

#include "platform/support/HulPlatformExport.h"
#include "platform/view/KV_BdBlock.h"

class HUL_PLATFORM_API KvCIvFcnReuseTools {
public:
  KvCIvFcnReuseTools() = default;

  // The master block of the block's reuse group (the master itself for the master), or
  // null when the block is not reused.
  KV_BdBlock* getReusedMasterBlock(const KV_BdBlock* block) const {
    return block ? block->getReuseMaster() : nullptr;
  }
  // The partition of the master block, or null when the block is not reused.
  KV_BdPartition* getReusedPartition(const KV_BdBlock* block) const {
    KV_BdBlock* master = getReusedMasterBlock(block);
    return master ? master->getPartition() : nullptr;
  }
};

#endif
