// The servers of symbol classes: KvCSmbClassServer (one per run, owned by the code view
// data) with its function class server KvCFcnClassServer and the run's variable class
// server (KvCVarClassServer, owned by the factory container; getVarClassServer answers
// it, or null for a server made without one). The function class server hands out the
// run's default function class (demandFcnClass, made on first demand, without a file), the
// class of the access-point macros (demandApMacroClass: "ApMacro", without a file, made on
// first demand) and makes further function classes by name (createFcnClass; the code
// generator reads them from the user's configuration, fixtures make them). The symbol
// class server makes the symbol classes (createSmbClass), each standing for a variable
// class and a function class. The classes live as long as the server.
#ifndef HUL_PLATFORM_ICODE_KVCSMBCLASSSERVER_H
#define HUL_PLATFORM_ICODE_KVCSMBCLASSSERVER_H

#include "platform/icode/KvCSmbClass.h"

#include <memory>
#include <vector>

class KvCSrcRef;
class KvCVarClassServer;

class HUL_PLATFORM_API KvCFcnClassServer {
public:
  KvCFcnClassServer() = default;
  KvCFcnClassServer(const KvCFcnClassServer&) = delete;
  KvCFcnClassServer& operator=(const KvCFcnClassServer&) = delete;

  // The default function class ("default", no file); the same object on every demand.
  // `srcRef` is the caller's and is not kept.
  KvCFcnClassId* demandFcnClass(const KvCSrcRef* srcRef);
  // The class of the Ecp tools' access-point macros ("ApMacro", no file); the same object
  // on every demand, distinct from the default class. `srcRef` is not kept.
  KvCFcnClassId* demandApMacroClass(const KvCSrcRef* srcRef);
  // A new function class of that name that puts its functions into `file` (may be null).
  KvCFcnClassId* createFcnClass(const WmCXString& name, KvCIcFileId* file);
  int getNumberOfFcnClasses() const { return static_cast<int>(classes.size()); }

private:
  std::vector<std::unique_ptr<KvCFcnClassId>> classes;
  KvCFcnClassId* defaultClass = nullptr;
  KvCFcnClassId* apMacroClass = nullptr;
};

class HUL_PLATFORM_API KvCSmbClassServer {
public:
  explicit KvCSmbClassServer(KvCVarClassServer* varClasses = nullptr) : variables(varClasses) {}
  KvCSmbClassServer(const KvCSmbClassServer&) = delete;
  KvCSmbClassServer& operator=(const KvCSmbClassServer&) = delete;

  KvCFcnClassServer* getFcnClassServer() { return &functions; }
  KvCVarClassServer* getVarClassServer() { return variables; }

  // A new symbol class `name` of `kind` that stands for `varClass` and `fcnClass` (either
  // may be null); each given class is linked to it (its getSmbClassId answers the new
  // class). Null, and nothing made, for an empty name, a name taken by another symbol
  // class, or a variable or function class that stands for another symbol class already.
  KvCSmbClassId* createSmbClass(const WmCXString& name, tagKvESmbClassKind kind,
                                KvCVarClassId* varClass, KvCFcnClassId* fcnClass);
  // The symbol class of that name, or null.
  KvCSmbClassId* findSmbClass(const WmCXString& name) const;
  int getNumberOfSmbClasses() const { return static_cast<int>(smbClasses.size()); }

private:
  KvCFcnClassServer functions;
  KvCVarClassServer* variables;
  std::vector<std::unique_ptr<KvCSmbClassId>> smbClasses;
};

#endif
