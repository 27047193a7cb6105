// KV_OpConversionInfo: how a calculating operation was converted to fixed point; whether
// it is calculated with a protected range (its result range then holds for sure).
#ifndef HUL_PLATFORM_ICODE_KV_OPCONVERSIONINFO_H
#define HUL_PLATFORM_ICODE_KV_OPCONVERSIONINFO_H

#include "platform/support/HulPlatformExport.h"

class HUL_PLATFORM_API KV_OpConversionInfo {
public:
  bool calculateProtected() const { return isProtected; }
  void setCalculateProtected(bool value) { isProtected = value; }

private:
  bool isProtected = false;
};

#endif
