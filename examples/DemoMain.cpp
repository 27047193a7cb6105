// The HulCvTools demo: boots the library against an option value storage, runs each
// subsystem's section and shuts down, all under a counting memory controller that must
// get every block back.
#include "DemoSampleApp.h"
#include "DemoSections.h"

#include "HulCvTools/Control/KvCCvToolsControl.h"
#include "platform/icode/KV_SymbolDB.h"
#include "platform/support/KvCCountingMemController.h"
#include "platform/support/KvCOptionValueStorage.h"

#include <iostream>
#include <string>

void printSectionTitle(std::ostream& out, const char* title) { out << "\n== " << title << " ==\n"; }

// Usage: hulcv_demo [--dot FILE]
int main(int argc, char** argv) {
  const char* dotFile = nullptr;
  for (int i = 1; i + 1 < argc; ++i)
    if (std::string(argv[i]) == "--dot")
      dotFile = argv[i + 1];
  std::ostream& out = std::cout;
  out << "HulCvTools demo\n";

  KvCCountingMemController memory;
  pKVMemory = &memory;
  KvCOptionValueStorage storage;
  auto* control = new KvCCvToolsControl;
  if (!control) {
    pKVMemory = nullptr;
    out << "out of memory\n";
    return 1;
  }
  out << "boot: " << (control->boot(&storage) ? "ok" : "failed") << "\n";

  {
    DemoSampleApp sample;
    DemoRun run{out, storage, *control, sample, dotFile};
    demoControl(run);
    out << "\nsample application: " << sample.app.data().getSymbolDB()->getNumberOfSymbols()
        << " symbols, " << sample.app.data().getNumberOfElements() << " ICode elements\n";
    demoElocQuery(run);
    demoExprLocDB(run);
    demoCallGraph(run);
    demoFixedPoint(run);
    demoRtos(run);
    demoEcp(run);
    demoSymbolTools(run);
    demoDdEnums(run);
    demoReuseCallGraph(run);
    demoInlineSymbolDb(run);
  }

  printSectionTitle(out, "Shutdown");
  out << "shutdown: " << (control->shutdown() ? "ok" : "failed") << "\n";
  out << "blocks taken from the memory controller: " << memory.getTotalBlocks() << "\n";
  delete control;
  pKVMemory = nullptr;
  out << "blocks still outstanding after destruction: " << memory.getOutstandingBlocks() << "\n";
  return memory.getOutstandingBlocks() == 0 ? 0 : 1;
}
