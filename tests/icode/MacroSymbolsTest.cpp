// Macros in the ICode: function-like macros made by the parameterised macro symbol server
// and the macro call inserter, object-like global macros, calls of macros, preprocessor
// concatenations and appends as the C printer writes them, and the undefined type,
// scaling and range that macros carry.
#include "platform/builder/AppBuilder.h"
#include "platform/icode/KV_BaseTypeServer.h"
#include "platform/icode/KV_DataTypeServer.h"
#include "platform/icode/KV_ExprLocation.h"
#include "platform/icode/KV_FunctionCallInserter.h"
#include "platform/icode/KV_ICodeFactoryContainer.h"
#include "platform/icode/KV_MacroCallInserter.h"
#include "platform/icode/KV_MacroSymbolServer.h"
#include "platform/icode/KV_Operation.h"
#include "platform/icode/KV_OperationFactories.h"
#include "platform/icode/KV_ParamAccess.h"
#include "platform/icode/KV_ParamMacroSymbolServer.h"
#include "platform/icode/KV_RangeServer.h"
#include "platform/icode/KV_ScaleServer.h"
#include "platform/icode/KV_Statement.h"
#include "platform/icode/KV_SymbolServer.h"
#include "platform/icode/KvCCDeclPrinter.h"
#include "platform/icode/KvCCStmTable.h"
#include "platform/icode/KvCCallOperation.h"
#include "platform/icode/KvCIcFileId.h"
#include "platform/icode/KvCParamSymbol.h"
#include "platform/icode/KvCUnparamSymbol.h"

#include <gtest/gtest.h>

#include <cfloat>
#include <string>

namespace {

struct Macros {
  AppBuilder app;
  KV_ICodeFactoryContainer& f = app.factories();
  KvCIcFileId* header = app.file("macros.h");
  KvCCStmTable* table = header->getFile()->getStt();
  KV_DataType* voidType = f.getBaseTypeServer()->getVoid();
  KV_ParamAccess read{true, false, false};
  KV_ParamAccess* accesses[2] = {&read, &read};
  KV_MacroCallInserter inserter{&f};

  KvCParamSymbol* demand(const char* name, int n, const WmCXString* names,
                         KvCIcExpression* body = nullptr) {
    return inserter.demandPreIncludeMacroSymbol(name, voidType, nullptr, n, accesses, names,
                                                nullptr, body, header, nullptr, false);
  }
  KV_ExprLocation* name(const char* text) {
    return f.getExprLocFactory()->createFromName(text, false, nullptr);
  }
  std::string print(KV_Operation* op) {
    return KvCCDeclPrinter().printExpression(f.getExprLocFactory()->createFromOperation(op)).str();
  }
};

TEST(MacroSymbolsTest, OneMacroPerNameAndTableWhileTheSignatureAgrees) {
  Macros m;
  const WmCXString two[2] = {"a", "b"};
  KvCParamSymbol* mac = m.demand("MAC", 2, two);
  ASSERT_NE(mac, nullptr);
  EXPECT_TRUE(mac->isMacro() && mac->isPreIncludeMacro());
  EXPECT_EQ(m.demand("MAC", 2, two), mac);
  EXPECT_EQ(m.demand("MAC", 1, two), nullptr) << "another parameter count";
  EXPECT_EQ(m.inserter.demandPreIncludeMacroSymbol("MAC", m.voidType, nullptr, 2, m.accesses, two,
                                                   nullptr, nullptr, m.header, nullptr, true),
            nullptr)
      << "must be new";
  EXPECT_EQ(m.f.getSymbolServer()->getParamMacro()->find(m.table, "MAC"), mac);
  // The macro's name is taken in the file: no function or variable can have it there.
  KV_FunctionCallInserter functions(&m.f);
  EXPECT_EQ(functions.demandFunctionSymbol("MAC", m.voidType, nullptr, 0, nullptr, nullptr, nullptr,
                                           m.header, nullptr, false),
            nullptr);
  EXPECT_FALSE(m.f.getCgsSupporter()->isNameFree(m.table, "MAC"));
}

TEST(MacroSymbolsTest, InvalidNamesAndPlacesAreRefused) {
  Macros m;
  const WmCXString duplicate[2] = {"a", "a"};
  const WmCXString invalid[1] = {"1a"};
  const WmCXString one[1] = {"x"};
  EXPECT_EQ(m.demand("DUP", 2, duplicate), nullptr);
  EXPECT_EQ(m.demand("BAD", 1, invalid), nullptr);
  ASSERT_NE(m.app.int8(), nullptr);
  EXPECT_EQ(m.demand("Int8", 1, one), nullptr) << "a type's name";
  EXPECT_EQ(m.demand("int", 1, one), nullptr) << "a keyword";
  KV_ExprLocation* held = m.name("held");
  EXPECT_EQ(m.demand("HELD", 1, one, held->getExpression()), nullptr) << "a body held elsewhere";
  auto& fn = m.app.function("inner");
  EXPECT_EQ(m.f.getSymbolServer()->getParamMacro()->demand(fn.body().table(), "LOCAL", m.voidType,
                                                           nullptr, 0, nullptr, nullptr, nullptr,
                                                           nullptr, true, nullptr, nullptr),
            nullptr)
      << "not a file's top level";
  EXPECT_EQ(m.f.getSymbolServer()->getParamMacro()->getNumberOfMacros(), 0);
}

TEST(MacroSymbolsTest, MacroCallsCheckTheirArgumentsAndCanBecomeStatements) {
  Macros m;
  const WmCXString two[2] = {"a", "b"};
  KvCParamSymbol* mac = m.demand("MAC", 2, two);
  KV_ExprLocation* x = m.name("x");
  KV_ExprLocation* y = m.name("y");
  KV_ExprLocation* args[2] = {x, y};
  KV_ExprLocation* twice[2] = {x, x};
  const KV_Range* undefined = m.f.getRangeServer()->getUndefinedRange();
  EXPECT_FALSE(
      m.inserter.insertMacroCall(mac, 1, args, m.accesses, false, nullptr, undefined, nullptr));
  EXPECT_EQ(m.inserter.getCallOperation(), nullptr);
  EXPECT_FALSE(
      m.inserter.insertMacroCall(mac, 2, twice, m.accesses, false, nullptr, undefined, nullptr));
  EXPECT_FALSE(m.inserter.insertMacroCall(m.app.function("f").symbol(), 0, nullptr, nullptr, false,
                                          nullptr, undefined, nullptr))
      << "a function is no macro";
  EXPECT_FALSE(
      m.inserter.insertMacroCall(mac, 2, args, m.accesses, true, nullptr, undefined, nullptr))
      << "a statement needs a place";
  ASSERT_TRUE(
      m.inserter.insertMacroCall(mac, 2, args, m.accesses, false, nullptr, undefined, nullptr));
  KvCCallOperation* call = m.inserter.getCallOperation();
  ASSERT_NE(call, nullptr);
  EXPECT_EQ(call->getCalledSymbol(), mac);
  EXPECT_EQ(call->getParent(), nullptr) << "left free";
  EXPECT_EQ(call->getResultRange().getFloatUpperLimit(), DBL_MAX);
  EXPECT_EQ(m.print(call), "MAC(x, y)");
  EXPECT_FALSE(
      m.inserter.insertMacroCall(mac, 2, args, m.accesses, false, nullptr, undefined, nullptr))
      << "the arguments are taken now";
  // As a statement after an existing one of a function body.
  auto& fn = m.app.function("g");
  KV_Statement* first = fn.body().stmt(m.name("first"));
  KV_ExprLocation* more[2] = {m.name("u"), m.name("v")};
  ASSERT_TRUE(m.inserter.insertMacroCall(mac, 2, more, m.accesses, true, first, nullptr, nullptr));
  ASSERT_EQ(first->getParentTable()->getNumberOfStatements(), 2);
  EXPECT_EQ(first->getParentTable()->getStatement(1)->getExprLoc()->getOperation(),
            m.inserter.getCallOperation());
}

TEST(MacroSymbolsTest, ConcatenationPastesOnlyWhereNamesMeet) {
  Macros m;
  KvCPreProcOpFactory* pp = m.f.getOperationFactories()->getPreProcessor();
  const struct {
    const char* left;
    const char* right;
    const char* printed;
  } rows[] = {{"a", "b", "a##b"},
              {"(", "b", "(b"},
              {"a", ")", "a)"},
              {"x1", "_y", "x1##_y"},
              {"a", "", "a"}};
  for (const auto& row : rows)
    EXPECT_EQ(m.print(pp->createConcat(row.left, row.right, nullptr)), row.printed) << row.left;
  KV_Operation* inner = pp->createConcat("name", ")", nullptr);
  EXPECT_EQ(m.print(pp->createConcat("(", inner, nullptr)), "(name)");
  EXPECT_EQ(pp->createConcat("(", inner, nullptr), nullptr) << "the inner one is held now";
  const WmCXString one[1] = {"n"};
  KvCParamSymbol* mac = m.demand("ONE", 1, one);
  KV_ExprLocation* args[1] = {m.name("z")};
  ASSERT_TRUE(
      m.inserter.insertMacroCall(mac, 1, args, m.accesses, false, nullptr, nullptr, nullptr));
  KV_Operation* append = m.f.getOperationFactories()->getAppend()->createStringAppend(
      m.inserter.getCallOperation(), "()");
  EXPECT_EQ(m.print(append), "ONE(z)()");
  EXPECT_EQ(m.f.getOperationFactories()->getAppend()->createStringAppend(nullptr, "()"), nullptr);
}

TEST(MacroSymbolsTest, GlobalMacrosAreNumberedAndKeptToTheirTableTypeAndScaling) {
  Macros m;
  KV_MacroSymbolServer* macros = m.f.getMacroSymbolServer();
  KV_DataType* int8 = m.app.int8();
  KvCUnparamSymbol* first = macros->demandGlobal(m.table, "FIRST", int8, nullptr, nullptr);
  KvCUnparamSymbol* second = macros->demandGlobal(m.table, "SECOND", int8, nullptr, nullptr);
  ASSERT_TRUE(first && second);
  EXPECT_TRUE(first->isGlobalMacro());
  EXPECT_EQ(macros->demandGlobal(m.table, "FIRST", int8, nullptr, nullptr), first);
  EXPECT_EQ(macros->demandGlobal(m.table, "FIRST", m.app.int16(), nullptr, nullptr), nullptr);
  EXPECT_EQ(macros->demandGlobal(m.app.file("other.h")->getFile()->getStt(), "FIRST", int8, nullptr,
                                 nullptr),
            nullptr);
  EXPECT_EQ(macros->demandGlobal(m.table, "Int8", int8, nullptr, nullptr), nullptr);
  const std::string text = KvCCDeclPrinter::printFile(m.header).str();
  EXPECT_NE(text.find("#define FIRST ((signed char)1)\n#define SECOND ((signed char)2)\n"),
            std::string::npos)
      << text;
}

TEST(MacroSymbolsTest, UndefinedTypeScalingAndRangeAreObjectsOfTheirOwn) {
  AppBuilder app;
  KV_DataTypeServer* types = app.data().getDataTypeServer();
  KV_DataType* undefined = app.data().getBaseTypeServer()->getUndefinedType();
  ASSERT_NE(undefined, nullptr);
  EXPECT_EQ(app.data().getBaseTypeServer()->getUndefinedType(), undefined);
  EXPECT_NE(undefined, types->demandVoidType());
  EXPECT_FALSE(undefined->isEqualType(types->demandVoidType()));
  EXPECT_TRUE(types->demandVoidType()->isEqualType(types->demandVoidType()));
  EXPECT_EQ(types->findType(undefined->getName()), nullptr) << "no name in the type name space";
  KV_ScaleServer* scales = app.data().getScalingServer();
  EXPECT_EQ(scales->getUndefinedScaling()->getKind(), KV_SCALING_UNDEFINED);
  EXPECT_NE(scales->getUndefinedScaling(), scales->getDefaultScaling());
  KV_RangeServer* ranges = app.factories().getRangeServer();
  KV_Range copy = *ranges->getUndefinedRange();
  EXPECT_TRUE(ranges->isUndefinedRange(ranges->getUndefinedRange()));
  EXPECT_FALSE(ranges->isUndefinedRange(&copy));
  EXPECT_EQ(copy.getFloatLowerLimit(), -DBL_MAX);
}

} // namespace
