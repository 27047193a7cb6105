// Expression-location queries: for a handful of locations of the sample application,
// where they stand and what role they play.
#include "DemoSampleApp.h"
#include "DemoSections.h"

#include "HulCvTools/ElocQuery/KvCElocQuery.h"
#include "platform/icode/KvCIcFileId.h"
#include "platform/icode/KvCParamSymbol.h"

#include <iomanip>
#include <string>
#include <vector>

namespace {

using Q = KvCElocQuery;

std::vector<std::string> factsAbout(KV_ExprLocation* loc) {
  std::vector<std::string> facts;
  auto note = [&](bool holds, const char* text) {
    if (holds)
      facts.emplace_back(text);
  };
  note(Q::isLhsOfAssign(loc), "left side of an assignment");
  note(Q::isRhsOfAssign(loc), "right side of an assignment");
  note(Q::isOnlyDefinedInParentOp(loc), "only defined by its operation");
  note(Q::isOnlyUsedInParentOp(loc), "only used by its operation");
  note(Q::isLocatedInLoopCondition(loc), "in a loop condition");
  note(Q::isPartOfBooleanLogicExpression(loc), "part of a boolean expression");
  note(Q::isContainedInIndexOperation(loc), "index expression of an array access");
  note(Q::isActualOfCall(loc), "actual argument of a call");
  note(Q::isSubjectToConstConversion(loc), "converted to const");
  note(Q::isLocatedInRestartFunction(loc), "in a restart function");
  KV_ExprLocation* outer = nullptr;
  int casts = 0;
  Q::getParentELocBySkippingCasts(loc, outer, casts);
  if (casts > 0)
    facts.push_back("under " + std::to_string(casts) + " cast(s)");
  return facts;
}

} // namespace

void demoElocQuery(DemoRun& run) {
  printSectionTitle(run.out, "Expression-location queries");
  for (const auto& [name, loc] : run.sample.spots) {
    KvCParamSymbol* function = Q::getCodeBlockSymbol(loc);
    KvCIcFileId* file = Q::getFile(loc);
    run.out << "  " << name << "\n    in " << (function ? function->getName().str() : "-") << " ("
            << (file ? file->getName().str() : "-") << ")";
    for (const std::string& fact : factsAbout(loc))
      run.out << "; " << fact;
    run.out << "\n";
  }
}
