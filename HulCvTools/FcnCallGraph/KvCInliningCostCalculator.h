// KvCInliningCostCalculator: the cost of inlining a function, from the number of call
// operations that call it and the number of statements of its body:
//   (calls - 1) * (statements - 1) + 1   when both are at least 1,
//   2147483647                           otherwise.
// A function called once, or with one statement, costs 1. Costs beyond the int range
// saturate at 2147483647. Stateless; cheap to make on the stack.
#ifndef HULCVTOOLS_FCNCALLGRAPH_KVCINLININGCOSTCALCULATOR_H
#define HULCVTOOLS_FCNCALLGRAPH_KVCINLININGCOSTCALCULATOR_H

#include "HulCvTools/HulCvToolsExport.h"
#include "HulCvTools/ModelInterfaces/ICodeFwd.h"

class HULCV_API KvCInliningCostCalculator {
public:
  KvCInliningCostCalculator() = default;
  virtual ~KvCInliningCostCalculator();

  int calculateInliningCosts(int numberOfCalls, int numberOfStatements) const;
  // Calls: the function info's set of call operations (filled by the call graph). The
  // statements: those of every table the ICode iterator reaches from the body. A null
  // function, or one without body, costs 2147483647. O(size of the body).
  int calculateInliningCosts(KvCParamSymbol* function) const;
};

#endif
