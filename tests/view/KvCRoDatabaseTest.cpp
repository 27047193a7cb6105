#include "platform/view/KvCRoDatabase.h"
#include "platform/icode/KvCCodeViewData.h"
#include "platform/icode/KvCIcFileServer.h"
#include "platform/view/KvCIvData.h"
#include "platform/view/KvCRoAlarm.h"
#include "platform/view/KvCRoCounter.h"
#include "platform/view/KvCRoEvent.h"
#include "platform/view/KvCRoMessage.h"
#include "platform/view/KvCRoRTOSInfo.h"
#include "platform/view/KvCRoResource.h"

#include <gtest/gtest.h>

#include <cstddef>
#include <string>

namespace {

TEST(KvCRoDatabaseTest, OsekHeaderFailsThenGivesTheSameFileEveryTime) {
  KvCCodeViewData codeView;
  KvCRoDatabase database(&codeView);
  KvCIcFileServer* files = codeView.getFileServer();
  KvCIcFile* other = files->demandFile("other.h")->getFile();

  database.setOsekHFileAvailable(false);
  KvCIcFile* file = other;
  EXPECT_FALSE(database.demandOsekHFile(file, nullptr));
  EXPECT_EQ(file, nullptr);
  EXPECT_EQ(files->findFile("osek.h"), nullptr) << "a failed demand makes no file";

  database.setOsekHFileAvailable(true);
  ASSERT_TRUE(database.demandOsekHFile(file, nullptr));
  KvCIcFileId* header = files->findFile("osek.h");
  ASSERT_NE(header, nullptr);
  EXPECT_EQ(file, header->getFile());
  EXPECT_NE(file->getStatementTable(), nullptr);

  KvCIcFile* again = other;
  ASSERT_TRUE(database.demandOsekHFile(again, nullptr));
  EXPECT_EQ(again, file);
  EXPECT_EQ(files->getNumberOfFiles(), 2);

  database.setOsekHFileAvailable(false);
  EXPECT_FALSE(database.demandOsekHFile(again, nullptr));
  EXPECT_EQ(again, nullptr);
  EXPECT_EQ(database.getNumberOfOsekHFileDemands(), 4);

  // Another header name gives another file; the first stays in the ICode.
  database.setOsekHFileAvailable(true);
  database.setOsekHFileName("rtos_api.h");
  ASSERT_TRUE(database.demandOsekHFile(again, nullptr));
  EXPECT_EQ(again, files->findFile("rtos_api.h")->getFile());
  EXPECT_EQ(files->findFile("osek.h"), header);
}

TEST(KvCRoDatabaseTest, CodeViewAndIntermediateViewHandOutTheDatabaseTheyWereGiven) {
  KvCCodeViewData codeView;
  KvCIvData ivData;
  EXPECT_EQ(codeView.getRtosDatabase(), nullptr);
  EXPECT_EQ(ivData.getRtosDatabase(), nullptr);
  KvCRoDatabase database(&codeView);
  codeView.setRtosDatabase(&database);
  ivData.setRtosDatabase(&database);
  EXPECT_EQ(codeView.getRtosDatabase(), &database);
  EXPECT_EQ(ivData.getRtosDatabase(), &database);
  EXPECT_EQ(database.demandRTOSInfo(), database.demandRTOSInfo());
  database.demandRTOSInfo()->setOSName("TinyOS");
  EXPECT_EQ(codeView.getRtosDatabase()->demandRTOSInfo()->getOSName().str(), "TinyOS");
}

// Every RTOS type's base type and description answer what was set for that type and for
// no other: each type gets its own texts, then every getter is read back.
TEST(KvCRoDatabaseTest, DataTypesAnswerWhatTheFixtureSetPerType) {
  using Getter = const WmCXString& (KvCRoDataTypes::*)() const;
  using Setter = void (KvCRoDataTypes::*)(const WmCXString&, const WmCXString&);
  struct Row {
    const char* type;
    Setter set;
    Getter baseType;
    Getter description;
  };
  const Row rows[] = {
      {"StatusType", &KvCRoDataTypes::setStatusType, &KvCRoDataTypes::getStatusTypeBaseType,
       &KvCRoDataTypes::getStatusTypeDescription},
      {"TaskType", &KvCRoDataTypes::setTaskType, &KvCRoDataTypes::getTaskTypeBaseType,
       &KvCRoDataTypes::getTaskTypeDescription},
      {"EventMaskType", &KvCRoDataTypes::setEventMaskType,
       &KvCRoDataTypes::getEventMaskTypeBaseType, &KvCRoDataTypes::getEventMaskTypeDescription},
      {"ResourceType", &KvCRoDataTypes::setResourceType, &KvCRoDataTypes::getResourceTypeBaseType,
       &KvCRoDataTypes::getResourceTypeDescription},
      {"AlarmType", &KvCRoDataTypes::setAlarmType, &KvCRoDataTypes::getAlarmTypeBaseType,
       &KvCRoDataTypes::getAlarmTypeDescription},
      {"TickType", &KvCRoDataTypes::setTickType, &KvCRoDataTypes::getTickTypeBaseType,
       &KvCRoDataTypes::getTickTypeDescription},
      {"SymbolicName", &KvCRoDataTypes::setSymbolicName, &KvCRoDataTypes::getSymbolicNameBaseType,
       &KvCRoDataTypes::getSymbolicNameDescription},
  };
  KvCRoDatabase database(nullptr);
  KvCRoRTOSInfo* info = database.demandRTOSInfo();
  const KvCRoDataTypes* types = static_cast<const KvCRoRTOSInfo*>(info)->getDataTypes();
  for (const Row& r : rows) {
    EXPECT_TRUE((types->*r.baseType)().isEmpty()) << r.type;
    EXPECT_TRUE((types->*r.description)().isEmpty()) << r.type;
  }
  EXPECT_TRUE(types->getAccessNameRefDescription().isEmpty());
  EXPECT_TRUE(types->getKvCounterTypeBaseType().isEmpty());

  for (const Row& r : rows)
    (info->getDataTypes()->*r.set)(WmCXString("base of ") + r.type, WmCXString("about ") + r.type);
  info->getDataTypes()->setAccessNameRefDescription("about AccessNameRef");
  info->getDataTypes()->setKvCounterTypeBaseType("UInt16");

  for (const Row& r : rows) {
    EXPECT_EQ((types->*r.baseType)().str(), std::string("base of ") + r.type);
    EXPECT_EQ((types->*r.description)().str(), std::string("about ") + r.type);
  }
  EXPECT_EQ(types->getAccessNameRefDescription().str(), "about AccessNameRef");
  EXPECT_EQ(types->getKvCounterTypeBaseType().str(), "UInt16");
}

TEST(KvCRoDatabaseTest, CounterApiOffersExactlyTheFunctionsThatWereSet) {
  KvCRoDatabase database(nullptr);
  KvCRoCounterAPI* api = database.demandRTOSInfo()->getCounterAPI();
  const KvCRoCounterAPI* view = api;
  EXPECT_EQ(view->getInitCounterFcn(), nullptr);
  EXPECT_EQ(view->getInitCounterFromISRFcn(), nullptr);
  EXPECT_EQ(view->getGetCounterValueFcn(), nullptr);

  api->setInitCounterFcn("InitCounter_CTR", 1);
  api->setGetCounterValueFcn("GetCounterValue_CTR", 6);
  api->setGetCounterValueFcn("ReadCounter_CTR", 7);
  ASSERT_NE(view->getInitCounterFcn(), nullptr);
  EXPECT_EQ(view->getInitCounterFcn()->getFunctionName().str(), "InitCounter_CTR");
  EXPECT_EQ(view->getInitCounterFcn()->getFunctionKind(), 1);
  EXPECT_EQ(view->getInitCounterFromISRFcn(), nullptr);
  ASSERT_NE(view->getGetCounterValueFcn(), nullptr);
  EXPECT_EQ(view->getGetCounterValueFcn()->getFunctionName().str(), "ReadCounter_CTR");
  EXPECT_EQ(view->getGetCounterValueFcn()->getFunctionKind(), 7);

  api->removeInitCounterFcn();
  api->setInitCounterFromISRFcn("InitCounterIsr_CTR", 2);
  EXPECT_EQ(view->getInitCounterFcn(), nullptr);
  ASSERT_NE(view->getInitCounterFromISRFcn(), nullptr);
  EXPECT_EQ(view->getInitCounterFromISRFcn()->getFunctionKind(), 2);
}

// Each object keeps its own identifier variable: setting one object's leaves every other
// object (of the same kind or another) without one.
TEST(KvCRoDatabaseTest, EachObjectKeepsItsOwnIdentifierVariable) {
  // The view only stores identifier variables and never reads through them, so distinct
  // addresses stand in for the ICode's variables here.
  std::max_align_t slots[5];
  auto variable = [&slots](int i) { return reinterpret_cast<KV_ExprDescrTupel*>(&slots[i]); };

  KvCRoDatabase database(nullptr);
  KvCRoAlarm* alarm = database.createAlarm("AlarmFast");
  KvCRoAlarm* otherAlarm = database.createAlarm("AlarmSlow");
  KvCRoResource* resource = database.createResource("ResBus");
  KvCRoEvent* event = database.createEvent("EvTick");
  KvCRoMessage* message = database.createMessage("MsgSpeed");
  KvCRoCounter* counter = database.createCounter("SystemCounter", 0.001);
  EXPECT_EQ(otherAlarm->getName().str(), "AlarmSlow");
  EXPECT_EQ(counter->getName().str(), "SystemCounter");
  EXPECT_DOUBLE_EQ(counter->getTickDuration(), 0.001);

  alarm->setAlarmIdVar(variable(0));
  EXPECT_EQ(alarm->getAlarmIdVar(), variable(0));
  EXPECT_EQ(otherAlarm->getAlarmIdVar(), nullptr);
  EXPECT_EQ(resource->getResourceIdVar(), nullptr);
  EXPECT_EQ(event->getEventIdVar(), nullptr);
  EXPECT_EQ(message->getMsgIdVar(), nullptr);

  otherAlarm->setAlarmIdVar(variable(1));
  resource->setResourceIdVar(variable(2));
  event->setEventIdVar(variable(3));
  message->setMsgIdVar(variable(4));
  EXPECT_EQ(alarm->getAlarmIdVar(), variable(0));
  EXPECT_EQ(otherAlarm->getAlarmIdVar(), variable(1));
  EXPECT_EQ(resource->getResourceIdVar(), variable(2));
  EXPECT_EQ(event->getEventIdVar(), variable(3));
  EXPECT_EQ(message->getMsgIdVar(), variable(4));
}

} // namespace
