// KvCSymbol: a named object of the ICode: a function or macro (KvCParamSymbol) or a
// variable or structure component (KvCUnparamSymbol).
//
// Every symbol has a debug index, unique in its symbol database and increasing in
// creation order (the first symbol has 1), and owns its expression-location database.
// Roles (step function, restart function, logging macro, ...) are flags the code
// generator sets; the predicates and marks below read and set them. A symbol is
// "selected" unless the code generator deselects it (for example a symbol of a library
// that is not generated).
//
// Class and place: a symbol's class (getSmbClassId) is the symbol class of its variable
// class (KvCUnparamSymbol) or function class (KvCParamSymbol); it has an extended class
// state and may carry an extern class besides (the class of its declarations in other
// files). Its statement table (getStt) is the table it was last entered in
// (KvCCStmTable::enterSymbol or enterDeclaration); the table's removeSymbol leaves it as
// it is, so it still names the old table until setStt changes it. At most one table lists
// a symbol at a time (see KvCCStmTable).
#ifndef HUL_PLATFORM_ICODE_KVCSYMBOL_H
#define HUL_PLATFORM_ICODE_KVCSYMBOL_H

#include "platform/icode/KvCExprLocDB.h"
#include "platform/icode/KvCSmbClass.h"
#include "platform/support/HulPlatformExport.h"
#include "platform/support/WmCXString.h"

class KV_DataType;
class KV_Scaling;
class KvCCStmTable;
class KvCParamSymbol;
class KvCSmbClassId;
class KvCUnparamSymbol;

enum tagKvESymbolRole : unsigned {
  KV_ROLE_STEP_FUNCTION = 1u << 0,
  KV_ROLE_RESTART_FUNCTION = 1u << 1,
  KV_ROLE_INIT_FUNCTION = 1u << 2,
  KV_ROLE_TERM_FUNCTION = 1u << 3,
  KV_ROLE_LOG_MACRO = 1u << 4,
  KV_ROLE_ACCESS_FUNCTION = 1u << 5,
  KV_ROLE_RTE_API_MACRO = 1u << 6,
  KV_ROLE_SIDE_EFFECT_FREE = 1u << 7,
  KV_ROLE_RTOS_SCHEDULE_FCN = 1u << 8,
  KV_ROLE_REUSE_MASTER = 1u << 9,
  KV_ROLE_SF_EXTERN_C_USER = 1u << 10,
  KV_ROLE_IMPORTED_CODE_BLOCK = 1u << 11,
  KV_ROLE_DEFINES_VECTOR_WIDTH = 1u << 12,
  KV_ROLE_REFERENCE_FORMAL = 1u << 13,
  KV_ROLE_FORMAL_PARAMETER = 1u << 14,
  KV_ROLE_TASK_FUNCTION = 1u << 15,
  KV_ROLE_TERMINATE_TASK = 1u << 16,
  KV_ROLE_SET_ABS_ALARM = 1u << 17,
  KV_ROLE_SET_REL_ALARM = 1u << 18,
  KV_ROLE_CANCEL_ALARM = 1u << 19,
  KV_ROLE_STARTUP_FUNCTION = 1u << 20,
  KV_ROLE_AP_ENTRY_FUNCTION = 1u << 21,
  KV_ROLE_AP_EXIT_FUNCTION = 1u << 22,
  // The Ecp tools' access-point macros (ap_Write, ap_Read, ap_Entry, ap_Exit), the ECU
  // service function, and object-like macros of file scope (KV_MacroSymbolServer's
  // global macros).
  KV_ROLE_AP_WRITE_MACRO = 1u << 23,
  KV_ROLE_AP_READ_MACRO = 1u << 24,
  KV_ROLE_AP_ENTRY_MACRO = 1u << 25,
  KV_ROLE_AP_EXIT_MACRO = 1u << 26,
  KV_ROLE_ECU_SERVICE_FUNCTION = 1u << 27,
  KV_ROLE_GLOBAL_MACRO = 1u << 28,
};

class HUL_PLATFORM_API KvCSymbol {
public:
  virtual ~KvCSymbol();
  KvCSymbol(const KvCSymbol&) = delete;
  KvCSymbol& operator=(const KvCSymbol&) = delete;

  const WmCXString& getName() const { return name; }
  int getDebugIndex() const { return debugIndex; }
  KV_DataType* getDataType() const { return dataType; }
  void setDataType(KV_DataType* type) { dataType = type; }
  KV_Scaling* getScaling() const { return scaling; }
  void setScaling(KV_Scaling* s) { scaling = s; }

  virtual KvCParamSymbol* asParamSymbol() { return nullptr; }
  virtual KvCUnparamSymbol* asUnparamSymbol() { return nullptr; }

  // The symbol's class: the symbol class its variable or function class stands for; null
  // when it has no such class (or the class stands for no symbol class).
  virtual KvCSmbClassId* getSmbClassId() const { return nullptr; }
  virtual tagKvESmbClassState getExtSmbClassState() const { return extClassState; }
  virtual void setExtSmbClassState(tagKvESmbClassState state) { extClassState = state; }
  // The class of the symbol's extern declarations in other files, or null. Not owned.
  virtual KvCSmbClassId* getExternSmbClass() const { return externClass; }
  virtual void setExternSmbClass(KvCSmbClassId* cls) { externClass = cls; }
  // The statement table the symbol was last entered in, or null (never entered, or reset).
  virtual KvCCStmTable* getStt() const { return stt; }
  virtual void setStt(KvCCStmTable* table) { stt = table; }

  KvCExprLocDB* getExprLocDB() const { return &db; }
  bool isSelected() const { return selected; }
  void setSelected(bool value) { selected = value; }

  bool hasRole(tagKvESymbolRole role) const { return (roles & role) != 0; }
  void setRole(tagKvESymbolRole role, bool value);

  bool isStepFunction() const { return hasRole(KV_ROLE_STEP_FUNCTION); }
  bool isRestartFunction() const { return hasRole(KV_ROLE_RESTART_FUNCTION); }
  bool isInitFunction() const { return hasRole(KV_ROLE_INIT_FUNCTION); }
  bool isTermFunction() const { return hasRole(KV_ROLE_TERM_FUNCTION); }
  bool isLogMacro() const { return hasRole(KV_ROLE_LOG_MACRO); }
  // The function run once when the application starts, and the functions run on entering
  // and on leaving an application partition.
  bool isStartupFunction() const { return hasRole(KV_ROLE_STARTUP_FUNCTION); }
  bool isApEntryFunction() const { return hasRole(KV_ROLE_AP_ENTRY_FUNCTION); }
  bool isApExitFunction() const { return hasRole(KV_ROLE_AP_EXIT_FUNCTION); }
  bool isSideEffectFreeFunction() const { return hasRole(KV_ROLE_SIDE_EFFECT_FREE); }
  bool isRtosScheduleFcn() const { return hasRole(KV_ROLE_RTOS_SCHEDULE_FCN); }
  void markAsSideEffectFreeFunction() { setRole(KV_ROLE_SIDE_EFFECT_FREE, true); }
  void markAsRtosScheduleFcn() { setRole(KV_ROLE_RTOS_SCHEDULE_FCN, true); }
  // The RTOS API functions that end a task and that set or cancel an alarm.
  bool isTerminateTaskSymbol() const { return hasRole(KV_ROLE_TERMINATE_TASK); }
  bool isSetAbsAlarmFunction() const { return hasRole(KV_ROLE_SET_ABS_ALARM); }
  bool isSetRelAlarmFunction() const { return hasRole(KV_ROLE_SET_REL_ALARM); }
  bool isCancelAlarmFunction() const { return hasRole(KV_ROLE_CANCEL_ALARM); }
  void markAsTerminateTaskSymbol() { setRole(KV_ROLE_TERMINATE_TASK, true); }
  void markAsSetAbsAlarmFunction() { setRole(KV_ROLE_SET_ABS_ALARM, true); }
  void markAsSetRelAlarmFunction() { setRole(KV_ROLE_SET_REL_ALARM, true); }
  void markAsCancelAlarmFunction() { setRole(KV_ROLE_CANCEL_ALARM, true); }
  // The access-point macros through which Ecp code writes, reads, enters and leaves an
  // access point (not to be confused with the application-partition entry and exit
  // functions above), and the function that calls the ECU's service.
  bool isApWriteMacro() const { return hasRole(KV_ROLE_AP_WRITE_MACRO); }
  bool isApReadMacro() const { return hasRole(KV_ROLE_AP_READ_MACRO); }
  bool isApEntryMacro() const { return hasRole(KV_ROLE_AP_ENTRY_MACRO); }
  bool isApExitMacro() const { return hasRole(KV_ROLE_AP_EXIT_MACRO); }
  bool isEcuServiceFunction() const { return hasRole(KV_ROLE_ECU_SERVICE_FUNCTION); }
  void markAsApWriteMacro() { setRole(KV_ROLE_AP_WRITE_MACRO, true); }
  void markAsApReadMacro() { setRole(KV_ROLE_AP_READ_MACRO, true); }
  void markAsApEntryMacro() { setRole(KV_ROLE_AP_ENTRY_MACRO, true); }
  void markAsApExitMacro() { setRole(KV_ROLE_AP_EXIT_MACRO, true); }
  void markAsEcuServiceFunction() { setRole(KV_ROLE_ECU_SERVICE_FUNCTION, true); }

protected:
  KvCSymbol(int index, WmCXString symbolName, KV_DataType* type);

private:
  friend class KvCCStmTable;   // records which table lists the symbol
  friend class KvCSymbolQuery; // answers that table (getDestinationStt)

  WmCXString name;
  int debugIndex;
  KV_DataType* dataType;
  KV_Scaling* scaling = nullptr;
  // Kept inline: the database is reached for every use of the symbol.
  mutable KvCExprLocDB db;
  unsigned roles = 0;
  bool selected = true;
  tagKvESmbClassState extClassState = KV_SMBCLASS_STATE_NONE;
  KvCSmbClassId* externClass = nullptr;
  KvCCStmTable* stt = nullptr;
  // The table whose entries list the symbol, or null.
  KvCCStmTable* listedIn = nullptr;
};

#endif
