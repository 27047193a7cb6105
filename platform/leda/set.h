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
#include <iterator>
#include <set>
#include <utility>

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
  set(const set& other) : items_(other.items_) { resetMarks(); }
  set(set&& other) noexcept : items_(std::move(other.items_)) {
    resetMarks();
    other.resetMarks();
  }
  set& operator=(const set& other) {
    items_ = other.items_;
    resetMarks();
    return *this;
  }
  set& operator=(set&& other) noexcept {
    items_ = std::move(other.items_);
    resetMarks();
    other.resetMarks();
    return *this;
  }

  // Returns false if an equal element was already present (it is kept).
  // Elements arriving in ascending order (the common case: symbols met in creation
  // order, again and again) cost O(1) amortized: the set remembers where the last
  // insertion ended (a finger) and looks right after it first. Others cost O(log n).
  bool insert(const T& x) {
    const detail::FnLess<T>& less = items_.key_comp();
    if (finger_ != items_.end()) {
      // The last element is remembered; stepping past it would climb the tree.
      const bool atLast = finger_ == last_;
      auto after = atLast ? items_.end() : std::next(finger_);
      if (after != items_.end() && !less(*after, x) && !less(x, *after)) {
        finger_ = after; // present already, right after the last one
        return false;
      }
      if (less(*finger_, x) && (after == items_.end() || less(x, *after))) {
        finger_ = items_.insert(after, x);
        if (atLast)
          last_ = finger_;
        return true;
      }
    }
    const std::size_t before = items_.size();
    finger_ = items_.insert(items_.end(), x);
    if (items_.size() == before)
      return false;
    if (last_ == items_.end() || less(*last_, x))
      last_ = finger_;
    return true;
  }
  // Returns false if no equal element was present.
  bool del(const T& x) {
    auto it = items_.find(x);
    if (it == items_.end())
      return false;
    if (it == finger_)
      finger_ = items_.end();
    if (it == last_)
      last_ = it == items_.begin() ? items_.end() : std::prev(it);
    items_.erase(it);
    return true;
  }
  bool erase(const T& x) { return del(x); }

  bool member(const T& x) const { return items_.find(x) != items_.end(); }
  bool contains(const T& x) const { return member(x); }

  int size() const { return static_cast<int>(items_.size()); }
  bool empty() const { return items_.empty(); }
  void clear() {
    items_.clear();
    resetMarks();
  }

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
    result.resetMarks();
    return result;
  }

  void resetMarks() {
    finger_ = items_.end();
    last_ = items_.empty() ? items_.end() : std::prev(items_.end());
  }

  Tree items_;
  // Where the last insertion ended, or end(); reset by whatever could invalidate it.
  typename Tree::iterator finger_ = items_.end();
  // The greatest element, or end() for the empty set.
  typename Tree::iterator last_ = items_.end();
};

} // namespace leda

#endif // HULCVTOOLS_PLATFORM_LEDA_SET_H
