#include "HulCvTools/InlineSymbolDb/KvCInlineSymbolDb.h"

#include "HulCvTools/Control/KvCInternalCheck.h"
#include "HulCvTools/ModelInterfaces/ICodeModel.h"

namespace {
const char* const kErrorCode = "KvCInlineSymbolDb";
enum : int {
  kNullSource = 79,
  kNullSink = 80,
  kNullInGetSource = 98,
  kNullInGetSink = 113,
  kNullInGetOriginalSource = 129,
  kNullInGetFinalSink = 151,
  kUnmatchedComponent = 220,
  kNoMemoryForEntry = 250,
};
} // namespace

HULCV_DEFINE_HEAP_OPERATORS(KvCInlineSymbolDb)

KvCInlineSymbolDb::KvCInlineSymbolDb(const KvCInlineSymbolDb& other) { copyEntries(other); }

KvCInlineSymbolDb& KvCInlineSymbolDb::operator=(const KvCInlineSymbolDb& other) {
  if (this == &other)
    return *this;
  deleteEntries();
  copyEntries(other);
  return *this;
}

KvCInlineSymbolDb::~KvCInlineSymbolDb() { deleteEntries(); }

void KvCInlineSymbolDb::deleteEntries() {
  for (KvCInlineSymbolDbEntry* entry : entries)
    delete entry;
  entries.clear();
  entryMap.clear();
  walkCount = 0;
}

// Two passes: first every entry in the original's order, then the links, each found
// through the symbol of the original's linked entry.
void KvCInlineSymbolDb::copyEntries(const KvCInlineSymbolDb& other) {
  for (KvCInlineSymbolDbEntry* entry : other.entries)
    demandEntry(entry->getSymbol());
  for (KvCInlineSymbolDbEntry* entry : other.entries) {
    KvCInlineSymbolDbEntry* copy = findEntry(entry->getSymbol());
    if (!copy)
      continue; // not made: out of memory, reported
    copy->setSourceEntry(findEntry(entry->getSourceSymbol()));
    copy->setSinkEntry(findEntry(entry->getSinkSymbol()));
  }
}

KvCInlineSymbolDbEntry* KvCInlineSymbolDb::findEntry(KvCUnparamSymbol* symbol) const {
  // The const map answers null for an undefined key without defining it.
  return symbol ? entryMap[symbol] : nullptr;
}

KvCInlineSymbolDbEntry* KvCInlineSymbolDb::demandEntry(KvCUnparamSymbol* symbol) {
  KvCInlineSymbolDbEntry*& slot = entryMap[symbol];
  if (slot)
    return slot;
  slot = new KvCInlineSymbolDbEntry(symbol);
  if (!slot) {
    entryMap.undefine(symbol);
    KV_INTERNAL_CHECK(kErrorCode, kNoMemoryForEntry);
    return nullptr;
  }
  entries.append(slot);
  return slot;
}

void KvCInlineSymbolDb::createEntries(KvCUnparamSymbol* source, KvCUnparamSymbol* sink) {
  KvCInlineSymbolDbEntry* sourceEntry = demandEntry(source);
  KvCInlineSymbolDbEntry* sinkEntry = demandEntry(sink);
  if (!sourceEntry || !sinkEntry)
    return;
  sourceEntry->setSinkEntry(sinkEntry);
  sinkEntry->setSourceEntry(sourceEntry);

  KvCCompSymbolIterator sourceComponents(source, true, false, true);
  KvCCompSymbolIterator sinkComponents(sink, true, false, true);
  for (; !sourceComponents.finished(); sourceComponents.next(), sinkComponents.next()) {
    if (!sourceComponents.isValidComponent())
      continue;
    if (!sinkComponents.isValidComponent()) {
      KV_INTERNAL_CHECK(kErrorCode, kUnmatchedComponent);
      continue;
    }
    createEntries(sourceComponents.getComponent(), sinkComponents.getComponent());
  }
}

void KvCInlineSymbolDb::mapSymbol(KvCUnparamSymbol* source, KvCUnparamSymbol* sink) {
  const bool haveSource = KV_VERIFY(source != nullptr, kErrorCode, kNullSource);
  const bool haveSink = KV_VERIFY(sink != nullptr, kErrorCode, kNullSink);
  if (!haveSource || !haveSink)
    return;
  if (source->isComponent()) {
    KvCUnparamSymbol* sourceStruct = source->getStructSymbol();
    KvCUnparamSymbol* sinkStruct = sink->getStructSymbol();
    if (sourceStruct && sinkStruct) {
      createEntries(sourceStruct, sinkStruct);
      return;
    }
  }
  createEntries(source, sink);
}

KvCUnparamSymbol* KvCInlineSymbolDb::getSourceSymbol(KvCUnparamSymbol* symbol) const {
  if (!KV_VERIFY(symbol != nullptr, kErrorCode, kNullInGetSource))
    return nullptr;
  KvCInlineSymbolDbEntry* entry = findEntry(symbol);
  return entry ? entry->getSourceSymbol() : nullptr;
}

KvCUnparamSymbol* KvCInlineSymbolDb::getSinkSymbol(KvCUnparamSymbol* symbol) const {
  if (!KV_VERIFY(symbol != nullptr, kErrorCode, kNullInGetSink))
    return nullptr;
  KvCInlineSymbolDbEntry* entry = findEntry(symbol);
  return entry ? entry->getSinkSymbol() : nullptr;
}

KvCUnparamSymbol* KvCInlineSymbolDb::getOriginalSourceSymbol(KvCUnparamSymbol* symbol) const {
  if (!KV_VERIFY(symbol != nullptr, kErrorCode, kNullInGetOriginalSource))
    return nullptr;
  KvCInlineSymbolDbEntry* entry = findEntry(symbol);
  KvCInlineSymbolDbEntry* last = entry ? followChain(entry, true) : nullptr;
  return last ? last->getSymbol() : nullptr;
}

KvCUnparamSymbol* KvCInlineSymbolDb::getFinalSinkSymbol(KvCUnparamSymbol* symbol) const {
  if (!KV_VERIFY(symbol != nullptr, kErrorCode, kNullInGetFinalSink))
    return nullptr;
  KvCInlineSymbolDbEntry* entry = findEntry(symbol);
  KvCInlineSymbolDbEntry* last = entry ? followChain(entry, false) : nullptr;
  return last ? last->getSymbol() : nullptr;
}

// Each walk marks the entries it reaches with a number of its own, so an entry reached
// twice (a cycle) ends the walk without a set of visited entries.
KvCInlineSymbolDbEntry* KvCInlineSymbolDb::followChain(KvCInlineSymbolDbEntry* start,
                                                       bool toSource) const {
  const std::uint64_t walk = ++walkCount;
  start->walkMark = walk;
  KvCInlineSymbolDbEntry* last = nullptr;
  for (KvCInlineSymbolDbEntry* next = toSource ? start->getSourceEntry() : start->getSinkEntry();
       next && next->walkMark != walk;
       next = toSource ? next->getSourceEntry() : next->getSinkEntry()) {
    next->walkMark = walk;
    last = next;
  }
  return last;
}

bool KvCInlineSymbolDb::completeDb() {
  // Collected first: createEntries adds entries to the map being walked.
  leda::list<KvCInlineSymbolDbEntry*> instances;
  for (const auto& [symbol, entry] : entryMap)
    if (symbol->isStructInstance() && !symbol->isComponent())
      instances.append(entry);
  for (KvCInlineSymbolDbEntry* entry : instances)
    if (entry->hasSinkEntry())
      createEntries(entry->getSymbol(), entry->getSinkSymbol());
  return true;
}
