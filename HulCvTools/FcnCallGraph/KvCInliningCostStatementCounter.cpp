#include "HulCvTools/FcnCallGraph/KvCInliningCostStatementCounter.h"

#include "HulCvTools/ModelInterfaces/ICodeModel.h"

void KvCInliningCostStatementCounter::visitStatementTable(KV_StatementTable* table) {
  if (table)
    counter += table->getNumberOfStatements();
}
