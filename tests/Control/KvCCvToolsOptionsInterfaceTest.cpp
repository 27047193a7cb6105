#include "HulCvTools/Control/KvCCvToolsOptionsInterface.h"
#include "platform/support/KV_Dump.h"
#include "platform/support/KvCOptionNameCodec.h"
#include "platform/support/KvCOptionValueStorage.h"
#include "platform/support/mxArray.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <map>
#include <memory>
#include <set>
#include <sstream>
#include <string>
#include <vector>

namespace {

class OptionsInterfaceTest : public ::testing::Test {
protected:
  void SetUp() override {
    for (int i = 0; i < 4; ++i)
      matrices.push_back(std::make_unique<mxArray_tag>(i + 1, 2));
  }
  const mxArray_tag* matrix(int i) const { return matrices[static_cast<std::size_t>(i % 4)].get(); }

  KvCOptionValueStorage storage;
  KvCCvToolsOptionsInterface options;
  std::vector<std::unique_ptr<mxArray_tag>> matrices;
};

TEST(OptionTable, CountsPerKindAndEncodedNamesAreDistinctAndReversible) {
  std::map<std::string, int> kinds;
  std::set<std::string> encoded;
  std::vector<std::string> names;
#define HULCV_OPTION(Kind, Name)                                                                   \
  ++kinds[#Kind];                                                                                  \
  names.push_back(#Name);
#include "HulCvTools/Control/KvCCvToolsOptions.def"
  EXPECT_EQ(kinds["Bool"], 146);
  EXPECT_EQ(kinds["Int"], 31);
  EXPECT_EQ(kinds["UInt"], 3);
  EXPECT_EQ(kinds["Double"], 12);
  EXPECT_EQ(kinds["String"], 33);
  EXPECT_EQ(kinds["MxArray"], 4);
  ASSERT_EQ(names.size(), 229u);
  for (const std::string& name : names) {
    const std::string e = KvCOptionNameCodec::encode(name.c_str());
    EXPECT_NE(e, name);
    EXPECT_EQ(KvCOptionNameCodec::decode(e.c_str()), name);
    encoded.insert(e);
  }
  EXPECT_EQ(encoded.size(), 229u);
}

// Per kind: the value option `i` gets, how the storage is read and written directly.
#define HULCV_VALUE_Bool(i) true
#define HULCV_VALUE_Int(i) (1000 + (i))
#define HULCV_VALUE_UInt(i) (4000000000u + static_cast<unsigned>(i))
#define HULCV_VALUE_Double(i) (0.5 + (i))
#define HULCV_VALUE_String(i) (WmCXString("value-") + WmCXString((i), false, false))
#define HULCV_VALUE_MxArray(i) matrix(i)
#define HULCV_ZERO_Bool false
#define HULCV_ZERO_Int 0
#define HULCV_ZERO_UInt 0u
#define HULCV_ZERO_Double 0.0
#define HULCV_ZERO_String WmCXString()
#define HULCV_ZERO_MxArray static_cast<const mxArray_tag*>(nullptr)
#define HULCV_READ_Bool getBoolOptionValueByEncodedName
#define HULCV_READ_Int getIntOptionValueByEncodedName
#define HULCV_READ_UInt getUnsignedIntOptionValueByEncodedName
#define HULCV_READ_Double getDoubleOptionValueByEncodedName
#define HULCV_READ_String getStringOptionValueByEncodedName
#define HULCV_READ_MxArray getMXArrayOptionValueByEncodedName

// Registers a first interface with the same names, so that a getter or setter using id 1
// instead of the assigned id 2 reads or writes the wrong interface.
void registerDecoy(KvCOptionValueStorage& storage) {
  static std::vector<std::string> names;
  names.clear();
#define HULCV_OPTION(Kind, Name) names.push_back(KvCOptionNameCodec::encode(#Name));
#include "HulCvTools/Control/KvCCvToolsOptions.def"
  leda::set<const char*> decoy;
  for (const std::string& n : names)
    decoy.insert(n.c_str());
  int id = -1;
  ASSERT_TRUE(storage.registerInterface(decoy, id));
  ASSERT_EQ(id, 1);
}

TEST_F(OptionsInterfaceTest, EverySetterWritesOnlyItsOwnOptionUnderTheAssignedId) {
  registerDecoy(storage);
  ASSERT_TRUE(options.boot(&storage));
  const int id = options.getInterfaceId();
  ASSERT_EQ(id, 2);
  int i = 0;
  // Write option i, read it back from the storage, then reset it: a setter that used
  // another name, another id or another type would leave the value unseen.
#define HULCV_OPTION(Kind, Name)                                                                   \
  {                                                                                                \
    SCOPED_TRACE(#Name);                                                                           \
    const std::string enc = KvCOptionNameCodec::encode(#Name);                                     \
    EXPECT_TRUE(options.set##Name(HULCV_VALUE_##Kind(i)));                                         \
    EXPECT_EQ(storage.HULCV_READ_##Kind(id, enc.c_str()), HULCV_VALUE_##Kind(i));                  \
    EXPECT_EQ(storage.HULCV_READ_##Kind(1, enc.c_str()), HULCV_ZERO_##Kind);                       \
    EXPECT_TRUE(options.set##Name(HULCV_ZERO_##Kind));                                             \
    ++i;                                                                                           \
  }
#include "HulCvTools/Control/KvCCvToolsOptions.def"
  EXPECT_EQ(i, 229);
}

TEST_F(OptionsInterfaceTest, EveryGetterReadsOnlyItsOwnOptionUnderTheAssignedId) {
  registerDecoy(storage);
  ASSERT_TRUE(options.boot(&storage));
  const int id = options.getInterfaceId();
  int i = 0;
#define HULCV_OPTION(Kind, Name)                                                                   \
  {                                                                                                \
    SCOPED_TRACE(#Name);                                                                           \
    const std::string enc = KvCOptionNameCodec::encode(#Name);                                     \
    EXPECT_EQ(options.get##Name(), HULCV_ZERO_##Kind);                                             \
    ASSERT_TRUE(storage.setOptionValueByEncodedName(id, enc.c_str(), HULCV_VALUE_##Kind(i)));      \
    EXPECT_EQ(options.get##Name(), HULCV_VALUE_##Kind(i));                                         \
    ASSERT_TRUE(storage.setOptionValueByEncodedName(id, enc.c_str(), HULCV_ZERO_##Kind));          \
    ++i;                                                                                           \
  }
#include "HulCvTools/Control/KvCCvToolsOptions.def"
  EXPECT_EQ(i, 229);
}

TEST_F(OptionsInterfaceTest, UnbootedInterfaceAnswersZeroAndRefusesToSet) {
  EXPECT_FALSE(options.setInlineMaxCost(5));
  EXPECT_EQ(options.getInlineMaxCost(), 0);
  EXPECT_EQ(options.getRtosName().str(), "");
  EXPECT_EQ(options.getInlineCostMatrix(), nullptr);
}

TEST_F(OptionsInterfaceTest, DumpWrapsTheStoragesDumpInTheInterfacesBlock) {
  ASSERT_TRUE(options.boot(&storage));
  options.setRtosName("OSEK_X");
  options.setInlineMaxDepth(7);
  EXPECT_EQ(options.getNameForDump().str(), "Options");
  EXPECT_EQ(options.getTypeNameForDump().str(), "Options");
  KV_Dump dump;
  EXPECT_EQ(options.dumpContents(&dump, false), &dump);
  std::istringstream text(dump.getText());
  std::vector<std::string> lines;
  for (std::string line; std::getline(text, line);)
    lines.push_back(line);
  ASSERT_EQ(lines.size(), 231u);
  EXPECT_EQ(lines.front(), "KvCCvToolsOptionsInterface : Options {");
  EXPECT_EQ(lines.back(), "}");
  EXPECT_NE(std::find(lines.begin(), lines.end(), "  RtosName = \"OSEK_X\""), lines.end());
  EXPECT_NE(std::find(lines.begin(), lines.end(), "  InlineMaxDepth = 7"), lines.end());
  EXPECT_EQ(dump.getDepth(), 0);
}

} // namespace
