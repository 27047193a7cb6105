// KvCRoDataTypes: how the RTOS implements its data types. For each RTOS type it gives the
// name of the base type that implements it (an existing type of the ICode, such as
// "UInt8") and a description for the type's declaration. AccessNameRef, a pointer, has
// only a description; the type of counter identifiers has only a base type.
#ifndef HUL_PLATFORM_VIEW_KVCRODATATYPES_H
#define HUL_PLATFORM_VIEW_KVCRODATATYPES_H

#include "platform/support/HulPlatformExport.h"
#include "platform/support/WmCXString.h"

// Owned by KvCRoRTOSInfo. A fresh object describes nothing: every name and description is
// empty until a fixture sets it. The database does not check that a base-type name names
// an existing type; the type's server finds it in the ICode.
class HUL_PLATFORM_API KvCRoDataTypes {
public:
  const WmCXString& getStatusTypeBaseType() const { return statusType.baseType; }
  const WmCXString& getStatusTypeDescription() const { return statusType.description; }
  const WmCXString& getTaskTypeBaseType() const { return taskType.baseType; }
  const WmCXString& getTaskTypeDescription() const { return taskType.description; }
  const WmCXString& getEventMaskTypeBaseType() const { return eventMaskType.baseType; }
  const WmCXString& getEventMaskTypeDescription() const { return eventMaskType.description; }
  const WmCXString& getResourceTypeBaseType() const { return resourceType.baseType; }
  const WmCXString& getResourceTypeDescription() const { return resourceType.description; }
  const WmCXString& getAlarmTypeBaseType() const { return alarmType.baseType; }
  const WmCXString& getAlarmTypeDescription() const { return alarmType.description; }
  const WmCXString& getTickTypeBaseType() const { return tickType.baseType; }
  const WmCXString& getTickTypeDescription() const { return tickType.description; }
  const WmCXString& getSymbolicNameBaseType() const { return symbolicName.baseType; }
  const WmCXString& getSymbolicNameDescription() const { return symbolicName.description; }
  const WmCXString& getAccessNameRefDescription() const { return accessNameRefDescription; }
  const WmCXString& getKvCounterTypeBaseType() const { return counterTypeBaseType; }

  void setStatusType(const WmCXString& baseType, const WmCXString& description) {
    statusType = {baseType, description};
  }
  void setTaskType(const WmCXString& baseType, const WmCXString& description) {
    taskType = {baseType, description};
  }
  void setEventMaskType(const WmCXString& baseType, const WmCXString& description) {
    eventMaskType = {baseType, description};
  }
  void setResourceType(const WmCXString& baseType, const WmCXString& description) {
    resourceType = {baseType, description};
  }
  void setAlarmType(const WmCXString& baseType, const WmCXString& description) {
    alarmType = {baseType, description};
  }
  void setTickType(const WmCXString& baseType, const WmCXString& description) {
    tickType = {baseType, description};
  }
  void setSymbolicName(const WmCXString& baseType, const WmCXString& description) {
    symbolicName = {baseType, description};
  }
  void setAccessNameRefDescription(const WmCXString& description) {
    accessNameRefDescription = description;
  }
  void setKvCounterTypeBaseType(const WmCXString& baseType) { counterTypeBaseType = baseType; }

private:
  struct TypeSpec {
    WmCXString baseType;
    WmCXString description;
  };

  TypeSpec statusType;
  TypeSpec taskType;
  TypeSpec eventMaskType;
  TypeSpec resourceType;
  TypeSpec alarmType;
  TypeSpec tickType;
  TypeSpec symbolicName;
  WmCXString accessNameRefDescription;
  WmCXString counterTypeBaseType;
};

#endif
