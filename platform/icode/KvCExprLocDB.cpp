#include "platform/icode/KvCExprLocDB.h"

#include "platform/icode/KV_ExprLocation.h"
#include "platform/icode/KV_Operation.h"
#include "platform/icode/KV_Statement.h"
#include "platform/icode/KvCCStmTable.h"
#include "platform/icode/KvCParamSymbol.h"

#include <algorithm>

KvCExprLocDB::KvCExprLocDB() : qsoPart(this) {
  std::fill(std::begin(lastSerial), std::end(lastSerial), -1);
}

KvCExprLocDB::~KvCExprLocDB() { clear(); }

bool KvCExprLocDB::add(tagKvEExprLocDBCategory category, KV_ExprLocation* loc) {
  if (!loc || category < 0 || category >= KV_DB_NUMBER_OF_CATEGORIES)
    return false;
  const bool defSide = isDefCategory(category);
  KV_ExprLocation::DbSlot& slot = defSide ? loc->defSlot : loc->useSlot;
  if (slot.db == this && slot.category == category)
    return true;
  if (slot.db)
    slot.db->removeSide(defSide, loc);
  std::vector<KeyedLocation>& list = entries[category];
  slot = KV_ExprLocation::DbSlot{this, category, static_cast<int>(list.size())};
  list.emplace_back(loc->getSerial(), loc);
  if (loc->getSerial() <= lastSerial[category])
    unsorted |= 1U << category;
  lastSerial[category] = loc->getSerial();
  return true;
}

bool KvCExprLocDB::removeSide(bool defSide, KV_ExprLocation* loc) {
  if (!loc)
    return false;
  KV_ExprLocation::DbSlot& slot = defSide ? loc->defSlot : loc->useSlot;
  if (slot.db != this)
    return false;
  std::vector<KeyedLocation>& list = entries[slot.category];
  KV_ExprLocation* last = list.back().second;
  if (last != loc)
    unsorted |= 1U << slot.category; // the last entry moves into the gap
  list[static_cast<std::size_t>(slot.position)] = list.back();
  (defSide ? last->defSlot : last->useSlot).position = slot.position;
  list.pop_back();
  slot = KV_ExprLocation::DbSlot{};
  return true;
}

bool KvCExprLocDB::removeDef(KV_ExprLocation* loc) { return removeSide(true, loc); }

bool KvCExprLocDB::removeUse(KV_ExprLocation* loc) { return removeSide(false, loc); }

void KvCExprLocDB::listRange(int first, int last,
                             leda::dictionary<int, KV_ExprLocation*>& out) const {
  out.clear();
  for (int c = first; c <= last; ++c)
    for (const auto& [key, loc] : entries[c])
      out.insert(key, loc);
}

void KvCExprLocDB::listDefs(leda::dictionary<int, KV_ExprLocation*>& defs) const {
  listRange(KV_DB_DEF, KV_DB_QSO_DEF, defs);
}

void KvCExprLocDB::listUses(leda::dictionary<int, KV_ExprLocation*>& uses) const {
  listRange(KV_DB_USE, KV_DB_QSO_USE, uses);
}

void KvCExprLocDB::listUses(std::vector<KeyedLocation>& uses) const {
  uses.clear();
  int filled = 0;
  bool sorted = true;
  for (int c = KV_DB_USE; c <= KV_DB_QSO_USE; ++c) {
    if (entries[c].empty())
      continue;
    uses.insert(uses.end(), entries[c].begin(), entries[c].end());
    ++filled;
    sorted = sorted && !(unsorted & (1U << c));
  }
  // One category in serial order is the answer as it stands.
  if (filled <= 1 && sorted)
    return;
  std::sort(uses.begin(), uses.end(),
            [](const KeyedLocation& a, const KeyedLocation& b) { return a.first < b.first; });
}

void KvCExprLocDB::listCategory(tagKvEExprLocDBCategory category,
                                leda::dictionary<int, KV_ExprLocation*>& out) const {
  if (category < 0 || category >= KV_DB_NUMBER_OF_CATEGORIES) {
    out.clear();
    return;
  }
  listRange(category, category, out);
}

int KvCExprLocDB::getCategorySize(tagKvEExprLocDBCategory category) const {
  if (category < 0 || category >= KV_DB_NUMBER_OF_CATEGORIES)
    return 0;
  return static_cast<int>(entries[category].size());
}

int KvCExprLocDB::getNumberOfDefs() const {
  int n = 0;
  for (int c = KV_DB_DEF; c <= KV_DB_QSO_DEF; ++c)
    n += static_cast<int>(entries[c].size());
  return n;
}

int KvCExprLocDB::getNumberOfUses() const {
  int n = 0;
  for (int c = KV_DB_USE; c <= KV_DB_QSO_USE; ++c)
    n += static_cast<int>(entries[c].size());
  return n;
}

bool KvCExprLocDB::contains(tagKvEExprLocDBCategory category, const KV_ExprLocation* loc) const {
  if (!loc || category < 0 || category >= KV_DB_NUMBER_OF_CATEGORIES)
    return false;
  const KV_ExprLocation::DbSlot& slot = isDefCategory(category) ? loc->defSlot : loc->useSlot;
  return slot.db == this && slot.category == category;
}

void KvCExprLocDB::clear() {
  for (int c = 0; c < KV_DB_NUMBER_OF_CATEGORIES; ++c) {
    const bool defSide = isDefCategory(static_cast<tagKvEExprLocDBCategory>(c));
    for (const auto& entry : entries[c])
      (defSide ? entry.second->defSlot : entry.second->useSlot) = KV_ExprLocation::DbSlot{};
    entries[c].clear();
    lastSerial[c] = -1;
  }
  unsorted = 0;
}

bool KvCQsoExprLocDB::addStaticDeclDefDef(KV_ExprLocation* loc) {
  return db->add(KV_DB_STATIC_DECLDEF_DEF, loc);
}
bool KvCQsoExprLocDB::addStaticDeclDefUse(KV_ExprLocation* loc) {
  return db->add(KV_DB_STATIC_DECLDEF_USE, loc);
}
bool KvCQsoExprLocDB::addQsoDef(KV_ExprLocation* loc) { return db->add(KV_DB_QSO_DEF, loc); }
bool KvCQsoExprLocDB::addQsoUse(KV_ExprLocation* loc) { return db->add(KV_DB_QSO_USE, loc); }
bool KvCQsoExprLocDB::addRestartDef(KV_ExprLocation* loc) {
  return db->add(KV_DB_RESTART_DEF, loc);
}

bool KvCQsoExprLocDB::isRestartDef(KV_ExprLocation* loc) {
  if (!loc || !loc->getQualifiedSymbolOp())
    return false;
  KV_Operation* parent = loc->getParentOperation();
  if (!parent || !parent->definesOperand(loc->getIndexInParent()))
    return false;
  KV_Statement* statement = loc->getStatement();
  KvCCStmTable* table = statement ? statement->getParentCTable() : nullptr;
  KvCParamSymbol* function = table ? table->getCodeBlockSymbol() : nullptr;
  return function && function->isRestartFunction();
}
