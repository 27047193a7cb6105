// The ICode scenarios of the declaration/definition mover's tests: a controller in the
// file pair ctrl.c / ctrl.h (each top-level table with a name space) with the function
// `step` defined in ctrl.c, whose body and one nested block have name spaces of their
// own, and the symbol classes Global, StaticGlobal, StaticLocal and Local.
#ifndef TESTS_SYMBOLTOOLS_MOVERFIXTURE_H
#define TESTS_SYMBOLTOOLS_MOVERFIXTURE_H

#include "HulCvTools/SymbolTools/KvCSmbDeclDefMover.h"
#include "platform/builder/AppBuilder.h"
#include "platform/icode/KvCCStmTable.h"
#include "platform/icode/KvCIcFileId.h"
#include "platform/icode/KvCParamSymbol.h"
#include "platform/icode/KvCSmbClass.h"
#include "platform/icode/KvCUnparamSymbol.h"
#include "platform/support/KvCNameSpace.h"

#include <gtest/gtest.h>

class MoverTest : public ::testing::Test {
protected:
  // The top-level table of the complementary file of `source`'s file.
  static KvCCStmTable* complementaryTable(KvCIcFileId* source) {
    return source->getFile()->getComplementaryFile()->getFile()->getStt();
  }
  static bool named(KvCCStmTable* table, const char* name) {
    return table->getNameSpace() && table->getNameSpace()->contains(name);
  }
  bool reserved(const char* name) { return app.potentialGlobals()->contains(name); }
  // A variable of Int16 placed into `table` with `cls`.
  KvCUnparamSymbol* placed(const char* name, KvCSmbClassId* cls, KvCCStmTable* table,
                           bool asDeclaration = false) {
    KvCUnparamSymbol* v = app.variable(name, app.int16(), false);
    app.place(v, cls, table, asDeclaration);
    return v;
  }

  AppBuilder app;
  KvCIcFileId* ctrl = app.filePair("ctrl");
  KvCCStmTable* ctrlC = ctrl->getFile()->getStt();
  KvCCStmTable* ctrlH = complementaryTable(ctrl);
  KvCSmbClassId* global = app.smbClass("Global", KV_SMBCLASS_GLOBAL);
  KvCSmbClassId* staticGlobal = app.smbClass("StaticGlobal", KV_SMBCLASS_STATIC_GLOBAL);
  KvCSmbClassId* staticLocal = app.smbClass("StaticLocal", KV_SMBCLASS_STATIC_LOCAL);
  KvCSmbClassId* local = app.smbClass("Local", KV_SMBCLASS_LOCAL);
  FunctionBuilder& step = app.function("step");
  KvCCStmTable* stepBody = step.body().table();
  BlockBuilder& inner = step.body().block();
  KvCCStmTable* innerBlock = inner.table();
  KvCSmbDeclDefMover mover;

  void SetUp() override {
    app.nameSpace(stepBody);
    app.nameSpace(innerBlock);
  }
};

#endif
