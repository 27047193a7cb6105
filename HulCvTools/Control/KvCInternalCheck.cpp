#include "HulCvTools/Control/KvCInternalCheck.h"

#include "HulCvTools/Control/KvCCodeGenMessage.h"
#include "platform/support/KvCMessageServer.h"

namespace {
void raiseDebugReport(const char* file, int line, const char* expression) {
  if (!KvCInternalCheck::hasDebugChecks())
    return;
  KvCMessageServer* server = KvCMessageServer::getMessageServer();
  if (server->ShowInternalInfo())
    server->raiseDebugAssertion(file, line, expression);
}
} // namespace

bool KvCInternalCheck::hasDebugChecks() {
#ifdef NDEBUG
  return false;
#else
  return true;
#endif
}

void KvCInternalCheck::report(const char* file, int line, const char* errorCode, int number) {
  raiseDebugReport(file, line, "0");
  KvCCodeGenMessage::msg10007(errorCode, number);
}

void KvCInternalCheck::reportWithSrcRef(const char* file, int line, const KvCSrcRef* srcRef,
                                        const char* errorCode, int number) {
  raiseDebugReport(file, line, "0");
  KvCCodeGenMessage::msg10008(srcRef, errorCode, number);
}

void KvCInternalCheck::debugAssertFailed(const char* file, int line, const char* expression) {
  raiseDebugReport(file, line, expression);
}
