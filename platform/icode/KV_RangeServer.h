// KV_RangeServer: the value ranges that the ICode hands out as objects of the run. Today
// this is the undefined range: the range of a value about which nothing is known (a macro
// call, whose value the preprocessor makes), the whole double range [-DBL_MAX, DBL_MAX] as
// a float range. It is one object for the run; isUndefinedRange tells it from a range that
// only has the same limits.
//
// Owned by the factory container (getRangeServer).
#ifndef HUL_PLATFORM_ICODE_KV_RANGESERVER_H
#define HUL_PLATFORM_ICODE_KV_RANGESERVER_H

#include "platform/icode/KV_Range.h"

#include <cfloat>

class HUL_PLATFORM_API KV_RangeServer {
public:
  KV_RangeServer() = default;
  KV_RangeServer(const KV_RangeServer&) = delete;
  KV_RangeServer& operator=(const KV_RangeServer&) = delete;

  // The undefined range of the run; the same object on every call. Callers read it (or
  // copy it); they do not change it.
  const KV_Range* getUndefinedRange() const { return &undefined; }
  bool isUndefinedRange(const KV_Range* range) const { return range == &undefined; }

private:
  KV_Range undefined{-DBL_MAX, DBL_MAX};
};

#endif
