#include "platform/icode/KV_PointerTypeServer.h"

#include "platform/icode/KV_DataTypeServer.h"

KV_PointerType*
KV_PointerTypeServer::getNonDDMappedPointer(const WmCXString& name, WmCXString& description,
                                            KV_DimensionDescriptor& dims, bool createTypedef,
                                            KV_PointerType* target, const KvCSrcRef* srcRef) {
  if (name.isEmpty() || !target || target->getBaseType())
    return nullptr;
  if (KV_DataType* existing = types->findType(name)) {
    KV_PointerType* pointer = existing->asPointerType();
    bool same = pointer && !pointer->isDataDictionaryType() && pointer->getBaseType() == target &&
                pointer->getDimensions() == dims;
    return same ? pointer : nullptr;
  }
  KV_DataType::Naming naming;
  naming.base = target;
  naming.description = description;
  naming.dims = dims;
  naming.createTypedef = createTypedef;
  naming.srcRef = srcRef;
  return types->adoptNamed(std::make_unique<KV_PointerType>(types->nextTypeId(), name,
                                                            target->getTargetType(),
                                                            target->isPointerToConst()),
                           std::move(naming));
}

KV_PointerType* KV_PointerTypeServer::getScalarPointer(KV_DataType* type, WmCXString* name,
                                                       bool toConst, bool createTypedef,
                                                       const WmCXString* description,
                                                       const KvCSrcRef* srcRef) {
  KV_PointerType* pointer = types->demandPointerType(type, toConst);
  if (!pointer || !name || name->isEmpty())
    return pointer;
  WmCXString text = description ? *description : WmCXString();
  KV_DimensionDescriptor scalar;
  return getNonDDMappedPointer(*name, text, scalar, createTypedef, pointer, srcRef);
}

KV_PointerType* KV_PointerTypeServer::getScalarPointer(KV_DataType* type,
                                                       const KvCSrcRef* /*srcRef*/) {
  return types->demandPointerType(type, false);
}

KV_PointerType* KV_PointerTypeServer::getVoidPointer() {
  return types->demandPointerType(types->demandVoidType(), false);
}
