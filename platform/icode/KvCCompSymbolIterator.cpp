#include "platform/icode/KvCCompSymbolIterator.h"

#include "platform/icode/KV_DataType.h"
#include "platform/icode/KvCUnparamSymbol.h"

namespace {
KV_StructType* structTypeOf(const KvCUnparamSymbol* symbol) {
  KV_DataType* type = symbol ? symbol->getDataType() : nullptr;
  return type ? type->asStructType() : nullptr;
}
} // namespace

KvCCompSymbolIterator::KvCCompSymbolIterator(KvCSymbol* structSymbol, bool allSlots_,
                                             bool nested_, bool structComponents_)
    : allSlots(allSlots_), nested(nested_), structComponents(structComponents_) {
  enter(structSymbol ? structSymbol->asUnparamSymbol() : nullptr);
  settle();
}

void KvCCompSymbolIterator::enter(KvCUnparamSymbol* instance) {
  KV_StructType* type = structTypeOf(instance);
  if (type && type->getNumberOfComponents() > 0)
    levels.push_back(Level{instance, 0, type->getNumberOfComponents()});
}

KvCUnparamSymbol* KvCCompSymbolIterator::getComponent() const {
  if (levels.empty())
    return nullptr;
  const Level& level = levels.back();
  return level.instance->getComponentSymbol(level.slot);
}

bool KvCCompSymbolIterator::admits() const {
  const Level& level = levels.back();
  KV_StructType* type = structTypeOf(level.instance);
  KV_DataType* slotType = type->getComponent(level.slot).type;
  if (!structComponents && slotType && slotType->asStructType())
    return false;
  return allSlots || getComponent() != nullptr;
}

void KvCCompSymbolIterator::advance() {
  KvCUnparamSymbol* component = getComponent();
  Level& level = levels.back();
  ++level.slot;
  if (level.slot >= level.slotCount)
    levels.pop_back();
  if (nested)
    enter(component); // the nested slots come before the slots after the component
  while (!levels.empty() && levels.back().slot >= levels.back().slotCount)
    levels.pop_back();
}

void KvCCompSymbolIterator::settle() {
  while (!levels.empty() && !admits())
    advance();
}

void KvCCompSymbolIterator::next() {
  if (levels.empty())
    return;
  advance();
  settle();
}
