// SyntheticApp: builds applications of a chosen shape and size for benchmarks and for
// tests that need more than a hand-written fixture, and counts what such an application
// holds.
//
// buildSyntheticApp adds to an AppBuilder: global variables v0..v<variables-1> (Int16,
// Int32 and UInt8) and one array "varr" (Int16[64]) in the builder's current file;
// functions f0..f<functions-1>, 256 to a file (syn0.c, syn1.c, ...); and, when asked
// for, a scheduler "sched" in the file that was current. Each body holds
// `statementsPerBody` statements: assignments v = expr, compound assignments v += expr,
// ifs on a relational condition holding one assignment, and for loops over eight
// elements of varr with an index expression; and, at random places among them, one
// statement per outgoing call. The right-hand side of every assignment statement has
// exactly `expressionDepth` levels of operations (add, sub, mul, bit and, casts) above
// its leaves (variable accesses, Int16 constants). Calls carry one or two actual
// arguments of depth at most one; a share of all calls are task activations instead
// (without arguments; the activated function gets the task-function role). The call
// graph has `callFanOut` calls from each function to later functions (none from the
// last), `recursionCycles` cycles of two to four functions, and the scheduler's calls
// of `schedulerCalls` distinct functions.
//
// Everything is drawn from one std::mt19937_64 seeded with `seed`, in a fixed order, so
// a seed gives the same application (the same structure and serial numbers) on every
// run and platform. Out-of-range shape values are clamped (negative counts to 0, the
// share to [0, 1], the scheduler's calls to the number of functions; at least one
// variable).
//
// Cost: time and memory linear in the number of elements built, about
// functions * statementsPerBody * 2^expressionDepth locations; functions are found by
// index, never by name. The builder owns everything built.
#ifndef HUL_PLATFORM_BUILDER_SYNTHETICAPP_H
#define HUL_PLATFORM_BUILDER_SYNTHETICAPP_H

#include "platform/builder/AppBuilder.h"

#include <cstdint>

class KvCCodeViewData;

struct SyntheticAppShape {
  int functions = 100;              // number of functions (besides the scheduler)
  int statementsPerBody = 10;       // statements per function body (calls come on top)
  int callFanOut = 2;               // calls from each function to later functions
  int schedulerCalls = 0;           // calls of distinct functions from "sched" (0: none)
  int recursionCycles = 0;          // call cycles of length 2..4 among the functions
  double taskActivationShare = 0.0; // share (0..1) of calls made as task activations
  int expressionDepth = 3;          // depth of the right-hand side of each assignment
  int variables = 50;               // global variables used by the expressions
  std::uint64_t seed = 1;
};

// Builds the application into `app`; deterministic for a seed.
void buildSyntheticApp(AppBuilder& app, const SyntheticAppShape& shape);

// What an application holds, found by one walk over every file of every code unit (so it
// counts any application, not only synthetic ones):
//   functions: function definitions (the scheduler included);
//   statements: statements inside function bodies, nested ones included;
//   calls: call operations, task activations included; taskActivations: those;
//   expressionLocations: every location the walk reaches (file level included).
// O(elements).
struct SyntheticAppCounts {
  int functions = 0;
  int statements = 0;
  int calls = 0;
  int taskActivations = 0;
  int expressionLocations = 0;
};
SyntheticAppCounts countSyntheticApp(KvCCodeViewData& data);

#endif
