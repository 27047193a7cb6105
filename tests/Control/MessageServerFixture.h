// A fixture that gives every test a clean message server and puts it back as it found it.
#ifndef HULCV_TESTS_CONTROL_MESSAGESERVERFIXTURE_H
#define HULCV_TESTS_CONTROL_MESSAGESERVERFIXTURE_H

#include "platform/support/KvCMessageServer.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

class MessageServerFixture : public ::testing::Test {
protected:
  void SetUp() override { reset(); }
  void TearDown() override { reset(); }

  static KvCMessageServer& server() { return *KvCMessageServer::getMessageServer(); }
  static const std::vector<KvCMessageRecord>& messages() { return server().getMessages(); }
  // The expressions of the debug assertion reports, in order.
  static std::vector<std::string> reports() {
    std::vector<std::string> expressions;
    for (const KvCDebugAssertionRecord& r : server().getDebugAssertions())
      expressions.push_back(r.expression.str());
    return expressions;
  }

private:
  static void reset() {
    server().clear();
    server().setShowInternalInfo(false);
    server().setDebugAssertionHandler(nullptr, nullptr);
  }
};

#endif
