// The Ecp symbol server: object-identifier macros of the CID type in the Acme header, made
// before anybody asked for the type, found again by name, refused where the name cannot
// be had; a disabled server; a missing file pair.
#include "HulCvTools/EcpTools/KvCEcpSymbolServer.h"
#include "HulCvTools/EcpTools/KvCEcpTypeServer.h"
#include "platform/builder/AppBuilder.h"
#include "platform/icode/KV_DataType.h"
#include "platform/icode/KV_DataTypeServer.h"
#include "platform/icode/KV_ICodeFactoryContainer.h"
#include "platform/icode/KvCCDeclPrinter.h"
#include "platform/icode/KvCCodeViewData.h"
#include "platform/icode/KvCIcFile.h"
#include "platform/icode/KvCIcFileId.h"
#include "platform/icode/KvCIcFileServer.h"
#include "platform/support/KvCMessageServer.h"
#include "platform/support/KvCSrcRefServer.h"
#include "platform/view/KvCIvData.h"

#include <gtest/gtest.h>

#include <string>

namespace {

KvCMessageServer& messages() { return *KvCMessageServer::getMessageServer(); }

class EcpSymbolServerTest : public ::testing::Test {
protected:
  void SetUp() override {
    messages().clear();
    types.bootPhaseOne(&app.data(), &app.factories(), true);
    ASSERT_TRUE(types.bootPhaseTwo());
  }
  void TearDown() override { messages().clear(); }
  bool boot(bool enabled = true) {
    server.bootPhaseOne(app.factories().getMacroSymbolServer(), &types, &app.data(),
                        &app.factories(), &view, enabled);
    return server.bootPhaseTwo();
  }
  KvCIcFileId* acmeHeader() { return app.data().getFileServer()->findFile("acme.h"); }
  std::string printedHeader() { return KvCCDeclPrinter::printFile(acmeHeader()).str(); }

  AppBuilder app;
  KvCIvData view;
  KvCEcpTypeServer types;
  KvCEcpSymbolServer server;
};

TEST_F(EcpSymbolServerTest, CidMacroComesBeforeTheTypeAndMakesIt) {
  ASSERT_TRUE(boot());
  ASSERT_EQ(app.data().getDataTypeServer()->findType("CIDDummyType"), nullptr);
  KvCUnparamSymbol* engine = server.createCidMacro("CID_Engine", nullptr);
  ASSERT_NE(engine, nullptr);
  KV_DataType* cid = app.data().getDataTypeServer()->findType("CIDDummyType");
  ASSERT_NE(cid, nullptr);
  EXPECT_EQ(types.demandCidType(nullptr), cid);
  EXPECT_EQ(engine->getDataType(), cid);
  EXPECT_EQ(engine->getScaling(), types.getStandardScaling());
  EXPECT_TRUE(engine->isGlobalMacro());
  EXPECT_TRUE(acmeHeader()->getFile()->isTypeDefined(cid));
  EXPECT_TRUE(messages().getMessages().empty());
}

TEST_F(EcpSymbolServerTest, CidMacrosAreFoundAgainByNameAndNumberedInOrder) {
  ASSERT_TRUE(boot());
  KvCUnparamSymbol* engine = server.createCidMacro("CID_Engine", nullptr);
  KvCUnparamSymbol* brake = server.createCidMacro("CID_Brake", nullptr);
  ASSERT_NE(engine, nullptr);
  ASSERT_NE(brake, nullptr);
  EXPECT_NE(engine, brake);
  EXPECT_EQ(server.createCidMacro("CID_Engine", nullptr), engine);
  // The CID type has no typedef: the macros cast to the spelled-out type.
  const std::string header = printedHeader();
  EXPECT_NE(header.find("#define CID_Engine ((signed char)1)\n"), std::string::npos) << header;
  EXPECT_NE(header.find("#define CID_Brake ((signed char)2)\n"), std::string::npos) << header;
  EXPECT_EQ(header.find("CID_Engine", header.find("CID_Brake")), std::string::npos)
      << "defined once";
}

TEST_F(EcpSymbolServerTest, NamesTheHeaderCannotTakeAreRefused) {
  ASSERT_TRUE(boot());
  for (const char* name : {"CIDDummyType", "int", "2fast", ""}) {
    SCOPED_TRACE(name);
    EXPECT_EQ(server.createCidMacro(name, nullptr), nullptr);
  }
  EXPECT_NE(server.createCidMacro("CID_Valid", nullptr), nullptr);
}

TEST_F(EcpSymbolServerTest, DisabledServerDoesNothingAndRefusesDemands) {
  const std::size_t refs = app.data().getSrcRefServer()->getNumberOfSrcRefs();
  EXPECT_TRUE(boot(false));
  EXPECT_EQ(app.data().getSrcRefServer()->getNumberOfSrcRefs(), refs);
  EXPECT_EQ(server.createCidMacro("CID_Engine", nullptr), nullptr);
  ASSERT_EQ(messages().getMessages().size(), 1u);
  EXPECT_NE(messages().getMessages()[0].text.str().find("KvCEcpSymbolServer"), std::string::npos);
  EXPECT_EQ(app.data().getDataTypeServer()->findType("CIDDummyType"), nullptr);
}

TEST_F(EcpSymbolServerTest, PhaseTwoMakesOneSourceReferenceAndNeedsTheAcmeFiles) {
  const std::size_t refs = app.data().getSrcRefServer()->getNumberOfSrcRefs();
  app.data().getFileServer()->setAcmeFilesUnavailable(true);
  EXPECT_FALSE(boot());
  EXPECT_TRUE(messages().getMessages().empty());
  app.data().getFileServer()->setAcmeFilesUnavailable(false);
  EXPECT_TRUE(boot());
  EXPECT_EQ(app.data().getSrcRefServer()->getNumberOfSrcRefs(), refs + 2);
  EXPECT_TRUE(server.shutdown());
  EXPECT_NE(server.createCidMacro("CID_Engine", nullptr), nullptr) << "shutdown keeps the roots";
}

} // namespace
