// KvCFcgQuery: transitive questions over a call graph. Holds the graph, which it does not
// own and which must outlive it.
#ifndef HULCVTOOLS_FCNCALLGRAPH_KVCFCGQUERY_H
#define HULCVTOOLS_FCNCALLGRAPH_KVCFCGQUERY_H

#include "HulCvTools/HulCvToolsExport.h"
#include "HulCvTools/ModelInterfaces/ICodeFwd.h"
#include "platform/leda/list.h"

class KvCGenericFunctionCallGraph;

class HULCV_API KvCFcgQuery {
public:
  explicit KvCFcgQuery(KvCGenericFunctionCallGraph* graph) : callGraph(graph) {}

  // Every function that calls `function` directly or indirectly, breadth first from its
  // direct callers, each once. A function on a call cycle is among its own callers. False,
  // and `callers` untouched, when the function has no node. O(callers reached + their
  // incoming edges).
  bool getAllCaller(KvCFcgFunctionInfo* function, leda::list<KvCFcgFunctionInfo*>& callers);

private:
  KvCGenericFunctionCallGraph* callGraph;
};

#endif
