// KV_OperationFactories: the factories of operations that only preprocessor text needs,
// owned by the factory container (getOperationFactories):
// - KvCPreProcOpFactory makes preprocessor concatenations (KV_OP_PREPROC_CONCAT): two
//   pieces of macro text joined. The C printer joins them with `##` where both sides meet
//   with names (identifier characters), so that the preprocessor pastes the two names into
//   one; elsewhere (a bracket next to a name) it writes the pieces side by side.
// - KvCAppendOpFactory makes string appends (KV_OP_STRING_APPEND): an expression followed
//   by a text, written as the expression's text with the text after it (a macro call
//   followed by "()").
// Names and texts become code strings (KvCStringExpr, as code, unquoted). Operations are
// new and held by no location; the code view data owns them. A `srcRef` is the caller's:
// it becomes the operation's source reference and is not owned.
#ifndef HUL_PLATFORM_ICODE_KV_OPERATIONFACTORIES_H
#define HUL_PLATFORM_ICODE_KV_OPERATIONFACTORIES_H

#include "platform/support/HulPlatformExport.h"
#include "platform/support/WmCXString.h"

class KV_ExprLocation;
class KV_Operation;
class KvCCodeViewData;
class KvCSrcRef;

class HUL_PLATFORM_API KvCPreProcOpFactory {
public:
  explicit KvCPreProcOpFactory(KvCCodeViewData* owner) : codeViewData(owner) {}

  // The concatenation of two names or texts ("name1", "name2"; "(" and ")").
  KV_Operation* createConcat(const WmCXString& left, const WmCXString& right,
                             const KvCSrcRef* srcRef);
  // The concatenation of a text and an operation (usually another concatenation); null
  // for a null operation or one that a location holds already.
  KV_Operation* createConcat(const WmCXString& left, KV_Operation* right, const KvCSrcRef* srcRef);
  // The concatenation of two locations; null for a null location or one with a parent.
  KV_Operation* createConcat(KV_ExprLocation* left, KV_ExprLocation* right,
                             const KvCSrcRef* srcRef);

private:
  KvCCodeViewData* codeViewData;
};

class HUL_PLATFORM_API KvCAppendOpFactory {
public:
  explicit KvCAppendOpFactory(KvCCodeViewData* owner) : codeViewData(owner) {}

  // `op` followed by `text`: operand 0 holds the operation, operand 1 the text. The append
  // has the operation's type and scaling. Null for a null operation or one that a location
  // holds already.
  KV_Operation* createStringAppend(KV_Operation* op, const WmCXString& text,
                                   const KvCSrcRef* srcRef = nullptr);

private:
  KvCCodeViewData* codeViewData;
};

class HUL_PLATFORM_API KV_OperationFactories {
public:
  explicit KV_OperationFactories(KvCCodeViewData* owner) : preProcessor(owner), append(owner) {}
  KV_OperationFactories(const KV_OperationFactories&) = delete;
  KV_OperationFactories& operator=(const KV_OperationFactories&) = delete;

  KvCPreProcOpFactory* getPreProcessor() { return &preProcessor; }
  KvCAppendOpFactory* getAppend() { return &append; }

private:
  KvCPreProcOpFactory preProcessor;
  KvCAppendOpFactory append;
};

#endif
