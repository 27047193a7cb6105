#include "platform/support/KvCNameSpace.h"

bool KvCNameSpace::add(const WmCXString& name) { return names.insert(name).second; }

bool KvCNameSpace::remove(const WmCXString& name) { return names.erase(name) != 0; }

WmCXString KvCNameSpace::getUniqueName(const WmCXString& base) const {
  if (!contains(base))
    return base;
  for (long long n = 1;; ++n) {
    WmCXString candidate = base + "_" + WmCXString(n, false, false);
    if (!contains(candidate))
      return candidate;
  }
}
