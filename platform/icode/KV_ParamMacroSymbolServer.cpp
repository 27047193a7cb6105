#include "platform/icode/KV_ParamMacroSymbolServer.h"

#include "platform/icode/KV_CgsSupporter.h"
#include "platform/icode/KV_ExprLocation.h"
#include "platform/icode/KV_ICodeFactoryContainer.h"
#include "platform/icode/KV_Operation.h"
#include "platform/icode/KV_Statement.h"
#include "platform/icode/KV_SymbolDB.h"
#include "platform/icode/KvCCStmTable.h"
#include "platform/icode/KvCCodeViewData.h"
#include "platform/icode/KvCParamSymbol.h"
#include "platform/support/KvCNameSpace.h"
#include "platform/support/KvCNames.h"

#include <set>
#include <vector>

namespace {
bool isFileScope(const KvCCStmTable* table) { return table && table->isFileScopeTable(); }

bool validNames(int n, const WmCXString* names) {
  if (n > 0 && !names)
    return false;
  std::set<WmCXString> seen;
  for (int i = 0; i < n; ++i)
    if (!KvCNames::isValidCIdentifier(names[i]) || !seen.insert(names[i]).second)
      return false;
  return true;
}
} // namespace

KvCParamSymbol* KV_ParamMacroSymbolServer::demand(
    KvCCStmTable* table, const WmCXString& name, KV_DataType* returnType, KV_Scaling* returnScaling,
    int n, const WmCXString* names, const unsigned int* paramFlags, KvCFcnClassId* fcnClass,
    KvCIcExpression* body, bool preInclude, bool* newlyCreated, const KvCSrcRef* /*srcRef*/) {
  ++demands;
  if (newlyCreated)
    *newlyCreated = false;
  if (!isFileScope(table) || name.isEmpty() || !returnType || n < 0)
    return nullptr;
  auto key = std::make_pair(static_cast<const KvCCStmTable*>(table), name);
  auto found = macros.find(key);
  if (found != macros.end()) {
    KvCParamSymbol* macro = found->second;
    const bool agrees = macro->getNumberOfFormalParams() == n &&
                        macro->getDataType() == returnType &&
                        macro->isPreIncludeMacro() == preInclude;
    return agrees ? macro : nullptr;
  }
  KV_ICodeFactoryContainer* factories = codeViewData->getFactoryContainer();
  if (!validNames(n, names) || (n > 0 && !paramFlags) ||
      !factories->getCgsSupporter()->isNameFree(table, name) ||
      (body && (body->getParent() || body->getContainingInitValue())))
    return nullptr;
  std::vector<KvCParamSymbol::FormalParam> params(static_cast<std::size_t>(n));
  for (int i = 0; i < n; ++i)
    params[static_cast<std::size_t>(i)] = {names[i], nullptr, nullptr, paramFlags[i]};

  KV_ExprLocFactory* locations = factories->getExprLocFactory();
  KV_ExprLocation* bodyLoc =
      body ? locations->createFromExpression(body) : locations->createEmpty();
  if (!bodyLoc)
    return nullptr;
  KvCParamSymbol* macro = codeViewData->getSymbolDB()->createParamSymbol(name, returnType, true);
  macro->setScaling(returnScaling);
  macro->setSignature(0u, fcnClass, std::move(params));
  if (preInclude)
    macro->markAsPreIncludeMacro();
  macro->setMacroBody(bodyLoc);
  // (macro, body, file). Fresh locations and a fresh statement: nothing can refuse them.
  KV_Operation* definition = factories->getOperationFactory()->createOperation(
      KV_OP_MACRO_DEFINITION,
      {locations->createFromSymbol(macro), bodyLoc, locations->createFromFileId(table->getFile())});
  table->appendStatement(factories->getStatementFactory()->createStatement(
      locations->createFromOperation(definition)));
  if (!table->getNameSpace())
    table->setNameSpace(codeViewData->createNameSpace());
  table->getNameSpace()->add(name);
  macros.emplace(key, macro);
  if (newlyCreated)
    *newlyCreated = true;
  return macro;
}

KvCParamSymbol* KV_ParamMacroSymbolServer::find(const KvCCStmTable* table,
                                                const WmCXString& name) const {
  auto it = macros.find(std::make_pair(table, name));
  return it == macros.end() ? nullptr : it->second;
}
