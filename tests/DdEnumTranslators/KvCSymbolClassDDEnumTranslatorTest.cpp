// The symbol-class translator: every row of every table, the strings outside the string
// tables with their internal-error messages, and the order of the function-kind tests.
#include "HulCvTools/DdEnumTranslators/KvCSymbolClassDDEnumTranslator.h"
#include "HulCvTools/Control/KvCInternalCheck.h"
#include "platform/builder/AppBuilder.h"
#include "platform/builder/FunctionBuilder.h"
#include "platform/icode/KV_LogObj.h"
#include "platform/icode/KvCParamSymbol.h"
#include "platform/icode/KvCUnparamSymbol.h"
#include "platform/support/KvCMessageServer.h"
#include "platform/support/WmCXString.h"

#include <gtest/gtest.h>

#include <cctype>
#include <string>
#include <vector>

namespace {

using T = KvCSymbolClassDDEnumTranslator;

// Test name parts: "m1" for -1; letters, digits and '_' of a string kept, "empty" for "".
std::string numberName(int v) { return v < 0 ? "m" + std::to_string(-v) : std::to_string(v); }
std::string textName(const char* text) {
  std::string name;
  for (const char* c = text; *c; ++c)
    name += std::isalnum(static_cast<unsigned char>(*c)) ? *c : '_';
  return name.empty() ? "empty" : name;
}
template <typename Row> std::string intRowName(const ::testing::TestParamInfo<Row>& info) {
  return numberName(info.param.from) + "_to_" + numberName(info.param.to);
}
template <typename Row> std::string stringRowName(const ::testing::TestParamInfo<Row>& info) {
  return textName(info.param.text);
}

// Records the messages and debug reports of one translation, internal information shown.
class MessageScope {
public:
  MessageScope() {
    server->clear();
    wasShown = server->ShowInternalInfo();
    server->setShowInternalInfo(true);
  }
  ~MessageScope() {
    server->setShowInternalInfo(wasShown);
    server->clear();
  }
  MessageScope(const MessageScope&) = delete;
  MessageScope& operator=(const MessageScope&) = delete;

  const std::vector<KvCMessageRecord>& messages() const { return server->getMessages(); }

  // Checks that exactly one internal error was reported and answers its text.
  std::string expectOneInternalError() const {
    EXPECT_EQ(messages().size(), 1u);
    if (messages().size() != 1u)
      return {};
    const KvCMessageRecord& m = messages().front();
    EXPECT_EQ(m.number, 10007);
    EXPECT_EQ(static_cast<int>(m.severity), 3);
    EXPECT_STREQ(m.category.c_str(), "General Messages");
    const std::string text = m.text.c_str();
    EXPECT_EQ(text.rfind("Internal error. Error code: KvCSymbolClassDDEnumTranslator.cpp ", 0), 0u)
        << text;
    const std::string tail = ". Contact Velmora's technical support team.";
    EXPECT_TRUE(text.size() > tail.size() &&
                text.compare(text.size() - tail.size(), tail.size(), tail) == 0)
        << text;
    if (KvCInternalCheck::hasDebugChecks()) {
      EXPECT_EQ(server->getDebugAssertions().size(), 1u);
      if (!server->getDebugAssertions().empty()) {
        EXPECT_STREQ(server->getDebugAssertions().front().expression.c_str(), "0");
      }
    }
    return text;
  }

private:
  KvCMessageServer* server = KvCMessageServer::getMessageServer();
  bool wasShown = false;
};

struct AccessRow {
  int dd;
  int ic;
};
const AccessRow kAccessRows[] = {{0, 1},  {1, 2}, {2, 3}, {3, 4},  {4, 5},
                                 {-1, 0}, {5, 0}, {6, 0}, {100, 0}};

class AccessInfoTest : public ::testing::TestWithParam<AccessRow> {};
TEST_P(AccessInfoTest, Row) {
  EXPECT_EQ(
      T::DdAccessInfoToKvAccessInfo(static_cast<wmddapi::VariableClassInfoEnum>(GetParam().dd)),
      GetParam().ic);
}
INSTANTIATE_TEST_SUITE_P(EveryRow, AccessInfoTest, ::testing::ValuesIn(kAccessRows),
                         [](const auto& info) {
                           return numberName(info.param.dd) + "_to_" + numberName(info.param.ic);
                         });

struct StringRow {
  const char* text;
  int dd;
};

const StringRow kVarClassRows[] = {{"none", 0},       {"readonly", 1},          {"readwrite", 2},
                                   {"adjustable", 3}, {"offline_readwrite", 4}, {"", 0}};

class VarClassStringTest : public ::testing::TestWithParam<StringRow> {};
TEST_P(VarClassStringTest, RowGivesItsValueSilently) {
  MessageScope scope;
  const WmCXString text(GetParam().text);
  EXPECT_EQ(T::KvVarClassStrToDdVarClassInfoEnum(&text), GetParam().dd);
  EXPECT_TRUE(scope.messages().empty());
}
INSTANTIATE_TEST_SUITE_P(EveryRow, VarClassStringTest, ::testing::ValuesIn(kVarClassRows),
                         stringRowName<StringRow>);

// Strings the tables do not hold: other case, surrounding blanks, a prefix, a neighbour's.
const char* const kUnknownStrings[] = {"Readonly", "READWRITE", " none",  "none ",
                                       "readonl",  "static",    "unknown"};

class VarClassUnknownStringTest : public ::testing::TestWithParam<const char*> {};
TEST_P(VarClassUnknownStringTest, IsAnInternalErrorThenNone) {
  MessageScope scope;
  const WmCXString text(GetParam());
  EXPECT_EQ(T::KvVarClassStrToDdVarClassInfoEnum(&text), 0);
  scope.expectOneInternalError();
}
INSTANTIATE_TEST_SUITE_P(Unknown, VarClassUnknownStringTest, ::testing::ValuesIn(kUnknownStrings),
                         [](const auto& info) {
                           return textName(info.param) + "_" + std::to_string(info.index);
                         });

const StringRow kStorageRows[] = {
    {"auto", 0}, {"static", 1}, {"extern", 2}, {"register", 0}, {"", 0}};

class StorageStringTest : public ::testing::TestWithParam<StringRow> {};
TEST_P(StorageStringTest, RowGivesItsValueSilently) {
  MessageScope scope;
  const WmCXString text(GetParam().text);
  EXPECT_EQ(T::KvStorageInfoToDdStorageClass(&text), GetParam().dd);
  EXPECT_TRUE(scope.messages().empty());
}
INSTANTIATE_TEST_SUITE_P(EveryRow, StorageStringTest, ::testing::ValuesIn(kStorageRows),
                         stringRowName<StringRow>);

TEST(SymbolClassTranslatorTest, UnknownStorageStringsAreInternalErrorsThenZero) {
  for (const char* unknown : {"Static", "EXTERN", "volatile", "auto ", "none"}) {
    SCOPED_TRACE(unknown);
    MessageScope scope;
    const WmCXString text(unknown);
    EXPECT_EQ(T::KvStorageInfoToDdStorageClass(&text), 0);
    scope.expectOneInternalError();
  }
}

const StringRow kScopeRows[] = {{"local", 1},     {"global", 2},     {"value_param", 3},
                                {"ref_param", 4}, {"fcn_return", 5}, {"struct_component", 6}};

class ScopeStringTest : public ::testing::TestWithParam<StringRow> {};
TEST_P(ScopeStringTest, RowGivesItsValueSilently) {
  MessageScope scope;
  const WmCXString text(GetParam().text);
  EXPECT_EQ(T::KvScopeStringToDdScopeEnum(&text), GetParam().dd);
  EXPECT_TRUE(scope.messages().empty());
}
INSTANTIATE_TEST_SUITE_P(EveryRow, ScopeStringTest, ::testing::ValuesIn(kScopeRows),
                         stringRowName<StringRow>);

TEST(SymbolClassTranslatorTest, EmptyAndUnknownScopeStringsReportFromDistinctPlaces) {
  std::string emptyText;
  {
    MessageScope scope;
    const WmCXString text("");
    EXPECT_EQ(T::KvScopeStringToDdScopeEnum(&text), 1);
    emptyText = scope.expectOneInternalError();
  }
  std::vector<std::string> unknownTexts;
  for (const char* unknown : {"Local", "GLOBAL", "param", "struct component", "static"}) {
    SCOPED_TRACE(unknown);
    MessageScope scope;
    const WmCXString text(unknown);
    EXPECT_EQ(T::KvScopeStringToDdScopeEnum(&text), 1);
    unknownTexts.push_back(scope.expectOneInternalError());
  }
  for (const std::string& unknownText : unknownTexts) {
    EXPECT_EQ(unknownText, unknownTexts.front());
    EXPECT_NE(unknownText, emptyText);
  }
}

TEST(SymbolClassTranslatorTest, NullStringsCountAsEmpty) {
  {
    MessageScope scope;
    EXPECT_EQ(T::KvVarClassStrToDdVarClassInfoEnum(nullptr), 0);
    EXPECT_EQ(T::KvStorageInfoToDdStorageClass(nullptr), 0);
    EXPECT_TRUE(scope.messages().empty());
  }
  MessageScope scope;
  EXPECT_EQ(T::KvScopeStringToDdScopeEnum(nullptr), 1);
  scope.expectOneInternalError();
}

// One row per combination of symbol roles: the roles set and the expected function kind.
struct FuncTypeRow {
  const char* name;
  std::vector<tagKvESymbolRole> roles;
  bool aux;
  int dd;
};

std::vector<FuncTypeRow> funcTypeRows() {
  return {
      {"step", {KV_ROLE_STEP_FUNCTION}, false, 1},
      {"init", {KV_ROLE_INIT_FUNCTION}, false, 2},
      {"term", {KV_ROLE_TERM_FUNCTION}, false, 3},
      {"aux", {}, true, 4},
      {"access", {KV_ROLE_ACCESS_FUNCTION}, false, 4},
      {"restart", {KV_ROLE_RESTART_FUNCTION}, false, 5},
      {"apEntry", {KV_ROLE_AP_ENTRY_FUNCTION}, false, 6},
      {"apExit", {KV_ROLE_AP_EXIT_FUNCTION}, false, 7},
      {"startup", {KV_ROLE_STARTUP_FUNCTION}, false, 8},
      {"none", {}, false, 4},
      {"restartAndStartup", {KV_ROLE_RESTART_FUNCTION, KV_ROLE_STARTUP_FUNCTION}, false, 8},
      {"stepBeforeInit", {KV_ROLE_STEP_FUNCTION, KV_ROLE_INIT_FUNCTION}, false, 1},
      {"initBeforeTerm", {KV_ROLE_INIT_FUNCTION, KV_ROLE_TERM_FUNCTION}, false, 2},
      {"termBeforeAux", {KV_ROLE_TERM_FUNCTION}, true, 3},
      {"auxBeforeRestart", {KV_ROLE_RESTART_FUNCTION}, true, 4},
      {"accessBeforeApEntry", {KV_ROLE_ACCESS_FUNCTION, KV_ROLE_AP_ENTRY_FUNCTION}, false, 4},
      {"restartBeforeApEntry", {KV_ROLE_RESTART_FUNCTION, KV_ROLE_AP_ENTRY_FUNCTION}, false, 5},
      {"apEntryBeforeApExit", {KV_ROLE_AP_ENTRY_FUNCTION, KV_ROLE_AP_EXIT_FUNCTION}, false, 6},
      {"apExitBeforeStartup", {KV_ROLE_AP_EXIT_FUNCTION, KV_ROLE_STARTUP_FUNCTION}, false, 7},
  };
}

class FuncTypeTest : public ::testing::TestWithParam<FuncTypeRow> {};
TEST_P(FuncTypeTest, FirstTestThatHoldsGivesTheKind) {
  const FuncTypeRow& row = GetParam();
  AppBuilder app;
  KvCParamSymbol* fn = app.function("f").symbol();
  ASSERT_NE(fn, nullptr);
  for (tagKvESymbolRole role : row.roles)
    fn->setRole(role, true);
  fn->setFunctionRole(KV_FROLE_AUX_FUNCTION, row.aux);
  EXPECT_EQ(T::getIcToDDEnumFuncType(fn), row.dd);
}
INSTANTIATE_TEST_SUITE_P(EveryRow, FuncTypeTest, ::testing::ValuesIn(funcTypeRows()),
                         [](const auto& info) { return std::string(info.param.name); });

TEST(SymbolClassTranslatorTest, SymbolsThatAreNoFunctionsGiveTheDefaultKind) {
  AppBuilder app;
  KvCUnparamSymbol* x = app.variable("x", app.int16());
  EXPECT_EQ(T::getIcToDDEnumFuncType(x), 4);
  x->setRole(KV_ROLE_ACCESS_FUNCTION, true);
  EXPECT_EQ(T::getIcToDDEnumFuncType(x), 4);
  x->setRole(KV_ROLE_STARTUP_FUNCTION, true);
  EXPECT_EQ(T::getIcToDDEnumFuncType(x), 8);
  EXPECT_EQ(T::getIcToDDEnumFuncType(nullptr), 4);
}

TEST(SymbolClassTranslatorTest, LoggingMode) {
  KV_LogObj timeHistory(true);
  KV_LogObj extremes(false);
  EXPECT_EQ(T::KvLogModeToDDLogModeEnum(&timeHistory), 1);
  EXPECT_EQ(T::KvLogModeToDDLogModeEnum(&extremes), 2);
  EXPECT_EQ(T::KvLogModeToDDLogModeEnum(nullptr), 2);
}

// Every combination of the three inline bits, with and without unrelated bits.
TEST(SymbolClassTranslatorTest, InlineOptionBitsEveryCombination) {
  for (unsigned long combo = 0; combo < 8; ++combo) {
    const bool b4 = combo & 1UL, b8 = combo & 2UL, b16 = combo & 4UL;
    const int expectedValue = b16 ? 3 : b8 ? 2 : b4 ? 1 : 0;
    const bool expectedResult = int{b4} + int{b8} + int{b16} <= 1;
    for (unsigned long others : {0UL, 1UL, 2UL, 32UL, 0xFFFF00UL, ~28UL}) {
      const unsigned long bits = (b4 ? 4UL : 0UL) | (b8 ? 8UL : 0UL) | (b16 ? 16UL : 0UL) | others;
      SCOPED_TRACE(bits);
      auto out = static_cast<tagKvEFcInline>(7);
      EXPECT_EQ(T::DdFcnClassOptiToKvFcInline(bits, out), expectedResult);
      EXPECT_EQ(out, expectedValue);
    }
  }
}

struct IntRow {
  int from;
  int to;
};

class SearchAlgorithmTest : public ::testing::TestWithParam<IntRow> {};
TEST_P(SearchAlgorithmTest, Row) {
  EXPECT_EQ(T::KvSearchAlgorithmEnumToDDEnum(
                static_cast<KV_SearchAlgorithm::SearchAlgorithm_etp>(GetParam().from)),
            GetParam().to);
}
INSTANTIATE_TEST_SUITE_P(EveryRow, SearchAlgorithmTest,
                         ::testing::Values(IntRow{1, 1}, IntRow{2, 2}, IntRow{3, 3}, IntRow{4, 4},
                                           IntRow{0, 5}, IntRow{5, 5}, IntRow{-1, 5}, IntRow{7, 5}),
                         intRowName<IntRow>);

class OutputModeTest : public ::testing::TestWithParam<IntRow> {};
TEST_P(OutputModeTest, Row) {
  EXPECT_EQ(T::KvOuputModeEnumToDDOutputModeEnum(
                static_cast<KvNOutputMode::KvEOutputMode>(GetParam().from)),
            GetParam().to);
}
INSTANTIATE_TEST_SUITE_P(EveryRow, OutputModeTest,
                         ::testing::Values(IntRow{0, 1}, IntRow{1, 2}, IntRow{2, 3}, IntRow{3, 3}),
                         intRowName<IntRow>);

TEST(SymbolClassTranslatorTest, ActionPortInitialState) {
  EXPECT_EQ(T::KvActionPortInitStateDDInitStateEnum(true), 2);
  EXPECT_EQ(T::KvActionPortInitStateDDInitStateEnum(false), 1);
}

class LookUpMethodTest : public ::testing::TestWithParam<IntRow> {};
TEST_P(LookUpMethodTest, Row) {
  EXPECT_EQ(
      T::KvLookUpMethodToDDEnum(static_cast<KV_LookUpMethod::LookUpMethod_etp>(GetParam().from)),
      GetParam().to);
}
INSTANTIATE_TEST_SUITE_P(EveryRow, LookUpMethodTest,
                         ::testing::Values(IntRow{1, 1}, IntRow{3, 3}, IntRow{4, 4}, IntRow{5, 5},
                                           IntRow{2, 2}, IntRow{0, 2}, IntRow{6, 2}, IntRow{-1, 2}),
                         intRowName<IntRow>);

TEST(SymbolClassTranslatorTest, NonStringTranslationsReportNothing) {
  MessageScope scope;
  tagKvEFcInline out = KV_FC_INLINE_DEFAULT;
  for (int v = -3; v <= 8; ++v) {
    T::DdAccessInfoToKvAccessInfo(static_cast<wmddapi::VariableClassInfoEnum>(v));
    T::DdFcnClassOptiToKvFcInline(static_cast<unsigned long>(v), out);
    T::KvSearchAlgorithmEnumToDDEnum(static_cast<KV_SearchAlgorithm::SearchAlgorithm_etp>(v & 7));
    T::KvOuputModeEnumToDDOutputModeEnum(static_cast<KvNOutputMode::KvEOutputMode>(v & 3));
    T::KvLookUpMethodToDDEnum(static_cast<KV_LookUpMethod::LookUpMethod_etp>(v & 7));
  }
  T::getIcToDDEnumFuncType(nullptr);
  T::KvLogModeToDDLogModeEnum(nullptr);
  EXPECT_TRUE(scope.messages().empty());
}

} // namespace
