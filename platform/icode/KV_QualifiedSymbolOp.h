// KV_QualifiedSymbolOp: an access to a symbol, possibly through a structure (the base
// symbol is the outermost structure variable; the symbol the accessed component),
// possibly dereferenced, possibly indexed. Each dimension has either a constant index
// or an index expression; the index expressions are the operation's operands, one slot
// per dimension (empty for a constant index).
#ifndef HUL_PLATFORM_ICODE_KV_QUALIFIEDSYMBOLOP_H
#define HUL_PLATFORM_ICODE_KV_QUALIFIEDSYMBOLOP_H

#include "platform/icode/KV_Operation.h"

class KvCSymbol;

class HUL_PLATFORM_API KV_QualifiedSymbolOp : public KV_Operation {
public:
  KV_QualifiedSymbolOp(int serialNumber, KvCSymbol* accessed);

  KV_QualifiedSymbolOp* asQualifiedSymbolOp() override { return this; }

  KvCSymbol* getSymbol() const { return symbol; }
  // The outermost symbol of the access; the symbol itself for a plain access.
  KvCSymbol* getBaseSymbol() const { return baseSymbol ? baseSymbol : symbol; }
  void setBaseSymbol(KvCSymbol* base) { baseSymbol = base; }

  int getResolvedNumberOfDims() const { return getNumberOfOperands(); }
  // The constant index of `dim`, or -1 when the dimension has an index expression, has
  // no constant recorded (an empty slot added through the operation interface), or does
  // not exist.
  int getIndexForDim(int dim, int unused = 0) const;
  KV_ExprLocation* getIndexElocForDim(int dim) const { return getOperand(dim); }
  // Appends a dimension. addIndexEloc answers false when the location cannot be attached.
  void addConstantIndex(int index);
  bool addIndexEloc(KV_ExprLocation* indexLoc);

  // Whether the access names every structure level explicitly (the level is not
  // distinguished in this model).
  bool isStrictlyQualified(int level) const;
  void setStrictlyQualified(bool strict) { strictlyQualified = strict; }
  // Whether the access goes through a pointer (*p, p->c).
  bool isDereferenced() const { return dereferenced; }
  void setDereferenced(bool deref) { dereferenced = deref; }

  // Same symbol, base symbol, dereference, dimensions with equal constant indices and
  // structurally equal index expressions, and (unless `ignoreQualification`) the same
  // strict qualification.
  bool isEqual(KV_QualifiedSymbolOp* other, bool ignoreQualification) const;
  // Same symbol, base symbol, dereference and number of dimensions.
  bool isEqualExceptIndices(KV_QualifiedSymbolOp* other) const;

  // The explicit result type if one was set, else the symbol's type with one array level
  // removed per dimension and the pointer removed for a dereference.
  KV_DataType* getDataType() const override;

private:
  KvCSymbol* symbol;
  KvCSymbol* baseSymbol = nullptr;
  std::vector<int> constantIndices; // per dimension; meaningful for empty slots only
  bool strictlyQualified = false;
  bool dereferenced = false;
};

#endif
