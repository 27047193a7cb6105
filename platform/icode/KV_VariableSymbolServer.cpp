#include "platform/icode/KV_VariableSymbolServer.h"

#include "platform/icode/KV_SymbolDB.h"
#include "platform/icode/KvCCodeViewData.h"
#include "platform/icode/KvCUnparamSymbol.h"

KvCUnparamSymbol* KV_VariableSymbolServer::create(const WmCXString& name, unsigned int roles,
                                                  KV_DataType* type, KV_Scaling* scaling,
                                                  KvCVarClassId* varClass,
                                                  const KvCSrcRef* /*srcRef*/) {
  if (name.isEmpty() || !type || !varClass)
    return nullptr;
  KvCUnparamSymbol* variable = codeViewData->getSymbolDB()->createUnparamSymbol(name, type, false);
  variable->setScaling(scaling);
  variable->setVarClass(varClass);
  for (unsigned bit = 1; bit != 0; bit <<= 1)
    if (roles & bit)
      variable->setRole(static_cast<tagKvESymbolRole>(bit), true);
  return variable;
}
