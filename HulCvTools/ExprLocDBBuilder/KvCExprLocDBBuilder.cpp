#include "HulCvTools/ExprLocDBBuilder/KvCExprLocDBBuilder.h"

#include "HulCvTools/Control/KvCInternalCheck.h"
#include "HulCvTools/ElocQuery/KvCElocQuery.h"
#include "HulCvTools/ExprLocDBBuilder/KvCSymbolOrder.h"
#include "HulCvTools/ModelInterfaces/ICodeModel.h"
#include "platform/leda/list.h"
#include "platform/leda/set.h"

HULCV_DEFINE_HEAP_OPERATORS(KvCExprLocDBBuilder)

int compare(KvCSymbol* const& a, KvCSymbol* const& b) {
  if (a == b)
    return 0;
  if (!a)
    return -1;
  if (!b)
    return 1;
  const int x = a->getDebugIndex();
  const int y = b->getDebugIndex();
  return x < y ? -1 : (x > y ? 1 : 0);
}

namespace {

// The type-using operator kinds, in the order they are tested.
bool usesTypes(const KV_OpOperator* k) {
  return k->isCast() || k->isFunctionDeclaration() || k->isFunctionDefinition() ||
         k->isFurtherDeclDef1() || k->isFurtherDeclDef2() || k->isVariableDeclaration() ||
         k->isVariableDefinition() || k->isFurtherDefinition1();
}

// The scalar initial value's first element, or null.
KvCIcExpression* firstScalarElement(KvCSmbInitValExpr* value) {
  if (value->getNumberOfDimensions() != 0 || !value->containsElements())
    return nullptr;
  return value->get(0, 0, 0);
}

// Enters the locations it visits into the databases. Lives for one build operation; the
// two sets collect the selected functions met as declared and as defined objects.
class KvCELocDBBuilderVisitor : public KV_ICodeElemVisitor {
public:
  explicit KvCELocDBBuilderVisitor(KvCExprLocDBServer* dbServer) : server(dbServer) {}
  ~KvCELocDBBuilderVisitor() override = default;

  void visitExprLocation(KV_ExprLocation* loc) override {
    if (KV_QualifiedSymbolOp* qso = loc->getQualifiedSymbolOp())
      enterAccess(loc, qso);
    else if (KV_DataType* type = loc->getDataTypeRef())
      enterType(loc, type);
    else if (KvCIcFileId* file = loc->getFileIdRef())
      server->demandExprLocDB(file)->addUse(loc);
    else if (KvCSmbInitValExpr* value = loc->getSmbInitValExpr())
      enterInitValue(loc, value);
  }

  leda::set<KvCSymbol*>& getDeclaredFunctions() { return declaredFunctions; }
  leda::set<KvCSymbol*>& getDefinedFunctions() { return definedFunctions; }

private:
  void enterAccess(KV_ExprLocation* loc, KV_QualifiedSymbolOp* qso) {
    KV_Operation* pParentOperation = qso->getParentOperation();
    KV_DEBUG_ASSERT(pParentOperation);
    if (!pParentOperation)
      return;
    KvCSymbol* symbol = qso->getSymbol();
    if (!symbol)
      return;
    KvCQsoExprLocDB* db = symbol->getExprLocDB()->getQsoExprLocDB();
    if (KvCElocQuery::isDefinedInParentOp(loc)) {
      if (KvCElocQuery::isStaticDeclDef(loc))
        db->addStaticDeclDefDef(loc);
      else if (KvCElocQuery::isRestartDef(loc))
        db->addRestartDef(loc);
      else
        db->addQsoDef(loc);
    }
    if (KvCElocQuery::isUsedInParentOp(loc)) {
      if (KvCElocQuery::isStaticDeclDef(loc))
        db->addStaticDeclDefUse(loc);
      else
        db->addQsoUse(loc);
    }
    // The sets collect the declared or defined object (operand 0), not the formal
    // parameters listed after it.
    if (!symbol->isSelected() || loc->getIndexInParent() != 0)
      return;
    KV_OpOperator* kind = pParentOperation->getOperator();
    if (kind->isFunctionDeclaration())
      declaredFunctions.insert(symbol);
    else if (kind->isFunctionDefinition())
      definedFunctions.insert(symbol);
  }

  void enterType(KV_ExprLocation* loc, KV_DataType* type) {
    KvCExprLocDB* db = server->demandExprLocDB(type);
    KV_Operation* pParentOperation = loc->getParentOperation();
    KV_DEBUG_ASSERT(pParentOperation);
    if (!pParentOperation)
      return;
    KV_OpOperator* kind = pParentOperation->getOperator();
    if (kind->isTypeDefinition()) {
      if (loc->getIndexInParent() == 0)
        db->addDef(loc);
      else
        db->addUse(loc);
      return;
    }
    if (usesTypes(kind))
      db->addUse(loc);
  }

  // The location holding the initial value stands for its first element. An element
  // that is an operation other than an access is walked instead.
  void enterInitValue(KV_ExprLocation* loc, KvCSmbInitValExpr* value) {
    KvCIcExpression* element = firstScalarElement(value);
    if (!element)
      return;
    if (KV_QualifiedSymbolOp* qso = element->asQualifiedSymbolOp()) {
      KvCSymbol* symbol = qso->getSymbol();
      if (!symbol || !qso->getParentOperation())
        return;
      KvCQsoExprLocDB* db = symbol->getExprLocDB()->getQsoExprLocDB();
      if (KvCElocQuery::isDefinedInParentOp(loc))
        db->addQsoDef(loc);
      if (KvCElocQuery::isUsedInParentOp(loc))
        db->addQsoUse(loc);
      return;
    }
    if (KV_Operation* op = element->asOperation()) {
      KvCICodeIterator iterator;
      iterator.iterateOperation(op, this);
    }
  }

  KvCExprLocDBServer* server;
  leda::set<KvCSymbol*> declaredFunctions;
  leda::set<KvCSymbol*> definedFunctions;
};

// Takes the locations it visits out of the databases, whatever their role.
class KvCELocDBRemoveVisitor : public KV_ICodeElemVisitor {
public:
  explicit KvCELocDBRemoveVisitor(KvCExprLocDBServer* dbServer) : server(dbServer) {}
  ~KvCELocDBRemoveVisitor() override = default;

  void visitExprLocation(KV_ExprLocation* loc) override {
    if (KV_QualifiedSymbolOp* qso = loc->getQualifiedSymbolOp())
      removeFromSymbol(loc, qso);
    else if (KV_DataType* type = loc->getDataTypeRef())
      removeFrom(server->demandExprLocDB(type), loc);
    else if (KvCIcFileId* file = loc->getFileIdRef())
      removeFrom(server->demandExprLocDB(file), loc);
    else if (KvCSmbInitValExpr* value = loc->getSmbInitValExpr())
      removeInitValue(loc, value);
  }

private:
  static void removeFrom(KvCExprLocDB* db, KV_ExprLocation* loc) {
    db->removeDef(loc);
    db->removeUse(loc);
  }

  static void removeFromSymbol(KV_ExprLocation* loc, KV_QualifiedSymbolOp* qso) {
    if (KvCSymbol* symbol = qso->getSymbol())
      removeFrom(symbol->getExprLocDB(), loc);
  }

  void removeInitValue(KV_ExprLocation* loc, KvCSmbInitValExpr* value) {
    KvCIcExpression* element = firstScalarElement(value);
    if (!element)
      return;
    if (KV_QualifiedSymbolOp* qso = element->asQualifiedSymbolOp()) {
      removeFromSymbol(loc, qso);
      return;
    }
    if (KV_Operation* op = element->asOperation()) {
      KvCICodeIterator iterator;
      iterator.iterateOperation(op, this);
    }
  }

  KvCExprLocDBServer* server;
};

} // namespace

KvCExprLocDBBuilder::~KvCExprLocDBBuilder() { shutdown(); }

bool KvCExprLocDBBuilder::boot(KvCCodeViewData* data) {
  codeViewData = data;
  return true;
}

bool KvCExprLocDBBuilder::shutdown() {
  codeViewData = nullptr;
  return true;
}

bool KvCExprLocDBBuilder::isBooted() const {
  return KV_VERIFY(codeViewData != nullptr, "KvCExprLocDBBuilder", __LINE__);
}

bool KvCExprLocDBBuilder::buildExprLocDBs() {
  if (!isBooted())
    return false;
  KvCICodeIterator iterator;
  KvCELocDBBuilderVisitor visitor(codeViewData->getExprLocDBServer());
  iterator.iterate(codeViewData->getApplication(), &visitor);
  // Selected functions declared but not defined in the walked tree: walk their bodies.
  // Symbols the pass adds to the sets are not looked at again.
  const leda::set<KvCSymbol*> declaredOnly =
      visitor.getDeclaredFunctions().diff(visitor.getDefinedFunctions());
  for (KvCSymbol* symbol : declaredOnly) {
    KvCParamSymbol* function = symbol->asParamSymbol();
    if (function && function->getBodySTT())
      iterator.iterateStatementTable(function->getBodySTT(), &visitor);
  }
  return true;
}

bool KvCExprLocDBBuilder::rebuildExprLocDBs() {
  if (!isBooted())
    return false;
  codeViewData->getExprLocDBServer()->clearExprLocDBs();
  return buildExprLocDBs();
}

bool KvCExprLocDBBuilder::walk(bool build, KV_ICodeElem* elem, bool omitFunctionBodies) {
  if (!isBooted() || !elem)
    return false;
  KvCICodeIterator iterator;
  if (omitFunctionBodies)
    iterator.omitFuncStt();
  KvCExprLocDBServer* server = codeViewData->getExprLocDBServer();
  KvCELocDBBuilderVisitor builder(server);
  KvCELocDBRemoveVisitor remover(server);
  KV_ICodeElemVisitor* visitor = build ? static_cast<KV_ICodeElemVisitor*>(&builder) : &remover;
  if (KV_ExprLocation* loc = elem->asExprLocation())
    return iterator.iterateExprLoc(loc, visitor);
  if (KV_Operation* op = elem->asOperation())
    return iterator.iterateOperation(op, visitor);
  if (KV_Statement* statement = elem->asStatement())
    return iterator.iterateStatement(statement, visitor);
  if (KV_StatementTable* table = elem->asStatementTable())
    return iterator.iterateStatementTable(table, visitor);
  return false;
}

bool KvCExprLocDBBuilder::walkInitValue(bool build, KvCSmbInitValExpr* initValue) {
  if (!isBooted() || !initValue)
    return false;
  bool result = true;
  for (KvCSmbInitValExprIterator it = initValue->createIterator(); !it.isDone(); it.next()) {
    KV_Operation* op = it.current() ? it.current()->asOperation() : nullptr;
    if (op)
      result = walk(build, op, false) && result;
  }
  return result;
}

bool KvCExprLocDBBuilder::buildExprLocDBsIncremental(KV_Operation* op) {
  return walk(true, op, false);
}
bool KvCExprLocDBBuilder::clearExprLocDBsIncremental(KV_Operation* op) {
  return walk(false, op, false);
}
bool KvCExprLocDBBuilder::buildExprLocDBsIncremental(KV_StatementTable* table) {
  return walk(true, table, false);
}
bool KvCExprLocDBBuilder::clearExprLocDBsIncremental(KV_StatementTable* table) {
  return walk(false, table, false);
}
bool KvCExprLocDBBuilder::buildExprLocDBsIncremental(KV_Statement* statement) {
  return walk(true, statement, false);
}
bool KvCExprLocDBBuilder::clearExprLocDBsIncremental(KV_Statement* statement) {
  return walk(false, statement, false);
}
bool KvCExprLocDBBuilder::buildExprLocDBsIncremental(KV_ExprLocation* loc) {
  return walk(true, loc, false);
}
bool KvCExprLocDBBuilder::clearExprLocDBsIncremental(KV_ExprLocation* loc) {
  return walk(false, loc, false);
}
bool KvCExprLocDBBuilder::buildExprLocDBsIncremental(KvCSmbInitValExpr* initValue) {
  return walkInitValue(true, initValue);
}
bool KvCExprLocDBBuilder::clearExprLocDBsIncremental(KvCSmbInitValExpr* initValue) {
  return walkInitValue(false, initValue);
}
bool KvCExprLocDBBuilder::buildExprLocDBsIncrementalOmitFuncStt(KV_Statement* statement) {
  return walk(true, statement, true);
}
bool KvCExprLocDBBuilder::clearExprLocDBsIncrementalOmitFuncStt(KV_Statement* statement) {
  return walk(false, statement, true);
}
bool KvCExprLocDBBuilder::buildExprLocDBsIncrementalOmitFuncStt(KV_ExprLocation* loc) {
  return walk(true, loc, true);
}
bool KvCExprLocDBBuilder::clearExprLocDBsIncrementalOmitFuncStt(KV_ExprLocation* loc) {
  return walk(false, loc, true);
}
