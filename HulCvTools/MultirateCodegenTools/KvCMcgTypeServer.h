// KvCMcgTypeServer: makes, on demand and once per run, the data types of the OSEK-style
// RTOS interface in the ICode (StatusType, TaskType, EventMaskType, EventMaskRefType,
// SymbolicName, AccessNameRef, ResourceType, AlarmType, TickType, ISRDummyType and the
// type of counter identifiers), declares each in the OSEK header file (ISRDummyType in
// the Acme header) and hands out the same object on every later demand. The base type and
// description of each type come from the RTOS database's data-type descriptions; a
// Data Dictionary TickType wins over the RTOS one, with warning 31688 listing where the
// two differ.
//
// Ownership: the server owns nothing it points to; the ICode owns every type, file and
// server, the view the RTOS database. Copies share everything (member-wise).
//
// Life: bootPhaseOne stores the roots; bootPhaseTwo (a no-op when inactive) takes the
// standard scaling and base type, the RTOS data types and the root and Acme header files.
// Demands need phase two to have run. A successful demand is cached: later demands answer
// the cached type without a model call. A failed demand caches nothing.
//
// Failures: without the OSEK header file a demand answers null and reports nothing (the
// header may come later). A failed defineType raises the internal check with the type's
// code (StatusType 231, TaskType 268, ISRDummyType 291, EventMaskType 328,
// EventMaskRefType 367, SymbolicName 404, AccessNameRef 439, ResourceType 476,
// AlarmType 513, TickType 639); the type is still cached and answered. A type that cannot
// be made at all (the RTOS base-type name names no type, the model answers no type, or the
// server was not booted through phase two) raises the internal check with the type's
// code plus one and answers null, caching nothing; for the counter identifier type the
// checks are 700 (no RTOS data types or base type server) and 701 (the base-type name
// names no base type). Phase two without its roots raises check 100.
#ifndef HULCVTOOLS_MULTIRATECODEGENTOOLS_KVCMCGTYPESERVER_H
#define HULCVTOOLS_MULTIRATECODEGENTOOLS_KVCMCGTYPESERVER_H

#include "HulCvTools/HulCvToolsExport.h"
#include "HulCvTools/ModelInterfaces/ICodeFwd.h"
#include "HulCvTools/ModelInterfaces/ViewFwd.h"

class KvCInternalSrcRef;
class KvCSrcRef;
class WmCXString;

class HULCV_API KvCMcgTypeServer {
public:
  KvCMcgTypeServer() = default;

  // Stores the roots, the file server and the data type server with its pointer server.
  // Always true.
  bool bootPhaseOne(KvCCodeViewData* codeView, KV_ICodeFactoryContainer* factories,
                    KvCRoDatabase* rtosDatabase, bool active);
  // True when inactive, or when the root and the Acme file pairs could be demanded.
  bool bootPhaseTwo();
  // Does nothing; true.
  bool shutdown() { return true; }

  // Int8 of the base type server, and the scaling with factor 1 and offset 0 (both null
  // before phase two).
  KV_DataType* getStandardBaseType() const;
  KV_Scaling* getStandardScaling() const { return standardScaling; }

  // The type, or null when the OSEK header file cannot be had (or the type cannot be made,
  // see above). `srcRef` goes to every model call of the demand.
  KV_DataType* demandStatusType(const KvCSrcRef* srcRef);
  KV_DataType* demandTaskType(const KvCSrcRef* srcRef);
  KV_DataType* demandEventMaskType(const KvCSrcRef* srcRef);
  KV_DataType* demandSymbolicNameType(const KvCSrcRef* srcRef);
  KV_DataType* demandResourceType(const KvCSrcRef* srcRef);
  KV_DataType* demandAlarmType(const KvCSrcRef* srcRef);
  KV_DataType* demandAccessNameRefType(const KvCSrcRef* srcRef);
  KV_DataType* demandEventMaskRefType(const KvCSrcRef* srcRef);
  KV_DataType* demandISRDummyType(const KvCSrcRef* srcRef);
  KV_DataType* demandTickType(const KvCSrcRef* srcRef);
  // The type of counter identifiers: the base type named by the RTOS information, read
  // through the code view's RTOS database. Not defined in any file.
  KV_DataType* demandCounterIDType();

private:
  // How one numerical RTOS type is made: its name, where the RTOS data types give its base
  // type name and description, and its check code.
  struct NumericalSpec;
  KV_DataType* demandNumerical(KV_DataType*& cache, const NumericalSpec& spec,
                               const KvCSrcRef* srcRef);
  bool haveOsekHeader(KvCIcFile*& header, const KvCSrcRef* srcRef) const;
  // Declares `type` in `file`; the internal check with `code` when that fails.
  static void define(KvCIcFile* file, KV_DataType* type, const KvCSrcRef* srcRef, int code);
  // The base type the RTOS information names, or null after the internal check `code`.
  KV_NumericalType* rtosBaseType(const WmCXString& name, const KvCSrcRef* srcRef, int code);
  // The list of properties in which a Data Dictionary TickType differs from the RTOS one.
  static WmCXString tickTypeDifferences(KV_DataType* ddType, KV_DataType* rtosBase,
                                        KvCIcFile* osekHeader);

  KvCCodeViewData* codeView = nullptr;
  KV_ICodeFactoryContainer* factories = nullptr;
  KvCIcFileServer* fileServer = nullptr;
  KvCRoDatabase* rtosDatabase = nullptr;
  KV_BaseTypeServer* baseTypeServer = nullptr;
  KV_DataTypeServer* dataTypeServer = nullptr;
  KV_PointerTypeServer* pointerTypeServer = nullptr;
  bool active = false;
  KvCInternalSrcRef* internalSrcRef = nullptr;
  KvCIcFile* rootHeaderFile = nullptr;
  KV_NumericalTypeServer* numericalTypeServer = nullptr;
  KV_Scaling* standardScaling = nullptr;
  KV_NumericalType* standardBaseType = nullptr;
  KV_DataType* statusType = nullptr;
  KV_DataType* taskType = nullptr;
  KV_DataType* eventMaskType = nullptr;
  KV_DataType* resourceType = nullptr;
  KV_DataType* alarmType = nullptr;
  KV_DataType* accessNameRefType = nullptr;
  KV_DataType* eventMaskRefType = nullptr;
  KV_DataType* symbolicNameType = nullptr;
  KV_DataType* counterIDType = nullptr;
  KV_DataType* tickType = nullptr;
  KV_DataType* isrDummyType = nullptr;
  const KvCRoDataTypes* rtosDataTypes = nullptr;
  KvCIcFile* acmeHeaderFile = nullptr;
};

#endif
