// KvCVarClassServer: the variable classes of a run, one per name, made on first demand
// and the same object on every later demand.
//
// Owned by the factory container; owns its classes, which live as long as it.
#ifndef HUL_PLATFORM_ICODE_KVCVARCLASSSERVER_H
#define HUL_PLATFORM_ICODE_KVCVARCLASSSERVER_H

#include "platform/icode/KvCVarClassId.h"

#include <map>
#include <memory>

class KvCSrcRef;

class HUL_PLATFORM_API KvCVarClassServer {
public:
  KvCVarClassServer() = default;
  KvCVarClassServer(const KvCVarClassServer&) = delete;
  KvCVarClassServer& operator=(const KvCVarClassServer&) = delete;

  // The class of that name. A class made earlier under the name keeps its properties
  // (`isExtern`, `isGlobal` only apply to a new class). Never null.
  KvCVarClassId* demandVarClass(const WmCXString& name, bool isExtern, bool isGlobal);
  // The default class of the extern globals that macros and the RTOS interface use:
  // "MacroGlobalExternDefault", extern and global. `srcRef` is the caller's and is not kept.
  KvCVarClassId* demandMacroGlobalExternDefault(const KvCSrcRef* srcRef);
  // The default class of local variables: "SlLocalDefault", neither extern nor global.
  // Its variables belong to no file scope (the dummy arguments of macro calls, for one).
  // `srcRef` is the caller's and is not kept (may be null).
  KvCVarClassId* demandSlLocalDefault(const KvCSrcRef* srcRef);
  // The class of that name, or null.
  KvCVarClassId* findVarClass(const WmCXString& name) const;

private:
  std::map<WmCXString, std::unique_ptr<KvCVarClassId>> classes;
};

#endif
