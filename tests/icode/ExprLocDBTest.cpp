// KvCExprLocDB: one entry per side, moves between categories and databases, listings in
// serial order, clearing, and a random add/remove sequence against a reference.
#include "platform/builder/AppBuilder.h"
#include "platform/icode/KV_ExprLocation.h"
#include "platform/icode/KV_Operation.h"
#include "platform/icode/KV_Statement.h"
#include "platform/icode/KvCExprLocDB.h"
#include "platform/icode/KvCExprLocDBServer.h"
#include "platform/icode/KvCIcFileId.h"
#include "platform/icode/KvCParamSymbol.h"
#include "platform/icode/KvCQsoExprLocDB.h"
#include "platform/icode/KvCUnparamSymbol.h"

#include <gtest/gtest.h>

#include <map>
#include <memory>
#include <random>
#include <set>
#include <utility>
#include <vector>

namespace {

using Listing = leda::dictionary<int, KV_ExprLocation*>;

std::vector<KV_ExprLocation*> values(const Listing& listing) {
  std::vector<KV_ExprLocation*> out;
  for (const auto& [serial, loc] : listing) {
    EXPECT_EQ(serial, loc->getSerial());
    out.push_back(loc);
  }
  return out;
}

std::vector<KV_ExprLocation*> defs(const KvCExprLocDB& db) {
  Listing l;
  db.listDefs(l);
  return values(l);
}
std::vector<KV_ExprLocation*> uses(const KvCExprLocDB& db) {
  Listing l;
  db.listUses(l);
  return values(l);
}

constexpr tagKvEExprLocDBCategory kAllCategories[] = {
    KV_DB_DEF, KV_DB_STATIC_DECLDEF_DEF, KV_DB_RESTART_DEF, KV_DB_QSO_DEF,
    KV_DB_USE, KV_DB_STATIC_DECLDEF_USE, KV_DB_QSO_USE};

TEST(ExprLocDBTest, EachSideHoldsTheLocationOnce) {
  AppBuilder app;
  KV_ExprLocation* a = app.empty();
  KV_ExprLocation* b = app.empty();
  KvCExprLocDB db;
  EXPECT_TRUE(db.isEmpty());
  EXPECT_TRUE(db.addDef(a));
  EXPECT_TRUE(db.addUse(a));
  EXPECT_TRUE(db.addUse(b));
  EXPECT_EQ(db.getNumberOfDefs(), 1);
  EXPECT_EQ(db.getNumberOfUses(), 2);
  // Re-adding to the same category changes nothing.
  EXPECT_TRUE(db.addDef(a));
  EXPECT_TRUE(db.getQsoExprLocDB()->getExprLocDB() == &db);
  EXPECT_EQ(db.getNumberOfDefs(), 1);
  EXPECT_EQ(defs(db), (std::vector<KV_ExprLocation*>{a}));
  EXPECT_EQ(uses(db), (std::vector<KV_ExprLocation*>{a, b}));

  // Removing one side leaves the other.
  EXPECT_TRUE(db.removeDef(a));
  EXPECT_FALSE(db.removeDef(a));
  EXPECT_TRUE(db.contains(KV_DB_USE, a));
  EXPECT_FALSE(db.removeDef(b)); // only on the use side
  EXPECT_TRUE(db.removeUse(a));
  EXPECT_FALSE(db.removeUse(a));
  EXPECT_FALSE(db.removeUse(nullptr));
  EXPECT_FALSE(db.removeDef(nullptr));
  EXPECT_EQ(uses(db), (std::vector<KV_ExprLocation*>{b}));
  EXPECT_FALSE(db.add(KV_DB_DEF, nullptr));
  EXPECT_FALSE(db.add(KV_DB_NUMBER_OF_CATEGORIES, a));
  EXPECT_FALSE(db.add(static_cast<tagKvEExprLocDBCategory>(-1), a));
  EXPECT_EQ(db.getCategorySize(KV_DB_NUMBER_OF_CATEGORIES), 0);
  EXPECT_FALSE(db.contains(KV_DB_NUMBER_OF_CATEGORIES, b));
}

TEST(ExprLocDBTest, AddingMovesBetweenCategoriesAndDatabasesOfTheSameSide) {
  AppBuilder app;
  KV_ExprLocation* loc = app.empty();
  KvCExprLocDB first;
  KvCExprLocDB second;
  KvCQsoExprLocDB* qso = first.getQsoExprLocDB();
  ASSERT_TRUE(qso->addQsoDef(loc));
  EXPECT_TRUE(first.contains(KV_DB_QSO_DEF, loc));
  ASSERT_TRUE(qso->addRestartDef(loc));
  EXPECT_FALSE(first.contains(KV_DB_QSO_DEF, loc));
  EXPECT_TRUE(first.contains(KV_DB_RESTART_DEF, loc));
  ASSERT_TRUE(qso->addStaticDeclDefDef(loc));
  EXPECT_EQ(first.getNumberOfDefs(), 1);
  EXPECT_EQ(first.getCategorySize(KV_DB_STATIC_DECLDEF_DEF), 1);
  EXPECT_EQ(first.getCategorySize(KV_DB_RESTART_DEF), 0);

  // The use side is independent of the definition side.
  ASSERT_TRUE(qso->addStaticDeclDefUse(loc));
  ASSERT_TRUE(qso->addQsoUse(loc));
  EXPECT_EQ(first.getCategorySize(KV_DB_STATIC_DECLDEF_USE), 0);
  EXPECT_TRUE(first.contains(KV_DB_STATIC_DECLDEF_DEF, loc));

  // Into another database: gone from the first on that side only.
  ASSERT_TRUE(second.addDef(loc));
  EXPECT_EQ(first.getNumberOfDefs(), 0);
  EXPECT_EQ(first.getNumberOfUses(), 1);
  EXPECT_FALSE(first.removeDef(loc));
  EXPECT_TRUE(second.contains(KV_DB_DEF, loc));
  ASSERT_TRUE(second.addUse(loc));
  EXPECT_TRUE(first.isEmpty());
  EXPECT_FALSE(first.removeUse(loc));
  EXPECT_TRUE(second.removeUse(loc));
  EXPECT_TRUE(second.removeDef(loc));
  EXPECT_TRUE(second.isEmpty());
}

TEST(ExprLocDBTest, ListingIsBySerialWhateverTheInsertionOrder) {
  AppBuilder app;
  std::vector<KV_ExprLocation*> locs;
  for (int i = 0; i < 12; ++i)
    locs.push_back(app.empty());
  KvCExprLocDB db;
  // Spread over the categories of both sides, inserted backwards and shuffled.
  std::vector<int> order = {11, 3, 7, 0, 9, 5, 1, 10, 2, 8, 6, 4};
  for (int i : order) {
    const tagKvEExprLocDBCategory defCat = kAllCategories[i % 4];
    const tagKvEExprLocDBCategory useCat = kAllCategories[4 + i % 3];
    ASSERT_TRUE(db.add(defCat, locs[static_cast<std::size_t>(i)]));
    ASSERT_TRUE(db.add(useCat, locs[static_cast<std::size_t>(11 - i)]));
  }
  EXPECT_EQ(defs(db), locs);
  EXPECT_EQ(uses(db), locs);
  Listing one;
  db.listCategory(KV_DB_QSO_DEF, one);
  EXPECT_EQ(values(one), (std::vector<KV_ExprLocation*>{locs[3], locs[7], locs[11]}));
  // Removing from the middle keeps the rest listed in order.
  ASSERT_TRUE(db.removeDef(locs[7]));
  ASSERT_TRUE(db.removeDef(locs[0]));
  db.listCategory(KV_DB_QSO_DEF, one);
  EXPECT_EQ(values(one), (std::vector<KV_ExprLocation*>{locs[3], locs[11]}));
  // Listing clears the dictionary first; a category out of range lists nothing.
  db.listCategory(KV_DB_NUMBER_OF_CATEGORIES, one);
  EXPECT_TRUE(one.empty());
}

TEST(ExprLocDBTest, ClearAndDestructionReleaseTheLocations) {
  AppBuilder app;
  KV_ExprLocation* a = app.empty();
  KV_ExprLocation* b = app.empty();
  KvCExprLocDB kept;
  {
    KvCExprLocDB db;
    ASSERT_TRUE(db.addDef(a));
    ASSERT_TRUE(db.addUse(b));
    db.clear();
    EXPECT_TRUE(db.isEmpty());
    EXPECT_FALSE(db.removeDef(a));
    EXPECT_FALSE(db.contains(KV_DB_DEF, a));
    ASSERT_TRUE(db.addDef(a));
    ASSERT_TRUE(db.getQsoExprLocDB()->addQsoUse(b));
  }
  // The database is gone; its locations are free to enter another one.
  ASSERT_TRUE(kept.addDef(a));
  ASSERT_TRUE(kept.addUse(b));
  EXPECT_TRUE(kept.removeDef(a));
  EXPECT_TRUE(kept.removeUse(b));
}

TEST(ExprLocDBTest, ServerClearsTheDatabasesOfSymbolsTypesAndFiles) {
  AppBuilder app;
  KvCUnparamSymbol* v = app.variable("v", app.int16());
  KvCParamSymbol* fn = app.function("fn").symbol();
  KvCExprLocDBServer* server = app.data().getExprLocDBServer();
  KvCExprLocDB* typeDb = server->demandExprLocDB(app.int16());
  KvCExprLocDB* fileDb = server->demandExprLocDB(app.currentFile());
  EXPECT_EQ(typeDb, app.int16()->findExprLocDB());
  EXPECT_EQ(fileDb, app.currentFile()->findExprLocDB());
  EXPECT_EQ(server->demandExprLocDB(static_cast<KV_DataType*>(nullptr)), nullptr);
  EXPECT_EQ(server->demandExprLocDB(static_cast<KvCIcFileId*>(nullptr)), nullptr);
  EXPECT_EQ(app.int32()->findExprLocDB(), nullptr); // not made unless demanded

  std::vector<KV_ExprLocation*> locs;
  for (int i = 0; i < 6; ++i)
    locs.push_back(app.empty());
  ASSERT_TRUE(v->getExprLocDB()->getQsoExprLocDB()->addQsoDef(locs[0]));
  ASSERT_TRUE(v->getExprLocDB()->getQsoExprLocDB()->addQsoUse(locs[1]));
  ASSERT_TRUE(fn->getExprLocDB()->addUse(locs[2]));
  ASSERT_TRUE(typeDb->addUse(locs[3]));
  ASSERT_TRUE(fileDb->addDef(locs[4]));
  ASSERT_TRUE(fileDb->addUse(locs[5]));

  server->clearExprLocDBs();
  for (KvCExprLocDB* db : {v->getExprLocDB(), fn->getExprLocDB(), typeDb, fileDb})
    EXPECT_TRUE(db->isEmpty());
  // The locations' records were reset too: removal finds nothing anywhere.
  EXPECT_FALSE(v->getExprLocDB()->removeDef(locs[0]));
  EXPECT_FALSE(fileDb->removeUse(locs[5]));
  KvCExprLocDB fresh;
  for (KV_ExprLocation* loc : locs)
    ASSERT_TRUE(fresh.addUse(loc));
  EXPECT_EQ(fresh.getNumberOfUses(), 6);
  EXPECT_TRUE(typeDb->isEmpty());
}

TEST(ExprLocDBTest, RestartDefinitionsAreDefinedAccessesInRestartFunctions) {
  AppBuilder app;
  KvCUnparamSymbol* x = app.variable("x", app.int16());
  FunctionBuilder& restart = app.function("restart").role(KV_ROLE_RESTART_FUNCTION);
  FunctionBuilder& step = app.function("step");
  KV_Operation* inRestart =
      restart.body().assign(app.access(x), app.access(x))->getExprLoc()->getOperation();
  KV_Operation* inStep =
      step.body().assign(app.access(x), app.access(x))->getExprLoc()->getOperation();
  KV_Operation* nested = restart.body()
                             .ifThen(app.access(x))
                             .stmt(app.op(KV_OP_ADD_ASSIGN, {app.access(x), app.constant(1)}))
                             ->getExprLoc()
                             ->getOperation();
  EXPECT_TRUE(KvCQsoExprLocDB::isRestartDef(inRestart->getOperand(0)));
  EXPECT_FALSE(KvCQsoExprLocDB::isRestartDef(inRestart->getOperand(1)));
  EXPECT_FALSE(KvCQsoExprLocDB::isRestartDef(inStep->getOperand(0)));
  EXPECT_TRUE(KvCQsoExprLocDB::isRestartDef(nested->getOperand(0)));
  EXPECT_FALSE(KvCQsoExprLocDB::isRestartDef(nested->getOperand(1))); // a constant
  EXPECT_FALSE(KvCQsoExprLocDB::isRestartDef(nullptr));
  EXPECT_FALSE(KvCQsoExprLocDB::isRestartDef(app.access(x))); // no parent
}

// A random add/remove sequence over three databases against a map of who holds what.
TEST(ExprLocDBTest, RandomSequenceAgreesWithReference) {
  AppBuilder app;
  std::vector<KV_ExprLocation*> locs;
  for (int i = 0; i < 20; ++i)
    locs.push_back(app.empty());
  std::vector<std::unique_ptr<KvCExprLocDB>> dbs;
  for (int i = 0; i < 3; ++i)
    dbs.push_back(std::make_unique<KvCExprLocDB>());
  // Per location and side: (database, category), absent when in none.
  std::map<std::pair<int, bool>, std::pair<int, int>> where;
  std::mt19937_64 rng(20240611);
  auto below = [&rng](int n) { return static_cast<int>(rng() % static_cast<std::uint64_t>(n)); };

  for (int stepNo = 0; stepNo < 4000; ++stepNo) {
    const int l = below(20);
    const int d = below(3);
    KvCExprLocDB& db = *dbs[static_cast<std::size_t>(d)];
    KV_ExprLocation* loc = locs[static_cast<std::size_t>(l)];
    const int action = below(5);
    if (action < 3) {
      const int c = below(KV_DB_NUMBER_OF_CATEGORIES);
      const auto category = static_cast<tagKvEExprLocDBCategory>(c);
      ASSERT_TRUE(db.add(category, loc));
      where[{l, KvCExprLocDB::isDefCategory(category)}] = {d, c};
    } else {
      const bool defSide = action == 3;
      auto it = where.find({l, defSide});
      const bool expected = it != where.end() && it->second.first == d;
      ASSERT_EQ(defSide ? db.removeDef(loc) : db.removeUse(loc), expected) << "step " << stepNo;
      if (expected)
        where.erase(it);
    }
    // Compare every category of every database with the reference, and the fast listing
    // of the uses with the keyed one.
    for (int dd = 0; dd < 3; ++dd) {
      std::vector<KvCExprLocDB::KeyedLocation> fast;
      dbs[static_cast<std::size_t>(dd)]->listUses(fast);
      Listing keyed;
      dbs[static_cast<std::size_t>(dd)]->listUses(keyed);
      std::vector<KvCExprLocDB::KeyedLocation> want;
      for (const auto& item : keyed)
        want.emplace_back(item.first, item.second);
      ASSERT_EQ(fast, want) << "step " << stepNo;
      for (tagKvEExprLocDBCategory c : kAllCategories) {
        std::vector<KV_ExprLocation*> want;
        for (const auto& [key, place] : where)
          if (place.first == dd && place.second == c)
            want.push_back(locs[static_cast<std::size_t>(key.first)]);
        // locs were made in order, so ascending index is ascending serial.
        Listing got;
        dbs[static_cast<std::size_t>(dd)]->listCategory(c, got);
        ASSERT_EQ(values(got), want) << "step " << stepNo << " db " << dd << " category " << c;
        ASSERT_EQ(dbs[static_cast<std::size_t>(dd)]->getCategorySize(c),
                  static_cast<int>(want.size()));
        for (int ll = 0; ll < 20; ++ll) {
          auto it = where.find({ll, KvCExprLocDB::isDefCategory(c)});
          const bool in =
              it != where.end() && it->second == std::make_pair(dd, static_cast<int>(c));
          ASSERT_EQ(
              dbs[static_cast<std::size_t>(dd)]->contains(c, locs[static_cast<std::size_t>(ll)]),
              in);
        }
      }
    }
  }
  // Clearing one database leaves the others untouched.
  const int usesBefore = dbs[1]->getNumberOfUses() + dbs[2]->getNumberOfUses();
  dbs[0]->clear();
  EXPECT_TRUE(dbs[0]->isEmpty());
  EXPECT_EQ(dbs[1]->getNumberOfUses() + dbs[2]->getNumberOfUses(), usesBefore);
}

} // namespace
