// Seeded random sequences of class changes over the symbols of two file pairs and their
// functions, checked after every step against a plain reference: which table lists each
// symbol and which names each name space (the potential globals included) holds. The
// reference knows the scopes by construction (which tables are a file's top level, which
// table is the other file's of a pair, which tables have a name space) and asks the model
// nothing.
#include "HulCvTools/SymbolTools/KvCSmbDeclDefMover.h"
#include "platform/builder/AppBuilder.h"
#include "platform/icode/KvCCStmTable.h"
#include "platform/icode/KvCIcFileId.h"
#include "platform/icode/KvCSmbClass.h"
#include "platform/icode/KvCUnparamSymbol.h"
#include "platform/support/KvCNameSpace.h"

#include <gtest/gtest.h>

#include <map>
#include <random>
#include <set>
#include <string>
#include <vector>

namespace {

using Mover = KvCSmbDeclDefMover;
using ClassChange = bool (Mover::*)(KvCSymbol*, KvCCStmTable*, KvCSmbClassId*, bool&);

struct ChangeKind {
  ClassChange change;
  bool clearsFile;
  bool toStaticGlobal;
};

const ChangeKind kChanges[] = {
    {&Mover::clearGlobalDeclareStaticGlobal, false, false},
    {&Mover::clearGlobalDefineStaticGlobal, true, true},
    {&Mover::clearGlobalDefineStaticLocal, true, false},
    {&Mover::clearGlobalDefineLocal, true, false},
    {&Mover::clearStaticGlobalDefineStaticLocal, true, false},
    {&Mover::clearStaticGlobalDefineLocal, true, false},
    {&Mover::clearStaticLocalDefineLocal, false, false},
    {&Mover::clearInitialValue, false, false},
};

// One table of the world, as the reference sees it.
struct Scope {
  KvCCStmTable* table;
  bool fileScope;                 // a file's top-level table
  bool header;                    // ... of a header
  KvCCStmTable* other = nullptr;  // the top-level table of the pair's other file
  std::set<std::string> expected; // names, when the table has a name space
};

class RandomMoves {
public:
  RandomMoves() {
    for (const char* pair : {"a", "b"}) {
      KvCIcFileId* source = app.filePair(pair);
      KvCCStmTable* sourceTable = source->getFile()->getStt();
      KvCCStmTable* headerTable = source->getFile()->getComplementaryFile()->getFile()->getStt();
      addScope(sourceTable, true, false, headerTable);
      addScope(headerTable, true, true, sourceTable);
      BlockBuilder& body = app.function((std::string("f_") + pair).c_str()).body();
      app.nameSpace(body.table());
      addScope(body.table(), false, false, nullptr);
      BlockBuilder& block = body.block();
      if (pair[0] == 'a') // f_b's nested block has no name space
        app.nameSpace(block.table());
      addScope(block.table(), false, false, nullptr);
    }
    classes = {app.smbClass("Global", KV_SMBCLASS_GLOBAL),
               app.smbClass("StaticGlobal", KV_SMBCLASS_STATIC_GLOBAL),
               app.smbClass("StaticLocal", KV_SMBCLASS_STATIC_LOCAL),
               app.smbClass("Local", KV_SMBCLASS_LOCAL)};
    for (int i = 0; i < 8; ++i) {
      const std::string name = "v" + std::to_string(i);
      KvCUnparamSymbol* v = app.variable(name.c_str(), app.int16(), false);
      const std::size_t at = static_cast<std::size_t>(i) % scopes.size();
      app.place(v, classes[static_cast<std::size_t>(i) % classes.size()], scopes[at].table);
      symbols.push_back(v);
      holder[v] = at;
      if (scopes[at].table->getNameSpace())
        scopes[at].expected.insert(name);
      if (scopes[at].fileScope) {
        potentialGlobals.insert(name);
        // The other file of the pair declares it.
        app.nameSpace(scopes[at].other)->add(name.c_str());
        scopes[indexOf(scopes[at].other)].expected.insert(name);
      }
    }
  }

  // One class change of a random symbol into a random table with a random class; now and
  // then with a missing argument.
  void step(std::mt19937& random) {
    KvCUnparamSymbol* v = symbols[pick(random, symbols.size())];
    const ChangeKind& kind = kChanges[pick(random, std::size(kChanges))];
    const std::size_t to = pick(random, scopes.size());
    KvCSmbClassId* cls = classes[pick(random, classes.size())];
    const int missing = static_cast<int>(pick(random, 20));
    KvCCStmTable* table = missing == 0 ? nullptr : scopes[to].table;
    if (missing == 1)
      cls = nullptr;

    bool moved = true;
    ASSERT_TRUE((mover.*kind.change)(v, table, cls, moved));
    ASSERT_EQ(moved, table && cls);
    if (!moved)
      return;
    const std::string name = v->getName().str();
    Scope& from = scopes[holder[v]];
    from.expected.erase(name);
    if (from.fileScope)
      potentialGlobals.erase(name);
    const bool clearsOther =
        kind.clearsFile && from.fileScope && (!from.header || !kind.toStaticGlobal);
    if (scopes[to].table->getNameSpace())
      scopes[to].expected.insert(name);
    // After the move: the other file of the old table's pair, unless the symbol went there.
    if (clearsOther && from.other->getNameSpace()) {
      if (from.other != scopes[to].table)
        scopes[indexOf(from.other)].expected.erase(name);
      if (scopes[to].fileScope)
        potentialGlobals.erase(name);
    }
    holder[v] = to;
    expectedClass[v] = cls;
  }

  void check() {
    for (KvCUnparamSymbol* v : symbols) {
      SCOPED_TRACE(v->getName().str());
      int listedIn = 0;
      for (const Scope& scope : scopes)
        listedIn += scope.table->holdsSymbol(v) ? 1 : 0;
      EXPECT_EQ(listedIn, 1);
      EXPECT_TRUE(scopes[holder.at(v)].table->holdsSymbol(v));
      EXPECT_EQ(v->getStt(), scopes[holder.at(v)].table);
      auto cls = expectedClass.find(v);
      if (cls != expectedClass.end()) {
        EXPECT_EQ(v->getSmbClassId(), cls->second);
        EXPECT_EQ(v->getExtSmbClassState(), KV_SMBCLASS_STATE_NONE);
      }
    }
    for (const Scope& scope : scopes) {
      const KvCNameSpace* names = scope.table->getNameSpace();
      if (!names)
        continue;
      SCOPED_TRACE("table " + std::to_string(indexOf(scope.table)));
      EXPECT_EQ(names->size(), scope.expected.size());
      for (KvCUnparamSymbol* v : symbols)
        EXPECT_EQ(names->contains(v->getName()), scope.expected.count(v->getName().str()) == 1)
            << v->getName().str();
    }
    EXPECT_EQ(app.potentialGlobals()->size(), potentialGlobals.size());
    for (const std::string& name : potentialGlobals)
      EXPECT_TRUE(app.potentialGlobals()->contains(name.c_str())) << name;
  }

private:
  static std::size_t pick(std::mt19937& random, std::size_t n) {
    return std::uniform_int_distribution<std::size_t>(0, n - 1)(random);
  }
  void addScope(KvCCStmTable* table, bool fileScope, bool header, KvCCStmTable* other) {
    scopes.push_back(Scope{table, fileScope, header, other, {}});
  }
  std::size_t indexOf(const KvCCStmTable* table) const {
    for (std::size_t i = 0; i < scopes.size(); ++i)
      if (scopes[i].table == table)
        return i;
    ADD_FAILURE() << "unknown table";
    return 0;
  }

  AppBuilder app;
  Mover mover;
  std::vector<Scope> scopes;
  std::vector<KvCSmbClassId*> classes;
  std::vector<KvCUnparamSymbol*> symbols;
  std::map<KvCUnparamSymbol*, std::size_t> holder;
  std::map<KvCUnparamSymbol*, KvCSmbClassId*> expectedClass;
  std::set<std::string> potentialGlobals;
};

TEST(MoverRandomTest, ClassChangesKeepTablesAndNameSpacesConsistent) {
  for (unsigned seed : {1u, 7u, 42u, 2024u, 99991u}) {
    SCOPED_TRACE("seed " + std::to_string(seed));
    std::mt19937 random(seed);
    RandomMoves world;
    world.check();
    for (int i = 0; i < 300 && !::testing::Test::HasFailure(); ++i) {
      SCOPED_TRACE("step " + std::to_string(i));
      world.step(random);
      world.check();
    }
  }
}

} // namespace
