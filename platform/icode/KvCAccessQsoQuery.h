// KvCAccessQsoQuery: what kind of structure access a symbol access is.
#ifndef HUL_PLATFORM_ICODE_KVCACCESSQSOQUERY_H
#define HUL_PLATFORM_ICODE_KVCACCESSQSOQUERY_H

#include "platform/support/HulPlatformExport.h"

class KV_QualifiedSymbolOp;

class HUL_PLATFORM_API KvCAccessQsoQuery {
public:
  // A whole structure accessed directly: the accessed value (getDataType) is a structure,
  // without dereference. False for null.
  static bool isPlainStructAccess(KV_QualifiedSymbolOp* qso);
  // A whole structure reached through a pointer (*p with p a pointer to a structure).
  static bool isDerefPointerToStructAccess(KV_QualifiedSymbolOp* qso);
};

#endif
