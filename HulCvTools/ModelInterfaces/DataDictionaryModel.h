// The Data Dictionary's enumerations and the ICode's enumerations and objects that the
// data-dictionary enum translators map. The translators reach both only through this
// header.
//
// Model operations the translators rely on, with the meaning a model plugged in here must
// give them:
// - KV_DataType::asKind15Type, asKind9Type, asKind12Type, asKind13Type, asKind14Type: the
//   type itself when it is of that kind (void, pointer, structure, union, enumeration),
//   else null; asArrayType likewise for arrays; isKind10: the type is the boolean.
// - KV_DataType::getNumericalType and KV_NumericalType::getNumBaseType: the numerical form
//   of a type and the numerical base type at the end of its base-type chain, never null
//   for a numerical type; the base type's isKind1 ... isKind8, isKind16, isKind17 tell
//   the Data Dictionary's numerical base types apart, at most one holding.
// - KvCSymbol::isStepFunction, isInitFunction, isTermFunction, isRestartFunction,
//   isStartupFunction, isApEntryFunction, isApExitFunction; the auxiliary- and
//   access-function predicates are those of the function view (KvCSymbol::asParamSymbol):
//   a symbol that is not a function is neither.
// - KV_LogObj::isTimeHistoryLogged.
#ifndef HULCVTOOLS_MODELINTERFACES_DATADICTIONARYMODEL_H
#define HULCVTOOLS_MODELINTERFACES_DATADICTIONARYMODEL_H

#include "platform/icode/KV_LookUpMethod.h"
#include "platform/icode/KV_SearchAlgorithm.h"
#include "platform/icode/KvCNumBaseTypeProps.h"
#include "platform/icode/KvCSmbClassProps.h"
#include "platform/icode/KvNOutputMode.h"
#include "platform/support/wmddapi.h"

class KV_LogObj;

#endif
