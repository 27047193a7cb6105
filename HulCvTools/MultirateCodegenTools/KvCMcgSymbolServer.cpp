#include "HulCvTools/MultirateCodegenTools/KvCMcgSymbolServer.h"

#include "HulCvTools/Control/KvCInternalCheck.h"
#include "HulCvTools/ModelInterfaces/ICodeModel.h"
#include "HulCvTools/ModelInterfaces/ViewModel.h"
#include "HulCvTools/MultirateCodegenTools/KvCMcgBootSupport.h"
#include "HulCvTools/MultirateCodegenTools/KvCMcgTypeServer.h"
#include "platform/support/KvCCIdentifier.h"
#include "platform/support/KvCInternalSrcRef.h"
#include "platform/support/KvCSrcRefServer.h"

namespace {
constexpr const char* kErrorCode = "KvCMcgSymbolServer";
constexpr int kNotBooted = 110;
constexpr int kAlarmCode = 210;
constexpr int kResourceCode = 220;
constexpr int kEventCode = 230;
constexpr int kMessageCode = 240;
constexpr int kActualParamCode = 300;
} // namespace

bool KvCMcgSymbolServer::bootPhaseOne(KV_MacroSymbolServer* macroSymbols,
                                      KvCMcgTypeServer* rtosTypes, KvCVarClassServer* varClasses,
                                      KvCCodeViewData* codeViewData,
                                      KV_ICodeFactoryContainer* container, KvCIvData* viewData,
                                      KV_CgsSupporter* supporter, bool isActive,
                                      KvCRoDatabase* database) {
  macroSymbolServer = macroSymbols;
  typeServer = rtosTypes;
  varClassServer = varClasses;
  codeView = codeViewData;
  factories = container;
  ivData = viewData;
  cgsSupporter = supporter;
  active = isActive;
  rtosDatabase = database;
  return true;
}

bool KvCMcgSymbolServer::bootPhaseTwo() {
  if (!active)
    return true;
  KvCIcFileServer* fileServer = factories ? factories->getFileServer() : nullptr;
  if (!KV_VERIFY(codeView && fileServer && ivData, kErrorCode, 100))
    return false;
  internalSrcRef =
      kvMcgInternalSrcRef(codeView, __FILE__, __LINE__, "rtos object identifier symbol");
  rootPartition = ivData->getIvRootPartition();
  acmeHeaderFile = kvMcgAcmeHeader(fileServer, internalSrcRef);
  return acmeHeaderFile != nullptr;
}

KV_ExprDescrTupel* KvCMcgSymbolServer::createIdVariable(const WmCXString& name,
                                                        TypeDemand demandType, int code,
                                                        const KvCSrcRef* srcRef) {
  if (!KV_VERIFY(rtosDatabase && typeServer && cgsSupporter && varClassServer && rootPartition,
                 kErrorCode, kNotBooted))
    return nullptr;
  KvCIcFile* osekHeader = nullptr;
  if (!rtosDatabase->demandOsekHFile(osekHeader, srcRef) || !osekHeader)
    return nullptr;
  KvCCStmTable* headerTable = osekHeader->getStt();
  KvCVarClassId* varClass = varClassServer->demandMacroGlobalExternDefault(srcRef);
  KV_Scaling* scaling = typeServer->getStandardScaling();
  KV_DataType* type = (typeServer->*demandType)(srcRef);
  if (!KV_VERIFY(headerTable && varClass && scaling && type, kErrorCode, code))
    return nullptr;
  KvCCIdentifier identifier(name);
  identifier.setSourceRef(srcRef);
  KV_ExprDescrTupel* variable = cgsSupporter->createScalarVariable(
      identifier, type, scaling, 0.0, false, varClass, srcRef, rootPartition, headerTable, 0);
  if (!KV_VERIFY(variable != nullptr, kErrorCode, code + 1))
    return nullptr;
  return variable;
}

KV_ExprDescrTupel* KvCMcgSymbolServer::demandAlarmIdVariable(KvCRoAlarm* alarm,
                                                             const KvCSrcRef* srcRef) {
  if (!KV_VERIFY(alarm != nullptr, kErrorCode, kAlarmCode))
    return nullptr;
  if (KV_ExprDescrTupel* known = alarm->getAlarmIdVar())
    return known;
  KV_ExprDescrTupel* variable =
      createIdVariable(alarm->getName(), &KvCMcgTypeServer::demandAlarmType, kAlarmCode, srcRef);
  if (!variable)
    return nullptr;
  alarm->setAlarmIdVar(variable);
  return alarm->getAlarmIdVar();
}

KV_ExprDescrTupel* KvCMcgSymbolServer::demandResourceIdVariable(KvCRoResource* resource,
                                                                const KvCSrcRef* srcRef) {
  if (!KV_VERIFY(resource != nullptr, kErrorCode, kResourceCode))
    return nullptr;
  if (KV_ExprDescrTupel* known = resource->getResourceIdVar())
    return known;
  KV_ExprDescrTupel* variable = createIdVariable(
      resource->getName(), &KvCMcgTypeServer::demandResourceType, kResourceCode, srcRef);
  if (!variable)
    return nullptr;
  resource->setResourceIdVar(variable);
  return resource->getResourceIdVar();
}

KV_ExprDescrTupel* KvCMcgSymbolServer::demandEventIdVariable(KvCRoEvent* event,
                                                             const KvCSrcRef* srcRef) {
  if (!KV_VERIFY(event != nullptr, kErrorCode, kEventCode))
    return nullptr;
  if (KV_ExprDescrTupel* known = event->getEventIdVar())
    return known;
  KV_ExprDescrTupel* variable = createIdVariable(
      event->getName(), &KvCMcgTypeServer::demandEventMaskType, kEventCode, srcRef);
  if (!variable)
    return nullptr;
  event->setEventIdVar(variable);
  return event->getEventIdVar();
}

KV_ExprDescrTupel* KvCMcgSymbolServer::demandMessageIdVariable(KvCRoMessage* message,
                                                               const KvCSrcRef* srcRef) {
  if (!KV_VERIFY(message != nullptr, kErrorCode, kMessageCode))
    return nullptr;
  if (KV_ExprDescrTupel* known = message->getMsgIdVar())
    return known;
  KV_ExprDescrTupel* variable = createIdVariable(
      message->getName(), &KvCMcgTypeServer::demandSymbolicNameType, kMessageCode, srcRef);
  if (!variable)
    return nullptr;
  message->setMsgIdVar(variable);
  return message->getMsgIdVar();
}

// The name is taken by value: the interface is fixed so for its callers.
// NOLINTNEXTLINE(performance-unnecessary-value-param)
KvCSymbol* KvCMcgSymbolServer::demandUserDefinedActualParam(WmCXString name,
                                                            const KvCSrcRef* /*srcRef*/) {
  if (!KV_VERIFY(macroSymbolServer && typeServer && acmeHeaderFile, kErrorCode, kNotBooted))
    return nullptr;
  KV_Scaling* scaling = typeServer->getStandardScaling();
  KV_DataType* baseType = typeServer->getStandardBaseType();
  if (!KV_VERIFY(scaling && baseType, kErrorCode, kActualParamCode))
    return nullptr;
  bool created = false;
  KvCSymbol* global = macroSymbolServer->demandExternGlobal(
      acmeHeaderFile->getFileId(), name, baseType, scaling, &created, internalSrcRef);
  if (!KV_VERIFY(global != nullptr, kErrorCode, kActualParamCode + 1))
    return nullptr;
  return global;
}
