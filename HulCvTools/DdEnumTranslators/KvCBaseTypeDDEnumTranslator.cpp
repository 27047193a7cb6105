#include "HulCvTools/DdEnumTranslators/KvCBaseTypeDDEnumTranslator.h"

#include "HulCvTools/ModelInterfaces/ICodeModel.h"

#include <array>
#include <utility>

namespace {

using Alignment = KvCNumBaseTypeProps::KvTAlignment;
using ByteOrder = KvCNumBaseTypeProps::KvTByteOrder;

// The alignment table, used in both directions.
constexpr std::array<std::pair<Alignment, wmddapi::AlignmentEnum>, 8> kAlignments{{
    {KvCNumBaseTypeProps::KV_ALIGN_SPECIAL_8, wmddapi::ALIGNMENT_SPECIAL_8},
    {KvCNumBaseTypeProps::KV_ALIGN_SPECIAL_4, wmddapi::ALIGNMENT_SPECIAL_4},
    {KvCNumBaseTypeProps::KV_ALIGN_SPECIAL_2, wmddapi::ALIGNMENT_SPECIAL_2},
    {KvCNumBaseTypeProps::KV_ALIGN_1, wmddapi::ALIGNMENT_1_BYTE},
    {KvCNumBaseTypeProps::KV_ALIGN_2, wmddapi::ALIGNMENT_2_BYTES},
    {KvCNumBaseTypeProps::KV_ALIGN_4, wmddapi::ALIGNMENT_4_BYTES},
    {KvCNumBaseTypeProps::KV_ALIGN_8, wmddapi::ALIGNMENT_8_BYTES},
    {KvCNumBaseTypeProps::KV_ALIGN_16, wmddapi::ALIGNMENT_16_BYTES},
}};

// The byte order table, used in both directions.
constexpr std::array<std::pair<ByteOrder, wmddapi::ByteOrderEnum>, 4> kByteOrders{{
    {KvCNumBaseTypeProps::KV_BYTE_ORDER_TARGET_DEFAULT, wmddapi::BYTE_ORDER_TARGET_DEFAULT},
    {KvCNumBaseTypeProps::KV_BYTE_ORDER_UNDEFINED, wmddapi::BYTE_ORDER_UNDEFINED},
    {KvCNumBaseTypeProps::KV_BYTE_ORDER_LITTLE_ENDIAN, wmddapi::BYTE_ORDER_LITTLE_ENDIAN},
    {KvCNumBaseTypeProps::KV_BYTE_ORDER_BIG_ENDIAN, wmddapi::BYTE_ORDER_BIG_ENDIAN},
}};

// The kind of a numerical base type, or 0 when it is of none of the listed kinds.
int numBaseTypeKind(const KV_NumericalType& base) {
  if (base.isKind1())
    return wmddapi::BASE_TYPE_INT8;
  if (base.isKind2())
    return wmddapi::BASE_TYPE_UINT8;
  if (base.isKind3())
    return wmddapi::BASE_TYPE_INT16;
  if (base.isKind4())
    return wmddapi::BASE_TYPE_UINT16;
  if (base.isKind5())
    return wmddapi::BASE_TYPE_INT32;
  if (base.isKind6())
    return wmddapi::BASE_TYPE_UINT32;
  if (base.isKind7())
    return wmddapi::BASE_TYPE_FLOAT32;
  if (base.isKind8())
    return wmddapi::BASE_TYPE_FLOAT64;
  if (base.isKind16())
    return wmddapi::BASE_TYPE_OTHER;
  if (base.isKind17())
    return wmddapi::BASE_TYPE_UINT64;
  return 0;
}

} // namespace

KvCBaseTypeDDEnumTranslator::~KvCBaseTypeDDEnumTranslator() = default;

wmddapi::AlignmentEnum
KvCBaseTypeDDEnumTranslator::getIcToDDEnumAlignment(KvCNumBaseTypeProps::KvTAlignment alignment) {
  for (const auto& [ic, dd] : kAlignments)
    if (ic == alignment)
      return dd;
  return wmddapi::ALIGNMENT_UNDEFINED;
}

KvCNumBaseTypeProps::KvTAlignment
KvCBaseTypeDDEnumTranslator::getDDToIcEnumAlignment(wmddapi::AlignmentEnum alignment) {
  for (const auto& [ic, dd] : kAlignments)
    if (dd == alignment)
      return ic;
  // -1 is outside the ICode's named alignments; the enumeration's range holds it.
  return static_cast<KvCNumBaseTypeProps::KvTAlignment>(-1);
}

wmddapi::ByteOrderEnum
KvCBaseTypeDDEnumTranslator::getIcToDDEnumByteOrder(KvCNumBaseTypeProps::KvTByteOrder order) {
  for (const auto& [ic, dd] : kByteOrders)
    if (ic == order)
      return dd;
  return wmddapi::BYTE_ORDER_UNDEFINED;
}

KvCNumBaseTypeProps::KvTByteOrder
KvCBaseTypeDDEnumTranslator::getDDToIcEnumByteOrder(wmddapi::ByteOrderEnum order) {
  for (const auto& [ic, dd] : kByteOrders)
    if (dd == order)
      return ic;
  return KvCNumBaseTypeProps::KV_BYTE_ORDER_TARGET_DEFAULT;
}

wmddapi::BaseTypeEnum KvCBaseTypeDDEnumTranslator::getIcToDDEnumBaseType(KV_DataType* type) {
  if (!type)
    return wmddapi::BASE_TYPE_OTHER;
  if (type->asKind15Type())
    return wmddapi::BASE_TYPE_VOID;
  if (KV_NumericalType* numerical = type->getNumericalType()) {
    const KV_NumericalType* base = numerical->getNumBaseType();
    if (const int kind = base ? numBaseTypeKind(*base) : 0)
      return static_cast<wmddapi::BaseTypeEnum>(kind);
    if (type->isKind10())
      return wmddapi::BASE_TYPE_BOOL;
    return wmddapi::BASE_TYPE_OTHER;
  }
  if (type->asKind9Type())
    return wmddapi::BASE_TYPE_POINTER;
  if (type->asArrayType())
    return wmddapi::BASE_TYPE_ARRAY;
  if (type->asKind12Type())
    return wmddapi::BASE_TYPE_STRUCT;
  if (type->asKind13Type())
    return wmddapi::BASE_TYPE_UNION;
  if (type->asKind14Type())
    return wmddapi::BASE_TYPE_ENUM;
  return wmddapi::BASE_TYPE_OTHER;
}
