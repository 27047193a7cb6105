// KvCNameSpace: the set of names taken in one scope of generated C code (a file, a
// function body). Look-up, insertion and removal are O(1) on average.
#ifndef HUL_PLATFORM_SUPPORT_KVCNAMESPACE_H
#define HUL_PLATFORM_SUPPORT_KVCNAMESPACE_H

#include "platform/support/HulPlatformExport.h"
#include "platform/support/WmCXString.h"

#include <unordered_set>

class HUL_PLATFORM_API KvCNameSpace {
public:
  // False when the name is taken already.
  bool add(const WmCXString& name);
  // False when the name was not there.
  bool remove(const WmCXString& name);
  bool contains(const WmCXString& name) const { return names.count(name) != 0; }
  std::size_t size() const { return names.size(); }
  // `base` if free, else the first free `base_<n>` with n = 1, 2, ...; the name is not
  // taken by this call.
  WmCXString getUniqueName(const WmCXString& base) const;

private:
  std::unordered_set<WmCXString> names;
};

#endif
