// KvCIvTools: searches over the view's blocks.
#ifndef HUL_PLATFORM_VIEW_KVCIVTOOLS_H
#define HUL_PLATFORM_VIEW_KVCIVTOOLS_H

#include "platform/leda/list.h"
#include "platform/support/HulPlatformExport.h"

class KV_BdPartition;

class HUL_PLATFORM_API KvCIvTools {
public:
  // Appends to `callers` the partitions that call `partition`: its triggers in order, a
  // counter, alarm or OSEK event standing for the partitions that trigger it (the event's
  // setters), each passed-over block expanded once per search. A partition that calls
  // twice is listed twice. O(triggers reached).
  static void getCallersSkipCounterAlarmConsiderOsekEvents(KV_BdPartition* partition,
                                                           leda::list<KV_BdPartition*>& callers);

private:
  KvCIvTools() = delete;
};

#endif
