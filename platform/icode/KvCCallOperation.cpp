#include "platform/icode/KvCCallOperation.h"

#include "platform/icode/KV_Statement.h"
#include "platform/icode/KvCCStmTable.h"

KvCCallOperation::KvCCallOperation(int serialNumber, KvCParamSymbol* called)
    : KV_Operation(serialNumber, KV_OpOperator::get(KV_OP_CALL)), calledSymbol(called) {}

KvCParamSymbol* KvCCallOperation::findCallingSymbol() const {
  KV_Statement* statement = findParentStatement();
  KvCCStmTable* table = statement ? statement->getParentCTable() : nullptr;
  callingSymbol = table ? table->getCodeBlockSymbol() : nullptr;
  callingEpoch = structureEpoch();
  return callingSymbol;
}
