// KvCElocDbQuery: questions answered from the expression-location (def/use) databases.
//
// getQsoStaticDeclDef finds where a symbol is statically declared and defined: among the
// definition-side symbol-access entries of the symbol's database (static declaration or
// definition, restart definition and ordinary definition categories), a location that is
// operand 0 (the declared object) of
//   - a variable or function declaration is a declaration;
//   - a variable, function, component or macro definition, or a static declaration or
//     definition operation, is a definition.
// Of each, the first in creation order is answered. The databases must have been built
// (KvCExprLocDBBuilder); locations that the databases do not hold are not seen.
//
// The query holds no state; any number of calls may use one object. Cost: O(n log n) in
// the symbol's definition entries.
#ifndef HUL_PLATFORM_ICODE_KVCELOCDBQUERY_H
#define HUL_PLATFORM_ICODE_KVCELOCDBQUERY_H

#include "platform/support/HulPlatformExport.h"

class KV_ExprLocation;
class KvCSymbol;

class HUL_PLATFORM_API KvCElocDbQuery {
public:
  KvCElocDbQuery() = default;
  virtual ~KvCElocDbQuery();
  KvCElocDbQuery(const KvCElocDbQuery&) = default;
  KvCElocDbQuery& operator=(const KvCElocDbQuery&) = default;

  // Resets both to null, then sets `declaration` and `definition` as above. True when
  // either was found; false otherwise and for null.
  virtual bool getQsoStaticDeclDef(KvCSymbol* symbol, KV_ExprLocation*& declaration,
                                   KV_ExprLocation*& definition) const;
};

#endif
