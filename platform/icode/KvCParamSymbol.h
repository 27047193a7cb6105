// KvCParamSymbol: a function or a macro. It owns its call-graph record
// (KvCFcgFunctionInfo) and points to its body statement table (owned by the code view
// data; null for a function without body in this application).
//
// A function made by the function symbol server (or the call inserter) also carries its
// signature: the symbol flag word, the function class, and per formal parameter a name,
// a type, a scaling and a flag word (hasSignature). The return type is the symbol's data
// type, the return scaling its scaling. Symbols made otherwise have no signature.
#ifndef HUL_PLATFORM_ICODE_KVCPARAMSYMBOL_H
#define HUL_PLATFORM_ICODE_KVCPARAMSYMBOL_H

#include "platform/icode/KvCSymbol.h"

#include <memory>
#include <vector>

class KvCCStmTable;
class KvCFcgFunctionInfo;
class KvCFcnClassId;

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

  // One formal parameter of the signature.
  struct FormalParam {
    WmCXString name;
    KV_DataType* type = nullptr;
    KV_Scaling* scaling = nullptr;
    unsigned int flags = 0;
  };
  bool hasSignature() const { return signatureSet; }
  // Set once by the server that makes the function.
  void setSignature(unsigned int symbolFlagWord, KvCFcnClassId* fcnClass,
                    std::vector<FormalParam> params) {
    symbolFlags = symbolFlagWord;
    functionClass = fcnClass;
    formals = std::move(params);
    signatureSet = true;
  }
  unsigned int getSymbolFlags() const { return symbolFlags; }
  KvCFcnClassId* getFcnClassId() const { return functionClass; }
  int getNumberOfFormalParams() const { return static_cast<int>(formals.size()); }
  const FormalParam& getFormalParam(int i) const { return formals[static_cast<std::size_t>(i)]; }

private:
  bool macro;
  KvCCStmTable* body = nullptr;
  std::unique_ptr<KvCFcgFunctionInfo> info;
  bool signatureSet = false;
  unsigned int symbolFlags = 0;
  KvCFcnClassId* functionClass = nullptr;
  std::vector<FormalParam> formals;
};

#endif
