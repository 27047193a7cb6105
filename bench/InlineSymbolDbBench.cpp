// Inline symbol database at 10^4 and 10^6 mappings: recording mappings (fresh database
// per run), the direct queries, the chain queries at chain lengths 1, 10 and 100, and the
// component-wise mapping of structure instances. Each size has its own symbols; every
// figure is reported as ns per operation (ns_per_step for the chain walks).
#include "HulCvTools/InlineSymbolDb/KvCInlineSymbolDb.h"

#include "platform/icode/KV_DataType.h"
#include "platform/icode/KV_DataTypeServer.h"
#include "platform/icode/KV_SymbolDB.h"
#include "platform/icode/KvCCodeViewData.h"
#include "platform/icode/KvCUnparamSymbol.h"

#include <benchmark/benchmark.h>

#include <algorithm>
#include <memory>
#include <random>
#include <string>
#include <vector>

namespace {

// "<stem><i>", built without operator+ (which GCC 12 warns about falsely in Release).
WmCXString numbered(const char* stem, int i) {
  std::string name = stem;
  name += std::to_string(i);
  return WmCXString(name.c_str());
}

benchmark::Counter perOperation(double operations) {
  return benchmark::Counter(operations * 1e-9, benchmark::Counter::kIsIterationInvariantRate |
                                                   benchmark::Counter::kInvert);
}

// `count` scalar variables in a model of their own.
struct Scalars {
  explicit Scalars(int count) : cvd(std::make_unique<KvCCodeViewData>("Bench")) {
    KV_DataType* type = cvd->getDataTypeServer()->getInt16();
    symbols.reserve(static_cast<std::size_t>(count));
    for (int i = 0; i < count; ++i)
      symbols.push_back(
          cvd->getSymbolDB()->createUnparamSymbol(numbered("v", i), type, false));
  }
  std::unique_ptr<KvCCodeViewData> cvd;
  std::vector<KvCUnparamSymbol*> symbols;
};

// Chains of `length` mappings each, `mappings` mappings in all: chain c maps its symbols
// s0 -> s1 -> ... -> s_length, as repeated inlining does.
void mapChains(KvCInlineSymbolDb& db, const Scalars& scalars, int mappings, int length) {
  const int chains = mappings / length;
  for (int c = 0; c < chains; ++c) {
    const std::size_t base = static_cast<std::size_t>(c) * static_cast<std::size_t>(length + 1);
    for (int i = 0; i < length; ++i)
      db.mapSymbol(scalars.symbols[base + static_cast<std::size_t>(i)],
                   scalars.symbols[base + static_cast<std::size_t>(i) + 1]);
  }
}

void BM_MapSymbol(benchmark::State& state) {
  const int mappings = static_cast<int>(state.range(0));
  Scalars scalars(2 * mappings);
  for (auto _ : state) {
    KvCInlineSymbolDb db;
    mapChains(db, scalars, mappings, 1);
    benchmark::DoNotOptimize(db.getNumberOfEntries());
  }
  state.counters["mappings"] = mappings;
  state.counters["ns_per_mapping"] = perOperation(mappings);
}
BENCHMARK(BM_MapSymbol)->Arg(10'000)->Arg(1'000'000)->Unit(benchmark::kMillisecond);

// getSourceSymbol and getSinkSymbol of every symbol, in a shuffled order (no help from the
// order the entries were made in).
void BM_DirectQueries(benchmark::State& state) {
  const int mappings = static_cast<int>(state.range(0));
  Scalars scalars(2 * mappings);
  KvCInlineSymbolDb db;
  mapChains(db, scalars, mappings, 1);
  std::vector<KvCUnparamSymbol*> order = scalars.symbols;
  std::shuffle(order.begin(), order.end(), std::mt19937(7));
  for (auto _ : state) {
    for (KvCUnparamSymbol* s : order) {
      benchmark::DoNotOptimize(db.getSourceSymbol(s));
      benchmark::DoNotOptimize(db.getSinkSymbol(s));
    }
  }
  state.counters["mappings"] = mappings;
  state.counters["ns_per_query"] = perOperation(2.0 * static_cast<double>(order.size()));
}
BENCHMARK(BM_DirectQueries)->Arg(10'000)->Arg(1'000'000)->Unit(benchmark::kMillisecond);

// getFinalSinkSymbol from every chain start and getOriginalSourceSymbol from every chain
// end, chains of state.range(1) mappings.
void BM_ChainQueries(benchmark::State& state) {
  const int mappings = static_cast<int>(state.range(0));
  const int length = static_cast<int>(state.range(1));
  const int chains = mappings / length;
  Scalars scalars(chains * (length + 1));
  KvCInlineSymbolDb db;
  mapChains(db, scalars, mappings, length);
  std::vector<int> order(static_cast<std::size_t>(chains));
  for (int c = 0; c < chains; ++c)
    order[static_cast<std::size_t>(c)] = c;
  std::shuffle(order.begin(), order.end(), std::mt19937(11));
  for (auto _ : state) {
    for (int c : order) {
      const std::size_t base = static_cast<std::size_t>(c) * static_cast<std::size_t>(length + 1);
      benchmark::DoNotOptimize(db.getFinalSinkSymbol(scalars.symbols[base]));
      benchmark::DoNotOptimize(
          db.getOriginalSourceSymbol(scalars.symbols[base + static_cast<std::size_t>(length)]));
    }
  }
  state.counters["mappings"] = mappings;
  state.counters["ns_per_query"] = perOperation(2.0 * chains);
  state.counters["ns_per_step"] = perOperation(2.0 * chains * length);
}
BENCHMARK(BM_ChainQueries)
    ->Args({10'000, 1})
    ->Args({10'000, 10})
    ->Args({10'000, 100})
    ->Args({1'000'000, 1})
    ->Args({1'000'000, 10})
    ->Args({1'000'000, 100})
    ->Unit(benchmark::kMillisecond);

// Pairs of instances of Outer { a, in: Inner { p, q }, b } mapped through one component
// each: six symbols joined per mapSymbol. Reported per symbol joined.
void BM_MapStructures(benchmark::State& state) {
  const int joined = static_cast<int>(state.range(0));
  const int pairs = joined / 6;
  auto cvd = std::make_unique<KvCCodeViewData>("Bench");
  KV_DataTypeServer* types = cvd->getDataTypeServer();
  KV_StructType* inner = types->demandStructType("Inner");
  inner->addComponent("p", types->getInt16());
  inner->addComponent("q", types->getInt16());
  KV_StructType* outer = types->demandStructType("Outer");
  outer->addComponent("a", types->getInt16());
  outer->addComponent("in", inner);
  outer->addComponent("b", types->getInt8());
  KV_SymbolDB* symbols = cvd->getSymbolDB();
  std::vector<KvCUnparamSymbol*> firstComponents;
  for (int i = 0; i < 2 * pairs; ++i) {
    KvCUnparamSymbol* s = symbols->createUnparamSymbol(numbered("s", i), outer, false);
    for (int slot = 0; slot < 3; ++slot)
      symbols->demandComponentSymbol(s, slot);
    symbols->demandComponentSymbol(s->getComponentSymbol(1), 0);
    symbols->demandComponentSymbol(s->getComponentSymbol(1), 1);
    firstComponents.push_back(s->getComponentSymbol(0));
  }
  for (auto _ : state) {
    KvCInlineSymbolDb db;
    for (int i = 0; i < pairs; ++i)
      db.mapSymbol(firstComponents[static_cast<std::size_t>(2 * i)],
                   firstComponents[static_cast<std::size_t>(2 * i + 1)]);
    benchmark::DoNotOptimize(db.getNumberOfEntries());
  }
  state.counters["mappings"] = pairs * 6;
  state.counters["ns_per_symbol_joined"] = perOperation(pairs * 6.0);
}
BENCHMARK(BM_MapStructures)->Arg(10'002)->Arg(1'000'002)->Unit(benchmark::kMillisecond);

} // namespace
