// KvCICodeSubtreeComparer: structural equality of ICode expression subtrees: two
// locations, two operations, or two symbol accesses with their index expressions.
//
// areSubTreesEqual is the general comparison: same shape, same operators (the model keeps
// one operator object per kind), equal accesses, equal constants, equal type references
// and strings; the types and scalings of the locations are not compared. The restricted
// comparisons also require equal location types and scalings and equal conversion levels
// and scalings of operations at every node, and accept only one family of operators:
//   containEqualLogic         logical operators (optionally only the unary one);
//   containEqualBitOps        bit operations and casts with equal target types;
//   containEqualQsoAndIndexOp array accesses whose index expressions use the index
//                             operators (one unary, six binary arithmetic) and casts.
// Constants are compared by the model with constants of different constant types allowed
// to compare equal.
//
// All operations are static and have no side effects. A missing element on either side
// (no location, operation, operator, constant or type) makes the comparison false. The
// walk keeps its own work list, so the depth of the trees does not use the call stack;
// cost O(size of the smaller tree).
#ifndef HULCVTOOLS_SUBTREECOMPARER_KVCICODESUBTREECOMPARER_H
#define HULCVTOOLS_SUBTREECOMPARER_KVCICODESUBTREECOMPARER_H

#include "HulCvTools/HulCvToolsExport.h"
#include "HulCvTools/ModelInterfaces/ICodeFwd.h"

class HULCV_API KvCICodeSubtreeComparer {
public:
  static bool areSubTreesEqual(KV_ExprLocation* a, KV_ExprLocation* b);
  static bool areOperationsEqual(KV_Operation* a, KV_Operation* b);
  static bool containEqualLogic(KV_ExprLocation* a, KV_ExprLocation* b, bool unaryOnly);
  static bool containEqualLogic(KV_ExprLocation* a, KV_ExprLocation* b);
  static bool containEqualBitOps(KV_ExprLocation* a, KV_ExprLocation* b);
  static bool containEqualQsoAndIndexOp(KV_QualifiedSymbolOp* a, KV_QualifiedSymbolOp* b);

  KvCICodeSubtreeComparer& operator=(const KvCICodeSubtreeComparer&) { return *this; }

private:
  friend class KvCSubtreeWalk;
  static bool areIndexOperationsEqual(KV_ExprLocation* a, KV_ExprLocation* b);
  static bool areElocTypeAndScalingEqual(KV_ExprLocation* a, KV_ExprLocation* b);
  static bool areOpConvLevelAndScalingEqual(KV_Operation* a, KV_Operation* b);
};

#endif
