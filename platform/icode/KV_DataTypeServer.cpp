#include "platform/icode/KV_DataTypeServer.h"

KV_DataTypeServer::KV_DataTypeServer() = default;
KV_DataTypeServer::~KV_DataTypeServer() = default;

template <class T> T* KV_DataTypeServer::adopt(std::unique_ptr<T> type) {
  T* result = type.get();
  types.push_back(std::move(type));
  return result;
}

KV_NumericalType* KV_DataTypeServer::demandNumericalType(const WmCXString& name, int bits,
                                                         bool isSigned, bool isFloat) {
  if (KV_DataType* existing = findType(name)) {
    KV_NumericalType* n = existing->asNumericalType();
    if (!n || n->getBits() != bits || n->isSigned() != isSigned || n->isFloat() != isFloat)
      return nullptr;
    return n;
  }
  auto* type =
      adopt(std::make_unique<KV_NumericalType>(getNumberOfTypes(), name, bits, isSigned, isFloat));
  byName.emplace(name, type);
  return type;
}

KV_VoidType* KV_DataTypeServer::demandVoidType() {
  if (!voidType)
    voidType = adopt(std::make_unique<KV_VoidType>(getNumberOfTypes(), "void"));
  return voidType;
}

KV_PointerType* KV_DataTypeServer::demandPointerType(KV_DataType* target, bool toConst) {
  if (!target)
    return nullptr;
  KV_PointerType*& slot = pointers[{target, toConst}];
  if (!slot) {
    WmCXString name = (toConst ? "const " : "") + target->getName() + "*";
    slot = adopt(std::make_unique<KV_PointerType>(getNumberOfTypes(), name, target, toConst));
  }
  return slot;
}

KV_ArrayType* KV_DataTypeServer::demandArrayType(KV_DataType* element, int size) {
  if (!element || size < 1)
    return nullptr;
  KV_ArrayType*& slot = arrays[{element, size}];
  if (!slot) {
    WmCXString name = element->getName() + "[" + WmCXString(size, false, false) + "]";
    slot = adopt(std::make_unique<KV_ArrayType>(getNumberOfTypes(), name, element, size));
  }
  return slot;
}

KV_StructType* KV_DataTypeServer::demandStructType(const WmCXString& name) {
  if (KV_DataType* existing = findType(name))
    return existing->asStructType();
  auto* type = adopt(std::make_unique<KV_StructType>(getNumberOfTypes(), name));
  byName.emplace(name, type);
  return type;
}

KV_DataType* KV_DataTypeServer::findType(const WmCXString& name) const {
  auto it = byName.find(name);
  return it == byName.end() ? nullptr : it->second;
}
