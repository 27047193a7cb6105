#include "ElocQueryFixture.h"
#include "HulCvTools/ElocQuery/KvCElocQuery.h"

namespace {

using Q = KvCElocQuery;

class CallTest : public ElocQueryTest {
protected:
  // Builds f's statement g(x, y) and keeps the formal and actual locations.
  void SetUp() override {
    g = app.function("g").symbol();
    byValue = app.function("g").addFormal("byValue", app.int16());
    byRef = app.function("g").addFormal("byRef", app.int16(), true);
    actual0 = app.access(x);
    actual1 = app.access(y);
    call = inBody(app.call(g, {actual0, actual1}));
    formal0 = formalOf(actual0);
  }
  static KV_ExprLocation* formalOf(KV_ExprLocation* actual) {
    return actual->getParentOperation()->getOperand(0);
  }
  // A call of the given kind (not a call operation) with one parameter (formal, actual).
  KV_ExprLocation* genericCallOf(KV_ExprLocation* callee, KV_ExprLocation* formal,
                                 KV_ExprLocation* actual) {
    return app.genericCall(callee, {app.parameter(formal, actual)});
  }

  KvCParamSymbol* g = nullptr;
  KvCUnparamSymbol* byValue = nullptr;
  KvCUnparamSymbol* byRef = nullptr;
  KV_ExprLocation* actual0 = nullptr;
  KV_ExprLocation* actual1 = nullptr;
  KV_ExprLocation* formal0 = nullptr;
  KV_ExprLocation* call = nullptr;
};

TEST_F(CallTest, FormalAndActualPositionsOfAParameter) {
  EXPECT_TRUE(Q::isParamOfCall(formal0, true, true));
  EXPECT_TRUE(Q::isParamOfCall(actual0, true, true));
  EXPECT_TRUE(Q::isFormalOfCall(formal0) && !Q::isActualOfCall(formal0));
  EXPECT_TRUE(Q::isActualOfCall(actual0) && !Q::isFormalOfCall(actual0));
  EXPECT_FALSE(Q::isParamOfCall(formal0, false, false));
  EXPECT_FALSE(Q::isParamOfCall(actual0, false, false));
  EXPECT_FALSE(Q::isParamOfCall(call, true, true));
}

TEST_F(CallTest, CallAndCalledSymbolOfAParameter) {
  bool isFormal = false;
  bool isActual = false;
  KV_Operation* callOp = nullptr;
  KvCParamSymbol* called = nullptr;
  EXPECT_TRUE(Q::getCallOpIfParamOfCall(actual1, isFormal, isActual, callOp, called));
  EXPECT_TRUE(isActual && !isFormal);
  EXPECT_EQ(callOp, call->getOperation());
  EXPECT_EQ(called, g);
  EXPECT_TRUE(Q::getCallOpIfParamOfCall(formal0, isFormal, isActual, callOp, called));
  EXPECT_TRUE(isFormal && !isActual);

  KvCParamSymbol* m = app.macro("M");
  KV_ExprLocation* ofMacro = app.access(x);
  genericCallOf(app.access(m), app.access(byValue), ofMacro);
  EXPECT_TRUE(Q::getCallOpIfParamOfCall(ofMacro, isFormal, isActual, callOp, called));
  EXPECT_EQ(called, m);

  // A call through a variable: flags and call are set, but no function is called.
  KV_ExprLocation* throughVariable = app.access(x);
  KV_ExprLocation* viaVariable = genericCallOf(app.access(y), app.access(byValue), throughVariable);
  EXPECT_FALSE(Q::getCallOpIfParamOfCall(throughVariable, isFormal, isActual, callOp, called));
  EXPECT_TRUE(isActual);
  EXPECT_EQ(callOp, viaVariable->getOperation());
  EXPECT_EQ(called, nullptr);

  // A parameter under another operation: the flags are set, the call is not.
  KV_ExprLocation* underComma = app.access(x);
  app.op(KV_OP_COMMA, {app.parameter(app.access(byValue), underComma)});
  EXPECT_FALSE(Q::getCallOpIfParamOfCall(underComma, isFormal, isActual, callOp, called));
  EXPECT_TRUE(isActual);
  EXPECT_EQ(callOp, nullptr);

  EXPECT_FALSE(Q::getCallOpIfParamOfCall(call, isFormal, isActual, callOp, called));
  EXPECT_FALSE(isFormal || isActual);
}

TEST_F(CallTest, CalledSymbolIsTheAccessAtOperandZeroAndMissingAccessesAnswerFalse) {
  KvCSymbol* called = nullptr;
  EXPECT_TRUE(Q::isInCallOp(actual0, called));
  EXPECT_EQ(called, g);
  EXPECT_TRUE(Q::isInCallOp(formal0, called));
  EXPECT_FALSE(Q::isInCallOp(call, called));
  EXPECT_EQ(called, nullptr);

  KV_ExprLocation* noCallee = app.access(x);
  KV_ExprLocation* calleeRemoved = app.call(g, {noCallee});
  calleeRemoved->getOperation()->setOperand(0, nullptr);
  KV_ExprLocation* constantCallee = app.access(x);
  genericCallOf(one(), app.access(byValue), constantCallee);
  KV_ExprLocation* symbolMissing = app.access(x);
  genericCallOf(accessWithoutSymbol(), app.access(byValue), symbolMissing);
  KV_ExprLocation* emptyCallee = app.access(x);
  KV_ExprLocation* emptyCalleeCall =
      app.op(KV_OP_CALL, {nullptr, app.parameter(app.access(byValue), emptyCallee)});
  for (KV_ExprLocation* loc : {noCallee, constantCallee, symbolMissing, emptyCallee}) {
    called = g;
    EXPECT_FALSE(Q::isInCallOp(loc, called));
    EXPECT_EQ(called, nullptr);
    KV_Operation* callOp = nullptr;
    EXPECT_FALSE(Q::isLogValInLogMacro(loc, callOp));
    EXPECT_EQ(callOp, loc->getParentOperation()->getParentOperation());
  }
  KvCParamSymbol* calledFunction = nullptr;
  EXPECT_TRUE(Q::containsCallTo(calleeRemoved, calledFunction));
  EXPECT_EQ(calledFunction, g) << "a call operation names its called symbol itself";
  EXPECT_FALSE(Q::containsCallTo(emptyCalleeCall, calledFunction));
  EXPECT_EQ(calledFunction, nullptr);
  bool isFormal = false;
  bool isActual = false;
  KV_Operation* callOp = nullptr;
  EXPECT_FALSE(Q::getCallOpIfParamOfCall(emptyCallee, isFormal, isActual, callOp, calledFunction));
  EXPECT_EQ(callOp, emptyCalleeCall->getOperation());
}

TEST_F(CallTest, LogValueIsAParameterOfALoggingMacro) {
  KvCParamSymbol* log = app.macro("LOG");
  log->setRole(KV_ROLE_LOG_MACRO, true);
  KV_ExprLocation* logged = app.access(x);
  KV_ExprLocation* logCall = inBody(genericCallOf(app.access(log), app.access(byValue), logged));
  KV_Operation* callOp = nullptr;
  EXPECT_TRUE(Q::isLogValInLogMacro(logged, callOp));
  EXPECT_EQ(callOp, logCall->getOperation());
  EXPECT_FALSE(Q::isLogValInLogMacro(actual0, callOp));
  EXPECT_EQ(callOp, call->getOperation());
  KV_Operation* untouched = logCall->getOperation();
  EXPECT_FALSE(Q::isLogValInLogMacro(logCall, untouched));
  EXPECT_EQ(untouched, logCall->getOperation()) << "no parameter: the caller's value stays";
  EXPECT_FALSE(Q::isLogValInLogMacro(app.access(x)));
}

TEST_F(CallTest, ContainedCallNamesAFunctionOrMacro) {
  KvCParamSymbol* called = nullptr;
  EXPECT_TRUE(Q::containsCallTo(call, called));
  EXPECT_EQ(called, g);
  KvCParamSymbol* m = app.macro("M");
  EXPECT_TRUE(Q::containsCallTo(app.genericCall(app.access(m), {}), called));
  EXPECT_EQ(called, m);
  for (KV_ExprLocation* loc : {app.genericCall(app.access(x), {}), app.genericCall(one(), {}),
                               app.add(app.access(x), one()), app.access(x), one()}) {
    called = g;
    EXPECT_FALSE(Q::containsCallTo(loc, called));
    EXPECT_EQ(called, nullptr);
  }
}

TEST_F(CallTest, RetrievedFormalIsAVariableThatIsNoReferenceFormal) {
  KvCUnparamSymbol* formal = nullptr;
  EXPECT_TRUE(Q::isActualOfCallRetrieveFormal(actual0, formal));
  EXPECT_EQ(formal, byValue);
  EXPECT_FALSE(Q::isActualOfCallRetrieveFormal(actual1, formal));
  EXPECT_EQ(formal, nullptr);

  // Failing before the formal's access is seen keeps the caller's value.
  KV_ExprLocation* withConstantFormal = app.access(x);
  app.parameter(one(), withConstantFormal);
  KV_ExprLocation* withoutFormal = app.access(x);
  app.parameter(nullptr, withoutFormal);
  for (KV_ExprLocation* loc : {formal0, withConstantFormal, withoutFormal, app.access(x)}) {
    formal = byRef;
    EXPECT_FALSE(Q::isActualOfCallRetrieveFormal(loc, formal));
    EXPECT_EQ(formal, byRef);
  }
  KV_ExprLocation* symbolMissing = app.access(x);
  app.parameter(accessWithoutSymbol(), symbolMissing);
  EXPECT_FALSE(Q::isActualOfCallRetrieveFormal(symbolMissing, formal));
  EXPECT_EQ(formal, nullptr);
}

TEST_F(CallTest, ScalarFormalHasNoIndexDimensions) {
  KvCUnparamSymbol* arr = app.variable("arr", app.arrayOf(app.int16(), 4));
  KV_ExprLocation* toElement = app.access(x);
  app.parameter(app.element(arr, {2}), toElement);
  EXPECT_TRUE(Q::isActualOfCallWithScalarFormal(actual0));
  EXPECT_FALSE(Q::isActualOfCallWithScalarFormal(toElement));
  EXPECT_FALSE(Q::isActualOfCallWithScalarFormal(formal0));
  KV_ExprLocation* withConstantFormal = app.access(x);
  app.parameter(one(), withConstantFormal);
  EXPECT_FALSE(Q::isActualOfCallWithScalarFormal(withConstantFormal));
}

TEST_F(CallTest, ActualsMayBeWrappedInPointerCastsOnly) {
  KvCUnparamSymbol* p = app.variable("p", app.pointerTo(app.int16()));
  KvCParamSymbol* h = app.function("h").symbol();
  KV_ExprLocation* twiceCast = app.access(p);
  KV_ExprLocation* valueCast = app.access(x);
  KV_ExprLocation* untypedCast = app.access(p);
  KV_ExprLocation* castWithoutType = app.cast(app.pointerTo(app.int16()), untypedCast);
  castWithoutType->getOperation()->setDataType(nullptr);
  inBody(app.call(h, {app.cast(app.pointerTo(app.int16(), true),
                               app.cast(app.pointerTo(app.voidType()), twiceCast)),
                      app.cast(app.int32(), valueCast), castWithoutType}));
  EXPECT_TRUE(Q::isActualOfCallSkipPointerCasts(twiceCast));
  EXPECT_TRUE(Q::isActualOfCallSkipPointerCasts(actual0));
  EXPECT_FALSE(Q::isActualOfCallSkipPointerCasts(valueCast));
  EXPECT_FALSE(Q::isActualOfCallSkipPointerCasts(untypedCast));
  EXPECT_FALSE(Q::isActualOfCallSkipPointerCasts(formal0));
  EXPECT_FALSE(Q::isActualOfCallSkipPointerCasts(app.access(x)));
  KV_ExprLocation* inUnheld = app.access(p);
  unheld(KV_OP_CAST, {inUnheld, app.typeRef(app.pointerTo(app.int16()))})
      ->setDataType(app.pointerTo(app.int16()));
  EXPECT_FALSE(Q::isActualOfCallSkipPointerCasts(inUnheld));
}

TEST_F(CallTest, FormalOfAnExternCUserFunctionCall) {
  KvCParamSymbol* ext = app.function("ext").role(KV_ROLE_SF_EXTERN_C_USER).symbol();
  KV_ExprLocation* actual = app.access(x);
  inBody(app.call(ext, {actual}));
  EXPECT_TRUE(Q::isFormalOfCallToSfExternCUserFcn(formalOf(actual)));
  EXPECT_FALSE(Q::isFormalOfCallToSfExternCUserFcn(actual));
  EXPECT_FALSE(Q::isFormalOfCallToSfExternCUserFcn(formal0));
}

TEST_F(CallTest, FormalReceivesAStringEmittedAsCodeOrInQuotes) {
  KvCParamSymbol* s = app.function("s").symbol();
  KV_ExprLocation* quoted = app.string("a", false, true);
  KV_ExprLocation* asCode = app.cast(app.int32(), app.string("b", true, false));
  KV_ExprLocation* bare = app.string("c", false, false);
  inBody(app.call(s, {quoted, asCode, bare, one()}));
  EXPECT_TRUE(Q::isFormalOfCallReceivingString(formalOf(quoted)));
  EXPECT_TRUE(Q::isFormalOfCallReceivingString(formalOf(asCode)));
  EXPECT_FALSE(Q::isFormalOfCallReceivingString(formalOf(bare)));
  EXPECT_FALSE(Q::isFormalOfCallReceivingString(formal0));
  EXPECT_FALSE(Q::isFormalOfCallReceivingString(quoted));
  KV_ExprLocation* withoutActual = app.access(byValue);
  app.parameter(withoutActual, nullptr);
  EXPECT_FALSE(Q::isFormalOfCallReceivingString(withoutActual));
}

} // namespace
