#include "HulCvTools/DdEnumTranslators/KvCSymbolClassDDEnumTranslator.h"

#include "HulCvTools/Control/KvCInternalCheck.h"
#include "HulCvTools/ModelInterfaces/ICodeModel.h"
#include "platform/support/WmCXString.h"

#include <array>

namespace {

// The error code of this file's internal errors; the number is the line of the failing
// case, so that each case reports from its own place.
constexpr const char* kErrorCode = "KvCSymbolClassDDEnumTranslator.cpp";

template <typename Enum> struct StringRow {
  const char* text;
  Enum value;
};

// The row whose text equals `text` exactly (whole content, case-sensitive), or null.
template <typename Enum, std::size_t N>
const StringRow<Enum>* findRow(const std::array<StringRow<Enum>, N>& table,
                               const WmCXString& text) {
  for (const StringRow<Enum>& row : table)
    if (text == WmCXString(row.text))
      return &row;
  return nullptr;
}

// A string argument; a null argument is taken as the empty string.
const WmCXString& textOf(const WmCXString* s) {
  static const WmCXString empty;
  return s ? *s : empty;
}

constexpr std::array<StringRow<wmddapi::VariableClassInfoEnum>, 6> kVarClasses{{
    {"none", wmddapi::VARIABLE_CLASS_INFO_NONE},
    {"readonly", wmddapi::VARIABLE_CLASS_INFO_READONLY},
    {"readwrite", wmddapi::VARIABLE_CLASS_INFO_READWRITE},
    {"adjustable", wmddapi::VARIABLE_CLASS_INFO_ADJUSTABLE},
    {"offline_readwrite", wmddapi::VARIABLE_CLASS_INFO_OFFLINE_READWRITE},
    {"", wmddapi::VARIABLE_CLASS_INFO_NONE},
}};

constexpr std::array<StringRow<wmddapi::StorageClassEnum>, 5> kStorageClasses{{
    {"auto", wmddapi::STORAGE_CLASS_DEFAULT},
    {"static", wmddapi::STORAGE_CLASS_STATIC},
    {"extern", wmddapi::STORAGE_CLASS_EXTERN},
    {"register", wmddapi::STORAGE_CLASS_DEFAULT},
    {"", wmddapi::STORAGE_CLASS_DEFAULT},
}};

constexpr std::array<StringRow<wmddapi::ScopeEnum>, 6> kScopes{{
    {"local", wmddapi::SCOPE_LOCAL},
    {"global", wmddapi::SCOPE_GLOBAL},
    {"value_param", wmddapi::SCOPE_VALUE_PARAM},
    {"ref_param", wmddapi::SCOPE_REF_PARAM},
    {"fcn_return", wmddapi::SCOPE_FCN_RETURN},
    {"struct_component", wmddapi::SCOPE_STRUCT_COMPONENT},
}};

} // namespace

tagKvEVcAcAccessInfo
KvCSymbolClassDDEnumTranslator::DdAccessInfoToKvAccessInfo(wmddapi::VariableClassInfoEnum info) {
  if (info >= wmddapi::VARIABLE_CLASS_INFO_NONE &&
      info <= wmddapi::VARIABLE_CLASS_INFO_OFFLINE_READWRITE)
    return static_cast<tagKvEVcAcAccessInfo>(static_cast<int>(info) + 1);
  return KV_VC_AC_UNDEFINED;
}

wmddapi::VariableClassInfoEnum
KvCSymbolClassDDEnumTranslator::KvVarClassStrToDdVarClassInfoEnum(const WmCXString* varClass) {
  if (const auto* row = findRow(kVarClasses, textOf(varClass)))
    return row->value;
  KV_INTERNAL_CHECK(kErrorCode, __LINE__);
  return wmddapi::VARIABLE_CLASS_INFO_NONE;
}

wmddapi::StorageClassEnum
KvCSymbolClassDDEnumTranslator::KvStorageInfoToDdStorageClass(const WmCXString* storage) {
  if (const auto* row = findRow(kStorageClasses, textOf(storage)))
    return row->value;
  KV_INTERNAL_CHECK(kErrorCode, __LINE__);
  return wmddapi::STORAGE_CLASS_DEFAULT;
}

wmddapi::ScopeEnum
KvCSymbolClassDDEnumTranslator::KvScopeStringToDdScopeEnum(const WmCXString* scope) {
  const WmCXString& text = textOf(scope);
  if (text == WmCXString("")) {
    KV_INTERNAL_CHECK(kErrorCode, __LINE__);
    return wmddapi::SCOPE_LOCAL;
  }
  if (const auto* row = findRow(kScopes, text))
    return row->value;
  KV_INTERNAL_CHECK(kErrorCode, __LINE__);
  return wmddapi::SCOPE_LOCAL;
}

wmddapi::FunctionKindEnum KvCSymbolClassDDEnumTranslator::getIcToDDEnumFuncType(KvCSymbol* symbol) {
  if (!symbol)
    return wmddapi::FUNCTION_KIND_AUX;
  if (symbol->isStepFunction())
    return wmddapi::FUNCTION_KIND_STEP;
  if (symbol->isInitFunction())
    return wmddapi::FUNCTION_KIND_INIT;
  if (symbol->isTermFunction())
    return wmddapi::FUNCTION_KIND_TERM;
  const KvCParamSymbol* function = symbol->asParamSymbol();
  if (function && (function->isAuxFunction() || function->isAccessFunction()))
    return wmddapi::FUNCTION_KIND_AUX;
  if (symbol->isRestartFunction() && !symbol->isStartupFunction())
    return wmddapi::FUNCTION_KIND_RESTART;
  if (symbol->isApEntryFunction())
    return wmddapi::FUNCTION_KIND_AP_ENTRY;
  if (symbol->isApExitFunction())
    return wmddapi::FUNCTION_KIND_AP_EXIT;
  if (symbol->isStartupFunction())
    return wmddapi::FUNCTION_KIND_STARTUP;
  return wmddapi::FUNCTION_KIND_AUX;
}

wmddapi::LoggingModeEnum
KvCSymbolClassDDEnumTranslator::KvLogModeToDDLogModeEnum(KV_LogObj* logObj) {
  return logObj && logObj->isTimeHistoryLogged() ? wmddapi::LOGGING_MODE_TIME_HISTORY
                                                 : wmddapi::LOGGING_MODE_MIN_MAX;
}

bool KvCSymbolClassDDEnumTranslator::DdFcnClassOptiToKvFcInline(unsigned long optionBits,
                                                                tagKvEFcInline& inlineValue) {
  inlineValue = KV_FC_INLINE_DEFAULT;
  int bitsSet = 0;
  if (optionBits & 4UL) {
    inlineValue = KV_FC_INLINE_INLINE;
    ++bitsSet;
  }
  if (optionBits & 8UL) {
    inlineValue = KV_FC_INLINE_NOINLINE;
    ++bitsSet;
  }
  if (optionBits & 16UL) {
    inlineValue = KV_FC_INLINE_FORCE_INLINE;
    ++bitsSet;
  }
  return bitsSet <= 1;
}

wmddapi::SearchMethodEnum KvCSymbolClassDDEnumTranslator::KvSearchAlgorithmEnumToDDEnum(
    KV_SearchAlgorithm::SearchAlgorithm_etp algorithm) {
  if (algorithm >= KV_SearchAlgorithm::KV_SA_LINEAR && algorithm <= KV_SearchAlgorithm::KV_SA_LOCAL)
    return static_cast<wmddapi::SearchMethodEnum>(static_cast<int>(algorithm));
  return wmddapi::SEARCH_METHOD_OTHER;
}

wmddapi::OutputModeEnum KvCSymbolClassDDEnumTranslator::KvOuputModeEnumToDDOutputModeEnum(
    KvNOutputMode::KvEOutputMode mode) {
  switch (mode) {
  case KvNOutputMode::KV_OUTPUT_HELD:
    return wmddapi::OUTPUT_MODE_HELD;
  case KvNOutputMode::KV_OUTPUT_RESET:
    return wmddapi::OUTPUT_MODE_RESET;
  default:
    return wmddapi::OUTPUT_MODE_OTHER;
  }
}

wmddapi::InitializeStatesEnum
KvCSymbolClassDDEnumTranslator::KvActionPortInitStateDDInitStateEnum(bool resetStates) {
  return resetStates ? wmddapi::INITIALIZE_STATES_RESET : wmddapi::INITIALIZE_STATES_HELD;
}

wmddapi::LookupMethodEnum
KvCSymbolClassDDEnumTranslator::KvLookUpMethodToDDEnum(KV_LookUpMethod::LookUpMethod_etp method) {
  switch (method) {
  case KV_LookUpMethod::KV_LUM_INTERPOLATION:
  case KV_LookUpMethod::KV_LUM_BELOW:
  case KV_LookUpMethod::KV_LUM_ABOVE:
  case KV_LookUpMethod::KV_LUM_NEAREST:
    return static_cast<wmddapi::LookupMethodEnum>(static_cast<int>(method));
  default:
    return wmddapi::LOOKUP_METHOD_OTHER;
  }
}
