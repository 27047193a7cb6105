// KV_SymbolServer: the servers that find or make symbols, one of each kind per run; the
// code view data owns it and them: the function symbol server (getFunction), the
// parameterised macro symbol server (getParamMacro), the variable symbol server
// (getVariable), and the macro symbol server of extern globals and global macros
// (getMacro, the factory container's getMacroSymbolServer).
#ifndef HUL_PLATFORM_ICODE_KV_SYMBOLSERVER_H
#define HUL_PLATFORM_ICODE_KV_SYMBOLSERVER_H

#include "platform/icode/KV_FunctionSymbolServer.h"
#include "platform/icode/KV_ParamMacroSymbolServer.h"
#include "platform/icode/KV_VariableSymbolServer.h"

class KV_MacroSymbolServer;

class HUL_PLATFORM_API KV_SymbolServer {
public:
  explicit KV_SymbolServer(KvCCodeViewData* owner)
      : codeViewData(owner), function(owner), paramMacro(owner), variable(owner) {}
  KV_SymbolServer(const KV_SymbolServer&) = delete;
  KV_SymbolServer& operator=(const KV_SymbolServer&) = delete;

  KV_FunctionSymbolServer* getFunction() { return &function; }
  KV_ParamMacroSymbolServer* getParamMacro() { return &paramMacro; }
  KV_VariableSymbolServer* getVariable() { return &variable; }
  KV_MacroSymbolServer* getMacro() const;

private:
  KvCCodeViewData* codeViewData;
  KV_FunctionSymbolServer function;
  KV_ParamMacroSymbolServer paramMacro;
  KV_VariableSymbolServer variable;
};

#endif
