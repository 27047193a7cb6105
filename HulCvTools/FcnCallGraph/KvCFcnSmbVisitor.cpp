#include "HulCvTools/FcnCallGraph/KvCFcnSmbVisitor.h"

#include "HulCvTools/FcnCallGraph/KvCFcgCallReader.h"
#include "HulCvTools/FcnCallGraph/KvCGenericFunctionCallGraph.h"
#include "HulCvTools/ModelInterfaces/ICodeModel.h"

KvCFcnSmbVisitor::~KvCFcnSmbVisitor() = default;

void KvCFcnSmbVisitor::visitParamSmbDBObj(KV_ParamSmbDBObj* entry) {
  if (!callGraph || !kvFcgVisitsEntry(entry, visitAllSymbols))
    return;
  if (KvCParamSymbol* function = entry->getParamSymbol())
    callGraph->treatFcnSymbolByUses(function);
}

void KvCFcnSmbVisitor::visitUnparamSymbol(KvCUnparamSymbol* /*symbol*/) {}
