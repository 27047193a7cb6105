#include "platform/icode/KV_FunctionCallInserter.h"

#include "platform/icode/KV_ICodeFactoryContainer.h"
#include "platform/icode/KV_SymbolServer.h"
#include "platform/icode/KvCIcFileId.h"
#include "platform/icode/KvCSmbClassServer.h"
#include <vector>

KvCParamSymbol* KV_FunctionCallInserter::demandFunctionSymbol(
    const WmCXString& name, KV_DataType* returnType, KV_Scaling* returnScaling, int n,
    KV_ParamAccess** accesses, KV_DataType** types, KV_Scaling** scalings, KvCIcFileId* file,
    const KvCSrcRef* srcRef, bool mustBeNew) {
  return demandFunctionSymbol(name, returnType, returnScaling, n, accesses, types, scalings,
                              nullptr, file, srcRef, mustBeNew);
}

KvCParamSymbol* KV_FunctionCallInserter::demandFunctionSymbol(
    const WmCXString& name, KV_DataType* returnType, KV_Scaling* returnScaling, int n,
    KV_ParamAccess** accesses, KV_DataType** types, KV_Scaling** scalings, KvCFcnClassId* fcnClass,
    KvCIcFileId* file, const KvCSrcRef* srcRef, bool mustBeNew) {
  if (!factories || !file || n < 0 || (n > 0 && (!accesses || !types || !scalings)))
    return nullptr;
  KV_FunctionSymbolServer* functions = factories->getSymbolServer()->getFunction();
  KvCCStmTable* table = file->getFile()->getStt();
  if (mustBeNew && functions->find(table, name))
    return nullptr;
  leda::array<KV_DataType*> typeTable(n);
  leda::array<KV_Scaling*> scalingTable(n);
  leda::array<WmCXString> nameTable(n);
  std::vector<unsigned int> flags(static_cast<std::size_t>(n) + 1, 0u);
  for (int i = 0; i < n; ++i) {
    if (!accesses[i])
      return nullptr;
    typeTable[i] = types[i];
    scalingTable[i] = scalings[i];
    nameTable[i] = "p" + WmCXString(i, false, false);
    flags[static_cast<std::size_t>(i)] = accesses[i]->getFlagWord();
  }
  if (!fcnClass)
    fcnClass = factories->getSmbClassServer()->getFcnClassServer()->demandFcnClass(srcRef);
  bool created = false;
  return functions->demand(table, name, 0u, returnType, returnScaling, typeTable, scalingTable,
                           nameTable, flags.data(), fcnClass, &created, srcRef);
}
