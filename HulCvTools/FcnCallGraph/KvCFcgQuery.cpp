#include "HulCvTools/FcnCallGraph/KvCFcgQuery.h"

#include "HulCvTools/FcnCallGraph/KvCGenericFunctionCallGraph.h"

bool KvCFcgQuery::getAllCaller(KvCFcgFunctionInfo* function,
                               leda::list<KvCFcgFunctionInfo*>& callers) {
  leda::node start = nullptr;
  if (!callGraph || !callGraph->getNode(function, start))
    return false;
  callers.clear();
  leda::node_array<bool> visited(*callGraph, false);
  leda::list<leda::node> queue;
  for (leda::edge e : callGraph->in_edges(start))
    queue.append(callGraph->source(e));
  while (!queue.empty()) {
    leda::node v = queue.pop();
    if (visited[v])
      continue;
    visited[v] = true;
    callers.append(callGraph->inf(v));
    for (leda::edge e : callGraph->in_edges(v))
      queue.append(callGraph->source(e));
  }
  return true;
}
