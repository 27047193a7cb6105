// KvCRoCounter: a counter of the RTOS (the time base that drives alarms), with the
// duration of one tick.
#ifndef HUL_PLATFORM_VIEW_KVCROCOUNTER_H
#define HUL_PLATFORM_VIEW_KVCROCOUNTER_H

#include "platform/view/KvCRoObject.h"

// Made and owned by KvCRoDatabase (createCounter). The tick duration is in seconds per
// tick; 0.0 (or less) means that the RTOS configuration does not give it, and generated
// code then treats tick values as plain counts.
class HUL_PLATFORM_API KvCRoCounter : public KvCRoObject {
public:
  KvCRoCounter(WmCXString name, double tickDuration)
      : KvCRoObject(std::move(name)), tickDuration(tickDuration) {}

  double getTickDuration() const { return tickDuration; }

private:
  double tickDuration;
};

#endif
