// KvCScaleTool: conversions between physical and implemented values under a scaling
// (physical = lsb * implemented + offset). A null scaling is the identity.
#ifndef HUL_PLATFORM_ICODE_KVCSCALETOOL_H
#define HUL_PLATFORM_ICODE_KVCSCALETOOL_H

#include "platform/support/HulPlatformExport.h"

class KV_NumericalType;
class KV_Scaling;

class HUL_PLATFORM_API KvCScaleTool {
public:
  // (physical - offset) / lsb, as a double.
  static double scaleFloatToFixed(double physical, const KV_Scaling* scaling);
  static double scaleFixedToFloat(double implemented, const KV_Scaling* scaling);
  // The smallest / largest physical value the type represents under the scaling; for a
  // floating-point type (or none) the extreme doubles.
  static double calcImplementedMin(const KV_NumericalType* type, const KV_Scaling* scaling);
  static double calcImplementedMax(const KV_NumericalType* type, const KV_Scaling* scaling);
};

#endif
