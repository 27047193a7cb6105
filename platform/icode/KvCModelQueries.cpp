// The model's query classes.
#include "platform/icode/KV_DataType.h"
#include "platform/icode/KV_QualifiedSymbolOp.h"
#include "platform/icode/KvCAccessQsoQuery.h"
#include "platform/icode/KvCParamSymbol.h"
#include "platform/icode/KvCSymbolQuery.h"

bool KvCAccessQsoQuery::isPlainStructAccess(KV_QualifiedSymbolOp* qso) {
  if (!qso || qso->isDereferenced())
    return false;
  KV_DataType* type = qso->getDataType();
  return type && type->asStructType();
}

bool KvCAccessQsoQuery::isDerefPointerToStructAccess(KV_QualifiedSymbolOp* qso) {
  if (!qso || !qso->isDereferenced())
    return false;
  KV_DataType* type = qso->getDataType();
  return type && type->asStructType();
}

bool KvCSymbolQuery::isCodeBlockImported(KvCParamSymbol* codeBlock) {
  return codeBlock && codeBlock->isImportedCodeBlock();
}
