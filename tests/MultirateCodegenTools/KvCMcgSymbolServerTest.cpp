// The RTOS symbol server against a sample RTOS description: each kind of RTOS object
// gets its identifier variable once, user-defined actual parameters are extern globals
// found again by name, the OSEK header may arrive late, names that cannot be had are
// reported without leaving half-made variables, and the printed headers compile.
#include "HulCvTools/MultirateCodegenTools/KvCMcgSymbolServer.h"
#include "HulCvTools/MultirateCodegenTools/KvCMcgFunctionServer.h"
#include "HulCvTools/MultirateCodegenTools/KvCMcgTypeServer.h"
#include "platform/builder/AppBuilder.h"
#include "platform/icode/KV_ExprDescrTupel.h"
#include "platform/icode/KV_ExprLocation.h"
#include "platform/icode/KV_ICodeFactoryContainer.h"
#include "platform/icode/KV_Operation.h"
#include "platform/icode/KV_QualifiedSymbolOp.h"
#include "platform/icode/KV_Statement.h"
#include "platform/icode/KV_SymbolDB.h"
#include "platform/icode/KvCCDeclPrinter.h"
#include "platform/icode/KvCCStmTable.h"
#include "platform/icode/KvCIcFileId.h"
#include "platform/icode/KvCIcFileServer.h"
#include "platform/icode/KvCVarClassId.h"
#include "platform/support/KvCMessageServer.h"
#include "platform/view/KvCIvData.h"
#include "platform/view/KvCRoAlarm.h"
#include "platform/view/KvCRoDataTypes.h"
#include "platform/view/KvCRoDatabase.h"
#include "platform/view/KvCRoEvent.h"
#include "platform/view/KvCRoMessage.h"
#include "platform/view/KvCRoRTOSInfo.h"
#include "platform/view/KvCRoResource.h"

#include <gtest/gtest.h>

#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <functional>
#include <string>
#include <unistd.h>
#include <vector>

namespace {

KvCMessageServer& messages() { return *KvCMessageServer::getMessageServer(); }

// An RTOS object of one kind, seen through its identifier variable.
struct IdObject {
  std::function<KV_ExprDescrTupel*(KvCMcgSymbolServer&, const KvCSrcRef*)> demand;
  std::function<KV_ExprDescrTupel*()> stored;
};

struct KindRow {
  const char* kind;
  const char* typeName;
  KV_DataType* (KvCMcgTypeServer::*type)(const KvCSrcRef*);
  IdObject (*create)(KvCRoDatabase&, const char* name);
};

const KindRow kKinds[] = {
    {"alarm", "AlarmType", &KvCMcgTypeServer::demandAlarmType,
     [](KvCRoDatabase& db, const char* name) {
       KvCRoAlarm* o = db.createAlarm(name);
       return IdObject{
           [o](KvCMcgSymbolServer& s, const KvCSrcRef* r) { return s.demandAlarmIdVariable(o, r); },
           [o] { return o->getAlarmIdVar(); }};
     }},
    {"resource", "ResourceType", &KvCMcgTypeServer::demandResourceType,
     [](KvCRoDatabase& db, const char* name) {
       KvCRoResource* o = db.createResource(name);
       return IdObject{[o](KvCMcgSymbolServer& s, const KvCSrcRef* r) {
                         return s.demandResourceIdVariable(o, r);
                       },
                       [o] { return o->getResourceIdVar(); }};
     }},
    {"event", "EventMaskType", &KvCMcgTypeServer::demandEventMaskType,
     [](KvCRoDatabase& db, const char* name) {
       KvCRoEvent* o = db.createEvent(name);
       return IdObject{
           [o](KvCMcgSymbolServer& s, const KvCSrcRef* r) { return s.demandEventIdVariable(o, r); },
           [o] { return o->getEventIdVar(); }};
     }},
    {"message", "SymbolicName", &KvCMcgTypeServer::demandSymbolicNameType,
     [](KvCRoDatabase& db, const char* name) {
       KvCRoMessage* o = db.createMessage(name);
       return IdObject{[o](KvCMcgSymbolServer& s, const KvCSrcRef* r) {
                         return s.demandMessageIdVariable(o, r);
                       },
                       [o] { return o->getMsgIdVar(); }};
     }},
};

class McgSymbolServerTest : public ::testing::Test {
protected:
  void SetUp() override {
    messages().clear();
    app.data().setRtosDatabase(&rtos);
    iv.setRtosDatabase(&rtos);
    KvCRoDataTypes* t = rtos.demandRTOSInfo()->getDataTypes();
    t->setStatusType("UInt8", "status of an API call");
    t->setTaskType("UInt8", "task identifier");
    t->setEventMaskType("UInt32", "event mask");
    t->setSymbolicName("UInt16", "symbolic name");
    t->setResourceType("UInt8", "resource identifier");
    t->setAlarmType("UInt8", "alarm identifier");
    t->setTickType("UInt32", "counter ticks");
    t->setAccessNameRefDescription("reference to message data");
    t->setKvCounterTypeBaseType("UInt16");
  }
  void TearDown() override { messages().clear(); }

  KV_ICodeFactoryContainer* container() { return app.data().getFactoryContainer(); }
  bool bootTypes(bool active = true) {
    types.bootPhaseOne(&app.data(), container(), &rtos, active);
    return types.bootPhaseTwo();
  }
  bool bootSymbols(bool active = true) {
    server.bootPhaseOne(container()->getMacroSymbolServer(), &types,
                        container()->getVarClassServer(), &app.data(), container(), &iv,
                        container()->getCgsSupporter(), active, &rtos);
    return server.bootPhaseTwo();
  }
  bool boot() { return bootTypes() && bootSymbols(); }

  KvCIcFileId* osekHeader() { return app.data().getFileServer()->demandFile("osek.h"); }
  KvCIcFileId* acmeHeader() { return app.data().getFileServer()->findFile("acme.h"); }
  int symbols() { return app.data().getSymbolDB()->getNumberOfSymbols(); }
  // The names of the variables a file's top-level table declares, in order.
  static std::vector<std::string> declaredIn(KvCIcFileId* file) {
    std::vector<std::string> names;
    const KvCCStmTable* table = file->getFile()->getStt();
    for (int i = 0; i < table->getNumberOfStatements(); ++i) {
      KV_Operation* op = table->getStatement(i)->getExprLoc()->getOperation();
      if (op && op->getOperator()->getKind() == KV_OP_VARIABLE_DECLARATION)
        names.push_back(op->getOperand(0)->getQualifiedSymbolOp()->getSymbol()->getName().str());
    }
    return names;
  }
  std::vector<std::string> messageTexts() {
    std::vector<std::string> texts;
    for (const KvCMessageRecord& m : messages().getMessages())
      texts.push_back(std::to_string(m.number) + " " + m.text.str());
    return texts;
  }
  bool reported(const std::string& code) {
    for (const std::string& text : messageTexts())
      if (text.rfind("10007 ", 0) == 0 && text.find(code) != std::string::npos)
        return true;
    return false;
  }

  AppBuilder app;
  KvCRoDatabase rtos{&app.data()};
  KvCIvData iv;
  KvCMcgTypeServer types;
  KvCMcgSymbolServer server;
};

TEST_F(McgSymbolServerTest, EachRtosObjectGetsOneIdentifierVariableOfItsType) {
  ASSERT_TRUE(boot());
  std::vector<std::string> expected;
  for (const KindRow& row : kKinds) {
    SCOPED_TRACE(row.kind);
    const std::string name = std::string("Id_") + row.kind;
    IdObject object = row.create(rtos, name.c_str());
    const int before = symbols();
    KV_ExprDescrTupel* variable = object.demand(server, nullptr);
    ASSERT_NE(variable, nullptr);
    EXPECT_EQ(object.stored(), variable) << "remembered by the object";
    ASSERT_EQ(variable->getNumberOfElements(), 1);
    KvCSymbol* symbol = variable->getSymbol();
    ASSERT_NE(symbol, nullptr);
    EXPECT_EQ(symbol->getName().str(), name);
    EXPECT_EQ(symbol->getDataType(), (types.*row.type)(nullptr));
    EXPECT_EQ(symbol->getDataType()->getName().str(), row.typeName);
    EXPECT_EQ(symbol->getScaling(), types.getStandardScaling());
    EXPECT_EQ(variable->getPartition(), iv.getIvRootPartition());
    ASSERT_NE(symbol->asUnparamSymbol()->getVarClass(), nullptr);
    EXPECT_TRUE(symbol->asUnparamSymbol()->getVarClass()->isExtern());
    EXPECT_EQ(symbols(), before + 1);
    expected.push_back(name);
    EXPECT_EQ(declaredIn(osekHeader()), expected);

    const int demands = rtos.getNumberOfOsekHFileDemands();
    EXPECT_EQ(object.demand(server, nullptr), variable);
    EXPECT_EQ(rtos.getNumberOfOsekHFileDemands(), demands) << "a known variable asks nothing";
    EXPECT_EQ(symbols(), before + 1);
  }
  // An object name that is no C identifier gives its cooked form.
  IdObject spaced = kKinds[0].create(rtos, "Wake up");
  ASSERT_NE(spaced.demand(server, nullptr), nullptr);
  EXPECT_EQ(spaced.stored()->getSymbol()->getName().str(), "Wake_up");
  EXPECT_TRUE(messageTexts().empty());
}

TEST_F(McgSymbolServerTest, WithoutTheOsekHeaderObjectsWaitUntilItArrives) {
  ASSERT_TRUE(boot());
  rtos.setOsekHFileAvailable(false);
  std::vector<IdObject> objects;
  for (const KindRow& row : kKinds)
    objects.push_back(row.create(rtos, (std::string("Late_") + row.kind).c_str()));
  const int before = symbols();
  for (IdObject& object : objects) {
    EXPECT_EQ(object.demand(server, nullptr), nullptr);
    EXPECT_EQ(object.stored(), nullptr);
  }
  EXPECT_EQ(symbols(), before);
  EXPECT_TRUE(messageTexts().empty()) << "a missing header is no fault of the server";
  rtos.setOsekHFileAvailable(true);
  for (IdObject& object : objects) {
    EXPECT_NE(object.demand(server, nullptr), nullptr);
    EXPECT_EQ(object.demand(server, nullptr), object.stored());
  }
  EXPECT_EQ(declaredIn(osekHeader()).size(), objects.size());
}

// Names the OSEK header cannot give: the creation is reported with the kind's code, the
// object stays without variable and nothing is declared.
TEST_F(McgSymbolServerTest, NamesThatCannotBeHadAreReportedAndNothingIsStored) {
  struct Case {
    const char* title;
    const char* name;
    int kind; // row of kKinds
    const char* code;
  };
  const Case cases[] = {
      {"taken by an alarm's variable", "Shared", 2, "KvCMcgSymbolServer 231"},
      {"the name of a type", "TaskType", 1, "KvCMcgSymbolServer 221"},
      {"a C keyword", "switch", 3, "KvCMcgSymbolServer 241"},
  };
  ASSERT_TRUE(boot());
  ASSERT_NE(kKinds[0].create(rtos, "Shared").demand(server, nullptr), nullptr);
  ASSERT_NE(types.demandTaskType(nullptr), nullptr);
  for (const Case& c : cases) {
    SCOPED_TRACE(c.title);
    messages().clear();
    const std::vector<std::string> declared = declaredIn(osekHeader());
    const int before = symbols();
    IdObject object = kKinds[c.kind].create(rtos, c.name);
    EXPECT_EQ(object.demand(server, nullptr), nullptr);
    EXPECT_EQ(object.stored(), nullptr);
    EXPECT_EQ(symbols(), before);
    EXPECT_EQ(declaredIn(osekHeader()), declared);
    EXPECT_TRUE(reported(c.code)) << ::testing::PrintToString(messageTexts());
  }
}

TEST_F(McgSymbolServerTest, UserDefinedActualParametersAreExternGlobalsFoundAgain) {
  ASSERT_TRUE(boot());
  const int before = symbols();
  KvCSymbol* first = server.demandUserDefinedActualParam("udp_speed", nullptr);
  ASSERT_NE(first, nullptr);
  EXPECT_EQ(first->getName().str(), "udp_speed");
  EXPECT_EQ(first->getDataType(), types.getStandardBaseType());
  EXPECT_EQ(first->getScaling(), types.getStandardScaling());
  EXPECT_EQ(server.demandUserDefinedActualParam("udp_speed", nullptr), first);
  KvCSymbol* second = server.demandUserDefinedActualParam("udp_mode", nullptr);
  ASSERT_NE(second, nullptr);
  EXPECT_NE(second, first);
  EXPECT_EQ(symbols(), before + 2);
  EXPECT_EQ(declaredIn(acmeHeader()), (std::vector<std::string>{"udp_speed", "udp_mode"}));
  EXPECT_TRUE(declaredIn(osekHeader()).empty());
  EXPECT_TRUE(messageTexts().empty());
  // A name that is no C identifier cannot be an extern global.
  EXPECT_EQ(server.demandUserDefinedActualParam("udp speed", nullptr), nullptr);
  EXPECT_TRUE(reported("KvCMcgSymbolServer 301"));
  EXPECT_EQ(symbols(), before + 2);
}

TEST_F(McgSymbolServerTest, InactiveOrUnbootedServersMakeNothing) {
  IdObject object = kKinds[0].create(rtos, "Early");
  // Inactive: phase two touches no file, and demands are reported instead of made.
  EXPECT_TRUE(bootSymbols(false));
  EXPECT_EQ(app.data().getFileServer()->findFile("acme.h"), nullptr);
  EXPECT_EQ(server.demandUserDefinedActualParam("p", nullptr), nullptr);
  EXPECT_EQ(object.demand(server, nullptr), nullptr);
  EXPECT_EQ(object.stored(), nullptr);
  EXPECT_TRUE(reported("KvCMcgSymbolServer 110"));
  // Active, but the type server never ran its phase two: no type, no standard scaling or
  // base type.
  messages().clear();
  ASSERT_TRUE(bootSymbols(true));
  EXPECT_EQ(object.demand(server, nullptr), nullptr);
  EXPECT_EQ(object.stored(), nullptr);
  EXPECT_TRUE(reported("KvCMcgSymbolServer 210"));
  EXPECT_EQ(server.demandUserDefinedActualParam("p", nullptr), nullptr);
  EXPECT_TRUE(reported("KvCMcgSymbolServer 300"));
  EXPECT_EQ(symbols(), 0);
  EXPECT_TRUE(declaredIn(osekHeader()).empty());
}

TEST_F(McgSymbolServerTest, MissingAcmeFilesFailPhaseTwo) {
  ASSERT_TRUE(bootTypes());
  app.data().getFileServer()->setAcmeFilesUnavailable(true);
  EXPECT_FALSE(bootSymbols());
  app.data().getFileServer()->setAcmeFilesUnavailable(false);
  EXPECT_TRUE(bootSymbols());
}

TEST_F(McgSymbolServerTest, BootShutdownBootAgainFindsWhatWasMade) {
  ASSERT_TRUE(boot());
  IdObject alarm = kKinds[0].create(rtos, "Cyclic");
  KV_ExprDescrTupel* variable = alarm.demand(server, nullptr);
  KvCSymbol* global = server.demandUserDefinedActualParam("udp_gain", nullptr);
  ASSERT_NE(variable, nullptr);
  ASSERT_NE(global, nullptr);
  const int before = symbols();
  EXPECT_TRUE(server.shutdown());
  KvCMcgSymbolServer again;
  again.bootPhaseOne(container()->getMacroSymbolServer(), &types, container()->getVarClassServer(),
                     &app.data(), container(), &iv, container()->getCgsSupporter(), true, &rtos);
  ASSERT_TRUE(again.bootPhaseTwo());
  EXPECT_EQ(
      again.demandAlarmIdVariable(rtos.createAlarm("Other"), nullptr)->getSymbol()->getName().str(),
      "Other");
  EXPECT_EQ(alarm.demand(again, nullptr), variable);
  EXPECT_EQ(again.demandUserDefinedActualParam("udp_gain", nullptr), global);
  EXPECT_EQ(symbols(), before + 1);
  EXPECT_TRUE(messageTexts().empty());
}

// A real client: the printed OSEK and Acme headers, with every kind of identifier variable
// and two actual parameters, compile together with C code that uses each of them.
TEST_F(McgSymbolServerTest, PrintedHeadersCompileWithEveryVariable) {
  if (std::system("command -v cc > /dev/null 2>&1") != 0)
    GTEST_SKIP() << "no C compiler (cc) found";
  ASSERT_TRUE(boot());
  std::string uses;
  for (const KindRow& row : kKinds) {
    const std::string name = std::string("Id_") + row.kind;
    ASSERT_NE(row.create(rtos, name.c_str()).demand(server, nullptr), nullptr) << row.kind;
    uses += "  { " + std::string(row.typeName) + " v = " + name + "; (void)v; }\n";
  }
  for (const char* param : {"udp_speed", "udp_mode"}) {
    ASSERT_NE(server.demandUserDefinedActualParam(param, nullptr), nullptr) << param;
    uses += "  " + std::string(param) + " = (signed char)(" + param + " + 1);\n";
  }
  // A directory of this process's own: other tests write headers of the same names.
  namespace fs = std::filesystem;
  const fs::path path =
      fs::temp_directory_path() / ("hul_mcg_symbols_" + std::to_string(::getpid()));
  fs::create_directories(path);
  const std::string dir = path.string() + "/";
  std::ofstream(dir + "osek.h") << KvCCDeclPrinter::printFile(osekHeader()).str();
  std::ofstream(dir + "acme.h") << KvCCDeclPrinter::printFile(acmeHeader()).str();
  std::ofstream source(dir + "rtos_ids.c");
  source << "#include \"osek.h\"\n#include \"acme.h\"\n#include \"osek.h\"\n"
            "void use(void) {\n"
         << uses << "}\n";
  source.close();
  const std::string command =
      "cc -std=c99 -Wall -Werror -fsyntax-only -I" + dir + " " + dir + "rtos_ids.c";
  EXPECT_EQ(std::system(command.c_str()), 0) << command;
  std::error_code ignored;
  fs::remove_all(path, ignored);
}

} // namespace

namespace {

// An RTOS object named like an API function: its identifier variable takes the name
// first, so the function cannot be declared beside it; the function server reports that
// instead of leaving a header that is not C.
TEST_F(McgSymbolServerTest, ApiFunctionNamedLikeAnIdentifierVariableIsRefused) {
  ASSERT_TRUE(boot());
  KvCMcgFunctionServer functions;
  functions.bootPhaseOne(&app.data(), container(), &types, &rtos, true);
  ASSERT_TRUE(functions.bootPhaseTwo());
  ASSERT_NE(server.demandAlarmIdVariable(rtos.createAlarm("Schedule"), nullptr), nullptr);
  messages().clear();
  EXPECT_EQ(functions.demandOsekApiSchedule(nullptr), nullptr);
  bool checked = false;
  for (const std::string& text : messageTexts())
    checked = checked || text.find("KvCMcgFunctionServer 2403") != std::string::npos;
  EXPECT_TRUE(checked);
  EXPECT_NE(functions.demandOsekApiActivateTask(nullptr), nullptr) << "other names are free";
}

} // namespace

namespace {

// The other order: an RTOS object named like an RTOS type that is not made yet. The type
// cannot take the variable's name; the type server reports it and answers null.
TEST_F(McgSymbolServerTest, RtosTypeNamedLikeAnIdentifierVariableIsRefused) {
  ASSERT_TRUE(boot());
  ASSERT_NE(server.demandAlarmIdVariable(rtos.createAlarm("TickType"), nullptr), nullptr);
  messages().clear();
  EXPECT_EQ(types.demandTickType(nullptr), nullptr);
  bool checked = false;
  for (const std::string& text : messageTexts())
    checked = checked || text.find("KvCMcgTypeServer 640") != std::string::npos;
  EXPECT_TRUE(checked);
}

} // namespace
