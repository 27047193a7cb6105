// Shared helpers of the call-graph tests: an application fixture with a clean message
// server, call statements in function bodies, and plain snapshots of a graph.
#ifndef HUL_TESTS_FCNCALLGRAPH_FCGTESTSUPPORT_H
#define HUL_TESTS_FCNCALLGRAPH_FCGTESTSUPPORT_H

#include "HulCvTools/ExprLocDBBuilder/KvCExprLocDBBuilder.h"
#include "HulCvTools/FcnCallGraph/KvCGenericFunctionCallGraph.h"
#include "platform/builder/AppBuilder.h"
#include "platform/icode/KV_ExprLocation.h"
#include "platform/icode/KV_Operation.h"
#include "platform/icode/KvCCallOperation.h"
#include "platform/icode/KvCFcgFunctionInfo.h"
#include "platform/support/KvCMessageServer.h"

#include <gtest/gtest.h>

#include <set>
#include <tuple>
#include <vector>

namespace fcgtest {

using Infos = std::vector<KvCFcgFunctionInfo*>;
// (calling, called, cardinality, task call), in edge order.
using EdgeRow = std::tuple<KvCFcgFunctionInfo*, KvCFcgFunctionInfo*, int, bool>;
using Edges = std::vector<EdgeRow>;

inline KvCMessageServer& server() { return *KvCMessageServer::getMessageServer(); }
inline KvCFcgFunctionInfo* infoOf(KvCParamSymbol* fn) { return fn->getFunctionInfo(); }

// Records what a traversal applies it to; asks to stop once `limit` functions were applied.
class Recorder : public KvCFcgFunctor {
public:
  explicit Recorder(int stopAfter = -1) : limit(stopAfter) {}
  void operator()(KvCFcgFunctionInfo* function) override { applied.push_back(function); }
  bool stopIteration() override { return limit >= 0 && static_cast<int>(applied.size()) >= limit; }
  Infos applied;

private:
  int limit;
};

inline Infos nodesOf(const KvCGenericFunctionCallGraph& g) {
  Infos result;
  for (leda::node v : g.all_nodes())
    result.push_back(g.inf(v));
  return result;
}

inline Edges edgesOf(const KvCGenericFunctionCallGraph& g) {
  Edges result;
  for (leda::edge e : g.all_edges())
    result.emplace_back(g.inf(g.source(e)), g.inf(g.target(e)), g.inf(e)->getCardinality(),
                        g.inf(e)->isTaskCall());
  return result;
}

inline Infos infosOf(const KvCGenericFunctionCallGraph& g, const leda::list<leda::node>& nodes) {
  Infos result;
  for (leda::node v : nodes)
    result.push_back(g.inf(v));
  return result;
}

inline std::set<KvCCallOperation*> callsOf(KvCParamSymbol* fn) {
  const auto& calls = infoOf(fn)->getCallOperationsSet();
  return {calls.begin(), calls.end()};
}

inline std::set<KvCParamSymbol*> calledOf(KvCParamSymbol* fn) {
  std::set<KvCParamSymbol*> result;
  for (const KvCFcgCalledFunction& called : infoOf(fn)->getCalledFunctionsSet())
    result.insert(called.symbol);
  return result;
}

class AppFixture : public ::testing::Test {
protected:
  void SetUp() override { server().clear(); }
  void TearDown() override { server().clear(); }

  KvCParamSymbol* fn(const char* name) { return app.function(name).symbol(); }
  KvCFcgFunctionInfo* info(const char* name) { return infoOf(fn(name)); }

  // A call statement in the caller's body; `task` makes it a task activation.
  KvCCallOperation* call(const char* caller, KvCParamSymbol* called, bool task = false) {
    KV_ExprLocation* loc = task ? app.taskActivation(called) : app.call(called, {});
    app.function(caller).body().stmt(loc);
    return loc->getOperation()->asCallOperation();
  }
  KvCCallOperation* task(const char* caller, KvCParamSymbol* called) {
    return call(caller, called, true);
  }

  void buildDatabases() {
    KvCExprLocDBBuilder builder;
    ASSERT_TRUE(builder.boot(&app.data()));
    ASSERT_TRUE(builder.rebuildExprLocDBs());
  }

  static std::vector<int> messageNumbers() {
    std::vector<int> numbers;
    for (const KvCMessageRecord& m : server().getMessages())
      numbers.push_back(m.number);
    return numbers;
  }

  AppBuilder app;
};

} // namespace fcgtest

#endif
