// KvCEcpParamSymbolServer: makes, on demand, the parameterised symbols through which code
// generated for the Ecp tools reaches its access points, and the ECU service function:
// - the access-point macros ap_Write(arg1, arg2), ap_Read(arg1, arg2), ap_Entry(arg1) and
//   ap_Exit(arg1), pre-include macros of the access-point header, each marked with its
//   role. Under C preprocessor expansion ap_Write(x, v) becomes ap_Write_x(v) and
//   ap_Entry(x) becomes ap_Entry_x() (ap_Read and ap_Exit likewise);
// - the auxiliary macros they expand through, in two levels so that the arguments are
//   expanded before they are pasted: AP_CONCAT(name1, name2) calls
//   AP_EXPAND_CONCAT(name1, name2), which pastes name1 and name2; AP_BRACKET(name) calls
//   AP_EXPAND_BRACKET(name), which puts name in brackets;
// - the ECU service function "wmecu_service", void, with one 8-bit signed parameter,
//   declared in the ECU service file.
// Every macro is void with the undefined scaling and of the access-point macro class. Each
// demand builds the macro's body anew as ICode operations (macro calls whose arguments are
// dummy symbols printed by name, preprocessor concatenations, an appended "()") and hands
// it to the macro call inserter, which finds the macro of the name in the header or makes
// it with that body; a demand of an access-point macro demands the auxiliary macros its
// body calls on the way.
//
// Ownership: the server owns its two call inserters and its five parameter accesses
// (made in boot, deleted in shutdown, each at most once) and nothing else; the ICode owns
// the macros, functions, bodies, dummy symbols and servers, the caller the type server.
// The server is not copied.
//
// Life: boot takes the servers and factories and makes the inserters and accesses;
// shutdown (also run by the destructor) forgets the servers and deletes what boot made.
// A server may be booted again after shutdown.
//
// Failures: demandEcuServiceFunction answers null, reporting nothing, when the file server
// gives no ECU service file. A demand on a server that is not booted (or whose boot could
// not allocate its inserters or accesses) raises the internal check
// "KvCEcpParamSymbolServer" with the source line and answers null. Otherwise every demand
// answers what the model answers (null when the access-point header cannot be had, or a
// macro of the name exists that does not agree).
#ifndef HULCVTOOLS_ECPTOOLS_KVCECPPARAMSYMBOLSERVER_H
#define HULCVTOOLS_ECPTOOLS_KVCECPPARAMSYMBOLSERVER_H

#include "HulCvTools/Control/KvCHeapObject.h"
#include "HulCvTools/HulCvToolsExport.h"
#include "HulCvTools/ModelInterfaces/ICodeFwd.h"

class KvCEcpTypeServer;
class KvCSrcRef;
class WmCXString;

class HULCV_API KvCEcpParamSymbolServer {
public:
  HULCV_HEAP_OPERATORS

  KvCEcpParamSymbolServer() = default;
  // Runs shutdown.
  virtual ~KvCEcpParamSymbolServer();
  KvCEcpParamSymbolServer(const KvCEcpParamSymbolServer&) = delete;
  KvCEcpParamSymbolServer& operator=(const KvCEcpParamSymbolServer&) = delete;

  // Stores the type server, takes the servers and factories from the container and makes
  // the call inserters and parameter accesses (a booted server is shut down first). Always
  // true; an inserter or access that cannot be allocated stays null, and demands report it.
  bool boot(KvCEcpTypeServer* typeServer, KV_ICodeFactoryContainer* factories);
  // Forgets the servers and deletes the inserters and accesses. True; a second shutdown
  // finds nothing to delete.
  bool shutdown();

  // The access-point macros. `srcRef` goes to every model call of the demand.
  KvCParamSymbol* demandApWriteMacro(const KvCSrcRef* srcRef);
  KvCParamSymbol* demandApReadMacro(const KvCSrcRef* srcRef);
  KvCParamSymbol* demandApEntryMacro(const KvCSrcRef* srcRef);
  KvCParamSymbol* demandApExitMacro(const KvCSrcRef* srcRef);
  // The auxiliary macros.
  KvCParamSymbol* demandApConcatMacro(const KvCSrcRef* srcRef);
  KvCParamSymbol* demandApExpandConcatMacro(const KvCSrcRef* srcRef);
  KvCParamSymbol* demandApBracketMacro(const KvCSrcRef* srcRef);
  KvCParamSymbol* demandApExpandBracketMacro(const KvCSrcRef* srcRef);
  // The ECU service function; null when the file server gives no ECU service file.
  KvCParamSymbol* demandEcuServiceFunction(const KvCSrcRef* srcRef);

private:
  // The macro `name` of the access-point header with `count` parameters named names[i]
  // and used as accesses[i] say, and `body`; `mustBeNew` as the macro call inserter takes it.
  KvCParamSymbol* demandAccesspointMacro(const WmCXString& name, int count,
                                         KV_ParamAccess** accesses, WmCXString* names,
                                         KvCIcExpression* body, const KvCSrcRef* srcRef,
                                         bool mustBeNew);
  // A location that prints as `name`: an access to a new dummy variable of that name.
  KV_ExprLocation* createElocFromString(const WmCXString& name);
  // A new call of `macro` with the arguments args[0..count-1]; null when it cannot be made.
  KV_Operation* createMacroCallOperation(KvCParamSymbol* macro, int count,
                                         KV_ParamAccess** accesses, KV_ExprLocation** args,
                                         const KvCSrcRef* srcRef);
  // The body of ap_Write and ap_Read:
  // AP_CONCAT(AP_CONCAT(<prefix>, names[0]), AP_BRACKET(names[1])). `accesses` is not used:
  // every call of the body uses the macro parameter accesses.
  KV_Operation* createApReadWriteMacroBody(const WmCXString& prefix, KV_ParamAccess** accesses,
                                           WmCXString* names, const KvCSrcRef* srcRef);
  // One of the role marks of a symbol (markAsApWriteMacro and its kin).
  using MarkOperation = void (KvCSymbol::*)();
  // ap_Write and ap_Read: the macro `name` over the body with `prefix`, marked by `mark`.
  KvCParamSymbol* demandApReadWriteMacro(const WmCXString& name, const WmCXString& prefix,
                                         MarkOperation mark, const KvCSrcRef* srcRef);
  // ap_Entry and ap_Exit, the same way.
  KvCParamSymbol* demandApEntryExitMacro(const WmCXString& name, const WmCXString& prefix,
                                         MarkOperation mark, const KvCSrcRef* srcRef);
  // The body of ap_Entry and ap_Exit: AP_CONCAT(<prefix>, arg1) followed by "()".
  KV_Operation* createApEntryExitMacroBody(const WmCXString& prefix, const KvCSrcRef* srcRef);
  // Whether boot ran and made everything a demand needs.
  bool isReady() const;

  KvCEcpTypeServer* typeServer = nullptr;
  KV_BaseTypeServer* baseTypeServer = nullptr;
  KV_ScaleServer* scaleServer = nullptr;
  KV_FunctionSymbolServer* functionSymbolServer = nullptr;
  KvCFcnClassServer* fcnClassServer = nullptr;
  KvCIcFileServer* fileServer = nullptr;
  KV_DataTypeServer* dataTypeServer = nullptr;
  KV_MacroSymbolServer* macroSymbolServer = nullptr;
  KV_ParamMacroSymbolServer* paramMacroSymbolServer = nullptr;
  KV_RangeServer* rangeServer = nullptr;
  KV_MacroCallInserter* macroCallInserter = nullptr;
  KV_VariableSymbolServer* variableSymbolServer = nullptr;
  KvCVarClassServer* varClassServer = nullptr;
  KV_ExprLocFactory* exprLocFactory = nullptr;
  KvCPreProcOpFactory* preProcOpFactory = nullptr;
  KV_FunctionCallInserter* functionCallInserter = nullptr;
  KvCAppendOpFactory* appendOpFactory = nullptr;
  KV_ParamAccess* entryExitParamAccess = nullptr;
  KV_ParamAccess* readWriteParamAccesses[2] = {nullptr, nullptr};
  KV_ParamAccess* macroParamAccesses[2] = {nullptr, nullptr};
};

#endif
