#include "HulCvTools/ExprLocDBBuilder/KvCExprLocDBBuilder.h"
#include "DbSnapshot.h"
#include "HulCvTools/Control/KvCInternalCheck.h"
#include "platform/builder/AppBuilder.h"
#include "platform/icode/KV_ExprLocation.h"
#include "platform/icode/KV_Operation.h"
#include "platform/icode/KV_QualifiedSymbolOp.h"
#include "platform/icode/KV_Statement.h"
#include "platform/icode/KvCCStmTable.h"
#include "platform/icode/KvCSmbInitValExpr.h"
#include "platform/support/KvCMessageServer.h"

#include <gtest/gtest.h>

namespace {

using Locs = std::vector<KV_ExprLocation*>;

class ExprLocDBBuilderTest : public ::testing::Test {
protected:
  void SetUp() override {
    server().clear();
    server().setShowInternalInfo(false);
    builder.boot(&app.data());
  }
  void TearDown() override {
    server().clear();
    server().setShowInternalInfo(false);
  }
  static KvCMessageServer& server() { return *KvCMessageServer::getMessageServer(); }

  AppBuilder app;
  KvCExprLocDBBuilder builder;
};

TEST_F(ExprLocDBBuilderTest, AssignmentEntersLeftAsDefinitionAndRightAsUse) {
  KvCUnparamSymbol* x = app.variable("x", app.int16());
  KV_ExprLocation* lhs = app.access(x);
  KV_ExprLocation* rhsX = app.access(x);
  app.function("f").body().assign(lhs, app.add(rhsX, app.constant(std::int64_t{1})));
  ASSERT_TRUE(builder.buildExprLocDBs());
  const Locs defs = entriesOf(x, KV_DB_QSO_DEF);
  ASSERT_EQ(defs.size(), 2u) << "the file-level definition and the assignment";
  EXPECT_EQ(defs[1], lhs);
  EXPECT_EQ(entriesOf(x, KV_DB_QSO_USE), Locs{rhsX});
}

TEST_F(ExprLocDBBuilderTest, ReadModifyWriteOperandIsEnteredOnBothSides) {
  KvCUnparamSymbol* x = app.variable("x", app.int16(), false);
  KV_ExprLocation* operand = app.access(x);
  app.function("f").body().stmt(app.op(KV_OP_ADD_ASSIGN, {operand, app.constant(std::int64_t{2})}));
  KV_ExprLocation* counter = app.access(x);
  app.function("f").body().stmt(app.op(KV_OP_POST_INCREMENT, {counter}));
  builder.buildExprLocDBs();
  EXPECT_EQ(entriesOf(x, KV_DB_QSO_DEF), (Locs{operand, counter}));
  EXPECT_EQ(entriesOf(x, KV_DB_QSO_USE), (Locs{operand, counter}));
}

TEST_F(ExprLocDBBuilderTest, StaticDeclarationsAndRestartDefinitionsHaveTheirOwnCategories) {
  KvCUnparamSymbol* s = app.variable("s", app.int16(), false);
  KvCUnparamSymbol* w = app.variable("w", app.int16(), false);
  KV_ExprLocation* declared = app.access(s);
  KV_ExprLocation* usedInDecl = app.access(w);
  app.fileScope().stmt(app.op(KV_OP_STATIC_DECLDEF, {declared, usedInDecl}));
  KV_ExprLocation* restartDef = app.access(w);
  KV_ExprLocation* stepDef = app.access(w);
  app.function("restart")
      .role(KV_ROLE_RESTART_FUNCTION)
      .body()
      .ifThen(app.access(s))
      .assign(restartDef, app.constant(std::int64_t{0}));
  app.function("step").body().assign(stepDef, app.constant(std::int64_t{1}));
  builder.buildExprLocDBs();
  EXPECT_EQ(entriesOf(s, KV_DB_STATIC_DECLDEF_DEF), Locs{declared});
  EXPECT_EQ(entriesOf(w, KV_DB_STATIC_DECLDEF_USE), Locs{usedInDecl});
  EXPECT_EQ(entriesOf(w, KV_DB_RESTART_DEF), Locs{restartDef}) << "also in nested blocks";
  EXPECT_EQ(entriesOf(w, KV_DB_QSO_DEF), Locs{stepDef});
  EXPECT_EQ(entriesOf(s, KV_DB_QSO_USE).size(), 1u) << "the if condition";
}

// A statement whose root is a bare access has no parent operation: every walk of it
// raises one debug report, which lets a test count the walks.
int reportsAfterBuild(KvCExprLocDBBuilder& b) {
  KvCMessageServer* s = KvCMessageServer::getMessageServer();
  s->clear();
  s->setShowInternalInfo(true);
  b.buildExprLocDBs();
  s->setShowInternalInfo(false);
  return static_cast<int>(s->getDebugAssertions().size());
}

TEST_F(ExprLocDBBuilderTest, DeclaredOnlySelectedFunctionBodyIsWalkedOnce) {
  KvCUnparamSymbol* z = app.variable("z", app.int16(), false);
  FunctionBuilder& g = app.declaredFunction("g");
  KV_ExprLocation* inG = app.access(z);
  g.body().assign(inG, app.constant(std::int64_t{2}));
  g.body().stmt(app.access(z));
  builder.buildExprLocDBs();
  EXPECT_EQ(entriesOf(z, KV_DB_QSO_DEF), Locs{inG});
  if (KvCInternalCheck::hasDebugChecks()) {
    EXPECT_EQ(reportsAfterBuild(builder), 1);
  }
}

TEST_F(ExprLocDBBuilderTest, DeclaredAndDefinedFunctionIsWalkedOnlyWithItsDefinition) {
  KvCUnparamSymbol* z = app.variable("z", app.int16(), false);
  FunctionBuilder& f = app.function("f");
  app.fileScope().stmt(app.funcDecl(f.symbol()));
  f.body().stmt(app.access(z));
  if (KvCInternalCheck::hasDebugChecks()) {
    EXPECT_EQ(reportsAfterBuild(builder), 1);
  }
}

TEST_F(ExprLocDBBuilderTest, DeclaredOnlyFunctionThatIsNotSelectedIsNotWalked) {
  KvCUnparamSymbol* z = app.variable("z", app.int16(), false);
  FunctionBuilder& g = app.declaredFunction("g");
  g.symbol()->setSelected(false);
  g.body().assign(app.access(z), app.constant(std::int64_t{2}));
  builder.buildExprLocDBs();
  EXPECT_TRUE(z->getExprLocDB()->isEmpty());
}

TEST_F(ExprLocDBBuilderTest, TypeDefinitionsDefineTheirTypeAndUseTheOthers) {
  KV_StructType* record = app.structType("Record", {{"a", app.int16()}});
  app.fileScope().stmt(app.typeDef(record, {app.int16(), app.uint8()}));
  KV_ExprLocation* castType = nullptr;
  KV_ExprLocation* cast = app.cast(app.int32(), app.constant(std::int64_t{1}));
  castType = cast->getOperation()->getOperand(1);
  app.function("f").body().stmt(cast);
  KV_ExprLocation* stray = app.typeRef(app.float32());
  app.function("f").body().stmt(app.op(KV_OP_COMMA, {stray, app.constant(std::int64_t{0})}));
  builder.buildExprLocDBs();
  EXPECT_EQ(entriesOf(record->getExprLocDB(), KV_DB_DEF).size(), 1u);
  EXPECT_EQ(entriesOf(app.uint8()->getExprLocDB(), KV_DB_USE).size(), 1u);
  EXPECT_EQ(entriesOf(app.int32()->getExprLocDB(), KV_DB_USE), Locs{castType});
  EXPECT_TRUE(app.float32()->getExprLocDB()->isEmpty()) << "no type-using parent";
}

TEST_F(ExprLocDBBuilderTest, ScalarInitialValueEntersItsOwnLocationNotTheElement) {
  KvCUnparamSymbol* w = app.variable("w", app.int16(), false);
  KvCUnparamSymbol* v = app.variable("v", app.int16(), false);
  KvCUnparamSymbol* arr = app.variable("arr", app.arrayOf(app.int16(), 2), false);
  KV_ExprLocation* init = app.initValue({}, {app.accessExpr(w)});
  app.fileScope().stmt(app.varDef(v, {init}));
  app.fileScope().stmt(
      app.varDef(arr, {app.initValue({2}, {app.accessExpr(w), app.accessExpr(w)})}));
  builder.buildExprLocDBs();
  EXPECT_EQ(entriesOf(w, KV_DB_QSO_USE), Locs{init});
  EXPECT_EQ(w->getExprLocDB()->getNumberOfDefs(), 0);
}

TEST_F(ExprLocDBBuilderTest, InitialValueOperationIsWalkedAndCanBeClearedAgain) {
  KvCUnparamSymbol* w = app.variable("w", app.int16(), false);
  KvCUnparamSymbol* v = app.variable("v", app.int16(), false);
  KV_ExprLocation* inner = app.access(w);
  KV_Operation* sum = app.operationExpr(KV_OP_ADD, {inner, app.constant(std::int64_t{1})});
  KV_ExprLocation* init = app.initValue({}, {sum});
  app.fileScope().stmt(app.varDef(v, {init}));
  builder.buildExprLocDBs();
  EXPECT_EQ(entriesOf(w, KV_DB_QSO_USE), Locs{inner});
  EXPECT_TRUE(builder.clearExprLocDBsIncremental(init->getSmbInitValExpr()));
  EXPECT_TRUE(w->getExprLocDB()->isEmpty());
  EXPECT_TRUE(builder.buildExprLocDBsIncremental(init->getSmbInitValExpr()));
  EXPECT_EQ(entriesOf(w, KV_DB_QSO_USE), Locs{inner});
}

TEST_F(ExprLocDBBuilderTest, ReferencesWithoutParentOperationEnterNothing) {
  KvCUnparamSymbol* x = app.variable("x", app.int16(), false);
  app.function("f").body().stmt(app.access(x));
  app.function("f").body().stmt(app.typeRef(app.int16()));
  server().setShowInternalInfo(true);
  builder.buildExprLocDBs();
  EXPECT_TRUE(x->getExprLocDB()->isEmpty());
  EXPECT_EQ(entriesOf(app.int16()->getExprLocDB(), KV_DB_USE).size(), 0u);
  if (KvCInternalCheck::hasDebugChecks()) {
    ASSERT_EQ(server().getDebugAssertions().size(), 2u);
    EXPECT_EQ(server().getDebugAssertions()[0].expression.str(), "pParentOperation");
  }
  EXPECT_TRUE(server().getMessages().empty());
}

TEST_F(ExprLocDBBuilderTest, IncrementalClearAndBuildOfAStatementRestoresTheDatabases) {
  KvCUnparamSymbol* x = app.variable("x", app.int16());
  KvCUnparamSymbol* y = app.variable("y", app.int16());
  BlockBuilder& body = app.function("f").body();
  body.assign(app.access(x), app.cast(app.int16(), app.access(y)));
  KV_Statement* loop = (body.forLoop(app.assignExpr(app.access(x), app.constant(std::int64_t{0})),
                                     app.less(app.access(x), app.constant(std::int64_t{4})),
                                     app.op(KV_OP_POST_INCREMENT, {app.access(x)})),
                        body.lastStatement());
  builder.buildExprLocDBs();
  const auto before = snapshot(app.data());
  ASSERT_TRUE(builder.clearExprLocDBsIncremental(loop));
  EXPECT_NE(snapshot(app.data()), before);
  ASSERT_TRUE(builder.buildExprLocDBsIncremental(loop));
  EXPECT_EQ(snapshot(app.data()), before);
}

TEST_F(ExprLocDBBuilderTest, OmitFuncSttLeavesFunctionBodiesAlone) {
  KvCUnparamSymbol* x = app.variable("x", app.int16(), false);
  FunctionBuilder& f = app.function("f");
  f.body().assign(app.access(x), app.constant(std::int64_t{1}));
  builder.buildExprLocDBs();
  const auto before = snapshot(app.data());
  ASSERT_TRUE(builder.clearExprLocDBsIncrementalOmitFuncStt(f.declaration()));
  EXPECT_EQ(entriesOf(x, KV_DB_QSO_DEF).size(), 1u) << "the body was not entered";
  EXPECT_TRUE(f.symbol()->getExprLocDB()->isEmpty()) << "the definition itself was cleared";
  ASSERT_TRUE(builder.buildExprLocDBsIncrementalOmitFuncStt(f.declaration()));
  EXPECT_EQ(snapshot(app.data()), before);
  ASSERT_TRUE(builder.clearExprLocDBsIncremental(f.declaration()));
  EXPECT_TRUE(x->getExprLocDB()->isEmpty());
}

TEST_F(ExprLocDBBuilderTest, RebuildTwiceGivesTheSameDatabases) {
  KvCUnparamSymbol* x = app.variable("x", app.int16());
  app.function("f").body().assign(app.access(x),
                                  app.call(app.function("g").symbol(), {app.access(x)}));
  builder.buildExprLocDBs();
  const auto first = snapshot(app.data());
  builder.rebuildExprLocDBs();
  EXPECT_EQ(snapshot(app.data()), first);
  builder.rebuildExprLocDBs();
  EXPECT_EQ(snapshot(app.data()), first);
}

TEST_F(ExprLocDBBuilderTest, UnbootedBuilderReportsAndDoesNothing) {
  KvCExprLocDBBuilder idle;
  KvCUnparamSymbol* x = app.variable("x", app.int16());
  EXPECT_FALSE(idle.buildExprLocDBs());
  EXPECT_FALSE(idle.clearExprLocDBsIncremental(app.fileScope().lastStatement()));
  EXPECT_TRUE(x->getExprLocDB()->isEmpty());
  ASSERT_EQ(server().getMessages().size(), 2u);
  EXPECT_EQ(server().getMessages()[0].number, 10007);
  EXPECT_FALSE(builder.buildExprLocDBsIncremental(static_cast<KV_Statement*>(nullptr)));
  builder.shutdown();
  EXPECT_FALSE(builder.buildExprLocDBs());
}

} // namespace
