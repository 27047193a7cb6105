// KV_Operation: an operation of the ICode: an operator and its operand locations, with
// the operation's result type, scaling and conversion level.
//
// Operands are attached only through setOperand, which keeps each operand's parent and
// index in agreement with this operation and refuses a location that has a parent
// already or that contains this operation (no cycles). An operand slot may be empty.
#ifndef HUL_PLATFORM_ICODE_KV_OPERATION_H
#define HUL_PLATFORM_ICODE_KV_OPERATION_H

#include "platform/icode/KV_OpOperator.h"
#include "platform/icode/KvCIcExpression.h"

#include <memory>
#include <vector>

class KV_OpConversionInfo;
class KV_OpConversionLevel;
class KV_Range;
class KvCSrcRef;
class KV_Scaling;
class KvCCallOperation;
class KvCCodeBlockOperation;

class HUL_PLATFORM_API KV_Operation : public KvCIcExpression {
public:
  KV_Operation(int serialNumber, KV_OpOperator* op);
  ~KV_Operation() override;

  KV_Operation* asOperation() override { return this; }
  virtual KvCCallOperation* asCallOperation() { return nullptr; }
  virtual KvCCodeBlockOperation* asCodeBlockOperation() { return nullptr; }

  KV_OpOperator* getOperator() const { return oper; }
  int getNumberOfOperands() const { return operandCount; }
  // The location of operand i, or null for an empty slot or a position out of range.
  KV_ExprLocation* getOperand(int i) const;
  // The operation of which the holding location is an operand, or null.
  KV_Operation* getParentOperation() const;
  // The statement that contains the operation, or null. O(depth).
  KV_Statement* findParentStatement() const;
  bool usesOperand(int i) const { return oper->usesOperand(i, getNumberOfOperands()); }
  bool definesOperand(int i) const { return oper->definesOperand(i, getNumberOfOperands()); }

  // The result type (for a cast: the target type), or null.
  KV_DataType* getDataType() const override { return dataType; }
  void setDataType(KV_DataType* type) { dataType = type; }
  KV_Scaling* getScaling() const { return scaling; }
  void setScaling(KV_Scaling* s) { scaling = s; }
  KV_OpConversionLevel* getConversionLevel() const { return conversionLevel; }
  void setConversionLevel(KV_OpConversionLevel* level) { conversionLevel = level; }
  // For a calculating operation: how it was converted to fixed point, or null for an
  // operation without conversion.
  KV_OpConversionInfo* getConversionInfo() const;
  void setConversionInfo(bool calculateProtected);
  // The result range in implemented units (the float range [0, 0] when none was set).
  const KV_Range& getResultRange() const;
  void setResultRange(const KV_Range& range);
  // Where the operation came from, or null. Not owned.
  const KvCSrcRef* getSourceRef() const { return srcRef; }
  void setSourceRef(const KvCSrcRef* ref) { srcRef = ref; }

  // Puts `loc` (or nothing, for null) at position i; i == getNumberOfOperands() appends.
  // The old operand is left without parent. False, and nothing changed, for a position
  // beyond the end, or a location with a parent or containing this operation.
  bool setOperand(int i, KV_ExprLocation* loc);
  bool appendOperand(KV_ExprLocation* loc) { return setOperand(getNumberOfOperands(), loc); }

private:
  // The first operands are kept inline (most operations have at most three), the rest
  // in a vector.
  static constexpr int kInlineOperands = 3;
  KV_ExprLocation*& slot(int i) {
    return i < kInlineOperands ? inlineOperands[i]
                               : extraOperands[static_cast<std::size_t>(i - kInlineOperands)];
  }

  KV_OpOperator* oper;
  int operandCount = 0;
  KV_ExprLocation* inlineOperands[kInlineOperands] = {};
  std::vector<KV_ExprLocation*> extraOperands;
  KV_DataType* dataType = nullptr;
  KV_Scaling* scaling = nullptr;
  KV_OpConversionLevel* conversionLevel = nullptr;
  const KvCSrcRef* srcRef = nullptr;
  // Conversion data of calculating operations, made on first use (most operations have
  // none).
  struct Calculation;
  std::unique_ptr<Calculation> calculation;
};

#endif
