// KV_OpSaturationInfo: how an operation saturates: at the top, at the bottom, with
// constant limits (known as 64-bit integers in implemented units and as doubles) or with
// limits computed at run time.
#ifndef HUL_PLATFORM_ICODE_KV_OPSATURATIONINFO_H
#define HUL_PLATFORM_ICODE_KV_OPSATURATIONINFO_H

#include "platform/support/HulPlatformExport.h"

#include <cstdint>

class HUL_PLATFORM_API KV_OpSaturationInfo {
public:
  bool saturateAny() const { return upper || lower; }
  bool saturateUpper() const { return upper; }
  bool saturateLower() const { return lower; }
  bool isUpperLimitConstantValue() const { return upperConstant; }
  bool isLowerLimitConstantValue() const { return lowerConstant; }
  std::int64_t getUpperLimit() const { return upperLimit; }
  std::int64_t getLowerLimit() const { return lowerLimit; }
  double getFloatUpperLimit() const { return floatUpperLimit; }
  double getFloatLowerLimit() const { return floatLowerLimit; }

  // Saturation at the top with a constant limit (given both ways) ...
  void setUpperLimit(std::int64_t limit, double floatLimit);
  void setLowerLimit(std::int64_t limit, double floatLimit);
  // ... or with a limit computed at run time.
  void setUpperLimitVariable();
  void setLowerLimitVariable();

private:
  bool upper = false;
  bool lower = false;
  bool upperConstant = false;
  bool lowerConstant = false;
  std::int64_t upperLimit = 0;
  std::int64_t lowerLimit = 0;
  double floatUpperLimit = 0.0;
  double floatLowerLimit = 0.0;
};

#endif
