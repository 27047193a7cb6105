// KvCEcpTypeServer: makes, on first demand and once per run, the two auxiliary types of the
// Ecp tools and defines them in the Acme header file (the header of the Acme file pair):
// - "CIDDummyType" ("Dummy type for CIDs"): the type of object identifiers (CIDs), an 8-bit
//   signed integer named for casts, written without a typedef of its own;
// - "AccessPointRef" ("Dummy type for AccessPoints"): the type of references to access
//   points, a typedef of the void pointer.
// It also hands out the standard scaling (LSB 1.0, offset 0.0) and the standard base type
// (the 8-bit signed integer) that the Ecp symbol servers give their symbols.
//
// Ownership: the server owns nothing it points to; the ICode owns every type, scaling,
// file, server and the internal source reference. Copies share everything (member-wise).
//
// Life: bootPhaseOne stores the roots and the servers it can take at once; bootPhaseTwo (a
// no-op on a disabled server) makes the internal source reference (cause "rtos api
// function") and takes the standard scaling, the standard base type and the Acme header.
// Demands need phase two to have run on an enabled server. shutdown does nothing.
//
// Cache: each type is made once and then answered unchanged, also when its definition in
// the header failed.
//
// Failures: phase two answers false, reporting nothing, when the Acme file pair cannot be
// had. A failed definition of a made type raises the internal check "KvCEcpTypeServer"
// with the source line of the place (message 10007); the type is still cached and
// answered. A demand on a server whose phase two did not complete raises the same check
// and answers null; a type the model refuses to make (its name taken) is answered as
// null after the check of the failed definition.
#ifndef HULCVTOOLS_ECPTOOLS_KVCECPTYPESERVER_H
#define HULCVTOOLS_ECPTOOLS_KVCECPTYPESERVER_H

#include "HulCvTools/HulCvToolsExport.h"
#include "HulCvTools/ModelInterfaces/ICodeFwd.h"

class KvCInternalSrcRef;
class KvCSrcRef;

class HULCV_API KvCEcpTypeServer {
public:
  KvCEcpTypeServer() = default;

  // Stores the roots and the enabled flag; takes the file server, the data type server and
  // its pointer type server. Always true.
  bool bootPhaseOne(KvCCodeViewData* codeView, KV_ICodeFactoryContainer* factories, bool enabled);
  // True when disabled (nothing done), or when the Acme file pair could be had; false
  // otherwise, with the servers, scaling and base type taken so far kept.
  bool bootPhaseTwo();
  // Does nothing: the model owns everything. True.
  bool shutdown() { return true; }

  // The CID type and the access-point reference type, made and defined in the Acme header
  // on first demand. `srcRef` goes to the type's definition.
  KV_DataType* demandCidType(const KvCSrcRef* srcRef);
  KV_DataType* demandAccessPointRefType(const KvCSrcRef* srcRef);

  // The 8-bit signed base type and the scaling with LSB 1.0 and offset 0.0; null before
  // phase two (and on a disabled server).
  KV_DataType* getStandardBaseType() const;
  KV_Scaling* getStandardScaling() const { return standardScaling; }

private:
  // Defines `type` in the Acme header; false when there is no type or header, or the model
  // refuses.
  bool define(KV_DataType* type, const KvCSrcRef* srcRef) const;

  KvCCodeViewData* codeViewData = nullptr;
  KV_ICodeFactoryContainer* factoryContainer = nullptr;
  KvCIcFileServer* fileServer = nullptr;
  KV_BaseTypeServer* baseTypeServer = nullptr;
  KV_DataTypeServer* dataTypeServer = nullptr;
  bool enabled = false;
  KV_NumericalTypeServer* numericalTypeServer = nullptr;
  KvCInternalSrcRef* internalSrcRef = nullptr;
  KV_PointerTypeServer* pointerTypeServer = nullptr;
  KvCIcFile* acmeHeaderFile = nullptr;
  KV_Scaling* standardScaling = nullptr;
  KV_NumericalType* standardBaseType = nullptr;
  KV_DataType* accessPointRefType = nullptr;
  KV_DataType* cidType = nullptr;
};

#endif
