// KvCRoRTOSInfo: what the RTOS database knows about the target's RTOS as a whole: the
// name of the OS, how it implements its data types, and its counter API.
#ifndef HUL_PLATFORM_VIEW_KVCRORTOSINFO_H
#define HUL_PLATFORM_VIEW_KVCRORTOSINFO_H

#include "platform/support/HulPlatformExport.h"
#include "platform/support/WmCXString.h"
#include "platform/view/KvCRoCounterAPI.h"
#include "platform/view/KvCRoDataTypes.h"

// Owned by KvCRoDatabase (one per database, alive as long as it) and owning its data
// types and counter API. A fresh object has an empty OS name and describes nothing.
// The const getters are what the code generator reads; fixtures describe the RTOS through
// the non-const getters and the setter.
class HUL_PLATFORM_API KvCRoRTOSInfo {
public:
  KvCRoRTOSInfo() = default;
  KvCRoRTOSInfo(const KvCRoRTOSInfo&) = delete;
  KvCRoRTOSInfo& operator=(const KvCRoRTOSInfo&) = delete;

  // The OS's name, as messages about its API name it.
  const WmCXString& getOSName() const { return osName; }
  void setOSName(const WmCXString& name) { osName = name; }

  const KvCRoDataTypes* getDataTypes() const { return &dataTypes; }
  KvCRoDataTypes* getDataTypes() { return &dataTypes; }

  const KvCRoCounterAPI* getCounterAPI() const { return &counterAPI; }
  KvCRoCounterAPI* getCounterAPI() { return &counterAPI; }

private:
  WmCXString osName;
  KvCRoDataTypes dataTypes;
  KvCRoCounterAPI counterAPI;
};

#endif
