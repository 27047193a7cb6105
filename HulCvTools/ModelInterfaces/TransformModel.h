// The sibling code-view transformation library as the library's sources see it.
//
// What the reuse call graph relies on: KvCMarkAtomicInlinedFunctions is a KvCFcgFunctor,
// default-constructible, that sets each function info's inlined-atomically mark
// (KvCFcgFunctionInfo::isInlinedAtomic) from the current inlining state when applied.
#ifndef HULCVTOOLS_MODELINTERFACES_TRANSFORMMODEL_H
#define HULCVTOOLS_MODELINTERFACES_TRANSFORMMODEL_H

#include "platform/transform/KvCMarkAtomicInlinedFunctions.h"

#endif
