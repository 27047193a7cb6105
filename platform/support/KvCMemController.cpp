#include "platform/support/KvCMemController.h"

#include <cstddef>
#include <cstdlib>

KvCMemController* pKVMemory = nullptr;

KvCMemController::~KvCMemController() = default;

void* KvCMemController::allocMemBlock(std::size_t size) { return std::malloc(size ? size : 1); }

void KvCMemController::freeMemBlock(void* block) { std::free(block); }

namespace {
// Each block starts with the controller that gave it (null: the C heap).
constexpr std::size_t kHeader = alignof(std::max_align_t);
} // namespace

void* kvAllocModelObject(std::size_t size) noexcept {
  KvCMemController* controller = pKVMemory;
  void* block =
      controller ? controller->allocMemBlock(size + kHeader) : std::malloc(size + kHeader);
  if (!block)
    return nullptr;
  *static_cast<KvCMemController**>(block) = controller;
  return static_cast<unsigned char*>(block) + kHeader;
}

void kvFreeModelObject(void* object) noexcept {
  if (!object)
    return;
  void* block = static_cast<unsigned char*>(object) - kHeader;
  KvCMemController* controller = *static_cast<KvCMemController**>(block);
  if (controller)
    controller->freeMemBlock(block);
  else
    std::free(block);
}
