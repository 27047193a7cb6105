// KvCObjectPool: storage for many library heap objects of one size that come and go
// together (a call graph's edge infos), without a trip to the C heap per object.
//
// Blocks come from chunks that the pool takes like any library heap object (from the run's
// memory controller when one is set) and carry the same header, so an object made with
// `new (pool) T` is released by a plain `delete` through T's class operators, whoever
// deletes it. Released blocks are reused; once no block is live, allocation starts again
// at the first chunk, so objects made one after another lie next to each other.
//
// Lifetime: destroying the pool frees its chunks when no block is live; otherwise the
// chunks stay until the last live block is deleted. Not thread-safe (one pass at a time,
// like the objects it serves).
//
// Costs: O(1) per allocation and release; chunks grow from 64 blocks to 64 KiB.
#ifndef HULCVTOOLS_CONTROL_KVCOBJECTPOOL_H
#define HULCVTOOLS_CONTROL_KVCOBJECTPOOL_H

#include "HulCvTools/HulCvToolsExport.h"

#include <cstddef>

namespace hulcv_detail {
struct KvCObjectPoolState;
} // namespace hulcv_detail

class HULCV_API KvCObjectPool {
public:
  // For objects of at most `objectSize` bytes.
  explicit KvCObjectPool(std::size_t objectSize);
  ~KvCObjectPool();
  KvCObjectPool(const KvCObjectPool&) = delete;
  KvCObjectPool& operator=(const KvCObjectPool&) = delete;

  // Storage for one object of `size` bytes, or null when memory runs out. Objects larger
  // than the pool's size are taken from the heap as usual (and released the same way).
  void* allocate(std::size_t size) noexcept;
  // Number of blocks handed out and not yet released.
  std::size_t live() const;

private:
  hulcv_detail::KvCObjectPoolState* state;
};

#endif
