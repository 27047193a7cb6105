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
  // lines): one hint per line-sized step and one for the last byte; nothing for size 0.
  static void readAll(const void* p, std::size_t size) { eachLine<read>(p, size); }
  static void writeAll(const void* p, std::size_t size) { eachLine<write>(p, size); }

private:
  static constexpr std::size_t kLine = 64;
  template <void (*hint)(const void*)> static void eachLine(const void* p, std::size_t size) {
    const char* first = static_cast<const char*>(p);
    for (std::size_t at = 0; at < size; at += kLine)
      hint(first + at);
    if (size != 0)
      hint(first + size - 1);
  }
};

#endif
