#include "HulCvTools/SubtreeComparer/KvCICodeSubtreeComparer.h"
#include "platform/builder/AppBuilder.h"
#include "platform/icode/KV_Constant.h"
#include "platform/icode/KV_ExprLocation.h"
#include "platform/icode/KV_ICodeFactoryContainer.h"
#include "platform/icode/KV_Operation.h"
#include "platform/icode/KV_QualifiedSymbolOp.h"
#include "platform/icode/KV_SymbolDB.h"

#include <gtest/gtest.h>

#include <random>
#include <vector>

namespace {

using Cmp = KvCICodeSubtreeComparer;

KV_QualifiedSymbolOp* qsoOf(KV_ExprLocation* loc) { return loc->getQualifiedSymbolOp(); }

// ---------------------------------------------------------------- fixed scenarios

class SubtreeComparerTest : public ::testing::Test {
protected:
  AppBuilder app;
  KvCUnparamSymbol* x = app.variable("x", app.boolean());
  KvCUnparamSymbol* y = app.variable("y", app.boolean());
  KvCUnparamSymbol* u = app.variable("u", app.uint16());
  KvCUnparamSymbol* i = app.variable("i", app.int16());
  KvCUnparamSymbol* arr = app.variable("a", app.arrayOf(app.int16(), 10));
};

TEST_F(SubtreeComparerTest, AccessesAreComparedByTheAccessAloneNotByScaling) {
  KV_ExprLocation* a = app.access(u);
  KV_ExprLocation* b = app.access(u);
  b->setScaling(app.scaling(0.5));
  EXPECT_TRUE(Cmp::areSubTreesEqual(a, b));
  EXPECT_FALSE(Cmp::areSubTreesEqual(a, app.access(i)));
  EXPECT_FALSE(Cmp::containEqualLogic(a, b)) << "the restricted comparison sees the scaling";
}

TEST_F(SubtreeComparerTest, ConstantsOfDifferentConstantTypesCompareEqualEverywhere) {
  auto sig = [&] { return app.constant(std::int64_t{1}); };
  auto uns = [&] { return app.unsignedConstant(1); };
  EXPECT_TRUE(Cmp::areSubTreesEqual(sig(), uns()));
  EXPECT_TRUE(Cmp::containEqualLogic(sig(), uns()));
  EXPECT_TRUE(Cmp::containEqualBitOps(sig(), uns()));
  EXPECT_FALSE(Cmp::areSubTreesEqual(sig(), app.unsignedConstant(2)));
  KV_ExprLocation* a = app.element(arr, {app.add(app.access(i), sig())});
  KV_ExprLocation* b = app.element(arr, {app.add(app.access(i), uns())});
  EXPECT_TRUE(Cmp::containEqualQsoAndIndexOp(qsoOf(a), qsoOf(b)));
}

TEST_F(SubtreeComparerTest, DoublesMustBeEqualExactly) {
  EXPECT_TRUE(
      Cmp::areSubTreesEqual(app.constant(0.25, app.float64()), app.constant(0.25, app.float64())));
  EXPECT_FALSE(Cmp::areSubTreesEqual(app.constant(0.1 + 0.2, app.float64()),
                                     app.constant(0.3, app.float64())));
}

TEST_F(SubtreeComparerTest, LogicalExpressions) {
  EXPECT_TRUE(Cmp::containEqualLogic(app.logNot(app.access(x)), app.logNot(app.access(x))));
  EXPECT_FALSE(Cmp::containEqualLogic(app.logNot(app.access(x)), app.logNot(app.access(y))));
  auto both = [&] { return app.logAnd(app.access(x), app.access(y)); };
  EXPECT_TRUE(Cmp::containEqualLogic(both(), both(), false));
  EXPECT_FALSE(Cmp::containEqualLogic(both(), both(), true));
  EXPECT_TRUE(Cmp::containEqualLogic(app.logNot(app.access(x)), app.logNot(app.access(x)), true));
  EXPECT_FALSE(Cmp::containEqualLogic(both(), app.logOr(app.access(x), app.access(y))));
  auto rel = [&] { return app.less(app.access(i), app.constant(std::int64_t{3})); };
  EXPECT_FALSE(Cmp::containEqualLogic(rel(), rel())) << "relational operators are not logic";
  EXPECT_TRUE(Cmp::areSubTreesEqual(rel(), rel()));
}

TEST_F(SubtreeComparerTest, LogicalExpressionsDifferingInScalingAreNotEqual) {
  KV_ExprLocation* a = app.logNot(app.access(x));
  KV_ExprLocation* b = app.logNot(app.access(x));
  b->setScaling(app.scaling(2.0));
  EXPECT_FALSE(Cmp::containEqualLogic(a, b));
  EXPECT_TRUE(Cmp::areSubTreesEqual(a, b));
}

TEST_F(SubtreeComparerTest, ConversionLevelsTakePartInRestrictedComparisons) {
  KV_ExprLocation* a = app.logNot(app.access(x));
  KV_ExprLocation* b = app.logNot(app.access(x));
  a->getOperation()->setConversionLevel(app.data().getConversionLevel(KV_CONV_C_CODE));
  EXPECT_FALSE(Cmp::containEqualLogic(a, b));
  b->getOperation()->setConversionLevel(app.data().getConversionLevel(KV_CONV_C_CODE));
  EXPECT_TRUE(Cmp::containEqualLogic(a, b));
}

TEST_F(SubtreeComparerTest, BitOperationsAndCasts) {
  auto masked = [&] { return app.bitAnd(app.access(u), app.unsignedConstant(0xff)); };
  EXPECT_TRUE(Cmp::containEqualBitOps(masked(), masked()));
  EXPECT_TRUE(Cmp::containEqualBitOps(app.bitNot(app.access(u)), app.bitNot(app.access(u))));
  EXPECT_TRUE(
      Cmp::containEqualBitOps(app.cast(app.uint8(), masked()), app.cast(app.uint8(), masked())));
  EXPECT_FALSE(
      Cmp::containEqualBitOps(app.cast(app.uint8(), masked()), app.cast(app.uint16(), masked())));
  EXPECT_FALSE(Cmp::containEqualBitOps(app.add(app.access(u), app.access(u)),
                                       app.add(app.access(u), app.access(u))));
}

TEST_F(SubtreeComparerTest, IndexExpressionsOfArrayAccesses) {
  auto plusOne = [&] {
    return qsoOf(app.element(arr, {app.add(app.access(i), app.constant(std::int64_t{1}))}));
  };
  EXPECT_TRUE(Cmp::containEqualQsoAndIndexOp(plusOne(), plusOne()));
  EXPECT_FALSE(
      Cmp::containEqualQsoAndIndexOp(qsoOf(app.element(arr, {1})), qsoOf(app.element(arr, {2}))));
  EXPECT_TRUE(
      Cmp::containEqualQsoAndIndexOp(qsoOf(app.element(arr, {1})), qsoOf(app.element(arr, {1}))));
  auto viaNeg = [&] { return qsoOf(app.element(arr, {app.neg(app.access(i))})); };
  EXPECT_TRUE(Cmp::containEqualQsoAndIndexOp(viaNeg(), viaNeg()));
  auto viaBitAnd = [&] {
    return qsoOf(app.element(arr, {app.bitAnd(app.access(i), app.constant(std::int64_t{3}))}));
  };
  EXPECT_TRUE(Cmp::containEqualQsoAndIndexOp(viaBitAnd(), viaBitAnd()))
      << "accesses equal as a whole are equal before any index rule applies";
  // Accesses that differ in qualification only reach the index rules.
  KV_QualifiedSymbolOp* a = viaBitAnd();
  a->setStrictlyQualified(true);
  EXPECT_FALSE(Cmp::containEqualQsoAndIndexOp(a, viaBitAnd())) << "bit-and is no index operator";
  KV_QualifiedSymbolOp* b = plusOne();
  b->setStrictlyQualified(true);
  EXPECT_TRUE(Cmp::containEqualQsoAndIndexOp(b, plusOne()));
}

TEST_F(SubtreeComparerTest, ScalarAccessesAreEqualOnlyWhenTheAccessesAre) {
  EXPECT_TRUE(Cmp::containEqualQsoAndIndexOp(qsoOf(app.access(i)), qsoOf(app.access(i))));
  KV_QualifiedSymbolOp* a = qsoOf(app.access(i));
  KV_QualifiedSymbolOp* b = qsoOf(app.access(i));
  b->setStrictlyQualified(true);
  EXPECT_FALSE(Cmp::containEqualQsoAndIndexOp(a, b)) << "no indices: not accepted here";
}

TEST_F(SubtreeComparerTest, IndexExpressionsWithCastsCompareTargetTypesByReference) {
  auto castIndex = [&](KV_DataType* t) {
    KV_QualifiedSymbolOp* q =
        qsoOf(app.element(arr, {app.cast(t, app.add(app.access(i), app.access(i)))}));
    q->setStrictlyQualified(t == app.int16());
    return q;
  };
  EXPECT_TRUE(Cmp::containEqualQsoAndIndexOp(castIndex(app.int16()), castIndex(app.int8())) ==
              false);
  KV_QualifiedSymbolOp* a = castIndex(app.int16());
  KV_QualifiedSymbolOp* b =
      qsoOf(app.element(arr, {app.cast(app.int16(), app.add(app.access(i), app.access(i)))}));
  EXPECT_TRUE(Cmp::containEqualQsoAndIndexOp(a, b));
}

TEST_F(SubtreeComparerTest, OperationsNeedTheSameOperatorAndOperandCount) {
  KV_ExprLocation* two = app.op(KV_OP_COMMA, {app.access(i), app.access(u)});
  KV_ExprLocation* three = app.op(KV_OP_COMMA, {app.access(i), app.access(u), app.access(x)});
  EXPECT_FALSE(Cmp::areOperationsEqual(two->getOperation(), three->getOperation()));
  EXPECT_FALSE(Cmp::areSubTreesEqual(app.add(app.access(i), app.access(u)),
                                     app.sub(app.access(i), app.access(u))));
  EXPECT_TRUE(Cmp::areSubTreesEqual(app.string("abc"), app.string("abc")));
  EXPECT_FALSE(Cmp::areSubTreesEqual(app.string("abc"), app.string("abd")));
  EXPECT_TRUE(Cmp::areSubTreesEqual(app.typeRef(app.int16()), app.typeRef(app.int16())));
}

TEST_F(SubtreeComparerTest, MissingElementsAreUnequal) {
  EXPECT_FALSE(Cmp::areSubTreesEqual(nullptr, app.access(i)));
  EXPECT_FALSE(Cmp::areSubTreesEqual(app.empty(), app.empty()));
  EXPECT_FALSE(Cmp::areOperationsEqual(nullptr, nullptr));
  EXPECT_FALSE(Cmp::containEqualLogic(app.access(x), nullptr));
  EXPECT_FALSE(Cmp::containEqualQsoAndIndexOp(qsoOf(app.access(i)), nullptr));
}

// ---------------------------------------------------------------- random trees

enum class Family { Logic, Bits, Index };
enum class Change { None, Leaf, Operator, Type, Scaling };

// Builds a random tree of one operator family. Every node is numbered in creation order;
// the node numbered `changeAt` is built with `change` applied (a leaf change on an inner
// node, or an operator or type change on a leaf, has no effect). Two makers with the same
// seed draw the same random numbers, so their trees differ at most at that node.
class TreeMaker {
public:
  TreeMaker(AppBuilder& builder, Family f, std::uint64_t seed, int changeAt, Change c)
      : app(builder), family(f), rng(seed), target(changeAt), change(c) {
    for (int k = 0; k < 4; ++k) {
      const std::string name = "t" + std::to_string(static_cast<int>(f)) + "_" + std::to_string(k);
      KvCSymbol* existing = builder.data().getSymbolDB()->findSymbol(name.c_str());
      vars.push_back(existing ? existing : builder.variable(name.c_str(), leafType(), false));
    }
  }

  KV_ExprLocation* make(int depth) {
    const int id = next++;
    const bool changed = id == target;
    const bool isLeaf = depth == 0 || pick(4) == 0;
    if (changed)
      changedNodeIsLeaf = isLeaf;
    KV_ExprLocation* loc = isLeaf ? leaf(changed) : inner(depth, changed);
    if (changed && change == Change::Scaling)
      loc->setScaling(app.scaling(0.125));
    return loc;
  }

  int nodes() const { return next; }
  // Whether the change took effect, and whether it changed the tree's structure.
  bool changeIsEffective() const {
    switch (change) {
    case Change::Leaf:
      return changedNodeIsLeaf;
    case Change::Operator:
    case Change::Type:
      return !changedNodeIsLeaf;
    case Change::Scaling:
      return true;
    case Change::None:
      return false;
    }
    return false;
  }
  bool changeIsStructural() const {
    return changeIsEffective() && (change == Change::Leaf || change == Change::Operator);
  }

private:
  KV_DataType* leafType() { return family == Family::Logic ? app.boolean() : app.uint16(); }
  int pick(int n) { return static_cast<int>(rng() % static_cast<std::uint64_t>(n)); }

  KV_ExprLocation* leaf(bool changed) {
    const int v = pick(4);
    const bool asConstant = pick(3) == 0;
    const int shift = changed && change == Change::Leaf ? 1 : 0;
    if (asConstant)
      return app.constant(std::int64_t{v + 10 * shift});
    return app.access(vars[static_cast<std::size_t>((v + shift) % 4)]);
  }

  KV_ExprLocation* inner(int depth, bool changed) {
    const bool flip = changed && change == Change::Operator;
    const bool unary = pick(4) == 0;
    KV_ExprLocation* loc = nullptr;
    switch (family) {
    case Family::Logic:
      loc = unary ? app.op(flip ? KV_OP_BIT_NOT : KV_OP_LOG_NOT, {make(depth - 1)})
                  : app.op(flip ? KV_OP_LOG_OR : KV_OP_LOG_AND, {make(depth - 1), make(depth - 1)});
      break;
    case Family::Bits:
      loc = unary ? app.cast(flip ? app.uint8() : app.uint16(), make(depth - 1))
                  : app.op(flip ? KV_OP_BIT_XOR : KV_OP_BIT_OR, {make(depth - 1), make(depth - 1)});
      break;
    case Family::Index:
      loc = unary ? app.op(flip ? KV_OP_BIT_NOT : KV_OP_NEG, {make(depth - 1)})
                  : app.op(flip ? KV_OP_SUB : KV_OP_ADD, {make(depth - 1), make(depth - 1)});
      break;
    }
    // The type of a location is compared through its recorded type and, where those
    // differ, through the expression's type: a type change changes both.
    KV_DataType* type = changed && change == Change::Type ? app.int32() : nullptr;
    KV_Operation* op = loc->getOperation();
    if (!type && !op->getOperator()->isCast())
      type = leafType();
    if (type) {
      op->setDataType(type);
      loc->setExprLocDataType(type);
    }
    return loc;
  }

  AppBuilder& app;
  Family family;
  std::mt19937_64 rng;
  int target;
  Change change;
  int next = 0;
  bool changedNodeIsLeaf = false;
  std::vector<KvCSymbol*> vars;
};

// The family's restricted comparison. Index trees are compared as the index of two
// accesses to one array that differ in qualification, so that the index rules decide.
bool restrictedEqual(AppBuilder& app, Family f, KV_ExprLocation* a, KV_ExprLocation* b) {
  switch (f) {
  case Family::Logic:
    return Cmp::containEqualLogic(a, b);
  case Family::Bits:
    return Cmp::containEqualBitOps(a, b);
  case Family::Index: {
    for (KV_ExprLocation* index : {a, b}) // free an index used by an earlier comparison
      if (KV_Operation* holder = index->getParentOperation())
        holder->setOperand(index->getIndexInParent(), nullptr);
    KvCSymbol* arr = app.data().getSymbolDB()->findSymbol("arr");
    if (!arr)
      arr = app.variable("arr", app.arrayOf(app.uint16(), 8), false);
    KV_ExprLocation* ea = app.element(arr, {a});
    KV_ExprLocation* eb = app.element(arr, {b});
    ea->getQualifiedSymbolOp()->setStrictlyQualified(true);
    return Cmp::containEqualQsoAndIndexOp(ea->getQualifiedSymbolOp(), eb->getQualifiedSymbolOp());
  }
  }
  return false;
}

constexpr Family kFamilies[] = {Family::Logic, Family::Bits, Family::Index};

TEST(SubtreeComparerRandom, ComparisonsAreReflexiveAndSymmetric) {
  for (Family f : kFamilies) {
    for (std::uint64_t seed = 1; seed <= 60; ++seed) {
      AppBuilder app;
      KV_ExprLocation* a = TreeMaker(app, f, seed, -1, Change::None).make(5);
      KV_ExprLocation* b = TreeMaker(app, f, seed, -1, Change::None).make(5);
      KV_ExprLocation* c = TreeMaker(app, f, seed + 1000, -1, Change::None).make(5);
      SCOPED_TRACE(seed);
      EXPECT_TRUE(Cmp::areSubTreesEqual(a, a));
      EXPECT_TRUE(Cmp::areSubTreesEqual(a, b));
      EXPECT_TRUE(restrictedEqual(app, f, a, b));
      EXPECT_EQ(Cmp::areSubTreesEqual(a, c), Cmp::areSubTreesEqual(c, a));
      EXPECT_EQ(restrictedEqual(app, f, a, c), restrictedEqual(app, f, c, a));
    }
  }
}

TEST(SubtreeComparerRandom, AnySingleChangeIsSeenByTheComparisonsThatCompareIt) {
  int effective = 0;
  for (Family f : kFamilies) {
    for (std::uint64_t seed = 1; seed <= 20; ++seed) {
      AppBuilder app;
      TreeMaker probe(app, f, seed, -1, Change::None);
      probe.make(4);
      for (int at = 0; at < probe.nodes(); ++at) {
        for (Change c : {Change::Leaf, Change::Operator, Change::Type, Change::Scaling}) {
          KV_ExprLocation* a = TreeMaker(app, f, seed, -1, Change::None).make(4);
          TreeMaker changed(app, f, seed, at, c);
          KV_ExprLocation* b = changed.make(4);
          SCOPED_TRACE(testing::Message() << "family " << static_cast<int>(f) << " seed " << seed
                                          << " node " << at << " change " << static_cast<int>(c));
          // The general comparison sees the structure only, not types and scalings.
          EXPECT_EQ(Cmp::areSubTreesEqual(a, b), !changed.changeIsStructural());
          EXPECT_EQ(restrictedEqual(app, f, a, b), !changed.changeIsEffective());
          effective += changed.changeIsEffective() ? 1 : 0;
        }
      }
    }
  }
  EXPECT_GT(effective, 500) << "the random trees must exercise the changes";
}

TEST(SubtreeComparerRandom, DeepTreesDoNotExhaustTheStack) {
  AppBuilder app;
  KvCUnparamSymbol* x = app.variable("x", app.boolean(), false);
  KvCUnparamSymbol* u = app.variable("u", app.uint16(), false);
  KV_ExprLocation* logicA = app.access(x);
  KV_ExprLocation* logicB = app.access(x);
  KV_ExprLocation* bitsA = app.access(u);
  KV_ExprLocation* bitsB = app.access(u);
  for (int d = 0; d < 10000; ++d) {
    logicA = app.logNot(logicA);
    logicB = app.logNot(logicB);
    bitsA = app.op(KV_OP_BIT_AND, {bitsA, app.access(u)});
    bitsB = app.op(KV_OP_BIT_AND, {bitsB, app.access(u)});
  }
  EXPECT_TRUE(Cmp::areSubTreesEqual(logicA, logicB));
  EXPECT_TRUE(Cmp::containEqualLogic(logicA, logicB, true));
  EXPECT_TRUE(Cmp::containEqualBitOps(bitsA, bitsB));
  EXPECT_FALSE(Cmp::areSubTreesEqual(logicA, bitsA));
}

} // namespace
