// One call graph construction in a fresh process, as a pass meets it: the application is
// built and its def/use databases filled, then a new KvCFunctionCallGraph is booted and
// constructed once. Nothing of the graph is in the caches or in the allocator's free
// lists yet, so the time includes the first touch of every page the graph takes.
//
//   usage: FcnCallGraphConstructOnce CALLS fanout|scheduler
//
// The application is the one FcnCallGraphBench builds for the same arguments (see
// callsShape there): fan-out is CALLS/10 functions with ten calls each to later
// functions; scheduler is one function calling CALLS distinct functions. Both have 5% task
// activations.
//
// Prints one line of key=value fields:
//   shape, calls         the shape and the call operations in the application
//   nodes, edges         of the constructed graph
//   ns_per_call          the construction's wall time (steady_clock) per call operation
//   bytes_per_edge       heap growth across construct (see heapInUse) per edge
//   model_bytes_per_edge the part of it that outlives the graph (the function-info sets)
//   heap_bytes           that growth in bytes
//   peak_rss_kib         the process's peak resident set (getrusage), model included
//   construct            ok, or false when construct answered false
//
// The program uses only the graph's public interface, so it builds against older versions
// of the library too (compare-construct.sh builds it in a second tree).
#include "HulCvTools/ExprLocDBBuilder/KvCExprLocDBBuilder.h"
#include "HulCvTools/FcnCallGraph/KvCFunctionCallGraph.h"
#include "platform/builder/AppBuilder.h"
#include "platform/builder/SyntheticApp.h"

#include <malloc.h>
#include <sys/resource.h>

#include <chrono>
#include <cstdio>
#include <cstdlib>
#include <cstring>

namespace {

// The same shape as callsShape in FcnCallGraphBench.cpp; keep the two in step.
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

// Bytes the C heap has handed out and not taken back: arena blocks in use plus blocks
// mapped on their own (large vectors and pool chunks). Every allocation of the library
// and of the model ends here: operator new, the record pools' aligned operator new, and
// the malloc behind the library's class-level operators and the memory controller.
//
// The difference across construct therefore counts what construct leaves allocated: the
// graph's node and edge records, the edge infos and their pool, the node map, the edge
// index, the scratch the graph keeps for its next construction, and the growth of the
// model's function-info sets (call operations, called functions). Scratch that construct
// frees before it returns is not counted. The process has one thread, so the main arena
// is the only one.
long long heapInUse() {
  const struct mallinfo2 info = mallinfo2();
  return static_cast<long long>(info.uordblks) + static_cast<long long>(info.hblkhd);
}

long peakRssKib() {
  struct rusage usage {};
  getrusage(RUSAGE_SELF, &usage);
  return usage.ru_maxrss;
}

int usage(const char* program) {
  std::fprintf(stderr, "usage: %s CALLS fanout|scheduler\n", program);
  return 2;
}

} // namespace

int main(int argc, char** argv) {
  if (argc != 3)
    return usage(argv[0]);
  char* end = nullptr;
  const long calls = std::strtol(argv[1], &end, 10);
  if (*end != '\0' || calls < 10 || calls > 100'000'000)
    return usage(argv[0]);
  const bool scheduler = std::strcmp(argv[2], "scheduler") == 0;
  if (!scheduler && std::strcmp(argv[2], "fanout") != 0)
    return usage(argv[0]);

  AppBuilder app;
  buildSyntheticApp(app, callsShape(calls, scheduler));
  const SyntheticAppCounts counts = countSyntheticApp(app.data());
  KvCExprLocDBBuilder builder;
  builder.boot(&app.data());
  builder.buildExprLocDBs();

  const long long heapBefore = heapInUse();
  long long heapBytes = 0;
  double ns = 0;
  int nodes = 0;
  int edges = 0;
  bool ok = false;
  {
    KvCFunctionCallGraph graph;
    graph.boot();
    const long long heapBooted = heapInUse();
    const auto start = std::chrono::steady_clock::now();
    ok = graph.construct(false);
    const auto stop = std::chrono::steady_clock::now();
    heapBytes = heapInUse() - heapBooted;
    ns = static_cast<double>(
        std::chrono::duration_cast<std::chrono::nanoseconds>(stop - start).count());
    nodes = graph.number_of_nodes();
    edges = graph.number_of_edges();
    graph.shutdown();
  }
  // What stays once the graph is gone: the growth of the model's function-info sets.
  const long long modelBytes = heapInUse() - heapBefore;

  const auto perEdge = [edges](long long bytes) {
    return edges > 0 ? static_cast<double>(bytes) / edges : 0.0;
  };
  std::printf("shape=%s calls=%d nodes=%d edges=%d ns_per_call=%.1f bytes_per_edge=%.1f "
              "model_bytes_per_edge=%.1f heap_bytes=%lld peak_rss_kib=%ld construct=%s\n",
              scheduler ? "scheduler" : "fanout", counts.calls, nodes, edges,
              counts.calls > 0 ? ns / counts.calls : 0.0, perEdge(heapBytes), perEdge(modelBytes),
              heapBytes, peakRssKib(), ok ? "ok" : "false");
  return ok ? 0 : 1;
}
