// Symbol tools: the variable `limit` of a controller moves from the file scope of ctrl.c
// into the body of `step` as a static local, and back to the file scope as a static
// global; at each step the section prints the table that lists it, its class and which
// name spaces hold its name. Then the effective type specifiers of the nested component
// cfg.gains.kp, inherited from the instance and the component declarations around it.
#include "DemoSections.h"

#include "HulCvTools/SymbolTools/KvCCvStructTool.h"
#include "HulCvTools/SymbolTools/KvCSmbDeclDefMover.h"
#include "platform/builder/AppBuilder.h"
#include "platform/icode/KvCAddressQualifier.h"
#include "platform/icode/KvCCStmTable.h"
#include "platform/icode/KvCIcFileId.h"
#include "platform/icode/KvCSmbClass.h"
#include "platform/icode/KvCUnparamSymbol.h"
#include "platform/support/KvCNameSpace.h"

#include <string>
#include <vector>

namespace {

struct NamedScope {
  const char* label;
  KvCCStmTable* table;
};

void printPlace(std::ostream& out, const char* stepText, KvCUnparamSymbol* symbol,
                const std::vector<NamedScope>& scopes, KvCNameSpace* potentialGlobals) {
  out << "  " << stepText << "\n    listed in:";
  for (const NamedScope& scope : scopes)
    for (int i = 0; i < scope.table->getNumberOfEnteredSymbols(); ++i)
      if (scope.table->getEnteredSymbol(i) == symbol)
        out << " " << scope.label
            << (scope.table->isEnteredAsDefinition(i) ? " (definition)" : " (declaration)");
  KvCSmbClassId* cls = symbol->getSmbClassId();
  out << ", class " << (cls ? cls->getSmbClass()->getName().str() : std::string("none"))
      << "\n    name \"" << symbol->getName().str() << "\" in:";
  for (const NamedScope& scope : scopes)
    if (scope.table->getNameSpace() && scope.table->getNameSpace()->contains(symbol->getName()))
      out << " " << scope.label;
  if (potentialGlobals->contains(symbol->getName()))
    out << " potential-globals";
  out << "\n";
}

void demoMover(std::ostream& out) {
  AppBuilder app("SymbolToolsDemo");
  KvCIcFileId* ctrl = app.filePair("ctrl");
  KvCCStmTable* ctrlC = ctrl->getFile()->getStt();
  KvCCStmTable* ctrlH = ctrl->getFile()->getComplementaryFile()->getFile()->getStt();
  KvCCStmTable* stepBody = app.function("step").body().table();
  app.nameSpace(stepBody);
  KvCSmbClassId* global = app.smbClass("Global", KV_SMBCLASS_GLOBAL);
  KvCSmbClassId* staticGlobal = app.smbClass("StaticGlobal", KV_SMBCLASS_STATIC_GLOBAL);
  KvCSmbClassId* staticLocal = app.smbClass("StaticLocal", KV_SMBCLASS_STATIC_LOCAL);
  KvCUnparamSymbol* limit = app.variable("limit", app.int16(), false);
  app.place(limit, global, ctrlC);
  app.nameSpace(ctrlH)->add("limit"); // ctrl.h declares it
  const std::vector<NamedScope> scopes = {{"ctrl.c", ctrlC}, {"ctrl.h", ctrlH}, {"step", stepBody}};

  KvCSmbDeclDefMover mover;
  printPlace(out, "a global of ctrl.c, declared in ctrl.h:", limit, scopes, app.potentialGlobals());
  bool moved = false;
  mover.clearGlobalDefineStaticLocal(limit, stepBody, staticLocal, moved);
  printPlace(out, moved ? "clearGlobalDefineStaticLocal into step's body:" : "not moved:", limit,
             scopes, app.potentialGlobals());
  // A class change starts from the table that holds the symbol: step's body, which is no
  // file's top level, so no complementary file is touched on the way back.
  mover.clearGlobalDefineStaticGlobal(limit, ctrlC, staticGlobal, moved);
  printPlace(out, moved ? "clearGlobalDefineStaticGlobal back into ctrl.c:" : "not moved:", limit,
             scopes, app.potentialGlobals());
}

void demoStructTool(std::ostream& out) {
  AppBuilder app("StructDemo");
  KV_StructType* gains = app.structType("Gains", {{"kp", app.int16()}, {"ki", app.int16()}});
  KV_StructType* config = app.structType("Config", {{"gains", gains}, {"mode", app.uint8()}});
  KvCAddressQualifier* calib = app.addressQualifier("__calib");
  // const Config cfg;  struct Config { __calib struct Gains gains; ... };
  // struct Gains { volatile Int16 kp; Int16 ki; };
  KvCUnparamSymbol* cfg = app.variable("cfg", config);
  cfg->setConst(true);
  app.declaredComponent(config, "gains")->setAddressQualifier(calib);
  app.declaredComponent(config, "mode");
  app.declaredComponent(gains, "kp")->setVolatile(true);
  app.declaredComponent(gains, "ki");

  out << "  const Config cfg; Config { __calib Gains gains; UInt8 mode; };"
         " Gains { volatile Int16 kp; Int16 ki; }\n";
  for (const char* path : {"gains.kp", "gains.ki", "mode"}) {
    bool isConst = false;
    bool isVolatile = false;
    bool qualified = false;
    KvCAddressQualifier* qualifier = nullptr;
    const bool found = KvCCvStructTool().getStructSpecificTypeSpecifiersOfComp(
        app.member(cfg, path), app.data().getDataTypeServer(), false, isConst, isVolatile,
        qualified, qualifier);
    std::string specifiers = found ? "" : " (incomplete)";
    specifiers += isConst ? " const" : "";
    specifiers += isVolatile ? " volatile" : "";
    specifiers += qualified ? " " + qualifier->getName().str() : std::string();
    out << "  cfg." << path << ":" << (specifiers.empty() ? " none" : specifiers) << "\n";
  }
}

} // namespace

void demoSymbolTools(DemoRun& run) {
  printSectionTitle(run.out, "Symbol tools");
  demoMover(run.out);
  demoStructTool(run.out);
}
