// KV_ExprLocation: a node of an expression tree. A location holds one thing: an
// expression (operation, symbol access, constant, string, symbol initial value), a
// reference to a data type, a reference to a file, or nothing.
//
// Its parent is the operation of which it is an operand, or the statement of which it is
// the root. The parent and the index in the parent always agree with the parent's
// operands: they are set only by KV_Operation::setOperand and KV_Statement::setExprLoc,
// which refuse a location that already has a parent. Likewise an expression is held by
// at most one location (setExpression refuses an expression held elsewhere).
//
// The location also records the (at most one) def/use database entry on each side that
// KvCExprLocDB keeps for it, so that removal from a database is O(1).
#ifndef HUL_PLATFORM_ICODE_KV_EXPRLOCATION_H
#define HUL_PLATFORM_ICODE_KV_EXPRLOCATION_H

#include "platform/icode/KV_ICodeElem.h"

#include <memory>

class KV_Constant;
class KV_Range;
class KV_DataType;
class KV_Scaling;
class KvCExprLocDB;
class KvCIcFileId;
class KvCSmbInitValExpr;
class KvCStringExpr;

class HUL_PLATFORM_API KV_ExprLocation : public KV_ICodeElem {
public:
  explicit KV_ExprLocation(int serialNumber);
  ~KV_ExprLocation() override;

  KV_ExprLocation* asExprLocation() override { return this; }

  // What the location holds; each is null when it holds something else.
  KvCIcExpression* getExpression() const { return expression; }
  KV_Operation* getOperation() const;
  KV_QualifiedSymbolOp* getQualifiedSymbolOp() const;
  KV_Constant* getConstant() const;
  KvCStringExpr* getStringExpr() const;
  KvCSmbInitValExpr* getSmbInitValExpr() const;
  KV_DataType* getDataTypeRef() const { return typeRef; }
  KvCIcFileId* getFileIdRef() const { return fileRef; }
  bool isEmpty() const { return !expression && !typeRef && !fileRef; }

  // The type of the held expression's value; null for references and empty locations.
  KV_DataType* getDataType() const;
  // The type the model recorded for the location itself, or null.
  KV_DataType* getExprLocDataType() const { return locationType; }
  void setExprLocDataType(KV_DataType* type) { locationType = type; }
  KV_Scaling* getScaling() const { return scaling; }
  void setScaling(KV_Scaling* s) { scaling = s; }

  // The held operation when it is a calculating operation (one with conversion data;
  // not a symbol access), else null.
  KV_Operation* getCalcOperation() const;
  // Writes the location's value range in implemented units: the range recorded for the
  // location, else a calculating operation's result range, else the limits of its
  // integer type, else the whole double range.
  void getValueRange(KV_Range& range) const;
  void setValueRange(const KV_Range& range);

  // The enclosing operation or statement, or null.
  KV_ICodeElem* getParent() const { return parent; }
  KV_ICodeElem* getParentElem() const override { return parent; }
  KV_Operation* getParentOperation() const;
  // The operand position in the parent operation; 0 as the root of a statement; -1
  // without parent.
  int getIndexInParent() const { return indexInParent; }
  // The statement that contains the location (walking up through operations and, for
  // the elements of an initial value, through the location that holds the value).
  // O(depth).
  KV_Statement* getStatement() const;

  // Replace what the location holds. The old expression (if any) is left without parent.
  // False, and nothing changed, when `expr` is held by another location already, is an
  // element of an initial value, or would contain this location.
  bool setExpression(KvCIcExpression* expr);
  void setDataTypeRef(KV_DataType* type);
  void setFileIdRef(KvCIcFileId* file);
  // Leaves the location empty; the old expression is returned without parent.
  KvCIcExpression* releaseContent();

  // Structural equality of what two locations hold: same kind of content, operations
  // with the same operator and pairwise equal operands, equal accesses, equal constants
  // (default equality), equal strings, identical references. Recursive over the depth.
  bool isStructurallyEqual(const KV_ExprLocation* other) const;

private:
  friend class KV_Operation;
  friend class KV_Statement;
  friend class KvCExprLocDB;

  // One def/use database entry per side.
  struct DbSlot {
    KvCExprLocDB* db = nullptr;
    int category = -1;
    int position = -1;
  };

  void attach(KV_ICodeElem* newParent, int index) {
    noteStructureChange();
    parent = newParent;
    indexInParent = index;
  }
  void detach() { attach(nullptr, -1); }
  void dropContent();
  // Whether this location lies within an element of the initial value `expr`. O(depth).
  bool liesInElementOf(KvCIcExpression* expr) const;

  KvCIcExpression* expression = nullptr;
  KV_DataType* typeRef = nullptr;
  KvCIcFileId* fileRef = nullptr;
  KV_DataType* locationType = nullptr;
  KV_Scaling* scaling = nullptr;
  KV_ICodeElem* parent = nullptr;
  int indexInParent = -1;
  DbSlot defSlot;
  DbSlot useSlot;
  std::unique_ptr<KV_Range> valueRange; // recorded range, made on first use
};

#endif
