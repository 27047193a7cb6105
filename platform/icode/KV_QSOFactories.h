// KV_QSOFactories: the factories of symbol-access operations beyond the plain access:
// today the reference factory, which makes references (the address of a symbol).
// Owned by the factory container (getQSOFactories).
#ifndef HUL_PLATFORM_ICODE_KV_QSOFACTORIES_H
#define HUL_PLATFORM_ICODE_KV_QSOFACTORIES_H

#include "platform/support/HulPlatformExport.h"

class KV_Operation;
class KvCCodeViewData;
class KvCSrcRef;
class KvCSymbol;

class HUL_PLATFORM_API KV_RefFactory {
public:
  explicit KV_RefFactory(KvCCodeViewData* owner) : codeViewData(owner) {}

  // A new address-of operation whose operand is a plain access to `symbol`; null for a
  // null symbol. `srcRef` is the caller's and is not kept.
  KV_Operation* createRef(KvCSymbol* symbol, const KvCSrcRef* srcRef);

private:
  KvCCodeViewData* codeViewData;
};

class HUL_PLATFORM_API KV_QSOFactories {
public:
  explicit KV_QSOFactories(KvCCodeViewData* owner) : refs(owner) {}

  KV_RefFactory* getRefFactory() { return &refs; }

private:
  KV_RefFactory refs;
};

#endif
