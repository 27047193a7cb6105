#include "platform/icode/KV_NumericalTypeServer.h"

#include "platform/icode/KV_DataTypeServer.h"

KV_NumericalType* KV_NumericalTypeServer::getNonDDMappedNumerical(
    const WmCXString& name, WmCXString& description, KV_NumericalType& base,
    KV_DimensionDescriptor& dims, bool createTypedef, const KvCSrcRef* srcRef, bool rtosType) {
  if (name.isEmpty())
    return nullptr;
  if (KV_DataType* existing = types->findType(name)) {
    KV_NumericalType* numerical = existing->asNumericalType();
    bool same = numerical && !numerical->isDataDictionaryType() &&
                numerical->getBaseType() == &base && numerical->getDimensions() == dims;
    return same ? numerical : nullptr;
  }
  KV_DataType::Naming naming;
  naming.base = &base;
  naming.description = description;
  naming.dims = dims;
  naming.createTypedef = createTypedef;
  naming.rtosType = rtosType;
  naming.srcRef = srcRef;
  return types->adoptNamed(std::make_unique<KV_NumericalType>(types->nextTypeId(), name,
                                                              base.getBits(), base.isSigned(),
                                                              base.isFloat()),
                           std::move(naming));
}
