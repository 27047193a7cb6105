#include "platform/support/KvCMessageServer.h"

#include "platform/support/KvCSrcRef.h"

KvCMessageServer::KvCMessageServer() : handler(&recordAssertion), handlerContext(this) {}

KvCMessageServer* KvCMessageServer::getMessageServer() {
  static KvCMessageServer server;
  return &server;
}

bool KvCMessageServer::putMessage(tagERR_error_severity_etp severity, int number,
                                  const KvCSrcRef* srcRef, const char* category, const char* text) {
  messages.push_back(KvCMessageRecord{severity, number, srcRef,
                                      srcRef ? srcRef->getText() : WmCXString(),
                                      WmCXString(category), WmCXString(text)});
  return true;
}

void KvCMessageServer::raiseDebugAssertion(const char* file, int line, const char* expression) {
  handler(handlerContext, file, line, expression);
}

void KvCMessageServer::setDebugAssertionHandler(DebugAssertionHandler newHandler, void* context,
                                                DebugAssertionHandler* previous,
                                                void** previousContext) {
  if (previous)
    *previous = handler;
  if (previousContext)
    *previousContext = handlerContext;
  handler = newHandler ? newHandler : &recordAssertion;
  handlerContext = newHandler ? context : this;
}

void KvCMessageServer::clear() {
  messages.clear();
  assertions.clear();
}

void KvCMessageServer::recordAssertion(void* context, const char* file, int line,
                                       const char* expression) {
  auto* server = static_cast<KvCMessageServer*>(context);
  server->assertions.push_back(
      KvCDebugAssertionRecord{WmCXString(file), line, WmCXString(expression)});
}
