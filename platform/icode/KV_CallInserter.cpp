#include "platform/icode/KV_CallInserter.h"

#include "platform/support/KvCMemController.h"

KV_CallInserter::~KV_CallInserter() = default;

void* KV_CallInserter::operator new(std::size_t size) noexcept { return kvAllocModelObject(size); }

void KV_CallInserter::operator delete(void* object) noexcept { kvFreeModelObject(object); }
