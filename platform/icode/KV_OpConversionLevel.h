// KV_OpConversionLevel: the stage of code generation an operation belongs to. The code
// view data keeps one object per level.
#ifndef HUL_PLATFORM_ICODE_KV_OPCONVERSIONLEVEL_H
#define HUL_PLATFORM_ICODE_KV_OPCONVERSIONLEVEL_H

#include "platform/support/HulPlatformExport.h"

enum tagKvEConversionLevel {
  KV_CONV_PHYSICAL,
  KV_CONV_IMPLEMENTED,
  KV_CONV_C_CODE,
  KV_CONV_NUMBER_OF_LEVELS
};

class HUL_PLATFORM_API KV_OpConversionLevel {
public:
  explicit KV_OpConversionLevel(tagKvEConversionLevel l) : level(l) {}

  tagKvEConversionLevel getLevel() const { return level; }
  // The operation is C code already (nothing left to convert).
  bool isCCode() const { return level == KV_CONV_C_CODE; }
  bool isEqualTo(const KV_OpConversionLevel* other) const { return other && level == other->level; }

private:
  tagKvEConversionLevel level;
};

#endif
