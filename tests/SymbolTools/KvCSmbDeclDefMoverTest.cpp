// The declaration/definition mover on a controller's symbols: the class changes and where
// they enter the symbol, the name spaces they clear, the re-entry of a scope-local
// variable at its declaration or definition, the enter operations when the table answers
// another symbol, and the early ends at missing pieces of the ICode.
#include "tests/SymbolTools/MoverFixture.h"

#include "HulCvTools/ExprLocDBBuilder/KvCExprLocDBBuilder.h"
#include "platform/icode/KV_QualifiedSymbolOp.h"
#include "platform/icode/KV_StatementFactory.h"
#include "platform/icode/KvCCodeViewData.h"
#include "platform/icode/KvCIcApplication.h"
#include "platform/icode/KvCIcFileServer.h"
#include "platform/icode/KvCVarClassId.h"

#include <string>
#include <vector>

namespace {

using Mover = KvCSmbDeclDefMover;
using ClassChange = bool (Mover::*)(KvCSymbol*, KvCCStmTable*, KvCSmbClassId*, bool&);

// Each class change: how it enters the symbol and from which kinds of old table it clears
// the complementary file.
struct ClassChangeCase {
  const char* name;
  ClassChange change;
  bool asDeclaration;
  bool clearsFromSourceFile; // old table: the top-level table of a source file
  bool clearsFromHeader;     // old table: the top-level table of a header
};

const std::vector<ClassChangeCase>& classChanges() {
  static const std::vector<ClassChangeCase> cases = {
      {"clearGlobalDeclareStaticGlobal", &Mover::clearGlobalDeclareStaticGlobal, true, false,
       false},
      {"clearGlobalDefineStaticGlobal", &Mover::clearGlobalDefineStaticGlobal, false, true, false},
      {"clearGlobalDefineStaticLocal", &Mover::clearGlobalDefineStaticLocal, false, true, true},
      {"clearGlobalDefineLocal", &Mover::clearGlobalDefineLocal, false, true, true},
      {"clearStaticGlobalDefineStaticLocal", &Mover::clearStaticGlobalDefineStaticLocal, false,
       true, true},
      {"clearStaticGlobalDefineLocal", &Mover::clearStaticGlobalDefineLocal, false, true, true},
      {"clearStaticLocalDefineLocal", &Mover::clearStaticLocalDefineLocal, false, false, false},
      {"clearInitialValue", &Mover::clearInitialValue, false, false, false},
  };
  return cases;
}

bool enteredAsDefinition(KvCCStmTable* table, const KvCSymbol* symbol) {
  for (int i = 0; i < table->getNumberOfEnteredSymbols(); ++i)
    if (table->getEnteredSymbol(i) == symbol)
      return table->isEnteredAsDefinition(i);
  return false;
}

TEST_F(MoverTest, EachClassChangeEntersAndClearsTheComplementaryFileAsItsKindSays) {
  for (const ClassChangeCase& c : classChanges())
    for (bool fromHeader : {false, true}) {
      SCOPED_TRACE(std::string(c.name) + (fromHeader ? " from ctrl.h" : " from ctrl.c"));
      AppBuilder world;
      KvCIcFileId* source = world.filePair("unit");
      KvCCStmTable* sourceTable = source->getFile()->getStt();
      KvCCStmTable* headerTable = complementaryTable(source);
      KvCCStmTable* oldTable = fromHeader ? headerTable : sourceTable;
      KvCCStmTable* otherTable = fromHeader ? sourceTable : headerTable;
      KvCCStmTable* body = world.function("f").body().table();
      world.nameSpace(body);
      KvCUnparamSymbol* v = world.variable("v", world.int16(), false);
      world.place(v, world.smbClass("Global", KV_SMBCLASS_GLOBAL), oldTable);
      world.nameSpace(otherTable)->add("v");
      KvCSmbClassId* newClass = world.smbClass("New", KV_SMBCLASS_STATIC_LOCAL);

      bool moved = false;
      EXPECT_TRUE((mover.*c.change)(v, body, newClass, moved));

      EXPECT_TRUE(moved);
      EXPECT_TRUE(body->holdsSymbol(v));
      EXPECT_FALSE(oldTable->holdsSymbol(v));
      EXPECT_EQ(enteredAsDefinition(body, v), !c.asDeclaration);
      EXPECT_EQ(v->getStt(), body);
      EXPECT_EQ(v->getVarClassId(), newClass->getVarClassId());
      EXPECT_EQ(v->getSmbClassId(), newClass);
      EXPECT_FALSE(named(oldTable, "v"));
      EXPECT_TRUE(named(body, "v"));
      EXPECT_FALSE(world.potentialGlobals()->contains("v"));
      const bool clears = fromHeader ? c.clearsFromHeader : c.clearsFromSourceFile;
      EXPECT_EQ(named(otherTable, "v"), !clears);
    }
}

TEST_F(MoverTest, GlobalBecomesStaticGlobalOfItsFile) {
  KvCUnparamSymbol* g = placed("g", global, ctrlC);
  app.nameSpace(ctrlH)->add("g"); // ctrl.h declares it
  g->setExtSmbClassState(KV_SMBCLASS_STATE_EXTERN_DECLARED);
  g->setExternSmbClass(global);
  ASSERT_TRUE(reserved("g"));

  bool moved = false;
  EXPECT_TRUE(mover.clearGlobalDefineStaticGlobal(g, ctrlC, staticGlobal, moved));

  EXPECT_TRUE(moved);
  EXPECT_TRUE(ctrlC->holdsSymbol(g));
  EXPECT_TRUE(named(ctrlC, "g"));
  EXPECT_FALSE(named(ctrlH, "g"));
  EXPECT_FALSE(reserved("g"));
  EXPECT_EQ(g->getSmbClassId(), staticGlobal);
  EXPECT_EQ(g->getExtSmbClassState(), KV_SMBCLASS_STATE_NONE);
  EXPECT_EQ(g->getExternSmbClass(), nullptr);
}

TEST_F(MoverTest, SymbolMovedIntoTheHeaderKeepsItsNameThere) {
  KvCUnparamSymbol* g = placed("g", global, ctrlC);
  app.nameSpace(ctrlH)->add("g");
  bool moved = false;
  mover.clearGlobalDefineStaticGlobal(g, ctrlH, staticGlobal, moved);
  EXPECT_TRUE(moved);
  EXPECT_TRUE(ctrlH->holdsSymbol(g));
  EXPECT_TRUE(named(ctrlH, "g"));
  EXPECT_FALSE(named(ctrlC, "g"));
}

TEST_F(MoverTest, FunctionTakesTheFunctionClassOfItsNewClass) {
  KvCParamSymbol* helper = app.function("helper").symbol();
  app.place(helper, global, ctrlC);
  bool moved = false;
  mover.clearGlobalDefineStaticGlobal(helper, ctrlC, staticGlobal, moved);
  EXPECT_TRUE(moved);
  EXPECT_EQ(helper->getFcnClassId(), staticGlobal->getFcnClassId());
  EXPECT_EQ(helper->getSmbClassId(), staticGlobal);
}

TEST_F(MoverTest, SymbolThatIsNoPotentialGlobalLeavesThePotentialGlobalsAlone) {
  // A global `x` elsewhere holds the name; step's static local `x` becomes a local of the
  // nested block.
  KvCIcFileId* util = app.filePair("util");
  placed("x", global, util->getFile()->getStt());
  KvCUnparamSymbol* x = placed("x_local", staticLocal, stepBody);
  app.potentialGlobals()->add("x_local");
  bool moved = false;
  mover.clearStaticLocalDefineLocal(x, innerBlock, local, moved);
  EXPECT_TRUE(moved);
  EXPECT_TRUE(reserved("x"));
  EXPECT_TRUE(reserved("x_local"));
  EXPECT_FALSE(named(stepBody, "x_local"));
  EXPECT_TRUE(named(innerBlock, "x_local"));
}

TEST_F(MoverTest, MovingIntoAnotherSubApplicationFreesTheNameThereToo) {
  // lib.c belongs to a second sub-application, whose potential globals also hold "g".
  KvCIcSubAppl* library = app.data().createSubApplication("Lib");
  KvCIcCodeUnit* unit = app.data().createCodeUnit("LibUnit");
  library->addCodeUnit(unit);
  KvCIcFileId* lib = app.data().getFileServer()->demandFile("lib.c");
  unit->addFile(lib);
  KvCIcFileId* libH = app.data().getFileServer()->demandFile("lib.h");
  unit->addFile(libH);
  lib->getFile()->setComplementaryFile(libH);
  libH->getFile()->setComplementaryFile(lib);
  app.nameSpace(libH->getFile()->getStt());
  KvCCStmTable* libC = lib->getFile()->getStt();
  library->getPotentialGlobalsNameSpace()->add("g");
  library->getPotentialGlobalsNameSpace()->add("h");
  KvCUnparamSymbol* g = placed("g", global, ctrlC);
  KvCUnparamSymbol* h = placed("h", global, ctrlC);

  bool moved = false;
  mover.clearGlobalDefineStaticGlobal(g, libC, staticGlobal, moved);
  EXPECT_TRUE(moved);
  EXPECT_FALSE(reserved("g"));
  EXPECT_FALSE(library->getPotentialGlobalsNameSpace()->contains("g"));
  // Entered as a declaration, nothing clears the new place's potential globals.
  mover.clearGlobalDeclareStaticGlobal(h, libC, staticGlobal, moved);
  EXPECT_TRUE(moved);
  EXPECT_FALSE(reserved("h"));
  EXPECT_TRUE(library->getPotentialGlobalsNameSpace()->contains("h"));
}

TEST_F(MoverTest, MoveLocalVarKeepsTheSymbolsClass) {
  KvCUnparamSymbol* t = placed("t", local, innerBlock);
  t->setExtSmbClassState(KV_SMBCLASS_STATE_IMPORTED);
  bool moved = false;
  EXPECT_TRUE(mover.moveLocalVar(t, innerBlock, stepBody, moved));
  EXPECT_TRUE(moved);
  EXPECT_TRUE(stepBody->holdsSymbol(t));
  EXPECT_FALSE(innerBlock->holdsSymbol(t));
  EXPECT_EQ(t->getSmbClassId(), local);
  EXPECT_EQ(t->getExtSmbClassState(), KV_SMBCLASS_STATE_NONE);
  EXPECT_FALSE(named(innerBlock, "t"));
  EXPECT_TRUE(named(stepBody, "t"));
  EXPECT_TRUE(mover.moveLocalVar(t, stepBody, innerBlock));
  EXPECT_TRUE(innerBlock->holdsSymbol(t));
}

TEST_F(MoverTest, RemoveSymbolClearsTheEntriesAndTheTable) {
  KvCUnparamSymbol* g = placed("g", global, ctrlC);
  EXPECT_TRUE(mover.removeSymbol(g, ctrlC));
  EXPECT_FALSE(ctrlC->holdsSymbol(g));
  EXPECT_EQ(g->getStt(), nullptr);
  EXPECT_FALSE(named(ctrlC, "g"));
  EXPECT_FALSE(reserved("g"));
  EXPECT_EQ(g->getSmbClassId(), global);
}

// --- moveLocalVarToFcnBaseScope

class BaseScopeTest : public MoverTest {
protected:
  void buildDatabases() {
    KvCExprLocDBBuilder builder;
    ASSERT_TRUE(builder.boot(&app.data()));
    ASSERT_TRUE(builder.buildExprLocDBs());
  }
  bool moveToBaseScope(KvCSymbol* symbol) {
    bool moved = true;
    EXPECT_TRUE(mover.moveLocalVarToFcnBaseScope(app.accessExpr(symbol), moved));
    return moved;
  }
};

TEST_F(BaseScopeTest, LocalWithOnlyADeclarationGoesToTheTableOfTheDeclaration) {
  KvCUnparamSymbol* t = placed("t", local, innerBlock);
  step.body().stmt(app.varDecl(t));
  buildDatabases();
  EXPECT_TRUE(moveToBaseScope(t));
  EXPECT_TRUE(stepBody->holdsSymbol(t));
  EXPECT_FALSE(innerBlock->holdsSymbol(t));
  EXPECT_EQ(t->getStt(), stepBody);
  EXPECT_FALSE(named(innerBlock, "t"));
  EXPECT_TRUE(named(stepBody, "t"));
  EXPECT_EQ(t->getSmbClassId(), local);
}

TEST_F(BaseScopeTest, DefinitionWinsOverDeclaration) {
  KvCUnparamSymbol* t = placed("t", local, stepBody);
  BlockBuilder& loop = step.body().whileLoop(app.constant(std::int64_t{1}));
  inner.stmt(app.varDecl(t));
  loop.stmt(app.varDef(t, {}));
  buildDatabases();
  EXPECT_TRUE(moveToBaseScope(t));
  EXPECT_TRUE(loop.table()->holdsSymbol(t));
  EXPECT_FALSE(stepBody->holdsSymbol(t));
  EXPECT_FALSE(innerBlock->holdsSymbol(t));
}

TEST_F(BaseScopeTest, OnlyScopeLocalVariablesWithAPlaceInAFunctionMove) {
  KvCUnparamSymbol* s = placed("s", staticLocal, innerBlock);
  step.body().stmt(app.varDef(s, {}));
  KvCUnparamSymbol* loose = placed("loose", local, innerBlock);
  KvCUnparamSymbol* atFileScope = placed("atFileScope", local, innerBlock);
  app.fileScope().stmt(app.varDef(atFileScope, {}));
  KvCUnparamSymbol* classless = app.variable("classless", app.int16(), false);
  step.body().stmt(app.varDef(classless, {}));
  buildDatabases();
  for (KvCUnparamSymbol* v : {s, loose, atFileScope}) {
    SCOPED_TRACE(v->getName().str());
    EXPECT_FALSE(moveToBaseScope(v));
    EXPECT_TRUE(innerBlock->holdsSymbol(v));
    EXPECT_TRUE(named(innerBlock, v->getName().c_str()));
  }
  EXPECT_FALSE(moveToBaseScope(classless));
  bool moved = true;
  EXPECT_TRUE(mover.moveLocalVarToFcnBaseScope(nullptr, moved));
  EXPECT_FALSE(moved);
}

// --- the table answers another symbol

TEST_F(MoverTest, EnterSymbolHandsBackWhatTheTableHoldsUnderTheName) {
  KvCParamSymbol* limitFunction = app.function("limit").symbol();
  app.place(limitFunction, global, ctrlC);
  KvCUnparamSymbol* limitVariable = app.variable("limit", app.int16(), false);

  KvCUnparamSymbol* asVariable = limitVariable;
  EXPECT_TRUE(mover.enterSymbol(asVariable, ctrlC));
  EXPECT_EQ(asVariable, nullptr); // the held symbol is a function
  KvCSymbol* asSymbol = limitVariable;
  EXPECT_TRUE(mover.enterSymbol(asSymbol, ctrlC));
  EXPECT_EQ(asSymbol, limitFunction);
  KvCParamSymbol* asFunction = app.function("other").symbol();
  KvCSymbol* probe = app.variable("other", app.int16(), false);
  app.place(probe, global, ctrlC);
  EXPECT_TRUE(mover.enterSymbol(asFunction, ctrlC));
  EXPECT_EQ(asFunction, nullptr); // the held symbol is a variable
  EXPECT_FALSE(ctrlC->holdsSymbol(limitVariable));
  EXPECT_EQ(limitVariable->getStt(), nullptr);

  KvCUnparamSymbol* first = placed("speed", global, innerBlock);
  KvCUnparamSymbol* second = app.variable("speed", app.int16(), false);
  KvCUnparamSymbol* entered = second;
  EXPECT_TRUE(mover.enterSymbol(entered, innerBlock));
  EXPECT_EQ(entered, first);
  KvCParamSymbol* fresh = app.function("fresh").symbol();
  KvCParamSymbol* same = fresh;
  EXPECT_TRUE(mover.enterSymbol(same, ctrlC));
  EXPECT_EQ(same, fresh);
  EXPECT_TRUE(ctrlC->holdsSymbol(fresh));
}

TEST_F(MoverTest, ClassChangeIntoATableHoldingTheNameLeavesTheHeldSymbol) {
  KvCUnparamSymbol* held = placed("n", local, stepBody);
  KvCUnparamSymbol* n = placed("n", global, ctrlC);
  bool moved = false;
  EXPECT_TRUE(mover.clearGlobalDefineLocal(n, stepBody, local, moved));
  EXPECT_TRUE(moved);
  EXPECT_TRUE(stepBody->holdsSymbol(held));
  EXPECT_FALSE(stepBody->holdsSymbol(n));
  EXPECT_FALSE(ctrlC->holdsSymbol(n));
  EXPECT_EQ(n->getStt(), nullptr);
  EXPECT_EQ(held->getStt(), stepBody);
}

// --- missing pieces

TEST_F(MoverTest, MissingArgumentsOrClassesChangeNothing) {
  KvCUnparamSymbol* g = placed("g", global, ctrlC);
  KvCUnparamSymbol* unplaced = app.variable("unplaced", app.int16(), false);
  KvCUnparamSymbol* classless = app.variable("classless", app.int16(), false);
  KvCSymbol* entered = classless;
  ctrlC->enterSymbol(entered);
  struct Call {
    const char* what;
    KvCSymbol* symbol;
    KvCCStmTable* table;
    KvCSmbClassId* cls;
  };
  for (const Call& call :
       {Call{"null symbol", nullptr, stepBody, local}, Call{"null table", g, nullptr, local},
        Call{"null class", g, stepBody, nullptr},
        Call{"symbol in no table", unplaced, stepBody, local}}) {
    SCOPED_TRACE(call.what);
    for (const ClassChangeCase& c : classChanges()) {
      bool moved = true;
      EXPECT_TRUE((mover.*c.change)(call.symbol, call.table, call.cls, moved));
      EXPECT_FALSE(moved);
    }
  }
  bool moved = true;
  EXPECT_TRUE(mover.moveLocalVar(classless, ctrlC, stepBody, moved));
  EXPECT_FALSE(moved);
  EXPECT_TRUE(mover.moveLocalVar(g, ctrlC, nullptr, moved));
  EXPECT_FALSE(moved);
  EXPECT_TRUE(mover.removeSymbol(nullptr, ctrlC));
  EXPECT_TRUE(mover.removeSymbol(g, nullptr));
  EXPECT_TRUE(mover.removeSymbol(classless, ctrlC));
  KvCSymbol* none = nullptr;
  EXPECT_TRUE(mover.enterSymbol(none, ctrlC));
  EXPECT_EQ(none, nullptr);
  EXPECT_TRUE(ctrlC->holdsSymbol(g));
  EXPECT_TRUE(ctrlC->holdsSymbol(classless));
  EXPECT_TRUE(named(ctrlC, "g"));
  EXPECT_TRUE(reserved("g"));
  EXPECT_EQ(g->getSmbClassId(), global);
  EXPECT_FALSE(stepBody->holdsSymbol(unplaced));
}

TEST_F(MoverTest, TablesWithoutNameSpaceOrFileLinksSkipOnlyWhatTheyLack) {
  // A table without name space, a file in no code unit, a file whose complementary file
  // has no name space or no statement table: the move happens, the reachable name spaces
  // are cleared.
  KvCCStmTable* bare = step.body().block().table();
  KvCUnparamSymbol* a = placed("a", local, bare);
  bool moved = false;
  mover.clearStaticLocalDefineLocal(a, stepBody, local, moved);
  EXPECT_TRUE(moved);
  EXPECT_TRUE(named(stepBody, "a"));
  EXPECT_EQ(a->getStt(), stepBody);

  KvCIcFileId* orphan = app.data().getFileServer()->demandFile("orphan.c"); // no code unit
  KvCIcFileId* orphanH = app.data().getFileServer()->demandFile("orphan.h");
  orphan->getFile()->setComplementaryFile(orphanH); // orphan.h's table has no name space
  KvCCStmTable* orphanC = orphan->getFile()->getStt();
  app.nameSpace(orphanC);
  KvCUnparamSymbol* b = placed("b", global, orphanC);
  app.potentialGlobals()->add("b");
  mover.clearGlobalDefineLocal(b, stepBody, local, moved);
  EXPECT_TRUE(moved);
  EXPECT_FALSE(named(orphanC, "b"));
  EXPECT_TRUE(reserved("b")); // the orphan's sub-application is not known
  EXPECT_TRUE(stepBody->holdsSymbol(b));

  KvCUnparamSymbol* c = placed("c", global, ctrlC);
  app.nameSpace(ctrlH)->add("c");
  KvCCStmTable* headerTable = ctrlH;
  KvCIcFileId* header = ctrl->getFile()->getComplementaryFile();
  header->getFile()->setStatementTable(nullptr);
  mover.clearGlobalDefineLocal(c, stepBody, local, moved);
  header->getFile()->setStatementTable(headerTable);
  EXPECT_TRUE(moved);
  EXPECT_TRUE(named(ctrlH, "c"));
  EXPECT_FALSE(reserved("c"));
  EXPECT_TRUE(stepBody->holdsSymbol(c));
}

} // namespace
