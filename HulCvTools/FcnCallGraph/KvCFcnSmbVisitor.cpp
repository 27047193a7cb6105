#include "HulCvTools/FcnCallGraph/KvCFcnSmbVisitor.h"

#include "HulCvTools/FcnCallGraph/KvCGenericFunctionCallGraph.h"
#include "HulCvTools/ModelInterfaces/ICodeModel.h"

KvCFcnSmbVisitor::~KvCFcnSmbVisitor() = default;

void KvCFcnSmbVisitor::visitParamSmbDBObj(KV_ParamSmbDBObj* entry) {
  if (!entry || !callGraph)
    return;
  if (!visitAllSymbols) {
    KvCSymbol* symbol = entry->getSymbol();
    if (!symbol || !symbol->isSelected())
      return;
  }
  if (KvCParamSymbol* function = entry->getParamSymbol())
    callGraph->treatFcnSymbolByUses(function);
}

void KvCFcnSmbVisitor::visitUnparamSymbol(KvCUnparamSymbol* /*symbol*/) {}
