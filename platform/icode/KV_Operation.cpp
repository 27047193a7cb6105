#include "platform/icode/KV_Operation.h"

#include "platform/icode/KV_ExprLocation.h"

KV_Operation::~KV_Operation() = default;

KV_ExprLocation* KV_Operation::getOperand(int i) const {
  if (i < 0 || i >= getNumberOfOperands())
    return nullptr;
  return operands[static_cast<std::size_t>(i)];
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
  const auto slot = static_cast<std::size_t>(i);
  if (slot < operands.size() && operands[slot] == loc)
    return true;
  if (loc && (loc->getParent() || isWithin(loc)))
    return false;
  if (slot == operands.size())
    operands.push_back(nullptr);
  if (KV_ExprLocation* old = operands[slot])
    old->detach();
  operands[slot] = loc;
  if (loc)
    loc->attach(this, i);
  return true;
}
