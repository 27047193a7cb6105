#include "ElocQueryFixture.h"
#include "HulCvTools/ElocQuery/KvCElocQuery.h"

namespace {

using Q = KvCElocQuery;
using DeclDefTest = ElocQueryTest;
using OperandRoleTest = ElocQueryTest;

KV_ExprLocation* operandOf(KV_ExprLocation* holder, int i) {
  return holder->getOperation()->getOperand(i);
}

TEST_F(DeclDefTest, DeclarationAndDefinitionKindsOfTheParentOperation) {
  KvCUnparamSymbol* v = app.variable("v", app.int16(), false);
  KV_ExprLocation* def = app.varDef(v, {});
  KV_ExprLocation* decl = app.varDecl(v);
  KV_ExprLocation* staticDef = app.staticDeclDef(v);
  KV_ExprLocation* component = app.op(KV_OP_COMPONENT_DEFINITION, {app.access(v)});
  KV_ExprLocation* macroDef = app.op(KV_OP_MACRO_DEFINITION, {app.access(v)});
  KV_ExprLocation* fnDef = app.function("f").declaration()->getExprLoc();
  KV_ExprLocation* fnDecl = app.funcDecl(app.function("g").symbol());
  for (KV_ExprLocation* d : {def, component, macroDef, fnDef})
    EXPECT_TRUE(Q::isStaticDef(operandOf(d, 0)));
  for (KV_ExprLocation* d : {decl, fnDecl})
    EXPECT_TRUE(Q::isStaticDecl(operandOf(d, 0)));
  EXPECT_FALSE(Q::isStaticDef(operandOf(decl, 0)));
  EXPECT_FALSE(Q::isStaticDecl(operandOf(def, 0)));
  EXPECT_TRUE(Q::isStaticDeclDef(operandOf(staticDef, 1)));
  EXPECT_FALSE(Q::isStaticDeclDef(operandOf(def, 0)));
  for (KV_ExprLocation* loose : {app.access(v), def}) {
    EXPECT_FALSE(Q::isStaticDef(loose));
    EXPECT_FALSE(Q::isStaticDecl(loose));
    EXPECT_FALSE(Q::isStaticDeclDef(loose));
    EXPECT_FALSE(Q::isStaticDeclDefOrRestart(loose));
  }
}

TEST_F(DeclDefTest, TypeDefinitionCountsAsStaticForVectorWidthVariablesOnly) {
  KvCUnparamSymbol* width = app.variable("w", app.int16(), false);
  width->setRole(KV_ROLE_DEFINES_VECTOR_WIDTH, true);
  KV_ExprLocation* typeDef = app.typeDef(app.arrayOf(app.int16(), 4), {app.int16()});
  KV_ExprLocation* widthAccess = app.access(width);
  KV_ExprLocation* plainAccess = app.access(x);
  KV_ExprLocation* noSymbol = accessWithoutSymbol();
  for (KV_ExprLocation* loc : {widthAccess, plainAccess, noSymbol})
    typeDef->getOperation()->appendOperand(loc);
  EXPECT_TRUE(Q::isStaticDeclDef(widthAccess));
  EXPECT_FALSE(Q::isStaticDeclDef(plainAccess));
  EXPECT_FALSE(Q::isStaticDeclDef(noSymbol));
  EXPECT_FALSE(Q::isStaticDeclDef(operandOf(typeDef, 0)));
}

TEST_F(DeclDefTest, RestartFunctionBodyCountsLikeAStaticDefinition) {
  app.function("r").role(KV_ROLE_RESTART_FUNCTION);
  KV_ExprLocation* lhsInRestart = app.access(x);
  KV_ExprLocation* rhsInRestart = app.access(y);
  body("r").assign(lhsInRestart, rhsInRestart);
  KV_ExprLocation* lhsInStep = operandOf(inBody(app.assignExpr(app.access(x), one())), 0);
  EXPECT_TRUE(Q::isStaticDeclDefOrRestart(lhsInRestart));
  EXPECT_TRUE(Q::isStaticDeclDefOrRestart(rhsInRestart));
  EXPECT_FALSE(Q::isStaticDeclDefOrRestart(lhsInStep));
  EXPECT_TRUE(Q::isStaticDeclDefOrRestart(operandOf(app.staticDeclDef(x), 0)));
  EXPECT_TRUE(Q::isRestartDef(lhsInRestart));
  EXPECT_FALSE(Q::isRestartDef(rhsInRestart));
  EXPECT_FALSE(Q::isRestartDef(lhsInStep));
  EXPECT_FALSE(Q::isRestartDef(nullptr));
  KV_ExprLocation* inLooseRoot = app.access(x);
  inLooseStatement(app.assignExpr(inLooseRoot, one()));
  EXPECT_FALSE(Q::isStaticDeclDefOrRestart(inLooseRoot));
}

TEST_F(DeclDefTest, OnlyInitialValuesAndWhatTheyReadAreUsedInTheVariableDefinition) {
  KvCUnparamSymbol* arr = app.variable("a", app.arrayOf(app.int16(), 4), false);
  KV_ExprLocation* index = app.access(i);
  KV_ExprLocation* summand = app.access(x);
  KV_ExprLocation* formal = app.access(app.function("g").formal(0));
  KV_ExprLocation* actual = app.access(y);
  KV_ExprLocation* call =
      app.genericCall(app.access(app.function("g").symbol()), {app.parameter(formal, actual)});
  KV_ExprLocation* def = app.varDef(app.variable("v", app.int16(), false),
                                    {app.element(arr, {index}), app.add(summand, one()), call});
  app.fileScope().stmt(def);
  for (int k = 0; k < 3; ++k)
    EXPECT_FALSE(Q::isUsedInVariableDefinition(operandOf(def, k))) << k;
  EXPECT_TRUE(Q::isUsedInVariableDefinition(operandOf(def, 3)));
  EXPECT_TRUE(Q::isUsedInVariableDefinition(index));
  EXPECT_TRUE(Q::isUsedInVariableDefinition(summand));
  EXPECT_TRUE(Q::isUsedInVariableDefinition(actual));
  EXPECT_FALSE(Q::isUsedInVariableDefinition(formal)); // written, not read
  EXPECT_FALSE(Q::isUsedInVariableDefinition(operandOf(inBody(app.add(app.access(x), one())), 0)));
  KV_ExprLocation* inUnheld = app.access(x);
  unheld(KV_OP_ADD, {inUnheld, one()});
  EXPECT_FALSE(Q::isUsedInVariableDefinition(inUnheld));
}

TEST_F(OperandRoleTest, SidesOfAssignmentsAndHowTheParentAccessesThem) {
  KV_ExprLocation* lhs = app.access(x);
  KV_ExprLocation* rhs = app.access(y);
  KV_ExprLocation* summand = app.access(y);
  body().assign(lhs, app.add(summand, one()));
  body().assign(app.access(x), rhs);
  KV_ExprLocation* counter = app.access(x);
  KV_ExprLocation* increment = app.access(y);
  body().stmt(app.op(KV_OP_ADD_ASSIGN, {counter, increment}));

  EXPECT_TRUE(Q::isLhsOfAssign(lhs) && Q::isAssign(lhs) && !Q::isRhsOfAssign(lhs));
  EXPECT_TRUE(Q::isRhsOfAssign(rhs) && Q::isAssign(rhs) && !Q::isLhsOfAssign(rhs));
  EXPECT_TRUE(Q::isLhsOfAssign(counter));
  EXPECT_TRUE(Q::isRhsOfAssign(increment));
  EXPECT_FALSE(Q::isAssign(summand) || Q::isLhsOfAssign(summand) || Q::isRhsOfAssign(summand));

  EXPECT_TRUE(Q::isOnlyDefinedInParentOp(lhs));
  EXPECT_FALSE(Q::isOnlyUsedInParentOp(lhs));
  EXPECT_TRUE(Q::isOnlyUsedInParentOp(rhs));
  EXPECT_FALSE(Q::isOnlyDefinedInParentOp(rhs));
  EXPECT_TRUE(Q::isUsedInParentOp(counter) && Q::isDefinedInParentOp(counter));
  EXPECT_FALSE(Q::isOnlyUsedInParentOp(counter) || Q::isOnlyDefinedInParentOp(counter));

  KV_ExprLocation* loose = app.access(x);
  EXPECT_FALSE(Q::isAssign(loose) || Q::isUsedInParentOp(loose) || Q::isDefinedInParentOp(loose));
  EXPECT_FALSE(Q::isOnlyUsedInParentOp(loose) || Q::isOnlyDefinedInParentOp(loose));
}

TEST_F(OperandRoleTest, StructAssignmentSidesHoldWholeStructures) {
  KV_StructType* point = app.structType("Point", {{"px", app.int16()}});
  KvCUnparamSymbol* s1 = app.variable("s1", point);
  KvCUnparamSymbol* s2 = app.variable("s2", point);
  KvCUnparamSymbol* ps = app.variable("ps", app.pointerTo(point));
  KV_ExprLocation* whole = app.access(s1);
  KV_ExprLocation* source = app.access(s2);
  body().assign(whole, source);
  KV_ExprLocation* derefed = app.deref(ps);
  body().assign(derefed, app.access(s2));
  KV_ExprLocation* part = app.componentAccess(s1, app.component("px", app.int16()));
  KV_ExprLocation* scalarSource = app.access(y);
  body().assign(part, scalarSource);
  EXPECT_TRUE(Q::isLhsOfStructAssignment(whole));
  EXPECT_TRUE(Q::isRhsOfStructAssignment(source));
  EXPECT_FALSE(Q::isLhsOfStructAssignment(source));
  EXPECT_TRUE(Q::isLhsOfStructAssignment(derefed));
  EXPECT_FALSE(Q::isLhsOfStructAssignment(part));
  EXPECT_FALSE(Q::isRhsOfStructAssignment(scalarSource));
}

TEST_F(OperandRoleTest, IndexExpressionsAreFoundUpToTheNearestAccess) {
  KvCUnparamSymbol* a = app.variable("a", app.arrayOf(app.arrayOf(app.int16(), 4), 4));
  KvCUnparamSymbol* b = app.variable("b", app.arrayOf(app.int16(), 4));
  KV_ExprLocation* iInB = app.access(i);
  KV_ExprLocation* bAccess = app.element(b, {iInB});
  KV_ExprLocation* xl = app.access(x);
  KV_ExprLocation* sum = app.add(xl, bAccess);
  KV_ExprLocation* aAccess = app.element(a, {1, sum});
  inBody(app.assignExpr(aAccess, one()));
  KV_QualifiedSymbolOp* qso = nullptr;
  EXPECT_TRUE(Q::isContainedInIndexOperation(iInB, qso));
  EXPECT_EQ(qso, bAccess->getQualifiedSymbolOp());
  EXPECT_TRUE(Q::isContainedInIndexOperation(xl, qso));
  EXPECT_EQ(qso, aAccess->getQualifiedSymbolOp());
  EXPECT_TRUE(Q::isContainedInIndexOperation(sum));
  EXPECT_FALSE(Q::isContainedInIndexOperation(aAccess, qso));
  EXPECT_EQ(qso, nullptr);
  KV_ExprLocation* inUnheld = app.access(x);
  unheld(KV_OP_ADD, {inUnheld, one()});
  EXPECT_FALSE(Q::isContainedInIndexOperation(inUnheld));
}

} // namespace
