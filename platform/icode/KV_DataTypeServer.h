// KV_DataTypeServer: makes and owns the data types, one per key: numerical types by name,
// pointers by (target, const), arrays by (element, size), structures by name. demand...
// finds or creates; find... only looks.
//
// Named types (typedefs and Data Dictionary types) share one name space with the base
// types and structures: a name stands for one type. The numerical type server and the
// pointer type server (owned here, getPointerServer) make the named typedefs through this
// server; the Data Dictionary's types are entered by registerDataDictionaryType (fixtures
// play the Data Dictionary).
//
// The base types (Int8, UInt8, Int16, UInt16, Int32, UInt32, Float32, Float64, Bool) exist
// for every run: they are made on first demand, also by a lookup of their name.
#ifndef HUL_PLATFORM_ICODE_KV_DATATYPESERVER_H
#define HUL_PLATFORM_ICODE_KV_DATATYPESERVER_H

#include "platform/icode/KV_DataType.h"
#include "platform/icode/KV_DimensionDescriptor.h"

#include <map>
#include <memory>
#include <tuple>
#include <unordered_map>
#include <vector>

class KV_PointerTypeServer;
class KvCIcFileId;
class KvCSrcRef;

class KV_SymbolDB;

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
  // The undefined type of the run (see KV_VoidType), made on first demand. It has no name
  // in the type name space: findType never answers it.
  KV_VoidType* demandUndefinedType();
  KV_PointerType* demandPointerType(KV_DataType* target, bool toConst);
  KV_ArrayType* demandArrayType(KV_DataType* element, int size);
  KV_StructType* demandStructType(const WmCXString& name);
  KV_DataType* findType(const WmCXString& name) const;
  // The symbol database whose names named types must not take (a typedef and a variable
  // of one name would not be C); not owned. Without one, only type names are checked.
  void setSymbolDB(const KV_SymbolDB* symbols) { symbolDB = symbols; }

  // The server of pointer types, the one of the run.
  KV_PointerTypeServer* getPointerServer() { return pointerServer.get(); }

  // The type of that name (a base type is made if it was not yet), or null when no type
  // has that name. `srcRef` is the caller's; a lookup records nothing.
  KV_DataType* findTypeByName(const WmCXString& name, const KvCSrcRef* srcRef);
  // With `fromDataDictionary`, the Data Dictionary type of that name, else the type of that
  // name that is not a Data Dictionary type (a base type is made if it was not yet); null
  // when there is none. A name identifies one type, so the dimensions take no part in the
  // lookup: `dims` is set to the found type's dimensions, and left as it was on null.
  KV_DataType* findTypeByName(const WmCXString& name, KV_DimensionDescriptor& dims,
                              const KvCSrcRef* srcRef, bool fromDataDictionary);
  // The base type of that name, made on first demand; null for a name that is not one of
  // the base types.
  KV_NumericalType* demandBaseType(const WmCXString& name);

  // Enters a type of the Data Dictionary: a numerical type named `name` made from
  // `baseType` (a numerical type; its width and signedness are taken), with the given
  // dimensions, typedef flag, module file (may be null) and source reference. Without base
  // type the Data Dictionary type is a base type of its own, a signed 32-bit integer.
  // Null, and nothing entered, for an empty or taken name or a base type that is not
  // numerical.
  KV_NumericalType* registerDataDictionaryType(const WmCXString& name, KV_DataType* baseType,
                                               const KV_DimensionDescriptor& dims,
                                               bool createTypedef, KvCIcFileId* module,
                                               const KvCSrcRef* srcRef);
  // The same; a type that is not `scalar` has one dimension of two elements.
  KV_NumericalType* registerDataDictionaryType(const WmCXString& name, KV_DataType* baseType,
                                               bool scalar, bool createTypedef, KvCIcFileId* module,
                                               const KvCSrcRef* srcRef);

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
  const KV_SymbolDB* symbolDB = nullptr;
  // The numerical and pointer type servers make named types through adoptNamed.
  friend class KV_NumericalTypeServer;
  friend class KV_PointerTypeServer;

  template <class T> T* adopt(std::unique_ptr<T> type);
  // Takes a new named type under its name with its naming; null (and the type dropped)
  // when the name is taken.
  template <class T> T* adoptNamed(std::unique_ptr<T> type, KV_DataType::Naming naming);
  int nextTypeId() const { return getNumberOfTypes(); }

  std::vector<std::unique_ptr<KV_DataType>> types;
  std::unordered_map<WmCXString, KV_DataType*> byName;
  std::map<std::pair<KV_DataType*, bool>, KV_PointerType*> pointers;
  std::map<std::pair<KV_DataType*, int>, KV_ArrayType*> arrays;
  KV_VoidType* voidType = nullptr;
  KV_VoidType* undefinedType = nullptr;
  std::unique_ptr<KV_PointerTypeServer> pointerServer;
};

#endif
