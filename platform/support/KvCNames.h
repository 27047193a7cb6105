// KvCNames: rules for names in generated C code.
#ifndef HUL_PLATFORM_SUPPORT_KVCNAMES_H
#define HUL_PLATFORM_SUPPORT_KVCNAMES_H

#include "platform/support/HulPlatformExport.h"
#include "platform/support/WmCXString.h"

class KV_DataType;
class KvCCIdentifier;

class HUL_PLATFORM_API KvCNames {
public:
  // The name macro that stands for a counter in a name form ("Init$(CounterName)").
  static constexpr const char* kMultirateCtrNameMacro = "$(CounterName)";

  // Replaces every multirate counter name macro in the raw name of `form` by the raw name
  // of `counterName`; answers the number replaced.
  static int replaceMultirateCtrName(KvCCIdentifier& form, const KvCCIdentifier& counterName);
  // Completes a name form: every name macro still in it ("$(...)") is dropped and
  // `prefix` is put in front; with `maxLength` > 0 the name is cut to that many characters.
  // `type`, `nameFlags` and `unique` take part in the code generator's own name forms
  // only; here they change nothing. False when the completed name is empty.
  static bool createNameFromForm(KvCCIdentifier& form, KV_DataType* type, unsigned int maxLength,
                                 unsigned int nameFlags, bool unique, const WmCXString& prefix);

  // A non-empty sequence of [A-Za-z0-9_] not starting with a digit.
  static bool isValidCIdentifier(const WmCXString& name);
  // The name made valid: every other byte becomes '_', a leading digit gets a '_' before
  // it, and an empty name becomes "_".
  static WmCXString cookName(const WmCXString& name);
};

#endif
