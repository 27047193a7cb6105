#include "HulCvTools/FcnCallGraph/KvCInliningCostCalculator.h"

#include "HulCvTools/FcnCallGraph/KvCInliningCostStatementCounter.h"
#include "HulCvTools/ModelInterfaces/ICodeModel.h"

#include <climits>
#include <cstdint>

KvCInliningCostCalculator::~KvCInliningCostCalculator() = default;

int KvCInliningCostCalculator::calculateInliningCosts(int numberOfCalls,
                                                      int numberOfStatements) const {
  if (numberOfCalls < 1 || numberOfStatements < 1)
    return INT_MAX;
  const std::int64_t cost =
      std::int64_t{numberOfCalls - 1} * std::int64_t{numberOfStatements - 1} + 1;
  return cost > INT_MAX ? INT_MAX : static_cast<int>(cost);
}

int KvCInliningCostCalculator::calculateInliningCosts(KvCParamSymbol* function) const {
  if (!function || !function->getFunctionInfo())
    return INT_MAX;
  KvCICodeIterator iterator;
  KvCInliningCostStatementCounter counter;
  const int calls = function->getFunctionInfo()->getCallOperationsSet().size();
  if (KvCCStmTable* body = function->getBodySTT())
    iterator.iterateStatementTable(body, &counter);
  return calculateInliningCosts(calls, counter.getCount());
}
