#include "platform/icode/KvCSmbClassServer.h"

KvCFcnClassId* KvCFcnClassServer::demandFcnClass(const KvCSrcRef* /*srcRef*/) {
  if (!defaultClass)
    defaultClass = createFcnClass("default", nullptr);
  return defaultClass;
}

KvCFcnClassId* KvCFcnClassServer::createFcnClass(const WmCXString& name, KvCIcFileId* file) {
  classes.push_back(std::make_unique<KvCFcnClassId>(name, file));
  return classes.back().get();
}
