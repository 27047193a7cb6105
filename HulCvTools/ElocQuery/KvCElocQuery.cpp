#include "HulCvTools/ElocQuery/KvCElocQuery.h"

#include "HulCvTools/ModelInterfaces/ICodeModel.h"
#include "platform/support/FPS.h"

namespace {

const KV_OpOperator* parentOperator(KV_ExprLocation* eloc) {
  KV_Operation* op = eloc->getParentOperation();
  return op ? op->getOperator() : nullptr;
}

bool isCast(KV_Operation* op) { return op && op->getOperator()->isCast(); }

bool isPointerToConst(KV_DataType* type) {
  KV_PointerType* pointer = type ? type->asPointerType() : nullptr;
  return pointer && pointer->isPointerToConst();
}

// A cast with a target type that is a pointer.
bool isPointerCast(KV_Operation* cast) {
  KV_DataType* target = cast->getDataType();
  return target && target->asPointerType();
}

// Null for a null location, a location without access, an access without symbol.
KvCSymbol* accessedSymbol(KV_ExprLocation* eloc) {
  KV_QualifiedSymbolOp* qso = eloc ? eloc->getQualifiedSymbolOp() : nullptr;
  return qso ? qso->getSymbol() : nullptr;
}

KV_QualifiedSymbolOp* qsoBelowCasts(KV_ExprLocation* eloc) {
  KvCIcExpression* expr = KvCElocQuery::getExprBySkippingCasts(eloc);
  return expr ? expr->asQualifiedSymbolOp() : nullptr;
}

KV_Constant* constantBelowCasts(KV_ExprLocation* eloc) {
  KvCIcExpression* expr = KvCElocQuery::getExprBySkippingCasts(eloc);
  return expr ? expr->asConstant() : nullptr;
}

// The C table of the statement's parent table.
KvCCStmTable* cTableAround(KV_Statement* statement) {
  KV_StatementTable* table = statement ? statement->getParentTable() : nullptr;
  return table ? table->getCTable() : nullptr;
}

// The code block symbol reached through the statement's parent C table.
KvCParamSymbol* enclosingCodeBlock(KV_ExprLocation* eloc) {
  KV_Statement* statement = eloc->getStatement();
  KvCCStmTable* table = statement ? statement->getParentCTable() : nullptr;
  return table ? table->getCodeBlockSymbol() : nullptr;
}

KvCIcFile* enclosingFile(KV_ExprLocation* eloc) {
  KvCIcFileId* file = KvCElocQuery::getFile(eloc);
  return file ? file->getFile() : nullptr;
}

// The called function or macro: named by a call operation itself, else accessed at
// operand 0.
KvCParamSymbol* calledParamSymbol(KV_Operation* call) {
  if (KvCCallOperation* callOp = call->asCallOperation())
    return callOp->getCalledSymbol();
  KvCSymbol* symbol = accessedSymbol(call->getOperand(0));
  return symbol ? symbol->asParamSymbol() : nullptr;
}

// The call whose parameter operation holds `eloc` (at any position), or null.
KV_Operation* callAroundParameter(KV_ExprLocation* eloc) {
  KV_Operation* parameter = eloc->getParentOperation();
  if (!parameter || !parameter->getOperator()->isParameter())
    return nullptr;
  KV_Operation* call = parameter->getParentOperation();
  if (!call || !call->getOperator()->isCall())
    return nullptr;
  return call;
}

// The formal's location of the parameter operation that holds the actual `eloc`.
KV_ExprLocation* formalOfActual(KV_ExprLocation* eloc) {
  return eloc->getParentOperation()->getOperand(0);
}

// A whole structure, accessed directly or through a pointer.
bool holdsWholeStruct(KV_ExprLocation* eloc) {
  KV_QualifiedSymbolOp* qso = eloc->getQualifiedSymbolOp();
  if (!qso)
    return false;
  return KvCAccessQsoQuery::isPlainStructAccess(qso) ||
         KvCAccessQsoQuery::isDerefPointerToStructAccess(qso);
}

bool isIndexOf(KV_QualifiedSymbolOp* qso, KV_ExprLocation* eloc) {
  for (int dim = 0; dim < qso->getResolvedNumberOfDims(); ++dim)
    if (qso->getIndexElocForDim(dim) == eloc)
      return true;
  return false;
}

// The operation the location holds; a symbol access counts as none.
KV_Operation* ownOperation(KV_ExprLocation* eloc) {
  KV_Operation* op = eloc->getOperation();
  return op && !op->asQualifiedSymbolOp() ? op : nullptr;
}

bool isBooleanLogic(const KV_OpOperator* oper) { return oper->isLogical() || oper->isRelational(); }

} // namespace

KvCElocQuery& KvCElocQuery::operator=(const KvCElocQuery&) { return *this; }

// --- navigation through casts

KvCIcExpression* KvCElocQuery::getExprBySkippingCasts(KV_ExprLocation* eloc,
                                                      KV_ExprLocation*& elocOfExpr,
                                                      int& nrOfCasts) {
  nrOfCasts = 0;
  elocOfExpr = nullptr;
  KV_Operation* op = eloc->getOperation();
  while (isCast(op)) {
    ++nrOfCasts;
    eloc = op->getOperand(0);
    if (!eloc)
      return nullptr;
    op = eloc->getOperation();
  }
  elocOfExpr = eloc;
  return eloc->getExpression();
}

KvCIcExpression* KvCElocQuery::getExprBySkippingCasts(KV_ExprLocation* eloc) {
  KV_ExprLocation* elocOfExpr = nullptr;
  int nrOfCasts = 0;
  return getExprBySkippingCasts(eloc, elocOfExpr, nrOfCasts);
}

KvCIcExpression* KvCElocQuery::getParentELocBySkippingCasts(KV_ExprLocation* eloc,
                                                            KV_ExprLocation*& parentEloc,
                                                            int& nrOfCasts) {
  nrOfCasts = 0;
  parentEloc = nullptr;
  KV_Operation* op = eloc->getParentOperation();
  while (isCast(op)) {
    ++nrOfCasts;
    eloc = op->getParent();
    if (!eloc)
      return nullptr;
    op = eloc->getParentOperation();
  }
  parentEloc = eloc;
  return eloc->getExpression();
}

// --- constants

bool KvCElocQuery::containsConstant(KV_ExprLocation* eloc, KV_Constant*& constant) {
  constant = constantBelowCasts(eloc);
  return constant != nullptr;
}

bool KvCElocQuery::containsConstant(KV_ExprLocation* eloc) {
  return constantBelowCasts(eloc) != nullptr;
}

bool KvCElocQuery::containsConstantWithValue(KV_ExprLocation* eloc, std::int64_t value) {
  KV_Constant* constant = constantBelowCasts(eloc);
  if (!constant)
    return false;
  if (!constant->hasDataType())
    return constant->getIntValue() == value;
  if (!constant->getDataType()->isFloat())
    return constant->getTypedIntValue() == value;
  return FPS_ValuesAreEqual(constant->getDoubleValue(), static_cast<double>(value));
}

bool KvCElocQuery::containsConstantWithNegativValue(KV_ExprLocation* eloc) {
  KV_Constant* constant = constantBelowCasts(eloc);
  return constant && constant->isNegative();
}

bool KvCElocQuery::containEqualQsos(KV_ExprLocation* eloc1, KV_ExprLocation* eloc2) {
  KV_QualifiedSymbolOp* qso1 = qsoBelowCasts(eloc1);
  KV_QualifiedSymbolOp* qso2 = qsoBelowCasts(eloc2);
  if (!qso1 || !qso2)
    return false;
  return qso1->isEqual(qso2, false);
}

// --- place of the location

KvCParamSymbol* KvCElocQuery::getCodeBlockSymbol(KV_ExprLocation* eloc) {
  KvCCStmTable* table = cTableAround(eloc->getStatement());
  return table ? table->getCodeBlockSymbol() : nullptr;
}

KvCParamSymbol* KvCElocQuery::getParentParametrizedSymbol(KV_ExprLocation* eloc) {
  return enclosingCodeBlock(eloc);
}

KvCIcFileId* KvCElocQuery::getFile(KV_ExprLocation* eloc) {
  KvCCStmTable* table = cTableAround(eloc->getStatement());
  return table ? table->getFile() : nullptr;
}

bool KvCElocQuery::isLocatedInStubFile(KV_ExprLocation* eloc) {
  KvCIcFile* file = enclosingFile(eloc);
  return file && file->isStubFile();
}

bool KvCElocQuery::isLocatedInDDBasedFile(KV_ExprLocation* eloc) {
  KvCIcFile* file = enclosingFile(eloc);
  return file && file->getCodegenBase() == KV_CODEGEN_BASE_DD;
}

bool KvCElocQuery::isLocatedInUserFile(KV_ExprLocation* eloc) {
  KvCIcFile* file = enclosingFile(eloc);
  return file && file->getResponsibility() == KV_FILE_RESPONSIBILITY_USER;
}

bool KvCElocQuery::isLocatedInArtificialFile(KV_ExprLocation* eloc) {
  KvCIcFile* file = enclosingFile(eloc);
  return file && file->isArtificial();
}

bool KvCElocQuery::isLocatedInImportedCodeBlock(KV_ExprLocation* eloc, KvCParamSymbol*& codeBlock) {
  codeBlock = enclosingCodeBlock(eloc);
  if (!codeBlock)
    return false;
  return KvCSymbolQuery::isCodeBlockImported(codeBlock);
}

bool KvCElocQuery::isLocatedInRestartFunction(KV_ExprLocation* eloc, KvCParamSymbol*& function) {
  function = enclosingCodeBlock(eloc);
  return function && function->isRestartFunction();
}

bool KvCElocQuery::isLocatedInRestartFunction(KV_ExprLocation* eloc) {
  KvCParamSymbol* function = nullptr;
  return isLocatedInRestartFunction(eloc, function);
}

bool KvCElocQuery::isLocatedInReusedFunction(KV_ExprLocation* eloc) {
  KvCParamSymbol* function = enclosingCodeBlock(eloc);
  return function && function->isReuseMasterFunction();
}

bool KvCElocQuery::isInRtosProtectedArea(KV_ExprLocation* eloc) {
  KV_Statement* statement = eloc->getStatement();
  while (statement) {
    KV_StatementTable* table = statement->getParentTable();
    if (!table)
      return false;
    if (table->getRtosProtection())
      return true;
    if (table->isCodeBlockTop())
      return false;
    statement = table->getParentStatement();
  }
  return false;
}

bool KvCElocQuery::isLocatedInCodeBlockOp(KV_ExprLocation* eloc) {
  KV_ICodeElem* parent = eloc->getParent();
  while (KV_Operation* op = parent ? parent->asOperation() : nullptr) {
    if (op->asCodeBlockOperation())
      return true;
    KV_ExprLocation* holder = op->getParent();
    if (!holder)
      return false;
    parent = holder->getParent();
  }
  return false;
}

// --- declarations and definitions

bool KvCElocQuery::isStaticDeclDef(KV_ExprLocation* eloc) {
  const KV_OpOperator* oper = parentOperator(eloc);
  if (!oper)
    return false;
  if (oper->isStaticDeclDef())
    return true;
  if (!oper->isTypeDefinition())
    return false;
  KvCSymbol* symbol = accessedSymbol(eloc);
  KvCUnparamSymbol* variable = symbol ? symbol->asUnparamSymbol() : nullptr;
  return variable && variable->definesVectorWidth();
}

bool KvCElocQuery::isStaticDef(KV_ExprLocation* eloc) {
  const KV_OpOperator* oper = parentOperator(eloc);
  if (!oper)
    return false;
  return oper->isVariableDefinition() || oper->isFurtherDefinition1() ||
         oper->isFurtherDefinition2() || oper->isFunctionDefinition();
}

bool KvCElocQuery::isStaticDecl(KV_ExprLocation* eloc) {
  const KV_OpOperator* oper = parentOperator(eloc);
  if (!oper)
    return false;
  return oper->isVariableDeclaration() || oper->isFunctionDeclaration();
}

bool KvCElocQuery::isStaticDeclDefOrRestart(KV_ExprLocation* eloc) {
  KV_Operation* op = eloc->getParentOperation();
  if (!op)
    return false;
  if (op->getOperator()->isStaticDeclDef())
    return true;
  KV_Statement* statement = op->findParentStatement();
  KvCCStmTable* table = statement ? statement->getParentCTable() : nullptr;
  KvCParamSymbol* function = table ? table->getCodeBlockSymbol() : nullptr;
  return function && function->isRestartFunction();
}

bool KvCElocQuery::isRestartDef(KV_ExprLocation* eloc) {
  if (!eloc)
    return false;
  return KvCQsoExprLocDB::isRestartDef(eloc);
}

bool KvCElocQuery::isUsedInVariableDefinition(KV_ExprLocation* eloc) {
  int index = eloc->getIndexInParent();
  KV_Operation* op = eloc->getParentOperation();
  while (op) {
    if (!op->usesOperand(index))
      return false;
    if (op->getOperator()->isVariableDefinition() && index > 2)
      return true;
    KV_ExprLocation* holder = op->getParent();
    if (!holder)
      return false;
    index = holder->getIndexInParent();
    op = holder->getParentOperation();
  }
  return false;
}

// --- operand roles

bool KvCElocQuery::isAssign(KV_ExprLocation* eloc) {
  const KV_OpOperator* oper = parentOperator(eloc);
  return oper && oper->isAssign();
}

bool KvCElocQuery::isLhsOfAssign(KV_ExprLocation* eloc) {
  return isAssign(eloc) && eloc->getIndexInParent() == 0;
}

bool KvCElocQuery::isRhsOfAssign(KV_ExprLocation* eloc) {
  return isAssign(eloc) && eloc->getIndexInParent() == 1;
}

bool KvCElocQuery::isLhsOfStructAssignment(KV_ExprLocation* eloc) {
  return isLhsOfAssign(eloc) && holdsWholeStruct(eloc);
}

bool KvCElocQuery::isRhsOfStructAssignment(KV_ExprLocation* eloc) {
  return isRhsOfAssign(eloc) && holdsWholeStruct(eloc);
}

bool KvCElocQuery::isUsedInParentOp(KV_ExprLocation* eloc) {
  KV_Operation* op = eloc->getParentOperation();
  return op && op->usesOperand(eloc->getIndexInParent());
}

bool KvCElocQuery::isDefinedInParentOp(KV_ExprLocation* eloc) {
  KV_Operation* op = eloc->getParentOperation();
  return op && op->definesOperand(eloc->getIndexInParent());
}

bool KvCElocQuery::isOnlyUsedInParentOp(KV_ExprLocation* eloc) {
  return isUsedInParentOp(eloc) && !isDefinedInParentOp(eloc);
}

bool KvCElocQuery::isOnlyDefinedInParentOp(KV_ExprLocation* eloc) {
  return !isUsedInParentOp(eloc) && isDefinedInParentOp(eloc);
}

bool KvCElocQuery::isStrictlyQualifiedSymbol(KV_ExprLocation* eloc) {
  KV_QualifiedSymbolOp* qso = eloc->getQualifiedSymbolOp();
  return qso && qso->isStrictlyQualified(0);
}

bool KvCElocQuery::isContainedInIndexOperation(KV_ExprLocation* eloc, KV_QualifiedSymbolOp*& qso) {
  qso = nullptr;
  KV_ExprLocation* current = eloc;
  KV_ICodeElem* parent = current->getParent();
  while (KV_Operation* op = parent ? parent->asOperation() : nullptr) {
    KV_QualifiedSymbolOp* access = op->asQualifiedSymbolOp();
    if (access && isIndexOf(access, current)) {
      qso = access;
      return true;
    }
    current = op->getParent();
    if (!current)
      return false;
    parent = current->getParent();
  }
  return false;
}

bool KvCElocQuery::isContainedInIndexOperation(KV_ExprLocation* eloc) {
  KV_QualifiedSymbolOp* qso = nullptr;
  return isContainedInIndexOperation(eloc, qso);
}

// --- control-flow context

bool KvCElocQuery::isLocatedInLoopCondition(KV_ExprLocation* eloc) {
  for (KV_Operation* op = ownOperation(eloc); op; op = op->getParentOperation())
    if (op->getOperator()->isLoopCondition())
      return true;
  return false;
}

bool KvCElocQuery::isLocatedInInitOfForLoopCondition(KV_ExprLocation* eloc) {
  KV_ExprLocation* current = eloc;
  KV_Operation* op = current->getParentOperation();
  while (op) {
    if (op->getOperator()->isForLoop() && current->getIndexInParent() == 0)
      return true;
    current = op->getParent();
    if (!current)
      return false;
    op = current->getParentOperation();
  }
  return false;
}

bool KvCElocQuery::isPartOfPreProcControlFlow(KV_ExprLocation* eloc) {
  for (KV_Operation* op = eloc->getParentOperation(); op; op = op->getParentOperation())
    if (op->getOperator()->isPreProcControlFlow())
      return true;
  return false;
}

bool KvCElocQuery::isPartOfBooleanLogicExpression(KV_ExprLocation* eloc) {
  for (KV_Operation* op = eloc->getParentOperation(); op; op = op->getParentOperation())
    if (isBooleanLogic(op->getOperator()))
      return true;
  return false;
}

// --- calls

bool KvCElocQuery::isParamOfCall(KV_ExprLocation* eloc, bool formal, bool actual) {
  const KV_OpOperator* oper = parentOperator(eloc);
  if (!oper || !oper->isParameter())
    return false;
  if (formal && actual)
    return true;
  if (formal)
    return eloc->getIndexInParent() == 0;
  if (actual)
    return eloc->getIndexInParent() == 1;
  return false;
}

bool KvCElocQuery::isFormalOfCall(KV_ExprLocation* eloc) {
  return isParamOfCall(eloc, true, false);
}

bool KvCElocQuery::isActualOfCall(KV_ExprLocation* eloc) {
  return isParamOfCall(eloc, false, true);
}

bool KvCElocQuery::getCallOpIfParamOfCall(KV_ExprLocation* eloc, bool& isFormal, bool& isActual,
                                          KV_Operation*& callOp, KvCParamSymbol*& calledSymbol) {
  isFormal = false;
  isActual = false;
  callOp = nullptr;
  calledSymbol = nullptr;
  KV_Operation* parameter = eloc->getParentOperation();
  if (!parameter || !parameter->getOperator()->isParameter())
    return false;
  KV_Operation* call = parameter->getParentOperation();
  if (!call)
    return false;
  isFormal = eloc->getIndexInParent() == 0;
  isActual = eloc->getIndexInParent() == 1;
  if (!call->getOperator()->isCall())
    return false;
  callOp = call;
  calledSymbol = calledParamSymbol(call);
  if (!calledSymbol)
    return false;
  return isActual || isFormal;
}

bool KvCElocQuery::isInCallOp(KV_ExprLocation* eloc, KvCSymbol*& calledSymbol) {
  calledSymbol = nullptr;
  KV_Operation* call = callAroundParameter(eloc);
  if (!call)
    return false;
  calledSymbol = accessedSymbol(call->getOperand(0));
  return calledSymbol != nullptr;
}

bool KvCElocQuery::isLogValInLogMacro(KV_ExprLocation* eloc, KV_Operation*& callOp) {
  KV_Operation* call = callAroundParameter(eloc);
  if (!call)
    return false;
  callOp = call;
  KvCSymbol* called = accessedSymbol(call->getOperand(0));
  return called && called->isLogMacro();
}

bool KvCElocQuery::isLogValInLogMacro(KV_ExprLocation* eloc) {
  KV_Operation* callOp = nullptr;
  return isLogValInLogMacro(eloc, callOp);
}

bool KvCElocQuery::containsCallTo(KV_ExprLocation* eloc, KvCParamSymbol*& calledSymbol) {
  calledSymbol = nullptr;
  KV_Operation* op = eloc->getOperation();
  if (!op)
    return false;
  if (op->asCallOperation() || op->getOperator()->isCall())
    calledSymbol = calledParamSymbol(op);
  return calledSymbol != nullptr;
}

bool KvCElocQuery::isActualOfCallRetrieveFormal(KV_ExprLocation* eloc, KvCUnparamSymbol*& formal) {
  if (!isActualOfCall(eloc))
    return false;
  KV_ExprLocation* formalLoc = formalOfActual(eloc);
  KV_QualifiedSymbolOp* qso = formalLoc ? formalLoc->getQualifiedSymbolOp() : nullptr;
  if (!qso)
    return false;
  formal = nullptr;
  KvCSymbol* symbol = qso->getSymbol();
  KvCUnparamSymbol* variable = symbol ? symbol->asUnparamSymbol() : nullptr;
  if (variable && !variable->isReferenceFormal())
    formal = variable;
  return formal != nullptr;
}

bool KvCElocQuery::isActualOfCallWithScalarFormal(KV_ExprLocation* eloc) {
  if (!isActualOfCall(eloc))
    return false;
  KV_ExprLocation* formalLoc = formalOfActual(eloc);
  KV_QualifiedSymbolOp* qso = formalLoc ? formalLoc->getQualifiedSymbolOp() : nullptr;
  return qso && qso->getResolvedNumberOfDims() == 0;
}

bool KvCElocQuery::isActualOfCallWithConstantFormal(KV_ExprLocation* eloc) {
  KV_Operation* op = eloc->getParentOperation();
  while (isCast(op))
    op = isPointerCast(op) ? op->getParentOperation() : nullptr;
  if (!op)
    return false;
  KV_ExprLocation* actual = op->getParent();
  if (!actual || !isActualOfCall(actual))
    return false;
  KV_ExprLocation* formalLoc = formalOfActual(actual);
  return formalLoc && isPointerToConst(formalLoc->getDataType());
}

bool KvCElocQuery::isActualOfCallSkipPointerCasts(KV_ExprLocation* eloc) {
  KV_ExprLocation* current = eloc;
  KV_Operation* op = current->getParentOperation();
  while (isCast(op)) {
    if (!isPointerCast(op))
      return false;
    current = op->getParent();
    if (!current)
      return false;
    op = current->getParentOperation();
  }
  if (!op)
    return false;
  return isActualOfCall(current);
}

bool KvCElocQuery::isFormalOfCallToSfExternCUserFcn(KV_ExprLocation* eloc) {
  bool isFormal = false;
  bool isActual = false;
  KV_Operation* callOp = nullptr;
  KvCParamSymbol* called = nullptr;
  if (!getCallOpIfParamOfCall(eloc, isFormal, isActual, callOp, called))
    return false;
  return isFormal && called && called->isSfExternCUserFunction();
}

bool KvCElocQuery::isFormalOfCallReceivingString(KV_ExprLocation* eloc) {
  if (!isFormalOfCall(eloc))
    return false;
  KV_ExprLocation* actual = eloc->getParentOperation()->getOperand(1);
  KvCIcExpression* expr = actual ? getExprBySkippingCasts(actual) : nullptr;
  KvCStringExpr* string = expr ? expr->asStringExpr() : nullptr;
  return string && (string->treatAsCode() || string->applyQuotes());
}

// --- const conversions

bool KvCElocQuery::isSubjectToConstCast(KV_ExprLocation* eloc) {
  KV_Operation* op = eloc->getParentOperation();
  return isCast(op) && isPointerToConst(op->getDataType());
}

bool KvCElocQuery::isSubjectToConstConversion(KV_ExprLocation* eloc) {
  if (isSubjectToConstCast(eloc))
    return true;
  if (isActualOfCallWithConstantFormal(eloc))
    return true;
  KV_Operation* op = eloc->getParentOperation();
  while (isCast(op))
    op = op->getParentOperation();
  if (!op || !op->getOperator()->isPlainAssign())
    return false;
  KV_ExprLocation* assigned = op->getOperand(0);
  return assigned && isPointerToConst(assigned->getDataType());
}
