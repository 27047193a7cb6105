// KvCIcExprEqualitySpec: how KV_Constant::isEqual compares two constants. By default
// constants of different constant types never compare equal, and doubles must be equal
// exactly; the permissions relax that (approximate equality is FPS_ValuesAreEqual).
#ifndef HUL_PLATFORM_ICODE_KVCICEXPREQUALITYSPEC_H
#define HUL_PLATFORM_ICODE_KVCICEXPREQUALITYSPEC_H

#include "platform/support/HulPlatformExport.h"

class HUL_PLATFORM_API KvCIcExprEqualitySpec {
public:
  KvCIcExprEqualitySpec();
  virtual ~KvCIcExprEqualitySpec();

  bool areConstantsWithDifferentConstantTypesPermitted() const {
    return permitConstantsWithDifferentConstantTypes;
  }
  void setPermitConstantsWithDifferentConstantTypes(bool permit) {
    permitConstantsWithDifferentConstantTypes = permit;
  }
  bool areApproxEqualDoubleConstantValuesPermitted() const {
    return permitApproxEqualDoubleConstantValues;
  }
  void setPermitApproxEqualDoubleConstantValues(bool permit) {
    permitApproxEqualDoubleConstantValues = permit;
  }

private:
  bool permitConstantsWithDifferentConstantTypes;
  bool permitApproxEqualDoubleConstantValues;
};

#endif
