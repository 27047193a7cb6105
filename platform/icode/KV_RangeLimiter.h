// KV_RangeLimiter: narrows ranges. The sign restrictions work on float ranges in physical
// units and respect the scaling: the new limit is the nearest value the scaling can
// represent (physical = lsb * k + offset for an integer k) on the required side of zero.
// A restriction never widens a range; a range may become empty (lower > upper).
#ifndef HUL_PLATFORM_ICODE_KV_RANGELIMITER_H
#define HUL_PLATFORM_ICODE_KV_RANGELIMITER_H

#include "platform/support/HulPlatformExport.h"

#include <cstdint>

class KV_NumericalType;
class KV_Range;
class KV_Scaling;

class HUL_PLATFORM_API KV_RangeLimiter {
public:
  // lower >= the smallest representable value > 0.
  static void makePositiveWithoutZeroConsiderScaling(KV_Range& range, const KV_NumericalType* type,
                                                     const KV_Scaling* scaling);
  // lower >= the smallest representable value >= 0.
  static void makePositiveWithZeroConsiderScaling(KV_Range& range, const KV_NumericalType* type,
                                                  const KV_Scaling* scaling);
  // upper <= the largest representable value <= 0.
  static void makeNegativeWithZeroConsiderScaling(KV_Range& range, const KV_NumericalType* type,
                                                  const KV_Scaling* scaling);
  // upper <= the largest representable value < 0.
  static void makeNegativeWithoutZeroConsiderScaling(KV_Range& range, const KV_NumericalType* type,
                                                     const KV_Scaling* scaling);
  // upper = min(upper, limit) / lower = max(lower, limit), in the range's own kind
  // (an integer range takes the integer limits, a float range the double limits).
  static void limitUpper(KV_Range& range, std::int64_t limit);
  static void limitUpper(KV_Range& range, double limit);
  static void limitLower(KV_Range& range, std::int64_t limit);
  static void limitLower(KV_Range& range, double limit);
};

// Multiplies the range by a constant: [a, b] * c, the limits swapped for c < 0. The source
// reference is for the model's diagnostics (none are issued here).
HUL_PLATFORM_API void ASC_MulRangeWithConst(KV_Range& range, double factor,
                                            const class KvCSrcRef* srcRef);

#endif
