// KvCFcgFunctor: what the call graph's traversals apply to a function. The traversals
// over all nodes ask stopIteration before each node and end when it answers true.
#ifndef HULCVTOOLS_FCNCALLGRAPH_KVCFCGFUNCTOR_H
#define HULCVTOOLS_FCNCALLGRAPH_KVCFCGFUNCTOR_H

#include "HulCvTools/HulCvToolsExport.h"
#include "HulCvTools/ModelInterfaces/ICodeFwd.h"

class HULCV_API KvCFcgFunctor {
public:
  virtual ~KvCFcgFunctor();
  virtual void operator()(KvCFcgFunctionInfo* function) = 0;
  // False unless overridden.
  virtual bool stopIteration();
};

#endif
