// Call graph construction and recursion analysis over synthetic applications: construct
// per call operation at 10^4..10^6 calls (10 times fewer functions) and with one scheduler
// calling 10^4 or 10^5 functions, with warm and with evicted caches; analyzeInlining per edge with
// 5% task calls, alone and next to Boost.Graph's strong_components on the same graph; the
// transitive caller query along a long call chain.
//
// The construction figure a user meets first, one construction in a fresh process, comes
// from FcnCallGraphConstructOnce (see compare-construct.sh); BM_Construct here measures
// repeated constructions in one process.
#include "HulCvTools/ExprLocDBBuilder/KvCExprLocDBBuilder.h"
#include "HulCvTools/FcnCallGraph/KvCFcgQuery.h"
#include "HulCvTools/FcnCallGraph/KvCFcnReuseCallGraph.h"
#include "HulCvTools/FcnCallGraph/KvCFunctionCallGraph.h"
#include "platform/builder/AppBuilder.h"
#include "platform/builder/PartitionBuilder.h"
#include "platform/builder/SyntheticApp.h"
#include "platform/icode/KvCCodeViewData.h"
#include "platform/icode/KvCFcgFunctionInfo.h"
#include "platform/icode/KvCParamSymbol.h"

#include <benchmark/benchmark.h>

#ifdef HUL_HAVE_BOOST_GRAPH
#include <boost/graph/adjacency_list.hpp>
#include <boost/graph/strong_components.hpp>
#endif

#include <algorithm>
#include <chrono>
#include <string>
#include <map>
#include <memory>
#include <vector>

namespace {

// The applications are built once per process and kept; the most recently built one is
// the run's current code view data, so each benchmark makes its own current again by
// building its application last or reusing the cached one only when it is current.
struct PreparedApp {
  std::unique_ptr<AppBuilder> app;
  SyntheticAppCounts counts{};
};

PreparedApp prepare(const SyntheticAppShape& shape) {
  PreparedApp prepared;
  prepared.app = std::make_unique<AppBuilder>();
  buildSyntheticApp(*prepared.app, shape);
  prepared.counts = countSyntheticApp(prepared.app->data());
  KvCExprLocDBBuilder builder;
  builder.boot(&prepared.app->data());
  builder.buildExprLocDBs();
  return prepared;
}

SyntheticAppShape callsShape(long calls, bool scheduler) {
  SyntheticAppShape shape;
  shape.seed = 7;
  shape.statementsPerBody = 1;
  shape.expressionDepth = 1;
  shape.variables = 16;
  shape.taskActivationShare = 0.05;
  if (scheduler) {
    shape.functions = static_cast<int>(calls);
    shape.callFanOut = 0;
    shape.schedulerCalls = static_cast<int>(calls);
  } else {
    shape.functions = static_cast<int>(calls / 10);
    shape.callFanOut = 10;
  }
  return shape;
}

void perCall(benchmark::State& state, double calls, const char* name) {
  state.counters["calls"] = calls;
  state.counters[name] = benchmark::Counter(
      calls * 1e-9, benchmark::Counter::kIsIterationInvariantRate | benchmark::Counter::kInvert);
}

// Evicts the caches: writes a buffer four times the size of this machine's last-level
// cache, as the passes that ran before a reconstruction would have.
void evictCaches() {
  static std::vector<long> buffer(std::size_t{128} << 17); // 128 MiB
  for (long& x : buffer)
    x += 1;
  benchmark::DoNotOptimize(buffer.data());
}

// state.range(2): how the construction finds the graph and the caches.
enum ConstructMode { kWarmReconstruction = 0, kFirstConstruction = 1, kColdReconstruction = 2 };

void BM_Construct(benchmark::State& state) {
  PreparedApp prepared = prepare(callsShape(state.range(0), state.range(1) != 0));
  KvCFunctionCallGraph graph;
  graph.boot();
  // A pass reconstructs its graph after changes; the first construction also creates the
  // nodes and touches fresh memory. A warm reconstruction finds what the previous one
  // left in the caches (the whole application, when it is small); a cold one finds the
  // caches filled with other data, as in a generator where other passes ran in between.
  const auto mode = static_cast<ConstructMode>(state.range(2));
  if (mode != kFirstConstruction)
    graph.construct(false);
  for (auto _ : state) {
    if (mode != kWarmReconstruction) {
      state.PauseTiming();
      if (mode == kFirstConstruction)
        graph.shutdown();
      else
        evictCaches();
      state.ResumeTiming();
    }
    benchmark::DoNotOptimize(graph.construct(false));
  }
  perCall(state, prepared.counts.calls, "ns_per_call");
  state.counters["edges"] = graph.number_of_edges();
  graph.shutdown();
}
// Args: call operations, scheduler shape (1) or fan-out shape (0), ConstructMode.
void constructArgs(benchmark::internal::Benchmark* b) {
  for (long mode : {kWarmReconstruction, kColdReconstruction}) {
    for (long calls : {10'000, 100'000, 1'000'000})
      b->Args({calls, 0, mode});
    for (long calls : {10'000, 100'000})
      b->Args({calls, 1, mode});
  }
  for (long calls : {10'000, 1'000'000})
    b->Args({calls, 0, kFirstConstruction});
}
BENCHMARK(BM_Construct)->Apply(constructArgs)->Unit(benchmark::kMillisecond);

void BM_AnalyzeInlining(benchmark::State& state) {
  SyntheticAppShape shape = callsShape(state.range(0), false);
  shape.recursionCycles = static_cast<int>(state.range(0) / 1000);
  PreparedApp prepared = prepare(shape);
  KvCFunctionCallGraph graph;
  graph.boot();
  graph.construct(false);
  for (auto _ : state)
    graph.analyzeInlining();
  const double edges = graph.number_of_edges();
  state.counters["edges"] = edges;
  state.counters["ns_per_edge"] = benchmark::Counter(
      edges * 1e-9, benchmark::Counter::kIsIterationInvariantRate | benchmark::Counter::kInvert);
  graph.shutdown();
}
BENCHMARK(BM_AnalyzeInlining)->Arg(100'000)->Arg(1'000'000)->Unit(benchmark::kMillisecond);

#ifdef HUL_HAVE_BOOST_GRAPH
using BoostDigraph = boost::adjacency_list<boost::vecS, boost::vecS, boost::directedS>;

// The peer's whole analysis: the components, then both ends of every edge inside one
// marked. `g` holds only the non-task edges, so no edge needs hiding.
void boostMarkInLoop(const BoostDigraph& g, std::vector<char>& marks) {
  std::vector<int> component(boost::num_vertices(g));
  boost::strong_components(
      g, boost::make_iterator_property_map(component.begin(), boost::get(boost::vertex_index, g)));
  for (auto [e, eEnd] = boost::edges(g); e != eEnd; ++e) {
    const auto v = boost::source(*e, g);
    const auto w = boost::target(*e, g);
    if (component[v] != component[w])
      continue;
    marks[v] = 1;
    marks[w] = 1;
  }
}
#endif

// analyzeInlining and Boost.Graph's strong_components with the same marking on the same
// graph, in turns within each iteration. The peer gets the graph's visible non-task edges
// copied once, before the clock runs, into the adjacency list a Boost user would keep;
// the library hides and restores the task calls itself, as its callers need. The
// iteration time is the peer's; ns_per_edge is the peer's time per edge of the call graph
// (all visible edges, as in BM_AnalyzeInlining), lib_ns_per_edge the library's, and
// ratio_to_boost the library's time over the peer's. same_marks is 1 when both mark
// exactly the same functions.
void BM_AnalyzeInliningBoostPeer(benchmark::State& state) {
#ifndef HUL_HAVE_BOOST_GRAPH
  state.SkipWithError("Boost.Graph not found");
#else
  SyntheticAppShape shape = callsShape(state.range(0), false);
  shape.recursionCycles = static_cast<int>(state.range(0) / 1000);
  PreparedApp prepared = prepare(shape);
  KvCFunctionCallGraph graph;
  graph.boot();
  graph.construct(false);

  const auto vertices = static_cast<std::size_t>(graph.max_node_index() + 1);
  BoostDigraph peer(vertices);
  for (leda::edge e : graph.all_edges()) {
    if (graph.inf(e) && graph.inf(e)->isTaskCall())
      continue;
    boost::add_edge(static_cast<std::size_t>(graph.index(graph.source(e))),
                    static_cast<std::size_t>(graph.index(graph.target(e))), peer);
  }

  // Both mark the same functions: the library's marks from a clean start against the
  // peer's, node by node (a node without info can carry no mark).
  std::vector<char> marks(vertices, 0);
  boostMarkInLoop(peer, marks);
  graph.reInitInlining();
  graph.analyzeInlining();
  bool same = true;
  long inLoop = 0;
  for (leda::node v : graph.all_nodes()) {
    const KvCFcgFunctionInfo* info = graph.inf(v);
    if (!info)
      continue;
    const bool peerMark = marks[static_cast<std::size_t>(graph.index(v))] != 0;
    same = same && info->isInLoop() == peerMark;
    inLoop += peerMark ? 1 : 0;
  }

  using Clock = std::chrono::steady_clock;
  double libSeconds = 0;
  double peerSeconds = 0;
  for (auto _ : state) {
    const auto t0 = Clock::now();
    graph.analyzeInlining();
    const auto t1 = Clock::now();
    boostMarkInLoop(peer, marks);
    const auto t2 = Clock::now();
    benchmark::DoNotOptimize(marks.data());
    const double lib = std::chrono::duration<double>(t1 - t0).count();
    const double boostTime = std::chrono::duration<double>(t2 - t1).count();
    libSeconds += lib;
    peerSeconds += boostTime;
    state.SetIterationTime(boostTime);
  }

  const double edges = graph.number_of_edges();
  const double iterations = static_cast<double>(state.iterations());
  state.counters["edges"] = edges;
  state.counters["boost_edges"] = static_cast<double>(boost::num_edges(peer));
  state.counters["in_loop"] = static_cast<double>(inLoop);
  state.counters["ns_per_edge"] = peerSeconds * 1e9 / (iterations * edges);
  state.counters["lib_ns_per_edge"] = libSeconds * 1e9 / (iterations * edges);
  state.counters["ratio_to_boost"] = peerSeconds > 0 ? libSeconds / peerSeconds : 0.0;
  state.counters["same_marks"] = same ? 1 : 0;
  graph.shutdown();
#endif
}
BENCHMARK(BM_AnalyzeInliningBoostPeer)
    ->Arg(100'000)
    ->Arg(1'000'000)
    ->UseManualTime()
    ->Unit(benchmark::kMillisecond);

// A chain f0 -> f1 -> ... -> f(n-1): analyzeInlining without recursion, and the callers of
// a function at depth k (k callers reached).
struct Chain {
  AppBuilder app;
  std::vector<KvCParamSymbol*> functions;
  KvCFunctionCallGraph graph;
};

Chain& chainOf(long n) {
  static std::map<long, std::unique_ptr<Chain>> chains;
  std::unique_ptr<Chain>& chain = chains[n];
  if (chain)
    return *chain;
  chain = std::make_unique<Chain>();
  for (long i = 0; i < n; ++i)
    chain->functions.push_back(
        chain->app.function(std::string("c").append(std::to_string(i)).c_str()).symbol());
  for (long i = 0; i + 1 < n; ++i)
    chain->app.functionBuilder(std::string("c").append(std::to_string(i)).c_str())
        .body()
        .call(chain->functions[static_cast<std::size_t>(i + 1)], {});
  KvCExprLocDBBuilder builder;
  builder.boot(&chain->app.data());
  builder.buildExprLocDBs();
  chain->graph.boot();
  chain->graph.construct(false);
  return *chain;
}

void BM_AnalyzeInliningChain(benchmark::State& state) {
  Chain& chain = chainOf(state.range(0));
  for (auto _ : state)
    chain.graph.analyzeInlining();
  state.counters["ns_per_edge"] = benchmark::Counter(
      static_cast<double>(chain.graph.number_of_edges()) * 1e-9,
      benchmark::Counter::kIsIterationInvariantRate | benchmark::Counter::kInvert);
}
BENCHMARK(BM_AnalyzeInliningChain)->Arg(1'000'000)->Unit(benchmark::kMillisecond);

void BM_GetAllCaller(benchmark::State& state) {
  Chain& chain = chainOf(1'000'000);
  const long depth = state.range(0);
  KvCFcgQuery query(&chain.graph);
  leda::list<KvCFcgFunctionInfo*> callers;
  KvCFcgFunctionInfo* target = chain.functions[static_cast<std::size_t>(depth)]->getFunctionInfo();
  for (auto _ : state)
    query.getAllCaller(target, callers);
  state.counters["callers"] = static_cast<double>(callers.size());
  state.counters["ns_per_caller"] = benchmark::Counter(
      static_cast<double>(depth) * 1e-9,
      benchmark::Counter::kIsIterationInvariantRate | benchmark::Counter::kInvert);
}
BENCHMARK(BM_GetAllCaller)->Arg(1'000)->Arg(100'000)->Arg(999'999)->Unit(benchmark::kMillisecond);

// Reuse call graph over a partitioned application: state.range(0) partitions with code of
// their own, state.range(1) partitions in all (the others instances of them, spread
// evenly). Every partition of master m is called by master m - 1 (the first masters' by
// the root), and every master's step function calls an auxiliary function of its own,
// which calls the next master's auxiliary function. Times construct of the reuse graph
// over a constructed real graph.
void BM_ReuseCallGraphConstruct(benchmark::State& state) {
  const int masters = static_cast<int>(state.range(0));
  const int partitions = static_cast<int>(state.range(1));
  auto app = std::make_unique<AppBuilder>();
  PartitionedAppBuilder model(*app);
  std::vector<PartitionBuilder*> masterBuilders;
  for (int m = 0; m < masters; ++m) {
    std::string name = "M";
    name += std::to_string(m);
    PartitionBuilder& master = model.partition(name.c_str()).withTerm();
    if (m > 0)
      master.calledBy(*masterBuilders.back());
    masterBuilders.push_back(&master);
    std::string aux = "aux";
    aux += std::to_string(m);
    model.auxFunction(aux.c_str());
    master.step().body().call(app->function(aux.c_str()).symbol(), {});
    if (m > 0) {
      std::string previous = "aux";
      previous += std::to_string(m - 1);
      app->function(previous.c_str()).body().call(app->function(aux.c_str()).symbol(), {});
    }
  }
  for (int i = masters; i < partitions; ++i) {
    const int m = i % masters;
    std::string name = "I";
    name += std::to_string(i);
    PartitionBuilder& instance =
        model.instance(name.c_str(), *masterBuilders[static_cast<std::size_t>(m)]);
    if (m > 0)
      instance.calledBy(*masterBuilders[static_cast<std::size_t>(m - 1)]);
  }
  KvCExprLocDBBuilder builder;
  builder.boot(&app->data());
  builder.buildExprLocDBs();
  KvCFunctionCallGraph real;
  real.boot();
  real.construct(false);
  KvCFcnReuseCallGraph reuse;
  reuse.boot(&real, &model.view());
  for (auto _ : state)
    benchmark::DoNotOptimize(reuse.construct());
  state.counters["instances"] = partitions;
  state.counters["ns_per_instance"] =
      benchmark::Counter(partitions * 1e-9, benchmark::Counter::kIsIterationInvariantRate |
                                                benchmark::Counter::kInvert);
  state.counters["edges"] = reuse.number_of_edges();
  int maxOut = 0;
  for (leda::node v : reuse.all_nodes())
    maxOut = std::max(maxOut, reuse.outdeg(v));
  state.counters["max_outdeg"] = maxOut;
  reuse.shutdown();
  real.shutdown();
}
BENCHMARK(BM_ReuseCallGraphConstruct)
    ->Args({100, 1'000})
    ->Args({1'000, 10'000})
    ->Args({3'000, 30'000})
    ->Args({10'000, 100'000})
    ->Unit(benchmark::kMillisecond);

} // namespace
