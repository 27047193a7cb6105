// Constants (equality under the permissions, typed values), data type equality by
// structure and by identity, symbol-access equality, and the symbol database's order.
#include "platform/builder/AppBuilder.h"
#include "platform/icode/KV_Constant.h"
#include "platform/icode/KV_DataTypeServer.h"
#include "platform/icode/KV_ExprLocation.h"
#include "platform/icode/KV_ICodeFactoryContainer.h"
#include "platform/icode/KV_QualifiedSymbolOp.h"
#include "platform/icode/KV_SymbolDB.h"
#include "platform/icode/KvCCStmTable.h"
#include "platform/icode/KvCIcExprEqualitySpec.h"
#include "platform/icode/KvCParamSymbol.h"
#include "platform/icode/KvCUnparamSymbol.h"

#include <gtest/gtest.h>

#include <cfloat>
#include <cstdint>
#include <limits>
#include <string>
#include <vector>

namespace {

// --- constants

struct Constants {
  AppBuilder app;
  KV_ExprLocFactory* f = app.factories().getExprLocFactory();
  KV_Constant* make(tagKvEConstantType t, std::int64_t v, KV_DataType* dt = nullptr) {
    return f->createConstant(t, v, dt);
  }
  KV_Constant* real(double v) { return f->createDoubleConstant(v, app.float64()); }
};

KvCIcExprEqualitySpec spec(bool differentTypes, bool approx) {
  KvCIcExprEqualitySpec s;
  s.setPermitConstantsWithDifferentConstantTypes(differentTypes);
  s.setPermitApproxEqualDoubleConstantValues(approx);
  return s;
}

TEST(ConstantTest, EqualityUnderEachPermission) {
  Constants c;
  KV_Constant* s5 = c.make(KV_CONST_SIGNED, 5);
  KV_Constant* s5b = c.make(KV_CONST_SIGNED, 5, c.app.int32());
  KV_Constant* u5 = c.make(KV_CONST_UNSIGNED, 5);
  KV_Constant* d5 = c.real(5.0);
  KV_Constant* d55 = c.real(5.5);
  KV_Constant* b1 = c.make(KV_CONST_BOOL, 1);
  KV_Constant* s1 = c.make(KV_CONST_SIGNED, 1);
  KV_Constant* sum = c.real(0.1 + 0.2);
  KV_Constant* third = c.real(0.3);
  KV_Constant* far = c.real(0.3 + 1e-9);
  KV_Constant* nan = c.real(std::numeric_limits<double>::quiet_NaN());
  KV_Constant* big = c.make(KV_CONST_SIGNED, (std::int64_t{1} << 53) + 1);
  KV_Constant* bigD = c.real(static_cast<double>(std::int64_t{1} << 53));

  KvCIcExprEqualitySpec none = spec(false, false);
  KvCIcExprEqualitySpec types = spec(true, false);
  KvCIcExprEqualitySpec approx = spec(false, true);
  KvCIcExprEqualitySpec both = spec(true, true);
  EXPECT_FALSE(KvCIcExprEqualitySpec().areConstantsWithDifferentConstantTypesPermitted());
  EXPECT_FALSE(KvCIcExprEqualitySpec().areApproxEqualDoubleConstantValuesPermitted());

  struct Row {
    KV_Constant* a;
    KV_Constant* b;
    bool none, types, approx, both;
  };
  // clang-format off
  const Row rows[] = {
      {s5, s5b, true, true, true, true},     // the data type does not matter
      {s5, u5, false, true, false, true},     // signed vs unsigned of equal value
      {s5, d5, false, true, false, true},     // integral vs floating, equal values
      {s5, d55, false, false, false, false},  // 5.5 is not 5 (no truncation)
      {b1, s1, false, true, false, true},
      {sum, third, false, false, true, true}, // 0.1 + 0.2 vs 0.3
      {third, far, false, false, false, false},
      {nan, nan, false, false, false, false},
      {big, bigD, false, true, false, true},   // 2^53 + 1 is 2^53 as a double
  };
  // clang-format on
  for (const Row& r : rows) {
    for (int swap = 0; swap < 2; ++swap) {
      KV_Constant* a = swap ? r.b : r.a;
      KV_Constant* b = swap ? r.a : r.b;
      SCOPED_TRACE(std::to_string(a->getDoubleValue()) + " vs " +
                   std::to_string(b->getDoubleValue()));
      EXPECT_EQ(a->isEqual(b, &none), r.none);
      EXPECT_EQ(a->isEqual(b, nullptr), r.none); // null is the default spec
      EXPECT_EQ(a->isEqual(b, &types), r.types);
      EXPECT_EQ(a->isEqual(b, &approx), r.approx);
      EXPECT_EQ(a->isEqual(b, &both), r.both);
    }
  }
  EXPECT_FALSE(s5->isEqual(nullptr, &both));
  // Integral constants compare exactly even when approximate doubles are permitted.
  KV_Constant* huge = c.make(KV_CONST_SIGNED, std::numeric_limits<std::int64_t>::max());
  KV_Constant* hugeMinus1 = c.make(KV_CONST_SIGNED, std::numeric_limits<std::int64_t>::max() - 1);
  EXPECT_FALSE(huge->isEqual(hugeMinus1, &both));
}

TEST(ConstantTest, TypedValueWrapsToTheDataType) {
  Constants c;
  KV_DataTypeServer* types = c.app.data().getDataTypeServer();
  KV_DataType* int64 = types->demandNumericalType("Int64", 64, true, false);
  struct Row {
    std::int64_t value;
    KV_DataType* type;
    std::int64_t typed;
  };
  const Row rows[] = {
      {300, c.app.uint8(), 44},
      {200, c.app.int8(), -56},
      {-1, c.app.uint16(), 65535},
      {65536 + 7, c.app.uint16(), 7},
      {-129, c.app.int8(), 127},
      {128, c.app.int8(), -128},
      {-32769, c.app.int16(), 32767},
      {std::int64_t{1} << 40, c.app.uint32(), 0},
      {(std::int64_t{1} << 32) - 1, c.app.int32(), -1},
      {256, c.app.boolean(), 0},
      {-5, nullptr, -5},
      {300, c.app.float32(), 300},
      {std::numeric_limits<std::int64_t>::min(), int64, std::numeric_limits<std::int64_t>::min()},
  };
  for (const Row& r : rows) {
    KV_Constant* k = c.make(KV_CONST_SIGNED, r.value, r.type);
    EXPECT_EQ(k->getTypedIntValue(), r.typed)
        << r.value << " as " << (r.type ? r.type->getName().str() : "no type");
    EXPECT_EQ(k->getIntValue(), r.value);
  }
  // Every value in a range, against the C++ conversions.
  for (std::int64_t v = -70000; v <= 70000; v += 7) {
    EXPECT_EQ(c.make(KV_CONST_SIGNED, v, c.app.int8())->getTypedIntValue(),
              static_cast<std::int8_t>(v));
    EXPECT_EQ(c.make(KV_CONST_SIGNED, v, c.app.uint8())->getTypedIntValue(),
              static_cast<std::uint8_t>(v));
    EXPECT_EQ(c.make(KV_CONST_UNSIGNED, v, c.app.int16())->getTypedIntValue(),
              static_cast<std::int16_t>(v));
    EXPECT_EQ(c.make(KV_CONST_SIGNED, v, c.app.uint16())->getTypedIntValue(),
              static_cast<std::uint16_t>(v));
  }
}

// --- data types

TEST(DataTypeTest, StructuralEqualityAndIdentity) {
  AppBuilder app;
  KV_DataTypeServer* types = app.data().getDataTypeServer();
  KV_DataType* i16 = app.int16();
  KV_DataType* alias = types->demandNumericalType("MyInt16", 16, true, false);
  KV_StructType* s1 = app.structType("S1", {{"a", i16}});
  KV_StructType* s2 = app.structType("S2", {{"a", i16}});
  const std::vector<KV_DataType*> all = {
      i16,
      alias,
      app.uint16(),
      app.int32(),
      app.float32(),
      app.float64(),
      app.voidType(),
      app.pointerTo(i16),
      app.pointerTo(alias),
      app.pointerTo(i16, true),
      app.pointerTo(app.int32()),
      app.arrayOf(i16, 4),
      app.arrayOf(alias, 4),
      app.arrayOf(i16, 5),
      app.arrayOf(app.arrayOf(alias, 2), 3),
      app.arrayOf(app.arrayOf(i16, 2), 3),
      s1,
      s2,
  };
  // The classes of structurally equal types.
  const std::vector<int> cls = {0, 0, 1, 2, 3, 4, 5, 6, 6, 7, 8, 9, 9, 10, 11, 11, 12, 13};
  ASSERT_EQ(all.size(), cls.size());
  for (std::size_t a = 0; a < all.size(); ++a) {
    EXPECT_FALSE(all[a]->isEqualType(nullptr));
    EXPECT_FALSE(all[a]->isEqualTypeRef(nullptr));
    for (std::size_t b = 0; b < all.size(); ++b) {
      EXPECT_EQ(all[a]->isEqualType(all[b]), cls[a] == cls[b])
          << all[a]->getName().str() << " vs " << all[b]->getName().str();
      EXPECT_EQ(all[a]->isEqualTypeRef(all[b]), a == b)
          << all[a]->getName().str() << " vs " << all[b]->getName().str();
    }
  }
  // The server keeps one object per key.
  EXPECT_EQ(app.pointerTo(i16), all[7]);
  EXPECT_EQ(app.arrayOf(i16, 4), all[11]);
  EXPECT_EQ(types->demandNumericalType("MyInt16", 16, true, false), alias);
  EXPECT_EQ(types->demandNumericalType("MyInt16", 16, false, false), nullptr);
  EXPECT_EQ(types->demandStructType("S1"), s1);
}

// --- symbol accesses

TEST(QualifiedSymbolOpTest, EqualityOverSymbolBaseDereferenceAndIndices) {
  AppBuilder app;
  KV_QSOFactory* q = app.factories().getQSOFactory();
  KvCUnparamSymbol* arr = app.variable("arr", app.arrayOf(app.arrayOf(app.int16(), 4), 4));
  KvCUnparamSymbol* other = app.variable("other", app.arrayOf(app.arrayOf(app.int16(), 4), 4));
  KvCUnparamSymbol* i = app.variable("i", app.int16());
  KvCUnparamSymbol* sa = app.variable("sa", app.structType("S", {{"c", app.int16()}}));
  KvCUnparamSymbol* sb = app.variable("sb", app.structType("S", {}));
  KvCUnparamSymbol* c = app.component("c", app.int16());
  KvCUnparamSymbol* p = app.variable("p", app.pointerTo(app.int16()));

  auto indexed = [&](KvCSymbol* s, std::initializer_list<BuilderIndex> idx) {
    return app.element(s, idx)->getQualifiedSymbolOp();
  };
  KV_QualifiedSymbolOp* a12 = indexed(arr, {1, 2});
  KV_QualifiedSymbolOp* a12b = indexed(arr, {1, 2});
  KV_QualifiedSymbolOp* a13 = indexed(arr, {1, 3});
  KV_QualifiedSymbolOp* o12 = indexed(other, {1, 2});
  KV_QualifiedSymbolOp* a1 = indexed(arr, {1});
  KV_QualifiedSymbolOp* a1i = indexed(arr, {1, app.access(i)});
  KV_QualifiedSymbolOp* a1ib = indexed(arr, {1, app.access(i)});
  KV_QualifiedSymbolOp* a1i1 = indexed(arr, {1, app.add(app.access(i), app.constant(1))});
  KV_QualifiedSymbolOp* a1i1b = indexed(arr, {1, app.add(app.access(i), app.constant(1))});
  KV_QualifiedSymbolOp* a1i2 = indexed(arr, {1, app.add(app.access(i), app.constant(2))});

  EXPECT_TRUE(a12->isEqual(a12b, false));
  EXPECT_FALSE(a12->isEqual(a13, false));
  EXPECT_TRUE(a12->isEqualExceptIndices(a13));
  EXPECT_FALSE(a12->isEqualExceptIndices(o12));
  EXPECT_FALSE(a12->isEqualExceptIndices(a1));
  EXPECT_FALSE(a12->isEqual(a1, true));
  EXPECT_TRUE(a1i->isEqual(a1ib, false));
  EXPECT_FALSE(a12->isEqual(a1i, true)); // constant vs index expression
  EXPECT_FALSE(a1i->isEqual(a12, true));
  EXPECT_TRUE(a12->isEqualExceptIndices(a1i));
  EXPECT_TRUE(a1i1->isEqual(a1i1b, false));
  EXPECT_FALSE(a1i1->isEqual(a1i2, false));
  EXPECT_FALSE(a1i->isEqual(a1i1, false));
  EXPECT_FALSE(a12->isEqual(nullptr, true));
  EXPECT_FALSE(a12->isEqualExceptIndices(nullptr));
  EXPECT_EQ(a1i->getIndexForDim(0), 1);
  EXPECT_EQ(a1i->getIndexForDim(1), -1);
  EXPECT_EQ(a1i->getIndexForDim(2), -1);

  // Structure base and dereference.
  KV_QualifiedSymbolOp* sac = q->createComponentQso(sa, c);
  KV_QualifiedSymbolOp* sacb = q->createComponentQso(sa, c);
  KV_QualifiedSymbolOp* sbc = q->createComponentQso(sb, c);
  KV_QualifiedSymbolOp* plainC = q->createQso(c);
  EXPECT_TRUE(sac->isEqual(sacb, false));
  EXPECT_FALSE(sac->isEqualExceptIndices(sbc));
  EXPECT_FALSE(sac->isEqualExceptIndices(plainC));
  EXPECT_EQ(plainC->getBaseSymbol(), c);
  KV_QualifiedSymbolOp* pd = q->createQso(p);
  KV_QualifiedSymbolOp* pp = q->createQso(p);
  pd->setDereferenced(true);
  EXPECT_FALSE(pd->isEqualExceptIndices(pp));
  pp->setDereferenced(true);
  EXPECT_TRUE(pd->isEqual(pp, false));
  EXPECT_EQ(pd->getDataType(), app.int16());

  // Strict qualification counts unless ignored.
  sacb->setStrictlyQualified(true);
  EXPECT_FALSE(sac->isEqual(sacb, false));
  EXPECT_TRUE(sac->isEqual(sacb, true));
  EXPECT_TRUE(sac->isEqualExceptIndices(sacb));
}

// Dimensions added through the generic operand interface have no recorded constant:
// asking for one must not read past the recorded constants.
TEST(QualifiedSymbolOpTest, DimensionsAddedAsPlainOperandsHaveNoConstantIndex) {
  AppBuilder app;
  KvCUnparamSymbol* arr = app.variable("arr", app.arrayOf(app.arrayOf(app.int16(), 4), 4));
  KV_QualifiedSymbolOp* a = app.factories().getQSOFactory()->createQso(arr);
  KV_QualifiedSymbolOp* b = app.factories().getQSOFactory()->createQso(arr);
  ASSERT_TRUE(a->appendOperand(nullptr));
  ASSERT_TRUE(a->appendOperand(app.constant(1)));
  ASSERT_TRUE(a->setOperand(1, nullptr));
  b->addConstantIndex(2);
  b->addConstantIndex(3);
  EXPECT_EQ(a->getResolvedNumberOfDims(), 2);
  EXPECT_EQ(a->getIndexForDim(0), -1);
  EXPECT_EQ(a->getIndexForDim(1), -1);
  EXPECT_TRUE(a->isEqualExceptIndices(b));
  EXPECT_FALSE(a->isEqual(b, true));
  EXPECT_FALSE(b->isEqual(a, true));
  // A constant index added afterwards lands in its own dimension.
  a->addConstantIndex(7);
  EXPECT_EQ(a->getIndexForDim(2), 7);
  EXPECT_EQ(a->getIndexForDim(0), -1);
}

// --- symbol database

class RecordingVisitor : public KV_SmbDBObjVisitor {
public:
  explicit RecordingVisitor(KV_SymbolDB* symbols) : db(symbols) {}
  std::vector<std::string> names;
  void visitParamSmbDBObj(KV_ParamSmbDBObj* entry) override {
    EXPECT_EQ(entry->getSymbol(), entry->getParamSymbol());
    names.push_back(entry->getParamSymbol()->getName().str());
    // A function made during the walk is visited as well, after the others.
    if (names.size() == 1)
      db->createParamSymbol("madeDuringWalk", nullptr, false);
  }

private:
  KV_SymbolDB* db;
};

TEST(SymbolDBTest, ParametrizedSymbolsInCreationOrderWithIncreasingDebugIndices) {
  KV_SymbolDB db;
  db.createUnparamSymbol("v1", nullptr, false);
  db.createParamSymbol("b", nullptr, false);
  db.createParamSymbol("a", nullptr, true);
  db.createUnparamSymbol("comp", nullptr, true);
  db.createParamSymbol("c", nullptr, false);
  KvCParamSymbol* dup = db.createParamSymbol("a", nullptr, false);

  RecordingVisitor visitor(&db);
  db.forallParametrizedSymbols(&visitor);
  EXPECT_EQ(visitor.names, (std::vector<std::string>{"b", "a", "c", "a", "madeDuringWalk"}));
  db.forallParametrizedSymbols(nullptr);

  ASSERT_EQ(db.getNumberOfSymbols(), 7);
  for (int i = 0; i < db.getNumberOfSymbols(); ++i)
    EXPECT_EQ(db.getSymbol(i)->getDebugIndex(), i + 1);
  // The first symbol of a repeated name is the one found.
  EXPECT_EQ(db.findSymbol("a"), db.getSymbol(2));
  EXPECT_NE(db.findSymbol("a"), dup);
  EXPECT_EQ(db.findSymbol("nope"), nullptr);
  EXPECT_TRUE(db.getSymbol(2)->asParamSymbol()->isMacro());
  EXPECT_TRUE(db.getSymbol(3)->asUnparamSymbol()->isComponent());
}

} // namespace

namespace {

std::vector<std::string> listed(const KvCCStmTable* table) {
  std::vector<std::string> names;
  for (int i = 0; i < table->getNumberOfEnteredSymbols(); ++i)
    names.push_back(table->getEnteredSymbol(i)->getName().str());
  return names;
}

} // namespace

// A table lists its symbols in the order entered, whatever was removed or moved away in
// between, finds them by name, and keeps one symbol per name.
TEST(StatementTableTest, ListsInEntryOrderThroughRemovalsMovesAndNameClashes) {
  AppBuilder app;
  KvCCStmTable* table = app.function("f").body().table();
  KvCCStmTable* other = app.function("g").body().table();
  std::vector<KvCUnparamSymbol*> v;
  for (const char* name : {"a", "b", "c", "d"}) {
    v.push_back(app.variable(name, app.int16(), false));
    KvCSymbol* symbol = v.back();
    EXPECT_TRUE(table->enterSymbol(symbol));
  }
  EXPECT_TRUE(table->removeSymbol(v[1]));
  EXPECT_FALSE(table->removeSymbol(v[1]));
  KvCSymbol* moved = v[2];
  EXPECT_TRUE(other->enterSymbol(moved));
  EXPECT_EQ(listed(table), (std::vector<std::string>{"a", "d"}));
  EXPECT_EQ(table->findEnteredSymbol("b"), nullptr);
  EXPECT_EQ(table->findEnteredSymbol("c"), nullptr);
  EXPECT_EQ(other->findEnteredSymbol("c"), v[2]);

  KvCSymbol* back = v[1];
  EXPECT_TRUE(table->enterDeclaration(back));
  EXPECT_EQ(listed(table), (std::vector<std::string>{"a", "d", "b"}));
  EXPECT_TRUE(table->isEnteredAsDefinition(1));
  EXPECT_FALSE(table->isEnteredAsDefinition(2));

  KvCSymbol* clash = app.variable("a", app.int16(), false);
  EXPECT_TRUE(table->enterDeclaration(clash));
  EXPECT_EQ(clash, v[0]);
  EXPECT_EQ(listed(table), (std::vector<std::string>{"a", "d", "b"}));
  EXPECT_TRUE(table->isEnteredAsDefinition(0));
}
