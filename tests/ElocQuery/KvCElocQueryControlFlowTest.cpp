#include "ElocQueryFixture.h"
#include "HulCvTools/ElocQuery/KvCElocQuery.h"

namespace {

using Q = KvCElocQuery;
using ControlFlowTest = ElocQueryTest;

TEST_F(ControlFlowTest, ForLoopPartsAreToldApart) {
  KV_ExprLocation* initTarget = app.access(i);
  KV_ExprLocation* init = app.assignExpr(initTarget, app.constant(std::int64_t{0}));
  KV_ExprLocation* counter = app.access(i);
  KV_ExprLocation* shifted = app.add(counter, one());
  KV_ExprLocation* limit = app.constant(std::int64_t{10});
  KV_ExprLocation* cond = app.less(shifted, limit);
  KV_ExprLocation* incremented = app.access(i);
  KV_ExprLocation* incr = app.op(KV_OP_POST_INCREMENT, {incremented});
  KV_ExprLocation* inBodyOfLoop = app.access(x);
  body().forLoop(init, cond, incr).assign(inBodyOfLoop, one());
  KV_ExprLocation* loopCondition = cond->getParent()->asOperation()->getParent();

  for (KV_ExprLocation* loc : {cond, shifted, loopCondition})
    EXPECT_TRUE(Q::isLocatedInLoopCondition(loc));
  // A plain access or a constant holds no operation of its own.
  for (KV_ExprLocation* loc : {counter, limit, init, incr, inBodyOfLoop})
    EXPECT_FALSE(Q::isLocatedInLoopCondition(loc));

  EXPECT_TRUE(Q::isLocatedInInitOfForLoopCondition(initTarget));
  EXPECT_TRUE(Q::isLocatedInInitOfForLoopCondition(init));
  for (KV_ExprLocation* loc : {counter, cond, incremented, inBodyOfLoop})
    EXPECT_FALSE(Q::isLocatedInInitOfForLoopCondition(loc));
  KV_ExprLocation* inUnheld = app.access(x);
  unheld(KV_OP_ADD, {inUnheld, one()});
  EXPECT_FALSE(Q::isLocatedInInitOfForLoopCondition(inUnheld));
}

TEST_F(ControlFlowTest, WhileConditionIsALoopConditionToo) {
  KV_ExprLocation* cond = app.greater(app.access(x), one());
  body().whileLoop(cond);
  EXPECT_TRUE(Q::isLocatedInLoopCondition(cond));
  EXPECT_FALSE(Q::isLocatedInLoopCondition(inBody(app.less(app.access(x), one()))));
}

TEST_F(ControlFlowTest, EnclosingPreprocessorAndBooleanOperationsAreFoundAtAnyDepth) {
  KV_ExprLocation* deep = app.access(x);
  inBody(app.op(KV_OP_PREPROC_IF, {app.equal(app.add(deep, one()), one())}));
  EXPECT_TRUE(Q::isPartOfPreProcControlFlow(deep));
  EXPECT_TRUE(Q::isPartOfBooleanLogicExpression(deep));

  KV_ExprLocation* negated = app.access(x);
  inBody(app.assignExpr(app.access(y), app.logNot(app.bitNot(negated))));
  EXPECT_TRUE(Q::isPartOfBooleanLogicExpression(negated));
  EXPECT_FALSE(Q::isPartOfPreProcControlFlow(negated));

  KV_ExprLocation* arithmetic = app.access(x);
  inBody(app.assignExpr(app.access(y), app.mul(arithmetic, one())));
  EXPECT_FALSE(Q::isPartOfBooleanLogicExpression(arithmetic));
  EXPECT_FALSE(Q::isPartOfPreProcControlFlow(arithmetic));
}

} // namespace
