// Def/use database builds over synthetic applications of 10^4 to 10^6 expression
// locations: the full build (reported in ns per location) and the incremental clear and
// build of one statement (which must not depend on the application's size).
#include "HulCvTools/ExprLocDBBuilder/KvCExprLocDBBuilder.h"
#include "platform/builder/AppBuilder.h"
#include "platform/builder/SyntheticApp.h"
#include "platform/icode/KV_ICodeElemVisitor.h"
#include "platform/icode/KV_Statement.h"
#include "platform/icode/KvCExprLocDBServer.h"
#include "platform/icode/KvCICodeIterator.h"

#include <benchmark/benchmark.h>

#include <map>
#include <memory>
#include <vector>

namespace {

class StatementCollector : public KV_ICodeElemVisitor {
public:
  void visitStatement(KV_Statement* statement) override { statements.push_back(statement); }
  std::vector<KV_Statement*> statements;
};

// One synthetic application per target size, built once per process.
struct SizedApp {
  std::unique_ptr<AppBuilder> app;
  SyntheticAppCounts counts{};
  std::vector<KV_Statement*> statements;
};

SizedApp& appWithLocations(long target) {
  static std::map<long, SizedApp> apps;
  SizedApp& sized = apps[target];
  if (sized.app)
    return sized;
  SyntheticAppShape shape;
  shape.statementsPerBody = 10;
  shape.expressionDepth = 3;
  shape.callFanOut = 2;
  shape.variables = 200;
  // About 17 locations per statement of this shape (the counts report the real figure).
  shape.functions = static_cast<int>(target / (shape.statementsPerBody * 17)) + 1;
  shape.seed = 42;
  sized.app = std::make_unique<AppBuilder>();
  buildSyntheticApp(*sized.app, shape);
  sized.counts = countSyntheticApp(sized.app->data());
  StatementCollector collector;
  KvCICodeIterator iterator;
  iterator.iterate(sized.app->data().getApplication(), &collector);
  sized.statements = std::move(collector.statements);
  return sized;
}

void perLocation(benchmark::State& state, const SizedApp& sized) {
  const double locations = sized.counts.expressionLocations;
  state.counters["locations"] = locations;
  state.counters["ns_per_location"] =
      benchmark::Counter(locations * 1e-9, benchmark::Counter::kIsIterationInvariantRate |
                                               benchmark::Counter::kInvert);
}

void BM_FullBuild(benchmark::State& state) {
  SizedApp& sized = appWithLocations(state.range(0));
  KvCExprLocDBBuilder builder;
  builder.boot(&sized.app->data());
  for (auto _ : state) {
    state.PauseTiming();
    sized.app->data().getExprLocDBServer()->clearExprLocDBs();
    state.ResumeTiming();
    builder.buildExprLocDBs();
  }
  perLocation(state, sized);
}
BENCHMARK(BM_FullBuild)->Arg(10'000)->Arg(100'000)->Arg(1'000'000)->Unit(benchmark::kMillisecond);

// The bare walk of the ICode iterator, for comparison with the full build.
void BM_WalkOnly(benchmark::State& state) {
  SizedApp& sized = appWithLocations(state.range(0));
  KV_ICodeElemVisitor nothing;
  KvCICodeIterator iterator;
  for (auto _ : state)
    iterator.iterate(sized.app->data().getApplication(), &nothing);
  perLocation(state, sized);
}
BENCHMARK(BM_WalkOnly)->Arg(10'000)->Arg(1'000'000)->Unit(benchmark::kMillisecond);

void BM_IncrementalStatement(benchmark::State& state) {
  SizedApp& sized = appWithLocations(state.range(0));
  KvCExprLocDBBuilder builder;
  builder.boot(&sized.app->data());
  builder.rebuildExprLocDBs();
  // The same 64 simple statements (no nested tables: a file-level definition statement
  // would take its whole function along) at every size, so that the figure shows the
  // algorithm's cost and not the cache's.
  std::vector<KV_Statement*> small;
  for (KV_Statement* s : sized.statements)
    if (s->getNumberOfStatementTables() == 0 && small.size() < 64)
      small.push_back(s);
  std::size_t next = 0;
  for (auto _ : state) {
    KV_Statement* statement = small[next];
    next = (next + 1) % small.size();
    builder.clearExprLocDBsIncremental(statement);
    builder.buildExprLocDBsIncremental(statement);
  }
  state.counters["locations"] = sized.counts.expressionLocations;
}
BENCHMARK(BM_IncrementalStatement)->Arg(10'000)->Arg(100'000)->Arg(1'000'000);

} // namespace
