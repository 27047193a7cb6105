// Parent and index coherence of the ICode tree: after building, after replacing,
// releasing and moving, and the attachments the model must refuse (a second parent, an
// expression held twice, cycles, duplicates in one operation).
#include "ModelChecks.h"

#include "platform/builder/AppBuilder.h"
#include "platform/icode/KV_ICodeFactoryContainer.h"
#include "platform/icode/KvCCStmTable.h"
#include "platform/icode/KvCCallOperation.h"
#include "platform/icode/KvCParamSymbol.h"
#include "platform/icode/KvCUnparamSymbol.h"

#include <gtest/gtest.h>

#include <cstdint>
#include <random>
#include <vector>

namespace {

using icode_test::coherenceFaults;
using icode_test::joinFaults;
using icode_test::reachesTop;

// A fixture with every kind of construct the builder offers, over two files.
struct VariedApp {
  AppBuilder app;
  KvCUnparamSymbol* x = nullptr;
  KvCUnparamSymbol* y = nullptr;
  FunctionBuilder* f = nullptr;
  FunctionBuilder* ext = nullptr;

  VariedApp() {
    x = app.variable("x", app.int16());
    y = app.variable("y", app.uint8());
    KvCUnparamSymbol* arr = app.variable("arr", app.arrayOf(app.int16(), 8));
    KvCUnparamSymbol* mat = app.variable("mat", app.arrayOf(app.arrayOf(app.int32(), 4), 3));
    KV_StructType* s = app.structType("S", {{"a", app.int16()}, {"b", app.int32()}});
    KvCUnparamSymbol* sv = app.variable("sv", s);
    KvCUnparamSymbol* ca = app.component("a", app.int16());
    KvCUnparamSymbol* p = app.variable("p", app.pointerTo(app.int16()));
    KvCUnparamSymbol* table = app.variable("table", app.arrayOf(app.int16(), 4), false);
    KV_ExprLocation* addElem = app.constant(3);
    KV_Operation* sum = app.operationExpr(KV_OP_ADD, {addElem, app.access(y)});
    app.fileScope().stmt(app.varDef(
        table,
        {app.initValue({4}, {app.constantExpr(1), app.constantExpr(2), app.accessExpr(x), sum})}));
    app.fileScope().stmt(app.typeDef(s, {app.int16(), app.int32()}));
    app.fileScope().stmt(app.staticDeclDef(y));
    app.fileScope().block().stmt(app.string("file-level block"));
    KvCParamSymbol* macro = app.macro("M");

    app.file("other.c");
    FunctionBuilder& g = app.function("g", app.int16());
    g.addFormal("a", app.int16());
    g.body().ret(app.add(app.access(g.formal(0)), app.constant(1)));

    f = &app.function("f");
    BlockBuilder& body = f->body();
    body.assign(app.access(x), app.add(app.mul(app.access(x), app.constant(2)),
                                       app.cast(app.int16(), app.access(y))));
    body.assign(app.element(arr, {app.add(app.access(x), app.constant(1))}),
                app.element(mat, {1, app.access(x)}));
    body.assign(app.componentAccess(sv, ca), app.deref(p));
    body.call(g.symbol(), {app.access(x)});
    body.stmt(app.call(macro, {app.constant(1), app.constant(2.5, app.float64())}));
    BlockBuilder& loop = body.forLoop(app.assignExpr(app.access(x), app.constant(0)),
                                      app.less(app.access(x), app.constant(8)),
                                      app.op(KV_OP_POST_INCREMENT, {app.access(x)}));
    loop.assign(app.element(arr, {app.access(x)}), app.neg(app.access(y)));
    loop.ifThen(app.logAnd(app.greater(app.access(x), app.constant(3)),
                           app.logNot(app.equal(app.access(y), app.constant(0)))))
        .stmt(app.op(KV_OP_BREAK, {}));
    body.whileLoop(app.less(app.access(y), app.constant(4)))
        .stmt(app.op(KV_OP_ADD_ASSIGN, {app.access(y), app.constant(1)}));
    body.block().stmt(app.codeBlock("nop();", false));
    body.protectedBlock("RES").activateTask(g.symbol());
    body.stmt(app.genericCall(app.access(p), {app.string("fmt"), app.empty()}));
    body.stmt(app.op(KV_OP_CONDITIONAL,
                     {app.access(x), app.typeRef(app.int16()), app.fileRef(app.currentFile())}));
    body.stmt(nullptr);
    body.ret();
    ext = &app.declaredFunction("ext");
    ext->body().assign(app.access(x), app.constant(5));
  }

  KV_Operation* rootOp(int statement) const {
    return f->body().table()->getStatement(statement)->getExprLoc()->getOperation();
  }
  KV_ExprLocation* newStatementRoot(KV_ExprLocation* root) {
    return f->body().stmt(root)->getExprLoc();
  }
};

void expectCoherent(VariedApp& v) {
  const std::vector<std::string> faults = coherenceFaults(v.app.data().getApplication());
  EXPECT_TRUE(faults.empty()) << joinFaults(faults);
  const std::vector<std::string> extFaults = coherenceFaults(v.ext->body().table());
  EXPECT_TRUE(extFaults.empty()) << joinFaults(extFaults);
}

void expectParentless(const KV_ExprLocation* loc) {
  EXPECT_EQ(loc->getParent(), nullptr);
  EXPECT_EQ(loc->getIndexInParent(), -1);
}

// --- after construction and mutation

TEST(ParentCoherenceTest, VariedFixtureIsCoherentEverywhere) {
  VariedApp v;
  icode_test::CoherenceChecker checker;
  KvCICodeIterator().iterate(v.app.data().getApplication(), &checker);
  EXPECT_TRUE(checker.faults.empty()) << joinFaults(checker.faults);
  // The walk covered the fixture (not an empty application).
  EXPECT_GT(checker.locations, 100);
  EXPECT_GT(checker.tables, 8);
  expectCoherent(v);
}

TEST(ParentCoherenceTest, ReplacingAnOperandDetachesTheOldAndAttachesTheNew) {
  VariedApp v;
  AppBuilder& app = v.app;
  KV_Operation* assign = v.rootOp(0);
  KV_ExprLocation* oldRhs = assign->getOperand(1);
  KV_ExprLocation* newRhs = app.sub(app.access(v.y), app.constant(7));
  ASSERT_TRUE(assign->setOperand(1, newRhs));
  expectParentless(oldRhs);
  EXPECT_EQ(newRhs->getParent(), assign);
  EXPECT_EQ(newRhs->getIndexInParent(), 1);
  EXPECT_EQ(assign->getNumberOfOperands(), 2);
  // The detached subtree is itself coherent and can be used again.
  EXPECT_TRUE(coherenceFaults(oldRhs).empty());
  v.newStatementRoot(oldRhs);
  // Emptying a slot and filling it again.
  KV_ExprLocation* lhs = assign->getOperand(0);
  ASSERT_TRUE(assign->setOperand(0, nullptr));
  expectParentless(lhs);
  EXPECT_EQ(assign->getOperand(0), nullptr);
  ASSERT_TRUE(assign->setOperand(0, lhs));
  // Setting the operand that is there already changes nothing.
  ASSERT_TRUE(assign->setOperand(0, lhs));
  EXPECT_EQ(lhs->getIndexInParent(), 0);
  expectCoherent(v);
}

TEST(ParentCoherenceTest, MovingAnExpressionBetweenLocations) {
  VariedApp v;
  KV_ExprLocation* from = v.rootOp(0)->getOperand(1);
  KV_Operation* moved = from->getOperation();
  ASSERT_NE(moved, nullptr);
  const int operandCount = moved->getNumberOfOperands();
  EXPECT_EQ(from->releaseContent(), moved);
  EXPECT_TRUE(from->isEmpty());
  EXPECT_EQ(moved->getParent(), nullptr);
  KV_ExprLocation* to = v.newStatementRoot(v.app.empty());
  ASSERT_TRUE(to->setExpression(moved));
  EXPECT_EQ(moved->getParent(), to);
  EXPECT_EQ(moved->getNumberOfOperands(), operandCount);
  EXPECT_EQ(moved->findParentStatement(), v.f->body().lastStatement());
  // Setting the held expression again changes nothing.
  EXPECT_TRUE(to->setExpression(moved));
  EXPECT_EQ(moved->getParent(), to);
  expectCoherent(v);
}

TEST(ParentCoherenceTest, ReferencesAndEmptyingReleaseTheHeldExpression) {
  VariedApp v;
  KV_ExprLocation* a = v.rootOp(0)->getOperand(1);
  KvCIcExpression* e1 = a->getExpression();
  a->setDataTypeRef(v.app.int32());
  EXPECT_EQ(e1->getParent(), nullptr);
  EXPECT_EQ(a->getExpression(), nullptr);
  EXPECT_EQ(a->getDataTypeRef(), v.app.int32());

  KV_ExprLocation* b = v.rootOp(1)->getOperand(1);
  KvCIcExpression* e2 = b->getExpression();
  b->setFileIdRef(v.app.currentFile());
  EXPECT_EQ(e2->getParent(), nullptr);
  EXPECT_EQ(b->getDataTypeRef(), nullptr);

  KV_ExprLocation* c = v.rootOp(2)->getOperand(1);
  KvCIcExpression* e3 = c->getExpression();
  ASSERT_TRUE(c->setExpression(nullptr));
  EXPECT_EQ(e3->getParent(), nullptr);
  EXPECT_TRUE(c->isEmpty());
  // A released expression can be held again elsewhere.
  ASSERT_TRUE(b->setExpression(e1));
  EXPECT_EQ(b->getFileIdRef(), nullptr);
  expectCoherent(v);
}

TEST(ParentCoherenceTest, ReplacingAStatementRootDetachesTheOldRoot) {
  VariedApp v;
  KV_Statement* statement = v.f->body().table()->getStatement(0);
  KV_ExprLocation* oldRoot = statement->getExprLoc();
  KV_ExprLocation* newRoot = v.app.op(KV_OP_RETURN, {});
  ASSERT_TRUE(statement->setExprLoc(newRoot));
  expectParentless(oldRoot);
  EXPECT_EQ(newRoot->getParent(), statement);
  EXPECT_EQ(newRoot->getIndexInParent(), 0);
  ASSERT_TRUE(statement->setExprLoc(nullptr));
  expectParentless(newRoot);
  ASSERT_TRUE(statement->setExprLoc(oldRoot));
  expectCoherent(v);
}

TEST(ParentCoherenceTest, InitialValueElementsFollowTheHoldingLocation) {
  AppBuilder app;
  KV_Constant* c = app.constantExpr(1);
  KV_Operation* sum = app.operationExpr(KV_OP_ADD, {app.constant(2), app.constant(3)});
  KV_ExprLocation* holder = app.initValue({2}, {c, sum});
  KvCSmbInitValExpr* init = holder->getSmbInitValExpr();
  ASSERT_NE(init, nullptr);
  EXPECT_EQ(c->getParent(), holder);
  EXPECT_EQ(sum->getParent(), holder);
  // The statement of an element's subtree is found through the holder.
  KV_Statement* statement = app.fileScope().stmt(holder);
  EXPECT_EQ(sum->getOperand(0)->getStatement(), statement);
  EXPECT_EQ(sum->findParentStatement(), statement);

  holder->releaseContent();
  EXPECT_EQ(init->getParent(), nullptr);
  EXPECT_EQ(c->getParent(), nullptr);
  EXPECT_EQ(sum->getParent(), nullptr);
  KV_ExprLocation* other = app.empty();
  ASSERT_TRUE(other->setExpression(init));
  EXPECT_EQ(c->getParent(), other);
  EXPECT_EQ(sum->getParent(), other);
  EXPECT_TRUE(coherenceFaults(other).empty());
  // An element held by the initial value cannot be held by a location too.
  EXPECT_FALSE(app.empty()->setExpression(c));
  EXPECT_EQ(app.factories().getExprLocFactory()->createFromExpression(sum), nullptr);
  EXPECT_EQ(c->getParent(), other);
}

TEST(ParentCoherenceTest, InitialValueRefusesBadElements) {
  AppBuilder app;
  KvCSmbInitValExpr* init = app.factories().getExprLocFactory()->createInitValue({2});
  KV_Constant* c = app.constantExpr(1);
  EXPECT_FALSE(init->addElement(nullptr));
  EXPECT_FALSE(init->addElement(init));
  KV_ExprLocation* held = app.constant(5);
  EXPECT_FALSE(init->addElement(held->getExpression()));
  EXPECT_TRUE(init->addElement(c));
  EXPECT_FALSE(init->addElement(c));
  EXPECT_TRUE(init->addElement(app.constantExpr(2)));
  EXPECT_FALSE(init->addElement(app.constantExpr(3))); // full
  EXPECT_EQ(init->getNumberOfElements(), 2);
  EXPECT_EQ(held->getExpression()->getParent(), held);
}

// An element of an initial value that no location holds yet belongs to the value all
// the same: it cannot be held by a location or a second initial value, or it would end
// up with two holders once the value is placed.
TEST(ParentCoherenceTest, ElementOfAnUnplacedInitialValueIsNotFree) {
  AppBuilder app;
  KV_ExprLocFactory* locs = app.factories().getExprLocFactory();
  KvCSmbInitValExpr* init = locs->createInitValue({});
  KV_Constant* c = app.constantExpr(1);
  ASSERT_TRUE(init->addElement(c));
  KV_ExprLocation* thief = app.empty();
  EXPECT_FALSE(thief->setExpression(c));
  EXPECT_EQ(locs->createFromExpression(c), nullptr);
  KvCSmbInitValExpr* second = locs->createInitValue({});
  EXPECT_FALSE(second->addElement(c));

  KV_ExprLocation* holder = locs->createFromExpression(init);
  ASSERT_NE(holder, nullptr);
  EXPECT_EQ(c->getParent(), holder);
  EXPECT_EQ(thief->getExpression(), nullptr);
  EXPECT_TRUE(coherenceFaults(holder).empty());
  // Released again, the value keeps its element.
  holder->releaseContent();
  EXPECT_FALSE(thief->setExpression(c));
  ASSERT_TRUE(thief->setExpression(init));
  EXPECT_EQ(c->getParent(), thief);
}

// --- refusals

TEST(ParentCoherenceTest, LocationWithAParentIsRefusedEverywhere) {
  AppBuilder app;
  KV_ICodeFactoryContainer& fc = app.factories();
  KV_ExprLocation* a = app.constant(1);
  KV_ExprLocation* b = app.constant(2);
  KV_Operation* first = app.operationExpr(KV_OP_ADD, {a, b});
  KV_Operation* second = app.operationExpr(KV_OP_NEG, {app.constant(3)});
  KV_ExprLocation* secondOld = second->getOperand(0);

  // As an operand of another operation: replacing, appending.
  EXPECT_FALSE(second->setOperand(0, a));
  EXPECT_FALSE(second->appendOperand(a));
  EXPECT_EQ(second->getOperand(0), secondOld);
  EXPECT_EQ(second->getNumberOfOperands(), 1);
  // At another position of the same operation.
  EXPECT_FALSE(first->setOperand(1, a));
  EXPECT_FALSE(first->appendOperand(a));
  EXPECT_EQ(first->getOperand(1), b);
  // As a statement root.
  EXPECT_EQ(fc.getStatementFactory()->createStatement(a), nullptr);
  KV_Statement* statement = fc.getStatementFactory()->createStatement(nullptr);
  ASSERT_NE(statement, nullptr);
  EXPECT_FALSE(statement->setExprLoc(a));
  EXPECT_EQ(statement->getExprLoc(), nullptr);
  EXPECT_EQ(a->getParent(), first);
  EXPECT_EQ(a->getIndexInParent(), 0);

  // A statement root is refused as an operand and as another statement's root.
  KV_ExprLocation* root = app.constant(9);
  KV_Statement* rooted = fc.getStatementFactory()->createStatement(root);
  EXPECT_FALSE(second->appendOperand(root));
  EXPECT_FALSE(statement->setExprLoc(root));
  EXPECT_EQ(root->getParent(), rooted);
  // Positions beyond the end are refused.
  EXPECT_FALSE(second->setOperand(5, app.constant(4)));
  EXPECT_FALSE(second->setOperand(-1, app.constant(4)));
  EXPECT_EQ(second->getNumberOfOperands(), 1);
}

TEST(ParentCoherenceTest, ExpressionHeldElsewhereIsRefused) {
  AppBuilder app;
  KV_ExprLocation* holder = app.add(app.constant(1), app.constant(2));
  KV_Operation* op = holder->getOperation();
  KV_ExprLocation* other = app.constant(3);
  KvCIcExpression* otherConst = other->getExpression();
  EXPECT_FALSE(other->setExpression(op));
  EXPECT_EQ(other->getExpression(), otherConst); // unchanged
  EXPECT_EQ(op->getParent(), holder);
  EXPECT_EQ(app.factories().getExprLocFactory()->createFromExpression(op), nullptr);
  EXPECT_EQ(app.factories().getExprLocFactory()->createFromOperation(op), nullptr);
}

TEST(ParentCoherenceTest, LocationCannotBecomeAnOperandInsideItself) {
  AppBuilder app;
  // top holds Add(c, Neg(Neg(... Neg(leaf)))) with a chain below.
  KV_ExprLocation* leaf = app.constant(1);
  KV_ExprLocation* chain = leaf;
  std::vector<KV_Operation*> inner;
  for (int i = 0; i < 50; ++i) {
    chain = app.neg(chain);
    inner.push_back(chain->getOperation());
  }
  KV_ExprLocation* top = app.add(app.constant(2), chain);
  KV_Operation* topOp = top->getOperation();
  // The top location has no parent: only the cycle stops it.
  ASSERT_EQ(top->getParent(), nullptr);
  EXPECT_FALSE(topOp->appendOperand(top));
  EXPECT_FALSE(topOp->setOperand(0, top));
  for (KV_Operation* op : {inner.front(), inner[25], inner.back()}) {
    EXPECT_FALSE(op->appendOperand(top));
    EXPECT_FALSE(op->setOperand(0, top));
  }
  EXPECT_EQ(top->getParent(), nullptr);
  EXPECT_TRUE(reachesTop(leaf));
  EXPECT_TRUE(coherenceFaults(top).empty());
  // A location below cannot hold an operation above it.
  EXPECT_FALSE(leaf->setExpression(topOp));
  EXPECT_FALSE(inner[10]->getOperand(0)->setExpression(inner[30]));
  EXPECT_TRUE(reachesTop(leaf));
  EXPECT_EQ(leaf->getConstant()->getIntValue(), 1);
}

TEST(ParentCoherenceTest, InitialValueCannotCloseACycle) {
  AppBuilder app;
  KV_ExprLocFactory* locs = app.factories().getExprLocFactory();
  // A placed value: its holder is an operand of an operation that would become an element.
  KvCSmbInitValExpr* placed = locs->createInitValue({2});
  KV_ExprLocation* holder = locs->createFromExpression(placed);
  KV_Operation* around = app.operationExpr(KV_OP_NEG, {holder});
  EXPECT_FALSE(placed->addElement(around));
  EXPECT_EQ(placed->getNumberOfElements(), 0);
  EXPECT_TRUE(reachesTop(holder, 100));

  // An unplaced value: an element's subtree holds the location that would hold it.
  KvCSmbInitValExpr* unplaced = locs->createInitValue({});
  KV_ExprLocation* inside = app.empty();
  KV_Operation* element = app.operationExpr(KV_OP_NEG, {inside});
  ASSERT_TRUE(unplaced->addElement(element));
  EXPECT_FALSE(inside->setExpression(unplaced));
  EXPECT_EQ(unplaced->getParent(), nullptr);
  EXPECT_TRUE(reachesTop(inside, 100));
}

TEST(ParentCoherenceTest, StatementTablesCannotFormACycle) {
  AppBuilder app;
  KV_StatementFactory* sf = app.factories().getStatementFactory();
  // outer owns t0; t0 holds s; s owns t1; t1 holds s2.
  KV_Statement* outer = sf->createStatement(nullptr);
  KvCCStmTable* t0 = sf->createCStmTable(nullptr, nullptr);
  KV_Statement* s = sf->createStatement(nullptr);
  KvCCStmTable* t1 = sf->createCStmTable(nullptr, nullptr);
  KV_Statement* s2 = sf->createStatement(nullptr);
  ASSERT_TRUE(outer->addStatementTable(t0));
  ASSERT_TRUE(t0->appendStatement(s));
  ASSERT_TRUE(s->addStatementTable(t1));
  ASSERT_TRUE(t1->appendStatement(s2));

  // A parentless ancestor is refused below its own descendants.
  EXPECT_FALSE(t1->appendStatement(outer));
  EXPECT_FALSE(s2->addStatementTable(t0)); // t0 has a parent as well
  KvCCStmTable* loose = sf->createCStmTable(nullptr, nullptr);
  KV_Statement* top = sf->createStatement(nullptr);
  ASSERT_TRUE(loose->appendStatement(top));
  KvCCStmTable* below = sf->createCStmTable(nullptr, nullptr);
  ASSERT_TRUE(top->addStatementTable(below));
  EXPECT_FALSE(top->addStatementTable(loose));
  EXPECT_FALSE(below->appendStatement(top));
  KV_Statement* lone = sf->createStatement(nullptr);
  ASSERT_TRUE(below->appendStatement(lone));
  EXPECT_FALSE(lone->addStatementTable(loose));
  // Tables and statements with a parent are refused a second one.
  EXPECT_FALSE(s2->addStatementTable(t1));
  EXPECT_FALSE(t1->appendStatement(s));
  EXPECT_FALSE(lone->addStatementTable(below));
  EXPECT_FALSE(outer->addStatementTable(nullptr));
  EXPECT_FALSE(t0->appendStatement(nullptr));

  EXPECT_EQ(t1->getNumberOfStatements(), 1);
  EXPECT_EQ(s2->getNumberOfStatementTables(), 0);
  EXPECT_EQ(lone->getNumberOfStatementTables(), 0);
  EXPECT_TRUE(reachesTop(s2, 100));
  EXPECT_TRUE(reachesTop(lone, 100));
  EXPECT_TRUE(coherenceFaults(loose).empty());
  EXPECT_TRUE(coherenceFaults(t0).empty());
}

TEST(ParentCoherenceTest, RefusedCreationLeavesEveryOperandParentless) {
  AppBuilder app;
  KV_OperationFactory* of = app.factories().getOperationFactory();
  KV_ExprLocation* a = app.constant(1);
  KV_ExprLocation* b = app.constant(2);
  KV_ExprLocation* c = app.constant(3);
  EXPECT_EQ(of->createOperation(KV_OP_ADD, {a, a}), nullptr);
  EXPECT_EQ(of->createOperation(KV_OP_COMMA, {a, b, c, b}), nullptr);
  EXPECT_EQ(of->createOperation(KV_OP_CONDITIONAL, {a, nullptr, a}), nullptr);
  // Wrong arity and kinds with their own creators.
  EXPECT_EQ(of->createOperation(KV_OP_ADD, {a}), nullptr);
  EXPECT_EQ(of->createOperation(KV_OP_NEG, {a, b}), nullptr);
  EXPECT_EQ(of->createOperation(KV_OP_QUALIFIED_SYMBOL, {a}), nullptr);
  EXPECT_EQ(of->createOperation(KV_OP_CODE_BLOCK, {a}), nullptr);
  KvCParamSymbol* fn = app.function("fn").symbol();
  EXPECT_EQ(of->createCallOperation(fn, {a, b, a}), nullptr);
  for (KV_ExprLocation* loc : {a, b, c})
    expectParentless(loc);

  // An operand that has a parent stays with it; the others stay free.
  KV_Operation* owner = of->createOperation(KV_OP_NEG, {c});
  ASSERT_NE(owner, nullptr);
  EXPECT_EQ(of->createOperation(KV_OP_COMMA, {a, b, c}), nullptr);
  EXPECT_EQ(of->createCallOperation(fn, {a, c}), nullptr);
  EXPECT_EQ(of->createCast(app.int32(), c), nullptr);
  expectParentless(a);
  expectParentless(b);
  EXPECT_EQ(c->getParent(), owner);
  EXPECT_EQ(c->getIndexInParent(), 0);
  EXPECT_EQ(owner->getNumberOfOperands(), 1);

  // The same operands make a valid operation afterwards.
  KV_Operation* ok = of->createOperation(KV_OP_COMMA, {a, nullptr, b});
  ASSERT_NE(ok, nullptr);
  EXPECT_EQ(ok->getNumberOfOperands(), 3);
  EXPECT_EQ(ok->getOperand(1), nullptr);
  EXPECT_EQ(b->getIndexInParent(), 2);
}

// --- random attach/detach/move against a reference model

// The reference: who is the parent of what, kept by the test itself.
class ReferenceTree {
public:
  struct LocParent {
    int op = -1;        // index into ops
    int statement = -1; // index into statements
    int index = -1;
  };

  ReferenceTree(AppBuilder& builder, std::uint64_t seed) : app(builder), rng(seed) {
    for (int i = 0; i < 24; ++i)
      locs.push_back(app.empty());
    for (int i = 0; i < 12; ++i)
      addExpression(app.operationExpr(KV_OP_COMMA, {}));
    for (int i = 0; i < 8; ++i)
      addExpression(app.constantExpr(i));
    for (int i = 0; i < 4; ++i)
      statements.push_back(app.factories().getStatementFactory()->createStatement(nullptr));
    locParent.resize(locs.size());
    locContent.assign(locs.size(), -1);
    stmtRoot.assign(statements.size(), -1);
  }

  void step() {
    switch (below(6)) {
    case 0:
    case 1:
      setOperand();
      break;
    case 2:
      setRoot();
      break;
    case 3:
      setExpression();
      break;
    case 4:
      release();
      break;
    default:
      createOperation();
      break;
    }
  }

  // Compares the model with the reference; empty when they agree.
  std::string mismatch() const {
    for (std::size_t l = 0; l < locs.size(); ++l) {
      const LocParent& p = locParent[l];
      const KV_ICodeElem* want = nullptr;
      if (p.op >= 0)
        want = exprs[static_cast<std::size_t>(p.op)];
      else if (p.statement >= 0)
        want = statements[static_cast<std::size_t>(p.statement)];
      if (locs[l]->getParent() != want || locs[l]->getIndexInParent() != p.index)
        return "parent of location " + std::to_string(l);
      const int content = locContent[l];
      if (locs[l]->getExpression() !=
          (content < 0 ? nullptr : exprs[static_cast<std::size_t>(content)]))
        return "content of location " + std::to_string(l);
    }
    for (std::size_t e = 0; e < exprs.size(); ++e) {
      const int holder = exprHolder[e];
      if (exprs[e]->getParent() != (holder < 0 ? nullptr : locs[static_cast<std::size_t>(holder)]))
        return "holder of expression " + std::to_string(e);
      if (KV_Operation* op = exprs[e]->asOperation()) {
        if (op->getNumberOfOperands() != static_cast<int>(operands[e].size()))
          return "operand count of expression " + std::to_string(e);
        for (std::size_t i = 0; i < operands[e].size(); ++i) {
          const int l = operands[e][i];
          if (op->getOperand(static_cast<int>(i)) !=
              (l < 0 ? nullptr : locs[static_cast<std::size_t>(l)]))
            return "operand " + std::to_string(i) + " of expression " + std::to_string(e);
        }
      }
    }
    for (std::size_t s = 0; s < statements.size(); ++s) {
      const int l = stmtRoot[s];
      if (statements[s]->getExprLoc() != (l < 0 ? nullptr : locs[static_cast<std::size_t>(l)]))
        return "root of statement " + std::to_string(s);
    }
    return {};
  }

  std::vector<std::string> coherence() const {
    std::vector<std::string> all;
    for (KV_ExprLocation* loc : locs)
      if (!loc->getParent())
        for (std::string& f : coherenceFaults(loc))
          all.push_back(std::move(f));
    for (KV_Statement* statement : statements)
      if (KV_ExprLocation* root = statement->getExprLoc())
        for (std::string& f : coherenceFaults(root))
          all.push_back(std::move(f));
    return all;
  }

  int accepted = 0;
  int refused = 0;

private:
  int below(int n) { return static_cast<int>(rng() % static_cast<std::uint64_t>(n)); }
  int anyLocOrNone() { return below(5) == 0 ? -1 : below(static_cast<int>(locs.size())); }
  int anyOp() {
    for (;;) {
      const int e = below(static_cast<int>(exprs.size()));
      if (exprs[static_cast<std::size_t>(e)]->asOperation())
        return e;
    }
  }

  void addExpression(KvCIcExpression* e) {
    exprs.push_back(e);
    exprHolder.push_back(-1);
    operands.emplace_back();
  }

  // Whether expression `e` lies within location `l` (reference ancestors).
  bool exprWithinLoc(int e, int l) const {
    for (int guard = 0; guard < 100000; ++guard) {
      const int holder = exprHolder[static_cast<std::size_t>(e)];
      if (holder < 0)
        return false;
      if (holder == l)
        return true;
      const LocParent& p = locParent[static_cast<std::size_t>(holder)];
      if (p.op < 0)
        return false;
      e = p.op;
    }
    return true;
  }

  void count(bool ok) { ok ? ++accepted : ++refused; }

  void detachLoc(int l) {
    if (l >= 0)
      locParent[static_cast<std::size_t>(l)] = LocParent{};
  }

  void setOperand() {
    const int o = anyOp();
    std::vector<int>& slots = operands[static_cast<std::size_t>(o)];
    const int i = below(static_cast<int>(slots.size()) + 2);
    const int l = anyLocOrNone();
    bool expected = i <= static_cast<int>(slots.size());
    if (expected &&
        !(i < static_cast<int>(slots.size()) && slots[static_cast<std::size_t>(i)] == l))
      expected =
          l < 0 || (locParent[static_cast<std::size_t>(l)].op < 0 &&
                    locParent[static_cast<std::size_t>(l)].statement < 0 && !exprWithinLoc(o, l));
    KV_Operation* op = exprs[static_cast<std::size_t>(o)]->asOperation();
    const bool ok = op->setOperand(i, l < 0 ? nullptr : locs[static_cast<std::size_t>(l)]);
    EXPECT_EQ(ok, expected) << "setOperand(" << o << ", " << i << ", " << l << ")";
    count(ok);
    if (!ok || !expected)
      return;
    if (i == static_cast<int>(slots.size()))
      slots.push_back(-1);
    detachLoc(slots[static_cast<std::size_t>(i)]);
    slots[static_cast<std::size_t>(i)] = l;
    if (l >= 0)
      locParent[static_cast<std::size_t>(l)] = LocParent{o, -1, i};
  }

  void setRoot() {
    const int s = below(static_cast<int>(statements.size()));
    const int l = anyLocOrNone();
    int& root = stmtRoot[static_cast<std::size_t>(s)];
    const bool expected = l == root || l < 0 ||
                          (locParent[static_cast<std::size_t>(l)].op < 0 &&
                           locParent[static_cast<std::size_t>(l)].statement < 0);
    const bool ok = statements[static_cast<std::size_t>(s)]->setExprLoc(
        l < 0 ? nullptr : locs[static_cast<std::size_t>(l)]);
    EXPECT_EQ(ok, expected) << "setExprLoc(" << s << ", " << l << ")";
    count(ok);
    if (!ok || !expected || l == root)
      return;
    detachLoc(root);
    root = l;
    if (l >= 0)
      locParent[static_cast<std::size_t>(l)] = LocParent{-1, s, 0};
  }

  void setExpression() {
    const int l = below(static_cast<int>(locs.size()));
    const int e = below(8) == 0 ? -1 : below(static_cast<int>(exprs.size()));
    int& content = locContent[static_cast<std::size_t>(l)];
    bool expected = true;
    if (e >= 0 && e != content) {
      // Refused when held elsewhere, or when the location lies within the expression.
      expected = exprHolder[static_cast<std::size_t>(e)] < 0 && !locWithinExpr(l, e);
    }
    const bool ok = locs[static_cast<std::size_t>(l)]->setExpression(
        e < 0 ? nullptr : exprs[static_cast<std::size_t>(e)]);
    EXPECT_EQ(ok, expected) << "setExpression(" << l << ", " << e << ")";
    count(ok);
    if (!ok || !expected || e == content)
      return;
    if (content >= 0)
      exprHolder[static_cast<std::size_t>(content)] = -1;
    content = e;
    if (e >= 0)
      exprHolder[static_cast<std::size_t>(e)] = l;
  }

  bool locWithinExpr(int l, int e) const {
    for (int guard = 0; guard < 100000; ++guard) {
      const LocParent& p = locParent[static_cast<std::size_t>(l)];
      if (p.op < 0)
        return false;
      if (p.op == e)
        return true;
      const int holder = exprHolder[static_cast<std::size_t>(p.op)];
      if (holder < 0)
        return false;
      l = holder;
    }
    return true;
  }

  void release() {
    const int l = below(static_cast<int>(locs.size()));
    int& content = locContent[static_cast<std::size_t>(l)];
    KvCIcExpression* old = locs[static_cast<std::size_t>(l)]->releaseContent();
    EXPECT_EQ(old, content < 0 ? nullptr : exprs[static_cast<std::size_t>(content)]);
    if (content >= 0)
      exprHolder[static_cast<std::size_t>(content)] = -1;
    content = -1;
  }

  void createOperation() {
    if (exprs.size() > 80)
      return;
    const int n = 1 + below(3);
    std::vector<int> picked;
    for (int k = 0; k < n; ++k)
      picked.push_back(below(static_cast<int>(locs.size())));
    bool expected = true;
    for (int k = 0; k < n; ++k) {
      const LocParent& p = locParent[static_cast<std::size_t>(picked[static_cast<std::size_t>(k)])];
      expected = expected && p.op < 0 && p.statement < 0;
      for (int j = 0; j < k; ++j)
        expected =
            expected && picked[static_cast<std::size_t>(j)] != picked[static_cast<std::size_t>(k)];
    }
    KV_ExprLocation* ops[3] = {nullptr, nullptr, nullptr};
    for (int k = 0; k < n; ++k)
      ops[k] = locs[static_cast<std::size_t>(picked[static_cast<std::size_t>(k)])];
    KV_OperationFactory* of = app.factories().getOperationFactory();
    KV_Operation* made = n == 1   ? of->createOperation(KV_OP_COMMA, {ops[0]})
                         : n == 2 ? of->createOperation(KV_OP_COMMA, {ops[0], ops[1]})
                                  : of->createOperation(KV_OP_COMMA, {ops[0], ops[1], ops[2]});
    EXPECT_EQ(made != nullptr, expected) << "createOperation with " << n << " operands";
    count(made != nullptr);
    if (!made || !expected)
      return;
    addExpression(made);
    const int o = static_cast<int>(exprs.size()) - 1;
    for (int k = 0; k < n; ++k) {
      operands[static_cast<std::size_t>(o)].push_back(picked[static_cast<std::size_t>(k)]);
      locParent[static_cast<std::size_t>(picked[static_cast<std::size_t>(k)])] =
          LocParent{o, -1, k};
    }
  }

  AppBuilder& app;
  std::mt19937_64 rng;
  std::vector<KV_ExprLocation*> locs;
  std::vector<KvCIcExpression*> exprs;
  std::vector<KV_Statement*> statements;
  std::vector<LocParent> locParent;
  std::vector<int> locContent;
  std::vector<int> exprHolder;
  std::vector<std::vector<int>> operands;
  std::vector<int> stmtRoot;
};

TEST(ParentCoherenceTest, RandomAttachDetachMoveAgreesWithReference) {
  for (std::uint64_t seed : {1u, 2u, 3u}) {
    SCOPED_TRACE("seed " + std::to_string(seed));
    AppBuilder app;
    ReferenceTree tree(app, seed);
    for (int stepNo = 0; stepNo < 3000; ++stepNo) {
      tree.step();
      const std::string diff = tree.mismatch();
      ASSERT_TRUE(diff.empty()) << "step " << stepNo << ": " << diff;
      const std::vector<std::string> faults = tree.coherence();
      ASSERT_TRUE(faults.empty()) << "step " << stepNo << ": " << joinFaults(faults);
    }
    // The sequence exercised both outcomes, not only one.
    EXPECT_GT(tree.accepted, 500);
    EXPECT_GT(tree.refused, 200);
  }
}

} // namespace
