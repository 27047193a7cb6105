// KvCElocQuery: predicates and small navigation functions over one expression location
// of the ICode. They tell where a location stands (the operation that holds it and its
// operand position, the statement, table, function and file around it), what it holds
// once casts are skipped, and whether it takes part in a call, an assignment, a
// declaration or definition, a loop condition, an index expression or a const
// conversion. Nothing is changed in the model, and nothing is cached: every answer is
// read from the model at the time of the call.
//
// Every location argument must be non-null (isRestartDef accepts null). A missing
// element on the way (no parent operation, statement, table, symbol or type, an empty
// operand slot, an operation held by no location) makes a Boolean query false and a
// pointer query null; nothing is reported. A location outside every statement lies in no
// file, function or protected area.
//
// Out-parameters: where a function's comment says "reset", the out-parameters are set
// (to null, false or 0) before the first test, so they hold the reset value, or what the
// query found before it failed, when it answers false. All other out-parameters keep the
// caller's value when the query fails before it reaches them.
//
// Costs: the queries that walk upwards (through casts, parent operations, statements or
// tables) are linear in the depth of the walk; the place queries also pay the depth of
// the location in its statement. All others are constant.
//
// Formal-variable exclusion: isActualOfCallRetrieveFormal gives no formal that is a
// reference formal (KvCUnparamSymbol::isReferenceFormal). Such a formal aliases the
// caller's object and never stands for a copy of the actual argument.
//
// A symbol access is an operation of the model; where a query starts from "the location's
// own operation" (isLocatedInLoopCondition), a location that holds a symbol access counts
// as holding no operation.
#ifndef HULCVTOOLS_ELOCQUERY_KVCELOCQUERY_H
#define HULCVTOOLS_ELOCQUERY_KVCELOCQUERY_H

#include "HulCvTools/HulCvToolsExport.h"
#include "HulCvTools/ModelInterfaces/ICodeFwd.h"

#include <cstdint>

class HULCV_API KvCElocQuery {
public:
  KvCElocQuery() = default;
  KvCElocQuery(const KvCElocQuery&) = default;
  KvCElocQuery& operator=(const KvCElocQuery& other);

  // --- navigation through casts

  // What `eloc` holds below any chain of casts (each cast's operand 0). Resets both
  // out-parameters: `elocOfExpr` becomes the innermost location (null when a cast has an
  // empty operand slot, together with a null result), `nrOfCasts` the casts passed.
  static KvCIcExpression* getExprBySkippingCasts(KV_ExprLocation* eloc,
                                                 KV_ExprLocation*& elocOfExpr, int& nrOfCasts);
  static KvCIcExpression* getExprBySkippingCasts(KV_ExprLocation* eloc);
  // What the outermost location of the chain of casts enclosing `eloc` holds (`eloc`'s own
  // expression when its parent is no cast). Resets both out-parameters: `parentEloc`
  // becomes that location (null, with a null result, when a cast is held by no location),
  // `nrOfCasts` the casts passed.
  static KvCIcExpression*
  getParentELocBySkippingCasts(KV_ExprLocation* eloc, KV_ExprLocation*& parentEloc, int& nrOfCasts);

  // --- constants, looked at below the casts

  // Resets `constant` to the constant found, or null.
  static bool containsConstant(KV_ExprLocation* eloc, KV_Constant*& constant);
  static bool containsConstant(KV_ExprLocation* eloc);
  // Compares the value as written for an untyped constant, the typed integer value for an
  // integer-typed one and the double value (FPS_ValuesAreEqual) for a floating one.
  static bool containsConstantWithValue(KV_ExprLocation* eloc, std::int64_t value);
  static bool containsConstantWithNegativValue(KV_ExprLocation* eloc);
  // Both hold equal symbol accesses, strict qualification included.
  static bool containEqualQsos(KV_ExprLocation* eloc1, KV_ExprLocation* eloc2);

  // --- place of the location: statement, table, function, file

  // The function or macro whose body contains the location.
  static KvCParamSymbol* getCodeBlockSymbol(KV_ExprLocation* eloc);
  static KvCParamSymbol* getParentParametrizedSymbol(KV_ExprLocation* eloc);
  static KvCIcFileId* getFile(KV_ExprLocation* eloc);
  static bool isLocatedInStubFile(KV_ExprLocation* eloc);
  static bool isLocatedInDDBasedFile(KV_ExprLocation* eloc);
  static bool isLocatedInUserFile(KV_ExprLocation* eloc);
  static bool isLocatedInArtificialFile(KV_ExprLocation* eloc);
  // Reset `codeBlock` / `function`; they hold the enclosing function whenever there is
  // one, also when the answer is false.
  static bool isLocatedInImportedCodeBlock(KV_ExprLocation* eloc, KvCParamSymbol*& codeBlock);
  static bool isLocatedInRestartFunction(KV_ExprLocation* eloc, KvCParamSymbol*& function);
  static bool isLocatedInRestartFunction(KV_ExprLocation* eloc);
  static bool isLocatedInReusedFunction(KV_ExprLocation* eloc);
  // A table between the statement and the top of its code block (both included) forms an
  // RTOS protected area.
  static bool isInRtosProtectedArea(KV_ExprLocation* eloc);
  // The location lies, through operations only, below a code block operation.
  static bool isLocatedInCodeBlockOp(KV_ExprLocation* eloc);

  // --- declarations and definitions (the parent operation's kind)

  // A static declaration or definition, or a type definition that holds an access to a
  // variable defining a vector width at this location.
  static bool isStaticDeclDef(KV_ExprLocation* eloc);
  static bool isStaticDef(KV_ExprLocation* eloc);
  static bool isStaticDecl(KV_ExprLocation* eloc);
  // A static declaration or definition, or any operand of an operation in the body of a
  // restart function.
  static bool isStaticDeclDefOrRestart(KV_ExprLocation* eloc);
  // False for null.
  static bool isRestartDef(KV_ExprLocation* eloc);
  // The location is read, through every operation up to it, by an initial value of a
  // variable definition.
  static bool isUsedInVariableDefinition(KV_ExprLocation* eloc);

  // --- operand roles

  static bool isAssign(KV_ExprLocation* eloc);
  static bool isLhsOfAssign(KV_ExprLocation* eloc);
  static bool isRhsOfAssign(KV_ExprLocation* eloc);
  // The side of an assignment that holds a whole structure, directly or dereferenced.
  static bool isLhsOfStructAssignment(KV_ExprLocation* eloc);
  static bool isRhsOfStructAssignment(KV_ExprLocation* eloc);
  static bool isUsedInParentOp(KV_ExprLocation* eloc);
  static bool isDefinedInParentOp(KV_ExprLocation* eloc);
  static bool isOnlyUsedInParentOp(KV_ExprLocation* eloc);
  static bool isOnlyDefinedInParentOp(KV_ExprLocation* eloc);
  static bool isStrictlyQualifiedSymbol(KV_ExprLocation* eloc);
  // The location lies, through operations only, in an index expression of a symbol
  // access. Resets `qso` to the nearest such access, or null.
  static bool isContainedInIndexOperation(KV_ExprLocation* eloc, KV_QualifiedSymbolOp*& qso);
  static bool isContainedInIndexOperation(KV_ExprLocation* eloc);

  // --- control-flow context

  // The location's own operation is, or lies within, a loop condition.
  static bool isLocatedInLoopCondition(KV_ExprLocation* eloc);
  // The location lies in the initialisation (operand 0) of a for loop.
  static bool isLocatedInInitOfForLoopCondition(KV_ExprLocation* eloc);
  static bool isPartOfPreProcControlFlow(KV_ExprLocation* eloc);
  // Some enclosing operation is a logical or relational operator.
  static bool isPartOfBooleanLogicExpression(KV_ExprLocation* eloc);

  // --- calls

  // The location is an operand of a parameter operation: the formal (operand 0) when only
  // `formal` is asked, the actual (operand 1) when only `actual` is, either for both.
  static bool isParamOfCall(KV_ExprLocation* eloc, bool formal, bool actual);
  static bool isFormalOfCall(KV_ExprLocation* eloc);
  static bool isActualOfCall(KV_ExprLocation* eloc);
  // The call (and the called function or macro) whose parameter holds the location. Resets
  // all four out-parameters. The formal/actual flags are set as soon as the parameter is
  // known to have a parent operation, so they may be set on false: when that operation is
  // no call, or when the called symbol cannot be found (then `callOp` is set too).
  static bool getCallOpIfParamOfCall(KV_ExprLocation* eloc, bool& isFormal, bool& isActual,
                                     KV_Operation*& callOp, KvCParamSymbol*& calledSymbol);
  // The symbol accessed at operand 0 of the call whose parameter holds the location. Resets
  // `calledSymbol`; false when that operand holds no access to a symbol.
  static bool isInCallOp(KV_ExprLocation* eloc, KvCSymbol*& calledSymbol);
  // The location is a parameter of a call of a logging macro. `callOp` is set to the call
  // once one is found (also when the answer is false); else it keeps the caller's value.
  static bool isLogValInLogMacro(KV_ExprLocation* eloc, KV_Operation*& callOp);
  static bool isLogValInLogMacro(KV_ExprLocation* eloc);
  // The location holds a call of a function or macro. Resets `calledSymbol`.
  static bool containsCallTo(KV_ExprLocation* eloc, KvCParamSymbol*& calledSymbol);
  // The location is an actual whose formal is a variable that is no reference formal.
  // `formal` is reset once the formal's location is known to hold a symbol access; else
  // it keeps the caller's value.
  static bool isActualOfCallRetrieveFormal(KV_ExprLocation* eloc, KvCUnparamSymbol*& formal);
  static bool isActualOfCallWithScalarFormal(KV_ExprLocation* eloc);
  // The location lies in an actual argument expression (below it, through pointer casts
  // at most up to the first other operation) whose formal is a pointer to const.
  static bool isActualOfCallWithConstantFormal(KV_ExprLocation* eloc);
  // The location is an actual, possibly wrapped in pointer casts.
  static bool isActualOfCallSkipPointerCasts(KV_ExprLocation* eloc);
  static bool isFormalOfCallToSfExternCUserFcn(KV_ExprLocation* eloc);
  // The location is a formal whose actual holds, below casts, a string emitted as code or
  // in quotes.
  static bool isFormalOfCallReceivingString(KV_ExprLocation* eloc);

  // --- const conversions

  // The location is the operand of a cast to a pointer to const.
  static bool isSubjectToConstCast(KV_ExprLocation* eloc);
  // A const cast, an actual of a pointer-to-const formal, or (below any casts) an operand
  // of a plain assignment whose left side is a pointer to const.
  static bool isSubjectToConstConversion(KV_ExprLocation* eloc);
};

#endif
