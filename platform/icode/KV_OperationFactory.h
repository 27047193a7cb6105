// KV_OperationFactory: makes operations, calls, casts and code blocks. Operations are new
// and held by no location; the code view data owns them.
#ifndef HUL_PLATFORM_ICODE_KV_OPERATIONFACTORY_H
#define HUL_PLATFORM_ICODE_KV_OPERATIONFACTORY_H

#include "platform/icode/KV_OpOperator.h"
#include "platform/support/HulPlatformExport.h"
#include "platform/support/WmCXString.h"

#include <initializer_list>

class KV_DataType;
class KV_ExprLocation;
class KV_Operation;
class KvCCallOperation;
class KvCCodeBlockOperation;
class KvCCodeViewData;
class KvCParamSymbol;

class HUL_PLATFORM_API KV_OperationFactory {
public:
  explicit KV_OperationFactory(KvCCodeViewData* owner) : codeViewData(owner) {}

  // An operation of `kind` with the given operands (null entries leave a slot empty).
  // Null, and no operand attached, when the kind needs its own creator (symbol access,
  // call operation, code block), when a kind of fixed arity gets another number of
  // operands, or when an operand cannot be attached (it has a parent, or appears twice).
  KV_Operation* createOperation(tagKvEOperatorKind kind,
                                std::initializer_list<KV_ExprLocation*> operands);
  // A cast of `operand` to `target`: operand 0 the operand, operand 1 a location holding
  // the target type, the operation's type the target.
  KV_Operation* createCast(KV_DataType* target, KV_ExprLocation* operand);
  // A call of `called`: operand 0 a new access to `called`, then the parameter
  // locations. Null for a null function or a parameter that cannot be attached.
  KvCCallOperation* createCallOperation(KvCParamSymbol* called,
                                        std::initializer_list<KV_ExprLocation*> parameters);
  KvCCodeBlockOperation* createCodeBlock(const WmCXString& code, bool assembler);

private:
  bool attachAll(KV_Operation* op, std::initializer_list<KV_ExprLocation*> operands);

  KvCCodeViewData* codeViewData;
};

#endif
