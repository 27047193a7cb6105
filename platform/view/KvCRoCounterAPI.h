// KvCRoCounterAPI: the counter API of the RTOS: the functions that initialise a counter,
// initialise it from an ISR, and read its value. An RTOS need not offer each of them.
#ifndef HUL_PLATFORM_VIEW_KVCROCOUNTERAPI_H
#define HUL_PLATFORM_VIEW_KVCROCOUNTERAPI_H

#include "platform/support/HulPlatformExport.h"
#include "platform/view/KvCRoCounterAPIFcn.h"

#include <optional>

// Owned by KvCRoRTOSInfo. A fresh API offers no function; fixtures describe the RTOS with
// the set and remove operations. Each getter answers the function or null when the RTOS
// does not offer it. Setting or removing a function ends the life of the object that the
// getter gave out for it before.
class HUL_PLATFORM_API KvCRoCounterAPI {
public:
  const KvCRoCounterAPIFcn* getInitCounterFcn() const { return get(initCounter); }
  const KvCRoCounterAPIFcn* getInitCounterFromISRFcn() const { return get(initCounterFromISR); }
  const KvCRoCounterAPIFcn* getGetCounterValueFcn() const { return get(getCounterValue); }

  void setInitCounterFcn(const WmCXString& nameForm, int kind) {
    initCounter.emplace(nameForm, kind);
  }
  void setInitCounterFromISRFcn(const WmCXString& nameForm, int kind) {
    initCounterFromISR.emplace(nameForm, kind);
  }
  void setGetCounterValueFcn(const WmCXString& nameForm, int kind) {
    getCounterValue.emplace(nameForm, kind);
  }
  void removeInitCounterFcn() { initCounter.reset(); }
  void removeInitCounterFromISRFcn() { initCounterFromISR.reset(); }
  void removeGetCounterValueFcn() { getCounterValue.reset(); }

private:
  static const KvCRoCounterAPIFcn* get(const std::optional<KvCRoCounterAPIFcn>& fcn) {
    return fcn ? &*fcn : nullptr;
  }

  std::optional<KvCRoCounterAPIFcn> initCounter;
  std::optional<KvCRoCounterAPIFcn> initCounterFromISR;
  std::optional<KvCRoCounterAPIFcn> getCounterValue;
};

#endif
