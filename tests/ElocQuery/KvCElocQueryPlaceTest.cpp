#include "ElocQueryFixture.h"
#include "HulCvTools/ElocQuery/KvCElocQuery.h"
#include "platform/icode/KvCIcFileId.h"
#include "platform/icode/KvCRtosProtection.h"

#include <functional>

namespace {

using Q = KvCElocQuery;
using PlaceTest = ElocQueryTest;

TEST_F(PlaceTest, LocationInANestedBlockBelongsToItsFunctionAndFile) {
  KvCIcFileId* file = app.file("ctrl.c");
  KvCParamSymbol* f = app.function("f").symbol();
  KV_ExprLocation* xl = app.access(x);
  body().ifThen(app.less(app.access(i), one())).assign(xl, one());
  EXPECT_EQ(Q::getCodeBlockSymbol(xl), f);
  EXPECT_EQ(Q::getParentParametrizedSymbol(xl), f);
  EXPECT_EQ(Q::getFile(xl), file);

  KV_ExprLocation* fileLevel = app.access(y);
  app.fileScope().stmt(app.varDef(app.variable("z", app.int16(), false), {fileLevel}));
  EXPECT_EQ(Q::getCodeBlockSymbol(fileLevel), nullptr);
  EXPECT_EQ(Q::getFile(fileLevel), file);
}

TEST_F(PlaceTest, EachFilePropertyIsReadFromTheEnclosingFile) {
  using Setter = std::function<void(KvCIcFile*)>;
  const std::vector<std::pair<const char*, Setter>> files = {
      {"stub.c", [](KvCIcFile* f) { f->setStubFile(true); }},
      {"dd.c", [](KvCIcFile* f) { f->setCodegenBase(KV_CODEGEN_BASE_DD); }},
      {"user.c", [](KvCIcFile* f) { f->setResponsibility(KV_FILE_RESPONSIBILITY_USER); }},
      {"artificial.c", [](KvCIcFile* f) { f->setArtificial(true); }},
      {"mixed.c", [](KvCIcFile* f) { f->setCodegenBase(KV_CODEGEN_BASE_MIXED); }},
  };
  for (std::size_t k = 0; k < files.size(); ++k) {
    SCOPED_TRACE(files[k].first);
    files[k].second(app.file(files[k].first)->getFile());
    KV_ExprLocation* xl =
        inBody(app.assignExpr(app.access(x), one()), files[k].first)->getOperation()->getOperand(0);
    EXPECT_EQ(Q::isLocatedInStubFile(xl), k == 0);
    EXPECT_EQ(Q::isLocatedInDDBasedFile(xl), k == 1);
    EXPECT_EQ(Q::isLocatedInUserFile(xl), k == 2);
    EXPECT_EQ(Q::isLocatedInArtificialFile(xl), k == 3);
  }
}

TEST_F(PlaceTest, LocationOutsideEveryTableIsInNoFileFunctionOrProtectedArea) {
  app.file("dd.c")->getFile()->setCodegenBase(KV_CODEGEN_BASE_DD);
  app.currentFile()->getFile()->setArtificial(true);
  app.fileScope().table()->setRtosProtection(app.protection("R"));
  for (KV_ExprLocation* xl : {app.access(x), inLooseStatement(app.access(x))}) {
    KvCParamSymbol* function = app.function("f").symbol();
    EXPECT_EQ(Q::getCodeBlockSymbol(xl), nullptr);
    EXPECT_EQ(Q::getParentParametrizedSymbol(xl), nullptr);
    EXPECT_EQ(Q::getFile(xl), nullptr);
    EXPECT_FALSE(Q::isLocatedInDDBasedFile(xl));
    EXPECT_FALSE(Q::isLocatedInArtificialFile(xl));
    EXPECT_FALSE(Q::isInRtosProtectedArea(xl));
    EXPECT_FALSE(Q::isLocatedInRestartFunction(xl, function));
    EXPECT_EQ(function, nullptr);
  }
}

TEST_F(PlaceTest, FunctionRolesAnswerAndTheFunctionIsReturnedEvenWhenTheRoleIsMissing) {
  KvCParamSymbol* restart = app.function("r").role(KV_ROLE_RESTART_FUNCTION).symbol();
  KvCParamSymbol* imported = app.function("m").role(KV_ROLE_IMPORTED_CODE_BLOCK).symbol();
  app.function("u").role(KV_ROLE_REUSE_MASTER);
  KV_ExprLocation* inRestart = inBody(app.access(x), "r");
  KV_ExprLocation* inImported = inBody(app.access(x), "m");
  KvCParamSymbol* function = nullptr;
  EXPECT_TRUE(Q::isLocatedInRestartFunction(inRestart, function));
  EXPECT_EQ(function, restart);
  EXPECT_FALSE(Q::isLocatedInRestartFunction(inImported, function));
  EXPECT_EQ(function, imported);
  EXPECT_FALSE(Q::isLocatedInRestartFunction(inImported));
  EXPECT_TRUE(Q::isLocatedInImportedCodeBlock(inImported, function));
  EXPECT_EQ(function, imported);
  EXPECT_FALSE(Q::isLocatedInImportedCodeBlock(inRestart, function));
  EXPECT_EQ(function, restart);
  EXPECT_FALSE(Q::isLocatedInImportedCodeBlock(app.access(x), function));
  EXPECT_EQ(function, nullptr);
  EXPECT_TRUE(Q::isLocatedInReusedFunction(inBody(app.access(x), "u")));
  EXPECT_FALSE(Q::isLocatedInReusedFunction(inRestart));
}

TEST_F(PlaceTest, ProtectedAreaIsSearchedUpToTheTopOfTheCodeBlock) {
  BlockBuilder& guarded = body().protectedBlock("RES");
  KV_ExprLocation* direct = app.access(x);
  guarded.assign(direct, one());
  KV_ExprLocation* nested = app.access(x);
  guarded.whileLoop(app.less(app.access(i), one())).assign(nested, one());
  KV_ExprLocation* outside = inBody(app.access(y));
  EXPECT_TRUE(Q::isInRtosProtectedArea(direct));
  EXPECT_TRUE(Q::isInRtosProtectedArea(nested));
  EXPECT_FALSE(Q::isInRtosProtectedArea(outside));
  // A protection above the function body does not reach into it.
  app.fileScope().table()->setRtosProtection(app.protection("FILE"));
  EXPECT_FALSE(Q::isInRtosProtectedArea(outside));
  body().table()->setRtosProtection(app.protection("BODY"));
  EXPECT_TRUE(Q::isInRtosProtectedArea(outside));
}

TEST_F(PlaceTest, CodeBlockOperationIsFoundThroughOperationsOnly) {
  KV_ExprLocation* block = inBody(app.codeBlock("__asm nop", true));
  KV_ExprLocation* xl = app.access(x);
  block->getOperation()->appendOperand(app.add(xl, one()));
  EXPECT_TRUE(Q::isLocatedInCodeBlockOp(xl));
  EXPECT_FALSE(Q::isLocatedInCodeBlockOp(block));
  EXPECT_FALSE(Q::isLocatedInCodeBlockOp(inBody(app.assignExpr(app.access(x), one()))));
  KV_ExprLocation* inUnheld = app.access(x);
  unheld(KV_OP_ADD, {inUnheld, one()});
  EXPECT_FALSE(Q::isLocatedInCodeBlockOp(inUnheld));
}

} // namespace
