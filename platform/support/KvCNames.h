// KvCNames: rules for names in generated C code.
#ifndef HUL_PLATFORM_SUPPORT_KVCNAMES_H
#define HUL_PLATFORM_SUPPORT_KVCNAMES_H

#include "platform/support/HulPlatformExport.h"
#include "platform/support/WmCXString.h"

class HUL_PLATFORM_API KvCNames {
public:
  // A non-empty sequence of [A-Za-z0-9_] not starting with a digit.
  static bool isValidCIdentifier(const WmCXString& name);
  // The name made valid: every other byte becomes '_', a leading digit gets a '_' before
  // it, and an empty name becomes "_".
  static WmCXString cookName(const WmCXString& name);
};

#endif
