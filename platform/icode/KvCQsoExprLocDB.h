// KvCQsoExprLocDB: the part of a symbol's expression-location database for symbol
// accesses: definitions by static declarations or definitions, definitions in restart
// functions, ordinary definitions, and uses by static declarations or definitions and
// ordinary uses. It is a view of its KvCExprLocDB, which holds the entries.
#ifndef HUL_PLATFORM_ICODE_KVCQSOEXPRLOCDB_H
#define HUL_PLATFORM_ICODE_KVCQSOEXPRLOCDB_H

#include "platform/support/HulPlatformExport.h"

class KV_ExprLocation;
class KvCExprLocDB;

class HUL_PLATFORM_API KvCQsoExprLocDB {
public:
  explicit KvCQsoExprLocDB(KvCExprLocDB* owner) : db(owner) {}
  KvCQsoExprLocDB(const KvCQsoExprLocDB&) = delete;
  KvCQsoExprLocDB& operator=(const KvCQsoExprLocDB&) = delete;

  bool addStaticDeclDefDef(KV_ExprLocation* loc);
  bool addStaticDeclDefUse(KV_ExprLocation* loc);
  bool addQsoDef(KV_ExprLocation* loc);
  bool addQsoUse(KV_ExprLocation* loc);
  bool addRestartDef(KV_ExprLocation* loc);

  // Whether `loc` holds a symbol access that its parent operation defines and lies in
  // the body of a restart function. False for null.
  static bool isRestartDef(KV_ExprLocation* loc);

  KvCExprLocDB* getExprLocDB() const { return db; }

private:
  KvCExprLocDB* db;
};

#endif
