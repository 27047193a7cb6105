// The type servers of the ICode: base types by name, named numerical and pointer types
// (typedefs), the Data Dictionary lookup, the base-type chain behind isSameType, type
// definitions in files, the root and Acme file pairs, and internal source references.
#include "platform/builder/AppBuilder.h"
#include "platform/icode/KV_BaseTypeServer.h"
#include "platform/icode/KV_DataTypeServer.h"
#include "platform/icode/KV_ICodeFactoryContainer.h"
#include "platform/icode/KV_NumericalTypeServer.h"
#include "platform/icode/KV_PointerTypeServer.h"
#include "platform/icode/KV_ScaleServer.h"
#include "platform/icode/KvCIcFileServer.h"
#include "platform/support/KvCSrcRefServer.h"

#include <gtest/gtest.h>

#include <random>
#include <string>
#include <vector>

namespace {

struct Types {
  AppBuilder app;
  KV_ICodeFactoryContainer& f = app.factories();
  KV_DataTypeServer* dts = f.getDataTypeServer();
  KV_NumericalTypeServer* nts = f.getNumTypeServer();
  KV_PointerTypeServer* pts = dts->getPointerServer();
  const KvCSrcRef* ref = app.data().getSrcRefServer()->createModelSrcRef("fixture");
  KV_DimensionDescriptor scalar;

  KV_NumericalType* named(const char* name, KV_NumericalType* base, const char* text = "",
                          bool typedefFlag = true) {
    WmCXString description(text);
    return nts->getNonDDMappedNumerical(name, description, *base, scalar, typedefFlag, ref, true);
  }
  KV_PointerType* namedPointer(const char* name, KV_PointerType* target) {
    WmCXString description("reference");
    return pts->getNonDDMappedPointer(name, description, scalar, true, target, ref);
  }
};

TEST(BaseTypeServerTest, EveryBaseTypeByNameAndNothingElse) {
  Types t;
  struct Row {
    const char* name;
    int bits;
    bool isSigned, isFloat;
  };
  const Row rows[] = {
      {"Int8", 8, true, false},     {"UInt8", 8, false, false},  {"Int16", 16, true, false},
      {"UInt16", 16, false, false}, {"Int32", 32, true, false},  {"UInt32", 32, false, false},
      {"Float32", 32, true, true},  {"Float64", 64, true, true}, {"Bool", 8, false, false}};
  KV_BaseTypeServer* bases = t.f.getBaseTypeServer();
  for (const Row& row : rows) {
    SCOPED_TRACE(row.name);
    WmCXString name(row.name);
    // A lookup by name finds a base type that nobody demanded before.
    int before = t.dts->getNumberOfTypes();
    KV_DataType* found = t.dts->findTypeByName(name, t.ref);
    ASSERT_NE(found, nullptr);
    EXPECT_EQ(t.dts->getNumberOfTypes(), before + 1);
    EXPECT_EQ(bases->getBase(&name), found);
    KV_NumericalType* n = found->getNumericalType();
    ASSERT_NE(n, nullptr);
    EXPECT_EQ(n->getName(), name);
    EXPECT_EQ(n->getBits(), row.bits);
    EXPECT_EQ(n->isSigned(), row.isSigned);
    EXPECT_EQ(n->isFloat(), row.isFloat);
    EXPECT_EQ(n->getBaseType(), nullptr);
    EXPECT_TRUE(n->isSameType(n));
    EXPECT_TRUE(n->isScalar());
    EXPECT_FALSE(n->isCreateTypedef());
  }
  EXPECT_EQ(bases->getInt8(), t.dts->getInt8());
  EXPECT_FALSE(t.dts->getBool()->isSameType(t.dts->getUInt8())); // equal structure only
  ASSERT_NE(t.named("StatusType", t.dts->getUInt8()), nullptr);
  for (const char* unknown : {"Int64", "int", "StatusType", ""}) {
    WmCXString name(unknown);
    EXPECT_EQ(bases->getBase(&name), nullptr) << unknown;
  }
  EXPECT_EQ(bases->getBase(nullptr), nullptr);
  EXPECT_EQ(t.dts->findTypeByName("NoSuchType", t.ref), nullptr);
}

TEST(NumericalTypeServerTest, NamedTypeIsATypedefMadeOnce) {
  Types t;
  KV_NumericalType* status = t.named("StatusType", t.dts->getUInt8(), "status of a call");
  ASSERT_NE(status, nullptr);
  EXPECT_EQ(status->getBits(), 8);
  EXPECT_FALSE(status->isSigned());
  EXPECT_EQ(status->getNumericalType(), status);
  EXPECT_EQ(status->getBaseType(), t.dts->getUInt8());
  EXPECT_EQ(t.dts->findTypeByName("StatusType", t.ref), status);

  // Again: the first one, as it was made.
  EXPECT_EQ(t.named("StatusType", t.dts->getUInt8(), "other text"), status);
  EXPECT_EQ(status->getDescription(), WmCXString("status of a call"));
  // The name is taken: by a typedef of another base, or by a base type.
  EXPECT_EQ(t.named("StatusType", t.dts->getUInt16()), nullptr);
  EXPECT_EQ(t.named("UInt16", t.dts->getUInt8()), nullptr);
  KV_DimensionDescriptor pair;
  pair.addDimension(2);
  WmCXString none;
  EXPECT_EQ(t.nts->getNonDDMappedNumerical("StatusType", none, *t.dts->getUInt8(), pair, true,
                                           t.ref, true),
            nullptr);
  EXPECT_EQ(t.named("", t.dts->getUInt8()), nullptr);
}

// Random forests of typedefs over the base types: getBaseType is the type each was made
// from, and isSameType holds exactly for types with the same base type at the end of
// their chains.
TEST(NumericalTypeServerTest, SameTypeFollowsBaseChainsToTheirEnd) {
  for (unsigned seed = 1; seed <= 20; ++seed) {
    Types t;
    std::mt19937 rng(seed);
    std::vector<KV_NumericalType*> all = {t.dts->getInt8(), t.dts->getUInt8(), t.dts->getBool(),
                                          t.dts->getInt32()};
    std::vector<std::size_t> root = {0, 1, 2, 3};
    std::vector<std::size_t> parent = {0, 1, 2, 3};
    for (int i = 0; i < 30; ++i) {
      std::size_t from = std::uniform_int_distribution<std::size_t>(0, all.size() - 1)(rng);
      std::string name = "T" + std::to_string(i);
      KV_NumericalType* type = t.named(name.c_str(), all[from]);
      ASSERT_NE(type, nullptr);
      EXPECT_EQ(type->getBits(), all[root[from]]->getBits());
      parent.push_back(from);
      root.push_back(root[from]);
      all.push_back(type);
    }
    for (std::size_t a = 0; a < all.size(); ++a) {
      EXPECT_EQ(all[a]->getBaseType(), a < 4 ? nullptr : all[parent[a]]);
      for (std::size_t b = 0; b < all.size(); ++b)
        ASSERT_EQ(all[a]->isSameType(all[b]), root[a] == root[b])
            << "seed " << seed << ": " << all[a]->getName().str() << " vs "
            << all[b]->getName().str();
      EXPECT_FALSE(all[a]->isSameType(nullptr));
    }
  }
}

TEST(PointerTypeServerTest, NamedPointersAreTypedefsOfUnnamedOnes) {
  Types t;
  KV_NumericalType* mask = t.named("EventMaskType", t.dts->getUInt32());
  WmCXString empty;
  KV_PointerType* toMask = t.pts->getScalarPointer(mask, &empty, false, false, &empty, t.ref);
  ASSERT_NE(toMask, nullptr);
  EXPECT_EQ(toMask, t.dts->demandPointerType(mask, false));
  EXPECT_EQ(t.pts->getScalarPointer(mask, nullptr, false, false, nullptr, t.ref), toMask);
  EXPECT_EQ(toMask->getBaseType(), nullptr);

  KV_PointerType* ref = t.namedPointer("EventMaskRefType", toMask);
  ASSERT_NE(ref, nullptr);
  EXPECT_EQ(ref->getTargetType(), mask);
  EXPECT_EQ(ref->getBaseType(), toMask);
  EXPECT_TRUE(ref->isSameType(toMask));
  EXPECT_FALSE(ref->isSameType(mask));
  EXPECT_EQ(t.namedPointer("EventMaskRefType", toMask), ref);
  EXPECT_EQ(t.dts->findTypeByName("EventMaskRefType", t.ref), ref);
  // Taken name, named target, no target.
  EXPECT_EQ(t.namedPointer("EventMaskRefType", t.pts->getVoidPointer()), nullptr);
  EXPECT_EQ(t.namedPointer("Other", ref), nullptr);
  EXPECT_EQ(t.namedPointer("Other", nullptr), nullptr);

  KV_PointerType* voidPointer = t.pts->getVoidPointer();
  EXPECT_EQ(t.pts->getVoidPointer(), voidPointer);
  ASSERT_NE(voidPointer->getTargetType(), nullptr);
  EXPECT_EQ(voidPointer->getTargetType()->getTypeKind(), KV_TYPE_VOID);
  KV_PointerType* access = t.namedPointer("AccessNameRef", voidPointer);
  ASSERT_NE(access, nullptr);
  EXPECT_EQ(access->getTargetType(), voidPointer->getTargetType());

  // A name given to getScalarPointer makes the named pointer over the unnamed one.
  WmCXString name("ConstMaskRef");
  WmCXString text("read-only mask");
  KV_PointerType* constRef = t.pts->getScalarPointer(mask, &name, true, true, &text, t.ref);
  ASSERT_NE(constRef, nullptr);
  EXPECT_EQ(constRef->getBaseType(), t.dts->demandPointerType(mask, true));
  EXPECT_EQ(t.pts->getScalarPointer(nullptr, &empty, false, false, &empty, t.ref), nullptr);
}

TEST(DataDictionaryTest, LookupFindsDataDictionaryTypesAndGivesTheirDimensions) {
  Types t;
  KvCIcFileId* osek = t.app.file("osek.h");
  KV_DimensionDescriptor four;
  four.addDimension(4);
  KV_NumericalType* tick =
      t.dts->registerDataDictionaryType("TickType", t.dts->getUInt16(), four, false, osek, t.ref);
  ASSERT_NE(tick, nullptr);
  EXPECT_EQ(tick->getBits(), 16);
  EXPECT_FALSE(tick->isScalar());
  EXPECT_EQ(tick->getModuleFileId(), osek);

  KV_DimensionDescriptor dims; // scalar in, the type's dimensions out
  EXPECT_EQ(t.dts->findTypeByName("TickType", dims, t.ref, true), tick);
  EXPECT_EQ(dims, four);
  KV_DimensionDescriptor untouched;
  EXPECT_EQ(t.dts->findTypeByName("TickType", untouched, t.ref, false), nullptr);
  EXPECT_TRUE(untouched.isScalar());

  // Non-DD names are not Data Dictionary types, and the other way round.
  ASSERT_NE(t.named("StatusType", t.dts->getUInt8()), nullptr);
  EXPECT_EQ(t.dts->findTypeByName("StatusType", dims, t.ref, true), nullptr);
  EXPECT_EQ(t.dts->findTypeByName("UInt8", dims, t.ref, true), nullptr);
  EXPECT_EQ(t.dts->findTypeByName("UInt8", dims, t.ref, false), t.dts->getUInt8());
  EXPECT_TRUE(dims.isScalar());
  EXPECT_EQ(t.dts->findTypeByName("Missing", dims, t.ref, true), nullptr);

  // Without base type: a base type of its own. Taken names and non-numerical bases fail.
  KV_NumericalType* own =
      t.dts->registerDataDictionaryType("OwnTick", nullptr, true, true, nullptr, t.ref);
  ASSERT_NE(own, nullptr);
  EXPECT_EQ(own->getBaseType(), nullptr);
  EXPECT_FALSE(own->isSameType(t.dts->getInt32()));
  EXPECT_EQ(t.dts->registerDataDictionaryType("StatusType", t.dts->getUInt8(), true, true, nullptr,
                                              t.ref),
            nullptr);
  EXPECT_EQ(
      t.dts->registerDataDictionaryType("P", t.pts->getVoidPointer(), true, true, nullptr, t.ref),
      nullptr);
  EXPECT_FALSE(
      t.dts->registerDataDictionaryType("Wide", t.dts->getUInt8(), false, true, nullptr, t.ref)
          ->isScalar());
}

TEST(FileTest, DefineTypeKeepsOrderOnceAndOneModule) {
  Types t;
  KvCIcFileId* osek = t.app.file("osek.h");
  KvCIcFileId* other = t.app.file("other.h");
  KvCIcFile* file = osek->getFile();
  EXPECT_EQ(file->getFileId(), osek);
  KV_NumericalType* a = t.named("A", t.dts->getUInt8());
  KV_NumericalType* b = t.named("B", t.dts->getUInt8());
  KV_NumericalType* c = t.named("C", t.dts->getUInt8());

  EXPECT_TRUE(file->defineType(a, t.ref, true));
  EXPECT_TRUE(file->defineType(b, t.ref, true));
  EXPECT_TRUE(file->defineType(c, t.ref, false)); // in front
  EXPECT_TRUE(file->defineType(a, t.ref, true));  // again: no change
  EXPECT_EQ(file->getDefinedTypes(), (std::vector<KV_DataType*>{c, a, b}));
  EXPECT_EQ(a->getModuleFileId(), osek);
  // One module per type; null is refused.
  EXPECT_FALSE(other->getFile()->defineType(a, t.ref, true));
  EXPECT_FALSE(other->getFile()->defineType(nullptr, t.ref, true));
  EXPECT_TRUE(other->getFile()->getDefinedTypes().empty());
  EXPECT_EQ(a->getModuleFileId(), osek);

  // The fixture switch: false and nothing recorded, until it is switched off.
  KV_NumericalType* d = t.named("D", t.dts->getUInt8());
  other->getFile()->setDefineTypeFails(true);
  EXPECT_FALSE(other->getFile()->defineType(d, t.ref, true));
  EXPECT_EQ(d->getModuleFileId(), nullptr);
  EXPECT_TRUE(other->getFile()->getDefinedTypes().empty());
  other->getFile()->setDefineTypeFails(false);
  EXPECT_TRUE(other->getFile()->defineType(d, t.ref, true));
  EXPECT_EQ(d->getModuleFileId(), other);
}

TEST(FileServerTest, RootAndAcmePairsAreComplementaryAndStable) {
  Types t;
  KvCIcFileServer* files = t.f.getFileServer();
  auto demand = [&](bool root, KvCIcFileId*& header, KvCIcFileId*& cFile) {
    return root ? files->demandRootFiles(header, cFile, t.ref)
                : files->demandAcmeFiles(header, cFile, t.ref);
  };
  KvCIcFileId* headers[2] = {};
  KvCIcFileId* cFiles[2] = {};
  for (bool root : {true, false}) {
    KvCIcFileId*& header = headers[root ? 0 : 1];
    KvCIcFileId*& cFile = cFiles[root ? 0 : 1];
    ASSERT_TRUE(demand(root, header, cFile));
    ASSERT_TRUE(header && cFile);
    EXPECT_NE(header, cFile);
    EXPECT_EQ(header->getFile()->getComplementaryFile(), cFile);
    EXPECT_EQ(cFile->getFile()->getComplementaryFile(), header);
    KvCIcFileId* header2 = nullptr;
    KvCIcFileId* cFile2 = nullptr;
    ASSERT_TRUE(demand(root, header2, cFile2));
    EXPECT_EQ(header2, header);
    EXPECT_EQ(cFile2, cFile);
  }
  EXPECT_NE(headers[0], headers[1]);
  EXPECT_NE(cFiles[0], cFiles[1]);

  files->setRootFilesUnavailable(true);
  files->setAcmeFilesUnavailable(true);
  for (bool root : {true, false}) {
    KvCIcFileId* header = headers[0];
    KvCIcFileId* cFile = cFiles[0];
    EXPECT_FALSE(demand(root, header, cFile));
    EXPECT_EQ(header, nullptr);
    EXPECT_EQ(cFile, nullptr);
  }
}

TEST(SrcRefTest, InternalReferenceCarriesLocationAndCause) {
  Types t;
  KvCInternalSrcRef* ref = t.app.data().getSrcRefServer()->getSrcRef();
  ASSERT_NE(ref, nullptr);
  ref->setLocation(__FILE__, __LINE__);
  ref->setCause("rtos api function");
  const int line = __LINE__ - 2;
  EXPECT_EQ(ref->getFile(), WmCXString(__FILE__));
  EXPECT_EQ(ref->getLine(), line);
  EXPECT_EQ(ref->getText(),
            WmCXString(__FILE__) + ":" + WmCXString(line, false, false) + " (rtos api function)");
  EXPECT_NE(t.app.data().getSrcRefServer()->getSrcRef(), ref);

  KV_ScaleServer* scales = t.f.getScalingServer();
  EXPECT_EQ(scales->getScaling(1.0, 0.0, ref), scales->getIdentityScaling());
  EXPECT_EQ(scales->getScaling(0.001, 0.0, ref), scales->demandScaling(0.001, 0.0));
}

} // namespace
