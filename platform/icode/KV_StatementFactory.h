// KV_StatementFactory: makes statements and C statement tables, new and without parent.
#ifndef HUL_PLATFORM_ICODE_KV_STATEMENTFACTORY_H
#define HUL_PLATFORM_ICODE_KV_STATEMENTFACTORY_H

#include "platform/support/HulPlatformExport.h"

class KV_ExprLocation;
class KV_Statement;
class KvCCStmTable;
class KvCCodeViewData;
class KvCIcFileId;
class KvCParamSymbol;

class HUL_PLATFORM_API KV_StatementFactory {
public:
  explicit KV_StatementFactory(KvCCodeViewData* owner) : codeViewData(owner) {}

  // A statement with `root` as its root location (may be null); null when the root has
  // a parent already.
  KV_Statement* createStatement(KV_ExprLocation* root);
  // A table; `codeBlock` and `file` may be null (then inherited from the enclosing table).
  KvCCStmTable* createCStmTable(KvCParamSymbol* codeBlock, KvCIcFileId* file);

private:
  KvCCodeViewData* codeViewData;
};

#endif
