#include "HulCvTools/FcnCallGraph/KvCGenericFunctionCallGraph.h"

#include "HulCvTools/Control/KvCInternalCheck.h"
#include "HulCvTools/Control/KvCObjectPool.h"
#include "HulCvTools/FcnCallGraph/KvCFcgQuery.h"
#include "HulCvTools/FcnCallGraph/KvCFcnSmbVisitor.h"
#include "HulCvTools/FcnCallGraph/KvCFunctionCallGraph.h"
#include "HulCvTools/ModelInterfaces/ICodeModel.h"
#include "platform/support/KvCPrefetch.h"

#include <algorithm>
#include <cassert>
#include <cstdint>
#include <typeinfo>
#include <utility>

// The graph type every call graph of the library derives from, instantiated and exported
// here once.
template class leda::GRAPH<KvCFcgFunctionInfo*, KvCFcgEdgeInfo*>;

int KvCFcgEdgeInfo::s_DebugIndex = 0;
HULCV_DEFINE_HEAP_OPERATORS(KvCFcgEdgeInfo)
void* KvCFcgEdgeInfo::operator new(std::size_t size, KvCObjectPool& pool) noexcept {
  return pool.allocate(size);
}
void KvCFcgEdgeInfo::operator delete(void* object, KvCObjectPool& /*pool*/) noexcept {
  hulcv_detail::freeObject(object);
}

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

// The index from (calling node, called node) to the pair's edges: open addressing with
// linear probing over a flat table, deletion by backward shift. A pair may appear more
// than once (see the class comment). Expected O(1) per operation.
class KvCFcgEdgeIndex {
public:
  explicit KvCFcgEdgeIndex(const KvCFcgGraph& g) : graph(g) {}

  void insert(leda::node v, leda::node w, leda::edge e) {
    if ((count + 1) * 4 > slots.size() * 3)
      grow();
    std::size_t i = home(v, w);
    while (slots[i].e)
      i = next(i);
    slots[i] = Slot{v, w, e};
    ++count;
  }

  // The first visible edge of the pair in creation order, or null.
  leda::edge find(leda::node v, leda::node w) const {
    if (slots.empty())
      return nullptr;
    leda::edge best = nullptr;
    for (std::size_t i = home(v, w); slots[i].e; i = next(i)) {
      const Slot& s = slots[i];
      if (s.v != v || s.w != w || graph.is_hidden(s.e))
        continue;
      if (!best || graph.index(s.e) < graph.index(best))
        best = s.e;
    }
    return best;
  }

  void erase(leda::node v, leda::node w, leda::edge e) {
    if (slots.empty())
      return;
    std::size_t i = home(v, w);
    while (slots[i].e && slots[i].e != e)
      i = next(i);
    if (!slots[i].e)
      return;
    // Backward shift: move later entries of the probe run into the gap when their home
    // lies at or before it.
    std::size_t gap = i;
    for (std::size_t j = next(gap); slots[j].e; j = next(j)) {
      const std::size_t h = home(slots[j].v, slots[j].w);
      const bool movable = gap <= j ? (h <= gap || h > j) : (h <= gap && h > j);
      if (movable) {
        slots[gap] = slots[j];
        gap = j;
      }
    }
    slots[gap] = Slot{};
    --count;
  }

  // Empties the index; the table's memory is kept for the next fill.
  void clear() {
    slots.clear();
    count = 0;
  }

  // Refills the index with every edge of the graph, hidden ones included. The entries go
  // in in the order of their home slots (a counting sort by the slots' high bits), so the
  // table is written front to back instead of at random: O(edges), cache friendly.
  void rebuild() {
    clear();
    const auto edges = static_cast<std::size_t>(graph.number_of_all_edges());
    std::size_t size = 64;
    while ((edges + 1) * 4 > size * 3)
      size *= 2;
    slots.assign(size, Slot{});
    // Buckets of about 16 slots each.
    const std::size_t buckets = std::max<std::size_t>(size / 16, 1);
    const std::size_t shift = static_cast<std::size_t>(__builtin_ctzll(size / buckets));
    std::vector<std::uint32_t> start(buckets + 1, 0);
    pending.resize(edges);
    std::size_t k = 0;
    for (leda::edge e : graph.all_edges()) {
      const leda::node v = graph.source(e);
      const leda::node w = graph.target(e);
      const auto h = static_cast<std::uint32_t>(home(v, w));
      assert(k < edges && "the graph counts every edge it lists");
      pending[k++] = Pending{h, Slot{v, w, e}};
      ++start[(h >> shift) + 1];
    }
    for (std::size_t b = 1; b <= buckets; ++b)
      start[b] += start[b - 1];
    sorted.resize(edges);
    for (const Pending& p : pending)
      sorted[start[p.home >> shift]++] = p;
    for (const Pending& p : sorted) {
      std::size_t i = p.home;
      while (slots[i].e)
        i = next(i);
      slots[i] = p.slot;
    }
    count = edges;
    pending.clear();
    sorted.clear();
  }

private:
  struct Slot {
    leda::node v = nullptr;
    leda::node w = nullptr;
    leda::edge e = nullptr;
  };

  std::size_t home(leda::node v, leda::node w) const {
    const auto a = reinterpret_cast<std::uintptr_t>(v);
    const auto b = reinterpret_cast<std::uintptr_t>(w);
    std::uint64_t h = (a * 0x9e3779b97f4a7c15ULL) ^ (b + 0x632be59bd9b4e019ULL + (a >> 7));
    h ^= h >> 29;
    h *= 0xbf58476d1ce4e5b9ULL;
    h ^= h >> 32;
    return static_cast<std::size_t>(h) & (slots.size() - 1);
  }
  std::size_t next(std::size_t i) const { return (i + 1) & (slots.size() - 1); }

  void grow() {
    std::vector<Slot> old = std::move(slots);
    slots.assign(old.empty() ? 64 : old.size() * 2, Slot{});
    count = 0;
    for (const Slot& s : old)
      if (s.e)
        insert(s.v, s.w, s.e);
  }

  struct Pending {
    std::uint32_t home;
    Slot slot;
  };

  const KvCFcgGraph& graph;
  std::vector<Slot> slots;
  std::size_t count = 0;
  // Scratch of rebuild, kept for the next one.
  std::vector<Pending> pending;
  std::vector<Pending> sorted;
};

KvCGenericFunctionCallGraph::KvCGenericFunctionCallGraph()
    : edgeIndex(std::make_unique<KvCFcgEdgeIndex>(*this)),
      edgeInfoPool(std::make_unique<KvCObjectPool>(sizeof(KvCFcgEdgeInfo))) {}

KvCGenericFunctionCallGraph::~KvCGenericFunctionCallGraph() { deleteAllEdges(); }

// --- construction

namespace {

// Collects, in symbol database order, the function and macro symbols that construction
// visits, skipping the first `skip` entries (those collected already).
class KvCFcnSmbCollector : public KV_SmbDBObjVisitor {
public:
  KvCFcnSmbCollector(std::vector<KvCParamSymbol*>& out, std::size_t skip, bool visitAll)
      : functions(out), toSkip(skip), visitAllSymbols(visitAll) {}

  void visitParamSmbDBObj(KV_ParamSmbDBObj* entry) override {
    if (!entry || visited++ < toSkip)
      return;
    if (!visitAllSymbols && !(entry->getSymbol() && entry->getSymbol()->isSelected()))
      return;
    if (KvCParamSymbol* function = entry->getParamSymbol())
      functions.push_back(function);
  }

  std::size_t visited = 0;

private:
  std::vector<KvCParamSymbol*>& functions;
  std::size_t toSkip;
  bool visitAllSymbols;
};

} // namespace

bool KvCGenericFunctionCallGraph::construct(bool onlySelected) {
  incomplete = false;
  restore_all_edges();
  deleteAllEdges();
  KvCCodeViewData* data = KvCCodeViewData::getCurrent();
  // The library's own graphs keep the base's hooks. Their edge hook's whole work (the
  // task mark) construction does itself from what it read with the rest of the call.
  plainEdgeHook = typeid(*this) == typeid(KvCGenericFunctionCallGraph) ||
                  typeid(*this) == typeid(KvCFunctionCallGraph);
  // Their node info hook only empties the info's set of call operations: that is done
  // when the run first adds to the set (the info is fetched then anyway), or at its end.
  clearSetsLazily = plainEdgeHook && data != nullptr;
  if (clearSetsLazily) {
    setCleared.assign(static_cast<std::size_t>(max_node_index() + 1), 0);
    setsLeft = setCleared.size();
  } else {
    deleteAllNodes();
  }
  if (!KV_VERIFY(data != nullptr, "KvCGenericFunctionCallGraph", __LINE__)) {
    incomplete = true;
    return false;
  }
  // The symbols are listed first and then treated in that order, the uses of all of them
  // in one sequence, so that prefetching runs ahead across symbol boundaries (a scheduler's
  // callees have one use each). Symbols made while treating are listed by a further walk.
  // Debug indices beyond a few times the number of symbols are looked up in the map.
  // The slots are kept from run to run for the nodes they name (a reconstruction finds
  // each function's node there instead of in the node map); a slot names a symbol and
  // its info only for the run that entered it.
  const std::size_t slotCount =
      static_cast<std::size_t>(data->getSymbolDB()->getNumberOfSymbols()) * 2 + 1024;
  if (++constructRun == 0) {
    functionSlots.clear();
    constructRun = 1;
  }
  if (functionSlots.size() < slotCount)
    functionSlots.resize(slotCount);
  // Edges are found through the group table while the run lasts; the edge index is filled
  // once at its end.
  edgeIndexCurrent = false;
  constructing = true;
  // The base's hooks do not look at the graph, so new edges join their calling
  // functions' out-edges at the end of the run, calling function by calling function.
  deferOutLinks = plainEdgeHook;
  std::size_t listed = 0;
  for (;;) {
    std::vector<KvCParamSymbol*> functions;
    KvCFcnSmbCollector collector(functions, listed, !onlySelected);
    data->getSymbolDB()->forallParametrizedSymbols(&collector);
    if (collector.visited <= listed)
      break;
    listed = collector.visited;
    treatFcnSymbols(functions);
  }
  flushGroupCalls();
  clearCallOperationsLeft();
  linkPendingOutEdges();
  deferOutLinks = false;
  constructing = false;
  groupNode = nullptr;
  groupInfo = nullptr;
  addDeferredCalledFcns();
  ensureEdgeIndex();
  // The per-use scratch is as large as the uses; it is not kept between runs.
  useRecords = std::vector<UseRecord>();
  useOrder = std::vector<SortedUse>();
  pendingOut = std::vector<PendingOut>();
  return !incomplete;
}

void KvCGenericFunctionCallGraph::treatFcnSymbols(const std::vector<KvCParamSymbol*>& functions) {
  // All uses, each symbol's in ascending serial order, and where each symbol's start.
  useBuffer.clear();
  std::vector<std::size_t> starts;
  starts.reserve(functions.size() + 1);
  const std::size_t count = functions.size();
  listedIndices.clear();
  for (std::size_t f = 0; f < count; ++f) {
    // The symbols lie scattered: kSymbolAhead places ahead the first and last line of each
    // (debug index, info), then its database's use lists, its uses and its function slot
    // (or node map entry) at shorter distances.
    constexpr std::size_t kSymbolAhead = 24;
    if (f + kSymbolAhead < count) {
      const char* symbol = reinterpret_cast<const char*>(functions[f + kSymbolAhead]);
      KvCPrefetch::read(symbol);
      KvCPrefetch::read(symbol + sizeof(KvCParamSymbol) - 1);
    }
    if (f + 16 < count)
      functions[f + 16]->getExprLocDB()->prefetchUseRecords();
    if (f + 8 < count) {
      functions[f + 8]->getExprLocDB()->prefetchUses();
      prefetchFunctionSlot(functions[f + 8]);
    }
    // The node map only for functions whose slot does not name their node yet.
    if (f + 4 < count && !slotNamesNode(functions[f + 4])) {
      nodes.prefetch_slot(functions[f + 4]->getFunctionInfo());
      nodes.prefetch_entry(functions[f + 4]->getFunctionInfo());
    }
    starts.push_back(useBuffer.size());
    functions[f]->getExprLocDB()->listUses(listedUses);
    useBuffer.insert(useBuffer.end(), listedUses.begin(), listedUses.end());
    listedIndices.push_back(enterFunctionSlot(functions[f]));
  }
  starts.push_back(useBuffer.size());
  resolveUses();

  // The records are carried out in batches small enough to stay in the cache.
  constexpr std::size_t kBatch = 2048;
  steps.clear();
  for (std::size_t f = 0; f < count; ++f) {
    KvCParamSymbol* function = functions[f];
    const int index = listedIndices[f];
    const FunctionSlot* slot = slotOf(function, index);
    KvCFcgFunctionInfo* info = slot ? slot->info : provideFcgNodeInfo(function);
    if (!info)
      continue;
    steps.push_back(Step{.kind = Step::kNode,
                         .callingIndex = index,
                         .groupUses = starts[f + 1] - starts[f],
                         .calling = info,
                         .function = function});
    for (std::size_t u = starts[f]; u < starts[f + 1]; ++u)
      pushStep(useRecords[u], function, info, index);
    if (steps.size() >= kBatch)
      replaySteps();
  }
  replaySteps();
}

void KvCGenericFunctionCallGraph::pushStep(const UseRecord& record, KvCParamSymbol* function,
                                           KvCFcgFunctionInfo* info, int index) {
  switch (record.kind) {
  case Step::kIncomplete:
    steps.push_back(Step{.kind = Step::kIncomplete});
    return;
  case Step::kCall:
    steps.push_back(Step{.kind = Step::kCall, .call = record.call});
    return;
  case Step::kEdge:
    break;
  default:
    return;
  }
  // Almost always the called function is the symbol whose uses these are.
  const bool visited = record.calledSymbol == function;
  KvCFcgFunctionInfo* called = visited ? info : provideFcgNodeInfo(record.calledSymbol);
  if (!called) {
    steps.push_back(Step{.kind = Step::kCall, .call = record.call});
    return;
  }
  steps.push_back(Step{.kind = Step::kEdge,
                       .selfCall = record.selfCall,
                       .taskCall = record.taskCall,
                       .ownCall = visited,
                       .callingIndex = record.callingIndex,
                       .calledIndex = visited ? index : record.calledSymbol->getDebugIndex(),
                       .serial = record.serial,
                       .calling = record.calling,
                       .called = called,
                       .call = record.call,
                       .v = record.v});
}

void KvCGenericFunctionCallGraph::sortUsesByAddress() {
  // A counting sort by address range (about four uses per range): the uses of one range
  // lie within a few pages of each other.
  const std::size_t n = useBuffer.size();
  std::uintptr_t low = UINTPTR_MAX;
  std::uintptr_t high = 0;
  for (KV_ExprLocation* use : useBuffer) {
    const auto a = reinterpret_cast<std::uintptr_t>(use);
    low = std::min(low, a);
    high = std::max(high, a);
  }
  const std::size_t ranges = std::clamp<std::size_t>(n / 4, 1, std::size_t{1} << 20);
  unsigned shift = 0;
  while (((high - low) >> shift) >= ranges)
    ++shift;
  const std::size_t buckets = static_cast<std::size_t>((high - low) >> shift) + 1;
  useRangeStart.assign(buckets + 1, 0);
  for (KV_ExprLocation* use : useBuffer)
    ++useRangeStart[((reinterpret_cast<std::uintptr_t>(use) - low) >> shift) + 1];
  for (std::size_t b = 1; b <= buckets; ++b)
    useRangeStart[b] += useRangeStart[b - 1];
  useOrder.resize(n);
  for (std::size_t i = 0; i < n; ++i) {
    const std::uintptr_t a = reinterpret_cast<std::uintptr_t>(useBuffer[i]) - low;
    useOrder[useRangeStart[a >> shift]++] = SortedUse{useBuffer[i], static_cast<std::uint32_t>(i)};
  }
}

void KvCGenericFunctionCallGraph::resolveUses() {
  // What each use asks for, as enterUse and addCall decide, read from the model in the
  // order the uses lie in memory: uses that lie together (the calls of one body) are read
  // together, and the calling function changes only from body to body.
  const std::size_t n = useBuffer.size();
  useRecords.resize(n);
  if (n == 0)
    return;
  sortUsesByAddress();
  constexpr std::size_t kFar = 16;
  constexpr std::size_t kNear = 8;
  KvCParamSymbol* lastCalling = nullptr;
  KvCFcgFunctionInfo* callingInfo = nullptr;
  int callingIndex = -1;
  leda::node callingNode = nullptr;
  for (std::size_t k = 0; k < n; ++k) {
    if (k + kFar < n)
      KvCPrefetch::read(useOrder[k + kFar].use);
    if (k + kNear < n) {
      const KV_ExprLocation* ahead = useOrder[k + kNear].use;
      KvCPrefetch::read(ahead->getExpression());
      // The call: all of its lines (serial, called, task and calling function are spread).
      const char* parent = reinterpret_cast<const char*>(ahead->getParent());
      KvCPrefetch::read(parent);
      KvCPrefetch::read(parent + 64);
      KvCPrefetch::read(parent + 128);
    }
    UseRecord& record = useRecords[useOrder[k].index];
    KV_Operation* op = useOrder[k].use->getOperation();
    if (!op) {
      record = UseRecord{.kind = Step::kIncomplete};
      continue;
    }
    KV_Operation* above = op->getParentOperation();
    KvCCallOperation* call = above ? above->asCallOperation() : nullptr;
    if (!call) {
      record = UseRecord{};
      continue;
    }
    KvCParamSymbol* calling = call->getCallingSymbol();
    KvCParamSymbol* called = call->getCalledSymbol();
    if (calling && calling != lastCalling) {
      lastCalling = calling;
      callingIndex = calling->getDebugIndex();
      if (const FunctionSlot* slot = slotOf(calling, callingIndex)) {
        callingInfo = slot->info;
        callingNode = slot->node;
      } else {
        callingInfo = provideFcgNodeInfo(calling);
        callingNode = callingInfo ? existingNodeOf(callingInfo, callingIndex) : nullptr;
      }
    }
    if (!calling || !called || !callingInfo) {
      record = UseRecord{.kind = Step::kCall, .call = call};
      continue;
    }
    record = UseRecord{.kind = Step::kEdge,
                       .selfCall = calling == called,
                       .taskCall = call->isTaskActivation(),
                       .callingIndex = callingIndex,
                       .serial = call->getSerial(),
                       .call = call,
                       .calling = callingInfo,
                       .calledSymbol = called,
                       .v = callingNode};
  }
}

int KvCGenericFunctionCallGraph::enterFunctionSlot(KvCParamSymbol* function) {
  const int index = function->getDebugIndex();
  const auto slot = static_cast<std::size_t>(index);
  if (index < 0 || slot >= functionSlots.size())
    return index;
  KvCFcgFunctionInfo* info = provideFcgNodeInfo(function);
  FunctionSlot& entry = functionSlots[slot];
  // The node an earlier run found for the same info is still its node.
  const leda::node known = entry.info == info ? entry.node : nullptr;
  entry = FunctionSlot{function, info, known, constructRun};
  if (info && !known)
    existingNodeOf(info, index); // looks the node up and keeps it in the slot
  return index;
}

void KvCGenericFunctionCallGraph::prefetchFunctionSlot(const KvCParamSymbol* function) const {
  const auto at = static_cast<std::size_t>(function->getDebugIndex());
  if (at < functionSlots.size())
    KvCPrefetch::read(&functionSlots[at]);
}

bool KvCGenericFunctionCallGraph::slotNamesNode(KvCParamSymbol* function) const {
  const auto at = static_cast<std::size_t>(function->getDebugIndex());
  return at < functionSlots.size() && functionSlots[at].node &&
         functionSlots[at].info == function->getFunctionInfo();
}

const KvCGenericFunctionCallGraph::FunctionSlot*
KvCGenericFunctionCallGraph::slotOf(const KvCParamSymbol* function, int index) const {
  const auto slot = static_cast<std::size_t>(index);
  if (index < 0 || slot >= functionSlots.size() || functionSlots[slot].symbol != function ||
      functionSlots[slot].run != constructRun)
    return nullptr;
  return &functionSlots[slot];
}

KvCGenericFunctionCallGraph::FunctionSlot*
KvCGenericFunctionCallGraph::slotOfInfo(KvCFcgFunctionInfo* function, int index) {
  const auto at = static_cast<std::size_t>(index);
  if (index < 0 || at >= functionSlots.size() || functionSlots[at].info != function)
    return nullptr;
  return &functionSlots[at];
}

leda::node KvCGenericFunctionCallGraph::existingNodeOf(KvCFcgFunctionInfo* function, int index) {
  FunctionSlot* slot = slotOfInfo(function, index);
  if (slot && slot->node)
    return slot->node;
  // One probe: an undefined key reads as a null node.
  const leda::node v = std::as_const(nodes)[function];
  if (slot)
    slot->node = v;
  return v;
}

void KvCGenericFunctionCallGraph::replaySteps() {
  // Two passes over the batch, each with its own prefetch distances: first the nodes
  // (registered in the order addEdge would register them, node hooks in order), then the
  // edges and calls in order. A pass reads, kFar records ahead, what the record needs
  // first and, kNear records ahead, what that brought in points to.
  constexpr std::size_t kFar = 16;
  constexpr std::size_t kNear = 8;
  const std::size_t n = steps.size();
  for (std::size_t i = 0; i < n; ++i) {
    if (i + kFar < n)
      prefetchNodes(steps[i + kFar], false);
    if (i + kNear < n)
      prefetchNodes(steps[i + kNear], true);
    Step& step = steps[i];
    if (step.kind == Step::kNode) {
      step.v = cachedNodeOf(step.calling, step.callingIndex);
      synchronizeNodeInfoAtConstruction(step.calling, step.function);
    } else if (step.kind == Step::kEdge) {
      if (!step.v)
        step.v = cachedNodeOf(step.calling, step.callingIndex);
      step.w = cachedNodeOf(step.called, step.calledIndex);
    }
  }
  for (std::size_t i = 0; i < n; ++i) {
    if (i + kFar < n)
      prefetchEdge(steps[i + kFar], false);
    if (i + kNear < n)
      prefetchEdge(steps[i + kNear], true);
    const Step& step = steps[i];
    switch (step.kind) {
    case Step::kNode:
      beginGroup(step);
      break;
    case Step::kIncomplete:
      incomplete = true;
      break;
    case Step::kEdge:
      enterEdge(step);
      break;
    case Step::kCall:
      // addCall may add to any set.
      clearCallOperationsLeft();
      addCall(step.call);
      break;
    default:
      break;
    }
  }
  steps.clear();
}

leda::node KvCGenericFunctionCallGraph::cachedNodeOf(KvCFcgFunctionInfo* function, int index) {
  FunctionSlot* slot = slotOfInfo(function, index);
  if (slot && slot->node)
    return slot->node;
  const leda::node v = nodeOf(function);
  if (slot)
    slot->node = v;
  return v;
}

void KvCGenericFunctionCallGraph::prefetchNodes(const Step& step, bool near) const {
  if (step.kind != Step::kNode && step.kind != Step::kEdge)
    return;
  const int indices[2] = {step.v ? -1 : step.callingIndex,
                          step.kind == Step::kEdge ? step.calledIndex : -1};
  for (int index : indices) {
    const auto slot = static_cast<std::size_t>(index);
    if (!near && index >= 0 && slot < functionSlots.size())
      KvCPrefetch::read(&functionSlots[slot]);
  }
  if (step.kind != Step::kNode)
    return;
  // A function's first record: for the node hook its info, its symbol and the symbol's
  // body (the node is in the function's slot).
  if (!near) {
    KvCPrefetch::readAll(step.calling, sizeof(KvCFcgFunctionInfo));
    KvCPrefetch::read(step.function);
  } else {
    KvCPrefetch::read(step.function->getBodySTT());
  }
}

void KvCGenericFunctionCallGraph::prefetchEdge(const Step& step, bool near) const {
  if (step.kind == Step::kNode) {
    // The group's node (its in-edges) and its info's set of call operations.
    if (!near)
      prefetch_node(step.v);
    else
      step.calling->getCallOperationsSet().prefetch();
    return;
  }
  if (step.kind != Step::kEdge)
    return;
  if (!near) {
    if (!deferOutLinks)
      prefetch_node(step.v);
    if (!plainEdgeHook || !step.ownCall)
      KvCPrefetch::read(step.call);
    return;
  }
  if (!deferOutLinks)
    prefetch_out_end(step.v);
}

void KvCGenericFunctionCallGraph::enterEdge(const Step& step) {
  // addCall once both infos are known.
  leda::edge e = findConstructedEdge(step.v, step.w);
  if (e) {
    if (KvCFcgEdgeInfo* info = inf(e))
      info->incCardinality();
  } else {
    e = linkNewEdge(step.v, step.w);
  }
  if (!plainEdgeHook)
    synchronizeEdgeInfoAtConstruction(inf(e), step.call);
  else if (step.taskCall && inf(e))
    inf(e)->setIsTaskCall(true);
  // The group's calls go to its function's set together, from the serials read before.
  if (step.ownCall && step.called == groupInfo) {
    groupCalls.push_back(step.call);
    groupSerials.push_back(step.serial);
  } else {
    clearCallOperationsOnce(step.w, step.called);
    step.called->addCallOperation(step.call);
  }
  if (!step.selfCall) {
    const bool own = step.ownCall && step.called == groupInfo;
    const KvCFcgCalledFunction called =
        own ? KvCFcgCalledFunction{groupCalledIndex, groupCalledSymbol}
            : step.called->asCalledFunction();
    deferredCalled.push_back(DeferredCalled{callerKey(step.callingIndex), called.debugIndex,
                                            step.calling, called.symbol});
  }
}

// --- edges while constructing

void KvCGenericFunctionCallGraph::flushGroupCalls() {
  if (groupInfo && !groupCalls.empty())
    groupInfo->addCallOperations(groupCalls.data(), groupSerials.data(), groupCalls.size());
  groupCalls.clear();
  groupSerials.clear();
}

void KvCGenericFunctionCallGraph::beginGroup(const Step& step) {
  const leda::node w = step.v;
  KvCFcgFunctionInfo* info = step.calling;
  const std::size_t uses = step.groupUses;
  // The table holds every edge into w: those made before (by calls that reached w through
  // another symbol's uses) are entered now, those made during the group as they are made.
  flushGroupCalls();
  if (info)
    clearCallOperationsOnce(w, info);
  groupInfo = info;
  // The info's own symbol is almost always the step's function, whose index is known.
  groupCalledSymbol = info ? info->getSymbol() : nullptr;
  groupCalledIndex = groupCalledSymbol == step.function ? step.callingIndex
                     : groupCalledSymbol                ? groupCalledSymbol->getDebugIndex()
                                                        : 0;
  groupNode = w;
  const std::size_t expected = uses + static_cast<std::size_t>(indeg(w));
  std::size_t size = 8;
  while (size < expected * 2 + 2)
    size *= 2;
  groupSlots.assign(size, GroupSlot{});
  groupCount = 0;
  for (leda::edge e : in_edges(w))
    if (!groupFind(source(e)))
      groupInsert(source(e), e);
}

std::size_t KvCGenericFunctionCallGraph::groupHome(leda::node v) const {
  const auto a = reinterpret_cast<std::uintptr_t>(v);
  return static_cast<std::size_t>(((a >> 4) * 0x9e3779b97f4a7c15ULL) >> 20) &
         (groupSlots.size() - 1);
}

leda::edge KvCGenericFunctionCallGraph::groupFind(leda::node v) const {
  for (std::size_t i = groupHome(v);; i = (i + 1) & (groupSlots.size() - 1)) {
    const GroupSlot& s = groupSlots[i];
    if (!s.v || s.v == v)
      return s.e;
  }
}

void KvCGenericFunctionCallGraph::groupInsert(leda::node v, leda::edge e) {
  if ((groupCount + 1) * 2 > groupSlots.size()) {
    std::vector<GroupSlot> old = std::move(groupSlots);
    groupSlots.assign(old.size() * 2, GroupSlot{});
    groupCount = 0;
    for (const GroupSlot& s : old)
      if (s.v)
        groupInsert(s.v, s.e);
  }
  std::size_t i = groupHome(v);
  while (groupSlots[i].v)
    i = (i + 1) & (groupSlots.size() - 1);
  groupSlots[i] = GroupSlot{v, e};
  ++groupCount;
}

leda::edge KvCGenericFunctionCallGraph::findConstructedEdge(leda::node v, leda::node w) {
  if (w == groupNode)
    return groupFind(v);
  if (edgeIndexCurrent)
    return edgeIndex->find(v, w);
  // A call reached through another symbol's uses (a function passed as an argument): the
  // shorter of the two edge lists is scanned (only the in-edges while out-edge links wait
  // for the end of the run); beyond a few edges the index is filled.
  constexpr int kScanLimit = 32;
  const bool scanOut = !deferOutLinks && outdeg(v) <= indeg(w);
  if ((scanOut ? outdeg(v) : indeg(w)) > kScanLimit) {
    ensureEdgeIndex();
    return edgeIndex->find(v, w);
  }
  if (scanOut) {
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

leda::edge KvCGenericFunctionCallGraph::linkNewEdge(leda::node v, leda::node w) {
  KvCFcgEdgeInfo* info = createFcgEdgeInfo();
  const leda::edge e = deferOutLinks ? new_edge_out_later(v, w, info) : new_edge(v, w, info);
  if (deferOutLinks)
    pendingOut.push_back(PendingOut{v, e});
  if (edgeIndexCurrent)
    edgeIndex->insert(v, w, e);
  if (constructing && w == groupNode)
    groupInsert(v, e);
  if (info)
    info->incCardinality();
  return e;
}

int KvCGenericFunctionCallGraph::callerKey(int callingIndex) const {
  const auto slot = static_cast<std::size_t>(callingIndex);
  return callingIndex >= 0 && slot < functionSlots.size() ? callingIndex
                                                          : static_cast<int>(functionSlots.size());
}

void KvCGenericFunctionCallGraph::linkPendingOutEdges() {
  // A stable radix sort by calling node address keeps each node's new edges in creation
  // order; the nodes are then visited in address order, each once.
  const std::size_t n = pendingOut.size();
  if (n == 0)
    return;
  std::uintptr_t low = UINTPTR_MAX;
  std::uintptr_t high = 0;
  for (const PendingOut& p : pendingOut) {
    low = std::min(low, reinterpret_cast<std::uintptr_t>(p.v));
    high = std::max(high, reinterpret_cast<std::uintptr_t>(p.v));
  }
  constexpr unsigned kDigitBits = 11;
  constexpr std::size_t kDigits = std::size_t{1} << kDigitBits;
  std::vector<PendingOut> other(n);
  std::vector<std::size_t> start(kDigits + 1);
  for (unsigned shift = 0; shift < 64 && ((high - low) >> shift) != 0; shift += kDigitBits) {
    std::fill(start.begin(), start.end(), 0);
    auto digit = [&](const PendingOut& p) {
      return static_cast<std::size_t>(((reinterpret_cast<std::uintptr_t>(p.v) - low) >> shift) &
                                      (kDigits - 1));
    };
    for (const PendingOut& p : pendingOut)
      ++start[digit(p) + 1];
    for (std::size_t d = 1; d <= kDigits; ++d)
      start[d] += start[d - 1];
    for (const PendingOut& p : pendingOut)
      other[start[digit(p)]++] = p;
    pendingOut.swap(other);
  }
  std::vector<leda::edge> edges(n);
  for (std::size_t i = 0; i < n; ++i)
    edges[i] = pendingOut[i].e;
  pendingOut.clear();
  link_out_edges(edges.data(), n);
}

void KvCGenericFunctionCallGraph::ensureEdgeIndex() const {
  if (edgeIndexCurrent)
    return;
  edgeIndex->rebuild();
  edgeIndexCurrent = true;
}

void KvCGenericFunctionCallGraph::addDeferredCalledFcns() {
  // A counting sort by calling function keeps each one's entries in the order they were
  // met; every set is then loaded once.
  const std::size_t buckets = functionSlots.size() + 1;
  std::vector<std::size_t> start(buckets + 1, 0);
  for (const DeferredCalled& d : deferredCalled)
    ++start[static_cast<std::size_t>(d.callingKey) + 1];
  for (std::size_t b = 1; b <= buckets; ++b)
    start[b] += start[b - 1];
  deferredByCaller.resize(deferredCalled.size());
  for (const DeferredCalled& d : deferredCalled)
    deferredByCaller[start[static_cast<std::size_t>(d.callingKey)]++] = d;
  deferredCalled.clear();
  constexpr std::size_t kAhead = 8;
  const std::size_t n = deferredByCaller.size();
  for (std::size_t i = 0; i < n; ++i) {
    if (i + kAhead < n)
      KvCPrefetch::readAll(deferredByCaller[i + kAhead].calling, sizeof(KvCFcgFunctionInfo));
    if (i + kAhead / 2 < n)
      deferredByCaller[i + kAhead / 2].calling->getCalledFunctionsSet().prefetch();
    const DeferredCalled& d = deferredByCaller[i];
    d.calling->addCalledFcn(KvCFcgCalledFunction{d.calledDebugIndex, d.calledSymbol});
  }
  deferredByCaller.clear();
}

void KvCGenericFunctionCallGraph::treatFcnSymbolByUses(KvCParamSymbol* function) {
  // The uses in ascending key (serial) order.
  function->getExprLocDB()->listUses(useBuffer);
  KvCFcgFunctionInfo* info = provideFcgNodeInfo(function);
  if (!info)
    return;
  registerNode(info);
  synchronizeNodeInfoAtConstruction(info, function);
  for (KV_ExprLocation* use : useBuffer)
    enterUse(use);
}

void KvCGenericFunctionCallGraph::enterUse(KV_ExprLocation* use) {
  KV_Operation* op = use->getOperation();
  if (!op) {
    incomplete = true;
    return;
  }
  KV_Operation* above = op->getParentOperation();
  if (KvCCallOperation* call = above ? above->asCallOperation() : nullptr)
    addCall(call);
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
  if (constructing)
    flushGroupCalls();
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
  const leda::node v = nodeOf(calling);
  const leda::node w = nodeOf(called);
  return addEdgeBetween(v, w, e);
}

bool KvCGenericFunctionCallGraph::addEdgeBetween(leda::node v, leda::node w, leda::edge& e) {
  ensureEdgeIndex();
  if (leda::edge existing = edgeIndex->find(v, w)) {
    e = existing;
    if (KvCFcgEdgeInfo* info = inf(e))
      info->incCardinality();
    return false;
  }
  e = linkNewEdge(v, w);
  return true;
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
  ensureEdgeIndex();
  leda::edge found = edgeIndex->find(v, w);
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

void KvCGenericFunctionCallGraph::deleteEdge(leda::edge e) {
  linkPendingOutEdges();
  ensureEdgeIndex();
  edgeIndex->erase(source(e), target(e), e);
  // A hook deleting edges while construct runs: the group table may hold this edge, so
  // the rest of the group looks its edges up as other calls do.
  groupNode = nullptr;
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

void KvCGenericFunctionCallGraph::clearCallOperationsOnce(leda::node v,
                                                          KvCFcgFunctionInfo* function) {
  if (!clearSetsLazily)
    return;
  const auto at = static_cast<std::size_t>(index(v));
  if (at >= setCleared.size() || setCleared[at])
    return;
  setCleared[at] = 1;
  --setsLeft;
  deleteFcgNodeInfo(function);
}

void KvCGenericFunctionCallGraph::clearCallOperationsLeft() {
  if (!clearSetsLazily)
    return;
  clearSetsLazily = false;
  if (setsLeft == 0) {
    // The usual case: the run added to every set it found (each listed function starts
    // its group by emptying its own).
    setCleared = std::vector<char>();
    return;
  }
  deleteNodeInfos(&setCleared);
  setCleared = std::vector<char>();
}

void KvCGenericFunctionCallGraph::deleteAllEdges() {
  restore_all_edges();
  // The infos go in edge creation order; the records then all at once (unlinking them one
  // by one would visit each edge's neighbours, scattered over memory).
  for (leda::edge e : all_edges())
    deleteFcgEdgeInfo(inf(e));
  del_all_edges();
  edgeIndex->clear();
  edgeIndexCurrent = true;
  groupNode = nullptr;
}

void KvCGenericFunctionCallGraph::deleteAllNodes() { deleteNodeInfos(nullptr); }

void KvCGenericFunctionCallGraph::deleteNodeInfos(const std::vector<char>* done) {
  auto wanted = [this, done](leda::node v) {
    if (!done)
      return true;
    const auto at = static_cast<std::size_t>(index(v));
    return at < done->size() && !(*done)[at];
  };
  // The infos lie scattered; each is fetched a few nodes ahead.
  constexpr int kAhead = 8;
  leda::node lead = first_node();
  for (int i = 0; i < kAhead && lead; ++i)
    lead = succ_node(lead);
  for (leda::node v = first_node(); v; v = succ_node(v)) {
    if (lead) {
      if (wanted(lead))
        KvCPrefetch::read(inf(lead));
      lead = succ_node(lead);
    }
    if (wanted(v))
      deleteFcgNodeInfo(inf(v));
  }
}

void KvCGenericFunctionCallGraph::clearNodeMap() {
  nodes.clear();
  // The slots name nodes too.
  functionSlots = std::vector<FunctionSlot>();
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

void KvCGenericFunctionCallGraph::synchronizeNodeInfoAtConstruction(KvCFcgFunctionInfo*,
                                                                    KvCParamSymbol*) {}

KvCFcgEdgeInfo* KvCGenericFunctionCallGraph::createFcgEdgeInfo() {
  // From the graph's pool: no heap call per edge, and infos made one after another lie
  // together. A plain delete releases them (deleteFcgEdgeInfo).
  return new (*edgeInfoPool) KvCFcgEdgeInfo;
}

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
