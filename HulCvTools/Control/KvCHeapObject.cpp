#include "HulCvTools/Control/KvCHeapObject.h"

#include "HulCvTools/Control/KvCHeapBlock.h"
#include "platform/support/KvCMemController.h"

#include <cstdlib>
#include <new>

namespace hulcv_detail {

void* allocObject(std::size_t size) noexcept {
  KvCMemController* controller = pKVMemory;
  const std::size_t total = sizeof(BlockHeader) + size;
  if (total < size)
    return nullptr;
  void* block = controller ? controller->allocMemBlock(total) : std::malloc(total);
  if (!block)
    return nullptr;
  auto* header = ::new (block) BlockHeader{controller, nullptr};
  return header + 1;
}

void freeObject(void* object) noexcept {
  if (!object)
    return;
  BlockHeader* header = static_cast<BlockHeader*>(object) - 1;
  if (header->pool) {
    releasePooled(header);
    return;
  }
  KvCMemController* controller = header->controller;
  if (controller)
    controller->freeMemBlock(header);
  else
    std::free(header);
}

} // namespace hulcv_detail
