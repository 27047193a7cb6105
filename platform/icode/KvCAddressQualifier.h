// KvCAddressQualifier: an address qualifier of the ICode: a memory-section or address-space
// attribute written into a declaration (`__near`, a section pragma). One qualifier may be
// the default one of the target: writing it changes nothing, so it counts as no qualifier
// where the code generator asks whether a declaration is qualified.
//
// Qualifiers are made and owned by the code view data (demandAddressQualifier), one per
// name; they never change.
#ifndef HUL_PLATFORM_ICODE_KVCADDRESSQUALIFIER_H
#define HUL_PLATFORM_ICODE_KVCADDRESSQUALIFIER_H

#include "platform/support/HulPlatformExport.h"
#include "platform/support/WmCXString.h"

#include <utility>

class HUL_PLATFORM_API KvCAddressQualifier {
public:
  KvCAddressQualifier(WmCXString qualifierName, bool defaultQualifier)
      : name(std::move(qualifierName)), isDefaultQualifier(defaultQualifier) {}
  KvCAddressQualifier(const KvCAddressQualifier&) = delete;
  KvCAddressQualifier& operator=(const KvCAddressQualifier&) = delete;

  const WmCXString& getName() const { return name; }
  // The target's default qualifier (counts as no qualifier).
  bool isDefault() const { return isDefaultQualifier; }

private:
  WmCXString name;
  bool isDefaultQualifier;
};

#endif
