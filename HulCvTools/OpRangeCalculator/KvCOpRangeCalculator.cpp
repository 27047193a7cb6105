#include "HulCvTools/OpRangeCalculator/KvCOpRangeCalculator.h"

#include "HulCvTools/ConstInRelationRounder/KvCConstInRelationRounder.h"
#include "HulCvTools/Control/KvCInternalCheck.h"
#include "HulCvTools/ModelInterfaces/ICodeModel.h"

bool KvCOpRangeCalculator::checkAbsForSimplification(KV_ExprLocation* argument,
                                                     KV_NumericalType* type, KV_Scaling* scaling,
                                                     bool& neverNegative, bool& neverPositive) {
  neverNegative = false;
  neverPositive = false;
  double lower = 0.0;
  double upper = 0.0;
  KV_Operation* calc = argument->getCalcOperation();
  if (calc && calc->getConversionInfo() && calc->getConversionInfo()->calculateProtected()) {
    KV_Range ScaledRange;
    ScaledRange.setLimits(calc->getResultRange());
    KvCRangeConverter::scaleToFloat(ScaledRange, scaling);
    lower = ScaledRange.getFloatLowerLimit();
    upper = ScaledRange.getFloatUpperLimit();
  } else if (argument->getQualifiedSymbolOp()) {
    KV_Range ArgRange;
    argument->getValueRange(ArgRange);
    KvCRangeConverter::scaleToFloat(ArgRange, scaling);
    lower = ArgRange.getFloatLowerLimit();
    upper = ArgRange.getFloatUpperLimit();
  } else {
    lower = KvCScaleTool::calcImplementedMin(type, scaling);
    upper = KvCScaleTool::calcImplementedMax(type, scaling);
  }
  if (lower >= 0.0)
    neverNegative = true;
  else if (upper <= 0.0)
    neverPositive = true;
  return true;
}

void KvCOpRangeCalculator::toImplementedIntRange(KV_OpOperator* op, KV_Range& range,
                                                 KV_NumericalType* type,
                                                 KV_Scaling* scaling) const {
  // The limits stand on the right-hand side of the relation (operand index 1).
  const KvCConstInRelationRounder rounder;
  long long upper = 0;
  long long lower = 0;
  rounder.scaleAndRoundConstant(op, range.getFloatUpperLimit(), 1, type, scaling, upper);
  rounder.scaleAndRoundConstant(op, range.getFloatLowerLimit(), 1, type, scaling, lower);
  range.toIntRange(upper, lower);
}

bool KvCOpRangeCalculator::calcRangesForAbs(KV_OpOperator* pRelatOperator,
                                            const KV_Range& argumentRange, KV_NumericalType* type,
                                            KV_Scaling* scaling, const KvCSrcRef* srcRef,
                                            KV_Range& plainRange, KV_Range& negatedRange) {
  plainRange.setLimits(argumentRange);
  negatedRange.setLimits(argumentRange);
  if (pRelatOperator->isGreater()) {
    // Zero goes to the negated branch.
    KV_RangeLimiter::makePositiveWithoutZeroConsiderScaling(plainRange, type, scaling);
  } else {
    KV_DEBUG_ASSERT(pRelatOperator->isGreaterEqual());
    KV_RangeLimiter::makePositiveWithZeroConsiderScaling(plainRange, type, scaling);
  }
  toImplementedIntRange(pRelatOperator, plainRange, type, scaling);

  if (pRelatOperator->isGreater())
    KV_RangeLimiter::makeNegativeWithZeroConsiderScaling(negatedRange, type, scaling);
  else
    KV_RangeLimiter::makeNegativeWithoutZeroConsiderScaling(negatedRange, type, scaling);
  ASC_MulRangeWithConst(negatedRange, -1.0, srcRef);
  toImplementedIntRange(pRelatOperator, negatedRange, type, scaling);
  return true;
}

bool KvCOpRangeCalculator::checkSaturation(const KV_Range& range, KV_OpSaturationInfo* saturation,
                                           bool& upper, bool& lower) {
  upper = false;
  lower = false;
  if (!saturation->saturateAny())
    return true;
  if (saturation->saturateUpper()) {
    upper = saturation->isUpperLimitConstantValue()
                ? range.getInt64UpperLimit() > saturation->getUpperLimit()
                : true;
  }
  if (!saturation->saturateLower())
    return true;
  lower = saturation->isLowerLimitConstantValue()
              ? range.getInt64LowerLimit() < saturation->getLowerLimit()
              : true;
  return true;
}

bool KvCOpRangeCalculator::checkSaturationForAbs(const KV_Range& plainRange,
                                                 const KV_Range& negatedRange,
                                                 KV_OpSaturationInfo* saturation, bool& plainUpper,
                                                 bool& plainLower, bool& negatedUpper,
                                                 bool& negatedLower) {
  plainUpper = plainLower = negatedUpper = negatedLower = false;
  const bool first = checkSaturation(plainRange, saturation, plainUpper, plainLower);
  const bool second = checkSaturation(negatedRange, saturation, negatedUpper, negatedLower);
  return first && second;
}

bool KvCOpRangeCalculator::saturateRange(KV_Range& range, KV_NumericalType* type,
                                         KV_OpSaturationInfo* saturation) {
  if (!saturation || !saturation->saturateAny() || !type)
    return true;
  if (type->isExemptFromRangeHandling())
    return true;
  if (saturation->saturateUpper() && saturation->isUpperLimitConstantValue()) {
    if (type->isFloat())
      KV_RangeLimiter::limitUpper(range, saturation->getFloatUpperLimit());
    else
      KV_RangeLimiter::limitUpper(range, saturation->getUpperLimit());
  }
  if (!saturation->saturateLower() || !saturation->isLowerLimitConstantValue())
    return true;
  if (type->isFloat())
    KV_RangeLimiter::limitLower(range, saturation->getFloatLowerLimit());
  else
    KV_RangeLimiter::limitLower(range, saturation->getLowerLimit());
  return true;
}
