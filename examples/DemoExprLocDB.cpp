// Expression-location databases and the subtree comparer: the definitions and uses of one
// variable, and one expression the sample application repeats.
#include "DemoSampleApp.h"
#include "DemoSections.h"

#include "HulCvTools/ElocQuery/KvCElocQuery.h"
#include "HulCvTools/ExprLocDBBuilder/KvCExprLocDBBuilder.h"
#include "HulCvTools/SubtreeComparer/KvCICodeSubtreeComparer.h"
#include "platform/icode/KV_ExprLocation.h"
#include "platform/icode/KV_ICodeElemVisitor.h"
#include "platform/icode/KV_Operation.h"
#include "platform/icode/KV_QualifiedSymbolOp.h"
#include "platform/icode/KV_Statement.h"
#include "platform/icode/KvCExprLocDB.h"
#include "platform/icode/KvCICodeIterator.h"
#include "platform/icode/KvCIcFileId.h"
#include "platform/icode/KvCParamSymbol.h"

#include <vector>

namespace {

const char* categoryName(int c) {
  switch (c) {
  case KV_DB_STATIC_DECLDEF_DEF:
    return "static decl/def definition";
  case KV_DB_RESTART_DEF:
    return "restart definition";
  case KV_DB_QSO_DEF:
    return "definition";
  case KV_DB_STATIC_DECLDEF_USE:
    return "static decl/def use";
  case KV_DB_QSO_USE:
    return "use";
  case KV_DB_DEF:
    return "definition";
  default:
    return "use";
  }
}

std::string placeOf(KV_ExprLocation* loc) {
  KvCParamSymbol* function = KvCElocQuery::getCodeBlockSymbol(loc);
  if (function)
    return function->getName().str();
  KvCIcFileId* file = KvCElocQuery::getFile(loc);
  return file ? file->getName().str() + " (file level)" : "-";
}

void showDefsAndUses(DemoRun& run, KvCSymbol* symbol) {
  KvCExprLocDB* db = symbol->getExprLocDB();
  run.out << "  " << symbol->getName().str() << ": " << db->getNumberOfDefs() << " definition(s), "
          << db->getNumberOfUses() << " use(s)\n";
  for (int c = 0; c < KV_DB_NUMBER_OF_CATEGORIES; ++c) {
    leda::dictionary<int, KV_ExprLocation*> entries;
    db->listCategory(static_cast<tagKvEExprLocDBCategory>(c), entries);
    for (const auto& entry : entries) {
      KV_Statement* statement = entry.second->getStatement();
      run.out << "    " << categoryName(c) << " in " << placeOf(entry.second) << ": "
              << (statement && statement->getExprLoc() ? renderExpression(statement->getExprLoc())
                                                       : std::string("?"))
              << "\n";
    }
  }
}

// Every location that holds an operation (array accesses included, plain accesses not).
class OperationCollector : public KV_ICodeElemVisitor {
public:
  void visitExprLocation(KV_ExprLocation* loc) override {
    KV_Operation* op = loc->getOperation();
    if (!op)
      return;
    KV_QualifiedSymbolOp* qso = op->asQualifiedSymbolOp();
    if ((qso && qso->getResolvedNumberOfDims() > 0) ||
        (!qso && op->getNumberOfOperands() == 2 && !op->getOperator()->isAssign()))
      found.push_back(loc);
  }
  std::vector<KV_ExprLocation*> found;
};

void showRepeatedExpression(DemoRun& run) {
  OperationCollector collector;
  KvCICodeIterator iterator;
  iterator.iterate(run.sample.app.data().getApplication(), &collector);
  const std::vector<KV_ExprLocation*>& all = collector.found;
  for (std::size_t i = 0; i < all.size(); ++i) {
    for (std::size_t j = i + 1; j < all.size(); ++j) {
      if (KvCElocQuery::getCodeBlockSymbol(all[i]) == KvCElocQuery::getCodeBlockSymbol(all[j]) ||
          !KvCICodeSubtreeComparer::areSubTreesEqual(all[i], all[j]))
        continue;
      run.out << "  repeated expression: " << renderExpression(all[i]) << " in " << placeOf(all[i])
              << " and in " << placeOf(all[j]) << "\n";
      KV_QualifiedSymbolOp* a = all[i]->getQualifiedSymbolOp();
      KV_QualifiedSymbolOp* b = all[j]->getQualifiedSymbolOp();
      if (a && b)
        run.out << "  equal as array accesses with equal index expressions: "
                << (KvCICodeSubtreeComparer::containEqualQsoAndIndexOp(a, b) ? "yes" : "no")
                << "\n";
      return;
    }
  }
  run.out << "  no repeated expression\n";
}

} // namespace

void demoExprLocDB(DemoRun& run) {
  printSectionTitle(run.out, "Def/use databases and subtree comparison");
  KvCExprLocDBBuilder builder;
  builder.boot(&run.sample.app.data());
  builder.buildExprLocDBs();
  showDefsAndUses(run, run.sample.speed);
  showRepeatedExpression(run);
  builder.shutdown();
}
