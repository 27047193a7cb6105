// KvCRoCounterAPIFcn: one function of the RTOS's counter API as the RTOS configuration
// describes it: a name form and a function kind.
//
// The name form is the text of a C identifier in which the multirate counter name macro
// stands for the counter; the code generator replaces it by a counter's name to name the
// function for that counter. The kind is the RTOS configuration's number for the
// function's signature (for example 1 or 2 for the two shapes of initialising a counter,
// 6 or 7 for the two shapes of reading its value); the database does not interpret it.
#ifndef HUL_PLATFORM_VIEW_KVCROCOUNTERAPIFCN_H
#define HUL_PLATFORM_VIEW_KVCROCOUNTERAPIFCN_H

#include "platform/support/HulPlatformExport.h"
#include "platform/support/WmCXString.h"

#include <utility>

// A value object, owned by the KvCRoCounterAPI that gives it out.
class HUL_PLATFORM_API KvCRoCounterAPIFcn {
public:
  KvCRoCounterAPIFcn(WmCXString functionName, int functionKind)
      : name(std::move(functionName)), kind(functionKind) {}

  const WmCXString& getFunctionName() const { return name; }
  int getFunctionKind() const { return kind; }

private:
  WmCXString name;
  int kind;
};

#endif
