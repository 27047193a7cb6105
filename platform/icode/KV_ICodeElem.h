// KV_ICodeElem: the root of every element of the intermediate code (ICode): expression
// locations, expressions (operations, symbol accesses, constants, strings, initial
// values), statements and statement tables.
//
// Every element carries a serial number, unique in its code view data and increasing in
// creation order. Listings of the model that must not depend on addresses (the uses of a
// symbol, the call operations of a function) are ordered by it.
//
// Elements are owned by the code view data that created them; nobody else frees them.
//
// Structure epoch: one process-wide counter that every change of how elements are linked
// bumps (operands, statement roots, a location's content, tables and statements attached,
// a table's code block symbol, initial value elements, an element destroyed). Answers
// derived by walking up the tree may be cached together with the epoch they were found
// at and reused while it is unchanged. The model is not thread-safe, nor is the counter.
#ifndef HUL_PLATFORM_ICODE_KV_ICODEELEM_H
#define HUL_PLATFORM_ICODE_KV_ICODEELEM_H

#include "platform/support/HulPlatformExport.h"

#include <cstdint>

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

  // The current structure epoch (never 0) and its bump; see the file comment.
  static std::uint64_t structureEpoch() { return s_structureEpoch; }
  static void noteStructureChange() { ++s_structureEpoch; }

protected:
  explicit KV_ICodeElem(int serialNumber) : serial(serialNumber) {}

private:
  int serial;
  static std::uint64_t s_structureEpoch;
};

#endif
