// KvCConstInRelationRounder: expresses a constant compared with a fixed-point value in
// that value's implemented (integer) units, rounding a non-integral scaled constant in the
// direction that keeps the relation exact over the integers:
//   x > c  ->  x > floor(c)     x >= c  ->  x >= ceil(c)
//   c > x  ->  ceil(c) > x      c >= x  ->  floor(c) >= x     (and likewise < and <=)
// The direction comes from the operator and the side (operand index) of the constant.
// Results beyond the signed 64-bit range saturate. No state: make one on the stack.
#ifndef HULCVTOOLS_CONSTINRELATIONROUNDER_KVCCONSTINRELATIONROUNDER_H
#define HULCVTOOLS_CONSTINRELATIONROUNDER_KVCCONSTINRELATIONROUNDER_H

#include "HulCvTools/HulCvToolsExport.h"
#include "HulCvTools/ModelInterfaces/ICodeFwd.h"

class HULCV_API KvCConstInRelationRounder {
public:
  enum KvERoundingKind : int { RoundUp = 1, RoundDown = 2, NoDirectedRounding = 3 };

  KvCConstInRelationRounder() = default;
  ~KvCConstInRelationRounder() = default;

  // The direction for a constant at `operandIndex` (0: left, anything else: right) of an
  // ordering relation; NoDirectedRounding for any other operator.
  KvERoundingKind determineRoundingKind(KV_OpOperator* op, int operandIndex) const;
  // The value in implemented units rounded as `kind` says, saturated to 64 bits.
  long long roundConstant(KvERoundingKind kind, double value) const;
  // The physical `value`, scaled to the type's implemented units with `scaling` and rounded
  // for the relation. For an index other than 0 and 1, a missing, floating-point or
  // range-exempt type, or an operator that is no relation: the unscaled value saturated to
  // 64 bits (after a debug report).
  void scaleAndRoundConstant(KV_OpOperator* op, double value, int operandIndex,
                             KV_NumericalType* type, KV_Scaling* scaling, long long& result) const;
  // Marks the constant for rounding up or down; false (the constant untouched) when the
  // operator is no ordering relation.
  bool setRoundingFlagOnConstant(KV_OpOperator* op, int operandIndex, KV_Constant* constant) const;
};

#endif
