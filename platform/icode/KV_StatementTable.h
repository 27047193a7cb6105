// KV_StatementTable: a sequence of statements: a file's top level, a function body, or a
// nested block. A table may form an RTOS protected area, and a function body is the top
// of its code block.
#ifndef HUL_PLATFORM_ICODE_KV_STATEMENTTABLE_H
#define HUL_PLATFORM_ICODE_KV_STATEMENTTABLE_H

#include "platform/icode/KV_ICodeElem.h"

#include <vector>

class KvCCStmTable;
class KvCRtosProtection;

class HUL_PLATFORM_API KV_StatementTable : public KV_ICodeElem {
public:
  KV_StatementTable* asStatementTable() override { return this; }
  KV_ICodeElem* getParentElem() const override;

  // The table's own number of statements (nested tables not counted).
  int getNumberOfStatements() const { return static_cast<int>(statements.size()); }
  KV_Statement* getStatement(int i) const;
  // Appends a statement. False for a statement that has a parent table already.
  bool appendStatement(KV_Statement* statement);

  KV_Statement* getParentStatement() const { return parentStatement; }
  // The table of the parent statement, or null.
  KV_StatementTable* getParentTable() const;
  // The table as a C statement table, or null.
  virtual KvCCStmTable* getCTable() { return nullptr; }

  bool isCodeBlockTop() const { return codeBlockTop; }
  void setCodeBlockTop(bool top) { codeBlockTop = top; }
  // The protected area this table forms, or null. Not owned.
  KvCRtosProtection* getRtosProtection() const { return rtosProtection; }
  void setRtosProtection(KvCRtosProtection* protection) { rtosProtection = protection; }

protected:
  explicit KV_StatementTable(int serialNumber) : KV_ICodeElem(serialNumber) {}

private:
  friend class KV_Statement;
  std::vector<KV_Statement*> statements;
  KV_Statement* parentStatement = nullptr;
  bool codeBlockTop = false;
  KvCRtosProtection* rtosProtection = nullptr;
};

#endif
