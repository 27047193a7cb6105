// Fixed-point tools: constants compared with a scaled variable, expressed in the
// variable's implemented units and rounded so that the comparison stays exact; an
// absolute value whose argument is never negative; the branch ranges of an absolute
// value.
#include "DemoSampleApp.h"
#include "DemoSections.h"

#include "HulCvTools/ConstInRelationRounder/KvCConstInRelationRounder.h"
#include "HulCvTools/OpRangeCalculator/KvCOpRangeCalculator.h"
#include "platform/icode/KV_ExprLocation.h"
#include "platform/icode/KV_OpOperator.h"
#include "platform/icode/KV_Range.h"
#include "platform/icode/KV_Scaling.h"

namespace {

struct Relation {
  tagKvEOperatorKind kind;
  const char* symbol;
  double constant;
  int constantIndex; // 0: the constant on the left
};

void showRoundedConstants(DemoRun& run, KV_NumericalType* type, KV_Scaling* scaling) {
  const KvCConstInRelationRounder rounder;
  const Relation relations[] = {{KV_OP_GREATER, ">", 2.6, 1},
                                {KV_OP_GREATER_EQUAL, ">=", 2.6, 1},
                                {KV_OP_GREATER, ">", 7.3, 0}};
  run.out << "  speed is Int16 with LSB " << scaling->getLsb() << ":\n";
  for (const Relation& r : relations) {
    long long implemented = 0;
    rounder.scaleAndRoundConstant(KV_OpOperator::get(r.kind), r.constant, r.constantIndex, type,
                                  scaling, implemented);
    if (r.constantIndex == 0)
      run.out << "    " << r.constant << " " << r.symbol << " speed   ->   " << implemented << " "
              << r.symbol << " speed_impl\n";
    else
      run.out << "    speed " << r.symbol << " " << r.constant << "   ->   speed_impl " << r.symbol
              << " " << implemented << "\n";
  }
}

void showAbs(DemoRun& run, KV_NumericalType* type, KV_Scaling* scaling) {
  KvCOpRangeCalculator calculator;
  AppBuilder& app = run.sample.app;
  KV_ExprLocation* argument = app.access(run.sample.limit);
  argument->setValueRange(KV_Range::makeIntRange(0, 400));
  bool neverNegative = false;
  bool neverPositive = false;
  calculator.checkAbsForSimplification(argument, type, scaling, neverNegative, neverPositive);
  run.out << "  abs(limit), limit in [0, 100] physical: "
          << (neverNegative
                  ? "never negative, abs(limit) is limit"
                  : (neverPositive ? "never positive, abs(limit) is -limit" : "not simplified"))
          << "\n";
  KV_Range plain;
  KV_Range negated;
  calculator.calcRangesForAbs(KV_OpOperator::get(KV_OP_GREATER), KV_Range(-3.3, 5.1), type, scaling,
                              nullptr, plain, negated);
  run.out << "  abs(x) as (x > 0 ? x : -x), x in [-3.3, 5.1]: branch x in ["
          << plain.getInt64LowerLimit() << ", " << plain.getInt64UpperLimit() << "], branch -x in ["
          << negated.getInt64LowerLimit() << ", " << negated.getInt64UpperLimit()
          << "] (implemented units)\n";
}

} // namespace

void demoFixedPoint(DemoRun& run) {
  printSectionTitle(run.out, "Fixed-point constants in relations and absolute values");
  AppBuilder& app = run.sample.app;
  KV_NumericalType* type = app.int16()->asNumericalType();
  KV_Scaling* scaling = app.scaling(0.25);
  showRoundedConstants(run, type, scaling);
  showAbs(run, type, scaling);
}
