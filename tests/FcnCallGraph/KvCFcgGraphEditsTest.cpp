// The call graph edited through the operations it inherits from the graph (del_edge,
// hide_edge, restore_edge, restore_all_edges, new_edge, del_node, del_all_edges, clear):
// its lookups must follow every edit, every edge info must be released exactly once
// whatever deletes its edge, and the hooks must run in the documented order.
#include "FcgTestSupport.h"
#include "HulCvTools/FcnCallGraph/KvCFunctionCallGraph.h"
#include "platform/icode/KV_ExprLocFactory.h"
#include "platform/icode/KV_ICodeFactoryContainer.h"
#include "platform/icode/KV_OperationFactory.h"

#include <algorithm>
#include <map>
#include <random>
#include <string>
#include <vector>

using namespace fcgtest;

namespace {

// Counts the edge infos it makes and releases; created - deleted is the number of infos
// the graph still holds.
template <class Base> class CountingGraph : public Base {
public:
  int created = 0;
  int deleted = 0;
  int live() const { return created - deleted; }

protected:
  KvCFcgEdgeInfo* createFcgEdgeInfo() override {
    ++created;
    return Base::createFcgEdgeInfo();
  }
  void deleteFcgEdgeInfo(KvCFcgEdgeInfo* info) override {
    ++deleted;
    Base::deleteFcgEdgeInfo(info);
  }
};
using CountingFcg = CountingGraph<KvCFunctionCallGraph>;

// -1 for an edge without info.
int cardinalityOf(const KvCGenericFunctionCallGraph& g, leda::edge e) {
  return g.inf(e) ? g.inf(e)->getCardinality() : -1;
}

class GraphEditsTest : public AppFixture {
protected:
  void TearDown() override {
    ASSERT_TRUE(graph.shutdown());
    EXPECT_EQ(graph.created, graph.deleted) << "every edge info released once";
    AppFixture::TearDown();
  }
  leda::edge edge(const char* from, const char* to) {
    leda::edge e = nullptr;
    return graph.getEdge(info(from), info(to), e) ? e : nullptr;
  }
  leda::node node(const char* name) {
    leda::node v = nullptr;
    return graph.getNode(info(name), v) ? v : nullptr;
  }

  CountingFcg graph;
};

TEST_F(GraphEditsTest, CallAfterItsEdgeWasDeletedDirectlyMakesAFreshEdge) {
  KvCCallOperation* c1 = call("f", fn("g"));
  KvCCallOperation* c2 = call("f", fn("g"));
  ASSERT_TRUE(graph.addCall(c1));
  graph.del_edge(edge("f", "g"));
  EXPECT_EQ(graph.deleted, 1) << "the info goes with its edge";
  ASSERT_TRUE(graph.addCall(c2));
  EXPECT_EQ(graph.number_of_edges(), 1);
  leda::edge e = edge("f", "g");
  ASSERT_NE(e, nullptr);
  EXPECT_EQ(e, *graph.all_edges().begin());
  EXPECT_EQ(cardinalityOf(graph, e), 1);
  // Any call of the pair takes one from the pair's edge.
  EXPECT_TRUE(graph.delCall(c1));
  EXPECT_EQ(graph.number_of_edges(), 0);
  EXPECT_FALSE(graph.delCall(c2));
  EXPECT_EQ(graph.live(), 0);
}

TEST_F(GraphEditsTest, PairWhoseEdgeWasDeletedDirectlyHasNoEdgeForLaterCalls) {
  KvCCallOperation* fg = call("f", fn("g"));
  ASSERT_TRUE(graph.addCall(fg));
  graph.del_edge(edge("f", "g"));
  ASSERT_TRUE(graph.addCall(call("h", fn("k")))); // may take the freed edge record
  EXPECT_EQ(edge("f", "g"), nullptr);
  EXPECT_FALSE(graph.delCall(fg));
  leda::edge hk = edge("h", "k");
  ASSERT_NE(hk, nullptr);
  EXPECT_EQ(cardinalityOf(graph, hk), 1);
  EXPECT_EQ(graph.number_of_edges(), 1);
  EXPECT_EQ(graph.getNrOfCalled(info("f")) + graph.getNrOfCallers(info("g")), 0);
}

TEST_F(GraphEditsTest, EdgeMadeWithoutInfoIsFoundAndGetsAnInfoFromTheNextCall) {
  KvCCallOperation* c = call("f", fn("g"));
  ASSERT_TRUE(graph.addCall(c) && graph.delCall(c)); // both nodes, no edge
  leda::edge bare = graph.new_edge(node("f"), node("g"));
  EXPECT_EQ(edge("f", "g"), bare);
  EXPECT_EQ(graph.getNrOfCalled(info("f")) + graph.getNrOfCallers(info("g")), 2);
  // No call is counted on it: delCall reports and keeps the edge.
  EXPECT_TRUE(graph.delCall(c));
  EXPECT_EQ(messageNumbers(), std::vector<int>{10007});
  EXPECT_EQ(graph.number_of_edges(), 1);
  server().clear();

  const int created = graph.created;
  ASSERT_TRUE(graph.addCall(c));
  EXPECT_EQ(edge("f", "g"), bare);
  EXPECT_EQ(cardinalityOf(graph, bare), 1);
  EXPECT_EQ(graph.created, created + 1);
  EXPECT_TRUE(graph.delCall(c));
  EXPECT_EQ(graph.number_of_edges(), 0);
  EXPECT_EQ(graph.live(), 0);

  // Bare edges leave through the removal paths without any release.
  graph.new_edge(node("f"), node("g"));
  graph.new_edge(node("g"), node("g"));
  graph.new_edge(node("g"), node("f"));
  const int deleted = graph.deleted;
  graph.removeEdges(info("g"));
  EXPECT_EQ(graph.number_of_edges(), 0);
  EXPECT_EQ(graph.deleted, deleted);
  EXPECT_TRUE(messageNumbers().empty());
}

TEST_F(GraphEditsTest, DeletedNodesAndClearedGraphForgetTheirFunctionsAndReleaseEveryInfo) {
  KvCCallOperation* fg = call("f", fn("g"));
  KvCCallOperation* gh = call("g", fn("h"));
  KvCCallOperation* hf = call("h", fn("f"));
  KvCCallOperation* gg = call("g", fn("g"));
  for (KvCCallOperation* c : {fg, gh, hf, gg})
    ASSERT_TRUE(graph.addCall(c));
  graph.hide_edge(edge("g", "h"));
  graph.del_node(node("g"));
  EXPECT_EQ(node("g"), nullptr);
  EXPECT_EQ(graph.deleted, 3) << "hidden edge and self-loop included";
  EXPECT_EQ(graph.number_of_all_edges(), 1);
  EXPECT_EQ(edge("f", "g"), nullptr);
  EXPECT_EQ(graph.getNrOfCalled(info("g")) + graph.getNrOfCallers(info("g")), 0);
  EXPECT_FALSE(graph.delCall(fg));
  EXPECT_NE(edge("h", "f"), nullptr);

  ASSERT_TRUE(graph.addCall(gh));
  EXPECT_EQ(nodesOf(graph), (Infos{info("f"), info("h"), info("g")})) << "g got a new node";
  ASSERT_NE(edge("g", "h"), nullptr);
  EXPECT_EQ(cardinalityOf(graph, edge("g", "h")), 1);

  graph.hide_edge(edge("h", "f"));
  graph.clear();
  EXPECT_EQ(graph.live(), 0);
  for (const char* name : {"f", "g", "h"}) {
    EXPECT_EQ(node(name), nullptr);
    EXPECT_EQ(graph.getNrOfCallers(info(name)) + graph.getNrOfCalled(info(name)), 0);
  }
  EXPECT_EQ(edge("g", "h"), nullptr);
  EXPECT_FALSE(graph.delCall(gh));
  ASSERT_TRUE(graph.addCall(fg) && graph.addCall(fg));
  EXPECT_EQ(edgesOf(graph), (Edges{{info("f"), info("g"), 2, false}}));

  graph.del_all_edges();
  EXPECT_EQ(graph.live(), 0);
  EXPECT_EQ(nodesOf(graph), (Infos{info("f"), info("g")})) << "nodes stay";
  EXPECT_EQ(edge("f", "g"), nullptr);
  ASSERT_TRUE(graph.addCall(hf) && graph.addCall(gg)); // left for shutdown (TearDown)
  EXPECT_EQ(graph.live(), 2);
}

// --- random edits against a plain reference

// One live edge of the reference, kept in creation order. `cardinality` -1: no info.
struct RefEdge {
  int from, to, cardinality;
  bool hidden;
  leda::edge handle; // to apply an edit to the same edge of the graph
};

TEST_F(GraphEditsTest, RandomEditsAgreeWithReference) {
  constexpr int n = 6;
  std::vector<KvCFcgFunctionInfo*> infos;
  for (int i = 0; i < n; ++i)
    infos.push_back(info(("f" + std::to_string(i)).c_str()));
  // One call per ordered pair; entering a call twice counts it twice.
  std::vector<std::vector<KvCCallOperation*>> calls(n);
  for (int a = 0; a < n; ++a)
    for (int b = 0; b < n; ++b)
      calls[a].push_back(
          call(("f" + std::to_string(a)).c_str(), fn(("f" + std::to_string(b)).c_str())));

  for (unsigned seed = 1; seed <= 20; ++seed) {
    std::mt19937 rng(seed);
    auto pick = [&](std::size_t bound) { return static_cast<int>(rng() % bound); };
    CountingFcg g;
    std::vector<RefEdge> edges;
    std::vector<bool> hasNode(n, false);
    auto firstVisible = [&](int a, int b) {
      return std::find_if(edges.begin(), edges.end(),
                          [&](const RefEdge& r) { return !r.hidden && r.from == a && r.to == b; });
    };
    auto pickEdge = [&](auto accept) -> RefEdge* {
      std::vector<RefEdge*> candidates;
      for (RefEdge& r : edges)
        if (accept(r))
          candidates.push_back(&r);
      return candidates.empty() ? nullptr : candidates[pick(candidates.size())];
    };
    auto nodeOf = [&](int a) {
      leda::node v = nullptr;
      return g.getNode(infos[a], v) ? v : nullptr;
    };
    for (int step = 0; step < 300; ++step) {
      SCOPED_TRACE("seed " + std::to_string(seed) + " step " + std::to_string(step));
      const int action = pick(100);
      const int a = pick(n), b = pick(n);
      if (action < 35) {
        ASSERT_TRUE(g.addCall(calls[a][b]));
        hasNode[a] = hasNode[b] = true;
        if (auto r = firstVisible(a, b); r != edges.end()) {
          r->cardinality = std::max(r->cardinality, 0) + 1;
        } else {
          leda::edge last = nullptr;
          for (leda::edge e : g.all_edges())
            last = e;
          edges.push_back({a, b, 1, false, last});
        }
      } else if (action < 55) {
        auto r = firstVisible(a, b);
        ASSERT_EQ(g.delCall(calls[a][b]), r != edges.end());
        if (r != edges.end() && r->cardinality >= 2)
          --r->cardinality;
        else if (r != edges.end() && r->cardinality == 1)
          edges.erase(r);
        // An edge without count stays (the fault is reported).
      } else if (action < 65) {
        if (RefEdge* r = pickEdge([](const RefEdge& x) { return !x.hidden; })) {
          g.hide_edge(r->handle);
          r->hidden = true;
        }
      } else if (action < 71) {
        if (RefEdge* r = pickEdge([](const RefEdge& x) { return x.hidden; })) {
          g.restore_edge(r->handle);
          r->hidden = false;
        }
      } else if (action < 73) {
        g.restore_all_edges();
        for (RefEdge& r : edges)
          r.hidden = false;
      } else if (action < 81) {
        if (RefEdge* r = pickEdge([](const RefEdge&) { return true; })) {
          g.del_edge(r->handle);
          edges.erase(edges.begin() + (r - edges.data()));
        }
      } else if (action < 89) {
        if (hasNode[a] && hasNode[b])
          edges.push_back({a, b, -1, false, g.new_edge(nodeOf(a), nodeOf(b))});
      } else if (action < 97) {
        if (hasNode[a]) {
          g.del_node(nodeOf(a));
          hasNode[a] = false;
          std::erase_if(edges, [&](const RefEdge& r) { return r.from == a || r.to == a; });
        }
      } else if (action < 99) {
        g.del_all_edges();
        edges.clear();
      } else {
        g.clear();
        edges.clear();
        hasNode.assign(n, false);
      }

      int visible = 0, withInfo = 0;
      for (const RefEdge& r : edges) {
        visible += !r.hidden;
        withInfo += r.cardinality >= 0;
      }
      ASSERT_EQ(g.number_of_edges(), visible);
      ASSERT_EQ(g.number_of_all_edges(), static_cast<int>(edges.size()));
      ASSERT_EQ(g.number_of_nodes(),
                static_cast<int>(std::count(hasNode.begin(), hasNode.end(), true)));
      ASSERT_EQ(g.live(), withInfo) << "infos held = edges with info, hidden ones included";
      for (int u = 0; u < n; ++u) {
        ASSERT_EQ(nodeOf(u) != nullptr, hasNode[u]) << "f" << u;
        int in = 0, out = 0;
        for (const RefEdge& r : edges) {
          in += !r.hidden && r.to == u;
          out += !r.hidden && r.from == u;
        }
        ASSERT_EQ(g.getNrOfCallers(infos[u]), in) << "f" << u;
        ASSERT_EQ(g.getNrOfCalled(infos[u]), out) << "f" << u;
        for (int w = 0; w < n; ++w) {
          leda::edge e = nullptr;
          auto r = firstVisible(u, w);
          ASSERT_EQ(g.getEdge(infos[u], infos[w], e), r != edges.end()) << u << "->" << w;
          if (r != edges.end()) {
            ASSERT_EQ(e, r->handle) << u << "->" << w << ": the first visible edge";
            ASSERT_EQ(cardinalityOf(g, e), r->cardinality) << u << "->" << w;
          }
        }
      }
    }
    ASSERT_TRUE(g.shutdown());
    EXPECT_EQ(g.created, g.deleted);
    server().clear(); // delCall on edges without info reported
  }
}

// --- order of the hooks

template <class Base> class LoggingGraph : public Base {
public:
  std::map<KvCCallOperation*, std::string> labels;
  // The log since the last call, tokens separated by blanks.
  std::string take() {
    std::string text;
    for (const std::string& token : log)
      text += (text.empty() ? "" : " ") + token;
    log.clear();
    return text;
  }

protected:
  static std::string name(KvCParamSymbol* s) { return s ? s->getName().str() : "null"; }
  KvCFcgFunctionInfo* provideFcgNodeInfo(KvCParamSymbol* function) override {
    log.push_back("provide(" + name(function) + ")");
    return Base::provideFcgNodeInfo(function);
  }
  void deleteFcgNodeInfo(KvCFcgFunctionInfo* function) override {
    log.push_back("delete-node(" + name(function->getSymbol()) + ")");
    Base::deleteFcgNodeInfo(function);
  }
  void synchronizeNodeInfoAtConstruction(KvCFcgFunctionInfo* info,
                                         KvCParamSymbol* function) override {
    log.push_back("sync-node(" + name(function) + ")");
    Base::synchronizeNodeInfoAtConstruction(info, function);
  }
  KvCFcgEdgeInfo* createFcgEdgeInfo() override {
    log.push_back("create-edge");
    return Base::createFcgEdgeInfo();
  }
  void deleteFcgEdgeInfo(KvCFcgEdgeInfo* info) override {
    log.push_back("delete-edge(" + pairs[info] + ")");
    pairs.erase(info);
    Base::deleteFcgEdgeInfo(info);
  }
  void synchronizeEdgeInfoAtConstruction(KvCFcgEdgeInfo* info, KvCCallOperation* call) override {
    log.push_back("sync-edge(" + labels[call] + ")");
    pairs[info] = name(call->getCallingSymbol()) + "->" + name(call->getCalledSymbol());
    Base::synchronizeEdgeInfoAtConstruction(info, call);
  }

private:
  std::vector<std::string> log;
  std::map<KvCFcgEdgeInfo*, std::string> pairs; // the pair each info was last synchronized for
};

class HookOrderTest : public AppFixture {
protected:
  // called(passed) in the caller's body: the call is among the uses of both functions.
  KvCCallOperation* callPassing(const char* caller, KvCParamSymbol* called,
                                KvCParamSymbol* passed) {
    KvCCallOperation* op =
        app.factories().getOperationFactory()->createCallOperation(called, {app.access(passed)});
    app.function(caller).body().stmt(app.factories().getExprLocFactory()->createFromOperation(op));
    return op;
  }

  template <class Graph> void checkHookOrder() {
    Graph graph;
    graph.labels = labels;
    ASSERT_TRUE(graph.construct(false));
    EXPECT_EQ(graph.take(), construction);
    leda::edge self = nullptr;
    ASSERT_TRUE(graph.getEdge(info("f"), info("f"), self));
    graph.hide_edge(self);
    ASSERT_TRUE(graph.construct(false));
    EXPECT_EQ(graph.take(), "delete-edge(top->f) delete-edge(f->f) delete-edge(f->g) "
                            "delete-node(top) delete-node(f) delete-node(g) delete-node(h) " +
                                construction)
        << "old infos in edge order (the hidden one too), then node infos in node order";

    ASSERT_TRUE(graph.addCall(c5));
    EXPECT_EQ(graph.take(), "provide(g) provide(top) create-edge sync-edge(c5)");
    ASSERT_TRUE(graph.addCall(c2));
    EXPECT_EQ(graph.take(), "provide(top) provide(f) sync-edge(c2)");
    ASSERT_TRUE(graph.delCall(c2));
    EXPECT_EQ(graph.take(), "provide(top) provide(f)");
    ASSERT_TRUE(graph.delCall(c5));
    EXPECT_EQ(graph.take(), "provide(g) provide(top) delete-edge(g->top)");
    ASSERT_TRUE(graph.getEdge(info("f"), info("f"), self));
    graph.del_edge(self);
    EXPECT_EQ(graph.take(), "delete-edge(f->f)");
    graph.del_all_edges();
    EXPECT_EQ(graph.take(), "delete-edge(top->f) delete-edge(f->g)");
  }

  void buildApp() {
    for (const char* name : {"top", "f", "g", "h"}) // the symbol database's order
      fn(name);
    c1 = call("top", fn("f"));
    c2 = call("top", fn("f"));
    c3 = call("f", fn("f"));
    c4 = callPassing("f", fn("g"), fn("h"));
    buildDatabases();
    c5 = call("g", fn("top")); // not in the databases: for addCall only
    labels = {{c1, "c1"}, {c2, "c2"}, {c3, "c3"}, {c4, "c4"}, {c5, "c5"}};
  }

  KvCCallOperation *c1 = nullptr, *c2 = nullptr, *c3 = nullptr, *c4 = nullptr, *c5 = nullptr;
  std::map<KvCCallOperation*, std::string> labels;
  // Per symbol: its node, then the call above each of its uses in ascending order.
  const std::string construction =
      "provide(top) sync-node(top) "
      "provide(f) sync-node(f) "
      "provide(top) provide(f) create-edge sync-edge(c1) "
      "provide(top) provide(f) sync-edge(c2) "
      "provide(f) provide(f) create-edge sync-edge(c3) "
      "provide(g) sync-node(g) provide(f) provide(g) create-edge sync-edge(c4) "
      "provide(h) sync-node(h) provide(f) provide(g) sync-edge(c4)";
};

TEST_F(HookOrderTest, HooksRunInTheDocumentedOrderForEveryGraphType) {
  buildApp();
  {
    SCOPED_TRACE("KvCFunctionCallGraph");
    checkHookOrder<LoggingGraph<KvCFunctionCallGraph>>();
  }
  {
    SCOPED_TRACE("KvCGenericFunctionCallGraph");
    checkHookOrder<LoggingGraph<KvCGenericFunctionCallGraph>>();
  }
  EXPECT_TRUE(messageNumbers().empty());
}

} // namespace
