// Strongly connected components of a leda::graph.
//
// STRONG_COMPONENTS(G, compnum) sets compnum[v] for every node v of G so that
// two nodes get the same number iff each is reachable from the other over
// visible edges, and returns the number c of components. Numbers are 0..c-1,
// given in order of each component's first node in node creation order.
//
// The search is Tarjan's algorithm run with explicit stacks (no recursion, so
// deep graphs do not exhaust the call stack). Each node keeps its position in
// its out-edge list, so every edge is examined once: O(V + E) time, hidden
// edges included in E, and O(max node index) memory.
#ifndef HULCVTOOLS_PLATFORM_LEDA_STRONG_COMPONENTS_H
#define HULCVTOOLS_PLATFORM_LEDA_STRONG_COMPONENTS_H

#include "platform/leda/graph.h"

#include <algorithm>
#include <cstddef>
#include <vector>

namespace leda {
namespace detail {

// One-shot state of a component search over a graph that must not change
// while the search runs.
class SccSearch {
public:
  explicit SccSearch(const graph& G)
      : G_(G), bound_(static_cast<std::size_t>(G.max_node_index() + 1)), order_(bound_, -1),
        low_(bound_, 0), onStack_(bound_, 0), cursor_(bound_, nullptr), comp_(bound_, -1) {}

  int run(node_array<int>& compnum) {
    for (node v : G_.all_nodes()) {
      if (order_[slot(v)] < 0)
        searchFrom(v);
    }
    return renumber(compnum);
  }

private:
  static std::size_t slot(node v) { return static_cast<std::size_t>(v->id); }

  void discover(node v) {
    order_[slot(v)] = low_[slot(v)] = counter_++;
    cursor_[slot(v)] = v->outFirst;
    onStack_[slot(v)] = 1;
    sccStack_.push_back(v);
    callStack_.push_back(v);
  }

  // Next visible out-edge of v not examined yet, or nullptr.
  edge nextEdge(node v) {
    edge e = cursor_[slot(v)];
    while (e && e->hidden())
      e = e->outNext;
    cursor_[slot(v)] = e ? e->outNext : nullptr;
    return e;
  }

  void searchFrom(node root) {
    discover(root);
    while (!callStack_.empty()) {
      node v = callStack_.back();
      if (edge e = nextEdge(v)) {
        visitEdge(v, e->tgt);
        continue;
      }
      callStack_.pop_back();
      if (low_[slot(v)] == order_[slot(v)])
        closeComponent(v);
      if (!callStack_.empty()) {
        int& parentLow = low_[slot(callStack_.back())];
        parentLow = std::min(parentLow, low_[slot(v)]);
      }
    }
  }

  void visitEdge(node v, node w) {
    if (order_[slot(w)] < 0) {
      discover(w);
      return;
    }
    if (onStack_[slot(w)])
      low_[slot(v)] = std::min(low_[slot(v)], order_[slot(w)]);
  }

  // Pops the component rooted at root off the search stack.
  void closeComponent(node root) {
    node w = nullptr;
    do {
      w = sccStack_.back();
      sccStack_.pop_back();
      onStack_[slot(w)] = 0;
      comp_[slot(w)] = components_;
    } while (w != root);
    ++components_;
  }

  int renumber(node_array<int>& compnum) const {
    std::vector<int> finalNumber(static_cast<std::size_t>(components_), -1);
    int next = 0;
    for (node v : G_.all_nodes()) {
      int& number = finalNumber[static_cast<std::size_t>(comp_[slot(v)])];
      if (number < 0)
        number = next++;
      compnum[v] = number;
    }
    return components_;
  }

  const graph& G_;
  std::size_t bound_;
  std::vector<int> order_; // discovery number, -1 if not yet discovered
  std::vector<int> low_;
  std::vector<char> onStack_;
  std::vector<edge> cursor_;
  std::vector<int> comp_; // component number in completion order
  std::vector<node> sccStack_;
  std::vector<node> callStack_;
  int counter_ = 0;
  int components_ = 0;
};

} // namespace detail

inline int STRONG_COMPONENTS(const graph& G, node_array<int>& compnum) {
  return detail::SccSearch(G).run(compnum);
}

} // namespace leda

#endif // HULCVTOOLS_PLATFORM_LEDA_STRONG_COMPONENTS_H
