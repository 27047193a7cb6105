// KvCRangeConverter: converts ranges between implemented and physical units.
#ifndef HUL_PLATFORM_ICODE_KVCRANGECONVERTER_H
#define HUL_PLATFORM_ICODE_KVCRANGECONVERTER_H

#include "platform/support/HulPlatformExport.h"

class KV_Range;
class KV_Scaling;

class HUL_PLATFORM_API KvCRangeConverter {
public:
  // Turns a range in implemented units into the float range of the physical values it
  // stands for (the limits swap for a negative LSB).
  static void scaleToFloat(KV_Range& range, const KV_Scaling* scaling);
};

#endif
