// KV_ScaleServer: makes and owns the scalings, one per (lsb, offset).
#ifndef HUL_PLATFORM_ICODE_KV_SCALESERVER_H
#define HUL_PLATFORM_ICODE_KV_SCALESERVER_H

#include "platform/icode/KV_Scaling.h"

#include <map>
#include <memory>
#include <utility>

class KvCSrcRef;

class HUL_PLATFORM_API KV_ScaleServer {
public:
  // Null for a non-finite or zero LSB, or a non-finite offset.
  KV_Scaling* demandScaling(double lsb, double offset);
  // The same as demandScaling(factor, offset); `srcRef` is the caller's and is not kept
  // (a scaling is shared by everything that has it).
  KV_Scaling* getScaling(double factor, double offset, const KvCSrcRef* /*srcRef*/) {
    return demandScaling(factor, offset);
  }
  // LSB 1, offset 0.
  KV_Scaling* getIdentityScaling() { return demandScaling(1.0, 0.0); }

private:
  std::map<std::pair<double, double>, std::unique_ptr<KV_Scaling>> scalings;
};

#endif
