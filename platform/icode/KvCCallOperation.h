// KvCCallOperation: a call of a function or macro. Operand 0 holds the access to the
// called symbol (so the call is a use in the called symbol's database); operands 1..n
// are the parameter operations (formal, actual).
//
// The calling function is not stored: it is the code block symbol of the statement table
// that contains the call, found on demand (null for a call outside every function, for
// example in an initial value at file level).
#ifndef HUL_PLATFORM_ICODE_KVCCALLOPERATION_H
#define HUL_PLATFORM_ICODE_KVCCALLOPERATION_H

#include "platform/icode/KV_Operation.h"

class KvCParamSymbol;
class KvCTaskActivation;

class HUL_PLATFORM_API KvCCallOperation : public KV_Operation {
public:
  KvCCallOperation(int serialNumber, KvCParamSymbol* called);

  KvCCallOperation* asCallOperation() override { return this; }

  KvCParamSymbol* getCalledSymbol() const { return calledSymbol; }
  // The function or macro whose body holds the call, or null. O(depth).
  KvCParamSymbol* getCallingSymbol() const;

  // The descriptor when the call activates a task, else null. Not owned.
  KvCTaskActivation* getTaskActivation() const { return taskActivation; }
  void setTaskActivation(KvCTaskActivation* activation) { taskActivation = activation; }
  bool isTaskActivation() const { return taskActivation != nullptr; }

private:
  KvCParamSymbol* calledSymbol;
  KvCTaskActivation* taskActivation = nullptr;
};

#endif
