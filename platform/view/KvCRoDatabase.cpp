#include "platform/view/KvCRoDatabase.h"

#include "platform/icode/KvCCodeViewData.h"
#include "platform/icode/KvCIcFileServer.h"
#include "platform/view/KvCRoAlarm.h"
#include "platform/view/KvCRoCounter.h"
#include "platform/view/KvCRoEvent.h"
#include "platform/view/KvCRoMessage.h"
#include "platform/view/KvCRoRTOSInfo.h"
#include "platform/view/KvCRoResource.h"

KvCRoDatabase::KvCRoDatabase(KvCCodeViewData* codeView)
    : codeView(codeView), rtosInfo(std::make_unique<KvCRoRTOSInfo>()) {}

KvCRoDatabase::~KvCRoDatabase() = default;

KvCRoRTOSInfo* KvCRoDatabase::demandRTOSInfo() { return rtosInfo.get(); }

bool KvCRoDatabase::demandOsekHFile(KvCIcFile*& file, const KvCSrcRef* /*srcRef*/) {
  file = nullptr;
  ++osekHFileDemands;
  if (!osekHFileAvailable || !codeView)
    return false;
  KvCIcFileId* id = codeView->getFileServer()->demandFile(osekHFileName);
  if (!id)
    return false;
  file = id->getFile();
  return true;
}

KvCRoAlarm* KvCRoDatabase::createAlarm(const WmCXString& name) {
  alarms.push_back(std::make_unique<KvCRoAlarm>(name));
  return alarms.back().get();
}

KvCRoResource* KvCRoDatabase::createResource(const WmCXString& name) {
  resources.push_back(std::make_unique<KvCRoResource>(name));
  return resources.back().get();
}

KvCRoEvent* KvCRoDatabase::createEvent(const WmCXString& name) {
  events.push_back(std::make_unique<KvCRoEvent>(name));
  return events.back().get();
}

KvCRoMessage* KvCRoDatabase::createMessage(const WmCXString& name) {
  messages.push_back(std::make_unique<KvCRoMessage>(name));
  return messages.back().get();
}

KvCRoCounter* KvCRoDatabase::createCounter(const WmCXString& name, double tickDuration) {
  counters.push_back(std::make_unique<KvCRoCounter>(name, tickDuration));
  return counters.back().get();
}
