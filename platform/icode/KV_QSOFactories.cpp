#include "platform/icode/KV_QSOFactories.h"

#include "platform/icode/KV_ICodeFactoryContainer.h"
#include "platform/icode/KvCCodeViewData.h"
#include "platform/support/KvCNames.h"

KV_Operation* KV_RefFactory::createRef(KvCSymbol* symbol, const KvCSrcRef* /*srcRef*/) {
  if (!symbol)
    return nullptr;
  KV_ICodeFactoryContainer* f = codeViewData->getFactoryContainer();
  return f->getOperationFactory()->createOperation(
      KV_OP_ADDRESS_OF, {f->getExprLocFactory()->createFromSymbol(symbol)});
}

// The expression-location factory's forms with a source reference.

KV_ExprLocation* KV_ExprLocFactory::createFromName(const WmCXString& name, bool cook,
                                                   const KvCSrcRef* /*srcRef*/) {
  if (name.isEmpty())
    return nullptr;
  return createFromString(cook ? KvCNames::cookName(name) : name, true, false);
}

KV_ExprLocation* KV_ExprLocFactory::createFromValue(std::int64_t value,
                                                    const KvCSrcRef* /*srcRef*/) {
  return createFromValue(value, static_cast<KV_DataType*>(nullptr), false);
}

KV_ExprLocation* KV_ExprLocFactory::createFromOperation(KV_Operation* op,
                                                        const KvCSrcRef* /*srcRef*/) {
  return createFromOperation(op);
}
