#include "HulCvTools/Control/KvCCvToolsOptionsInterface.h"

#include "platform/leda/set.h"
#include "platform/support/KvCOptionNameCodec.h"
#include "platform/support/KvCOptionValueStorage.h"

#include <functional>

HULCV_DEFINE_HEAP_OPERATORS(KvCCvToolsOptionsInterface)

namespace {

// Three copies of every encoded name: the getter's, the setter's and the registration
// list's. The storage compares names by content, so any copy finds the option.
namespace getter_names {
#define HULCV_OPTION(Kind, Name) constexpr KvCEncodedOptionName Name{#Name};
#include "HulCvTools/Control/KvCCvToolsOptions.def"
} // namespace getter_names

namespace setter_names {
#define HULCV_OPTION(Kind, Name) constexpr KvCEncodedOptionName Name{#Name};
#include "HulCvTools/Control/KvCCvToolsOptions.def"
} // namespace setter_names

namespace registration_names {
#define HULCV_OPTION(Kind, Name) constexpr KvCEncodedOptionName Name{#Name};
#include "HulCvTools/Control/KvCCvToolsOptions.def"
} // namespace registration_names

constexpr const char* kRegistrationList[] = {
#define HULCV_OPTION(Kind, Name) registration_names::Name.text,
#include "HulCvTools/Control/KvCCvToolsOptions.def"
};
static_assert(std::size(kRegistrationList) == KvCCvToolsOptionsInterface::kNumberOfOptions);

// The registration set is ordered by the names' addresses.
int compareAddresses(const char* const& a, const char* const& b) {
  if (a == b)
    return 0;
  return std::less<const char*>()(a, b) ? -1 : 1;
}

} // namespace

KvCCvToolsOptionsInterface::~KvCCvToolsOptionsInterface() {
  storage = nullptr;
  interfaceId = -1;
}

bool KvCCvToolsOptionsInterface::boot(KvCOptionValueStorage* optionStorage) {
  storage = optionStorage;
  if (!storage)
    return false;
  leda::set<const char*> names(&compareAddresses);
  for (const char* name : kRegistrationList)
    names.insert(name);
  return storage->registerInterface(names, interfaceId);
}

WmCXString KvCCvToolsOptionsInterface::getNameForDump() const { return "Options"; }

WmCXString KvCCvToolsOptionsInterface::getTypeNameForDump() const { return "Options"; }

KV_Dump* KvCCvToolsOptionsInterface::dumpContents(KV_Dump* dump, bool /*deep*/) const {
  dumpStart(dump, "KvCCvToolsOptionsInterface");
  if (storage)
    storage->dumpOptions(dump, interfaceId);
  dumpFinish(dump);
  return dump;
}

// Getters and setters, one pair per line of the table.
#define HULCV_STORAGE_GET_Bool getBoolOptionValueByEncodedName
#define HULCV_STORAGE_GET_Int getIntOptionValueByEncodedName
#define HULCV_STORAGE_GET_UInt getUnsignedIntOptionValueByEncodedName
#define HULCV_STORAGE_GET_Double getDoubleOptionValueByEncodedName
#define HULCV_STORAGE_GET_String getStringOptionValueByEncodedName
#define HULCV_STORAGE_GET_MxArray getMXArrayOptionValueByEncodedName

#define HULCV_OPTION(Kind, Name)                                                                   \
  HULCV_OPTION_GET_TYPE_##Kind KvCCvToolsOptionsInterface::get##Name() const {                     \
    if (!storage)                                                                                  \
      return {};                                                                                   \
    return storage->HULCV_STORAGE_GET_##Kind(interfaceId, getter_names::Name.text);                \
  }                                                                                                \
  bool KvCCvToolsOptionsInterface::set##Name(HULCV_OPTION_SET_TYPE_##Kind value) {                 \
    return storage &&                                                                              \
           storage->setOptionValueByEncodedName(interfaceId, setter_names::Name.text, value);      \
  }
#include "HulCvTools/Control/KvCCvToolsOptions.def"
