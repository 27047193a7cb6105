// KvCOpRangeCalculator: whether an absolute value can be simplified, the integer ranges of
// the two branches of an absolute value, whether a saturating operation must saturate and
// how the saturation limits narrow a range.
#include "HulCvTools/OpRangeCalculator/KvCOpRangeCalculator.h"
#include "HulCvTools/Control/KvCInternalCheck.h"
#include "platform/builder/AppBuilder.h"
#include "platform/icode/KV_DataType.h"
#include "platform/icode/KV_ExprLocation.h"
#include "platform/icode/KV_OpOperator.h"
#include "platform/icode/KV_OpSaturationInfo.h"
#include "platform/icode/KV_Operation.h"
#include "platform/icode/KV_Range.h"
#include "platform/support/KvCMessageServer.h"

#include "tests/Control/MessageServerFixture.h"

#include <gtest/gtest.h>

#include <array>
#include <cstdint>
#include <limits>
#include <string>
#include <utility>
#include <vector>

namespace {

constexpr std::int64_t kMax = std::numeric_limits<std::int64_t>::max();
constexpr std::int64_t kMin = std::numeric_limits<std::int64_t>::min();

using Verdict = std::pair<bool, bool>; // never negative, never positive
const Verdict kNeverNegative{true, false};
const Verdict kNeverPositive{false, true};
const Verdict kEither{false, false};
// Integer limits of the non-negated branch, then of the negated branch: lo, hi, lo, hi.
using Branches = std::array<std::int64_t, 4>;
using Ints = std::array<std::int64_t, 2>;
using Doubles = std::array<double, 2>;
using Flags = std::array<bool, 4>;

class OpRangeCalculatorTest : public MessageServerFixture {
protected:
  KV_NumericalType* numerical(KV_DataType* type) { return type->asNumericalType(); }
  // x + 1 with conversion information and the given result range.
  KV_ExprLocation* calculation(bool calculateProtected, const KV_Range& resultRange) {
    KV_ExprLocation* loc = app.add(app.access(x), app.constant(1));
    loc->getOperation()->setConversionInfo(calculateProtected);
    loc->getOperation()->setResultRange(resultRange);
    return loc;
  }
  Verdict judge(KV_ExprLocation* argument, KV_DataType* type, KV_Scaling* scaling) {
    bool neverNegative = true;
    bool neverPositive = true;
    EXPECT_TRUE(calc.checkAbsForSimplification(argument, numerical(type), scaling, neverNegative,
                                               neverPositive));
    return {neverNegative, neverPositive};
  }
  Branches branches(tagKvEOperatorKind kind, const KV_Range& argument, KV_DataType* type,
                    KV_Scaling* scaling) {
    KV_Range plain(99.0, 99.0);
    KV_Range negated(99.0, 99.0);
    EXPECT_TRUE(calc.calcRangesForAbs(KV_OpOperator::get(kind), argument, numerical(type), scaling,
                                      nullptr, plain, negated));
    EXPECT_TRUE(plain.isIntRange());
    EXPECT_TRUE(negated.isIntRange());
    return {plain.getInt64LowerLimit(), plain.getInt64UpperLimit(), negated.getInt64LowerLimit(),
            negated.getInt64UpperLimit()};
  }
  Verdict saturates(const KV_Range& range, KV_OpSaturationInfo& info) {
    bool upper = true;
    bool lower = true;
    EXPECT_TRUE(calc.checkSaturation(range, &info, upper, lower));
    return {upper, lower};
  }
  KV_Range saturated(KV_Range range, KV_DataType* type, KV_OpSaturationInfo* info) {
    EXPECT_TRUE(calc.saturateRange(range, type ? numerical(type) : nullptr, info));
    return range;
  }
  static KV_OpSaturationInfo limits(std::int64_t lower, std::int64_t upper) {
    KV_OpSaturationInfo info;
    info.setUpperLimit(upper, static_cast<double>(upper));
    info.setLowerLimit(lower, static_cast<double>(lower));
    return info;
  }

  AppBuilder app;
  KvCUnparamSymbol* x = app.variable("x", app.int16());
  KvCOpRangeCalculator calc;
};

Doubles floatLimits(const KV_Range& r) { return {r.getFloatLowerLimit(), r.getFloatUpperLimit()}; }
Ints intLimits(const KV_Range& r) { return {r.getInt64LowerLimit(), r.getInt64UpperLimit()}; }

// --- checkAbsForSimplification

TEST_F(OpRangeCalculatorTest, ProtectedCalculationIsJudgedByItsScaledResultRange) {
  KV_DataType* int16 = app.int16(); // whose own limits would allow either sign
  KV_Scaling* half = app.scaling(0.5);
  KV_ExprLocation* positive = calculation(true, KV_Range::makeIntRange(0, 10));
  positive->setValueRange(KV_Range::makeIntRange(-5, 5)); // not consulted
  EXPECT_EQ(judge(positive, int16, half), kNeverNegative);
  EXPECT_EQ(judge(calculation(true, KV_Range::makeIntRange(-7, 0)), int16, half), kNeverPositive);
  EXPECT_EQ(judge(calculation(true, KV_Range::makeIntRange(-2, 2)), int16, half), kEither);
  EXPECT_EQ(judge(calculation(true, KV_Range::makeIntRange(4, 10)), int16, app.scaling(0.5, -2)),
            kNeverNegative);
  EXPECT_EQ(judge(calculation(true, KV_Range::makeIntRange(3, 10)), int16, app.scaling(0.5, -2)),
            kEither);
  EXPECT_EQ(judge(calculation(true, KV_Range::makeIntRange(1, 10)), int16, app.scaling(-0.5)),
            kNeverPositive);
  // An empty result range [1, -1] (never computed) keeps its order under a positive LSB.
  EXPECT_EQ(judge(calculation(true, KV_Range::makeIntRange(1, -1)), int16, half), kNeverNegative);
}

TEST_F(OpRangeCalculatorTest, UnprotectedCalculationIsJudgedByTheTypeLimits) {
  KV_ExprLocation* argument = calculation(false, KV_Range::makeIntRange(1, 5));
  argument->setValueRange(KV_Range::makeIntRange(1, 5));
  EXPECT_EQ(judge(argument, app.int16(), nullptr), kEither);
  EXPECT_EQ(judge(argument, app.uint8(), nullptr), kNeverNegative);
}

TEST_F(OpRangeCalculatorTest, SymbolAccessIsJudgedByItsValueRange) {
  KV_Scaling* half = app.scaling(0.5);
  auto access = [&](KV_Range range) {
    KV_ExprLocation* loc = app.access(x);
    loc->setValueRange(range);
    return loc;
  };
  EXPECT_EQ(judge(access(KV_Range::makeIntRange(0, 0)), app.int16(), half), kNeverNegative);
  EXPECT_EQ(judge(access(KV_Range::makeIntRange(-7, 0)), app.int16(), half), kNeverPositive);
  EXPECT_EQ(judge(access(KV_Range(-3.5, 0.0)), app.int16(), nullptr), kNeverPositive);
  EXPECT_EQ(judge(access(KV_Range::makeIntRange(-1, 1)), app.int16(), nullptr), kEither);
  EXPECT_EQ(judge(access(KV_Range::makeIntRange(0, 10)), app.int16(), app.scaling(1, -0.5)),
            kEither);
  // Without a recorded range the variable's type decides, not the type given.
  KvCUnparamSymbol* count = app.variable("count", app.uint8());
  EXPECT_EQ(judge(app.access(count), app.int16(), nullptr), kNeverNegative);
  // Ordered comparisons: a NaN limit satisfies neither test.
  const double nan = std::numeric_limits<double>::quiet_NaN();
  EXPECT_EQ(judge(access(KV_Range(nan, -1.0)), app.int16(), nullptr), kNeverPositive);
  EXPECT_EQ(judge(access(KV_Range(nan, nan)), app.int16(), nullptr), kEither);
}

TEST_F(OpRangeCalculatorTest, OtherArgumentsAreJudgedByTheTypeLimitsUnderTheScaling) {
  KV_ExprLocation* constant = app.constant(-5); // its value is not consulted
  EXPECT_EQ(judge(constant, app.uint16(), nullptr), kNeverNegative);
  EXPECT_EQ(judge(constant, app.int16(), app.scaling(1, 32768)), kNeverNegative);
  EXPECT_EQ(judge(constant, app.uint8(), app.scaling(-0.25)), kNeverPositive);
  EXPECT_EQ(judge(constant, app.uint8(), app.scaling(1, -3.25)), kEither);
  EXPECT_EQ(judge(constant, app.float32(), nullptr), kEither);
}

// --- calcRangesForAbs

TEST_F(OpRangeCalculatorTest, ZeroBelongsToTheNegatedBranchForGreaterAndToThePlainOneOtherwise) {
  const KV_Range argument(-2.0, 3.0);
  EXPECT_EQ(branches(KV_OP_GREATER, argument, app.int16(), nullptr), (Branches{1, 3, 0, 2}));
  EXPECT_EQ(branches(KV_OP_GREATER_EQUAL, argument, app.int16(), nullptr), (Branches{0, 3, 1, 2}));
}

TEST_F(OpRangeCalculatorTest, NonIntegralScaledLimitsRoundDownForGreaterAndUpForGreaterEqual) {
  KV_Scaling* half = app.scaling(0.5);
  const KV_Range fractional(-3.3, 5.7); // scaled: -6.6 .. 11.4
  EXPECT_EQ(branches(KV_OP_GREATER, fractional, app.int16(), half), (Branches{1, 11, 0, 6}));
  EXPECT_EQ(branches(KV_OP_GREATER_EQUAL, fractional, app.int16(), half), (Branches{0, 12, 1, 7}));
  const KV_Range integral(-4.0, 6.0); // scaled: -8 .. 12
  EXPECT_EQ(branches(KV_OP_GREATER, integral, app.int16(), half), (Branches{1, 12, 0, 8}));
  EXPECT_EQ(branches(KV_OP_GREATER_EQUAL, integral, app.int16(), half), (Branches{0, 12, 1, 8}));
  // With an offset the branches start at the representable values next to zero, +-0.25.
  EXPECT_EQ(branches(KV_OP_GREATER, fractional, app.int16(), app.scaling(0.5, -3.25)),
            (Branches{7, 17, 7, 13}));
}

TEST_F(OpRangeCalculatorTest, BranchThatTheArgumentNeverTakesStaysEmptyThroughTheNegation) {
  // Lower limit above the upper one: the branch is never taken. A negative argument under
  // ">=" is the exception: its plain branch [0, -0.25] has its upper limit rounded up to 0.
  const KV_Range positive(0.25, 3.0);
  const KV_Range negative(-3.0, -0.25);
  EXPECT_EQ(branches(KV_OP_GREATER, positive, app.int16(), nullptr), (Branches{1, 3, 0, -1}));
  EXPECT_EQ(branches(KV_OP_GREATER_EQUAL, positive, app.int16(), nullptr), (Branches{1, 3, 1, 0}));
  EXPECT_EQ(branches(KV_OP_GREATER, negative, app.int16(), nullptr), (Branches{1, -1, 0, 3}));
  EXPECT_EQ(branches(KV_OP_GREATER_EQUAL, negative, app.int16(), nullptr), (Branches{0, 0, 1, 3}));
  const KV_Range zero(0.0, 0.0);
  EXPECT_EQ(branches(KV_OP_GREATER, zero, app.int16(), nullptr), (Branches{1, 0, 0, 0}));
  EXPECT_EQ(branches(KV_OP_GREATER_EQUAL, zero, app.int16(), nullptr), (Branches{0, 0, 1, 0}));
}

TEST_F(OpRangeCalculatorTest, FloatTypeGetsThePhysicalLimitsUnscaledAfterDebugReports) {
  server().setShowInternalInfo(true);
  EXPECT_EQ(branches(KV_OP_GREATER, KV_Range(-3.3, 5.7), app.float32(), app.scaling(0.5)),
            (Branches{0, 5, 0, 3}));
  const std::size_t perLimit = KvCInternalCheck::hasDebugChecks() ? 4 : 0;
  EXPECT_EQ(reports(), std::vector<std::string>(perLimit, "0"));
  EXPECT_TRUE(server().getMessages().empty());
}

TEST_F(OpRangeCalculatorTest, OperatorOtherThanGreaterIsCheckedToBeGreaterEqual) {
  const bool debug = KvCInternalCheck::hasDebugChecks();
  const std::string check = "pRelatOperator->isGreaterEqual()";
  KV_Scaling* half = app.scaling(0.5);
  const KV_Range argument(-3.3, 5.7);
  server().setShowInternalInfo(true);
  EXPECT_EQ(branches(KV_OP_GREATER, argument, app.int16(), half), (Branches{1, 11, 0, 6}));
  EXPECT_EQ(branches(KV_OP_GREATER_EQUAL, argument, app.int16(), half), (Branches{0, 12, 1, 7}));
  EXPECT_TRUE(reports().empty());

  // "<" goes on as ">=" (a right-hand "<" also rounds up).
  EXPECT_EQ(branches(KV_OP_LESS, argument, app.int16(), half), (Branches{0, 12, 1, 7}));
  EXPECT_EQ(reports(), debug ? std::vector<std::string>{check} : std::vector<std::string>{});

  // No relation at all: the rounder rejects every limit as well.
  server().clear();
  EXPECT_EQ(branches(KV_OP_ADD, argument, app.int16(), half), (Branches{0, 5, 0, 3}));
  const std::vector<std::string> checkThenRejections{check, "0", "0", "0", "0"};
  EXPECT_EQ(reports(), debug ? checkThenRejections : std::vector<std::string>{});
  EXPECT_TRUE(server().getMessages().empty());

  server().clear();
  server().setShowInternalInfo(false);
  branches(KV_OP_LESS, argument, app.int16(), half);
  EXPECT_TRUE(reports().empty());
}

// --- checkSaturation, checkSaturationForAbs

TEST_F(OpRangeCalculatorTest, RangeTouchingAConstantLimitNeedsNoSaturation) {
  KV_OpSaturationInfo info = limits(-100, 100);
  EXPECT_EQ(saturates(KV_Range::makeIntRange(-100, 100), info), Verdict(false, false));
  EXPECT_EQ(saturates(KV_Range::makeIntRange(-101, 101), info), Verdict(true, true));
  EXPECT_EQ(saturates(KV_Range::makeIntRange(-100, 101), info), Verdict(true, false));
  EXPECT_EQ(saturates(KV_Range::makeIntRange(-101, 100), info), Verdict(false, true));
  // A float range is judged by its integer limits (rounded outwards).
  EXPECT_EQ(saturates(KV_Range(-100.0, 100.0), info), Verdict(false, false));
  EXPECT_EQ(saturates(KV_Range(-100.5, 100.2), info), Verdict(true, true));
  // The integer limit decides, not the double one.
  KV_OpSaturationInfo mixed;
  mixed.setUpperLimit(100, 200.0);
  EXPECT_EQ(saturates(KV_Range::makeIntRange(0, 150), mixed), Verdict(true, false));
  // Signed 64-bit comparisons, exact at the extremes.
  KV_OpSaturationInfo nearExtremes = limits(kMin + 1, kMax - 1);
  EXPECT_EQ(saturates(KV_Range::makeIntRange(kMin, kMax), nearExtremes), Verdict(true, true));
  EXPECT_EQ(saturates(KV_Range::makeIntRange(kMin + 1, kMax - 1), nearExtremes),
            Verdict(false, false));
  KV_OpSaturationInfo negative = limits(-20, -5);
  EXPECT_EQ(saturates(KV_Range::makeIntRange(-20, -6), negative), Verdict(false, false));
  EXPECT_EQ(saturates(KV_Range::makeIntRange(-21, -4), negative), Verdict(true, true));
}

TEST_F(OpRangeCalculatorTest, LimitComputedAtRunTimeAlwaysNeedsSaturation) {
  KV_OpSaturationInfo info;
  info.setUpperLimitVariable();
  info.setLowerLimit(-100, -100.0);
  EXPECT_EQ(saturates(KV_Range::makeIntRange(0, 0), info), Verdict(true, false));
  KV_OpSaturationInfo lowerOnly;
  lowerOnly.setLowerLimitVariable();
  EXPECT_EQ(saturates(KV_Range::makeIntRange(0, kMax), lowerOnly), Verdict(false, true));
  KV_OpSaturationInfo upperOnly;
  upperOnly.setUpperLimit(10, 10.0);
  EXPECT_EQ(saturates(KV_Range::makeIntRange(kMin, 5), upperOnly), Verdict(false, false));
}

TEST_F(OpRangeCalculatorTest, AbsSaturationChecksBothBranchesIntoTheirOwnFlags) {
  auto check = [&](const KV_Range& plain, const KV_Range& negated, KV_OpSaturationInfo& info) {
    Flags flags{true, true, true, true};
    EXPECT_TRUE(
        calc.checkSaturationForAbs(plain, negated, &info, flags[0], flags[1], flags[2], flags[3]));
    return flags;
  };
  KV_OpSaturationInfo none;
  const KV_Range wide = KV_Range::makeIntRange(kMin, kMax);
  EXPECT_EQ(check(wide, wide, none), (Flags{false, false, false, false}));
  KV_OpSaturationInfo info = limits(-100, 100);
  EXPECT_EQ(check(KV_Range::makeIntRange(-101, 50), KV_Range::makeIntRange(0, 100), info),
            (Flags{false, true, false, false}));
  EXPECT_EQ(check(KV_Range::makeIntRange(0, 100), KV_Range::makeIntRange(0, 101), info),
            (Flags{false, false, true, false}));
  EXPECT_EQ(check(KV_Range::makeIntRange(0, 101), KV_Range::makeIntRange(-101, 0), info),
            (Flags{true, false, false, true}));
}

// --- saturateRange

TEST_F(OpRangeCalculatorTest, SaturateRangeLeavesTheRangeAloneWithoutSomethingToApply) {
  const KV_Range range = KV_Range::makeIntRange(-1000, 1000);
  KV_OpSaturationInfo info = limits(-100, 100);
  KV_OpSaturationInfo none;
  KV_DataType* exempt = app.int32();
  numerical(exempt)->setExemptFromRangeHandling(true);
  EXPECT_EQ(intLimits(saturated(range, app.int16(), nullptr)), intLimits(range));
  EXPECT_EQ(intLimits(saturated(range, nullptr, nullptr)), intLimits(range));
  EXPECT_EQ(intLimits(saturated(range, nullptr, &info)), intLimits(range));
  EXPECT_EQ(intLimits(saturated(range, app.int16(), &none)), intLimits(range));
  EXPECT_EQ(intLimits(saturated(range, exempt, &info)), intLimits(range));
  EXPECT_TRUE(saturated(range, exempt, &info).isIntRange());
}

TEST_F(OpRangeCalculatorTest, FloatTypesTakeTheDoubleLimitsIntegerTypesThe64BitOnes) {
  KV_OpSaturationInfo info;
  info.setUpperLimit(100, 7.5);
  info.setLowerLimit(-100, -7.5);
  const KV_Range floatRange(-1000.0, 1000.0);
  EXPECT_EQ(floatLimits(saturated(floatRange, app.float32(), &info)), (Doubles{-7.5, 7.5}));
  EXPECT_EQ(floatLimits(saturated(floatRange, app.int16(), &info)), (Doubles{-100.0, 100.0}));
  const KV_Range intRange = KV_Range::makeIntRange(-1000, 1000);
  EXPECT_EQ(intLimits(saturated(intRange, app.float64(), &info)), (Ints{-7, 7}));
  EXPECT_EQ(intLimits(saturated(intRange, app.int16(), &info)), (Ints{-100, 100}));
  // Never widened; the 64-bit limits are taken exactly.
  EXPECT_EQ(intLimits(saturated(KV_Range::makeIntRange(-5, 5), app.int16(), &info)), (Ints{-5, 5}));
  KV_OpSaturationInfo extremes = limits(kMin + 1, kMax - 1);
  EXPECT_EQ(intLimits(saturated(KV_Range::makeIntRange(kMin, kMax), app.int32(), &extremes)),
            (Ints{kMin + 1, kMax - 1}));
}

TEST_F(OpRangeCalculatorTest, SideWithoutAConstantLimitIsLeftUnchanged) {
  const KV_Range range = KV_Range::makeIntRange(-1000, 1000);
  KV_OpSaturationInfo upperVariable;
  upperVariable.setUpperLimitVariable();
  upperVariable.setLowerLimit(-100, -100.0);
  EXPECT_EQ(intLimits(saturated(range, app.int16(), &upperVariable)), (Ints{-100, 1000}));
  KV_OpSaturationInfo lowerVariable;
  lowerVariable.setUpperLimit(100, 100.0);
  lowerVariable.setLowerLimitVariable();
  EXPECT_EQ(intLimits(saturated(range, app.int16(), &lowerVariable)), (Ints{-1000, 100}));
  KV_OpSaturationInfo lowerOnly;
  lowerOnly.setLowerLimit(-100, -100.0);
  EXPECT_EQ(intLimits(saturated(range, app.int16(), &lowerOnly)), (Ints{-100, 1000}));
}

} // namespace
