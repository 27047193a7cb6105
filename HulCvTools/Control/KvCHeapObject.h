// Class-level allocation for the objects the library creates with `new`: from the run's
// memory controller (pKVMemory) when one is set, from the C heap otherwise.
//
// Each block starts with a small header that records which controller (or none) gave
// it, so a block always goes back where it came from, even if pKVMemory is changed while
// the object lives. The controller must outlive its blocks.
//
// `new` of such a class answers null when memory runs out (the library throws nothing);
// callers check the result.
//
// Use: HULCV_HEAP_OPERATORS in the class body, HULCV_DEFINE_HEAP_OPERATORS(Class) in its
// .cpp file.
#ifndef HULCVTOOLS_CONTROL_KVCHEAPOBJECT_H
#define HULCVTOOLS_CONTROL_KVCHEAPOBJECT_H

#include <cstddef>

namespace hulcv_detail {
void* allocObject(std::size_t size) noexcept;
void freeObject(void* object) noexcept;
} // namespace hulcv_detail

#define HULCV_HEAP_OPERATORS                                                                       \
  static void* operator new(std::size_t size) noexcept;                                            \
  static void operator delete(void* object) noexcept;

#define HULCV_DEFINE_HEAP_OPERATORS(Class)                                                         \
  void* Class::operator new(std::size_t size) noexcept {                                           \
    return ::hulcv_detail::allocObject(size);                                                      \
  }                                                                                                \
  void Class::operator delete(void* object) noexcept { ::hulcv_detail::freeObject(object); }

#endif
