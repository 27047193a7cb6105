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
  // The special scalings (see KV_Scaling): one object each for the run, distinct from
  // every fixed scaling and from each other.
  KV_Scaling* getAdaptiveScaling() { return &adaptive; }
  KV_Scaling* getDefaultScaling() { return &defaultScaling; }
  KV_Scaling* getDefaultVoidScaling() { return &defaultVoid; }
  KV_Scaling* getUndefinedScaling() { return &undefined; }

private:
  KV_Scaling adaptive{1.0, 0.0, KV_SCALING_ADAPTIVE};
  KV_Scaling defaultScaling{1.0, 0.0, KV_SCALING_DEFAULT};
  KV_Scaling defaultVoid{1.0, 0.0, KV_SCALING_DEFAULT_VOID};
  KV_Scaling undefined{1.0, 0.0, KV_SCALING_UNDEFINED};
  std::map<std::pair<double, double>, std::unique_ptr<KV_Scaling>> scalings;
};

#endif
