// KV_CgsSupporter: the code generation support of the ICode: makes the global variables
// that code generation needs beyond the model's own (identifier variables of RTOS
// objects, extern globals), each with its declaration or definition statement in the
// top-level statement table of a file, and describes each made variable by a
// KV_ExprDescrTupel.
//
// Names: a variable takes a name of its file's scope. A name is free there when it is a
// C identifier, not a C keyword, not taken in the table's name space (made on first use),
// and neither the name of a data type nor that of a function or macro of the run (typedef
// and function names share C's ordinary name space, and a header may be included next to
// any other).
//
// Owned by the factory container; owns the tuples it makes, which live as long as it. The
// symbols, statements and name spaces belong to the code view data.
#ifndef HUL_PLATFORM_ICODE_KV_CGSSUPPORTER_H
#define HUL_PLATFORM_ICODE_KV_CGSSUPPORTER_H

#include "platform/icode/KV_ExprDescrTupel.h"
#include "platform/support/WmCXString.h"

#include <memory>
#include <vector>

class KV_BdPartition;
class KV_DataType;
class KV_Scaling;
class KvCCIdentifier;
class KvCCStmTable;
class KvCCodeViewData;
class KvCSrcRef;
class KvCUnparamSymbol;
class KvCVarClassId;

class HUL_PLATFORM_API KV_CgsSupporter {
public:
  explicit KV_CgsSupporter(KvCCodeViewData* owner) : codeViewData(owner) {}
  KV_CgsSupporter(const KV_CgsSupporter&) = delete;
  KV_CgsSupporter& operator=(const KV_CgsSupporter&) = delete;
  ~KV_CgsSupporter();

  // Makes a scalar variable named after `name`'s cooked form in the scope of `table` (the
  // top-level table of a file) and answers its one-element tuple, recorded for
  // `partition` (may be null).
  // - `makeUnique`: a taken name becomes the first free `name_<n>`; without it a taken
  //   name fails the creation. On success `name` holds the name given.
  // - `varClass` must be a global class: an extern class's variable gets a declaration
  //   statement, any other class's a definition with `initialValue`.
  // - `roles`: tagKvESymbolRole bits the new variable carries (0: none).
  // Null, and nothing made, for a null type or class, a non-global class, a table that is
  // not a file's top level, or a name that is taken (without `makeUnique`).
  // `srcRef` is the caller's and is not kept.
  KV_ExprDescrTupel* createScalarVariable(KvCCIdentifier& name, KV_DataType* type,
                                          KV_Scaling* scaling, double initialValue, bool makeUnique,
                                          KvCVarClassId* varClass, const KvCSrcRef* srcRef,
                                          KV_BdPartition* partition, KvCCStmTable* table,
                                          unsigned int roles);
  // The variable alone, as createScalarVariable makes it, with exactly the name `name`;
  // null under the same conditions.
  KvCUnparamSymbol* createGlobalVariable(const WmCXString& name, KV_DataType* type,
                                         KV_Scaling* scaling, double initialValue,
                                         KvCVarClassId* varClass, KvCCStmTable* table,
                                         unsigned int roles);
  // Whether `name` is free in the scope of `table` (see above). False for a null table.
  bool isNameFree(const KvCCStmTable* table, const WmCXString& name) const;

  int getNumberOfTuples() const { return static_cast<int>(tuples.size()); }

private:
  KvCCodeViewData* codeViewData;
  std::vector<std::unique_ptr<KV_ExprDescrTupel>> tuples;
};

#endif
