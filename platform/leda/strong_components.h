// Strongly connected components of a leda::graph.
//
// STRONG_COMPONENTS(G, compnum) sets compnum[v] for every node v of G so that
// two nodes get the same number iff each is reachable from the other over
// visible edges, and returns the number c of components. Numbers are 0..c-1,
// given in order of each component's first node in node creation order.
//
// The search is Tarjan's algorithm run with explicit stacks (no recursion, so
// deep graphs do not exhaust the call stack) over a compact copy of the visible
// edges. Each node keeps its position in its out-edges, so every edge is examined
// once: O(V + E) time, hidden edges included in E, and O(max node index + E) memory.
#ifndef HULCVTOOLS_PLATFORM_LEDA_STRONG_COMPONENTS_H
#define HULCVTOOLS_PLATFORM_LEDA_STRONG_COMPONENTS_H

#include "platform/leda/graph.h"

#include <algorithm>
#include <cstddef>
#include <utility>
#include <vector>

namespace leda {
namespace detail {

// One-shot state of a component search over a graph that must not change
// while the search runs. The visible edges are first copied, in creation order, into
// per-node arrays of target indices (a stable counting sort by source), so the search
// reads contiguous integers instead of following edge records scattered over memory.
class SccSearch {
public:
  explicit SccSearch(const graph& G)
      : G_(G), bound_(static_cast<std::size_t>(G.max_node_index() + 1)), order_(bound_, -1),
        low_(bound_, 0), onStack_(bound_, 0), cursor_(bound_, 0), comp_(bound_, -1),
        firstOut_(bound_ + 1, 0) {
    // One walk over the edge records; the sort then runs over the compact pairs.
    std::vector<std::pair<int, int>> pairs;
    pairs.reserve(static_cast<std::size_t>(G_.number_of_edges()));
    for (edge e : G_.all_edges()) {
      pairs.emplace_back(e->src->id, e->tgt->id);
      ++firstOut_[slot(e->src) + 1];
    }
    for (std::size_t i = 0; i < bound_; ++i)
      firstOut_[i + 1] += firstOut_[i];
    targets_.resize(firstOut_[bound_]);
    std::vector<std::size_t> fill(firstOut_.begin(), firstOut_.end() - 1);
    for (const auto& [source, target] : pairs)
      targets_[fill[at(source)]++] = target;
  }

  int run(node_array<int>& compnum) {
    for (node v : G_.all_nodes()) {
      if (order_[slot(v)] < 0)
        searchFrom(v->id);
    }
    return renumber(compnum);
  }

private:
  static std::size_t slot(node v) { return static_cast<std::size_t>(v->id); }
  static std::size_t at(int v) { return static_cast<std::size_t>(v); }

  void discover(int v) {
    order_[at(v)] = low_[at(v)] = counter_++;
    cursor_[at(v)] = firstOut_[at(v)];
    onStack_[at(v)] = 1;
    sccStack_.push_back(v);
    callStack_.push_back(v);
  }

  void searchFrom(int root) {
    discover(root);
    while (!callStack_.empty()) {
      const int v = callStack_.back();
      std::size_t& next = cursor_[at(v)];
      if (next < firstOut_[at(v) + 1]) {
        visitEdge(v, targets_[next++]);
        continue;
      }
      callStack_.pop_back();
      if (low_[at(v)] == order_[at(v)])
        closeComponent(v);
      if (!callStack_.empty()) {
        int& parentLow = low_[at(callStack_.back())];
        parentLow = std::min(parentLow, low_[at(v)]);
      }
    }
  }

  void visitEdge(int v, int w) {
    if (order_[at(w)] < 0) {
      discover(w);
      return;
    }
    if (onStack_[at(w)])
      low_[at(v)] = std::min(low_[at(v)], order_[at(w)]);
  }

  // Pops the component rooted at root off the search stack.
  void closeComponent(int root) {
    int w = -1;
    do {
      w = sccStack_.back();
      sccStack_.pop_back();
      onStack_[at(w)] = 0;
      comp_[at(w)] = components_;
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
  std::vector<std::size_t> cursor_;   // next position in targets_ to examine
  std::vector<int> comp_;             // component number in completion order
  std::vector<std::size_t> firstOut_; // node i's targets: [firstOut_[i], firstOut_[i + 1])
  std::vector<int> targets_;
  std::vector<int> sccStack_;
  std::vector<int> callStack_;
  int counter_ = 0;
  int components_ = 0;
};

} // namespace detail

inline int STRONG_COMPONENTS(const graph& G, node_array<int>& compnum) {
  return detail::SccSearch(G).run(compnum);
}

} // namespace leda

#endif // HULCVTOOLS_PLATFORM_LEDA_STRONG_COMPONENTS_H
