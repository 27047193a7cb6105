// leda::dictionary<K, V>: a key -> info map sorted by key (std::map).
//
// Keys are ordered by a three-way compare function as in leda::set (see
// compare.h). Lookups and updates are O(log n); iteration is ascending by key
// and yields (key, info) pairs. access(k), key(it) and inf(it) require a
// defined key or a live item.
#ifndef HULCVTOOLS_PLATFORM_LEDA_DICTIONARY_H
#define HULCVTOOLS_PLATFORM_LEDA_DICTIONARY_H

#include "platform/leda/compare.h"

#include <cassert>
#include <map>
#include <utility>

namespace leda {

// Owns its entries; copies are deep and keep the order function (items of a
// copy are distinct from the original's). An item is a handle to one entry
// and stays valid until that entry is deleted or the dictionary is cleared.
template <class K, class V> class dictionary {
  using Tree = std::map<K, V, detail::FnLess<K>>;

public:
  using value_type = std::pair<const K, V>;
  using item = value_type*;
  using iterator = typename Tree::iterator;
  using const_iterator = typename Tree::const_iterator;

  dictionary() = default;
  explicit dictionary(detail::CompareFn<K> cmp) : entries_(detail::FnLess<K>{cmp}) {}

  // Defines k with info i, replacing the info if k is already defined.
  item insert(const K& k, const V& i) {
    auto [pos, inserted] = entries_.try_emplace(k, i);
    if (!inserted)
      pos->second = i;
    return &*pos;
  }

  item lookup(const K& k) const {
    auto pos = entries_.find(k);
    return pos == entries_.end() ? nullptr : const_cast<item>(&*pos);
  }

  const K& key(item it) const {
    assert(it);
    return it->first;
  }
  V& inf(item it) {
    assert(it);
    return it->second;
  }
  const V& inf(item it) const {
    assert(it);
    return it->second;
  }

  V& access(const K& k) {
    auto pos = entries_.find(k);
    assert(pos != entries_.end());
    return pos->second;
  }
  const V& access(const K& k) const {
    auto pos = entries_.find(k);
    assert(pos != entries_.end());
    return pos->second;
  }

  bool defined(const K& k) const { return entries_.find(k) != entries_.end(); }

  // Returns false if k was not defined.
  bool del(const K& k) { return entries_.erase(k) != 0; }

  void del_item(item it) {
    assert(it);
    auto pos = entries_.find(it->first);
    assert(pos != entries_.end() && &*pos == it);
    entries_.erase(pos);
  }

  int size() const { return static_cast<int>(entries_.size()); }
  bool empty() const { return entries_.empty(); }
  void clear() { entries_.clear(); }

  iterator begin() { return entries_.begin(); }
  iterator end() { return entries_.end(); }
  const_iterator begin() const { return entries_.begin(); }
  const_iterator end() const { return entries_.end(); }

private:
  Tree entries_;
};

} // namespace leda

#endif // HULCVTOOLS_PLATFORM_LEDA_DICTIONARY_H
