// KvCInternalCheck: the one way the library reports a condition that must never fail in
// a correct run.
//
// A failed internal check (KV_INTERNAL_CHECK, KV_VERIFY):
//   1. in builds with debug checks (NDEBUG not defined), and only while the message
//      server's ShowInternalInfo() holds, raises a debug assertion report with the source
//      file, the line and the expression text "0";
//   2. in every build, emits message 10007 with the reporting place's error code (the
//      class name, or the source file's path) and number, or 10008 when a source
//      reference is at hand (KV_INTERNAL_CHECK_SRC).
// The lighter debug assertion (KV_DEBUG_ASSERT) performs step 1 alone, with the text of
// the failed condition, and emits no message. Neither ever ends the program: the caller
// goes on on its own failure path.
#ifndef HULCVTOOLS_CONTROL_KVCINTERNALCHECK_H
#define HULCVTOOLS_CONTROL_KVCINTERNALCHECK_H

#include "HulCvTools/HulCvToolsExport.h"

class KvCSrcRef;

class HULCV_API KvCInternalCheck {
public:
  static void report(const char* file, int line, const char* errorCode, int number);
  static void reportWithSrcRef(const char* file, int line, const KvCSrcRef* srcRef,
                               const char* errorCode, int number);
  static void debugAssertFailed(const char* file, int line, const char* expression);

  // Whether this build of the library carries debug checks.
  static bool hasDebugChecks();

private:
  KvCInternalCheck() = delete;
};

// Reports a failed internal check with the error code text and number.
#define KV_INTERNAL_CHECK(errorCode, number)                                                       \
  KvCInternalCheck::report(__FILE__, __LINE__, (errorCode), (number))
#define KV_INTERNAL_CHECK_SRC(srcRef, errorCode, number)                                           \
  KvCInternalCheck::reportWithSrcRef(__FILE__, __LINE__, (srcRef), (errorCode), (number))
// Evaluates `cond`; when it fails, reports the internal check. Yields `cond` as a bool:
//   if (!KV_VERIFY(symbol != nullptr, "KvCInlineSymbolDb", 120)) return false;
#define KV_VERIFY(cond, errorCode, number)                                                         \
  ((cond) ? true : (KV_INTERNAL_CHECK(errorCode, number), false))
// The debug assertion: reports the text of `cond` when it fails (debug builds only).
#define KV_DEBUG_ASSERT(cond)                                                                      \
  do {                                                                                             \
    if (!(cond))                                                                                   \
      KvCInternalCheck::debugAssertFailed(__FILE__, __LINE__, #cond);                              \
  } while (0)

#endif
