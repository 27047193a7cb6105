#include "ElocQueryFixture.h"
#include "HulCvTools/ElocQuery/KvCElocQuery.h"
#include "platform/icode/KV_Constant.h"

namespace {

using Q = KvCElocQuery;
using CastsTest = ElocQueryTest;
using ConstantsTest = ElocQueryTest;

TEST_F(CastsTest, SkippingCastsDownwardsReachesTheAccessBelowTwoCasts) {
  KV_ExprLocation* xl = app.access(x);
  KV_ExprLocation* outer = app.cast(app.int32(), app.cast(app.uint16(), xl));
  body().assign(app.access(y), outer);
  KV_ExprLocation* found = nullptr;
  int casts = -1;
  EXPECT_EQ(Q::getExprBySkippingCasts(outer, found, casts), xl->getExpression());
  EXPECT_EQ(found, xl);
  EXPECT_EQ(casts, 2);
  EXPECT_EQ(Q::getExprBySkippingCasts(xl, found, casts), xl->getExpression());
  EXPECT_EQ(found, xl);
  EXPECT_EQ(casts, 0);
}

TEST_F(CastsTest, SkippingCastsUpwardsReachesTheOuterCastsLocation) {
  KV_ExprLocation* xl = app.access(x);
  KV_ExprLocation* lhs = app.access(y);
  KV_ExprLocation* outer = app.cast(app.int32(), app.cast(app.uint16(), xl));
  body().assign(lhs, outer);
  KV_ExprLocation* found = nullptr;
  int casts = -1;
  EXPECT_EQ(Q::getParentELocBySkippingCasts(xl, found, casts), outer->getExpression());
  EXPECT_EQ(found, outer);
  EXPECT_EQ(casts, 2);
  EXPECT_EQ(Q::getParentELocBySkippingCasts(lhs, found, casts), lhs->getExpression());
  EXPECT_EQ(found, lhs);
  EXPECT_EQ(casts, 0);
}

TEST_F(CastsTest, BrokenCastChainsGiveNullAndResetOutParameters) {
  KV_ExprLocation* castWithoutOperand = app.cast(app.int32(), app.access(x));
  castWithoutOperand->getOperation()->setOperand(0, nullptr);
  KV_ExprLocation* found = castWithoutOperand;
  int casts = -1;
  EXPECT_EQ(Q::getExprBySkippingCasts(castWithoutOperand, found, casts), nullptr);
  EXPECT_EQ(found, nullptr);
  EXPECT_EQ(casts, 1);

  KV_ExprLocation* xl = app.access(x);
  unheld(KV_OP_CAST, {xl, app.typeRef(app.int32())});
  found = xl;
  EXPECT_EQ(Q::getParentELocBySkippingCasts(xl, found, casts), nullptr);
  EXPECT_EQ(found, nullptr);
  EXPECT_EQ(casts, 1);
}

TEST_F(ConstantsTest, ConstantIsFoundBelowCastsAndTheOutParameterIsReset) {
  KV_ExprLocation* c = app.constant(std::int64_t{-5});
  KV_ExprLocation* casted = app.cast(app.int32(), c);
  KV_Constant* found = nullptr;
  EXPECT_TRUE(Q::containsConstant(casted, found));
  EXPECT_EQ(found, c->getConstant());
  EXPECT_TRUE(Q::containsConstantWithNegativValue(casted));
  EXPECT_FALSE(Q::containsConstant(app.access(x), found));
  EXPECT_EQ(found, nullptr);
  EXPECT_FALSE(Q::containsConstant(app.typeRef(app.int16())));
  EXPECT_FALSE(Q::containsConstantWithNegativValue(app.constant(std::int64_t{5})));
  EXPECT_FALSE(Q::containsConstantWithNegativValue(app.access(x)));
}

TEST_F(ConstantsTest, ValueComparisonDependsOnTheConstantsType) {
  EXPECT_TRUE(Q::containsConstantWithValue(app.constant(1.0, app.float64()), 1));
  EXPECT_FALSE(Q::containsConstantWithValue(app.constant(0.99999999, app.float64()), 1));
  EXPECT_TRUE(Q::containsConstantWithValue(app.constant(0.0, app.float64()), 0));
  EXPECT_TRUE(Q::containsConstantWithValue(app.constant(-3.0, app.float32()), -3));
  // 300 held by an UInt8 is 44.
  EXPECT_TRUE(Q::containsConstantWithValue(app.constant(std::int64_t{300}, app.uint8()), 44));
  EXPECT_FALSE(Q::containsConstantWithValue(app.constant(std::int64_t{300}, app.uint8()), 300));
  EXPECT_TRUE(Q::containsConstantWithValue(app.constant(std::int64_t{300}), 300));
  EXPECT_TRUE(
      Q::containsConstantWithValue(app.cast(app.int32(), app.constant(std::int64_t{7})), 7));
  EXPECT_FALSE(Q::containsConstantWithValue(app.access(x), 0));
}

TEST_F(ConstantsTest, EqualAccessesAreComparedBelowCastsWithTheirQualification) {
  EXPECT_TRUE(Q::containEqualQsos(app.access(x), app.cast(app.int32(), app.access(x))));
  EXPECT_FALSE(Q::containEqualQsos(app.access(x), app.access(y)));
  EXPECT_FALSE(Q::containEqualQsos(app.access(x), one()));
  EXPECT_FALSE(Q::containEqualQsos(one(), app.access(x)));
  KV_ExprLocation* strict = app.access(x);
  strict->getQualifiedSymbolOp()->setStrictlyQualified(true);
  EXPECT_FALSE(Q::containEqualQsos(app.access(x), strict));
  EXPECT_TRUE(Q::isStrictlyQualifiedSymbol(strict));
  EXPECT_FALSE(Q::isStrictlyQualifiedSymbol(app.access(x)));
  EXPECT_FALSE(Q::isStrictlyQualifiedSymbol(one()));
}

} // namespace
