// KvCExprLocDB: the expression-location (def/use) database of one symbol, data type or
// file: the locations at which it is defined and used.
//
// Entries are kept by category. The plain categories (def, use) serve data types and
// files; the symbol-access categories (static declaration or definition, restart
// definition, ordinary definition and use) are reached through getQsoExprLocDB(). Every
// category is on the definition side or on the use side; removeDef and removeUse remove a
// location from whatever category of that side holds it.
//
// A location is in at most one database entry per side (the location records it), so
// adding a location that sits in another category or database of the same side moves it,
// and adding it twice to the same category changes nothing. Adding and removing are O(1);
// listing is O(n log n) and keyed by the locations' serial numbers, so it is in creation
// order whatever the order of insertion.
#ifndef HUL_PLATFORM_ICODE_KVCEXPRLOCDB_H
#define HUL_PLATFORM_ICODE_KVCEXPRLOCDB_H

#include "platform/icode/KvCQsoExprLocDB.h"
#include "platform/leda/dictionary.h"
#include "platform/support/HulPlatformExport.h"

#include <utility>
#include <vector>

class KV_ExprLocation;

enum tagKvEExprLocDBCategory {
  KV_DB_DEF,
  KV_DB_STATIC_DECLDEF_DEF,
  KV_DB_RESTART_DEF,
  KV_DB_QSO_DEF,
  KV_DB_USE,
  KV_DB_STATIC_DECLDEF_USE,
  KV_DB_QSO_USE,
  KV_DB_NUMBER_OF_CATEGORIES
};

class HUL_PLATFORM_API KvCExprLocDB {
public:
  KvCExprLocDB();
  // Forgets every entry (the locations' records are reset).
  ~KvCExprLocDB();
  KvCExprLocDB(const KvCExprLocDB&) = delete;
  KvCExprLocDB& operator=(const KvCExprLocDB&) = delete;

  bool addDef(KV_ExprLocation* loc) { return add(KV_DB_DEF, loc); }
  bool addUse(KV_ExprLocation* loc) { return add(KV_DB_USE, loc); }
  // False when the location is not on that side of this database.
  bool removeDef(KV_ExprLocation* loc);
  bool removeUse(KV_ExprLocation* loc);

  KvCQsoExprLocDB* getQsoExprLocDB() { return &qsoPart; }

  // Enters `loc` in `category`; false for a null location or category out of range.
  bool add(tagKvEExprLocDBCategory category, KV_ExprLocation* loc);
  static bool isDefCategory(tagKvEExprLocDBCategory category) { return category < KV_DB_USE; }

  // The locations of one side or one category, keyed by serial number. The dictionary is
  // cleared first.
  void listDefs(leda::dictionary<int, KV_ExprLocation*>& defs) const;
  void listUses(leda::dictionary<int, KV_ExprLocation*>& uses) const;
  // The uses with their keys (serial numbers), as the dictionary form lists them, in
  // ascending key order into a vector the caller may reuse (cleared first). Reads no
  // location. O(number of uses) when the uses were entered in ascending serial order (as a
  // walk of the ICode enters them) and none was removed from the middle since; O(n log n)
  // otherwise.
  using KeyedLocation = std::pair<int, KV_ExprLocation*>;
  void listUses(std::vector<KeyedLocation>& uses) const;
  void listCategory(tagKvEExprLocDBCategory category,
                    leda::dictionary<int, KV_ExprLocation*>& entries) const;

  int getNumberOfDefs() const;
  int getNumberOfUses() const;
  int getCategorySize(tagKvEExprLocDBCategory category) const;
  bool isEmpty() const { return getNumberOfDefs() == 0 && getNumberOfUses() == 0; }
  // Whether `loc` is in `category` of this database.
  bool contains(tagKvEExprLocDBCategory category, const KV_ExprLocation* loc) const;
  void clear();

private:
  bool removeSide(bool defSide, KV_ExprLocation* loc);
  void listRange(int first, int last, leda::dictionary<int, KV_ExprLocation*>& out) const;

  // Per category, each entry with its key (serial number).
  std::vector<KeyedLocation> entries[KV_DB_NUMBER_OF_CATEGORIES];
  // Per category: the serial number of the last entry added, and (one bit each) whether
  // the entries may be out of ascending serial order.
  int lastSerial[KV_DB_NUMBER_OF_CATEGORIES];
  unsigned unsorted = 0;
  KvCQsoExprLocDB qsoPart;
};

#endif
