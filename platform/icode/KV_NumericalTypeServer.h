// KV_NumericalTypeServer: makes the named numerical types that are not mapped to the Data
// Dictionary: typedefs of a numerical type (`typedef unsigned char StatusType;`), with the
// base's width and signedness, a description and dimensions.
//
// Owned by the code view data; the types it makes are owned by the data type server and
// share its name space.
#ifndef HUL_PLATFORM_ICODE_KV_NUMERICALTYPESERVER_H
#define HUL_PLATFORM_ICODE_KV_NUMERICALTYPESERVER_H

#include "platform/icode/KV_DataType.h"
#include "platform/icode/KV_DimensionDescriptor.h"

class KV_DataTypeServer;
class KvCSrcRef;

class HUL_PLATFORM_API KV_NumericalTypeServer {
public:
  explicit KV_NumericalTypeServer(KV_DataTypeServer* typeServer) : types(typeServer) {}
  KV_NumericalTypeServer(const KV_NumericalTypeServer&) = delete;
  KV_NumericalTypeServer& operator=(const KV_NumericalTypeServer&) = delete;

  // The named numerical type `name` made from `base`, with the given description and
  // dimensions, made at `srcRef`. `createTypedef`: the name is written as a typedef where
  // the type is defined (without it, C code spells the base type instead). `rtosType`:
  // the type belongs to the RTOS interface (isRtosType). A second demand with the same
  // name, base and dimensions returns the type made first (description and flags as given
  // then). Null for an empty name or a name that another type has.
  KV_NumericalType* getNonDDMappedNumerical(const WmCXString& name, WmCXString& description,
                                            KV_NumericalType& base, KV_DimensionDescriptor& dims,
                                            bool createTypedef, const KvCSrcRef* srcRef,
                                            bool rtosType);

private:
  KV_DataTypeServer* types;
};

#endif
