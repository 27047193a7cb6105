// KvCInlineSymbolDb: the record of the variables that function inlining replaces. Each
// mapping joins a source symbol (the variable being replaced) to a sink symbol (its
// replacement at the place of the call); as inlined code is inlined again, mappings form
// chains, which the queries follow to a symbol's original source or final sink. A
// structured variable is mapped component by component, at every level of nesting.
//
// The database records; it does not check that a mapping makes sense (types, scopes) and
// never changes the ICode.
//
// Ownership: the database owns one entry (KvCInlineSymbolDbEntry) per symbol that takes
// part in any mapping, kept in creation order and found by symbol through a hashing map;
// entries live as long as the database. The symbols belong to the ICode and must outlive
// the database's use of them. Nothing else is cached.
//
// Links: mapping A to B sets A's sink to B and B's source to A and leaves the earlier
// partners of A and B as they were, so after mapping a to b and then a to c, b still names
// a as its source while a's sink is c.
//
// Cycles: a mapping may close a cycle (a symbol becoming its own indirect source or sink);
// it is recorded like any other. The chain-following queries stop before an entry their
// walk has already reached, so they always end: on a cycle the answer is the last symbol
// reached before the walk would come round again.
//
// The queries change nothing a caller sees; a chain walk only numbers the entries it
// reaches (see followChain), so two walks on one database must not run at the same time.
//
// Copies are deep: a copy (or assignment) makes its own entries, linked as the original's
// are, so each database deletes only the entries it made.
//
// Costs: mapSymbol and the direct queries O(1) expected (plus the components of
// structures mapped); the chain queries linear in the length of the chain; completeDb and
// copies linear in the number of entries (plus components).
#ifndef HULCVTOOLS_INLINESYMBOLDB_KVCINLINESYMBOLDB_H
#define HULCVTOOLS_INLINESYMBOLDB_KVCINLINESYMBOLDB_H

#include "HulCvTools/Control/KvCHeapObject.h"
#include "HulCvTools/HulCvToolsExport.h"
#include "HulCvTools/InlineSymbolDb/KvCInlineSymbolDbEntry.h"
#include "HulCvTools/ModelInterfaces/ICodeFwd.h"
#include "platform/leda/list.h"
#include "platform/leda/map.h"

#include <cstdint>

class HULCV_API KvCInlineSymbolDb {
public:
  KvCInlineSymbolDb() = default;
  KvCInlineSymbolDb(const KvCInlineSymbolDb& other);
  KvCInlineSymbolDb& operator=(const KvCInlineSymbolDb& other);
  ~KvCInlineSymbolDb();

  // Records that `sink` replaces `source`. A component of a structure instance maps its
  // whole structure instance onto the sink's, component by component (when both
  // components belong to instances; otherwise the two symbols alone). A null argument is
  // an internal check, and nothing is mapped.
  void mapSymbol(KvCUnparamSymbol* source, KvCUnparamSymbol* sink);

  // The symbol that `symbol` directly replaces (that directly replaces `symbol`); null when
  // there is none, when the symbol takes part in no mapping, or for null (internal check).
  KvCUnparamSymbol* getSourceSymbol(KvCUnparamSymbol* symbol) const;
  KvCUnparamSymbol* getSinkSymbol(KvCUnparamSymbol* symbol) const;
  // The far end of the chain of sources (sinks) from `symbol`, never `symbol` itself; null
  // when `symbol` has no source (sink), takes part in no mapping, or is null (internal
  // check). Linear in the length of the chain.
  KvCUnparamSymbol* getOriginalSourceSymbol(KvCUnparamSymbol* symbol) const;
  KvCUnparamSymbol* getFinalSinkSymbol(KvCUnparamSymbol* symbol) const;

  // (Re)joins the components of every mapped top-level structure instance to those of its
  // sink, for components made after the mapping. Always true. Linear in the entries and
  // their components.
  bool completeDb();
  // Prints nothing.
  void dump() const {}

  // Number of symbols that take part in any mapping.
  int getNumberOfEntries() const { return entries.size(); }

  HULCV_HEAP_OPERATORS

private:
  // The entry of `symbol`, made when missing; null only when memory runs out (after the
  // internal check).
  KvCInlineSymbolDbEntry* demandEntry(KvCUnparamSymbol* symbol);
  // Links source and sink entries both ways, then their components pairwise, recursively.
  void createEntries(KvCUnparamSymbol* source, KvCUnparamSymbol* sink);
  KvCInlineSymbolDbEntry* findEntry(KvCUnparamSymbol* symbol) const;
  // The last entry of the chain from `start` along source (`toSource`) or sink links, before
  // the chain ends or comes back to an entry reached already; null when there is none
  // after `start`.
  KvCInlineSymbolDbEntry* followChain(KvCInlineSymbolDbEntry* start, bool toSource) const;
  void copyEntries(const KvCInlineSymbolDb& other);
  void deleteEntries();

  leda::list<KvCInlineSymbolDbEntry*> entries;
  leda::map<KvCUnparamSymbol*, KvCInlineSymbolDbEntry*> entryMap;
  // Number of chain walks so far; each walk marks the entries it reaches with its number.
  mutable std::uint64_t walkCount = 0;
};

#endif
