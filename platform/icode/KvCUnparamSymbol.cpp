#include "platform/icode/KvCUnparamSymbol.h"

#include "platform/icode/KV_DataType.h"
#include "platform/icode/KvCVarClassId.h"

bool KvCUnparamSymbol::isStructInstance() const {
  KV_DataType* type = getDataType();
  return type && type->asStructType();
}

KvCUnparamSymbol* KvCUnparamSymbol::getComponentSymbol(int i) const {
  if (i < 0 || static_cast<std::size_t>(i) >= componentSymbols.size())
    return nullptr;
  return componentSymbols[static_cast<std::size_t>(i)];
}

KvCSmbClassId* KvCUnparamSymbol::getSmbClassId() const {
  return varClass ? varClass->getSmbClassId() : nullptr;
}

KV_StructType* KvCUnparamSymbol::getSlotStructType() const {
  KV_DataType* type = getDataType();
  if (KV_ArrayType* array = type ? type->asArrayType() : nullptr)
    type = array->getElementType();
  return type ? type->asStructType() : nullptr;
}

KvCUnparamSymbol* KvCUnparamSymbol::getComponentInstance(const WmCXString& componentName) const {
  KV_StructType* type = getSlotStructType();
  for (int i = 0; type && i < type->getNumberOfComponents(); ++i)
    if (type->getComponent(i).name == componentName)
      return getComponentSymbol(i);
  return nullptr;
}
