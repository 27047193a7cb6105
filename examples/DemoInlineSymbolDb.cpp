// Inline symbol database: the variables of `filter` are replaced when it is inlined into
// `step`, and again when `step` is inlined into `task`. The section records both
// inlinings and prints each variable's chain, its final sink and, from the end, its
// original source; the structure is recorded through one component and mapped whole.
#include "DemoSections.h"

#include "HulCvTools/InlineSymbolDb/KvCInlineSymbolDb.h"
#include "platform/builder/AppBuilder.h"
#include "platform/icode/KvCUnparamSymbol.h"

#include <string>
#include <vector>

namespace {

// "st.y" for a component, the plain name otherwise; "-" for null.
std::string qualifiedName(const KvCUnparamSymbol* symbol) {
  if (!symbol)
    return "-";
  const KvCUnparamSymbol* owner = symbol->getStructSymbol();
  return owner ? qualifiedName(owner) + "." + symbol->getName().str() : symbol->getName().str();
}

void printChain(std::ostream& out, KvCInlineSymbolDb& db, KvCUnparamSymbol* start) {
  std::string chain = qualifiedName(start);
  // Every step goes to a symbol made for a later inlining, so the chain ends.
  for (KvCUnparamSymbol* s = db.getSinkSymbol(start); s; s = db.getSinkSymbol(s))
    chain += " -> " + qualifiedName(s);
  KvCUnparamSymbol* last = db.getFinalSinkSymbol(start);
  out << "  " << chain << "    (final sink " << qualifiedName(last) << ", its original source "
      << qualifiedName(last ? db.getOriginalSourceSymbol(last) : nullptr) << ")\n";
}

} // namespace

void demoInlineSymbolDb(DemoRun& run) {
  std::ostream& out = run.out;
  printSectionTitle(out, "Inline symbol database");

  AppBuilder app("InlineDemo");
  KV_StructType* state = app.structType(
      "FilterState", {{"x", app.int16()}, {"y", app.int16()}, {"n", app.uint8()}});
  // filter's own variables, and their replacements in step and then in task.
  KvCUnparamSymbol* gain = app.variable("gain", app.int16());
  KvCUnparamSymbol* acc = app.variable("acc", app.int32());
  KvCUnparamSymbol* st = app.structVariable("st", state);
  KvCUnparamSymbol* gainStep = app.variable("gain_step", app.int16());
  KvCUnparamSymbol* accStep = app.variable("acc_step", app.int32());
  KvCUnparamSymbol* stStep = app.structVariable("st_step", state);
  KvCUnparamSymbol* accTask = app.variable("acc_task", app.int32());
  KvCUnparamSymbol* stTask = app.structVariable("st_task", state);

  KvCInlineSymbolDb db;
  // filter inlined into step.
  db.mapSymbol(gain, gainStep);
  db.mapSymbol(acc, accStep);
  db.mapSymbol(app.member(st, "x"), app.member(stStep, "x")); // maps st whole
  // step inlined into task; gain_step became a constant there and is not replaced.
  db.mapSymbol(accStep, accTask);
  db.mapSymbol(stStep, stTask);
  db.completeDb();

  out << "two inlinings recorded, " << db.getNumberOfEntries() << " symbols take part:\n";
  for (KvCUnparamSymbol* s : std::vector<KvCUnparamSymbol*>{
           gain, acc, st, app.member(st, "x"), app.member(st, "y"), app.member(st, "n")})
    printChain(out, db, s);
  out << "  direct source of st_task.y: " << qualifiedName(db.getSourceSymbol(app.member(stTask, "y")))
      << "\n";
}
