#include "platform/icode/KV_MacroSymbolServer.h"

#include "platform/icode/KV_CgsSupporter.h"
#include "platform/icode/KV_ExprLocation.h"
#include "platform/icode/KV_ICodeFactoryContainer.h"
#include "platform/icode/KV_Operation.h"
#include "platform/icode/KV_Statement.h"
#include "platform/icode/KV_SymbolDB.h"
#include "platform/icode/KvCCStmTable.h"
#include "platform/icode/KvCCodeViewData.h"
#include "platform/icode/KvCIcFileId.h"
#include "platform/icode/KvCUnparamSymbol.h"
#include "platform/icode/KvCVarClassServer.h"
#include "platform/support/KvCNameSpace.h"

#include <cstdint>

KvCSymbol* KV_MacroSymbolServer::demandExternGlobal(KvCIcFileId* file, const WmCXString& name,
                                                    KV_DataType* type, KV_Scaling* scaling,
                                                    bool* created, const KvCSrcRef* srcRef) {
  if (created)
    *created = false;
  if (!file || !type)
    return nullptr;
  auto found = globals.find(name);
  if (found != globals.end()) {
    const Global& global = found->second;
    const bool same = global.file == file && global.symbol->getDataType() == type &&
                      global.symbol->getScaling() == scaling;
    return same ? global.symbol : nullptr;
  }
  KvCVarClassId* varClass = varClassServer->demandMacroGlobalExternDefault(srcRef);
  KvCUnparamSymbol* symbol = cgsSupporter->createGlobalVariable(
      name, type, scaling, 0.0, varClass, file->getFile()->getStatementTable(), 0);
  if (!symbol)
    return nullptr;
  globals.emplace(name, Global{symbol, file});
  if (created)
    *created = true;
  return symbol;
}

KvCUnparamSymbol* KV_MacroSymbolServer::findExternGlobal(const WmCXString& name) const {
  auto found = globals.find(name);
  return found == globals.end() ? nullptr : found->second.symbol;
}

KvCUnparamSymbol* KV_MacroSymbolServer::demandGlobal(KvCCStmTable* table, const WmCXString& name,
                                                     KV_DataType* type, KV_Scaling* scaling,
                                                     const KvCSrcRef* /*srcRef*/) {
  if (!table || !type)
    return nullptr;
  auto found = macros.find(name);
  if (found != macros.end()) {
    const Macro& macro = found->second;
    const bool same = macro.table == table && macro.symbol->getDataType() == type &&
                      macro.symbol->getScaling() == scaling;
    return same ? macro.symbol : nullptr;
  }
  if (!table->isFileScopeTable() || !cgsSupporter->isNameFree(table, name))
    return nullptr;
  KV_ICodeFactoryContainer* factories = codeViewData->getFactoryContainer();
  KV_ExprLocFactory* locations = factories->getExprLocFactory();
  KvCUnparamSymbol* symbol = codeViewData->getSymbolDB()->createUnparamSymbol(name, type, false);
  symbol->setScaling(scaling);
  symbol->setRole(KV_ROLE_GLOBAL_MACRO, true);
  const auto identifier = static_cast<std::int64_t>(macros.size()) + 1;
  // (macro, type, file, value). Fresh locations and a fresh statement: nothing can refuse them.
  KV_Operation* definition = factories->getOperationFactory()->createOperation(
      KV_OP_MACRO_DEFINITION,
      {locations->createFromSymbol(symbol), locations->createFromDataType(type),
       locations->createFromFileId(table->getFile()),
       locations->createFromValue(identifier, type)});
  table->appendStatement(factories->getStatementFactory()->createStatement(
      locations->createFromOperation(definition)));
  if (!table->getNameSpace())
    table->setNameSpace(codeViewData->createNameSpace());
  table->getNameSpace()->add(name);
  macros.emplace(name, Macro{symbol, table});
  return symbol;
}

KvCUnparamSymbol* KV_MacroSymbolServer::findGlobal(const WmCXString& name) const {
  auto found = macros.find(name);
  return found == macros.end() ? nullptr : found->second.symbol;
}
