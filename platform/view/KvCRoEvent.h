// KvCRoEvent: an event of the RTOS (a bit of a task's event mask), with the
// ICode variable that identifies it in generated code.
#ifndef HUL_PLATFORM_VIEW_KVCROEVENT_H
#define HUL_PLATFORM_VIEW_KVCROEVENT_H

#include "platform/view/KvCRoObject.h"

class KV_ExprDescrTupel;

// Made and owned by KvCRoDatabase (createEvent). The identifier variable is null until
// someone sets it. The event only remembers it (the variable belongs to the ICode and is
// never freed here), so that every later request for the identifier finds the same one.
class HUL_PLATFORM_API KvCRoEvent : public KvCRoObject {
public:
  explicit KvCRoEvent(WmCXString name) : KvCRoObject(std::move(name)) {}

  KV_ExprDescrTupel* getEventIdVar() const { return idVar; }
  void setEventIdVar(KV_ExprDescrTupel* variable) { idVar = variable; }

private:
  KV_ExprDescrTupel* idVar = nullptr;
};

#endif
