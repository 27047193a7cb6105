#include "HulCvTools/FcnCallGraph/KvCGenericFunctionCallGraph.h"
#include "FcgTestSupport.h"
#include "HulCvTools/FcnCallGraph/KvCFcgQuery.h"
#include "HulCvTools/FcnCallGraph/KvCFcnSmbVisitor.h"
#include "HulCvTools/FcnCallGraph/KvCFunctionCallGraph.h"
#include "platform/icode/KV_ExprLocFactory.h"
#include "platform/icode/KV_ICodeFactoryContainer.h"
#include "platform/icode/KV_OperationFactory.h"
#include "platform/icode/KV_SymbolDB.h"
#include "platform/icode/KvCCodeViewData.h"
#include "platform/support/KvCSrcRefServer.h"

#include <algorithm>
#include <deque>
#include <map>
#include <random>
#include <string>
#include <type_traits>

using namespace fcgtest;

static_assert(!std::is_copy_constructible_v<KvCGenericFunctionCallGraph> &&
              !std::is_copy_assignable_v<KvCGenericFunctionCallGraph>);
static_assert(!std::is_copy_constructible_v<KvCFunctionCallGraph> &&
              !std::is_copy_assignable_v<KvCFunctionCallGraph>);

namespace {

class GenericCallGraphTest : public AppFixture {
protected:
  Infos allCallers(const char* name) {
    leda::list<KvCFcgFunctionInfo*> callers;
    EXPECT_TRUE(KvCFcgQuery(&graph).getAllCaller(info(name), callers));
    return {callers.begin(), callers.end()};
  }
  void addAll(std::initializer_list<KvCCallOperation*> calls) {
    for (KvCCallOperation* c : calls)
      ASSERT_TRUE(graph.addCall(c));
  }

  KvCGenericFunctionCallGraph graph;
};

TEST_F(GenericCallGraphTest, ThreeCallsOfOnePairAreOneEdgeUntilTheLastIsDeleted) {
  KvCParamSymbol* g = fn("g");
  KvCCallOperation* c[] = {call("f", g), call("f", g), call("f", g)};
  leda::list<leda::node> roots{nullptr};
  EXPECT_FALSE(graph.findAllFcgRoots(roots) || !roots.empty()) << "empty graph";
  addAll({c[0], c[1], c[2]});
  EXPECT_EQ(edgesOf(graph), (Edges{{info("f"), info("g"), 3, false}}));
  EXPECT_EQ(graph.getNrOfCalled(info("f")) + graph.getNrOfCallers(info("g")), 2) << "edges";
  EXPECT_EQ(callsOf(g).size(), 3u);
  EXPECT_TRUE(graph.delCall(c[0]) && graph.delCall(c[1]));
  EXPECT_EQ(edgesOf(graph), (Edges{{info("f"), info("g"), 1, false}}));
  EXPECT_EQ(callsOf(g), std::set<KvCCallOperation*>{c[2]});
  EXPECT_TRUE(graph.delCall(c[2]));
  EXPECT_EQ(graph.number_of_edges(), 0);
  EXPECT_TRUE(callsOf(g).empty());
  EXPECT_FALSE(graph.delCall(c[2]));
  EXPECT_EQ(graph.number_of_nodes(), 2) << "nodes stay";
  EXPECT_EQ(calledOf(fn("f")), std::set<KvCParamSymbol*>{g}) << "delCall keeps the called set";
  EXPECT_TRUE(messageNumbers().empty());
}

TEST_F(GenericCallGraphTest, SelfRecursionIsASelfLoopCountedOnBothSides) {
  addAll({call("f", fn("f")), call("h", fn("f"))});
  leda::edge e = nullptr;
  ASSERT_TRUE(graph.getEdge(info("f"), info("f"), e));
  EXPECT_EQ(graph.source(e), graph.target(e));
  EXPECT_EQ(graph.getNrOfCallers(info("f")), 2);
  EXPECT_EQ(graph.getNrOfCalled(info("f")), 1);
  EXPECT_TRUE(calledOf(fn("f")).empty()) << "never its own called function";
  EXPECT_EQ(allCallers("f"), (Infos{info("f"), info("h")}));
  EXPECT_EQ(allCallers("h"), Infos{});
}

TEST_F(GenericCallGraphTest, ConstructTwiceRebuildsSameGraphWithNewEdgeInfos) {
  KvCParamSymbol* g = fn("g");
  call("f", g);
  call("f", g);
  task("f", fn("t"));
  call("g", g);
  call("t", fn("f"));
  fn("lonely");
  buildDatabases();
  ASSERT_TRUE(graph.construct(false));
  const std::vector<leda::node> nodes(graph.all_nodes().begin(), graph.all_nodes().end());
  const Edges edges = edgesOf(graph);
  const std::set<KvCCallOperation*> callsOfG = callsOf(g);
  ASSERT_EQ(edges, (Edges{{info("f"), info("g"), 2, false},
                          {info("g"), info("g"), 1, false},
                          {info("t"), info("f"), 1, false},
                          {info("f"), info("t"), 1, true}}));
  const int firstIndex = KvCFcgEdgeInfo::s_DebugIndex;

  ASSERT_TRUE(graph.construct(false));
  EXPECT_EQ(std::vector<leda::node>(graph.all_nodes().begin(), graph.all_nodes().end()), nodes);
  EXPECT_EQ(edgesOf(graph), edges);
  EXPECT_EQ(callsOf(g), callsOfG);
  int expected = firstIndex;
  for (leda::edge e : graph.all_edges())
    EXPECT_EQ(graph.inf(e)->getDebugIndex(), expected++);
  EXPECT_EQ(KvCFcgEdgeInfo::s_DebugIndex, expected);
  leda::list<leda::node> roots, leaves;
  ASSERT_TRUE(graph.findAllFcgRoots(roots) && graph.findAllFcgLeaves(leaves));
  EXPECT_EQ(infosOf(graph, roots), Infos{info("lonely")});
  EXPECT_EQ(infosOf(graph, leaves), Infos{info("lonely")});
}

TEST_F(GenericCallGraphTest, UseWithoutOperationMakesTheRebuildIncomplete) {
  KvCCallOperation* lost = call("f", fn("g"));
  call("f", fn("h"));
  buildDatabases();
  ASSERT_TRUE(graph.construct(false));
  lost->getOperand(0)->releaseContent();
  EXPECT_FALSE(graph.construct(false));
  EXPECT_EQ(edgesOf(graph), (Edges{{info("f"), info("h"), 1, false}}));
  EXPECT_TRUE(callsOf(fn("g")).empty()) << "call sets are emptied before a rebuild";
}

TEST_F(GenericCallGraphTest, CallReachedThroughTwoFunctionSymbolsIsEnteredTwice) {
  // g(h): the access of function h is a direct operand of the call.
  KvCParamSymbol* g = fn("g");
  KvCCallOperation* op =
      app.factories().getOperationFactory()->createCallOperation(g, {app.access(fn("h"))});
  app.function("f").body().stmt(app.factories().getExprLocFactory()->createFromOperation(op));
  buildDatabases();
  ASSERT_TRUE(graph.construct(false));
  EXPECT_EQ(edgesOf(graph), (Edges{{info("f"), info("g"), 2, false}}));
  EXPECT_EQ(callsOf(g), std::set<KvCCallOperation*>{op});
  EXPECT_EQ(nodesOf(graph), (Infos{info("g"), info("f"), info("h")}));
}

TEST_F(GenericCallGraphTest, OnlySelectedVisitsTheUsesOfSelectedFunctions) {
  fn("f");
  call("f", fn("g"));
  call("g", fn("h"));
  fn("g")->setSelected(false);
  buildDatabases();
  ASSERT_TRUE(graph.construct(true));
  EXPECT_EQ(nodesOf(graph), (Infos{info("f"), info("h"), info("g")})) << "g only as a caller";
  EXPECT_EQ(edgesOf(graph), (Edges{{info("g"), info("h"), 1, false}}));
  ASSERT_TRUE(graph.construct(false));
  EXPECT_EQ(nodesOf(graph), (Infos{info("f"), info("h"), info("g")})) << "nodes are reused";
  EXPECT_EQ(edgesOf(graph),
            (Edges{{info("f"), info("g"), 1, false}, {info("g"), info("h"), 1, false}}));
  EXPECT_EQ(callsOf(fn("g")).size(), 1u);
  ASSERT_TRUE(graph.construct(true));
  EXPECT_TRUE(callsOf(fn("g")).empty()) << "g has a node, but its uses are not entered";
  EXPECT_EQ(callsOf(fn("h")).size(), 1u);
}

TEST_F(GenericCallGraphTest, EdgeWithATaskActivationIsATaskCallInEitherOrder) {
  KvCCallOperation* taskOfG = task("f", fn("g"));
  addAll({call("f", fn("g")), taskOfG, task("h", fn("k")), call("h", fn("k"))});
  EXPECT_EQ(edgesOf(graph),
            (Edges{{info("f"), info("g"), 2, true}, {info("h"), info("k"), 2, true}}));
  ASSERT_TRUE(graph.delCall(taskOfG));
  EXPECT_TRUE(std::get<3>(edgesOf(graph)[0])) << "the flag is never taken back";
}

TEST_F(GenericCallGraphTest, CallsOutsideFunctionsAreNotEntered) {
  KvCParamSymbol* acc = fn("Acc_Get");
  acc->setRole(KV_ROLE_ACCESS_FUNCTION, true);
  KvCParamSymbol* rte = app.macro("Rte_Read");
  rte->setRole(KV_ROLE_RTE_API_MACRO, true);
  KV_OperationFactory* ops = app.factories().getOperationFactory();
  auto initialize = [&](const char* variable, KvCIcExpression* value) {
    app.fileScope().stmt(
        app.varDef(app.variable(variable, app.int16(), false), {app.initValue({}, {value})}));
  };
  // Access function and RTE macro (below an addition) in initial values: silently skipped.
  KvCCallOperation* direct = ops->createCallOperation(acc, {});
  initialize("v", direct);
  KV_Operation* sum = app.operationExpr(KV_OP_ADD, {app.call(rte, {}), app.constant(1)});
  KvCCallOperation* nested = sum->getOperand(0)->getOperation()->asCallOperation();
  initialize("w", sum);
  call("f", fn("g"));
  buildDatabases();
  ASSERT_TRUE(graph.construct(false));
  EXPECT_EQ(edgesOf(graph), (Edges{{info("f"), info("g"), 1, false}}));
  for (KvCCallOperation* c : {direct, nested})
    EXPECT_FALSE(graph.addCall(c) || graph.delCall(c));
  EXPECT_TRUE(callsOf(acc).empty() && callsOf(rte).empty());
  EXPECT_TRUE(messageNumbers().empty());

  // A plain function in an initial value and an access function at file level: reported.
  KvCCallOperation* inInit = ops->createCallOperation(fn("g"), {});
  inInit->setSourceRef(app.data().getSrcRefServer()->createModelSrcRef("model/init"));
  initialize("u", inInit);
  KV_ExprLocation* loc = app.call(acc, {});
  app.fileScope().stmt(loc);
  for (KvCCallOperation* c : {inInit, loc->getOperation()->asCallOperation()}) {
    server().clear();
    EXPECT_FALSE(graph.addCall(c));
    ASSERT_EQ(messageNumbers(), std::vector<int>{10008});
    EXPECT_EQ(server().getMessages()[0].srcRef, c->getSourceRef());
    EXPECT_NE(server().getMessages()[0].text.str().find("KvCGenericFunctionCallGraph 233"),
              std::string::npos);
    EXPECT_FALSE(graph.delCall(c));
  }
  EXPECT_EQ(edgesOf(graph), (Edges{{info("f"), info("g"), 1, false}}));
  EXPECT_EQ(callsOf(fn("g")).size(), 1u);
}

TEST_F(GenericCallGraphTest, TraversalsStopOnlyBetweenNodes) {
  // Node order a, b, c, d; a calls each of the others and each of them calls a.
  for (const char* other : {"b", "c", "d"})
    addAll({call("a", fn(other))});
  for (const char* other : {"b", "c", "d"})
    addAll({call(other, fn("a"))});
  const Infos others{info("b"), info("c"), info("d")};
  Recorder two(2), none(0), callers(2), called(2), all;
  graph.forall_FcgNodes(two);
  graph.forall_FcgNodes(none);
  EXPECT_EQ(two.applied, (Infos{info("a"), info("b")}));
  EXPECT_TRUE(none.applied.empty());
  graph.forall_CallerNodes(callers);
  graph.forall_CalledNodes(called);
  EXPECT_EQ(callers.applied, others) << "all edges of the first node, then stop";
  EXPECT_EQ(called.applied, others);
  graph.forall_CalledNodes(all);
  EXPECT_EQ(all.applied, (Infos{others[0], others[1], others[2], info("a"), info("a"), info("a")}));

  Recorder ofA, ofB, ofNoNode;
  graph.forall_CalledFunctionsOf(info("a"), ofA);
  graph.forall_CallingFunctionsOf(info("b"), ofB);
  graph.forall_CalledFunctionsOf(info("z"), ofNoNode);
  graph.forall_CallingFunctionsOf(info("z"), ofNoNode);
  EXPECT_EQ(ofA.applied, others);
  EXPECT_EQ(ofB.applied, Infos{info("a")});
  EXPECT_TRUE(ofNoNode.applied.empty());
}

TEST_F(GenericCallGraphTest, RemoveCalledEdgesEmptiesTheCalledFunctionsWholeCallSets) {
  KvCCallOperation* intoF = call("x", fn("f"));
  addAll({call("f", fn("g")), call("h", fn("g")), call("f", fn("k")), intoF});
  graph.removeCalledEdges(info("f"));
  EXPECT_TRUE(callsOf(fn("g")).empty()) << "h's call to g too";
  EXPECT_TRUE(callsOf(fn("k")).empty());
  EXPECT_EQ(callsOf(fn("f")), std::set<KvCCallOperation*>{intoF});
  EXPECT_EQ(edgesOf(graph),
            (Edges{{info("h"), info("g"), 1, false}, {info("x"), info("f"), 1, false}}));
}

TEST_F(GenericCallGraphTest, DelCallOnEdgeWithoutCardinalityReportsAndKeepsTheEdge) {
  KvCCallOperation* c = call("f", fn("g"));
  addAll({c});
  leda::edge e = nullptr;
  ASSERT_TRUE(graph.getEdge(info("f"), info("g"), e));
  graph.inf(e)->setCardinality(0);
  EXPECT_TRUE(graph.delCall(c));
  ASSERT_EQ(messageNumbers(), std::vector<int>{10007});
  EXPECT_NE(server().getMessages()[0].text.str().find("KvCGenericFunctionCallGraph 290"),
            std::string::npos);
  EXPECT_EQ(graph.number_of_edges(), 1);
  EXPECT_TRUE(callsOf(fn("g")).empty());
}

TEST_F(GenericCallGraphTest, HiddenEdgeIsAbsentForLookupsUntilRestored) {
  addAll({call("f", fn("g"))});
  leda::edge e = nullptr;
  ASSERT_TRUE(graph.getEdge(info("f"), info("g"), e));
  graph.hide_edge(e);
  EXPECT_FALSE(graph.getEdge(info("f"), info("g"), e));
  EXPECT_EQ(graph.getNrOfCalled(info("f")), 0);
  buildDatabases();
  ASSERT_TRUE(graph.construct(false));
  EXPECT_EQ(edgesOf(graph), (Edges{{info("f"), info("g"), 1, false}}));
}

// --- random addCall / delCall / removals against a plain reference

TEST_F(GenericCallGraphTest, RandomUpdatesAgreeWithReference) {
  constexpr int n = 8;
  std::vector<KvCParamSymbol*> f;
  for (int i = 0; i < n; ++i)
    f.push_back(fn(("f" + std::to_string(i)).c_str()));
  for (unsigned seed = 1; seed <= 6; ++seed) {
    std::mt19937_64 rng(seed);
    auto pick = [&](std::size_t bound) { return static_cast<std::size_t>(rng() % bound); };
    std::vector<KvCCallOperation*> pool;
    for (int k = 0; k < 40; ++k) {
      const std::size_t from = pick(n), to = pick(4) == 0 ? from : pick(n);
      pool.push_back(call(f[from]->getName().c_str(), f[to], pick(6) == 0));
    }
    for (KvCParamSymbol* s : f) { // the infos outlive the graphs of earlier seeds
      infoOf(s)->getCallOperationsSet().clear();
      infoOf(s)->getCalledFunctionsSet().clear();
    }
    KvCGenericFunctionCallGraph g;
    Infos nodes; // registration order
    Edges edges; // creation order
    std::map<KvCFcgFunctionInfo*, std::set<KvCCallOperation*>> calls;
    std::map<KvCFcgFunctionInfo*, std::set<KvCParamSymbol*>> called;
    auto edgeOf = [&](KvCFcgFunctionInfo* from, KvCFcgFunctionInfo* to) {
      return std::find_if(edges.begin(), edges.end(), [&](const EdgeRow& e) {
        return std::get<0>(e) == from && std::get<1>(e) == to;
      });
    };
    for (int step = 0; step < 400; ++step) {
      SCOPED_TRACE("seed " + std::to_string(seed) + " step " + std::to_string(step));
      const std::size_t action = pick(100);
      KvCFcgFunctionInfo* v = infoOf(f[pick(n)]);
      KvCCallOperation* op = pool[pick(pool.size())];
      KvCFcgFunctionInfo* from = infoOf(op->getCallingSymbol());
      KvCFcgFunctionInfo* to = infoOf(op->getCalledSymbol());
      auto it = edgeOf(from, to);
      if (action < 50) {
        ASSERT_TRUE(g.addCall(op));
        for (KvCFcgFunctionInfo* u : {from, to})
          if (std::find(nodes.begin(), nodes.end(), u) == nodes.end())
            nodes.push_back(u);
        if (it == edges.end())
          it = edges.insert(edges.end(), EdgeRow{from, to, 0, false});
        ++std::get<2>(*it);
        std::get<3>(*it) = std::get<3>(*it) || op->isTaskActivation();
        calls[to].insert(op);
        if (from != to)
          called[from].insert(to->getSymbol());
      } else if (action < 92) {
        ASSERT_EQ(g.delCall(op), it != edges.end());
        if (it != edges.end()) {
          calls[to].erase(op);
          if (--std::get<2>(*it) == 0)
            edges.erase(it);
        }
      } else if (action < 96) {
        g.removeEdges(v);
        std::erase_if(edges,
                      [&](const EdgeRow& e) { return std::get<0>(e) == v || std::get<1>(e) == v; });
      } else {
        g.removeCalledEdges(v);
        for (const EdgeRow& e : edges)
          if (std::get<0>(e) == v)
            calls[std::get<1>(e)].clear();
        std::erase_if(edges, [&](const EdgeRow& e) { return std::get<0>(e) == v; });
      }

      ASSERT_EQ(nodesOf(g), nodes);
      ASSERT_EQ(edgesOf(g), edges);
      Infos roots, leaves, callerWalk;
      for (KvCFcgFunctionInfo* u : nodes) {
        int in = 0, out = 0;
        for (const EdgeRow& e : edges) {
          out += std::get<0>(e) == u;
          if (std::get<1>(e) == u) {
            ++in;
            callerWalk.push_back(std::get<0>(e));
          }
        }
        if (in == 0)
          roots.push_back(u);
        if (out == 0)
          leaves.push_back(u);
        EXPECT_EQ(g.getNrOfCallers(u), in);
        EXPECT_EQ(g.getNrOfCalled(u), out);
      }
      leda::list<leda::node> rootList, leafList;
      EXPECT_EQ(g.findAllFcgRoots(rootList), !roots.empty());
      EXPECT_EQ(g.findAllFcgLeaves(leafList), !leaves.empty());
      EXPECT_EQ(infosOf(g, rootList), roots);
      EXPECT_EQ(infosOf(g, leafList), leaves);
      Recorder walk;
      g.forall_CallerNodes(walk);
      EXPECT_EQ(walk.applied, callerWalk);
      for (KvCParamSymbol* su : f) {
        KvCFcgFunctionInfo* u = infoOf(su);
        for (KvCParamSymbol* sw : f) {
          leda::edge e = nullptr;
          const bool found = g.getEdge(u, infoOf(sw), e);
          ASSERT_EQ(found, edgeOf(u, infoOf(sw)) != edges.end());
          EXPECT_TRUE(!found || (g.inf(g.source(e)) == u && g.inf(g.target(e)) == infoOf(sw)));
        }
        // Breadth first over the incoming edges in creation order.
        Infos expectedCallers;
        std::deque<KvCFcgFunctionInfo*> queue;
        auto enqueueCallers = [&](KvCFcgFunctionInfo* x) {
          for (const EdgeRow& e : edges)
            if (std::get<1>(e) == x)
              queue.push_back(std::get<0>(e));
        };
        for (enqueueCallers(u); !queue.empty(); queue.pop_front())
          if (std::find(expectedCallers.begin(), expectedCallers.end(), queue.front()) ==
              expectedCallers.end()) {
            expectedCallers.push_back(queue.front());
            enqueueCallers(queue.front());
          }
        leda::list<KvCFcgFunctionInfo*> found{nullptr};
        const bool hasNode = std::find(nodes.begin(), nodes.end(), u) != nodes.end();
        ASSERT_EQ(KvCFcgQuery(&g).getAllCaller(u, found), hasNode);
        EXPECT_EQ(Infos(found.begin(), found.end()), hasNode ? expectedCallers : Infos{nullptr});
        EXPECT_EQ(callsOf(su), calls[u]);
        EXPECT_EQ(calledOf(su), called[u]);
      }
      if (HasFailure())
        return;
    }
  }
  EXPECT_TRUE(messageNumbers().empty());
}

} // namespace

// --- construct against entering every use one at a time

namespace {

// Builds its graph the plain way: every listed symbol's uses, one addCall each, through the
// symbol visitor. Its own type also sends construct through the overridable edge hook.
class OneByOneGraph : public KvCGenericFunctionCallGraph {
public:
  void enterUsesOneByOne() {
    restore_all_edges();
    deleteAllEdges();
    deleteAllNodes();
    KvCFcnSmbVisitor visitor(this, true);
    KvCCodeViewData::getCurrent()->getSymbolDB()->forallParametrizedSymbols(&visitor);
  }
  int edgeHookCalls = 0;

protected:
  void synchronizeEdgeInfoAtConstruction(KvCFcgEdgeInfo* info, KvCCallOperation* call) override {
    ++edgeHookCalls;
    KvCGenericFunctionCallGraph::synchronizeEdgeInfoAtConstruction(info, call);
  }
};

// Everything construct decides: node order, edges in order, each node's out- and in-edge
// order, and the call and called sets of the functions.
struct GraphSnapshot {
  Infos nodes;
  Edges edges;
  std::vector<Infos> outs, ins;
  std::vector<std::set<KvCCallOperation*>> calls;
  std::vector<std::set<KvCParamSymbol*>> called;
  bool operator==(const GraphSnapshot&) const = default;
};

GraphSnapshot snapshot(const KvCGenericFunctionCallGraph& g,
                       const std::vector<KvCParamSymbol*>& functions) {
  GraphSnapshot s{nodesOf(g), edgesOf(g), {}, {}, {}, {}};
  for (leda::node v : g.all_nodes()) {
    s.outs.emplace_back();
    s.ins.emplace_back();
    for (leda::edge e : g.out_edges(v))
      s.outs.back().push_back(g.inf(g.target(e)));
    for (leda::edge e : g.in_edges(v))
      s.ins.back().push_back(g.inf(g.source(e)));
  }
  for (KvCParamSymbol* f : functions) {
    s.calls.push_back(callsOf(f));
    s.called.push_back(calledOf(f));
  }
  return s;
}

void forgetSets(const std::vector<KvCParamSymbol*>& functions) {
  for (KvCParamSymbol* f : functions) {
    infoOf(f)->getCallOperationsSet().clear();
    infoOf(f)->getCalledFunctionsSet().clear();
  }
}

// called(passed): the access of `passed` is a direct operand of the call, so the call is
// among the uses of both functions.
KV_ExprLocation* callPassing(AppBuilder& app, KvCParamSymbol* called, KvCParamSymbol* passed) {
  KvCCallOperation* op =
      app.factories().getOperationFactory()->createCallOperation(called, {app.access(passed)});
  return app.factories().getExprLocFactory()->createFromOperation(op);
}

TEST_F(GenericCallGraphTest, ConstructAgreesWithEnteringEachUseInTurn) {
  for (unsigned seed = 1; seed <= 4; ++seed) {
    SCOPED_TRACE("seed " + std::to_string(seed));
    AppBuilder& local = app;
    const std::string prefix = "s" + std::to_string(seed) + "_";
    std::mt19937_64 rng(seed);
    auto pick = [&](std::size_t bound) { return static_cast<std::size_t>(rng() % bound); };
    auto callPassing = [&](KvCParamSymbol* called, KvCParamSymbol* passed) {
      return ::callPassing(local, called, passed);
    };
    auto function = [&](const std::string& name) {
      return local.function((prefix + name).c_str()).symbol();
    };
    std::vector<KvCParamSymbol*> all;
    // Passed as arguments by the hubs, one listed before every other function, one after.
    KvCParamSymbol* early = function("early");
    all.push_back(early);
    std::vector<KvCParamSymbol*> f, hubs, targets;
    for (int i = 0; i < 60; ++i)
      f.push_back(function("f" + std::to_string(i)));
    for (int i = 0; i < 36; ++i) {
      hubs.push_back(function("h" + std::to_string(i)));
      targets.push_back(function("t" + std::to_string(i)));
    }
    KvCParamSymbol* late = function("late");
    all.insert(all.end(), f.begin(), f.end());
    all.insert(all.end(), hubs.begin(), hubs.end());
    all.insert(all.end(), targets.begin(), targets.end());
    all.push_back(late);
    // Random calls, some repeated, some recursive, some task activations, some passing a
    // function as an argument (so the call is reached through that function's uses too).
    for (int k = 0; k < 600; ++k) {
      KvCParamSymbol* from = f[pick(f.size())];
      KvCParamSymbol* to = pick(8) == 0 ? from : f[pick(f.size())];
      KV_ExprLocation* loc = nullptr;
      if (pick(10) == 0) {
        loc = local.taskActivation(to);
      } else if (pick(3) == 0) {
        loc = callPassing(to, f[pick(f.size())]);
      } else {
        loc = local.call(to, {local.constant(1)});
      }
      local.functionBuilder(from->getName().c_str()).body().stmt(loc);
    }
    // Every hub calls every target (in a shuffled order) passing early or late: those
    // pairs are met again through early's and late's uses, between nodes of high degree.
    for (KvCParamSymbol* hub : hubs) {
      std::vector<KvCParamSymbol*> order = targets;
      std::shuffle(order.begin(), order.end(), rng);
      for (KvCParamSymbol* target : order)
        local.functionBuilder(hub->getName().c_str())
            .body()
            .stmt(callPassing(target, pick(2) == 0 ? early : late));
    }
    buildDatabases();

    OneByOneGraph reference;
    reference.enterUsesOneByOne();
    const GraphSnapshot expected = snapshot(reference, all);
    ASSERT_GT(expected.edges.size(), 36u * 36u);

    for (int round = 0; round < 2; ++round) {
      forgetSets(all);
      KvCGenericFunctionCallGraph plain;
      ASSERT_TRUE(plain.construct(false));
      EXPECT_EQ(snapshot(plain, all), expected) << "plain hooks, round " << round;
      forgetSets(all);
      OneByOneGraph hooked;
      ASSERT_TRUE(hooked.construct(false));
      ASSERT_TRUE(hooked.construct(false)) << "a reconstruction reuses the nodes";
      EXPECT_EQ(snapshot(hooked, all), expected);
      EXPECT_EQ(hooked.edgeHookCalls, 2 * static_cast<int>([&] {
                                        int calls = 0;
                                        for (const EdgeRow& e : expected.edges)
                                          calls += std::get<2>(e);
                                        return calls;
                                      }()));
      // Single calls still find the constructed edges through the index.
      KvCCallOperation* someCall = *callsOf(targets[0]).begin();
      leda::edge e = nullptr;
      ASSERT_TRUE(plain.getEdge(infoOf(someCall->getCallingSymbol()), infoOf(targets[0]), e));
      const int before = plain.inf(e)->getCardinality();
      ASSERT_TRUE(plain.addCall(someCall));
      EXPECT_EQ(plain.inf(e)->getCardinality(), before + 1);
      EXPECT_EQ(plain.number_of_edges(), static_cast<int>(expected.edges.size()));
    }
  }
  EXPECT_TRUE(messageNumbers().empty());
}

// What a graph says of each function, independent of the order its nodes were made in:
// the edges in creation order, each node's out- and in-edges in order, the sets.
struct FunctionView {
  Infos outs, ins;
  std::set<KvCCallOperation*> calls;
  std::set<KvCParamSymbol*> called;
  bool operator==(const FunctionView&) const = default;
};
std::pair<Edges, std::map<KvCFcgFunctionInfo*, FunctionView>>
viewOf(const KvCGenericFunctionCallGraph& g) {
  std::map<KvCFcgFunctionInfo*, FunctionView> views;
  for (leda::node v : g.all_nodes()) {
    FunctionView& view = views[g.inf(v)];
    for (leda::edge e : g.out_edges(v))
      view.outs.push_back(g.inf(g.target(e)));
    for (leda::edge e : g.in_edges(v))
      view.ins.push_back(g.inf(g.source(e)));
    view.calls = callsOf(g.inf(v)->getSymbol());
    view.called = calledOf(g.inf(v)->getSymbol());
  }
  return {edgesOf(g), views};
}

TEST_F(GenericCallGraphTest, ReconstructionAfterTheApplicationGrewAgreesWithAFreshGraph) {
  // One graph lives through three versions of the application (functions and calls
  // added, functions passed as arguments) and is reconstructed each time, once after a
  // shutdown; a new graph constructed on the same version must say the same.
  std::mt19937_64 rng(11);
  auto pick = [&](std::size_t bound) { return static_cast<std::size_t>(rng() % bound); };
  std::vector<KvCParamSymbol*> functions;
  KvCFunctionCallGraph kept;
  for (int version = 0; version < 3; ++version) {
    SCOPED_TRACE("version " + std::to_string(version));
    for (int i = 0; i < 40; ++i)
      functions.push_back(fn(std::string("v")
                                 .append(std::to_string(version))
                                 .append("_")
                                 .append(std::to_string(i))
                                 .c_str()));
    for (int k = 0; k < 300; ++k) {
      KvCParamSymbol* from = functions[pick(functions.size())];
      KvCParamSymbol* to = functions[pick(functions.size())];
      KV_ExprLocation* loc = pick(4) == 0 ? callPassing(app, to, functions[pick(functions.size())])
                             : pick(9) == 0 ? app.taskActivation(to)
                                            : app.call(to, {app.constant(1)});
      app.functionBuilder(from->getName().c_str()).body().stmt(loc);
    }
    buildDatabases();
    if (version == 2) {
      ASSERT_TRUE(kept.shutdown());
    } else {
      // What the graph's functions' sets hold before a reconstruction must go.
      KvCCallOperation* stray =
          app.factories().getOperationFactory()->createCallOperation(functions[0], {});
      for (leda::node v : kept.all_nodes())
        kept.inf(v)->addCallOperation(stray);
    }
    ASSERT_TRUE(kept.construct(false));
    const auto reconstructed = viewOf(kept);
    forgetSets(functions);
    KvCFunctionCallGraph fresh;
    ASSERT_TRUE(fresh.construct(false));
    EXPECT_EQ(viewOf(fresh), reconstructed);
    EXPECT_EQ(kept.number_of_nodes(), fresh.number_of_nodes());
    // The kept graph's lookups find the new edges.
    for (const EdgeRow& row : reconstructed.first) {
      leda::edge e = nullptr;
      ASSERT_TRUE(kept.getEdge(std::get<0>(row), std::get<1>(row), e));
    }
    fresh.shutdown();
  }
  EXPECT_TRUE(messageNumbers().empty());
}

TEST_F(GenericCallGraphTest, CallReachedOnlyThroughAPassedFunctionStaysInTheCalledSet) {
  // f calls g passing h; g has a node from the first construction but is not listed by
  // the second, which reaches the call through h's uses only.
  fn("f");
  KvCParamSymbol* g = fn("g");
  KvCParamSymbol* h = fn("h");
  app.functionBuilder("f").body().stmt(callPassing(app, g, h));
  buildDatabases();
  ASSERT_TRUE(graph.construct(false));
  ASSERT_EQ(callsOf(g).size(), 1u);
  const std::set<KvCCallOperation*> calls = callsOf(g);
  g->setSelected(false);
  ASSERT_TRUE(graph.construct(true));
  EXPECT_EQ(callsOf(g), calls);
  leda::edge e = nullptr;
  ASSERT_TRUE(graph.getEdge(info("f"), infoOf(g), e));
  EXPECT_EQ(graph.inf(e)->getCardinality(), 1);
}

} // namespace

namespace {} // namespace

namespace {

// A hook that starts the same graph's construction again, and makes a function symbol,
// while the first run is under way.
class ReenteringGraph : public KvCGenericFunctionCallGraph {
public:
  explicit ReenteringGraph(AppBuilder& builder) : app(builder) {}
  bool nestedResult = true;

protected:
  void synchronizeNodeInfoAtConstruction(KvCFcgFunctionInfo* /*info*/,
                                         KvCParamSymbol* /*function*/) override {
    if (done)
      return;
    done = true;
    nestedResult = construct(false);
    app.function("late");
  }

private:
  AppBuilder& app;
  bool done = false;
};

TEST_F(GenericCallGraphTest, ConstructStartedFromAHookIsRefusedAndLateSymbolsAreVisited) {
  call("f", fn("g"));
  call("f", fn("g"));
  call("g", fn("f"));
  buildDatabases();
  ReenteringGraph reentering(app);
  EXPECT_TRUE(reentering.construct(false));
  EXPECT_FALSE(reentering.nestedResult);
  EXPECT_EQ(messageNumbers(), std::vector<int>{10007});
  ASSERT_TRUE(graph.construct(false));
  EXPECT_EQ(edgesOf(reentering), edgesOf(graph)) << "the outer run went on undisturbed";
  leda::node late = nullptr;
  EXPECT_TRUE(reentering.getNode(info("late"), late)) << "a symbol made during the run";
}

} // namespace
