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

int KvCCStmTable::indexOf(const KvCSymbol* symbol) const {
  for (std::size_t i = 0; symbol && i < entries.size(); ++i)
    if (entries[i].symbol == symbol)
      return static_cast<int>(i);
  return -1;
}

void KvCCStmTable::dropEntry(int index) {
  entries[static_cast<std::size_t>(index)].symbol->listedIn = nullptr;
  entries.erase(entries.begin() + index);
}

KvCSymbol* KvCCStmTable::getEnteredSymbol(int i) const {
  if (i < 0 || i >= getNumberOfEnteredSymbols())
    return nullptr;
  return entries[static_cast<std::size_t>(i)].symbol;
}

bool KvCCStmTable::isEnteredAsDefinition(int i) const {
  if (i < 0 || i >= getNumberOfEnteredSymbols())
    return false;
  return entries[static_cast<std::size_t>(i)].definition;
}

KvCSymbol* KvCCStmTable::findEnteredSymbol(const WmCXString& name) const {
  for (const Entry& entry : entries)
    if (entry.symbol->getName() == name)
      return entry.symbol;
  return nullptr;
}

bool KvCCStmTable::enter(KvCSymbol*& symbol, bool definition) {
  if (!symbol)
    return false;
  int at = indexOf(symbol);
  if (at < 0) {
    if (KvCSymbol* held = findEnteredSymbol(symbol->getName())) {
      // One object per name: the caller goes on with the held symbol, whose entry stays.
      symbol = held;
      entries[static_cast<std::size_t>(indexOf(held))].definition |= definition;
      return true;
    }
    if (KvCCStmTable* previous = symbol->listedIn)
      previous->dropEntry(previous->indexOf(symbol));
    entries.push_back(Entry{symbol, definition});
    symbol->listedIn = this;
  } else {
    entries[static_cast<std::size_t>(at)].definition |= definition;
  }
  if (KvCNameSpace* names = getNameSpace())
    names->add(symbol->getName());
  symbol->setStt(this);
  return true;
}

bool KvCCStmTable::enterSymbol(KvCSymbol*& symbol) { return enter(symbol, true); }

bool KvCCStmTable::enterDeclaration(KvCSymbol*& symbol) { return enter(symbol, false); }

bool KvCCStmTable::removeSymbol(KvCSymbol* symbol) {
  const int at = indexOf(symbol);
  if (at < 0)
    return false;
  dropEntry(at);
  return true;
}
