#include "HulCvTools/MultirateCodegenTools/KvCMcgFunctionServer.h"

#include "HulCvTools/Control/KvCCodeGenMessage.h"
#include "HulCvTools/Control/KvCInternalCheck.h"
#include "HulCvTools/ModelInterfaces/ICodeModel.h"
#include "HulCvTools/ModelInterfaces/ViewModel.h"
#include "HulCvTools/MultirateCodegenTools/KvCMcgBootSupport.h"
#include "HulCvTools/MultirateCodegenTools/KvCMcgTypeServer.h"
#include "platform/support/KvCCIdentifier.h"
#include "platform/support/KvCInternalSrcRef.h"
#include "platform/support/KvCNames.h"
#include "platform/support/KvCSrcRefServer.h"
#include "platform/support/WmCXString.h"

namespace {
constexpr const char* kErrorCode = "KvCMcgFunctionServer";

// Check numbers of the places where the model answers a null it must not.
constexpr int kNotBooted = 2400;       // a demand before phase two (or on an inactive server)
constexpr int kNoSignatureType = 2401; // a type or scaling of the signature cannot be had
constexpr int kNoFunctionClass = 2402; // the function class server answers no class
constexpr int kNoSymbol = 2403;        // the function symbol server or call inserter refuses
constexpr int kNoAccess = 2404;        // an access object cannot be allocated
constexpr int kNoCounterApi = 2405;    // no RTOS database, counter API or counter
constexpr int kNoActuals = 2406;       // the actual arguments cannot be made
constexpr int kBadParamCount = 2407;   // a negative parameter count
constexpr int kBootRoots = 100;        // phase two without its roots

constexpr unsigned int kSymbolFlags = 0x800000u;
constexpr unsigned int kParamFlag = 0x20u;

enum class TypeOf {
  Status,
  Task,
  EventMask,
  EventMaskRef,
  SymbolicName,
  AccessNameRef,
  Resource,
  Alarm,
  Tick,
  ISRDummy,
  StandardBase,
  Void
};
enum class ScalingOf { Standard, Adaptive, Default, DefaultVoid };

enum Mark : unsigned {
  kSideEffectFree = 1u << 0,
  kTerminateTask = 1u << 1,
  kRtosSchedule = 1u << 2,
  kSetAbsAlarm = 1u << 3,
  kSetRelAlarm = 1u << 4,
};

struct ParamSpec {
  const char* name;
  TypeOf type;
  ScalingOf scaling;
  unsigned int flags;
};

// The access objects of one call-inserter demand; deleted on every way out.
class Accesses {
public:
  Accesses() = default;
  Accesses(const Accesses&) = delete;
  Accesses& operator=(const Accesses&) = delete;
  ~Accesses() {
    for (int i = 0; i < count; ++i)
      delete items[i];
  }
  // False when the object cannot be allocated (after the internal check).
  bool add(bool isRead, bool isWritten, bool byReference, const KvCSrcRef* srcRef) {
    auto* access = new KV_ParamAccess(isRead, isWritten, byReference);
    if (!access) {
      KV_INTERNAL_CHECK_SRC(srcRef, kErrorCode, kNoAccess);
      return false;
    }
    items[count++] = access;
    return true;
  }
  KV_ParamAccess** get() { return items; }

private:
  KV_ParamAccess* items[2] = {nullptr, nullptr};
  int count = 0;
};
} // namespace

struct KvCMcgFunctionServer::ApiSpec {
  const char* name;
  bool inAcmeHeader; // else the OSEK header
  int nParams;
  ParamSpec params[3];
  unsigned int flagWithoutParams; // the one flag word passed for a function without parameters
  TypeOf returnType;
  ScalingOf returnScaling;
  unsigned marks;
};

struct KvCMcgFunctionServer::UserSpec {
  tagKvEFunctionTplKey key;
};

HULCV_DEFINE_HEAP_OPERATORS(KvCMcgFunctionServer)

bool KvCMcgFunctionServer::bootPhaseOne(KvCCodeViewData* codeViewData,
                                        KV_ICodeFactoryContainer* container,
                                        KvCMcgTypeServer* types, KvCRoDatabase* database,
                                        bool isActive) {
  codeView = codeViewData;
  factories = container;
  typeServer = types;
  rtosDatabase = database;
  active = isActive;
  KV_SymbolServer* symbols = container ? container->getSymbolServer() : nullptr;
  functionSymbolServer = symbols ? symbols->getFunction() : nullptr;
  KvCSmbClassServer* classes = container ? container->getSmbClassServer() : nullptr;
  fcnClassServer = classes ? classes->getFcnClassServer() : nullptr;
  baseTypeServer = container ? container->getBaseTypeServer() : nullptr;
  scaleServer = container ? container->getScalingServer() : nullptr;
  fileServer = container ? container->getFileServer() : nullptr;
  templateServer = codeViewData ? codeViewData->getTemplateServer() : nullptr;
  functionTemplateServer = templateServer ? templateServer->getFunctionTemplateServer() : nullptr;
  activateTask = terminateTask = triggerTask = setEvent = getEvent = clearEvent = waitEvent =
      nullptr;
  sendMessage = receiveMessage = lockMessage = unlockMessage = nullptr;
  disableAllInterrupts = enableAllInterrupts = suspendAllInterrupts = resumeAllInterrupts = nullptr;
  suspendOSInterrupts = resumeOSInterrupts = getResource = releaseResource = nullptr;
  enterCriticalSection = leaveCriticalSection = schedule = lastInitCounter = nullptr;
  setRelAlarm = setAbsAlarm = startISRDummy = nullptr;
  nEnterCSParams = nLeaveCSParams = nLockMessageParams = nUnlockMessageParams = 0;
  return true;
}

bool KvCMcgFunctionServer::bootPhaseTwo() {
  if (!active)
    return true;
  if (!KV_VERIFY(codeView && factories && fileServer, kErrorCode, kBootRoots))
    return false;
  KvCSmbClassServer* classes = codeView->getSmbClassServer();
  fcnClassServer = classes ? classes->getFcnClassServer() : nullptr;
  KV_SymbolServer* symbols = factories->getSymbolServer();
  functionSymbolServer = symbols ? symbols->getFunction() : nullptr;
  applicationServer = codeView->getApplServer();
  internalSrcRef = kvMcgInternalSrcRef(codeView, __FILE__, __LINE__, "rtos api function");
  acmeHeaderFile = kvMcgAcmeHeader(fileServer, internalSrcRef);
  return acmeHeaderFile != nullptr;
}

bool KvCMcgFunctionServer::isReady() const {
  const bool ready = codeView && factories && functionSymbolServer && fcnClassServer &&
                     typeServer && baseTypeServer && scaleServer && functionTemplateServer &&
                     applicationServer && rtosDatabase && acmeHeaderFile;
  return KV_VERIFY(ready, kErrorCode, kNotBooted);
}

bool KvCMcgFunctionServer::haveOsekHeader(KvCIcFile*& header, const KvCSrcRef* srcRef) const {
  header = nullptr;
  return rtosDatabase && rtosDatabase->demandOsekHFile(header, srcRef) && header;
}

KvCIcFileId* KvCMcgFunctionServer::demandOsekHFileID(const KvCSrcRef* srcRef) {
  KvCIcFile* header = nullptr;
  return haveOsekHeader(header, srcRef) ? header->getFileId() : nullptr;
}

// --- the fixed API catalogue

namespace {
KV_DataType* typeOf(TypeOf which, KvCMcgTypeServer* types, KV_BaseTypeServer* bases,
                    const KvCSrcRef* srcRef) {
  switch (which) {
  case TypeOf::Status:
    return types->demandStatusType(srcRef);
  case TypeOf::Task:
    return types->demandTaskType(srcRef);
  case TypeOf::EventMask:
    return types->demandEventMaskType(srcRef);
  case TypeOf::EventMaskRef:
    return types->demandEventMaskRefType(srcRef);
  case TypeOf::SymbolicName:
    return types->demandSymbolicNameType(srcRef);
  case TypeOf::AccessNameRef:
    return types->demandAccessNameRefType(srcRef);
  case TypeOf::Resource:
    return types->demandResourceType(srcRef);
  case TypeOf::Alarm:
    return types->demandAlarmType(srcRef);
  case TypeOf::Tick:
    return types->demandTickType(srcRef);
  case TypeOf::ISRDummy:
    return types->demandISRDummyType(srcRef);
  case TypeOf::StandardBase:
    return types->getStandardBaseType();
  case TypeOf::Void:
    return bases->getVoid();
  }
  return nullptr;
}

KV_Scaling* scalingOf(ScalingOf which, KvCMcgTypeServer* types, KV_ScaleServer* scales) {
  switch (which) {
  case ScalingOf::Standard:
    return types->getStandardScaling();
  case ScalingOf::Adaptive:
    return scales->getAdaptiveScaling();
  case ScalingOf::Default:
    return scales->getDefaultScaling();
  case ScalingOf::DefaultVoid:
    return scales->getDefaultVoidScaling();
  }
  return nullptr;
}

void applyMarks(KvCParamSymbol* symbol, unsigned marks) {
  if (marks & kSideEffectFree)
    symbol->markAsSideEffectFreeFunction();
  if (marks & kTerminateTask)
    symbol->markAsTerminateTaskSymbol();
  if (marks & kRtosSchedule)
    symbol->markAsRtosScheduleFcn();
  if (marks & kSetAbsAlarm)
    symbol->markAsSetAbsAlarmFunction();
  if (marks & kSetRelAlarm)
    symbol->markAsSetRelAlarmFunction();
}

constexpr ParamSpec kNone{nullptr, TypeOf::Void, ScalingOf::Standard, 0};
} // namespace

KvCParamSymbol* KvCMcgFunctionServer::demandApi(KvCParamSymbol*& cache, const ApiSpec& spec,
                                                const KvCSrcRef* srcRef) {
  if (cache)
    return cache;
  if (!isReady())
    return nullptr;
  leda::array<KV_DataType*> types;
  leda::array<KV_Scaling*> scalings;
  leda::array<WmCXString> names;
  KvCIcFile* file = acmeHeaderFile;
  if (!spec.inAcmeHeader && !haveOsekHeader(file, srcRef))
    return nullptr;
  types.resize(spec.nParams);
  scalings.resize(spec.nParams);
  names.resize(spec.nParams);
  unsigned int flags[3] = {spec.flagWithoutParams, 0u, 0u};
  for (int i = 0; i < spec.nParams; ++i) {
    const ParamSpec& param = spec.params[i];
    types[i] = typeOf(param.type, typeServer, baseTypeServer, srcRef);
    scalings[i] = scalingOf(param.scaling, typeServer, scaleServer);
    names[i] = param.name;
    flags[i] = param.flags;
    if (!types[i] || !scalings[i]) {
      KV_INTERNAL_CHECK_SRC(srcRef, kErrorCode, kNoSignatureType);
      return nullptr;
    }
  }
  KvCFcnClassId* fcnClass = fcnClassServer->demandFcnClass(srcRef);
  if (!fcnClass) {
    KV_INTERNAL_CHECK_SRC(srcRef, kErrorCode, kNoFunctionClass);
    return nullptr;
  }
  KV_Scaling* returnScaling = scalingOf(spec.returnScaling, typeServer, scaleServer);
  KV_DataType* returnType = typeOf(spec.returnType, typeServer, baseTypeServer, srcRef);
  if (!returnType || !returnScaling) {
    KV_INTERNAL_CHECK_SRC(srcRef, kErrorCode, kNoSignatureType);
    return nullptr;
  }
  bool newlyCreated = false;
  KvCParamSymbol* symbol = functionSymbolServer->demand(
      file->getStt(), spec.name, kSymbolFlags, returnType, returnScaling, types, scalings, names,
      flags, fcnClass, &newlyCreated, srcRef);
  if (!symbol) {
    KV_INTERNAL_CHECK_SRC(srcRef, kErrorCode, kNoSymbol);
    return nullptr;
  }
  cache = symbol;
  applyMarks(symbol, spec.marks);
  return symbol;
}

KvCParamSymbol* KvCMcgFunctionServer::demandOsekApiActivateTask(const KvCSrcRef* srcRef) {
  static const ApiSpec spec{"ActivateTask",
                            false,
                            1,
                            {{"taskId", TypeOf::Task, ScalingOf::Standard, kParamFlag}},
                            0,
                            TypeOf::Status,
                            ScalingOf::Standard,
                            kSideEffectFree};
  return demandApi(activateTask, spec, srcRef);
}

KvCParamSymbol* KvCMcgFunctionServer::demandOsekApiTerminateTask(const KvCSrcRef* srcRef) {
  static const ApiSpec spec{
      "TerminateTask",     false,         0, {kNone}, kParamFlag, TypeOf::Status,
      ScalingOf::Standard, kTerminateTask};
  return demandApi(terminateTask, spec, srcRef);
}

KvCParamSymbol* KvCMcgFunctionServer::demandOsekApiGetEvent(const KvCSrcRef* srcRef) {
  static const ApiSpec spec{"GetEvent",
                            false,
                            2,
                            {{"taskId", TypeOf::Task, ScalingOf::Standard, kParamFlag},
                             {"maskRef", TypeOf::EventMaskRef, ScalingOf::Standard, 0}},
                            0,
                            TypeOf::Status,
                            ScalingOf::Standard,
                            kSideEffectFree};
  return demandApi(getEvent, spec, srcRef);
}

KvCParamSymbol* KvCMcgFunctionServer::demandOsekApiSetEvent(const KvCSrcRef* srcRef) {
  static const ApiSpec spec{"SetEvent",
                            false,
                            2,
                            {{"taskId", TypeOf::Task, ScalingOf::Standard, kParamFlag},
                             {"mask", TypeOf::EventMask, ScalingOf::Standard, 0}},
                            0,
                            TypeOf::Status,
                            ScalingOf::Standard,
                            kSideEffectFree};
  return demandApi(setEvent, spec, srcRef);
}

KvCParamSymbol* KvCMcgFunctionServer::demandOsekApiClearEvent(const KvCSrcRef* srcRef) {
  static const ApiSpec spec{"ClearEvent",
                            false,
                            1,
                            {{"mask", TypeOf::EventMask, ScalingOf::Standard, 0}},
                            0,
                            TypeOf::Status,
                            ScalingOf::Standard,
                            kSideEffectFree};
  return demandApi(clearEvent, spec, srcRef);
}

KvCParamSymbol* KvCMcgFunctionServer::demandOsekApiWaitEvent(const KvCSrcRef* srcRef) {
  static const ApiSpec spec{"WaitEvent",
                            false,
                            1,
                            {{"mask", TypeOf::EventMask, ScalingOf::Standard, kParamFlag}},
                            0,
                            TypeOf::Status,
                            ScalingOf::Standard,
                            kSideEffectFree};
  return demandApi(waitEvent, spec, srcRef);
}

KvCParamSymbol* KvCMcgFunctionServer::demandOsekApiSendMessage(const KvCSrcRef* srcRef) {
  static const ApiSpec spec{"SendMessage",
                            false,
                            2,
                            {{"message", TypeOf::SymbolicName, ScalingOf::Standard, kParamFlag},
                             {"dataRef", TypeOf::AccessNameRef, ScalingOf::Standard, 0}},
                            0,
                            TypeOf::Status,
                            ScalingOf::Standard,
                            kSideEffectFree};
  return demandApi(sendMessage, spec, srcRef);
}

KvCParamSymbol* KvCMcgFunctionServer::demandOsekApiReceiveMessage(const KvCSrcRef* srcRef) {
  static const ApiSpec spec{"ReceiveMessage",
                            false,
                            2,
                            {{"message", TypeOf::SymbolicName, ScalingOf::Standard, kParamFlag},
                             {"dataRef", TypeOf::AccessNameRef, ScalingOf::Standard, 0}},
                            0,
                            TypeOf::Status,
                            ScalingOf::Standard,
                            kSideEffectFree};
  return demandApi(receiveMessage, spec, srcRef);
}

KvCParamSymbol* KvCMcgFunctionServer::demandOsekApiGetResource(const KvCSrcRef* srcRef) {
  static const ApiSpec spec{"GetResource",
                            false,
                            1,
                            {{"resId", TypeOf::Resource, ScalingOf::Standard, 0}},
                            0,
                            TypeOf::Status,
                            ScalingOf::Standard,
                            kSideEffectFree};
  return demandApi(getResource, spec, srcRef);
}

KvCParamSymbol* KvCMcgFunctionServer::demandOsekApiReleaseResource(const KvCSrcRef* srcRef) {
  static const ApiSpec spec{"ReleaseResource",
                            false,
                            1,
                            {{"resId", TypeOf::Resource, ScalingOf::Standard, 0}},
                            0,
                            TypeOf::Status,
                            ScalingOf::Standard,
                            kSideEffectFree};
  return demandApi(releaseResource, spec, srcRef);
}

// The interrupt functions: no parameters, void with the default void scaling, SEF.
#define HULCV_MCG_VOID_API(Operation, Name, cache)                                                 \
  KvCParamSymbol* KvCMcgFunctionServer::Operation(const KvCSrcRef* srcRef) {                       \
    static const ApiSpec spec{                                                                     \
        Name, false, 0, {kNone}, 0, TypeOf::Void, ScalingOf::DefaultVoid, kSideEffectFree};        \
    return demandApi(cache, spec, srcRef);                                                         \
  }

HULCV_MCG_VOID_API(demandOsekApiDisableAllInterrupts, "DisableAllInterrupts", disableAllInterrupts)
HULCV_MCG_VOID_API(demandOsekApiEnableAllInterrupts, "EnableAllInterrupts", enableAllInterrupts)
HULCV_MCG_VOID_API(demandOsekApiSuspendAllInterrupts, "SuspendAllInterrupts", suspendAllInterrupts)
HULCV_MCG_VOID_API(demandOsekApiResumeAllInterrupts, "ResumeAllInterrupts", resumeAllInterrupts)
HULCV_MCG_VOID_API(demandOsekApiSuspendOSInterrupts, "SuspendOSInterrupts", suspendOSInterrupts)
HULCV_MCG_VOID_API(demandOsekApiResumeOSInterrupts, "ResumeOSInterrupts", resumeOSInterrupts)
#undef HULCV_MCG_VOID_API

KvCParamSymbol* KvCMcgFunctionServer::demandOsekApiSetAbsAlarm(const KvCSrcRef* srcRef) {
  static const ApiSpec spec{"SetAbsAlarm",
                            false,
                            3,
                            {{"alarmId", TypeOf::Alarm, ScalingOf::Adaptive, kParamFlag},
                             {"start", TypeOf::Tick, ScalingOf::Adaptive, kParamFlag},
                             {"cycle", TypeOf::Tick, ScalingOf::Adaptive, kParamFlag}},
                            0,
                            TypeOf::Status,
                            ScalingOf::Standard,
                            kSideEffectFree | kSetAbsAlarm};
  return demandApi(setAbsAlarm, spec, srcRef);
}

KvCParamSymbol* KvCMcgFunctionServer::demandOsekApiSetRelAlarm(const KvCSrcRef* srcRef) {
  static const ApiSpec spec{"SetRelAlarm",
                            false,
                            3,
                            {{"alarmId", TypeOf::Alarm, ScalingOf::Adaptive, kParamFlag},
                             {"increment", TypeOf::Tick, ScalingOf::Adaptive, kParamFlag},
                             {"cycle", TypeOf::Tick, ScalingOf::Adaptive, kParamFlag}},
                            0,
                            TypeOf::Status,
                            ScalingOf::Standard,
                            kSideEffectFree | kSetRelAlarm};
  return demandApi(setRelAlarm, spec, srcRef);
}

KvCParamSymbol* KvCMcgFunctionServer::demandOsekApiSchedule(const KvCSrcRef* srcRef) {
  static const ApiSpec spec{
      "Schedule", false, 0, {kNone}, 0, TypeOf::Void, ScalingOf::DefaultVoid, kRtosSchedule};
  return demandApi(schedule, spec, srcRef);
}

KvCParamSymbol* KvCMcgFunctionServer::demandStartISRDummy(const KvCSrcRef* srcRef) {
  static const ApiSpec spec{"StartISRDummy",
                            true,
                            1,
                            {{"isrId", TypeOf::ISRDummy, ScalingOf::Standard, kParamFlag}},
                            0,
                            TypeOf::StandardBase,
                            ScalingOf::Standard,
                            kSideEffectFree};
  return demandApi(startISRDummy, spec, srcRef);
}

// --- user-defined functions

WmCXString KvCMcgFunctionServer::getTemplateKeyAsString(tagKvEFunctionTplKey key) {
  switch (static_cast<int>(key)) {
  case KV_FCN_TPL_ENTER_CRITICAL_SECTION:
    return "KvEnterCriticalSection";
  case KV_FCN_TPL_INIT_ALARMS:
    return "KvInitAlarms";
  case KV_FCN_TPL_LEAVE_CRITICAL_SECTION:
    return "KvLeaveCriticalSection";
  case KV_FCN_TPL_LOCK_MESSAGE:
    return "KvLockMessage";
  case KV_FCN_TPL_TRIGGER_TASK:
    return "KvTriggerTask";
  case KV_FCN_TPL_UNLOCK_MESSAGE:
    return "KvUnlockMessage";
  default:
    KV_INTERNAL_CHECK(kErrorCode, 2395);
    return {};
  }
}

bool KvCMcgFunctionServer::getUserFunctionSettings(tagKvEFunctionTplKey key,
                                                   WmCXString& functionName,
                                                   KvCFcnClassId*& fcnClass, KvCIcFileId*& codeFile,
                                                   const KvCSrcRef* srcRef) {
  functionName = WmCXString();
  fcnClass = nullptr;
  codeFile = nullptr;
  bool result = true;
  KvCFunctionTemplate* functionTemplate = functionTemplateServer->demandTemplate(key);
  const KvCFunctionTemplateDescr* description =
      functionTemplate ? functionTemplate->getUserDefault() : nullptr;
  if (!description) {
    const WmCXString keyText = getTemplateKeyAsString(key);
    KvCCodeGenMessage::msg30243(srcRef, keyText.c_str());
    return false;
  }
  fcnClass = description->getFunctionClass();
  KvCSmbClass* smbClass = fcnClass ? fcnClass->getFcnClass() : nullptr;
  if (smbClass && smbClass->getFile()) {
    codeFile = smbClass->getFile();
  } else if (description->getCodeFile().isEmpty()) {
    // Neither the class nor the template names a code file: nothing to put the function in.
    KV_INTERNAL_CHECK(kErrorCode, 2339);
    result = false;
  } else {
    KvCIcSubAppl* userSubAppl = applicationServer->demandUserSubAppl(srcRef);
    if (!userSubAppl ||
        !applicationServer->demandCgOwnedCFile(userSubAppl, description->getCodeFile(), srcRef,
                                               codeFile) ||
        !codeFile) {
      codeFile = nullptr;
      result = false;
    } else {
      // The template's files hold user code: the code generator must not write them, even
      // when the user asked for them to be emitted (reported once).
      const WmCXString keyText = getTemplateKeyAsString(key);
      KvCIcFile* file = codeFile->getFile();
      bool reported = false;
      if (file->isMarkedAsForceEmit()) {
        KvCCodeGenMessage::msg32300(file->getSourceRef(), keyText.c_str());
        reported = true;
      }
      file->markAsDoNotEmitCauseSpecialFunctionTempl();
      if (KvCIcFileId* complementary = file->getComplementaryFile()) {
        KvCIcFile* other = complementary->getFile();
        if (!reported && other->isMarkedAsForceEmit())
          KvCCodeGenMessage::msg32300(other->getSourceRef(), keyText.c_str());
        other->markAsDoNotEmitCauseSpecialFunctionTempl();
      }
    }
  }
  functionName = description->getFunctionName();
  if (functionName.isEmpty())
    return false;
  return result;
}

KvCParamSymbol* KvCMcgFunctionServer::demandInCodeFile(
    KvCIcFileId* codeFile, const WmCXString& name, leda::array<KV_DataType*>& types,
    leda::array<KV_Scaling*>& scalings, leda::array<WmCXString>& names, unsigned int* flags,
    KvCFcnClassId* fcnClass, const KvCSrcRef* srcRef, int nParams) {
  KV_DataType* voidType = baseTypeServer->getVoid();
  KV_Scaling* voidScaling = scaleServer->getDefaultVoidScaling();
  if (!voidType || !voidScaling) {
    KV_INTERNAL_CHECK_SRC(srcRef, kErrorCode, kNoSignatureType);
    return nullptr;
  }
  KvCCStmTable* table = codeFile->getFile()->getStt();
  bool newlyCreated = false;
  KvCParamSymbol* symbol =
      functionSymbolServer->demand(table, name, kSymbolFlags, voidType, voidScaling, types,
                                   scalings, names, flags, fcnClass, &newlyCreated, srcRef);
  if (symbol)
    return symbol;
  // The file has the function already, made earlier in the run with another parameter
  // count: the same conflict as a count other than the cached one.
  KvCParamSymbol* existing = functionSymbolServer->find(table, name);
  if (existing && existing->getNumberOfFormalParams() != nParams) {
    KvCCodeGenMessage::msg30179(srcRef, existing->getName().c_str());
    return nullptr;
  }
  KV_INTERNAL_CHECK_SRC(srcRef, kErrorCode, kNoSymbol);
  return nullptr;
}

KvCParamSymbol* KvCMcgFunctionServer::demandUserDefinedTriggerTask(const KvCSrcRef* srcRef) {
  if (triggerTask)
    return triggerTask;
  if (!isReady())
    return nullptr;
  leda::array<KV_DataType*> types(1);
  leda::array<KV_Scaling*> scalings(1);
  leda::array<WmCXString> names(1);
  unsigned int flags[1] = {kParamFlag};
  types[0] = typeServer->getStandardBaseType();
  scalings[0] = typeServer->getStandardScaling();
  names[0] = "TaskID";
  if (!types[0] || !scalings[0]) {
    KV_INTERNAL_CHECK_SRC(srcRef, kErrorCode, kNoSignatureType);
    return nullptr;
  }
  WmCXString name;
  KvCFcnClassId* fcnClass = nullptr;
  KvCIcFileId* codeFile = nullptr;
  if (!getUserFunctionSettings(KV_FCN_TPL_TRIGGER_TASK, name, fcnClass, codeFile, srcRef))
    return nullptr;
  KvCParamSymbol* symbol =
      demandInCodeFile(codeFile, name, types, scalings, names, flags, fcnClass, srcRef, 1);
  if (!symbol)
    return nullptr;
  triggerTask = symbol;
  symbol->markAsSideEffectFreeFunction();
  return symbol;
}

KvCParamSymbol* KvCMcgFunctionServer::demandUserDefined(KvCParamSymbol*& cache, int& count,
                                                        const UserSpec& spec, int nParams,
                                                        const KvCSrcRef* srcRef) {
  if (!cache) {
    if (nParams < 0) {
      KV_INTERNAL_CHECK_SRC(srcRef, kErrorCode, kBadParamCount);
      return nullptr;
    }
    if (!isReady())
      return nullptr;
    leda::array<KV_DataType*> types(nParams);
    leda::array<KV_Scaling*> scalings(nParams);
    leda::array<WmCXString> names(nParams);
    leda::array<unsigned int> flags(nParams + 1); // one word also without parameters
    KV_DataType* base = typeServer->getStandardBaseType();
    KV_Scaling* standard = typeServer->getStandardScaling();
    if (!base || !standard) {
      KV_INTERNAL_CHECK_SRC(srcRef, kErrorCode, kNoSignatureType);
      return nullptr;
    }
    for (int i = 0; i < nParams; ++i) {
      types[i] = base;
      scalings[i] = standard;
      names[i] = "Param" + WmCXString(i, false, false);
    }
    WmCXString name;
    KvCFcnClassId* fcnClass = nullptr;
    KvCIcFileId* codeFile = nullptr;
    if (!getUserFunctionSettings(spec.key, name, fcnClass, codeFile, srcRef))
      return nullptr;
    KvCParamSymbol* symbol = demandInCodeFile(codeFile, name, types, scalings, names, &flags[0],
                                              fcnClass, srcRef, nParams);
    if (!symbol)
      return nullptr;
    // The count is fixed only by a demand that made (or found) the function.
    count = nParams;
    cache = symbol;
    symbol->markAsSideEffectFreeFunction();
  }
  if (nParams != count) {
    KvCCodeGenMessage::msg30179(srcRef, cache->getName().c_str());
    return nullptr;
  }
  return cache;
}

KvCParamSymbol*
KvCMcgFunctionServer::demandUserDefinedEnterCriticalSection(int nParams, const KvCSrcRef* srcRef) {
  static const UserSpec spec{KV_FCN_TPL_ENTER_CRITICAL_SECTION};
  return demandUserDefined(enterCriticalSection, nEnterCSParams, spec, nParams, srcRef);
}

KvCParamSymbol*
KvCMcgFunctionServer::demandUserDefinedLeaveCriticalSection(int nParams, const KvCSrcRef* srcRef) {
  static const UserSpec spec{KV_FCN_TPL_LEAVE_CRITICAL_SECTION};
  return demandUserDefined(leaveCriticalSection, nLeaveCSParams, spec, nParams, srcRef);
}

KvCParamSymbol* KvCMcgFunctionServer::demandUserDefinedLockMessage(int nParams,
                                                                   const KvCSrcRef* srcRef) {
  static const UserSpec spec{KV_FCN_TPL_LOCK_MESSAGE};
  return demandUserDefined(lockMessage, nLockMessageParams, spec, nParams, srcRef);
}

KvCParamSymbol* KvCMcgFunctionServer::demandUserDefinedUnlockMessage(int nParams,
                                                                     const KvCSrcRef* srcRef) {
  static const UserSpec spec{KV_FCN_TPL_UNLOCK_MESSAGE};
  return demandUserDefined(unlockMessage, nUnlockMessageParams, spec, nParams, srcRef);
}

// --- functions made through the call inserter

KvCParamSymbol* KvCMcgFunctionServer::demandOsekApiCancelAlarm(const KvCSrcRef* srcRef) {
  if (!isReady())
    return nullptr;
  KvCIcFile* header = nullptr;
  if (!haveOsekHeader(header, srcRef))
    return nullptr;
  KV_FunctionCallInserter inserter(factories);
  Accesses accesses;
  if (!accesses.add(true, false, false, srcRef))
    return nullptr;
  KV_DataType* types[1] = {typeServer->demandCounterIDType()};
  KV_Scaling* scalings[1] = {scaleServer->getDefaultScaling()};
  KV_DataType* status = typeServer->demandStatusType(srcRef);
  if (!types[0] || !status) {
    KV_INTERNAL_CHECK_SRC(srcRef, kErrorCode, kNoSignatureType);
    return nullptr;
  }
  KvCParamSymbol* symbol = inserter.demandFunctionSymbol(
      "CancelAlarm", status, scaleServer->getDefaultScaling(), 1, accesses.get(), types, scalings,
      header->getFileId(), srcRef, false);
  if (!symbol) {
    KV_INTERNAL_CHECK_SRC(srcRef, kErrorCode, kNoSymbol);
    return nullptr;
  }
  symbol->markAsCancelAlarmFunction();
  return symbol;
}

WmCXString KvCMcgFunctionServer::counterFunctionName(const WmCXString& nameForm,
                                                     const KvCRoCounter* counter,
                                                     const KvCSrcRef* srcRef) {
  KvCCIdentifier identifier;
  identifier = nameForm;
  identifier.setSourceRef(srcRef);
  KvCCIdentifier counterName;
  counterName = counter->getName();
  KvCNames::replaceMultirateCtrName(identifier, counterName);
  KvCNames::createNameFromForm(identifier, nullptr, 0, 0, false, WmCXString());
  return identifier.getCookedName(0);
}

KvCParamSymbol* KvCMcgFunctionServer::demandCounterFcn(CounterFcn which, const KvCSrcRef* srcRef,
                                                       KvCRoCounter* counter,
                                                       KvCUnparamSymbol* resultVariable,
                                                       leda::array<KV_ExprLocation*>& actuals) {
  if (!isReady())
    return nullptr;
  const bool init = which == CounterFcn::InitCounter || which == CounterFcn::InitCounterFromISR;
  KvCRoDatabase* database = codeView->getRtosDatabase();
  KvCRoRTOSInfo* info = database ? database->demandRTOSInfo() : nullptr;
  KvCRoCounterAPI* api = info ? info->getCounterAPI() : nullptr;
  if (!api || !counter || (!init && !resultVariable)) {
    KV_INTERNAL_CHECK_SRC(srcRef, kErrorCode, kNoCounterApi);
    return nullptr;
  }
  // The scaling of tick values read from the counter: ticks of the counter's duration.
  KV_Scaling* tickScaling = scaleServer->getDefaultScaling();
  if (!init && counter->getTickDuration() > 0.0)
    tickScaling = scaleServer->getScaling(counter->getTickDuration(), 0.0, srcRef);
  KvCIcFile* header = nullptr;
  if (!haveOsekHeader(header, srcRef))
    return nullptr;
  const KvCRoCounterAPIFcn* fcn = nullptr;
  void (*report)(const KvCSrcRef*, const char*) = nullptr;
  switch (which) {
  case CounterFcn::InitCounter:
    fcn = api->getInitCounterFcn();
    report = &KvCCodeGenMessage::msg21274;
    break;
  case CounterFcn::InitCounterFromISR:
    fcn = api->getInitCounterFromISRFcn();
    report = &KvCCodeGenMessage::msg21274;
    break;
  case CounterFcn::GetCounterValue:
    fcn = api->getGetCounterValueFcn();
    report = &KvCCodeGenMessage::msg21272;
    break;
  case CounterFcn::GetCounterValueFromISR:
    fcn = api->getGetCounterValueFcn();
    report = &KvCCodeGenMessage::msg21273;
    break;
  }
  const int kind = fcn ? fcn->getFunctionKind() : 0;
  const bool known = init ? (kind == 1 || kind == 2) : (kind == 6 || kind == 7);
  if (!fcn || !known) {
    report(srcRef, info->getOSName().c_str());
    return nullptr;
  }
  // The signature: kinds 1 and 6 take the counter first.
  Accesses accesses;
  KV_DataType* types[2] = {nullptr, nullptr};
  KV_Scaling* scalings[2] = {nullptr, nullptr};
  int n = 0;
  if (kind == 1 || kind == 6) {
    if (!accesses.add(true, false, false, srcRef))
      return nullptr;
    types[n] = typeServer->demandCounterIDType();
    scalings[n++] = scaleServer->getDefaultScaling();
  }
  if (init) {
    if (!accesses.add(true, false, false, srcRef))
      return nullptr;
    types[n] = typeServer->demandTickType(srcRef);
    scalings[n++] = which == CounterFcn::InitCounter ? scaleServer->getAdaptiveScaling()
                                                     : scaleServer->getDefaultScaling();
  } else if (kind == 6) {
    if (!accesses.add(true, true, true, srcRef))
      return nullptr;
    KV_DataType* tick = typeServer->demandTickType(srcRef);
    KV_PointerTypeServer* pointers = factories->getDataTypeServer()->getPointerServer();
    types[n] = tick && pointers ? pointers->getScalarPointer(tick, srcRef) : nullptr;
    scalings[n++] = tickScaling;
  }
  KV_DataType* returnType =
      kind == 7 ? typeServer->demandTickType(srcRef) : typeServer->demandStatusType(srcRef);
  KV_Scaling* returnScaling = init ? scaleServer->getDefaultScaling() : tickScaling;
  bool complete = returnType && returnScaling;
  for (int i = 0; i < n; ++i)
    complete = complete && types[i] && scalings[i];
  if (!complete) {
    KV_INTERNAL_CHECK_SRC(srcRef, kErrorCode, kNoSignatureType);
    return nullptr;
  }
  const WmCXString name = counterFunctionName(fcn->getFunctionName(), counter, srcRef);
  KV_FunctionCallInserter inserter(factories);
  KvCParamSymbol* symbol =
      inserter.demandFunctionSymbol(name, returnType, returnScaling, n, accesses.get(), types,
                                    scalings, header->getFileId(), srcRef, false);
  if (!symbol) {
    KV_INTERNAL_CHECK_SRC(srcRef, kErrorCode, kNoSymbol);
    return nullptr;
  }
  if (init)
    lastInitCounter = symbol;
  // The actual arguments, made once the function is there: the counter's identifier, then
  // the initial value 0 or the reference to the result variable.
  leda::array<KV_ExprLocation*> arguments(n);
  KV_ExprLocFactory* locations = factories->getExprLocFactory();
  int next = 0;
  if (kind == 1 || kind == 6)
    arguments[next++] = locations->createFromName(counter->getName(), true, srcRef);
  if (init) {
    arguments[next++] = locations->createFromValue(0, srcRef);
  } else if (kind == 6) {
    KV_QSOFactories* qsoFactories = factories->getQSOFactories();
    KV_Operation* ref = qsoFactories->getRefFactory()->createRef(resultVariable, srcRef);
    arguments[next++] = ref ? locations->createFromOperation(ref, srcRef) : nullptr;
  }
  for (int i = 0; i < n; ++i) {
    if (!arguments[i]) {
      KV_INTERNAL_CHECK_SRC(srcRef, kErrorCode, kNoActuals);
      return nullptr;
    }
  }
  actuals = arguments;
  return symbol;
}

KvCParamSymbol*
KvCMcgFunctionServer::demandExtOsekApiInitCounter(const KvCSrcRef* srcRef, KvCRoCounter* counter,
                                                  leda::array<KV_ExprLocation*>& actuals) {
  return demandCounterFcn(CounterFcn::InitCounter, srcRef, counter, nullptr, actuals);
}

KvCParamSymbol* KvCMcgFunctionServer::demandExtOsekApiInitCounterFromISR(
    const KvCSrcRef* srcRef, KvCRoCounter* counter, leda::array<KV_ExprLocation*>& actuals) {
  return demandCounterFcn(CounterFcn::InitCounterFromISR, srcRef, counter, nullptr, actuals);
}

KvCParamSymbol* KvCMcgFunctionServer::demandExtOsekApiGetCounterValue(
    const KvCSrcRef* srcRef, KvCRoCounter* counter, KvCUnparamSymbol* resultVariable,
    leda::array<KV_ExprLocation*>& actuals) {
  return demandCounterFcn(CounterFcn::GetCounterValue, srcRef, counter, resultVariable, actuals);
}

KvCParamSymbol* KvCMcgFunctionServer::demandExtOsekApiGetCounterValueFromISR(
    const KvCSrcRef* srcRef, KvCRoCounter* counter, KvCUnparamSymbol* resultVariable,
    leda::array<KV_ExprLocation*>& actuals) {
  return demandCounterFcn(CounterFcn::GetCounterValueFromISR, srcRef, counter, resultVariable,
                          actuals);
}
