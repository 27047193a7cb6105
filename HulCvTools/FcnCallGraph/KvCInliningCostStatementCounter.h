// KvCInliningCostStatementCounter: counts the statements of every statement table the
// ICode iterator reaches (each table's own statements; nested tables add theirs when
// reached).
#ifndef HULCVTOOLS_FCNCALLGRAPH_KVCINLININGCOSTSTATEMENTCOUNTER_H
#define HULCVTOOLS_FCNCALLGRAPH_KVCINLININGCOSTSTATEMENTCOUNTER_H

#include "HulCvTools/HulCvToolsExport.h"
#include "HulCvTools/ModelInterfaces/ICodeVisitors.h"

class HULCV_API KvCInliningCostStatementCounter : public KV_ICodeElemVisitor {
public:
  void visitStatementTable(KV_StatementTable* table) override;
  int getCount() const { return counter; }

private:
  int counter = 0;
};

#endif
