#include "HulCvTools/FcnCallGraph/KvCFunctionCallGraph.h"

#include "HulCvTools/FcnCallGraph/KvCFcgReInitInlining.h"
#include "HulCvTools/ModelInterfaces/ICodeModel.h"
#include "platform/leda/strong_components.h"

#include <vector>

HULCV_DEFINE_HEAP_OPERATORS(KvCFunctionCallGraph)

KvCFunctionCallGraph::~KvCFunctionCallGraph() = default;

bool KvCFunctionCallGraph::boot() { return true; }

bool KvCFunctionCallGraph::construct(bool onlySelected) {
  return KvCGenericFunctionCallGraph::construct(onlySelected);
}

void KvCFunctionCallGraph::synchronizeNodeInfoAtConstruction(KvCFcgFunctionInfo* info,
                                                             KvCParamSymbol* function) {
  KvCCStmTable* body = function ? function->getBodySTT() : nullptr;
  if (info && body)
    info->setFile(body->getFile());
}

bool KvCFunctionCallGraph::analyzeInlining() {
  // Task calls never close a cycle: hide them. A visible self-loop puts its function on a
  // cycle whatever the components say, so those are noted on the way.
  std::vector<leda::node> selfCalling;
  for (leda::edge e : all_edges()) {
    const KvCFcgEdgeInfo* info = inf(e);
    if (info && info->isTaskCall())
      hide_edge(e);
    else if (source(e) == target(e))
      selfCalling.push_back(source(e));
  }
  leda::node_array<int> component(*this, 0);
  const int count = leda::STRONG_COMPONENTS(*this, component);
  if (count > 0) {
    // A visible edge joins two nodes of one component exactly when the component has two
    // or more nodes (each of them has an edge inside it) or the edge is a self-loop, so
    // marking both ends of every such edge marks these nodes.
    std::vector<int> members(static_cast<std::size_t>(count), 0);
    for (leda::node v : all_nodes())
      ++members[static_cast<std::size_t>(component[v])];
    for (leda::node v : all_nodes())
      if (members[static_cast<std::size_t>(component[v])] > 1 && inf(v))
        inf(v)->markInLoop();
    for (leda::node v : selfCalling)
      if (inf(v))
        inf(v)->markInLoop();
  }
  restore_all_edges();
  return true;
}

bool KvCFunctionCallGraph::reInitInlining() {
  KvCFcgReInitInlining reset;
  forall_FcgNodes(reset);
  return true;
}

bool KvCFunctionCallGraph::shutdown() {
  deleteAllEdges();
  clear();
  clearNodeMap();
  return true;
}
