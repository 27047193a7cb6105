// Reuse call graph: a small partitioned application in which one partition's code is
// reused by a second partition. The controller calls both instances of the filter, and
// the filter's step function calls a lookup helper. The reuse call graph joins the
// partition functions per pair of instances, so the controller's step function calls the
// filter's step function twice, once per instance, and the helper is reached from each
// instance of the filter.
#include "DemoSections.h"

#include "HulCvTools/ExprLocDBBuilder/KvCExprLocDBBuilder.h"
#include "HulCvTools/FcnCallGraph/KvCFcnReuseCallGraph.h"
#include "platform/builder/AppBuilder.h"
#include "platform/builder/PartitionBuilder.h"
#include "platform/icode/KvCFcgFunctionInfo.h"
#include "platform/icode/KvCParamSymbol.h"
#include "platform/view/KvCCbActualInterface.h"

#include <ostream>
#include <string>

namespace {

std::string instanceName(const KvCCbActualInterface* instance) {
  return instance ? std::string(instance->getName().c_str()) : std::string("-");
}

} // namespace

void demoReuseCallGraph(DemoRun& run) {
  printSectionTitle(run.out, "Reuse call graph");
  AppBuilder app("Partitioned");
  PartitionedAppBuilder model(app);
  auto& controller = model.partition("Ctrl").withTerm();
  auto& filter = model.partition("Filter").withTerm();
  auto& secondFilter = model.instance("Filter2", filter);
  filter.calledBy(controller);
  secondFilter.calledBy(controller);
  model.auxFunction("Filter_lookup");
  filter.step().body().call(app.function("Filter_lookup").symbol(), {});
  model.auxFunction("Rte_Read_speed", KV_FROLE_RTE_API_FUNC_CALL);
  controller.step().body().call(app.function("Rte_Read_speed").symbol(), {});

  KvCExprLocDBBuilder databases;
  databases.boot(&app.data());
  databases.buildExprLocDBs();
  KvCFunctionCallGraph real;
  real.boot();
  real.construct(false);
  KvCFcnReuseCallGraph reuse;
  reuse.boot(&real, &model.view());
  if (!reuse.construct()) {
    run.out << "  the reuse call graph could not be built\n";
    return;
  }
  run.out << "  " << reuse.number_of_nodes() << " functions, " << reuse.number_of_edges()
          << " edges (the real call graph has " << real.number_of_edges() << ")\n";
  for (leda::edge e : reuse.all_edges()) {
    const KvCFcgEdgeInfo* info = reuse.inf(e);
    run.out << "  " << reuse.inf(reuse.source(e))->getSymbol()->getName().c_str() << " ["
            << instanceName(info->getCallingInstanceId()) << "] -> "
            << reuse.inf(reuse.target(e))->getSymbol()->getName().c_str() << " ["
            << instanceName(info->getCalledInstanceId()) << "]  x" << info->getCardinality()
            << "\n";
  }
  reuse.shutdown();
  real.shutdown();
}
