// KvCFunctionCallGraph: the call graph the passes construct and query. It records, for
// each function, the file of its body, and finds the functions on call cycles (direct or
// indirect recursion, task activations excluded) for the inlining passes: analyzeInlining
// sets the in-loop mark of those functions' infos, reInitInlining clears every mark.
//
// The marks live in the model's function infos, so they outlive shutdown. Copying is
// deleted (see the base class).
#ifndef HULCVTOOLS_FCNCALLGRAPH_KVCFUNCTIONCALLGRAPH_H
#define HULCVTOOLS_FCNCALLGRAPH_KVCFUNCTIONCALLGRAPH_H

#include "HulCvTools/FcnCallGraph/KvCGenericFunctionCallGraph.h"

class HULCV_API KvCFunctionCallGraph : public KvCGenericFunctionCallGraph {
public:
  KvCFunctionCallGraph() = default;
  ~KvCFunctionCallGraph() override;

  // Does nothing; true.
  bool boot();
  bool construct(bool onlySelected) override;
  leda::map<KvCFcgFunctionInfo*, leda::node>& getGraphMap() { return nodeMap(); }
  // Marks every function on a cycle of calls that are not task calls: hides the task-call
  // edges, computes the strongly connected components, marks the members of every
  // component of two or more functions and every function with a visible self-call (the
  // ends of the edges inside components), then restores all hidden edges, including any
  // a caller hid before. Only sets marks. O(nodes + edges). True.
  bool analyzeInlining();
  // Clears every function's in-loop mark. True.
  bool reInitInlining();
  // Deletes all edges and their infos, all nodes and the node map. True.
  bool shutdown();

  HULCV_HEAP_OPERATORS

protected:
  void synchronizeNodeInfoAtConstruction(KvCFcgFunctionInfo* info,
                                         KvCParamSymbol* function) override;
};

#endif
