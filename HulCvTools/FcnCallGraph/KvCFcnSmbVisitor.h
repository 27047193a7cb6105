// KvCFcnSmbVisitor: the symbol-database visitor that drives a call graph's construction:
// for each function or macro symbol (the selected ones only, unless told to visit all) it
// lets the graph enter the calls found among the symbol's uses.
#ifndef HULCVTOOLS_FCNCALLGRAPH_KVCFCNSMBVISITOR_H
#define HULCVTOOLS_FCNCALLGRAPH_KVCFCNSMBVISITOR_H

#include "HulCvTools/HulCvToolsExport.h"
#include "HulCvTools/ModelInterfaces/ICodeVisitors.h"

class KvCGenericFunctionCallGraph;

class HULCV_API KvCFcnSmbVisitor : public KV_SmbDBObjVisitor {
public:
  // The graph is not owned and must outlive the visitor.
  KvCFcnSmbVisitor(KvCGenericFunctionCallGraph* graph, bool visitAll)
      : callGraph(graph), visitAllSymbols(visitAll) {}
  ~KvCFcnSmbVisitor() override;

  void visitParamSmbDBObj(KV_ParamSmbDBObj* entry) override;
  void visitUnparamSymbol(KvCUnparamSymbol* symbol) override;

private:
  KvCGenericFunctionCallGraph* callGraph;
  bool visitAllSymbols;
};

#endif
