// KvCEcpSymbolServer: makes the object-identifier macros (CID macros) of the Ecp tools: one
// object-like macro per name, of the CID type and the standard scaling that the Ecp type
// server hands out, defined in the Acme header file. The first CID macro makes the CID
// type, so a macro may be demanded before anybody asked for the type.
//
// Ownership: the server owns nothing it points to; the ICode owns the macros, files,
// servers and the internal source reference, the caller the type server. Copies share
// everything (member-wise).
//
// Cache: none of its own: the macro symbol server finds a macro again by name.
//
// Life: bootPhaseOne stores its arguments; bootPhaseTwo (a no-op on a disabled server)
// makes the internal source reference (cause "rtos object identifier symbol") and takes
// the Acme header file id. The type server must have run both its phases before the first
// demand. shutdown does nothing.
//
// Failures: phase two answers false, reporting nothing, when the Acme file pair cannot be
// had. A demand on a server whose phase two did not complete raises the internal check
// "KvCEcpSymbolServer" with the source line and answers null; otherwise createCidMacro
// answers what the macro symbol server answers (null for a name that cannot be had in the
// header).
#ifndef HULCVTOOLS_ECPTOOLS_KVCECPSYMBOLSERVER_H
#define HULCVTOOLS_ECPTOOLS_KVCECPSYMBOLSERVER_H

#include "HulCvTools/HulCvToolsExport.h"
#include "HulCvTools/ModelInterfaces/ICodeFwd.h"
#include "HulCvTools/ModelInterfaces/ViewFwd.h"

class KvCEcpTypeServer;
class KvCInternalSrcRef;
class KvCSrcRef;
class WmCXString;

class HULCV_API KvCEcpSymbolServer {
public:
  KvCEcpSymbolServer() = default;

  // Stores the arguments. Always true.
  bool bootPhaseOne(KV_MacroSymbolServer* macroSymbols, KvCEcpTypeServer* typeServer,
                    KvCCodeViewData* codeView, KV_ICodeFactoryContainer* factories,
                    KvCIvData* ivData, bool enabled);
  // True when disabled (nothing done), or when the Acme file pair could be had.
  bool bootPhaseTwo();
  // Does nothing: the model owns everything. True.
  bool shutdown() { return true; }

  // The CID macro `name` of the CID type and the standard scaling, defined in the Acme
  // header: found when it exists, made otherwise. `srcRef` goes to the model calls.
  KvCUnparamSymbol* createCidMacro(const WmCXString& name, const KvCSrcRef* srcRef);

private:
  KV_MacroSymbolServer* macroSymbolServer = nullptr;
  KvCEcpTypeServer* typeServer = nullptr;
  KvCInternalSrcRef* internalSrcRef = nullptr;
  KvCCodeViewData* codeViewData = nullptr;
  KV_ICodeFactoryContainer* factoryContainer = nullptr;
  KvCIvData* ivData = nullptr;
  bool enabled = false;
  KvCIcFileId* acmeHeaderFileId = nullptr;
};

#endif
