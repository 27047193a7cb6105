// leda::map<K, V>: a hashed key -> value map that iterates in insertion order.
//
// Entries live in chunked storage (a deque, so they never move) and are linked in the
// order their keys were first defined; an open-addressing index (linear probing,
// deletion by backward shift) maps keys to entries. Each index slot keeps the key's hash
// next to the entry number, so a lookup reads one slot run and the one entry it answers.
// Access, define and undefine are O(1) on average. Undefining a key and defining it
// again moves it to the end; the storage of undefined entries is reused. Reading an
// undefined key through a non-const map defines it with the default value; through a
// const map it yields the default without defining.
#ifndef HULCVTOOLS_PLATFORM_LEDA_MAP_H
#define HULCVTOOLS_PLATFORM_LEDA_MAP_H

#include <cstddef>
#include <cstdint>
#include <deque>
#include <functional>
#include <iterator>
#include <optional>
#include <utility>
#include <vector>

namespace leda {

// Owns its entries; copies are deep. Iterators and value references stay
// valid until their key is undefined or the map is cleared.
template <class K, class V, class Hash = std::hash<K>> class map {
public:
  using value_type = std::pair<const K, V>;

private:
  static constexpr int kNone = -1;

  struct Entry {
    std::optional<value_type> kv;
    int prev = kNone;
    int next = kNone;
  };
  using Entries = std::deque<Entry>;

  struct Slot {
    std::size_t hash = 0;
    int entry = kNone; // kNone: empty slot
  };

  template <class EntriesRef, class Value> class Iter {
  public:
    using iterator_category = std::bidirectional_iterator_tag;
    using value_type = std::remove_const_t<Value>;
    using difference_type = std::ptrdiff_t;
    using pointer = Value*;
    using reference = Value&;

    Iter() = default;
    Iter(EntriesRef* entries, int at, int last) : entries_(entries), at_(at), last_(last) {}
    template <class OtherRef, class OtherValue>
    Iter(const Iter<OtherRef, OtherValue>& other)
        : entries_(other.entries_), at_(other.at_), last_(other.last_) {}

    reference operator*() const { return *(*entries_)[static_cast<std::size_t>(at_)].kv; }
    pointer operator->() const { return &**this; }
    Iter& operator++() {
      at_ = (*entries_)[static_cast<std::size_t>(at_)].next;
      return *this;
    }
    Iter operator++(int) {
      Iter old = *this;
      ++*this;
      return old;
    }
    Iter& operator--() {
      at_ = at_ == kNone ? last_ : (*entries_)[static_cast<std::size_t>(at_)].prev;
      return *this;
    }
    Iter operator--(int) {
      Iter old = *this;
      --*this;
      return old;
    }
    bool operator==(const Iter& other) const { return at_ == other.at_; }

  private:
    template <class, class> friend class Iter;
    EntriesRef* entries_ = nullptr;
    int at_ = kNone;
    int last_ = kNone; // the last entry when the iterator was made, for --end()
  };

public:
  using iterator = Iter<Entries, value_type>;
  using const_iterator = Iter<const Entries, const value_type>;

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
    const std::size_t h = hashOf(k);
    const std::size_t found = findSlot(k, h);
    if (found != kNoSlot)
      return entryAt(slots_[found].entry).kv->second;
    return entryAt(insertNew(k, h)).kv->second;
  }

  const V& operator[](const K& k) const {
    const std::size_t found = findSlot(k, hashOf(k));
    return found == kNoSlot ? def_ : entryAt(slots_[found].entry).kv->second;
  }

  bool defined(const K& k) const { return findSlot(k, hashOf(k)) != kNoSlot; }

  // Returns false if k was not defined.
  bool undefine(const K& k) {
    const std::size_t found = findSlot(k, hashOf(k));
    if (found == kNoSlot)
      return false;
    const int e = slots_[found].entry;
    eraseSlot(found);
    unlink(e);
    entryAt(e).kv.reset();
    entryAt(e).next = freeEntry_;
    freeEntry_ = e;
    --count_;
    return true;
  }

  int size() const { return count_; }
  bool empty() const { return count_ == 0; }
  void clear() {
    slots_.clear();
    entries_.clear();
    first_ = last_ = freeEntry_ = kNone;
    count_ = 0;
  }

  iterator begin() { return iterator(&entries_, first_, last_); }
  iterator end() { return iterator(&entries_, kNone, last_); }
  const_iterator begin() const { return const_iterator(&entries_, first_, last_); }
  const_iterator end() const { return const_iterator(&entries_, kNone, last_); }

private:
  static constexpr std::size_t kNoSlot = ~std::size_t{0};

  // Spreads the hash over all bits: std::hash of a pointer or integer is the identity,
  // which would cluster the probe runs.
  static std::size_t hashOf(const K& k) {
    std::uint64_t h = static_cast<std::uint64_t>(Hash{}(k));
    h ^= h >> 33;
    h *= 0xff51afd7ed558ccdULL;
    h ^= h >> 33;
    h *= 0xc4ceb9fe1a85ec53ULL;
    h ^= h >> 33;
    return static_cast<std::size_t>(h);
  }

  std::size_t mask() const { return slots_.size() - 1; }

  Entry& entryAt(int e) { return entries_[static_cast<std::size_t>(e)]; }
  const Entry& entryAt(int e) const { return entries_[static_cast<std::size_t>(e)]; }

  std::size_t findSlot(const K& k, std::size_t h) const {
    if (slots_.empty())
      return kNoSlot;
    for (std::size_t i = h & mask(); slots_[i].entry != kNone; i = (i + 1) & mask()) {
      if (slots_[i].hash == h && entryAt(slots_[i].entry).kv->first == k)
        return i;
    }
    return kNoSlot;
  }

  // Defines k (known to be undefined) with the default value at the end of the order.
  int insertNew(const K& k, std::size_t h) {
    if ((static_cast<std::size_t>(count_) + 1) * 4 > slots_.size() * 3)
      rehash(slots_.empty() ? 16 : slots_.size() * 2);
    int e = freeEntry_;
    if (e != kNone) {
      freeEntry_ = entryAt(e).next;
    } else {
      e = static_cast<int>(entries_.size());
      entries_.emplace_back();
    }
    Entry& entry = entryAt(e);
    entry.kv.emplace(k, def_);
    entry.prev = last_;
    entry.next = kNone;
    (last_ == kNone ? first_ : entryAt(last_).next) = e;
    last_ = e;
    placeSlot(Slot{h, e});
    ++count_;
    return e;
  }

  void placeSlot(Slot s) {
    std::size_t i = s.hash & mask();
    while (slots_[i].entry != kNone)
      i = (i + 1) & mask();
    slots_[i] = s;
  }

  void rehash(std::size_t size) {
    std::vector<Slot> old = std::move(slots_);
    slots_.assign(size, Slot{});
    for (const Slot& s : old)
      if (s.entry != kNone)
        placeSlot(s);
  }

  // Backward shift: later entries of the probe run move into the gap when their home
  // lies cyclically at or before it.
  void eraseSlot(std::size_t i) {
    std::size_t gap = i;
    for (std::size_t j = (gap + 1) & mask(); slots_[j].entry != kNone; j = (j + 1) & mask()) {
      const std::size_t home = slots_[j].hash & mask();
      const bool movable = gap <= j ? (home <= gap || home > j) : (home <= gap && home > j);
      if (movable) {
        slots_[gap] = slots_[j];
        gap = j;
      }
    }
    slots_[gap] = Slot{};
  }

  void unlink(int e) {
    Entry& entry = entryAt(e);
    (entry.prev == kNone ? first_ : entryAt(entry.prev).next) = entry.next;
    (entry.next == kNone ? last_ : entryAt(entry.next).prev) = entry.prev;
  }

  void copyEntries(const map& other) {
    for (const value_type& kv : other)
      entryAt(insertNew(kv.first, hashOf(kv.first))).kv->second = kv.second;
  }

  V def_{};
  Entries entries_;
  std::vector<Slot> slots_;
  int first_ = kNone;
  int last_ = kNone;
  int freeEntry_ = kNone;
  int count_ = 0;
};

} // namespace leda

#endif // HULCVTOOLS_PLATFORM_LEDA_MAP_H
