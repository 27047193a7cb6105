#include "HulCvTools/MultirateCodegenTools/KvCMcgBootSupport.h"

#include "HulCvTools/ModelInterfaces/ICodeModel.h"
#include "platform/support/KvCInternalSrcRef.h"
#include "platform/support/KvCSrcRefServer.h"

KvCInternalSrcRef* kvMcgInternalSrcRef(KvCCodeViewData* codeView, const char* file, int line,
                                       const char* cause) {
  KvCInternalSrcRef* srcRef = codeView->getSrcRefServer()->getSrcRef();
  if (!srcRef)
    return nullptr;
  srcRef->setLocation(file, line);
  srcRef->setCause(cause);
  return srcRef;
}

KvCIcFile* kvMcgRootHeader(KvCIcFileServer* files, const KvCSrcRef* srcRef) {
  KvCIcFileId* header = nullptr;
  KvCIcFileId* cFile = nullptr;
  if (!files->demandRootFiles(header, cFile, srcRef) || !header)
    return nullptr;
  return header->getFile();
}

KvCIcFile* kvMcgAcmeHeader(KvCIcFileServer* files, const KvCSrcRef* srcRef) {
  KvCIcFileId* header = nullptr;
  KvCIcFileId* cFile = nullptr;
  if (!files->demandAcmeFiles(header, cFile, srcRef) || !header)
    return nullptr;
  return header->getFile();
}
