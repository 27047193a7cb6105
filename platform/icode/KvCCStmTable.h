// KvCCStmTable: a statement table of the C code: it knows the function or macro whose
// body it is part of (its code block symbol) and the file it is emitted into. A nested
// table that has neither set takes them from the table around it.
#ifndef HUL_PLATFORM_ICODE_KVCCSTMTABLE_H
#define HUL_PLATFORM_ICODE_KVCCSTMTABLE_H

#include "platform/icode/KV_StatementTable.h"

class KvCIcFileId;
class KvCNameSpace;
class KvCParamSymbol;

class HUL_PLATFORM_API KvCCStmTable : public KV_StatementTable {
public:
  explicit KvCCStmTable(int serialNumber) : KV_StatementTable(serialNumber) {}
  ~KvCCStmTable() override;

  KvCCStmTable* getCTable() override { return this; }

  // Own or inherited; null outside every function. O(nesting depth).
  KvCParamSymbol* getCodeBlockSymbol() const;
  void setCodeBlockSymbol(KvCParamSymbol* symbol) {
    noteStructureChange();
    codeBlockSymbol = symbol;
  }
  KvCIcFileId* getFile() const;
  void setFile(KvCIcFileId* file) { fileId = file; }
  // The names declared in this table's scope, or null when it has no scope of its own.
  KvCNameSpace* getNameSpace() const { return nameSpace; }
  void setNameSpace(KvCNameSpace* names) { nameSpace = names; }

private:
  const KvCCStmTable* enclosingCTable() const;

  KvCParamSymbol* codeBlockSymbol = nullptr;
  KvCIcFileId* fileId = nullptr;
  KvCNameSpace* nameSpace = nullptr;
};

#endif
