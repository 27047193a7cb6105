// The structure tool on a nested component s.in.x (struct Outer { struct Inner in; },
// struct Inner { Int16 x; }): every combination of const, volatile and address qualifier
// (none, default, other) on the five sources the walk reads, against a small reference of
// the merge rules; components of arrays of structures; and the walk's ends at missing
// pieces.
#include "HulCvTools/SymbolTools/KvCCvStructTool.h"
#include "platform/builder/AppBuilder.h"
#include "platform/icode/KvCAddressQualifier.h"
#include "platform/icode/KvCUnparamSymbol.h"

#include <gtest/gtest.h>

#include <array>
#include <string>

namespace {

struct Specifiers {
  bool isConst = false;
  bool isVolatile = false;
  bool hasQualifier = false;
  KvCAddressQualifier* qualifier = nullptr;
  bool result = false;
};

bool operator==(const Specifiers& a, const Specifiers& b) {
  return a.isConst == b.isConst && a.isVolatile == b.isVolatile &&
         a.hasQualifier == b.hasQualifier && a.qualifier == b.qualifier && a.result == b.result;
}

std::ostream& operator<<(std::ostream& out, const Specifiers& s) {
  return out << "{const " << s.isConst << ", volatile " << s.isVolatile << ", qualified "
             << s.hasQualifier << ", "
             << (s.qualifier ? s.qualifier->getName().str() : std::string("no qualifier"))
             << ", result " << s.result << "}";
}

class StructToolTest : public ::testing::Test {
protected:
  Specifiers specifiersOf(KvCUnparamSymbol* component, bool option = false) {
    Specifiers s{true, true, true, app.addressQualifier("stale"), false};
    s.result = KvCCvStructTool().getStructSpecificTypeSpecifiersOfComp(
        component, app.data().getDataTypeServer(), option, s.isConst, s.isVolatile, s.hasQualifier,
        s.qualifier);
    return s;
  }
  static void give(KvCUnparamSymbol* symbol, bool isConst, bool isVolatile,
                   KvCAddressQualifier* qualifier) {
    symbol->setConst(isConst);
    symbol->setVolatile(isVolatile);
    symbol->setAddressQualifier(qualifier);
  }

  AppBuilder app;
  KV_StructType* inner = app.structType("Inner", {{"x", app.int16()}});
  KV_StructType* outer = app.structType("Outer", {{"in", inner}, {"y", app.int16()}});
  KvCUnparamSymbol* s = app.variable("s", outer);
  KvCUnparamSymbol* sIn = app.member(s, "in");
  KvCUnparamSymbol* sInX = app.member(s, "in.x");
  KvCUnparamSymbol* declIn = app.declaredComponent(outer, "in");
  KvCUnparamSymbol* declX = app.declaredComponent(inner, "x");
  KvCAddressQualifier* defaultQualifier = app.addressQualifier("default", true);
  KvCAddressQualifier* near = app.addressQualifier("__near");
};

// --- every combination against the reference

// A source of specifiers, in the order the walk reads them: instances and the component
// itself report through the specifier query, component declarations are read directly.
struct Source {
  const char* name;
  bool isDeclaration;
};
constexpr std::array<Source, 5> kSources = {{{"s.in", false},
                                             {"s", false},
                                             {"declaration of in", true},
                                             {"declaration of x", true},
                                             {"s.in.x", false}}};

// One source's specifiers: const, volatile, and 0 no qualifier, 1 the default one, 2 another.
struct Given {
  bool isConst;
  bool isVolatile;
  int qualifier;
};

Given decode(int code) { return Given{(code & 1) != 0, (code & 2) != 0, code / 4}; }

Specifiers reference(const std::array<Given, 5>& given,
                     const std::array<KvCAddressQualifier*, 3 * 5>& qualifiers, bool option) {
  Specifiers r;
  r.result = true;
  for (std::size_t i = 0; i < kSources.size(); ++i) {
    if (r.isConst && r.isVolatile && r.hasQualifier)
      break;
    r.isConst = r.isConst || given[i].isConst;
    r.isVolatile = r.isVolatile || given[i].isVolatile;
    KvCAddressQualifier* q = qualifiers[3 * i + static_cast<std::size_t>(given[i].qualifier)];
    const bool isDefault = given[i].qualifier == 1;
    if (r.hasQualifier)
      continue;
    if (!kSources[i].isDeclaration) {
      r.hasQualifier = q && (option || !isDefault);
      r.qualifier = q;
    } else if (q) {
      r.hasQualifier = !isDefault;
      r.qualifier = q;
    }
  }
  return r;
}

TEST_F(StructToolTest, EveryCombinationOfSpecifiersOnInstancesDeclarationsAndComponent) {
  const std::array<KvCUnparamSymbol*, 5> symbols = {sIn, s, declIn, declX, sInX};
  // Per source: no qualifier, a default one, another one (each source its own objects, so
  // that the winner is seen).
  std::array<KvCAddressQualifier*, 3 * 5> qualifiers{};
  for (std::size_t i = 0; i < kSources.size(); ++i) {
    const std::string tag = std::to_string(i);
    qualifiers[3 * i + 1] = app.addressQualifier(("default_" + tag).c_str(), true);
    qualifiers[3 * i + 2] = app.addressQualifier(("section_" + tag).c_str(), false);
  }
  constexpr int kCodes = 12; // 2 const x 2 volatile x 3 qualifiers
  int checked = 0;
  for (int combination = 0; combination < kCodes * kCodes * kCodes * kCodes * kCodes;
       ++combination) {
    std::array<Given, 5> given{};
    for (int i = 0, rest = combination; i < 5; ++i, rest /= kCodes) {
      given[static_cast<std::size_t>(i)] = decode(rest % kCodes);
      const Given& g = given[static_cast<std::size_t>(i)];
      give(symbols[static_cast<std::size_t>(i)], g.isConst, g.isVolatile,
           qualifiers[3 * static_cast<std::size_t>(i) + static_cast<std::size_t>(g.qualifier)]);
    }
    for (bool option : {false, true}) {
      const Specifiers expected = reference(given, qualifiers, option);
      const Specifiers actual = specifiersOf(sInX, option);
      ++checked;
      if (actual == expected)
        continue;
      ADD_FAILURE() << "combination " << combination << " option " << option << ": expected "
                    << expected << ", got " << actual;
      return;
    }
  }
  EXPECT_EQ(checked, 2 * 248832);
}

// --- scenarios

TEST_F(StructToolTest, NonComponentsInheritNothing) {
  give(s, true, true, near);
  EXPECT_EQ(specifiersOf(s), (Specifiers{false, false, false, nullptr, true}));
  EXPECT_EQ(specifiersOf(app.variable("plain", app.int16())),
            (Specifiers{false, false, false, nullptr, true}));
  EXPECT_EQ(specifiersOf(nullptr), (Specifiers{false, false, false, nullptr, true}));
}

TEST_F(StructToolTest, ComponentOfAConstInstanceIsConstAndTheNearestEnclosingQualifierWins) {
  KvCAddressQualifier* far = app.addressQualifier("__far");
  give(s, true, false, far);
  give(sIn, false, false, near);
  EXPECT_EQ(specifiersOf(sInX), (Specifiers{true, false, true, near, true}));
  // For s.in itself, s encloses it: s's qualifier comes before s.in's own.
  EXPECT_EQ(specifiersOf(sIn), (Specifiers{true, false, true, far, true}));
}

TEST_F(StructToolTest, ComponentsOfArraysOfStructuresTakeTheElementsDeclarations) {
  KvCUnparamSymbol* samples = app.variable("samples", app.arrayOf(inner, 4));
  give(samples, false, true, nullptr);
  declX->setConst(true);
  EXPECT_EQ(specifiersOf(app.member(samples, "x")), (Specifiers{true, true, false, nullptr, true}));

  // struct Log { struct Inner items[3]; } log; log.items.x
  KV_StructType* logType = app.structType("Log", {{"items", app.arrayOf(inner, 3)}});
  app.declaredComponent(logType, "items")->setAddressQualifier(near);
  KvCUnparamSymbol* log = app.variable("log", logType);
  EXPECT_EQ(specifiersOf(app.member(log, "items.x")), (Specifiers{true, false, true, near, true}));
}

TEST_F(StructToolTest, CompleteOutermostInstanceConsultsNoDeclaration) {
  // Bare { Inner in; }: no declaring symbol for `in`.
  KV_StructType* bare = app.structType("Bare", {{"in", inner}});
  KvCUnparamSymbol* b = app.variable("b", bare);
  KvCUnparamSymbol* bInX = app.member(b, "in.x");
  give(b, true, true, near);
  EXPECT_EQ(specifiersOf(bInX), (Specifiers{true, true, true, near, true}));
  give(b, true, true, defaultQualifier);
  EXPECT_EQ(specifiersOf(bInX, true), (Specifiers{true, true, true, defaultQualifier, true}));
  EXPECT_EQ(specifiersOf(bInX, false), (Specifiers{true, true, false, defaultQualifier, false}));
}

TEST_F(StructToolTest, MissingDeclarationEndsWithFalseAndKeepsWhatWasFound) {
  // Holder { Inner in; Int16 z; } with `in` declared volatile and a default qualifier; the
  // declaration of x has no declaring symbol in Plain { Int16 x; }.
  KV_StructType* plain = app.structType("Plain", {{"x", app.int16()}});
  KV_StructType* holder = app.structType("Holder", {{"in", plain}});
  KvCUnparamSymbol* h = app.variable("h", holder);
  give(h, true, false, nullptr);
  give(app.declaredComponent(holder, "in"), false, true, defaultQualifier);
  EXPECT_EQ(specifiersOf(app.member(h, "in.x")),
            (Specifiers{true, true, false, defaultQualifier, false}));
  // A declaring symbol for x, and the walk reaches the component itself, whose own report
  // replaces the qualifier that did not count.
  app.declaredComponent(plain, "x");
  EXPECT_EQ(specifiersOf(app.member(h, "in.x")), (Specifiers{true, true, false, nullptr, true}));
}

} // namespace
