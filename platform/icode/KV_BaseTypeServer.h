// KV_BaseTypeServer: the base types of the ICode by name: Int8, UInt8, Int16, UInt16,
// Int32, UInt32, Float32, Float64 and Bool. The types are those of the data type server
// (which owns them), made on first demand.
//
// Owned by the code view data.
#ifndef HUL_PLATFORM_ICODE_KV_BASETYPESERVER_H
#define HUL_PLATFORM_ICODE_KV_BASETYPESERVER_H

#include "platform/icode/KV_DataTypeServer.h"

class HUL_PLATFORM_API KV_BaseTypeServer {
public:
  explicit KV_BaseTypeServer(KV_DataTypeServer* typeServer) : types(typeServer) {}
  KV_BaseTypeServer(const KV_BaseTypeServer&) = delete;
  KV_BaseTypeServer& operator=(const KV_BaseTypeServer&) = delete;

  KV_NumericalType* getInt8() { return types->getInt8(); }
  // The void type of the run.
  KV_DataType* getVoid() { return types->demandVoidType(); }
  // The undefined type of the run (KV_VoidType::isUndefinedType), distinct from void.
  KV_DataType* getUndefinedType() { return types->demandUndefinedType(); }
  // The base type of that name; null for a null name or one that names no base type.
  KV_DataType* getBase(const WmCXString* name) {
    return name ? types->demandBaseType(*name) : nullptr;
  }

private:
  KV_DataTypeServer* types;
};

#endif
