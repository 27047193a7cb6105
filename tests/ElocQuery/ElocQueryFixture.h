// The ICode scenarios of the expression-location query tests: an application with
// variables x, y, i (Int16) and the helpers to place a location in a function body, in a
// statement that hangs in no table, or in an operation that no location holds.
#ifndef TESTS_ELOCQUERY_ELOCQUERYFIXTURE_H
#define TESTS_ELOCQUERY_ELOCQUERYFIXTURE_H

#include "platform/builder/AppBuilder.h"
#include "platform/icode/KV_ExprLocation.h"
#include "platform/icode/KV_ICodeFactoryContainer.h"
#include "platform/icode/KV_Operation.h"
#include "platform/icode/KV_QualifiedSymbolOp.h"
#include "platform/icode/KV_Statement.h"
#include "platform/icode/KvCCStmTable.h"
#include "platform/icode/KvCParamSymbol.h"
#include "platform/icode/KvCUnparamSymbol.h"

#include <gtest/gtest.h>

#include <cstdint>
#include <memory>

class ElocQueryTest : public ::testing::Test {
protected:
  KV_ExprLocation* one() { return app.constant(std::int64_t{1}); }
  BlockBuilder& body(const char* function = "f") { return app.function(function).body(); }
  // Puts `root` as a statement into the body of `function`.
  KV_ExprLocation* inBody(KV_ExprLocation* root, const char* function = "f") {
    body(function).stmt(root);
    return root;
  }
  // The root of a statement that belongs to no table.
  KV_ExprLocation* inLooseStatement(KV_ExprLocation* root) {
    app.factories().getStatementFactory()->createStatement(root);
    return root;
  }
  // An operation of `kind` over `operands` that no location holds.
  KV_Operation* unheld(tagKvEOperatorKind kind, std::initializer_list<KV_ExprLocation*> operands) {
    return app.operationExpr(kind, operands);
  }
  // A location holding an access whose symbol is missing.
  KV_ExprLocation* accessWithoutSymbol() {
    KV_QualifiedSymbolOp* qso = app.data().make<KV_QualifiedSymbolOp>(nullptr);
    return app.factories().getExprLocFactory()->createFromExpression(qso);
  }

  AppBuilder app;
  KvCUnparamSymbol* x = app.variable("x", app.int16());
  KvCUnparamSymbol* y = app.variable("y", app.int16());
  KvCUnparamSymbol* i = app.variable("i", app.int16());
};

#endif
