// KvCSmbDeclDefMover: moves a symbol's declaration or definition from one C statement
// table to another when the symbol changes its storage class or scope (a global becomes
// static global or local, a static local becomes local, a local goes to the base scope of
// its function), and removes the bookkeeping that tied the symbol to its old place:
//   - the symbol's extended class state, its extern class and its variable or function
//     class (set from the new class);
//   - its name in the name space of its old table and, when it was a potential global
//     there, in the potential-globals name space of its sub-application;
//   - for moves out of file scope, its name in the name space of the complementary file
//     (the header that declared it, or the source file of a header).
// It enters the symbol into the new table, as a definition or a declaration. It does not
// add names to the potential-globals name space, write statements or change the
// symbol's def/use database.
//
// The class-change operations start from the table that holds the symbol
// (KvCSymbolQuery::getDestinationStt). The table's enterSymbol may answer another symbol
// (one it holds under the same name); the class-change operations and moveLocalVar go on
// with that answer internally and do not hand it back, the enterSymbol operations do.
//
// Every operation answers true; `moved` says whether the symbol was entered into its new
// table. Missing pieces end an operation early, with `moved` as reached by then:
//   - a null symbol, old table or new table, or a null class (the new class, or the
//     symbol's own class where that is used), or a symbol that is neither a variable nor a
//     function or macro: nothing is done;
//   - when clearing a symbol's entries, a missing link on the way to a name space (the
//     symbol has no table, the table no name space, no file, the file no code unit or
//     sub-application) skips that name space; the other steps are still done;
//   - when clearing the complementary file, any missing link (no file, no complementary
//     file, no statement table or name space there) ends the clearing; a symbol moved
//     into the complementary file's own table keeps its name there;
//   - the complementary file is cleared only when the symbol was moved.
// No messages are issued.
//
// The mover owns only its def/use database query; symbols, tables, classes and name
// spaces belong to the ICode. Calls are independent: nothing is kept between them. Cost:
// that of the table and name-space operations, plus, for moveLocalVarToFcnBaseScope, a
// look-up in the symbol's def/use database (which must have been built).
#ifndef HULCVTOOLS_SYMBOLTOOLS_KVCSMBDECLDEFMOVER_H
#define HULCVTOOLS_SYMBOLTOOLS_KVCSMBDECLDEFMOVER_H

#include "HulCvTools/Control/KvCHeapObject.h"
#include "HulCvTools/HulCvToolsExport.h"
#include "HulCvTools/ModelInterfaces/ICodeFwd.h"
#include "HulCvTools/ModelInterfaces/ICodeMembers.h"

class HULCV_API KvCSmbDeclDefMover {
public:
  KvCSmbDeclDefMover() = default;
  virtual ~KvCSmbDeclDefMover();
  KvCSmbDeclDefMover(const KvCSmbDeclDefMover&) = default;
  KvCSmbDeclDefMover& operator=(const KvCSmbDeclDefMover&) = default;

  // Moves `symbol` from `from` into `to`, entered as a definition, with its own class.
  bool moveLocalVar(KvCSymbol* symbol, KvCCStmTable* from, KvCCStmTable* to, bool& moved);
  bool moveLocalVar(KvCSymbol* symbol, KvCCStmTable* from, KvCCStmTable* to);
  // Re-enters the accessed variable, when its class is scope-local, in the table of its
  // static definition (else of its static declaration), with its own class. Not moved
  // when the class is not scope-local, when the database knows neither place, or when the
  // place lies outside every function or in no table.
  bool moveLocalVarToFcnBaseScope(KV_QualifiedSymbolOp* access, bool& moved);
  // Takes `symbol` out of `table` and clears its entries (with its own class).
  bool removeSymbol(KvCSymbol* symbol, KvCCStmTable* table);
  // Enters `symbol` into `table` as a definition; the pointer becomes the symbol the
  // table answers (the variable or the function form of it, null when it is not of that
  // form).
  bool enterSymbol(KvCSymbol*& symbol, KvCCStmTable* table);
  bool enterSymbol(KvCUnparamSymbol*& symbol, KvCCStmTable* table);
  bool enterSymbol(KvCParamSymbol*& symbol, KvCCStmTable* table);

  // Class changes: move `symbol` from the table that holds it into `newTable` with
  // `newClass`. Entered as a declaration by clearGlobalDeclareStaticGlobal, as a
  // definition by the others. After the move, the complementary file of the old table is
  // cleared by clearGlobalDefineStaticGlobal (only from a primary-scope table) and by
  // clearGlobalDefineStaticLocal, clearGlobalDefineLocal, clearStaticGlobalDefineStaticLocal
  // and clearStaticGlobalDefineLocal (from a primary- or secondary-scope table).
  // clearInitialValue moves like clearStaticLocalDefineLocal.
  bool clearGlobalDeclareStaticGlobal(KvCSymbol* symbol, KvCCStmTable* newTable,
                                      KvCSmbClassId* newClass, bool& moved);
  bool clearGlobalDefineStaticGlobal(KvCSymbol* symbol, KvCCStmTable* newTable,
                                     KvCSmbClassId* newClass, bool& moved);
  bool clearGlobalDefineStaticLocal(KvCSymbol* symbol, KvCCStmTable* newTable,
                                    KvCSmbClassId* newClass, bool& moved);
  bool clearGlobalDefineLocal(KvCSymbol* symbol, KvCCStmTable* newTable, KvCSmbClassId* newClass,
                              bool& moved);
  bool clearStaticGlobalDefineStaticLocal(KvCSymbol* symbol, KvCCStmTable* newTable,
                                          KvCSmbClassId* newClass, bool& moved);
  bool clearStaticGlobalDefineLocal(KvCSymbol* symbol, KvCCStmTable* newTable,
                                    KvCSmbClassId* newClass, bool& moved);
  bool clearStaticLocalDefineLocal(KvCSymbol* symbol, KvCCStmTable* newTable,
                                   KvCSmbClassId* newClass, bool& moved);
  bool clearInitialValue(KvCSymbol* symbol, KvCCStmTable* newTable, KvCSmbClassId* newClass,
                         bool& moved);

  HULCV_HEAP_OPERATORS

private:
  bool moveSymbol(KvCSymbol* symbol, KvCCStmTable* from, KvCCStmTable* to, KvCSmbClassId* smbClass,
                  bool asDeclaration, bool& moved);
  // The class change: from the symbol's table, moveSymbol, then (when `clearFile`) the
  // complementary file.
  bool changeClass(KvCSymbol* symbol, KvCCStmTable* newTable, KvCSmbClassId* newClass,
                   bool asDeclaration, bool clearFile, bool toStaticGlobal, bool& moved);
  bool clearSymbolEntries(KvCSymbol* symbol);
  bool clearSymbolEntries(KvCSymbol* symbol, KvCSmbClassId* smbClass);
  bool clearFromFileSyT(KvCSymbol* symbol, KvCCStmTable* oldTable, bool toStaticGlobal);

  KvCElocDbQuery elocDbQuery;
};

#endif
