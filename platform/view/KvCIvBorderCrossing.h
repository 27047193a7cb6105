// KvCIvBorderCrossing: decides whether a walk over the partition hierarchy enters a child
// partition. The base enters every child.
#ifndef HUL_PLATFORM_VIEW_KVCIVBORDERCROSSING_H
#define HUL_PLATFORM_VIEW_KVCIVBORDERCROSSING_H

#include "platform/support/HulPlatformExport.h"

class KV_BdPartition;

class HUL_PLATFORM_API KvCIvBorderCrossing {
public:
  KvCIvBorderCrossing() = default;
  virtual ~KvCIvBorderCrossing() = default;
  virtual bool mayEnter(KV_BdPartition* /*from*/, KV_BdPartition* /*child*/) { return true; }
};

#endif
