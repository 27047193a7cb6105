// KvCBaseTypeDDEnumTranslator: translates the properties of base types between the ICode
// and the Data Dictionary: alignment and byte order in both directions, and the Data
// Dictionary's base type of an ICode data type. Every translation is a fixed table; values
// outside a table give that table's fallback value and report nothing. The translator
// holds no data; the operations are static and keep no state.
#ifndef HULCVTOOLS_DDENUMTRANSLATORS_KVCBASETYPEDDENUMTRANSLATOR_H
#define HULCVTOOLS_DDENUMTRANSLATORS_KVCBASETYPEDDENUMTRANSLATOR_H

#include "HulCvTools/DdEnumTranslators/KvCDataTypeDDEnumTranslator.h"
#include "HulCvTools/HulCvToolsExport.h"
#include "HulCvTools/ModelInterfaces/DataDictionaryModel.h"
#include "HulCvTools/ModelInterfaces/ICodeFwd.h"

class HULCV_API KvCBaseTypeDDEnumTranslator : public KvCDataTypeDDEnumTranslator {
public:
  KvCBaseTypeDDEnumTranslator() = default;
  ~KvCBaseTypeDDEnumTranslator() override;

  // ICode alignments 0 to 4 give the byte counts 1 to 16; the special values -8, -4 and
  // -2 pass through; any other value gives -1.
  static wmddapi::AlignmentEnum getIcToDDEnumAlignment(KvCNumBaseTypeProps::KvTAlignment alignment);
  // The inverse of getIcToDDEnumAlignment; any other Data Dictionary value gives -1.
  static KvCNumBaseTypeProps::KvTAlignment getDDToIcEnumAlignment(wmddapi::AlignmentEnum alignment);

  // ICode byte orders 0 to 3 give -2 to 1; any other value gives -1.
  static wmddapi::ByteOrderEnum getIcToDDEnumByteOrder(KvCNumBaseTypeProps::KvTByteOrder order);
  // The inverse of getIcToDDEnumByteOrder; any other Data Dictionary value gives 0.
  static KvCNumBaseTypeProps::KvTByteOrder getDDToIcEnumByteOrder(wmddapi::ByteOrderEnum order);

  // The Data Dictionary's base type of `type`: void 15; for a numerical type the kind of
  // the numerical base type at the end of its base-type chain (1 to 8, 16, 17), else 10
  // for the boolean, else 16; for other types pointer 9, array 11, kinds 12 to 14, else
  // 16. A null type gives 16.
  static wmddapi::BaseTypeEnum getIcToDDEnumBaseType(KV_DataType* type);
};

#endif
