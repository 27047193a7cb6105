#include "platform/icode/KV_Operation.h"

#include "platform/icode/KV_ExprLocation.h"

KV_Operation::~KV_Operation() = default;

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
