// KV_SmbDBObjVisitor: visits the entries of the symbol database. KV_ParamSmbDBObj is the
// database's entry of a function or macro symbol; the two belong together and are kept
// here.
#ifndef HUL_PLATFORM_ICODE_KV_SMBDBOBJVISITOR_H
#define HUL_PLATFORM_ICODE_KV_SMBDBOBJVISITOR_H

#include "platform/support/HulPlatformExport.h"

class KvCParamSymbol;
class KvCSymbol;
class KvCUnparamSymbol;

class HUL_PLATFORM_API KV_ParamSmbDBObj {
public:
  explicit KV_ParamSmbDBObj(KvCParamSymbol* s) : symbol(s) {}
  KvCParamSymbol* getParamSymbol() const { return symbol; }
  KvCSymbol* getSymbol() const;

private:
  KvCParamSymbol* symbol;
};

class HUL_PLATFORM_API KV_SmbDBObjVisitor {
public:
  virtual ~KV_SmbDBObjVisitor();
  virtual void visitParamSmbDBObj(KV_ParamSmbDBObj* entry) = 0;
  // Variables and components; nothing by default.
  virtual void visitUnparamSymbol(KvCUnparamSymbol* symbol);
};

#endif
