#include "HulCvTools/ElocQuery/KvCOperationQuery.h"
#include "platform/builder/AppBuilder.h"
#include "platform/icode/KV_ExprLocation.h"
#include "platform/icode/KV_Operation.h"
#include "platform/icode/KvCCodeBlockOperation.h"

#include <gtest/gtest.h>

#include <memory>
#include <set>

namespace {

class OperationQueryTest : public ::testing::Test {
protected:
  // An operation of `kind` without operands (the decision does not look at them).
  KV_Operation* operationOf(tagKvEOperatorKind kind) {
    return app.data().make<KV_Operation>(KV_OpOperator::get(kind));
  }
  static bool canExpand(KV_Operation* op) {
    return KvCOperationQuery::canOperationExpandToNotSideEffectFreeParamSymbol(op);
  }

  AppBuilder app;
};

// The preprocessor concatenation and the string append are kinds the decision does not
// name: they get its cautious answer.
TEST_F(OperationQueryTest, OnlyHelperPronePlainKindsCanExpand) {
  const std::set<tagKvEOperatorKind> canExpandKinds = {KV_OP_ADD,
                                                       KV_OP_SUB,
                                                       KV_OP_MUL,
                                                       KV_OP_DIV,
                                                       KV_OP_MOD,
                                                       KV_OP_NEG,
                                                       KV_OP_ABS,
                                                       KV_OP_SATURATE,
                                                       KV_OP_SHIFT_LEFT,
                                                       KV_OP_SHIFT_RIGHT,
                                                       KV_OP_ADD_ASSIGN,
                                                       KV_OP_SUB_ASSIGN,
                                                       KV_OP_MUL_ASSIGN,
                                                       KV_OP_PRE_INCREMENT,
                                                       KV_OP_POST_INCREMENT,
                                                       KV_OP_PRE_DECREMENT,
                                                       KV_OP_POST_DECREMENT,
                                                       KV_OP_CODE_BLOCK,
                                                       KV_OP_PREPROC_CONCAT,
                                                       KV_OP_STRING_APPEND};
  for (int k = 0; k < KV_OP_NUMBER_OF_KINDS; ++k) {
    const auto kind = static_cast<tagKvEOperatorKind>(k);
    SCOPED_TRACE(KV_OpOperator::get(kind)->getName());
    EXPECT_EQ(canExpand(operationOf(kind)), canExpandKinds.count(kind) == 1);
  }
}

TEST_F(OperationQueryTest, CCodeAndSymbolAccessesNeverExpand) {
  KV_Operation* mod = operationOf(KV_OP_MOD);
  mod->setConversionLevel(app.data().getConversionLevel(KV_CONV_IMPLEMENTED));
  EXPECT_TRUE(canExpand(mod));
  mod->setConversionLevel(app.data().getConversionLevel(KV_CONV_C_CODE));
  EXPECT_FALSE(canExpand(mod));
  KV_ExprLocation* access = app.access(app.variable("x", app.int16()));
  EXPECT_FALSE(canExpand(access->getOperation()));
  EXPECT_FALSE(canExpand(nullptr));
}

TEST_F(OperationQueryTest, AssemblerBlocksAreTheOnlyCodeBlocksThatCannotExpand) {
  EXPECT_FALSE(canExpand(app.codeBlock("nop", true)->getOperation()));
  EXPECT_TRUE(canExpand(app.codeBlock("user();", false)->getOperation()));
  KV_Operation* custom = app.codeBlock("user();", false)->getOperation();
  custom->setConversionLevel(app.data().getConversionLevel(KV_CONV_C_CODE));
  EXPECT_FALSE(canExpand(custom));
}

} // namespace
