#include "platform/icode/KV_CallInserter.h"

#include "platform/support/KvCMemController.h"

#include <cstdlib>

namespace {
// Each block starts with the controller that gave it (null: the C heap).
constexpr std::size_t kHeader = alignof(std::max_align_t);
} // namespace

KV_CallInserter::~KV_CallInserter() = default;

void* KV_CallInserter::operator new(std::size_t size) noexcept {
  KvCMemController* controller = pKVMemory;
  void* block =
      controller ? controller->allocMemBlock(size + kHeader) : std::malloc(size + kHeader);
  if (!block)
    return nullptr;
  *static_cast<KvCMemController**>(block) = controller;
  return static_cast<unsigned char*>(block) + kHeader;
}

void KV_CallInserter::operator delete(void* object) noexcept {
  if (!object)
    return;
  void* block = static_cast<unsigned char*>(object) - kHeader;
  KvCMemController* controller = *static_cast<KvCMemController**>(block);
  if (controller)
    controller->freeMemBlock(block);
  else
    std::free(block);
}
