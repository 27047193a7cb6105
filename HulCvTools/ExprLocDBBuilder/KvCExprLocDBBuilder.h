// KvCExprLocDBBuilder: fills the expression-location (def/use) databases of symbols, data
// types and files by walking the ICode, and takes entries out again.
//
// What is entered for a location:
//   - a symbol access, into its symbol's database: a location its parent operation
//     defines as a static-declaration/definition definition, a restart definition (in a
//     restart function) or an ordinary definition; a location its parent uses as a
//     static-declaration/definition use or an ordinary use (a read-modify-write operand
//     on both sides);
//   - a data type reference: a type definition's defined type (operand 0) as a
//     definition, its other types and the types of casts, declarations and definitions
//     as uses;
//   - a file reference: a use;
//   - a scalar initial value whose first element is a symbol access: the location of the
//     initial value, into that symbol's database; a first element that is an operation
//     is walked.
// The full build also walks the bodies of selected functions that are declared but whose
// definition it did not meet.
//
// The builder holds only the code view data, which it does not own. Every operation
// answers false, doing nothing, on a builder that is not booted (an internal check) or for
// a null argument; otherwise true. Cost: linear in the size of what is walked, each entry
// O(1).
#ifndef HULCVTOOLS_EXPRLOCDBBUILDER_KVCEXPRLOCDBBUILDER_H
#define HULCVTOOLS_EXPRLOCDBBUILDER_KVCEXPRLOCDBBUILDER_H

#include "HulCvTools/Control/KvCHeapObject.h"
#include "HulCvTools/HulCvToolsExport.h"
#include "HulCvTools/ModelInterfaces/ICodeFwd.h"

class HULCV_API KvCExprLocDBBuilder {
public:
  KvCExprLocDBBuilder() = default;
  // Shuts down.
  ~KvCExprLocDBBuilder();
  KvCExprLocDBBuilder(const KvCExprLocDBBuilder&) = default;
  // Copies the code view data pointer.
  KvCExprLocDBBuilder& operator=(const KvCExprLocDBBuilder&) = default;

  bool boot(KvCCodeViewData* data);
  bool shutdown();
  KvCCodeViewData* getCodeViewData() const { return codeViewData; }

  // The whole application, then the declared-only selected functions.
  bool buildExprLocDBs();
  // Empties every database, then builds.
  bool rebuildExprLocDBs();

  bool buildExprLocDBsIncremental(KV_Operation* op);
  bool clearExprLocDBsIncremental(KV_Operation* op);
  bool buildExprLocDBsIncremental(KV_StatementTable* table);
  bool clearExprLocDBsIncremental(KV_StatementTable* table);
  bool buildExprLocDBsIncremental(KV_Statement* statement);
  bool clearExprLocDBsIncremental(KV_Statement* statement);
  bool buildExprLocDBsIncremental(KV_ExprLocation* loc);
  bool clearExprLocDBsIncremental(KV_ExprLocation* loc);
  // The operations among the initial value's elements, each as the operation overload;
  // the AND of their answers.
  bool buildExprLocDBsIncremental(KvCSmbInitValExpr* initValue);
  bool clearExprLocDBsIncremental(KvCSmbInitValExpr* initValue);
  // As the statement and location overloads, without entering function bodies.
  bool buildExprLocDBsIncrementalOmitFuncStt(KV_Statement* statement);
  bool clearExprLocDBsIncrementalOmitFuncStt(KV_Statement* statement);
  bool buildExprLocDBsIncrementalOmitFuncStt(KV_ExprLocation* loc);
  bool clearExprLocDBsIncrementalOmitFuncStt(KV_ExprLocation* loc);

  HULCV_HEAP_OPERATORS

private:
  bool isBooted() const;
  // Walks an operation, statement table, statement or location with a builder or remove
  // visitor.
  bool walk(bool build, KV_ICodeElem* elem, bool omitFunctionBodies);
  bool walkInitValue(bool build, KvCSmbInitValExpr* initValue);

  KvCCodeViewData* codeViewData = nullptr;
};

#endif
