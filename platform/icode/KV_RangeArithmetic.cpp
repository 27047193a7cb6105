// The model's range arithmetic: ranges, saturation descriptions, scaling conversions and
// range narrowing.
#include "platform/icode/KV_DataType.h"
#include "platform/icode/KV_OpSaturationInfo.h"
#include "platform/icode/KV_Range.h"
#include "platform/icode/KV_RangeLimiter.h"
#include "platform/icode/KV_Scaling.h"
#include "platform/icode/KvCRangeConverter.h"
#include "platform/icode/KvCScaleTool.h"
#include "platform/support/FPS.h"

#include <algorithm>
#include <cfloat>
#include <cmath>
#include <limits>

// --- KV_Range

KV_Range KV_Range::makeIntRange(std::int64_t lower, std::int64_t upper) {
  KV_Range range;
  range.toIntRange(upper, lower);
  return range;
}

double KV_Range::getFloatLowerLimit() const {
  return integer ? static_cast<double>(intLower) : floatLower;
}

double KV_Range::getFloatUpperLimit() const {
  return integer ? static_cast<double>(intUpper) : floatUpper;
}

std::int64_t KV_Range::getInt64LowerLimit() const {
  return integer ? intLower : FPS_SatCastToInt64(std::floor(floatLower));
}

std::int64_t KV_Range::getInt64UpperLimit() const {
  return integer ? intUpper : FPS_SatCastToInt64(std::ceil(floatUpper));
}

void KV_Range::setFloatLimits(double lower, double upper) {
  integer = false;
  floatLower = lower;
  floatUpper = upper;
}

void KV_Range::toIntRange(std::int64_t upper, std::int64_t lower) {
  integer = true;
  intLower = lower;
  intUpper = upper;
}

// --- KV_OpSaturationInfo

void KV_OpSaturationInfo::setUpperLimit(std::int64_t limit, double floatLimit) {
  upper = true;
  upperConstant = true;
  upperLimit = limit;
  floatUpperLimit = floatLimit;
}

void KV_OpSaturationInfo::setLowerLimit(std::int64_t limit, double floatLimit) {
  lower = true;
  lowerConstant = true;
  lowerLimit = limit;
  floatLowerLimit = floatLimit;
}

void KV_OpSaturationInfo::setUpperLimitVariable() {
  upper = true;
  upperConstant = false;
}

void KV_OpSaturationInfo::setLowerLimitVariable() {
  lower = true;
  lowerConstant = false;
}

// --- KvCScaleTool, KvCRangeConverter

namespace {
double lsbOf(const KV_Scaling* s) { return s ? s->getLsb() : 1.0; }
double offsetOf(const KV_Scaling* s) { return s ? s->getOffset() : 0.0; }
} // namespace

double KvCScaleTool::scaleFloatToFixed(double physical, const KV_Scaling* scaling) {
  return (physical - offsetOf(scaling)) / lsbOf(scaling);
}

double KvCScaleTool::scaleFixedToFloat(double implemented, const KV_Scaling* scaling) {
  return lsbOf(scaling) * implemented + offsetOf(scaling);
}

double KvCScaleTool::calcImplementedMin(const KV_NumericalType* type, const KV_Scaling* scaling) {
  if (!type || type->isFloat())
    return -DBL_MAX;
  const double a = scaleFixedToFloat(static_cast<double>(type->getMinValue()), scaling);
  const double b = scaleFixedToFloat(static_cast<double>(type->getMaxValue()), scaling);
  return std::min(a, b);
}

double KvCScaleTool::calcImplementedMax(const KV_NumericalType* type, const KV_Scaling* scaling) {
  if (!type || type->isFloat())
    return DBL_MAX;
  const double a = scaleFixedToFloat(static_cast<double>(type->getMinValue()), scaling);
  const double b = scaleFixedToFloat(static_cast<double>(type->getMaxValue()), scaling);
  return std::max(a, b);
}

void KvCRangeConverter::scaleToFloat(KV_Range& range, const KV_Scaling* scaling) {
  const double a = KvCScaleTool::scaleFixedToFloat(range.getFloatLowerLimit(), scaling);
  const double b = KvCScaleTool::scaleFixedToFloat(range.getFloatUpperLimit(), scaling);
  // Only a negative LSB swaps the limits: an empty range stays empty, a NaN limit stays put.
  if (lsbOf(scaling) < 0.0)
    range.setFloatLimits(b, a);
  else
    range.setFloatLimits(a, b);
}

// --- KV_RangeLimiter

namespace {

// The representable physical values are offset + step * k for integers k (step = |lsb|);
// for a floating-point type every double.
struct Grid {
  Grid(const KV_NumericalType* type, const KV_Scaling* scaling)
      : continuous(type && type->isFloat()), step(std::fabs(lsbOf(scaling))),
        offset(offsetOf(scaling)) {}
  double at(double k) const { return offset + step * k; }

  double smallestAbove(bool includeZero) const {
    if (continuous)
      return includeZero ? 0.0 : std::numeric_limits<double>::denorm_min();
    double k = includeZero ? std::ceil(-offset / step) : std::floor(-offset / step) + 1;
    // Rounding may leave the first guess one step short; where the grid is coarser than
    // the doubles a few steps are enough.
    for (int guard = 0; guard < 4 && (includeZero ? at(k) < 0.0 : at(k) <= 0.0); ++guard)
      k += 1;
    return at(k);
  }

  double largestBelow(bool includeZero) const {
    if (continuous)
      return includeZero ? 0.0 : -std::numeric_limits<double>::denorm_min();
    double k = includeZero ? std::floor(-offset / step) : std::ceil(-offset / step) - 1;
    for (int guard = 0; guard < 4 && (includeZero ? at(k) > 0.0 : at(k) >= 0.0); ++guard)
      k -= 1;
    return at(k);
  }

  bool continuous;
  double step;
  double offset;
};

void raiseLower(KV_Range& range, double lower) {
  range.setFloatLimits(std::max(range.getFloatLowerLimit(), lower), range.getFloatUpperLimit());
}

void lowerUpper(KV_Range& range, double upper) {
  range.setFloatLimits(range.getFloatLowerLimit(), std::min(range.getFloatUpperLimit(), upper));
}

} // namespace

void KV_RangeLimiter::makePositiveWithoutZeroConsiderScaling(KV_Range& range,
                                                             const KV_NumericalType* type,
                                                             const KV_Scaling* scaling) {
  raiseLower(range, Grid(type, scaling).smallestAbove(false));
}

void KV_RangeLimiter::makePositiveWithZeroConsiderScaling(KV_Range& range,
                                                          const KV_NumericalType* type,
                                                          const KV_Scaling* scaling) {
  raiseLower(range, Grid(type, scaling).smallestAbove(true));
}

void KV_RangeLimiter::makeNegativeWithZeroConsiderScaling(KV_Range& range,
                                                          const KV_NumericalType* type,
                                                          const KV_Scaling* scaling) {
  lowerUpper(range, Grid(type, scaling).largestBelow(true));
}

void KV_RangeLimiter::makeNegativeWithoutZeroConsiderScaling(KV_Range& range,
                                                             const KV_NumericalType* type,
                                                             const KV_Scaling* scaling) {
  lowerUpper(range, Grid(type, scaling).largestBelow(false));
}

void KV_RangeLimiter::limitUpper(KV_Range& range, std::int64_t limit) {
  if (range.isIntRange())
    range.toIntRange(std::min(range.getInt64UpperLimit(), limit), range.getInt64LowerLimit());
  else
    lowerUpper(range, static_cast<double>(limit));
}

void KV_RangeLimiter::limitUpper(KV_Range& range, double limit) {
  if (!range.isIntRange()) {
    lowerUpper(range, limit);
    return;
  }
  const std::int64_t upper = FPS_SatCastToInt64(std::floor(limit));
  range.toIntRange(std::min(range.getInt64UpperLimit(), upper), range.getInt64LowerLimit());
}

void KV_RangeLimiter::limitLower(KV_Range& range, std::int64_t limit) {
  if (range.isIntRange())
    range.toIntRange(range.getInt64UpperLimit(), std::max(range.getInt64LowerLimit(), limit));
  else
    raiseLower(range, static_cast<double>(limit));
}

void KV_RangeLimiter::limitLower(KV_Range& range, double limit) {
  if (!range.isIntRange()) {
    raiseLower(range, limit);
    return;
  }
  const std::int64_t lower = FPS_SatCastToInt64(std::ceil(limit));
  range.toIntRange(range.getInt64UpperLimit(), std::max(range.getInt64LowerLimit(), lower));
}

void ASC_MulRangeWithConst(KV_Range& range, double factor, const KvCSrcRef* /*srcRef*/) {
  const double a = range.getFloatLowerLimit() * factor;
  const double b = range.getFloatUpperLimit() * factor;
  // Only a negative factor swaps the limits: an empty range stays empty.
  if (factor < 0.0)
    range.setFloatLimits(b, a);
  else
    range.setFloatLimits(a, b);
}
