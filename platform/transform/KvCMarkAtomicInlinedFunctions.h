// KvCMarkAtomicInlinedFunctions: the transformation library's functor that marks, in
// their function infos, the functions that are inlined atomically: inlined as a whole
// (the code generator asked for atomic inlining of the function, and it is inlined). Every
// other function's mark is cleared, so one traversal leaves marks for the current state.
//
// Header-only: it builds on the call-graph functor of the code view tools library, and the
// library creates it itself.
#ifndef HUL_PLATFORM_TRANSFORM_KVCMARKATOMICINLINEDFUNCTIONS_H
#define HUL_PLATFORM_TRANSFORM_KVCMARKATOMICINLINEDFUNCTIONS_H

#include "HulCvTools/FcnCallGraph/KvCFcgFunctor.h"
#include "platform/icode/KvCFcgFunctionInfo.h"
#include "platform/icode/KvCParamSymbol.h"

class KvCMarkAtomicInlinedFunctions : public KvCFcgFunctor {
public:
  void operator()(KvCFcgFunctionInfo* info) override {
    if (!info)
      return;
    const KvCParamSymbol* function = info->getSymbol();
    info->setInlinedAtomically(function && function->isAtomicInlineFunction() && info->isInlined());
  }
};

#endif
