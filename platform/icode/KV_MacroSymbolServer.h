// KV_MacroSymbolServer: the symbols that macros and generated interface code refer to by
// name. Today these are the extern globals: variables of file scope that the generated
// code only declares (in a header), found again by name.
//
// An extern global is keyed by its name: the run has one extern global per name, declared
// in the file of its first demand, with the type and scaling of that demand. It is made
// through the code generation support (KV_CgsSupporter) with the variable class
// "MacroGlobalExternDefault", so its declaration is a statement of the file's top-level
// table and its name is taken in that file's scope.
//
// Owned by the factory container. It owns nothing: the symbols belong to the code view
// data. Finding a global by name is O(1).
#ifndef HUL_PLATFORM_ICODE_KV_MACROSYMBOLSERVER_H
#define HUL_PLATFORM_ICODE_KV_MACROSYMBOLSERVER_H

#include "platform/support/HulPlatformExport.h"
#include "platform/support/WmCXString.h"

#include <unordered_map>

class KV_CgsSupporter;
class KV_DataType;
class KV_Scaling;
class KvCIcFileId;
class KvCSrcRef;
class KvCSymbol;
class KvCUnparamSymbol;
class KvCVarClassServer;

class HUL_PLATFORM_API KV_MacroSymbolServer {
public:
  KV_MacroSymbolServer(KV_CgsSupporter* supporter, KvCVarClassServer* varClasses)
      : cgsSupporter(supporter), varClassServer(varClasses) {}
  KV_MacroSymbolServer(const KV_MacroSymbolServer&) = delete;
  KV_MacroSymbolServer& operator=(const KV_MacroSymbolServer&) = delete;

  // The extern global `name`, declared in `file`. An existing one is answered when it is
  // declared in `file` with the same type and scaling; `*created` (when given) says whether
  // this call made it, and is false on every other answer. Null, and nothing made, for a
  // null file or type, a name that is not a C identifier, an existing global of the name
  // declared elsewhere or otherwise, or a name taken in the file's scope by something else
  // (see KV_CgsSupporter). `srcRef` is the caller's and is not kept.
  KvCSymbol* demandExternGlobal(KvCIcFileId* file, const WmCXString& name, KV_DataType* type,
                                KV_Scaling* scaling, bool* created, const KvCSrcRef* srcRef);
  // The extern global of that name, or null.
  KvCUnparamSymbol* findExternGlobal(const WmCXString& name) const;

private:
  struct Global {
    KvCUnparamSymbol* symbol;
    KvCIcFileId* file;
  };

  KV_CgsSupporter* cgsSupporter;
  KvCVarClassServer* varClassServer;
  std::unordered_map<WmCXString, Global> globals;
};

#endif
