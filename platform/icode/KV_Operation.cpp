#include "platform/icode/KV_Operation.h"

#include "platform/icode/KV_ExprLocation.h"
#include "platform/icode/KV_OpConversionInfo.h"
#include "platform/icode/KV_Range.h"

struct KV_Operation::Calculation {
  bool hasConversion = false;
  KV_OpConversionInfo conversion;
  KV_Range resultRange;
};

KV_Operation::KV_Operation(int serialNumber, KV_OpOperator* op)
    : KvCIcExpression(serialNumber), oper(op) {}

KV_Operation::~KV_Operation() = default;

KV_OpConversionInfo* KV_Operation::getConversionInfo() const {
  return calculation && calculation->hasConversion ? &calculation->conversion : nullptr;
}

void KV_Operation::setConversionInfo(bool calculateProtected) {
  if (!calculation)
    calculation = std::make_unique<Calculation>();
  calculation->hasConversion = true;
  calculation->conversion.setCalculateProtected(calculateProtected);
}

const KV_Range& KV_Operation::getResultRange() const {
  static const KV_Range none;
  return calculation ? calculation->resultRange : none;
}

void KV_Operation::setResultRange(const KV_Range& range) {
  if (!calculation)
    calculation = std::make_unique<Calculation>();
  calculation->resultRange = range;
}

KV_ExprLocation* KV_Operation::getOperand(int i) const {
  if (i < 0 || i >= operandCount)
    return nullptr;
  return const_cast<KV_Operation*>(this)->slot(i);
}

KV_Operation* KV_Operation::getParentOperation() const {
  KV_ExprLocation* holder = getParent();
  return holder ? holder->getParentOperation() : nullptr;
}

KV_Statement* KV_Operation::findParentStatement() const {
  KV_ExprLocation* holder = getParent();
  return holder ? holder->getStatement() : nullptr;
}

bool KV_Operation::setOperand(int i, KV_ExprLocation* loc) {
  if (i < 0 || i > getNumberOfOperands())
    return false;
  if (i < operandCount && slot(i) == loc)
    return true;
  if (loc && (loc->getParent() || isWithin(loc)))
    return false;
  if (i == operandCount) {
    if (operandCount >= kInlineOperands)
      extraOperands.push_back(nullptr);
    ++operandCount;
  }
  if (KV_ExprLocation* old = slot(i))
    old->detach();
  slot(i) = loc;
  if (loc)
    loc->attach(this, i);
  return true;
}
