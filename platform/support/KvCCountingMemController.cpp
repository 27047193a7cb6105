#include "platform/support/KvCCountingMemController.h"

KvCCountingMemController::~KvCCountingMemController() {
  for (auto& [block, size] : live)
    KvCMemController::freeMemBlock(block);
}

void* KvCCountingMemController::allocMemBlock(std::size_t size) {
  if (remainingBeforeFailure == 0)
    return nullptr;
  if (remainingBeforeFailure > 0)
    --remainingBeforeFailure;
  void* block = KvCMemController::allocMemBlock(size);
  if (!block)
    return nullptr;
  live.emplace(block, size);
  liveBytes += size;
  ++totalBlocks;
  return block;
}

void KvCCountingMemController::freeMemBlock(void* block) {
  if (!block)
    return;
  auto it = live.find(block);
  if (it == live.end()) {
    ++foreignFrees;
    return;
  }
  liveBytes -= it->second;
  live.erase(it);
  KvCMemController::freeMemBlock(block);
}
