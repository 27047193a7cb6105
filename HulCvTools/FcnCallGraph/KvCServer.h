// KvCServer: a small keyed object server: a hashed map from keys to entries, each entry
// owning one object. It hands out the object of a key, finds an object equal to a given
// one (compareServerEntry of the object class) and takes new objects under a key.
//
// Ownership: the server owns its map, every entry and, through the entries, every object
// it was given; the destructor deletes them all. An object found equal to a stored one is
// deleted and replaced by the stored one. Taking a new object under a key in use releases
// the earlier entry and its object. Copying is deleted: a copy would delete the entries
// twice.
//
// Order: scans follow the map's order (keys in the order they were first stored).
// The library exports the instantiation KvCServer<int, KvCSignal>.
#ifndef HULCVTOOLS_FCNCALLGRAPH_KVCSERVER_H
#define HULCVTOOLS_FCNCALLGRAPH_KVCSERVER_H

#include "HulCvTools/Control/KvCHeapObject.h"
#include "HulCvTools/Control/KvCInternalCheck.h"
#include "HulCvTools/FcnCallGraph/KvCServerEntry.h"
#include "HulCvTools/HulCvToolsExport.h"
#include "HulCvTools/ModelInterfaces/ViewFwd.h"
#include "platform/leda/map.h"

#include <new>

template <class K, class T> class KvCServer {
public:
  using Entry = KvCServerEntry<K, T>;
  using EntryMap = leda::map<K, Entry*>;

  // Makes the map (from the memory controller; without it every entry is refused).
  KvCServer();
  // Deletes every entry with its object, then the map.
  virtual ~KvCServer();
  KvCServer(const KvCServer&) = delete;
  KvCServer& operator=(const KvCServer&) = delete;

  // When a stored object equals `object`: deletes `object` (unless null), sets it to the
  // stored one and `key` to that entry's key, true. Otherwise false, nothing changed.
  // O(entries).
  virtual bool sameObjectAlreadyDefined(T*& object, K& key);
  // Stores `object` (taking ownership) under `key`; false, taking nothing, for a null
  // object or when no entry could be made. A key already in use is an internal check
  // (message 10007, number 211): the earlier entry and its object are released and the new
  // one is stored. O(1) expected.
  virtual bool createNewEntry(K key, T* object);
  // The object stored under the key, or null. O(1) expected.
  T* getObject(K key) const;

private:
  EntryMap* entries;
};

template <class K, class T> KvCServer<K, T>::KvCServer() : entries(nullptr) {
  void* place = ::hulcv_detail::allocObject(sizeof(EntryMap));
  if (place)
    entries = ::new (place) EntryMap();
}

template <class K, class T> KvCServer<K, T>::~KvCServer() {
  if (!entries)
    return;
  for (auto& keyed : *entries)
    delete keyed.second;
  entries->clear();
  entries->~EntryMap();
  ::hulcv_detail::freeObject(entries);
  entries = nullptr;
}

template <class K, class T> T* KvCServer<K, T>::getObject(K key) const {
  if (!entries || !entries->defined(key))
    return nullptr;
  const EntryMap& map = *entries;
  Entry* entry = map[key];
  return entry ? entry->getObject() : nullptr;
}

template <class K, class T> bool KvCServer<K, T>::sameObjectAlreadyDefined(T*& object, K& key) {
  if (!entries)
    return false;
  for (auto& keyed : *entries) {
    Entry* entry = keyed.second;
    if (!entry || !entry->getObject() || !entry->getObject()->compareServerEntry(object))
      continue;
    if (object && object != entry->getObject())
      delete object;
    object = entry->getObject();
    key = entry->getKey();
    return true;
  }
  return false;
}

template <class K, class T> bool KvCServer<K, T>::createNewEntry(K key, T* object) {
  if (!object || !entries)
    return false;
  Entry* entry = new Entry(object, key);
  if (!entry)
    return false;
  Entry*& slot = (*entries)[key];
  if (slot) {
    KV_INTERNAL_CHECK(__FILE__, 211);
    if (slot->getObject() == object) {
      // The same object under the same key: the earlier entry must not delete it.
      delete entry;
      return true;
    }
    delete slot;
  }
  slot = entry;
  return true;
}

extern template class HULCV_API KvCServer<int, KvCSignal>;

#endif
