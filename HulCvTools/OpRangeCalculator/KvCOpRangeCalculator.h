// KvCOpRangeCalculator: range questions of fixed-point code generation: can an absolute
// value be replaced by its argument or the argument's negation, what are the ranges of
// the two branches of an absolute-value implementation, does a saturating operation
// really saturate, and how do saturation limits narrow a range. The range arithmetic is
// the model's (range limiter, scale tool, range converter, range multiplication); this
// class decides which utility runs, in which order, with which limits.
//
// No state; every range, type, scaling and saturation description belongs to the caller.
// Every operation answers true and resets its out-parameters first.
#ifndef HULCVTOOLS_OPRANGECALCULATOR_KVCOPRANGECALCULATOR_H
#define HULCVTOOLS_OPRANGECALCULATOR_KVCOPRANGECALCULATOR_H

#include "HulCvTools/HulCvToolsExport.h"
#include "HulCvTools/ModelInterfaces/ICodeFwd.h"

class KvCSrcRef;

class HULCV_API KvCOpRangeCalculator {
public:
  KvCOpRangeCalculator() = default;
  ~KvCOpRangeCalculator() = default;

  // From the argument's physical limits L and U (the protected result range of a
  // calculating operation, else the value range of a symbol access, else the limits of
  // the type under the scaling): neverNegative when L >= 0, else neverPositive when U <= 0.
  bool checkAbsForSimplification(KV_ExprLocation* argument, KV_NumericalType* type,
                                 KV_Scaling* scaling, bool& neverNegative, bool& neverPositive);
  // The integer ranges (implemented units) of the branch that keeps the argument and of
  // the branch that negates it, when the branch is chosen by `pRelatOperator` (> or >=)
  // comparing the argument with zero; `argumentRange` is in physical units.
  bool calcRangesForAbs(KV_OpOperator* pRelatOperator, const KV_Range& argumentRange,
                        KV_NumericalType* type, KV_Scaling* scaling, const KvCSrcRef* srcRef,
                        KV_Range& plainRange, KV_Range& negatedRange);
  bool checkSaturationForAbs(const KV_Range& plainRange, const KV_Range& negatedRange,
                             KV_OpSaturationInfo* saturation, bool& plainUpper, bool& plainLower,
                             bool& negatedUpper, bool& negatedLower);
  // Whether an integer range (implemented units) exceeds constant saturation limits; a
  // side with a limit computed at run time always needs saturation.
  bool checkSaturation(const KV_Range& range, KV_OpSaturationInfo* saturation, bool& upper,
                       bool& lower);
  // Narrows `range` to the constant saturation limits (double limits for floating-point
  // types, 64-bit limits otherwise). Null description or type, no saturation, or a
  // range-exempt type: unchanged.
  bool saturateRange(KV_Range& range, KV_NumericalType* type, KV_OpSaturationInfo* saturation);

private:
  // Rounds both limits of `range` for the relation and makes it an integer range.
  void toImplementedIntRange(KV_OpOperator* op, KV_Range& range, KV_NumericalType* type,
                             KV_Scaling* scaling) const;
};

#endif
