#include "platform/icode/KV_MacroSymbolServer.h"

#include "platform/icode/KV_CgsSupporter.h"
#include "platform/icode/KvCIcFileId.h"
#include "platform/icode/KvCUnparamSymbol.h"
#include "platform/icode/KvCVarClassServer.h"

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
