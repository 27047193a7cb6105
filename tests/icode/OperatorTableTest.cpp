// KV_OpOperator: the use/define table for every kind and operand count, the agreement of
// the kind families with it, and which kinds createOperation accepts.
#include "platform/builder/AppBuilder.h"
#include "platform/icode/KV_ExprLocation.h"
#include "platform/icode/KV_ICodeFactoryContainer.h"
#include "platform/icode/KV_OpOperator.h"
#include "platform/icode/KV_Operation.h"

#include <gtest/gtest.h>

#include <set>
#include <string>
#include <vector>

namespace {

enum class Expect { UseAll, DefineFirstUseRest, UseAndDefineFirst };

// The table written out kind by kind, independently of the implementation's grouping.
Expect expectedAccess(tagKvEOperatorKind kind) {
  switch (kind) {
  case KV_OP_ASSIGN:
  case KV_OP_PARAMETER:
  case KV_OP_FUNCTION_DECLARATION:
  case KV_OP_FUNCTION_DEFINITION:
  case KV_OP_VARIABLE_DECLARATION:
  case KV_OP_VARIABLE_DEFINITION:
  case KV_OP_COMPONENT_DEFINITION:
  case KV_OP_MACRO_DEFINITION:
  case KV_OP_STRUCT_DECLDEF:
  case KV_OP_ENUM_DECLDEF:
  case KV_OP_TYPE_DEFINITION:
  case KV_OP_STATIC_DECLDEF:
    return Expect::DefineFirstUseRest;
  case KV_OP_ADD_ASSIGN:
  case KV_OP_SUB_ASSIGN:
  case KV_OP_MUL_ASSIGN:
  case KV_OP_BIT_AND_ASSIGN:
  case KV_OP_BIT_OR_ASSIGN:
  case KV_OP_PRE_INCREMENT:
  case KV_OP_POST_INCREMENT:
  case KV_OP_PRE_DECREMENT:
  case KV_OP_POST_DECREMENT:
    return Expect::UseAndDefineFirst;
  default:
    return Expect::UseAll;
  }
}

std::vector<tagKvEOperatorKind> allKinds() {
  std::vector<tagKvEOperatorKind> kinds;
  for (int k = 0; k < KV_OP_NUMBER_OF_KINDS; ++k)
    kinds.push_back(static_cast<tagKvEOperatorKind>(k));
  return kinds;
}

TEST(OperatorTableTest, OneOperatorObjectPerKind) {
  std::set<const KV_OpOperator*> seen;
  std::set<std::string> names;
  for (tagKvEOperatorKind kind : allKinds()) {
    KV_OpOperator* op = KV_OpOperator::get(kind);
    ASSERT_NE(op, nullptr) << kind;
    EXPECT_EQ(op->getKind(), kind);
    EXPECT_EQ(KV_OpOperator::get(kind), op);
    EXPECT_TRUE(seen.insert(op).second);
    EXPECT_TRUE(names.insert(op->getName()).second) << op->getName();
  }
  EXPECT_EQ(KV_OpOperator::get(KV_OP_NUMBER_OF_KINDS), nullptr);
  EXPECT_EQ(KV_OpOperator::get(static_cast<tagKvEOperatorKind>(-1)), nullptr);
}

TEST(OperatorTableTest, UsesAndDefinesOfEveryKindAndCount) {
  for (tagKvEOperatorKind kind : allKinds()) {
    const KV_OpOperator* op = KV_OpOperator::get(kind);
    const Expect access = expectedAccess(kind);
    for (int count = 0; count <= 5; ++count) {
      for (int i = -2; i <= count + 1; ++i) {
        const bool inRange = i >= 0 && i < count;
        bool uses = inRange;
        bool defines = false;
        if (inRange && i == 0 && access == Expect::DefineFirstUseRest) {
          uses = false;
          defines = true;
        }
        if (inRange && i == 0 && access == Expect::UseAndDefineFirst)
          defines = true;
        EXPECT_EQ(op->usesOperand(i, count), uses)
            << op->getName() << " operand " << i << " of " << count;
        EXPECT_EQ(op->definesOperand(i, count), defines)
            << op->getName() << " operand " << i << " of " << count;
      }
    }
  }
}

TEST(OperatorTableTest, FamiliesAgreeWithTheTable) {
  for (tagKvEOperatorKind kind : allKinds()) {
    const KV_OpOperator* op = KV_OpOperator::get(kind);
    const bool definesFirst = op->definesOperand(0, 2);
    EXPECT_EQ(definesFirst, op->isAssign() || op->isIncrementOrDecrement() || op->isParameter() ||
                                op->isDeclOrDef())
        << op->getName();
    EXPECT_EQ(op->isAssign(), op->isPlainAssign() || op->isCompoundAssign()) << op->getName();
    if (op->isCompoundAssign() || op->isIncrementOrDecrement()) {
      EXPECT_TRUE(op->usesOperand(0, 2)) << op->getName();
    }
    if (op->isDeclOrDef() || op->isPlainAssign() || op->isParameter()) {
      EXPECT_FALSE(op->usesOperand(0, 2)) << op->getName();
    }
    if (op->getArity() >= 0) {
      EXPECT_EQ(op->isUnary(), op->getArity() == 1);
      EXPECT_EQ(op->isBinary(), op->getArity() == 2);
    }
  }
  // The families, member by member.
  EXPECT_TRUE(KV_OpOperator::get(KV_OP_BIT_OR_ASSIGN)->isCompoundAssign());
  EXPECT_FALSE(KV_OpOperator::get(KV_OP_ASSIGN)->isCompoundAssign());
  EXPECT_FALSE(KV_OpOperator::get(KV_OP_PRE_INCREMENT)->isAssign());
  EXPECT_TRUE(KV_OpOperator::get(KV_OP_STATIC_DECLDEF)->isDeclOrDef());
  EXPECT_TRUE(KV_OpOperator::get(KV_OP_FUNCTION_DECLARATION)->isDeclOrDef());
  EXPECT_FALSE(KV_OpOperator::get(KV_OP_CODE_BLOCK)->isDeclOrDef());
  EXPECT_TRUE(KV_OpOperator::get(KV_OP_NOT_EQUAL)->isRelational());
  EXPECT_FALSE(KV_OpOperator::get(KV_OP_LOG_NOT)->isRelational());
  EXPECT_TRUE(KV_OpOperator::get(KV_OP_DO_WHILE_LOOP)->isLoop());
  EXPECT_FALSE(KV_OpOperator::get(KV_OP_LOOP_CONDITION)->isLoop());
  EXPECT_TRUE(KV_OpOperator::get(KV_OP_PREPROC_IF)->isControlFlow());
  EXPECT_TRUE(KV_OpOperator::get(KV_OP_SHIFT_LEFT)->isBinaryIndexOperator());
  EXPECT_FALSE(KV_OpOperator::get(KV_OP_BIT_AND)->isBinaryIndexOperator());
}

// Built operations answer through the table with their own operand count.
TEST(OperatorTableTest, OperationsAnswerWithTheirOwnOperandCount) {
  AppBuilder app;
  KvCUnparamSymbol* x = app.variable("x", app.int16());
  KV_Operation* assign = app.assignExpr(app.access(x), app.constant(1))->getOperation();
  EXPECT_TRUE(assign->definesOperand(0));
  EXPECT_FALSE(assign->usesOperand(0));
  EXPECT_TRUE(assign->usesOperand(1));
  EXPECT_FALSE(assign->usesOperand(2));
  KV_Operation* def = app.varDef(x, {app.constant(1), app.constant(2)})->getOperation();
  ASSERT_EQ(def->getNumberOfOperands(), 5);
  EXPECT_TRUE(def->definesOperand(0));
  for (int i = 1; i < 5; ++i) {
    EXPECT_TRUE(def->usesOperand(i));
    EXPECT_FALSE(def->definesOperand(i));
  }
  EXPECT_FALSE(def->usesOperand(5));
  KV_Operation* inc = app.op(KV_OP_POST_DECREMENT, {app.access(x)})->getOperation();
  EXPECT_TRUE(inc->usesOperand(0));
  EXPECT_TRUE(inc->definesOperand(0));
  KV_Operation* call = app.call(app.function("g").symbol(), {app.access(x)})->getOperation();
  KV_Operation* param = call->getOperand(1)->getOperation();
  ASSERT_TRUE(param->getOperator()->isParameter());
  EXPECT_TRUE(param->definesOperand(0));
  EXPECT_TRUE(param->usesOperand(1));
  for (int i = 0; i < call->getNumberOfOperands(); ++i)
    EXPECT_FALSE(call->definesOperand(i));
  KV_Operation* ret = app.op(KV_OP_RETURN, {})->getOperation();
  EXPECT_FALSE(ret->usesOperand(0));
  EXPECT_FALSE(ret->definesOperand(0));
}

// createOperation takes every kind but those with their own creator, with exactly the
// arity of a fixed-arity kind.
TEST(OperatorTableTest, CreateOperationAcceptsExactlyTheArity) {
  AppBuilder app;
  KV_OperationFactory* of = app.factories().getOperationFactory();
  for (tagKvEOperatorKind kind : allKinds()) {
    const KV_OpOperator* oper = KV_OpOperator::get(kind);
    const bool ownCreator = kind == KV_OP_QUALIFIED_SYMBOL || kind == KV_OP_CODE_BLOCK;
    for (int count = 0; count <= 3; ++count) {
      std::vector<KV_ExprLocation*> locs;
      for (int i = 0; i < count; ++i)
        locs.push_back(app.constant(i));
      KV_Operation* made = nullptr;
      switch (count) {
      case 0:
        made = of->createOperation(kind, {});
        break;
      case 1:
        made = of->createOperation(kind, {locs[0]});
        break;
      case 2:
        made = of->createOperation(kind, {locs[0], locs[1]});
        break;
      default:
        made = of->createOperation(kind, {locs[0], locs[1], locs[2]});
        break;
      }
      const bool expected = !ownCreator && (oper->getArity() < 0 || oper->getArity() == count);
      EXPECT_EQ(made != nullptr, expected) << oper->getName() << " with " << count;
      for (int i = 0; i < count; ++i) {
        const KV_ExprLocation* loc = locs[static_cast<std::size_t>(i)];
        EXPECT_EQ(loc->getParent(), made ? static_cast<KV_ICodeElem*>(made) : nullptr);
        EXPECT_EQ(loc->getIndexInParent(), made ? i : -1);
      }
      if (made) {
        EXPECT_EQ(made->getOperator(), oper);
        EXPECT_EQ(made->getNumberOfOperands(), count);
      }
    }
  }
}

} // namespace
