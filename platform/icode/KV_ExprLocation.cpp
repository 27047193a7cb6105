#include "platform/icode/KV_ExprLocation.h"

#include "platform/icode/KV_Constant.h"
#include "platform/icode/KV_DataType.h"
#include "platform/icode/KV_Operation.h"
#include "platform/icode/KV_QualifiedSymbolOp.h"
#include "platform/icode/KV_Range.h"
#include "platform/icode/KV_Statement.h"
#include "platform/icode/KvCExprLocDB.h"
#include "platform/icode/KvCSmbInitValExpr.h"
#include "platform/icode/KvCStringExpr.h"

#include <cfloat>

KV_ExprLocation::KV_ExprLocation(int serialNumber) : KV_ICodeElem(serialNumber) {}

KV_ExprLocation::~KV_ExprLocation() = default;

KV_Operation* KV_ExprLocation::getOperation() const {
  return expression ? expression->asOperation() : nullptr;
}

KV_QualifiedSymbolOp* KV_ExprLocation::getQualifiedSymbolOp() const {
  return expression ? expression->asQualifiedSymbolOp() : nullptr;
}

KV_Constant* KV_ExprLocation::getConstant() const {
  return expression ? expression->asConstant() : nullptr;
}

KvCStringExpr* KV_ExprLocation::getStringExpr() const {
  return expression ? expression->asStringExpr() : nullptr;
}

KvCSmbInitValExpr* KV_ExprLocation::getSmbInitValExpr() const {
  return expression ? expression->asSmbInitValExpr() : nullptr;
}

KV_DataType* KV_ExprLocation::getDataType() const {
  return expression ? expression->getDataType() : nullptr;
}

KV_Operation* KV_ExprLocation::getCalcOperation() const {
  KV_Operation* op = getOperation();
  if (!op || op->asQualifiedSymbolOp() || !op->getConversionInfo())
    return nullptr;
  return op;
}

void KV_ExprLocation::getValueRange(KV_Range& range) const {
  if (valueRange) {
    range = *valueRange;
    return;
  }
  if (KV_Operation* calc = getCalcOperation()) {
    range = calc->getResultRange();
    return;
  }
  KV_DataType* type = getDataType();
  KV_NumericalType* numerical = type ? type->asNumericalType() : nullptr;
  if (numerical && !numerical->isFloat()) {
    range = KV_Range::makeIntRange(numerical->getMinValue(), numerical->getMaxValue());
    return;
  }
  range = KV_Range(-DBL_MAX, DBL_MAX);
}

void KV_ExprLocation::setValueRange(const KV_Range& range) {
  valueRange = std::make_unique<KV_Range>(range);
}

KV_Operation* KV_ExprLocation::getParentOperation() const {
  return parent ? parent->asOperation() : nullptr;
}

KV_Statement* KV_ExprLocation::getStatement() const {
  for (KV_ICodeElem* e = parent; e; e = e->getParentElem())
    if (KV_Statement* statement = e->asStatement())
      return statement;
  return nullptr;
}

void KV_ExprLocation::dropContent() {
  noteStructureChange();
  if (expression) {
    expression->parentLocation = nullptr;
    if (KvCSmbInitValExpr* init = expression->asSmbInitValExpr())
      init->setElementsParent(nullptr);
  }
  expression = nullptr;
  typeRef = nullptr;
  fileRef = nullptr;
}

bool KV_ExprLocation::liesInElementOf(KvCIcExpression* expr) const {
  // The elements of an initial value that no location holds have no parent: such an
  // element is the top of any tree below it.
  KV_ICodeElem* top = parent;
  if (!top)
    return false;
  while (KV_ICodeElem* up = top->getParentElem())
    top = up;
  KvCIcExpression* topExpr = top->asExpression();
  return topExpr && topExpr->containingInitValue == expr;
}

bool KV_ExprLocation::setExpression(KvCIcExpression* expr) {
  if (expr == expression && expr)
    return true;
  if (expr && (expr->parentLocation || expr->containingInitValue || isWithin(expr) ||
               liesInElementOf(expr)))
    return false;
  dropContent();
  expression = expr;
  if (!expr)
    return true;
  expr->parentLocation = this;
  if (KvCSmbInitValExpr* init = expr->asSmbInitValExpr())
    init->setElementsParent(this);
  return true;
}

void KV_ExprLocation::setDataTypeRef(KV_DataType* type) {
  dropContent();
  typeRef = type;
}

void KV_ExprLocation::setFileIdRef(KvCIcFileId* file) {
  dropContent();
  fileRef = file;
}

KvCIcExpression* KV_ExprLocation::releaseContent() {
  KvCIcExpression* old = expression;
  dropContent();
  return old;
}

bool KV_ExprLocation::isStructurallyEqual(const KV_ExprLocation* other) const {
  if (!other)
    return false;
  if (this == other)
    return true;
  if (typeRef || other->typeRef)
    return typeRef == other->typeRef && !expression && !other->expression;
  if (fileRef || other->fileRef)
    return fileRef == other->fileRef && !expression && !other->expression;
  if (!expression || !other->expression)
    return !expression && !other->expression;
  if (KV_QualifiedSymbolOp* q = getQualifiedSymbolOp()) {
    KV_QualifiedSymbolOp* r = other->getQualifiedSymbolOp();
    return r && q->isEqual(r, false);
  }
  if (KV_Operation* a = getOperation()) {
    KV_Operation* b = other->getOperation();
    if (!b || b->asQualifiedSymbolOp() || a->getOperator() != b->getOperator() ||
        a->getNumberOfOperands() != b->getNumberOfOperands())
      return false;
    for (int i = 0; i < a->getNumberOfOperands(); ++i) {
      const KV_ExprLocation* x = a->getOperand(i);
      const KV_ExprLocation* y = b->getOperand(i);
      if ((x == nullptr) != (y == nullptr) || (x && !x->isStructurallyEqual(y)))
        return false;
    }
    return true;
  }
  if (KV_Constant* c = getConstant())
    return other->getConstant() && c->isEqual(other->getConstant(), nullptr);
  if (KvCStringExpr* s = getStringExpr())
    return other->getStringExpr() && s->getString() == other->getStringExpr()->getString();
  return expression == other->expression;
}
