#include "platform/icode/KV_FunctionSymbolServer.h"

#include "platform/icode/KV_DataTypeServer.h"
#include "platform/icode/KV_ExprLocation.h"
#include "platform/icode/KV_ICodeFactoryContainer.h"
#include "platform/icode/KV_Operation.h"
#include "platform/icode/KV_Statement.h"
#include "platform/icode/KV_SymbolDB.h"
#include "platform/icode/KvCCStmTable.h"
#include "platform/icode/KvCCodeViewData.h"
#include "platform/icode/KvCParamSymbol.h"
#include "platform/support/KvCNameSpace.h"

#include <vector>

namespace {
bool agrees(const KvCParamSymbol* existing, KV_DataType* returnType,
            const leda::array<KV_DataType*>& types) {
  if (existing->getDataType() != returnType || existing->getNumberOfFormalParams() != types.size())
    return false;
  for (int i = 0; i < types.size(); ++i)
    if (existing->getFormalParam(i).type != types[types.low() + i])
      return false;
  return true;
}

// Appends `function fn returning type, in file` to the table.
void declare(KvCCodeViewData* cvd, KvCCStmTable* table, KvCParamSymbol* fn) {
  KV_ICodeFactoryContainer* f = cvd->getFactoryContainer();
  KV_ExprLocFactory* locs = f->getExprLocFactory();
  KV_Operation* decl = f->getOperationFactory()->createOperation(
      KV_OP_FUNCTION_DECLARATION,
      {locs->createFromSymbol(fn), locs->createFromDataType(fn->getDataType()),
       locs->createFromFileId(table->getFile())});
  KV_Statement* statement =
      decl ? f->getStatementFactory()->createStatement(locs->createFromOperation(decl)) : nullptr;
  if (statement)
    table->appendStatement(statement);
}
} // namespace

KvCParamSymbol* KV_FunctionSymbolServer::demand(
    KvCCStmTable* table, const WmCXString& name, unsigned int flags, KV_DataType* returnType,
    KV_Scaling* returnScaling, leda::array<KV_DataType*>& types, leda::array<KV_Scaling*>& scalings,
    leda::array<WmCXString>& names, unsigned int* paramFlags, KvCFcnClassId* fcnClass,
    bool* newlyCreated, const KvCSrcRef* /*srcRef*/) {
  ++demands;
  if (newlyCreated)
    *newlyCreated = false;
  const int n = types.size();
  if (!table || name.isEmpty() || !returnType || scalings.size() != n || names.size() != n ||
      (n > 0 && (!paramFlags || types.low() != 0 || scalings.low() != 0 || names.low() != 0)))
    return nullptr;
  std::vector<KvCParamSymbol::FormalParam> params(static_cast<std::size_t>(n));
  for (int i = 0; i < n; ++i) {
    if (!types[i])
      return nullptr;
    params[static_cast<std::size_t>(i)] = {names[i], types[i], scalings[i], paramFlags[i]};
  }
  auto key = std::make_pair(static_cast<const KvCCStmTable*>(table), name);
  auto it = functions.find(key);
  if (it != functions.end())
    return agrees(it->second, returnType, types) ? it->second : nullptr;
  // A name a variable of the file's scope, or a type, already carries cannot name a
  // function as well: the file would not be C.
  if ((table->getNameSpace() && table->getNameSpace()->contains(name)) ||
      codeViewData->getDataTypeServer()->findType(name))
    return nullptr;
  KvCParamSymbol* fn = codeViewData->getSymbolDB()->createParamSymbol(name, returnType, false);
  fn->setScaling(returnScaling);
  fn->setSignature(flags, fcnClass, std::move(params));
  functions.emplace(key, fn);
  declare(codeViewData, table, fn);
  if (newlyCreated)
    *newlyCreated = true;
  return fn;
}

KvCParamSymbol* KV_FunctionSymbolServer::find(const KvCCStmTable* table,
                                              const WmCXString& name) const {
  auto it = functions.find(std::make_pair(table, name));
  return it == functions.end() ? nullptr : it->second;
}
