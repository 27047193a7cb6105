// leda::map<K, V>: a hashed key -> value map that iterates in insertion order.
//
// Entries live in a linked list in the order their keys were first defined; a
// hash index maps keys to list positions. Access, define and undefine are O(1)
// on average. Undefining a key and defining it again moves it to the end.
// Reading an undefined key through a non-const map defines it with the
// default value; through a const map it yields the default without defining.
#ifndef HULCVTOOLS_PLATFORM_LEDA_MAP_H
#define HULCVTOOLS_PLATFORM_LEDA_MAP_H

#include <functional>
#include <list>
#include <unordered_map>
#include <utility>

namespace leda {

// Owns its entries; copies are deep. Iterators and value references stay
// valid until their key is undefined or the map is cleared.
template <class K, class V, class Hash = std::hash<K>> class map {
  using Entries = std::list<std::pair<const K, V>>;

public:
  using value_type = std::pair<const K, V>;
  using iterator = typename Entries::iterator;
  using const_iterator = typename Entries::const_iterator;

  map() = default;
  explicit map(V def) : def_(std::move(def)) {}

  map(const map& other) : def_(other.def_) { copyEntries(other); }
  map& operator=(const map& other) {
    if (this == &other)
      return *this;
    clear();
    def_ = other.def_;
    copyEntries(other);
    return *this;
  }
  map(map&&) = default;
  map& operator=(map&&) = default;

  V& operator[](const K& k) {
    auto found = index_.find(k);
    if (found != index_.end())
      return found->second->second;
    entries_.emplace_back(k, def_);
    index_.emplace(k, std::prev(entries_.end()));
    return entries_.back().second;
  }

  const V& operator[](const K& k) const {
    auto found = index_.find(k);
    return found == index_.end() ? def_ : found->second->second;
  }

  bool defined(const K& k) const { return index_.find(k) != index_.end(); }

  // Returns false if k was not defined.
  bool undefine(const K& k) {
    auto found = index_.find(k);
    if (found == index_.end())
      return false;
    entries_.erase(found->second);
    index_.erase(found);
    return true;
  }

  int size() const { return static_cast<int>(entries_.size()); }
  bool empty() const { return entries_.empty(); }
  void clear() {
    index_.clear();
    entries_.clear();
  }

  iterator begin() { return entries_.begin(); }
  iterator end() { return entries_.end(); }
  const_iterator begin() const { return entries_.begin(); }
  const_iterator end() const { return entries_.end(); }

private:
  void copyEntries(const map& other) {
    index_.reserve(other.index_.size());
    for (const value_type& entry : other.entries_) {
      entries_.push_back(entry);
      index_.emplace(entry.first, std::prev(entries_.end()));
    }
  }

  V def_{};
  Entries entries_;
  std::unordered_map<K, iterator, Hash> index_;
};

} // namespace leda

#endif // HULCVTOOLS_PLATFORM_LEDA_MAP_H
