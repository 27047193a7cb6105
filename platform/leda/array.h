// leda::array<T>: a contiguous array over an explicit index range [low, high].
//
// array(n) covers [0, n-1]; an empty array has high() == low() - 1. Elements
// start value-initialised (0, null, T{}). Indexing outside the range is a
// programming error checked by assert in debug builds. resize() keeps the
// elements whose index is in both the old and the new range.
#ifndef HULCVTOOLS_PLATFORM_LEDA_ARRAY_H
#define HULCVTOOLS_PLATFORM_LEDA_ARRAY_H

#include <algorithm>
#include <cassert>
#include <cstddef>
#include <utility>
#include <vector>

namespace leda {
namespace detail {

// Wraps an element so that storage of bool is not std::vector<bool> and
// element references are plain T&.
template <class T> struct Slot { T value{}; };

} // namespace detail

// Owns its elements; copies are deep. References to elements stay valid until
// the next resize().
template <class T> class array {
public:
  array() = default;
  explicit array(int n) : array(0, n - 1) {}
  array(int low, int high) : low_(low) { slots_.resize(extent(low, high)); }

  int low() const { return low_; }
  int high() const { return low_ + size() - 1; }
  int size() const { return static_cast<int>(slots_.size()); }
  bool empty() const { return slots_.empty(); }

  T& operator[](int i) { return slots_[offset(i)].value; }
  const T& operator[](int i) const { return slots_[offset(i)].value; }

  void resize(int n) { resize(0, n - 1); }

  void resize(int low, int high) {
    std::vector<detail::Slot<T>> moved(extent(low, high));
    int keepLow = std::max(low, low_);
    int keepHigh = std::min(high, this->high());
    for (int i = keepLow; i <= keepHigh; ++i)
      moved[static_cast<std::size_t>(i - low)].value = std::move(slots_[offset(i)].value);
    slots_ = std::move(moved);
    low_ = low;
  }

  // Sets every element to x.
  void init(const T& x) {
    for (detail::Slot<T>& slot : slots_)
      slot.value = x;
  }

private:
  static std::size_t extent(int low, int high) {
    return high < low ? 0 : static_cast<std::size_t>(high - low) + 1;
  }

  std::size_t offset(int i) const {
    assert(i >= low_ && i <= high());
    return static_cast<std::size_t>(i - low_);
  }

  int low_ = 0;
  std::vector<detail::Slot<T>> slots_;
};

} // namespace leda

#endif // HULCVTOOLS_PLATFORM_LEDA_ARRAY_H
