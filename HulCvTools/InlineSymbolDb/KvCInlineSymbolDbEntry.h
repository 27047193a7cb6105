// KvCInlineSymbolDbEntry: one symbol's place in the inline symbol database: the symbol it
// stands for, the entry of the symbol this one replaces (its source) and the entry of the
// symbol that replaces it (its sink).
//
// An entry points to its symbol and to its neighbours and owns none of them: the ICode
// owns the symbol, the database (KvCInlineSymbolDb) owns every entry. An entry belongs to
// one database, so it cannot be copied.
#ifndef HULCVTOOLS_INLINESYMBOLDB_KVCINLINESYMBOLDBENTRY_H
#define HULCVTOOLS_INLINESYMBOLDB_KVCINLINESYMBOLDBENTRY_H

#include "HulCvTools/Control/KvCHeapObject.h"
#include "HulCvTools/HulCvToolsExport.h"
#include "HulCvTools/ModelInterfaces/ICodeFwd.h"

#include <cstdint>

class HULCV_API KvCInlineSymbolDbEntry {
public:
  explicit KvCInlineSymbolDbEntry(KvCUnparamSymbol* entrySymbol) : symbol(entrySymbol) {}
  KvCInlineSymbolDbEntry(const KvCInlineSymbolDbEntry&) = delete;
  KvCInlineSymbolDbEntry& operator=(const KvCInlineSymbolDbEntry&) = delete;

  KvCUnparamSymbol* getSymbol() const { return symbol; }
  bool hasSourceEntry() const { return sourceEntry != nullptr; }
  bool hasSinkEntry() const { return sinkEntry != nullptr; }
  // Null when the symbol replaces no symbol (has no sink, for getSinkEntry).
  KvCInlineSymbolDbEntry* getSourceEntry() const { return sourceEntry; }
  KvCInlineSymbolDbEntry* getSinkEntry() const { return sinkEntry; }
  // The symbol of the source (sink) entry, or null.
  KvCUnparamSymbol* getSourceSymbol() const {
    return sourceEntry ? sourceEntry->symbol : nullptr;
  }
  KvCUnparamSymbol* getSinkSymbol() const { return sinkEntry ? sinkEntry->symbol : nullptr; }
  // Sets one side only; the database keeps both directions in step.
  void setSourceEntry(KvCInlineSymbolDbEntry* entry) { sourceEntry = entry; }
  void setSinkEntry(KvCInlineSymbolDbEntry* entry) { sinkEntry = entry; }

  HULCV_HEAP_OPERATORS

private:
  friend class KvCInlineSymbolDb; // marks entries while it follows a chain

  KvCUnparamSymbol* symbol;
  KvCInlineSymbolDbEntry* sourceEntry = nullptr;
  KvCInlineSymbolDbEntry* sinkEntry = nullptr;
  // The number of the last chain walk of the database that reached this entry.
  std::uint64_t walkMark = 0;
};

#endif
