// leda::stack<T>: a LIFO stack. pop() and top() require a non-empty stack
// (checked by assert in debug builds).
#ifndef HULCVTOOLS_PLATFORM_LEDA_STACK_H
#define HULCVTOOLS_PLATFORM_LEDA_STACK_H

#include <cassert>
#include <deque>
#include <utility>

namespace leda {

// Owns its elements; copies are deep. A reference from top() stays valid until
// that element is popped.
template <class T> class stack {
public:
  void push(const T& x) { items_.push_back(x); }
  void push(T&& x) { items_.push_back(std::move(x)); }

  T pop() {
    assert(!items_.empty());
    T x = std::move(items_.back());
    items_.pop_back();
    return x;
  }

  T& top() {
    assert(!items_.empty());
    return items_.back();
  }
  const T& top() const {
    assert(!items_.empty());
    return items_.back();
  }

  int size() const { return static_cast<int>(items_.size()); }
  bool empty() const { return items_.empty(); }
  void clear() { items_.clear(); }

private:
  std::deque<T> items_;
};

} // namespace leda

#endif // HULCVTOOLS_PLATFORM_LEDA_STACK_H
