// KvCPartitionIterator: walks the partition hierarchy depth-first (a partition before its
// children, children in creation order), without recursion.
#ifndef HUL_PLATFORM_VIEW_KVCPARTITIONITERATOR_H
#define HUL_PLATFORM_VIEW_KVCPARTITIONITERATOR_H

#include "platform/support/HulPlatformExport.h"

class KV_BdPartition;
class KV_BdVisitor;
class KvCIvBorderCrossing;

// Keeps no state between walks; copying is harmless.
class HUL_PLATFORM_API KvCPartitionIterator {
public:
  KvCPartitionIterator() = default;

  // Visits `start` and every partition below it: the first visitor, then the second
  // (either may be null), per partition. A child is entered when the border crossing (if
  // given) allows it. False for a null start. O(partitions).
  bool iterHierarchyDepthFirst(KV_BdPartition* start, KV_BdVisitor* first, KV_BdVisitor* second,
                               KvCIvBorderCrossing* border);
};

#endif
