// KvCGenericFunctionCallGraph: the directed call graph of the application: one node per
// function or macro, one edge per ordered pair (calling, called) linked by at least one
// call operation, the edge's cardinality counting those operations. A self-recursive call
// is a self-loop. Built from the ICode by construct (from the uses listed in the def/use
// databases, which must be built first), then kept up to date call by call (addCall,
// delCall), and walked with functors.
//
// What it does not do: it never looks inside function bodies itself (the calls are found
// through the called symbols' uses), and it never frees model objects.
//
// Ownership:
// - Node payloads are the model's function infos, which the graph never frees. Nodes,
//   once made, stay for the life of the graph (a new construct reuses them) until a derived
//   graph clears the graph at its shutdown.
// - Every edge payload belongs to the graph, however the edge was made: it is created by
//   createFcgEdgeInfo and released by deleteFcgEdgeInfo when its edge goes, whether the edge
//   is deleted by this class, by a derived graph or through the inherited graph operations
//   (del_edge, del_node, del_all_edges, clear). Infos made by the base hook come from a pool
//   the graph owns; the destructor releases every info that is left.
// - Copying is deleted: a copied node map would name the source graph's nodes.
//
// Lookups stay exact whatever the inherited graph operations do, because nothing is cached
// beside the graph except the node map, which the graph's update handlers keep in step when
// nodes go (del_node, clear):
// - getNode: one hashed lookup in the node map.
// - getEdge: scans the called node's in-edges, or the calling node's out-edges when those
//   are less than a quarter as many (both in creation order, hidden edges skipped), so it
//   costs O(min(out-degree, in-degree)): a scheduler calling thousands of functions each
//   once finds every edge at the called function's single in-edge.
//
// Hooks: construct visits the function and macro symbols in the symbol database's order;
// for each it calls provideFcgNodeInfo, registers the node and calls
// synchronizeNodeInfoAtConstruction, then enters the calls among the symbol's uses one by
// one, in ascending key order, exactly as addCall enters them (provideFcgNodeInfo for
// both ends, createFcgEdgeInfo for a new edge, synchronizeEdgeInfoAtConstruction). The same
// order holds for every graph type. Hooks may read the graph; deleteFcgEdgeInfo, which may
// be called from inside a graph operation, must not change it. Construction reads the
// calls above all uses from the ICode before it enters them (in the ICode's key order,
// which spares a jump through the ICode per use), so hooks must not add or remove call
// operations while it runs, nor construct this graph again.
//
// Cost: construct is O(symbols + uses * (1 + edge scan)) expected, with about 60 bytes
// per use of scratch while it runs; addCall and delCall O(1) expected plus the edge scan.
// Memory: the graph's node and edge records, one pooled edge info per edge and one
// node-map entry per function.
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

#include <memory>
#include <vector>

class KvCFcgCallReader;
class KvCFcnSmbVisitor;
class KvCObjectPool;

// The graph of every call graph: instantiated (and exported) once, by the library.
extern template class HULCV_API leda::GRAPH<KvCFcgFunctionInfo*, KvCFcgEdgeInfo*>;
using KvCFcgGraph = leda::GRAPH<KvCFcgFunctionInfo*, KvCFcgEdgeInfo*>;

class HULCV_API KvCGenericFunctionCallGraph : public KvCFcgGraph {
public:
  KvCGenericFunctionCallGraph();
  // Releases the edge infos that are left (through this class's deleteFcgEdgeInfo: a
  // derived graph whose infos need its own hook releases them in its shutdown).
  ~KvCGenericFunctionCallGraph() override;
  KvCGenericFunctionCallGraph(const KvCGenericFunctionCallGraph&) = delete;
  KvCGenericFunctionCallGraph& operator=(const KvCGenericFunctionCallGraph&) = delete;

  // Rebuilds the edges from the ICode of the run's current code view data: restores hidden
  // edges, deletes every edge, empties every node's function info (deleteFcgNodeInfo), then
  // gives every function or macro symbol (only the selected ones when `onlySelected`) a node
  // and enters the call operation above each of its uses. False when a use had no operation
  // or there is no current code view data; the graph built so far stays usable.
  virtual bool construct(bool onlySelected);
  // Traversals in node order; the first three ask the functor's stopIteration before each
  // node. A function without node gets no application.
  virtual void forall_FcgNodes(KvCFcgFunctor& functor);
  virtual void forall_CallerNodes(KvCFcgFunctor& functor);
  virtual void forall_CallingFunctionsOf(KvCFcgFunctionInfo* function, KvCFcgFunctor& functor);
  virtual void forall_CalledNodes(KvCFcgFunctor& functor);
  virtual void forall_CalledFunctionsOf(KvCFcgFunctionInfo* function, KvCFcgFunctor& functor);

  // Enters one call operation: its (calling, called) edge, the call in the called
  // function's set of calls, the called function in the caller's set of called functions.
  // False, entering nothing, for a null call or a call outside every function (after an
  // internal check, except for access functions and RTE API macros in initial values).
  bool addCall(KvCCallOperation* call);
  // Takes one call operation out: the edge's cardinality goes down, the edge goes at 1.
  // False, changing nothing, when the graph has no visible edge for the call.
  bool delCall(KvCCallOperation* call);

  // `node` untouched on false.
  bool getNode(KvCFcgFunctionInfo* function, leda::node& node) const;
  // The first visible edge from `calling` to `called` in creation order. `edge` is
  // meaningful only on true. O(min(out-degree of calling, in-degree of called)).
  bool getEdge(KvCFcgFunctionInfo* calling, KvCFcgFunctionInfo* called, leda::edge& edge) const;
  // Visible edges, not call operations; 0 without node.
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

  // Registers both functions and adds one call to their edge: the existing visible edge's
  // cardinality goes up (an edge without info gets one first), or a new edge is made with
  // cardinality 1. True when the edge is new; `edge` is null only when no edge info could
  // be made.
  bool addEdge(KvCFcgFunctionInfo* calling, KvCFcgFunctionInfo* called, leda::edge& edge);
  // Registers both functions and makes a new edge between them with a new edge info of
  // cardinality 1, even when the pair has an edge already (parallel edges, for derived
  // graphs that keep one edge per pair of instances). False, `edge` null, for a null
  // function or when no edge info could be made.
  bool addNewEdge(KvCFcgFunctionInfo* calling, KvCFcgFunctionInfo* called, leda::edge& edge);
  void registerNode(KvCFcgFunctionInfo* function);
  // Restores hidden edges, then deletes every edge after passing its info to
  // deleteFcgEdgeInfo, in edge order.
  void deleteAllEdges();
  // Passes every node's info to deleteFcgNodeInfo, in node order; nodes and map stay.
  void deleteAllNodes();
  // Deletes one edge after passing its info to deleteFcgEdgeInfo.
  void deleteEdge(leda::edge e);

  leda::map<KvCFcgFunctionInfo*, leda::node>& nodeMap() { return nodes; }
  bool isIncomplete() const { return incomplete; }
  // Forgets every node (for a derived graph's shutdown, together with clear()).
  void clearNodeMap() { nodes.clear(); }

  // Update handlers of the graph: whatever deletes an edge releases its info, and the node
  // map forgets nodes that go.
  void pre_del_edge_handler(leda::edge e) override;
  void pre_del_node_handler(leda::node v) override;
  void pre_clear_handler() override;

private:
  friend class KvCFcnSmbVisitor;

  void treatFcnSymbolByUses(KvCParamSymbol* function);
  // addCall with the call's ends given (as construction read them ahead).
  bool enterCall(KvCCallOperation* call, KvCParamSymbol* calling, KvCParamSymbol* called);
  // The function's node, registered when missing.
  leda::node nodeOf(KvCFcgFunctionInfo* function);
  // A new edge v -> w with a new edge info of cardinality 1, or null when no info could
  // be made.
  leda::edge linkNewEdge(leda::node v, leda::node w);
  // The first visible edge v -> w, or null.
  leda::edge findEdge(leda::node v, leda::node w) const;
  // Passes e's info to deleteFcgEdgeInfo and detaches it from e.
  void releaseEdgeInfo(leda::edge e);
  // Whether a call without calling function stands in a symbol's initial value.
  static bool isInInitialValue(KvCCallOperation* call);
  void forall_CallingFunctionsOf(leda::node v, KvCFcgFunctor& functor);
  void forall_CalledFunctionsOf(leda::node v, KvCFcgFunctor& functor);

  leda::map<KvCFcgFunctionInfo*, leda::node> nodes;
  bool incomplete = true;
  // Storage of the edge infos the base hook makes.
  std::unique_ptr<KvCObjectPool> edgeInfoPool;
  // While construct runs: the calls above the uses, read ahead (see KvCFcgCallReader).
  std::unique_ptr<KvCFcgCallReader> callReader;
  bool constructing = false;
};

#endif
