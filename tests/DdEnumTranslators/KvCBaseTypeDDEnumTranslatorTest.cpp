// The base-type translator: every row of the alignment and byte-order tables in both
// directions, the values outside them, and the base type of every kind of data type the
// model makes, also behind typedef chains.
#include "HulCvTools/DdEnumTranslators/KvCBaseTypeDDEnumTranslator.h"
#include "platform/builder/AppBuilder.h"
#include "platform/icode/KV_DataTypeServer.h"
#include "platform/icode/KV_ICodeFactoryContainer.h"
#include "platform/icode/KV_NumericalTypeServer.h"
#include "platform/support/KvCMessageServer.h"
#include "platform/support/KvCSrcRefServer.h"

#include <gtest/gtest.h>

#include <memory>
#include <string>

namespace {

using T = KvCBaseTypeDDEnumTranslator;

// A test name part for a possibly negative number: "m8" for -8.
std::string numberName(int v) { return v < 0 ? "m" + std::to_string(-v) : std::to_string(v); }
template <typename Row> std::string rowName(const ::testing::TestParamInfo<Row>& info) {
  return "ic" + numberName(info.param.ic) + "_dd" + numberName(info.param.dd);
}

struct AlignmentRow {
  int ic;
  int dd;
};
const AlignmentRow kAlignmentRows[] = {{-8, -8}, {-4, -4}, {-2, -2}, {0, 1},
                                       {1, 2},   {2, 4},   {3, 8},   {4, 16}};

class AlignmentTableTest : public ::testing::TestWithParam<AlignmentRow> {};

TEST_P(AlignmentTableTest, RowTranslatesBothWays) {
  const AlignmentRow row = GetParam();
  EXPECT_EQ(T::getIcToDDEnumAlignment(static_cast<KvCNumBaseTypeProps::KvTAlignment>(row.ic)),
            row.dd);
  EXPECT_EQ(T::getDDToIcEnumAlignment(static_cast<wmddapi::AlignmentEnum>(row.dd)), row.ic);
}

INSTANTIATE_TEST_SUITE_P(EveryRow, AlignmentTableTest, ::testing::ValuesIn(kAlignmentRows),
                         rowName<AlignmentRow>);

TEST(BaseTypeTranslatorTest, AlignmentOutsideTheTableGivesMinusOneBothWays) {
  for (int ic : {-9, -7, -6, -5, -3, -1, 5, 6, 7}) {
    SCOPED_TRACE(ic);
    EXPECT_EQ(T::getIcToDDEnumAlignment(static_cast<KvCNumBaseTypeProps::KvTAlignment>(ic)), -1);
  }
  for (int dd : {-9, -7, -3, -1, 0, 3, 5, 6, 7, 9, 15, 17, 32}) {
    SCOPED_TRACE(dd);
    EXPECT_EQ(T::getDDToIcEnumAlignment(static_cast<wmddapi::AlignmentEnum>(dd)), -1);
  }
}

struct ByteOrderRow {
  int ic;
  int dd;
};
const ByteOrderRow kByteOrderRows[] = {{0, -2}, {1, -1}, {2, 0}, {3, 1}};

class ByteOrderTableTest : public ::testing::TestWithParam<ByteOrderRow> {};

TEST_P(ByteOrderTableTest, RowTranslatesBothWays) {
  const ByteOrderRow row = GetParam();
  EXPECT_EQ(T::getIcToDDEnumByteOrder(static_cast<KvCNumBaseTypeProps::KvTByteOrder>(row.ic)),
            row.dd);
  EXPECT_EQ(T::getDDToIcEnumByteOrder(static_cast<wmddapi::ByteOrderEnum>(row.dd)), row.ic);
}

INSTANTIATE_TEST_SUITE_P(EveryRow, ByteOrderTableTest, ::testing::ValuesIn(kByteOrderRows),
                         rowName<ByteOrderRow>);

TEST(BaseTypeTranslatorTest, ByteOrderOutsideTheTableGivesMinusOneToAndZeroFrom) {
  EXPECT_EQ(T::getIcToDDEnumByteOrder(static_cast<KvCNumBaseTypeProps::KvTByteOrder>(4)), -1);
  EXPECT_EQ(T::getIcToDDEnumByteOrder(static_cast<KvCNumBaseTypeProps::KvTByteOrder>(7)), -1);
  for (int dd : {-3, 2, 3, 100}) {
    SCOPED_TRACE(dd);
    EXPECT_EQ(T::getDDToIcEnumByteOrder(static_cast<wmddapi::ByteOrderEnum>(dd)), 0);
  }
}

TEST(BaseTypeTranslatorTest, TranslationsReportNothing) {
  KvCMessageServer* server = KvCMessageServer::getMessageServer();
  server->clear();
  for (int v = -20; v <= 20; ++v) {
    T::getIcToDDEnumAlignment(static_cast<KvCNumBaseTypeProps::KvTAlignment>(v & 7));
    T::getDDToIcEnumAlignment(static_cast<wmddapi::AlignmentEnum>(v));
    T::getIcToDDEnumByteOrder(static_cast<KvCNumBaseTypeProps::KvTByteOrder>(v & 3));
    T::getDDToIcEnumByteOrder(static_cast<wmddapi::ByteOrderEnum>(v));
  }
  T::getIcToDDEnumBaseType(nullptr);
  EXPECT_TRUE(server->getMessages().empty());
}

// Types of every kind the model makes, each under its base-type name and as a typedef.
struct TypeFixture {
  AppBuilder app;
  KV_ICodeFactoryContainer& f = app.factories();
  KV_DataTypeServer* dts = f.getDataTypeServer();
  const KvCSrcRef* ref = app.data().getSrcRefServer()->createModelSrcRef("fixture");
  KV_DimensionDescriptor scalar;

  KV_NumericalType* typedefOf(const char* name, KV_NumericalType* base) {
    WmCXString description("");
    return f.getNumTypeServer()->getNonDDMappedNumerical(name, description, *base, scalar, true,
                                                         ref, true);
  }
};

struct NumericalRow {
  const char* name;
  int bits;
  bool isSigned;
  bool isFloat;
  int dd;
};
const NumericalRow kNumericalRows[] = {
    {"Int8", 8, true, false, 1},     {"UInt8", 8, false, false, 2},
    {"Int16", 16, true, false, 3},   {"UInt16", 16, false, false, 4},
    {"Int32", 32, true, false, 5},   {"UInt32", 32, false, false, 6},
    {"Float32", 32, true, true, 7},  {"Float64", 64, true, true, 8},
    {"Int64", 64, true, false, 16},  {"UInt64", 64, false, false, 17},
    {"Bool", 8, false, false, 10},   {"Int24", 24, true, false, 16},
    {"Float16", 16, true, true, 16},
};

class NumericalBaseTypeTest : public ::testing::TestWithParam<NumericalRow> {};

TEST_P(NumericalBaseTypeTest, BaseTypeAndItsTypedefChainGiveTheRow) {
  const NumericalRow row = GetParam();
  TypeFixture t;
  KV_NumericalType* base =
      t.dts->demandNumericalType(row.name, row.bits, row.isSigned, row.isFloat);
  ASSERT_NE(base, nullptr);
  EXPECT_EQ(T::getIcToDDEnumBaseType(base), row.dd);
  KV_NumericalType* first = t.typedefOf("Named1", base);
  ASSERT_NE(first, nullptr);
  EXPECT_EQ(T::getIcToDDEnumBaseType(first), row.dd);
  KV_NumericalType* second = t.typedefOf("Named2", first);
  ASSERT_NE(second, nullptr);
  EXPECT_EQ(T::getIcToDDEnumBaseType(second), row.dd);
}

INSTANTIATE_TEST_SUITE_P(EveryKind, NumericalBaseTypeTest, ::testing::ValuesIn(kNumericalRows),
                         [](const auto& info) { return std::string(info.param.name); });

TEST(BaseTypeTranslatorTest, OtherKindsOfTypes) {
  TypeFixture t;
  KV_NumericalType* i16 = t.dts->getInt16();
  EXPECT_EQ(T::getIcToDDEnumBaseType(t.dts->demandVoidType()), 15);
  EXPECT_EQ(T::getIcToDDEnumBaseType(t.dts->demandPointerType(i16, false)), 9);
  EXPECT_EQ(T::getIcToDDEnumBaseType(t.dts->demandPointerType(t.dts->demandVoidType(), true)), 9);
  EXPECT_EQ(T::getIcToDDEnumBaseType(t.dts->demandArrayType(i16, 4)), 11);
  EXPECT_EQ(T::getIcToDDEnumBaseType(t.dts->demandStructType("S")), 12);
  EXPECT_EQ(T::getIcToDDEnumBaseType(nullptr), 16);
}

TEST(BaseTypeTranslatorTest, IsPolymorphicThroughItsBase) {
  std::unique_ptr<KvCDataTypeDDEnumTranslator> translator =
      std::make_unique<KvCBaseTypeDDEnumTranslator>();
  EXPECT_NE(translator, nullptr);
}

} // namespace
