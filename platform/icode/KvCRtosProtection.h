// KvCRtosProtection: an RTOS protected area (a resource taken around a block of
// statements). Owned by the code view data.
#ifndef HUL_PLATFORM_ICODE_KVCRTOSPROTECTION_H
#define HUL_PLATFORM_ICODE_KVCRTOSPROTECTION_H

#include "platform/support/HulPlatformExport.h"
#include "platform/support/WmCXString.h"

class HUL_PLATFORM_API KvCRtosProtection {
public:
  explicit KvCRtosProtection(WmCXString resource) : resourceName(std::move(resource)) {}
  const WmCXString& getResourceName() const { return resourceName; }

private:
  WmCXString resourceName;
};

#endif
