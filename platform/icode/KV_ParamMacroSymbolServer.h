// KV_ParamMacroSymbolServer: finds or makes function-like macros by name in a statement
// table (a file's top level), with their signature (return type and scaling, function
// class, per parameter a name and a flag word) and their body, an expression of the ICode
// (macro calls, preprocessor concatenations, appended text, names).
//
// A new macro is entered in the symbol database as a macro (KvCParamSymbol::isMacro),
// takes its name in the file's scope and is defined in the table: a macro definition
// statement (KV_OP_MACRO_DEFINITION: the macro's access, the location holding the body
// (empty for a macro without body), the table's file) is appended to it, which is what the
// C declaration printer writes as `#define NAME(p1, p2) body`. A pre-include macro is
// written before everything else the file holds.
//
// A name stands for one macro per table. A demand for a name that the table has already
// answers that macro when it agrees (the same number of parameters, the same return type
// and pre-include kind); the body given then is not used (it stays held by nothing, owned
// by the code view data). A demand that does not agree answers null, and find() shows the
// macro that is there. Parameter names, flag words, scaling and class of an existing macro
// are not compared: the first demand set them.
//
// Owned by the symbol server (KV_SymbolServer::getParamMacro); the macros belong to the
// symbol database.
#ifndef HUL_PLATFORM_ICODE_KV_PARAMMACROSYMBOLSERVER_H
#define HUL_PLATFORM_ICODE_KV_PARAMMACROSYMBOLSERVER_H

#include "platform/support/HulPlatformExport.h"
#include "platform/support/WmCXString.h"

#include <map>
#include <utility>

class KV_DataType;
class KV_Scaling;
class KvCCStmTable;
class KvCCodeViewData;
class KvCFcnClassId;
class KvCIcExpression;
class KvCParamSymbol;
class KvCSrcRef;

class HUL_PLATFORM_API KV_ParamMacroSymbolServer {
public:
  explicit KV_ParamMacroSymbolServer(KvCCodeViewData* owner) : codeViewData(owner) {}
  KV_ParamMacroSymbolServer(const KV_ParamMacroSymbolServer&) = delete;
  KV_ParamMacroSymbolServer& operator=(const KV_ParamMacroSymbolServer&) = delete;

  // The macro `name` of `table`, made when the table has none, with `n` parameters named
  // names[0..n-1] (distinct C identifiers) with the flag words paramFlags[0..n-1] (both
  // arrays are not read for n = 0), and `body` (may be null: no body). `*newlyCreated` (when
  // given) says whether this call made the macro; it is false whenever the answer is null.
  // Null, and nothing made, for a null table or one that is not a file's top level, a
  // name that is not free in the table's scope (see KV_CgsSupporter::isNameFree), a null
  // return type, n < 0, missing or invalid parameter names, missing flag words, a body that
  // a location holds already, or a demand that does not agree with the macro of the name
  // (see above). `srcRef` is the caller's and is not kept.
  KvCParamSymbol* demand(KvCCStmTable* table, const WmCXString& name, KV_DataType* returnType,
                         KV_Scaling* returnScaling, int n, const WmCXString* names,
                         const unsigned int* paramFlags, KvCFcnClassId* fcnClass,
                         KvCIcExpression* body, bool preInclude, bool* newlyCreated,
                         const KvCSrcRef* srcRef);
  // The macro `name` of `table`, or null (no creation).
  KvCParamSymbol* find(const KvCCStmTable* table, const WmCXString& name) const;
  // The number of macros made so far, and of demand calls (refused ones included).
  int getNumberOfMacros() const { return static_cast<int>(macros.size()); }
  int getNumberOfDemands() const { return demands; }

private:
  KvCCodeViewData* codeViewData;
  std::map<std::pair<const KvCCStmTable*, WmCXString>, KvCParamSymbol*> macros;
  int demands = 0;
};

#endif
