// The Ecp parameterised symbol server: the access-point macros with the auxiliary macros
// they expand through, built as ICode bodies and found again; the ECU service function;
// what happens without the files; and the server's own storage under a counting memory
// controller across boot, shutdown and boot again.
#include "HulCvTools/EcpTools/KvCEcpParamSymbolServer.h"
#include "HulCvTools/EcpTools/KvCEcpTypeServer.h"
#include "HulCvTools/ExprLocDBBuilder/KvCExprLocDBBuilder.h"
#include "HulCvTools/FcnCallGraph/KvCFunctionCallGraph.h"
#include "platform/builder/AppBuilder.h"
#include "platform/icode/KV_BaseTypeServer.h"
#include "platform/icode/KV_DataType.h"
#include "platform/icode/KV_DataTypeServer.h"
#include "platform/icode/KV_ExprLocation.h"
#include "platform/icode/KV_ICodeFactoryContainer.h"
#include "platform/icode/KV_NumericalTypeServer.h"
#include "platform/icode/KV_Operation.h"
#include "platform/icode/KV_ParamAccess.h"
#include "platform/icode/KV_ParamMacroSymbolServer.h"
#include "platform/icode/KV_QualifiedSymbolOp.h"
#include "platform/icode/KV_ScaleServer.h"
#include "platform/icode/KV_Statement.h"
#include "platform/icode/KV_SymbolServer.h"
#include "platform/icode/KvCCDeclPrinter.h"
#include "platform/icode/KvCCStmTable.h"
#include "platform/icode/KvCCallOperation.h"
#include "platform/icode/KvCCodeViewData.h"
#include "platform/icode/KvCIcFile.h"
#include "platform/icode/KvCIcFileId.h"
#include "platform/icode/KvCIcFileServer.h"
#include "platform/icode/KvCParamSymbol.h"
#include "platform/icode/KvCSmbClass.h"
#include "platform/icode/KvCSmbClassServer.h"
#include "platform/icode/KvCStringExpr.h"
#include "platform/support/KvCCountingMemController.h"
#include "platform/support/KvCMemController.h"
#include "platform/support/KvCMessageServer.h"
#include "tests/CountingMemory.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

namespace {

KvCMessageServer& messages() { return *KvCMessageServer::getMessageServer(); }

using Demand = KvCParamSymbol* (KvCEcpParamSymbolServer::*)(const KvCSrcRef*);

class EcpParamSymbolServerTest : public ::testing::Test {
protected:
  void SetUp() override {
    messages().clear();
    types.bootPhaseOne(&app.data(), &app.factories(), true);
    ASSERT_TRUE(types.bootPhaseTwo());
  }
  void TearDown() override { messages().clear(); }

  KvCIcFileServer* files() { return app.data().getFileServer(); }
  KvCIcFileId* apHeader() { return files()->findFile("ecp_ap.h"); }
  KvCParamSymbol* macro(const char* name) {
    KvCIcFileId* header = apHeader();
    return header ? app.data().getSymbolServer()->getParamMacro()->find(header->getFile()->getStt(),
                                                                        name)
                  : nullptr;
  }
  // The macros of the access-point header in definition order.
  std::vector<std::string> definedMacros() {
    std::vector<std::string> names;
    KvCCStmTable* table = apHeader() ? apHeader()->getFile()->getStt() : nullptr;
    for (int i = 0; table && i < table->getNumberOfStatements(); ++i) {
      KV_Operation* op = table->getStatement(i)->getExprLoc()->getOperation();
      names.push_back(op->getOperand(0)->getQualifiedSymbolOp()->getSymbol()->getName().str());
    }
    return names;
  }
  std::string body(KvCParamSymbol* m) {
    return m ? KvCCDeclPrinter().printExpression(m->getMacroBody()).str() : "(none)";
  }
  std::vector<std::string> params(KvCParamSymbol* m) {
    std::vector<std::string> names;
    for (int i = 0; m && i < m->getNumberOfFormalParams(); ++i)
      names.push_back(m->getFormalParam(i).name.str() + ":" +
                      std::to_string(m->getFormalParam(i).flags));
    return names;
  }
  // Every macro of the header is a void pre-include macro of the access-point class with
  // the undefined scaling.
  void expectMacroProperties(KvCParamSymbol* m) {
    ASSERT_NE(m, nullptr);
    SCOPED_TRACE(m->getName().str());
    EXPECT_TRUE(m->isMacro());
    EXPECT_TRUE(m->isPreIncludeMacro());
    EXPECT_EQ(m->getDataType(), app.data().getBaseTypeServer()->getVoid());
    EXPECT_EQ(m->getScaling(), app.data().getScalingServer()->getUndefinedScaling());
    EXPECT_EQ(m->getFcnClassId(),
              app.data().getSmbClassServer()->getFcnClassServer()->demandApMacroClass(nullptr));
  }

  AppBuilder app;
  KvCEcpTypeServer types;
  KvCEcpParamSymbolServer server;
};

constexpr unsigned kRead = KV_PARAM_READ;
constexpr unsigned kReadWrite = KV_PARAM_READ | KV_PARAM_WRITTEN | KV_PARAM_BY_REFERENCE;

TEST_F(EcpParamSymbolServerTest, ApWriteFirstMakesTheFourAuxiliaryMacros) {
  ASSERT_TRUE(server.boot(&types, &app.factories()));
  EXPECT_EQ(apHeader(), nullptr);
  KvCParamSymbol* write = server.demandApWriteMacro(nullptr);
  ASSERT_NE(write, nullptr);
  EXPECT_EQ(definedMacros(),
            (std::vector<std::string>{"AP_EXPAND_BRACKET", "AP_BRACKET", "AP_EXPAND_CONCAT",
                                      "AP_CONCAT", "ap_Write"}));
  for (const std::string& name : definedMacros())
    expectMacroProperties(macro(name.c_str()));
  EXPECT_EQ(body(macro("AP_EXPAND_CONCAT")), "name1##name2");
  EXPECT_EQ(body(macro("AP_CONCAT")), "AP_EXPAND_CONCAT(name1, name2)");
  EXPECT_EQ(body(macro("AP_EXPAND_BRACKET")), "(name)");
  EXPECT_EQ(body(macro("AP_BRACKET")), "AP_EXPAND_BRACKET(name)");
  EXPECT_EQ(body(write), "AP_CONCAT(AP_CONCAT(ap_Write_, arg1), AP_BRACKET(arg2))");
  EXPECT_EQ(params(write), (std::vector<std::string>{"arg1:1", "arg2:7"}));
  EXPECT_EQ(params(macro("AP_CONCAT")), (std::vector<std::string>{"name1:1", "name2:1"}));
  EXPECT_EQ(params(macro("AP_BRACKET")), (std::vector<std::string>{"name:1"}));
  EXPECT_TRUE(write->isApWriteMacro());
  EXPECT_FALSE(write->isApReadMacro() || write->isApEntryMacro() || write->isApExitMacro());
  EXPECT_FALSE(macro("AP_CONCAT")->isApWriteMacro());
  // The body as built: a call of AP_CONCAT whose arguments are calls of AP_CONCAT and
  // AP_BRACKET; the bracket a concatenation of "(" with the concatenation of name and ")".
  KvCCallOperation* outer = write->getMacroBody()->getOperation()->asCallOperation();
  ASSERT_NE(outer, nullptr);
  EXPECT_EQ(outer->getCalledSymbol(), macro("AP_CONCAT"));
  ASSERT_EQ(outer->getNumberOfOperands(), 3);
  KV_Operation* first = outer->getOperand(1)->getOperation()->getOperand(1)->getOperation();
  KV_Operation* second = outer->getOperand(2)->getOperation()->getOperand(1)->getOperation();
  ASSERT_TRUE(first && first->asCallOperation() && second && second->asCallOperation());
  EXPECT_EQ(first->asCallOperation()->getCalledSymbol(), macro("AP_CONCAT"));
  EXPECT_EQ(second->asCallOperation()->getCalledSymbol(), macro("AP_BRACKET"));
  KV_Operation* bracket = macro("AP_EXPAND_BRACKET")->getMacroBody()->getOperation();
  ASSERT_TRUE(bracket && bracket->getOperator()->isPreProcConcat());
  EXPECT_EQ(bracket->getOperand(0)->getStringExpr()->getString().str(), "(");
  ASSERT_TRUE(bracket->getOperand(1)->getOperation()->getOperator()->isPreProcConcat());
  // Found again, nothing new made.
  EXPECT_EQ(server.demandApWriteMacro(nullptr), write);
  EXPECT_EQ(definedMacros().size(), 5u);
  EXPECT_TRUE(messages().getMessages().empty());
}

TEST_F(EcpParamSymbolServerTest, ReadAndWriteDifferOnlyInPrefixNameAndMarking) {
  ASSERT_TRUE(server.boot(&types, &app.factories()));
  KvCParamSymbol* read = server.demandApReadMacro(nullptr);
  KvCParamSymbol* write = server.demandApWriteMacro(nullptr);
  expectMacroProperties(read);
  expectMacroProperties(write);
  EXPECT_EQ(read->getName().str(), "ap_Read");
  EXPECT_EQ(params(read), params(write));
  std::string writeBody = body(write);
  writeBody.replace(writeBody.find("ap_Write_"), 9, "ap_Read_");
  EXPECT_EQ(body(read), writeBody);
  EXPECT_TRUE(read->isApReadMacro());
  EXPECT_FALSE(read->isApWriteMacro());
  EXPECT_EQ(definedMacros().size(), 6u) << "the auxiliary macros are shared";
}

TEST_F(EcpParamSymbolServerTest, EntryAndExitTakeOneParameterAndAppendBrackets) {
  const struct {
    const char* name;
    Demand demand;
    bool (KvCSymbol::*mark)() const;
  } rows[] = {
      {"ap_Entry", &KvCEcpParamSymbolServer::demandApEntryMacro, &KvCSymbol::isApEntryMacro},
      {"ap_Exit", &KvCEcpParamSymbolServer::demandApExitMacro, &KvCSymbol::isApExitMacro}};
  ASSERT_TRUE(server.boot(&types, &app.factories()));
  for (const auto& row : rows) {
    SCOPED_TRACE(row.name);
    KvCParamSymbol* m = (server.*row.demand)(nullptr);
    expectMacroProperties(m);
    EXPECT_EQ(m->getName().str(), row.name);
    EXPECT_TRUE((m->*row.mark)());
    EXPECT_EQ(params(m), (std::vector<std::string>{"arg1:" + std::to_string(kReadWrite)}));
    EXPECT_EQ(body(m), "AP_CONCAT(" + std::string(row.name) + "_, arg1)()");
    KV_Operation* append = m->getMacroBody()->getOperation();
    ASSERT_TRUE(append && append->getOperator()->isStringAppend());
    EXPECT_EQ(append->getOperand(0)->getOperation()->asCallOperation()->getCalledSymbol(),
              macro("AP_CONCAT"));
  }
  EXPECT_EQ(macro("AP_BRACKET"), nullptr) << "entry and exit need no brackets";
}

TEST_F(EcpParamSymbolServerTest, EachAuxiliaryMacroOnItsOwn) {
  const struct {
    Demand demand;
    const char* name;
    const char* body;
    int nParams;
  } rows[] = {
      {&KvCEcpParamSymbolServer::demandApExpandConcatMacro, "AP_EXPAND_CONCAT", "name1##name2", 2},
      {&KvCEcpParamSymbolServer::demandApConcatMacro, "AP_CONCAT", "AP_EXPAND_CONCAT(name1, name2)",
       2},
      {&KvCEcpParamSymbolServer::demandApExpandBracketMacro, "AP_EXPAND_BRACKET", "(name)", 1},
      {&KvCEcpParamSymbolServer::demandApBracketMacro, "AP_BRACKET", "AP_EXPAND_BRACKET(name)", 1},
  };
  for (const auto& row : rows) {
    SCOPED_TRACE(row.name);
    AppBuilder local;
    KvCEcpTypeServer localTypes;
    localTypes.bootPhaseOne(&local.data(), &local.factories(), true);
    ASSERT_TRUE(localTypes.bootPhaseTwo());
    KvCEcpParamSymbolServer localServer;
    ASSERT_TRUE(localServer.boot(&localTypes, &local.factories()));
    KvCParamSymbol* m = (localServer.*row.demand)(nullptr);
    ASSERT_NE(m, nullptr);
    EXPECT_EQ(m->getName().str(), row.name);
    EXPECT_EQ(m->getNumberOfFormalParams(), row.nParams);
    for (int i = 0; i < row.nParams; ++i)
      EXPECT_EQ(m->getFormalParam(i).flags, kRead);
    EXPECT_EQ(KvCCDeclPrinter().printExpression(m->getMacroBody()).str(), row.body);
    EXPECT_EQ((localServer.*row.demand)(nullptr), m);
  }
}

TEST_F(EcpParamSymbolServerTest, EcuServiceFunctionHasOneSignedByteParameter) {
  ASSERT_TRUE(server.boot(&types, &app.factories()));
  KvCParamSymbol* service = server.demandEcuServiceFunction(nullptr);
  ASSERT_NE(service, nullptr);
  EXPECT_EQ(service->getName().str(), "wmecu_service");
  EXPECT_FALSE(service->isMacro());
  EXPECT_TRUE(service->isEcuServiceFunction());
  EXPECT_EQ(service->getDataType(), app.data().getBaseTypeServer()->getVoid());
  EXPECT_EQ(service->getScaling(), app.data().getScalingServer()->getUndefinedScaling());
  ASSERT_EQ(service->getNumberOfFormalParams(), 1);
  EXPECT_EQ(service->getFormalParam(0).type, app.data().getDataTypeServer()->getInt8());
  EXPECT_EQ(service->getFormalParam(0).scaling, app.data().getScalingServer()->getDefaultScaling());
  EXPECT_EQ(service->getFormalParam(0).flags, kRead);
  EXPECT_EQ(service->getFcnClassId(),
            app.data().getSmbClassServer()->getFcnClassServer()->demandFcnClass(nullptr));
  KvCIcFileId* file = files()->findFile("wmecu.h");
  ASSERT_NE(file, nullptr);
  EXPECT_NE(KvCCDeclPrinter::printFile(file).str().find("void wmecu_service(signed char p0);"),
            std::string::npos);
  EXPECT_EQ(server.demandEcuServiceFunction(nullptr), service);
}

TEST_F(EcpParamSymbolServerTest, WithoutItsFileADemandAnswersNullAndReportsNothing) {
  ASSERT_TRUE(server.boot(&types, &app.factories()));
  files()->setEcuServiceFileUnavailable(true);
  EXPECT_EQ(server.demandEcuServiceFunction(nullptr), nullptr);
  files()->setApHeaderFileUnavailable(true);
  for (Demand demand :
       {&KvCEcpParamSymbolServer::demandApWriteMacro, &KvCEcpParamSymbolServer::demandApReadMacro,
        &KvCEcpParamSymbolServer::demandApEntryMacro, &KvCEcpParamSymbolServer::demandApExitMacro,
        &KvCEcpParamSymbolServer::demandApConcatMacro,
        &KvCEcpParamSymbolServer::demandApBracketMacro})
    EXPECT_EQ((server.*demand)(nullptr), nullptr);
  EXPECT_TRUE(messages().getMessages().empty());
  EXPECT_EQ(app.data().getSymbolServer()->getParamMacro()->getNumberOfMacros(), 0);
  // The files arrive later: the demands succeed.
  files()->setEcuServiceFileUnavailable(false);
  files()->setApHeaderFileUnavailable(false);
  EXPECT_NE(server.demandEcuServiceFunction(nullptr), nullptr);
  EXPECT_NE(server.demandApWriteMacro(nullptr), nullptr);
}

// A name the header cannot give to a macro: what needs that macro is not made (a macro
// without its body would expand to nothing); what does not need it is.
TEST_F(EcpParamSymbolServerTest, AMacroNameTakenByATypeKeepsOnlyItsUsersFromBeingMade) {
  WmCXString description("fixture");
  KV_DimensionDescriptor scalar;
  ASSERT_NE(app.data().getNumTypeServer()->getNonDDMappedNumerical(
                "AP_BRACKET", description, *app.data().getDataTypeServer()->getInt8(), scalar, true,
                nullptr, false),
            nullptr);
  ASSERT_TRUE(server.boot(&types, &app.factories()));
  EXPECT_EQ(server.demandApWriteMacro(nullptr), nullptr);
  EXPECT_EQ(macro("ap_Write"), nullptr);
  EXPECT_NE(server.demandApEntryMacro(nullptr), nullptr);
  EXPECT_TRUE(messages().getMessages().empty());
}

TEST_F(EcpParamSymbolServerTest, DemandsOnAServerThatIsNotBootedAreReported) {
  EXPECT_EQ(server.demandApWriteMacro(nullptr), nullptr);
  EXPECT_EQ(server.demandEcuServiceFunction(nullptr), nullptr);
  ASSERT_EQ(messages().getMessages().size(), 2u);
  for (const KvCMessageRecord& message : messages().getMessages())
    EXPECT_NE(message.text.str().find("KvCEcpParamSymbolServer"), std::string::npos);
  EXPECT_EQ(files()->findFile("ecp_ap.h"), nullptr);
}

// The macro bodies are ICode like any other: the def/use databases see the calls in them
// (the bodies of repeated demands, held by no statement, are not there), and the call
// graph joins each macro to the macros its body calls.
TEST_F(EcpParamSymbolServerTest, DatabasesAndCallGraphWalkTheMacroBodies) {
  ASSERT_TRUE(server.boot(&types, &app.factories()));
  ASSERT_NE(server.demandApWriteMacro(nullptr), nullptr);
  ASSERT_NE(server.demandApEntryMacro(nullptr), nullptr);
  ASSERT_NE(server.demandEcuServiceFunction(nullptr), nullptr);
  // The code generator places the headers in a code unit of the application.
  app.file("ecp_ap.h");
  app.file("wmecu.h");
  KvCExprLocDBBuilder builder;
  ASSERT_TRUE(builder.boot(&app.data()));
  ASSERT_TRUE(builder.rebuildExprLocDBs());
  std::vector<KvCExprLocDB::KeyedLocation> uses;
  macro("AP_CONCAT")->getExprLocDB()->listUses(uses);
  EXPECT_EQ(uses.size(), 3u) << "two calls in ap_Write, one in ap_Entry";
  KvCFunctionCallGraph graph;
  ASSERT_TRUE(graph.boot());
  ASSERT_TRUE(graph.construct(false));
  // ap_Write -> AP_CONCAT, AP_BRACKET; ap_Entry -> AP_CONCAT; AP_CONCAT -> AP_EXPAND_CONCAT;
  // AP_BRACKET -> AP_EXPAND_BRACKET.
  EXPECT_EQ(graph.number_of_edges(), 5);
  EXPECT_EQ(graph.getNrOfCalled(macro("ap_Write")->getFunctionInfo()), 2);
  EXPECT_TRUE(graph.analyzeInlining());
  EXPECT_TRUE(graph.shutdown());
  EXPECT_TRUE(builder.shutdown());
  for (const KvCMessageRecord& message : messages().getMessages())
    ADD_FAILURE() << message.number << " " << message.text.str();
}

// Every block the server takes from the memory controller goes back: after shutdown, after
// a second shutdown (which deletes nothing), after booting again, and through the
// destructor of a server made with new.
TEST_F(EcpParamSymbolServerTest, EveryBlockGoesBackAcrossBootShutdownAndBootAgain) {
  CountingMemory memory;
  KvCCountingMemController& counted = memory.controller;
  ASSERT_TRUE(server.boot(&types, &app.factories()));
  EXPECT_EQ(counted.getOutstandingBlocks(), 7u) << "two inserters, five accesses";
  KvCParamSymbol* write = server.demandApWriteMacro(nullptr);
  KvCParamSymbol* exit = server.demandApExitMacro(nullptr);
  KvCParamSymbol* service = server.demandEcuServiceFunction(nullptr);
  ASSERT_TRUE(write && exit && service);
  EXPECT_EQ(counted.getOutstandingBlocks(), 7u) << "the temporary access went back";
  EXPECT_TRUE(server.shutdown());
  EXPECT_EQ(counted.getOutstandingBlocks(), 0u);
  const std::size_t total = counted.getTotalBlocks();
  EXPECT_TRUE(server.shutdown());
  EXPECT_EQ(counted.getOutstandingBlocks(), 0u);
  EXPECT_EQ(counted.getForeignFrees(), 0u) << "the second shutdown freed nothing";
  EXPECT_EQ(counted.getTotalBlocks(), total);
  EXPECT_EQ(server.demandApWriteMacro(nullptr), nullptr) << "shut down";
  messages().clear();

  ASSERT_TRUE(server.boot(&types, &app.factories()));
  EXPECT_EQ(server.demandApWriteMacro(nullptr), write) << "the model keeps the macros";
  EXPECT_EQ(server.demandApExitMacro(nullptr), exit);
  EXPECT_EQ(server.demandEcuServiceFunction(nullptr), service);
  ASSERT_TRUE(server.boot(&types, &app.factories())) << "booting twice loses nothing";
  EXPECT_EQ(counted.getOutstandingBlocks(), 7u);
  EXPECT_TRUE(server.shutdown());
  EXPECT_EQ(counted.getOutstandingBlocks(), 0u);

  auto* owned = new KvCEcpParamSymbolServer;
  ASSERT_NE(owned, nullptr);
  ASSERT_TRUE(owned->boot(&types, &app.factories()));
  KvCParamSymbol* entry = owned->demandApEntryMacro(nullptr);
  EXPECT_EQ(entry, macro("ap_Entry"));
  EXPECT_NE(entry, nullptr);
  EXPECT_EQ(counted.getOutstandingBlocks(), 8u) << "the server itself and what it owns";
  delete owned;
  EXPECT_EQ(counted.getOutstandingBlocks(), 0u);
  EXPECT_EQ(counted.getForeignFrees(), 0u);
  EXPECT_TRUE(messages().getMessages().empty());
}

// Memory runs out during boot: boot still answers true, every demand reports the missing
// objects and answers null, and shutdown gives back what was allocated.
TEST_F(EcpParamSymbolServerTest, AllocationFailureInBootIsReportedByTheDemands) {
  CountingMemory memory;
  memory.controller.failAfter(3);
  ASSERT_TRUE(server.boot(&types, &app.factories()));
  EXPECT_EQ(memory.controller.getOutstandingBlocks(), 3u);
  EXPECT_EQ(server.demandApEntryMacro(nullptr), nullptr);
  EXPECT_EQ(server.demandEcuServiceFunction(nullptr), nullptr);
  EXPECT_EQ(messages().getMessages().size(), 2u);
  EXPECT_TRUE(server.shutdown());
  EXPECT_EQ(memory.controller.getOutstandingBlocks(), 0u);
}

} // namespace
