// KvCRoAlarm: an alarm of the RTOS (it activates a task or sets an event when its counter reaches a
// value), with the ICode variable that identifies it in generated code.
#ifndef HUL_PLATFORM_VIEW_KVCROALARM_H
#define HUL_PLATFORM_VIEW_KVCROALARM_H

#include "platform/view/KvCRoObject.h"

class KV_ExprDescrTupel;

// Made and owned by KvCRoDatabase (createAlarm). The identifier variable is null until
// someone sets it. The alarm only remembers it (the variable belongs to the ICode and is
// never freed here), so that every later request for the identifier finds the same one.
class HUL_PLATFORM_API KvCRoAlarm : public KvCRoObject {
public:
  explicit KvCRoAlarm(WmCXString name) : KvCRoObject(std::move(name)) {}

  KV_ExprDescrTupel* getAlarmIdVar() const { return idVar; }
  void setAlarmIdVar(KV_ExprDescrTupel* variable) { idVar = variable; }

private:
  KV_ExprDescrTupel* idVar = nullptr;
};

#endif
