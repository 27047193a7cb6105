// The RTOS function server against a sample RTOS description: every catalogue function
// with its signature, file and marks; caching; the OSEK header arriving late; the user's
// function templates with their files; the counter functions and CancelAlarm through the
// call inserter; the memory the server takes; and the printed headers a C compiler reads.
#include "HulCvTools/MultirateCodegenTools/KvCMcgFunctionServer.h"
#include "HulCvTools/MultirateCodegenTools/KvCMcgTypeServer.h"
#include "platform/builder/AppBuilder.h"
#include "platform/icode/KV_BaseTypeServer.h"
#include "platform/icode/KV_Constant.h"
#include "platform/icode/KV_DataType.h"
#include "platform/icode/KV_DataTypeServer.h"
#include "platform/icode/KV_ExprLocation.h"
#include "platform/icode/KV_FunctionSymbolServer.h"
#include "platform/icode/KV_Operation.h"
#include "platform/icode/KV_QualifiedSymbolOp.h"
#include "platform/icode/KV_ScaleServer.h"
#include "platform/icode/KV_SymbolDB.h"
#include "platform/icode/KV_SymbolServer.h"
#include "platform/icode/KvCApplicationServer.h"
#include "platform/icode/KvCCDeclPrinter.h"
#include "platform/icode/KvCCodeViewData.h"
#include "platform/icode/KvCIcFile.h"
#include "platform/icode/KvCIcFileId.h"
#include "platform/icode/KvCIcFileServer.h"
#include "platform/icode/KvCParamSymbol.h"
#include "platform/icode/KvCSmbClassServer.h"
#include "platform/icode/KvCStringExpr.h"
#include "platform/icode/KvCTemplateServer.h"
#include "platform/icode/KvCUnparamSymbol.h"
#include "platform/support/KvCCountingMemController.h"
#include "platform/support/KvCMessageServer.h"
#include "platform/support/KvCSrcRef.h"
#include "platform/view/KvCRoCounter.h"
#include "platform/view/KvCRoDataTypes.h"
#include "platform/view/KvCRoDatabase.h"
#include "platform/view/KvCRoRTOSInfo.h"

#include <gtest/gtest.h>

#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <string>
#include <vector>

namespace {

KvCMessageServer& messages() { return *KvCMessageServer::getMessageServer(); }

using ApiDemand = KvCParamSymbol* (KvCMcgFunctionServer::*)(const KvCSrcRef*);
using UserDemand = KvCParamSymbol* (KvCMcgFunctionServer::*)(int, const KvCSrcRef*);
using UserCount = int (KvCMcgFunctionServer::*)() const;

enum class T {
  Status, Task, EventMask, EventMaskRef, SymbolicName, AccessNameRef, Resource, Alarm, Tick,
  ISRDummy, StandardBase, Void, CounterId, TickPointer
};
enum class S { Standard, Adaptive, Default, DefaultVoid, Tick };
enum Marks : unsigned { kSEF = 1, kTerm = 2, kSched = 4, kAbs = 8, kRel = 16, kCancel = 32 };

struct Param {
  const char* name;
  T type;
  S scaling;
  unsigned flags;
};

struct ApiRow {
  ApiDemand demand;
  const char* name;
  bool inAcme;
  std::vector<Param> params;
  T returnType;
  S returnScaling;
  unsigned marks;
};

const std::vector<ApiRow>& catalogue() {
  using F = KvCMcgFunctionServer;
  static const std::vector<ApiRow> rows = {
      {&F::demandOsekApiActivateTask, "ActivateTask", false, {{"taskId", T::Task, S::Standard, 0x20}},
       T::Status, S::Standard, kSEF},
      {&F::demandOsekApiTerminateTask, "TerminateTask", false, {}, T::Status, S::Standard, kTerm},
      {&F::demandOsekApiGetEvent, "GetEvent", false,
       {{"taskId", T::Task, S::Standard, 0x20}, {"maskRef", T::EventMaskRef, S::Standard, 0}},
       T::Status, S::Standard, kSEF},
      {&F::demandOsekApiSetEvent, "SetEvent", false,
       {{"taskId", T::Task, S::Standard, 0x20}, {"mask", T::EventMask, S::Standard, 0}},
       T::Status, S::Standard, kSEF},
      {&F::demandOsekApiClearEvent, "ClearEvent", false, {{"mask", T::EventMask, S::Standard, 0}},
       T::Status, S::Standard, kSEF},
      {&F::demandOsekApiWaitEvent, "WaitEvent", false,
       {{"mask", T::EventMask, S::Standard, 0x20}}, T::Status, S::Standard, kSEF},
      {&F::demandOsekApiSendMessage, "SendMessage", false,
       {{"message", T::SymbolicName, S::Standard, 0x20},
        {"dataRef", T::AccessNameRef, S::Standard, 0}},
       T::Status, S::Standard, kSEF},
      {&F::demandOsekApiReceiveMessage, "ReceiveMessage", false,
       {{"message", T::SymbolicName, S::Standard, 0x20},
        {"dataRef", T::AccessNameRef, S::Standard, 0}},
       T::Status, S::Standard, kSEF},
      {&F::demandOsekApiGetResource, "GetResource", false,
       {{"resId", T::Resource, S::Standard, 0}}, T::Status, S::Standard, kSEF},
      {&F::demandOsekApiReleaseResource, "ReleaseResource", false,
       {{"resId", T::Resource, S::Standard, 0}}, T::Status, S::Standard, kSEF},
      {&F::demandOsekApiDisableAllInterrupts, "DisableAllInterrupts", false, {}, T::Void,
       S::DefaultVoid, kSEF},
      {&F::demandOsekApiEnableAllInterrupts, "EnableAllInterrupts", false, {}, T::Void,
       S::DefaultVoid, kSEF},
      {&F::demandOsekApiSuspendAllInterrupts, "SuspendAllInterrupts", false, {}, T::Void,
       S::DefaultVoid, kSEF},
      {&F::demandOsekApiResumeAllInterrupts, "ResumeAllInterrupts", false, {}, T::Void,
       S::DefaultVoid, kSEF},
      {&F::demandOsekApiSuspendOSInterrupts, "SuspendOSInterrupts", false, {}, T::Void,
       S::DefaultVoid, kSEF},
      {&F::demandOsekApiResumeOSInterrupts, "ResumeOSInterrupts", false, {}, T::Void,
       S::DefaultVoid, kSEF},
      {&F::demandOsekApiSetAbsAlarm, "SetAbsAlarm", false,
       {{"alarmId", T::Alarm, S::Adaptive, 0x20}, {"start", T::Tick, S::Adaptive, 0x20},
        {"cycle", T::Tick, S::Adaptive, 0x20}},
       T::Status, S::Standard, kSEF | kAbs},
      {&F::demandOsekApiSetRelAlarm, "SetRelAlarm", false,
       {{"alarmId", T::Alarm, S::Adaptive, 0x20}, {"increment", T::Tick, S::Adaptive, 0x20},
        {"cycle", T::Tick, S::Adaptive, 0x20}},
       T::Status, S::Standard, kSEF | kRel},
      {&F::demandOsekApiSchedule, "Schedule", false, {}, T::Void, S::DefaultVoid, kSched},
      {&F::demandStartISRDummy, "StartISRDummy", true, {{"isrId", T::ISRDummy, S::Standard, 0x20}},
       T::StandardBase, S::Standard, kSEF},
  };
  return rows;
}

unsigned marksOf(const KvCSymbol* s) {
  return (s->isSideEffectFreeFunction() ? kSEF : 0u) | (s->isTerminateTaskSymbol() ? kTerm : 0u) |
         (s->isRtosScheduleFcn() ? kSched : 0u) | (s->isSetAbsAlarmFunction() ? kAbs : 0u) |
         (s->isSetRelAlarmFunction() ? kRel : 0u) | (s->isCancelAlarmFunction() ? kCancel : 0u);
}

struct UserRow {
  UserDemand demand;
  UserCount count;
  tagKvEFunctionTplKey key;
  const char* keyText;
};

const UserRow kUserRows[] = {
    {&KvCMcgFunctionServer::demandUserDefinedEnterCriticalSection,
     &KvCMcgFunctionServer::getNrOfActualUserDefinedEnterCSParams,
     KV_FCN_TPL_ENTER_CRITICAL_SECTION, "KvEnterCriticalSection"},
    {&KvCMcgFunctionServer::demandUserDefinedLeaveCriticalSection,
     &KvCMcgFunctionServer::getNrOfActualUserDefinedLeaveCSParams,
     KV_FCN_TPL_LEAVE_CRITICAL_SECTION, "KvLeaveCriticalSection"},
    {&KvCMcgFunctionServer::demandUserDefinedLockMessage,
     &KvCMcgFunctionServer::getNrOfActualUserDefinedLockMessageParams, KV_FCN_TPL_LOCK_MESSAGE,
     "KvLockMessage"},
    {&KvCMcgFunctionServer::demandUserDefinedUnlockMessage,
     &KvCMcgFunctionServer::getNrOfActualUserDefinedUnlockMessageParams,
     KV_FCN_TPL_UNLOCK_MESSAGE, "KvUnlockMessage"},
};

class McgFunctionServerTest : public ::testing::Test {
protected:
  void SetUp() override {
    messages().clear();
    app.data().setRtosDatabase(&rtos);
    KvCRoRTOSInfo* info = rtos.demandRTOSInfo();
    info->setOSName("SampleOS");
    KvCRoDataTypes* dt = info->getDataTypes();
    dt->setStatusType("UInt8", "status of an API call");
    dt->setTaskType("UInt8", "task identifier");
    dt->setEventMaskType("UInt32", "event mask");
    dt->setSymbolicName("UInt16", "symbolic name");
    dt->setResourceType("UInt8", "resource identifier");
    dt->setAlarmType("UInt8", "alarm identifier");
    dt->setTickType("UInt32", "counter ticks");
    dt->setAccessNameRefDescription("reference to message data");
    dt->setKvCounterTypeBaseType("UInt16");
  }
  void TearDown() override { messages().clear(); }

  bool boot(KvCMcgFunctionServer& s, bool active = true) {
    types.bootPhaseOne(&app.data(), factories(), &rtos, active);
    if (!types.bootPhaseTwo())
      return false;
    s.bootPhaseOne(&app.data(), factories(), &types, &rtos, active);
    return s.bootPhaseTwo();
  }
  bool boot() { return boot(server); }

  KV_ICodeFactoryContainer* factories() { return app.data().getFactoryContainer(); }
  KV_FunctionSymbolServer* functions() { return app.data().getSymbolServer()->getFunction(); }
  KV_ScaleServer* scales() { return app.data().getScalingServer(); }
  KvCIcFile* file(const char* name) { return app.data().getFileServer()->demandFile(name)->getFile(); }
  KvCFunctionTemplate* tpl(tagKvEFunctionTplKey key) {
    return app.data().getTemplateServer()->getFunctionTemplateServer()->demandTemplate(key);
  }
  KvCFcnClassId* plainClass() {
    return app.data().getSmbClassServer()->getFcnClassServer()->createFcnClass("user", nullptr);
  }
  // Every user template defined, with a class without file and the code file rtos_user.c.
  void defineUserTemplates() {
    KvCFcnClassId* cls = plainClass();
    tpl(KV_FCN_TPL_TRIGGER_TASK)->setUserDefault("UserTriggerTask", cls, "rtos_user.c");
    for (const UserRow& row : kUserRows)
      tpl(row.key)->setUserDefault(WmCXString("User") + row.keyText, cls, "rtos_user.c");
  }

  KV_DataType* expectedType(T t) {
    switch (t) {
    case T::Status: return types.demandStatusType(nullptr);
    case T::Task: return types.demandTaskType(nullptr);
    case T::EventMask: return types.demandEventMaskType(nullptr);
    case T::EventMaskRef: return types.demandEventMaskRefType(nullptr);
    case T::SymbolicName: return types.demandSymbolicNameType(nullptr);
    case T::AccessNameRef: return types.demandAccessNameRefType(nullptr);
    case T::Resource: return types.demandResourceType(nullptr);
    case T::Alarm: return types.demandAlarmType(nullptr);
    case T::Tick: return types.demandTickType(nullptr);
    case T::ISRDummy: return types.demandISRDummyType(nullptr);
    case T::StandardBase: return types.getStandardBaseType();
    case T::Void: return app.data().getBaseTypeServer()->getVoid();
    case T::CounterId: return types.demandCounterIDType();
    case T::TickPointer:
      return app.data().getDataTypeServer()->demandPointerType(types.demandTickType(nullptr), false);
    }
    return nullptr;
  }
  KV_Scaling* expectedScaling(S s, KV_Scaling* tick = nullptr) {
    switch (s) {
    case S::Standard: return types.getStandardScaling();
    case S::Adaptive: return scales()->getAdaptiveScaling();
    case S::Default: return scales()->getDefaultScaling();
    case S::DefaultVoid: return scales()->getDefaultVoidScaling();
    case S::Tick: return tick;
    }
    return nullptr;
  }
  void expectSignature(KvCParamSymbol* fn, const std::vector<Param>& params, T returnType,
                       S returnScaling, KV_Scaling* tick = nullptr) {
    ASSERT_NE(fn, nullptr);
    ASSERT_TRUE(fn->hasSignature());
    EXPECT_EQ(fn->getDataType(), expectedType(returnType));
    EXPECT_EQ(fn->getScaling(), expectedScaling(returnScaling, tick));
    ASSERT_EQ(fn->getNumberOfFormalParams(), static_cast<int>(params.size()));
    for (int i = 0; i < fn->getNumberOfFormalParams(); ++i) {
      SCOPED_TRACE(params[i].name);
      const KvCParamSymbol::FormalParam& p = fn->getFormalParam(i);
      EXPECT_EQ(p.name.str(), params[i].name);
      EXPECT_EQ(p.type, expectedType(params[i].type));
      EXPECT_EQ(p.scaling, expectedScaling(params[i].scaling, tick));
      EXPECT_EQ(p.flags, params[i].flags);
    }
  }
  std::vector<std::string> messageTexts() {
    std::vector<std::string> texts;
    for (const KvCMessageRecord& m : messages().getMessages())
      texts.push_back(std::to_string(m.number) + " " + m.text.str());
    return texts;
  }

  AppBuilder app;
  KvCRoDatabase rtos{&app.data()};
  KvCMcgTypeServer types;
  KvCMcgFunctionServer server;
};

TEST_F(McgFunctionServerTest, EveryCatalogueFunctionHasItsSignatureFileAndMarks) {
  ASSERT_TRUE(boot());
  EXPECT_EQ(server.getOsekApiActivateTask(), nullptr);
  EXPECT_EQ(server.getOsekApiSetEvent(), nullptr);
  for (const ApiRow& row : catalogue()) {
    SCOPED_TRACE(row.name);
    KvCParamSymbol* fn = (server.*row.demand)(nullptr);
    ASSERT_NE(fn, nullptr);
    EXPECT_EQ(fn->getName().str(), row.name);
    KvCIcFile* home = file(row.inAcme ? "acme.h" : "osek.h");
    EXPECT_EQ(functions()->find(home->getStt(), row.name), fn) << "declared in its header";
    EXPECT_EQ(fn->getSymbolFlags(), 0x800000u);
    EXPECT_EQ(fn->getFcnClassId(),
              app.data().getSmbClassServer()->getFcnClassServer()->demandFcnClass(nullptr));
    expectSignature(fn, row.params, row.returnType, row.returnScaling);
    EXPECT_EQ(marksOf(fn), row.marks);
    const int symbolDemands = functions()->getNumberOfDemands();
    const int headerDemands = rtos.getNumberOfOsekHFileDemands();
    EXPECT_EQ((server.*row.demand)(nullptr), fn);
    EXPECT_EQ(functions()->getNumberOfDemands(), symbolDemands) << "a cached symbol asks nothing";
    EXPECT_EQ(rtos.getNumberOfOsekHFileDemands(), headerDemands);
  }
  EXPECT_EQ(server.getOsekApiActivateTask()->getName().str(), "ActivateTask");
  EXPECT_EQ(server.getOsekApiSetEvent()->getName().str(), "SetEvent");
  EXPECT_TRUE(messageTexts().empty());
}

TEST_F(McgFunctionServerTest, WithoutTheOsekHeaderDemandsWaitAndCacheNothing) {
  rtos.setOsekHFileAvailable(false);
  ASSERT_TRUE(boot());
  EXPECT_EQ(server.demandOsekHFileID(nullptr), nullptr);
  for (const ApiRow& row : catalogue())
    EXPECT_EQ((server.*row.demand)(nullptr) == nullptr, !row.inAcme) << row.name;
  EXPECT_EQ(server.demandOsekApiCancelAlarm(nullptr), nullptr);
  KvCRoCounter* counter = rtos.createCounter("Ctr", 0.0);
  rtos.demandRTOSInfo()->getCounterAPI()->setInitCounterFcn("Init_$(CounterName)", 1);
  leda::array<KV_ExprLocation*> actuals(3);
  EXPECT_EQ(server.demandExtOsekApiInitCounter(nullptr, counter, actuals), nullptr);
  EXPECT_EQ(actuals.size(), 3) << "left as it was";
  EXPECT_EQ(server.getOsekApiActivateTask(), nullptr);
  EXPECT_TRUE(messageTexts().empty()) << "a missing header is no fault of the server";
  rtos.setOsekHFileAvailable(true);
  EXPECT_EQ(server.demandOsekHFileID(nullptr), file("osek.h")->getFileId());
  for (const ApiRow& row : catalogue())
    EXPECT_NE((server.*row.demand)(nullptr), nullptr) << row.name;
  EXPECT_NE(server.getOsekApiActivateTask(), nullptr);
}

TEST_F(McgFunctionServerTest, ModelRefusalsAreReportedAndNothingIsCached) {
  ASSERT_TRUE(boot());
  // A SetEvent with another signature in the OSEK header: the symbol server refuses.
  leda::array<KV_DataType*> t(0);
  leda::array<KV_Scaling*> s(0);
  leda::array<WmCXString> n(0);
  unsigned int flag = 0;
  ASSERT_NE(functions()->demand(file("osek.h")->getStt(), "SetEvent", 0, types.demandStatusType(nullptr),
                                nullptr, t, s, n, &flag, nullptr, nullptr, nullptr),
            nullptr);
  EXPECT_EQ(server.demandOsekApiSetEvent(nullptr), nullptr);
  EXPECT_EQ(server.getOsekApiSetEvent(), nullptr);
  ASSERT_EQ(messageTexts().size(), 1u);
  EXPECT_NE(messageTexts()[0].find("KvCMcgFunctionServer 2403"), std::string::npos)
      << messageTexts()[0];
  // A type the type server cannot make: reported, null, and made once the RTOS is right.
  messages().clear();
  rtos.demandRTOSInfo()->getDataTypes()->setAlarmType("NoSuchBase", "alarm identifier");
  EXPECT_EQ(server.demandOsekApiSetRelAlarm(nullptr), nullptr);
  const std::vector<std::string> texts = messageTexts();
  ASSERT_EQ(texts.size(), 2u);
  EXPECT_NE(texts[1].find("KvCMcgFunctionServer 2401"), std::string::npos) << texts[1];
  rtos.demandRTOSInfo()->getDataTypes()->setAlarmType("UInt8", "alarm identifier");
  EXPECT_NE(server.demandOsekApiSetRelAlarm(nullptr), nullptr);
  // A server that never ran phase two follows no null.
  KvCMcgFunctionServer unbooted;
  messages().clear();
  EXPECT_EQ(unbooted.demandOsekApiSchedule(nullptr), nullptr);
  EXPECT_EQ(unbooted.demandUserDefinedTriggerTask(nullptr), nullptr);
  EXPECT_EQ(unbooted.demandOsekApiCancelAlarm(nullptr), nullptr);
  EXPECT_EQ(messageTexts().size(), 3u);
}

TEST_F(McgFunctionServerTest, UserDefinedFunctionsComeFromTheirTemplates) {
  defineUserTemplates();
  ASSERT_TRUE(boot());
  KvCParamSymbol* trigger = server.demandUserDefinedTriggerTask(nullptr);
  ASSERT_NE(trigger, nullptr);
  EXPECT_EQ(trigger->getName().str(), "UserTriggerTask");
  expectSignature(trigger, {{"TaskID", T::StandardBase, S::Standard, 0x20}}, T::Void,
                  S::DefaultVoid);
  EXPECT_EQ(server.getUserDefinedTriggerTask(), trigger);
  KvCIcFile* code = file("rtos_user.c");
  EXPECT_EQ(functions()->find(code->getStt(), "UserTriggerTask"), trigger);
  for (const UserRow& row : kUserRows) {
    SCOPED_TRACE(row.keyText);
    EXPECT_EQ((server.*row.count)(), 0);
    KvCParamSymbol* fn = (server.*row.demand)(2, nullptr);
    ASSERT_NE(fn, nullptr);
    EXPECT_EQ(fn->getName().str(), std::string("User") + row.keyText);
    EXPECT_EQ(functions()->find(code->getStt(), fn->getName()), fn);
    expectSignature(fn, {{"Param0", T::StandardBase, S::Standard, 0}, {"Param1", T::StandardBase, S::Standard, 0}},
                    T::Void, S::DefaultVoid);
    EXPECT_EQ(marksOf(fn), static_cast<unsigned>(kSEF));
    const int demands = functions()->getNumberOfDemands();
    EXPECT_EQ((server.*row.demand)(2, nullptr), fn);
    EXPECT_EQ(functions()->getNumberOfDemands(), demands);
    messages().clear();
    KvCSrcRef where;
    EXPECT_EQ((server.*row.demand)(3, &where), nullptr);
    ASSERT_EQ(messages().getMessages().size(), 1u);
    EXPECT_EQ(messages().getMessages()[0].number, 30179);
    EXPECT_EQ(messages().getMessages()[0].srcRef, &where);
    EXPECT_NE(messageTexts()[0].find(fn->getName().str()), std::string::npos) << messageTexts()[0];
    EXPECT_EQ((server.*row.count)(), 2) << "the first count stays";
    EXPECT_EQ((server.*row.demand)(2, nullptr), fn);
  }
  // Both files of the template are kept from being written.
  EXPECT_TRUE(code->isMarkedAsDoNotEmitCauseSpecialFunctionTempl());
  EXPECT_TRUE(file("rtos_user.h")->isMarkedAsDoNotEmitCauseSpecialFunctionTempl());
  // A fresh server over the same run: the count conflicts with the function in the file.
  KvCMcgFunctionServer second;
  ASSERT_TRUE(boot(second));
  messages().clear();
  EXPECT_EQ(second.demandUserDefinedEnterCriticalSection(3, nullptr), nullptr);
  EXPECT_EQ(messageTexts().size(), 1u);
  EXPECT_EQ(messages().getMessages()[0].number, 30179);
  EXPECT_EQ(second.getNrOfActualUserDefinedEnterCSParams(), 0);
  EXPECT_EQ(second.demandUserDefinedEnterCriticalSection(2, nullptr),
            server.demandUserDefinedEnterCriticalSection(2, nullptr));
}

TEST_F(McgFunctionServerTest, UserDefinedFunctionWithoutParameters) {
  defineUserTemplates();
  ASSERT_TRUE(boot());
  KvCParamSymbol* fn = server.demandUserDefinedLockMessage(0, nullptr);
  expectSignature(fn, {}, T::Void, S::DefaultVoid);
  EXPECT_EQ(server.getNrOfActualUserDefinedLockMessageParams(), 0);
  EXPECT_EQ(server.demandUserDefinedLockMessage(1, nullptr), nullptr);
}

TEST_F(McgFunctionServerTest, TemplateProblemsGiveNullWithTheirReports) {
  ASSERT_TRUE(boot());
  // No user default: 30243 with the key's text, for each function.
  KvCSrcRef where;
  EXPECT_EQ(server.demandUserDefinedTriggerTask(&where), nullptr);
  for (const UserRow& row : kUserRows)
    EXPECT_EQ((server.*row.demand)(1, &where), nullptr);
  std::vector<std::string> texts = messageTexts();
  ASSERT_EQ(texts.size(), 5u);
  const char* keys[] = {"KvTriggerTask", "KvEnterCriticalSection", "KvLeaveCriticalSection",
                        "KvLockMessage", "KvUnlockMessage"};
  for (int i = 0; i < 5; ++i) {
    EXPECT_EQ(messages().getMessages()[i].number, 30243);
    EXPECT_EQ(messages().getMessages()[i].srcRef, &where);
    EXPECT_NE(texts[i].find(keys[i]), std::string::npos) << texts[i];
  }
  EXPECT_EQ(server.getNrOfActualUserDefinedEnterCSParams(), 0);
  // Neither class file nor code file: check 2339, null, and no function made anywhere.
  messages().clear();
  tpl(KV_FCN_TPL_TRIGGER_TASK)->setUserDefault("UserTriggerTask", plainClass(), "");
  const int demands = functions()->getNumberOfDemands();
  EXPECT_EQ(server.demandUserDefinedTriggerTask(nullptr), nullptr);
  texts = messageTexts();
  ASSERT_EQ(texts.size(), 1u);
  EXPECT_NE(texts[0].find("KvCMcgFunctionServer 2339"), std::string::npos) << texts[0];
  EXPECT_EQ(functions()->getNumberOfDemands(), demands);
  // A code file the application server cannot make: null, no message; later it works.
  messages().clear();
  tpl(KV_FCN_TPL_TRIGGER_TASK)->setUserDefault("UserTriggerTask", plainClass(), "rtos_user.c");
  app.data().getApplServer()->setCgOwnedCFileFails(true);
  EXPECT_EQ(server.demandUserDefinedTriggerTask(nullptr), nullptr);
  EXPECT_TRUE(messageTexts().empty());
  app.data().getApplServer()->setCgOwnedCFileFails(false);
  EXPECT_NE(server.demandUserDefinedTriggerTask(nullptr), nullptr);
  // An empty function name: null.
  tpl(KV_FCN_TPL_UNLOCK_MESSAGE)->setUserDefault("", plainClass(), "rtos_user.c");
  EXPECT_EQ(server.demandUserDefinedUnlockMessage(1, nullptr), nullptr);
  EXPECT_EQ(server.getNrOfActualUserDefinedUnlockMessageParams(), 0);
}

TEST_F(McgFunctionServerTest, ClassFileWinsAndNeverAsksTheApplicationServer) {
  KvCIcFileId* classFile = app.data().getFileServer()->demandFile("class_code.c");
  classFile->getFile()->markAsForceEmit();
  KvCFcnClassId* cls =
      app.data().getSmbClassServer()->getFcnClassServer()->createFcnClass("placed", classFile);
  tpl(KV_FCN_TPL_ENTER_CRITICAL_SECTION)->setUserDefault("EnterCS", cls, "ignored.c");
  ASSERT_TRUE(boot());
  KvCParamSymbol* fn = server.demandUserDefinedEnterCriticalSection(1, nullptr);
  ASSERT_NE(fn, nullptr);
  EXPECT_EQ(functions()->find(classFile->getFile()->getStt(), "EnterCS"), fn);
  EXPECT_EQ(fn->getFcnClassId(), cls);
  EXPECT_EQ(app.data().getApplServer()->getNumberOfCgOwnedCFileDemands(), 0);
  EXPECT_TRUE(messageTexts().empty());
  EXPECT_FALSE(classFile->getFile()->isMarkedAsDoNotEmitCauseSpecialFunctionTempl());
}

TEST_F(McgFunctionServerTest, ForceEmitFilesAreReportedOnceAndBothAreMarked) {
  struct Case {
    bool cForced, hForced;
    int expectedFrom; // 0: no message, 1: the C file's reference, 2: the header's
  };
  const Case cases[] = {{false, false, 0}, {true, false, 1}, {false, true, 2}, {true, true, 1}};
  for (const Case& c : cases) {
    SCOPED_TRACE(std::to_string(c.cForced) + std::to_string(c.hForced));
    AppBuilder local;
    KvCRoDatabase localRtos(&local.data());
    local.data().setRtosDatabase(&localRtos);
    KvCIcFileServer* files = local.data().getFileServer();
    KvCSrcRef cRef, hRef;
    KvCIcFileId* cFile = files->demandFile("tpl_code.c");
    KvCIcFileId* hFile = files->demandFile("tpl_code.h");
    cFile->getFile()->setSourceRef(&cRef);
    hFile->getFile()->setSourceRef(&hRef);
    if (c.cForced)
      cFile->getFile()->markAsForceEmit();
    if (c.hForced)
      hFile->getFile()->markAsForceEmit();
    KvCFcnClassId* cls =
        local.data().getSmbClassServer()->getFcnClassServer()->createFcnClass("user", nullptr);
    local.data().getTemplateServer()->getFunctionTemplateServer()
        ->demandTemplate(KV_FCN_TPL_TRIGGER_TASK)->setUserDefault("Trigger", cls, "tpl_code.c");
    KvCMcgTypeServer localTypes;
    localTypes.bootPhaseOne(&local.data(), local.data().getFactoryContainer(), &localRtos, true);
    ASSERT_TRUE(localTypes.bootPhaseTwo());
    KvCMcgFunctionServer localServer;
    localServer.bootPhaseOne(&local.data(), local.data().getFactoryContainer(), &localTypes,
                             &localRtos, true);
    ASSERT_TRUE(localServer.bootPhaseTwo());
    messages().clear();
    EXPECT_NE(localServer.demandUserDefinedTriggerTask(nullptr), nullptr);
    const auto& got = messages().getMessages();
    if (c.expectedFrom == 0) {
      EXPECT_TRUE(got.empty());
    } else {
      ASSERT_EQ(got.size(), 1u);
      EXPECT_EQ(got[0].number, 32300);
      EXPECT_EQ(got[0].srcRef, c.expectedFrom == 1 ? &cRef : &hRef);
      EXPECT_NE(got[0].text.str().find("KvTriggerTask"), std::string::npos) << got[0].text.str();
    }
    EXPECT_TRUE(cFile->getFile()->isMarkedAsDoNotEmitCauseSpecialFunctionTempl());
    EXPECT_TRUE(hFile->getFile()->isMarkedAsDoNotEmitCauseSpecialFunctionTempl());
  }
}

// What a counter demand is expected to make, and the actual arguments it gives back.
enum class Arg { CounterName, Zero, ResultRef };

struct CounterRow {
  const char* title;
  int variant; // 0 init, 1 init from ISR, 2 get value, 3 get value from ISR
  int kind;
  std::vector<Param> params;
  T returnType;
  S returnScaling;
  std::vector<Arg> actuals;
};

TEST_F(McgFunctionServerTest, CounterFunctionsFollowTheirKind) {
  const unsigned kIn = 0x1;   // read
  const unsigned kOut = 0x7;  // read, written, by reference
  const std::vector<CounterRow> rows = {
      {"init 1", 0, 1, {{"p0", T::CounterId, S::Default, kIn}, {"p1", T::Tick, S::Adaptive, kIn}},
       T::Status, S::Default, {Arg::CounterName, Arg::Zero}},
      {"init 2", 0, 2, {{"p0", T::Tick, S::Adaptive, kIn}}, T::Status, S::Default, {Arg::Zero}},
      {"init ISR 1", 1, 1, {{"p0", T::CounterId, S::Default, kIn}, {"p1", T::Tick, S::Default, kIn}},
       T::Status, S::Default, {Arg::CounterName, Arg::Zero}},
      {"init ISR 2", 1, 2, {{"p0", T::Tick, S::Default, kIn}}, T::Status, S::Default, {Arg::Zero}},
      {"get 6", 2, 6, {{"p0", T::CounterId, S::Default, kIn}, {"p1", T::TickPointer, S::Tick, kOut}},
       T::Status, S::Tick, {Arg::CounterName, Arg::ResultRef}},
      {"get 7", 2, 7, {}, T::Tick, S::Tick, {}},
      {"get ISR 6", 3, 6, {{"p0", T::CounterId, S::Default, kIn}, {"p1", T::TickPointer, S::Tick, kOut}},
       T::Status, S::Tick, {Arg::CounterName, Arg::ResultRef}},
      {"get ISR 7", 3, 7, {}, T::Tick, S::Tick, {}},
  };
  for (double tickDuration : {0.0, 0.001}) {
    for (const CounterRow& row : rows) {
      SCOPED_TRACE(std::string(row.title) + " tick " + std::to_string(tickDuration));
      AppBuilder local;
      KvCRoDatabase localRtos(&local.data());
      // A fresh model per row: the name form gives every row the same function name.
      local.data().setRtosDatabase(&localRtos);
      localRtos.demandRTOSInfo()->setOSName("SampleOS");
      KvCRoDataTypes* dt = localRtos.demandRTOSInfo()->getDataTypes();
      dt->setStatusType("UInt8", "status");
      dt->setTickType("UInt32", "ticks");
      dt->setKvCounterTypeBaseType("UInt16");
      KvCRoCounterAPI* api = localRtos.demandRTOSInfo()->getCounterAPI();
      const char* form = "Ctr_$(CounterName)_Fcn";
      if (row.variant == 0)
        api->setInitCounterFcn(form, row.kind);
      else if (row.variant == 1)
        api->setInitCounterFromISRFcn(form, row.kind);
      else
        api->setGetCounterValueFcn(form, row.kind);
      KvCRoCounter* counter = localRtos.createCounter("Main Counter", tickDuration);
      KvCUnparamSymbol* result =
          local.data().getSymbolDB()->createUnparamSymbol("ticksNow", nullptr, false);
      KvCMcgTypeServer localTypes;
      localTypes.bootPhaseOne(&local.data(), local.data().getFactoryContainer(), &localRtos, true);
      ASSERT_TRUE(localTypes.bootPhaseTwo());
      KvCMcgFunctionServer s;
      s.bootPhaseOne(&local.data(), local.data().getFactoryContainer(), &localTypes, &localRtos,
                     true);
      ASSERT_TRUE(s.bootPhaseTwo());
      messages().clear();
      leda::array<KV_ExprLocation*> actuals(5);
      KvCParamSymbol* fn = nullptr;
      switch (row.variant) {
      case 0: fn = s.demandExtOsekApiInitCounter(nullptr, counter, actuals); break;
      case 1: fn = s.demandExtOsekApiInitCounterFromISR(nullptr, counter, actuals); break;
      case 2: fn = s.demandExtOsekApiGetCounterValue(nullptr, counter, result, actuals); break;
      default: fn = s.demandExtOsekApiGetCounterValueFromISR(nullptr, counter, result, actuals);
      }
      ASSERT_NE(fn, nullptr);
      EXPECT_TRUE(messageTexts().empty());
      EXPECT_EQ(fn->getName().str(), "Ctr_Main_Counter_Fcn");
      KvCIcFile* osek = local.data().getFileServer()->findFile("osek.h")->getFile();
      EXPECT_EQ(local.data().getSymbolServer()->getFunction()->find(osek->getStt(), fn->getName()), fn);
      // Expected types and scalings from the local servers.
      KV_ScaleServer* sc = local.data().getScalingServer();
      KV_Scaling* tick = tickDuration > 0.0 ? sc->getScaling(0.001, 0.0, nullptr) : sc->getDefaultScaling();
      auto typeOf = [&](T t) -> KV_DataType* {
        switch (t) {
        case T::Status: return localTypes.demandStatusType(nullptr);
        case T::Tick: return localTypes.demandTickType(nullptr);
        case T::CounterId: return localTypes.demandCounterIDType();
        case T::TickPointer:
          return local.data().getDataTypeServer()->demandPointerType(localTypes.demandTickType(nullptr), false);
        default: return nullptr;
        }
      };
      auto scalingOf = [&](S k) -> KV_Scaling* {
        switch (k) {
        case S::Adaptive: return sc->getAdaptiveScaling();
        case S::Default: return sc->getDefaultScaling();
        case S::Tick: return tick;
        default: return nullptr;
        }
      };
      EXPECT_EQ(fn->getDataType(), typeOf(row.returnType));
      EXPECT_EQ(fn->getScaling(), scalingOf(row.returnScaling));
      ASSERT_EQ(fn->getNumberOfFormalParams(), static_cast<int>(row.params.size()));
      for (int i = 0; i < fn->getNumberOfFormalParams(); ++i) {
        EXPECT_EQ(fn->getFormalParam(i).type, typeOf(row.params[i].type)) << i;
        EXPECT_EQ(fn->getFormalParam(i).scaling, scalingOf(row.params[i].scaling)) << i;
        EXPECT_EQ(fn->getFormalParam(i).flags, row.params[i].flags) << i;
      }
      ASSERT_EQ(actuals.size(), static_cast<int>(row.actuals.size()));
      EXPECT_EQ(actuals.low(), 0);
      for (int i = 0; i < actuals.size(); ++i) {
        ASSERT_NE(actuals[i], nullptr);
        KvCIcExpression* e = actuals[i]->getExpression();
        ASSERT_NE(e, nullptr);
        switch (row.actuals[i]) {
        case Arg::CounterName:
          ASSERT_NE(e->asStringExpr(), nullptr);
          EXPECT_EQ(e->asStringExpr()->getString().str(), "Main_Counter");
          break;
        case Arg::Zero:
          ASSERT_NE(e->asConstant(), nullptr);
          EXPECT_EQ(e->asConstant()->getIntValue(), 0);
          break;
        case Arg::ResultRef: {
          KV_Operation* op = actuals[i]->getOperation();
          ASSERT_NE(op, nullptr);
          EXPECT_EQ(op->getOperator()->getKind(), KV_OP_ADDRESS_OF);
          KvCIcExpression* target = op->getOperand(0)->getExpression();
          ASSERT_NE(target->asQualifiedSymbolOp(), nullptr);
          EXPECT_EQ(target->asQualifiedSymbolOp()->getSymbol(), result);
          break;
        }
        }
      }
    }
  }
}

TEST_F(McgFunctionServerTest, MissingOrUnknownCounterFunctionsAreReported) {
  ASSERT_TRUE(boot());
  KvCRoCounter* counter = rtos.createCounter("Ctr", 0.0);
  KvCUnparamSymbol* result = app.data().getSymbolDB()->createUnparamSymbol("v", nullptr, false);
  KvCRoCounterAPI* api = rtos.demandRTOSInfo()->getCounterAPI();
  struct Case {
    const char* title;
    int initKind, isrKind, getKind; // 0: the RTOS does not offer it
  };
  const Case cases[] = {{"none offered", 0, 0, 0}, {"unknown kinds", 6, 7, 1}};
  for (const Case& c : cases) {
    SCOPED_TRACE(c.title);
    api->removeInitCounterFcn();
    api->removeInitCounterFromISRFcn();
    api->removeGetCounterValueFcn();
    if (c.initKind)
      api->setInitCounterFcn("I_$(CounterName)", c.initKind);
    if (c.isrKind)
      api->setInitCounterFromISRFcn("J_$(CounterName)", c.isrKind);
    if (c.getKind)
      api->setGetCounterValueFcn("G_$(CounterName)", c.getKind);
    messages().clear();
    KvCSrcRef where;
    leda::array<KV_ExprLocation*> actuals(4);
    EXPECT_EQ(server.demandExtOsekApiInitCounter(&where, counter, actuals), nullptr);
    EXPECT_EQ(server.demandExtOsekApiInitCounterFromISR(&where, counter, actuals), nullptr);
    EXPECT_EQ(server.demandExtOsekApiGetCounterValue(&where, counter, result, actuals), nullptr);
    EXPECT_EQ(server.demandExtOsekApiGetCounterValueFromISR(&where, counter, result, actuals),
              nullptr);
    EXPECT_EQ(actuals.size(), 4) << "left as it was";
    const auto& got = messages().getMessages();
    ASSERT_EQ(got.size(), 4u);
    const int numbers[] = {21274, 21274, 21272, 21273};
    for (int i = 0; i < 4; ++i) {
      EXPECT_EQ(got[static_cast<std::size_t>(i)].number, numbers[i]);
      EXPECT_EQ(got[static_cast<std::size_t>(i)].srcRef, &where);
      EXPECT_NE(got[static_cast<std::size_t>(i)].text.str().find("SampleOS"), std::string::npos);
    }
  }
}

TEST_F(McgFunctionServerTest, CancelAlarmIsFoundAgainAndMarkedEachTime) {
  ASSERT_TRUE(boot());
  KvCParamSymbol* cancel = server.demandOsekApiCancelAlarm(nullptr);
  ASSERT_NE(cancel, nullptr);
  EXPECT_EQ(cancel->getName().str(), "CancelAlarm");
  EXPECT_EQ(functions()->find(file("osek.h")->getStt(), "CancelAlarm"), cancel);
  expectSignature(cancel, {{"p0", T::CounterId, S::Default, 0x1}}, T::Status, S::Default);
  EXPECT_EQ(marksOf(cancel), static_cast<unsigned>(kCancel));
  const int demands = functions()->getNumberOfDemands();
  EXPECT_EQ(server.demandOsekApiCancelAlarm(nullptr), cancel);
  EXPECT_EQ(functions()->getNumberOfDemands(), demands + 1) << "not cached: the model is asked";
  EXPECT_TRUE(cancel->isCancelAlarmFunction());
}

// Demands every function the server offers for the sample RTOS (counter API kinds 1 and 6).
std::vector<KvCParamSymbol*> demandEverything(KvCMcgFunctionServer& s, KvCRoCounter* counter,
                                              KvCUnparamSymbol* result) {
  std::vector<KvCParamSymbol*> all;
  for (const ApiRow& row : catalogue())
    all.push_back((s.*row.demand)(nullptr));
  all.push_back(s.demandUserDefinedTriggerTask(nullptr));
  for (const UserRow& row : kUserRows)
    all.push_back((s.*row.demand)(2, nullptr));
  all.push_back(s.demandOsekApiCancelAlarm(nullptr));
  leda::array<KV_ExprLocation*> actuals;
  all.push_back(s.demandExtOsekApiInitCounter(nullptr, counter, actuals));
  all.push_back(s.demandExtOsekApiGetCounterValue(nullptr, counter, result, actuals));
  all.push_back(s.demandExtOsekApiGetCounterValueFromISR(nullptr, counter, result, actuals));
  return all;
}

TEST_F(McgFunctionServerTest, EveryBlockIsGivenBackAfterShutdownAcrossBoots) {
  defineUserTemplates();
  rtos.demandRTOSInfo()->getCounterAPI()->setInitCounterFcn("InitCounter_$(CounterName)", 1);
  rtos.demandRTOSInfo()->getCounterAPI()->setGetCounterValueFcn("GetCounter_$(CounterName)", 6);
  KvCRoCounter* counter = rtos.createCounter("SysCounter", 0.001);
  KvCUnparamSymbol* result = app.data().getSymbolDB()->createUnparamSymbol("now", nullptr, false);
  KvCCountingMemController counting;
  KvCMemController* previous = pKVMemory;
  pKVMemory = &counting;
  std::vector<KvCParamSymbol*> first;
  for (int round = 0; round < 2; ++round) {
    SCOPED_TRACE(round);
    auto* s = new KvCMcgFunctionServer;
    ASSERT_NE(s, nullptr);
    ASSERT_TRUE(boot(*s));
    std::vector<KvCParamSymbol*> all = demandEverything(*s, counter, result);
    for (KvCParamSymbol* fn : all)
      EXPECT_NE(fn, nullptr);
    if (round == 0)
      first = all;
    else
      EXPECT_EQ(all, first) << "a second boot finds the same functions";
    EXPECT_TRUE(s->shutdown());
    delete s;
    EXPECT_EQ(counting.getOutstandingBlocks(), 0u);
  }
  // The server itself and the call inserter's access objects came from the controller.
  // Per round: the server, one access for CancelAlarm and two per counter function.
  EXPECT_EQ(counting.getTotalBlocks(), 2u * (1u + 1u + 3u * 2u));
  // An access object that cannot be had: reported, null, nothing outstanding.
  KvCMcgFunctionServer s;
  ASSERT_TRUE(boot(s));
  counting.failAfter(0);
  messages().clear();
  EXPECT_EQ(s.demandOsekApiCancelAlarm(nullptr), nullptr);
  counting.failAfter(-1);
  EXPECT_EQ(messageTexts().size(), 1u);
  EXPECT_EQ(counting.getOutstandingBlocks(), 0u);
  EXPECT_EQ(counting.getForeignFrees(), 0u);
  pKVMemory = previous;
  EXPECT_EQ(messages().getMessages()[0].number, 10008);
}

TEST_F(McgFunctionServerTest, InactiveServerBootsWithoutTouchingTheModel) {
  KvCMcgFunctionServer s;
  s.bootPhaseOne(&app.data(), factories(), &types, &rtos, false);
  EXPECT_TRUE(s.bootPhaseTwo());
  EXPECT_EQ(app.data().getFileServer()->findFile("acme.h"), nullptr);
  app.data().getFileServer()->setAcmeFilesUnavailable(true);
  KvCMcgFunctionServer t;
  t.bootPhaseOne(&app.data(), factories(), &types, &rtos, true);
  EXPECT_FALSE(t.bootPhaseTwo());
}

// The C text of a type for the client program: named types by name, the rest spelled out.
std::string cType(KV_DataType* type) {
  if (type->getBaseType() && type->isCreateTypedef())
    return type->getName().str();
  if (type->getBaseType())
    return cType(type->getBaseType());
  if (KV_PointerType* p = type->asPointerType())
    return cType(p->getTargetType()) + "*";
  if (KV_NumericalType* n = type->asNumericalType())
    return KvCCDeclPrinter::getCTypeName(n->getBits(), n->isSigned(), n->isFloat());
  return "void";
}

// The printed OSEK header, Acme files and user code file are C that a compiler accepts
// together with a program that calls every function with arguments of the declared types.
TEST_F(McgFunctionServerTest, PrintedHeadersCompileWithCallsOfEveryFunction) {
  if (std::system("command -v cc > /dev/null 2>&1") != 0)
    GTEST_SKIP() << "no C compiler (cc) found";
  defineUserTemplates();
  rtos.demandRTOSInfo()->getCounterAPI()->setInitCounterFcn("InitCounter_$(CounterName)", 1);
  rtos.demandRTOSInfo()->getCounterAPI()->setGetCounterValueFcn("GetCounter_$(CounterName)", 6);
  KvCRoCounter* counter = rtos.createCounter("SysCounter", 0.001);
  KvCUnparamSymbol* result = app.data().getSymbolDB()->createUnparamSymbol("now", nullptr, false);
  ASSERT_TRUE(boot());
  std::vector<KvCParamSymbol*> all = demandEverything(server, counter, result);
  // The two counter readers are one function.
  ASSERT_EQ(all[all.size() - 1], all[all.size() - 2]);
  all.pop_back();
  // A folder of its own: other tests print headers of the same names.
  const std::string dir = ::testing::TempDir() + "mcg_function_server_client/";
  std::filesystem::create_directories(dir);
  const char* printed[][2] = {{"osek.h", "osek.h"},
                              {"acme.h", "acme.h"},
                              {"acme.c", "acme_c.h"},
                              {"rtos_user.c", "rtos_user_c.h"}};
  std::ofstream source(dir + "rtos_api_client.c");
  for (const auto& p : printed) {
    const std::string text =
        KvCCDeclPrinter::printFile(app.data().getFileServer()->findFile(p[0])).str();
    std::ofstream(dir + p[1]) << text;
    source << "#include \"" << p[1] << "\"\n";
  }
  const std::string osek = KvCCDeclPrinter::printFile(file("osek.h")->getFileId()).str();
  EXPECT_NE(osek.find("StatusType SetEvent(TaskType taskId, EventMaskType mask);"), std::string::npos)
      << osek;
  EXPECT_NE(osek.find("void Schedule(void);"), std::string::npos) << osek;
  source << "void callEverything(void) {\n";
  for (KvCParamSymbol* fn : all) {
    ASSERT_NE(fn, nullptr);
    source << "  {\n";
    std::string args;
    for (int i = 0; i < fn->getNumberOfFormalParams(); ++i) {
      const std::string name = "a" + std::to_string(i);
      source << "    " << cType(fn->getFormalParam(i).type) << " " << name << " = 0;\n";
      args += (i ? ", " : "") + name;
    }
    source << "    (void)" << fn->getName().str() << "(" << args << ");\n  }\n";
  }
  source << "}\n";
  source.close();
  const std::string command =
      "cc -std=c99 -Wall -Werror -fsyntax-only -I" + dir + " " + dir + "rtos_api_client.c";
  EXPECT_EQ(std::system(command.c_str()), 0) << command;
}

} // namespace
