// KV_DataTypeServer: makes and owns the data types, one per key: numerical types by name,
// pointers by (target, const), arrays by (element, size), structures by name. demand...
// finds or creates; find... only looks.
#ifndef HUL_PLATFORM_ICODE_KV_DATATYPESERVER_H
#define HUL_PLATFORM_ICODE_KV_DATATYPESERVER_H

#include "platform/icode/KV_DataType.h"

#include <map>
#include <memory>
#include <tuple>
#include <unordered_map>
#include <vector>

class HUL_PLATFORM_API KV_DataTypeServer {
public:
  KV_DataTypeServer();
  ~KV_DataTypeServer();
  KV_DataTypeServer(const KV_DataTypeServer&) = delete;
  KV_DataTypeServer& operator=(const KV_DataTypeServer&) = delete;

  // A numerical type of that name; an existing one of the name is returned only when its
  // width, signedness and floating-ness match, else null.
  KV_NumericalType* demandNumericalType(const WmCXString& name, int bits, bool isSigned,
                                        bool isFloat);
  KV_VoidType* demandVoidType();
  KV_PointerType* demandPointerType(KV_DataType* target, bool toConst);
  KV_ArrayType* demandArrayType(KV_DataType* element, int size);
  KV_StructType* demandStructType(const WmCXString& name);
  KV_DataType* findType(const WmCXString& name) const;

  // The usual base types (made on first demand).
  KV_NumericalType* getInt8() { return demandNumericalType("Int8", 8, true, false); }
  KV_NumericalType* getUInt8() { return demandNumericalType("UInt8", 8, false, false); }
  KV_NumericalType* getInt16() { return demandNumericalType("Int16", 16, true, false); }
  KV_NumericalType* getUInt16() { return demandNumericalType("UInt16", 16, false, false); }
  KV_NumericalType* getInt32() { return demandNumericalType("Int32", 32, true, false); }
  KV_NumericalType* getUInt32() { return demandNumericalType("UInt32", 32, false, false); }
  KV_NumericalType* getFloat32() { return demandNumericalType("Float32", 32, true, true); }
  KV_NumericalType* getFloat64() { return demandNumericalType("Float64", 64, true, true); }
  KV_NumericalType* getBool() { return demandNumericalType("Bool", 8, false, false); }

  int getNumberOfTypes() const { return static_cast<int>(types.size()); }
  KV_DataType* getType(int i) const { return types[static_cast<std::size_t>(i)].get(); }

private:
  template <class T> T* adopt(std::unique_ptr<T> type);

  std::vector<std::unique_ptr<KV_DataType>> types;
  std::unordered_map<WmCXString, KV_DataType*> byName;
  std::map<std::pair<KV_DataType*, bool>, KV_PointerType*> pointers;
  std::map<std::pair<KV_DataType*, int>, KV_ArrayType*> arrays;
  KV_VoidType* voidType = nullptr;
};

#endif
