#include "HulCvTools/InlineSymbolDb/KvCInlineSymbolDb.h"
#include "tests/CountingMemory.h"

#include "platform/icode/KvCUnparamSymbol.h"
#include "platform/support/KvCCountingMemController.h"
#include "platform/support/KvCMemController.h"
#include "tests/InlineSymbolDb/InlineSymbolDbFixture.h"

#include <gtest/gtest.h>

#include <memory>
#include <string>
#include <vector>

namespace {

using Checks = std::vector<std::string>;

class InlineSymbolDbTest : public InlineSymbolDbFixture {
protected:
  // Point { x, y }
  KV_StructType* point() {
    return app.structType("Point", {{"x", app.int16()}, {"y", app.int16()}});
  }
  // Outer { a, in: Inner { p, q }, b }
  KV_StructType* outer() {
    KV_StructType* inner = app.structType("Inner", {{"p", app.int16()}, {"q", app.int32()}});
    return app.structType("Outer", {{"a", app.int16()}, {"in", inner}, {"b", app.int8()}});
  }

  KvCInlineSymbolDb db;
};

// --- chains

TEST_F(InlineSymbolDbTest, TwoInliningsFormAChainFollowedBothWays) {
  KvCUnparamSymbol* a = scalar("a");
  KvCUnparamSymbol* b = scalar("b");
  KvCUnparamSymbol* c = scalar("c");
  db.mapSymbol(a, b);
  db.mapSymbol(b, c);

  EXPECT_EQ(db.getSinkSymbol(a), b);
  EXPECT_EQ(db.getFinalSinkSymbol(a), c);
  EXPECT_EQ(db.getOriginalSourceSymbol(c), a);
  EXPECT_EQ(db.getSourceSymbol(b), a);
  EXPECT_EQ(db.getSinkSymbol(c), nullptr);
  EXPECT_EQ(db.getFinalSinkSymbol(c), nullptr) << "a symbol is never its own chain end";
  EXPECT_EQ(db.getOriginalSourceSymbol(a), nullptr);
  EXPECT_EQ(db.getNumberOfEntries(), 3);
  EXPECT_TRUE(messages().empty());
}

TEST_F(InlineSymbolDbTest, SymbolNeverMappedAnswersNullToEveryQuery) {
  db.mapSymbol(scalar("a"), scalar("b"));
  KvCUnparamSymbol* lone = scalar("lone");
  EXPECT_EQ(db.getSourceSymbol(lone), nullptr);
  EXPECT_EQ(db.getSinkSymbol(lone), nullptr);
  EXPECT_EQ(db.getOriginalSourceSymbol(lone), nullptr);
  EXPECT_EQ(db.getFinalSinkSymbol(lone), nullptr);
  EXPECT_TRUE(messages().empty());
}

TEST_F(InlineSymbolDbTest, ChainStartHasNoOriginalSourceButAFinalSink) {
  KvCUnparamSymbol* a = scalar("a");
  KvCUnparamSymbol* b = scalar("b");
  KvCUnparamSymbol* c = scalar("c");
  KvCUnparamSymbol* d = scalar("d");
  db.mapSymbol(c, d);
  db.mapSymbol(a, b);
  db.mapSymbol(b, c);
  EXPECT_EQ(db.getOriginalSourceSymbol(a), nullptr);
  EXPECT_EQ(db.getFinalSinkSymbol(a), d);
  EXPECT_EQ(db.getFinalSinkSymbol(b), d);
  EXPECT_EQ(db.getOriginalSourceSymbol(d), a);
}

TEST_F(InlineSymbolDbTest, RemappingASourceMovesItsSinkAndLeavesTheOldSinkPointingBack) {
  KvCUnparamSymbol* a = scalar("a");
  KvCUnparamSymbol* b = scalar("b");
  KvCUnparamSymbol* c = scalar("c");
  db.mapSymbol(a, b);
  db.mapSymbol(a, c);
  EXPECT_EQ(db.getSinkSymbol(a), c);
  EXPECT_EQ(db.getSourceSymbol(c), a);
  EXPECT_EQ(db.getSourceSymbol(b), a);
  EXPECT_EQ(db.getOriginalSourceSymbol(b), a);
  EXPECT_EQ(db.getFinalSinkSymbol(a), c);
}

// --- structures

TEST_F(InlineSymbolDbTest, MappingOneComponentMapsTheWholeInstanceComponentByComponent) {
  KvCUnparamSymbol* s1 = app.structVariable("s1", point());
  KvCUnparamSymbol* t1 = app.structVariable("t1", point());
  db.mapSymbol(app.member(s1, "x"), app.member(t1, "x"));

  EXPECT_EQ(db.getSinkSymbol(s1), t1);
  EXPECT_EQ(db.getSourceSymbol(t1), s1);
  EXPECT_EQ(db.getSinkSymbol(app.member(s1, "x")), app.member(t1, "x"));
  EXPECT_EQ(db.getSinkSymbol(app.member(s1, "y")), app.member(t1, "y"));
  EXPECT_EQ(db.getSourceSymbol(app.member(t1, "y")), app.member(s1, "y"));
  EXPECT_EQ(db.getNumberOfEntries(), 6);
  EXPECT_TRUE(messages().empty());
}

TEST_F(InlineSymbolDbTest, NestedInstancesAreJoinedAtEveryLevel) {
  KvCUnparamSymbol* s = app.structVariable("s", outer());
  KvCUnparamSymbol* t = app.structVariable("t", outer());
  db.mapSymbol(s, t);
  for (const char* path : {"a", "in", "in.p", "in.q", "b"}) {
    SCOPED_TRACE(path);
    EXPECT_EQ(db.getSinkSymbol(app.member(s, path)), app.member(t, path));
    EXPECT_EQ(db.getSourceSymbol(app.member(t, path)), app.member(s, path));
  }
  EXPECT_EQ(db.getNumberOfEntries(), 12);
}

TEST_F(InlineSymbolDbTest, NestedComponentMapsItsOwnInstanceNotTheOuterOne) {
  KvCUnparamSymbol* s = app.structVariable("s", outer());
  KvCUnparamSymbol* t = app.structVariable("t", outer());
  db.mapSymbol(app.member(s, "in.q"), app.member(t, "in.q"));
  EXPECT_EQ(db.getSinkSymbol(app.member(s, "in")), app.member(t, "in"));
  EXPECT_EQ(db.getSinkSymbol(app.member(s, "in.p")), app.member(t, "in.p"));
  EXPECT_EQ(db.getSinkSymbol(s), nullptr);
  EXPECT_EQ(db.getSinkSymbol(app.member(s, "a")), nullptr);
}

TEST_F(InlineSymbolDbTest, StructureChainsFollowEveryComponentThroughTwoInlinings) {
  KvCUnparamSymbol* s = app.structVariable("s", outer());
  KvCUnparamSymbol* t = app.structVariable("t", outer());
  KvCUnparamSymbol* u = app.structVariable("u", outer());
  db.mapSymbol(app.member(s, "a"), app.member(t, "a"));
  db.mapSymbol(t, u);
  EXPECT_EQ(db.getFinalSinkSymbol(app.member(s, "in.p")), app.member(u, "in.p"));
  EXPECT_EQ(db.getOriginalSourceSymbol(app.member(u, "b")), app.member(s, "b"));
}

TEST_F(InlineSymbolDbTest, SinkWithFewerComponentsReportsEachUnmatchedSourceComponent) {
  KV_StructType* big =
      app.structType("Big", {{"x", app.int16()}, {"y", app.int16()}, {"z", app.int16()}});
  KV_StructType* small = app.structType("Small", {{"x", app.int16()}});
  KvCUnparamSymbol* s = app.structVariable("s", big);
  KvCUnparamSymbol* t = app.structVariable("t", small);
  db.mapSymbol(s, t);

  EXPECT_EQ(internalChecks(), (Checks{"KvCInlineSymbolDb 220", "KvCInlineSymbolDb 220"}));
  EXPECT_EQ(db.getSinkSymbol(s), t);
  EXPECT_EQ(db.getSinkSymbol(app.member(s, "x")), app.member(t, "x"));
  EXPECT_EQ(db.getSinkSymbol(app.member(s, "y")), nullptr);
  EXPECT_EQ(db.getSinkSymbol(app.member(s, "z")), nullptr);
}

TEST_F(InlineSymbolDbTest, SourceSlotsWithoutSymbolAreSkippedSilently) {
  KvCUnparamSymbol* s = app.variable("s", point()); // components made on demand only
  KvCUnparamSymbol* t = app.structVariable("t", point());
  KvCUnparamSymbol* sy = app.member(s, "y");
  db.mapSymbol(s, t);
  EXPECT_EQ(db.getSinkSymbol(sy), app.member(t, "y"));
  EXPECT_EQ(db.getNumberOfEntries(), 4);
  EXPECT_TRUE(messages().empty());
}

TEST_F(InlineSymbolDbTest, CompleteDbJoinsComponentsMadeAfterTheMapping) {
  KvCUnparamSymbol* s = app.variable("s", outer());
  KvCUnparamSymbol* t = app.variable("t", outer());
  db.mapSymbol(s, t);
  KvCUnparamSymbol* sp = app.member(s, "in.p");
  KvCUnparamSymbol* tp = app.member(t, "in.p");
  EXPECT_EQ(db.getSinkSymbol(sp), nullptr);

  EXPECT_TRUE(db.completeDb());
  EXPECT_EQ(db.getSinkSymbol(sp), tp);
  EXPECT_EQ(db.getSinkSymbol(app.member(s, "in")), app.member(t, "in"));
  EXPECT_TRUE(db.completeDb()) << "repeatable";
  EXPECT_EQ(db.getNumberOfEntries(), 6);
}

TEST_F(InlineSymbolDbTest, ComponentWithoutInstanceIsMappedOnItsOwn) {
  KvCUnparamSymbol* free = app.component("free", app.int16());
  KvCUnparamSymbol* t = app.structVariable("t", point());
  KvCUnparamSymbol* v = scalar("v");
  db.mapSymbol(free, app.member(t, "x"));
  db.mapSymbol(app.member(t, "y"), v); // sink outside any instance
  EXPECT_EQ(db.getSinkSymbol(free), app.member(t, "x"));
  EXPECT_EQ(db.getSinkSymbol(app.member(t, "y")), v);
  EXPECT_EQ(db.getSinkSymbol(t), nullptr);
  EXPECT_TRUE(messages().empty());
}

// --- failures

TEST_F(InlineSymbolDbTest, NullArgumentsAreInternalChecksAndChangeNothing) {
  KvCUnparamSymbol* a = scalar("a");
  db.mapSymbol(nullptr, a);
  db.mapSymbol(a, nullptr);
  EXPECT_EQ(db.getNumberOfEntries(), 0);
  EXPECT_EQ(db.getSourceSymbol(nullptr), nullptr);
  EXPECT_EQ(db.getSinkSymbol(nullptr), nullptr);
  EXPECT_EQ(db.getOriginalSourceSymbol(nullptr), nullptr);
  EXPECT_EQ(db.getFinalSinkSymbol(nullptr), nullptr);
  EXPECT_EQ(internalChecks(),
            (Checks{"KvCInlineSymbolDb 79", "KvCInlineSymbolDb 80", "KvCInlineSymbolDb 98",
                    "KvCInlineSymbolDb 113", "KvCInlineSymbolDb 129", "KvCInlineSymbolDb 151"}));
}

// --- cycles

TEST_F(InlineSymbolDbTest, ChainQueriesEndOnACycleAtTheLastSymbolBeforeComingRound) {
  KvCUnparamSymbol* a = scalar("a");
  KvCUnparamSymbol* b = scalar("b");
  KvCUnparamSymbol* c = scalar("c");
  db.mapSymbol(a, b);
  db.mapSymbol(b, c);
  db.mapSymbol(c, a);
  EXPECT_EQ(db.getFinalSinkSymbol(a), c);
  EXPECT_EQ(db.getFinalSinkSymbol(b), a);
  EXPECT_EQ(db.getOriginalSourceSymbol(a), b);
  EXPECT_EQ(db.getOriginalSourceSymbol(c), a);
}

TEST_F(InlineSymbolDbTest, ChainQueriesEndOnACycleTheWalkEntersLater) {
  KvCUnparamSymbol* a = scalar("a");
  KvCUnparamSymbol* b = scalar("b");
  KvCUnparamSymbol* c = scalar("c");
  db.mapSymbol(a, b);
  db.mapSymbol(b, c);
  db.mapSymbol(c, b); // b's source becomes c
  EXPECT_EQ(db.getFinalSinkSymbol(a), c);
  EXPECT_EQ(db.getOriginalSourceSymbol(a), nullptr);
  EXPECT_EQ(db.getOriginalSourceSymbol(c), b);
}

TEST_F(InlineSymbolDbTest, SymbolMappedOntoItselfHasNoChainEnd) {
  KvCUnparamSymbol* a = scalar("a");
  db.mapSymbol(a, a);
  EXPECT_EQ(db.getSinkSymbol(a), a);
  EXPECT_EQ(db.getSourceSymbol(a), a);
  EXPECT_EQ(db.getFinalSinkSymbol(a), nullptr);
  EXPECT_EQ(db.getOriginalSourceSymbol(a), nullptr);
}

TEST_F(InlineSymbolDbTest, CycleThroughStructuresEnds) {
  KvCUnparamSymbol* s = app.structVariable("s", outer());
  KvCUnparamSymbol* t = app.structVariable("t", outer());
  db.mapSymbol(s, t);
  db.mapSymbol(app.member(t, "in.p"), app.member(s, "in.p"));
  EXPECT_EQ(db.getFinalSinkSymbol(app.member(s, "in.q")), app.member(t, "in.q"));
  EXPECT_EQ(db.getFinalSinkSymbol(app.member(t, "in.q")), app.member(s, "in.q"));
  EXPECT_EQ(db.getFinalSinkSymbol(s), t) << "the outer instances were not remapped";
}

// --- copies

TEST_F(InlineSymbolDbTest, CopiesAreDeepAndOutliveTheOriginal) {
  KvCUnparamSymbol* a = scalar("a");
  KvCUnparamSymbol* b = scalar("b");
  KvCUnparamSymbol* c = scalar("c");
  auto original = std::make_unique<KvCInlineSymbolDb>();
  original->mapSymbol(a, b);
  original->mapSymbol(b, c);
  KvCInlineSymbolDb copy(*original);
  KvCInlineSymbolDb assigned;
  assigned.mapSymbol(c, a);
  assigned = *original;
  original->mapSymbol(a, c);
  original.reset();

  for (KvCInlineSymbolDb* d : {&copy, &assigned}) {
    EXPECT_EQ(d->getNumberOfEntries(), 3);
    EXPECT_EQ(d->getSinkSymbol(a), b);
    EXPECT_EQ(d->getFinalSinkSymbol(a), c);
    EXPECT_EQ(d->getOriginalSourceSymbol(c), a);
    EXPECT_EQ(d->getSinkSymbol(c), nullptr);
  }
  KvCInlineSymbolDb& self = copy;
  copy = self;
  EXPECT_EQ(copy.getFinalSinkSymbol(a), c);
}

// --- memory

TEST_F(InlineSymbolDbTest, EveryBlockGoesBackAfterDestructionOfDatabaseAndCopies) {
  KvCUnparamSymbol* s = app.structVariable("s", outer());
  KvCUnparamSymbol* t = app.structVariable("t", outer());
  KvCUnparamSymbol* a = scalar("a");
  KvCUnparamSymbol* b = scalar("b");
  CountingMemory memory;
  {
    auto* d = new KvCInlineSymbolDb;
    ASSERT_NE(d, nullptr);
    d->mapSymbol(s, t);
    d->mapSymbol(a, b);
    d->mapSymbol(b, a);
    EXPECT_TRUE(d->completeDb());
    EXPECT_EQ(memory.controller.getOutstandingBlocks(), 1u + 14u) << "database and entries";
    KvCInlineSymbolDb copy(*d);
    copy = *d;
    EXPECT_EQ(memory.controller.getOutstandingBlocks(), 1u + 14u + 14u);
    delete d;
  }
  EXPECT_EQ(memory.controller.getTotalBlocks(), 1u + 14u + 14u + 14u);
  EXPECT_EQ(memory.controller.getOutstandingBlocks(), 0u);
  EXPECT_EQ(memory.controller.getForeignFrees(), 0u);
}

TEST_F(InlineSymbolDbTest, RunningOutOfMemoryIsReportedAndLeavesAConsistentDatabase) {
  KvCUnparamSymbol* s = app.structVariable("s", outer());
  KvCUnparamSymbol* t = app.structVariable("t", outer());
  for (long granted = 0; granted < 12; ++granted) {
    SCOPED_TRACE(granted);
    server().clear();
    CountingMemory memory;
    {
      KvCInlineSymbolDb d;
      memory.controller.failAfter(granted);
      d.mapSymbol(s, t);
      EXPECT_EQ(d.getNumberOfEntries(), granted);
      EXPECT_FALSE(internalChecks().empty());
      for (const std::string& code : internalChecks())
        EXPECT_TRUE(code == "KvCInlineSymbolDb 250" || code == "KvCInlineSymbolDb 220") << code;
      memory.controller.failAfter(-1);
      d.mapSymbol(s, t); // completes what was missing
      EXPECT_EQ(d.getNumberOfEntries(), 12);
      EXPECT_EQ(d.getFinalSinkSymbol(app.member(s, "in.q")), app.member(t, "in.q"));
    }
    EXPECT_EQ(memory.controller.getOutstandingBlocks(), 0u);
  }
}

} // namespace
