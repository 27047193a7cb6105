#include "platform/icode/KV_DataType.h"

#include "platform/icode/KvCExprLocDB.h"

KV_DataType::KV_DataType(int id, tagKvEDataTypeKind k, WmCXString typeName)
    : typeId(id), kind(k), name(std::move(typeName)) {}

KV_DataType::~KV_DataType() = default;

bool KV_DataType::isEqualType(KV_DataType* other) const {
  if (!other)
    return false;
  if (this == other)
    return true;
  return kind == other->kind && hasEqualStructure(*other);
}

namespace {
const KV_DataType* endOfBaseChain(const KV_DataType* type) {
  while (KV_DataType* base = type->getBaseType())
    type = base;
  return type;
}
} // namespace

KV_DataType* KV_DataType::getSourceType() {
  KV_DataType* type = this;
  while (KV_DataType* base = type->getBaseType())
    type = base;
  return type;
}

bool KV_DataType::isSameType(KV_DataType* other) const {
  return other && endOfBaseChain(this) == endOfBaseChain(other);
}

bool KV_DataType::isKind10() const {
  const KV_DataType* end = endOfBaseChain(this);
  return end->kind == KV_TYPE_NUMERICAL &&
         static_cast<const KV_NumericalType*>(end)->isBooleanBaseType();
}

KV_NumericalType* KV_NumericalType::getNumBaseType() {
  KV_NumericalType* type = this;
  while (KV_DataType* base = type->getBaseType()) {
    KV_NumericalType* numerical = base->asNumericalType();
    if (!numerical)
      break;
    type = numerical;
  }
  return type;
}

bool KV_NumericalType::isBooleanBaseType() const {
  return getBaseType() == nullptr && !isDataDictionaryType() && getName() == WmCXString("Bool");
}

KvCExprLocDB* KV_DataType::getExprLocDB() {
  if (!db)
    db = std::make_unique<KvCExprLocDB>();
  return db.get();
}

KV_NumericalType::KV_NumericalType(int id, WmCXString typeName, int bitWidth, bool signedType,
                                   bool floatType)
    : KV_DataType(id, KV_TYPE_NUMERICAL, std::move(typeName)), bits(bitWidth),
      isSignedType(signedType), floating(floatType) {}

std::int64_t KV_NumericalType::getMinValue() const {
  if (floating || !isSignedType || bits <= 0)
    return 0;
  if (bits >= 64)
    return INT64_MIN;
  return -(std::int64_t{1} << (bits - 1));
}

std::int64_t KV_NumericalType::getMaxValue() const {
  if (floating || bits <= 0)
    return 0;
  const int valueBits = isSignedType ? bits - 1 : bits;
  if (valueBits >= 63)
    return INT64_MAX;
  return (std::int64_t{1} << valueBits) - 1;
}

bool KV_NumericalType::hasEqualStructure(const KV_DataType& other) const {
  const auto& n = static_cast<const KV_NumericalType&>(other);
  return bits == n.bits && isSignedType == n.isSignedType && floating == n.floating;
}

KV_PointerType::KV_PointerType(int id, WmCXString typeName, KV_DataType* target, bool toConst)
    : KV_DataType(id, KV_TYPE_POINTER, std::move(typeName)), targetType(target),
      pointerToConst(toConst) {}

bool KV_PointerType::hasEqualStructure(const KV_DataType& other) const {
  const auto& p = static_cast<const KV_PointerType&>(other);
  if (pointerToConst != p.pointerToConst)
    return false;
  if (!targetType || !p.targetType)
    return targetType == p.targetType;
  return targetType->isEqualType(p.targetType);
}

void KV_StructType::addComponent(const WmCXString& componentName, KV_DataType* type) {
  components.emplace_back(componentName, type);
}

KV_ComponentDeclaration* KV_StructType::getComponent(const WmCXString& componentName) {
  for (Component& c : components)
    if (c.name == componentName)
      return &c;
  return nullptr;
}

KV_DataType* KV_StructType::findComponentType(const WmCXString& componentName) const {
  for (const Component& c : components)
    if (c.name == componentName)
      return c.type;
  return nullptr;
}

KV_ArrayType::KV_ArrayType(int id, WmCXString typeName, KV_DataType* element, int elementCount)
    : KV_DataType(id, KV_TYPE_ARRAY, std::move(typeName)), elementType(element),
      size(elementCount) {}

bool KV_ArrayType::hasEqualStructure(const KV_DataType& other) const {
  const auto& a = static_cast<const KV_ArrayType&>(other);
  if (size != a.size)
    return false;
  if (!elementType || !a.elementType)
    return elementType == a.elementType;
  return elementType->isEqualType(a.elementType);
}
