#include "platform/icode/KV_Constant.h"

#include "platform/icode/KV_DataType.h"
#include "platform/icode/KvCIcExprEqualitySpec.h"
#include "platform/support/FPS.h"

KvCIcExprEqualitySpec::KvCIcExprEqualitySpec()
    : permitConstantsWithDifferentConstantTypes(false),
      permitApproxEqualDoubleConstantValues(false) {}

KvCIcExprEqualitySpec::~KvCIcExprEqualitySpec() = default;

KV_Constant::KV_Constant(int serialNumber, tagKvEConstantType type, std::int64_t value,
                         KV_DataType* dt)
    : KvCIcExpression(serialNumber), constantType(type), intValue(value),
      doubleValue(static_cast<double>(value)), dataType(dt) {}

KV_Constant::KV_Constant(int serialNumber, double value, KV_DataType* dt)
    : KvCIcExpression(serialNumber), constantType(KV_CONST_DOUBLE),
      intValue(FPS_SatCastToInt64(value)), doubleValue(value), dataType(dt) {}

std::int64_t KV_Constant::getIntValue() const { return intValue; }

std::int64_t KV_Constant::getTypedIntValue() const {
  KV_NumericalType* type = dataType ? dataType->asNumericalType() : nullptr;
  if (!type || type->isFloat() || type->getBits() <= 0 || type->getBits() >= 64)
    return intValue;
  const int bits = type->getBits();
  const std::uint64_t mask = (std::uint64_t{1} << bits) - 1;
  const std::uint64_t raw = static_cast<std::uint64_t>(intValue) & mask;
  if (!type->isSigned() || (raw >> (bits - 1)) == 0)
    return static_cast<std::int64_t>(raw);
  return static_cast<std::int64_t>(raw | ~mask);
}

double KV_Constant::getDoubleValue() const { return doubleValue; }

bool KV_Constant::isNegative() const {
  return isFloatingPoint() ? doubleValue < 0.0 : intValue < 0;
}

bool KV_Constant::isEqual(KV_Constant* other, KvCIcExprEqualitySpec* spec) const {
  if (!other)
    return false;
  const KvCIcExprEqualitySpec defaults;
  const KvCIcExprEqualitySpec& rules = spec ? *spec : defaults;
  if (constantType != other->constantType &&
      !rules.areConstantsWithDifferentConstantTypesPermitted())
    return false;
  if (!isFloatingPoint() && !other->isFloatingPoint())
    return intValue == other->intValue;
  const double a = doubleValue;
  const double b = other->doubleValue;
  if (rules.areApproxEqualDoubleConstantValuesPermitted())
    return FPS_ValuesAreEqual(a, b);
  return a == b;
}
