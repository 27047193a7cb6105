// KvCCountingMemController: a memory controller that counts what it gives and takes
// back, for proving that a component returns every block. It can also be told to refuse
// blocks, to exercise out-of-memory paths.
//
// Freeing a block it did not give (or freeing twice) is not passed to the heap; it is
// counted as a foreign free instead.
#ifndef HUL_PLATFORM_SUPPORT_KVCCOUNTINGMEMCONTROLLER_H
#define HUL_PLATFORM_SUPPORT_KVCCOUNTINGMEMCONTROLLER_H

#include "platform/support/KvCMemController.h"

#include <unordered_map>

class HUL_PLATFORM_API KvCCountingMemController : public KvCMemController {
public:
  KvCCountingMemController() = default;
  // Blocks still outstanding are given back to the heap.
  ~KvCCountingMemController() override;

  void* allocMemBlock(std::size_t size) override;
  void freeMemBlock(void* block) override;

  // After `count` more successful blocks, every request answers null.
  void failAfter(long count) { remainingBeforeFailure = count; }

  std::size_t getOutstandingBlocks() const { return live.size(); }
  std::size_t getOutstandingBytes() const { return liveBytes; }
  std::size_t getTotalBlocks() const { return totalBlocks; }
  std::size_t getForeignFrees() const { return foreignFrees; }

private:
  std::unordered_map<void*, std::size_t> live;
  std::size_t liveBytes = 0;
  std::size_t totalBlocks = 0;
  std::size_t foreignFrees = 0;
  long remainingBeforeFailure = -1;
};

#endif
