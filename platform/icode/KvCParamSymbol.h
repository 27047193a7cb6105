// KvCParamSymbol: a function or a macro. It owns its call-graph record
// (KvCFcgFunctionInfo) and points to its body statement table (owned by the code view
// data; null for a function without body in this application).
#ifndef HUL_PLATFORM_ICODE_KVCPARAMSYMBOL_H
#define HUL_PLATFORM_ICODE_KVCPARAMSYMBOL_H

#include "platform/icode/KvCSymbol.h"

#include <memory>

class KvCCStmTable;
class KvCFcgFunctionInfo;

class HUL_PLATFORM_API KvCParamSymbol : public KvCSymbol {
public:
  KvCParamSymbol(int index, WmCXString symbolName, KV_DataType* returnType, bool macro);
  ~KvCParamSymbol() override;

  KvCParamSymbol* asParamSymbol() override { return this; }

  bool isMacro() const { return macro; }
  KvCCStmTable* getBodySTT() const { return body; }
  void setBodySTT(KvCCStmTable* table) { body = table; }
  KvCFcgFunctionInfo* getFunctionInfo() const { return info.get(); }

  bool isAccessFunction() const { return hasRole(KV_ROLE_ACCESS_FUNCTION); }
  bool isRteApiMacro() const { return hasRole(KV_ROLE_RTE_API_MACRO); }
  bool isReuseMasterFunction() const { return hasRole(KV_ROLE_REUSE_MASTER); }
  bool isSfExternCUserFunction() const { return hasRole(KV_ROLE_SF_EXTERN_C_USER); }
  // The function's code is imported from outside the generated code.
  bool isImportedCodeBlock() const { return hasRole(KV_ROLE_IMPORTED_CODE_BLOCK); }
  bool isTaskFunction() const { return hasRole(KV_ROLE_TASK_FUNCTION); }

private:
  bool macro;
  KvCCStmTable* body = nullptr;
  std::unique_ptr<KvCFcgFunctionInfo> info;
};

#endif
