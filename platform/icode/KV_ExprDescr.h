// KV_ExprDescr: describes one scalar expression of the ICode that the code generator
// reads or writes as a unit: the symbol it accesses, with the data type and scaling under
// which it is accessed.
//
// A descriptor is a value inside its KV_ExprDescrTupel and lives as long as that tuple.
// It does not own the symbol, type or scaling (the ICode does).
#ifndef HUL_PLATFORM_ICODE_KV_EXPRDESCR_H
#define HUL_PLATFORM_ICODE_KV_EXPRDESCR_H

#include "platform/support/HulPlatformExport.h"

class KV_DataType;
class KV_Scaling;
class KvCSymbol;

class HUL_PLATFORM_API KV_ExprDescr {
public:
  KV_ExprDescr(KvCSymbol* accessed, KV_DataType* accessType, KV_Scaling* accessScaling)
      : symbol(accessed), type(accessType), scaling(accessScaling) {}

  KvCSymbol* getSymbol() const { return symbol; }
  KV_DataType* getDataType() const { return type; }
  KV_Scaling* getScaling() const { return scaling; }

private:
  KvCSymbol* symbol;
  KV_DataType* type;
  KV_Scaling* scaling;
};

#endif
