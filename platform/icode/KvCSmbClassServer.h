// The servers of symbol classes: KvCSmbClassServer (one per run, owned by the code view
// data) and its function class server KvCFcnClassServer. The function class server hands
// out the run's default function class (demandFcnClass, made on first demand, without a
// file) and makes further function classes by name (createFcnClass; the code generator
// reads them from the user's configuration, fixtures make them). The classes live as
// long as the server.
#ifndef HUL_PLATFORM_ICODE_KVCSMBCLASSSERVER_H
#define HUL_PLATFORM_ICODE_KVCSMBCLASSSERVER_H

#include "platform/icode/KvCSmbClass.h"

#include <memory>
#include <vector>

class KvCSrcRef;

class HUL_PLATFORM_API KvCFcnClassServer {
public:
  KvCFcnClassServer() = default;
  KvCFcnClassServer(const KvCFcnClassServer&) = delete;
  KvCFcnClassServer& operator=(const KvCFcnClassServer&) = delete;

  // The default function class ("default", no file); the same object on every demand.
  // `srcRef` is the caller's and is not kept.
  KvCFcnClassId* demandFcnClass(const KvCSrcRef* srcRef);
  // A new function class of that name that puts its functions into `file` (may be null).
  KvCFcnClassId* createFcnClass(const WmCXString& name, KvCIcFileId* file);
  int getNumberOfFcnClasses() const { return static_cast<int>(classes.size()); }

private:
  std::vector<std::unique_ptr<KvCFcnClassId>> classes;
  KvCFcnClassId* defaultClass = nullptr;
};

class HUL_PLATFORM_API KvCSmbClassServer {
public:
  KvCSmbClassServer() = default;
  KvCSmbClassServer(const KvCSmbClassServer&) = delete;
  KvCSmbClassServer& operator=(const KvCSmbClassServer&) = delete;

  KvCFcnClassServer* getFcnClassServer() { return &functions; }

private:
  KvCFcnClassServer functions;
};

#endif
