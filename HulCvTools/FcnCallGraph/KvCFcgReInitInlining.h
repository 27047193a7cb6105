// KvCFcgReInitInlining: the functor that clears a function's in-loop mark.
#ifndef HULCVTOOLS_FCNCALLGRAPH_KVCFCGREINITINLINING_H
#define HULCVTOOLS_FCNCALLGRAPH_KVCFCGREINITINLINING_H

#include "HulCvTools/FcnCallGraph/KvCFcgFunctor.h"

class HULCV_API KvCFcgReInitInlining : public KvCFcgFunctor {
public:
  ~KvCFcgReInitInlining() override;
  void operator()(KvCFcgFunctionInfo* function) override;
  bool stopIteration() override;
};

#endif
