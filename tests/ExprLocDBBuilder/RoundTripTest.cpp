// Round trips of the def/use databases on synthetic applications of several shapes: the
// incremental operations must always lead back to the state of the full build.
#include "DbSnapshot.h"
#include "HulCvTools/ExprLocDBBuilder/KvCExprLocDBBuilder.h"
#include "platform/builder/AppBuilder.h"
#include "platform/builder/SyntheticApp.h"
#include "platform/icode/KV_ICodeElemVisitor.h"
#include "platform/icode/KV_Statement.h"
#include "platform/icode/KvCICodeIterator.h"

#include <gtest/gtest.h>

#include <vector>

namespace {

class StatementCollector : public KV_ICodeElemVisitor {
public:
  void visitStatement(KV_Statement* statement) override { all.push_back(statement); }
  std::vector<KV_Statement*> all;
};

std::vector<KV_Statement*> statementsOf(AppBuilder& app) {
  StatementCollector collector;
  KvCICodeIterator iterator;
  iterator.iterate(app.data().getApplication(), &collector);
  return collector.all;
}

SyntheticAppShape shapeNumber(int n) {
  SyntheticAppShape shape;
  shape.seed = static_cast<std::uint64_t>(100 + n);
  shape.functions = 6 + 3 * n;
  shape.statementsPerBody = 2 + n;
  shape.callFanOut = n % 3;
  shape.schedulerCalls = n % 2 == 0 ? 5 : 0;
  shape.recursionCycles = n % 2;
  shape.taskActivationShare = 0.25 * (n % 3);
  shape.expressionDepth = 1 + n % 4;
  shape.variables = 5 + n;
  return shape;
}

TEST(ExprLocDBRoundTrip, EveryStatementClearedAndBuiltAgainRestoresTheFullBuild) {
  for (int n = 0; n < 4; ++n) {
    SCOPED_TRACE(n);
    AppBuilder app;
    buildSyntheticApp(app, shapeNumber(n));
    KvCExprLocDBBuilder builder;
    builder.boot(&app.data());
    ASSERT_TRUE(builder.buildExprLocDBs());
    const auto full = snapshot(app.data());
    ASSERT_FALSE(full.empty());
    for (KV_Statement* statement : statementsOf(app)) {
      ASSERT_TRUE(builder.clearExprLocDBsIncremental(statement));
      ASSERT_TRUE(builder.buildExprLocDBsIncremental(statement));
      ASSERT_EQ(snapshot(app.data()), full) << "statement " << statement->getSerial();
    }
  }
}

TEST(ExprLocDBRoundTrip, ClearingEveryStatementEmptiesEveryDatabase) {
  for (int n = 0; n < 4; ++n) {
    SCOPED_TRACE(n);
    AppBuilder app;
    buildSyntheticApp(app, shapeNumber(n));
    KvCExprLocDBBuilder builder;
    builder.boot(&app.data());
    builder.buildExprLocDBs();
    const std::vector<KV_Statement*> statements = statementsOf(app);
    // Innermost first, then outward: every statement once, in reverse walk order.
    for (auto it = statements.rbegin(); it != statements.rend(); ++it)
      ASSERT_TRUE(builder.clearExprLocDBsIncrementalOmitFuncStt(*it));
    EXPECT_TRUE(snapshot(app.data()).empty());
    // Building them back statement by statement gives the full build again.
    for (KV_Statement* statement : statements)
      builder.buildExprLocDBsIncrementalOmitFuncStt(statement);
    builder.rebuildExprLocDBs();
    const auto rebuilt = snapshot(app.data());
    for (KV_Statement* statement : statements)
      builder.clearExprLocDBsIncrementalOmitFuncStt(statement);
    for (KV_Statement* statement : statements)
      builder.buildExprLocDBsIncrementalOmitFuncStt(statement);
    EXPECT_EQ(snapshot(app.data()), rebuilt);
  }
}

TEST(ExprLocDBRoundTrip, RebuildingIsIdempotent) {
  AppBuilder app;
  buildSyntheticApp(app, shapeNumber(5));
  KvCExprLocDBBuilder builder;
  builder.boot(&app.data());
  builder.buildExprLocDBs();
  const auto first = snapshot(app.data());
  builder.buildExprLocDBs();
  EXPECT_EQ(snapshot(app.data()), first) << "a second full build adds nothing";
  builder.rebuildExprLocDBs();
  builder.rebuildExprLocDBs();
  EXPECT_EQ(snapshot(app.data()), first);
}

} // namespace
