// KvCParamSymbol: a function or a macro. It owns its call-graph record
// (KvCFcgFunctionInfo) and points to its body statement table (owned by the code view
// data; null for a function without body in this application).
//
// A function made by the function symbol server (or the call inserter) also carries its
// signature: the symbol flag word, the function class, and per formal parameter a name,
// a type, a scaling and a flag word (hasSignature). The return type is the symbol's data
// type, the return scaling its scaling. Symbols made otherwise have no signature.
//
// A macro made by the parameterised macro symbol server (or the macro call inserter) also
// carries a signature: its parameters have names and flag words but no types or scalings
// (null). It may be a pre-include macro: one that a file defines before everything else
// it holds. Its body is the location that its definition statement holds as body
// (getMacroBody; null for a macro without body in this application).
//
// In partitioned code a function also has roles of its own (tagKvEFunctionRole: partition
// step/init/term/restart function, auxiliary function, RTE API call, called by the
// simulation frame) and may point to its code block in the view (not owned; null for a
// function without one).
#ifndef HUL_PLATFORM_ICODE_KVCPARAMSYMBOL_H
#define HUL_PLATFORM_ICODE_KVCPARAMSYMBOL_H

#include "platform/icode/KvCSymbol.h"

#include <memory>
#include <vector>

class KV_ExprLocation;
class KvCCStmTable;
class KvCCodeBlockId;
class KvCFcgFunctionInfo;
class KvCFcnClassId;

// Roles of a function in partitioned code (a word of its own beside the symbol roles).
enum tagKvEFunctionRole : unsigned {
  KV_FROLE_AUX_FUNCTION = 1u << 0,        // an auxiliary function of generated code
  KV_FROLE_PARTITION_STEP = 1u << 1,      // the step function of a partition
  KV_FROLE_PARTITION_INIT = 1u << 2,      // the init function of a partition
  KV_FROLE_PARTITION_TERM = 1u << 3,      // the term function of a partition
  KV_FROLE_PARTITION_RESTART = 1u << 4,   // the restart function of a partition
  KV_FROLE_RTE_API_FUNC_CALL = 1u << 5,   // a call of an RTE API function
  KV_FROLE_RTE_API_MACRO_CALL = 1u << 6,  // a call of an RTE API macro
  KV_FROLE_CALLED_BY_SIM_FRAME = 1u << 7, // called by the simulation frame
  KV_FROLE_ATOMIC_INLINE = 1u << 8,       // to be inlined as a whole, when inlined
};

class HUL_PLATFORM_API KvCParamSymbol : public KvCSymbol {
public:
  KvCParamSymbol(int index, WmCXString symbolName, KV_DataType* returnType, bool macro);
  ~KvCParamSymbol() override;

  KvCParamSymbol* asParamSymbol() override { return this; }

  bool isMacro() const { return macro; }
  bool isPreIncludeMacro() const { return preInclude; }
  void markAsPreIncludeMacro() { preInclude = true; }
  // The location that holds the macro's body (owned by the code view data), or null.
  KV_ExprLocation* getMacroBody() const { return macroBody; }
  void setMacroBody(KV_ExprLocation* body) { macroBody = body; }
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

  // The code block of the function in the view, or null (a function without one).
  KvCCodeBlockId* getCodeBlockId() const { return codeBlockId; }
  void setCodeBlockId(KvCCodeBlockId* id) { codeBlockId = id; }
  bool hasFunctionRole(tagKvEFunctionRole role) const { return (functionRoles & role) != 0; }
  void setFunctionRole(tagKvEFunctionRole role, bool value) {
    functionRoles = value ? (functionRoles | role) : (functionRoles & ~static_cast<unsigned>(role));
  }
  bool isAuxFunction() const { return hasFunctionRole(KV_FROLE_AUX_FUNCTION); }
  bool isPartitionStepFunction() const { return hasFunctionRole(KV_FROLE_PARTITION_STEP); }
  bool isPartitionInitFunction() const { return hasFunctionRole(KV_FROLE_PARTITION_INIT); }
  bool isPartitionTermFunction() const { return hasFunctionRole(KV_FROLE_PARTITION_TERM); }
  bool isPartitionRestartFunction() const { return hasFunctionRole(KV_FROLE_PARTITION_RESTART); }
  bool isRteApiFuncCall() const { return hasFunctionRole(KV_FROLE_RTE_API_FUNC_CALL); }
  bool isRteApiMacroCall() const { return hasFunctionRole(KV_FROLE_RTE_API_MACRO_CALL); }
  bool isCalledBySimFrame() const { return hasFunctionRole(KV_FROLE_CALLED_BY_SIM_FRAME); }
  bool isAtomicInlineFunction() const { return hasFunctionRole(KV_FROLE_ATOMIC_INLINE); }

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
  // The function class (given with the signature, or set on its own), or null.
  KvCFcnClassId* getFcnClassId() const { return functionClass; }
  virtual void setFcnClassId(KvCFcnClassId* fcnClass) { functionClass = fcnClass; }
  // The symbol class of the function class, or null.
  KvCSmbClassId* getSmbClassId() const override;
  int getNumberOfFormalParams() const { return static_cast<int>(formals.size()); }
  const FormalParam& getFormalParam(int i) const { return formals[static_cast<std::size_t>(i)]; }

private:
  bool macro;
  bool preInclude = false;
  KV_ExprLocation* macroBody = nullptr;
  KvCCStmTable* body = nullptr;
  std::unique_ptr<KvCFcgFunctionInfo> info;
  bool signatureSet = false;
  unsigned int symbolFlags = 0;
  KvCFcnClassId* functionClass = nullptr;
  std::vector<FormalParam> formals;
  KvCCodeBlockId* codeBlockId = nullptr;
  unsigned functionRoles = 0;
};

#endif
