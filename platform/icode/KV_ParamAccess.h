// KV_ParamAccess: how a function reads or writes one of its parameters: read, written,
// passed by reference. The call inserter turns it into the parameter's flag word
// (getFlagWord: KV_PARAM_READ | KV_PARAM_WRITTEN | KV_PARAM_BY_REFERENCE).
//
// Callers make access objects with new and delete them after the call inserter's demand
// (the inserter keeps none). Their storage comes from the run's memory controller
// (pKVMemory) when one is set, from the C heap otherwise; each block goes back to the
// controller that gave it. new answers null when memory runs out.
#ifndef HUL_PLATFORM_ICODE_KV_PARAMACCESS_H
#define HUL_PLATFORM_ICODE_KV_PARAMACCESS_H

#include "platform/support/HulPlatformExport.h"

#include <cstddef>

enum tagKvEParamFlag : unsigned int {
  KV_PARAM_READ = 0x1u,
  KV_PARAM_WRITTEN = 0x2u,
  KV_PARAM_BY_REFERENCE = 0x4u
};

class HUL_PLATFORM_API KV_ParamAccess {
public:
  KV_ParamAccess(bool isRead, bool isWritten, bool byReference)
      : read(isRead), written(isWritten), reference(byReference) {}

  bool isRead() const { return read; }
  bool isWritten() const { return written; }
  bool isByReference() const { return reference; }
  unsigned int getFlagWord() const {
    return (read ? KV_PARAM_READ : 0u) | (written ? KV_PARAM_WRITTEN : 0u) |
           (reference ? KV_PARAM_BY_REFERENCE : 0u);
  }

  static void* operator new(std::size_t size) noexcept;
  static void operator delete(void* object) noexcept;

private:
  bool read;
  bool written;
  bool reference;
};

#endif
