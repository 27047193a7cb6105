// The RTOS type server against a sample RTOS description: every type made once and
// declared where it belongs, the OSEK header arriving late, the Data Dictionary's
// TickType, and the failures the model may answer.
#include "HulCvTools/MultirateCodegenTools/KvCMcgTypeServer.h"
#include "platform/builder/AppBuilder.h"
#include "platform/icode/KV_DataType.h"
#include "platform/icode/KV_DataTypeServer.h"
#include "platform/icode/KvCCDeclPrinter.h"
#include "platform/icode/KvCCodeViewData.h"
#include "platform/icode/KvCIcFile.h"
#include "platform/icode/KvCIcFileId.h"
#include "platform/icode/KvCIcFileServer.h"
#include "platform/support/KvCMessageServer.h"
#include "platform/view/KvCRoDataTypes.h"
#include "platform/view/KvCRoDatabase.h"
#include "platform/view/KvCRoRTOSInfo.h"

#include <gtest/gtest.h>

#include <cstdio>
#include <cstdlib>
#include <fstream>
#include <string>
#include <vector>

namespace {

KvCMessageServer& messages() { return *KvCMessageServer::getMessageServer(); }

using Demand = KV_DataType* (KvCMcgTypeServer::*)(const KvCSrcRef*);

// Where a type is declared: the OSEK header, the Acme header, or nowhere.
enum Home { kOsek, kAcme };

struct TypeRow {
  const char* name;
  Demand demand;
  Home home;
  bool namedForCasts;
};

const TypeRow kTypes[] = {
    {"StatusType", &KvCMcgTypeServer::demandStatusType, kOsek, true},
    {"TaskType", &KvCMcgTypeServer::demandTaskType, kOsek, true},
    {"EventMaskType", &KvCMcgTypeServer::demandEventMaskType, kOsek, true},
    {"SymbolicName", &KvCMcgTypeServer::demandSymbolicNameType, kOsek, true},
    {"ResourceType", &KvCMcgTypeServer::demandResourceType, kOsek, true},
    {"AlarmType", &KvCMcgTypeServer::demandAlarmType, kOsek, true},
    {"AccessNameRef", &KvCMcgTypeServer::demandAccessNameRefType, kOsek, false},
    {"EventMaskRefType", &KvCMcgTypeServer::demandEventMaskRefType, kOsek, false},
    {"TickType", &KvCMcgTypeServer::demandTickType, kOsek, true},
    {"ISRDummyType", &KvCMcgTypeServer::demandISRDummyType, kAcme, true},
};

class McgTypeServerTest : public ::testing::Test {
protected:
  void SetUp() override {
    messages().clear();
    app.data().setRtosDatabase(&rtos);
    KvCRoDataTypes* types = rtos.demandRTOSInfo()->getDataTypes();
    types->setStatusType("UInt8", "status of an API call");
    types->setTaskType("UInt8", "task identifier");
    types->setEventMaskType("UInt32", "event mask");
    types->setSymbolicName("UInt16", "symbolic name");
    types->setResourceType("UInt8", "resource identifier");
    types->setAlarmType("UInt8", "alarm identifier");
    types->setTickType("UInt32", "counter ticks");
    types->setAccessNameRefDescription("reference to message data");
    types->setKvCounterTypeBaseType("UInt16");
  }
  void TearDown() override { messages().clear(); }

  bool boot(bool active = true) {
    server.bootPhaseOne(&app.data(), app.data().getFactoryContainer(), &rtos, active);
    return server.bootPhaseTwo();
  }
  KvCIcFile* osekHeader() { return app.data().getFileServer()->demandFile("osek.h")->getFile(); }
  KvCIcFile* acmeHeader() { return app.data().getFileServer()->findFile("acme.h")->getFile(); }
  KvCIcFile* homeOf(Home home) { return home == kOsek ? osekHeader() : acmeHeader(); }
  std::vector<std::string> definedIn(KvCIcFile* file) {
    std::vector<std::string> names;
    for (KV_DataType* type : file->getDefinedTypes())
      names.push_back(type->getName().str());
    return names;
  }
  std::vector<std::string> messageTexts() {
    std::vector<std::string> texts;
    for (const KvCMessageRecord& m : messages().getMessages())
      texts.push_back(std::to_string(m.number) + " " + m.text.str());
    return texts;
  }

  AppBuilder app;
  KvCRoDatabase rtos{&app.data()};
  KvCMcgTypeServer server;
};

TEST_F(McgTypeServerTest, EveryTypeIsMadeOnceAndDeclaredWhereItBelongs) {
  ASSERT_TRUE(boot());
  ASSERT_NE(server.getStandardBaseType(), nullptr);
  EXPECT_EQ(server.getStandardBaseType()->getName().str(), "Int8");
  ASSERT_NE(server.getStandardScaling(), nullptr);
  for (const TypeRow& row : kTypes) {
    SCOPED_TRACE(row.name);
    KV_DataType* type = (server.*row.demand)(nullptr);
    ASSERT_NE(type, nullptr);
    EXPECT_EQ(type->getName().str(), row.name);
    EXPECT_EQ(type->isUseNameForCasts(), row.namedForCasts);
    EXPECT_TRUE(homeOf(row.home)->isTypeDefined(type));
    const int demands = rtos.getNumberOfOsekHFileDemands();
    EXPECT_EQ((server.*row.demand)(nullptr), type);
    EXPECT_EQ(rtos.getNumberOfOsekHFileDemands(), demands) << "a cached type asks nothing";
  }
  // EventMaskType went in before the reference type made from it.
  EXPECT_EQ(definedIn(osekHeader()),
            (std::vector<std::string>{"StatusType", "TaskType", "EventMaskType", "SymbolicName",
                                      "ResourceType", "AlarmType", "AccessNameRef",
                                      "EventMaskRefType", "TickType"}));
  KV_DataType* counterId = server.demandCounterIDType();
  ASSERT_NE(counterId, nullptr);
  EXPECT_EQ(counterId->getName().str(), "UInt16");
  EXPECT_EQ(server.demandCounterIDType(), counterId);
  EXPECT_TRUE(messageTexts().empty());
}

TEST_F(McgTypeServerTest, EventMaskRefTypeOnAFreshServerMakesEventMaskTypeFirst) {
  ASSERT_TRUE(boot());
  KV_DataType* ref = server.demandEventMaskRefType(nullptr);
  ASSERT_NE(ref, nullptr);
  ASSERT_NE(ref->asPointerType(), nullptr);
  KV_DataType* mask = server.demandEventMaskType(nullptr);
  EXPECT_EQ(ref->asPointerType()->getTargetType(), mask);
  EXPECT_EQ(definedIn(osekHeader()),
            (std::vector<std::string>{"EventMaskType", "EventMaskRefType"}));
}

TEST_F(McgTypeServerTest, WithoutTheOsekHeaderTypesWaitUntilItArrives) {
  rtos.setOsekHFileAvailable(false);
  ASSERT_TRUE(boot());
  for (const TypeRow& row : kTypes)
    EXPECT_EQ((server.*row.demand)(nullptr) == nullptr, row.home == kOsek) << row.name;
  EXPECT_TRUE(messageTexts().empty()) << "a missing header is no fault of the server";
  rtos.setOsekHFileAvailable(true);
  for (const TypeRow& row : kTypes)
    EXPECT_NE((server.*row.demand)(nullptr), nullptr) << row.name;
}

struct TickCase {
  const char* title;
  const char* ddBase; // null: a Data Dictionary type without base type
  bool scalar;
  bool createTypedef;
  bool inOsekHeader;
  const char* differences; // null: no message
};

TEST_F(McgTypeServerTest, DataDictionaryTickTypeWinsAndItsDifferencesAreListedInOrder) {
  const TickCase cases[] = {
      {"all alike", "UInt32", true, true, true, nullptr},
      {"no base type", nullptr, true, true, true, "\nIsBaseType\nBaseType"},
      {"other base type", "UInt16", true, true, true, "\nBaseType"},
      {"width and module", "UInt32", false, true, false, "\nWidth\nModule"},
      {"everything", nullptr, false, false, false,
       "\nIsBaseType\nBaseType\nWidth\nCreateTypedef\nModule"},
  };
  for (const TickCase& c : cases) {
    SCOPED_TRACE(c.title);
    AppBuilder local;
    KvCRoDatabase localRtos(&local.data());
    local.data().setRtosDatabase(&localRtos);
    localRtos.demandRTOSInfo()->getDataTypes()->setTickType("UInt32", "counter ticks");
    KV_DataTypeServer* types = local.data().getDataTypeServer();
    KvCIcFileServer* files = local.data().getFileServer();
    KV_DataType* base = c.ddBase ? types->findTypeByName(c.ddBase, nullptr) : nullptr;
    KV_DataType* dd = types->registerDataDictionaryType(
        "TickType", base, c.scalar, c.createTypedef,
        files->demandFile(c.inOsekHeader ? "osek.h" : "dd.h"), nullptr);
    ASSERT_NE(dd, nullptr);
    KvCMcgTypeServer tickServer;
    tickServer.bootPhaseOne(&local.data(), local.data().getFactoryContainer(), &localRtos, true);
    ASSERT_TRUE(tickServer.bootPhaseTwo());
    messages().clear();
    EXPECT_EQ(tickServer.demandTickType(nullptr), dd->getNumericalType());
    EXPECT_TRUE(dd->isUseNameForCasts());
    const auto& got = messages().getMessages();
    if (!c.differences) {
      EXPECT_TRUE(got.empty());
      continue;
    }
    ASSERT_EQ(got.size(), 1u);
    EXPECT_EQ(got[0].number, 31688);
    const std::string text = got[0].text.str();
    EXPECT_NE(text.find("The RTOS data type TickType"), std::string::npos) << text;
    EXPECT_EQ(text.substr(text.size() - std::string(c.differences).size()), c.differences);
    EXPECT_EQ(tickServer.demandTickType(nullptr), dd->getNumericalType());
    EXPECT_EQ(got.size(), 1u) << "reported once";
  }
}

TEST_F(McgTypeServerTest, InactiveServerBootsWithoutTouchingTheModel) {
  EXPECT_TRUE(boot(false));
  EXPECT_EQ(server.getStandardScaling(), nullptr);
  EXPECT_EQ(server.getStandardBaseType(), nullptr);
  EXPECT_EQ(app.data().getFileServer()->findFile("root.h"), nullptr);
}

TEST_F(McgTypeServerTest, MissingFilePairsFailPhaseTwo) {
  app.data().getFileServer()->setRootFilesUnavailable(true);
  EXPECT_FALSE(boot());
  app.data().getFileServer()->setRootFilesUnavailable(false);
  app.data().getFileServer()->setAcmeFilesUnavailable(true);
  EXPECT_FALSE(boot());
  app.data().getFileServer()->setAcmeFilesUnavailable(false);
  EXPECT_TRUE(boot());
}

TEST_F(McgTypeServerTest, ModelFailuresAreReportedAndOnlyWholeTypesCached) {
  ASSERT_TRUE(boot());
  // A failed declaration: reported with the type's code, the type still cached.
  osekHeader()->setDefineTypeFails(true);
  KV_DataType* status = server.demandStatusType(nullptr);
  ASSERT_NE(status, nullptr);
  EXPECT_EQ(server.demandStatusType(nullptr), status);
  osekHeader()->setDefineTypeFails(false);
  ASSERT_EQ(messageTexts().size(), 1u);
  EXPECT_NE(messageTexts()[0].find("10007 "), std::string::npos);
  EXPECT_NE(messageTexts()[0].find("KvCMcgTypeServer 231"), std::string::npos) << messageTexts()[0];
  // A base-type name that names no type: reported, null, nothing cached; once the RTOS
  // information is right the type is made.
  messages().clear();
  rtos.demandRTOSInfo()->getDataTypes()->setTaskType("NoSuchBase", "task identifier");
  EXPECT_EQ(server.demandTaskType(nullptr), nullptr);
  ASSERT_EQ(messageTexts().size(), 1u);
  EXPECT_NE(messageTexts()[0].find("KvCMcgTypeServer 269"), std::string::npos) << messageTexts()[0];
  rtos.demandRTOSInfo()->getDataTypes()->setTaskType("UInt8", "task identifier");
  EXPECT_NE(server.demandTaskType(nullptr), nullptr);
  // Demands on a server that never ran phase two answer null instead of following nulls.
  KvCMcgTypeServer unbooted;
  messages().clear();
  EXPECT_EQ(unbooted.demandISRDummyType(nullptr), nullptr);
  EXPECT_EQ(unbooted.demandCounterIDType(), nullptr);
  EXPECT_EQ(messageTexts().size(), 2u);
}

// The OSEK and Acme headers the printer writes for every RTOS type are C that a compiler
// accepts, together with code that uses each type.
TEST_F(McgTypeServerTest, PrintedHeadersCompileWithEveryType) {
  if (std::system("command -v cc > /dev/null 2>&1") != 0)
    GTEST_SKIP() << "no C compiler (cc) found";
  ASSERT_TRUE(boot());
  for (const TypeRow& row : kTypes)
    ASSERT_NE((server.*row.demand)(nullptr), nullptr) << row.name;
  const std::string dir = ::testing::TempDir();
  std::ofstream(dir + "osek.h") << KvCCDeclPrinter::printFile(osekHeader()->getFileId()).str();
  std::ofstream(dir + "acme.h") << KvCCDeclPrinter::printFile(acmeHeader()->getFileId()).str();
  std::ofstream source(dir + "rtos_client.c");
  source << "#include \"osek.h\"\n#include \"acme.h\"\n";
  for (const TypeRow& row : kTypes)
    if (row.home == kOsek)
      source << row.name << " v_" << row.name << ";\n";
  source << "void use(void) {\n  EventMaskRefType r = &v_EventMaskType;\n  (void)r;\n"
            "  v_AccessNameRef = (AccessNameRef)0;\n}\n";
  source.close();
  const std::string command =
      "cc -std=c99 -Wall -Werror -fsyntax-only -I" + dir + " " + dir + "rtos_client.c";
  EXPECT_EQ(std::system(command.c_str()), 0) << command;
}

} // namespace
