#include "platform/icode/KvCICodeIterator.h"

#include "platform/icode/KV_Constant.h"
#include "platform/icode/KV_ExprLocation.h"
#include "platform/icode/KV_QualifiedSymbolOp.h"
#include "platform/icode/KV_Statement.h"
#include "platform/icode/KV_StatementTable.h"
#include "platform/icode/KvCCStmTable.h"
#include "platform/icode/KvCCodeBlockOperation.h"
#include "platform/icode/KvCIcApplication.h"
#include "platform/icode/KvCIcFileId.h"
#include "platform/icode/KvCSmbInitValExpr.h"
#include "platform/icode/KvCStringExpr.h"
#include "platform/support/KvCPrefetch.h"

KV_ICodeElemVisitor::~KV_ICodeElemVisitor() = default;
void KV_ICodeElemVisitor::visitOperation(KV_Operation*) {}
void KV_ICodeElemVisitor::visitConstant(KV_Constant*) {}
void KV_ICodeElemVisitor::visitSymbol(KvCSymbol*) {}
void KV_ICodeElemVisitor::visitExprLocation(KV_ExprLocation*) {}
void KV_ICodeElemVisitor::visitStatement(KV_Statement*) {}
void KV_ICodeElemVisitor::visitStatementTable(KV_StatementTable*) {}
void KV_ICodeElemVisitor::visitStringExpr(KvCStringExpr*) {}
void KV_ICodeElemVisitor::visitEmptyExpr(KV_ExprLocation*) {}
void KV_ICodeElemVisitor::visitSmbInitValExpr(KvCSmbInitValExpr*) {}
void KV_ICodeElemVisitor::visitCodeBlockOperation(KvCCodeBlockOperation*) {}
void KV_ICodeElemVisitor::visitDataType(KV_DataType*) {}
void KV_ICodeElemVisitor::visitQSO(KV_QualifiedSymbolOp*) {}
void KV_ICodeElemVisitor::visitIcApplication(KvCIcApplication*) {}
void KV_ICodeElemVisitor::visitIcSubApplication(KvCIcSubAppl*) {}
void KV_ICodeElemVisitor::visitIcCodeUnit(KvCIcCodeUnit*) {}
void KV_ICodeElemVisitor::visitIcFileId(KvCIcFileId*) {}
bool KV_ICodeElemVisitor::stopIteration() { return false; }

namespace {

void visitContent(KV_ExprLocation* loc, KV_ICodeElemVisitor* visitor,
                  std::vector<KV_ICodeElem*>& stack) {
  if (loc->isEmpty()) {
    visitor->visitEmptyExpr(loc);
    return;
  }
  if (KV_DataType* type = loc->getDataTypeRef()) {
    visitor->visitDataType(type);
    return;
  }
  if (KvCIcFileId* file = loc->getFileIdRef()) {
    visitor->visitIcFileId(file);
    return;
  }
  KvCIcExpression* expr = loc->getExpression();
  if (KV_Operation* op = expr->asOperation()) {
    stack.push_back(op);
    return;
  }
  if (KV_Constant* constant = expr->asConstant())
    visitor->visitConstant(constant);
  else if (KvCStringExpr* string = expr->asStringExpr())
    visitor->visitStringExpr(string);
  else if (KvCSmbInitValExpr* init = expr->asSmbInitValExpr())
    visitor->visitSmbInitValExpr(init);
}

// False when the visitor ended the walk.
bool visitOperationNode(KV_Operation* op, KV_ICodeElemVisitor* visitor) {
  if (KV_QualifiedSymbolOp* qso = op->asQualifiedSymbolOp()) {
    visitor->visitQSO(qso);
    if (visitor->stopIteration())
      return false;
    visitor->visitSymbol(qso->getSymbol());
  } else if (KvCCodeBlockOperation* block = op->asCodeBlockOperation()) {
    visitor->visitCodeBlockOperation(block);
  } else {
    visitor->visitOperation(op);
  }
  return true;
}

// Expression trees are made bottom-up, operands before operations before statements,
// and the code view data keeps elements in creation order: the tree of a statement lies
// in memory just before the statement. When a statement is visited, the memory before
// the next element waiting on the stack is loaded ahead, a few lines at each element
// visited, so that walks over ICode far larger than the caches stream instead of waiting
// on each element.
class LookAhead {
public:
  void aimBefore(const KV_ICodeElem* next) {
    const char* end = reinterpret_cast<const char*>(next);
    const char* begin = end - kAhead;
    cursor = cursor > begin && cursor < end ? cursor : begin;
    limit = end;
  }
  void step() {
    for (int i = 0; i < kLinesPerStep && cursor < limit; ++i, cursor += kLine)
      KvCPrefetch::read(cursor);
  }

private:
  static constexpr std::ptrdiff_t kAhead = 8192;
  static constexpr std::ptrdiff_t kLine = 64;
  static constexpr int kLinesPerStep = 3;
  const char* cursor = nullptr;
  const char* limit = nullptr;
};

} // namespace

bool KvCICodeIterator::walk(KV_ICodeElem* start, KV_ICodeElemVisitor* visitor) {
  // Local, so that a visitor may start another walk with this iterator.
  std::vector<KV_ICodeElem*> stack{start};
  LookAhead lookAhead;
  while (!stack.empty()) {
    KV_ICodeElem* elem = stack.back();
    stack.pop_back();
    if (elem->asStatement() && !stack.empty())
      lookAhead.aimBefore(stack.back());
    lookAhead.step();
    if (visitor->stopIteration())
      return true;
    if (KV_ExprLocation* loc = elem->asExprLocation()) {
      visitor->visitExprLocation(loc);
      if (visitor->stopIteration())
        return true;
      visitContent(loc, visitor, stack);
    } else if (KV_Operation* op = elem->asOperation()) {
      if (!visitOperationNode(op, visitor))
        return true;
      for (int i = op->getNumberOfOperands() - 1; i >= 0; --i)
        if (KV_ExprLocation* operand = op->getOperand(i))
          stack.push_back(operand);
    } else if (KV_Statement* statement = elem->asStatement()) {
      visitor->visitStatement(statement);
      for (int i = statement->getNumberOfStatementTables() - 1; i >= 0; --i) {
        KV_StatementTable* table = statement->getStatementTable(i);
        if (!(omitFunctionBodies && table->isCodeBlockTop()))
          stack.push_back(table);
      }
      if (KV_ExprLocation* root = statement->getExprLoc())
        stack.push_back(root);
    } else if (KV_StatementTable* table = elem->asStatementTable()) {
      visitor->visitStatementTable(table);
      for (int i = table->getNumberOfStatements() - 1; i >= 0; --i)
        stack.push_back(table->getStatement(i));
    }
  }
  return false;
}

bool KvCICodeIterator::iterate(KvCIcApplication* app, KV_ICodeElemVisitor* visitor) {
  if (!app || !visitor)
    return false;
  if (visitor->stopIteration())
    return true;
  visitor->visitIcApplication(app);
  for (KvCIcSubAppl* sub : app->getSubApplications()) {
    if (visitor->stopIteration())
      return true;
    visitor->visitIcSubApplication(sub);
    for (KvCIcCodeUnit* unit : sub->getCodeUnits()) {
      if (visitor->stopIteration())
        return true;
      visitor->visitIcCodeUnit(unit);
      for (KvCIcFileId* file : unit->getFiles()) {
        if (visitor->stopIteration())
          return true;
        visitor->visitIcFileId(file);
        KvCCStmTable* table = file->getFile()->getStatementTable();
        if (table && walk(table, visitor))
          return true;
      }
    }
  }
  return true;
}

bool KvCICodeIterator::iterateStatementTable(KV_StatementTable* table,
                                             KV_ICodeElemVisitor* visitor) {
  if (!table || !visitor)
    return false;
  walk(table, visitor);
  return true;
}

bool KvCICodeIterator::iterateStatement(KV_Statement* statement, KV_ICodeElemVisitor* visitor) {
  if (!statement || !visitor)
    return false;
  walk(statement, visitor);
  return true;
}

bool KvCICodeIterator::iterateOperation(KV_Operation* op, KV_ICodeElemVisitor* visitor) {
  if (!op || !visitor)
    return false;
  walk(op, visitor);
  return true;
}

bool KvCICodeIterator::iterateExprLoc(KV_ExprLocation* loc, KV_ICodeElemVisitor* visitor) {
  if (!loc || !visitor)
    return false;
  walk(loc, visitor);
  return true;
}
