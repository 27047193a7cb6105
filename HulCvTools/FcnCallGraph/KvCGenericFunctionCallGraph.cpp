#include "HulCvTools/FcnCallGraph/KvCGenericFunctionCallGraph.h"

#include "HulCvTools/Control/KvCInternalCheck.h"
#include "HulCvTools/Control/KvCObjectPool.h"
#include "HulCvTools/FcnCallGraph/KvCFcgCallReader.h"
#include "HulCvTools/FcnCallGraph/KvCFcnSmbVisitor.h"
#include "HulCvTools/ModelInterfaces/ICodeModel.h"

// The graph type every call graph of the library derives from, instantiated and exported
// here once.
template class leda::GRAPH<KvCFcgFunctionInfo*, KvCFcgEdgeInfo*>;

KvCGenericFunctionCallGraph::KvCGenericFunctionCallGraph()
    : edgeInfoPool(std::make_unique<KvCObjectPool>(sizeof(KvCFcgEdgeInfo))),
      callReader(std::make_unique<KvCFcgCallReader>()) {}

KvCGenericFunctionCallGraph::~KvCGenericFunctionCallGraph() {
  // Every info goes while the pool is still there; the graph's own destructor then finds
  // edges without infos.
  deleteAllEdges();
}

// --- construction

bool KvCGenericFunctionCallGraph::construct(bool onlySelected) {
  // A hook that starts this graph's construction again would pull the run's reads away.
  if (!KV_VERIFY(!constructing, "KvCGenericFunctionCallGraph", 111))
    return false;
  KvCFcnSmbVisitor visitor(this, !onlySelected);
  incomplete = false;
  restore_all_edges();
  deleteAllEdges();
  deleteAllNodes();
  KvCCodeViewData* data = KvCCodeViewData::getCurrent();
  KV_SymbolDB* symbols = data ? data->getSymbolDB() : nullptr;
  if (!KV_VERIFY(symbols != nullptr, "KvCGenericFunctionCallGraph", 110)) {
    incomplete = true;
    return false;
  }
  constructing = true;
  callReader->readAhead(symbols, !onlySelected);
  symbols->forallParametrizedSymbols(&visitor);
  callReader->clear();
  constructing = false;
  return !incomplete;
}

void KvCGenericFunctionCallGraph::treatFcnSymbolByUses(KvCParamSymbol* function) {
  // The calls above the uses, in ascending key order of the uses (read ahead by construct,
  // or now when the symbol was not listed ahead).
  const auto [first, last] = callReader->callsOf(function);
  KvCFcgFunctionInfo* info = provideFcgNodeInfo(function);
  if (!info)
    return;
  registerNode(info);
  synchronizeNodeInfoAtConstruction(info, function);
  for (const KvCFcgCallReader::UseCall* use = first; use != last; ++use) {
    if (!use->hasOperation)
      incomplete = true;
    else if (use->call)
      enterCall(use->call, use->calling, use->called);
  }
}

// --- single calls

bool KvCGenericFunctionCallGraph::isInInitialValue(KvCCallOperation* call) {
  for (KV_ExprLocation* loc = call->getParent(); loc;) {
    if (loc->getSmbInitValExpr())
      return true;
    KV_Operation* op = loc->getParentOperation();
    if (!op)
      return false;
    loc = op->getParent();
  }
  return false;
}

bool KvCGenericFunctionCallGraph::addCall(KvCCallOperation* call) {
  if (!call)
    return false;
  return enterCall(call, call->getCallingSymbol(), call->getCalledSymbol());
}

bool KvCGenericFunctionCallGraph::enterCall(KvCCallOperation* call, KvCParamSymbol* calling,
                                            KvCParamSymbol* called) {
  if (!calling || !called) {
    // A call of an access function or RTE API macro in a symbol's initial value lies
    // outside every function by design; anything else without both ends is a fault, and
    // without both ends no edge can be attached.
    const bool serviceCall = called && (called->isAccessFunction() || called->isRteApiMacro());
    if (!calling && serviceCall && isInInitialValue(call))
      return false;
    KV_INTERNAL_CHECK_SRC(call->getSourceRef(), "KvCGenericFunctionCallGraph", 233);
    return false;
  }
  KvCFcgFunctionInfo* callingInfo = provideFcgNodeInfo(calling);
  KvCFcgFunctionInfo* calledInfo = provideFcgNodeInfo(called);
  if (!callingInfo || !calledInfo)
    return false;
  leda::edge e = nullptr;
  addEdge(callingInfo, calledInfo, e);
  if (!e)
    return false;
  synchronizeEdgeInfoAtConstruction(inf(e), call);
  calledInfo->addCallOperation(call);
  if (calling != called)
    callingInfo->addCalledFcn(calledInfo);
  return true;
}

bool KvCGenericFunctionCallGraph::delCall(KvCCallOperation* call) {
  KvCParamSymbol* calling = call ? call->getCallingSymbol() : nullptr;
  KvCParamSymbol* called = call ? call->getCalledSymbol() : nullptr;
  if (!calling || !called)
    return false;
  KvCFcgFunctionInfo* callingInfo = provideFcgNodeInfo(calling);
  KvCFcgFunctionInfo* calledInfo = provideFcgNodeInfo(called);
  leda::edge e = nullptr;
  if (!getEdge(callingInfo, calledInfo, e))
    return false;
  KvCFcgEdgeInfo* info = inf(e);
  const int cardinality = info ? info->getCardinality() : 0;
  if (cardinality >= 2)
    info->decCardinality();
  else if (cardinality == 1)
    deleteEdge(e);
  else
    KV_INTERNAL_CHECK("KvCGenericFunctionCallGraph", 290);
  calledInfo->delCallOperation(call);
  return true;
}

// --- nodes and edges

bool KvCGenericFunctionCallGraph::addEdge(KvCFcgFunctionInfo* calling, KvCFcgFunctionInfo* called,
                                          leda::edge& e) {
  e = nullptr;
  if (!calling || !called)
    return false;
  const leda::node v = nodeOf(calling);
  const leda::node w = nodeOf(called);
  leda::edge existing = findEdge(v, w);
  if (!existing) {
    e = linkNewEdge(v, w);
    return e != nullptr;
  }
  // An edge made through the inherited graph operations may come without info.
  if (!inf(existing))
    assign(existing, createFcgEdgeInfo());
  if (!inf(existing))
    return false;
  inf(existing)->incCardinality();
  e = existing;
  return false;
}

bool KvCGenericFunctionCallGraph::addNewEdge(KvCFcgFunctionInfo* calling,
                                             KvCFcgFunctionInfo* called, leda::edge& e) {
  e = nullptr;
  if (!calling || !called)
    return false;
  const leda::node v = nodeOf(calling);
  const leda::node w = nodeOf(called);
  e = linkNewEdge(v, w);
  return e != nullptr;
}

leda::edge KvCGenericFunctionCallGraph::linkNewEdge(leda::node v, leda::node w) {
  KvCFcgEdgeInfo* info = createFcgEdgeInfo();
  if (!info)
    return nullptr;
  info->incCardinality();
  return new_edge(v, w, info);
}

leda::node KvCGenericFunctionCallGraph::nodeOf(KvCFcgFunctionInfo* function) {
  leda::node& v = nodes[function];
  if (!v)
    v = new_node(function);
  return v;
}

void KvCGenericFunctionCallGraph::registerNode(KvCFcgFunctionInfo* function) {
  if (function)
    nodeOf(function);
}

bool KvCGenericFunctionCallGraph::getNode(KvCFcgFunctionInfo* function, leda::node& v) const {
  if (!function || !nodes.defined(function))
    return false;
  v = nodes[function];
  return true;
}

leda::edge KvCGenericFunctionCallGraph::findEdge(leda::node v, leda::node w) const {
  // Out-edges and in-edges are both kept in creation order, so either list meets the
  // pair's edges in the same order. The called node's in-edges are scanned unless they are
  // more than a few times as many as the caller's out-edges: while construction enters the
  // calls of one function, its in-edges were made just before and are at hand, whereas the
  // caller's out-edges lie scattered. Either way the scan is O(min(out-degree, in-degree)).
  if (indeg(w) > 4 * outdeg(v) + 4) {
    for (leda::edge e : out_edges(v))
      if (target(e) == w)
        return e;
    return nullptr;
  }
  for (leda::edge e : in_edges(w))
    if (source(e) == v)
      return e;
  return nullptr;
}

bool KvCGenericFunctionCallGraph::getEdge(KvCFcgFunctionInfo* calling, KvCFcgFunctionInfo* called,
                                          leda::edge& e) const {
  leda::node v = nullptr;
  leda::node w = nullptr;
  if (!getNode(calling, v) || !getNode(called, w))
    return false;
  leda::edge found = findEdge(v, w);
  if (!found)
    return false;
  e = found;
  return true;
}

int KvCGenericFunctionCallGraph::getNrOfCallers(KvCFcgFunctionInfo* function) const {
  leda::node v = nullptr;
  return getNode(function, v) ? indeg(v) : 0;
}

int KvCGenericFunctionCallGraph::getNrOfCalled(KvCFcgFunctionInfo* function) const {
  leda::node v = nullptr;
  return getNode(function, v) ? outdeg(v) : 0;
}

// --- removal

void KvCGenericFunctionCallGraph::releaseEdgeInfo(leda::edge e) {
  KvCFcgEdgeInfo* info = inf(e);
  if (!info)
    return;
  assign(e, nullptr);
  deleteFcgEdgeInfo(info);
}

void KvCGenericFunctionCallGraph::deleteEdge(leda::edge e) {
  releaseEdgeInfo(e);
  del_edge(e);
}

void KvCGenericFunctionCallGraph::removeEdges(KvCFcgFunctionInfo* function) {
  leda::node v = nullptr;
  if (!getNode(function, v))
    return;
  for (leda::edge e : out_edges(v))
    deleteEdge(e);
  for (leda::edge e : in_edges(v))
    deleteEdge(e);
}

void KvCGenericFunctionCallGraph::removeCalledEdges(KvCFcgFunctionInfo* function) {
  leda::node v = nullptr;
  if (!getNode(function, v))
    return;
  for (leda::edge e : out_edges(v)) {
    if (KvCFcgFunctionInfo* called = inf(target(e)))
      called->getCallOperationsSet().clear();
    deleteEdge(e);
  }
}

void KvCGenericFunctionCallGraph::deleteAllEdges() {
  restore_all_edges();
  for (leda::edge e : all_edges())
    releaseEdgeInfo(e);
  del_all_edges();
}

void KvCGenericFunctionCallGraph::deleteAllNodes() {
  for (leda::node v : all_nodes())
    deleteFcgNodeInfo(inf(v));
}

void KvCGenericFunctionCallGraph::pre_del_edge_handler(leda::edge e) { releaseEdgeInfo(e); }

void KvCGenericFunctionCallGraph::pre_del_node_handler(leda::node v) {
  KvCFcgFunctionInfo* function = inf(v);
  if (nodes.defined(function) && nodes[function] == v)
    nodes.undefine(function);
}

void KvCGenericFunctionCallGraph::pre_clear_handler() {
  // Hidden edges go too; showing them first lets the walk reach their infos.
  restore_all_edges();
  for (leda::edge e : all_edges())
    releaseEdgeInfo(e);
  nodes.clear();
}

// --- roots and leaves

bool KvCGenericFunctionCallGraph::findAllFcgLeaves(leda::list<leda::node>& leaves) const {
  leaves.clear();
  for (leda::node v : all_nodes())
    if (outdeg(v) == 0)
      leaves.append(v);
  return !leaves.empty();
}

bool KvCGenericFunctionCallGraph::findAllFcgRoots(leda::list<leda::node>& roots) const {
  roots.clear();
  for (leda::node v : all_nodes())
    if (indeg(v) == 0)
      roots.append(v);
  return !roots.empty();
}

void KvCGenericFunctionCallGraph::display(const leda::set<leda::node>& /*nodes*/,
                                          int /*depth*/) const {}

// --- traversals

void KvCGenericFunctionCallGraph::forall_FcgNodes(KvCFcgFunctor& functor) {
  for (leda::node v : all_nodes()) {
    if (functor.stopIteration())
      return;
    functor(inf(v));
  }
}

void KvCGenericFunctionCallGraph::forall_CallerNodes(KvCFcgFunctor& functor) {
  for (leda::node v : all_nodes()) {
    if (functor.stopIteration())
      return;
    forall_CallingFunctionsOf(v, functor);
  }
}

void KvCGenericFunctionCallGraph::forall_CalledNodes(KvCFcgFunctor& functor) {
  for (leda::node v : all_nodes()) {
    if (functor.stopIteration())
      return;
    forall_CalledFunctionsOf(v, functor);
  }
}

void KvCGenericFunctionCallGraph::forall_CallingFunctionsOf(KvCFcgFunctionInfo* function,
                                                            KvCFcgFunctor& functor) {
  leda::node v = nullptr;
  if (getNode(function, v))
    forall_CallingFunctionsOf(v, functor);
}

void KvCGenericFunctionCallGraph::forall_CalledFunctionsOf(KvCFcgFunctionInfo* function,
                                                           KvCFcgFunctor& functor) {
  leda::node v = nullptr;
  if (getNode(function, v))
    forall_CalledFunctionsOf(v, functor);
}

void KvCGenericFunctionCallGraph::forall_CallingFunctionsOf(leda::node v, KvCFcgFunctor& functor) {
  for (leda::edge e : in_edges(v))
    functor(inf(source(e)));
}

void KvCGenericFunctionCallGraph::forall_CalledFunctionsOf(leda::node v, KvCFcgFunctor& functor) {
  for (leda::edge e : out_edges(v))
    functor(inf(target(e)));
}

// --- hooks

KvCFcgFunctionInfo* KvCGenericFunctionCallGraph::provideFcgNodeInfo(KvCParamSymbol* function) {
  return function ? function->getFunctionInfo() : nullptr;
}

void KvCGenericFunctionCallGraph::deleteFcgNodeInfo(KvCFcgFunctionInfo* function) {
  if (function)
    function->getCallOperationsSet().clear();
}

void KvCGenericFunctionCallGraph::synchronizeNodeInfoAtConstruction(KvCFcgFunctionInfo* /*info*/,
                                                                    KvCParamSymbol* /*function*/) {}

KvCFcgEdgeInfo* KvCGenericFunctionCallGraph::createFcgEdgeInfo() {
  // From the graph's pool: no heap call per edge. A plain delete releases it.
  return new (*edgeInfoPool) KvCFcgEdgeInfo;
}

void KvCGenericFunctionCallGraph::deleteFcgEdgeInfo(KvCFcgEdgeInfo* info) { delete info; }

void KvCGenericFunctionCallGraph::synchronizeEdgeInfoAtConstruction(KvCFcgEdgeInfo* info,
                                                                    KvCCallOperation* call) {
  if (info && call && call->isTaskActivation())
    info->setIsTaskCall(true);
}
