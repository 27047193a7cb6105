#include "platform/icode/KV_DataTypeServer.h"

#include "platform/icode/KV_SymbolDB.h"

#include "platform/icode/KV_PointerTypeServer.h"

KV_DataTypeServer::KV_DataTypeServer()
    : pointerServer(std::make_unique<KV_PointerTypeServer>(this)) {}

KV_DataTypeServer::~KV_DataTypeServer() = default;

template <class T> T* KV_DataTypeServer::adopt(std::unique_ptr<T> type) {
  T* result = type.get();
  types.push_back(std::move(type));
  return result;
}

template <class T>
T* KV_DataTypeServer::adoptNamed(std::unique_ptr<T> type, KV_DataType::Naming naming) {
  if (findType(type->getName()) || (symbolDB && symbolDB->findSymbol(type->getName())))
    return nullptr;
  type->naming = std::move(naming);
  T* result = adopt(std::move(type));
  byName.emplace(result->getName(), result);
  return result;
}

template KV_NumericalType* KV_DataTypeServer::adoptNamed(std::unique_ptr<KV_NumericalType>,
                                                         KV_DataType::Naming);
template KV_PointerType* KV_DataTypeServer::adoptNamed(std::unique_ptr<KV_PointerType>,
                                                       KV_DataType::Naming);

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

KV_VoidType* KV_DataTypeServer::demandUndefinedType() {
  if (!undefinedType)
    undefinedType = adopt(std::make_unique<KV_VoidType>(getNumberOfTypes(), "undefined", true));
  return undefinedType;
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

KV_NumericalType* KV_DataTypeServer::demandBaseType(const WmCXString& name) {
  static const struct {
    const char* name;
    KV_NumericalType* (KV_DataTypeServer::*demand)();
  } kBaseTypes[] = {
      {"Int8", &KV_DataTypeServer::getInt8},       {"UInt8", &KV_DataTypeServer::getUInt8},
      {"Int16", &KV_DataTypeServer::getInt16},     {"UInt16", &KV_DataTypeServer::getUInt16},
      {"Int32", &KV_DataTypeServer::getInt32},     {"UInt32", &KV_DataTypeServer::getUInt32},
      {"Float32", &KV_DataTypeServer::getFloat32}, {"Float64", &KV_DataTypeServer::getFloat64},
      {"Bool", &KV_DataTypeServer::getBool},
  };
  for (const auto& base : kBaseTypes)
    if (name == base.name)
      return (this->*base.demand)();
  return nullptr;
}

KV_DataType* KV_DataTypeServer::findTypeByName(const WmCXString& name,
                                               const KvCSrcRef* /*srcRef*/) {
  if (KV_DataType* existing = findType(name))
    return existing;
  return demandBaseType(name);
}

KV_DataType* KV_DataTypeServer::findTypeByName(const WmCXString& name, KV_DimensionDescriptor& dims,
                                               const KvCSrcRef* srcRef, bool fromDataDictionary) {
  KV_DataType* type = fromDataDictionary ? findType(name) : findTypeByName(name, srcRef);
  if (!type || type->isDataDictionaryType() != fromDataDictionary)
    return nullptr;
  dims = type->getDimensions();
  return type;
}

KV_NumericalType* KV_DataTypeServer::registerDataDictionaryType(
    const WmCXString& name, KV_DataType* baseType, const KV_DimensionDescriptor& dims,
    bool createTypedef, KvCIcFileId* module, const KvCSrcRef* srcRef) {
  KV_NumericalType* base = baseType ? baseType->getNumericalType() : nullptr;
  if (name.isEmpty() || (baseType && !base))
    return nullptr;
  auto type = base ? std::make_unique<KV_NumericalType>(nextTypeId(), name, base->getBits(),
                                                        base->isSigned(), base->isFloat())
                   : std::make_unique<KV_NumericalType>(nextTypeId(), name, 32, true, false);
  KV_DataType::Naming naming;
  naming.base = base;
  naming.dims = dims;
  naming.createTypedef = createTypedef;
  naming.dataDictionary = true;
  naming.srcRef = srcRef;
  KV_NumericalType* result = adoptNamed(std::move(type), std::move(naming));
  if (result)
    result->moduleFile = module;
  return result;
}

KV_NumericalType* KV_DataTypeServer::registerDataDictionaryType(const WmCXString& name,
                                                                KV_DataType* baseType, bool scalar,
                                                                bool createTypedef,
                                                                KvCIcFileId* module,
                                                                const KvCSrcRef* srcRef) {
  KV_DimensionDescriptor dims;
  if (!scalar)
    dims.addDimension(2);
  return registerDataDictionaryType(name, baseType, dims, createTypedef, module, srcRef);
}
