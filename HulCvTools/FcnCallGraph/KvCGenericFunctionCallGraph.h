// KvCGenericFunctionCallGraph: the directed call graph of the application: one node per
// function or macro, one edge per ordered pair (calling, called) linked by at least one
// call operation, the edge's cardinality counting those operations. A self-recursive
// call is a self-loop. Built from the ICode (construct, from the uses in the def/use
// databases, which must be built first), then kept up to date call by call (addCall,
// delCall), and walked with functors.
//
// Ownership: node payloads are the model's function infos, which the graph never frees;
// nodes once made stay until shutdown of a derived graph (a new construct reuses them).
// Edge infos belong to the graph (createFcgEdgeInfo / deleteFcgEdgeInfo). Copying is
// deleted: a copied node map would point into the source graph.
//
// Lookups are O(1): next to the node map the graph keeps an index from (calling node,
// called node) to the pair's edges, so a scheduler calling N functions is entered in
// O(N). getEdge answers what a scan of the caller's visible out-edges would: the first
// visible edge to the called node in creation order (a pair has two edges only when a
// call was added while the pair's edge was hidden).
//
// The virtual hooks let derived graphs (recursion analysis, reuse graph) change what the
// nodes and edges carry.
//
// construct gives the graph and the function infos that entering every use's call with
// addCall in symbol order would give (same nodes, edges, edge and adjacency orders, sets).
// It reads the uses' calls from the model in memory order first (asking
// provideFcgNodeInfo in that order; it must answer the same for a symbol throughout a run),
// then enters them in symbol order in batches: node hooks of a batch run before its edge
// hooks, each hook kind in the order addCall would call it. A function's call operations
// go to its set once its uses are entered, and the called functions to the calling
// functions' sets at the end of the run: hooks must not rely on those sets during
// construction. For the library's own graph types, whose hooks are the base's,
// construction sets the task mark itself and empties a node's set of call operations
// when it first adds to it (or at the end of the run) instead of all sets first. Edges
// are found through a table of the current function's callers while the run lasts; the
// edge index is filled once at its end. Cost: O(uses + functions) expected.
#ifndef HULCVTOOLS_FCNCALLGRAPH_KVCGENERICFUNCTIONCALLGRAPH_H
#define HULCVTOOLS_FCNCALLGRAPH_KVCGENERICFUNCTIONCALLGRAPH_H

#include "HulCvTools/Control/KvCHeapObject.h"
#include "HulCvTools/FcnCallGraph/KvCFcgEdgeInfo.h"
#include "HulCvTools/FcnCallGraph/KvCFcgFunctor.h"
#include "HulCvTools/HulCvToolsExport.h"
#include "HulCvTools/ModelInterfaces/ICodeFwd.h"
#include "platform/leda/graph.h"
#include "platform/leda/list.h"
#include "platform/leda/map.h"
#include "platform/leda/set.h"

#include <cstddef>
#include <cstdint>
#include <memory>
#include <vector>

class KvCFcnSmbVisitor;
class KvCFcgEdgeIndex;
class KvCObjectPool;

// The graph of every call graph: instantiated (and exported) once, by the library.
extern template class HULCV_API leda::GRAPH<KvCFcgFunctionInfo*, KvCFcgEdgeInfo*>;
using KvCFcgGraph = leda::GRAPH<KvCFcgFunctionInfo*, KvCFcgEdgeInfo*>;

class HULCV_API KvCGenericFunctionCallGraph : public KvCFcgGraph {
public:
  KvCGenericFunctionCallGraph();
  // Releases the edge infos; the function infos are the model's.
  ~KvCGenericFunctionCallGraph() override;
  KvCGenericFunctionCallGraph(const KvCGenericFunctionCallGraph&) = delete;
  KvCGenericFunctionCallGraph& operator=(const KvCGenericFunctionCallGraph&) = delete;

  // Rebuilds the edges from the ICode: every function or macro symbol (only the selected
  // ones when `onlySelected`) gets a node, and every use of it that is the called symbol
  // of a call operation enters that call. False when a use had no operation (the graph
  // built so far stays usable). Needs the run's current code view data.
  virtual bool construct(bool onlySelected);
  virtual void forall_FcgNodes(KvCFcgFunctor& functor);
  virtual void forall_CallerNodes(KvCFcgFunctor& functor);
  virtual void forall_CallingFunctionsOf(KvCFcgFunctionInfo* function, KvCFcgFunctor& functor);
  virtual void forall_CalledNodes(KvCFcgFunctor& functor);
  virtual void forall_CalledFunctionsOf(KvCFcgFunctionInfo* function, KvCFcgFunctor& functor);

  // Enters one call operation: its (calling, called) edge, the call in the called
  // function's set of calls, the called function in the caller's set of called functions.
  // False, entering nothing, for a call outside every function (after an internal check,
  // except for access functions and RTE API macros in initial values).
  bool addCall(KvCCallOperation* call);
  // Takes one call operation out: the edge's cardinality goes down, the edge goes at 0.
  // False, changing nothing, when the graph has no edge for the call.
  bool delCall(KvCCallOperation* call);

  // `node` untouched on false.
  bool getNode(KvCFcgFunctionInfo* function, leda::node& node) const;
  // `edge` meaningful only on true.
  bool getEdge(KvCFcgFunctionInfo* calling, KvCFcgFunctionInfo* called, leda::edge& edge) const;
  // Edges, not call operations; 0 without node.
  int getNrOfCallers(KvCFcgFunctionInfo* function) const;
  int getNrOfCalled(KvCFcgFunctionInfo* function) const;
  // Deletes every edge incident to the function's node; the node stays.
  void removeEdges(KvCFcgFunctionInfo* function);
  // Deletes the function's outgoing edges, emptying each called function's whole set of
  // call operations (its calls from every caller).
  void removeCalledEdges(KvCFcgFunctionInfo* function);
  // The nodes without outgoing / incoming edges, in node order; true when there are any.
  bool findAllFcgLeaves(leda::list<leda::node>& leaves) const;
  bool findAllFcgRoots(leda::list<leda::node>& roots) const;
  // Diagnostic output; prints nothing in this build.
  void display() const {}
  void display(const leda::set<leda::node>& nodes, int depth) const;

protected:
  virtual KvCFcgFunctionInfo* provideFcgNodeInfo(KvCParamSymbol* function);
  virtual void deleteFcgNodeInfo(KvCFcgFunctionInfo* function);
  virtual void synchronizeNodeInfoAtConstruction(KvCFcgFunctionInfo* info,
                                                 KvCParamSymbol* function);
  virtual KvCFcgEdgeInfo* createFcgEdgeInfo();
  virtual void deleteFcgEdgeInfo(KvCFcgEdgeInfo* info);
  virtual void synchronizeEdgeInfoAtConstruction(KvCFcgEdgeInfo* info, KvCCallOperation* call);

  // Registers both functions and adds one call to their edge; true when the edge is new.
  bool addEdge(KvCFcgFunctionInfo* calling, KvCFcgFunctionInfo* called, leda::edge& edge);
  void registerNode(KvCFcgFunctionInfo* function);
  // Deletes every edge (restoring hidden ones first) and its info.
  void deleteAllEdges();
  // Passes every node's info to deleteFcgNodeInfo; nodes and map stay.
  void deleteAllNodes();
  // Deletes one edge and its info.
  void deleteEdge(leda::edge e);

  leda::map<KvCFcgFunctionInfo*, leda::node>& nodeMap() { return nodes; }
  bool isIncomplete() const { return incomplete; }
  // Forgets every node (for a derived graph's shutdown, together with clear()).
  void clearNodeMap();

private:
  friend class KvCFcnSmbVisitor;

  void treatFcnSymbolByUses(KvCParamSymbol* function);
  // Treats the symbols in order as treatFcnSymbolByUses would, prefetching ahead.
  void treatFcnSymbols(const std::vector<KvCParamSymbol*>& functions);
  // Enters the call of which `use` is an operand, if any.
  void enterUse(KV_ExprLocation* use);

  // Construction reads what each use asks for (UseRecord, in memory order), turns the
  // records into steps in symbol order and carries them out batch by batch, fetching the
  // graph memory of the steps a few places ahead into the cache meanwhile.
  struct Step {
    enum Kind : unsigned char {
      kNode,       // register `calling` (the info of `function`) and synchronize it
      kIncomplete, // a use without operation
      kEdge,       // enter `call` from `calling` to `called`, both known
      kCall,       // enter `call` through addCall (it has an end missing)
      kNone        // (use records only) the use is no operand of a call
    };
    Kind kind;
    bool selfCall = false;
    bool taskCall = false; // kEdge: the call activates a task
    bool ownCall = false;  // kEdge: `called` is the function whose uses these are
    // Debug indices of the calling and the called symbol (kNode: of `function`), or -1;
    // they key the function slots of a construction run.
    int callingIndex = -1;
    int calledIndex = -1;
    int serial = 0;            // kEdge: the call's serial number
    std::size_t groupUses = 0; // kNode: the number of uses of `function`
    KvCFcgFunctionInfo* calling = nullptr;
    KvCFcgFunctionInfo* called = nullptr;
    KvCParamSymbol* function = nullptr;
    KvCCallOperation* call = nullptr;
    // kEdge: the calling and called node, once registered; kNode: the function's node.
    leda::node v = nullptr;
    leda::node w = nullptr;
  };
  // What one use asks for, read from the model before the steps are made (kEdge: `v` is
  // the calling node if it existed already; kCall: only `call`).
  struct UseRecord {
    Step::Kind kind = Step::kNone;
    bool selfCall = false;
    bool taskCall = false;
    int callingIndex = -1;
    int serial = 0;
    KvCCallOperation* call = nullptr;
    KvCFcgFunctionInfo* calling = nullptr;
    KvCParamSymbol* calledSymbol = nullptr;
    leda::node v = nullptr;
  };
  // Fills useRecords for useBuffer, reading the uses in address order.
  void resolveUses();
  // Fills useOrder: the uses of useBuffer grouped by their address range.
  void sortUsesByAddress();
  // The step a use record of `function` (whose info and debug index are given) makes.
  void pushStep(const UseRecord& record, KvCParamSymbol* function, KvCFcgFunctionInfo* info,
                int index);
  // The function's node if it has one (through the function slots), else null.
  leda::node existingNodeOf(KvCFcgFunctionInfo* function, int index);
  // Enters a listed function (its info and existing node) in its function slot and
  // returns its debug index.
  int enterFunctionSlot(KvCParamSymbol* function);
  struct FunctionSlot;
  // While the run empties call-operation sets lazily (see construct): empties the set of
  // `function`, whose node is v, unless the run did already or v is new.
  void clearCallOperationsOnce(leda::node v, KvCFcgFunctionInfo* function);
  // Empties the sets the run has not emptied yet, and ends lazy emptying.
  void clearCallOperationsLeft();
  // Calls the node info hook for every node (done null) or for the nodes of the run's
  // start (index below done's size) not marked in done, fetching infos ahead.
  void deleteNodeInfos(const std::vector<char>* done);
  // Fetches the slot of `function` into the cache.
  void prefetchFunctionSlot(const KvCParamSymbol* function) const;
  // Whether the slot of `function` names its node (a guess for prefetching: the info is
  // the symbol's own).
  bool slotNamesNode(KvCParamSymbol* function) const;
  // The slot at `index` when it names the info `function` (from any run), else null.
  FunctionSlot* slotOfInfo(KvCFcgFunctionInfo* function, int index);
  // The slot of `function` (debug index `index`), or null when it has none.
  const FunctionSlot* slotOf(const KvCParamSymbol* function, int index) const;
  // Carries out the recorded steps in order and forgets them.
  void replaySteps();
  void prefetchNodes(const Step& step, bool near) const;
  // The node of `function` through its function slot (debug index `index`), registering
  // it when missing.
  leda::node cachedNodeOf(KvCFcgFunctionInfo* function, int index);
  void prefetchEdge(const Step& step, bool near) const;
  // addEdge between registered nodes.
  bool addEdgeBetween(leda::node v, leda::node w, leda::edge& e);
  void enterEdge(const Step& step);
  // Creates the edge v -> w with a new info of cardinality 1, entering it in the edge index
  // (when current) and in the group table (when w is the group's node).
  leda::edge linkNewEdge(leda::node v, leda::node w);
  // While constructing: the edge v -> w, or null.
  leda::edge findConstructedEdge(leda::node v, leda::node w);
  // Starts the uses of the function of a kNode step (its node is step.v).
  void beginGroup(const Step& step);
  // Adds the group's calls to its function's set of call operations.
  void flushGroupCalls();
  std::size_t groupHome(leda::node v) const;
  leda::edge groupFind(leda::node v) const;
  void groupInsert(leda::node v, leda::edge e);
  // Fills the edge index from the graph when construction left it behind.
  void ensureEdgeIndex() const;
  // A calling function's bucket when construction groups by calling function: its debug
  // index when it has a function slot, else one shared last bucket.
  int callerKey(int callingIndex) const;
  // Appends the edges made with their out-edge links deferred to their sources' lists.
  void linkPendingOutEdges();
  // Adds the called functions that construction deferred, grouped by calling function.
  void addDeferredCalledFcns();

  // The function's node, registered when missing (one map lookup).
  leda::node nodeOf(KvCFcgFunctionInfo* function);
  bool isEnteredOutsideFunctions(KvCCallOperation* call) const;
  void forall_CallingFunctionsOf(leda::node v, KvCFcgFunctor& functor);
  void forall_CalledFunctionsOf(leda::node v, KvCFcgFunctor& functor);

  leda::map<KvCFcgFunctionInfo*, leda::node> nodes;
  bool incomplete = true;
  std::unique_ptr<KvCFcgEdgeIndex> edgeIndex;
  // False while construct runs (the index is filled at its end); every other operation
  // that uses the index fills it first when it is false.
  mutable bool edgeIndexCurrent = true;
  // Storage of the edge infos the base hook makes (the destructor deletes every info
  // before the pool goes).
  std::unique_ptr<KvCObjectPool> edgeInfoPool;
  // Scratch of construction, reused from run to run: the uses of the symbols being treated.
  std::vector<KV_ExprLocation*> useBuffer;
  std::vector<KV_ExprLocation*> listedUses;
  std::vector<int> listedIndices; // the debug indices of the functions being treated
  std::vector<Step> steps;
  std::vector<UseRecord> useRecords;
  // The uses sorted by address range, each with its place in useBuffer.
  struct SortedUse {
    KV_ExprLocation* use;
    std::uint32_t index;
  };
  std::vector<SortedUse> useOrder;
  std::vector<std::uint32_t> useRangeStart;
  // While constructing, the edges into the node of the function whose uses are being
  // entered (groupNode), by calling node: most calls find their edge here, in a table the
  // size of the function's uses, instead of in the index.
  struct GroupSlot {
    leda::node v = nullptr;
    leda::edge e = nullptr;
  };
  bool constructing = false;
  // The graph's edge hook is the base's (see construct).
  bool plainEdgeHook = false;
  // New edges wait in pendingOut for their place in the calling node's out-edges.
  bool deferOutLinks = false;
  struct PendingOut {
    leda::node v;
    leda::edge e;
  };
  std::vector<PendingOut> pendingOut;
  leda::node groupNode = nullptr;
  KvCFcgFunctionInfo* groupInfo = nullptr;
  // groupInfo as an element of a called-function set (see DeferredCalled).
  int groupCalledIndex = 0;
  KvCParamSymbol* groupCalledSymbol = nullptr;
  // The group's calls to its function, with their serial numbers, not yet in its set.
  std::vector<KvCCallOperation*> groupCalls;
  std::vector<int> groupSerials;
  std::vector<GroupSlot> groupSlots;
  std::size_t groupCount = 0;
  // By symbol debug index: the symbol listed with that index in construction run `run`,
  // its info (from provideFcgNodeInfo) and the info's node once known. A slot serves a
  // symbol only in its run and when it names it, and a node (in any later run, until
  // clearNodeMap) only for the info it names. Most calls find their calling function here
  // instead of in the node map, and a reconstruction finds every node here. Kept between
  // runs: 32 bytes per symbol of the application, twice over for symbols made meanwhile.
  struct FunctionSlot {
    KvCParamSymbol* symbol = nullptr;
    KvCFcgFunctionInfo* info = nullptr;
    leda::node node = nullptr;
    std::uint32_t run = 0;
  };
  std::vector<FunctionSlot> functionSlots;
  // While construct empties the call-operation sets of the nodes it found lazily: by node
  // index, whether the run emptied the node's set (nodes made by the run are past the end).
  bool clearSetsLazily = false;
  std::vector<char> setCleared;
  std::size_t setsLeft = 0; // entries of setCleared still 0
  std::uint32_t constructRun = 0;
  // Called functions still to be added to their calling function's set: construction adds
  // them calling function by calling function, which loads each set once instead of once
  // per call.
  struct DeferredCalled {
    int callingKey;       // the calling function's bucket (callerKey)
    int calledDebugIndex; // with calledSymbol, the called function as its set keeps it
    KvCFcgFunctionInfo* calling;
    KvCParamSymbol* calledSymbol;
  };
  std::vector<DeferredCalled> deferredCalled;
  std::vector<DeferredCalled> deferredByCaller;
};

#endif
