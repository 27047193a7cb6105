// Call graph construction and recursion analysis over synthetic applications: construct
// per call operation at 10^4..10^6 calls (10 times fewer functions) and with one scheduler
// calling 10^4 or 10^5 functions, with warm and with evicted caches; analyzeInlining per edge with
// 5% task calls; the transitive caller query along a long call chain.
#include "HulCvTools/ExprLocDBBuilder/KvCExprLocDBBuilder.h"
#include "HulCvTools/FcnCallGraph/KvCFcgQuery.h"
#include "HulCvTools/FcnCallGraph/KvCFunctionCallGraph.h"
#include "platform/builder/AppBuilder.h"
#include "platform/builder/SyntheticApp.h"
#include "platform/icode/KvCCodeViewData.h"
#include "platform/icode/KvCParamSymbol.h"

#include <benchmark/benchmark.h>

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

} // namespace
