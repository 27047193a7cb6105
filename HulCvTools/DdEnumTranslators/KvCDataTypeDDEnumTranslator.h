// KvCDataTypeDDEnumTranslator: the common base of the translators between the ICode's type
// properties and the Data Dictionary's enumerations. It holds no data and translates
// nothing itself; the translations are static operations of its derived classes.
#ifndef HULCVTOOLS_DDENUMTRANSLATORS_KVCDATATYPEDDENUMTRANSLATOR_H
#define HULCVTOOLS_DDENUMTRANSLATORS_KVCDATATYPEDDENUMTRANSLATOR_H

#include "HulCvTools/HulCvToolsExport.h"

class HULCV_API KvCDataTypeDDEnumTranslator {
public:
  KvCDataTypeDDEnumTranslator() = default;
  virtual ~KvCDataTypeDDEnumTranslator();
};

#endif
