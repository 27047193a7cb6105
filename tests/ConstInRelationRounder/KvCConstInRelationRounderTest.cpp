// KvCConstInRelationRounder: the rounded constant keeps the relation true for exactly the
// same integers; rejected requests fall back to the unscaled value, saturated.
#include "HulCvTools/ConstInRelationRounder/KvCConstInRelationRounder.h"
#include "HulCvTools/Control/KvCInternalCheck.h"
#include "platform/builder/AppBuilder.h"
#include "platform/icode/KV_Constant.h"
#include "platform/icode/KV_DataType.h"
#include "platform/icode/KV_OpOperator.h"
#include "platform/icode/KvCScaleTool.h"
#include "platform/support/FPS.h"
#include "platform/support/KvCMessageServer.h"

#include "tests/Control/MessageServerFixture.h"

#include <gtest/gtest.h>

#include <cfloat>
#include <cmath>
#include <cstdint>
#include <limits>
#include <string>
#include <vector>

namespace {

using Rounder = KvCConstInRelationRounder;
constexpr std::int64_t kMax = std::numeric_limits<std::int64_t>::max();
constexpr std::int64_t kMin = std::numeric_limits<std::int64_t>::min();
constexpr double kTwoTo63 = 0x1p63;
constexpr tagKvEOperatorKind kOrdering[] = {KV_OP_LESS, KV_OP_LESS_EQUAL, KV_OP_GREATER,
                                            KV_OP_GREATER_EQUAL};

KV_OpOperator* oper(tagKvEOperatorKind kind) { return KV_OpOperator::get(kind); }

// The sign of x - c, exact for every 64-bit x and every non-NaN double c.
int compareExact(std::int64_t x, double c) {
  if (c >= kTwoTo63)
    return -1;
  if (c < -kTwoTo63)
    return 1;
  const double whole = std::trunc(c);
  const auto wholeInt = static_cast<std::int64_t>(whole);
  if (x != wholeInt)
    return x < wholeInt ? -1 : 1;
  const double fraction = c - whole; // exact
  return fraction > 0 ? -1 : (fraction < 0 ? 1 : 0);
}

int compareInt(std::int64_t a, std::int64_t b) { return a < b ? -1 : (a > b ? 1 : 0); }

// Whether `x OP c` (constant at index 1) or `c OP x` (index 0) holds, given sign(x - c).
bool relationHolds(tagKvEOperatorKind kind, int constantIndex, int signXMinusC) {
  const int s = constantIndex == 0 ? -signXMinusC : signXMinusC;
  return kind == KV_OP_LESS         ? s < 0
         : kind == KV_OP_LESS_EQUAL ? s <= 0
         : kind == KV_OP_GREATER    ? s > 0
                                    : s >= 0;
}

// Empty when the relation with the rounded constant `r` holds for the same integers near
// `c` as the relation with `c`; a constant beyond the 64-bit range must saturate instead.
std::string disagreement(tagKvEOperatorKind kind, int index, double c, std::int64_t r) {
  const std::string where = std::string(oper(kind)->getName()) + " index " + std::to_string(index) +
                            " c=" + std::to_string(c) + " r=" + std::to_string(r);
  if (c >= kTwoTo63 || c < -kTwoTo63)
    return r == (c > 0 ? kMax : kMin) ? "" : where + ": not saturated";
  const auto center = static_cast<std::int64_t>(c);
  const std::int64_t from = center < kMin + 50 ? kMin : center - 50;
  const std::int64_t to = center > kMax - 50 ? kMax : center + 50;
  for (std::int64_t x = from;; ++x) {
    if (relationHolds(kind, index, compareExact(x, c)) !=
        relationHolds(kind, index, compareInt(x, r)))
      return where + ": differs at x=" + std::to_string(x);
    if (x == to)
      return "";
  }
}

// Non-integral values (negative ones, ones just off an integer, the last half-integers
// below 2^52), integral ones up to and beyond the 64-bit limits.
std::vector<double> constantGrid() {
  std::vector<double> grid;
  for (double base : {0.0, 1.0, 2.0, 7.0, 100.0, 12345.0, 0x1p20, 0x1p40, 0x1p51, 0x1p52 - 1}) {
    for (double k : {base, -base}) {
      for (double d : {0.0, 0.5, 0.25, 0.75, 0.1, 0.9, -0.5, -0.1, 1e-9, -1e-9})
        grid.push_back(k + d);
      grid.push_back(std::nextafter(k, HUGE_VAL));
      grid.push_back(std::nextafter(k, -HUGE_VAL));
    }
  }
  for (double big : {0x1p53 - 1, 0x1p53, 0x1p53 + 2, 0x1p62, std::nextafter(kTwoTo63, 0.0),
                     kTwoTo63, 1e19, 1e30, DBL_MAX}) {
    grid.push_back(big);
    grid.push_back(-big);
  }
  return grid;
}

class ConstInRelationRounderTest : public MessageServerFixture {
protected:
  // One debug report "0" per rejection, in builds with debug checks.
  static std::vector<std::string> rejections(std::size_t n) {
    return std::vector<std::string>(KvCInternalCheck::hasDebugChecks() ? n : 0, "0");
  }

  long long scaleAndRound(tagKvEOperatorKind kind, double physical, int index,
                          KV_NumericalType* type, KV_Scaling* scaling) const {
    long long result = 12345;
    rounder.scaleAndRoundConstant(oper(kind), physical, index, type, scaling, result);
    return result;
  }

  AppBuilder app;
  KV_NumericalType* int32 = app.int32()->asNumericalType();
  Rounder rounder;
};

TEST_F(ConstInRelationRounderTest, RoundedConstantKeepsEveryOrderingRelationOverTheIntegers) {
  for (double c : constantGrid())
    for (tagKvEOperatorKind kind : kOrdering)
      for (int index : {0, 1, 2, -1}) {
        const long long r =
            rounder.roundConstant(rounder.determineRoundingKind(oper(kind), index), c);
        const std::string problem = disagreement(kind, index == 0 ? 0 : 1, c, r);
        ASSERT_TRUE(problem.empty()) << problem;
      }
}

TEST_F(ConstInRelationRounderTest, ScaledAndRoundedConstantKeepsTheRelationUnderEveryScaling) {
  std::vector<KV_Scaling*> scalings = {nullptr};
  for (double lsb : {1.0, 0.5, 0.1, 0x1p-7})
    for (double offset : {0.0, -3.25})
      scalings.push_back(app.scaling(lsb, offset));
  for (KV_Scaling* scaling : scalings)
    for (double c : constantGrid()) {
      const double physical = KvCScaleTool::scaleFixedToFloat(c, scaling);
      const double scaled = KvCScaleTool::scaleFloatToFixed(physical, scaling);
      for (tagKvEOperatorKind kind : kOrdering)
        for (int index : {0, 1}) {
          const std::string problem = disagreement(
              kind, index, scaled, scaleAndRound(kind, physical, index, int32, scaling));
          ASSERT_TRUE(problem.empty()) << problem << " physical=" << physical;
        }
    }
}

TEST_F(ConstInRelationRounderTest, IntegralScaledConstantIsConvertedUnchangedWhateverTheRelation) {
  KV_Scaling* half = app.scaling(0.5, -3.25);
  for (double scaled : {0.0, 3.0, -7.0, 0x1p53, -0x1p62})
    for (tagKvEOperatorKind kind : {KV_OP_LESS, KV_OP_LESS_EQUAL, KV_OP_GREATER,
                                    KV_OP_GREATER_EQUAL, KV_OP_EQUAL, KV_OP_NOT_EQUAL})
      for (int index : {0, 1})
        EXPECT_EQ(scaleAndRound(kind, scaled * 0.5 - 3.25, index, int32, half),
                  static_cast<long long>(scaled))
            << oper(kind)->getName() << " " << scaled << " index " << index;
}

TEST_F(ConstInRelationRounderTest, HalfwayConstantsRoundTowardsTheSideThatKeepsTheRelation) {
  struct Case {
    tagKvEOperatorKind kind;
    long long left, right, negativeLeft, negativeRight; // 2.5 OP x, x OP 2.5, then -2.5
  };
  const Case cases[] = {{KV_OP_GREATER, 3, 2, -2, -3},
                        {KV_OP_GREATER_EQUAL, 2, 3, -3, -2},
                        {KV_OP_LESS, 2, 3, -3, -2},
                        {KV_OP_LESS_EQUAL, 3, 2, -2, -3}};
  KV_Scaling* half = app.scaling(0.5);
  for (const Case& c : cases) {
    SCOPED_TRACE(oper(c.kind)->getName());
    EXPECT_EQ(scaleAndRound(c.kind, 1.25, 0, int32, half), c.left);
    EXPECT_EQ(scaleAndRound(c.kind, 1.25, 1, int32, half), c.right);
    EXPECT_EQ(scaleAndRound(c.kind, -1.25, 0, int32, half), c.negativeLeft);
    EXPECT_EQ(scaleAndRound(c.kind, -1.25, 1, int32, half), c.negativeRight);
    // Any index other than 0 stands for the right-hand side when choosing the direction.
    EXPECT_EQ(rounder.roundConstant(rounder.determineRoundingKind(oper(c.kind), 2), 2.5), c.right);
  }
}

TEST_F(ConstInRelationRounderTest, RelationsWithoutOrderGetAPlainSaturatingConversion) {
  for (tagKvEOperatorKind kind : {KV_OP_EQUAL, KV_OP_NOT_EQUAL}) {
    EXPECT_EQ(rounder.determineRoundingKind(oper(kind), 0), Rounder::NoDirectedRounding);
    EXPECT_EQ(rounder.determineRoundingKind(oper(kind), 1), Rounder::NoDirectedRounding);
    for (double scaled : {2.5, -2.5, 7.75, -1e30, 1e30})
      EXPECT_EQ(scaleAndRound(kind, scaled, 1, int32, nullptr), FPS_SatCastToInt64(scaled));
  }
  EXPECT_EQ(rounder.determineRoundingKind(oper(KV_OP_ADD), 1), Rounder::NoDirectedRounding);
}

TEST_F(ConstInRelationRounderTest, OutOfRangeConstantsSaturateAndNotANumberGivesZero) {
  const double nan = std::numeric_limits<double>::quiet_NaN();
  for (tagKvEOperatorKind kind : kOrdering)
    for (int index : {0, 1}) {
      EXPECT_EQ(scaleAndRound(kind, 1e30, index, int32, nullptr), kMax);
      EXPECT_EQ(scaleAndRound(kind, -1e30, index, int32, nullptr), kMin);
      EXPECT_EQ(scaleAndRound(kind, -HUGE_VAL, index, int32, nullptr), kMin);
      EXPECT_EQ(scaleAndRound(kind, nan, index, int32, app.scaling(0.5)), 0);
    }
  EXPECT_EQ(scaleAndRound(KV_OP_EQUAL, nan, 1, int32, nullptr), 0);
  EXPECT_EQ(rounder.roundConstant(Rounder::NoDirectedRounding, nan), 0);
  // Rejected requests saturate as well.
  EXPECT_EQ(scaleAndRound(KV_OP_LESS, 1e30, 1, app.float64()->asNumericalType(), nullptr), kMax);
}

TEST_F(ConstInRelationRounderTest, RejectedRequestsFallBackToTheUnscaledValueWithADebugReport) {
  server().setShowInternalInfo(true);
  KV_Scaling* quarter = app.scaling(0.25); // 7.75 would scale to 31
  KV_NumericalType* exempt = app.int16()->asNumericalType();
  exempt->setExemptFromRangeHandling(true);
  struct Case {
    const char* what;
    tagKvEOperatorKind kind;
    int index;
    KV_NumericalType* type;
  };
  const Case cases[] = {{"index 2", KV_OP_LESS, 2, int32},
                        {"index -1", KV_OP_LESS, -1, int32},
                        {"no type", KV_OP_LESS, 1, nullptr},
                        {"exempt type", KV_OP_LESS, 1, exempt},
                        {"float type", KV_OP_LESS, 1, app.float32()->asNumericalType()},
                        {"no relation", KV_OP_ADD, 1, int32}};
  for (const Case& c : cases) {
    SCOPED_TRACE(c.what);
    server().clear();
    EXPECT_EQ(scaleAndRound(c.kind, 7.75, c.index, c.type, quarter), 7);
    EXPECT_EQ(reports(), rejections(1));
    EXPECT_TRUE(server().getMessages().empty());
  }
  server().clear();
  long long result = 0;
  rounder.scaleAndRoundConstant(nullptr, -7.75, 0, int32, quarter, result);
  EXPECT_EQ(result, -7);
  EXPECT_EQ(reports(), rejections(1));

  server().clear();
  EXPECT_EQ(scaleAndRound(KV_OP_LESS, 7.75, 1, int32, quarter), 31);
  EXPECT_TRUE(server().getDebugAssertions().empty());
}

TEST_F(ConstInRelationRounderTest, UnknownRoundingKindReportsAndConvertsPlainly) {
  server().setShowInternalInfo(true);
  EXPECT_EQ(rounder.roundConstant(static_cast<Rounder::KvERoundingKind>(0), -2.5),
            FPS_SatCastToInt64(-2.5));
  EXPECT_EQ(reports(), rejections(1));
  EXPECT_TRUE(server().getMessages().empty());

  server().clear();
  server().setShowInternalInfo(false);
  EXPECT_EQ(scaleAndRound(KV_OP_LESS, 7.75, 5, int32, nullptr), 7);
  EXPECT_TRUE(server().getDebugAssertions().empty());
}

TEST_F(ConstInRelationRounderTest, RoundingFlagFollowsTheOperatorAndTheSide) {
  struct Case {
    tagKvEOperatorKind kind;
    tagKvERoundingMark left;
    tagKvERoundingMark right;
  };
  const Case cases[] = {{KV_OP_GREATER, KV_ROUND_UP, KV_ROUND_DOWN},
                        {KV_OP_GREATER_EQUAL, KV_ROUND_DOWN, KV_ROUND_UP},
                        {KV_OP_LESS, KV_ROUND_DOWN, KV_ROUND_UP},
                        {KV_OP_LESS_EQUAL, KV_ROUND_UP, KV_ROUND_DOWN}};
  for (const Case& c : cases)
    for (int index : {0, 1, 2}) {
      KV_Constant* constant = app.constantExpr(5);
      EXPECT_TRUE(rounder.setRoundingFlagOnConstant(oper(c.kind), index, constant));
      EXPECT_EQ(constant->getRoundingMark(), index == 0 ? c.left : c.right)
          << oper(c.kind)->getName() << " index " << index;
    }
  KV_Constant* untouched = app.constantExpr(5);
  for (tagKvEOperatorKind kind : {KV_OP_EQUAL, KV_OP_NOT_EQUAL, KV_OP_ADD}) {
    EXPECT_FALSE(rounder.setRoundingFlagOnConstant(oper(kind), 1, untouched));
    EXPECT_FALSE(rounder.setRoundingFlagOnConstant(oper(kind), 0, nullptr));
  }
  EXPECT_EQ(untouched->getRoundingMark(), KV_ROUND_NONE);
}

} // namespace
