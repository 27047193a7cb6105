#include "platform/icode/KV_ICodeElem.h"

#include "platform/icode/KV_ExprLocation.h"
#include "platform/icode/KvCIcExpression.h"

std::uint64_t KV_ICodeElem::s_structureEpoch = 1;

KV_ICodeElem::~KV_ICodeElem() { noteStructureChange(); }

bool KV_ICodeElem::isWithin(const KV_ICodeElem* ancestor) const {
  for (const KV_ICodeElem* e = this; e; e = e->getParentElem())
    if (e == ancestor)
      return true;
  return false;
}

KV_ICodeElem* KvCIcExpression::getParentElem() const { return parentLocation; }
