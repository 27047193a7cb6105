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

KvCSmbClassId* KvCParamSymbol::getSmbClassId() const {
  return functionClass ? functionClass->getSmbClassId() : nullptr;
}

bool KvCFcgCallsBySerial::operator()(const KvCCallOperation* a, const KvCCallOperation* b) const {
  return (a ? a->getSerial() : -1) < (b ? b->getSerial() : -1);
}

KvCFcgFunctionInfo::KvCFcgFunctionInfo(KvCParamSymbol* owner) : symbol(owner) {}

bool KvCFcgFunctionInfo::addCallOperation(KvCCallOperation* call) {
  return call && callOperations.insert(call);
}

bool KvCFcgFunctionInfo::delCallOperation(KvCCallOperation* call) {
  return call && callOperations.del(call);
}

bool KvCFcgFunctionInfo::addCalledFcn(KvCFcgFunctionInfo* called) {
  KvCParamSymbol* calledSymbol = called ? called->getSymbol() : nullptr;
  return calledSymbol &&
         calledFunctions.insert(KvCFcgCalledFunction{calledSymbol->getDebugIndex(), calledSymbol});
}
