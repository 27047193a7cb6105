// KV_Constant: a literal. Its constant type says how the literal is written (signed or
// unsigned integer, floating point, Boolean); its data type, when it has one, is the type
// the model gave the constant.
//
// Integral constants keep an int64 value, floating ones a double. getTypedIntValue is the
// value as the constant's integer data type holds it (wrapped to the type's width and
// signedness); getIntValue the value as written.
#ifndef HUL_PLATFORM_ICODE_KV_CONSTANT_H
#define HUL_PLATFORM_ICODE_KV_CONSTANT_H

#include "platform/icode/KvCIcExpression.h"

#include <cstdint>

class KvCIcExprEqualitySpec;

enum tagKvEConstantType { KV_CONST_SIGNED, KV_CONST_UNSIGNED, KV_CONST_DOUBLE, KV_CONST_BOOL };

enum tagKvERoundingMark { KV_ROUND_NONE, KV_ROUND_UP, KV_ROUND_DOWN };

class HUL_PLATFORM_API KV_Constant : public KvCIcExpression {
public:
  KV_Constant(int serialNumber, tagKvEConstantType type, std::int64_t value, KV_DataType* dt);
  KV_Constant(int serialNumber, double value, KV_DataType* dt);

  KV_Constant* asConstant() override { return this; }

  tagKvEConstantType getConstantType() const { return constantType; }
  bool hasDataType() const { return dataType != nullptr; }
  KV_DataType* getDataType() const override { return dataType; }
  bool isFloatingPoint() const { return constantType == KV_CONST_DOUBLE; }

  // Integral value as written (a floating constant: truncated, saturated, NaN as 0).
  std::int64_t getIntValue() const;
  // The value as the constant's integer data type holds it; getIntValue without such a
  // type.
  std::int64_t getTypedIntValue() const;
  double getDoubleValue() const;
  bool isNegative() const;

  // Equal values, under `spec` (null: the default spec). Integral constants compare
  // their values exactly; when either is floating, both are compared as doubles.
  bool isEqual(KV_Constant* other, KvCIcExprEqualitySpec* spec) const;

  // The direction in which the constant is to be rounded when it is emitted.
  void setRoundUp() { roundingMark = KV_ROUND_UP; }
  void setRoundDown() { roundingMark = KV_ROUND_DOWN; }
  tagKvERoundingMark getRoundingMark() const { return roundingMark; }

private:
  tagKvEConstantType constantType;
  std::int64_t intValue = 0;
  double doubleValue = 0.0;
  KV_DataType* dataType;
  tagKvERoundingMark roundingMark = KV_ROUND_NONE;
};

#endif
