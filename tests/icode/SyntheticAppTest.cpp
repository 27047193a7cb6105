// The synthetic application generator: the same application for a seed, another for
// another seed, and the shape it was asked for (call graph, scheduler, cycles, task
// activations, expression depth).
#include "ModelChecks.h"

#include "platform/builder/SyntheticApp.h"
#include "platform/icode/KvCCStmTable.h"
#include "platform/icode/KvCCallOperation.h"
#include "platform/icode/KvCParamSymbol.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <map>
#include <set>
#include <string>
#include <vector>

namespace {

using icode_test::TraceVisitor;

SyntheticAppShape smallShape(std::uint64_t seed) {
  SyntheticAppShape s;
  s.functions = 40;
  s.statementsPerBody = 6;
  s.callFanOut = 2;
  s.schedulerCalls = 10;
  s.recursionCycles = 3;
  s.taskActivationShare = 0.25;
  s.expressionDepth = 3;
  s.variables = 12;
  s.seed = seed;
  return s;
}

std::vector<std::string> traceOf(AppBuilder& app) {
  TraceVisitor v;
  KvCICodeIterator().iterate(app.data().getApplication(), &v);
  return v.trace;
}

bool sameCounts(const SyntheticAppCounts& a, const SyntheticAppCounts& b) {
  return a.functions == b.functions && a.statements == b.statements && a.calls == b.calls &&
         a.taskActivations == b.taskActivations && a.expressionLocations == b.expressionLocations;
}

// The calls found in the application: caller name -> callee names, in walk order.
class CallCollector : public KV_ICodeElemVisitor {
public:
  std::map<std::string, std::vector<std::string>> calls;
  void visitOperation(KV_Operation* op) override {
    if (KvCCallOperation* call = op->asCallOperation()) {
      KvCParamSymbol* caller = call->getCallingSymbol();
      calls[caller ? caller->getName().str() : "<none>"].push_back(
          call->getCalledSymbol()->getName().str());
    }
  }
};

std::map<std::string, std::vector<std::string>> callsOf(AppBuilder& app) {
  CallCollector c;
  KvCICodeIterator().iterate(app.data().getApplication(), &c);
  return c.calls;
}

int indexOf(const std::string& name) { return std::stoi(name.substr(1)); }

// The functions that reach themselves through one or more calls.
std::set<std::string> recursive(const std::map<std::string, std::vector<std::string>>& calls) {
  std::set<std::string> result;
  for (const auto& entry : calls) {
    std::set<std::string> seen;
    std::vector<std::string> work = entry.second;
    while (!work.empty()) {
      const std::string f = work.back();
      work.pop_back();
      if (f == entry.first)
        result.insert(f);
      if (!seen.insert(f).second)
        continue;
      auto it = calls.find(f);
      if (it != calls.end())
        work.insert(work.end(), it->second.begin(), it->second.end());
    }
  }
  return result;
}

// Levels of operations above the leaves; a cast's type operand is a leaf.
int depthOf(const KV_ExprLocation* loc) {
  const KV_Operation* op = loc ? loc->getOperation() : nullptr;
  if (!op || op->getNumberOfOperands() == 0)
    return 0;
  int deepest = 0;
  for (int i = 0; i < op->getNumberOfOperands(); ++i)
    deepest = std::max(deepest, depthOf(op->getOperand(i)));
  return deepest + 1;
}

TEST(SyntheticAppTest, SameSeedSameApplicationOtherSeedAnother) {
  AppBuilder first;
  AppBuilder second;
  AppBuilder other;
  buildSyntheticApp(first, smallShape(7));
  buildSyntheticApp(second, smallShape(7));
  buildSyntheticApp(other, smallShape(8));
  EXPECT_TRUE(sameCounts(countSyntheticApp(first.data()), countSyntheticApp(second.data())));
  EXPECT_EQ(first.data().getNumberOfElements(), second.data().getNumberOfElements());
  const std::vector<std::string> trace = traceOf(first);
  EXPECT_EQ(trace, traceOf(second));
  EXPECT_NE(trace, traceOf(other));
  EXPECT_NE(callsOf(first), callsOf(other));
}

TEST(SyntheticAppTest, CountsAndCallGraphFollowTheShape) {
  const SyntheticAppShape shape = smallShape(11);
  AppBuilder app;
  buildSyntheticApp(app, shape);
  const SyntheticAppCounts counts = countSyntheticApp(app.data());
  EXPECT_EQ(counts.functions, shape.functions + 1);
  const int acyclic = (shape.functions - 1) * shape.callFanOut;
  EXPECT_GE(counts.calls, acyclic + shape.schedulerCalls + 2 * shape.recursionCycles);
  EXPECT_LE(counts.calls, acyclic + shape.schedulerCalls + 4 * shape.recursionCycles);
  EXPECT_GT(counts.taskActivations, 0);
  EXPECT_LT(counts.taskActivations, counts.calls);
  EXPECT_GE(counts.statements, shape.functions * shape.statementsPerBody + counts.calls);
  EXPECT_GT(counts.expressionLocations, counts.statements * 3);

  const auto calls = callsOf(app);
  // The scheduler calls exactly schedulerCalls distinct functions.
  ASSERT_EQ(calls.count("sched"), 1u);
  const std::vector<std::string>& fromSched = calls.at("sched");
  EXPECT_EQ(fromSched.size(), static_cast<std::size_t>(shape.schedulerCalls));
  EXPECT_EQ(std::set<std::string>(fromSched.begin(), fromSched.end()).size(),
            static_cast<std::size_t>(shape.schedulerCalls));
  EXPECT_EQ(calls.count("<none>"), 0u);
  // Cycles exist: at least two functions reach themselves.
  EXPECT_GE(recursive(calls).size(), 2u);
  EXPECT_EQ(recursive(calls).count("sched"), 0u);
  // Every function but the last calls at least callFanOut later functions.
  for (int i = 0; i + 1 < shape.functions; ++i) {
    const std::string name = "f" + std::to_string(i);
    int later = 0;
    for (const std::string& callee :
         calls.count(name) ? calls.at(name) : std::vector<std::string>{})
      later += indexOf(callee) > i;
    EXPECT_GE(later, shape.callFanOut) << name;
  }
}

TEST(SyntheticAppTest, WithoutCyclesEveryCallGoesForward) {
  SyntheticAppShape shape = smallShape(3);
  shape.recursionCycles = 0;
  shape.schedulerCalls = 0;
  shape.taskActivationShare = 0.0;
  AppBuilder app;
  buildSyntheticApp(app, shape);
  const SyntheticAppCounts counts = countSyntheticApp(app.data());
  EXPECT_EQ(counts.functions, shape.functions);
  EXPECT_EQ(counts.calls, (shape.functions - 1) * shape.callFanOut);
  EXPECT_EQ(counts.taskActivations, 0);
  const auto calls = callsOf(app);
  EXPECT_TRUE(recursive(calls).empty());
  EXPECT_EQ(calls.count("sched"), 0u);
  for (const auto& [caller, callees] : calls)
    for (const std::string& callee : callees)
      EXPECT_GT(indexOf(callee), indexOf(caller)) << caller << " -> " << callee;
}

TEST(SyntheticAppTest, EveryCallIsATaskActivationAtShareOne) {
  SyntheticAppShape shape = smallShape(5);
  shape.taskActivationShare = 1.0;
  AppBuilder app;
  buildSyntheticApp(app, shape);
  const SyntheticAppCounts counts = countSyntheticApp(app.data());
  EXPECT_GT(counts.calls, 0);
  EXPECT_EQ(counts.taskActivations, counts.calls);
}

TEST(SyntheticAppTest, AssignmentsHaveTheRequestedDepthAndTheTreeIsCoherent) {
  for (int depth : {0, 1, 4}) {
    SyntheticAppShape shape = smallShape(static_cast<std::uint64_t>(depth) + 20);
    shape.expressionDepth = depth;
    AppBuilder app;
    buildSyntheticApp(app, shape);
    int assignments = 0;
    for (int i = 0; i < shape.functions; ++i) {
      KV_StatementTable* body =
          app.functionBuilder(("f" + std::to_string(i)).c_str()).body().table();
      for (int s = 0; s < body->getNumberOfStatements(); ++s) {
        KV_ExprLocation* root = body->getStatement(s)->getExprLoc();
        KV_Operation* op = root ? root->getOperation() : nullptr;
        if (op && op->getOperator()->isPlainAssign()) {
          ++assignments;
          EXPECT_EQ(depthOf(op->getOperand(1)), depth) << "f" << i << " statement " << s;
        }
      }
    }
    EXPECT_GT(assignments, shape.functions);
    const std::vector<std::string> faults =
        icode_test::coherenceFaults(app.data().getApplication());
    EXPECT_TRUE(faults.empty()) << icode_test::joinFaults(faults);
  }
}

TEST(SyntheticAppTest, DegenerateShapesAreClamped) {
  SyntheticAppShape shape;
  shape.functions = 1;
  shape.statementsPerBody = -3;
  shape.callFanOut = 5;
  shape.schedulerCalls = 9;
  shape.recursionCycles = 4;
  shape.taskActivationShare = 2.0;
  shape.expressionDepth = -1;
  shape.variables = 0;
  AppBuilder app;
  buildSyntheticApp(app, shape);
  const SyntheticAppCounts counts = countSyntheticApp(app.data());
  EXPECT_EQ(counts.functions, 2); // f0 and the scheduler
  EXPECT_EQ(counts.calls, 1);     // the scheduler's one call; f0 has no later function
  EXPECT_EQ(counts.taskActivations, 1);
  EXPECT_EQ(counts.statements, 1);
}

} // namespace
