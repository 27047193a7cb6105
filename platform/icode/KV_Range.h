// KV_Range: a closed value range [lower, upper], either of doubles (a float range) or of
// signed 64-bit integers (an integer range, for implemented fixed-point values). Both
// views are always available: an integer range reads as doubles exactly where the values
// are representable; a float range reads as integers rounded outwards (lower down, upper
// up) and saturated to the 64-bit limits (NaN reads as 0).
#ifndef HUL_PLATFORM_ICODE_KV_RANGE_H
#define HUL_PLATFORM_ICODE_KV_RANGE_H

#include "platform/support/HulPlatformExport.h"

#include <cstdint>

class HUL_PLATFORM_API KV_Range {
public:
  // The float range [0, 0].
  KV_Range() = default;
  KV_Range(double lower, double upper) : floatLower(lower), floatUpper(upper) {}
  static KV_Range makeIntRange(std::int64_t lower, std::int64_t upper);

  bool isIntRange() const { return integer; }
  double getFloatLowerLimit() const;
  double getFloatUpperLimit() const;
  std::int64_t getInt64LowerLimit() const;
  std::int64_t getInt64UpperLimit() const;

  // Copies the limits (and the kind) of `other`.
  void setLimits(const KV_Range& other) { *this = other; }
  void setFloatLimits(double lower, double upper);
  // Makes this the integer range [lower, upper]. The upper limit comes first.
  void toIntRange(std::int64_t upper, std::int64_t lower);

private:
  bool integer = false;
  double floatLower = 0.0;
  double floatUpper = 0.0;
  std::int64_t intLower = 0;
  std::int64_t intUpper = 0;
};

#endif
