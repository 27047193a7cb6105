#include "platform/icode/KV_OperationFactories.h"

#include "platform/icode/KV_ExprLocation.h"
#include "platform/icode/KV_ICodeFactoryContainer.h"
#include "platform/icode/KV_Operation.h"
#include "platform/icode/KvCCodeViewData.h"

namespace {
KV_ExprLocation* codeText(KvCCodeViewData* data, const WmCXString& text) {
  return data->getFactoryContainer()->getExprLocFactory()->createFromString(text, true, false);
}

KV_ExprLocation* holding(KvCCodeViewData* data, KV_Operation* op) {
  return op ? data->getFactoryContainer()->getExprLocFactory()->createFromOperation(op) : nullptr;
}
} // namespace

KV_Operation* KvCPreProcOpFactory::createConcat(KV_ExprLocation* left, KV_ExprLocation* right,
                                                const KvCSrcRef* srcRef) {
  if (!left || !right || left == right || left->getParent() || right->getParent())
    return nullptr;
  KV_Operation* concat =
      codeViewData->getFactoryContainer()->getOperationFactory()->createOperation(
          KV_OP_PREPROC_CONCAT, {left, right});
  if (concat)
    concat->setSourceRef(srcRef);
  return concat;
}

KV_Operation* KvCPreProcOpFactory::createConcat(const WmCXString& left, const WmCXString& right,
                                                const KvCSrcRef* srcRef) {
  return createConcat(codeText(codeViewData, left), codeText(codeViewData, right), srcRef);
}

KV_Operation* KvCPreProcOpFactory::createConcat(const WmCXString& left, KV_Operation* right,
                                                const KvCSrcRef* srcRef) {
  KV_ExprLocation* rightLoc = holding(codeViewData, right);
  if (!rightLoc)
    return nullptr;
  KV_Operation* concat = createConcat(codeText(codeViewData, left), rightLoc, srcRef);
  if (!concat)
    rightLoc->releaseContent(); // the operation is free again for the caller
  return concat;
}

KV_Operation* KvCAppendOpFactory::createStringAppend(KV_Operation* op, const WmCXString& text,
                                                     const KvCSrcRef* srcRef) {
  KV_ExprLocation* opLoc = holding(codeViewData, op);
  if (!opLoc)
    return nullptr;
  KV_Operation* append =
      codeViewData->getFactoryContainer()->getOperationFactory()->createOperation(
          KV_OP_STRING_APPEND, {opLoc, codeText(codeViewData, text)});
  if (!append) {
    opLoc->releaseContent();
    return nullptr;
  }
  append->setDataType(op->getDataType());
  append->setScaling(op->getScaling());
  append->setSourceRef(srcRef);
  return append;
}
