// leda::set<T>: an ordered set over a balanced search tree (std::set).
//
// Elements are ordered by a three-way compare function (see compare.h); two
// elements are the same member iff they compare 0. Inserting an element equal
// to a member keeps the stored member. Lookups and updates are O(log n);
// join/intersect/diff are O(n log m) and use this set's order for the result.
// min() and max() require a non-empty set.
#ifndef HULCVTOOLS_PLATFORM_LEDA_SET_H
#define HULCVTOOLS_PLATFORM_LEDA_SET_H

#include "platform/leda/compare.h"

#include <cassert>
#include <set>

namespace leda {

// Owns copies of its elements; copies are deep and keep the order function.
// Iterators stay valid until their element is deleted.
template <class T> class set {
  using Tree = std::set<T, detail::FnLess<T>>;

public:
  using value_type = T;
  using const_iterator = typename Tree::const_iterator;
  using iterator = const_iterator;

  set() = default;
  explicit set(detail::CompareFn<T> cmp) : items_(detail::FnLess<T>{cmp}) {}

  // Returns false if an equal element was already present (it is kept).
  // Elements arriving in ascending order (the common case: symbols met in creation
  // order) are appended in O(1) amortized; others cost O(log n).
  bool insert(const T& x) {
    const std::size_t before = items_.size();
    items_.insert(items_.end(), x);
    return items_.size() != before;
  }
  // Returns false if no equal element was present.
  bool del(const T& x) { return items_.erase(x) != 0; }
  bool erase(const T& x) { return del(x); }

  bool member(const T& x) const { return items_.find(x) != items_.end(); }
  bool contains(const T& x) const { return member(x); }

  int size() const { return static_cast<int>(items_.size()); }
  bool empty() const { return items_.empty(); }
  void clear() { items_.clear(); }

  const T& min() const {
    assert(!items_.empty());
    return *items_.begin();
  }
  const T& max() const {
    assert(!items_.empty());
    return *items_.rbegin();
  }

  set join(const set& other) const {
    set result(*this);
    for (const T& x : other.items_)
      result.insert(x);
    return result;
  }

  set intersect(const set& other) const { return filter(other, true); }
  set diff(const set& other) const { return filter(other, false); }

  friend set operator+(const set& a, const set& b) { return a.join(b); }
  friend set operator&(const set& a, const set& b) { return a.intersect(b); }
  friend set operator-(const set& a, const set& b) { return a.diff(b); }

  const_iterator begin() const { return items_.begin(); }
  const_iterator end() const { return items_.end(); }

private:
  set filter(const set& other, bool keepMembers) const {
    set result(items_.key_comp().cmp);
    for (const T& x : items_) {
      if (other.member(x) == keepMembers)
        result.items_.insert(result.items_.end(), x);
    }
    return result;
  }

  Tree items_;
};

} // namespace leda

#endif // HULCVTOOLS_PLATFORM_LEDA_SET_H
