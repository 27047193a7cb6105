// KvCFcnReuseCallGraph: a call graph on the level of the model's partitions. Its nodes are
// the functions of a constructed real call graph (KvCFunctionCallGraph); its edges join
// the step, init, term and restart functions of calling and called active partitions,
// and the partition functions with the additional functions (auxiliary functions,
// non-partition step/init/term/restart functions, RTE API calls) around them. Where reuse
// is involved it keeps one edge per pair of instances, so it may hold parallel edges
// between two functions; every edge records its calling and called instance (the actual
// interfaces of the code blocks). Edges between additional functions, and between
// partition functions and additional functions, carry the real graph's cardinalities.
//
// A partition is active when its step function is really called as a function: not
// inlined or removed, or inlined atomically, or called by the simulation frame, or kept
// alive by a restart function that is itself neither inlined nor removed. Calls from
// inactive partitions are attributed to the nearest active partitions above them.
//
// What it does not do: it reads nothing from the ICode but the real graph, the function
// roles and the view; it never frees model objects. The inlined-atomically marks of the
// function infos are set by construct (through the transformation library's functor).
//
// Ownership: the real graph and the view data are the caller's and must outlive every
// construct; the partition iterator, the partition visitor (which points back to this
// graph) and the reuse tools are owned, made by the constructor from the memory
// controller, and released by the destructor. Edge infos are the graph's (see the base).
// Copying is deleted: a copy would share or double-delete the owned objects.
//
// Cost: construct is O(real nodes + real edges + partitions * (callers on the paths up to
// the active partitions) + edge scans); findEdge scans the calling function's out-edges.
#ifndef HULCVTOOLS_FCNCALLGRAPH_KVCFCNREUSECALLGRAPH_H
#define HULCVTOOLS_FCNCALLGRAPH_KVCFCNREUSECALLGRAPH_H

#include "HulCvTools/Control/KvCHeapObject.h"
#include "HulCvTools/FcnCallGraph/KvCFunctionCallGraph.h"
#include "HulCvTools/HulCvToolsExport.h"
#include "HulCvTools/ModelInterfaces/ICodeFwd.h"
#include "HulCvTools/ModelInterfaces/ViewFwd.h"
#include "HulCvTools/ModelInterfaces/ViewVisitors.h"
#include "platform/leda/list.h"

#include <vector>

class HULCV_API KvCFcnReuseCallGraph : public KvCFunctionCallGraph {
public:
  // The partition visitor: visits each partition of the hierarchy for its graph. Owned by
  // the graph; not copied.
  class HULCV_API BdVisitor : public KV_BdVisitor {
  public:
    explicit BdVisitor(KvCFcnReuseCallGraph* graph) : reuseGraph(graph) {}
    ~BdVisitor() override;
    // Joins the partition to its calling active partitions and to the additional functions
    // around its functions; does nothing for an extern partition that is not the topmost.
    void visitPartition(KV_BdPartition* partition) override;

    HULCV_HEAP_OPERATORS

  private:
    KvCFcnReuseCallGraph* reuseGraph;
  };

  // Makes the iterator, the visitor and the reuse tools (any may be null when memory ran
  // out; construct then answers false).
  KvCFcnReuseCallGraph();
  // Forgets the real graph and releases iterator, visitor and reuse tools.
  ~KvCFcnReuseCallGraph() override;
  KvCFcnReuseCallGraph(const KvCFcnReuseCallGraph&) = delete;
  KvCFcnReuseCallGraph& operator=(const KvCFcnReuseCallGraph&) = delete;

  // Stores the real graph and the view data (not owned); true.
  bool boot(KvCFunctionCallGraph* realGraph, KvCIvData* ivData);
  // Rebuilds every edge from the real graph (constructed before) and the partitions of the
  // view; nodes of earlier runs remain, and every function of the real graph has a node.
  // Sets the inlined-atomically marks of the real graph's function infos. Refused edges
  // (same step function, an existing edge not forced new) are only left out. False when
  // not booted or the owned helpers are missing.
  bool construct();
  // The inherited construct(bool) stays visible beside it: it builds the graph from the
  // ICode's calls as a function call graph does, not from the partitions.
  using KvCFunctionCallGraph::construct;
  // Forgets real graph and view data, deletes every edge with its info, every node and the
  // node map; true.
  bool shutdown();

  HULCV_HEAP_OPERATORS

private:
  using PartitionList = leda::list<KV_BdPartition*>;

  KvCFunctionCallGraph* getRealCallGraph() const { return realCallGraph; }
  bool iteratePartitions();
  void visitPartition(KV_BdPartition* partition);
  bool isPartitionActive(KV_BdPartition* partition);
  // The symbol of the partition's master partition's step function, or null.
  KvCParamSymbol* getFcnSymbolFromPartition(KV_BdPartition* partition);
  // The nearest active partitions on every calling path up from `partition` (itself when
  // active), in depth-first order, a partition once per path. A path that comes back to an
  // inactive partition already on it ends there, so a cycle of inactive callers ends.
  // Clears `result` first.
  void getActivePartitions(KV_BdPartition* partition, PartitionList& result);
  // NOLINTNEXTLINE(readability-identifier-naming): a fixed operation name
  void getActivePartitions_rec(KV_BdPartition* partition, PartitionList& result,
                               std::vector<KV_BdPartition*>& path);
  // Clears `callers` first.
  void getCallersSkipCounterAlarmConsiderOsekEvents(KV_BdPartition* partition,
                                                    PartitionList& callers);
  // Joins the partition functions of `calling` to those of `called`. False when both have
  // the same step function or an edge was refused.
  bool addCall(KV_BdPartition* calling, KV_BdPartition* called);
  // One edge between two functions with their instances; a new parallel edge when either
  // instance belongs to a reused partition. False when no edge was made.
  bool addCall(KvCFcgFunctionInfo* calling, KvCCbActualInterface* callingInstance,
               KvCFcgFunctionInfo* called, KvCCbActualInterface* calledInstance);
  // The existing edge (false) unless `forceNew` or there is none: then a new edge of
  // cardinality 1 (true). Enters `called` in the caller's called functions in every case.
  bool addEdge(KvCFcgFunctionInfo* calling, KvCFcgFunctionInfo* called, leda::edge& edge,
               bool forceNew);
  // The first edge from `calling` to `called` with exactly these instances; `edge`
  // meaningful only on true. O(out-degree of calling).
  bool findEdge(KvCFcgFunctionInfo* calling, KvCCbActualInterface* callingInstance,
                KvCFcgFunctionInfo* called, KvCCbActualInterface* calledInstance,
                leda::edge& edge) const;
  bool addStepFromToAddFcnCalls(KV_BdPartition* partition);
  bool addStepFromToAddFcnCall(KvCFcgFunctionInfo* info, KvCCbActualInterface* instance);
  bool addAddToAddFcnCalls();
  static bool considerAdditionalFcn(const KvCParamSymbol* function);
  // The actual interface of the function's code block for the call id; without call id,
  // the one of a code block with a single call id. Null otherwise.
  static KvCCbActualInterface* getInstanceId(const KvCParamSymbol* function,
                                             const KvCIvCallId* callId);
  // The partition whose code `partition` runs: its reuse group's master partition, or
  // itself.
  KV_BdPartition* getMasterPartition(KV_BdPartition* partition) const;
  KvCFcgFunctionInfo* infoOf(KvCParamSymbol* function);

  KvCFunctionCallGraph* realCallGraph = nullptr;
  KvCIvData* ivData = nullptr;
  KvCPartitionIterator* partitionIterator = nullptr;
  BdVisitor* partitionVisitor = nullptr;
  KvCIvFcnReuseTools* reuseTools = nullptr;
};

#endif
