// KV_VariableSymbolServer: makes variable symbols that no file declares: local variables,
// and the dummy symbols that stand for the arguments of macro calls in a macro body (an
// access to such a symbol prints as its bare name). Every create makes a new symbol, also
// for a name that another symbol has: the symbol takes no name of any scope, gets no
// declaration statement and is found by no server.
//
// Owned by the symbol server (KV_SymbolServer::getVariable); the symbols belong to the
// symbol database.
#ifndef HUL_PLATFORM_ICODE_KV_VARIABLESYMBOLSERVER_H
#define HUL_PLATFORM_ICODE_KV_VARIABLESYMBOLSERVER_H

#include "platform/support/HulPlatformExport.h"
#include "platform/support/WmCXString.h"

class KV_DataType;
class KV_Scaling;
class KvCCodeViewData;
class KvCSrcRef;
class KvCUnparamSymbol;
class KvCVarClassId;

class HUL_PLATFORM_API KV_VariableSymbolServer {
public:
  explicit KV_VariableSymbolServer(KvCCodeViewData* owner) : codeViewData(owner) {}
  KV_VariableSymbolServer(const KV_VariableSymbolServer&) = delete;
  KV_VariableSymbolServer& operator=(const KV_VariableSymbolServer&) = delete;

  // A new variable `name` of `type` (may be the undefined type), `scaling` and `varClass`,
  // carrying the tagKvESymbolRole bits `roles` (0: none). Null, and nothing made, for an
  // empty name or a null type or class. `srcRef` is the caller's and is not kept.
  KvCUnparamSymbol* create(const WmCXString& name, unsigned int roles, KV_DataType* type,
                           KV_Scaling* scaling, KvCVarClassId* varClass, const KvCSrcRef* srcRef);

private:
  KvCCodeViewData* codeViewData;
};

#endif
