#include "HulCvTools/EcpTools/KvCEcpParamSymbolServer.h"

#include "HulCvTools/Control/KvCInternalCheck.h"
#include "HulCvTools/ModelInterfaces/ICodeModel.h"
#include "platform/support/WmCXString.h"

namespace {
constexpr const char* kErrorCode = "KvCEcpParamSymbolServer";

// Deletes an inserter through its base, as the model asks, and forgets it.
template <class Inserter> void deleteInserter(Inserter*& inserter) {
  KV_CallInserter* base = inserter;
  delete base;
  inserter = nullptr;
}

void deleteAccess(KV_ParamAccess*& access) {
  delete access;
  access = nullptr;
}
} // namespace

HULCV_DEFINE_HEAP_OPERATORS(KvCEcpParamSymbolServer)

KvCEcpParamSymbolServer::~KvCEcpParamSymbolServer() { shutdown(); }

bool KvCEcpParamSymbolServer::boot(KvCEcpTypeServer* ecpTypes,
                                   KV_ICodeFactoryContainer* factories) {
  // A second boot would otherwise lose what the first one made.
  shutdown();
  typeServer = ecpTypes;
  if (!factories)
    return true;
  KV_SymbolServer* symbols = factories->getSymbolServer();
  KvCSmbClassServer* classes = factories->getSmbClassServer();
  KV_OperationFactories* operations = factories->getOperationFactories();
  baseTypeServer = factories->getBaseTypeServer();
  scaleServer = factories->getScalingServer();
  functionSymbolServer = symbols ? symbols->getFunction() : nullptr;
  fcnClassServer = classes ? classes->getFcnClassServer() : nullptr;
  fileServer = factories->getFileServer();
  paramMacroSymbolServer = symbols ? symbols->getParamMacro() : nullptr;
  dataTypeServer = factories->getDataTypeServer();
  macroSymbolServer = symbols ? symbols->getMacro() : nullptr;
  rangeServer = factories->getRangeServer();
  variableSymbolServer = symbols ? symbols->getVariable() : nullptr;
  varClassServer = classes ? classes->getVarClassServer() : nullptr;
  exprLocFactory = factories->getExprLocFactory();
  preProcOpFactory = operations ? operations->getPreProcessor() : nullptr;
  appendOpFactory = operations ? operations->getAppend() : nullptr;
  // Allocation may fail (new answers null); the demands then report the missing object.
  macroCallInserter = new KV_MacroCallInserter(factories);
  functionCallInserter = new KV_FunctionCallInserter(factories);
  macroParamAccesses[0] = new KV_ParamAccess(true, false, false);
  macroParamAccesses[1] = new KV_ParamAccess(true, false, false);
  readWriteParamAccesses[0] = new KV_ParamAccess(true, false, false);
  readWriteParamAccesses[1] = new KV_ParamAccess(true, true, true);
  entryExitParamAccess = new KV_ParamAccess(true, true, true);
  return true;
}

bool KvCEcpParamSymbolServer::shutdown() {
  typeServer = nullptr;
  baseTypeServer = nullptr;
  scaleServer = nullptr;
  functionSymbolServer = nullptr;
  fcnClassServer = nullptr;
  fileServer = nullptr;
  dataTypeServer = nullptr;
  macroSymbolServer = nullptr;
  paramMacroSymbolServer = nullptr;
  rangeServer = nullptr;
  variableSymbolServer = nullptr;
  varClassServer = nullptr;
  exprLocFactory = nullptr;
  preProcOpFactory = nullptr;
  appendOpFactory = nullptr;
  deleteInserter(macroCallInserter);
  deleteInserter(functionCallInserter);
  deleteAccess(entryExitParamAccess);
  for (KV_ParamAccess*& access : readWriteParamAccesses)
    deleteAccess(access);
  for (KV_ParamAccess*& access : macroParamAccesses)
    deleteAccess(access);
  return true;
}

bool KvCEcpParamSymbolServer::isReady() const {
  const bool servers = baseTypeServer && scaleServer && fcnClassServer && fileServer &&
                       rangeServer && variableSymbolServer && varClassServer && exprLocFactory &&
                       preProcOpFactory && appendOpFactory;
  const bool owned = macroCallInserter && functionCallInserter && entryExitParamAccess &&
                     readWriteParamAccesses[0] && readWriteParamAccesses[1] &&
                     macroParamAccesses[0] && macroParamAccesses[1];
  return servers && owned;
}

// --- building blocks of the bodies

KvCParamSymbol* KvCEcpParamSymbolServer::demandAccesspointMacro(
    const WmCXString& name, int count, KV_ParamAccess** accesses, WmCXString* names,
    KvCIcExpression* body, const KvCSrcRef* srcRef, bool mustBeNew) {
  // A body that could not be built: the model refused a macro it calls. A macro without
  // its body would expand to nothing, so none is made.
  if (!body)
    return nullptr;
  KvCIcFileId* header = fileServer->demandApHeaderFile(srcRef);
  KV_DataType* voidType = baseTypeServer->getVoid();
  KV_Scaling* undefinedScaling = scaleServer->getUndefinedScaling();
  KvCFcnClassId* macroClass = fcnClassServer->demandApMacroClass(srcRef);
  return macroCallInserter->demandPreIncludeMacroSymbol(name, voidType, undefinedScaling, count,
                                                        accesses, names, macroClass, body, header,
                                                        srcRef, mustBeNew);
}

KV_ExprLocation* KvCEcpParamSymbolServer::createElocFromString(const WmCXString& name) {
  KvCUnparamSymbol* symbol = variableSymbolServer->create(
      name, 0, baseTypeServer->getUndefinedType(), scaleServer->getUndefinedScaling(),
      varClassServer->demandSlLocalDefault(nullptr), nullptr);
  return exprLocFactory->createSymbolExprLoc(symbol, 0);
}

KV_Operation* KvCEcpParamSymbolServer::createMacroCallOperation(KvCParamSymbol* macro, int count,
                                                                KV_ParamAccess** accesses,
                                                                KV_ExprLocation** args,
                                                                const KvCSrcRef* srcRef) {
  macroCallInserter->insertMacroCall(macro, count, args, accesses, false, nullptr,
                                     rangeServer->getUndefinedRange(), srcRef);
  return macroCallInserter->getCallOperation();
}

KV_Operation* KvCEcpParamSymbolServer::createApReadWriteMacroBody(const WmCXString& prefix,
                                                                  KV_ParamAccess** /*accesses*/,
                                                                  WmCXString* names,
                                                                  const KvCSrcRef* srcRef) {
  KV_ExprLocation* bracketArgs[1] = {createElocFromString(names[1])};
  KV_ExprLocation* concatArgs[2] = {createElocFromString(prefix), createElocFromString(names[0])};
  KV_Operation* bracketCall = createMacroCallOperation(demandApBracketMacro(srcRef), 1,
                                                       macroParamAccesses, bracketArgs, srcRef);
  KvCParamSymbol* concat = demandApConcatMacro(srcRef);
  KV_Operation* concatCall =
      createMacroCallOperation(concat, 2, macroParamAccesses, concatArgs, srcRef);
  KV_ExprLocation* operationArgs[2] = {exprLocFactory->createOperationExprLoc(concatCall),
                                       exprLocFactory->createOperationExprLoc(bracketCall)};
  return createMacroCallOperation(concat, 2, macroParamAccesses, operationArgs, srcRef);
}

KV_Operation* KvCEcpParamSymbolServer::createApEntryExitMacroBody(const WmCXString& prefix,
                                                                  const KvCSrcRef* srcRef) {
  KV_ExprLocation* args[2] = {createElocFromString(prefix), createElocFromString("arg1")};
  KV_Operation* call =
      createMacroCallOperation(demandApConcatMacro(srcRef), 2, macroParamAccesses, args, srcRef);
  return call ? appendOpFactory->createStringAppend(call, "()", srcRef) : nullptr;
}

// --- the access-point macros

KvCParamSymbol* KvCEcpParamSymbolServer::demandApReadWriteMacro(const WmCXString& name,
                                                                const WmCXString& prefix,
                                                                MarkOperation mark,
                                                                const KvCSrcRef* srcRef) {
  if (!KV_VERIFY(isReady(), kErrorCode, __LINE__))
    return nullptr;
  WmCXString names[2] = {"arg1", "arg2"};
  KV_Operation* body = createApReadWriteMacroBody(prefix, readWriteParamAccesses, names, srcRef);
  KvCParamSymbol* macro =
      demandAccesspointMacro(name, 2, readWriteParamAccesses, names, body, srcRef, false);
  if (macro)
    (macro->*mark)();
  return macro;
}

KvCParamSymbol* KvCEcpParamSymbolServer::demandApEntryExitMacro(const WmCXString& name,
                                                                const WmCXString& prefix,
                                                                MarkOperation mark,
                                                                const KvCSrcRef* srcRef) {
  if (!KV_VERIFY(isReady(), kErrorCode, __LINE__))
    return nullptr;
  WmCXString names[1] = {"arg1"};
  KV_Operation* body = createApEntryExitMacroBody(prefix, srcRef);
  KvCParamSymbol* macro =
      demandAccesspointMacro(name, 1, &entryExitParamAccess, names, body, srcRef, false);
  if (macro)
    (macro->*mark)();
  return macro;
}

KvCParamSymbol* KvCEcpParamSymbolServer::demandApWriteMacro(const KvCSrcRef* srcRef) {
  return demandApReadWriteMacro("ap_Write", "ap_Write_", &KvCSymbol::markAsApWriteMacro, srcRef);
}

KvCParamSymbol* KvCEcpParamSymbolServer::demandApReadMacro(const KvCSrcRef* srcRef) {
  return demandApReadWriteMacro("ap_Read", "ap_Read_", &KvCSymbol::markAsApReadMacro, srcRef);
}

KvCParamSymbol* KvCEcpParamSymbolServer::demandApEntryMacro(const KvCSrcRef* srcRef) {
  return demandApEntryExitMacro("ap_Entry", "ap_Entry_", &KvCSymbol::markAsApEntryMacro, srcRef);
}

KvCParamSymbol* KvCEcpParamSymbolServer::demandApExitMacro(const KvCSrcRef* srcRef) {
  return demandApEntryExitMacro("ap_Exit", "ap_Exit_", &KvCSymbol::markAsApExitMacro, srcRef);
}

// --- the auxiliary macros

KvCParamSymbol* KvCEcpParamSymbolServer::demandApExpandConcatMacro(const KvCSrcRef* srcRef) {
  if (!KV_VERIFY(isReady(), kErrorCode, __LINE__))
    return nullptr;
  WmCXString names[2] = {"name1", "name2"};
  KV_Operation* body = preProcOpFactory->createConcat(names[0], names[1], srcRef);
  return demandAccesspointMacro("AP_EXPAND_CONCAT", 2, macroParamAccesses, names, body, srcRef,
                                false);
}

KvCParamSymbol* KvCEcpParamSymbolServer::demandApConcatMacro(const KvCSrcRef* srcRef) {
  if (!KV_VERIFY(isReady(), kErrorCode, __LINE__))
    return nullptr;
  WmCXString names[2] = {"name1", "name2"};
  KV_ExprLocation* args[2] = {createElocFromString(names[0]), createElocFromString(names[1])};
  KV_Operation* body = createMacroCallOperation(demandApExpandConcatMacro(srcRef), 2,
                                                macroParamAccesses, args, srcRef);
  return demandAccesspointMacro("AP_CONCAT", 2, macroParamAccesses, names, body, srcRef, false);
}

KvCParamSymbol* KvCEcpParamSymbolServer::demandApExpandBracketMacro(const KvCSrcRef* srcRef) {
  if (!KV_VERIFY(isReady(), kErrorCode, __LINE__))
    return nullptr;
  WmCXString names[1] = {"name"};
  KV_Operation* inner = preProcOpFactory->createConcat(names[0], ")", srcRef);
  KV_Operation* body = inner ? preProcOpFactory->createConcat("(", inner, srcRef) : nullptr;
  return demandAccesspointMacro("AP_EXPAND_BRACKET", 1, macroParamAccesses, names, body, srcRef,
                                false);
}

KvCParamSymbol* KvCEcpParamSymbolServer::demandApBracketMacro(const KvCSrcRef* srcRef) {
  if (!KV_VERIFY(isReady(), kErrorCode, __LINE__))
    return nullptr;
  WmCXString names[1] = {"name"};
  KV_ExprLocation* args[1] = {createElocFromString(names[0])};
  KV_Operation* body = createMacroCallOperation(demandApExpandBracketMacro(srcRef), 1,
                                                macroParamAccesses, args, srcRef);
  return demandAccesspointMacro("AP_BRACKET", 1, macroParamAccesses, names, body, srcRef, false);
}

// --- the ECU service function

KvCParamSymbol* KvCEcpParamSymbolServer::demandEcuServiceFunction(const KvCSrcRef* srcRef) {
  if (!KV_VERIFY(isReady(), kErrorCode, __LINE__))
    return nullptr;
  const WmCXString name("wmecu_service");
  KV_DataType* voidType = baseTypeServer->getVoid();
  KV_Scaling* undefinedScaling = scaleServer->getUndefinedScaling();
  KV_DataType* types[1] = {baseTypeServer->getInt8()};
  KV_Scaling* scalings[1] = {scaleServer->getDefaultScaling()};
  KV_ParamAccess* accesses[1] = {new KV_ParamAccess(true, false, false)};
  if (!accesses[0]) {
    KV_INTERNAL_CHECK_SRC(srcRef, kErrorCode, __LINE__);
    return nullptr;
  }
  KvCFcnClassId* fcnClass = fcnClassServer->demandFcnClass(srcRef);
  KvCIcFileId* file = nullptr;
  KvCParamSymbol* function = nullptr;
  if (fileServer->demandEcuServiceFile(file, srcRef) && file)
    function =
        functionCallInserter->demandFunctionSymbol(name, voidType, undefinedScaling, 1, accesses,
                                                   types, scalings, fcnClass, file, srcRef, false);
  if (function)
    function->markAsEcuServiceFunction();
  // The access was needed for the demand only; the model keeps its flag word.
  delete accesses[0];
  return function;
}
