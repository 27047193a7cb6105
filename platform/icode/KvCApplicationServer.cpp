#include "platform/icode/KvCApplicationServer.h"

#include "platform/icode/KvCCodeViewData.h"
#include "platform/icode/KvCIcApplication.h"
#include "platform/icode/KvCIcFileServer.h"

KvCIcSubAppl* KvCApplicationServer::demandUserSubAppl(const KvCSrcRef* /*srcRef*/) {
  if (!userSubAppl)
    userSubAppl = codeViewData->createSubApplication("user");
  return userSubAppl;
}

bool KvCApplicationServer::demandCgOwnedCFile(KvCIcSubAppl* subAppl, const WmCXString& fileName,
                                              const KvCSrcRef* srcRef, KvCIcFileId*& file) {
  file = nullptr;
  ++cFileDemands;
  if (!subAppl || fileName.isEmpty() || cFileFails)
    return false;
  KvCIcFileServer* files = codeViewData->getFileServer();
  KvCIcFileId* cFile = files->demandFile(fileName);
  if (!cFile->getFile()->getSourceRef())
    cFile->getFile()->setSourceRef(srcRef);
  const std::string& name = fileName.str();
  if (name.size() > 2 && name.compare(name.size() - 2, 2, ".c") == 0 &&
      !cFile->getFile()->getComplementaryFile()) {
    KvCIcFileId* header = files->demandFile(name.substr(0, name.size() - 2) + ".h");
    if (!header->getFile()->getSourceRef())
      header->getFile()->setSourceRef(srcRef);
    cFile->getFile()->setComplementaryFile(header);
    header->getFile()->setComplementaryFile(cFile);
  }
  KvCIcCodeUnit*& unit = unitsByFile[fileName];
  if (!unit) {
    unit = codeViewData->createCodeUnit(fileName);
    subAppl->addCodeUnit(unit);
    unit->addFile(cFile);
  }
  file = cFile;
  return true;
}
