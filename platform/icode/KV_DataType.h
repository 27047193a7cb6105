// The data types of the ICode: KV_DataType and its kinds, numerical types (integers and
// floating point), pointers, structures and arrays. The classes form one family and are
// kept together here.
//
// Types are made and owned by KV_DataTypeServer, which keeps one type per key: two
// pointers to equal keys are the same object. A numerical type may exist under several
// names (a base type and its typedefs): isEqualType compares structure (width,
// signedness, pointed-to and element types), isEqualTypeRef compares identity.
//
// A named type is a typedef of another type, its base type (getBaseType): a named numerical
// type has its base's width and signedness, a named pointer points where its base pointer
// points. A Data Dictionary type is a named type that the Data Dictionary specifies; it may
// have no base type. Base types (Int8, UInt8, ..., Float64, Bool), unnamed pointers,
// arrays, structures and void have no base type: getBaseType answers null for them.
// isSameType compares identity after following base types to the end of the chain, so a
// named type is the same type as its base; isEqualType compares structure.
//
// The servers set what makes a type named when they make it (base type, description,
// dimensions, flags, source reference); afterwards only the module file (set when a file
// defines the type) and the use-name-for-casts mark change.
//
// Each type owns its expression-location database, made on first demand.
#ifndef HUL_PLATFORM_ICODE_KV_DATATYPE_H
#define HUL_PLATFORM_ICODE_KV_DATATYPE_H

#include "platform/icode/KV_DimensionDescriptor.h"
#include "platform/support/HulPlatformExport.h"
#include "platform/support/WmCXString.h"

#include <cstdint>
#include <deque>
#include <memory>
#include <vector>

class KV_ArrayType;
class KV_NumericalType;
class KV_PointerType;
class KV_StructType;
class KvCExprLocDB;
class KvCIcFileId;
class KvCSrcRef;
class KvCUnparamSymbol;

enum tagKvEDataTypeKind {
  KV_TYPE_VOID,
  KV_TYPE_NUMERICAL,
  KV_TYPE_POINTER,
  KV_TYPE_STRUCT,
  KV_TYPE_ARRAY
};

class HUL_PLATFORM_API KV_DataType {
public:
  virtual ~KV_DataType();
  KV_DataType(const KV_DataType&) = delete;
  KV_DataType& operator=(const KV_DataType&) = delete;

  const WmCXString& getName() const { return name; }
  tagKvEDataTypeKind getTypeKind() const { return kind; }
  // Creation order within the type server.
  int getTypeId() const { return typeId; }

  virtual KV_NumericalType* asNumericalType() { return nullptr; }
  KV_NumericalType* getNumericalType() { return asNumericalType(); }
  virtual KV_PointerType* asPointerType() { return nullptr; }
  virtual KV_StructType* asStructType() { return nullptr; }
  virtual KV_ArrayType* asArrayType() { return nullptr; }
  virtual bool isFloat() const { return false; }

  // The kind predicates the Data Dictionary's base-type vocabulary rests on. A kind answered
  // by an as...Type predicate gives the type itself when it is of that kind, else null:
  // kind 15 is void, kind 9 a pointer, kind 12 a structure; kinds 13 and 14 (unions and
  // enumerations) are kinds this model does not make, so it answers null for them. Kind 10
  // is the boolean: the type, followed through its base types, is the base type "Bool".
  KV_DataType* asKind15Type() { return kind == KV_TYPE_VOID ? this : nullptr; }
  KV_DataType* asKind9Type() { return kind == KV_TYPE_POINTER ? this : nullptr; }
  KV_DataType* asKind12Type() { return kind == KV_TYPE_STRUCT ? this : nullptr; }
  KV_DataType* asKind13Type() { return nullptr; }
  KV_DataType* asKind14Type() { return nullptr; }
  bool isKind10() const;

  bool isEqualType(KV_DataType* other) const;
  bool isEqualTypeRef(KV_DataType* other) const { return this == other; }

  // The type this named type is made from, or null for a type that is not made from
  // another (base types among them).
  virtual KV_DataType* getBaseType() const { return naming.base; }
  // The type a derived (named) type is defined from, at the end of its base-type chain;
  // the type itself for a type that is not made from another (structures, arrays, base
  // types). Never null.
  KV_DataType* getSourceType();
  // Whether both are the same type once each is followed through its base types to the
  // end of the chain. False for null.
  virtual bool isSameType(KV_DataType* other) const;
  // False for arrays and for named types with dimensions.
  virtual bool isScalar() const { return naming.dims.isScalar(); }
  // Whether the type's name is written as a typedef where the type is defined; without it
  // C code spells the type out instead of using the name.
  virtual bool isCreateTypedef() const { return naming.createTypedef; }
  // The file whose header defines the type, or null: set by KvCIcFile::defineType, or by
  // the Data Dictionary for its types.
  virtual KvCIcFileId* getModuleFileId() const { return moduleFile; }
  // Where a named type was made, or null (for types made without a caller's reference:
  // base types, void, unnamed pointers, arrays, structures).
  virtual const KvCSrcRef* getSrcRef() const { return naming.srcRef; }
  // The description of a named type; empty for other types.
  const WmCXString& getDescription() const { return naming.description; }
  // The dimensions of a named type (scalar for other types).
  const KV_DimensionDescriptor& getDimensions() const { return naming.dims; }
  bool isDataDictionaryType() const { return naming.dataDictionary; }
  // Whether the type belongs to the RTOS interface (its name and meaning are the RTOS's).
  bool isRtosType() const { return naming.rtosType; }
  // Whether casts to this type are written with its name rather than its base type.
  bool isUseNameForCasts() const { return useNameForCasts; }
  void setUseNameForCasts(bool value) { useNameForCasts = value; }

  KvCExprLocDB* getExprLocDB();
  // The database if it was made already, else null (no creation).
  KvCExprLocDB* findExprLocDB() const { return db.get(); }

  // What makes a type named; given once, by the type servers, when they make the type.
  struct Naming {
    KV_DataType* base = nullptr;
    WmCXString description;
    KV_DimensionDescriptor dims;
    bool createTypedef = false;
    bool dataDictionary = false;
    bool rtosType = false;
    const KvCSrcRef* srcRef = nullptr;
  };

protected:
  KV_DataType(int id, tagKvEDataTypeKind k, WmCXString typeName);
  virtual bool hasEqualStructure(const KV_DataType& other) const = 0;

private:
  friend class KV_DataTypeServer; // names the types it makes
  friend class KvCIcFile;         // records the file that defines the type

  int typeId;
  tagKvEDataTypeKind kind;
  WmCXString name;
  std::unique_ptr<KvCExprLocDB> db;
  Naming naming;
  KvCIcFileId* moduleFile = nullptr;
  bool useNameForCasts = false;
};

// Void, and the undefined type: the type of an object whose type the code generator does not
// fix (the arguments of a macro call, which the preprocessor pastes as text). The undefined
// type is of the void kind, but a type of its own, distinct from void.
class HUL_PLATFORM_API KV_VoidType : public KV_DataType {
public:
  KV_VoidType(int id, WmCXString typeName, bool undefinedType = false)
      : KV_DataType(id, KV_TYPE_VOID, std::move(typeName)), undefined(undefinedType) {}

  bool isUndefinedType() const { return undefined; }

protected:
  // Void equals void; the undefined type only itself.
  bool hasEqualStructure(const KV_DataType& other) const override {
    return !undefined && !static_cast<const KV_VoidType&>(other).undefined;
  }

private:
  bool undefined;
};

class HUL_PLATFORM_API KV_NumericalType : public KV_DataType {
public:
  KV_NumericalType(int id, WmCXString typeName, int bitWidth, bool signedType, bool floatType);

  KV_NumericalType* asNumericalType() override { return this; }
  bool isFloat() const override { return floating; }
  int getBits() const { return bits; }
  bool isSigned() const { return isSignedType; }

  // The numerical type at the end of this type's base-type chain (the type itself when it
  // is not made from another numerical type).
  KV_NumericalType* getNumBaseType();
  // The base-type kinds of a numerical base type: 1 to 6 the signed and unsigned 8, 16 and
  // 32 bit integers (in that order, signed first), 7 and 8 the 32 and 64 bit floating-point
  // types, 16 the signed and 17 the unsigned 64 bit integer. The boolean base type "Bool"
  // is of none of these kinds. Other widths are of no kind.
  bool isKind1() const { return isInteger(8, true); }
  bool isKind2() const { return isInteger(8, false); }
  bool isKind3() const { return isInteger(16, true); }
  bool isKind4() const { return isInteger(16, false); }
  bool isKind5() const { return isInteger(32, true); }
  bool isKind6() const { return isInteger(32, false); }
  bool isKind7() const { return floating && bits == 32; }
  bool isKind8() const { return floating && bits == 64; }
  bool isKind16() const { return isInteger(64, true); }
  bool isKind17() const { return isInteger(64, false); }
  // Whether this is the boolean base type "Bool".
  bool isBooleanBaseType() const;
  // Whether the code generator keeps its range handling (saturation, rounding of limits)
  // off this type; set per type by the code generator.
  bool isExemptFromRangeHandling() const { return exempt; }
  void setExemptFromRangeHandling(bool value) { exempt = value; }
  // The limits of an integer type (0 for floating-point types).
  std::int64_t getMinValue() const;
  std::int64_t getMaxValue() const;

protected:
  bool hasEqualStructure(const KV_DataType& other) const override;

private:
  bool isInteger(int width, bool signedness) const {
    return !floating && bits == width && isSignedType == signedness && !isBooleanBaseType();
  }

  int bits;
  bool isSignedType;
  bool floating;
  bool exempt = false;
};

class HUL_PLATFORM_API KV_PointerType : public KV_DataType {
public:
  KV_PointerType(int id, WmCXString typeName, KV_DataType* target, bool toConst);

  KV_PointerType* asPointerType() override { return this; }
  KV_DataType* getTargetType() const { return targetType; }
  bool isPointerToConst() const { return pointerToConst; }

protected:
  bool hasEqualStructure(const KV_DataType& other) const override;

private:
  KV_DataType* targetType;
  bool pointerToConst;
};

// The declaration of one component in a structure type: its name, its type and the
// symbol that declares it (a free component symbol carrying the specifiers written in the
// declaration: const, volatile, address qualifier), or null when none was made
// (KV_SymbolDB::demandComponentDeclSymbol makes it). Owned by its structure type; its
// address stays the same for the type's life.
class HUL_PLATFORM_API KV_ComponentDeclaration {
public:
  KV_ComponentDeclaration(WmCXString componentName, KV_DataType* componentType)
      : name(std::move(componentName)), type(componentType) {}

  const WmCXString& getName() const { return name; }
  KV_DataType* getType() const { return type; }
  KvCUnparamSymbol* getComponentSymbol() const { return symbol; }
  void setComponentSymbol(KvCUnparamSymbol* declaring) { symbol = declaring; }

  WmCXString name;
  KV_DataType* type;

private:
  KvCUnparamSymbol* symbol = nullptr;
};

class HUL_PLATFORM_API KV_StructType : public KV_DataType {
public:
  using Component = KV_ComponentDeclaration;

  KV_StructType(int id, WmCXString typeName)
      : KV_DataType(id, KV_TYPE_STRUCT, std::move(typeName)) {}

  KV_StructType* asStructType() override { return this; }
  void addComponent(const WmCXString& componentName, KV_DataType* type);
  int getNumberOfComponents() const { return static_cast<int>(components.size()); }
  const Component& getComponent(int i) const { return components[static_cast<std::size_t>(i)]; }
  Component& getComponent(int i) { return components[static_cast<std::size_t>(i)]; }
  // The declaration of the named component, or null. O(components).
  KV_ComponentDeclaration* getComponent(const WmCXString& componentName);
  // The type of the named component, or null.
  KV_DataType* findComponentType(const WmCXString& componentName) const;

protected:
  // A structure equals only itself.
  bool hasEqualStructure(const KV_DataType&) const override { return false; }

private:
  // A deque: declarations keep their addresses as components are added.
  std::deque<Component> components;
};

class HUL_PLATFORM_API KV_ArrayType : public KV_DataType {
public:
  KV_ArrayType(int id, WmCXString typeName, KV_DataType* element, int elementCount);

  KV_ArrayType* asArrayType() override { return this; }
  bool isScalar() const override { return false; }
  KV_DataType* getElementType() const { return elementType; }
  int getSize() const { return size; }

protected:
  bool hasEqualStructure(const KV_DataType& other) const override;

private:
  KV_DataType* elementType;
  int size;
};

#endif
