// The code generation support's global variables and the macro symbol server's extern
// globals: names of a file's scope (taken, renamed, refused), declarations versus
// definitions, and extern globals found again only under the key they were made with.
#include "platform/builder/AppBuilder.h"
#include "platform/icode/KV_CgsSupporter.h"
#include "platform/icode/KV_DataTypeServer.h"
#include "platform/icode/KV_ExprLocation.h"
#include "platform/icode/KV_ICodeFactoryContainer.h"
#include "platform/icode/KV_MacroSymbolServer.h"
#include "platform/icode/KV_Operation.h"
#include "platform/icode/KV_ScaleServer.h"
#include "platform/icode/KV_Statement.h"
#include "platform/icode/KV_SymbolDB.h"
#include "platform/icode/KvCCStmTable.h"
#include "platform/icode/KvCIcFileId.h"
#include "platform/icode/KvCIcFileServer.h"
#include "platform/icode/KvCVarClassServer.h"
#include "platform/support/KvCCIdentifier.h"

#include <gtest/gtest.h>

#include <string>

namespace {

struct Globals {
  AppBuilder app;
  KV_ICodeFactoryContainer* container = app.data().getFactoryContainer();
  KV_CgsSupporter* cgs = container->getCgsSupporter();
  KvCVarClassServer* classes = container->getVarClassServer();
  KvCIcFileId* header = app.data().getFileServer()->demandFile("api.h");
  KV_DataType* int16 = app.data().getDataTypeServer()->getInt16();
  KV_Scaling* unit = app.data().getScalingServer()->getIdentityScaling();

  KvCVarClassId* externClass() { return classes->demandMacroGlobalExternDefault(nullptr); }
  KV_ExprDescrTupel* make(const char* name, bool makeUnique, KvCVarClassId* cls = nullptr,
                          KvCCStmTable* table = nullptr) {
    KvCCIdentifier id(name);
    return cgs->createScalarVariable(id, int16, unit, 3.0, makeUnique, cls ? cls : externClass(),
                                     nullptr, nullptr, table ? table : header->getFile()->getStt(),
                                     0);
  }
  int statements() { return header->getFile()->getStt()->getNumberOfStatements(); }
  tagKvEOperatorKind lastKind() {
    const KvCCStmTable* t = header->getFile()->getStt();
    return t->getStatement(t->getNumberOfStatements() - 1)
        ->getExprLoc()
        ->getOperation()
        ->getOperator()
        ->getKind();
  }
};

TEST(GlobalVariablesTest, NamesOfAFileScopeAreTakenRenamedOrRefused) {
  Globals g;
  g.app.function("SetEvent");
  struct Case {
    const char* name;
    bool makeUnique;
    const char* given; // null: refused
  };
  const Case cases[] = {
      {"speed", false, "speed"},    {"speed", false, nullptr},  {"speed", true, "speed_1"},
      {"speed", true, "speed_2"},   {"Int16", false, nullptr},  {"Int16", true, "Int16_1"},
      {"while", false, nullptr},    {"while", true, "while_1"}, {"SetEvent", false, nullptr},
      {"2 fast", false, "_2_fast"}, {"", false, "_"},
  };
  for (const Case& c : cases) {
    SCOPED_TRACE(std::string(c.name) + (c.makeUnique ? " unique" : ""));
    const int symbols = g.app.data().getSymbolDB()->getNumberOfSymbols();
    const int statements = g.statements();
    KV_ExprDescrTupel* made = g.make(c.name, c.makeUnique);
    if (!c.given) {
      EXPECT_EQ(made, nullptr);
      EXPECT_EQ(g.app.data().getSymbolDB()->getNumberOfSymbols(), symbols) << "nothing made";
      EXPECT_EQ(g.statements(), statements);
      continue;
    }
    ASSERT_NE(made, nullptr);
    EXPECT_EQ(made->getSymbol()->getName().str(), c.given);
    EXPECT_EQ(g.statements(), statements + 1);
    EXPECT_EQ(g.lastKind(), KV_OP_VARIABLE_DECLARATION);
  }
  // The same name in another file's scope is free there.
  KvCIcFileId* other = g.app.data().getFileServer()->demandFile("other.h");
  EXPECT_NE(g.make("speed", false, nullptr, other->getFile()->getStt()), nullptr);
}

TEST(GlobalVariablesTest, ClassesDecideDeclarationOrDefinitionAndWhereVariablesMayGo) {
  Globals g;
  KvCVarClassId* defined = g.classes->demandVarClass("GlobalDefault", false, true);
  KvCVarClassId* local = g.classes->demandVarClass("Local", false, false);
  ASSERT_NE(g.make("calibrated", false, defined), nullptr);
  EXPECT_EQ(g.lastKind(), KV_OP_VARIABLE_DEFINITION);
  EXPECT_EQ(g.make("scratch", false, local), nullptr) << "only global classes";
  auto& f = g.app.function("step");
  EXPECT_EQ(g.make("inBody", false, nullptr, f.symbol()->getBodySTT()), nullptr)
      << "only a file's top level";
  EXPECT_EQ(g.classes->demandMacroGlobalExternDefault(nullptr), g.externClass());
  EXPECT_TRUE(g.externClass()->isExtern());
}

TEST(GlobalVariablesTest, ExternGlobalsAreFoundOnlyUnderTheirKey) {
  Globals g;
  KV_MacroSymbolServer* macros = g.container->getMacroSymbolServer();
  KvCIcFileId* other = g.app.data().getFileServer()->demandFile("other.h");
  KV_DataType* uint8 = g.app.data().getDataTypeServer()->getUInt8();
  bool created = false;
  KvCSymbol* gain =
      macros->demandExternGlobal(g.header, "gain", g.int16, g.unit, &created, nullptr);
  ASSERT_NE(gain, nullptr);
  EXPECT_TRUE(created);
  struct Case {
    const char* title;
    KvCIcFileId* file;
    KV_DataType* type;
    KV_Scaling* scaling;
    bool found;
  };
  const Case cases[] = {
      {"same key", g.header, g.int16, g.unit, true},
      {"other file", other, g.int16, g.unit, false},
      {"other type", g.header, uint8, g.unit, false},
      {"other scaling", g.header, g.int16, g.app.data().getScalingServer()->demandScaling(0.5, 0.0),
       false},
  };
  for (const Case& c : cases) {
    SCOPED_TRACE(c.title);
    created = true;
    EXPECT_EQ(macros->demandExternGlobal(c.file, "gain", c.type, c.scaling, &created, nullptr),
              c.found ? gain : nullptr);
    EXPECT_FALSE(created);
  }
  EXPECT_EQ(macros->findExternGlobal("gain"), gain);
  // A name taken in the file by another variable, and one that is no C identifier.
  ASSERT_NE(g.make("taken", false), nullptr);
  EXPECT_EQ(macros->demandExternGlobal(g.header, "taken", g.int16, g.unit, &created, nullptr),
            nullptr);
  EXPECT_EQ(macros->demandExternGlobal(g.header, "no good", g.int16, g.unit, nullptr, nullptr),
            nullptr);
  EXPECT_EQ(macros->demandExternGlobal(nullptr, "x", g.int16, g.unit, nullptr, nullptr), nullptr);
}

} // namespace
