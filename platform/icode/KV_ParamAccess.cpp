#include "platform/icode/KV_ParamAccess.h"

#include "platform/support/KvCMemController.h"

void* KV_ParamAccess::operator new(std::size_t size) noexcept { return kvAllocModelObject(size); }

void KV_ParamAccess::operator delete(void* object) noexcept { kvFreeModelObject(object); }
