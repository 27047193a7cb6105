// Seeded random sequences of mappings over scalars and over flat, nested and partly made
// structure instances, checked after every step against a plain reference: two maps of
// direct links, structures joined slot by slot through the model's component symbols, and
// chain walks with a set of visited symbols.
#include "HulCvTools/InlineSymbolDb/KvCInlineSymbolDb.h"

#include "platform/icode/KvCUnparamSymbol.h"
#include "tests/InlineSymbolDb/InlineSymbolDbFixture.h"

#include <gtest/gtest.h>

#include <map>
#include <random>
#include <set>
#include <string>
#include <vector>

namespace {

class Reference {
public:
  void mapSymbol(KvCUnparamSymbol* source, KvCUnparamSymbol* sink) {
    if (source->isComponent() && source->getStructSymbol() && sink->getStructSymbol())
      link(source->getStructSymbol(), sink->getStructSymbol());
    else
      link(source, sink);
  }

  KvCUnparamSymbol* source(KvCUnparamSymbol* s) const { return lookup(sources, s); }
  KvCUnparamSymbol* sink(KvCUnparamSymbol* s) const { return lookup(sinks, s); }
  KvCUnparamSymbol* originalSource(KvCUnparamSymbol* s) const { return walk(sources, s); }
  KvCUnparamSymbol* finalSink(KvCUnparamSymbol* s) const { return walk(sinks, s); }
  int unmatchedComponents() const { return unmatched; }
  std::size_t symbolsMapped() const { return mapped.size(); }

private:
  using Links = std::map<KvCUnparamSymbol*, KvCUnparamSymbol*>;

  static int slots(const KvCUnparamSymbol* s) {
    KV_DataType* type = s->getDataType();
    return type && type->asStructType() ? type->asStructType()->getNumberOfComponents() : 0;
  }

  void link(KvCUnparamSymbol* source, KvCUnparamSymbol* sink) {
    sinks[source] = sink;
    sources[sink] = source;
    mapped.insert(source);
    mapped.insert(sink);
    for (int i = 0; i < slots(source); ++i) {
      KvCUnparamSymbol* from = source->getComponentSymbol(i);
      if (!from)
        continue;
      KvCUnparamSymbol* to = i < slots(sink) ? sink->getComponentSymbol(i) : nullptr;
      if (to)
        link(from, to);
      else
        ++unmatched;
    }
  }

  static KvCUnparamSymbol* lookup(const Links& links, KvCUnparamSymbol* s) {
    auto it = links.find(s);
    return it == links.end() ? nullptr : it->second;
  }

  static KvCUnparamSymbol* walk(const Links& links, KvCUnparamSymbol* start) {
    std::set<KvCUnparamSymbol*> seen{start};
    KvCUnparamSymbol* last = nullptr;
    for (KvCUnparamSymbol* next = lookup(links, start); next && seen.insert(next).second;
         next = lookup(links, next))
      last = next;
    return last;
  }

  Links sources;
  Links sinks;
  std::set<KvCUnparamSymbol*> mapped;
  int unmatched = 0;
};

class InlineSymbolDbRandomTest : public InlineSymbolDbFixture {
protected:
  // Scalars, flat and nested instances (some with only a few component symbols), and all
  // their component symbols.
  std::vector<KvCUnparamSymbol*> makeUniverse() {
    KV_StructType* flat =
        app.structType("Flat", {{"a", app.int16()}, {"b", app.int16()}, {"c", app.int32()}});
    KV_StructType* small = app.structType("Small", {{"a", app.int16()}});
    KV_StructType* inner = app.structType("Inner", {{"p", app.int16()}, {"q", app.int16()}});
    KV_StructType* outer =
        app.structType("Outer", {{"x", app.int16()}, {"in", inner}, {"y", app.int8()}});
    KV_StructType* deep = app.structType("Deep", {{"o", outer}, {"z", app.int16()}});

    std::vector<KvCUnparamSymbol*> all;
    auto addWithComponents = [&all](KvCUnparamSymbol* root) {
      std::vector<KvCUnparamSymbol*> stack{root};
      while (!stack.empty()) {
        KvCUnparamSymbol* s = stack.back();
        stack.pop_back();
        all.push_back(s);
        KV_DataType* type = s->getDataType();
        for (int i = 0; type->asStructType() && i < type->asStructType()->getNumberOfComponents();
             ++i)
          if (KvCUnparamSymbol* c = s->getComponentSymbol(i))
            stack.push_back(c);
      }
    };
    int n = 0;
    auto name = [&n](const char* stem) { return std::string(stem) + std::to_string(n++); };
    for (int i = 0; i < 6; ++i)
      all.push_back(scalar(name("v").c_str()));
    for (KV_StructType* type : {flat, small, inner, outer, deep})
      for (int i = 0; i < 3; ++i)
        addWithComponents(app.structVariable(name(type->getName().c_str()).c_str(), type));
    KvCUnparamSymbol* partialFlat = app.variable("partialFlat", flat);
    app.member(partialFlat, "b");
    addWithComponents(partialFlat);
    KvCUnparamSymbol* partialOuter = app.variable("partialOuter", outer);
    app.member(partialOuter, "in.q");
    app.member(partialOuter, "y");
    addWithComponents(partialOuter);
    return all;
  }
};

TEST_F(InlineSymbolDbRandomTest, EveryQueryAgreesWithTheReferenceAfterEveryMapping) {
  const std::vector<KvCUnparamSymbol*> all = makeUniverse();
  for (unsigned seed = 1; seed <= 24; ++seed) {
    SCOPED_TRACE(seed);
    server().clear();
    std::mt19937 random(seed);
    // Small seeds keep to a few symbols, so that chains grow long and cycles close.
    const std::size_t span = seed % 3 == 0 ? 8 : all.size();
    std::uniform_int_distribution<std::size_t> pick(0, span - 1);
    KvCInlineSymbolDb db;
    Reference reference;
    for (int step = 0; step < 150; ++step) {
      KvCUnparamSymbol* source = all[pick(random)];
      KvCUnparamSymbol* sink = all[pick(random)];
      db.mapSymbol(source, sink);
      reference.mapSymbol(source, sink);
      for (KvCUnparamSymbol* s : all) {
        ASSERT_EQ(db.getSourceSymbol(s), reference.source(s)) << step << " " << s->getName().str();
        ASSERT_EQ(db.getSinkSymbol(s), reference.sink(s)) << step << " " << s->getName().str();
        ASSERT_EQ(db.getOriginalSourceSymbol(s), reference.originalSource(s))
            << step << " " << s->getName().str();
        ASSERT_EQ(db.getFinalSinkSymbol(s), reference.finalSink(s))
            << step << " " << s->getName().str();
      }
      ASSERT_EQ(static_cast<std::size_t>(db.getNumberOfEntries()), reference.symbolsMapped());
    }
    std::vector<std::string> expected(static_cast<std::size_t>(reference.unmatchedComponents()),
                                      "KvCInlineSymbolDb 220");
    EXPECT_EQ(internalChecks(), expected);
    // Copies answer like the original.
    KvCInlineSymbolDb copy(db);
    for (KvCUnparamSymbol* s : all) {
      ASSERT_EQ(copy.getFinalSinkSymbol(s), db.getFinalSinkSymbol(s));
      ASSERT_EQ(copy.getOriginalSourceSymbol(s), db.getOriginalSourceSymbol(s));
    }
  }
}

} // namespace
