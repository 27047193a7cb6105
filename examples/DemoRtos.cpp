// RTOS servers: for a sample RTOS description, every RTOS type is made once and declared
// in the OSEK header (ISRDummyType in the Acme header), and the identifier variables of a
// few RTOS objects join them there; the model's printer shows the header a C compiler
// would get.
#include "DemoSampleApp.h"
#include "DemoSections.h"

#include "HulCvTools/MultirateCodegenTools/KvCMcgFunctionServer.h"
#include "HulCvTools/MultirateCodegenTools/KvCMcgSymbolServer.h"
#include "HulCvTools/MultirateCodegenTools/KvCMcgTypeServer.h"
#include "platform/icode/KV_DataType.h"
#include "platform/icode/KV_ExprDescrTupel.h"
#include "platform/icode/KV_ICodeFactoryContainer.h"
#include "platform/icode/KvCCDeclPrinter.h"
#include "platform/icode/KvCCodeViewData.h"
#include "platform/icode/KvCIcFile.h"
#include "platform/icode/KvCIcFileId.h"
#include "platform/view/KvCIvData.h"
#include "platform/view/KvCRoAlarm.h"
#include "platform/view/KvCRoDataTypes.h"
#include "platform/view/KvCRoDatabase.h"
#include "platform/view/KvCRoEvent.h"
#include "platform/view/KvCRoRTOSInfo.h"

#include <iterator>

namespace {

void describeRtos(KvCRoDatabase& rtos) {
  KvCRoRTOSInfo* info = rtos.demandRTOSInfo();
  info->setOSName("SampleOS");
  KvCRoDataTypes* types = info->getDataTypes();
  types->setStatusType("UInt8", "status of an API call");
  types->setTaskType("UInt8", "task identifier");
  types->setEventMaskType("UInt32", "event mask");
  types->setSymbolicName("UInt16", "symbolic name of a message");
  types->setResourceType("UInt8", "resource identifier");
  types->setAlarmType("UInt8", "alarm identifier");
  types->setTickType("UInt32", "counter ticks");
  types->setAccessNameRefDescription("reference to message data");
  types->setKvCounterTypeBaseType("UInt16");
}

} // namespace

void demoRtos(DemoRun& run) {
  printSectionTitle(run.out, "RTOS types for multirate code");
  KvCCodeViewData& data = run.sample.app.data();
  KvCRoDatabase rtos(&data);
  describeRtos(rtos);
  KvCRoDatabase* previous = data.getRtosDatabase();
  data.setRtosDatabase(&rtos);

  KvCMcgTypeServer types;
  types.bootPhaseOne(&data, data.getFactoryContainer(), &rtos, true);
  if (!types.bootPhaseTwo()) {
    run.out << "  the type server could not boot\n";
    data.setRtosDatabase(previous);
    return;
  }
  using Demand = KV_DataType* (KvCMcgTypeServer::*)(const KvCSrcRef*);
  const Demand demands[] = {
      &KvCMcgTypeServer::demandStatusType,       &KvCMcgTypeServer::demandTaskType,
      &KvCMcgTypeServer::demandEventMaskType,    &KvCMcgTypeServer::demandEventMaskRefType,
      &KvCMcgTypeServer::demandSymbolicNameType, &KvCMcgTypeServer::demandAccessNameRefType,
      &KvCMcgTypeServer::demandResourceType,     &KvCMcgTypeServer::demandAlarmType,
      &KvCMcgTypeServer::demandTickType,         &KvCMcgTypeServer::demandISRDummyType};
  run.out << "  " << rtos.demandRTOSInfo()->getOSName().str() << " types:";
  for (Demand demand : demands) {
    KV_DataType* type = (types.*demand)(nullptr);
    run.out << " " << (type ? type->getName().str() : std::string("(none)"));
  }
  KV_DataType* counterId = types.demandCounterIDType();
  run.out << "\n  counter identifiers are " << (counterId ? counterId->getName().str() : "(none)");

  // Identifier variables of an alarm and an event: made once, kept by the objects.
  KvCIvData view;
  KV_ICodeFactoryContainer* factories = data.getFactoryContainer();
  KvCMcgSymbolServer symbols;
  symbols.bootPhaseOne(factories->getMacroSymbolServer(), &types, factories->getVarClassServer(),
                       &data, factories, &view, factories->getCgsSupporter(), true, &rtos);
  if (symbols.bootPhaseTwo()) {
    KvCRoAlarm* alarm = rtos.createAlarm("Alarm_10ms");
    KvCRoEvent* event = rtos.createEvent("Ev_DataReady");
    KV_ExprDescrTupel* alarmId = symbols.demandAlarmIdVariable(alarm, nullptr);
    KV_ExprDescrTupel* eventId = symbols.demandEventIdVariable(event, nullptr);
    run.out << "\n  identifier variables: "
            << (alarmId ? alarmId->getSymbol()->getName().str() : "(none)") << ", "
            << (eventId ? eventId->getSymbol()->getName().str() : "(none)")
            << (symbols.demandAlarmIdVariable(alarm, nullptr) == alarmId ? " (found again)" : "");
    symbols.shutdown();
  }
  // The OSEK API: every function made once, with its signature, in the OSEK header.
  KvCMcgFunctionServer functions;
  functions.bootPhaseOne(&data, factories, &types, &rtos, true);
  if (functions.bootPhaseTwo()) {
    using FunctionDemand = KvCParamSymbol* (KvCMcgFunctionServer::*)(const KvCSrcRef*);
    const FunctionDemand api[] = {&KvCMcgFunctionServer::demandOsekApiActivateTask,
                                  &KvCMcgFunctionServer::demandOsekApiTerminateTask,
                                  &KvCMcgFunctionServer::demandOsekApiSetEvent,
                                  &KvCMcgFunctionServer::demandOsekApiWaitEvent,
                                  &KvCMcgFunctionServer::demandOsekApiGetResource,
                                  &KvCMcgFunctionServer::demandOsekApiReleaseResource,
                                  &KvCMcgFunctionServer::demandOsekApiSetRelAlarm,
                                  &KvCMcgFunctionServer::demandOsekApiSchedule};
    int made = 0;
    for (FunctionDemand demand : api)
      made += (functions.*demand)(nullptr) != nullptr ? 1 : 0;
    run.out << "\n  OSEK API functions made: " << made << " of " << std::size(api)
            << (functions.demandOsekApiSetEvent(nullptr) == functions.demandOsekApiSetEvent(nullptr)
                    ? " (each once)"
                    : "");
    functions.shutdown();
  }
  run.out << "\n  the OSEK header as printed:\n";
  KvCIcFile* header = nullptr;
  if (rtos.demandOsekHFile(header, nullptr) && header) {
    const std::string text = KvCCDeclPrinter::printFile(header->getFileId()).str();
    std::size_t start = 0;
    while (start < text.size()) {
      const std::size_t end = text.find('\n', start);
      const std::string line = text.substr(start, end == std::string::npos ? end : end - start);
      if (!line.empty())
        run.out << "    " << line << "\n";
      if (end == std::string::npos)
        break;
      start = end + 1;
    }
  }
  types.shutdown();
  data.setRtosDatabase(previous);
}
