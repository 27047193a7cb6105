// KV_QSOFactory: makes symbol accesses (qualified-symbol operations).
#ifndef HUL_PLATFORM_ICODE_KV_QSOFACTORY_H
#define HUL_PLATFORM_ICODE_KV_QSOFACTORY_H

#include "platform/support/HulPlatformExport.h"

class KV_QualifiedSymbolOp;
class KvCCodeViewData;
class KvCSymbol;

class HUL_PLATFORM_API KV_QSOFactory {
public:
  explicit KV_QSOFactory(KvCCodeViewData* owner) : codeViewData(owner) {}

  // A plain access to `symbol` (no base, no indices); null for a null symbol.
  KV_QualifiedSymbolOp* createQso(KvCSymbol* symbol);
  // An access to the component `component` of the structure variable `base`.
  KV_QualifiedSymbolOp* createComponentQso(KvCSymbol* base, KvCSymbol* component);

private:
  KvCCodeViewData* codeViewData;
};

#endif
