#include "HulCvTools/MultirateCodegenTools/KvCMcgTypeServer.h"

#include "HulCvTools/Control/KvCCodeGenMessage.h"
#include "HulCvTools/Control/KvCInternalCheck.h"
#include "HulCvTools/ModelInterfaces/ICodeModel.h"
#include "HulCvTools/ModelInterfaces/ViewModel.h"
#include "HulCvTools/MultirateCodegenTools/KvCMcgBootSupport.h"
#include "platform/support/KvCInternalSrcRef.h"
#include "platform/support/KvCSrcRefServer.h"
#include "platform/support/WmCXString.h"

namespace {
constexpr const char* kErrorCode = "KvCMcgTypeServer";
} // namespace

struct KvCMcgTypeServer::NumericalSpec {
  const char* name;
  const WmCXString& (KvCRoDataTypes::*baseTypeName)() const;
  const WmCXString& (KvCRoDataTypes::*description)() const;
  int defineCode; // the internal check when defineType fails; plus one: cannot be made
};

bool KvCMcgTypeServer::bootPhaseOne(KvCCodeViewData* codeViewData,
                                    KV_ICodeFactoryContainer* container, KvCRoDatabase* database,
                                    bool isActive) {
  codeView = codeViewData;
  factories = container;
  rtosDatabase = database;
  active = isActive;
  fileServer = container ? container->getFileServer() : nullptr;
  dataTypeServer = container ? container->getDataTypeServer() : nullptr;
  pointerTypeServer = dataTypeServer ? dataTypeServer->getPointerServer() : nullptr;
  return true;
}

bool KvCMcgTypeServer::bootPhaseTwo() {
  if (!active)
    return true;
  if (!KV_VERIFY(codeView && factories && fileServer && rtosDatabase, kErrorCode, 100))
    return false;
  numericalTypeServer = factories->getNumTypeServer();
  internalSrcRef = kvMcgInternalSrcRef(codeView, __FILE__, __LINE__, "rtos api function");
  rootHeaderFile = kvMcgRootHeader(fileServer, internalSrcRef);
  if (!rootHeaderFile)
    return false;
  if (KV_ScaleServer* scales = factories->getScalingServer())
    standardScaling = scales->getScaling(1.0, 0.0, internalSrcRef);
  baseTypeServer = factories->getBaseTypeServer();
  standardBaseType = baseTypeServer ? baseTypeServer->getInt8() : nullptr;
  KvCRoRTOSInfo* info = rtosDatabase->demandRTOSInfo();
  rtosDataTypes = info ? info->getDataTypes() : nullptr;
  acmeHeaderFile = kvMcgAcmeHeader(fileServer, internalSrcRef);
  return acmeHeaderFile != nullptr;
}

KV_DataType* KvCMcgTypeServer::getStandardBaseType() const { return standardBaseType; }

bool KvCMcgTypeServer::haveOsekHeader(KvCIcFile*& header, const KvCSrcRef* srcRef) const {
  header = nullptr;
  return rtosDatabase && rtosDatabase->demandOsekHFile(header, srcRef) && header;
}

void KvCMcgTypeServer::define(KvCIcFile* file, KV_DataType* type, const KvCSrcRef* srcRef,
                              int code) {
  if (!file || !file->defineType(type, srcRef, true))
    KV_INTERNAL_CHECK(kErrorCode, code);
}

KV_NumericalType* KvCMcgTypeServer::rtosBaseType(const WmCXString& name, const KvCSrcRef* srcRef,
                                                 int code) {
  KV_DataType* base = dataTypeServer ? dataTypeServer->findTypeByName(name, srcRef) : nullptr;
  KV_NumericalType* numerical = base ? base->getNumericalType() : nullptr;
  // An RTOS information whose base-type name names no numerical type: nothing to make
  // the RTOS type from.
  if (!KV_VERIFY(numerical != nullptr, kErrorCode, code + 1))
    return nullptr;
  return numerical;
}

KV_DataType* KvCMcgTypeServer::demandNumerical(KV_DataType*& cache, const NumericalSpec& spec,
                                               const KvCSrcRef* srcRef) {
  if (cache)
    return cache;
  KvCIcFile* osekHeader = nullptr;
  if (!haveOsekHeader(osekHeader, srcRef))
    return nullptr;
  if (!KV_VERIFY(rtosDataTypes && numericalTypeServer, kErrorCode, spec.defineCode + 1))
    return nullptr;
  KV_NumericalType* base =
      rtosBaseType((rtosDataTypes->*spec.baseTypeName)(), srcRef, spec.defineCode);
  if (!base)
    return nullptr;
  WmCXString description = (rtosDataTypes->*spec.description)();
  KV_DimensionDescriptor scalar;
  KV_DataType* type = numericalTypeServer->getNonDDMappedNumerical(spec.name, description, *base,
                                                                   scalar, true, srcRef, true);
  if (!KV_VERIFY(type != nullptr, kErrorCode, spec.defineCode + 1))
    return nullptr;
  cache = type;
  type->setUseNameForCasts(true);
  define(osekHeader, type, srcRef, spec.defineCode);
  return type;
}

KV_DataType* KvCMcgTypeServer::demandStatusType(const KvCSrcRef* srcRef) {
  static const NumericalSpec spec{"StatusType", &KvCRoDataTypes::getStatusTypeBaseType,
                                  &KvCRoDataTypes::getStatusTypeDescription, 231};
  return demandNumerical(statusType, spec, srcRef);
}

KV_DataType* KvCMcgTypeServer::demandTaskType(const KvCSrcRef* srcRef) {
  static const NumericalSpec spec{"TaskType", &KvCRoDataTypes::getTaskTypeBaseType,
                                  &KvCRoDataTypes::getTaskTypeDescription, 268};
  return demandNumerical(taskType, spec, srcRef);
}

KV_DataType* KvCMcgTypeServer::demandEventMaskType(const KvCSrcRef* srcRef) {
  static const NumericalSpec spec{"EventMaskType", &KvCRoDataTypes::getEventMaskTypeBaseType,
                                  &KvCRoDataTypes::getEventMaskTypeDescription, 328};
  return demandNumerical(eventMaskType, spec, srcRef);
}

KV_DataType* KvCMcgTypeServer::demandSymbolicNameType(const KvCSrcRef* srcRef) {
  static const NumericalSpec spec{"SymbolicName", &KvCRoDataTypes::getSymbolicNameBaseType,
                                  &KvCRoDataTypes::getSymbolicNameDescription, 404};
  return demandNumerical(symbolicNameType, spec, srcRef);
}

KV_DataType* KvCMcgTypeServer::demandResourceType(const KvCSrcRef* srcRef) {
  static const NumericalSpec spec{"ResourceType", &KvCRoDataTypes::getResourceTypeBaseType,
                                  &KvCRoDataTypes::getResourceTypeDescription, 476};
  return demandNumerical(resourceType, spec, srcRef);
}

KV_DataType* KvCMcgTypeServer::demandAlarmType(const KvCSrcRef* srcRef) {
  static const NumericalSpec spec{"AlarmType", &KvCRoDataTypes::getAlarmTypeBaseType,
                                  &KvCRoDataTypes::getAlarmTypeDescription, 513};
  return demandNumerical(alarmType, spec, srcRef);
}

KV_DataType* KvCMcgTypeServer::demandEventMaskRefType(const KvCSrcRef* srcRef) {
  constexpr int kCode = 367;
  if (eventMaskRefType)
    return eventMaskRefType;
  KvCIcFile* osekHeader = nullptr;
  if (!haveOsekHeader(osekHeader, srcRef))
    return nullptr;
  KV_DataType* eventMask = demandEventMaskType(srcRef);
  if (!eventMask)
    return nullptr;
  if (!KV_VERIFY(pointerTypeServer != nullptr, kErrorCode, kCode + 1))
    return nullptr;
  WmCXString noName;
  WmCXString noDescription;
  KV_PointerType* pointer =
      pointerTypeServer->getScalarPointer(eventMask, &noName, false, false, &noDescription, srcRef);
  WmCXString description("type of event identifier references");
  KV_DimensionDescriptor scalar;
  KV_DataType* type = pointer ? pointerTypeServer->getNonDDMappedPointer(
                                    "EventMaskRefType", description, scalar, true, pointer, srcRef)
                              : nullptr;
  if (!KV_VERIFY(type != nullptr, kErrorCode, kCode + 1))
    return nullptr;
  eventMaskRefType = type;
  define(osekHeader, type, srcRef, kCode);
  return type;
}

KV_DataType* KvCMcgTypeServer::demandAccessNameRefType(const KvCSrcRef* srcRef) {
  constexpr int kCode = 439;
  if (accessNameRefType)
    return accessNameRefType;
  KvCIcFile* osekHeader = nullptr;
  if (!haveOsekHeader(osekHeader, srcRef))
    return nullptr;
  if (!KV_VERIFY(pointerTypeServer && rtosDataTypes, kErrorCode, kCode + 1))
    return nullptr;
  WmCXString description = rtosDataTypes->getAccessNameRefDescription();
  KV_DimensionDescriptor scalar;
  KV_DataType* type = pointerTypeServer->getNonDDMappedPointer(
      "AccessNameRef", description, scalar, true, pointerTypeServer->getVoidPointer(), srcRef);
  if (!KV_VERIFY(type != nullptr, kErrorCode, kCode + 1))
    return nullptr;
  accessNameRefType = type;
  define(osekHeader, type, srcRef, kCode);
  return type;
}

KV_DataType* KvCMcgTypeServer::demandISRDummyType(const KvCSrcRef* srcRef) {
  constexpr int kCode = 291;
  if (isrDummyType)
    return isrDummyType;
  KV_NumericalType* base = standardBaseType ? standardBaseType->getNumericalType() : nullptr;
  if (!KV_VERIFY(base && numericalTypeServer, kErrorCode, kCode + 1))
    return nullptr;
  WmCXString description("dummy type of ISR identifiers");
  KV_DimensionDescriptor scalar;
  KV_DataType* type = numericalTypeServer->getNonDDMappedNumerical(
      "ISRDummyType", description, *base, scalar, false, srcRef, true);
  if (!KV_VERIFY(type != nullptr, kErrorCode, kCode + 1))
    return nullptr;
  isrDummyType = type;
  type->setUseNameForCasts(true);
  define(acmeHeaderFile, type, srcRef, kCode);
  return type;
}

WmCXString KvCMcgTypeServer::tickTypeDifferences(KV_DataType* ddType, KV_DataType* rtosBase,
                                                 KvCIcFile* osekHeader) {
  WmCXString differences;
  KV_DataType* ddBase = ddType->getBaseType();
  if (!ddBase)
    differences += "\nIsBaseType";
  if (!ddBase || !rtosBase->isSameType(ddBase))
    differences += "\nBaseType";
  if (!ddType->isScalar())
    differences += "\nWidth";
  if (!ddType->isCreateTypedef())
    differences += "\nCreateTypedef";
  KvCIcFileId* module = ddType->getModuleFileId();
  if (!module || module->getFile() != osekHeader)
    differences += "\nModule";
  return differences;
}

KV_DataType* KvCMcgTypeServer::demandTickType(const KvCSrcRef* srcRef) {
  constexpr int kCode = 639;
  if (tickType)
    return tickType;
  KvCIcFile* osekHeader = nullptr;
  if (!haveOsekHeader(osekHeader, srcRef))
    return nullptr;
  if (!KV_VERIFY(rtosDataTypes && numericalTypeServer, kErrorCode, kCode + 1))
    return nullptr;
  KV_NumericalType* base = rtosBaseType(rtosDataTypes->getTickTypeBaseType(), srcRef, kCode);
  if (!base)
    return nullptr;
  WmCXString description = rtosDataTypes->getTickTypeDescription();
  KV_DimensionDescriptor scalar;
  KV_DataType* ddType = dataTypeServer->findTypeByName("TickType", scalar, srcRef, true);
  KV_DataType* type = nullptr;
  if (!ddType) {
    type = numericalTypeServer->getNonDDMappedNumerical("TickType", description, *base, scalar,
                                                        true, srcRef, true);
    if (!KV_VERIFY(type != nullptr, kErrorCode, kCode + 1))
      return nullptr;
    tickType = type;
    define(osekHeader, type, srcRef, kCode);
  } else {
    type = ddType->getNumericalType();
    if (!KV_VERIFY(type != nullptr, kErrorCode, kCode + 1))
      return nullptr;
    tickType = type;
    const WmCXString differences = tickTypeDifferences(ddType, base, osekHeader);
    if (!differences.isEmpty())
      KvCCodeGenMessage::msg31688(ddType->getSrcRef(), "TickType", differences.c_str());
  }
  type->setUseNameForCasts(true);
  return type;
}

KV_DataType* KvCMcgTypeServer::demandCounterIDType() {
  constexpr int kCode = 700;
  if (counterIDType)
    return counterIDType;
  KvCRoDatabase* database = codeView ? codeView->getRtosDatabase() : nullptr;
  KvCRoRTOSInfo* info = database ? database->demandRTOSInfo() : nullptr;
  const KvCRoDataTypes* types = info ? info->getDataTypes() : nullptr;
  if (!KV_VERIFY(types && baseTypeServer, kErrorCode, kCode))
    return nullptr;
  const WmCXString name = types->getKvCounterTypeBaseType();
  KV_DataType* type = baseTypeServer->getBase(&name);
  if (!KV_VERIFY(type != nullptr, kErrorCode, kCode + 1))
    return nullptr;
  counterIDType = type;
  return type;
}
