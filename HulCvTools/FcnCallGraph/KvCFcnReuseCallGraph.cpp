#include "HulCvTools/FcnCallGraph/KvCFcnReuseCallGraph.h"

#include "HulCvTools/Control/KvCInternalCheck.h"
#include "HulCvTools/ModelInterfaces/ICodeModel.h"
#include "HulCvTools/ModelInterfaces/TransformModel.h"
#include "HulCvTools/ModelInterfaces/ViewModel.h"

#include <algorithm>
#include <new>

HULCV_DEFINE_HEAP_OPERATORS(KvCFcnReuseCallGraph)
HULCV_DEFINE_HEAP_OPERATORS(KvCFcnReuseCallGraph::BdVisitor)

namespace {

// Model objects the graph owns come from the memory controller like the library's own.
template <class T> T* createOwned() {
  void* place = hulcv_detail::allocObject(sizeof(T));
  return place ? ::new (place) T() : nullptr;
}

template <class T> void destroyOwned(T*& object) {
  if (!object)
    return;
  object->~T();
  hulcv_detail::freeObject(object);
  object = nullptr;
}

KvCIvPartitionDbEntry* entryOf(KV_BdPartition* partition) {
  KvCIvPdbEntryId* id = partition ? partition->getPdbEntryId() : nullptr;
  return id ? id->getPdbEntry() : nullptr;
}

KvCParamSymbol* symbolOf(KvCCodeBlockId* id) {
  KvCCodeBlock* block = id ? id->getCodeBlock() : nullptr;
  return block ? block->getSymbol() : nullptr;
}

} // namespace

// --- life

KvCFcnReuseCallGraph::BdVisitor::~BdVisitor() = default;

void KvCFcnReuseCallGraph::BdVisitor::visitPartition(KV_BdPartition* partition) {
  reuseGraph->visitPartition(partition);
}

KvCFcnReuseCallGraph::KvCFcnReuseCallGraph()
    : partitionIterator(createOwned<KvCPartitionIterator>()), partitionVisitor(new BdVisitor(this)),
      reuseTools(createOwned<KvCIvFcnReuseTools>()) {}

KvCFcnReuseCallGraph::~KvCFcnReuseCallGraph() {
  realCallGraph = nullptr;
  destroyOwned(partitionIterator);
  delete partitionVisitor;
  partitionVisitor = nullptr;
  destroyOwned(reuseTools);
}

bool KvCFcnReuseCallGraph::boot(KvCFunctionCallGraph* realGraph, KvCIvData* data) {
  realCallGraph = realGraph;
  ivData = data;
  return true;
}

bool KvCFcnReuseCallGraph::shutdown() {
  realCallGraph = nullptr;
  ivData = nullptr;
  deleteAllEdges();
  clear();
  clearNodeMap();
  return true;
}

// --- construction

bool KvCFcnReuseCallGraph::construct() {
  KvCMarkAtomicInlinedFunctions markAtomicInlined;
  deleteAllEdges();
  deleteAllNodes();
  KvCFunctionCallGraph* real = getRealCallGraph();
  if (!real || !ivData || !partitionIterator || !partitionVisitor || !reuseTools)
    return false;
  for (leda::node v : real->all_nodes())
    registerNode(real->inf(v));
  forall_FcgNodes(markAtomicInlined);
  iteratePartitions();
  return addAddToAddFcnCalls();
}

bool KvCFcnReuseCallGraph::iteratePartitions() {
  partitionIterator->iterHierarchyDepthFirst(ivData->getIvRootPartition(), partitionVisitor,
                                             nullptr, nullptr);
  return true;
}

void KvCFcnReuseCallGraph::visitPartition(KV_BdPartition* partition) {
  KvCPartitionControlFlow* flow = partition->getControlFlowObj();
  if (flow && flow->isExternPartition() && !flow->isTopmostExternPartition())
    return;
  const bool active = isPartitionActive(partition);
  if (!active)
    return; // neither calls into it nor its additional functions are entered
  if (!KvCIvAUTOSARTool::isRunnable(partition) && !KvCIvAUTOSARTool::isOperationCall(partition)) {
    PartitionList callers;
    PartitionList activeCallers;
    getCallersSkipCounterAlarmConsiderOsekEvents(partition, callers);
    for (KV_BdPartition* caller : callers) {
      getActivePartitions(caller, activeCallers);
      for (KV_BdPartition* calling : activeCallers)
        if (!calling->isRoot() && caller != partition)
          addCall(calling, partition);
    }
  }
  addStepFromToAddFcnCalls(partition);
}

// --- partitions

KV_BdPartition* KvCFcnReuseCallGraph::getMasterPartition(KV_BdPartition* partition) const {
  if (!reuseTools->getReusedPartition(partition))
    return partition;
  KV_BdBlock* master = reuseTools->getReusedMasterBlock(partition);
  KV_BdPartition* masterPartition = master ? master->getPartition() : nullptr;
  return masterPartition ? masterPartition : partition;
}

KvCFcgFunctionInfo* KvCFcnReuseCallGraph::infoOf(KvCParamSymbol* function) {
  return function ? provideFcgNodeInfo(function) : nullptr;
}

KvCParamSymbol* KvCFcnReuseCallGraph::getFcnSymbolFromPartition(KV_BdPartition* partition) {
  KvCIvPartitionDbEntry* entry = entryOf(getMasterPartition(partition));
  return entry ? symbolOf(entry->getStepFunction()) : nullptr;
}

bool KvCFcnReuseCallGraph::isPartitionActive(KV_BdPartition* partition) {
  KvCIvPartitionDbEntry* entry = entryOf(getMasterPartition(partition));
  KvCParamSymbol* step = getFcnSymbolFromPartition(partition);
  if (!entry || !step || entry->getStepFunction() != step->getCodeBlockId())
    return false;
  KvCFcgFunctionInfo* info = infoOf(step);
  if (!info)
    return false;
  if (!info->isInlined() && !info->isRemoved())
    return true;
  if (info->isInlinedAtomic() || step->isCalledBySimFrame())
    return true;
  KvCFcgFunctionInfo* restart = infoOf(symbolOf(entry->getRestartFunction()));
  return restart && !restart->isInlined() && !restart->isRemoved();
}

void KvCFcnReuseCallGraph::getCallersSkipCounterAlarmConsiderOsekEvents(KV_BdPartition* partition,
                                                                        PartitionList& callers) {
  callers.clear();
  KvCIvTools::getCallersSkipCounterAlarmConsiderOsekEvents(partition, callers);
}

void KvCFcnReuseCallGraph::getActivePartitions(KV_BdPartition* partition, PartitionList& result) {
  result.clear();
  std::vector<KV_BdPartition*> path;
  getActivePartitions_rec(partition, result, path);
}

void KvCFcnReuseCallGraph::getActivePartitions_rec(KV_BdPartition* partition, PartitionList& result,
                                                   std::vector<KV_BdPartition*>& path) {
  if (isPartitionActive(partition)) {
    result.append(partition);
    return;
  }
  // An inactive partition met again on the same path closes a cycle that adds nothing.
  if (std::find(path.begin(), path.end(), partition) != path.end())
    return;
  path.push_back(partition);
  PartitionList callers;
  getCallersSkipCounterAlarmConsiderOsekEvents(partition, callers);
  for (KV_BdPartition* caller : callers)
    getActivePartitions_rec(caller, result, path);
  path.pop_back();
}

// --- edges

bool KvCFcnReuseCallGraph::addCall(KV_BdPartition* calling, KV_BdPartition* called) {
  KvCParamSymbol* callingStep = getFcnSymbolFromPartition(calling);
  KvCParamSymbol* calledStep = getFcnSymbolFromPartition(called);
  if (!callingStep || !calledStep || callingStep == calledStep)
    return false;
  KvCIvPartitionDbEntry* callingEntry = entryOf(getMasterPartition(calling));
  KvCIvPartitionDbEntry* calledEntry = entryOf(getMasterPartition(called));
  KvCIvCallId* callingId = calling->getCallId();
  KvCIvCallId* calledId = called->getCallId();
  // One pair of partition functions, each with its instance for its partition's call id.
  auto join = [&](KvCCodeBlockId* from, KvCCodeBlockId* to) {
    KvCParamSymbol* fromSymbol = symbolOf(from);
    KvCParamSymbol* toSymbol = symbolOf(to);
    return fromSymbol && toSymbol &&
           addCall(infoOf(fromSymbol), getInstanceId(fromSymbol, callingId), infoOf(toSymbol),
                   getInstanceId(toSymbol, calledId));
  };
  if (!join(callingEntry->getStepFunction(), calledEntry->getStepFunction()))
    return false;
  if (infoOf(callingStep)->isInlinedAtomic() || infoOf(calledStep)->isInlinedAtomic())
    return true;
  if (!join(callingEntry->getInitFunction(), calledEntry->getInitFunction()))
    return false;
  if (callingEntry->getTermFunction() && calledEntry->getTermFunction() &&
      !join(callingEntry->getTermFunction(), calledEntry->getTermFunction()))
    return false;
  if (!callingEntry->getRestartFunction() || !calledEntry->getRestartFunction())
    return true;
  return join(callingEntry->getRestartFunction(), calledEntry->getRestartFunction());
}

bool KvCFcnReuseCallGraph::addCall(KvCFcgFunctionInfo* calling,
                                   KvCCbActualInterface* callingInstance,
                                   KvCFcgFunctionInfo* called,
                                   KvCCbActualInterface* calledInstance) {
  if (!calling || !called)
    return false;
  registerNode(calling);
  registerNode(called);
  auto isReusedInstance = [this](const KvCCbActualInterface* instance) {
    KvCIvCallId* id = instance ? instance->getCallId() : nullptr;
    KV_BdPartition* partition = id ? id->getPartition() : nullptr;
    return partition && reuseTools->getReusedMasterBlock(partition);
  };
  const bool forceNew = isReusedInstance(callingInstance) || isReusedInstance(calledInstance);
  leda::edge e = nullptr;
  if (!addEdge(calling, called, e, forceNew))
    return false;
  inf(e)->setCalledInstanceId(calledInstance);
  inf(e)->setCallingInstanceId(callingInstance);
  return true;
}

bool KvCFcnReuseCallGraph::addEdge(KvCFcgFunctionInfo* calling, KvCFcgFunctionInfo* called,
                                   leda::edge& e, bool forceNew) {
  e = nullptr;
  if (!calling || !called)
    return false;
  registerNode(calling);
  registerNode(called);
  leda::edge existing = nullptr;
  const bool found = getEdge(calling, called, existing);
  calling->addCalledFcn(called);
  if (found && !forceNew) {
    e = existing;
    return false;
  }
  return addNewEdge(calling, called, e);
}

bool KvCFcnReuseCallGraph::findEdge(KvCFcgFunctionInfo* calling,
                                    KvCCbActualInterface* callingInstance,
                                    KvCFcgFunctionInfo* called,
                                    KvCCbActualInterface* calledInstance, leda::edge& e) const {
  leda::node v = nullptr;
  leda::node w = nullptr;
  if (!getNode(calling, v) || !getNode(called, w))
    return false;
  for (leda::edge candidate : out_edges(v)) {
    const KvCFcgEdgeInfo* info = inf(candidate);
    if (target(candidate) == w && info && info->getCalledInstanceId() == calledInstance &&
        info->getCallingInstanceId() == callingInstance) {
      e = candidate;
      return true;
    }
  }
  return false;
}

// --- additional functions

bool KvCFcnReuseCallGraph::considerAdditionalFcn(const KvCParamSymbol* s) {
  if (!s)
    return false;
  return s->isAuxFunction() || (s->isRestartFunction() && !s->isPartitionRestartFunction()) ||
         (s->isStepFunction() && !s->isPartitionStepFunction()) ||
         (s->isInitFunction() && !s->isPartitionInitFunction()) ||
         (s->isTermFunction() && !s->isPartitionTermFunction()) || s->isRteApiFuncCall() ||
         s->isRteApiMacroCall();
}

KvCCbActualInterface* KvCFcnReuseCallGraph::getInstanceId(const KvCParamSymbol* function,
                                                          const KvCIvCallId* callId) {
  KvCCodeBlockId* id = function ? function->getCodeBlockId() : nullptr;
  KvCCodeBlock* block = id ? id->getCodeBlock() : nullptr;
  if (!block)
    return nullptr;
  if (callId)
    return block->getActualInterface(callId);
  if (block->getCallIds().size() != 1)
    return nullptr;
  return block->getActualInterface(block->getCallIds().front());
}

bool KvCFcnReuseCallGraph::addStepFromToAddFcnCalls(KV_BdPartition* partition) {
  if (!isPartitionActive(partition))
    return true;
  KvCIvPartitionDbEntry* entry = entryOf(getMasterPartition(partition));
  if (!entry)
    return true;
  bool result = true;
  for (KvCCodeBlockId* id : {entry->getStepFunction(), entry->getInitFunction(),
                             entry->getTermFunction(), entry->getRestartFunction()}) {
    KvCParamSymbol* function = symbolOf(id);
    if (!function)
      continue;
    const bool joined =
        addStepFromToAddFcnCall(infoOf(function), getInstanceId(function, partition->getCallId()));
    result = result && joined;
  }
  return result;
}

bool KvCFcnReuseCallGraph::addStepFromToAddFcnCall(KvCFcgFunctionInfo* info,
                                                   KvCCbActualInterface* instance) {
  KvCFunctionCallGraph* real = getRealCallGraph();
  leda::node v = nullptr;
  if (!info || !real->getNode(info, v))
    return true;
  for (leda::edge realEdge : real->in_edges(v)) {
    KvCFcgFunctionInfo* caller = real->inf(real->source(realEdge));
    KvCParamSymbol* symbol = caller ? caller->getSymbol() : nullptr;
    if (!considerAdditionalFcn(symbol))
      continue;
    KvCCbActualInterface* callerInstance = getInstanceId(symbol, nullptr);
    if (!addCall(caller, callerInstance, info, instance))
      return false;
    leda::edge made = nullptr;
    if (findEdge(caller, callerInstance, info, instance, made) && real->inf(realEdge))
      inf(made)->setCardinality(real->inf(realEdge)->getCardinality());
  }
  for (leda::edge realEdge : real->out_edges(v)) {
    KvCFcgFunctionInfo* callee = real->inf(real->target(realEdge));
    KvCParamSymbol* symbol = callee ? callee->getSymbol() : nullptr;
    if (!considerAdditionalFcn(symbol))
      continue;
    KvCCbActualInterface* calleeInstance = getInstanceId(symbol, nullptr);
    if (!addCall(info, instance, callee, calleeInstance))
      return false;
    leda::edge made = nullptr;
    if (findEdge(info, instance, callee, calleeInstance, made) && real->inf(realEdge))
      inf(made)->setCardinality(real->inf(realEdge)->getCardinality());
  }
  return true;
}

bool KvCFcnReuseCallGraph::addAddToAddFcnCalls() {
  KvCFunctionCallGraph* real = getRealCallGraph();
  for (leda::node v : real->all_nodes()) {
    KvCFcgFunctionInfo* info = real->inf(v);
    KvCParamSymbol* symbol = info ? info->getSymbol() : nullptr;
    if (!considerAdditionalFcn(symbol))
      continue;
    for (leda::edge realEdge : real->in_edges(v)) {
      KvCFcgFunctionInfo* caller = real->inf(real->source(realEdge));
      KvCParamSymbol* callerSymbol = caller ? caller->getSymbol() : nullptr;
      if (!considerAdditionalFcn(callerSymbol))
        continue;
      leda::edge new_edge = nullptr; // NOLINT(readability-identifier-naming): checked by name
      addEdge(caller, info, new_edge, false);
      KV_DEBUG_ASSERT(new_edge != 0); // NOLINT(modernize-use-nullptr): the reported text
      if (!new_edge)
        continue;
      KvCFcgEdgeInfo* edgeInfo = inf(new_edge);
      if (real->inf(realEdge))
        edgeInfo->setCardinality(real->inf(realEdge)->getCardinality());
      edgeInfo->setCalledInstanceId(getInstanceId(symbol, nullptr));
      edgeInfo->setCallingInstanceId(getInstanceId(callerSymbol, nullptr));
    }
  }
  return true;
}
