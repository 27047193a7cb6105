#include "HulCvTools/FcnCallGraph/KvCFunctionCallGraph.h"
#include "FcgTestSupport.h"
#include "HulCvTools/FcnCallGraph/KvCInliningCostCalculator.h"
#include "platform/icode/KV_Statement.h"
#include "platform/icode/KvCCStmTable.h"

#include <climits>
#include <random>
#include <string>

using namespace fcgtest;

namespace {

using Matrix = std::vector<std::vector<char>>;

// Whether each function lies on a cycle of the given adjacency matrix (depth-first search
// from each function back to itself).
std::vector<bool> onCycle(const Matrix& adjacent) {
  const std::size_t n = adjacent.size();
  std::vector<bool> result(n, false);
  for (std::size_t start = 0; start < n; ++start) {
    std::vector<bool> seen(n, false);
    std::vector<std::size_t> stack{start};
    while (!stack.empty() && !result[start]) {
      const std::size_t v = stack.back();
      stack.pop_back();
      for (std::size_t w = 0; w < n; ++w) {
        if (!adjacent[v][w] || seen[w])
          continue;
        if (w == start)
          result[start] = true;
        seen[w] = true;
        stack.push_back(w);
      }
    }
  }
  return result;
}

class FunctionCallGraphTest : public AppFixture {
protected:
  std::string marked(std::initializer_list<const char*> names) {
    std::string result;
    for (const char* name : names)
      if (info(name)->isInLoop())
        result += name;
    return result;
  }

  KvCFunctionCallGraph graph;
};

TEST_F(FunctionCallGraphTest, FunctionsOnCyclesWithoutTaskActivationsAreMarked) {
  call("A", fn("B"));
  call("B", fn("A"));
  call("A", fn("C"));
  call("X", fn("A")); // reaches a cycle
  call("D", fn("D"));
  task("E", fn("F"));
  task("F", fn("E"));
  call("G", fn("H"));
  task("H", fn("G"));
  call("P", fn("Q"));
  call("Q", fn("R"));
  task("R", fn("P"));
  buildDatabases();
  ASSERT_TRUE(graph.boot());
  ASSERT_TRUE(graph.construct(false));
  const int edges = graph.number_of_edges();
  ASSERT_TRUE(graph.analyzeInlining());
  EXPECT_EQ(marked({"A", "B", "C", "X", "D", "E", "F", "G", "H", "P", "Q", "R"}), "ABD");
  EXPECT_EQ(graph.number_of_edges(), edges) << "task calls visible again";
  EXPECT_EQ(graph.getNrOfCalled(info("E")) + graph.getNrOfCalled(info("R")), 2);
  ASSERT_TRUE(graph.reInitInlining());
  EXPECT_EQ(marked({"A", "B", "D"}), "");
}

TEST_F(FunctionCallGraphTest, MarksStayUntilReInitEvenWhenTheRecursionIsRemoved) {
  KvCCallOperation* back = call("B", fn("A"));
  KvCCallOperation* self = call("D", fn("D"));
  for (KvCCallOperation* c : {call("A", fn("B")), back, self, call("D", fn("A"))})
    ASSERT_TRUE(graph.addCall(c));
  graph.analyzeInlining();
  ASSERT_EQ(marked({"A", "B", "D"}), "ABD");
  ASSERT_TRUE(graph.delCall(back) && graph.delCall(self));
  graph.analyzeInlining();
  EXPECT_EQ(marked({"A", "B", "D"}), "ABD") << "analyzeInlining only sets marks";
  graph.reInitInlining();
  graph.analyzeInlining();
  EXPECT_EQ(marked({"A", "B", "D"}), "");
}

TEST_F(FunctionCallGraphTest, ConstructionRecordsBodyFilesAndShutdownEmptiesTheGraph) {
  call("f", fn("g"));
  call("f", fn("f"));
  KvCIcFileId* other = app.file("other.c");
  call("h", fn("f"));
  KvCParamSymbol* m = app.macro("M");
  app.function("h").body().stmt(app.call(m, {}));
  buildDatabases();
  ASSERT_TRUE(graph.construct(false));
  EXPECT_NE(info("f")->getFile(), nullptr);
  EXPECT_EQ(info("f")->getFile(), fn("f")->getBodySTT()->getFile());
  EXPECT_EQ(info("h")->getFile(), other);
  EXPECT_EQ(infoOf(m)->getFile(), nullptr) << "no body";
  EXPECT_EQ(graph.getGraphMap().size(), graph.number_of_nodes());
  for (leda::node v : graph.all_nodes())
    EXPECT_EQ(graph.getGraphMap()[graph.inf(v)], v);

  graph.analyzeInlining();
  ASSERT_TRUE(graph.shutdown());
  EXPECT_EQ(graph.number_of_nodes() + graph.number_of_edges(), 0);
  EXPECT_TRUE(graph.getGraphMap().empty());
  graph.analyzeInlining(); // an empty graph leaves the marks
  EXPECT_TRUE(info("f")->isInLoop()) << "marks outlive shutdown";
  ASSERT_TRUE(graph.construct(false));
  leda::edge e = nullptr;
  EXPECT_TRUE(graph.getEdge(info("h"), info("f"), e)) << "rebuilt afresh";
}

TEST_F(FunctionCallGraphTest, EveryGraphOfThreeFunctionsMarksExactlyTheCycleMembers) {
  const char* names[] = {"f0", "f1", "f2"};
  KvCCallOperation* plainOp[3][3];
  KvCCallOperation* taskOp[3][3];
  for (int i = 0; i < 3; ++i)
    for (int j = 0; j < 3; ++j) {
      plainOp[i][j] = call(names[i], fn(names[j]));
      taskOp[i][j] = task(names[i], fn(names[j]));
    }
  for (int code = 0; code < 19683; ++code) { // 3^9
    // Each ordered pair: 0 absent, 1 a call, 2 a task activation (on odd codes after a call
    // of the same pair).
    KvCFunctionCallGraph g;
    Matrix plain(3, std::vector<char>(3, 0));
    int pairs = 0, outDegrees = 0;
    for (int p = 0, rest = code; p < 9; ++p, rest /= 3) {
      const int i = p / 3, j = p % 3, state = rest % 3;
      pairs += state != 0;
      plain[i][j] = state == 1;
      if (state == 1 || (state == 2 && code % 2 == 1))
        g.addCall(plainOp[i][j]);
      if (state == 2)
        g.addCall(taskOp[i][j]);
    }
    for (const char* name : names)
      info(name)->unmarkInLoop();
    g.analyzeInlining();
    const std::vector<bool> expected = onCycle(plain);
    for (int i = 0; i < 3; ++i) {
      ASSERT_EQ(info(names[i])->isInLoop(), expected[i]) << "graph " << code << " f" << i;
      outDegrees += g.getNrOfCalled(info(names[i]));
    }
    ASSERT_EQ(outDegrees, pairs) << "graph " << code;
    g.reInitInlining();
    ASSERT_EQ(marked({"f0", "f1", "f2"}), "") << "graph " << code;
  }
}

TEST_F(FunctionCallGraphTest, RandomLargeGraphsMarkExactlyTheCycleMembers) {
  constexpr int n = 300;
  std::vector<KvCParamSymbol*> f;
  for (int i = 0; i < n; ++i)
    f.push_back(fn(("f" + std::to_string(i)).c_str()));
  for (unsigned seed : {11u, 12u, 13u}) {
    std::mt19937_64 rng(seed);
    auto pick = [&](int bound) { return static_cast<int>(rng() % static_cast<unsigned>(bound)); };
    KvCFunctionCallGraph g;
    Matrix present(n, std::vector<char>(n, 0)), plain = present, hasTask = present;
    for (int k = 0; k < 380 + 40 * static_cast<int>(seed % 3); ++k) {
      const int from = pick(n), to = pick(20) == 0 ? from : pick(n);
      const bool isTask = pick(8) == 0;
      ASSERT_TRUE(g.addCall(call(("f" + std::to_string(from)).c_str(), f[to], isTask)));
      present[from][to] = 1;
      hasTask[from][to] = hasTask[from][to] || isTask;
    }
    int edges = 0, cycleMembers = 0;
    for (int i = 0; i < n; ++i)
      for (int j = 0; j < n; ++j) {
        plain[i][j] = present[i][j] && !hasTask[i][j];
        edges += present[i][j];
      }
    for (KvCParamSymbol* s : f)
      infoOf(s)->unmarkInLoop();
    g.analyzeInlining();
    const std::vector<bool> expected = onCycle(plain);
    for (int i = 0; i < n; ++i) {
      cycleMembers += expected[i];
      ASSERT_EQ(infoOf(f[i])->isInLoop(), expected[i]) << "seed " << seed << " f" << i;
    }
    EXPECT_GT(cycleMembers, 5) << "the sample has cycles";
    EXPECT_EQ(g.number_of_edges(), edges);
  }
}

// --- inlining costs

TEST(InliningCostTest, CostsFromCountsIncludingInvalidAndHugeOnes) {
  const KvCInliningCostCalculator calc;
  struct Row {
    int calls, statements, cost;
  };
  const Row rows[] = {{1, 50, 1},
                      {3, 1, 1},
                      {3, 4, 7},
                      {0, 9, INT_MAX},
                      {9, 0, INT_MAX},
                      {-1, 9, INT_MAX},
                      {9, -4, INT_MAX},
                      {INT_MIN, 2, INT_MAX},
                      {2, INT_MAX, INT_MAX},
                      {3, INT_MAX, INT_MAX},
                      {46341, 46341, 2147395601},
                      {46342, 46342, INT_MAX},
                      {INT_MAX, INT_MAX, INT_MAX}};
  for (const Row& r : rows)
    EXPECT_EQ(calc.calculateInliningCosts(r.calls, r.statements), r.cost)
        << r.calls << " calls, " << r.statements << " statements";
}

TEST_F(FunctionCallGraphTest, CostOfAFunctionCountsGraphCallsAndNestedStatements) {
  KvCUnparamSymbol* x = app.variable("x", app.int16());
  BlockBuilder& body = app.function("g").body();
  body.assign(app.access(x), app.constant(1));
  BlockBuilder& loop = body.whileLoop(app.access(x));
  for (int k = 0; k < 3; ++k)
    loop.assign(app.access(x), app.constant(k));
  body.ret();
  KvCCallOperation* first = call("f", fn("g"));
  call("f", fn("g"));
  call("h", fn("g"));
  KvCParamSymbol* m = app.macro("M");
  app.function("h").body().stmt(app.call(m, {}));
  KvCParamSymbol* declared = app.declaredFunction("d").symbol();
  app.function("h").body().stmt(app.call(declared, {}));
  buildDatabases();
  ASSERT_TRUE(graph.construct(false));

  const KvCInliningCostCalculator calc;
  EXPECT_EQ(calc.calculateInliningCosts(fn("g")), 2 * 5 + 1) << "3 calls, 3 + 3 statements";
  ASSERT_TRUE(graph.delCall(first));
  EXPECT_EQ(calc.calculateInliningCosts(fn("g")), 1 * 5 + 1);
  EXPECT_EQ(calc.calculateInliningCosts(fn("h")), INT_MAX) << "never called";
  EXPECT_EQ(calc.calculateInliningCosts(m), INT_MAX) << "called, without body";
  EXPECT_EQ(calc.calculateInliningCosts(declared), INT_MAX) << "called, no statements";
}

} // namespace
