#include "platform/icode/KvCElocDbQuery.h"

#include "platform/icode/KV_ExprLocation.h"
#include "platform/icode/KV_OpOperator.h"
#include "platform/icode/KV_Operation.h"
#include "platform/icode/KvCExprLocDB.h"
#include "platform/icode/KvCSymbol.h"

KvCElocDbQuery::~KvCElocDbQuery() = default;

namespace {
enum class DeclDefRole { kNone, kDeclaration, kDefinition };

DeclDefRole roleOf(KV_ExprLocation* loc) {
  KV_Operation* parent = loc ? loc->getParentOperation() : nullptr;
  if (!parent || loc->getIndexInParent() != 0)
    return DeclDefRole::kNone;
  const KV_OpOperator* oper = parent->getOperator();
  if (oper->isVariableDeclaration() || oper->isFunctionDeclaration())
    return DeclDefRole::kDeclaration;
  if (oper->isVariableDefinition() || oper->isFunctionDefinition() ||
      oper->isFurtherDefinition1() || oper->isFurtherDefinition2() || oper->isStaticDeclDef())
    return DeclDefRole::kDefinition;
  return DeclDefRole::kNone;
}
} // namespace

bool KvCElocDbQuery::getQsoStaticDeclDef(KvCSymbol* symbol, KV_ExprLocation*& declaration,
                                         KV_ExprLocation*& definition) const {
  declaration = nullptr;
  definition = nullptr;
  if (!symbol)
    return false;
  const KvCExprLocDB* db = symbol->getExprLocDB();
  // Keyed by serial number: the walk below goes in creation order.
  leda::dictionary<int, KV_ExprLocation*> entries;
  leda::dictionary<int, KV_ExprLocation*> category;
  for (tagKvEExprLocDBCategory c : {KV_DB_STATIC_DECLDEF_DEF, KV_DB_RESTART_DEF, KV_DB_QSO_DEF}) {
    db->listCategory(c, category);
    for (auto it = category.begin(); it != category.end(); ++it)
      entries.insert(it->first, it->second);
  }
  for (auto it = entries.begin(); it != entries.end(); ++it) {
    KV_ExprLocation* loc = it->second;
    switch (roleOf(loc)) {
    case DeclDefRole::kDeclaration:
      if (!declaration)
        declaration = loc;
      break;
    case DeclDefRole::kDefinition:
      if (!definition)
        definition = loc;
      break;
    case DeclDefRole::kNone:
      break;
    }
  }
  return declaration || definition;
}
