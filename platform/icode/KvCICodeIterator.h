// KvCICodeIterator: walks the ICode below an element in tree order and calls a visitor
// for each element:
//   application, then each sub-application, code unit and file id, then the file's
//   statement table;
//   a statement table, then its statements in order;
//   a statement, then its root location, then the tables it owns;
//   a location (visitExprLocation), then what it holds: an operation (visitQSO and
//   visitSymbol for a symbol access, visitCodeBlockOperation for a code block,
//   visitOperation otherwise) followed by its operand locations in order; a constant,
//   string or initial value (its elements are not entered); a data type or file
//   reference; visitEmptyExpr for an empty location.
// After omitFuncStt() the walk does not enter tables that are the top of a code block
// (function bodies) below the element it starts from.
//
// The walk uses an explicit stack, so deep expressions do not exhaust the call stack.
// The visitor must not change the part of the tree still to be walked.
#ifndef HUL_PLATFORM_ICODE_KVCICODEITERATOR_H
#define HUL_PLATFORM_ICODE_KVCICODEITERATOR_H

#include "platform/icode/KV_ICodeElemVisitor.h"

class KV_ICodeElem;

class HUL_PLATFORM_API KvCICodeIterator {
public:
  void omitFuncStt() { omitFunctionBodies = true; }
  bool isOmittingFuncStt() const { return omitFunctionBodies; }

  // Each answers false (and visits nothing) for a null element or visitor, else true.
  bool iterate(KvCIcApplication* app, KV_ICodeElemVisitor* visitor);
  bool iterateStatementTable(KV_StatementTable* table, KV_ICodeElemVisitor* visitor);
  bool iterateStatement(KV_Statement* statement, KV_ICodeElemVisitor* visitor);
  bool iterateOperation(KV_Operation* op, KV_ICodeElemVisitor* visitor);
  bool iterateExprLoc(KV_ExprLocation* loc, KV_ICodeElemVisitor* visitor);

private:
  // True when the visitor ended the walk.
  bool walk(KV_ICodeElem* start, KV_ICodeElemVisitor* visitor);

  bool omitFunctionBodies = false;
};

#endif
