// KvCPrefetch: cache hints that survive optimisation.
//
// __builtin_prefetch has no effect the optimiser must keep. A small function that only
// reads a table and prefetches an entry of it therefore counts as free of side effects,
// and a call of it whose result is unused is deleted as dead code: the hint silently
// disappears. The empty volatile asm that takes the address is an effect the optimiser
// keeps; it emits no instruction.
#ifndef HUL_PLATFORM_SUPPORT_KVCPREFETCH_H
#define HUL_PLATFORM_SUPPORT_KVCPREFETCH_H

#include <cstddef>
#include <cstdint>

struct KvCPrefetch {
  // Hints that the line holding `p` will be read (write: written) soon. Never faults.
  static void read(const void* p) {
    __builtin_prefetch(p, 0);
    asm volatile("" : : "r"(p));
  }
  static void write(const void* p) {
    __builtin_prefetch(p, 1);
    asm volatile("" : : "r"(p));
  }
  // The same for every line of the `size` bytes at `p` (an object that may straddle
  // lines); nothing for size 0.
  static void readAll(const void* p, std::size_t size) {
    if (size == 0)
      return;
    for (std::uintptr_t a = lineOf(p); a <= lineOf(static_cast<const char*>(p) + size - 1);
         a += kLine)
      read(reinterpret_cast<const void*>(a));
  }
  static void writeAll(const void* p, std::size_t size) {
    if (size == 0)
      return;
    for (std::uintptr_t a = lineOf(p); a <= lineOf(static_cast<const char*>(p) + size - 1);
         a += kLine)
      write(reinterpret_cast<const void*>(a));
  }

private:
  static constexpr std::uintptr_t kLine = 64;
  static std::uintptr_t lineOf(const void* p) {
    return reinterpret_cast<std::uintptr_t>(p) & ~(kLine - 1);
  }
};

#endif
