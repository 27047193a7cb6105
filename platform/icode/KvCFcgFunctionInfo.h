// KvCFcgFunctionInfo: the call-graph record of one function or macro, owned by its
// symbol: the call operations that call it, the functions it calls, the in-loop mark of
// the recursion analysis, the inlining state and the file of its body.
//
// Both sets iterate deterministically: call operations by serial number, functions by
// debug index.
#ifndef HUL_PLATFORM_ICODE_KVCFCGFUNCTIONINFO_H
#define HUL_PLATFORM_ICODE_KVCFCGFUNCTIONINFO_H

#include "platform/icode/KvCFcgSortedSet.h"
#include "platform/support/HulPlatformExport.h"

class KvCCallOperation;
class KvCIcFileId;
class KvCParamSymbol;

// An element of a function's set of called functions: the function and its debug index,
// kept together so that the set is ordered without reading the symbols.
struct KvCFcgCalledFunction {
  int debugIndex;
  KvCParamSymbol* symbol;
};

// The orders of the two sets: call operations by serial number, called functions by debug
// index.
struct HUL_PLATFORM_API KvCFcgCallsBySerial {
  bool operator()(const KvCCallOperation* a, const KvCCallOperation* b) const;
};
struct KvCFcgCalledByDebugIndex {
  bool operator()(const KvCFcgCalledFunction& a, const KvCFcgCalledFunction& b) const {
    return a.debugIndex < b.debugIndex;
  }
};

class HUL_PLATFORM_API KvCFcgFunctionInfo {
public:
  explicit KvCFcgFunctionInfo(KvCParamSymbol* owner);

  KvCParamSymbol* getSymbol() const { return symbol; }

  using CallOperationSet = KvCFcgSortedSet<KvCCallOperation*, KvCFcgCallsBySerial>;
  using CalledFunctionSet = KvCFcgSortedSet<KvCFcgCalledFunction, KvCFcgCalledByDebugIndex>;

  CallOperationSet& getCallOperationsSet() { return callOperations; }
  CalledFunctionSet& getCalledFunctionsSet() { return calledFunctions; }
  // Each answers whether the set changed.
  bool addCallOperation(KvCCallOperation* call);
  bool delCallOperation(KvCCallOperation* call);
  bool addCalledFcn(KvCFcgFunctionInfo* called);

  bool isInLoop() const { return inLoop; }
  void markInLoop() { inLoop = true; }
  void unmarkInLoop() { inLoop = false; }
  bool isInlined() const { return inlined; }
  void setInlined(bool value) { inlined = value; }
  bool isRemoved() const { return removed; }
  void setRemoved(bool value) { removed = value; }
  bool isInlinedAtomically() const { return inlinedAtomically; }
  void setInlinedAtomically(bool value) { inlinedAtomically = value; }
  // The same mark, as the reuse call graph reads it.
  bool isInlinedAtomic() const { return inlinedAtomically; }

  KvCIcFileId* getFile() const { return file; }
  void setFile(KvCIcFileId* f) { file = f; }

private:
  KvCParamSymbol* symbol;
  CallOperationSet callOperations;
  CalledFunctionSet calledFunctions;
  bool inLoop = false;
  bool inlined = false;
  bool removed = false;
  bool inlinedAtomically = false;
  KvCIcFileId* file = nullptr;
};

#endif
