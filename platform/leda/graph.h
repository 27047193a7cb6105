// Directed graphs: leda::graph, leda::GRAPH<V, E> with node and edge payloads,
// and node_array / edge_array keyed by node and edge handles.
//
// Nodes and edges are kept in intrusive doubly linked lists (all nodes, all
// edges, and per node its out-edges and in-edges), so creation, deletion,
// hiding and restoring are O(1) and every iteration runs in creation order.
// A hidden edge stays linked at its position but is skipped by iteration,
// degrees, edge counts and the algorithms; restoring it makes it reappear
// where it was created. Every node and edge gets an index that is unique in
// its graph and never reused, not even after clear().
//
// The records live in per-graph pools (see RecordPool): records made in sequence
// lie together in memory, and deleting every edge (del_all_edges) or everything
// (clear) is one pass without unlinking.
//
// Undirected graphs, edge reversal and reordering of edges are not provided.
#ifndef HULCVTOOLS_PLATFORM_LEDA_GRAPH_H
#define HULCVTOOLS_PLATFORM_LEDA_GRAPH_H

#include "platform/leda/array.h"

#include <algorithm>
#include <cassert>
#include <cstddef>
#include <iterator>
#include <new>
#include <utility>
#include <vector>

namespace leda {

namespace detail {

struct EdgeRec;

struct NodeRec {
  virtual ~NodeRec() = default;

  int id = 0;
  NodeRec* prev = nullptr;
  NodeRec* next = nullptr;
  EdgeRec* outFirst = nullptr;
  EdgeRec* outLast = nullptr;
  EdgeRec* inFirst = nullptr;
  EdgeRec* inLast = nullptr;
  // Degrees count visible edges only.
  int outdeg = 0;
  int indeg = 0;
};

struct EdgeRec {
  virtual ~EdgeRec() = default;

  bool hidden() const { return hiddenPos >= 0; }

  int id = 0;
  NodeRec* src = nullptr;
  NodeRec* tgt = nullptr;
  EdgeRec* prev = nullptr;
  EdgeRec* next = nullptr;
  EdgeRec* outPrev = nullptr;
  EdgeRec* outNext = nullptr;
  EdgeRec* inPrev = nullptr;
  EdgeRec* inNext = nullptr;
  // Position in the owning graph's list of hidden edges, -1 if visible.
  int hiddenPos = -1;
};

template <class V> struct NodeRecOf : NodeRec {
  explicit NodeRecOf(V x) : inf(std::move(x)) {}
  V inf;
};

template <class E> struct EdgeRecOf : EdgeRec {
  explicit EdgeRecOf(E x) : inf(std::move(x)) {}
  E inf;
};

// Iterators fetch the successor before the loop body runs, so the body may
// delete (or hide) the current element. Deleting any other element that the
// iteration has not reached yet is not allowed.
class NodeIterator {
public:
  using iterator_category = std::forward_iterator_tag;
  using value_type = NodeRec*;
  using difference_type = std::ptrdiff_t;
  using pointer = NodeRec* const*;
  using reference = NodeRec*;

  NodeIterator() = default;
  explicit NodeIterator(NodeRec* cur) : cur_(cur), next_(cur ? cur->next : nullptr) {}

  NodeRec* operator*() const { return cur_; }
  NodeIterator& operator++() {
    cur_ = next_;
    next_ = cur_ ? cur_->next : nullptr;
    return *this;
  }
  bool operator==(const NodeIterator& other) const { return cur_ == other.cur_; }

private:
  NodeRec* cur_ = nullptr;
  NodeRec* next_ = nullptr;
};

// Walks one of the edge lists selected by Next, skipping hidden edges.
template <EdgeRec* EdgeRec::*Next> class EdgeIterator {
public:
  using iterator_category = std::forward_iterator_tag;
  using value_type = EdgeRec*;
  using difference_type = std::ptrdiff_t;
  using pointer = EdgeRec* const*;
  using reference = EdgeRec*;

  EdgeIterator() = default;
  explicit EdgeIterator(EdgeRec* cur) { settle(cur); }

  EdgeRec* operator*() const { return cur_; }
  EdgeIterator& operator++() {
    settle(next_);
    return *this;
  }
  bool operator==(const EdgeIterator& other) const { return cur_ == other.cur_; }

private:
  void settle(EdgeRec* e) {
    while (e && e->hidden())
      e = e->*Next;
    cur_ = e;
    next_ = e ? e->*Next : nullptr;
  }

  EdgeRec* cur_ = nullptr;
  EdgeRec* next_ = nullptr;
};

template <class It> class Range {
public:
  explicit Range(It first) : first_(first) {}
  It begin() const { return first_; }
  It end() const { return It(); }

private:
  It first_;
};

// Visible edge following e (inclusive) in the list selected by Next.
template <EdgeRec* EdgeRec::*Next> EdgeRec* firstVisible(EdgeRec* e) {
  while (e && e->hidden())
    e = e->*Next;
  return e;
}

// Storage for the records of one kind of one graph: fixed-size slots carved from chunks
// in address order, freed slots kept on a free list. Records made one after another lie
// next to each other, and once every record is gone (clear, del_all_edges) allocation
// starts again at the first chunk, so a graph rebuilt edge by edge reuses the same warm
// memory in the same order. Chunks are returned only when the graph is destroyed.
class RecordPool {
public:
  explicit RecordPool(std::size_t slotSize)
      : slot_((std::max(slotSize, sizeof(void*)) + alignof(std::max_align_t) - 1) /
              alignof(std::max_align_t) * alignof(std::max_align_t)) {}
  RecordPool(const RecordPool&) = delete;
  RecordPool& operator=(const RecordPool&) = delete;
  ~RecordPool() {
    for (Chunk& c : chunks_)
      ::operator delete (c.memory, std::align_val_t{alignof(std::max_align_t)});
  }

  std::size_t slotSize() const { return slot_; }

  void* allocate() {
    if (free_) {
      void* p = free_;
      free_ = *static_cast<void**>(p);
      return p;
    }
    if (chunk_ == chunks_.size() || used_ == chunks_[chunk_].slots) {
      if (chunk_ < chunks_.size())
        ++chunk_;
      used_ = 0;
      if (chunk_ == chunks_.size()) {
        const std::size_t slots =
            chunks_.empty() ? kFirstSlots : std::min(chunks_.back().slots * 2, kMaxSlots);
        chunks_.push_back(Chunk{static_cast<char*>(::operator new (
                                    slots* slot_, std::align_val_t{alignof(std::max_align_t)})),
                                slots});
      }
    }
    return chunks_[chunk_].memory + slot_ * used_++;
  }

  void release(void* p) {
    *static_cast<void**>(p) = free_;
    free_ = p;
  }

  // Forgets every slot; only when no record lives.
  void reset() {
    free_ = nullptr;
    chunk_ = 0;
    used_ = 0;
  }

private:
  struct Chunk {
    char* memory;
    std::size_t slots;
  };
  static constexpr std::size_t kFirstSlots = 64;
  static constexpr std::size_t kMaxSlots = 16384;

  std::size_t slot_;
  std::vector<Chunk> chunks_;
  std::size_t chunk_ = 0; // chunk being carved
  std::size_t used_ = 0;  // slots of it handed out
  void* free_ = nullptr;
};

} // namespace detail

using node = detail::NodeRec*;
using edge = detail::EdgeRec*;
inline constexpr std::nullptr_t nil = nullptr;

// A directed graph (multi-edges and self-loops allowed). The graph owns its
// nodes and edges and frees them on deletion, clear() and destruction; a
// node or edge handle is invalid once its element is deleted. Handles of one
// graph must not be passed to another. Copying and moving are deleted.
class graph {
public:
  using EdgeIterator = detail::EdgeIterator<&detail::EdgeRec::next>;
  using OutEdgeIterator = detail::EdgeIterator<&detail::EdgeRec::outNext>;
  using InEdgeIterator = detail::EdgeIterator<&detail::EdgeRec::inNext>;
  using NodeRange = detail::Range<detail::NodeIterator>;
  using EdgeRange = detail::Range<EdgeIterator>;
  using OutEdgeRange = detail::Range<OutEdgeIterator>;
  using InEdgeRange = detail::Range<InEdgeIterator>;

  graph() : graph(sizeof(detail::NodeRec), sizeof(detail::EdgeRec)) {}
  graph(const graph&) = delete;
  graph& operator=(const graph&) = delete;
  virtual ~graph() { clear(); }

  node new_node() { return linkNode(makeNode()); }
  edge new_edge(node v, node w) { return linkEdge(makeEdge(), v, w); }

  // Deletes v and all its edges, hidden ones included. O(degree).
  void del_node(node v) {
    assert(v);
    pre_del_node_handler(v);
    while (v->outFirst)
      del_edge(v->outFirst);
    while (v->inFirst)
      del_edge(v->inFirst);
    (v->prev ? v->prev->next : firstNode_) = v->next;
    (v->next ? v->next->prev : lastNode_) = v->prev;
    --nodeCount_;
    destroyNode(v);
  }

  // Deletes e, which may be hidden. O(1).
  void del_edge(edge e) {
    assert(e);
    pre_del_edge_handler(e);
    if (e->hidden())
      forgetHidden(e);
    else
      adjustDegrees(e, -1);
    (e->prev ? e->prev->next : firstEdge_) = e->next;
    (e->next ? e->next->prev : lastEdge_) = e->prev;
    (e->outPrev ? e->outPrev->outNext : e->src->outFirst) = e->outNext;
    (e->outNext ? e->outNext->outPrev : e->src->outLast) = e->outPrev;
    (e->inPrev ? e->inPrev->inNext : e->tgt->inFirst) = e->inNext;
    (e->inNext ? e->inNext->inPrev : e->tgt->inLast) = e->inPrev;
    --edgeCount_;
    destroyEdge(e);
  }

  // Deletes every edge, hidden ones included, in creation order; the nodes stay, without
  // edges. O(nodes + edges), without the per-edge unlinking of del_edge.
  void del_all_edges() {
    for (edge e = firstEdge_; e; e = e->next)
      pre_del_edge_handler(e);
    for (edge e = firstEdge_; e;) {
      edge next = e->next;
      e->~EdgeRec();
      e = next;
    }
    edgePool_.reset();
    firstEdge_ = lastEdge_ = nullptr;
    edgeCount_ = 0;
    hidden_.clear();
    for (node v = firstNode_; v; v = v->next) {
      v->outFirst = v->outLast = v->inFirst = v->inLast = nullptr;
      v->outdeg = v->indeg = 0;
    }
  }

  // Deletes all nodes and edges. Indices of later elements keep counting up.
  void clear() {
    pre_clear_handler();
    for (edge e = firstEdge_; e;) {
      edge next = e->next;
      e->~EdgeRec();
      e = next;
    }
    for (node v = firstNode_; v;) {
      node next = v->next;
      v->~NodeRec();
      v = next;
    }
    edgePool_.reset();
    nodePool_.reset();
    firstNode_ = lastNode_ = nullptr;
    firstEdge_ = lastEdge_ = nullptr;
    nodeCount_ = edgeCount_ = 0;
    hidden_.clear();
  }

  // Hiding a hidden edge and restoring a visible one are no-ops.
  void hide_edge(edge e) {
    assert(e);
    if (e->hidden())
      return;
    e->hiddenPos = static_cast<int>(hidden_.size());
    hidden_.push_back(e);
    adjustDegrees(e, -1);
  }

  bool is_hidden(edge e) const { return e->hidden(); }

  void restore_edge(edge e) {
    assert(e);
    if (!e->hidden())
      return;
    forgetHidden(e);
    adjustDegrees(e, +1);
  }

  // O(number of hidden edges).
  void restore_all_edges() {
    for (edge e : hidden_) {
      e->hiddenPos = -1;
      adjustDegrees(e, +1);
    }
    hidden_.clear();
  }

  node source(edge e) const { return e->src; }
  node target(edge e) const { return e->tgt; }
  node opposite(node v, edge e) const { return v == e->src ? e->tgt : e->src; }
  int outdeg(node v) const { return v->outdeg; }
  int indeg(node v) const { return v->indeg; }

  int number_of_nodes() const { return nodeCount_; }
  int number_of_edges() const { return edgeCount_ - static_cast<int>(hidden_.size()); }
  // Hidden edges included (as all_edges lists them).
  int number_of_all_edges() const { return edgeCount_; }
  bool empty() const { return nodeCount_ == 0; }

  int index(node v) const { return v->id; }
  int index(edge e) const { return e->id; }
  // Largest index ever given to a node (edge) of this graph, -1 if none.
  int max_node_index() const { return nextNodeId_ - 1; }
  int max_edge_index() const { return nextEdgeId_ - 1; }

  // Single-step traversal; each returns nil past the end.
  node first_node() const { return firstNode_; }
  node last_node() const { return lastNode_; }
  node succ_node(node v) const { return v->next; }
  node pred_node(node v) const { return v->prev; }
  edge first_edge() const { return detail::firstVisible<&detail::EdgeRec::next>(firstEdge_); }
  edge succ_edge(edge e) const { return detail::firstVisible<&detail::EdgeRec::next>(e->next); }
  edge first_adj_edge(node v) const {
    return detail::firstVisible<&detail::EdgeRec::outNext>(v->outFirst);
  }
  edge adj_succ(edge e) const {
    return detail::firstVisible<&detail::EdgeRec::outNext>(e->outNext);
  }
  edge first_in_edge(node v) const {
    return detail::firstVisible<&detail::EdgeRec::inNext>(v->inFirst);
  }
  edge in_succ(edge e) const { return detail::firstVisible<&detail::EdgeRec::inNext>(e->inNext); }

  // Ranges in creation order; edge ranges skip hidden edges.
  NodeRange all_nodes() const { return NodeRange(detail::NodeIterator(firstNode_)); }
  EdgeRange all_edges() const { return EdgeRange(EdgeIterator(firstEdge_)); }
  OutEdgeRange out_edges(node v) const { return OutEdgeRange(OutEdgeIterator(v->outFirst)); }
  InEdgeRange in_edges(node v) const { return InEdgeRange(InEdgeIterator(v->inFirst)); }

protected:
  // Records are made in the graph's pools, whose slots have the given sizes (those of
  // the largest record types the graph makes).
  graph(std::size_t nodeSize, std::size_t edgeSize) : nodePool_(nodeSize), edgePool_(edgeSize) {}

  // Record factories for new_node() / new_edge(); GRAPH makes records that
  // carry a default payload.
  virtual detail::NodeRec* makeNode() {
    return new (nodeMemory(sizeof(detail::NodeRec))) detail::NodeRec;
  }
  virtual detail::EdgeRec* makeEdge() {
    return new (edgeMemory(sizeof(detail::EdgeRec))) detail::EdgeRec;
  }

  // Uninitialised memory for a record of `size` bytes.
  void* nodeMemory(std::size_t size) {
    assert(size <= nodePool_.slotSize());
    (void)size;
    return nodePool_.allocate();
  }
  void* edgeMemory(std::size_t size) {
    assert(size <= edgePool_.slotSize());
    (void)size;
    return edgePool_.allocate();
  }

  node linkNode(detail::NodeRec* v) {
    v->id = nextNodeId_++;
    v->prev = lastNode_;
    (lastNode_ ? lastNode_->next : firstNode_) = v;
    lastNode_ = v;
    ++nodeCount_;
    return v;
  }

  edge linkEdge(detail::EdgeRec* e, node v, node w) {
    assert(v && w);
    e->id = nextEdgeId_++;
    e->src = v;
    e->tgt = w;
    e->prev = lastEdge_;
    (lastEdge_ ? lastEdge_->next : firstEdge_) = e;
    lastEdge_ = e;
    e->inPrev = w->inLast;
    (w->inLast ? w->inLast->inNext : w->inFirst) = e;
    w->inLast = e;
    ++w->indeg;
    e->outPrev = v->outLast;
    (v->outLast ? v->outLast->outNext : v->outFirst) = e;
    v->outLast = e;
    ++v->outdeg;
    ++edgeCount_;
    return e;
  }

  // Update handlers, as the graph library offers them: called before an edge is deleted
  // (by del_edge, del_node or del_all_edges), before a node is deleted (ahead of its
  // edges), and before clear() deletes everything. Derived graphs override them to keep
  // what they hold beside the graph in step; a handler must not add or delete nodes or
  // edges (showing hidden edges is allowed: they are about to go). The
  // destructor's clear() calls this class's handlers, which do nothing.
  virtual void pre_del_edge_handler(edge /*e*/) {}
  virtual void pre_del_node_handler(node /*v*/) {}
  virtual void pre_clear_handler() {}

private:
  void destroyNode(node v) {
    v->~NodeRec();
    nodePool_.release(v);
  }
  void destroyEdge(edge e) {
    e->~EdgeRec();
    edgePool_.release(e);
  }

  static void adjustDegrees(edge e, int delta) {
    e->src->outdeg += delta;
    e->tgt->indeg += delta;
  }

  // Drops e from hidden_ (swap with the last entry) and marks it visible.
  void forgetHidden(edge e) {
    edge last = hidden_.back();
    hidden_[static_cast<std::size_t>(e->hiddenPos)] = last;
    last->hiddenPos = e->hiddenPos;
    hidden_.pop_back();
    e->hiddenPos = -1;
  }

  node firstNode_ = nullptr;
  node lastNode_ = nullptr;
  edge firstEdge_ = nullptr;
  edge lastEdge_ = nullptr;
  int nodeCount_ = 0;
  int edgeCount_ = 0; // hidden edges included
  int nextNodeId_ = 0;
  int nextEdgeId_ = 0;
  std::vector<edge> hidden_;
  detail::RecordPool nodePool_;
  detail::RecordPool edgePool_;
};

// A graph whose nodes carry a V and whose edges carry an E. new_node() and
// new_edge(v, w) without a payload value-initialise it. Ownership and handle
// rules are those of graph.
template <class V, class E> class GRAPH : public graph {
public:
  using graph::new_edge;
  using graph::new_node;

  GRAPH() : graph(sizeof(detail::NodeRecOf<V>), sizeof(detail::EdgeRecOf<E>)) {}
  node new_node(const V& x) {
    return linkNode(new (nodeMemory(sizeof(detail::NodeRecOf<V>))) detail::NodeRecOf<V>(x));
  }
  edge new_edge(node v, node w, const E& x) {
    return linkEdge(new (edgeMemory(sizeof(detail::EdgeRecOf<E>))) detail::EdgeRecOf<E>(x), v, w);
  }

  const V& inf(node v) const { return payload(v); }
  const E& inf(edge e) const { return payload(e); }
  V& operator[](node v) { return payload(v); }
  const V& operator[](node v) const { return payload(v); }
  E& operator[](edge e) { return payload(e); }
  const E& operator[](edge e) const { return payload(e); }
  void assign(node v, const V& x) { payload(v) = x; }
  void assign(edge e, const E& x) { payload(e) = x; }

protected:
  detail::NodeRec* makeNode() override {
    return new (nodeMemory(sizeof(detail::NodeRecOf<V>))) detail::NodeRecOf<V>(V());
  }
  detail::EdgeRec* makeEdge() override {
    return new (edgeMemory(sizeof(detail::EdgeRecOf<E>))) detail::EdgeRecOf<E>(E());
  }

private:
  static V& payload(node v) { return static_cast<detail::NodeRecOf<V>*>(v)->inf; }
  static E& payload(edge e) { return static_cast<detail::EdgeRecOf<E>*>(e)->inf; }
};

namespace detail {

// Values indexed by node or edge index. The array grows on demand, filling
// new slots with the init value, so it also covers elements created after
// init(). Reading an element the array has not grown to yet yields the init
// value. References stay valid until the array grows.
template <class T, class Rec> class HandleArray {
public:
  T& operator[](Rec* h) {
    assert(h);
    std::size_t i = static_cast<std::size_t>(h->id);
    if (i >= slots_.size())
      slots_.resize(i + 1, Slot<T>{init_});
    return slots_[i].value;
  }

  const T& operator[](Rec* h) const {
    assert(h);
    std::size_t i = static_cast<std::size_t>(h->id);
    return i < slots_.size() ? slots_[i].value : init_;
  }

protected:
  void reset(int maxIndex, T x) {
    init_ = std::move(x);
    slots_.assign(static_cast<std::size_t>(maxIndex + 1), Slot<T>{init_});
  }

private:
  T init_{};
  std::vector<Slot<T>> slots_;
};

} // namespace detail

template <class T> class node_array : public detail::HandleArray<T, detail::NodeRec> {
public:
  node_array() = default;
  explicit node_array(const graph& G, T x = T()) { init(G, std::move(x)); }

  void init(const graph& G, T x = T()) { this->reset(G.max_node_index(), std::move(x)); }
};

template <class T> class edge_array : public detail::HandleArray<T, detail::EdgeRec> {
public:
  edge_array() = default;
  explicit edge_array(const graph& G, T x = T()) { init(G, std::move(x)); }

  void init(const graph& G, T x = T()) { this->reset(G.max_edge_index(), std::move(x)); }
};

} // namespace leda

#endif // HULCVTOOLS_PLATFORM_LEDA_GRAPH_H
