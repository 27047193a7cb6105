// KvCFcgSortedSet<T, Less>: the ordered set a function's call-graph record keeps its call
// operations and its called functions in.
//
// Most such sets are small (a function is called a few times and calls a few functions)
// and are filled in ascending order, cleared and filled again each time a call graph is
// constructed. So the set keeps its elements in one sorted array while it is small: an
// insertion at the end is O(1), a lookup is one binary search in contiguous memory, and
// clear() keeps the array's capacity, so refilling allocates nothing. Appends keep the array
// however large it grows (a scheduler's called functions are appended in order, and
// refilled in order they are met one after another in contiguous memory); the first
// insertion or deletion inside an array of more than kFlatLimit elements moves the set into
// a balanced tree (O(log n) for every update, whatever the order), where it stays until it
// is cleared. So large sets never pay O(n) per update.
//
// Elements are ordered by `Less` (a stateless strict weak order); two elements are the same
// member iff neither is less than the other, and inserting such an element keeps the stored
// one. Iteration is in ascending order. Any insertion or deletion invalidates iterators.
#ifndef HUL_PLATFORM_ICODE_KVCFCGSORTEDSET_H
#define HUL_PLATFORM_ICODE_KVCFCGSORTEDSET_H

#include "platform/support/KvCPrefetch.h"
#include <algorithm>
#include <cstddef>
#include <iterator>
#include <memory>
#include <set>
#include <type_traits>
#include <vector>

template <class T, class Less> class KvCFcgSortedSet {
  using Tree = std::set<T, Less>;

public:
  static constexpr std::size_t kFlatLimit = 128;
  static constexpr std::size_t kNone = static_cast<std::size_t>(-1);

  class const_iterator {
  public:
    using iterator_category = std::forward_iterator_tag;
    using value_type = T;
    using difference_type = std::ptrdiff_t;
    using pointer = const T*;
    using reference = const T&;

    const_iterator() = default;
    reference operator*() const { return flat ? *p : *it; }
    pointer operator->() const { return &**this; }
    const_iterator& operator++() {
      if (flat)
        ++p;
      else
        ++it;
      return *this;
    }
    const_iterator operator++(int) {
      const_iterator old = *this;
      ++*this;
      return old;
    }
    friend bool operator==(const const_iterator& a, const const_iterator& b) {
      return a.flat ? a.p == b.p : a.it == b.it;
    }
    friend bool operator!=(const const_iterator& a, const const_iterator& b) { return !(a == b); }

  private:
    friend class KvCFcgSortedSet;
    explicit const_iterator(const T* q) : p(q), flat(true) {}
    explicit const_iterator(typename Tree::const_iterator i) : it(i), flat(false) {}

    const T* p = nullptr;
    typename Tree::const_iterator it{};
    bool flat = true;
  };
  using iterator = const_iterator;
  using value_type = T;

  // Returns false if an equal element was present already (it is kept).
  bool insert(const T& x) {
    if (tree)
      return insertIntoTree(x);
    // The element after the one the last insertion met may be x itself: a refill of a set
    // that kept its elements then compares no keys.
    if (last + 1 < items.size() && same(items[last + 1], x)) {
      ++last;
      return false;
    }
    const Less less;
    if (items.empty() || less(items.back(), x)) {
      items.push_back(x);
      last = items.size() - 1;
    } else {
      // Ascending refills of a set that kept its elements meet each one right after the
      // element the last insertion met.
      std::size_t at = last + 1;
      if (at < items.size() && !less(items[at], x) && !less(x, items[at])) {
        last = at;
        return false;
      }
      at = static_cast<std::size_t>(std::lower_bound(items.begin(), items.end(), x, less) -
                                    items.begin());
      last = at;
      if (!less(x, items[at]))
        return false;
      if (items.size() >= kFlatLimit) {
        moveToTree();
        return insertIntoTree(x);
      }
      items.insert(items.begin() + static_cast<std::ptrdiff_t>(at), x);
    }
    return true;
  }

  // Appends n elements that the caller knows to be strictly ascending and greater than
  // every element of the set, without comparing them (a refill from sorted data whose
  // order keys are known elsewhere). O(n) amortized.
  void appendAscending(const T* first, std::size_t n) {
    if (!tree) {
      items.insert(items.end(), first, first + n);
      if (!items.empty())
        last = items.size() - 1;
      return;
    }
    for (std::size_t i = 0; i < n; ++i)
      finger = tree->insert(tree->end(), first[i]);
  }

  // Starts the next insertions' search for their elements at the front: a refill in
  // ascending order of a set that kept its elements then meets each at once.
  void rewind() {
    last = kNone;
    if (tree)
      finger = tree->end();
  }

  // The greatest element; the set must not be empty.
  const T& back() const { return tree ? *tree->rbegin() : items.back(); }

  // Returns false if no equal element was present.
  bool del(const T& x) {
    if (tree) {
      auto at = tree->find(x);
      if (at == tree->end())
        return false;
      if (at == finger)
        finger = tree->end();
      tree->erase(at);
      return true;
    }
    const Less less;
    auto at = std::lower_bound(items.begin(), items.end(), x, less);
    if (at == items.end() || less(x, *at))
      return false;
    if (items.size() > kFlatLimit) {
      moveToTree();
      return del(x);
    }
    items.erase(at);
    last = kNone;
    return true;
  }

  bool member(const T& x) const {
    if (tree)
      return tree->find(x) != tree->end();
    const Less less;
    auto at = std::lower_bound(items.begin(), items.end(), x, less);
    return at != items.end() && !less(x, *at);
  }

  int size() const { return static_cast<int>(tree ? tree->size() : items.size()); }
  bool empty() const { return size() == 0; }

  // Keeps the array's capacity for the next filling; a tree's nodes are freed.
  void clear() {
    items.clear();
    tree.reset();
    last = kNone;
  }

  const_iterator begin() const {
    return tree ? const_iterator(tree->cbegin()) : const_iterator(items.data());
  }
  const_iterator end() const {
    return tree ? const_iterator(tree->cend()) : const_iterator(items.data() + items.size());
  }

  // Cache hint for an insertion to come: where the next ascending element would go.
  void prefetch() const {
    if (!tree && !items.empty())
      KvCPrefetch::read(items.data() + std::min(last + 1, items.size() - 1));
  }

private:
  bool insertIntoTree(const T& x) {
    const Less less;
    // Past the greatest element: O(1) amortized at the end.
    if (tree->empty() || less(*tree->rbegin(), x)) {
      finger = tree->insert(tree->end(), x);
      return true;
    }
    // Like the array form: an ascending pass meets each element right after the one the
    // last insertion met (O(1) amortized instead of a descent through the tree).
    if (finger != tree->end()) {
      const auto next = std::next(finger);
      if (next != tree->end() && (same(*next, x) || (!less(*next, x) && !less(x, *next)))) {
        finger = next;
        return false;
      }
      if (less(*finger, x) && (next == tree->end() || less(x, *next))) {
        finger = tree->insert(next, x);
        return true;
      }
    }
    const auto [at, inserted] = tree->insert(x);
    finger = at;
    return inserted;
  }

  // Identity of pointer elements: equal without comparing their keys.
  static bool same(const T& a, const T& b) {
    if constexpr (std::is_pointer_v<T>)
      return a == b;
    else
      return false;
  }

  void moveToTree() {
    tree = std::make_unique<Tree>(items.begin(), items.end());
    finger = tree->end();
    items = std::vector<T>();
  }

  std::vector<T> items;           // sorted; holds the elements while the set is small
  std::unique_ptr<Tree> tree;     // holds them once large
  typename Tree::iterator finger; // in the tree: the element the last insertion met, or end
  // Where the last flat insertion met its element; kNone before the first.
  std::size_t last = kNone;
};

#endif
