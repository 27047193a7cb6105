#include "HulCvTools/EcpTools/KvCEcpSymbolServer.h"

#include "HulCvTools/Control/KvCInternalCheck.h"
#include "HulCvTools/EcpTools/KvCEcpTypeServer.h"
#include "HulCvTools/ModelInterfaces/ICodeModel.h"
#include "HulCvTools/MultirateCodegenTools/KvCMcgBootSupport.h"
#include "platform/support/KvCInternalSrcRef.h"
#include "platform/support/WmCXString.h"

namespace {
constexpr const char* kErrorCode = "KvCEcpSymbolServer";
} // namespace

bool KvCEcpSymbolServer::bootPhaseOne(KV_MacroSymbolServer* macroSymbols,
                                      KvCEcpTypeServer* ecpTypes, KvCCodeViewData* codeView,
                                      KV_ICodeFactoryContainer* factories, KvCIvData* viewData,
                                      bool isEnabled) {
  macroSymbolServer = macroSymbols;
  typeServer = ecpTypes;
  codeViewData = codeView;
  factoryContainer = factories;
  ivData = viewData;
  enabled = isEnabled;
  return true;
}

bool KvCEcpSymbolServer::bootPhaseTwo() {
  if (!enabled)
    return true;
  KvCIcFileServer* fileServer = factoryContainer ? factoryContainer->getFileServer() : nullptr;
  // Phase one without its roots: nothing to boot from.
  if (!KV_VERIFY(codeViewData && fileServer, kErrorCode, __LINE__))
    return false;
  internalSrcRef =
      kvMcgInternalSrcRef(codeViewData, __FILE__, __LINE__, "rtos object identifier symbol");
  KvCIcFile* header = kvMcgAcmeHeader(fileServer, internalSrcRef);
  acmeHeaderFileId = header ? header->getFileId() : nullptr;
  return acmeHeaderFileId != nullptr;
}

KvCUnparamSymbol* KvCEcpSymbolServer::createCidMacro(const WmCXString& name,
                                                     const KvCSrcRef* srcRef) {
  // A demand before this server's (or the type server's) phase two completed.
  if (!KV_VERIFY(macroSymbolServer && typeServer && acmeHeaderFileId, kErrorCode, __LINE__))
    return nullptr;
  // The type server reports a CID type it cannot make; the macro symbol server then
  // refuses the macro without type.
  KV_Scaling* scaling = typeServer->getStandardScaling();
  KV_DataType* cidType = typeServer->demandCidType(srcRef);
  return macroSymbolServer->demandGlobal(acmeHeaderFileId->getFile()->getStt(), name, cidType,
                                         scaling, srcRef);
}
