#include "HulCvTools/SymbolTools/KvCCvStructTool.h"

#include "HulCvTools/ModelInterfaces/ICodeModel.h"
#include "platform/leda/stack.h"
#include "platform/support/WmCXString.h"

namespace {

// The caller's outputs, filled as the walk goes.
struct SpecifierResult {
  bool& isConst;
  bool& isVolatile;
  bool& hasQualifier;
  KvCAddressQualifier*& qualifier;

  bool complete() const { return isConst && isVolatile && hasQualifier; }
};

// The names of the components between the outermost instance and the component asked
// for; the name nearest to the outermost instance is on top.
using ComponentNames = leda::stack<WmCXString>;

} // namespace

// KvCCvStructTool's implementation: the walk up through the enclosing instances and down
// the component declarations. Made on the stack for one call; holds the data type server
// (not owned), which it hands to every specifier query.
class KvCCvStructToolImpl {
public:
  explicit KvCCvStructToolImpl(KV_DataTypeServer* server) : typeServer(server) {}
  virtual ~KvCCvStructToolImpl() = default;
  KvCCvStructToolImpl(const KvCCvStructToolImpl&) = delete;
  KvCCvStructToolImpl& operator=(const KvCCvStructToolImpl&) = delete;

  // `component` must have a parent structure instance.
  bool getTypeSpecifiersOfComp(KvCUnparamSymbol* component, bool option, SpecifierResult& result);

private:
  // Merges the instance's own specifiers, then goes on outwards, or down from the
  // outermost instance.
  bool collectParentSpecifiers(KvCUnparamSymbol* instance, ComponentNames& names, bool option,
                               SpecifierResult& result);
  // Merges the declaration of the next component on the path, then goes on with its
  // instance; at the end of the path, the component's own specifiers.
  bool collectPathSpecifiers(KvCUnparamSymbol* symbol, ComponentNames& names, bool option,
                             SpecifierResult& result);
  // Merges what the specifier query reports for `symbol`.
  void mergeOwnSpecifiers(KvCUnparamSymbol* symbol, bool option, SpecifierResult& result);
  // The structure type whose components `symbol` holds: its own type's (through the
  // type's source type), or its array element type's; null when there is none.
  static KV_StructType* structTypeOf(KvCUnparamSymbol* symbol);

  KV_DataTypeServer* typeServer;
};

bool KvCCvStructToolImpl::getTypeSpecifiersOfComp(KvCUnparamSymbol* component, bool option,
                                                  SpecifierResult& result) {
  ComponentNames names;
  names.push(component->getName());
  return collectParentSpecifiers(component->getParentStructInstance(), names, option, result);
}

bool KvCCvStructToolImpl::collectParentSpecifiers(KvCUnparamSymbol* instance, ComponentNames& names,
                                                  bool option, SpecifierResult& result) {
  if (!instance)
    return true;
  mergeOwnSpecifiers(instance, option, result);
  if (result.complete())
    return true;
  if (KvCUnparamSymbol* parent = instance->getParentStructInstance()) {
    names.push(instance->getName());
    return collectParentSpecifiers(parent, names, option, result);
  }
  return collectPathSpecifiers(instance, names, option, result);
}

bool KvCCvStructToolImpl::collectPathSpecifiers(KvCUnparamSymbol* symbol, ComponentNames& names,
                                                bool option, SpecifierResult& result) {
  if (!symbol)
    return false;
  if (names.empty()) {
    mergeOwnSpecifiers(symbol, option, result);
    return true;
  }
  KV_StructType* structType = structTypeOf(symbol);
  if (!structType)
    return false;
  const WmCXString compName = names.pop();
  KV_ComponentDeclaration* declaration = structType->getComponent(compName);
  KvCUnparamSymbol* declaring = declaration ? declaration->getComponentSymbol() : nullptr;
  if (!declaring)
    return false;
  if (!result.isConst && declaring->isConst())
    result.isConst = true;
  if (!result.isVolatile && declaring->isVolatile())
    result.isVolatile = true;
  KvCAddressQualifier* qualifier = declaring->getAddressQualifier();
  if (!result.hasQualifier && qualifier) {
    result.hasQualifier = !qualifier->isDefault();
    result.qualifier = qualifier;
  }
  if (result.complete())
    return true;
  return collectPathSpecifiers(symbol->getComponentInstance(compName), names, option, result);
}

void KvCCvStructToolImpl::mergeOwnSpecifiers(KvCUnparamSymbol* symbol, bool option,
                                             SpecifierResult& result) {
  bool ownConst = false;
  bool ownVolatile = false;
  bool ownHasQualifier = false;
  KvCAddressQualifier* ownQualifier = nullptr;
  KvCSymbolQuery::getUnparamSymbolTypeSpecifiersIgnoreStructs(
      symbol, typeServer, option, ownConst, ownVolatile, ownHasQualifier, ownQualifier);
  if (!result.isConst && ownConst)
    result.isConst = true;
  if (!result.isVolatile && ownVolatile)
    result.isVolatile = true;
  if (!result.hasQualifier) {
    result.hasQualifier = ownHasQualifier;
    result.qualifier = ownQualifier;
  }
}

KV_StructType* KvCCvStructToolImpl::structTypeOf(KvCUnparamSymbol* symbol) {
  KV_DataType* type = symbol->getDataType();
  if (!type)
    return nullptr;
  if (type->asStructType()) {
    KV_DataType* source = type->getSourceType();
    return source ? source->asStructType() : nullptr;
  }
  KV_ArrayType* array = type->asArrayType();
  KV_DataType* element = array ? array->getElementType() : nullptr;
  if (!element || !element->asStructType())
    return nullptr;
  KV_DataType* source = element->getSourceType();
  return source ? source->asStructType() : nullptr;
}

KvCCvStructTool::~KvCCvStructTool() = default;

bool KvCCvStructTool::getStructSpecificTypeSpecifiersOfComp(
    KvCUnparamSymbol* component, KV_DataTypeServer* typeServer, bool specifierOption, bool& isConst,
    bool& isVolatile, bool& hasAddressQualifier, KvCAddressQualifier*& addressQualifier) {
  isConst = false;
  isVolatile = false;
  hasAddressQualifier = false;
  addressQualifier = nullptr;
  if (!component || !component->getParentStructInstance())
    return true;
  KvCCvStructToolImpl impl(typeServer);
  SpecifierResult result{isConst, isVolatile, hasAddressQualifier, addressQualifier};
  return impl.getTypeSpecifiersOfComp(component, specifierOption, result);
}
