#include "platform/icode/KvCCallOperation.h"

#include "platform/icode/KV_ExprLocation.h"
#include "platform/icode/KV_QualifiedSymbolOp.h"
#include "platform/icode/KV_Statement.h"
#include "platform/icode/KvCCStmTable.h"
#include "platform/icode/KvCParamSymbol.h"

KvCCallOperation::KvCCallOperation(int serialNumber, KvCParamSymbol* called)
    : KV_Operation(serialNumber, KV_OpOperator::get(KV_OP_CALL)), calledSymbol(called) {}

namespace {
// The macro that `statement` defines, when it is a macro definition of a function-like
// macro (the call then lies in the macro's body), else null.
KvCParamSymbol* definedMacro(const KV_Statement* statement) {
  KV_ExprLocation* root = statement ? statement->getExprLoc() : nullptr;
  KV_Operation* op = root ? root->getOperation() : nullptr;
  if (!op || !op->getOperator()->isFurtherDefinition2())
    return nullptr;
  KV_ExprLocation* object = op->getOperand(0);
  KV_QualifiedSymbolOp* access = object ? object->getQualifiedSymbolOp() : nullptr;
  KvCParamSymbol* macro = access ? access->getSymbol()->asParamSymbol() : nullptr;
  return macro && macro->isMacro() ? macro : nullptr;
}
} // namespace

KvCParamSymbol* KvCCallOperation::findCallingSymbol() const {
  KV_Statement* statement = findParentStatement();
  KvCCStmTable* table = statement ? statement->getParentCTable() : nullptr;
  callingSymbol = definedMacro(statement);
  if (!callingSymbol)
    callingSymbol = table ? table->getCodeBlockSymbol() : nullptr;
  callingEpoch = structureEpoch();
  return callingSymbol;
}
