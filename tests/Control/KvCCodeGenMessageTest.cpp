#include "HulCvTools/Control/KvCCodeGenMessage.h"
#include "MessageServerFixture.h"
#include "platform/support/KvCSrcRef.h"

#include <cstring>
#include <functional>
#include <string>

namespace {

using MessageTest = MessageServerFixture;

struct Expected {
  const char* name;
  std::function<void(const KvCSrcRef*)> emit;
  int number;
  int severity;
  const char* category;
  bool hasSrcRef;
  std::string text;
};

std::string internalError(const char* code, int number) {
  return std::string("Internal error. Error code: ") + code + " " + std::to_string(number) +
         ". Contact Velmora's technical support team.";
}

TEST_F(MessageTest, EveryMessageHasItsNumberSeverityCategorySourceAndText) {
  const std::vector<Expected> table = {
      {"10007", [](const KvCSrcRef*) { KvCCodeGenMessage::msg10007("KvCInlineSymbolDb", 77); },
       10007, 3, "General Messages", false, internalError("KvCInlineSymbolDb", 77)},
      {"10008", [](const KvCSrcRef* r) { KvCCodeGenMessage::msg10008(r, "a/b.cpp", 233); }, 10008,
       3, "General Messages", true, internalError("a/b.cpp", 233)},
      {"21272", [](const KvCSrcRef* r) { KvCCodeGenMessage::msg21272(r, "OSEK1"); }, 21272, 2,
       "Counter Alarm Block Messages", true,
       "CounterAlarm: No function kind to get the CounterValue is specified for the currently "
       "selected RTOS OSEK1. Because of this, the CounterValue block output cannot be used and "
       "should therefore be connected with a Terminator block."},
      {"21273", [](const KvCSrcRef* r) { KvCCodeGenMessage::msg21273(r, "OSEK2"); }, 21273, 2,
       "Counter Alarm Block Messages", true,
       "CounterAlarm: No function kind to get the CounterValue from an ISR is specified for "
       "the currently selected RTOS OSEK2. Because of this, the CounterValue block output "
       "cannot be used from an ISR."},
      {"21274", [](const KvCSrcRef* r) { KvCCodeGenMessage::msg21274(r, "OSEK3"); }, 21274, 2,
       "Counter Alarm Block Messages", true,
       "CounterAlarm: No function kind to initialize the counter is specified for the "
       "currently selected RTOS OSEK3. Use the 'Omit counter initialization' option."},
      {"30179", [](const KvCSrcRef* r) { KvCCodeGenMessage::msg30179(r, "MyFcn"); }, 30179, 2,
       "RTOS Messages", true,
       "The number of arguments for the user-defined function MyFcn differ."},
      {"30243", [](const KvCSrcRef* r) { KvCCodeGenMessage::msg30243(r, "MyMacro"); }, 30243, 2,
       "RTOS Messages", true,
       "Function template for user-defined function or macro MyMacro missing"},
      {"31688", [](const KvCSrcRef* r) { KvCCodeGenMessage::msg31688(r, "TickType", "width"); },
       31688, 1, "RTOS Messages", true,
       "The RTOS data type TickType is specified in the RTOSInfo file and also in the Data "
       "Dictionary. The data type from the Data Dictionary will be used. The two "
       "specifications differ in the following properties: width"},
      {"32300", [](const KvCSrcRef* r) { KvCCodeGenMessage::msg32300(r, "Tpl"); }, 32300, 1,
       "RTOS Messages", true,
       "At least one FileSpecification object of the module has EmitFile set to 'on' and is "
       "referenced by RTOS function template Tpl. The EmitFile property is ignored."},
  };
  KvCSrcRef where("model/Subsystem/Block");
  for (const Expected& e : table) {
    SCOPED_TRACE(e.name);
    server().clear();
    e.emit(&where);
    ASSERT_EQ(messages().size(), 1u);
    const KvCMessageRecord& m = messages().front();
    EXPECT_EQ(m.number, e.number);
    EXPECT_EQ(static_cast<int>(m.severity), e.severity);
    EXPECT_EQ(m.category.str(), e.category);
    EXPECT_EQ(m.srcRef, e.hasSrcRef ? &where : nullptr);
    EXPECT_EQ(m.text.str(), e.text);
  }
}

TEST_F(MessageTest, NullStringArgumentsPrintAsNullMark) {
  KvCCodeGenMessage::msg31688(nullptr, "TickType", nullptr);
  KvCCodeGenMessage::msg10007(nullptr, 5);
  ASSERT_EQ(messages().size(), 2u);
  const std::string first = messages()[0].text.str();
  EXPECT_NE(first.find("following properties: _NULL_"), std::string::npos) << first;
  EXPECT_NE(first.find("data type TickType is"), std::string::npos) << first;
  EXPECT_EQ(messages()[1].text.str(), internalError("_NULL_", 5));
}

// The fixed part of 30179's text around its one %s.
constexpr const char* kPrefix30179 = "The number of arguments for the user-defined function ";
constexpr const char* kSuffix30179 = " differ.";

std::size_t argumentLengthFilling(std::size_t textLength) {
  return textLength - std::strlen(kPrefix30179) - std::strlen(kSuffix30179);
}

TEST_F(MessageTest, TextThatJustFitsIsNotMarked) {
  const std::string name(argumentLengthFilling(16383), 'f');
  KvCCodeGenMessage::msg30179(nullptr, name.c_str());
  ASSERT_EQ(messages().size(), 1u);
  const std::string text = messages()[0].text.str();
  EXPECT_EQ(text.size(), 16383u);
  EXPECT_TRUE(text == kPrefix30179 + name + kSuffix30179) << "the whole text, unmarked";
}

TEST_F(MessageTest, TextOneTooLongIsCutAndMarkedAtTheBufferEnd) {
  for (std::size_t textLength : {16384u, 16385u, 20000u, 100000u}) {
    SCOPED_TRACE(textLength);
    server().clear();
    const std::string name(argumentLengthFilling(textLength), 'g');
    KvCCodeGenMessage::msg30179(nullptr, name.c_str());
    ASSERT_EQ(messages().size(), 1u);
    const std::string text = messages()[0].text.str();
    EXPECT_EQ(text.size(), 16383u);
    EXPECT_EQ(text.substr(text.size() - 4), " ...");
    const std::string full = kPrefix30179 + name + kSuffix30179;
    EXPECT_TRUE(text.compare(0, 16379, full, 0, 16379) == 0) << "the text before the mark";
    EXPECT_EQ(std::strlen(KvCCodeGenMessage::MSG_Buffer), 16383u);
  }
}

TEST_F(MessageTest, ShortMessageAfterLongOneIsNotAffectedByTheOldMark) {
  const std::string name(20000, 'h');
  KvCCodeGenMessage::msg30243(nullptr, name.c_str());
  KvCCodeGenMessage::msg30243(nullptr, "m");
  ASSERT_EQ(messages().size(), 2u);
  EXPECT_EQ(messages()[1].text.str(),
            "Function template for user-defined function or macro m missing");
}

} // namespace
