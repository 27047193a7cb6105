// KvCPartitionControlFlow: how a partition is entered. An extern partition is one whose
// functions the application's frame calls; the topmost extern partition is an extern
// partition without extern ancestor (nested extern partitions run inside it).
#ifndef HUL_PLATFORM_VIEW_KVCPARTITIONCONTROLFLOW_H
#define HUL_PLATFORM_VIEW_KVCPARTITIONCONTROLFLOW_H

#include "platform/support/HulPlatformExport.h"

class KV_BdPartition;

// Part of its partition; not copied.
class HUL_PLATFORM_API KvCPartitionControlFlow {
public:
  explicit KvCPartitionControlFlow(KV_BdPartition* owner) : partition(owner) {}
  KvCPartitionControlFlow(const KvCPartitionControlFlow&) = delete;
  KvCPartitionControlFlow& operator=(const KvCPartitionControlFlow&) = delete;

  bool isExternPartition() const;
  // O(depth of the partition).
  bool isTopmostExternPartition() const;

private:
  KV_BdPartition* partition;
};

#endif
