#include "platform/icode/KvCSmbClassServer.h"

#include "platform/icode/KvCVarClassId.h"

KvCFcnClassId* KvCFcnClassServer::demandFcnClass(const KvCSrcRef* /*srcRef*/) {
  if (!defaultClass)
    defaultClass = createFcnClass("default", nullptr);
  return defaultClass;
}

KvCFcnClassId* KvCFcnClassServer::demandApMacroClass(const KvCSrcRef* /*srcRef*/) {
  if (!apMacroClass)
    apMacroClass = createFcnClass("ApMacro", nullptr);
  return apMacroClass;
}

KvCFcnClassId* KvCFcnClassServer::createFcnClass(const WmCXString& name, KvCIcFileId* file) {
  classes.push_back(std::make_unique<KvCFcnClassId>(name, file));
  return classes.back().get();
}

KvCSmbClassId* KvCSmbClassServer::createSmbClass(const WmCXString& name, tagKvESmbClassKind kind,
                                                 KvCVarClassId* varClass, KvCFcnClassId* fcnClass) {
  if (name.isEmpty() || findSmbClass(name) || (varClass && varClass->getSmbClassId()) ||
      (fcnClass && fcnClass->getSmbClassId()))
    return nullptr;
  smbClasses.push_back(std::make_unique<KvCSmbClassId>(name, kind, varClass, fcnClass));
  KvCSmbClassId* made = smbClasses.back().get();
  if (varClass)
    varClass->smbClassId = made;
  if (fcnClass)
    fcnClass->smbClassId = made;
  return made;
}

KvCSmbClassId* KvCSmbClassServer::findSmbClass(const WmCXString& name) const {
  for (const auto& cls : smbClasses)
    if (cls->getSmbClass()->getName() == name)
      return cls.get();
  return nullptr;
}
