// The header in front of every block the library's heap objects live in (internal to the
// library): which memory controller (null: the C heap) or which object pool gave the block,
// so that a block always goes back where it came from.
#ifndef HULCVTOOLS_CONTROL_KVCHEAPBLOCK_H
#define HULCVTOOLS_CONTROL_KVCHEAPBLOCK_H

class KvCMemController;

namespace hulcv_detail {

struct KvCObjectPoolState;

// Kept a multiple of the default new alignment, so the object after it stays aligned (on
// the usual 64-bit targets that is 16 bytes, room for both pointers). The block comes from
// the pool `pool` when that is set, otherwise from `controller` (null: the C heap).
struct alignas(__STDCPP_DEFAULT_NEW_ALIGNMENT__) BlockHeader {
  KvCMemController* controller;
  KvCObjectPoolState* pool;
};

// Gives a pooled block back to its pool (KvCObjectPool.cpp).
void releasePooled(BlockHeader* header) noexcept;

} // namespace hulcv_detail

#endif
