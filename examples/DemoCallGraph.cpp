// Function call graph: the sample application's calls, the functions on call cycles
// (task activations excluded) and the cost of inlining each function. With --dot FILE
// the graph is also written in Graphviz DOT.
#include "DemoSampleApp.h"
#include "DemoSections.h"

#include "HulCvTools/ExprLocDBBuilder/KvCExprLocDBBuilder.h"
#include "HulCvTools/FcnCallGraph/KvCFunctionCallGraph.h"
#include "HulCvTools/FcnCallGraph/KvCInliningCostCalculator.h"
#include "platform/icode/KvCFcgFunctionInfo.h"
#include "platform/icode/KvCParamSymbol.h"

#include <climits>
#include <fstream>
#include <string>

namespace {

std::string nameOf(const KvCFunctionCallGraph& graph, leda::node v) {
  KvCFcgFunctionInfo* info = graph.inf(v);
  return info && info->getSymbol() ? info->getSymbol()->getName().str() : "?";
}

void writeDot(const KvCFunctionCallGraph& graph, const char* path, std::ostream& out) {
  std::ofstream dot(path);
  if (!dot) {
    out << "  cannot write " << path << "\n";
    return;
  }
  dot << "digraph calls {\n  node [shape=box];\n";
  for (leda::node v : graph.all_nodes()) {
    const bool inLoop = graph.inf(v)->isInLoop();
    dot << "  \"" << nameOf(graph, v) << "\"" << (inLoop ? " [style=filled, fillcolor=orange]" : "")
        << ";\n";
  }
  for (leda::edge e : graph.all_edges()) {
    KvCFcgEdgeInfo* info = graph.inf(e);
    dot << "  \"" << nameOf(graph, graph.source(e)) << "\" -> \"" << nameOf(graph, graph.target(e))
        << "\" [label=\"x" << info->getCardinality() << "\""
        << (info->isTaskCall() ? ", style=dashed" : "") << "];\n";
  }
  dot << "}\n";
  out << "  call graph written to " << path << "\n";
}

// A pass may edit the graph through the graph operations it inherits; the call graph's
// lookups follow, and the deleted edge's info is released with it.
void showEditThroughTheGraph(KvCFunctionCallGraph& graph, std::ostream& out) {
  leda::edge e = graph.first_edge();
  if (!e)
    return;
  KvCFcgFunctionInfo* calling = graph.inf(graph.source(e));
  KvCFcgFunctionInfo* called = graph.inf(graph.target(e));
  const std::string pair = nameOf(graph, graph.source(e)) + " -> " + nameOf(graph, graph.target(e));
  graph.del_edge(e);
  leda::edge found = nullptr;
  out << "  a pass deletes " << pair << " through the graph itself: getEdge "
      << (graph.getEdge(calling, called, found) ? "still finds it" : "finds none");
  graph.construct(false);
  out << "; after construct again: "
      << (graph.getEdge(calling, called, found)
              ? pair + " x" + std::to_string(graph.inf(found)->getCardinality())
              : std::string("none"))
      << "\n";
}

} // namespace

void demoCallGraph(DemoRun& run) {
  printSectionTitle(run.out, "Function call graph, recursion analysis, inlining costs");
  KvCExprLocDBBuilder databases;
  databases.boot(&run.sample.app.data());
  databases.rebuildExprLocDBs();

  KvCFunctionCallGraph graph;
  graph.boot();
  const bool complete = graph.construct(false);
  graph.analyzeInlining();
  run.out << "  " << graph.number_of_nodes() << " functions, " << graph.number_of_edges()
          << " call edges" << (complete ? "" : " (incomplete)") << "\n";
  for (leda::edge e : graph.all_edges()) {
    KvCFcgEdgeInfo* info = graph.inf(e);
    run.out << "    " << nameOf(graph, graph.source(e)) << " -> " << nameOf(graph, graph.target(e))
            << " x" << info->getCardinality() << (info->isTaskCall() ? "  (task activation)" : "")
            << "\n";
  }
  run.out << "  in a loop (recursive):";
  for (leda::node v : graph.all_nodes())
    if (graph.inf(v)->isInLoop())
      run.out << " " << nameOf(graph, v);
  run.out << "\n  inlining costs:";
  KvCInliningCostCalculator costs;
  for (leda::node v : graph.all_nodes()) {
    const int cost = costs.calculateInliningCosts(graph.inf(v)->getSymbol());
    run.out << " " << nameOf(graph, v) << "="
            << (cost == INT_MAX ? std::string("max") : std::to_string(cost));
  }
  run.out << "\n";
  if (run.dotFile)
    writeDot(graph, run.dotFile, run.out);
  showEditThroughTheGraph(graph, run.out);
  graph.reInitInlining();
  graph.shutdown();
}
