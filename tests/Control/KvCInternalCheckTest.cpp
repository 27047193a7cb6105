#include "HulCvTools/Control/KvCInternalCheck.h"
#include "MessageServerFixture.h"
#include "platform/support/KvCSrcRef.h"

#include <string>
#include <vector>

namespace {

using InternalCheckTest = MessageServerFixture;

const char* const kThisFile = __FILE__;

TEST_F(InternalCheckTest, FailedCheckEmits10007WithCodeAndNumberButNoReportWhenHidden) {
  KV_INTERNAL_CHECK("KvCFcgQuery", 290);
  ASSERT_EQ(messages().size(), 1u);
  EXPECT_EQ(messages()[0].number, 10007);
  EXPECT_EQ(messages()[0].srcRef, nullptr);
  EXPECT_EQ(messages()[0].text.str(),
            "Internal error. Error code: KvCFcgQuery 290. Contact Velmora's technical support "
            "team.");
  EXPECT_TRUE(server().getDebugAssertions().empty());
}

TEST_F(InternalCheckTest, ShownInternalInfoRaisesDebugReportBeforeTheMessage) {
  server().setShowInternalInfo(true);
  std::vector<std::string> order;
  struct Context {
    std::vector<std::string>* order;
    KvCMessageServer* server;
  } context{&order, &server()};
  server().setDebugAssertionHandler(
      [](void* raw, const char* file, int line, const char* expression) {
        auto* c = static_cast<Context*>(raw);
        c->order->push_back(std::string("report ") + file + ":" + std::to_string(line) + " " +
                            expression + " after " +
                            std::to_string(c->server->getMessages().size()) + " messages");
      },
      &context);
  const int line = __LINE__ + 1;
  KV_INTERNAL_CHECK("KvCFcgQuery", 290);
  ASSERT_EQ(messages().size(), 1u);
  if (!KvCInternalCheck::hasDebugChecks()) {
    EXPECT_TRUE(order.empty());
    return;
  }
  ASSERT_EQ(order.size(), 1u);
  EXPECT_EQ(order[0], std::string("report ") + kThisFile + ":" + std::to_string(line) +
                          " 0 after 0 messages");
}

TEST_F(InternalCheckTest, CheckWithSourceReferenceEmits10008) {
  KvCSrcRef where("model/Block");
  KV_INTERNAL_CHECK_SRC(&where, "KvCGenericFunctionCallGraph", 233);
  ASSERT_EQ(messages().size(), 1u);
  EXPECT_EQ(messages()[0].number, 10008);
  EXPECT_EQ(messages()[0].srcRef, &where);
  EXPECT_EQ(messages()[0].srcRefText.str(), "model/Block");
  EXPECT_NE(messages()[0].text.str().find("KvCGenericFunctionCallGraph 233."), std::string::npos);
}

TEST_F(InternalCheckTest, DebugAssertionReportsTheConditionTextAndEmitsNoMessage) {
  server().setShowInternalInfo(true);
  const void* pParentOperation = nullptr;
  const int line = __LINE__ + 1;
  KV_DEBUG_ASSERT(pParentOperation);
  EXPECT_TRUE(messages().empty());
  const auto& reports = server().getDebugAssertions();
  if (!KvCInternalCheck::hasDebugChecks()) {
    EXPECT_TRUE(reports.empty());
    return;
  }
  ASSERT_EQ(reports.size(), 1u);
  EXPECT_EQ(reports[0].expression.str(), "pParentOperation");
  EXPECT_EQ(reports[0].file.str(), kThisFile);
  EXPECT_EQ(reports[0].line, line);
}

TEST_F(InternalCheckTest, DebugAssertionIsSilentWhileInternalInfoIsHidden) {
  KV_DEBUG_ASSERT(1 + 1 == 3);
  EXPECT_TRUE(server().getDebugAssertions().empty());
  EXPECT_TRUE(messages().empty());
}

TEST_F(InternalCheckTest, VerifyYieldsTheConditionEvaluatedOnceAndReportsOnlyFailures) {
  int evaluations = 0;
  auto count = [&](bool value) {
    ++evaluations;
    return value;
  };
  EXPECT_TRUE(KV_VERIFY(count(true), "KvCX", 1));
  EXPECT_TRUE(messages().empty());
  EXPECT_FALSE(KV_VERIFY(count(false), "KvCX", 2));
  EXPECT_EQ(evaluations, 2);
  ASSERT_EQ(messages().size(), 1u);
  EXPECT_NE(messages()[0].text.str().find("KvCX 2."), std::string::npos);
}

TEST_F(InternalCheckTest, ReplacedHandlerCanBeRestored) {
  server().setShowInternalInfo(true);
  int calls = 0;
  KvCMessageServer::DebugAssertionHandler previous = nullptr;
  void* previousContext = nullptr;
  server().setDebugAssertionHandler(
      [](void* c, const char*, int, const char*) { ++*static_cast<int*>(c); }, &calls, &previous,
      &previousContext);
  KV_DEBUG_ASSERT(false);
  server().setDebugAssertionHandler(previous, previousContext);
  KV_DEBUG_ASSERT(false);
  const int expected = KvCInternalCheck::hasDebugChecks() ? 1 : 0;
  EXPECT_EQ(calls, expected);
  EXPECT_EQ(server().getDebugAssertions().size(), static_cast<std::size_t>(expected));
}

} // namespace
