#include "platform/support/KvCSrcRefServer.h"

KvCSrcRefServer::KvCSrcRefServer() = default;
KvCSrcRefServer::~KvCSrcRefServer() = default;

KvCInternalSrcRef* KvCSrcRefServer::getSrcRef() {
  auto ref = std::make_unique<KvCInternalSrcRef>();
  KvCInternalSrcRef* result = ref.get();
  refs.push_back(std::move(ref));
  return result;
}

KvCSrcRef* KvCSrcRefServer::createModelSrcRef(const WmCXString& origin) {
  refs.push_back(std::make_unique<KvCSrcRef>(origin));
  return refs.back().get();
}
