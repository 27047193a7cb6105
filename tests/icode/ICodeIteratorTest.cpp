// KvCICodeIterator: the exact visit order, skipping function bodies, ending the walk on
// request, reaching every file, and deep expressions.
#include "ModelChecks.h"

#include "platform/builder/AppBuilder.h"
#include "platform/icode/KvCCStmTable.h"
#include "platform/icode/KvCIcFileServer.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <string>
#include <vector>

namespace {

using icode_test::TraceVisitor;
using Trace = std::vector<std::string>;

// x, arr and f in main.c; f's body has an assignment, a loop with a code block, an
// indexed access and a comma of a string, an empty location and an initial value.
struct SmallApp {
  AppBuilder app;
  FunctionBuilder* f = nullptr;
  BlockBuilder* loopBody = nullptr;

  SmallApp() {
    KvCUnparamSymbol* x = app.variable("x", app.int16());
    KvCUnparamSymbol* arr = app.variable("arr", app.arrayOf(app.int16(), 4));
    f = &app.function("f");
    BlockBuilder& body = f->body();
    body.assign(app.access(x), app.add(app.access(x), app.constant(1)));
    loopBody = &body.whileLoop(app.less(app.access(x), app.constant(3)));
    loopBody->stmt(app.codeBlock("c", false));
    body.stmt(app.element(arr, {2, app.access(x)}));
    body.stmt(app.op(KV_OP_COMMA,
                     {app.string("s"), app.empty(), app.initValue({}, {app.constantExpr(7)})}));
  }
};

const Trace kVarDefX = {
    "Stmt", "Loc",        "Op:VariableDefinition", "Loc", "QSO:x", "Sym:x", "Loc", "Type:Int16",
    "Loc",  "File:main.c"};
const Trace kVarDefArr = {"Stmt",    "Loc", "Op:VariableDefinition", "Loc", "QSO:arr",
                          "Sym:arr", "Loc", "Type:Int16[4]",         "Loc", "File:main.c"};
const Trace kFuncDefF = {
    "Stmt", "Loc",        "Op:FunctionDefinition", "Loc", "QSO:f", "Sym:f", "Loc", "Type:void",
    "Loc",  "File:main.c"};
const Trace kBodyF = {"Table",
                      // x = x + 1
                      "Stmt", "Loc", "Op:Assign", "Loc", "QSO:x", "Sym:x", "Loc", "Op:Add", "Loc",
                      "QSO:x", "Sym:x", "Loc", "Const:1",
                      // while (x < 3) { c }
                      "Stmt", "Loc", "Op:WhileLoop", "Loc", "Op:LoopCondition", "Loc", "Op:Less",
                      "Loc", "QSO:x", "Sym:x", "Loc", "Const:3", "Table", "Stmt", "Loc", "Block",
                      // arr[2][x]: the constant index has no operand location
                      "Stmt", "Loc", "QSO:arr", "Sym:arr", "Loc", "QSO:x", "Sym:x",
                      // "s", <empty>, {7}: the initial value's elements are not entered
                      "Stmt", "Loc", "Op:Comma", "Loc", "Str:s", "Loc", "Empty", "Loc", "Init"};

Trace concat(std::initializer_list<Trace> parts) {
  Trace all;
  for (const Trace& p : parts)
    all.insert(all.end(), p.begin(), p.end());
  return all;
}

Trace walkApp(AppBuilder& app, bool omit = false) {
  TraceVisitor v;
  KvCICodeIterator it;
  if (omit)
    it.omitFuncStt();
  EXPECT_TRUE(it.iterate(app.data().getApplication(), &v));
  return v.trace;
}

TEST(ICodeIteratorTest, VisitsInTreeOrder) {
  SmallApp s;
  const Trace expected = concat({{"App:App", "Sub:Main", "Unit:Unit", "File:main.c", "Table"},
                                 kVarDefX,
                                 kVarDefArr,
                                 kFuncDefF,
                                 kBodyF});
  EXPECT_EQ(walkApp(s.app), expected);

  TraceVisitor fromBody;
  ASSERT_TRUE(KvCICodeIterator().iterateStatementTable(s.f->body().table(), &fromBody));
  EXPECT_EQ(fromBody.trace, kBodyF);

  TraceVisitor fromStatement;
  ASSERT_TRUE(KvCICodeIterator().iterateStatement(s.f->declaration(), &fromStatement));
  EXPECT_EQ(fromStatement.trace, concat({kFuncDefF, kBodyF}));

  KV_ExprLocation* assignRoot = s.f->body().table()->getStatement(0)->getExprLoc();
  TraceVisitor fromLoc;
  ASSERT_TRUE(KvCICodeIterator().iterateExprLoc(assignRoot, &fromLoc));
  EXPECT_EQ(fromLoc.trace, Trace(kBodyF.begin() + 2, kBodyF.begin() + 14));
  TraceVisitor fromOp;
  ASSERT_TRUE(KvCICodeIterator().iterateOperation(assignRoot->getOperation(), &fromOp));
  EXPECT_EQ(fromOp.trace, Trace(kBodyF.begin() + 3, kBodyF.begin() + 14));
}

TEST(ICodeIteratorTest, NullArgumentsVisitNothing) {
  SmallApp s;
  TraceVisitor v;
  KvCICodeIterator it;
  EXPECT_FALSE(it.iterate(nullptr, &v));
  EXPECT_FALSE(it.iterate(s.app.data().getApplication(), nullptr));
  EXPECT_FALSE(it.iterateStatementTable(nullptr, &v));
  EXPECT_FALSE(it.iterateStatement(nullptr, &v));
  EXPECT_FALSE(it.iterateOperation(nullptr, &v));
  EXPECT_FALSE(it.iterateExprLoc(nullptr, &v));
  EXPECT_FALSE(it.iterateStatementTable(s.f->body().table(), nullptr));
  EXPECT_TRUE(v.trace.empty());
}

TEST(ICodeIteratorTest, OmitFuncSttSkipsFunctionBodiesOnly) {
  SmallApp s;
  AppBuilder& app = s.app;
  // A nested block at file level is not a function body.
  app.fileScope().block().stmt(app.string("file block"));
  // A nested block inside the loop, marked as the top of a code block.
  KvCCStmTable* innerTop = s.loopBody->block().table();
  innerTop->setCodeBlockTop(true);
  BlockBuilder(app, innerTop).stmt(app.string("inner top"));

  KvCICodeIterator it;
  EXPECT_FALSE(it.isOmittingFuncStt());
  it.omitFuncStt();
  EXPECT_TRUE(it.isOmittingFuncStt());

  const Trace omitted = walkApp(app, true);
  const Trace fileBlock = {"Stmt", "Table", "Stmt", "Loc", "Str:file block"};
  EXPECT_EQ(omitted, concat({{"App:App", "Sub:Main", "Unit:Unit", "File:main.c", "Table"},
                             kVarDefX,
                             kVarDefArr,
                             kFuncDefF,
                             fileBlock}));

  // Started from a body, the body itself is walked, its loop body too, but not a
  // code-block top below it.
  TraceVisitor fromBody;
  ASSERT_TRUE(it.iterateStatementTable(s.f->body().table(), &fromBody));
  EXPECT_NE(std::find(fromBody.trace.begin(), fromBody.trace.end(), "Block"), fromBody.trace.end());
  EXPECT_EQ(std::find(fromBody.trace.begin(), fromBody.trace.end(), "Str:inner top"),
            fromBody.trace.end());
  TraceVisitor full;
  ASSERT_TRUE(KvCICodeIterator().iterateStatementTable(s.f->body().table(), &full));
  EXPECT_NE(std::find(full.trace.begin(), full.trace.end(), "Str:inner top"), full.trace.end());
  EXPECT_EQ(full.trace.size(), fromBody.trace.size() + 4); // Table, Stmt, Loc, Str
}

// Two files in two code units of two sub-applications, for walks that cross files.
struct TwoUnitApp : SmallApp {
  TwoUnitApp() {
    app.file("b.c");
    app.variable("y", app.int8());
    KvCIcSubAppl* sub = app.data().createSubApplication("Second");
    KvCIcCodeUnit* empty = app.data().createCodeUnit("Empty");
    KvCIcCodeUnit* unit = app.data().createCodeUnit("U2");
    sub->addCodeUnit(empty);
    sub->addCodeUnit(unit);
    app.data().createSubApplication("NoUnits");
    KvCIcFileServer* files = app.data().getFileServer();
    unit->addFile(files->demandFile("z.c"));
    unit->addFile(files->demandFile("w.c"));
    BlockBuilder(app, files->findFile("z.c")->getFile()->getStatementTable())
        .stmt(app.string("in z"));
  }
};

TEST(ICodeIteratorTest, IterateReachesEveryFileOfEveryCodeUnit) {
  TwoUnitApp s;
  const Trace trace = walkApp(s.app);
  Trace tree;
  for (const std::string& t : trace)
    if (t.rfind("App:", 0) == 0 || t.rfind("Sub:", 0) == 0 || t.rfind("Unit:", 0) == 0 ||
        (t.rfind("File:", 0) == 0 && t != "File:main.c" && t != "File:b.c") || t == "Str:in z")
      tree.push_back(t);
  EXPECT_EQ(tree, (Trace{"App:App", "Sub:Main", "Unit:Unit", "Sub:Second", "Unit:Empty", "Unit:U2",
                         "File:z.c", "Str:in z", "File:w.c", "Sub:NoUnits"}));
  // main.c and b.c: each visited as a file and once per definition referring to it.
  EXPECT_EQ(std::count(trace.begin(), trace.end(), "File:b.c"), 2);
  EXPECT_EQ(std::count(trace.begin(), trace.end(), "QSO:y"), 1);
}

// Every stop after k visits leaves exactly the first k visits of the full walk.
TEST(ICodeIteratorTest, StopIterationEndsTheWalkAtEveryPoint) {
  TwoUnitApp s;
  const Trace full = walkApp(s.app);
  ASSERT_GT(full.size(), 60u);
  for (std::size_t k = 0; k <= full.size(); ++k) {
    TraceVisitor v(static_cast<int>(k));
    KvCICodeIterator().iterate(s.app.data().getApplication(), &v);
    ASSERT_EQ(v.trace, Trace(full.begin(), full.begin() + static_cast<std::ptrdiff_t>(k)))
        << "stopping after " << k << " visits";
  }
  const Trace body = [&] {
    TraceVisitor v;
    KvCICodeIterator().iterateStatementTable(s.f->body().table(), &v);
    return v.trace;
  }();
  for (std::size_t k = 0; k <= body.size(); ++k) {
    TraceVisitor v(static_cast<int>(k));
    KvCICodeIterator().iterateStatementTable(s.f->body().table(), &v);
    ASSERT_EQ(v.trace, Trace(body.begin(), body.begin() + static_cast<std::ptrdiff_t>(k)))
        << "stopping after " << k << " visits";
  }
}

// A visitor that answers true once: the walk still ends there.
class StopOnceVisitor : public TraceVisitor {
public:
  explicit StopOnceVisitor(int question) : stopAt(question) {}
  bool stopIteration() override {
    if (++asked != stopAt)
      return false;
    sizeAtStop = static_cast<int>(trace.size());
    return true;
  }
  int sizeAtStop = -1;

private:
  int stopAt;
  int asked = 0;
};

TEST(ICodeIteratorTest, OneTrueAnswerEndsTheWholeWalk) {
  TwoUnitApp s;
  TraceVisitor counter;
  KvCICodeIterator().iterate(s.app.data().getApplication(), &counter);
  for (int q = 1; q <= counter.stopQuestions; ++q) {
    StopOnceVisitor v(q);
    KvCICodeIterator().iterate(s.app.data().getApplication(), &v);
    ASSERT_EQ(static_cast<int>(v.trace.size()), v.sizeAtStop) << "stopped at question " << q;
  }
}

TEST(ICodeIteratorTest, DeepExpressionChainDoesNotExhaustTheStack) {
  AppBuilder app;
  KvCUnparamSymbol* x = app.variable("x", app.int16());
  constexpr int kDepth = 10000;
  KV_ExprLocation* chain = app.access(x);
  for (int i = 0; i < kDepth; ++i)
    chain = app.neg(chain);
  FunctionBuilder& f = app.function("f");
  KV_Statement* statement = f.body().stmt(chain);

  icode_test::CoherenceChecker checker;
  ASSERT_TRUE(KvCICodeIterator().iterateStatement(statement, &checker));
  EXPECT_TRUE(checker.faults.empty());
  EXPECT_EQ(checker.locations, kDepth + 1);
  EXPECT_EQ(checker.operations, kDepth + 1); // the negations and the access
  TraceVisitor whole;
  KvCICodeIterator().iterate(app.data().getApplication(), &whole);
  EXPECT_EQ(std::count(whole.trace.begin(), whole.trace.end(), "Op:Neg"), kDepth);
  EXPECT_EQ(whole.trace.back(), "Sym:x");
  // The innermost location still finds its statement.
  KV_ExprLocation* leaf = chain;
  while (leaf->getOperation() && leaf->getOperation()->getNumberOfOperands() > 0)
    leaf = leaf->getOperation()->getOperand(0);
  EXPECT_EQ(leaf->getStatement(), statement);
}

} // namespace
