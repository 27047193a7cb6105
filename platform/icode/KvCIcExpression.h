// KvCIcExpression: what an expression location can hold as an expression: an operation
// (including symbol accesses, calls and code blocks), a constant, a string or a symbol
// initial value.
//
// An expression is held by at most one location, its parent. The elements of a symbol
// initial value are the exception that proves the rule: they are held by no location of
// their own, and their parent is the location that holds the initial value (null while
// no location holds it). An element belongs to its initial value for good: no location
// and no other initial value can take it.
#ifndef HUL_PLATFORM_ICODE_KVCICEXPRESSION_H
#define HUL_PLATFORM_ICODE_KVCICEXPRESSION_H

#include "platform/icode/KV_ICodeElem.h"

class KV_Constant;
class KV_DataType;
class KvCSmbInitValExpr;
class KvCStringExpr;

class HUL_PLATFORM_API KvCIcExpression : public KV_ICodeElem {
public:
  KvCIcExpression* asExpression() override { return this; }
  virtual KV_Constant* asConstant() { return nullptr; }
  virtual KvCStringExpr* asStringExpr() { return nullptr; }
  virtual KvCSmbInitValExpr* asSmbInitValExpr() { return nullptr; }

  // The location that holds this expression, or null.
  KV_ExprLocation* getParent() const { return parentLocation; }
  // The initial value of which this expression is an element, or null.
  KvCSmbInitValExpr* getContainingInitValue() const { return containingInitValue; }
  KV_ICodeElem* getParentElem() const override;
  // The type of the expression's value, or null.
  virtual KV_DataType* getDataType() const = 0;

protected:
  explicit KvCIcExpression(int serialNumber) : KV_ICodeElem(serialNumber) {}

private:
  friend class KV_ExprLocation;
  friend class KvCSmbInitValExpr;
  KV_ExprLocation* parentLocation = nullptr;
  KvCSmbInitValExpr* containingInitValue = nullptr;
};

#endif
