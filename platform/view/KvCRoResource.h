// KvCRoResource: a resource of the RTOS (a lock that tasks take around shared data), with the
// ICode variable that identifies it in generated code.
#ifndef HUL_PLATFORM_VIEW_KVCRORESOURCE_H
#define HUL_PLATFORM_VIEW_KVCRORESOURCE_H

#include "platform/view/KvCRoObject.h"

class KV_ExprDescrTupel;

// Made and owned by KvCRoDatabase (createResource). The identifier variable is null until
// someone sets it. The resource only remembers it (the variable belongs to the ICode and is
// never freed here), so that every later request for the identifier finds the same one.
class HUL_PLATFORM_API KvCRoResource : public KvCRoObject {
public:
  explicit KvCRoResource(WmCXString name) : KvCRoObject(std::move(name)) {}

  KV_ExprDescrTupel* getResourceIdVar() const { return idVar; }
  void setResourceIdVar(KV_ExprDescrTupel* variable) { idVar = variable; }

private:
  KV_ExprDescrTupel* idVar = nullptr;
};

#endif
