// KvCMessageServer: the code generator's message server. It takes every message of the
// run (severity, number, source reference, category, text) and keeps a record of them in
// the order they arrived, so that a pass, a test or the demo can read them back.
//
// It also raises the debug assertion reports of failed internal checks. A report goes to
// a replaceable handler; the default handler records (file, line, expression). No report
// ever ends the program.
//
// There is one server per process (getMessageServer()). It is not locked: messages must
// not be put from two threads at once.
#ifndef HUL_PLATFORM_SUPPORT_KVCMESSAGESERVER_H
#define HUL_PLATFORM_SUPPORT_KVCMESSAGESERVER_H

#include "platform/support/HulPlatformExport.h"
#include "platform/support/WmCXString.h"

#include <vector>

class KvCSrcRef;

// Severities of messages; the numbers are what callers rely on.
enum tagERR_error_severity_etp {
  ERR_SEVERITY_NOTE = 0,
  ERR_SEVERITY_WARNING = 1,
  ERR_SEVERITY_ERROR = 2,
  ERR_SEVERITY_FATAL = 3
};

// One message as the server received it. `srcRef` is the caller's pointer (may be null);
// `srcRefText` is its text at the time of the message.
struct KvCMessageRecord {
  tagERR_error_severity_etp severity;
  int number;
  const KvCSrcRef* srcRef;
  WmCXString srcRefText;
  WmCXString category;
  WmCXString text;
};

// One debug assertion report.
struct KvCDebugAssertionRecord {
  WmCXString file;
  int line;
  WmCXString expression;
};

class HUL_PLATFORM_API KvCMessageServer {
public:
  // Receives a debug assertion report; `context` is the pointer given with the handler.
  using DebugAssertionHandler = void (*)(void* context, const char* file, int line,
                                         const char* expression);

  static KvCMessageServer* getMessageServer();

  KvCMessageServer(const KvCMessageServer&) = delete;
  KvCMessageServer& operator=(const KvCMessageServer&) = delete;

  // Records the message. Null category or text are taken as empty. Returns true.
  bool putMessage(tagERR_error_severity_etp severity, int number, const KvCSrcRef* srcRef,
                  const char* category, const char* text);

  // Whether internal information (debug assertion reports) is to be shown.
  bool ShowInternalInfo() const { return showInternalInfo; }
  void setShowInternalInfo(bool show) { showInternalInfo = show; }

  // Raises a debug assertion report through the current handler.
  void raiseDebugAssertion(const char* file, int line, const char* expression);
  // Installs `handler` (null restores the recording default) and returns the previous
  // handler through the out-parameters.
  void setDebugAssertionHandler(DebugAssertionHandler handler, void* context,
                                DebugAssertionHandler* previous = nullptr,
                                void** previousContext = nullptr);

  const std::vector<KvCMessageRecord>& getMessages() const { return messages; }
  const std::vector<KvCDebugAssertionRecord>& getDebugAssertions() const { return assertions; }
  // Forgets the recorded messages and reports; settings and the handler stay.
  void clear();

private:
  KvCMessageServer();
  static void recordAssertion(void* context, const char* file, int line, const char* expr);

  std::vector<KvCMessageRecord> messages;
  std::vector<KvCDebugAssertionRecord> assertions;
  DebugAssertionHandler handler;
  void* handlerContext;
  bool showInternalInfo = false;
};

#endif
