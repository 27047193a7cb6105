// The factories of the ICode and their container.
#include "platform/icode/KV_ICodeFactoryContainer.h"

#include "platform/icode/KV_DataType.h"
#include "platform/icode/KV_ExprLocation.h"
#include "platform/icode/KV_QualifiedSymbolOp.h"
#include "platform/icode/KV_Statement.h"
#include "platform/icode/KV_SymbolServer.h"
#include "platform/icode/KvCCStmTable.h"
#include "platform/icode/KvCCallOperation.h"
#include "platform/icode/KvCCodeBlockOperation.h"
#include "platform/icode/KvCCodeViewData.h"
#include "platform/icode/KvCParamSymbol.h"
#include "platform/icode/KvCSmbInitValExpr.h"
#include "platform/icode/KvCStringExpr.h"

#include <memory>

KV_ICodeFactoryContainer::KV_ICodeFactoryContainer(KvCCodeViewData* owner)
    : codeViewData(owner), locations(owner), operations(owner), qsos(owner), statements(owner),
      qsoFactories(owner), operationFactories(owner), cgsSupporter(owner),
      macroSymbols(owner, &cgsSupporter, &varClasses) {}

KV_DataTypeServer* KV_ICodeFactoryContainer::getDataTypeServer() const {
  return codeViewData->getDataTypeServer();
}
KV_BaseTypeServer* KV_ICodeFactoryContainer::getBaseTypeServer() const {
  return codeViewData->getBaseTypeServer();
}
KV_NumericalTypeServer* KV_ICodeFactoryContainer::getNumTypeServer() const {
  return codeViewData->getNumTypeServer();
}
KV_ScaleServer* KV_ICodeFactoryContainer::getScalingServer() const {
  return codeViewData->getScalingServer();
}
KvCIcFileServer* KV_ICodeFactoryContainer::getFileServer() const {
  return codeViewData->getFileServer();
}
KV_SymbolDB* KV_ICodeFactoryContainer::getSymbolDB() const { return codeViewData->getSymbolDB(); }
KV_SymbolServer* KV_ICodeFactoryContainer::getSymbolServer() const {
  return codeViewData->getSymbolServer();
}
KvCSmbClassServer* KV_ICodeFactoryContainer::getSmbClassServer() const {
  return codeViewData->getSmbClassServer();
}

KV_MacroSymbolServer* KV_SymbolServer::getMacro() const {
  return codeViewData->getFactoryContainer()->getMacroSymbolServer();
}

// --- locations and what they hold

KV_ExprLocation* KV_ExprLocFactory::createEmpty() {
  return codeViewData->make<KV_ExprLocation>();
}

KV_ExprLocation* KV_ExprLocFactory::createFromExpression(KvCIcExpression* expr) {
  if (!expr || expr->getParent() || expr->getContainingInitValue())
    return nullptr;
  KV_ExprLocation* loc = createEmpty();
  loc->setExpression(expr);
  return loc;
}

KV_ExprLocation* KV_ExprLocFactory::createFromOperation(KV_Operation* op) {
  return createFromExpression(op);
}

KV_ExprLocation* KV_ExprLocFactory::createFromSymbol(KvCSymbol* symbol) {
  KV_QualifiedSymbolOp* qso =
      codeViewData->getFactoryContainer()->getQSOFactory()->createQso(symbol);
  return qso ? createFromExpression(qso) : nullptr;
}

KV_ExprLocation* KV_ExprLocFactory::createSymbolExprLoc(KvCSymbol* symbol,
                                                        unsigned int accessFlags) {
  KV_QualifiedSymbolOp* qso =
      codeViewData->getFactoryContainer()->getQSOFactory()->createQso(symbol);
  if (!qso)
    return nullptr;
  qso->setDereferenced((accessFlags & KV_ACCESS_DEREFERENCED) != 0);
  return createFromExpression(qso);
}

KV_ExprLocation* KV_ExprLocFactory::createOperationExprLoc(KV_Operation* op) {
  return createFromExpression(op);
}

KV_ExprLocation* KV_ExprLocFactory::createFromValue(std::int64_t value, KV_DataType* type,
                                                         bool isUnsigned) {
  return createFromExpression(
      createConstant(isUnsigned ? KV_CONST_UNSIGNED : KV_CONST_SIGNED, value, type));
}

KV_ExprLocation* KV_ExprLocFactory::createFromValue(double value, KV_DataType* type) {
  return createFromExpression(createDoubleConstant(value, type));
}

KV_ExprLocation* KV_ExprLocFactory::createFromString(const WmCXString& text, bool asCode,
                                                          bool quoted) {
  return createFromExpression(createString(text, asCode, quoted));
}

KV_ExprLocation* KV_ExprLocFactory::createFromDataType(KV_DataType* type) {
  KV_ExprLocation* loc = createEmpty();
  loc->setDataTypeRef(type);
  return loc;
}

KV_ExprLocation* KV_ExprLocFactory::createFromFileId(KvCIcFileId* file) {
  KV_ExprLocation* loc = createEmpty();
  loc->setFileIdRef(file);
  return loc;
}

KV_Constant* KV_ExprLocFactory::createConstant(tagKvEConstantType type, std::int64_t value,
                                                    KV_DataType* dt) {
  if (type == KV_CONST_DOUBLE)
    return createDoubleConstant(static_cast<double>(value), dt);
  return codeViewData->make<KV_Constant>(type, value, dt);
}

KV_Constant* KV_ExprLocFactory::createDoubleConstant(double value, KV_DataType* dt) {
  return codeViewData->make<KV_Constant>(value, dt);
}

KvCStringExpr* KV_ExprLocFactory::createString(const WmCXString& text, bool asCode,
                                                    bool quoted) {
  return codeViewData->make<KvCStringExpr>(text, asCode, quoted);
}

KvCSmbInitValExpr* KV_ExprLocFactory::createInitValue(const std::vector<int>& sizes) {
  if (sizes.size() > 3)
    return nullptr;
  for (int size : sizes)
    if (size < 1)
      return nullptr;
  return codeViewData->make<KvCSmbInitValExpr>(sizes);
}

// --- operations

bool KV_OperationFactory::attachAll(KV_Operation* op,
                                    std::initializer_list<KV_ExprLocation*> operands) {
  for (KV_ExprLocation* loc : operands) {
    if (op->appendOperand(loc))
      continue;
    // Undo: leave every operand as it was.
    for (int i = 0; i < op->getNumberOfOperands(); ++i)
      op->setOperand(i, nullptr);
    return false;
  }
  return true;
}

KV_Operation*
KV_OperationFactory::createOperation(tagKvEOperatorKind kind,
                                     std::initializer_list<KV_ExprLocation*> operands) {
  KV_OpOperator* oper = KV_OpOperator::get(kind);
  if (!oper || oper->isQualifiedSymbol() || oper->isCodeBlock() ||
      (oper->getArity() >= 0 && oper->getArity() != static_cast<int>(operands.size())))
    return nullptr;
  // A refused operation stays behind, held by nothing and owned by the code view data.
  KV_Operation* op = codeViewData->make<KV_Operation>(oper);
  return attachAll(op, operands) ? op : nullptr;
}

KV_Operation* KV_OperationFactory::createCast(KV_DataType* target, KV_ExprLocation* operand) {
  KV_ExprLocation* typeLoc =
      codeViewData->getFactoryContainer()->getExprLocFactory()->createFromDataType(target);
  KV_Operation* cast = createOperation(KV_OP_CAST, {operand, typeLoc});
  if (cast)
    cast->setDataType(target);
  return cast;
}

KvCCallOperation*
KV_OperationFactory::createCallOperation(KvCParamSymbol* called,
                                         std::initializer_list<KV_ExprLocation*> parameters) {
  if (!called)
    return nullptr;
  KvCCallOperation* call = codeViewData->make<KvCCallOperation>(called);
  KV_ExprLocation* access =
      codeViewData->getFactoryContainer()->getExprLocFactory()->createFromSymbol(called);
  if (!call->appendOperand(access) || !attachAll(call, parameters)) {
    call->setOperand(0, nullptr);
    return nullptr;
  }
  call->setDataType(called->getDataType());
  return call;
}

KvCCodeBlockOperation* KV_OperationFactory::createCodeBlock(const WmCXString& code,
                                                            bool assembler) {
  return codeViewData->make<KvCCodeBlockOperation>(code, assembler);
}

// --- symbol accesses

KV_QualifiedSymbolOp* KV_QSOFactory::createQso(KvCSymbol* symbol) {
  if (!symbol)
    return nullptr;
  return codeViewData->make<KV_QualifiedSymbolOp>(symbol);
}

KV_QualifiedSymbolOp* KV_QSOFactory::createComponentQso(KvCSymbol* base, KvCSymbol* component) {
  KV_QualifiedSymbolOp* qso = createQso(component);
  if (qso)
    qso->setBaseSymbol(base);
  return qso;
}

// --- statements and tables

KV_Statement* KV_StatementFactory::createStatement(KV_ExprLocation* root) {
  if (root && root->getParent())
    return nullptr;
  KV_Statement* statement = codeViewData->make<KV_Statement>();
  statement->setExprLoc(root);
  return statement;
}

KvCCStmTable* KV_StatementFactory::createCStmTable(KvCParamSymbol* codeBlock, KvCIcFileId* file) {
  KvCCStmTable* table = codeViewData->make<KvCCStmTable>();
  table->setCodeBlockSymbol(codeBlock);
  table->setFile(file);
  return table;
}
