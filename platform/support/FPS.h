// Floating-point helpers of the code generator's utility library.
//
// FPS_ValuesAreEqual uses a relative tolerance of 4 ulp-sized steps:
//   a == b, or both finite and |a - b| <= 4 * DBL_EPSILON * max(|a|, |b|).
// So 0.1 + 0.2 equals 0.3, while 1.0 and 0.99999999 differ; NaN equals nothing and an
// infinity only itself. FPS_IsIntegerValue is exact (no tolerance): a value just off an
// integer is not integral.
#ifndef HUL_PLATFORM_SUPPORT_FPS_H
#define HUL_PLATFORM_SUPPORT_FPS_H

#include "platform/support/HulPlatformExport.h"

#include <cstdint>

// Smallest integral double >= value (the value itself for NaN and infinities).
HUL_PLATFORM_API double FPS_RoundUp(double value);
// Largest integral double <= value (the value itself for NaN and infinities).
HUL_PLATFORM_API double FPS_RoundDown(double value);
// True for finite values without a fractional part.
HUL_PLATFORM_API bool FPS_IsIntegerValue(double value);
HUL_PLATFORM_API bool FPS_ValuesAreEqual(double a, double b);
// Truncates towards zero into int64, saturating at INT64_MIN and INT64_MAX (also for
// infinities). NaN converts to 0.
HUL_PLATFORM_API std::int64_t FPS_SatCastToInt64(double value);

#endif
