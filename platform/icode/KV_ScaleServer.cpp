#include "platform/icode/KV_ScaleServer.h"

#include <cmath>

KV_Scaling* KV_ScaleServer::demandScaling(double lsb, double offset) {
  if (!std::isfinite(lsb) || lsb == 0.0 || !std::isfinite(offset))
    return nullptr;
  std::unique_ptr<KV_Scaling>& slot = scalings[{lsb, offset}];
  if (!slot)
    slot = std::make_unique<KV_Scaling>(lsb, offset);
  return slot.get();
}
