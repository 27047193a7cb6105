// KV_PointerTypeServer: the pointer types of the ICode: unnamed pointers (the pointer to a
// type, one per target and constness) and named pointers, typedefs of an unnamed pointer
// (`typedef EventMaskType* EventMaskRefType;`) that are not mapped to the Data
// Dictionary.
//
// Owned by the data type server (KV_DataTypeServer::getPointerServer); the types it makes
// are owned there too and share the data type server's name space.
#ifndef HUL_PLATFORM_ICODE_KV_POINTERTYPESERVER_H
#define HUL_PLATFORM_ICODE_KV_POINTERTYPESERVER_H

#include "platform/icode/KV_DataType.h"
#include "platform/icode/KV_DimensionDescriptor.h"

class KV_DataTypeServer;
class KvCSrcRef;

class HUL_PLATFORM_API KV_PointerTypeServer {
public:
  explicit KV_PointerTypeServer(KV_DataTypeServer* owner) : types(owner) {}
  KV_PointerTypeServer(const KV_PointerTypeServer&) = delete;
  KV_PointerTypeServer& operator=(const KV_PointerTypeServer&) = delete;

  // The named pointer `name` whose base is the unnamed pointer `target`: it points where
  // `target` points, with the given description and dimensions, made at `srcRef`.
  // `createTypedef`: the name is written as a typedef where the type is defined. A second
  // demand with the same name, target and dimensions returns the type made first
  // (description and flag as given then). Null for an empty name, a null or named
  // `target`, or a name that another type has.
  KV_PointerType* getNonDDMappedPointer(const WmCXString& name, WmCXString& description,
                                        KV_DimensionDescriptor& dims, bool createTypedef,
                                        KV_PointerType* target, const KvCSrcRef* srcRef);
  // Without a name (null or empty): the unnamed pointer to `type`, to const `type` with
  // `toConst`. With a name: the scalar named pointer of that name whose base is that
  // unnamed pointer (as getNonDDMappedPointer with `description` and `createTypedef`).
  // Null for a null type.
  KV_PointerType* getScalarPointer(KV_DataType* type, WmCXString* name, bool toConst,
                                   bool createTypedef, const WmCXString* description,
                                   const KvCSrcRef* srcRef);
  // The unnamed pointer to `type` (not to const); null for a null type. `srcRef` is the
  // caller's and is not kept.
  KV_PointerType* getScalarPointer(KV_DataType* type, const KvCSrcRef* srcRef);
  // The unnamed pointer to void.
  KV_PointerType* getVoidPointer();

private:
  KV_DataTypeServer* types;
};

#endif
