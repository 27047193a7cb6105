#include "HulCvTools/FcnCallGraph/KvCGenericFunctionCallGraph.h"

#include "HulCvTools/Control/KvCInternalCheck.h"
#include "HulCvTools/FcnCallGraph/KvCFcgQuery.h"
#include "HulCvTools/FcnCallGraph/KvCFcnSmbVisitor.h"
#include "HulCvTools/ModelInterfaces/ICodeModel.h"
#include "platform/leda/dictionary.h"

#include <functional>

// The graph type every call graph of the library derives from, instantiated and exported
// here once.
template class leda::GRAPH<KvCFcgFunctionInfo*, KvCFcgEdgeInfo*>;

int KvCFcgEdgeInfo::s_DebugIndex = 0;
HULCV_DEFINE_HEAP_OPERATORS(KvCFcgEdgeInfo)

KvCFcgFunctor::~KvCFcgFunctor() = default;
bool KvCFcgFunctor::stopIteration() { return false; }

KvCFcnSmbVisitor::~KvCFcnSmbVisitor() = default;

void KvCFcnSmbVisitor::visitParamSmbDBObj(KV_ParamSmbDBObj* entry) {
  if (!entry || !callGraph)
    return;
  if (!visitAllSymbols && !(entry->getSymbol() && entry->getSymbol()->isSelected()))
    return;
  if (KvCParamSymbol* function = entry->getParamSymbol())
    callGraph->treatFcnSymbolByUses(function);
}

void KvCFcnSmbVisitor::visitUnparamSymbol(KvCUnparamSymbol* /*symbol*/) {}

std::size_t KvCGenericFunctionCallGraph::PairHash::operator()(
    const std::pair<leda::node, leda::node>& p) const noexcept {
  const std::size_t a = std::hash<const void*>()(p.first);
  const std::size_t b = std::hash<const void*>()(p.second);
  return a ^ (b + 0x9e3779b97f4a7c15ULL + (a << 6) + (a >> 2));
}

KvCGenericFunctionCallGraph::KvCGenericFunctionCallGraph() = default;

KvCGenericFunctionCallGraph::~KvCGenericFunctionCallGraph() { deleteAllEdges(); }

// --- construction

bool KvCGenericFunctionCallGraph::construct(bool onlySelected) {
  KvCFcnSmbVisitor visitor(this, !onlySelected);
  incomplete = false;
  restore_all_edges();
  deleteAllEdges();
  deleteAllNodes();
  KvCCodeViewData* data = KvCCodeViewData::getCurrent();
  if (!KV_VERIFY(data != nullptr, "KvCGenericFunctionCallGraph", __LINE__)) {
    incomplete = true;
    return false;
  }
  data->getSymbolDB()->forallParametrizedSymbols(&visitor);
  return !incomplete;
}

void KvCGenericFunctionCallGraph::treatFcnSymbolByUses(KvCParamSymbol* function) {
  leda::dictionary<int, KV_ExprLocation*> uses;
  function->getExprLocDB()->listUses(uses);
  KvCFcgFunctionInfo* info = provideFcgNodeInfo(function);
  if (!info)
    return;
  registerNode(info);
  synchronizeNodeInfoAtConstruction(info, function);
  for (const auto& use : uses) {
    KV_Operation* op = use.second->getOperation();
    if (!op) {
      incomplete = true;
      continue;
    }
    KV_Operation* above = op->getParentOperation();
    if (KvCCallOperation* call = above ? above->asCallOperation() : nullptr)
      addCall(call);
  }
}

// --- single calls

bool KvCGenericFunctionCallGraph::isEnteredOutsideFunctions(KvCCallOperation* call) const {
  // A call of an access function or RTE API macro in a symbol's initial value is
  // legitimately outside every function.
  for (KV_ExprLocation* loc = call->getParent(); loc;) {
    if (loc->getSmbInitValExpr())
      return true;
    KV_Operation* op = loc->getParentOperation();
    if (!op)
      break;
    loc = op->getParent();
  }
  return false;
}

bool KvCGenericFunctionCallGraph::addCall(KvCCallOperation* call) {
  if (!call)
    return false;
  KvCParamSymbol* calling = call->getCallingSymbol();
  KvCParamSymbol* called = call->getCalledSymbol();
  if (!calling || !called) {
    const bool serviceCall = called && (called->isAccessFunction() || called->isRteApiMacro());
    if (!calling && serviceCall && isEnteredOutsideFunctions(call))
      return false;
    // No edge can be attached without both ends.
    KV_INTERNAL_CHECK_SRC(call->getSourceRef(), "KvCGenericFunctionCallGraph", 233);
    return false;
  }
  KvCFcgFunctionInfo* callingInfo = provideFcgNodeInfo(calling);
  KvCFcgFunctionInfo* calledInfo = provideFcgNodeInfo(called);
  if (!callingInfo || !calledInfo)
    return false;
  leda::edge e = nullptr;
  addEdge(callingInfo, calledInfo, e);
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

bool KvCGenericFunctionCallGraph::addEdge(KvCFcgFunctionInfo* calling, KvCFcgFunctionInfo* called,
                                          leda::edge& e) {
  registerNode(calling);
  registerNode(called);
  if (getEdge(calling, called, e)) {
    if (KvCFcgEdgeInfo* info = inf(e))
      info->incCardinality();
    return false;
  }
  const leda::node v = nodes[calling];
  const leda::node w = nodes[called];
  KvCFcgEdgeInfo* info = createFcgEdgeInfo();
  e = new_edge(v, w, info);
  edgeIndex[{v, w}] = e;
  if (info)
    info->incCardinality();
  return true;
}

void KvCGenericFunctionCallGraph::registerNode(KvCFcgFunctionInfo* function) {
  if (!function || nodes.defined(function))
    return;
  nodes[function] = new_node(function);
}

// --- lookups

bool KvCGenericFunctionCallGraph::getNode(KvCFcgFunctionInfo* function, leda::node& v) const {
  if (!function || !nodes.defined(function))
    return false;
  v = nodes[function];
  return true;
}

bool KvCGenericFunctionCallGraph::getEdge(KvCFcgFunctionInfo* calling, KvCFcgFunctionInfo* called,
                                          leda::edge& e) const {
  leda::node v = nullptr;
  leda::node w = nullptr;
  if (!getNode(calling, v) || !getNode(called, w))
    return false;
  auto it = edgeIndex.find({v, w});
  if (it == edgeIndex.end() || is_hidden(it->second))
    return false;
  e = it->second;
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

void KvCGenericFunctionCallGraph::deleteEdge(leda::edge e) {
  edgeIndex.erase({source(e), target(e)});
  deleteFcgEdgeInfo(inf(e));
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
    deleteEdge(e);
  edgeIndex.clear();
}

void KvCGenericFunctionCallGraph::deleteAllNodes() {
  for (leda::node v : all_nodes())
    deleteFcgNodeInfo(inf(v));
}

void KvCGenericFunctionCallGraph::clearNodeMap() { nodes.clear(); }

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

void KvCGenericFunctionCallGraph::synchronizeNodeInfoAtConstruction(KvCFcgFunctionInfo*,
                                                                    KvCParamSymbol*) {}

KvCFcgEdgeInfo* KvCGenericFunctionCallGraph::createFcgEdgeInfo() { return new KvCFcgEdgeInfo; }

void KvCGenericFunctionCallGraph::deleteFcgEdgeInfo(KvCFcgEdgeInfo* info) { delete info; }

void KvCGenericFunctionCallGraph::synchronizeEdgeInfoAtConstruction(KvCFcgEdgeInfo* info,
                                                                    KvCCallOperation* call) {
  if (info && call && call->isTaskActivation())
    info->setIsTaskCall(true);
}

// --- transitive callers

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
