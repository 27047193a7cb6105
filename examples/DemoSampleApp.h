// The demo's sample application: a small multirate controller built with the fixture
// builder. A scheduler calls two tasks and activates a third; a recursive pair of
// functions; a loop over an array with an index expression; a filter with a const pointer
// parameter; a restart function. The locations the demo talks about are kept by name.
#ifndef HULCV_EXAMPLES_DEMOSAMPLEAPP_H
#define HULCV_EXAMPLES_DEMOSAMPLEAPP_H

#include "platform/builder/AppBuilder.h"

#include <string>
#include <utility>
#include <vector>

struct DemoSampleApp {
  DemoSampleApp();

  AppBuilder app;
  KvCUnparamSymbol* speed = nullptr;
  KvCUnparamSymbol* limit = nullptr;
  KvCUnparamSymbol* idx = nullptr;
  KvCUnparamSymbol* buf = nullptr;
  // Named locations the demo queries, in the order it prints them.
  std::vector<std::pair<std::string, KV_ExprLocation*>> spots;
};

// C-like text of an expression, for printing.
std::string renderExpression(KV_ExprLocation* loc);

#endif
