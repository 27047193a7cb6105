#include "HulCvTools/FcnCallGraph/KvCFcgReInitInlining.h"

#include "HulCvTools/ModelInterfaces/ICodeModel.h"

KvCFcgReInitInlining::~KvCFcgReInitInlining() = default;

void KvCFcgReInitInlining::operator()(KvCFcgFunctionInfo* function) {
  if (function)
    function->unmarkInLoop();
}

bool KvCFcgReInitInlining::stopIteration() { return false; }
