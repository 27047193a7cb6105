// KvCFcgSortedSet<T, Less>: the ordered set a function's call-graph record keeps its call
// operations and its called functions in.
//
// Most such sets are small (a function is called a few times and calls a few functions)
// and are filled in ascending order, cleared and filled again each time a call graph is
// constructed. So the set keeps its elements in one sorted array while it is small: an
// insertion past the greatest element is O(1) amortized, a lookup is one binary search, and
// clear() keeps the array's capacity. An insertion or deletion inside an array of more
// than kFlatLimit elements moves the set into a balanced tree (O(log n) for every update),
// where it stays until it is cleared; appends keep the array however large it grows.
//
// Elements are ordered by `Less` (a stateless strict weak order); two elements are the same
// member iff neither is less than the other, and inserting such an element keeps the stored
// one. Iteration is in ascending order. Any insertion or deletion invalidates iterators.
#ifndef HUL_PLATFORM_ICODE_KVCFCGSORTEDSET_H
#define HUL_PLATFORM_ICODE_KVCFCGSORTEDSET_H

#include <algorithm>
#include <cstddef>
#include <iterator>
#include <memory>
#include <set>
#include <vector>

template <class T, class Less> class KvCFcgSortedSet {
  using Tree = std::set<T, Less>;

public:
  static constexpr std::size_t kFlatLimit = 128;

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
      return tree->insert(x).second;
    const Less less;
    if (items.empty() || less(items.back(), x)) {
      items.push_back(x);
      return true;
    }
    const auto at = std::lower_bound(items.begin(), items.end(), x, less);
    if (!less(x, *at))
      return false;
    if (items.size() >= kFlatLimit) {
      moveToTree();
      return tree->insert(x).second;
    }
    items.insert(at, x);
    return true;
  }

  // Returns false if no equal element was present.
  bool del(const T& x) {
    if (tree)
      return tree->erase(x) != 0;
    const Less less;
    const auto at = std::lower_bound(items.begin(), items.end(), x, less);
    if (at == items.end() || less(x, *at))
      return false;
    if (items.size() > kFlatLimit) {
      moveToTree();
      return tree->erase(x) != 0;
    }
    items.erase(at);
    return true;
  }

  bool member(const T& x) const {
    if (tree)
      return tree->find(x) != tree->end();
    const Less less;
    const auto at = std::lower_bound(items.begin(), items.end(), x, less);
    return at != items.end() && !less(x, *at);
  }

  int size() const { return static_cast<int>(tree ? tree->size() : items.size()); }
  bool empty() const { return size() == 0; }
  // The greatest element; the set must not be empty.
  const T& back() const { return tree ? *tree->rbegin() : items.back(); }

  // Keeps the array's capacity for the next filling; a tree's nodes are freed.
  void clear() {
    items.clear();
    tree.reset();
  }

  const_iterator begin() const {
    return tree ? const_iterator(tree->cbegin()) : const_iterator(items.data());
  }
  const_iterator end() const {
    return tree ? const_iterator(tree->cend()) : const_iterator(items.data() + items.size());
  }

private:
  void moveToTree() {
    tree = std::make_unique<Tree>(items.begin(), items.end());
    items = std::vector<T>();
  }

  std::vector<T> items;       // sorted; holds the elements while the set is small
  std::unique_ptr<Tree> tree; // holds them once large
};

#endif
