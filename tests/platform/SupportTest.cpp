#include "platform/leda/set.h"
#include "platform/support/FPS.h"
#include "platform/support/KV_Dump.h"
#include "platform/support/KV_Dumpable.h"
#include "platform/support/KvCCIdentifier.h"
#include "platform/support/KvCCountingMemController.h"
#include "platform/support/KvCInternalSrcRef.h"
#include "platform/support/KvCMessageServer.h"
#include "platform/support/KvCNameSpace.h"
#include "platform/support/KvCNames.h"
#include "platform/support/KvCOptionNameCodec.h"
#include "platform/support/KvCOptionValueStorage.h"
#include "platform/support/KvCSrcRefServer.h"
#include "platform/support/WmCXString.h"
#include "platform/support/mxArray.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cctype>
#include <cmath>
#include <cstdint>
#include <cstring>
#include <initializer_list>
#include <limits>
#include <random>
#include <set>
#include <string>
#include <vector>

namespace {

constexpr double kInf = std::numeric_limits<double>::infinity();
constexpr double kNaN = std::numeric_limits<double>::quiet_NaN();
constexpr std::int64_t kMin64 = std::numeric_limits<std::int64_t>::min();
constexpr std::int64_t kMax64 = std::numeric_limits<std::int64_t>::max();
constexpr double kTwoTo63 = 9223372036854775808.0;

int sign(int v) { return (v > 0) - (v < 0); }

// FPS

TEST(FpsTest, SatCastToInt64BoundaryTable) {
  struct Row {
    double in;
    std::int64_t out;
  };
  // Below 2^63 the largest double is 2^63 - 1024; 2^52 + 1 converts exactly.
  const double below63 = std::nextafter(kTwoTo63, 0.0);
  const double aboveMinus63 = std::nextafter(-kTwoTo63, 0.0);
  const double belowMinus63 = std::nextafter(-kTwoTo63, -kInf);
  // clang-format off
  const Row rows[] = {
      {kNaN, 0}, {kInf, kMax64}, {-kInf, kMin64}, {1e300, kMax64}, {-1e300, kMin64},
      {kTwoTo63, kMax64}, {below63, 9223372036854774784LL},
      {-kTwoTo63, kMin64}, {belowMinus63, kMin64}, {aboveMinus63, -9223372036854774784LL},
      {2.5, 2}, {-2.5, -2}, {-0.5, 0}, {-0.0, 0}, {4503599627370497.0, 4503599627370497LL}};
  // clang-format on
  for (const Row& r : rows)
    EXPECT_EQ(FPS_SatCastToInt64(r.in), r.out) << "input " << r.in;
}

TEST(FpsTest, RoundingOnNegativeHugeAndNonFinite) {
  struct Row {
    double in, up, down;
  };
  for (const Row& r :
       {Row{-2.5, -2, -3}, Row{-0.5, 0, -1}, Row{2.0000001, 3, 2}, Row{-3, -3, -3}}) {
    EXPECT_EQ(FPS_RoundUp(r.in), r.up) << r.in;
    EXPECT_EQ(FPS_RoundDown(r.in), r.down) << r.in;
  }
  // Beyond 2^53 every double is integral and must come back unchanged.
  for (double v : {1e300, -1e300, kTwoTo63, -kTwoTo63, 9007199254740993.0 * 2}) {
    EXPECT_EQ(FPS_RoundUp(v), v);
    EXPECT_EQ(FPS_RoundDown(v), v);
  }
  EXPECT_EQ(FPS_RoundUp(kInf), kInf);
  EXPECT_EQ(FPS_RoundDown(-kInf), -kInf);
  EXPECT_TRUE(std::isnan(FPS_RoundUp(kNaN)));
  EXPECT_TRUE(std::isnan(FPS_RoundDown(kNaN)));
}

TEST(FpsTest, IsIntegerValueIsExact) {
  for (double v : {0.0, -0.0, 1.0, -7.0, 1e300, -kTwoTo63, 4503599627370497.0})
    EXPECT_TRUE(FPS_IsIntegerValue(v)) << v;
  for (double v : {1.0, -7.0, 1000000.0, 3.0}) {
    EXPECT_FALSE(FPS_IsIntegerValue(std::nextafter(v, kInf))) << v;
    EXPECT_FALSE(FPS_IsIntegerValue(std::nextafter(v, -kInf))) << v;
  }
  for (double v : {0.5, std::numeric_limits<double>::denorm_min(), kInf, -kInf, kNaN})
    EXPECT_FALSE(FPS_IsIntegerValue(v)) << v;
}

TEST(FpsTest, ValuesAreEqualTolerance) {
  constexpr double kMaxD = std::numeric_limits<double>::max();
  struct Row {
    double a, b;
    bool equal;
  };
  const Row rows[] = {{0.1 + 0.2, 0.3, true}, {1e20 + 5e4, 1e20, true}, {1e20 + 2e5, 1e20, false},
                      {0.0, -0.0, true},      {1.0, 0.99999999, false}, {0.0, 1e-300, false},
                      {kNaN, kNaN, false},    {kNaN, 1.0, false},       {kInf, kInf, true},
                      {-kInf, -kInf, true},   {kInf, -kInf, false},     {kInf, kMaxD, false},
                      {-kMaxD, -kInf, false}};
  for (const Row& r : rows)
    EXPECT_EQ(FPS_ValuesAreEqual(r.a, r.b), r.equal) << r.a << " vs " << r.b;
}

TEST(FpsTest, ValuesAreEqualSymmetricOverRandomSample) {
  std::mt19937_64 rng(20240611);
  std::uniform_real_distribution<double> mag(-1e6, 1e6);
  std::uniform_int_distribution<int> ulps(-8, 8);
  for (int i = 0; i < 5000; ++i) {
    const double a = mag(rng);
    double b = a;
    const int steps = ulps(rng);
    for (int s = 0; s < std::abs(steps); ++s)
      b = std::nextafter(b, steps > 0 ? kInf : -kInf);
    if (i % 5 == 0)
      b = mag(rng);
    ASSERT_EQ(FPS_ValuesAreEqual(a, b), FPS_ValuesAreEqual(b, a)) << a << " vs " << b;
    // Two ulps apart is always within the tolerance.
    if (std::abs(steps) <= 2 && i % 5 != 0) {
      ASSERT_TRUE(FPS_ValuesAreEqual(a, b)) << a << " vs " << b;
    }
  }
}

// WmCXString

TEST(WmCXStringTest, NullTextAndNumberConstructor) {
  const WmCXString fromNull(static_cast<const char*>(nullptr));
  EXPECT_TRUE(fromNull.isEmpty());
  EXPECT_STREQ(fromNull.c_str(), "");

  struct Row {
    long long n;
    bool isUnsigned, asHex;
    const char* text;
  };
  constexpr long long kMinLL = std::numeric_limits<long long>::min();
  // clang-format off
  const Row rows[] = {
      {-42, false, false, "-42"}, {-1, true, false, "18446744073709551615"},
      {-1, false, true, "0xffffffffffffffff"}, {255, false, true, "0xff"}, {0, true, true, "0x0"},
      {kMinLL, false, false, "-9223372036854775808"}, {kMinLL, true, false, "9223372036854775808"}};
  // clang-format on
  for (const Row& r : rows)
    EXPECT_EQ(WmCXString(r.n, r.isUnsigned, r.asHex).str(), r.text) << r.n;
}

std::string randomString(std::mt19937& rng, const std::string& alphabet, int maxLen) {
  std::uniform_int_distribution<int> len(0, maxLen);
  std::uniform_int_distribution<std::size_t> pick(0, alphabet.size() - 1);
  std::string s(static_cast<std::size_t>(len(rng)), ' ');
  for (char& c : s)
    c = alphabet[pick(rng)];
  return s;
}

TEST(WmCXStringTest, CompareAgreesWithReferenceOverRandomStrings) {
  std::mt19937 rng(7);
  const std::string alphabet = std::string("aAbB_z") + '\x7f' + '\x80' + '\xff';
  for (int i = 0; i < 3000; ++i) {
    const std::string a = randomString(rng, alphabet, 4);
    const std::string b = randomString(rng, alphabet, 4);
    ASSERT_EQ(sign(WmCXString(a).compareWith(b)), sign(a.compare(b)));
    std::string la = a, lb = b;
    for (char& c : la)
      c = static_cast<char>(std::tolower(static_cast<unsigned char>(c)));
    for (char& c : lb)
      c = static_cast<char>(std::tolower(static_cast<unsigned char>(c)));
    ASSERT_EQ(sign(WmCXString(a).compareWithNoCase(b)), sign(la.compare(lb)));
  }
  EXPECT_EQ(WmCXString("ABC").compareWithNoCase("abc"), 0);
  EXPECT_LT(WmCXString("ab").compareWithNoCase("ABC"), 0);
  EXPECT_LT(WmCXString("abc").compareWith("\xe0"), 0); // bytes compare as unsigned
}

TEST(WmCXStringTest, ReplaceAll) {
  struct Row {
    const char *text, *from, *to, *result;
    int count;
  };
  const Row rows[] = {{"aaa", "aa", "b", "ba", 1},       {"aaaa", "aa", "a", "aa", 2},
                      {"aaa", "a", "aa", "aaaaaa", 3}, // replacement is not scanned again
                      {"abcabc", "abc", "", "", 2},      {"hello", "xyz", "q", "hello", 0},
                      {"hello", "", "q", "hello", 0},    {"", "a", "b", "", 0},
                      {"a.b.c", ".", "::", "a::b::c", 2}};
  for (const Row& r : rows) {
    WmCXString s(r.text);
    EXPECT_EQ(s.replaceAll(r.from, r.to), r.count) << r.text << " / " << r.from;
    EXPECT_EQ(s.str(), r.result) << r.text << " / " << r.from;
  }
}

// Option name codec

TEST(CodecTest, EncodingIsItsOwnInverseAndMovesAlnum) {
  for (int byte = 1; byte < 256; ++byte) {
    const char c = static_cast<char>(byte);
    const char e = KvCOptionNameCodec::encodeChar(c);
    EXPECT_EQ(KvCOptionNameCodec::decodeChar(e), c) << byte;
    EXPECT_NE(e, '\0') << byte;
    if (std::isalnum(byte))
      EXPECT_NE(e, c) << byte;
    else
      EXPECT_EQ(e, c) << byte;
    const char text[2] = {c, '\0'};
    EXPECT_EQ(KvCOptionNameCodec::decode(KvCOptionNameCodec::encode(text).c_str()), text);
  }
  EXPECT_EQ(KvCOptionNameCodec::encode("GenCode_09"), "TraPbqr_54");
  EXPECT_EQ(KvCOptionNameCodec::encode(nullptr), "");
}

TEST(CodecTest, CompileTimeNameMatchesRunTimeEncoding) {
  static constexpr KvCEncodedOptionName name("OptLevel_3 z");
  static_assert(name.text[0] == 'B' && name.text[11] == 'm' && name.text[12] == '\0');
  EXPECT_STREQ(name.text, KvCOptionNameCodec::encode("OptLevel_3 z").c_str());
}

// Option value storage

int byContent(const char* const& a, const char* const& b) {
  if (!a || !b)
    return (a != nullptr) - (b != nullptr);
  return std::strcmp(a, b);
}

leda::set<const char*> nameSet(std::initializer_list<const char*> names) {
  leda::set<const char*> s(&byContent);
  for (const char* n : names)
    s.insert(n);
  return s;
}

TEST(OptionStorageTest, RegistrationIdsAndRefusal) {
  KvCOptionValueStorage storage;
  int first = -5, second = -5;
  ASSERT_TRUE(storage.registerInterface(nameSet({"n", "o"}), first));
  ASSERT_TRUE(storage.registerInterface(nameSet({"n"}), second));
  EXPECT_EQ(first, 1);
  EXPECT_EQ(second, 2);
  EXPECT_EQ(storage.getNumberOfOptions(1), 2u);
  EXPECT_EQ(storage.getNumberOfOptions(2), 1u);
  EXPECT_EQ(storage.getNumberOfOptions(0), 0u);
  EXPECT_EQ(storage.getNumberOfOptions(3), 0u);

  // The two interfaces share a name but not its value.
  EXPECT_TRUE(storage.setOptionValueByEncodedName(1, "n", 11));
  EXPECT_EQ(storage.getIntOptionValueByEncodedName(2, "n"), 0);
  EXPECT_TRUE(storage.setOptionValueByEncodedName(2, "n", 22));
  EXPECT_EQ(storage.getIntOptionValueByEncodedName(1, "n"), 11);

  int id = 77;
  EXPECT_FALSE(storage.registerInterface(nameSet({"a", nullptr}), id));
  EXPECT_EQ(id, 77);
  storage.setRefuseRegistration(true);
  EXPECT_FALSE(storage.registerInterface(nameSet({"b"}), id));
  EXPECT_EQ(id, 77);
  EXPECT_EQ(storage.getNumberOfInterfaces(), 2);
  storage.setRefuseRegistration(false);
  EXPECT_TRUE(storage.registerInterface(nameSet({}), id));
  EXPECT_EQ(id, 3);
}

TEST(OptionStorageTest, NamesComparedByContent) {
  KvCOptionValueStorage storage;
  std::string registered = "fbzr";
  int id = 0;
  ASSERT_TRUE(storage.registerInterface(nameSet({registered.c_str()}), id));
  registered = "xxxx"; // the storage keeps its own copy

  char other[] = "fbzr";
  EXPECT_TRUE(storage.isRegistered(id, other));
  EXPECT_FALSE(storage.isRegistered(id, "xxxx"));
  EXPECT_FALSE(storage.isRegistered(id, nullptr));
  EXPECT_TRUE(storage.setOptionValueByEncodedName(id, other, 2.5));
  const std::string again = "fbzr";
  EXPECT_EQ(storage.getDoubleOptionValueByEncodedName(id, again.c_str()), 2.5);
}

TEST(OptionStorageTest, TypedValuesUnregisteredNamesAndMismatch) {
  KvCOptionValueStorage storage;
  int id = 0;
  ASSERT_TRUE(storage.registerInterface(nameSet({"o", "i", "u", "d", "s", "m"}), id));
  mxArray_tag matrix(2, 3);

  EXPECT_TRUE(storage.setOptionValueByEncodedName(id, "o", true));
  EXPECT_TRUE(storage.setOptionValueByEncodedName(id, "i", -3));
  EXPECT_TRUE(storage.setOptionValueByEncodedName(id, "u", 4000000000u));
  EXPECT_TRUE(storage.setOptionValueByEncodedName(id, "d", 0.125));
  EXPECT_TRUE(storage.setOptionValueByEncodedName(id, "s", WmCXString("txt")));
  EXPECT_TRUE(storage.setOptionValueByEncodedName(id, "m", &matrix));

  EXPECT_TRUE(storage.getBoolOptionValueByEncodedName(id, "o"));
  EXPECT_EQ(storage.getIntOptionValueByEncodedName(id, "i"), -3);
  EXPECT_EQ(storage.getUnsignedIntOptionValueByEncodedName(id, "u"), 4000000000u);
  EXPECT_EQ(storage.getDoubleOptionValueByEncodedName(id, "d"), 0.125);
  EXPECT_EQ(storage.getStringOptionValueByEncodedName(id, "s").str(), "txt");
  EXPECT_EQ(storage.getMXArrayOptionValueByEncodedName(id, "m"), &matrix);

  // A getter of another type reads the zero of its own type.
  EXPECT_EQ(storage.getIntOptionValueByEncodedName(id, "o"), 0);
  EXPECT_EQ(storage.getUnsignedIntOptionValueByEncodedName(id, "i"), 0u);
  EXPECT_EQ(storage.getIntOptionValueByEncodedName(id, "u"), 0);
  EXPECT_FALSE(storage.getBoolOptionValueByEncodedName(id, "m"));
  EXPECT_TRUE(storage.getStringOptionValueByEncodedName(id, "d").isEmpty());
  EXPECT_EQ(storage.getMXArrayOptionValueByEncodedName(id, "s"), nullptr);

  // The last setter decides the type.
  EXPECT_TRUE(storage.setOptionValueByEncodedName(id, "i", 1.5));
  EXPECT_EQ(storage.getIntOptionValueByEncodedName(id, "i"), 0);
  EXPECT_EQ(storage.getDoubleOptionValueByEncodedName(id, "i"), 1.5);

  // Unregistered names and ids: refused, nothing stored, zero read.
  EXPECT_FALSE(storage.setOptionValueByEncodedName(id, "zz", 9));
  EXPECT_FALSE(storage.isRegistered(id, "zz"));
  EXPECT_EQ(storage.getIntOptionValueByEncodedName(id, "zz"), 0);
  EXPECT_FALSE(storage.setOptionValueByEncodedName(id + 1, "i", 9));
  EXPECT_FALSE(storage.setOptionValueByEncodedName(0, "i", 9));
  EXPECT_FALSE(storage.setOptionValueByEncodedName(id, nullptr, 9));
  EXPECT_EQ(storage.getNumberOfOptions(id), 6u);
}

TEST(OptionStorageTest, DumpSortedByDecodedName) {
  KvCOptionValueStorage storage;
  // Encoded, "zeta" (mrgn) sorts before "alpha" (nycun) and "mode" (zbqr).
  const std::string alpha = KvCOptionNameCodec::encode("alpha");
  const std::string mode = KvCOptionNameCodec::encode("mode");
  const std::string zeta = KvCOptionNameCodec::encode("zeta");
  int id = 0;
  ASSERT_TRUE(storage.registerInterface(nameSet({mode.c_str(), zeta.c_str(), alpha.c_str()}), id));
  storage.setOptionValueByEncodedName(id, zeta.c_str(), WmCXString("fast"));
  storage.setOptionValueByEncodedName(id, alpha.c_str(), 7u);

  KV_Dump dump;
  storage.dumpOptions(&dump, id);
  EXPECT_EQ(dump.getText(), "alpha = 7\nmode = <unset>\nzeta = \"fast\"\n");

  KV_Dump untouched;
  storage.dumpOptions(&untouched, id + 1);
  storage.dumpOptions(&untouched, 0);
  storage.dumpOptions(nullptr, id);
  EXPECT_EQ(untouched.getText(), "");
}

// Counting memory controller

TEST(MemControllerTest, CountsBlocksAndForeignFrees) {
  KvCCountingMemController mem;
  void* a = mem.allocMemBlock(16);
  void* b = mem.allocMemBlock(0);
  ASSERT_NE(a, nullptr);
  ASSERT_NE(b, nullptr);
  EXPECT_NE(a, b);
  EXPECT_EQ(mem.getOutstandingBlocks(), 2u);
  EXPECT_EQ(mem.getOutstandingBytes(), 16u);

  mem.freeMemBlock(a);
  mem.freeMemBlock(a); // double free: counted, never given to the heap
  int onStack = 0;
  mem.freeMemBlock(&onStack); // foreign: would crash the heap if passed on
  mem.freeMemBlock(nullptr);  // ignored, not foreign
  EXPECT_EQ(mem.getForeignFrees(), 2u);
  EXPECT_EQ(mem.getOutstandingBlocks(), 1u);
  EXPECT_EQ(mem.getOutstandingBytes(), 0u);
  EXPECT_EQ(mem.getTotalBlocks(), 2u);
  // `b` stays outstanding; the destructor gives it back (checked by the leak sanitizer).
}

TEST(MemControllerTest, FailAfter) {
  KvCCountingMemController mem;
  mem.failAfter(2);
  void* a = mem.allocMemBlock(8);
  void* b = mem.allocMemBlock(8);
  EXPECT_NE(a, nullptr);
  EXPECT_NE(b, nullptr);
  EXPECT_EQ(mem.allocMemBlock(8), nullptr);
  mem.freeMemBlock(a);
  EXPECT_EQ(mem.allocMemBlock(8), nullptr); // freeing does not give credit back
  EXPECT_EQ(mem.getTotalBlocks(), 2u);
  EXPECT_EQ(mem.getOutstandingBlocks(), 1u);
  mem.failAfter(0);
  EXPECT_EQ(mem.allocMemBlock(1), nullptr);
  mem.freeMemBlock(b);
  EXPECT_EQ(mem.getForeignFrees(), 0u);
}

// Message server

class MessageServerTest : public ::testing::Test {
protected:
  void SetUp() override { reset(); }
  void TearDown() override { reset(); }
  static void reset() {
    server->clear();
    server->setShowInternalInfo(false);
    server->setDebugAssertionHandler(nullptr, nullptr);
  }
  static inline KvCMessageServer* server = KvCMessageServer::getMessageServer();
};

std::string describe(const KvCMessageRecord& m) {
  return std::to_string(m.severity) + "|" + std::to_string(m.number) + "|" + m.srcRefText.str() +
         "|" + m.category.str() + "|" + m.text.str();
}

std::string describe(const KvCDebugAssertionRecord& a) {
  return a.file.str() + ":" + std::to_string(a.line) + ":" + a.expression.str();
}

TEST_F(MessageServerTest, RecordsInOrderWithSrcRefTextAtMessageTime) {
  KvCSrcRefServer refs;
  KvCInternalSrcRef* ref = refs.getSrcRef();
  ref->setLocation("gen.cpp", 12);
  ref->setCause("first");

  EXPECT_TRUE(server->putMessage(ERR_SEVERITY_WARNING, 101, ref, "cat", "text one"));
  ref->setCause("second");
  EXPECT_TRUE(server->putMessage(ERR_SEVERITY_ERROR, 102, nullptr, nullptr, nullptr));

  const auto& messages = server->getMessages();
  ASSERT_EQ(messages.size(), 2u);
  EXPECT_EQ(messages[0].srcRef, ref);
  EXPECT_EQ(describe(messages[0]), "1|101|gen.cpp:12 (first)|cat|text one");
  EXPECT_EQ(messages[1].srcRef, nullptr);
  EXPECT_EQ(describe(messages[1]), "2|102|||");

  server->setShowInternalInfo(true);
  server->clear();
  EXPECT_TRUE(server->getMessages().empty());
  EXPECT_TRUE(server->ShowInternalInfo()); // settings survive clear()
}

struct Captured {
  int calls = 0;
  std::string last;
};

void captureAssertion(void* context, const char* file, int line, const char* expression) {
  auto* c = static_cast<Captured*>(context);
  ++c->calls;
  c->last = std::string(file) + ":" + std::to_string(line) + ":" + expression;
}

TEST_F(MessageServerTest, DebugAssertionHandlerReplaceAndRestore) {
  server->raiseDebugAssertion("a.cpp", 1, "x > 0");
  ASSERT_EQ(server->getDebugAssertions().size(), 1u);
  EXPECT_EQ(describe(server->getDebugAssertions()[0]), "a.cpp:1:x > 0");

  Captured captured;
  KvCMessageServer::DebugAssertionHandler previous = nullptr;
  void* previousContext = nullptr;
  server->setDebugAssertionHandler(&captureAssertion, &captured, &previous, &previousContext);
  server->raiseDebugAssertion("b.cpp", 2, "y");
  EXPECT_EQ(captured.calls, 1);
  EXPECT_EQ(captured.last, "b.cpp:2:y");
  EXPECT_EQ(server->getDebugAssertions().size(), 1u); // not recorded while replaced

  // Putting the previous handler back restores recording.
  server->setDebugAssertionHandler(previous, previousContext);
  server->raiseDebugAssertion(nullptr, 3, nullptr);
  EXPECT_EQ(captured.calls, 1);
  ASSERT_EQ(server->getDebugAssertions().size(), 2u);
  EXPECT_EQ(describe(server->getDebugAssertions()[1]), ":3:");

  // A null handler also restores the recording default.
  server->setDebugAssertionHandler(&captureAssertion, &captured);
  server->setDebugAssertionHandler(nullptr, &captured);
  server->raiseDebugAssertion("c.cpp", 4, "z");
  EXPECT_EQ(captured.calls, 1);
  EXPECT_EQ(server->getDebugAssertions().size(), 3u);
}

// Dump

TEST(DumpTest, NestedBlocksAndUnbalancedClose) {
  KV_Dump dump;
  dump.endObject(); // nothing open: ignored
  dump.beginObject("outer", "Block");
  dump.writeValue("k", "v");
  dump.beginObject("inner", "Port");
  dump.writeLine("raw");
  dump.endObject();
  dump.endObject();
  dump.endObject();
  dump.writeValue("top", "1");
  EXPECT_EQ(dump.getDepth(), 0);
  EXPECT_EQ(dump.getText(), "outer : Block {\n"
                            "  k = v\n"
                            "  inner : Port {\n"
                            "    raw\n"
                            "  }\n"
                            "}\n"
                            "top = 1\n");
}

class NamedDumpable : public KV_Dumpable {
public:
  WmCXString getTypeNameForDump() const override { return "Widget"; }
};

TEST(DumpTest, DefaultContentsUseOverriddenTypeName) {
  NamedDumpable object;
  EXPECT_EQ(object.getNameForDump().str(), "Widget");
  EXPECT_EQ(object.getLinkNameForDump().str(), "Widget");
  KV_Dump dump;
  dump.beginObject("parent", "P");
  EXPECT_EQ(object.dumpContents(&dump, true), &dump);
  object.dump(&dump, false);
  dump.endObject();
  EXPECT_EQ(dump.getText(),
            "parent : P {\n  Widget : Widget {\n  }\n  Widget : Widget {\n  }\n}\n");
  EXPECT_EQ(object.dumpContents(nullptr, true), nullptr);
  object.dumpStart(nullptr, "x");
  object.dumpFinish(nullptr);
}

// Names, identifiers, name spaces, source references

TEST(NamesTest, ValidityAndCooking) {
  struct Row {
    const char* raw;
    bool valid;
    const char* cooked;
  };
  const Row rows[] = {{"abc_1", true, "abc_1"},  {"_", true, "_"},          {"", false, "_"},
                      {"1x", false, "_1x"},      {"a b", false, "a_b"},     {"9", false, "_9"},
                      {"a-b.c", false, "a_b_c"}, {"\xc3\xa4", false, "__"}, {"Z9_", true, "Z9_"}};
  for (const Row& r : rows) {
    EXPECT_EQ(KvCNames::isValidCIdentifier(r.raw), r.valid) << r.raw;
    const WmCXString cooked = KvCNames::cookName(r.raw);
    EXPECT_EQ(cooked.str(), r.cooked) << r.raw;
    EXPECT_TRUE(KvCNames::isValidCIdentifier(cooked)) << r.raw;
    EXPECT_EQ(KvCNames::cookName(cooked).str(), cooked.str()) << r.raw;
  }
  KvCCIdentifier id(WmCXString("2 fast"));
  EXPECT_EQ(id.getRawName().str(), "2 fast");
  EXPECT_EQ(id.getCookedName().str(), "_2_fast");
  id = static_cast<const char*>(nullptr);
  EXPECT_EQ(id.getCookedName().str(), "_");
}

TEST(NamesTest, NameSpaceUniqueNames) {
  KvCNameSpace scope;
  EXPECT_EQ(scope.getUniqueName("x").str(), "x");
  EXPECT_TRUE(scope.add("x"));
  EXPECT_FALSE(scope.add("x"));
  EXPECT_TRUE(scope.add("x_1"));
  EXPECT_TRUE(scope.add("x_2"));
  EXPECT_TRUE(scope.add("x_4"));
  EXPECT_EQ(scope.getUniqueName("x").str(), "x_3");
  EXPECT_EQ(scope.size(), 4u); // not taken by the call
  EXPECT_TRUE(scope.remove("x_1"));
  EXPECT_FALSE(scope.remove("x_1"));
  EXPECT_EQ(scope.getUniqueName("x").str(), "x_1");
  EXPECT_EQ(scope.getUniqueName("x_2").str(), "x_2_1");
}

TEST(SupportSrcRefTest, TextAndPointerStability) {
  KvCSrcRefServer refs;
  KvCInternalSrcRef* first = refs.getSrcRef();
  first->setLocation("pass.cpp", 77);
  first->setCause("temp");
  EXPECT_EQ(first->getText().str(), "pass.cpp:77 (temp)");
  KvCSrcRef* model = refs.createModelSrcRef("Model/Block");

  std::vector<KvCInternalSrcRef*> made;
  for (int i = 0; i < 2000; ++i) {
    made.push_back(refs.getSrcRef());
    made.back()->setLocation("f.cpp", i);
  }
  EXPECT_EQ(refs.getNumberOfSrcRefs(), 2002u);
  EXPECT_EQ(first->getText().str(), "pass.cpp:77 (temp)");
  EXPECT_EQ(model->getText().str(), "Model/Block");
  EXPECT_EQ(made[1234]->getText().str(), "f.cpp:1234 ()");
  EXPECT_EQ(std::set<void*>(made.begin(), made.end()).size(), made.size());
}

} // namespace
