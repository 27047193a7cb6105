// KvCMcgSymbolServer: makes the variables and globals of the RTOS interface in the ICode:
// - the identifier variable of an RTOS object (alarm, resource, event, message): one
//   extern variable per object, named like the object, of the object's RTOS type
//   (AlarmType, ResourceType, EventMaskType, SymbolicName), declared in the OSEK header
//   and remembered by the object itself;
// - the actual parameters of user-defined RTOS functions: extern globals of the standard
//   base type and scaling, declared in the Acme header, found again by name.
// Every type, the standard base type and scaling come from the RTOS type server.
//
// Ownership: the server owns nothing it points to. The ICode owns the variables and
// globals, the view the RTOS objects; copies share everything (member-wise).
//
// Cache: none of its own. An identifier variable is kept by its RTOS object (a later
// demand answers the object's variable without a model call); an extern global is found
// again by the macro symbol server.
//
// Life: bootPhaseOne stores the roots; bootPhaseTwo (a no-op when inactive) takes the
// internal source reference, the root partition and the Acme header. The type server must
// have run its own phase two before the first demand.
//
// Failures: without the OSEK header an identifier-variable demand answers null, reports
// nothing and leaves the object without variable (the header may come later). Anything
// else that keeps a variable or global from being made raises the internal check
// ("KvCMcgSymbolServer") and answers null, storing nothing in the object:
//   100  phase two without its roots (code view, factories, intermediate view data);
//   110  a demand before phase two (or without the servers it needs);
//   alarm 210, resource 220, event 230, message 240: a null object, or the object's RTOS
//        type, the header's statement table, the variable class or the standard scaling
//        cannot be had (the type server not through its phase two, for one);
//        plus one: the variable could not be made (its name is taken in the OSEK header);
//   300  a user-defined actual parameter without the standard base type or scaling;
//   301  the extern global could not be made or found (a name that is no C identifier,
//        or one taken otherwise).
#ifndef HULCVTOOLS_MULTIRATECODEGENTOOLS_KVCMCGSYMBOLSERVER_H
#define HULCVTOOLS_MULTIRATECODEGENTOOLS_KVCMCGSYMBOLSERVER_H

#include "HulCvTools/HulCvToolsExport.h"
#include "HulCvTools/ModelInterfaces/ICodeFwd.h"
#include "HulCvTools/ModelInterfaces/ViewFwd.h"
#include "platform/support/WmCXString.h"

class KvCInternalSrcRef;
class KvCMcgTypeServer;
class KvCSrcRef;

class HULCV_API KvCMcgSymbolServer {
public:
  KvCMcgSymbolServer() = default;

  // Stores the arguments. Always true.
  bool bootPhaseOne(KV_MacroSymbolServer* macroSymbols, KvCMcgTypeServer* typeServer,
                    KvCVarClassServer* varClasses, KvCCodeViewData* codeView,
                    KV_ICodeFactoryContainer* factories, KvCIvData* ivData,
                    KV_CgsSupporter* cgsSupporter, bool active, KvCRoDatabase* rtosDatabase);
  // True when inactive, or when the Acme file pair could be demanded.
  bool bootPhaseTwo();
  // Does nothing; true.
  bool shutdown() { return true; }

  // The identifier variable of the object: the one it has, else a new one made now. Null
  // when the OSEK header cannot be had (or the variable cannot be made, see above); the
  // object then stays without variable. `srcRef` goes to every model call of the demand.
  KV_ExprDescrTupel* demandAlarmIdVariable(KvCRoAlarm* alarm, const KvCSrcRef* srcRef);
  KV_ExprDescrTupel* demandResourceIdVariable(KvCRoResource* resource, const KvCSrcRef* srcRef);
  KV_ExprDescrTupel* demandEventIdVariable(KvCRoEvent* event, const KvCSrcRef* srcRef);
  KV_ExprDescrTupel* demandMessageIdVariable(KvCRoMessage* message, const KvCSrcRef* srcRef);

  // The extern global `name` of the standard base type and scaling, declared in the Acme
  // header: found when it exists, made otherwise. Null after the internal check when it
  // can be neither. The model calls take the server's own source reference, not the
  // caller's.
  KvCSymbol* demandUserDefinedActualParam(WmCXString name, const KvCSrcRef* srcRef);

private:
  // The RTOS type of one kind of object, demanded from the type server.
  using TypeDemand = KV_DataType* (KvCMcgTypeServer::*)(const KvCSrcRef*);
  // Makes the identifier variable of an object named `name` with the type `demandType`
  // gives; null when it cannot (see above). `code` is the kind's check code.
  KV_ExprDescrTupel* createIdVariable(const WmCXString& name, TypeDemand demandType, int code,
                                      const KvCSrcRef* srcRef);

  KV_MacroSymbolServer* macroSymbolServer = nullptr;
  KvCMcgTypeServer* typeServer = nullptr;
  KvCInternalSrcRef* internalSrcRef = nullptr;
  KV_BdPartition* rootPartition = nullptr;
  KV_CgsSupporter* cgsSupporter = nullptr;
  KvCVarClassServer* varClassServer = nullptr;
  KvCCodeViewData* codeView = nullptr;
  KV_ICodeFactoryContainer* factories = nullptr;
  KvCIvData* ivData = nullptr;
  bool active = false;
  KvCIcFile* acmeHeaderFile = nullptr;
  KvCRoDatabase* rtosDatabase = nullptr;
};

#endif
