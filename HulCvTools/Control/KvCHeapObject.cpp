#include "HulCvTools/Control/KvCHeapObject.h"

#include "platform/support/KvCMemController.h"

#include <cstdlib>
#include <new>

namespace {
// Kept a multiple of the default new alignment, so the object after it stays aligned.
struct alignas(__STDCPP_DEFAULT_NEW_ALIGNMENT__) BlockHeader {
  KvCMemController* controller; // null: the C heap
};
} // namespace

namespace hulcv_detail {

void* allocObject(std::size_t size) noexcept {
  KvCMemController* controller = pKVMemory;
  const std::size_t total = sizeof(BlockHeader) + size;
  if (total < size)
    return nullptr;
  void* block = controller ? controller->allocMemBlock(total) : std::malloc(total);
  if (!block)
    return nullptr;
  auto* header = ::new (block) BlockHeader{controller};
  return header + 1;
}

void freeObject(void* object) noexcept {
  if (!object)
    return;
  BlockHeader* header = static_cast<BlockHeader*>(object) - 1;
  KvCMemController* controller = header->controller;
  if (controller)
    controller->freeMemBlock(header);
  else
    std::free(header);
}

} // namespace hulcv_detail
