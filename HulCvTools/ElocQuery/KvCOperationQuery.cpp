#include "HulCvTools/ElocQuery/KvCOperationQuery.h"

#include "HulCvTools/ModelInterfaces/ICodeModel.h"

namespace {

bool isCCode(KV_Operation* op) {
  KV_OpConversionLevel* level = op->getConversionLevel();
  return level && level->isCCode();
}

bool bitOperationCanExpand(tagKvEOperatorKind kind) {
  switch (kind) {
  case KV_OP_BIT_AND:
  case KV_OP_BIT_OR:
  case KV_OP_BIT_XOR:
  case KV_OP_BIT_NOT:
    return false;
  default:
    return true;
  }
}

bool assignmentCanExpand(tagKvEOperatorKind kind) {
  switch (kind) {
  case KV_OP_ASSIGN:
  case KV_OP_BIT_AND_ASSIGN:
  case KV_OP_BIT_OR_ASSIGN:
    return false;
  default:
    return true;
  }
}

bool codeBlockCanExpand(KV_Operation* op) {
  KvCCodeBlockOperation* block = op->asCodeBlockOperation();
  return !block || !block->isAssemblerBlock();
}

bool remainingKindCanExpand(tagKvEOperatorKind kind) {
  switch (kind) {
  case KV_OP_CAST:
  case KV_OP_ADDRESS_OF:
  case KV_OP_DEREFERENCE:
  case KV_OP_CONDITIONAL:
  case KV_OP_COMMA:
  case KV_OP_CALL:
  case KV_OP_PARAMETER:
  case KV_OP_QUALIFIED_SYMBOL:
    return false;
  default:
    return true;
  }
}

// The six families, then the remaining kinds.
bool kindCanExpand(KV_Operation* op) {
  const KV_OpOperator* oper = op->getOperator();
  if (oper->isLogical())
    return false;
  if (oper->isRelational())
    return false;
  if (oper->isArithmetic())
    return true;
  if (oper->isBitOperation())
    return bitOperationCanExpand(oper->getKind());
  if (oper->isAssign() || oper->isIncrementOrDecrement())
    return assignmentCanExpand(oper->getKind());
  if (oper->isControlFlow())
    return false;
  if (oper->isCodeBlock())
    return codeBlockCanExpand(op);
  if (oper->isDeclOrDef())
    return false;
  return remainingKindCanExpand(oper->getKind());
}

} // namespace

KvCOperationQuery& KvCOperationQuery::operator=(const KvCOperationQuery&) { return *this; }

bool KvCOperationQuery::canOperationExpandToNotSideEffectFreeParamSymbol(KV_Operation* op) {
  if (!op)
    return false;
  if (isCCode(op))
    return false;
  if (op->asQualifiedSymbolOp())
    return false;
  return kindCanExpand(op);
}
