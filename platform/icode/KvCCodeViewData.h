// KvCCodeViewData: the root of one run's ICode. It owns every element, symbol, type,
// scaling, file and server of the run, and hands out the application, the servers and the
// factory container (each getter returns the one instance of the run).
//
// Elements are numbered in creation order (getSerial). Everything lives until the code
// view data is destroyed; the model frees nothing earlier, so pointers into it stay valid
// for the whole run.
#ifndef HUL_PLATFORM_ICODE_KVCCODEVIEWDATA_H
#define HUL_PLATFORM_ICODE_KVCCODEVIEWDATA_H

#include "platform/icode/KV_OpConversionLevel.h"
#include "platform/support/HulPlatformExport.h"
#include "platform/support/WmCXString.h"

#include <cstddef>
#include <memory>
#include <new>
#include <utility>
#include <vector>

class KV_BaseTypeServer;
class KvCAddressQualifier;
class KV_DataTypeServer;
class KV_ICodeElem;
class KV_ICodeFactoryContainer;
class KV_NumericalTypeServer;
class KV_ScaleServer;
class KV_SymbolDB;
class KV_SymbolServer;
class KvCApplicationServer;
class KvCSmbClassServer;
class KvCTemplateServer;
class KvCExprLocDBServer;
class KvCIcApplication;
class KvCIcCodeUnit;
class KvCIcFileServer;
class KvCIcSubAppl;
class KvCNameSpace;
class KvCRoDatabase;
class KvCRtosProtection;
class KvCSrcRefServer;
class KvCTaskActivation;

class HUL_PLATFORM_API KvCCodeViewData {
public:
  // The new code view data becomes the current one of the process.
  explicit KvCCodeViewData(const WmCXString& applicationName = "Application");
  ~KvCCodeViewData();

  // The code view data of the run: the most recently made one still alive, or null. The
  // ICode's services that take no model argument (the symbol database of a call graph's
  // construction) reach the run through it.
  static KvCCodeViewData* getCurrent();
  KvCCodeViewData(const KvCCodeViewData&) = delete;
  KvCCodeViewData& operator=(const KvCCodeViewData&) = delete;

  KvCIcApplication* getApplication() const { return application.get(); }
  KvCExprLocDBServer* getExprLocDBServer() const { return dbServer.get(); }
  KvCSrcRefServer* getSrcRefServer() const { return srcRefServer.get(); }
  KV_SymbolDB* getSymbolDB() const { return symbolDB.get(); }
  KV_DataTypeServer* getDataTypeServer() const { return typeServer.get(); }
  KV_BaseTypeServer* getBaseTypeServer() const { return baseTypeServer.get(); }
  KV_NumericalTypeServer* getNumTypeServer() const { return numTypeServer.get(); }
  KV_ScaleServer* getScalingServer() const { return scalingServer.get(); }
  KvCIcFileServer* getFileServer() const { return fileServer.get(); }
  KV_ICodeFactoryContainer* getFactoryContainer() const { return factories.get(); }
  KV_SymbolServer* getSymbolServer() const { return symbolServer.get(); }
  KvCSmbClassServer* getSmbClassServer() const { return smbClassServer.get(); }
  KvCTemplateServer* getTemplateServer() const { return templateServer.get(); }
  KvCApplicationServer* getApplServer() const { return applServer.get(); }
  KV_OpConversionLevel* getConversionLevel(tagKvEConversionLevel level) const;

  // The RTOS database of the run, or null when none was set. Not owned: whoever makes the
  // database keeps it, and it must outlive every use through the code view data.
  KvCRoDatabase* getRtosDatabase() const { return rtosDatabase; }
  void setRtosDatabase(KvCRoDatabase* database) { rtosDatabase = database; }

  // Parts of the application tree and descriptors; owned here.
  KvCIcSubAppl* createSubApplication(const WmCXString& name);
  KvCIcCodeUnit* createCodeUnit(const WmCXString& name);
  KvCTaskActivation* createTaskActivation(int kind, const WmCXString& taskName);
  KvCRtosProtection* createRtosProtection(const WmCXString& resourceName);
  KvCNameSpace* createNameSpace();
  // The address qualifier of that name, made on first demand; `isDefault` only applies to
  // a new qualifier (a qualifier keeps what it was made with). Null for an empty name.
  KvCAddressQualifier* demandAddressQualifier(const WmCXString& name, bool isDefault);

  // Makes a new element of type T, numbered with the next serial number (its first
  // constructor argument) and owned here. Elements live in large blocks in creation
  // order, so that walks over the ICode touch memory mostly in sequence.
  template <class T, class... A> T* make(A&&... args) {
    void* place = allocate(sizeof(T), alignof(T));
    T* elem = ::new (place) T(nextSerial(), std::forward<A>(args)...);
    elements.push_back(elem);
    return elem;
  }
  int nextSerial() const { return static_cast<int>(elements.size()); }
  int getNumberOfElements() const { return static_cast<int>(elements.size()); }

private:
  void* allocate(std::size_t size, std::size_t alignment);

  // Blocks of element storage and the elements in creation order. The elements are
  // destroyed after the symbols, types and files: their databases reset the records of
  // their locations when they go.
  std::vector<std::unique_ptr<unsigned char[]>> blocks;
  std::size_t blockUsed = 0;
  std::size_t blockSize = 0;
  std::vector<KV_ICodeElem*> elements;
  std::unique_ptr<KvCIcApplication> application;
  std::vector<std::unique_ptr<KvCIcSubAppl>> subApplications;
  std::vector<std::unique_ptr<KvCIcCodeUnit>> codeUnits;
  std::vector<std::unique_ptr<KvCTaskActivation>> taskActivations;
  std::vector<std::unique_ptr<KvCRtosProtection>> protections;
  std::vector<std::unique_ptr<KvCNameSpace>> nameSpaces;
  std::vector<std::unique_ptr<KvCAddressQualifier>> addressQualifiers;
  std::unique_ptr<KV_OpConversionLevel> levels[KV_CONV_NUMBER_OF_LEVELS];
  std::unique_ptr<KvCSrcRefServer> srcRefServer;
  std::unique_ptr<KV_DataTypeServer> typeServer;
  std::unique_ptr<KV_BaseTypeServer> baseTypeServer;
  std::unique_ptr<KV_NumericalTypeServer> numTypeServer;
  std::unique_ptr<KV_ScaleServer> scalingServer;
  std::unique_ptr<KvCIcFileServer> fileServer;
  std::unique_ptr<KV_SymbolDB> symbolDB;
  std::unique_ptr<KvCExprLocDBServer> dbServer;
  std::unique_ptr<KV_ICodeFactoryContainer> factories;
  std::unique_ptr<KV_SymbolServer> symbolServer;
  std::unique_ptr<KvCSmbClassServer> smbClassServer;
  std::unique_ptr<KvCTemplateServer> templateServer;
  std::unique_ptr<KvCApplicationServer> applServer;
  KvCRoDatabase* rtosDatabase = nullptr;
};

#endif
