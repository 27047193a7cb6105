#include "platform/icode/KvCSymbol.h"

#include "platform/icode/KvCCallOperation.h"
#include "platform/icode/KvCExprLocDB.h"
#include "platform/icode/KvCFcgFunctionInfo.h"
#include "platform/icode/KvCParamSymbol.h"

KvCSymbol::KvCSymbol(int index, WmCXString symbolName, KV_DataType* type)
    : name(std::move(symbolName)), debugIndex(index), dataType(type) {}

KvCSymbol::~KvCSymbol() = default;

void KvCSymbol::setRole(tagKvESymbolRole role, bool value) {
  if (value)
    roles |= role;
  else
    roles &= ~static_cast<unsigned>(role);
}

KvCParamSymbol::KvCParamSymbol(int index, WmCXString symbolName, KV_DataType* returnType,
                               bool isMacroSymbol)
    : KvCSymbol(index, std::move(symbolName), returnType), macro(isMacroSymbol),
      info(std::make_unique<KvCFcgFunctionInfo>(this)) {}

KvCParamSymbol::~KvCParamSymbol() = default;

namespace {
int compareCallsBySerial(KvCCallOperation* const& a, KvCCallOperation* const& b) {
  const int x = a ? a->getSerial() : -1;
  const int y = b ? b->getSerial() : -1;
  return x < y ? -1 : (x > y ? 1 : 0);
}

int compareFunctionsByDebugIndex(const KvCFcgCalledFunction& a, const KvCFcgCalledFunction& b) {
  return a.debugIndex < b.debugIndex ? -1 : (a.debugIndex > b.debugIndex ? 1 : 0);
}
} // namespace

KvCFcgFunctionInfo::KvCFcgFunctionInfo(KvCParamSymbol* owner)
    : symbol(owner), callOperations(&compareCallsBySerial),
      calledFunctions(&compareFunctionsByDebugIndex) {}

bool KvCFcgFunctionInfo::addCalledFcn(KvCFcgFunctionInfo* called) {
  if (!called || !called->symbol)
    return false;
  return calledFunctions.insert(
      KvCFcgCalledFunction{called->symbol->getDebugIndex(), called->symbol});
}
