// KvCSmbInitValExpr: the initial value of a variable: a scalar (0 dimensions, one
// element) or an array of up to three dimensions, its elements stored row-major. The
// elements are expressions held by no location of their own: their parent is the
// location that holds this initial value.
#ifndef HUL_PLATFORM_ICODE_KVCSMBINITVALEXPR_H
#define HUL_PLATFORM_ICODE_KVCSMBINITVALEXPR_H

#include "platform/icode/KvCIcExpression.h"

#include <vector>

class KvCSmbInitValExpr;

// Walks the elements of an initial value in storage order. A value object: the caller
// owns it; it must not outlive the initial value.
class HUL_PLATFORM_API KvCSmbInitValExprIterator {
public:
  explicit KvCSmbInitValExprIterator(const KvCSmbInitValExpr* value) : initValue(value) {}
  bool isDone() const;
  KvCIcExpression* current() const;
  void next() { ++position; }

private:
  const KvCSmbInitValExpr* initValue;
  std::size_t position = 0;
};

class HUL_PLATFORM_API KvCSmbInitValExpr : public KvCIcExpression {
public:
  // `dimensionSizes` has 0 to 3 entries, each at least 1.
  KvCSmbInitValExpr(int serialNumber, std::vector<int> dimensionSizes)
      : KvCIcExpression(serialNumber), sizes(std::move(dimensionSizes)) {}

  KvCSmbInitValExpr* asSmbInitValExpr() override { return this; }
  KV_DataType* getDataType() const override { return nullptr; }

  int getNumberOfDimensions() const { return static_cast<int>(sizes.size()); }
  int getNumberOfElements() const { return static_cast<int>(elements.size()); }
  bool containsElements() const { return !elements.empty(); }
  // The element at the given indices (unused indices 0), or null when out of range or
  // not given yet.
  KvCIcExpression* get(int i, int j, int k) const;
  KvCSmbInitValExprIterator createIterator() const { return KvCSmbInitValExprIterator(this); }

  // Appends an element in storage order. False for null, an expression held elsewhere (by
  // a location or as an element of an initial value), an expression that contains the
  // location holding this value, or when the value is full.
  bool addElement(KvCIcExpression* element);

private:
  friend class KV_ExprLocation;
  friend class KvCSmbInitValExprIterator;
  void setElementsParent(KV_ExprLocation* holder);
  std::size_t capacity() const;

  std::vector<int> sizes;
  std::vector<KvCIcExpression*> elements;
};

#endif
