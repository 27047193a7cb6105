// Checks shared by the ICode model tests: the parent/index coherence of a tree, a
// bounded walk to the top (a cycle shows as a walk that does not end), and a visitor
// that records the visits of a walk as a trace of short tokens.
//
// The coherence check compares every downward link (operands, statement roots, tables,
// statements, held expressions, initial-value elements) with the upward link of the
// element it reaches, and every upward link of a visited location with its parent's
// downward link. It walks with KvCICodeIterator and enters the elements of initial values
// (which the iterator does not) with nested walks. O(elements).
#ifndef HUL_TESTS_ICODE_MODELCHECKS_H
#define HUL_TESTS_ICODE_MODELCHECKS_H

#include "platform/icode/KV_Constant.h"
#include "platform/icode/KV_DataType.h"
#include "platform/icode/KV_ExprLocation.h"
#include "platform/icode/KV_ICodeElemVisitor.h"
#include "platform/icode/KV_Operation.h"
#include "platform/icode/KV_QualifiedSymbolOp.h"
#include "platform/icode/KV_Statement.h"
#include "platform/icode/KV_StatementTable.h"
#include "platform/icode/KvCCodeBlockOperation.h"
#include "platform/icode/KvCICodeIterator.h"
#include "platform/icode/KvCIcApplication.h"
#include "platform/icode/KvCIcFileId.h"
#include "platform/icode/KvCSmbInitValExpr.h"
#include "platform/icode/KvCStringExpr.h"
#include "platform/icode/KvCSymbol.h"

#include <string>
#include <vector>

namespace icode_test {

// Whether walking up from `elem` reaches the top within `limit` steps.
inline bool reachesTop(const KV_ICodeElem* elem, int limit = 1000000) {
  for (int steps = 0; elem; ++steps) {
    if (steps > limit)
      return false;
    elem = elem->getParentElem();
  }
  return true;
}

class CoherenceChecker : public KV_ICodeElemVisitor {
public:
  std::vector<std::string> faults;
  int locations = 0;
  int operations = 0;
  int statements = 0;
  int tables = 0;

  void visitExprLocation(KV_ExprLocation* loc) override {
    ++locations;
    if (KvCIcExpression* expr = loc->getExpression())
      expect(expr->getParent() == loc, "expression's parent is not its location", expr);
    KV_ICodeElem* parent = loc->getParent();
    if (!parent) {
      expect(loc->getIndexInParent() == -1, "location without parent has an index", loc);
      return;
    }
    if (KV_Operation* op = parent->asOperation())
      expect(op->getOperand(loc->getIndexInParent()) == loc,
             "location's parent does not hold it at its index", loc);
    else if (KV_Statement* statement = parent->asStatement())
      expect(statement->getExprLoc() == loc && loc->getIndexInParent() == 0,
             "location's statement does not hold it as root at index 0", loc);
    else
      fault("location's parent is neither operation nor statement", loc);
  }
  void visitOperation(KV_Operation* op) override { checkOperation(op); }
  void visitQSO(KV_QualifiedSymbolOp* qso) override { checkOperation(qso); }
  void visitCodeBlockOperation(KvCCodeBlockOperation* op) override { checkOperation(op); }
  void visitStatement(KV_Statement* statement) override {
    ++statements;
    if (KV_ExprLocation* root = statement->getExprLoc())
      expect(root->getParent() == statement && root->getIndexInParent() == 0,
             "statement root's parent/index", statement);
    for (int i = 0; i < statement->getNumberOfStatementTables(); ++i)
      expect(statement->getStatementTable(i)->getParentStatement() == statement,
             "table's parent statement", statement);
  }
  void visitStatementTable(KV_StatementTable* table) override {
    ++tables;
    for (int i = 0; i < table->getNumberOfStatements(); ++i)
      expect(table->getStatement(i)->getParentTable() == table, "statement's parent table", table);
  }
  void visitSmbInitValExpr(KvCSmbInitValExpr* init) override {
    KV_ExprLocation* holder = init->getParent();
    for (KvCSmbInitValExprIterator it = init->createIterator(); !it.isDone(); it.next()) {
      KvCIcExpression* element = it.current();
      expect(element->getParent() == holder, "initial-value element's parent is not the holder",
             element);
      if (KV_Operation* op = element->asOperation()) {
        KvCICodeIterator nested;
        nested.iterateOperation(op, this);
      }
    }
  }

private:
  void checkOperation(KV_Operation* op) {
    ++operations;
    for (int i = 0; i < op->getNumberOfOperands(); ++i)
      if (KV_ExprLocation* operand = op->getOperand(i))
        expect(operand->getParent() == op && operand->getIndexInParent() == i,
               "operand " + std::to_string(i) + " parent/index", op);
  }
  void expect(bool ok, const std::string& what, const KV_ICodeElem* elem) {
    if (!ok)
      fault(what, elem);
  }
  void fault(const std::string& what, const KV_ICodeElem* elem) {
    faults.push_back(what + " (serial " + std::to_string(elem->getSerial()) + ")");
  }
};

inline std::string joinFaults(const std::vector<std::string>& faults) {
  std::string text;
  for (std::size_t i = 0; i < faults.size() && i < 20; ++i)
    text += faults[i] + "\n";
  return text;
}

// The faults below `app` (every file of every code unit); empty when coherent.
inline std::vector<std::string> coherenceFaults(KvCIcApplication* app) {
  CoherenceChecker checker;
  KvCICodeIterator().iterate(app, &checker);
  return checker.faults;
}
inline std::vector<std::string> coherenceFaults(KV_StatementTable* table) {
  CoherenceChecker checker;
  KvCICodeIterator().iterateStatementTable(table, &checker);
  return checker.faults;
}
inline std::vector<std::string> coherenceFaults(KV_ExprLocation* loc) {
  CoherenceChecker checker;
  KvCICodeIterator().iterateExprLoc(loc, &checker);
  return checker.faults;
}
inline std::vector<std::string> coherenceFaults(KV_Operation* op) {
  CoherenceChecker checker;
  KvCICodeIterator().iterateOperation(op, &checker);
  return checker.faults;
}

// Records each visit as a token: "App:App", "Loc", "Op:Add", "QSO:x", "Sym:x", "Const:1",
// "Str:text", "Init", "Block", "Type:Int16", "File:main.c", "Empty", "Stmt", "Table".
// Stops once `limit` visits are recorded (negative: never).
class TraceVisitor : public KV_ICodeElemVisitor {
public:
  explicit TraceVisitor(int visitLimit = -1) : limit(visitLimit) {}
  std::vector<std::string> trace;
  int stopQuestions = 0;

  void visitOperation(KV_Operation* op) override {
    add(std::string("Op:") + op->getOperator()->getName());
  }
  void visitConstant(KV_Constant* c) override { add("Const:" + std::to_string(c->getIntValue())); }
  void visitSymbol(KvCSymbol* s) override { add("Sym:" + s->getName().str()); }
  void visitExprLocation(KV_ExprLocation*) override { add("Loc"); }
  void visitStatement(KV_Statement*) override { add("Stmt"); }
  void visitStatementTable(KV_StatementTable*) override { add("Table"); }
  void visitStringExpr(KvCStringExpr* s) override { add("Str:" + s->getString().str()); }
  void visitEmptyExpr(KV_ExprLocation*) override { add("Empty"); }
  void visitSmbInitValExpr(KvCSmbInitValExpr*) override { add("Init"); }
  void visitCodeBlockOperation(KvCCodeBlockOperation*) override { add("Block"); }
  void visitDataType(KV_DataType* t) override { add("Type:" + t->getName().str()); }
  void visitQSO(KV_QualifiedSymbolOp* q) override { add("QSO:" + q->getSymbol()->getName().str()); }
  void visitIcApplication(KvCIcApplication* a) override { add("App:" + a->getName().str()); }
  void visitIcSubApplication(KvCIcSubAppl* s) override { add("Sub:" + s->getName().str()); }
  void visitIcCodeUnit(KvCIcCodeUnit* u) override { add("Unit:" + u->getName().str()); }
  void visitIcFileId(KvCIcFileId* f) override { add("File:" + f->getName().str()); }
  bool stopIteration() override {
    ++stopQuestions;
    return limit >= 0 && static_cast<int>(trace.size()) >= limit;
  }

private:
  void add(std::string token) { trace.push_back(std::move(token)); }
  int limit;
};

} // namespace icode_test

#endif
