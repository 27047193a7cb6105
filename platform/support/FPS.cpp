#include "platform/support/FPS.h"

#include <algorithm>
#include <cfloat>
#include <cmath>
#include <limits>

double FPS_RoundUp(double value) { return std::ceil(value); }

double FPS_RoundDown(double value) { return std::floor(value); }

bool FPS_IsIntegerValue(double value) { return std::isfinite(value) && std::trunc(value) == value; }

bool FPS_ValuesAreEqual(double a, double b) {
  if (a == b)
    return true;
  if (!std::isfinite(a) || !std::isfinite(b))
    return false;
  return std::fabs(a - b) <= 4.0 * DBL_EPSILON * std::max(std::fabs(a), std::fabs(b));
}

std::int64_t FPS_SatCastToInt64(double value) {
  // 2^63 is exactly representable; every double below it and >= -2^63 converts.
  constexpr double twoTo63 = 9223372036854775808.0;
  if (std::isnan(value))
    return 0;
  if (value >= twoTo63)
    return std::numeric_limits<std::int64_t>::max();
  if (value < -twoTo63)
    return std::numeric_limits<std::int64_t>::min();
  return static_cast<std::int64_t>(value);
}
