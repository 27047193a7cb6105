#include "HulCvTools/FcnCallGraph/KvCFcnReuseCallGraph.h"
#include "FcgTestSupport.h"
#include "HulCvTools/FcnCallGraph/KvCServer.h"
#include "platform/builder/PartitionBuilder.h"
#include "platform/support/KvCCountingMemController.h"
#include "platform/view/KvCCbActualInterface.h"
#include "platform/view/KvCCodeBlockId.h"
#include "platform/view/KvCSignal.h"

#include <string>
#include <type_traits>

using namespace fcgtest;

// Copies would share or delete twice the owned helpers and entries.
static_assert(!std::is_copy_constructible_v<KvCFcnReuseCallGraph> &&
              !std::is_copy_assignable_v<KvCFcnReuseCallGraph>);
static_assert(!std::is_copy_constructible_v<KvCServer<int, KvCSignal>> &&
              !std::is_copy_assignable_v<KvCServerEntry<int, KvCSignal>>);

namespace {

class ReuseCallGraphTest : public AppFixture {
protected:
  void build() {
    buildDatabases();
    ASSERT_TRUE(real.boot());
    real.construct(false);
    ASSERT_TRUE(reuse.boot(&real, &model.view()));
    ASSERT_TRUE(reuse.construct());
  }

  // "caller(instance)->called(instance)xcardinality" per edge, in edge order; "-" for no
  // instance.
  std::vector<std::string> edges() const {
    auto name = [](const KvCCbActualInterface* instance) {
      return instance ? std::string(instance->getName().c_str()) : std::string("-");
    };
    std::vector<std::string> result;
    for (leda::edge e : reuse.all_edges()) {
      const KvCFcgEdgeInfo* info = reuse.inf(e);
      result.push_back(std::string(reuse.inf(reuse.source(e))->getSymbol()->getName().c_str()) +
                       "(" + name(info->getCallingInstanceId()) + ")->" +
                       reuse.inf(reuse.target(e))->getSymbol()->getName().c_str() + "(" +
                       name(info->getCalledInstanceId()) + ")x" +
                       std::to_string(info->getCardinality()));
    }
    return result;
  }

  PartitionedAppBuilder model{app};
  KvCFunctionCallGraph real;
  KvCFcnReuseCallGraph reuse;
};

using Strings = std::vector<std::string>;

TEST_F(ReuseCallGraphTest, TwoInstancesOfAReusedPartitionGiveParallelEdges) {
  auto& caller = model.partition("C");
  auto& master = model.partition("R");
  auto& second = model.instance("R2", master);
  master.calledBy(caller);
  second.calledBy(caller);
  build();
  EXPECT_EQ(edges(), (Strings{"C_step(C)->R_step(R)x1", "C_init(C)->R_init(R)x1",
                              "C_step(C)->R_step(R2)x1", "C_init(C)->R_init(R2)x1"}));
  // Every function of the real graph has a node, in the real graph's order.
  EXPECT_EQ(nodesOf(reuse), nodesOf(real));
  EXPECT_EQ(calledOf(fn("C_step")), (std::set<KvCParamSymbol*>{fn("R_step")}));
}

TEST_F(ReuseCallGraphTest, NonReusedPartitionReachedTwiceGetsOneEdge) {
  // P is called by two inlined partitions, both called by C: C reaches P twice.
  auto& caller = model.partition("C");
  auto& x1 = model.partition("X1").stepInlined(true);
  auto& x2 = model.partition("X2").stepInlined(true);
  auto& called = model.partition("P");
  x1.calledBy(caller);
  x2.calledBy(caller);
  called.calledBy(x1).calledBy(x2);
  build();
  EXPECT_EQ(edges(), (Strings{"C_step(C)->P_step(P)x1", "C_init(C)->P_init(P)x1"}));
}

TEST_F(ReuseCallGraphTest, RestartFunctionKeepsAnInlinedPartitionActive) {
  auto& caller = model.partition("C").withRestart();
  auto& kept = model.partition("K").withRestart().stepInlined(true);
  auto& gone = model.partition("G").withRestart().stepInlined(true);
  gone.restart().symbol()->getFunctionInfo()->setInlined(true);
  kept.calledBy(caller);
  gone.calledBy(caller);
  build();
  EXPECT_EQ(edges(), (Strings{"C_step(C)->K_step(K)x1", "C_init(C)->K_init(K)x1",
                              "C_restart(C)->K_restart(K)x1"}));
}

TEST_F(ReuseCallGraphTest, AtomicallyInlinedPartitionJoinsOnlyStepFunctions) {
  auto& caller = model.partition("C").withTerm().withRestart();
  auto& atomic = model.partition("A").withTerm().withRestart().stepInlinedAtomically();
  auto& simFrame = model.partition("S").stepInlined(true);
  simFrame.step().symbol()->setFunctionRole(KV_FROLE_CALLED_BY_SIM_FRAME, true);
  atomic.calledBy(caller);
  simFrame.calledBy(caller);
  build();
  EXPECT_TRUE(atomic.step().symbol()->getFunctionInfo()->isInlinedAtomic());
  EXPECT_EQ(edges(), (Strings{"C_step(C)->A_step(A)x1", "C_step(C)->S_step(S)x1",
                              "C_init(C)->S_init(S)x1"}));
}

TEST_F(ReuseCallGraphTest, OnlyTheTopmostExternPartitionIsVisited) {
  auto& caller = model.partition("C");
  auto& top = model.partition("E").externPartition();
  auto& nested = model.partition("N", &top).externPartition();
  auto& runnable = model.partition("U").runnable();
  top.calledBy(caller);
  nested.calledBy(caller);
  runnable.calledBy(caller);
  model.auxFunction("helper");
  nested.step().body().call(fn("helper"), {});
  runnable.step().body().call(fn("helper"), {});
  build();
  // Calls into a runnable are not entered; its additional functions are.
  EXPECT_EQ(edges(), (Strings{"C_step(C)->E_step(E)x1", "C_init(C)->E_init(E)x1",
                              "U_step(U)->helper(-)x1"}));
}

TEST_F(ReuseCallGraphTest, AdditionalFunctionEdgesCarryTheRealCardinalities) {
  auto& master = model.partition("R");
  model.instance("R2", master);
  model.auxFunction("outer");
  model.auxFunction("inner");
  model.auxFunction("plain", KV_FROLE_AUX_FUNCTION)
      .symbol()
      ->setFunctionRole(KV_FROLE_AUX_FUNCTION, false); // no role: not additional
  for (int i = 0; i < 3; ++i)
    app.function("outer").body().call(fn("inner"), {});
  master.step().body().call(fn("outer"), {});
  master.step().body().call(fn("outer"), {});
  master.init().body().call(fn("plain"), {});
  build();
  EXPECT_EQ(edges(),
            (Strings{"R_step(R)->outer(-)x2", "R_step(R2)->outer(-)x2", "outer(-)->inner(-)x3"}));
  leda::edge e = nullptr;
  ASSERT_TRUE(reuse.getEdge(info("outer"), info("inner"), e));
}

TEST_F(ReuseCallGraphTest, AdditionalFunctionsTakeTheInstanceOfASingleUseOnly) {
  auto& caller = model.partition("C");
  auto& master = model.partition("R");
  auto& second = model.instance("R2", master);
  // A step function that is no partition's, run by both instances: no single instance.
  FunctionBuilder& shared = app.function("R_sub").role(KV_ROLE_STEP_FUNCTION);
  KvCCodeBlockId* sharedBlock = model.view().createCodeBlock(shared.symbol());
  model.view().addUse(sharedBlock, master.partition(), "R_sub1");
  model.view().addUse(sharedBlock, second.partition(), "R_sub2");
  // An init function that is no partition's, run once.
  FunctionBuilder& single = app.function("C_sub").role(KV_ROLE_INIT_FUNCTION);
  model.view().addUse(model.view().createCodeBlock(single.symbol()), caller.partition(), "C_sub1");
  model.auxFunction("frame");
  app.function("frame").body().call(caller.step().symbol(), {});
  app.function("frame").body().call(caller.step().symbol(), {});
  caller.step().body().call(single.symbol(), {});
  master.step().body().call(shared.symbol(), {});
  build();
  EXPECT_EQ(edges(), (Strings{"frame(-)->C_step(C)x2", "C_step(C)->C_sub(C_sub1)x1",
                              "R_step(R)->R_sub(-)x1", "R_step(R2)->R_sub(-)x1"}));
}

TEST_F(ReuseCallGraphTest, CycleOfInactiveCallersEnds) {
  auto& caller = model.partition("C");
  auto& x = model.partition("X").stepInlined(true);
  auto& y = model.partition("Y").stepInlined(true);
  auto& called = model.partition("P");
  called.calledBy(x);
  x.calledBy(y);
  y.calledBy(x);
  y.calledBy(caller);
  build(); // returns
  EXPECT_EQ(edges(), (Strings{"C_step(C)->P_step(P)x1", "C_init(C)->P_init(P)x1"}));
}

TEST_F(ReuseCallGraphTest, CountersAndAlarmsArePassedOver) {
  auto& caller = model.partition("C");
  KV_BdBlock* counter = model.counter("Ctr");
  KV_BdBlock* alarm = model.alarm("Alm");
  counter->addTrigger(caller.partition());
  alarm->addTrigger(counter);
  counter->addTrigger(alarm); // a loop of passed-over blocks ends too
  model.partition("P").triggeredBy(alarm);
  build();
  EXPECT_EQ(edges(), (Strings{"C_step(C)->P_step(P)x1", "C_init(C)->P_init(P)x1"}));
}

TEST_F(ReuseCallGraphTest, ConstructTwiceGivesTheSameEdgesAndShutdownEmpties) {
  auto& caller = model.partition("C");
  model.instance("R2", model.partition("R").calledBy(caller)).calledBy(caller);
  build();
  const Strings first = edges();
  ASSERT_TRUE(reuse.construct());
  EXPECT_EQ(edges(), first);
  ASSERT_TRUE(reuse.shutdown());
  EXPECT_EQ(reuse.number_of_nodes(), 0);
  EXPECT_FALSE(reuse.construct()) << "not booted";
}

TEST_F(ReuseCallGraphTest, EveryBlockIsGivenBackAfterShutdownAndDestruction) {
  auto& caller = model.partition("C");
  model.instance("R2", model.partition("R").calledBy(caller)).calledBy(caller);
  buildDatabases();
  KvCCountingMemController memory;
  KvCMemController* previous = pKVMemory;
  pKVMemory = &memory;
  {
    KvCFunctionCallGraph realGraph;
    KvCFcnReuseCallGraph graph;
    ASSERT_TRUE(realGraph.construct(false));
    ASSERT_TRUE(graph.boot(&realGraph, &model.view()));
    ASSERT_TRUE(graph.construct());
    EXPECT_EQ(graph.number_of_edges(), 4);
    ASSERT_TRUE(graph.shutdown());
    ASSERT_TRUE(realGraph.shutdown());
    KvCServer<int, KvCSignal> signals;
    signals.createNewEntry(1, new KvCSignal("s", "Int16", 1));
  }
  pKVMemory = previous;
  EXPECT_GT(memory.getTotalBlocks(), 0u);
  EXPECT_EQ(memory.getOutstandingBlocks(), 0u);
  EXPECT_EQ(memory.getForeignFrees(), 0u);
}

// --- keyed server

int g_signalsAlive = 0;
class CountedSignal : public KvCSignal {
public:
  CountedSignal(const char* name, int width) : KvCSignal(name, "Int16", width) { ++g_signalsAlive; }
  ~CountedSignal() override { --g_signalsAlive; }
};

TEST_F(ReuseCallGraphTest, ServerKeyInUseReplacesAndReleasesTheEarlierEntry) {
  g_signalsAlive = 0;
  {
    KvCServer<int, KvCSignal> server;
    auto* first = new CountedSignal("a", 1);
    auto* second = new CountedSignal("b", 2);
    ASSERT_TRUE(server.createNewEntry(7, first));
    EXPECT_FALSE(server.createNewEntry(8, nullptr));
    ASSERT_TRUE(server.createNewEntry(7, second));
    EXPECT_EQ(messageNumbers(), std::vector<int>{10007});
    EXPECT_EQ(server.getObject(7), second);
    EXPECT_EQ(server.getObject(8), nullptr);
    EXPECT_EQ(g_signalsAlive, 1) << "the earlier object was released";

    KvCSignal* equal = new CountedSignal("b", 2);
    int key = 0;
    ASSERT_TRUE(server.sameObjectAlreadyDefined(equal, key));
    EXPECT_EQ(equal, second);
    EXPECT_EQ(key, 7);
    KvCSignal* other = new CountedSignal("c", 2);
    key = 0;
    EXPECT_FALSE(server.sameObjectAlreadyDefined(other, key));
    EXPECT_EQ(key, 0);
    delete other;
    EXPECT_EQ(g_signalsAlive, 1);
  }
  EXPECT_EQ(g_signalsAlive, 0);
}

} // namespace
