// The model's query classes.
#include "platform/icode/KV_DataType.h"
#include "platform/icode/KV_QualifiedSymbolOp.h"
#include "platform/icode/KvCAccessQsoQuery.h"
#include "platform/icode/KvCAddressQualifier.h"
#include "platform/icode/KvCCStmTable.h"
#include "platform/icode/KvCParamSymbol.h"
#include "platform/icode/KvCSymbolQuery.h"
#include "platform/icode/KvCUnparamSymbol.h"

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

KvCCStmTable* KvCSymbolQuery::getDestinationStt(KvCSymbol* symbol) {
  return symbol ? symbol->listedIn : nullptr;
}

bool KvCSymbolQuery::isPotentialGlobalSymbol(KvCSymbol* symbol, KvCCStmTable* table) {
  if (!symbol || !table)
    return false;
  KvCUnparamSymbol* variable = symbol->asUnparamSymbol();
  if (variable && variable->isComponent())
    return false;
  return table->isPrimaryScopeTable() || table->isSecondaryScopeTable();
}

bool KvCSymbolQuery::getUnparamSymbolTypeSpecifiersIgnoreStructs(
    KvCUnparamSymbol* variable, KV_DataTypeServer* /*typeServer*/, bool countDefaultQualifier,
    bool& isConst, bool& isVolatile, bool& hasQualifier, KvCAddressQualifier*& qualifier) {
  isConst = false;
  isVolatile = false;
  hasQualifier = false;
  qualifier = nullptr;
  if (!variable)
    return false;
  isConst = variable->isConst();
  isVolatile = variable->isVolatile();
  qualifier = variable->getAddressQualifier();
  hasQualifier = qualifier && (countDefaultQualifier || !qualifier->isDefault());
  return true;
}
