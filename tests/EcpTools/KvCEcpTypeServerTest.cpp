// The Ecp type server: the two dummy types made once and defined once in the Acme header,
// the standard scaling and base type, a disabled server, and a failed definition reported
// with the server's name and the source line of the place.
#include "HulCvTools/EcpTools/KvCEcpTypeServer.h"
#include "platform/builder/AppBuilder.h"
#include "platform/icode/KV_DataType.h"
#include "platform/icode/KV_DataTypeServer.h"
#include "platform/icode/KV_ICodeFactoryContainer.h"
#include "platform/icode/KV_PointerTypeServer.h"
#include "platform/icode/KV_Scaling.h"
#include "platform/icode/KvCCodeViewData.h"
#include "platform/icode/KvCIcFile.h"
#include "platform/icode/KvCIcFileId.h"
#include "platform/icode/KvCIcFileServer.h"
#include "platform/support/KvCInternalSrcRef.h"
#include "platform/support/KvCMessageServer.h"
#include "platform/support/KvCSrcRefServer.h"

#include <gtest/gtest.h>

#include <string>

namespace {

KvCMessageServer& messages() { return *KvCMessageServer::getMessageServer(); }

bool endsWith(const std::string& text, const std::string& tail) {
  return text.size() >= tail.size() &&
         text.compare(text.size() - tail.size(), tail.size(), tail) == 0;
}

class EcpTypeServerTest : public ::testing::Test {
protected:
  void SetUp() override { messages().clear(); }
  void TearDown() override {
    messages().setShowInternalInfo(false);
    messages().clear();
  }
  bool boot(bool enabled = true) {
    server.bootPhaseOne(&app.data(), &app.factories(), enabled);
    return server.bootPhaseTwo();
  }
  KvCIcFileId* acmeHeader() { return app.data().getFileServer()->findFile("acme.h"); }

  AppBuilder app;
  KvCEcpTypeServer server;
};

TEST_F(EcpTypeServerTest, DisabledServerLeavesEveryPhaseTwoMemberUnset) {
  const std::size_t refs = app.data().getSrcRefServer()->getNumberOfSrcRefs();
  EXPECT_TRUE(boot(false));
  EXPECT_EQ(server.getStandardScaling(), nullptr);
  EXPECT_EQ(server.getStandardBaseType(), nullptr);
  EXPECT_EQ(app.data().getSrcRefServer()->getNumberOfSrcRefs(), refs) << "no source reference";
  EXPECT_EQ(acmeHeader(), nullptr) << "no file demanded";
  EXPECT_TRUE(messages().getMessages().empty());
  // A demand on it is a misuse: reported, nothing made.
  EXPECT_EQ(server.demandCidType(nullptr), nullptr);
  ASSERT_EQ(messages().getMessages().size(), 1u);
  EXPECT_NE(messages().getMessages()[0].text.str().find("KvCEcpTypeServer"), std::string::npos);
  EXPECT_EQ(app.data().getDataTypeServer()->findType("CIDDummyType"), nullptr);
}

TEST_F(EcpTypeServerTest, StandardScalingAndBaseType) {
  ASSERT_TRUE(boot());
  KV_Scaling* scaling = server.getStandardScaling();
  ASSERT_NE(scaling, nullptr);
  EXPECT_EQ(scaling->getKind(), KV_SCALING_FIXED);
  EXPECT_EQ(scaling->getLsb(), 1.0);
  EXPECT_EQ(scaling->getOffset(), 0.0);
  KV_DataType* base = server.getStandardBaseType();
  ASSERT_NE(base, nullptr);
  ASSERT_NE(base->getNumericalType(), nullptr);
  EXPECT_EQ(base->getNumericalType()->getBits(), 8);
  EXPECT_TRUE(base->getNumericalType()->isSigned());
  EXPECT_EQ(base, app.data().getDataTypeServer()->getInt8());
  EXPECT_EQ(server.shutdown(), true);
  EXPECT_EQ(server.getStandardBaseType(), base) << "shutdown changes nothing";
}

TEST_F(EcpTypeServerTest, CidTypeIsMadeOnceAndDefinedOnce) {
  ASSERT_TRUE(boot());
  KV_DataType* cid = server.demandCidType(nullptr);
  ASSERT_NE(cid, nullptr);
  EXPECT_EQ(cid->getName().str(), "CIDDummyType");
  EXPECT_EQ(cid->getDescription().str(), "Dummy type for CIDs");
  ASSERT_NE(cid->getNumericalType(), nullptr);
  EXPECT_EQ(cid->getBaseType(), server.getStandardBaseType());
  EXPECT_TRUE(cid->isUseNameForCasts());
  EXPECT_FALSE(cid->isCreateTypedef());
  EXPECT_TRUE(cid->isRtosType());
  EXPECT_TRUE(cid->getDimensions().isScalar());
  EXPECT_EQ(cid->getModuleFileId(), acmeHeader());
  // Made with the server's internal source reference.
  const auto* made = dynamic_cast<const KvCInternalSrcRef*>(cid->getSrcRef());
  ASSERT_NE(made, nullptr);
  EXPECT_EQ(made->getCause().str(), "rtos api function");
  EXPECT_TRUE(endsWith(made->getFile().str(), "KvCEcpTypeServer.cpp")) << made->getFile().str();
  // A second demand defines nothing: with definitions failing now it still reports nothing.
  acmeHeader()->getFile()->setDefineTypeFails(true);
  EXPECT_EQ(server.demandCidType(nullptr), cid);
  EXPECT_TRUE(messages().getMessages().empty());
  EXPECT_EQ(acmeHeader()->getFile()->getDefinedTypes().size(), 1u);
}

TEST_F(EcpTypeServerTest, AccessPointRefTypeIsAVoidPointerMadeOnce) {
  ASSERT_TRUE(boot());
  KV_DataType* ref = server.demandAccessPointRefType(nullptr);
  ASSERT_NE(ref, nullptr);
  EXPECT_EQ(ref->getName().str(), "AccessPointRef");
  EXPECT_EQ(ref->getDescription().str(), "Dummy type for AccessPoints");
  ASSERT_NE(ref->asPointerType(), nullptr);
  EXPECT_EQ(ref->getBaseType(),
            app.data().getDataTypeServer()->getPointerServer()->getVoidPointer());
  EXPECT_EQ(ref->asPointerType()->getTargetType()->getTypeKind(), KV_TYPE_VOID);
  EXPECT_TRUE(ref->isCreateTypedef());
  EXPECT_FALSE(ref->isUseNameForCasts());
  EXPECT_EQ(ref->getModuleFileId(), acmeHeader());
  acmeHeader()->getFile()->setDefineTypeFails(true);
  EXPECT_EQ(server.demandAccessPointRefType(nullptr), ref);
  EXPECT_TRUE(messages().getMessages().empty());
}

// The definition of either type fails: message 10007 names the server and the line of the
// place, which the debug report of the same check gives too; the type is made and cached.
TEST_F(EcpTypeServerTest, FailedDefinitionReportsTheServerAndLineAndStillAnswersTheType) {
  using Demand = KV_DataType* (KvCEcpTypeServer::*)(const KvCSrcRef*);
  const struct {
    const char* name;
    Demand demand;
  } rows[] = {{"CIDDummyType", &KvCEcpTypeServer::demandCidType},
              {"AccessPointRef", &KvCEcpTypeServer::demandAccessPointRefType}};
  ASSERT_TRUE(boot());
  messages().setShowInternalInfo(true);
  acmeHeader()->getFile()->setDefineTypeFails(true);
  int lines[2] = {0, 0};
  for (int i = 0; i < 2; ++i) {
    SCOPED_TRACE(rows[i].name);
    messages().clear();
    KV_DataType* type = (server.*rows[i].demand)(nullptr);
    ASSERT_NE(type, nullptr);
    EXPECT_EQ(type->getName().str(), rows[i].name);
    EXPECT_EQ(type->getModuleFileId(), nullptr) << "not defined";
    ASSERT_EQ(messages().getMessages().size(), 1u);
    const KvCMessageRecord& message = messages().getMessages()[0];
    ASSERT_EQ(messages().getDebugAssertions().size(), 1u);
    const KvCDebugAssertionRecord& report = messages().getDebugAssertions()[0];
    EXPECT_EQ(report.expression.str(), "0");
    EXPECT_TRUE(endsWith(report.file.str(), "KvCEcpTypeServer.cpp")) << report.file.str();
    lines[i] = report.line;
    EXPECT_EQ(message.number, 10007);
    EXPECT_EQ(message.severity, ERR_SEVERITY_FATAL);
    EXPECT_EQ(message.category.str(), "General Messages");
    EXPECT_EQ(message.text.str(), "Internal error. Error code: KvCEcpTypeServer " +
                                      std::to_string(report.line) +
                                      ". Contact Velmora's technical support team.");
    EXPECT_EQ((server.*rows[i].demand)(nullptr), type);
    EXPECT_EQ(messages().getMessages().size(), 1u) << "cached: no second attempt";
  }
  EXPECT_NE(lines[0], lines[1]) << "each place has its own line";
}

TEST_F(EcpTypeServerTest, WithoutTheAcmeFilesPhaseTwoFailsSilently) {
  app.data().getFileServer()->setAcmeFilesUnavailable(true);
  EXPECT_FALSE(boot());
  EXPECT_TRUE(messages().getMessages().empty());
  app.data().getFileServer()->setAcmeFilesUnavailable(false);
  EXPECT_TRUE(boot());
  EXPECT_NE(server.demandCidType(nullptr), nullptr);
}

} // namespace
