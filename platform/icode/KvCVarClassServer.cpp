#include "platform/icode/KvCVarClassServer.h"

KvCVarClassId* KvCVarClassServer::demandVarClass(const WmCXString& name, bool isExtern,
                                                 bool isGlobal) {
  std::unique_ptr<KvCVarClassId>& slot = classes[name];
  if (!slot)
    slot = std::make_unique<KvCVarClassId>(name, isExtern, isGlobal);
  return slot.get();
}

KvCVarClassId* KvCVarClassServer::demandMacroGlobalExternDefault(const KvCSrcRef* /*srcRef*/) {
  return demandVarClass("MacroGlobalExternDefault", true, true);
}

KvCVarClassId* KvCVarClassServer::demandSlLocalDefault(const KvCSrcRef* /*srcRef*/) {
  return demandVarClass("SlLocalDefault", false, false);
}

KvCVarClassId* KvCVarClassServer::findVarClass(const WmCXString& name) const {
  auto it = classes.find(name);
  return it == classes.end() ? nullptr : it->second.get();
}
