// KvCSymbolClassDDEnumTranslator: translates properties of symbols and of variable and
// function classes between the ICode and the Data Dictionary: access information, the
// variable class, storage and scope strings, function kinds, logging, inline options,
// search and look-up methods, output modes and initial states. Every translation is a
// fixed table. A string outside its table is an internal error (message 10007); the
// translation then gives the table's fallback value. Nothing else is reported.
//
// The class holds no data; the operations are static and keep no state. String arguments are
// compared exactly, case-sensitively.
#ifndef HULCVTOOLS_DDENUMTRANSLATORS_KVCSYMBOLCLASSDDENUMTRANSLATOR_H
#define HULCVTOOLS_DDENUMTRANSLATORS_KVCSYMBOLCLASSDDENUMTRANSLATOR_H

#include "HulCvTools/HulCvToolsExport.h"
#include "HulCvTools/ModelInterfaces/DataDictionaryModel.h"
#include "HulCvTools/ModelInterfaces/ICodeFwd.h"

class WmCXString;

class HULCV_API KvCSymbolClassDDEnumTranslator {
public:
  // NOLINTBEGIN(readability-identifier-naming): fixed operation names
  // Data Dictionary access information 0 to 4 gives 1 to 5; any other value gives 0.
  static tagKvEVcAcAccessInfo DdAccessInfoToKvAccessInfo(wmddapi::VariableClassInfoEnum info);
  // "none", "readonly", "readwrite", "adjustable", "offline_readwrite" give 0 to 4; the
  // empty string and a null string give 0; any other string is an internal error, then 0.
  static wmddapi::VariableClassInfoEnum
  KvVarClassStrToDdVarClassInfoEnum(const WmCXString* varClass);
  // "auto" 0, "static" 1, "extern" 2, "register" 0; the empty and a null string give 0;
  // any other string is an internal error, then 0.
  static wmddapi::StorageClassEnum KvStorageInfoToDdStorageClass(const WmCXString* storage);
  // "local" 1, "global" 2, "value_param" 3, "ref_param" 4, "fcn_return" 5,
  // "struct_component" 6; the empty (or a null) string and any other string are internal
  // errors, reported with distinct error codes, then 1.
  static wmddapi::ScopeEnum KvScopeStringToDdScopeEnum(const WmCXString* scope);
  // The kind of the function: step 1, init 2, term 3, auxiliary or access 4, restart (and
  // not startup) 5, partition entry 6, partition exit 7, startup 8, the first that holds;
  // else (a null symbol too) 4.
  static wmddapi::FunctionKindEnum getIcToDDEnumFuncType(KvCSymbol* symbol);
  // 1 when the time history is logged, else 2 (also for a null log object).
  static wmddapi::LoggingModeEnum KvLogModeToDDLogModeEnum(KV_LogObj* logObj);
  // Sets `inlineValue` from the option bits: 0, then 1 for bit value 4, 2 for bit value 8,
  // 3 for bit value 16, the highest set bit of these winning; other bits are ignored.
  // False when two or three of these bits are set (`inlineValue` is written all the same).
  static bool DdFcnClassOptiToKvFcInline(unsigned long optionBits, tagKvEFcInline& inlineValue);
  // 1 to 4 map to themselves; any other value gives 5.
  static wmddapi::SearchMethodEnum
  KvSearchAlgorithmEnumToDDEnum(KV_SearchAlgorithm::SearchAlgorithm_etp algorithm);
  // 0 gives 1, 1 gives 2, any other value 3.
  static wmddapi::OutputModeEnum
  KvOuputModeEnumToDDOutputModeEnum(KvNOutputMode::KvEOutputMode mode);
  // true gives 2 (reset), false 1 (held).
  static wmddapi::InitializeStatesEnum KvActionPortInitStateDDInitStateEnum(bool resetStates);
  // 1, 3, 4 and 5 map to themselves; any other value gives 2.
  static wmddapi::LookupMethodEnum KvLookUpMethodToDDEnum(KV_LookUpMethod::LookUpMethod_etp method);
  // NOLINTEND(readability-identifier-naming)
};

#endif
