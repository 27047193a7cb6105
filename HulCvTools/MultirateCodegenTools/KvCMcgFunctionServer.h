// KvCMcgFunctionServer: makes, on demand and once per run, the function symbols through
// which generated multirate code talks to the RTOS: the OSEK API functions (declared in
// the OSEK header file), StartISRDummy (in the Acme header file), the counter functions
// the RTOS information names and CancelAlarm (through the ICode's call inserter), and the
// user-defined functions of the user's function templates (KvTriggerTask,
// KvEnterCriticalSection, KvLeaveCriticalSection, KvLockMessage, KvUnlockMessage), which
// go into the template's code file. Every type of a signature comes from the RTOS type
// server, which makes it on first demand.
//
// Ownership: the server owns nothing it points to; the ICode owns every symbol, file,
// class and server, the view the RTOS database. Copies share everything (member-wise).
//
// Caches: each fixed API function and each user-defined function is cached once its
// demand has succeeded; later demands answer the cached symbol without a model call. A
// failed demand caches nothing, so a later demand tries again. The counter functions and
// CancelAlarm are not cached (the call inserter finds them again); the last counter
// initialisation function is kept. The first successful demand of a user-defined
// function with a parameter count fixes that count for the run.
//
// Life: bootPhaseOne stores the roots and clears the caches and counts; bootPhaseTwo (a
// no-op when inactive) takes the application server, the internal source reference and
// the Acme header file. Demands need phase two to have run and the type server booted.
//
// Failures: without the OSEK header file an OSEK demand answers null and reports nothing
// (the header may come later). User-level problems are messages: 30243 (the user has not
// defined the template), 30179 (a parameter count other than the fixed one), 32300 (a
// force-emit file referenced by a template; at most once per demand), 21272/21273/21274
// (the RTOS offers no such counter function, or one of an unknown kind). A null the model
// answers where it must not (a type the type server cannot make, no function class, a
// symbol the function symbol server refuses, an access object that cannot be allocated,
// a server that did not run phase two) raises the internal check "KvCMcgFunctionServer"
// with the code of the place and answers null.
#ifndef HULCVTOOLS_MULTIRATECODEGENTOOLS_KVCMCGFUNCTIONSERVER_H
#define HULCVTOOLS_MULTIRATECODEGENTOOLS_KVCMCGFUNCTIONSERVER_H

#include "HulCvTools/Control/KvCHeapObject.h"
#include "HulCvTools/HulCvToolsExport.h"
#include "HulCvTools/ModelInterfaces/ICodeFwd.h"
#include "HulCvTools/ModelInterfaces/ViewFwd.h"
#include "platform/leda/array.h"

class KvCInternalSrcRef;
class KvCMcgTypeServer;
class KvCSrcRef;
class WmCXString;

class HULCV_API KvCMcgFunctionServer {
public:
  HULCV_HEAP_OPERATORS

  KvCMcgFunctionServer() = default;

  // Stores the roots and takes the servers of phase one; clears the caches and the
  // parameter counts. Always true.
  bool bootPhaseOne(KvCCodeViewData* codeView, KV_ICodeFactoryContainer* factories,
                    KvCMcgTypeServer* typeServer, KvCRoDatabase* rtosDatabase, bool active);
  // True when inactive, or when the Acme file pair could be demanded.
  bool bootPhaseTwo();
  // Does nothing; true.
  bool shutdown() { return true; }

  // The cached symbol, or null while its demand has not succeeded (no creation).
  KvCParamSymbol* getOsekApiActivateTask() const { return activateTask; }
  KvCParamSymbol* getOsekApiSetEvent() const { return setEvent; }
  KvCParamSymbol* getUserDefinedTriggerTask() const { return triggerTask; }
  // The parameter count fixed by the first successful demand (0 before).
  int getNrOfActualUserDefinedEnterCSParams() const { return nEnterCSParams; }
  int getNrOfActualUserDefinedLeaveCSParams() const { return nLeaveCSParams; }
  int getNrOfActualUserDefinedLockMessageParams() const { return nLockMessageParams; }
  int getNrOfActualUserDefinedUnlockMessageParams() const { return nUnlockMessageParams; }

  // The file id of the OSEK header file, or null when the RTOS database cannot give it.
  KvCIcFileId* demandOsekHFileID(const KvCSrcRef* srcRef);

  // The OSEK API functions: the symbol, or null when the OSEK header file cannot be had
  // (or the model fails, see above). `srcRef` goes to every model call of the demand.
  KvCParamSymbol* demandOsekApiActivateTask(const KvCSrcRef* srcRef);
  KvCParamSymbol* demandOsekApiTerminateTask(const KvCSrcRef* srcRef);
  KvCParamSymbol* demandOsekApiGetEvent(const KvCSrcRef* srcRef);
  KvCParamSymbol* demandOsekApiSetEvent(const KvCSrcRef* srcRef);
  KvCParamSymbol* demandOsekApiClearEvent(const KvCSrcRef* srcRef);
  KvCParamSymbol* demandOsekApiWaitEvent(const KvCSrcRef* srcRef);
  KvCParamSymbol* demandOsekApiSendMessage(const KvCSrcRef* srcRef);
  KvCParamSymbol* demandOsekApiReceiveMessage(const KvCSrcRef* srcRef);
  KvCParamSymbol* demandOsekApiGetResource(const KvCSrcRef* srcRef);
  KvCParamSymbol* demandOsekApiReleaseResource(const KvCSrcRef* srcRef);
  KvCParamSymbol* demandOsekApiDisableAllInterrupts(const KvCSrcRef* srcRef);
  KvCParamSymbol* demandOsekApiEnableAllInterrupts(const KvCSrcRef* srcRef);
  KvCParamSymbol* demandOsekApiSuspendAllInterrupts(const KvCSrcRef* srcRef);
  KvCParamSymbol* demandOsekApiResumeAllInterrupts(const KvCSrcRef* srcRef);
  KvCParamSymbol* demandOsekApiSuspendOSInterrupts(const KvCSrcRef* srcRef);
  KvCParamSymbol* demandOsekApiResumeOSInterrupts(const KvCSrcRef* srcRef);
  KvCParamSymbol* demandOsekApiSetAbsAlarm(const KvCSrcRef* srcRef);
  KvCParamSymbol* demandOsekApiSetRelAlarm(const KvCSrcRef* srcRef);
  KvCParamSymbol* demandOsekApiSchedule(const KvCSrcRef* srcRef);
  // In the Acme header file; needs no OSEK header.
  KvCParamSymbol* demandStartISRDummy(const KvCSrcRef* srcRef);

  // Functions made through the call inserter, not cached. CancelAlarm is marked on every
  // demand. The counter demands re-size `actuals` to the parameter count (0..n-1) and fill
  // it with the actual arguments of a call; on null `actuals` is left as it was.
  KvCParamSymbol* demandOsekApiCancelAlarm(const KvCSrcRef* srcRef);
  KvCParamSymbol* demandExtOsekApiInitCounter(const KvCSrcRef* srcRef, KvCRoCounter* counter,
                                              leda::array<KV_ExprLocation*>& actuals);
  KvCParamSymbol* demandExtOsekApiInitCounterFromISR(const KvCSrcRef* srcRef,
                                                     KvCRoCounter* counter,
                                                     leda::array<KV_ExprLocation*>& actuals);
  KvCParamSymbol* demandExtOsekApiGetCounterValue(const KvCSrcRef* srcRef, KvCRoCounter* counter,
                                                  KvCUnparamSymbol* resultVariable,
                                                  leda::array<KV_ExprLocation*>& actuals);
  KvCParamSymbol* demandExtOsekApiGetCounterValueFromISR(const KvCSrcRef* srcRef,
                                                         KvCRoCounter* counter,
                                                         KvCUnparamSymbol* resultVariable,
                                                         leda::array<KV_ExprLocation*>& actuals);

  // The user-defined functions: name, class and code file from the user's template. Null
  // when the template is missing (30243), its code file cannot be had, or (for the
  // functions with `nParams` parameters) `nParams` differs from the count fixed by the
  // first successful demand (30179).
  KvCParamSymbol* demandUserDefinedTriggerTask(const KvCSrcRef* srcRef);
  KvCParamSymbol* demandUserDefinedEnterCriticalSection(int nParams, const KvCSrcRef* srcRef);
  KvCParamSymbol* demandUserDefinedLeaveCriticalSection(int nParams, const KvCSrcRef* srcRef);
  KvCParamSymbol* demandUserDefinedLockMessage(int nParams, const KvCSrcRef* srcRef);
  KvCParamSymbol* demandUserDefinedUnlockMessage(int nParams, const KvCSrcRef* srcRef);

private:
  // One row of the fixed API catalogue.
  struct ApiSpec;
  // How one of the user-defined functions with a parameter count is made.
  struct UserSpec;
  // The variant of a counter function demand.
  enum class CounterFcn { InitCounter, InitCounterFromISR, GetCounterValue, GetCounterValueFromISR };

  KvCParamSymbol* demandApi(KvCParamSymbol*& cache, const ApiSpec& spec, const KvCSrcRef* srcRef);
  KvCParamSymbol* demandUserDefined(KvCParamSymbol*& cache, int& count, const UserSpec& spec,
                                    int nParams, const KvCSrcRef* srcRef);
  // The template's function name, class and code file, after the emit marks of the code
  // file pair; false (after 30243, or with the check 2339) when the function cannot be made.
  bool getUserFunctionSettings(tagKvEFunctionTplKey key, WmCXString& functionName,
                               KvCFcnClassId*& fcnClass, KvCIcFileId*& codeFile,
                               const KvCSrcRef* srcRef);
  WmCXString getTemplateKeyAsString(tagKvEFunctionTplKey key);
  // Demands the function in `codeFile` with void return; the symbol, or null after a
  // report (30179 when the file has the function with another parameter count than
  // `nParams`).
  KvCParamSymbol* demandInCodeFile(KvCIcFileId* codeFile, const WmCXString& name,
                                   leda::array<KV_DataType*>& types,
                                   leda::array<KV_Scaling*>& scalings,
                                   leda::array<WmCXString>& names, unsigned int* flags,
                                   KvCFcnClassId* fcnClass, const KvCSrcRef* srcRef, int nParams);
  KvCParamSymbol* demandCounterFcn(CounterFcn which, const KvCSrcRef* srcRef,
                                   KvCRoCounter* counter, KvCUnparamSymbol* resultVariable,
                                   leda::array<KV_ExprLocation*>& actuals);
  // The name of a counter function for `counter`, from the function's name form.
  static WmCXString counterFunctionName(const WmCXString& nameForm, const KvCRoCounter* counter,
                                        const KvCSrcRef* srcRef);
  bool haveOsekHeader(KvCIcFile*& header, const KvCSrcRef* srcRef) const;
  // Whether phase two ran with every server a demand needs; the internal check if not.
  bool isReady() const;

  KvCCodeViewData* codeView = nullptr;
  KV_ICodeFactoryContainer* factories = nullptr;
  KV_FunctionSymbolServer* functionSymbolServer = nullptr;
  KvCFcnClassServer* fcnClassServer = nullptr;
  KvCMcgTypeServer* typeServer = nullptr;
  KV_BaseTypeServer* baseTypeServer = nullptr;
  KV_ScaleServer* scaleServer = nullptr;
  KvCTemplateServer* templateServer = nullptr;
  KvCFunctionTemplateServer* functionTemplateServer = nullptr;
  KvCApplicationServer* applicationServer = nullptr;
  KvCIcFileServer* fileServer = nullptr;
  KvCRoDatabase* rtosDatabase = nullptr;
  bool active = false;
  KvCIcFile* acmeHeaderFile = nullptr;
  KvCInternalSrcRef* internalSrcRef = nullptr;
  KvCParamSymbol* activateTask = nullptr;
  KvCParamSymbol* terminateTask = nullptr;
  KvCParamSymbol* triggerTask = nullptr;
  KvCParamSymbol* setEvent = nullptr;
  KvCParamSymbol* getEvent = nullptr;
  KvCParamSymbol* clearEvent = nullptr;
  KvCParamSymbol* waitEvent = nullptr;
  KvCParamSymbol* sendMessage = nullptr;
  KvCParamSymbol* receiveMessage = nullptr;
  KvCParamSymbol* lockMessage = nullptr;
  KvCParamSymbol* unlockMessage = nullptr;
  KvCParamSymbol* disableAllInterrupts = nullptr;
  KvCParamSymbol* enableAllInterrupts = nullptr;
  KvCParamSymbol* suspendAllInterrupts = nullptr;
  KvCParamSymbol* resumeAllInterrupts = nullptr;
  KvCParamSymbol* suspendOSInterrupts = nullptr;
  KvCParamSymbol* resumeOSInterrupts = nullptr;
  KvCParamSymbol* getResource = nullptr;
  KvCParamSymbol* releaseResource = nullptr;
  KvCParamSymbol* enterCriticalSection = nullptr;
  KvCParamSymbol* leaveCriticalSection = nullptr;
  KvCParamSymbol* schedule = nullptr;
  KvCParamSymbol* lastInitCounter = nullptr;
  KvCParamSymbol* setRelAlarm = nullptr;
  KvCParamSymbol* setAbsAlarm = nullptr;
  KvCParamSymbol* startISRDummy = nullptr;
  int nEnterCSParams = 0;
  int nLeaveCSParams = 0;
  int nLockMessageParams = 0;
  int nUnlockMessageParams = 0;
};

#endif
