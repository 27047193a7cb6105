// KV_MacroCallInserter: finds or makes the function-like macros that generated code needs
// and builds calls of them.
//
// demandPreIncludeMacroSymbol works through the run's parameterised macro symbol server
// (KV_ParamMacroSymbolServer): the same name in the same file is the same macro, made by
// the first demand with its signature and body and defined before everything else the
// file holds (a pre-include macro); a later demand answers it when it agrees (see there).
// Parameter flag words are the accesses' flag words; the symbol flag word is 0.
//
// insertMacroCall builds a call operation (KvCCallOperation) of a macro: operand 0 the
// access to the macro, then one parameter operation per argument, whose formal is the
// macro's parameter name (a code string) and whose actual the argument's location. The
// call has the macro's type and scaling, the given result range and source reference.
// getCallOperation answers the call the last insertMacroCall made (null after a refused
// one). The C declaration printer writes such a call as `NAME(arg1, arg2)`.
//
// A light object over the factory container (see KV_CallInserter); besides the last call
// it keeps nothing. The caller keeps and deletes the access objects.
#ifndef HUL_PLATFORM_ICODE_KV_MACROCALLINSERTER_H
#define HUL_PLATFORM_ICODE_KV_MACROCALLINSERTER_H

#include "platform/icode/KV_CallInserter.h"
#include "platform/icode/KV_ParamAccess.h"
#include "platform/support/WmCXString.h"

class KV_DataType;
class KV_ExprLocation;
class KV_Range;
class KV_Scaling;
class KV_Statement;
class KvCCallOperation;
class KvCFcnClassId;
class KvCIcExpression;
class KvCIcFileId;
class KvCParamSymbol;
class KvCSrcRef;

class HUL_PLATFORM_API KV_MacroCallInserter : public KV_CallInserter {
public:
  explicit KV_MacroCallInserter(KV_ICodeFactoryContainer* container) : KV_CallInserter(container) {}

  // Builds a call of `macro` with the `n` arguments args[0..n-1], the macro's parameters
  // being used as accesses[0..n-1] say. `asStatement`: the call becomes the root of a new
  // statement appended to the table that holds `statement`; without it the call is left
  // free (held by no location) for the caller to place, and `statement` is not read.
  // `range` (may be null): the call's result range. True when the call was made; false,
  // and nothing made, for a null container or macro, a symbol that is not a macro, a count
  // other than the macro's parameter count, missing arrays or entries, an argument that has
  // a parent or is given twice, or `asStatement` without a statement in a table.
  bool insertMacroCall(KvCParamSymbol* macro, int n, KV_ExprLocation** args,
                       KV_ParamAccess** accesses, bool asStatement, KV_Statement* statement,
                       const KV_Range* range, const KvCSrcRef* srcRef);
  // The call made by the last insertMacroCall, or null (none yet, or the last was refused).
  KvCCallOperation* getCallOperation() const { return lastCall; }

  // The pre-include macro `name` defined in `file`, made when missing, returning `type`
  // with `scaling`, with the `n` parameters names[i] used as accesses[i] say, of
  // `fcnClass`, with `body` (may be null). `mustBeNew`: answer null when the file has the
  // macro already. Null for a null container or file, missing arrays or entries, or
  // whatever the parameterised macro symbol server refuses. `srcRef` is not kept.
  KvCParamSymbol* demandPreIncludeMacroSymbol(const WmCXString& name, KV_DataType* type,
                                              KV_Scaling* scaling, int n, KV_ParamAccess** accesses,
                                              const WmCXString* names, KvCFcnClassId* fcnClass,
                                              KvCIcExpression* body, KvCIcFileId* file,
                                              const KvCSrcRef* srcRef, bool mustBeNew);

private:
  KvCCallOperation* lastCall = nullptr;
};

#endif
