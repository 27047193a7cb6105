#include "HulCvTools/ConstInRelationRounder/KvCConstInRelationRounder.h"

#include "HulCvTools/Control/KvCInternalCheck.h"
#include "HulCvTools/ModelInterfaces/ICodeModel.h"
#include "platform/support/FPS.h"

KvCConstInRelationRounder::KvERoundingKind
KvCConstInRelationRounder::determineRoundingKind(KV_OpOperator* op, int operandIndex) const {
  const bool left = operandIndex == 0;
  if (op->isGreater())
    return left ? RoundUp : RoundDown;
  if (op->isGreaterEqual())
    return left ? RoundDown : RoundUp;
  if (op->isLess())
    return left ? RoundDown : RoundUp;
  if (op->isLessEqual())
    return left ? RoundUp : RoundDown;
  return NoDirectedRounding;
}

long long KvCConstInRelationRounder::roundConstant(KvERoundingKind kind, double value) const {
  switch (kind) {
  case RoundUp:
    return FPS_SatCastToInt64(FPS_RoundUp(value));
  case RoundDown:
    return FPS_SatCastToInt64(FPS_RoundDown(value));
  case NoDirectedRounding:
    return FPS_SatCastToInt64(value);
  }
  KV_DEBUG_ASSERT(0);
  return FPS_SatCastToInt64(value);
}

void KvCConstInRelationRounder::scaleAndRoundConstant(KV_OpOperator* op, double value,
                                                      int operandIndex, KV_NumericalType* type,
                                                      KV_Scaling* scaling,
                                                      long long& result) const {
  const bool valid = (operandIndex == 0 || operandIndex == 1) && type &&
                     !type->isExemptFromRangeHandling() && !type->isFloat() &&
                     type->getNumericalType() && op && op->isRelational();
  if (!valid) {
    KV_DEBUG_ASSERT(0);
    result = FPS_SatCastToInt64(value);
    return;
  }
  const double scaled = KvCScaleTool::scaleFloatToFixed(value, scaling);
  if (FPS_IsIntegerValue(scaled)) {
    result = FPS_SatCastToInt64(scaled);
    return;
  }
  result = roundConstant(determineRoundingKind(op, operandIndex), scaled);
}

bool KvCConstInRelationRounder::setRoundingFlagOnConstant(KV_OpOperator* op, int operandIndex,
                                                          KV_Constant* constant) const {
  if (!op->isRelational())
    return false;
  switch (determineRoundingKind(op, operandIndex)) {
  case RoundDown:
    constant->setRoundDown();
    return true;
  case RoundUp:
    constant->setRoundUp();
    return true;
  case NoDirectedRounding:
    return false;
  }
  return false;
}
