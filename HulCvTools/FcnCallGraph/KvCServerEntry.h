// KvCServerEntry: one entry of a keyed object server (KvCServer): the object, which the
// entry owns, its key, and a use count (1 from construction; kept for the view library,
// not read here).
//
// The destructor deletes the object. Copying is deleted: a copy would delete the object
// twice.
#ifndef HULCVTOOLS_FCNCALLGRAPH_KVCSERVERENTRY_H
#define HULCVTOOLS_FCNCALLGRAPH_KVCSERVERENTRY_H

#include "HulCvTools/Control/KvCHeapObject.h"
#include "HulCvTools/HulCvToolsExport.h"
#include "HulCvTools/ModelInterfaces/ViewFwd.h"

template <class K, class T> class KvCServerEntry {
public:
  KvCServerEntry(T* ownedObject, K entryKey) : object(ownedObject), key(entryKey) {}
  ~KvCServerEntry();
  KvCServerEntry(const KvCServerEntry&) = delete;
  KvCServerEntry& operator=(const KvCServerEntry&) = delete;

  T* getObject() const { return object; }
  K getKey() const { return key; }
  int getUseCount() const { return useCount; }

  static void* operator new(std::size_t size) noexcept;
  static void operator delete(void* entry) noexcept;

private:
  T* object;
  K key;
  int useCount = 1;
};

template <class K, class T> KvCServerEntry<K, T>::~KvCServerEntry() {
  delete object;
  object = nullptr;
}

template <class K, class T> void* KvCServerEntry<K, T>::operator new(std::size_t size) noexcept {
  return ::hulcv_detail::allocObject(size);
}

template <class K, class T> void KvCServerEntry<K, T>::operator delete(void* entry) noexcept {
  ::hulcv_detail::freeObject(entry);
}

// The instantiation the library exports.
extern template class HULCV_API KvCServerEntry<int, KvCSignal>;

#endif
