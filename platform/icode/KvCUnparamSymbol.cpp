#include "platform/icode/KvCUnparamSymbol.h"

#include "platform/icode/KV_DataType.h"

bool KvCUnparamSymbol::isStructInstance() const {
  KV_DataType* type = getDataType();
  return type && type->asStructType();
}

KvCUnparamSymbol* KvCUnparamSymbol::getComponentSymbol(int i) const {
  if (i < 0 || static_cast<std::size_t>(i) >= componentSymbols.size())
    return nullptr;
  return componentSymbols[static_cast<std::size_t>(i)];
}
