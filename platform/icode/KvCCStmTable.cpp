#include "platform/icode/KvCCStmTable.h"

#include "platform/icode/KV_Statement.h"
#include "platform/icode/KvCIcFileId.h"
#include "platform/icode/KvCSymbol.h"
#include "platform/support/KvCNameSpace.h"

KvCCStmTable::~KvCCStmTable() = default;

const KvCCStmTable* KvCCStmTable::enclosingCTable() const {
  KV_StatementTable* outer = getParentTable();
  return outer ? outer->getCTable() : nullptr;
}

KvCParamSymbol* KvCCStmTable::getCodeBlockSymbol() const {
  for (const KvCCStmTable* t = this; t; t = t->enclosingCTable())
    if (t->codeBlockSymbol)
      return t->codeBlockSymbol;
  return nullptr;
}

KvCIcFileId* KvCCStmTable::getFile() const {
  for (const KvCCStmTable* t = this; t; t = t->enclosingCTable())
    if (t->fileId)
      return t->fileId;
  return nullptr;
}

bool KvCCStmTable::isFileScopeTable() const {
  return getFile() && !getParentStatement() && !getCodeBlockSymbol();
}

bool KvCCStmTable::isTopLevelTableOfFile(bool& header) const {
  header = false;
  KvCIcFileId* id = getFile();
  const KvCIcFile* file = id ? id->getFile() : nullptr;
  if (!file || file->getStt() != this)
    return false;
  header = file->isHeaderFile();
  return true;
}

bool KvCCStmTable::isPrimaryScopeTable() const {
  bool header = false;
  return isTopLevelTableOfFile(header) && !header;
}

bool KvCCStmTable::isSecondaryScopeTable() const {
  bool header = false;
  return isTopLevelTableOfFile(header) && header;
}

KvCCStmTable::Entry* KvCCStmTable::entryOf(const KvCSymbol* symbol) {
  auto slot = slotOf.find(symbol);
  return slot == slotOf.end() ? nullptr : &entries[slot->second];
}

void KvCCStmTable::dropEntry(KvCSymbol* symbol) {
  auto slot = slotOf.find(symbol);
  if (slot == slotOf.end())
    return;
  entries[slot->second].symbol = nullptr;
  slotOf.erase(slot);
  byName.erase(symbol->getName().str());
  symbol->listedIn = nullptr;
}

void KvCCStmTable::compact() const {
  if (entries.size() == slotOf.size())
    return;
  std::size_t kept = 0;
  for (const Entry& entry : entries) {
    if (!entry.symbol)
      continue;
    slotOf[entry.symbol] = kept;
    entries[kept++] = entry;
  }
  entries.resize(kept);
}

KvCSymbol* KvCCStmTable::getEnteredSymbol(int i) const {
  if (i < 0 || i >= getNumberOfEnteredSymbols())
    return nullptr;
  compact();
  return entries[static_cast<std::size_t>(i)].symbol;
}

bool KvCCStmTable::isEnteredAsDefinition(int i) const {
  if (i < 0 || i >= getNumberOfEnteredSymbols())
    return false;
  compact();
  return entries[static_cast<std::size_t>(i)].definition;
}

KvCSymbol* KvCCStmTable::findEnteredSymbol(const WmCXString& name) const {
  auto held = byName.find(name.str());
  return held == byName.end() ? nullptr : held->second;
}

bool KvCCStmTable::enter(KvCSymbol*& symbol, bool definition) {
  if (!symbol)
    return false;
  if (Entry* listed = entryOf(symbol)) {
    listed->definition |= definition;
  } else if (KvCSymbol* held = findEnteredSymbol(symbol->getName())) {
    // One object per name: the caller goes on with the held symbol, whose entry stays.
    symbol = held;
    entryOf(held)->definition |= definition;
    return true;
  } else {
    if (KvCCStmTable* previous = symbol->listedIn)
      previous->dropEntry(symbol);
    slotOf.emplace(symbol, entries.size());
    byName.emplace(symbol->getName().str(), symbol);
    entries.push_back(Entry{symbol, definition});
    symbol->listedIn = this;
  }
  if (KvCNameSpace* names = getNameSpace())
    names->add(symbol->getName());
  symbol->setStt(this);
  return true;
}

bool KvCCStmTable::enterSymbol(KvCSymbol*& symbol) { return enter(symbol, true); }

bool KvCCStmTable::enterDeclaration(KvCSymbol*& symbol) { return enter(symbol, false); }

bool KvCCStmTable::removeSymbol(KvCSymbol* symbol) {
  if (!symbol || !entryOf(symbol))
    return false;
  dropEntry(symbol);
  return true;
}
