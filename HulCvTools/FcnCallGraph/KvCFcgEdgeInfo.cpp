#include "HulCvTools/FcnCallGraph/KvCFcgEdgeInfo.h"

#include "HulCvTools/Control/KvCObjectPool.h"

int KvCFcgEdgeInfo::s_DebugIndex = 0;

HULCV_DEFINE_HEAP_OPERATORS(KvCFcgEdgeInfo)

void* KvCFcgEdgeInfo::operator new(std::size_t size, KvCObjectPool& pool) noexcept {
  return pool.allocate(size);
}

// Only reached when the constructor throws, which it does not.
void KvCFcgEdgeInfo::operator delete(void* object, KvCObjectPool& /*pool*/) noexcept {
  hulcv_detail::freeObject(object);
}
