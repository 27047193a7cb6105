// KV_FunctionSymbolServer: finds or makes function symbols by name in a statement table
// (a file's top level), with their signature: return type and scaling, symbol flag word,
// function class, and per formal parameter a type, a scaling, a name and a flag word.
//
// A new function is entered in the symbol database, carries its signature
// (KvCParamSymbol::hasSignature) and is declared in the table: a function declaration
// statement (function access, return type, the table's file) is appended to it, which is
// what the C declaration printer writes as the function's prototype.
//
// A name stands for one function per table. A demand for a name that the table has
// already answers that function when the signatures agree (the same number of parameters,
// identical parameter types and an identical return type); otherwise the demand conflicts
// and answers null, and find() shows the function that is there. The flag words, names,
// scalings and class of an existing function are not compared: the first demand set them.
//
// Owned by the symbol server (KV_SymbolServer::getFunction); the symbols belong to the
// symbol database. The server counts its demands so tests can see who asked.
#ifndef HUL_PLATFORM_ICODE_KV_FUNCTIONSYMBOLSERVER_H
#define HUL_PLATFORM_ICODE_KV_FUNCTIONSYMBOLSERVER_H

#include "platform/leda/array.h"
#include "platform/support/HulPlatformExport.h"
#include "platform/support/WmCXString.h"

#include <map>
#include <utility>

class KV_DataType;
class KV_Scaling;
class KvCCStmTable;
class KvCCodeViewData;
class KvCFcnClassId;
class KvCParamSymbol;
class KvCSrcRef;

class HUL_PLATFORM_API KV_FunctionSymbolServer {
public:
  explicit KV_FunctionSymbolServer(KvCCodeViewData* owner) : codeViewData(owner) {}
  KV_FunctionSymbolServer(const KV_FunctionSymbolServer&) = delete;
  KV_FunctionSymbolServer& operator=(const KV_FunctionSymbolServer&) = delete;

  // The function `name` of `table`, made when the table has none. The parameter tables
  // have equal length n (index range 0..n-1); `paramFlags` holds n flag words (it is not
  // read for n = 0). `*newlyCreated` (when given) is set to whether the function was made
  // by this call; it is false whenever the answer is null. Null for a null table, an
  // empty name, a null return type, tables of unequal length or of another index range,
  // a null parameter type, missing flag words, or a signature that conflicts with the
  // function the table has (see above). `srcRef` is the caller's and is not kept.
  KvCParamSymbol* demand(KvCCStmTable* table, const WmCXString& name, unsigned int flags,
                         KV_DataType* returnType, KV_Scaling* returnScaling,
                         leda::array<KV_DataType*>& types, leda::array<KV_Scaling*>& scalings,
                         leda::array<WmCXString>& names, unsigned int* paramFlags,
                         KvCFcnClassId* fcnClass, bool* newlyCreated, const KvCSrcRef* srcRef);
  // The function `name` of `table`, or null (no creation).
  KvCParamSymbol* find(const KvCCStmTable* table, const WmCXString& name) const;
  // The number of demand calls so far, refused ones included.
  int getNumberOfDemands() const { return demands; }

private:
  KvCCodeViewData* codeViewData;
  std::map<std::pair<const KvCCStmTable*, WmCXString>, KvCParamSymbol*> functions;
  int demands = 0;
};

#endif
