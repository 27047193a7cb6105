// The demo's sections, one per subsystem of the library. Each section runs the
// subsystem's passes on the demo's run state and prints what they found. Output must be
// the same on every run: print no addresses and nothing that depends on hash order.
#ifndef HULCV_EXAMPLES_DEMOSECTIONS_H
#define HULCV_EXAMPLES_DEMOSECTIONS_H

#include <ostream>

class KvCCvToolsControl;
class KvCOptionValueStorage;
struct DemoSampleApp;

// What the sections share: the booted control object, the run's option storage and the
// sample application.
struct DemoRun {
  std::ostream& out;
  KvCOptionValueStorage& storage;
  KvCCvToolsControl& control;
  DemoSampleApp& sample;
  // Where to write the call graph in Graphviz DOT, or null.
  const char* dotFile = nullptr;
};

void printSectionTitle(std::ostream& out, const char* title);

// Library frame: options, messages, internal checks.
void demoControl(DemoRun& run);
// Where locations stand and what they take part in.
void demoElocQuery(DemoRun& run);
// Definitions and uses of a variable; a repeated expression.
void demoExprLocDB(DemoRun& run);
// The call graph, the functions on call cycles, inlining costs.
void demoCallGraph(DemoRun& run);
// Constants in relations scaled and rounded; absolute values.
void demoFixedPoint(DemoRun& run);
// The RTOS types of multirate code and the OSEK header that declares them.
void demoRtos(DemoRun& run);
// The Ecp tools' object identifiers, access-point macros and ECU service function, the
// headers that define them and an expansion of the macros.
void demoEcp(DemoRun& run);
// A variable moved into a function and back; a nested component's inherited specifiers.
void demoSymbolTools(DemoRun& run);
// The call graph over partitions, with the instances of a reused partition.
void demoReuseCallGraph(DemoRun& run);
// Variables replaced through two inlinings, and their chains.
void demoInlineSymbolDb(DemoRun& run);

// Properties translated to and from the Data Dictionary.
void demoDdEnums(DemoRun& run);

#endif
