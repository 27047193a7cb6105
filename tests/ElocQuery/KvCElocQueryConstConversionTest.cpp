#include "ElocQueryFixture.h"
#include "HulCvTools/ElocQuery/KvCElocQuery.h"

namespace {

using Q = KvCElocQuery;

class ConstConversionTest : public ElocQueryTest {
protected:
  KV_PointerType* constPtr() { return app.pointerTo(app.int16(), true); }
  KV_PointerType* ptr() { return app.pointerTo(app.int16()); }
  KvCUnparamSymbol* p = app.variable("p", app.pointerTo(app.int16()));
  KvCUnparamSymbol* cp = app.variable("cp", app.pointerTo(app.int16(), true));
};

TEST_F(ConstConversionTest, CastToPointerToConst) {
  KV_ExprLocation* toConst = app.access(p);
  KV_ExprLocation* toPlain = app.access(p);
  KV_ExprLocation* toValue = app.access(p);
  body().assign(app.access(cp), app.cast(constPtr(), toConst));
  body().assign(app.access(p), app.cast(ptr(), toPlain));
  body().assign(app.access(x), app.cast(app.int16(), toValue));
  EXPECT_TRUE(Q::isSubjectToConstCast(toConst));
  EXPECT_FALSE(Q::isSubjectToConstCast(toPlain));
  EXPECT_FALSE(Q::isSubjectToConstCast(toValue));
  EXPECT_FALSE(Q::isSubjectToConstCast(app.access(p)));
}

TEST_F(ConstConversionTest, ActualPartOfAPointerToConstFormal) {
  app.function("h").addFormal("in", constPtr());
  app.function("k").addFormal("out", ptr());
  KV_ExprLocation* addressed = app.access(x);
  KV_ExprLocation* underPointerCast = app.access(p);
  KV_ExprLocation* direct = app.access(p);
  body().call(app.function("h").symbol(), {app.addressOf(addressed)});
  body().call(app.function("h").symbol(),
              {app.addressOf(app.cast(ptr(), app.cast(ptr(), underPointerCast)))});
  body().call(app.function("h").symbol(), {direct});
  KV_ExprLocation* toPlainFormal = app.access(x);
  body().call(app.function("k").symbol(), {app.addressOf(toPlainFormal)});
  KV_ExprLocation* underValueCast = app.access(x);
  body().call(app.function("h").symbol(), {app.addressOf(app.cast(app.int16(), underValueCast))});

  EXPECT_TRUE(Q::isActualOfCallWithConstantFormal(addressed));
  EXPECT_TRUE(Q::isActualOfCallWithConstantFormal(underPointerCast));
  EXPECT_TRUE(Q::isSubjectToConstConversion(addressed));
  // The actual itself is no part below the actual.
  EXPECT_FALSE(Q::isActualOfCallWithConstantFormal(direct));
  EXPECT_FALSE(Q::isActualOfCallWithConstantFormal(toPlainFormal));
  EXPECT_FALSE(Q::isActualOfCallWithConstantFormal(underValueCast));
  EXPECT_FALSE(Q::isActualOfCallWithConstantFormal(app.access(x)));
  KV_ExprLocation* inUnheld = app.access(x);
  unheld(KV_OP_ADDRESS_OF, {inUnheld});
  EXPECT_FALSE(Q::isActualOfCallWithConstantFormal(inUnheld));
}

TEST_F(ConstConversionTest, PlainAssignmentToAPointerToConstBelowAnyCasts) {
  KV_ExprLocation* assigned = app.access(p);
  KV_ExprLocation* castTwice = app.access(x);
  KV_ExprLocation* toPlain = app.access(p);
  KV_ExprLocation* compound = app.access(p);
  body().assign(app.access(cp), assigned);
  body().assign(app.access(cp), app.cast(ptr(), app.cast(app.int32(), castTwice)));
  body().assign(app.access(p), toPlain);
  body().stmt(app.op(KV_OP_ADD_ASSIGN, {app.access(cp), compound}));
  EXPECT_TRUE(Q::isSubjectToConstConversion(assigned));
  EXPECT_TRUE(Q::isSubjectToConstConversion(castTwice));
  EXPECT_FALSE(Q::isSubjectToConstConversion(toPlain));
  EXPECT_FALSE(Q::isSubjectToConstConversion(compound));
  EXPECT_FALSE(Q::isSubjectToConstConversion(app.access(p)));
  KV_ExprLocation* noTarget = app.access(p);
  app.op(KV_OP_ASSIGN, {nullptr, noTarget});
  EXPECT_FALSE(Q::isSubjectToConstConversion(noTarget));
}

} // namespace
