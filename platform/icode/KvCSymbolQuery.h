// KvCSymbolQuery: questions about symbols that need more than one symbol's own state.
#ifndef HUL_PLATFORM_ICODE_KVCSYMBOLQUERY_H
#define HUL_PLATFORM_ICODE_KVCSYMBOLQUERY_H

#include "platform/support/HulPlatformExport.h"

class KV_DataTypeServer;
class KvCAddressQualifier;
class KvCCStmTable;
class KvCParamSymbol;
class KvCSymbol;
class KvCUnparamSymbol;

class HUL_PLATFORM_API KvCSymbolQuery {
public:
  // Whether the code block's code is imported from outside the generated code. False for
  // null.
  static bool isCodeBlockImported(KvCParamSymbol* codeBlock);

  // The statement table that holds the symbol: the table that lists it
  // (KvCCStmTable::enterSymbol, enterDeclaration); null when no table lists it, or for
  // null. This is where a change of the symbol's class starts from.
  static KvCCStmTable* getDestinationStt(KvCSymbol* symbol);
  // Whether `symbol`, placed in `table`, is a potential global: a name of file scope that
  // the link of the sub-application may see, so that its potential-globals name space
  // keeps it. That is every variable that is not a structure component, and every
  // function or macro, placed in a file's top-level table (a primary- or secondary-scope
  // table), whatever its class: a static global may still be made global. The symbol's
  // class is not read. False for null arguments.
  static bool isPotentialGlobalSymbol(KvCSymbol* symbol, KvCCStmTable* table);
  // The const and volatile specifiers and the address qualifier of the variable's own
  // declaration, without what it inherits from structures around it. `qualifier` is the
  // variable's address qualifier or null; `hasQualifier` says whether it counts: always
  // for a qualifier that is not the default one, and for the default one only when
  // `countDefaultQualifier` is set. The data type server is the run's (this model's types
  // carry no specifiers, so it is not read). Resets the outputs (false, null) first; false
  // for a null variable, else true.
  static bool getUnparamSymbolTypeSpecifiersIgnoreStructs(KvCUnparamSymbol* variable,
                                                          KV_DataTypeServer* typeServer,
                                                          bool countDefaultQualifier, bool& isConst,
                                                          bool& isVolatile, bool& hasQualifier,
                                                          KvCAddressQualifier*& qualifier);
};

#endif
