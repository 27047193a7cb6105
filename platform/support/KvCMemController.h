// KvCMemController: the code generator's memory controller. When the global controller
// `pKVMemory` is set, libraries take the blocks of the objects they create from it and
// give them back to it. This base controller takes blocks from the C heap; derived
// controllers may count, pool or check.
//
// Blocks are aligned for any fundamental type (as malloc's). allocMemBlock answers null
// when no memory is left. A block must be freed by the controller that gave it.
#ifndef HUL_PLATFORM_SUPPORT_KVCMEMCONTROLLER_H
#define HUL_PLATFORM_SUPPORT_KVCMEMCONTROLLER_H

#include "platform/support/HulPlatformExport.h"

#include <cstddef>

class HUL_PLATFORM_API KvCMemController {
public:
  KvCMemController() = default;
  virtual ~KvCMemController();
  KvCMemController(const KvCMemController&) = delete;
  KvCMemController& operator=(const KvCMemController&) = delete;

  virtual void* allocMemBlock(std::size_t size);
  // Null is ignored.
  virtual void freeMemBlock(void* block);
};

// The run's memory controller, or null for the ordinary heap. Set and reset by the code
// generator (or a test) while no object taken from the old controller is alive.
extern HUL_PLATFORM_API KvCMemController* pKVMemory;

// Storage for the model's own heap objects (their operator new/delete): a block of
// `size` bytes from `pKVMemory`, or from the C heap when none is set, that remembers
// where it came from, so it goes back there even when the controller has changed since.
// Null when no memory is left; freeing null is ignored.
HUL_PLATFORM_API void* kvAllocModelObject(std::size_t size) noexcept;
HUL_PLATFORM_API void kvFreeModelObject(void* object) noexcept;

#endif
