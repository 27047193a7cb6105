// KV_Scaling: the fixed-point scaling of a value: physical = lsb * implemented + offset.
// Scalings are made and owned by KV_ScaleServer, one per (lsb, offset).
//
// Besides these fixed scalings the scale server has four special ones, each a single
// object of its kind with LSB 1 and offset 0: the adaptive scaling (the code generator
// chooses the scaling later, from what the value meets), the default scaling (the scaling
// of a value for which nothing was specified), the default void scaling (the scaling of a
// void value, such as the return of a void function) and the undefined scaling (the
// scaling of what has no value the code generator could scale: macros and the arguments
// of macro calls).
#ifndef HUL_PLATFORM_ICODE_KV_SCALING_H
#define HUL_PLATFORM_ICODE_KV_SCALING_H

#include "platform/support/HulPlatformExport.h"

enum tagKvEScalingKind {
  KV_SCALING_FIXED,
  KV_SCALING_ADAPTIVE,
  KV_SCALING_DEFAULT,
  KV_SCALING_DEFAULT_VOID,
  KV_SCALING_UNDEFINED
};

class HUL_PLATFORM_API KV_Scaling {
public:
  KV_Scaling(double leastSignificantBit, double valueOffset,
             tagKvEScalingKind scalingKind = KV_SCALING_FIXED)
      : lsb(leastSignificantBit), offset(valueOffset), kind(scalingKind) {}

  tagKvEScalingKind getKind() const { return kind; }
  bool isAdaptive() const { return kind == KV_SCALING_ADAPTIVE; }

  double getLsb() const { return lsb; }
  double getOffset() const { return offset; }
  // Exactly equal LSB and offset; false for null.
  bool hasEqualLsbAndOffset(const KV_Scaling* other) const {
    return other && lsb == other->lsb && offset == other->offset;
  }

private:
  double lsb;
  double offset;
  tagKvEScalingKind kind;
};

#endif
