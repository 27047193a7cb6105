#include "platform/icode/KV_SymbolDB.h"

#include "platform/icode/KV_DataType.h"
#include "platform/icode/KvCParamSymbol.h"
#include "platform/icode/KvCUnparamSymbol.h"

KvCSymbol* KV_ParamSmbDBObj::getSymbol() const { return symbol; }

KV_SmbDBObjVisitor::~KV_SmbDBObjVisitor() = default;

void KV_SmbDBObjVisitor::visitUnparamSymbol(KvCUnparamSymbol* /*symbol*/) {}

KV_SymbolDB::KV_SymbolDB() = default;
KV_SymbolDB::~KV_SymbolDB() = default;

void KV_SymbolDB::enter(std::unique_ptr<KvCSymbol> symbol) {
  byName.emplace(symbol->getName(), symbol.get());
  symbols.push_back(std::move(symbol));
}

KvCParamSymbol* KV_SymbolDB::createParamSymbol(const WmCXString& name, KV_DataType* returnType,
                                               bool macro) {
  auto symbol = std::make_unique<KvCParamSymbol>(getNumberOfSymbols() + 1, name, returnType, macro);
  KvCParamSymbol* result = symbol.get();
  enter(std::move(symbol));
  paramEntries.emplace_back(result);
  return result;
}

KvCUnparamSymbol* KV_SymbolDB::createUnparamSymbol(const WmCXString& name, KV_DataType* type,
                                                   bool component) {
  auto symbol = std::make_unique<KvCUnparamSymbol>(getNumberOfSymbols() + 1, name, type, component);
  KvCUnparamSymbol* result = symbol.get();
  enter(std::move(symbol));
  return result;
}

KvCUnparamSymbol* KV_SymbolDB::demandComponentSymbol(KvCUnparamSymbol* structSymbol, int i) {
  KV_StructType* structType = structSymbol ? structSymbol->getSlotStructType() : nullptr;
  if (!structType || i < 0 || i >= structType->getNumberOfComponents())
    return nullptr;
  if (KvCUnparamSymbol* existing = structSymbol->getComponentSymbol(i))
    return existing;
  const KV_StructType::Component& slot = structType->getComponent(i);
  // Not entered by name: the name is the component's, not one of a scope.
  auto made = std::make_unique<KvCUnparamSymbol>(getNumberOfSymbols() + 1, slot.name, slot.type,
                                                 true);
  KvCUnparamSymbol* component = made.get();
  symbols.push_back(std::move(made));
  component->structSymbol = structSymbol;
  component->componentIndex = i;
  structSymbol->componentSymbols.resize(
      static_cast<std::size_t>(structType->getNumberOfComponents()), nullptr);
  structSymbol->componentSymbols[static_cast<std::size_t>(i)] = component;
  return component;
}

KvCUnparamSymbol* KV_SymbolDB::demandComponentDeclSymbol(KV_StructType* structType,
                                                         const WmCXString& componentName) {
  KV_ComponentDeclaration* declaration =
      structType ? structType->getComponent(componentName) : nullptr;
  if (!declaration)
    return nullptr;
  if (KvCUnparamSymbol* existing = declaration->getComponentSymbol())
    return existing;
  auto made = std::make_unique<KvCUnparamSymbol>(getNumberOfSymbols() + 1, declaration->name,
                                                 declaration->type, true);
  KvCUnparamSymbol* symbol = made.get();
  symbols.push_back(std::move(made));
  declaration->setComponentSymbol(symbol);
  return symbol;
}

KvCSymbol* KV_SymbolDB::findSymbol(const WmCXString& name) const {
  auto it = byName.find(name);
  return it == byName.end() ? nullptr : it->second;
}

void KV_SymbolDB::forallParametrizedSymbols(KV_SmbDBObjVisitor* visitor) {
  if (!visitor)
    return;
  // Index loop: a visitor may create symbols; those made during the walk are visited too.
  for (std::size_t i = 0; i < paramEntries.size(); ++i) {
    KV_ParamSmbDBObj entry = paramEntries[i];
    visitor->visitParamSmbDBObj(&entry);
  }
}
