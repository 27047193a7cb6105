// KvCRoMessage: a message of the RTOS's communication (a named datum sent and received between
// tasks), with the ICode variable that identifies it in generated code.
#ifndef HUL_PLATFORM_VIEW_KVCROMESSAGE_H
#define HUL_PLATFORM_VIEW_KVCROMESSAGE_H

#include "platform/view/KvCRoObject.h"

class KV_ExprDescrTupel;

// Made and owned by KvCRoDatabase (createMessage). The identifier variable is null until
// someone sets it. The message only remembers it (the variable belongs to the ICode and is
// never freed here), so that every later request for the identifier finds the same one.
class HUL_PLATFORM_API KvCRoMessage : public KvCRoObject {
public:
  explicit KvCRoMessage(WmCXString name) : KvCRoObject(std::move(name)) {}

  KV_ExprDescrTupel* getMsgIdVar() const { return idVar; }
  void setMsgIdVar(KV_ExprDescrTupel* variable) { idVar = variable; }

private:
  KV_ExprDescrTupel* idVar = nullptr;
};

#endif
