#include "HulCvTools/EcpTools/KvCEcpTypeServer.h"

#include "HulCvTools/Control/KvCInternalCheck.h"
#include "HulCvTools/ModelInterfaces/ICodeModel.h"
#include "HulCvTools/MultirateCodegenTools/KvCMcgBootSupport.h"
#include "platform/support/KvCInternalSrcRef.h"
#include "platform/support/WmCXString.h"

namespace {
constexpr const char* kErrorCode = "KvCEcpTypeServer";
} // namespace

bool KvCEcpTypeServer::bootPhaseOne(KvCCodeViewData* codeView, KV_ICodeFactoryContainer* factories,
                                    bool isEnabled) {
  codeViewData = codeView;
  factoryContainer = factories;
  fileServer = factories ? factories->getFileServer() : nullptr;
  dataTypeServer = factories ? factories->getDataTypeServer() : nullptr;
  pointerTypeServer = dataTypeServer ? dataTypeServer->getPointerServer() : nullptr;
  enabled = isEnabled;
  return true;
}

bool KvCEcpTypeServer::bootPhaseTwo() {
  if (!enabled)
    return true;
  // Phase one without its roots: nothing to boot from.
  if (!KV_VERIFY(codeViewData && factoryContainer && fileServer, kErrorCode, __LINE__))
    return false;
  numericalTypeServer = factoryContainer->getNumTypeServer();
  internalSrcRef = kvMcgInternalSrcRef(codeViewData, __FILE__, __LINE__, "rtos api function");
  if (KV_ScaleServer* scales = factoryContainer->getScalingServer())
    standardScaling = scales->getScaling(1.0, 0.0, internalSrcRef);
  baseTypeServer = factoryContainer->getBaseTypeServer();
  standardBaseType = baseTypeServer ? baseTypeServer->getInt8() : nullptr;
  acmeHeaderFile = kvMcgAcmeHeader(fileServer, internalSrcRef);
  return acmeHeaderFile != nullptr;
}

KV_DataType* KvCEcpTypeServer::getStandardBaseType() const { return standardBaseType; }

bool KvCEcpTypeServer::define(KV_DataType* type, const KvCSrcRef* srcRef) const {
  return type && acmeHeaderFile && acmeHeaderFile->defineType(type, srcRef, true);
}

KV_DataType* KvCEcpTypeServer::demandCidType(const KvCSrcRef* srcRef) {
  if (cidType)
    return cidType;
  KV_NumericalType* base = standardBaseType ? standardBaseType->getNumericalType() : nullptr;
  // A demand before phase two completed: no base type, server or header to make it with.
  if (!KV_VERIFY(base && numericalTypeServer && acmeHeaderFile, kErrorCode, __LINE__))
    return nullptr;
  WmCXString description("Dummy type for CIDs");
  KV_DimensionDescriptor scalar;
  cidType = numericalTypeServer->getNonDDMappedNumerical("CIDDummyType", description, *base, scalar,
                                                         false, internalSrcRef, true);
  if (KV_NumericalType* numerical = cidType ? cidType->getNumericalType() : nullptr)
    numerical->setUseNameForCasts(true);
  if (!define(cidType, srcRef))
    KV_INTERNAL_CHECK(kErrorCode, __LINE__);
  return cidType;
}

KV_DataType* KvCEcpTypeServer::demandAccessPointRefType(const KvCSrcRef* srcRef) {
  if (accessPointRefType)
    return accessPointRefType;
  if (!KV_VERIFY(pointerTypeServer && acmeHeaderFile, kErrorCode, __LINE__))
    return nullptr;
  KV_PointerType* voidPointer = pointerTypeServer->getVoidPointer();
  WmCXString description("Dummy type for AccessPoints");
  KV_DimensionDescriptor scalar;
  accessPointRefType = pointerTypeServer->getNonDDMappedPointer(
      "AccessPointRef", description, scalar, true, voidPointer, internalSrcRef);
  if (!define(accessPointRefType, srcRef))
    KV_INTERNAL_CHECK(kErrorCode, __LINE__);
  return accessPointRefType;
}
