// KvCFcgFunctionInfo: the call-graph record of one function or macro, owned by its
// symbol: the call operations that call it, the functions it calls, the in-loop mark of
// the recursion analysis, the inlining state and the file of its body.
//
// Both sets iterate deterministically: call operations by serial number, functions by
// debug index.
#ifndef HUL_PLATFORM_ICODE_KVCFCGFUNCTIONINFO_H
#define HUL_PLATFORM_ICODE_KVCFCGFUNCTIONINFO_H

#include "platform/leda/set.h"
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

class HUL_PLATFORM_API KvCFcgFunctionInfo {
public:
  explicit KvCFcgFunctionInfo(KvCParamSymbol* owner);

  KvCParamSymbol* getSymbol() const { return symbol; }

  leda::set<KvCCallOperation*>& getCallOperationsSet() { return callOperations; }
  leda::set<KvCFcgCalledFunction>& getCalledFunctionsSet() { return calledFunctions; }
  // Each answers whether the set changed.
  bool addCallOperation(KvCCallOperation* call) { return call && callOperations.insert(call); }
  bool delCallOperation(KvCCallOperation* call) { return call && callOperations.del(call); }
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

  KvCIcFileId* getFile() const { return file; }
  void setFile(KvCIcFileId* f) { file = f; }

private:
  KvCParamSymbol* symbol;
  leda::set<KvCCallOperation*> callOperations;
  leda::set<KvCFcgCalledFunction> calledFunctions;
  bool inLoop = false;
  bool inlined = false;
  bool removed = false;
  bool inlinedAtomically = false;
  KvCIcFileId* file = nullptr;
};

#endif
