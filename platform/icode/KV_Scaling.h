// KV_Scaling: the fixed-point scaling of a value: physical = lsb * implemented + offset.
// Scalings are made and owned by KV_ScaleServer, one per (lsb, offset).
#ifndef HUL_PLATFORM_ICODE_KV_SCALING_H
#define HUL_PLATFORM_ICODE_KV_SCALING_H

#include "platform/support/HulPlatformExport.h"

class HUL_PLATFORM_API KV_Scaling {
public:
  KV_Scaling(double leastSignificantBit, double valueOffset)
      : lsb(leastSignificantBit), offset(valueOffset) {}

  double getLsb() const { return lsb; }
  double getOffset() const { return offset; }
  // Exactly equal LSB and offset; false for null.
  bool hasEqualLsbAndOffset(const KV_Scaling* other) const {
    return other && lsb == other->lsb && offset == other->offset;
  }

private:
  double lsb;
  double offset;
};

#endif
