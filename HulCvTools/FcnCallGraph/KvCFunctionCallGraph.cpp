#include "HulCvTools/FcnCallGraph/KvCFunctionCallGraph.h"

#include "HulCvTools/FcnCallGraph/KvCFcgReInitInlining.h"
#include "HulCvTools/ModelInterfaces/ICodeModel.h"
#include "platform/leda/strong_components.h"

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
  leda::node_array<int> component(*this, 0);
  for (leda::edge e : all_edges())
    if (inf(e) && inf(e)->isTaskCall())
      hide_edge(e);
  const int count = leda::STRONG_COMPONENTS(*this, component);
  if (count > 0) {
    for (leda::edge e : all_edges()) {
      if (component[source(e)] != component[target(e)])
        continue;
      if (KvCFcgFunctionInfo* from = inf(source(e)))
        from->markInLoop();
      if (KvCFcgFunctionInfo* to = inf(target(e)))
        to->markInLoop();
    }
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
