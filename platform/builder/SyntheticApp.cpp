#include "platform/builder/SyntheticApp.h"

#include "platform/icode/KV_ICodeElemVisitor.h"
#include "platform/icode/KV_Operation.h"
#include "platform/icode/KV_Statement.h"
#include "platform/icode/KvCCStmTable.h"
#include "platform/icode/KvCCallOperation.h"
#include "platform/icode/KvCICodeIterator.h"
#include "platform/icode/KvCIcFileId.h"
#include "platform/icode/KvCParamSymbol.h"
#include "platform/icode/KvCUnparamSymbol.h"

#include <algorithm>
#include <random>
#include <string>
#include <utility>
#include <vector>

namespace {

constexpr int kFunctionsPerFile = 256;
constexpr int kArraySize = 64;
constexpr int kLoopCount = 8;

// Draws from std::mt19937_64 without the standard distributions, whose results differ
// between standard libraries.
class Draw {
public:
  explicit Draw(std::uint64_t seed) : engine(seed) {}
  // Uniform in [0, n); 0 for n <= 1.
  int below(int n) {
    return n <= 1 ? 0 : static_cast<int>(engine() % static_cast<std::uint64_t>(n));
  }
  bool chance(double p) {
    const double unit = static_cast<double>(engine() >> 11) * (1.0 / 9007199254740992.0);
    return unit < p;
  }

private:
  std::mt19937_64 engine;
};

SyntheticAppShape clamped(SyntheticAppShape s) {
  s.functions = std::max(s.functions, 0);
  s.statementsPerBody = std::max(s.statementsPerBody, 0);
  s.callFanOut = std::max(s.callFanOut, 0);
  s.schedulerCalls = std::clamp(s.schedulerCalls, 0, s.functions);
  s.recursionCycles = s.functions < 2 ? 0 : std::max(s.recursionCycles, 0);
  s.taskActivationShare = std::clamp(s.taskActivationShare, 0.0, 1.0);
  s.expressionDepth = std::max(s.expressionDepth, 0);
  s.variables = std::max(s.variables, 1);
  return s;
}

class Generator {
public:
  Generator(AppBuilder& builder, const SyntheticAppShape& s)
      : app(builder), shape(clamped(s)), draw(shape.seed) {}

  void build() {
    makeVariables();
    KvCIcFileId* home = app.currentFile();
    makeFunctions();
    planCalls();
    FunctionBuilder* scheduler = nullptr;
    if (shape.schedulerCalls > 0) {
      app.file(home->getName().c_str());
      scheduler = &app.function("sched");
      scheduler->symbol()->markAsRtosScheduleFcn();
    }
    for (std::size_t i = 0; i < functions.size(); ++i)
      fillBody(functions[i]->body(), callees[i]);
    if (scheduler)
      for (int callee : schedulerCallees)
        callStatement(scheduler->body(), callee);
  }

private:
  void makeVariables() {
    types[0] = app.int16();
    types[1] = app.int32();
    types[2] = app.uint8();
    int16 = types[0];
    int32 = types[1];
    variables.reserve(static_cast<std::size_t>(shape.variables));
    for (int v = 0; v < shape.variables; ++v) {
      const std::string name = std::string("v").append(std::to_string(v));
      // Mostly Int16; every fourth Int32, every seventh UInt8.
      KV_DataType* type = v % 7 == 6 ? types[2] : (v % 4 == 3 ? types[1] : types[0]);
      variables.push_back(app.variable(name.c_str(), type));
    }
    array = app.variable("varr", app.arrayOf(int16, kArraySize));
  }

  void makeFunctions() {
    functions.reserve(static_cast<std::size_t>(shape.functions));
    for (int i = 0; i < shape.functions; ++i) {
      if (i % kFunctionsPerFile == 0)
        app.file(std::string("syn").append(std::to_string(i / kFunctionsPerFile)).append(".c").c_str());
      functions.push_back(&app.function(std::string("f").append(std::to_string(i)).c_str()));
    }
  }

  void planCalls() {
    const int n = shape.functions;
    callees.assign(static_cast<std::size_t>(n), {});
    for (int i = 0; i + 1 < n; ++i)
      for (int k = 0; k < shape.callFanOut; ++k)
        callees[static_cast<std::size_t>(i)].push_back(i + 1 + draw.below(n - 1 - i));
    for (int c = 0; c < shape.recursionCycles; ++c) {
      const int length = std::min(2 + draw.below(3), n);
      std::vector<int> members;
      while (static_cast<int>(members.size()) < length) {
        const int f = draw.below(n);
        if (std::find(members.begin(), members.end(), f) == members.end())
          members.push_back(f);
      }
      for (int k = 0; k < length; ++k)
        callees[static_cast<std::size_t>(members[static_cast<std::size_t>(k)])].push_back(
            members[static_cast<std::size_t>((k + 1) % length)]);
    }
    // The scheduler's callees: the first schedulerCalls of a partial shuffle.
    std::vector<int> all(static_cast<std::size_t>(n));
    for (int i = 0; i < n; ++i)
      all[static_cast<std::size_t>(i)] = i;
    for (int k = 0; k < shape.schedulerCalls; ++k)
      std::swap(all[static_cast<std::size_t>(k)],
                all[static_cast<std::size_t>(k + draw.below(n - k))]);
    schedulerCallees.assign(all.begin(), all.begin() + shape.schedulerCalls);
  }

  // The filler statements and the calls, in an order drawn at random.
  void fillBody(BlockBuilder& body, const std::vector<int>& calls) {
    std::vector<int> order(static_cast<std::size_t>(shape.statementsPerBody), -1);
    order.insert(order.end(), calls.begin(), calls.end());
    for (std::size_t k = order.size(); k > 1; --k)
      std::swap(order[k - 1], order[static_cast<std::size_t>(draw.below(static_cast<int>(k)))]);
    for (int entry : order) {
      if (entry < 0)
        fillerStatement(body);
      else
        callStatement(body, entry);
    }
  }

  void callStatement(BlockBuilder& body, int callee) {
    KvCParamSymbol* fn = functions[static_cast<std::size_t>(callee)]->symbol();
    if (draw.chance(shape.taskActivationShare)) {
      fn->setRole(KV_ROLE_TASK_FUNCTION, true);
      body.activateTask(fn);
      return;
    }
    KV_ExprLocation* first = expr(draw.below(2));
    if (draw.below(2) == 0) {
      body.call(fn, {first});
      return;
    }
    KV_ExprLocation* second = expr(draw.below(2));
    body.call(fn, {first, second});
  }

  void fillerStatement(BlockBuilder& body) {
    const int depth = shape.expressionDepth;
    const int kind = draw.below(100);
    if (kind < 55) {
      KV_ExprLocation* lhs = app.access(anyVariable());
      KV_ExprLocation* rhs = expr(depth);
      body.assign(lhs, rhs);
    } else if (kind < 65) {
      KV_ExprLocation* lhs = app.access(anyVariable());
      KV_ExprLocation* rhs = expr(std::max(depth - 1, 0));
      body.stmt(app.op(KV_OP_ADD_ASSIGN, {lhs, rhs}));
    } else if (kind < 82) {
      static constexpr tagKvEOperatorKind kRelations[] = {KV_OP_LESS, KV_OP_GREATER, KV_OP_EQUAL,
                                                          KV_OP_LESS_EQUAL};
      const tagKvEOperatorKind relation = kRelations[draw.below(4)];
      KV_ExprLocation* left = expr(std::max(depth - 1, 0));
      KV_ExprLocation* right = expr(draw.below(std::max(depth, 1)));
      BlockBuilder& then = body.ifThen(app.op(relation, {left, right}));
      KV_ExprLocation* lhs = app.access(anyVariable());
      KV_ExprLocation* rhs = expr(depth);
      then.assign(lhs, rhs);
    } else {
      KvCUnparamSymbol* counter = anyVariable();
      const int offset = draw.below(kArraySize - kLoopCount + 1);
      // One element per statement: the serial numbers do not depend on the compiler's
      // order of evaluating arguments.
      KV_ExprLocation* initLhs = app.access(counter);
      KV_ExprLocation* zero = app.constant(std::int64_t{0}, int16);
      KV_ExprLocation* init = app.assignExpr(initLhs, zero);
      KV_ExprLocation* condLhs = app.access(counter);
      KV_ExprLocation* bound = app.constant(std::int64_t{kLoopCount}, int16);
      KV_ExprLocation* cond = app.less(condLhs, bound);
      KV_ExprLocation* incr = app.op(KV_OP_POST_INCREMENT, {app.access(counter)});
      BlockBuilder& loop = body.forLoop(init, cond, incr);
      KV_ExprLocation* indexBase = app.access(counter);
      KV_ExprLocation* indexOffset = app.constant(std::int64_t{offset}, int16);
      KV_ExprLocation* index = app.add(indexBase, indexOffset);
      KV_ExprLocation* lhs = app.element(array, {index});
      KV_ExprLocation* rhs = expr(depth);
      loop.assign(lhs, rhs);
    }
  }

  // An expression with exactly `depth` levels of operations above its leaves.
  KV_ExprLocation* expr(int depth) {
    if (depth <= 0)
      return leaf();
    const int kind = draw.below(10);
    if (kind == 9) {
      KV_DataType* target = draw.below(2) == 0 ? int32 : int16;
      return app.cast(target, expr(depth - 1));
    }
    static constexpr tagKvEOperatorKind kBinary[] = {KV_OP_ADD, KV_OP_ADD,     KV_OP_ADD,
                                                     KV_OP_SUB, KV_OP_SUB,     KV_OP_MUL,
                                                     KV_OP_MUL, KV_OP_BIT_AND, KV_OP_BIT_AND};
    // One side has the full depth, the other any smaller one.
    KV_ExprLocation* deep = expr(depth - 1);
    KV_ExprLocation* shallow = expr(draw.below(depth));
    if (draw.below(2) == 0)
      std::swap(deep, shallow);
    return app.op(kBinary[kind], {deep, shallow});
  }

  KV_ExprLocation* leaf() {
    if (draw.below(10) < 7)
      return app.access(anyVariable());
    return app.constant(std::int64_t{draw.below(200)}, int16);
  }

  KvCUnparamSymbol* anyVariable() {
    return variables[static_cast<std::size_t>(draw.below(static_cast<int>(variables.size())))];
  }

  AppBuilder& app;
  SyntheticAppShape shape;
  Draw draw;
  KV_DataType* types[3] = {nullptr, nullptr, nullptr};
  KV_DataType* int16 = nullptr;
  KV_DataType* int32 = nullptr;
  std::vector<KvCUnparamSymbol*> variables;
  KvCUnparamSymbol* array = nullptr;
  std::vector<FunctionBuilder*> functions;
  std::vector<std::vector<int>> callees;
  std::vector<int> schedulerCallees;
};

class Counter : public KV_ICodeElemVisitor {
public:
  SyntheticAppCounts counts;

  void visitExprLocation(KV_ExprLocation*) override { ++counts.expressionLocations; }
  void visitOperation(KV_Operation* op) override {
    if (op->getOperator()->isFunctionDefinition())
      ++counts.functions;
    if (KvCCallOperation* call = op->asCallOperation()) {
      ++counts.calls;
      if (call->isTaskActivation())
        ++counts.taskActivations;
    }
  }
  void visitStatement(KV_Statement* statement) override {
    KvCCStmTable* table = statement->getParentCTable();
    if (table && table->getCodeBlockSymbol())
      ++counts.statements;
  }
};

} // namespace

void buildSyntheticApp(AppBuilder& app, const SyntheticAppShape& shape) {
  Generator(app, shape).build();
}

SyntheticAppCounts countSyntheticApp(KvCCodeViewData& data) {
  Counter counter;
  KvCICodeIterator().iterate(data.getApplication(), &counter);
  return counter.counts;
}
