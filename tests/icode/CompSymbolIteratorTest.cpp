// Structure instances, their component symbols and KvCCompSymbolIterator's walks.
#include "platform/builder/AppBuilder.h"
#include "platform/icode/KV_SymbolDB.h"
#include "platform/icode/KvCCompSymbolIterator.h"
#include "platform/icode/KvCUnparamSymbol.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

namespace {

// Names of the slots walked; "-" for a slot without symbol.
std::vector<std::string> walk(KvCSymbol* s, bool allSlots, bool nested, bool structComponents) {
  std::vector<std::string> names;
  for (KvCCompSymbolIterator it(s, allSlots, nested, structComponents); !it.finished(); it.next())
    names.push_back(it.isValidComponent() ? it.getComponent()->getName().str() : "-");
  return names;
}

using Names = std::vector<std::string>;

class CompSymbolIteratorTest : public ::testing::Test {
protected:
  CompSymbolIteratorTest() {
    KV_StructType* inner = app.structType("Inner", {{"p", app.int16()}, {"q", app.int16()}});
    outer = app.structType("Outer", {{"a", app.int16()}, {"in", inner}, {"b", app.int8()}});
  }
  AppBuilder app;
  KV_StructType* outer;
};

TEST_F(CompSymbolIteratorTest, ComponentsKnowTheirInstanceAndSlot) {
  KvCUnparamSymbol* s = app.structVariable("s", outer);
  KvCUnparamSymbol* p = app.member(s, "in.p");
  EXPECT_TRUE(s->isStructInstance());
  EXPECT_FALSE(s->isComponent());
  EXPECT_TRUE(p->isComponent());
  EXPECT_FALSE(p->isStructInstance());
  EXPECT_EQ(p->getStructSymbol(), app.member(s, "in"));
  EXPECT_EQ(app.member(s, "in")->getStructSymbol(), s);
  EXPECT_EQ(p->getComponentIndex(), 0);
  EXPECT_EQ(app.data().getSymbolDB()->demandComponentSymbol(s, 1), app.member(s, "in"));
  EXPECT_EQ(app.data().getSymbolDB()->demandComponentSymbol(s, 3), nullptr);
  EXPECT_EQ(app.data().getSymbolDB()->demandComponentSymbol(p, 0), nullptr);
  EXPECT_EQ(app.data().getSymbolDB()->findSymbol("p"), nullptr) << "components have no scope";
}

TEST_F(CompSymbolIteratorTest, FlagsChooseSlotsLevelsAndStructureComponents) {
  KvCUnparamSymbol* full = app.structVariable("full", outer);
  EXPECT_EQ(walk(full, true, false, true), (Names{"a", "in", "b"}));
  EXPECT_EQ(walk(full, true, true, true), (Names{"a", "in", "p", "q", "b"}));
  EXPECT_EQ(walk(full, true, true, false), (Names{"a", "p", "q", "b"}));
  EXPECT_EQ(walk(full, true, false, false), (Names{"a", "b"}));

  KvCUnparamSymbol* partial = app.variable("partial", outer);
  app.member(partial, "in.q");
  EXPECT_EQ(walk(partial, true, false, true), (Names{"-", "in", "-"}));
  EXPECT_EQ(walk(partial, false, false, true), (Names{"in"}));
  EXPECT_EQ(walk(partial, true, true, true), (Names{"-", "in", "-", "q", "-"}));
  EXPECT_EQ(walk(partial, false, true, false), (Names{"q"}));
}

TEST_F(CompSymbolIteratorTest, WalkOverNonInstanceIsFinishedAtOnce) {
  KvCUnparamSymbol* v = app.variable("v", app.int16());
  KvCCompSymbolIterator it(v, true, false, true);
  EXPECT_TRUE(it.finished());
  EXPECT_FALSE(it.isValidComponent());
  EXPECT_EQ(it.getComponent(), nullptr);
  it.next();
  EXPECT_TRUE(it.finished());
  EXPECT_TRUE(walk(nullptr, true, true, true).empty());
  EXPECT_TRUE(walk(app.variable("e", app.structType("Empty", {})), true, true, true).empty());
}

} // namespace
