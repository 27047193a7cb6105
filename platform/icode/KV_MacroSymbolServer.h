// KV_MacroSymbolServer: the symbols that macros and generated interface code refer to by
// name: the extern globals, variables of file scope that the generated code only declares
// (in a header), and the global macros, object-like macros of file scope; both found again
// by name.
//
// An extern global is keyed by its name: the run has one extern global per name, declared
// in the file of its first demand, with the type and scaling of that demand. It is made
// through the code generation support (KV_CgsSupporter) with the variable class
// "MacroGlobalExternDefault", so its declaration is a statement of the file's top-level
// table and its name is taken in that file's scope.
//
// A global macro is keyed by its name likewise: one per name in the run, defined in the
// statement table (a file's top level) of its first demand, with that demand's type and
// scaling. It is a variable symbol marked as macro (KvCUnparamSymbol::isGlobalMacro),
// takes its name in the file's scope (the name must be free there, see
// KV_CgsSupporter::isNameFree) and is defined by a macro definition statement appended to
// the table (KV_OP_MACRO_DEFINITION: the macro's access, its type, the file, its value).
// Its value is the identifier the macro stands for: its number among the run's global
// macros (1, 2, ...) as a constant of its type. The C declaration printer writes
// `#define NAME ((Type)1)`, with the type's name where the type asks for its name in casts
// and its typedef is written above, and the type spelled out otherwise.
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
class KvCCStmTable;
class KvCCodeViewData;
class KvCIcFileId;
class KvCSrcRef;
class KvCSymbol;
class KvCUnparamSymbol;
class KvCVarClassServer;

class HUL_PLATFORM_API KV_MacroSymbolServer {
public:
  KV_MacroSymbolServer(KvCCodeViewData* owner, KV_CgsSupporter* supporter,
                       KvCVarClassServer* varClasses)
      : codeViewData(owner), cgsSupporter(supporter), varClassServer(varClasses) {}
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

  // The global macro `name`, defined in `table`. An existing one is answered when it is
  // defined in `table` with the same type and scaling. Null, and nothing made, for a null
  // table or type, a table that is not a file's top level, an existing global macro of the
  // name defined elsewhere or otherwise, or a name that is not free in the table's scope.
  // `srcRef` is the caller's and is not kept.
  KvCUnparamSymbol* demandGlobal(KvCCStmTable* table, const WmCXString& name, KV_DataType* type,
                                 KV_Scaling* scaling, const KvCSrcRef* srcRef);
  // The global macro of that name, or null; the number of global macros made.
  KvCUnparamSymbol* findGlobal(const WmCXString& name) const;
  int getNumberOfGlobals() const { return static_cast<int>(macros.size()); }

private:
  struct Global {
    KvCUnparamSymbol* symbol;
    KvCIcFileId* file;
  };

  struct Macro {
    KvCUnparamSymbol* symbol;
    KvCCStmTable* table;
  };

  KvCCodeViewData* codeViewData;
  KV_CgsSupporter* cgsSupporter;
  KvCVarClassServer* varClassServer;
  std::unordered_map<WmCXString, Global> globals;
  std::unordered_map<WmCXString, Macro> macros;
};

#endif
