// KvCRoObject: a named object of the RTOS database (an alarm, a counter, an event, a
// resource, a message). It gives the name under which the RTOS configuration knows the
// object; generated code names the object's identifier after it.
#ifndef HUL_PLATFORM_VIEW_KVCROOBJECT_H
#define HUL_PLATFORM_VIEW_KVCROOBJECT_H

#include "platform/support/HulPlatformExport.h"
#include "platform/support/WmCXString.h"

#include <utility>

// The objects are made and owned by KvCRoDatabase, one per call of its create operation,
// and live as long as the database. They are identities (the code generator remembers
// ICode objects in them), so they are neither copied nor deleted through this base.
class HUL_PLATFORM_API KvCRoObject {
public:
  KvCRoObject(const KvCRoObject&) = delete;
  KvCRoObject& operator=(const KvCRoObject&) = delete;

  const WmCXString& getName() const { return name; }

protected:
  explicit KvCRoObject(WmCXString objectName) : name(std::move(objectName)) {}
  ~KvCRoObject() = default;

private:
  WmCXString name;
};

#endif
