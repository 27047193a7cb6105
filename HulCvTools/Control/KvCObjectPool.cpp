#include "HulCvTools/Control/KvCObjectPool.h"

#include "HulCvTools/Control/KvCHeapBlock.h"
#include "HulCvTools/Control/KvCHeapObject.h"

#include <algorithm>
#include <new>
#include <vector>

namespace hulcv_detail {

struct KvCObjectPoolState {
  explicit KvCObjectPoolState(std::size_t objectSize)
      : objectSize(objectSize),
        blockSize(
            (sizeof(BlockHeader) + std::max(objectSize, sizeof(void*)) + alignof(BlockHeader) - 1) /
            alignof(BlockHeader) * alignof(BlockHeader)) {}
  ~KvCObjectPoolState() {
    for (const Chunk& c : chunks)
      freeObject(c.memory);
  }

  void* take() noexcept {
    if (freeList) {
      void* block = freeList;
      freeList = *static_cast<void**>(block);
      return block;
    }
    if (chunk == chunks.size() || used == chunks[chunk].blocks) {
      if (chunk < chunks.size())
        ++chunk;
      used = 0;
      if (chunk == chunks.size() && !addChunk())
        return nullptr;
    }
    return chunks[chunk].memory + blockSize * used++;
  }

  bool addChunk() noexcept {
    constexpr std::size_t kFirstBlocks = 64;
    constexpr std::size_t kMaxChunkBytes = std::size_t{1} << 16;
    const std::size_t blocks = chunks.empty()
                                   ? kFirstBlocks
                                   : std::max<std::size_t>(1, std::min(chunks.back().blocks * 2,
                                                                       kMaxChunkBytes / blockSize));
    auto* memory = static_cast<unsigned char*>(allocObject(blocks * blockSize));
    if (!memory)
      return false;
    chunks.push_back(Chunk{memory, blocks});
    return true;
  }

  // Once no block is live every block is free: carve from the first chunk again.
  void restart() {
    freeList = nullptr;
    chunk = 0;
    used = 0;
  }

  struct Chunk {
    unsigned char* memory;
    std::size_t blocks;
  };
  const std::size_t objectSize;
  const std::size_t blockSize; // header and object
  std::vector<Chunk> chunks;
  std::size_t chunk = 0; // chunk being carved
  std::size_t used = 0;  // blocks of it handed out
  void* freeList = nullptr;
  std::size_t live = 0;
  bool orphaned = false; // the pool object is gone; the last release frees the state
};

void releasePooled(BlockHeader* header) noexcept {
  KvCObjectPoolState* state = header->pool;
  *reinterpret_cast<void**>(header) = state->freeList;
  state->freeList = header;
  if (--state->live != 0)
    return;
  if (state->orphaned)
    delete state;
  else
    state->restart();
}

} // namespace hulcv_detail

KvCObjectPool::KvCObjectPool(std::size_t objectSize)
    : state(new (std::nothrow) hulcv_detail::KvCObjectPoolState(objectSize)) {}

KvCObjectPool::~KvCObjectPool() {
  if (!state)
    return;
  if (state->live == 0)
    delete state;
  else
    state->orphaned = true;
}

void* KvCObjectPool::allocate(std::size_t size) noexcept {
  if (!state || size > state->objectSize)
    return hulcv_detail::allocObject(size);
  void* block = state->take();
  if (!block)
    return nullptr;
  auto* header = ::new (block) hulcv_detail::BlockHeader{nullptr, state};
  ++state->live;
  return header + 1;
}

std::size_t KvCObjectPool::live() const { return state ? state->live : 0; }
