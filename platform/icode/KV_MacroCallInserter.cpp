#include "platform/icode/KV_MacroCallInserter.h"

#include "platform/icode/KV_ExprLocation.h"
#include "platform/icode/KV_ICodeFactoryContainer.h"
#include "platform/icode/KV_ParamMacroSymbolServer.h"
#include "platform/icode/KV_Range.h"
#include "platform/icode/KV_Statement.h"
#include "platform/icode/KV_StatementTable.h"
#include "platform/icode/KV_SymbolServer.h"
#include "platform/icode/KvCCallOperation.h"
#include "platform/icode/KvCIcFileId.h"
#include "platform/icode/KvCParamSymbol.h"

#include <set>
#include <vector>

bool KV_MacroCallInserter::insertMacroCall(KvCParamSymbol* macro, int n, KV_ExprLocation** args,
                                           KV_ParamAccess** accesses, bool asStatement,
                                           KV_Statement* statement, const KV_Range* range,
                                           const KvCSrcRef* srcRef) {
  lastCall = nullptr;
  if (!factories || !macro || !macro->isMacro() || n < 0 ||
      (macro->hasSignature() && macro->getNumberOfFormalParams() != n) ||
      (n > 0 && (!args || !accesses)))
    return false;
  std::set<KV_ExprLocation*> seen;
  for (int i = 0; i < n; ++i)
    if (!args[i] || !accesses[i] || args[i]->getParent() || !seen.insert(args[i]).second)
      return false;
  KV_StatementTable* table = nullptr;
  if (asStatement) {
    table = statement ? statement->getParentTable() : nullptr;
    if (!table)
      return false;
  }
  KV_ExprLocFactory* locations = factories->getExprLocFactory();
  KV_OperationFactory* operations = factories->getOperationFactory();
  KvCCallOperation* call = operations->createCallOperation(macro, {});
  if (!call)
    return false;
  for (int i = 0; i < n; ++i) {
    const WmCXString formal =
        macro->hasSignature() ? macro->getFormalParam(i).name : "p" + WmCXString(i, false, false);
    // Fresh formal, checked argument: the parameter operation cannot be refused.
    KV_Operation* parameter = operations->createOperation(
        KV_OP_PARAMETER, {locations->createFromString(formal, true, false), args[i]});
    call->appendOperand(locations->createFromOperation(parameter));
  }
  call->setScaling(macro->getScaling());
  if (range)
    call->setResultRange(*range);
  call->setSourceRef(srcRef);
  if (asStatement)
    table->appendStatement(
        factories->getStatementFactory()->createStatement(locations->createFromOperation(call)));
  lastCall = call;
  return true;
}

KvCParamSymbol* KV_MacroCallInserter::demandPreIncludeMacroSymbol(
    const WmCXString& name, KV_DataType* type, KV_Scaling* scaling, int n,
    KV_ParamAccess** accesses, const WmCXString* names, KvCFcnClassId* fcnClass,
    KvCIcExpression* body, KvCIcFileId* file, const KvCSrcRef* srcRef, bool mustBeNew) {
  if (!factories || !file || n < 0 || (n > 0 && (!accesses || !names)))
    return nullptr;
  std::vector<unsigned int> flags(static_cast<std::size_t>(n) + 1, 0u);
  for (int i = 0; i < n; ++i) {
    if (!accesses[i])
      return nullptr;
    flags[static_cast<std::size_t>(i)] = accesses[i]->getFlagWord();
  }
  KV_ParamMacroSymbolServer* macros = factories->getSymbolServer()->getParamMacro();
  KvCCStmTable* table = file->getFile()->getStt();
  if (mustBeNew && macros->find(table, name))
    return nullptr;
  bool created = false;
  return macros->demand(table, name, type, scaling, n, names, flags.data(), fcnClass, body, true,
                        &created, srcRef);
}
