// Three-way comparison used by the ordered leda containers (set, dictionary).
//
// An ordered container compares through a plain function pointer
// `int (*)(const T&, const T&)`. By default that pointer is
// detail::defaultCompare<T>, which makes an unqualified call `compare(a, b)`:
// a non-template `compare` overload for T found by argument-dependent lookup
// (e.g. one in the global namespace for a global class or a pointer to one)
// wins over the leda::compare template below, which orders by std::less
// (numbers by value, pointers by address).
#ifndef HULCVTOOLS_PLATFORM_LEDA_COMPARE_H
#define HULCVTOOLS_PLATFORM_LEDA_COMPARE_H

#include <functional>

namespace leda {

template <class T> int compare(const T& a, const T& b) {
  std::less<T> less;
  if (less(a, b))
    return -1;
  return less(b, a) ? 1 : 0;
}

namespace detail {

template <class T> using CompareFn = int (*)(const T&, const T&);

template <class T> int defaultCompare(const T& a, const T& b) { return compare(a, b); }

// Strict weak ordering adaptor over a three-way compare function.
template <class T> struct FnLess {
  CompareFn<T> cmp = &defaultCompare<T>;

  bool operator()(const T& a, const T& b) const { return cmp(a, b) < 0; }
};

} // namespace detail
} // namespace leda

#endif // HULCVTOOLS_PLATFORM_LEDA_COMPARE_H
