#include "platform/icode/KvCSmbInitValExpr.h"

#include "platform/icode/KV_ExprLocation.h"

bool KvCSmbInitValExprIterator::isDone() const {
  return !initValue || position >= initValue->elements.size();
}

KvCIcExpression* KvCSmbInitValExprIterator::current() const {
  return isDone() ? nullptr : initValue->elements[position];
}

std::size_t KvCSmbInitValExpr::capacity() const {
  std::size_t n = 1;
  for (int size : sizes)
    n *= static_cast<std::size_t>(size > 0 ? size : 0);
  return n;
}

KvCIcExpression* KvCSmbInitValExpr::get(int i, int j, int k) const {
  const int index[3] = {i, j, k};
  std::size_t flat = 0;
  for (int d = 0; d < 3; ++d) {
    const int size = d < getNumberOfDimensions() ? sizes[static_cast<std::size_t>(d)] : 1;
    if (index[d] < 0 || index[d] >= size)
      return nullptr;
    flat = flat * static_cast<std::size_t>(size) + static_cast<std::size_t>(index[d]);
  }
  return flat < elements.size() ? elements[flat] : nullptr;
}

bool KvCSmbInitValExpr::addElement(KvCIcExpression* element) {
  if (!element || element == this || element->getParent() || element->containingInitValue ||
      elements.size() >= capacity())
    return false;
  // Its parent would be the holder: refused when the holder lies within it.
  if (getParent() && getParent()->isWithin(element))
    return false;
  noteStructureChange();
  elements.push_back(element);
  element->containingInitValue = this;
  element->parentLocation = getParent();
  return true;
}

void KvCSmbInitValExpr::setElementsParent(KV_ExprLocation* holder) {
  noteStructureChange();
  for (KvCIcExpression* e : elements)
    e->parentLocation = holder;
}
