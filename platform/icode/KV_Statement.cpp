#include "platform/icode/KV_Statement.h"

#include "platform/icode/KV_ExprLocation.h"
#include "platform/icode/KvCCStmTable.h"

KV_ICodeElem* KV_Statement::getParentElem() const { return parentTable; }

KV_ICodeElem* KV_StatementTable::getParentElem() const { return parentStatement; }

bool KV_Statement::setExprLoc(KV_ExprLocation* loc) {
  if (loc == root)
    return true;
  if (loc && loc->getParent())
    return false;
  noteStructureChange();
  if (root)
    root->detach();
  root = loc;
  if (loc)
    loc->attach(this, 0);
  return true;
}

KvCCStmTable* KV_Statement::getParentCTable() const {
  return parentTable ? parentTable->getCTable() : nullptr;
}

KV_StatementTable* KV_Statement::getStatementTable(int i) const {
  if (i < 0 || i >= getNumberOfStatementTables())
    return nullptr;
  return tables[static_cast<std::size_t>(i)];
}

bool KV_Statement::addStatementTable(KV_StatementTable* table) {
  if (!table || table->parentStatement || isWithin(table))
    return false;
  noteStructureChange();
  table->parentStatement = this;
  tables.push_back(table);
  return true;
}

KV_Statement* KV_StatementTable::getStatement(int i) const {
  if (i < 0 || i >= getNumberOfStatements())
    return nullptr;
  return statements[static_cast<std::size_t>(i)];
}

bool KV_StatementTable::appendStatement(KV_Statement* statement) {
  if (!statement || statement->parentTable || isWithin(statement))
    return false;
  noteStructureChange();
  statement->parentTable = this;
  statements.push_back(statement);
  return true;
}

KV_StatementTable* KV_StatementTable::getParentTable() const {
  return parentStatement ? parentStatement->getParentTable() : nullptr;
}
