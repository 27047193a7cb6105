#include "platform/icode/KV_QualifiedSymbolOp.h"

#include "platform/icode/KV_DataType.h"
#include "platform/icode/KV_ExprLocation.h"
#include "platform/icode/KvCSymbol.h"

KV_QualifiedSymbolOp::KV_QualifiedSymbolOp(int serialNumber, KvCSymbol* accessed)
    : KV_Operation(serialNumber, KV_OpOperator::get(KV_OP_QUALIFIED_SYMBOL)), symbol(accessed) {}

int KV_QualifiedSymbolOp::getIndexForDim(int dim, int /*unused*/) const {
  if (dim < 0 || dim >= getResolvedNumberOfDims() || getOperand(dim))
    return -1;
  // A dimension added as a plain operand (appendOperand) has no recorded constant.
  if (static_cast<std::size_t>(dim) >= constantIndices.size())
    return -1;
  return constantIndices[static_cast<std::size_t>(dim)];
}

void KV_QualifiedSymbolOp::addConstantIndex(int index) {
  constantIndices.resize(static_cast<std::size_t>(getNumberOfOperands()), -1);
  appendOperand(nullptr);
  constantIndices.push_back(index);
}

bool KV_QualifiedSymbolOp::addIndexEloc(KV_ExprLocation* indexLoc) {
  if (!indexLoc || !appendOperand(indexLoc))
    return false;
  constantIndices.resize(static_cast<std::size_t>(getNumberOfOperands()), -1);
  return true;
}

bool KV_QualifiedSymbolOp::isStrictlyQualified(int /*level*/) const { return strictlyQualified; }

bool KV_QualifiedSymbolOp::isEqualExceptIndices(KV_QualifiedSymbolOp* other) const {
  return other && symbol == other->symbol && getBaseSymbol() == other->getBaseSymbol() &&
         dereferenced == other->dereferenced &&
         getResolvedNumberOfDims() == other->getResolvedNumberOfDims();
}

bool KV_QualifiedSymbolOp::isEqual(KV_QualifiedSymbolOp* other, bool ignoreQualification) const {
  if (!isEqualExceptIndices(other))
    return false;
  if (!ignoreQualification && strictlyQualified != other->strictlyQualified)
    return false;
  for (int d = 0; d < getResolvedNumberOfDims(); ++d) {
    const KV_ExprLocation* a = getIndexElocForDim(d);
    const KV_ExprLocation* b = other->getIndexElocForDim(d);
    if ((a == nullptr) != (b == nullptr))
      return false;
    if (!a && getIndexForDim(d) != other->getIndexForDim(d))
      return false;
    if (a && !a->isStructurallyEqual(b))
      return false;
  }
  return true;
}

KV_DataType* KV_QualifiedSymbolOp::getDataType() const {
  if (KV_DataType* explicitType = KV_Operation::getDataType())
    return explicitType;
  KV_DataType* type = symbol ? symbol->getDataType() : nullptr;
  if (type && dereferenced)
    type = type->asPointerType() ? type->asPointerType()->getTargetType() : nullptr;
  for (int d = 0; type && d < getResolvedNumberOfDims(); ++d)
    type = type->asArrayType() ? type->asArrayType()->getElementType() : nullptr;
  return type;
}
