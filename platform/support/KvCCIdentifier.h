// KvCCIdentifier: a name meant for generated C code, as given (raw) and as it will be
// emitted (cooked: made a valid C identifier), with the source reference it came from.
#ifndef HUL_PLATFORM_SUPPORT_KVCCIDENTIFIER_H
#define HUL_PLATFORM_SUPPORT_KVCCIDENTIFIER_H

#include "platform/support/HulPlatformExport.h"
#include "platform/support/WmCXString.h"

class KvCSrcRef;

class HUL_PLATFORM_API KvCCIdentifier {
public:
  KvCCIdentifier() = default;
  explicit KvCCIdentifier(const WmCXString& name) : rawName(name) {}

  KvCCIdentifier& operator=(const WmCXString& name) {
    rawName = name;
    return *this;
  }
  KvCCIdentifier& operator=(const char* name) { return *this = WmCXString(name); }

  const WmCXString& getRawName() const { return rawName; }
  WmCXString getCookedName() const;
  // The cooked name for a kind of name (0: the name of a symbol); every kind is cooked
  // alike here.
  WmCXString getCookedName(int /*nameType*/) const { return getCookedName(); }

  // The reference is not owned; it must outlive this identifier's use.
  void setSourceRef(const KvCSrcRef* ref) { srcRef = ref; }
  const KvCSrcRef* getSourceRef() const { return srcRef; }

private:
  WmCXString rawName;
  const KvCSrcRef* srcRef = nullptr;
};

#endif
