// KV_ICodeElem: the root of every element of the intermediate code (ICode): expression
// locations, expressions (operations, symbol accesses, constants, strings, initial
// values), statements and statement tables.
//
// Every element carries a serial number, unique in its code view data and increasing in
// creation order. Listings of the model that must not depend on addresses (the uses of a
// symbol, the call operations of a function) are ordered by it.
//
// Elements are owned by the code view data that created them; nobody else frees them.
#ifndef HUL_PLATFORM_ICODE_KV_ICODEELEM_H
#define HUL_PLATFORM_ICODE_KV_ICODEELEM_H

#include "platform/support/HulPlatformExport.h"

class KV_ExprLocation;
class KV_Operation;
class KV_QualifiedSymbolOp;
class KV_Statement;
class KV_StatementTable;
class KvCIcExpression;

class HUL_PLATFORM_API KV_ICodeElem {
public:
  virtual ~KV_ICodeElem();
  KV_ICodeElem(const KV_ICodeElem&) = delete;
  KV_ICodeElem& operator=(const KV_ICodeElem&) = delete;

  int getSerial() const { return serial; }

  virtual KV_ExprLocation* asExprLocation() { return nullptr; }
  virtual KvCIcExpression* asExpression() { return nullptr; }
  virtual KV_Operation* asOperation() { return nullptr; }
  virtual KV_QualifiedSymbolOp* asQualifiedSymbolOp() { return nullptr; }
  virtual KV_Statement* asStatement() { return nullptr; }
  virtual KV_StatementTable* asStatementTable() { return nullptr; }

  // The element directly above in the tree: a location's operation or statement, an
  // expression's location, a statement's table, a table's statement. Null at the top.
  virtual KV_ICodeElem* getParentElem() const = 0;
  // Whether `ancestor` is this element or lies above it. O(depth).
  bool isWithin(const KV_ICodeElem* ancestor) const;

protected:
  explicit KV_ICodeElem(int serialNumber) : serial(serialNumber) {}

private:
  int serial;
};

#endif
