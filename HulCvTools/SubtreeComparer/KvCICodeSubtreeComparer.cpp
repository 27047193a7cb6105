#include "HulCvTools/SubtreeComparer/KvCICodeSubtreeComparer.h"

#include "HulCvTools/ModelInterfaces/ICodeModel.h"

#include <vector>

namespace {

enum class Mode { SubTree, Operations, Logic, LogicUnaryOnly, BitOps, QsoIndex, IndexOp };

struct Pair {
  Mode mode;
  KV_ICodeElem* a;
  KV_ICodeElem* b;
};

// The constant-leaf rule: the model compares, constants of different constant types may
// be equal.
bool areConstantsEqual(KV_Constant* a, KV_Constant* b) {
  if (!a || !b)
    return false;
  KvCIcExprEqualitySpec spec;
  spec.setPermitConstantsWithDifferentConstantTypes(true);
  return a->isEqual(b, &spec);
}

bool areScalingsEqual(KV_Scaling* a, KV_Scaling* b) {
  if (a == b)
    return true;
  if (!a || !b)
    return false;
  return a->hasEqualLsbAndOffset(b);
}

bool areCastTargetTypesEqual(KV_Operation* a, KV_Operation* b) {
  KV_DataType* ta = a->getDataType();
  KV_DataType* tb = b->getDataType();
  return ta && tb && ta->isEqualType(tb);
}

} // namespace

// The work list: every pair pushed must be equal for the whole comparison to hold. Each
// step checks one pair's own node and pushes its child pairs.
class KvCSubtreeWalk {
public:
  explicit KvCSubtreeWalk(Pair first) : work{first} {}

  bool run() {
    while (!work.empty()) {
      const Pair p = work.back();
      work.pop_back();
      if (!step(p))
        return false;
    }
    return true;
  }

private:
  using Comparer = KvCICodeSubtreeComparer;

  bool step(const Pair& p) {
    switch (p.mode) {
    case Mode::SubTree:
      return subTree(loc(p.a), loc(p.b));
    case Mode::Operations:
      return operations(p.a ? p.a->asOperation() : nullptr, p.b ? p.b->asOperation() : nullptr);
    case Mode::Logic:
      return logic(loc(p.a), loc(p.b), false);
    case Mode::LogicUnaryOnly:
      return logic(loc(p.a), loc(p.b), true);
    case Mode::BitOps:
      return bitOps(loc(p.a), loc(p.b));
    case Mode::QsoIndex:
      return qsoIndex(p.a ? p.a->asQualifiedSymbolOp() : nullptr,
                      p.b ? p.b->asQualifiedSymbolOp() : nullptr);
    case Mode::IndexOp:
      return indexOp(loc(p.a), loc(p.b));
    }
    return false;
  }

  static KV_ExprLocation* loc(KV_ICodeElem* e) { return e ? e->asExprLocation() : nullptr; }

  void push(Mode mode, KV_ICodeElem* a, KV_ICodeElem* b) { work.push_back(Pair{mode, a, b}); }

  void pushOperand(Mode mode, KV_Operation* a, KV_Operation* b, int i) {
    push(mode, a->getOperand(i), b->getOperand(i));
  }

  bool subTree(KV_ExprLocation* a, KV_ExprLocation* b) {
    if (!a || !b)
      return false;
    KV_QualifiedSymbolOp* qa = a->getQualifiedSymbolOp();
    KV_QualifiedSymbolOp* qb = b->getQualifiedSymbolOp();
    if (qa && qb)
      return qa->isEqual(qb, false);
    KV_Operation* oa = a->getOperation();
    KV_Operation* ob = b->getOperation();
    if (oa && ob)
      return operations(oa, ob);
    KV_Constant* ca = a->getConstant();
    KV_Constant* cb = b->getConstant();
    if (ca && cb)
      return areConstantsEqual(ca, cb);
    KV_DataType* ta = a->getDataTypeRef();
    KV_DataType* tb = b->getDataTypeRef();
    if (ta && tb)
      return ta->isEqualTypeRef(tb);
    KvCStringExpr* sa = a->getStringExpr();
    KvCStringExpr* sb = b->getStringExpr();
    if (sa && sb)
      return sa->getString().compareWith(sb->getString()) == 0;
    return false;
  }

  bool operations(KV_Operation* a, KV_Operation* b) {
    if (!a || !b || a->getOperator() != b->getOperator() ||
        a->getNumberOfOperands() != b->getNumberOfOperands())
      return false;
    for (int i = a->getNumberOfOperands() - 1; i >= 0; --i)
      pushOperand(Mode::SubTree, a, b, i);
    return true;
  }

  // What the logic and bit comparisons check alike before their operator rules: location
  // types and scalings, constants, conversion levels and scalings, symbol accesses.
  struct Shared {
    bool decided = true; // the answer is `result`; otherwise the operator rules decide
    bool result = false;
    KV_Operation* oa = nullptr;
    KV_Operation* ob = nullptr;
    KV_OpOperator* ka = nullptr;
    KV_OpOperator* kb = nullptr;
  };

  static Shared sharedChecks(KV_ExprLocation* a, KV_ExprLocation* b) {
    Shared s;
    if (!a || !b || !Comparer::areElocTypeAndScalingEqual(a, b))
      return s;
    s.oa = a->getOperation();
    s.ob = b->getOperation();
    if (!s.oa || !s.ob) {
      s.result = areConstantsEqual(a->getConstant(), b->getConstant());
      return s;
    }
    if (!Comparer::areOpConvLevelAndScalingEqual(s.oa, s.ob))
      return s;
    if (KV_QualifiedSymbolOp* qa = s.oa->asQualifiedSymbolOp()) {
      KV_QualifiedSymbolOp* qb = s.ob->asQualifiedSymbolOp();
      s.result = qb && qa->isEqual(qb, false);
      return s;
    }
    s.ka = s.oa->getOperator();
    s.kb = s.ob->getOperator();
    s.decided = !s.ka || !s.kb;
    return s;
  }

  // Equal operators, then the operands 0 (and 1 for a binary rule) must be equal too.
  bool requireOperands(Mode mode, const Shared& s, bool binary) {
    if (!(*s.ka == *s.kb))
      return false;
    if (binary)
      pushOperand(mode, s.oa, s.ob, 1);
    pushOperand(mode, s.oa, s.ob, 0);
    return true;
  }

  bool logic(KV_ExprLocation* a, KV_ExprLocation* b, bool unaryOnly) {
    const Shared s = sharedChecks(a, b);
    if (s.decided)
      return s.result;
    const Mode mode = unaryOnly ? Mode::LogicUnaryOnly : Mode::Logic;
    if (s.ka->isUnaryLogical())
      return requireOperands(mode, s, false);
    if (unaryOnly || !s.ka->isLogical() || !s.ka->isBinary())
      return false;
    return requireOperands(mode, s, true);
  }

  bool bitOps(KV_ExprLocation* a, KV_ExprLocation* b) {
    const Shared s = sharedChecks(a, b);
    if (s.decided)
      return s.result;
    if (s.ka->isUnaryBitOperation())
      return requireOperands(Mode::BitOps, s, false);
    if (s.ka->isBitOperation() && s.ka->isBinary())
      return requireOperands(Mode::BitOps, s, true);
    if (!s.ka->isCast() || !s.kb->isCast() || !areCastTargetTypesEqual(s.oa, s.ob))
      return false;
    pushOperand(Mode::BitOps, s.oa, s.ob, 0);
    return true;
  }

  bool qsoIndex(KV_QualifiedSymbolOp* a, KV_QualifiedSymbolOp* b) {
    if (!a || !b || !Comparer::areOpConvLevelAndScalingEqual(a, b))
      return false;
    if (a->isEqual(b, false))
      return true;
    KvCSymbol* base = a->getBaseSymbol();
    if (!a->isEqualExceptIndices(b) || !base || base->asParamSymbol())
      return false;
    const int n = a->getResolvedNumberOfDims();
    if (n <= 0)
      return false;
    for (int d = 0; d < n; ++d) {
      const int ia = a->getIndexForDim(d, 0);
      if (ia != b->getIndexForDim(d, 0))
        return false;
      if (ia != -1)
        continue;
      KV_ExprLocation* xa = a->getIndexElocForDim(d);
      KV_ExprLocation* xb = b->getIndexElocForDim(d);
      if (!xa) {
        if (xb)
          return false;
        continue;
      }
      if (!xb)
        return false;
      push(Mode::IndexOp, xa, xb);
    }
    return true;
  }

  bool indexOp(KV_ExprLocation* a, KV_ExprLocation* b) {
    if (!a || !b || !Comparer::areElocTypeAndScalingEqual(a, b))
      return false;
    KV_Operation* oa = a->getOperation();
    KV_Operation* ob = b->getOperation();
    if (!oa || !ob)
      return areConstantsEqual(a->getConstant(), b->getConstant());
    if (!Comparer::areOpConvLevelAndScalingEqual(oa, ob))
      return false;
    if (KV_QualifiedSymbolOp* qa = oa->asQualifiedSymbolOp()) {
      KV_QualifiedSymbolOp* qb = ob->asQualifiedSymbolOp();
      if (!qb)
        return false;
      push(Mode::QsoIndex, qa, qb);
      return true;
    }
    KV_OpOperator* ka = oa->getOperator();
    KV_OpOperator* kb = ob->getOperator();
    if (!ka || !kb || !(*ka == *kb))
      return false;
    if (ka->isUnaryIndexOperator()) {
      pushOperand(Mode::IndexOp, oa, ob, 0);
      return true;
    }
    if (ka->isBinaryIndexOperator()) {
      pushOperand(Mode::IndexOp, oa, ob, 1);
      pushOperand(Mode::IndexOp, oa, ob, 0);
      return true;
    }
    if (!ka->isCast())
      return false;
    KV_ExprLocation* targetA = oa->getOperand(1);
    KV_ExprLocation* targetB = ob->getOperand(1);
    KV_DataType* ta = targetA ? targetA->getDataTypeRef() : nullptr;
    KV_DataType* tb = targetB ? targetB->getDataTypeRef() : nullptr;
    if (!ta || !tb || !ta->isEqualTypeRef(tb))
      return false;
    pushOperand(Mode::IndexOp, oa, ob, 0);
    return true;
  }

  std::vector<Pair> work;
};

bool KvCICodeSubtreeComparer::areSubTreesEqual(KV_ExprLocation* a, KV_ExprLocation* b) {
  return KvCSubtreeWalk(Pair{Mode::SubTree, a, b}).run();
}

bool KvCICodeSubtreeComparer::areOperationsEqual(KV_Operation* a, KV_Operation* b) {
  return KvCSubtreeWalk(Pair{Mode::Operations, a, b}).run();
}

bool KvCICodeSubtreeComparer::containEqualLogic(KV_ExprLocation* a, KV_ExprLocation* b,
                                                bool unaryOnly) {
  return KvCSubtreeWalk(Pair{unaryOnly ? Mode::LogicUnaryOnly : Mode::Logic, a, b}).run();
}

bool KvCICodeSubtreeComparer::containEqualLogic(KV_ExprLocation* a, KV_ExprLocation* b) {
  return containEqualLogic(a, b, false);
}

bool KvCICodeSubtreeComparer::containEqualBitOps(KV_ExprLocation* a, KV_ExprLocation* b) {
  return KvCSubtreeWalk(Pair{Mode::BitOps, a, b}).run();
}

bool KvCICodeSubtreeComparer::containEqualQsoAndIndexOp(KV_QualifiedSymbolOp* a,
                                                        KV_QualifiedSymbolOp* b) {
  return KvCSubtreeWalk(Pair{Mode::QsoIndex, a, b}).run();
}

bool KvCICodeSubtreeComparer::areIndexOperationsEqual(KV_ExprLocation* a, KV_ExprLocation* b) {
  return KvCSubtreeWalk(Pair{Mode::IndexOp, a, b}).run();
}

bool KvCICodeSubtreeComparer::areElocTypeAndScalingEqual(KV_ExprLocation* a, KV_ExprLocation* b) {
  if (!a || !b)
    return false;
  bool typesEqual = a->getExprLocDataType() == b->getExprLocDataType();
  if (!typesEqual) {
    KV_DataType* ta = a->getDataType();
    KV_DataType* tb = b->getDataType();
    typesEqual = ta == tb || (ta && tb && ta->isEqualType(tb));
  }
  return typesEqual && areScalingsEqual(a->getScaling(), b->getScaling());
}

bool KvCICodeSubtreeComparer::areOpConvLevelAndScalingEqual(KV_Operation* a, KV_Operation* b) {
  if (!a || !b)
    return false;
  KV_OpConversionLevel* la = a->getConversionLevel();
  KV_OpConversionLevel* lb = b->getConversionLevel();
  const bool levelsEqual = la == lb || (la && lb && la->isEqualTo(lb));
  return levelsEqual && areScalingsEqual(a->getScaling(), b->getScaling());
}
