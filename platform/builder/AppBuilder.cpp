#include "platform/builder/AppBuilder.h"

#include "platform/icode/KV_Constant.h"
#include "platform/icode/KV_DataTypeServer.h"
#include "platform/icode/KV_ExprLocation.h"
#include "platform/icode/KV_ICodeFactoryContainer.h"
#include "platform/icode/KV_QualifiedSymbolOp.h"
#include "platform/icode/KV_ScaleServer.h"
#include "platform/icode/KV_Statement.h"
#include "platform/icode/KV_SymbolDB.h"
#include "platform/icode/KvCAddressQualifier.h"
#include "platform/icode/KvCCStmTable.h"
#include "platform/icode/KvCCallOperation.h"
#include "platform/icode/KvCCodeBlockOperation.h"
#include "platform/icode/KvCIcApplication.h"
#include "platform/icode/KvCIcFileId.h"
#include "platform/icode/KvCIcFileServer.h"
#include "platform/icode/KvCParamSymbol.h"
#include "platform/icode/KvCSmbClassServer.h"
#include "platform/icode/KvCSmbInitValExpr.h"
#include "platform/icode/KvCSymbolQuery.h"
#include "platform/icode/KvCUnparamSymbol.h"
#include "platform/icode/KvCVarClassServer.h"
#include "platform/support/KvCNameSpace.h"

#include <cstdio>
#include <cstdlib>

AppBuilder::AppBuilder(const char* applicationName)
    : cvd(std::make_unique<KvCCodeViewData>(applicationName)) {
  KvCIcSubAppl* sub = cvd->createSubApplication("Main");
  unit = cvd->createCodeUnit("Unit");
  sub->addCodeUnit(unit);
  file("main.c");
}

AppBuilder::~AppBuilder() = default;

void AppBuilder::fail(const std::string& what) const {
  std::fprintf(stderr, "malformed ICode fixture: %s\n", what.c_str());
  std::fflush(stderr);
  std::abort();
}

KV_ICodeFactoryContainer& AppBuilder::factories() { return *cvd->getFactoryContainer(); }

// --- types

KV_DataType* AppBuilder::int8() { return cvd->getDataTypeServer()->getInt8(); }
KV_DataType* AppBuilder::uint8() { return cvd->getDataTypeServer()->getUInt8(); }
KV_DataType* AppBuilder::int16() { return cvd->getDataTypeServer()->getInt16(); }
KV_DataType* AppBuilder::uint16() { return cvd->getDataTypeServer()->getUInt16(); }
KV_DataType* AppBuilder::int32() { return cvd->getDataTypeServer()->getInt32(); }
KV_DataType* AppBuilder::uint32() { return cvd->getDataTypeServer()->getUInt32(); }
KV_DataType* AppBuilder::float32() { return cvd->getDataTypeServer()->getFloat32(); }
KV_DataType* AppBuilder::float64() { return cvd->getDataTypeServer()->getFloat64(); }
KV_DataType* AppBuilder::boolean() { return cvd->getDataTypeServer()->getBool(); }
KV_DataType* AppBuilder::voidType() { return cvd->getDataTypeServer()->demandVoidType(); }

KV_PointerType* AppBuilder::pointerTo(KV_DataType* target, bool toConst) {
  return check(cvd->getDataTypeServer()->demandPointerType(target, toConst), "pointer type");
}

KV_ArrayType* AppBuilder::arrayOf(KV_DataType* element, int size) {
  return check(cvd->getDataTypeServer()->demandArrayType(element, size), "array type");
}

KV_StructType*
AppBuilder::structType(const char* name,
                       std::initializer_list<std::pair<const char*, KV_DataType*>> components) {
  KV_StructType* type = check(cvd->getDataTypeServer()->demandStructType(name), "struct type");
  if (type->getNumberOfComponents() == 0)
    for (const auto& [componentName, componentType] : components)
      type->addComponent(componentName, componentType);
  return type;
}

KV_Scaling* AppBuilder::scaling(double lsb, double offset) {
  return check(cvd->getScalingServer()->demandScaling(lsb, offset), "scaling");
}

// --- files

KvCIcFileId* AppBuilder::file(const char* name) {
  KvCIcFileId* f = check(cvd->getFileServer()->demandFile(name), "file");
  unit->addFile(f);
  if (!fileScopes.count(f))
    fileScopes[f] = &newBlockBuilder(f->getFile()->getStatementTable());
  current = f;
  return f;
}

BlockBuilder& AppBuilder::fileScope() { return *fileScopes.at(current); }

BlockBuilder& AppBuilder::newBlockBuilder(KvCCStmTable* table) {
  blocks.emplace_back(*this, check(table, "statement table"));
  return blocks.back();
}

// --- scopes and symbol classes

KvCIcFileId* AppBuilder::filePair(const char* base) {
  const std::string stem = base;
  KvCIcFileId* header = file((stem + ".h").c_str());
  KvCIcFileId* source = file((stem + ".c").c_str());
  header->getFile()->setComplementaryFile(source);
  source->getFile()->setComplementaryFile(header);
  nameSpace(header->getFile()->getStt());
  nameSpace(source->getFile()->getStt());
  return source;
}

KvCNameSpace* AppBuilder::nameSpace(KvCCStmTable* table) {
  check(table, "name space of a null table");
  if (!table->getNameSpace())
    table->setNameSpace(cvd->createNameSpace());
  return table->getNameSpace();
}

KvCNameSpace* AppBuilder::potentialGlobals() {
  return cvd->getApplication()->getSubApplications().front()->getPotentialGlobalsNameSpace();
}

KvCSmbClassId* AppBuilder::smbClass(const char* name, tagKvESmbClassKind kind) {
  KvCSmbClassServer* classes = cvd->getSmbClassServer();
  if (KvCSmbClassId* existing = classes->findSmbClass(name))
    return existing;
  const bool isExtern = kind == KV_SMBCLASS_EXTERN;
  KvCVarClassId* varClass = factories().getVarClassServer()->demandVarClass(
      name, isExtern, isExtern || kind == KV_SMBCLASS_GLOBAL);
  KvCFcnClassId* fcnClass = classes->getFcnClassServer()->createFcnClass(name, nullptr);
  return check(classes->createSmbClass(name, kind, varClass, fcnClass), "symbol class");
}

KvCSymbol* AppBuilder::place(KvCSymbol* symbol, KvCSmbClassId* cls, KvCCStmTable* table,
                             bool asDeclaration) {
  check(symbol, "place a null symbol");
  check(cls, "place with a null class");
  check(table, "place into a null table");
  if (KvCUnparamSymbol* variable = symbol->asUnparamSymbol())
    variable->setVarClassId(cls->getVarClassId());
  else
    symbol->asParamSymbol()->setFcnClassId(cls->getFcnClassId());
  KvCSymbol* entered = symbol;
  if (asDeclaration)
    table->enterDeclaration(entered);
  else
    table->enterSymbol(entered);
  if (entered != symbol)
    fail("place: the table holds another " + symbol->getName().str());
  if (KvCSymbolQuery::isPotentialGlobalSymbol(symbol, table))
    potentialGlobals()->add(symbol->getName());
  return symbol;
}

// --- symbols

KvCUnparamSymbol* AppBuilder::variable(const char* name, KV_DataType* type, bool define) {
  KvCUnparamSymbol* v = cvd->getSymbolDB()->createUnparamSymbol(name, type, false);
  if (define)
    fileScope().stmt(varDef(v, {}));
  return v;
}

KvCUnparamSymbol* AppBuilder::component(const char* name, KV_DataType* type) {
  return cvd->getSymbolDB()->createUnparamSymbol(name, type, true);
}

namespace {
void demandAllComponents(KV_SymbolDB* db, KvCUnparamSymbol* instance) {
  KV_DataType* type = instance->getDataType();
  KV_StructType* structType = type ? type->asStructType() : nullptr;
  for (int i = 0; structType && i < structType->getNumberOfComponents(); ++i)
    demandAllComponents(db, db->demandComponentSymbol(instance, i));
}
} // namespace

KvCUnparamSymbol* AppBuilder::structVariable(const char* name, KV_StructType* type, bool define) {
  KvCUnparamSymbol* v = variable(name, check(type, "structure type"), define);
  demandAllComponents(cvd->getSymbolDB(), v);
  return v;
}

KvCUnparamSymbol* AppBuilder::member(KvCUnparamSymbol* instance, const char* path) {
  KvCUnparamSymbol* at = check(instance, "structure instance");
  std::string rest = path;
  while (true) {
    const std::size_t dot = rest.find('.');
    const std::string name = rest.substr(0, dot);
    KV_StructType* structType = at->getSlotStructType();
    if (!structType)
      fail("not a structure instance: " + at->getName().str());
    int slot = -1;
    for (int i = 0; i < structType->getNumberOfComponents(); ++i)
      if (structType->getComponent(i).name.str() == name)
        slot = i;
    if (slot < 0)
      fail("no component " + name + " in " + at->getName().str());
    at = cvd->getSymbolDB()->demandComponentSymbol(at, slot);
    if (dot == std::string::npos)
      return at;
    rest = rest.substr(dot + 1);
  }
}

KvCUnparamSymbol* AppBuilder::declaredComponent(KV_StructType* type, const char* name) {
  return check(cvd->getSymbolDB()->demandComponentDeclSymbol(check(type, "structure type"), name),
               "component declaration");
}

KvCAddressQualifier* AppBuilder::addressQualifier(const char* name, bool isDefault) {
  return check(cvd->demandAddressQualifier(name, isDefault), "address qualifier");
}

FunctionBuilder& AppBuilder::makeFunction(const char* name, KV_DataType* returnType, bool defined) {
  if (functionsByName.count(name))
    fail(std::string("function defined twice: ") + name);
  KvCParamSymbol* fn =
      cvd->getSymbolDB()->createParamSymbol(name, returnType ? returnType : voidType(), false);
  KvCCStmTable* body =
      factories().getStatementFactory()->createCStmTable(fn, defined ? nullptr : current);
  body->setCodeBlockTop(true);
  fn->setBodySTT(body);
  functions.emplace_back(*this, fn, &newBlockBuilder(body));
  FunctionBuilder& builder = functions.back();
  functionsByName[name] = &builder;
  tagKvEOperatorKind kind = defined ? KV_OP_FUNCTION_DEFINITION : KV_OP_FUNCTION_DECLARATION;
  KV_Statement* statement = fileScope().stmt(
      declaration(kind, {access(fn), typeRef(fn->getDataType()), fileRef(current)}));
  if (defined && !statement->addStatementTable(body))
    fail("function body cannot be attached");
  builder.declStatement = statement;
  return builder;
}

FunctionBuilder& AppBuilder::function(const char* name, KV_DataType* returnType) {
  auto it = functionsByName.find(name);
  if (it != functionsByName.end())
    return *it->second;
  return makeFunction(name, returnType, true);
}

FunctionBuilder& AppBuilder::declaredFunction(const char* name, KV_DataType* returnType) {
  return makeFunction(name, returnType, false);
}

KvCParamSymbol* AppBuilder::macro(const char* name, KV_DataType* returnType) {
  return cvd->getSymbolDB()->createParamSymbol(name, returnType ? returnType : voidType(), true);
}

FunctionBuilder& AppBuilder::functionBuilder(const char* name) {
  auto it = functionsByName.find(name);
  if (it == functionsByName.end())
    fail(std::string("unknown function: ") + name);
  return *it->second;
}

KvCUnparamSymbol* FunctionBuilder::addFormal(const char* name, KV_DataType* type,
                                             bool byReference) {
  KvCUnparamSymbol* f = app.variable(name, type, false);
  f->setRole(KV_ROLE_FORMAL_PARAMETER, true);
  f->setRole(KV_ROLE_REFERENCE_FORMAL, byReference);
  formals.push_back(f);
  if (declStatement) {
    KV_Operation* decl = declStatement->getExprLoc()->getOperation();
    if (!decl->appendOperand(app.access(f)))
      app.fail("formal cannot be attached");
  }
  return f;
}

KvCUnparamSymbol* FunctionBuilder::formal(int i) {
  while (getNumberOfFormals() <= i) {
    const std::string name = fn->getName().str() + "_p" + std::to_string(getNumberOfFormals());
    addFormal(name.c_str(), app.int16());
  }
  return formals[static_cast<std::size_t>(i)];
}

// --- leaves

KV_ExprLocation* AppBuilder::access(KvCSymbol* symbol) {
  return check(factories().getExprLocFactory()->createFromSymbol(symbol), "access to null symbol");
}

KV_ExprLocation* AppBuilder::element(KvCSymbol* array,
                                     std::initializer_list<BuilderIndex> indices) {
  KV_QualifiedSymbolOp* qso = check(factories().getQSOFactory()->createQso(array), "element");
  for (const BuilderIndex& index : indices) {
    if (!index.loc) {
      qso->addConstantIndex(index.value);
      continue;
    }
    if (!qso->addIndexEloc(index.loc))
      fail("index expression cannot be attached");
  }
  return factories().getExprLocFactory()->createFromExpression(qso);
}

KV_ExprLocation* AppBuilder::componentAccess(KvCSymbol* base, KvCSymbol* component) {
  KV_QualifiedSymbolOp* qso =
      check(factories().getQSOFactory()->createComponentQso(base, component), "component");
  return factories().getExprLocFactory()->createFromExpression(qso);
}

KV_ExprLocation* AppBuilder::deref(KvCSymbol* pointer) {
  KV_QualifiedSymbolOp* qso = check(factories().getQSOFactory()->createQso(pointer), "deref");
  qso->setDereferenced(true);
  return factories().getExprLocFactory()->createFromExpression(qso);
}

KV_ExprLocation* AppBuilder::constant(std::int64_t value, KV_DataType* type) {
  return factories().getExprLocFactory()->createFromValue(value, type);
}

KV_ExprLocation* AppBuilder::constant(double value, KV_DataType* type) {
  return factories().getExprLocFactory()->createFromValue(value, type);
}

KV_ExprLocation* AppBuilder::unsignedConstant(std::uint64_t value, KV_DataType* type) {
  return factories().getExprLocFactory()->createFromValue(static_cast<std::int64_t>(value), type,
                                                          true);
}

KV_ExprLocation* AppBuilder::string(const char* text, bool asCode, bool quoted) {
  return factories().getExprLocFactory()->createFromString(text, asCode, quoted);
}

KV_ExprLocation* AppBuilder::typeRef(KV_DataType* type) {
  return factories().getExprLocFactory()->createFromDataType(type);
}

KV_ExprLocation* AppBuilder::fileRef(KvCIcFileId* f) {
  return factories().getExprLocFactory()->createFromFileId(f);
}

KV_ExprLocation* AppBuilder::empty() { return factories().getExprLocFactory()->createEmpty(); }

// --- operations

KV_Operation* AppBuilder::operationExpr(tagKvEOperatorKind kind,
                                        std::initializer_list<KV_ExprLocation*> operands) {
  KV_Operation* operation = factories().getOperationFactory()->createOperation(kind, operands);
  if (!operation) {
    KV_OpOperator* oper = KV_OpOperator::get(kind);
    fail(std::string("operation ") + (oper ? oper->getName() : "?") +
         ": wrong operand count, or an operand used twice");
  }
  return operation;
}

KV_ExprLocation* AppBuilder::op(tagKvEOperatorKind kind,
                                std::initializer_list<KV_ExprLocation*> operands) {
  return factories().getExprLocFactory()->createFromOperation(operationExpr(kind, operands));
}

KV_ExprLocation* AppBuilder::cast(KV_DataType* target, KV_ExprLocation* operand) {
  KV_Operation* c = check(factories().getOperationFactory()->createCast(target, operand),
                          "cast: operand used twice");
  return factories().getExprLocFactory()->createFromOperation(c);
}

KV_ExprLocation* AppBuilder::call(KvCParamSymbol* fn,
                                  std::initializer_list<KV_ExprLocation*> actuals) {
  return call(fn, std::vector<KV_ExprLocation*>(actuals));
}

KV_ExprLocation* AppBuilder::call(KvCParamSymbol* fn,
                                  const std::vector<KV_ExprLocation*>& actuals) {
  check(fn, "call of a null function");
  KvCCallOperation* c =
      check(factories().getOperationFactory()->createCallOperation(fn, {}), "call operation");
  auto it = functionsByName.find(fn->getName().str());
  for (std::size_t i = 0; i < actuals.size(); ++i) {
    KvCSymbol* formalSymbol = nullptr;
    if (it != functionsByName.end() && it->second->symbol() == fn)
      formalSymbol = it->second->formal(static_cast<int>(i));
    else
      formalSymbol =
          variable((fn->getName().str() + "_p" + std::to_string(i)).c_str(), int16(), false);
    if (!c->appendOperand(parameter(access(formalSymbol), actuals.begin()[i])))
      fail("call: parameter cannot be attached");
  }
  return factories().getExprLocFactory()->createFromOperation(c);
}

KV_ExprLocation* AppBuilder::genericCall(KV_ExprLocation* callee,
                                         std::initializer_list<KV_ExprLocation*> operands) {
  KV_Operation* c = operationExpr(KV_OP_CALL, {callee});
  for (KV_ExprLocation* loc : operands)
    if (!c->appendOperand(loc))
      fail("call: operand cannot be attached");
  return factories().getExprLocFactory()->createFromOperation(c);
}

KV_ExprLocation* AppBuilder::taskActivation(KvCParamSymbol* task, tagKvETaskActivationKind kind) {
  KV_ExprLocation* loc = call(check(task, "task activation of a null task"), {});
  loc->getOperation()->asCallOperation()->setTaskActivation(
      cvd->createTaskActivation(kind, task->getName()));
  return loc;
}

KV_ExprLocation* AppBuilder::codeBlock(const char* code, bool assembler) {
  return factories().getExprLocFactory()->createFromOperation(
      factories().getOperationFactory()->createCodeBlock(code, assembler));
}

// --- declarations and definitions

KV_ExprLocation* AppBuilder::declaration(tagKvEOperatorKind kind,
                                         std::vector<KV_ExprLocation*> operands) {
  KV_Operation* decl = operationExpr(kind, {});
  for (KV_ExprLocation* loc : operands)
    if (!decl->appendOperand(loc))
      fail("declaration: operand cannot be attached");
  return factories().getExprLocFactory()->createFromOperation(decl);
}

KV_ExprLocation* AppBuilder::varDecl(KvCSymbol* v) {
  return declaration(KV_OP_VARIABLE_DECLARATION,
                     {access(v), typeRef(v->getDataType()), fileRef(current)});
}

KV_ExprLocation* AppBuilder::varDef(KvCSymbol* v, std::initializer_list<KV_ExprLocation*> init) {
  std::vector<KV_ExprLocation*> operands{access(v), typeRef(v->getDataType()), fileRef(current)};
  operands.insert(operands.end(), init.begin(), init.end());
  return declaration(KV_OP_VARIABLE_DEFINITION, operands);
}

KV_ExprLocation* AppBuilder::funcDecl(KvCParamSymbol* fn) {
  return declaration(KV_OP_FUNCTION_DECLARATION,
                     {access(fn), typeRef(fn->getDataType()), fileRef(current)});
}

KV_ExprLocation* AppBuilder::typeDef(KV_DataType* defined,
                                     std::initializer_list<KV_DataType*> used) {
  std::vector<KV_ExprLocation*> operands{typeRef(defined)};
  for (KV_DataType* t : used)
    operands.push_back(typeRef(t));
  return declaration(KV_OP_TYPE_DEFINITION, operands);
}

KV_ExprLocation* AppBuilder::staticDeclDef(KvCSymbol* v) {
  return declaration(KV_OP_STATIC_DECLDEF, {access(v), typeRef(v->getDataType())});
}

KV_ExprLocation* AppBuilder::initValue(const std::vector<int>& sizes,
                                       std::initializer_list<KvCIcExpression*> elements) {
  KvCSmbInitValExpr* value =
      check(factories().getExprLocFactory()->createInitValue(sizes), "initial value dimensions");
  for (KvCIcExpression* e : elements)
    if (!value->addElement(e))
      fail("initial value: element cannot be added");
  return factories().getExprLocFactory()->createFromExpression(value);
}

KV_Constant* AppBuilder::constantExpr(std::int64_t value, KV_DataType* type) {
  return factories().getExprLocFactory()->createConstant(KV_CONST_SIGNED, value, type);
}

KV_QualifiedSymbolOp* AppBuilder::accessExpr(KvCSymbol* symbol) {
  return check(factories().getQSOFactory()->createQso(symbol), "access to null symbol");
}

KvCRtosProtection* AppBuilder::protection(const char* resource) {
  return cvd->createRtosProtection(resource);
}

// --- blocks

KV_Statement* BlockBuilder::stmt(KV_ExprLocation* root) {
  KV_Statement* statement = app.check(app.factories().getStatementFactory()->createStatement(root),
                                      "statement root used twice");
  if (!stmTable->appendStatement(statement))
    app.fail("statement cannot be appended");
  last = statement;
  return statement;
}

KV_Statement* BlockBuilder::assign(KV_ExprLocation* lhs, KV_ExprLocation* rhs) {
  return stmt(app.assignExpr(lhs, rhs));
}

KV_Statement* BlockBuilder::call(KvCParamSymbol* fn,
                                 std::initializer_list<KV_ExprLocation*> actuals) {
  return stmt(app.call(fn, actuals));
}

KV_Statement* BlockBuilder::activateTask(KvCParamSymbol* task, tagKvETaskActivationKind kind) {
  return stmt(app.taskActivation(task, kind));
}

KV_Statement* BlockBuilder::ret(KV_ExprLocation* value) {
  return stmt(value ? app.op(KV_OP_RETURN, {value}) : app.op(KV_OP_RETURN, {}));
}

BlockBuilder& BlockBuilder::nested(KV_ExprLocation* root) {
  KV_Statement* statement = stmt(root);
  KvCCStmTable* inner = app.factories().getStatementFactory()->createCStmTable(nullptr, nullptr);
  if (!statement->addStatementTable(inner))
    app.fail("nested block cannot be attached");
  return app.newBlockBuilder(inner);
}

BlockBuilder& BlockBuilder::forLoop(KV_ExprLocation* init, KV_ExprLocation* cond,
                                    KV_ExprLocation* incr) {
  return nested(app.op(KV_OP_FOR_LOOP, {init, app.loopCondition(cond), incr}));
}

BlockBuilder& BlockBuilder::whileLoop(KV_ExprLocation* cond) {
  return nested(app.op(KV_OP_WHILE_LOOP, {app.loopCondition(cond)}));
}

BlockBuilder& BlockBuilder::ifThen(KV_ExprLocation* cond) {
  return nested(app.op(KV_OP_IF, {cond}));
}

BlockBuilder& BlockBuilder::block() { return nested(nullptr); }

BlockBuilder& BlockBuilder::protectedBlock(const char* resource) {
  BlockBuilder& inner = nested(nullptr);
  inner.table()->setRtosProtection(app.protection(resource));
  return inner;
}
