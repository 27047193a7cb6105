// KV_SymbolServer: the servers that find or make symbols, one of each kind per run; the
// code view data owns it and them. Today it holds the function symbol server.
#ifndef HUL_PLATFORM_ICODE_KV_SYMBOLSERVER_H
#define HUL_PLATFORM_ICODE_KV_SYMBOLSERVER_H

#include "platform/icode/KV_FunctionSymbolServer.h"

class HUL_PLATFORM_API KV_SymbolServer {
public:
  explicit KV_SymbolServer(KvCCodeViewData* owner) : function(owner) {}
  KV_SymbolServer(const KV_SymbolServer&) = delete;
  KV_SymbolServer& operator=(const KV_SymbolServer&) = delete;

  KV_FunctionSymbolServer* getFunction() { return &function; }

private:
  KV_FunctionSymbolServer function;
};

#endif
