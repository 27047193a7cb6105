// leda::list<T>: a doubly linked sequence over std::list.
//
// pop(), pop_back(), front() and back() require a non-empty list (checked by
// assert in debug builds). remove() and search() compare with operator==,
// sort() is stable and orders by operator<.
#ifndef HULCVTOOLS_PLATFORM_LEDA_LIST_H
#define HULCVTOOLS_PLATFORM_LEDA_LIST_H

#include <algorithm>
#include <cassert>
#include <initializer_list>
#include <list>
#include <utility>

namespace leda {

// Owns its elements; copies are deep. Iterators and element references stay
// valid until their element is removed.
template <class T> class list {
public:
  using value_type = T;
  using iterator = typename std::list<T>::iterator;
  using const_iterator = typename std::list<T>::const_iterator;

  list() = default;
  list(std::initializer_list<T> init) : items_(init) {}

  void append(const T& x) { items_.push_back(x); }
  void append(T&& x) { items_.push_back(std::move(x)); }
  void push(const T& x) { items_.push_front(x); }
  void push(T&& x) { items_.push_front(std::move(x)); }

  T pop() {
    assert(!items_.empty());
    T x = std::move(items_.front());
    items_.pop_front();
    return x;
  }

  T pop_back() {
    assert(!items_.empty());
    T x = std::move(items_.back());
    items_.pop_back();
    return x;
  }

  T& front() {
    assert(!items_.empty());
    return items_.front();
  }
  const T& front() const {
    assert(!items_.empty());
    return items_.front();
  }
  T& back() {
    assert(!items_.empty());
    return items_.back();
  }
  const T& back() const {
    assert(!items_.empty());
    return items_.back();
  }
  T& head() { return front(); }
  const T& head() const { return front(); }
  T& tail() { return back(); }
  const T& tail() const { return back(); }

  int size() const { return static_cast<int>(items_.size()); }
  int length() const { return size(); }
  bool empty() const { return items_.empty(); }
  void clear() { items_.clear(); }

  // Removes every element equal to x; returns how many were removed.
  int remove(const T& x) { return static_cast<int>(items_.remove(x)); }

  // The first element equal to x, or nullptr. O(n).
  T* search(const T& x) {
    auto it = std::find(items_.begin(), items_.end(), x);
    return it == items_.end() ? nullptr : &*it;
  }
  const T* search(const T& x) const {
    auto it = std::find(items_.begin(), items_.end(), x);
    return it == items_.end() ? nullptr : &*it;
  }
  bool contains(const T& x) const { return search(x) != nullptr; }

  void sort() { items_.sort(); }

  iterator begin() { return items_.begin(); }
  iterator end() { return items_.end(); }
  const_iterator begin() const { return items_.begin(); }
  const_iterator end() const { return items_.end(); }

  friend bool operator==(const list& a, const list& b) { return a.items_ == b.items_; }

private:
  std::list<T> items_;
};

} // namespace leda

#endif // HULCVTOOLS_PLATFORM_LEDA_LIST_H
