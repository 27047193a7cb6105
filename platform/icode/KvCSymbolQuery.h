// KvCSymbolQuery: questions about symbols that need more than one symbol's own state.
#ifndef HUL_PLATFORM_ICODE_KVCSYMBOLQUERY_H
#define HUL_PLATFORM_ICODE_KVCSYMBOLQUERY_H

#include "platform/support/HulPlatformExport.h"

class KvCParamSymbol;

class HUL_PLATFORM_API KvCSymbolQuery {
public:
  // Whether the code block's code is imported from outside the generated code. False for
  // null.
  static bool isCodeBlockImported(KvCParamSymbol* codeBlock);
};

#endif
