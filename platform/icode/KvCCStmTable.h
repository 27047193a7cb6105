// KvCCStmTable: a statement table of the C code: it knows the function or macro whose
// body it is part of (its code block symbol) and the file it is emitted into. A nested
// table that has neither set takes them from the table around it.
//
// Scope kinds. A table is a primary-scope table when it is the top-level table of a
// source file (the file's getStt, a file whose name does not end in ".h"): the scope in
// which the file defines its symbols. It is a secondary-scope table when it is the
// top-level table of a header file: the scope that other files take in by including the
// header. Every other table (function bodies, nested blocks, a table whose file does not
// name it as its top-level table) is neither.
//
// Symbols entered. Besides its statements, a table lists the symbols whose declaration
// or definition its scope holds, each entered as a definition (enterSymbol) or a
// declaration (enterDeclaration), in the order entered. A symbol is listed by at most one
// table: entering it takes it out of the table that listed it before. Entering:
//   - a null symbol: false, nothing changes;
//   - the symbol listed here already: its entry stays (entered as a definition, a
//     declaration entry becomes a definition entry); name and statement table as below;
//   - a symbol whose name another listed symbol has (the scope has one object per name):
//     the given symbol is not entered and keeps its state; the table answers the symbol
//     it holds under that name in the argument, which the caller takes as the entered
//     symbol (entered as a definition, that symbol's declaration entry becomes a
//     definition entry). This is the only case in which the pointer changes;
//   - any other symbol: listed here, its name added to the table's name space (when the
//     table has one), its statement table (KvCSymbol::getStt) set to this table.
// Every case but the first answers true. The potential-globals name space of the
// sub-application is left alone. removeSymbol takes the symbol's entry out and nothing
// else: the name stays in the name space and the symbol's getStt still names this table;
// whoever moves the symbol clears those (KvCSmbDeclDefMover). Costs: entering, removing
// and finding by name or symbol are O(1) expected; the first indexed read after removals
// closes the gaps they left, O(entries) once.
#ifndef HUL_PLATFORM_ICODE_KVCCSTMTABLE_H
#define HUL_PLATFORM_ICODE_KVCCSTMTABLE_H

#include "platform/icode/KV_StatementTable.h"

#include <cstddef>
#include <string>
#include <unordered_map>
#include <vector>

class KvCIcFileId;
class KvCNameSpace;
class KvCParamSymbol;
class KvCSymbol;
class WmCXString;

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
  // Own or inherited; null when neither this table nor one around it names a file.
  virtual KvCIcFileId* getFile() const;
  void setFile(KvCIcFileId* file) { fileId = file; }
  // The names declared in this table's scope, or null when it has no scope of its own.
  virtual KvCNameSpace* getNameSpace() const { return nameSpace; }
  void setNameSpace(KvCNameSpace* names) { nameSpace = names; }

  // The table holds a file's globals: it names a file and lies outside every statement and
  // function body.
  bool isFileScopeTable() const;
  // The scope kinds (see above).
  virtual bool isPrimaryScopeTable() const;
  virtual bool isSecondaryScopeTable() const;

  // Enter `symbol` as a definition or a declaration; the pointer may change (see above).
  virtual bool enterSymbol(KvCSymbol*& symbol);
  virtual bool enterDeclaration(KvCSymbol*& symbol);
  // Takes the symbol's entry out; false when this table does not list it (or for null).
  virtual bool removeSymbol(KvCSymbol* symbol);

  // The listed symbols, in the order entered.
  int getNumberOfEnteredSymbols() const { return static_cast<int>(slotOf.size()); }
  KvCSymbol* getEnteredSymbol(int i) const;
  bool isEnteredAsDefinition(int i) const;
  bool holdsSymbol(const KvCSymbol* symbol) const { return slotOf.count(symbol) != 0; }
  // The listed symbol of that name, or null.
  KvCSymbol* findEnteredSymbol(const WmCXString& name) const;

private:
  // An entry whose symbol is null is a gap left by a removal.
  struct Entry {
    KvCSymbol* symbol;
    bool definition;
  };

  const KvCCStmTable* enclosingCTable() const;
  // True when the table's file names it as its top-level table; `header` says whether
  // that file is a header.
  bool isTopLevelTableOfFile(bool& header) const;
  bool enter(KvCSymbol*& symbol, bool definition);
  // The slot of a listed symbol in `entries`, or null.
  Entry* entryOf(const KvCSymbol* symbol);
  void dropEntry(KvCSymbol* symbol);
  // Closes the gaps, keeping the order entered, and renumbers the slots.
  void compact() const;

  KvCParamSymbol* codeBlockSymbol = nullptr;
  KvCIcFileId* fileId = nullptr;
  KvCNameSpace* nameSpace = nullptr;
  // In the order entered, with gaps; the maps name the live entries only.
  mutable std::vector<Entry> entries;
  mutable std::unordered_map<const KvCSymbol*, std::size_t> slotOf;
  std::unordered_map<std::string, KvCSymbol*> byName;
};

#endif
