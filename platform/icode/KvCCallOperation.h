// KvCCallOperation: a call of a function or macro. Operand 0 holds the access to the
// called symbol (so the call is a use in the called symbol's database); operands 1..n
// are the parameter operations (formal, actual).
//
// The calling function is not stored: it is the code block symbol of the statement table
// that contains the call, or, for a call in the body of a macro definition, that macro;
// found on demand (null for a call outside every function and macro body, for example in
// an initial value at file level). The answer is kept with the structure
// epoch it was found at (see KV_ICodeElem) and reused while no link of the ICode changed.
#ifndef HUL_PLATFORM_ICODE_KVCCALLOPERATION_H
#define HUL_PLATFORM_ICODE_KVCCALLOPERATION_H

#include "platform/icode/KV_Operation.h"

#include <cstdint>

class KvCParamSymbol;
class KvCTaskActivation;

class HUL_PLATFORM_API KvCCallOperation : public KV_Operation {
public:
  KvCCallOperation(int serialNumber, KvCParamSymbol* called);

  KvCCallOperation* asCallOperation() override { return this; }

  KvCParamSymbol* getCalledSymbol() const { return calledSymbol; }
  // The function or macro whose body holds the call, or null. O(1) while the ICode's
  // structure is unchanged since the last call, else O(depth).
  KvCParamSymbol* getCallingSymbol() const {
    if (callingEpoch == structureEpoch())
      return callingSymbol;
    return findCallingSymbol();
  }

  // The descriptor when the call activates a task, else null. Not owned.
  KvCTaskActivation* getTaskActivation() const { return taskActivation; }
  void setTaskActivation(KvCTaskActivation* activation) { taskActivation = activation; }
  bool isTaskActivation() const { return taskActivation != nullptr; }

private:
  KvCParamSymbol* calledSymbol;
  KvCTaskActivation* taskActivation = nullptr;

  // Walks up to the calling function and caches it.
  KvCParamSymbol* findCallingSymbol() const;
  mutable KvCParamSymbol* callingSymbol = nullptr;
  mutable std::uint64_t callingEpoch = 0; // 0: nothing cached
};

#endif
