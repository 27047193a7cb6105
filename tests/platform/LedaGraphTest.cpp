#include "platform/leda/graph.h"
#include "platform/leda/strong_components.h"

#include <gtest/gtest.h>

#include <cstdint>
#include <random>
#include <set>
#include <string>
#include <vector>

namespace {

using leda::edge;
using leda::node;

template <class Range> std::vector<int> indices(const leda::graph& G, const Range& range) {
  std::vector<int> result;
  for (auto x : range)
    result.push_back(G.index(x));
  return result;
}

// Reachability over visible edges, by breadth-first search from every node.
// reach[i][j] for the i-th and j-th node in creation order.
std::vector<std::vector<bool>> reachability(const leda::graph& G, const std::vector<node>& nodes) {
  leda::node_array<int> pos(G, -1);
  for (std::size_t i = 0; i < nodes.size(); ++i)
    pos[nodes[i]] = static_cast<int>(i);
  std::vector<std::vector<bool>> reach(nodes.size(), std::vector<bool>(nodes.size(), false));
  for (std::size_t s = 0; s < nodes.size(); ++s) {
    std::vector<node> queue{nodes[s]};
    reach[s][s] = true;
    for (std::size_t head = 0; head < queue.size(); ++head) {
      for (edge e : G.out_edges(queue[head])) {
        auto t = static_cast<std::size_t>(pos[G.target(e)]);
        if (!reach[s][t]) {
          reach[s][t] = true;
          queue.push_back(G.target(e));
        }
      }
    }
  }
  return reach;
}

// Checks STRONG_COMPONENTS against mutual reachability; returns a failure
// description or an empty string.
std::string checkComponents(const leda::graph& G) {
  std::vector<node> nodes;
  for (node v : G.all_nodes())
    nodes.push_back(v);
  leda::node_array<int> comp;
  int count = leda::STRONG_COMPONENTS(G, comp);
  auto reach = reachability(G, nodes);

  int nextNew = 0;
  for (std::size_t i = 0; i < nodes.size(); ++i) {
    int c = comp[nodes[i]];
    if (c < 0 || c >= count)
      return "number out of range";
    if (c > nextNew)
      return "numbers not in order of first node";
    if (c == nextNew)
      ++nextNew;
    for (std::size_t j = 0; j < nodes.size(); ++j) {
      bool mutual = reach[i][j] && reach[j][i];
      if (mutual != (c == comp[nodes[j]]))
        return "component differs from mutual reachability";
    }
  }
  if (nextNew != count)
    return "count differs from number of distinct components";
  return "";
}

TEST(LedaStrongComponents, EveryDigraphUpToFourNodes) {
  for (int n = 0; n <= 4; ++n) {
    const int pairs = n * n;
    for (std::uint32_t mask = 0; mask < (1u << pairs); ++mask) {
      leda::graph plain;
      leda::graph complete; // all pairs present, those outside mask hidden
      std::vector<node> pv, cv;
      for (int i = 0; i < n; ++i) {
        pv.push_back(plain.new_node());
        cv.push_back(complete.new_node());
      }
      for (int bit = 0; bit < pairs; ++bit) {
        bool present = (mask >> bit) & 1u;
        auto from = static_cast<std::size_t>(bit / n);
        auto to = static_cast<std::size_t>(bit % n);
        if (present)
          plain.new_edge(pv[from], pv[to]);
        edge e = complete.new_edge(cv[from], cv[to]);
        if (!present)
          complete.hide_edge(e);
      }
      ASSERT_EQ(checkComponents(plain), "") << "n=" << n << " mask=" << mask;
      ASSERT_EQ(checkComponents(complete), "") << "hidden, n=" << n << " mask=" << mask;
    }
  }
}

TEST(LedaStrongComponents, RandomGraphsWithHiddenEdgesAndDeletedNodes) {
  std::mt19937 rng(20240611);
  for (int round = 0; round < 24; ++round) {
    const std::size_t n = 100 + rng() % 300;
    const std::size_t m = n * static_cast<std::size_t>(1 + round % 4) / 2 + rng() % 50;
    leda::graph G;
    std::vector<node> nodes;
    for (std::size_t i = 0; i < n; ++i)
      nodes.push_back(G.new_node());
    std::vector<edge> edges;
    for (std::size_t i = 0; i < m; ++i)
      edges.push_back(G.new_edge(nodes[rng() % n], nodes[rng() % n]));
    ASSERT_EQ(checkComponents(G), "") << "round " << round;

    for (edge e : edges) {
      if (rng() % 5 == 0)
        G.hide_edge(e);
    }
    for (std::size_t i = 0; i < n / 10; ++i) {
      std::size_t k = rng() % nodes.size();
      G.del_node(nodes[k]);
      nodes.erase(nodes.begin() + static_cast<std::ptrdiff_t>(k));
    }
    ASSERT_EQ(checkComponents(G), "") << "round " << round << " after hiding";
  }
}

TEST(LedaStrongComponents, NumbersFollowNodeCreationOrder) {
  leda::graph G;
  node a = G.new_node();
  node b = G.new_node();
  node c = G.new_node();
  node d = G.new_node();
  G.new_edge(a, b);
  G.new_edge(c, d);
  G.new_edge(d, c);
  G.new_edge(b, b);
  leda::node_array<int> comp(G, -1);
  ASSERT_EQ(leda::STRONG_COMPONENTS(G, comp), 3);
  EXPECT_EQ(comp[a], 0);
  EXPECT_EQ(comp[b], 1);
  EXPECT_EQ(comp[c], 2);
  EXPECT_EQ(comp[d], 2);
}

TEST(LedaStrongComponents, CompletesOnLargeStarAndDeepChain) {
  {
    leda::graph star;
    node hub = star.new_node();
    for (int i = 0; i < 100000; ++i) {
      node leaf = star.new_node();
      star.new_edge(hub, leaf);
      if (i % 2 == 0)
        star.new_edge(leaf, hub);
    }
    leda::node_array<int> comp;
    EXPECT_EQ(leda::STRONG_COMPONENTS(star, comp), 1 + 50000);
  }
  {
    leda::graph chain;
    node first = chain.new_node();
    node last = first;
    for (int i = 1; i < 1000000; ++i) {
      node v = chain.new_node();
      chain.new_edge(last, v);
      last = v;
    }
    edge back = chain.new_edge(last, first);
    leda::node_array<int> comp;
    EXPECT_EQ(leda::STRONG_COMPONENTS(chain, comp), 1);
    EXPECT_EQ(comp[last], 0);
    chain.hide_edge(back);
    EXPECT_EQ(leda::STRONG_COMPONENTS(chain, comp), 1000000);
    EXPECT_EQ(comp[last], 999999);
  }
}

// Graph a -> b, a -> c, b -> c, c -> a, a -> a, with edges e0..e4 in that order.
class LedaGraphFixture : public ::testing::Test {
protected:
  void SetUp() override {
    a = G.new_node();
    b = G.new_node();
    c = G.new_node();
    e = {G.new_edge(a, b), G.new_edge(a, c), G.new_edge(b, c), G.new_edge(c, a), G.new_edge(a, a)};
  }

  leda::graph G;
  node a = nullptr, b = nullptr, c = nullptr;
  std::vector<edge> e;
};

TEST_F(LedaGraphFixture, HidingRemovesEdgesFromEveryViewAndRestoreAllKeepsCreationOrder) {
  G.hide_edge(e[1]);
  G.hide_edge(e[4]);
  G.hide_edge(e[4]);
  G.hide_edge(e[0]);
  EXPECT_TRUE(G.is_hidden(e[4]));
  EXPECT_EQ(G.number_of_edges(), 2);
  EXPECT_EQ(indices(G, G.all_edges()), (std::vector<int>{2, 3}));
  EXPECT_TRUE(indices(G, G.out_edges(a)).empty());
  EXPECT_EQ(indices(G, G.in_edges(a)), (std::vector<int>{3}));
  EXPECT_EQ(G.outdeg(a), 0);
  EXPECT_EQ(G.indeg(a), 1);
  EXPECT_EQ(G.indeg(c), 1);
  EXPECT_EQ(G.first_adj_edge(a), nullptr);
  EXPECT_EQ(G.first_edge(), e[2]);
  EXPECT_EQ(G.first_in_edge(c), e[2]);
  EXPECT_EQ(G.in_succ(e[2]), nullptr);

  G.restore_edge(e[4]);
  G.restore_edge(e[4]);
  EXPECT_EQ(indices(G, G.out_edges(a)), (std::vector<int>{4}));
  EXPECT_EQ(G.outdeg(a), 1);

  G.restore_all_edges();
  EXPECT_EQ(G.number_of_edges(), 5);
  EXPECT_EQ(indices(G, G.all_edges()), (std::vector<int>{0, 1, 2, 3, 4}));
  EXPECT_EQ(indices(G, G.out_edges(a)), (std::vector<int>{0, 1, 4}));
  EXPECT_EQ(indices(G, G.in_edges(a)), (std::vector<int>{3, 4}));
  EXPECT_EQ(indices(G, G.in_edges(c)), (std::vector<int>{1, 2}));
  EXPECT_EQ(G.outdeg(a), 3);
  EXPECT_EQ(G.indeg(a), 2);
  for (edge x : e)
    EXPECT_FALSE(G.is_hidden(x));

  std::vector<int> stepped;
  for (edge x = G.first_adj_edge(a); x; x = G.adj_succ(x))
    stepped.push_back(G.index(x));
  EXPECT_EQ(stepped, (std::vector<int>{0, 1, 4}));
}

TEST_F(LedaGraphFixture, DeletingTheCurrentElementDuringIterationIsSafe) {
  G.hide_edge(e[3]);
  for (edge x : G.out_edges(a))
    G.del_edge(x);
  EXPECT_EQ(G.outdeg(a), 0);
  EXPECT_EQ(G.indeg(a), 0);
  EXPECT_EQ(indices(G, G.in_edges(c)), (std::vector<int>{2}));
  EXPECT_EQ(G.number_of_edges(), 1);

  G.restore_all_edges();
  EXPECT_EQ(indices(G, G.all_edges()), (std::vector<int>{2, 3}));

  for (edge x : G.all_edges())
    G.del_edge(x);
  EXPECT_EQ(G.number_of_edges(), 0);

  G.new_edge(b, c);
  for (node v : G.all_nodes())
    G.del_node(v);
  EXPECT_TRUE(G.empty());
  EXPECT_EQ(G.first_node(), nullptr);
  EXPECT_EQ(G.first_edge(), nullptr);
}

TEST_F(LedaGraphFixture, DelNodeRemovesAllItsEdgesIncludingHiddenAndSelfLoops) {
  G.hide_edge(e[3]);
  G.hide_edge(e[4]);
  G.del_node(a);
  EXPECT_EQ(G.number_of_nodes(), 2);
  EXPECT_EQ(G.number_of_edges(), 1);
  G.restore_all_edges();
  EXPECT_EQ(indices(G, G.all_edges()), (std::vector<int>{2}));
  EXPECT_EQ(G.outdeg(c), 0);
  EXPECT_EQ(G.indeg(b), 0);
  EXPECT_EQ(indices(G, G.all_nodes()), (std::vector<int>{1, 2}));
  EXPECT_EQ(G.succ_node(b), c);
  EXPECT_EQ(G.pred_node(b), nullptr);
}

TEST_F(LedaGraphFixture, IndicesAreNeverReused) {
  G.del_edge(e[4]);
  G.del_node(c);
  EXPECT_EQ(G.index(G.new_node()), 3);
  EXPECT_EQ(G.index(G.new_edge(a, b)), 5);
  G.clear();
  EXPECT_EQ(G.number_of_nodes(), 0);
  EXPECT_EQ(G.number_of_edges(), 0);
  node v = G.new_node();
  EXPECT_EQ(G.index(v), 4);
  EXPECT_EQ(G.index(G.new_edge(v, v)), 6);
  EXPECT_EQ(G.opposite(v, G.first_edge()), v);
}

TEST_F(LedaGraphFixture, HandleArraysCoverElementsCreatedLater) {
  leda::node_array<bool> seen(G, false);
  leda::edge_array<int> weight(G, 7);
  seen[a] = true;
  node late = G.new_node();
  edge lateEdge = G.new_edge(late, a);
  const leda::node_array<bool>& constSeen = seen;
  EXPECT_FALSE(constSeen[late]);
  seen[late] = true;
  EXPECT_TRUE(seen[late]);
  EXPECT_TRUE(seen[a]);
  EXPECT_FALSE(seen[b]);
  EXPECT_EQ(weight[lateEdge], 7);
  weight[e[0]] = 1;
  weight.init(G, 3);
  EXPECT_EQ(weight[e[0]], 3);
  EXPECT_EQ(weight[lateEdge], 3);
}

TEST(LedaGRAPH, PayloadsIncludingDefaultsMadeThroughTheBaseClass) {
  leda::GRAPH<std::string, int> G;
  node v = G.new_node("v");
  node w = G.new_node("w");
  edge vw = G.new_edge(v, w, 5);
  leda::graph& base = G;
  node u = base.new_node();
  edge wu = base.new_edge(w, u);
  EXPECT_EQ(G.inf(v), "v");
  EXPECT_EQ(G.inf(u), "");
  EXPECT_EQ(G.inf(vw), 5);
  EXPECT_EQ(G.inf(wu), 0);
  G[u] = std::string(100, 'u');
  G.assign(vw, 9);
  G[wu] += 2;
  EXPECT_EQ(G.inf(u).size(), 100u);
  EXPECT_EQ(G[vw], 9);
  EXPECT_EQ(G[wu], 2);
  base.del_node(u);
  EXPECT_EQ(G.number_of_edges(), 1);
}

// Records what the update handlers see, and the payloads still present when they run.
class WatchedGraph : public leda::GRAPH<int, int> {
public:
  std::vector<std::string> seen;

protected:
  void pre_del_edge_handler(edge e) override {
    seen.push_back("edge " + std::to_string(inf(e)) + (is_hidden(e) ? " hidden" : ""));
  }
  void pre_del_node_handler(node v) override { seen.push_back("node " + std::to_string(inf(v))); }
  void pre_clear_handler() override {
    seen.push_back("clear " + std::to_string(number_of_nodes()) + "/" +
                   std::to_string(number_of_all_edges()));
  }
};

TEST(LedaGRAPH, UpdateHandlersSeeEveryDeletionBeforeItHappens) {
  WatchedGraph G;
  node a = G.new_node(0);
  node b = G.new_node(1);
  node c = G.new_node(2);
  edge ab = G.new_edge(a, b, 10);
  edge bc = G.new_edge(b, c, 11);
  G.new_edge(c, a, 12);
  G.new_edge(a, c, 13);
  G.hide_edge(bc);
  G.del_edge(ab);
  // A node goes before its edges, outgoing then incoming, hidden ones included.
  G.del_node(b);
  EXPECT_EQ(G.seen, (std::vector<std::string>{"edge 10", "node 1", "edge 11 hidden"}));
  G.seen.clear();
  G.del_all_edges();
  EXPECT_EQ(G.seen, (std::vector<std::string>{"edge 12", "edge 13"}));
  G.new_edge(a, c, 14);
  G.seen.clear();
  G.clear();
  EXPECT_EQ(G.seen, (std::vector<std::string>{"clear 2/1"}));
  EXPECT_EQ(G.number_of_nodes(), 0);
}

} // namespace
