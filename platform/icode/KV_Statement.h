// KV_Statement: one statement of a statement table: a root expression location and the
// statement tables it owns (the body of a loop, the branches of an if, the body of a
// function definition).
#ifndef HUL_PLATFORM_ICODE_KV_STATEMENT_H
#define HUL_PLATFORM_ICODE_KV_STATEMENT_H

#include "platform/icode/KV_ICodeElem.h"

#include <vector>

class KvCCStmTable;

class HUL_PLATFORM_API KV_Statement : public KV_ICodeElem {
public:
  explicit KV_Statement(int serialNumber) : KV_ICodeElem(serialNumber) {}

  KV_Statement* asStatement() override { return this; }
  KV_ICodeElem* getParentElem() const override;

  // The root location, or null.
  KV_ExprLocation* getExprLoc() const { return root; }
  // Makes `loc` the root (null: none). False, and nothing changed, for a location that
  // has a parent already. The old root is left without parent.
  bool setExprLoc(KV_ExprLocation* loc);

  KV_StatementTable* getParentTable() const { return parentTable; }
  // The parent table as a C statement table, or null.
  KvCCStmTable* getParentCTable() const;

  int getNumberOfStatementTables() const { return static_cast<int>(tables.size()); }
  KV_StatementTable* getStatementTable(int i) const;
  // Attaches a table below this statement. False for a table that has a parent already
  // or that contains this statement.
  bool addStatementTable(KV_StatementTable* table);

private:
  friend class KV_StatementTable;
  KV_ExprLocation* root = nullptr;
  KV_StatementTable* parentTable = nullptr;
  std::vector<KV_StatementTable*> tables;
};

#endif
