#include "platform/icode/KvCIcFileServer.h"

#include "platform/icode/KV_ICodeFactoryContainer.h"
#include "platform/icode/KvCCodeViewData.h"

KvCIcFileServer::~KvCIcFileServer() = default;

KvCIcFileId* KvCIcFileServer::demandFile(const WmCXString& name) {
  if (KvCIcFileId* existing = findFile(name))
    return existing;
  files.push_back(std::make_unique<KvCIcFileId>(getNumberOfFiles(), name));
  KvCIcFileId* file = files.back().get();
  byName.emplace(name, file);
  KvCCStmTable* table =
      codeViewData->getFactoryContainer()->getStatementFactory()->createCStmTable(nullptr, file);
  file->getFile()->setStatementTable(table);
  return file;
}

KvCIcFileId* KvCIcFileServer::findFile(const WmCXString& name) const {
  auto it = byName.find(name);
  return it == byName.end() ? nullptr : it->second;
}

bool KvCIcFileServer::demandPair(const WmCXString& headerName, const WmCXString& cName,
                                 bool unavailable, KvCIcFileId*& headerFile, KvCIcFileId*& cFile) {
  headerFile = nullptr;
  cFile = nullptr;
  if (unavailable)
    return false;
  headerFile = demandFile(headerName);
  cFile = demandFile(cName);
  headerFile->getFile()->setComplementaryFile(cFile);
  cFile->getFile()->setComplementaryFile(headerFile);
  return true;
}

bool KvCIcFileServer::demandRootFiles(KvCIcFileId*& headerFile, KvCIcFileId*& cFile,
                                      const KvCSrcRef* /*srcRef*/) {
  return demandPair("root.h", "root.c", rootFilesUnavailable, headerFile, cFile);
}

bool KvCIcFileServer::demandAcmeFiles(KvCIcFileId*& headerFile, KvCIcFileId*& cFile,
                                      const KvCSrcRef* /*srcRef*/) {
  return demandPair("acme.h", "acme.c", acmeFilesUnavailable, headerFile, cFile);
}

KvCIcFileId* KvCIcFileServer::demandApHeaderFile(const KvCSrcRef* /*srcRef*/) {
  return apHeaderUnavailable ? nullptr : demandFile("ecp_ap.h");
}

bool KvCIcFileServer::demandEcuServiceFile(KvCIcFileId*& file, const KvCSrcRef* /*srcRef*/) {
  file = ecuServiceUnavailable ? nullptr : demandFile("wmecu.h");
  return file != nullptr;
}
