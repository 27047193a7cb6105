#include "platform/icode/KvCCodeViewData.h"

#include "platform/icode/KV_BaseTypeServer.h"
#include "platform/icode/KV_DataTypeServer.h"
#include "platform/icode/KV_ICodeElem.h"
#include "platform/icode/KV_ICodeFactoryContainer.h"
#include "platform/icode/KV_NumericalTypeServer.h"
#include "platform/icode/KV_ScaleServer.h"
#include "platform/icode/KV_SymbolDB.h"
#include "platform/icode/KV_SymbolServer.h"
#include "platform/icode/KvCAddressQualifier.h"
#include "platform/icode/KvCApplicationServer.h"
#include "platform/icode/KvCExprLocDB.h"
#include "platform/icode/KvCExprLocDBServer.h"
#include "platform/icode/KvCIcApplication.h"
#include "platform/icode/KvCIcFileServer.h"
#include "platform/icode/KvCRtosProtection.h"
#include "platform/icode/KvCSmbClassServer.h"
#include "platform/icode/KvCSymbol.h"
#include "platform/icode/KvCTaskActivation.h"
#include "platform/icode/KvCTemplateServer.h"
#include "platform/support/KvCNameSpace.h"
#include "platform/support/KvCSrcRefServer.h"

#include <algorithm>

namespace {
// The live code view data in order of creation; the last one is the current one.
std::vector<KvCCodeViewData*>& liveCodeViewData() {
  static std::vector<KvCCodeViewData*> live;
  return live;
}
} // namespace

KvCCodeViewData* KvCCodeViewData::getCurrent() {
  const std::vector<KvCCodeViewData*>& live = liveCodeViewData();
  return live.empty() ? nullptr : live.back();
}

KvCCodeViewData::KvCCodeViewData(const WmCXString& applicationName)
    : application(std::make_unique<KvCIcApplication>(applicationName)),
      srcRefServer(std::make_unique<KvCSrcRefServer>()),
      typeServer(std::make_unique<KV_DataTypeServer>()),
      baseTypeServer(std::make_unique<KV_BaseTypeServer>(typeServer.get())),
      numTypeServer(std::make_unique<KV_NumericalTypeServer>(typeServer.get())),
      scalingServer(std::make_unique<KV_ScaleServer>()),
      fileServer(std::make_unique<KvCIcFileServer>(this)),
      symbolDB(std::make_unique<KV_SymbolDB>()),
      dbServer(std::make_unique<KvCExprLocDBServer>(this)),
      factories(std::make_unique<KV_ICodeFactoryContainer>(this)),
      symbolServer(std::make_unique<KV_SymbolServer>(this)),
      smbClassServer(std::make_unique<KvCSmbClassServer>(factories->getVarClassServer())),
      templateServer(std::make_unique<KvCTemplateServer>()),
      applServer(std::make_unique<KvCApplicationServer>(this)) {
  typeServer->setSymbolDB(symbolDB.get());
  for (int l = 0; l < KV_CONV_NUMBER_OF_LEVELS; ++l)
    levels[l] = std::make_unique<KV_OpConversionLevel>(static_cast<tagKvEConversionLevel>(l));
  liveCodeViewData().push_back(this);
}

KvCCodeViewData::~KvCCodeViewData() {
  std::vector<KvCCodeViewData*>& live = liveCodeViewData();
  live.erase(std::remove(live.begin(), live.end(), this), live.end());
  // Owners of databases first (they reset their locations' records), then the elements.
  factories.reset();
  dbServer.reset();
  symbolDB.reset();
  fileServer.reset();
  numTypeServer.reset();
  baseTypeServer.reset();
  typeServer.reset();
  for (auto it = elements.rbegin(); it != elements.rend(); ++it)
    (*it)->~KV_ICodeElem();
  elements.clear();
}

void* KvCCodeViewData::allocate(std::size_t size, std::size_t alignment) {
  constexpr std::size_t kBlockSize = std::size_t{1} << 20;
  std::size_t start = (blockUsed + alignment - 1) / alignment * alignment;
  if (blocks.empty() || start + size > blockSize) {
    blockSize = size > kBlockSize ? size : kBlockSize;
    // operator new[] of unsigned char gives storage aligned for any fundamental type.
    blocks.push_back(std::make_unique<unsigned char[]>(blockSize));
    start = 0;
  }
  blockUsed = start + size;
  return blocks.back().get() + start;
}

KV_OpConversionLevel* KvCCodeViewData::getConversionLevel(tagKvEConversionLevel level) const {
  if (level < 0 || level >= KV_CONV_NUMBER_OF_LEVELS)
    return nullptr;
  return levels[level].get();
}

KvCIcSubAppl* KvCCodeViewData::createSubApplication(const WmCXString& name) {
  subApplications.push_back(std::make_unique<KvCIcSubAppl>(name));
  application->addSubApplication(subApplications.back().get());
  return subApplications.back().get();
}

KvCIcCodeUnit* KvCCodeViewData::createCodeUnit(const WmCXString& name) {
  codeUnits.push_back(std::make_unique<KvCIcCodeUnit>(name));
  return codeUnits.back().get();
}

KvCTaskActivation* KvCCodeViewData::createTaskActivation(int kind, const WmCXString& taskName) {
  taskActivations.push_back(
      std::make_unique<KvCTaskActivation>(static_cast<tagKvETaskActivationKind>(kind), taskName));
  return taskActivations.back().get();
}

KvCRtosProtection* KvCCodeViewData::createRtosProtection(const WmCXString& resourceName) {
  protections.push_back(std::make_unique<KvCRtosProtection>(resourceName));
  return protections.back().get();
}

KvCNameSpace* KvCCodeViewData::createNameSpace() {
  nameSpaces.push_back(std::make_unique<KvCNameSpace>());
  return nameSpaces.back().get();
}

KvCAddressQualifier* KvCCodeViewData::demandAddressQualifier(const WmCXString& name,
                                                             bool isDefault) {
  if (name.isEmpty())
    return nullptr;
  for (const auto& qualifier : addressQualifiers)
    if (qualifier->getName() == name)
      return qualifier.get();
  addressQualifiers.push_back(std::make_unique<KvCAddressQualifier>(name, isDefault));
  return addressQualifiers.back().get();
}

KvCExprLocDB* KvCExprLocDBServer::demandExprLocDB(KV_DataType* type) {
  return type ? type->getExprLocDB() : nullptr;
}

KvCExprLocDB* KvCExprLocDBServer::demandExprLocDB(KvCIcFileId* file) {
  return file ? file->getExprLocDB() : nullptr;
}

void KvCExprLocDBServer::clearExprLocDBs() {
  KV_SymbolDB* symbols = codeViewData->getSymbolDB();
  for (int i = 0; i < symbols->getNumberOfSymbols(); ++i)
    symbols->getSymbol(i)->getExprLocDB()->clear();
  KV_DataTypeServer* types = codeViewData->getDataTypeServer();
  for (int i = 0; i < types->getNumberOfTypes(); ++i)
    if (KvCExprLocDB* db = types->getType(i)->findExprLocDB())
      db->clear();
  KvCIcFileServer* files = codeViewData->getFileServer();
  for (int i = 0; i < files->getNumberOfFiles(); ++i)
    if (KvCExprLocDB* db = files->getFile(i)->findExprLocDB())
      db->clear();
}
