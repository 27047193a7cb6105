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

bool KvCFcgCallsBySerial::operator()(const KvCCallOperation* a, const KvCCallOperation* b) const {
  return (a ? a->getSerial() : -1) < (b ? b->getSerial() : -1);
}

KvCFcgFunctionInfo::KvCFcgFunctionInfo(KvCParamSymbol* owner) : symbol(owner) {}

bool KvCFcgFunctionInfo::addCallOperation(KvCCallOperation* call) {
  return call && callOperations.insert(call);
}

void KvCFcgFunctionInfo::addCallOperations(KvCCallOperation* const* calls, const int* serials,
                                           std::size_t n) {
  bool ordered = callOperations.empty();
  for (std::size_t i = 0; i < n && ordered; ++i)
    ordered = calls[i] && (i == 0 || serials[i - 1] < serials[i]);
  if (ordered) {
    callOperations.appendAscending(calls, n);
    return;
  }
  // A set that kept its elements (most often these very calls): one by one from the front.
  callOperations.rewind();
  for (std::size_t i = 0; i < n; ++i)
    addCallOperation(calls[i]);
}

bool KvCFcgFunctionInfo::delCallOperation(KvCCallOperation* call) {
  return call && callOperations.del(call);
}

bool KvCFcgFunctionInfo::addCalledFcn(KvCFcgFunctionInfo* called) {
  return called && addCalledFcn(called->asCalledFunction());
}

bool KvCFcgFunctionInfo::addCalledFcn(const KvCFcgCalledFunction& called) {
  return called.symbol && calledFunctions.insert(called);
}

KvCFcgCalledFunction KvCFcgFunctionInfo::asCalledFunction() const {
  return KvCFcgCalledFunction{symbol ? symbol->getDebugIndex() : 0, symbol};
}
