// Symbol classes of the ICode: a class says how the code generator places and writes the
// symbols that have it (the function class of a function, the storage class and scope of
// a variable). KvCSmbClass holds what the library reads: the class name, the file into
// which the class puts its symbols, if it names one, and the class's kind (where its
// symbols live). KvCFcnClassId is the handle by which the ICode names a function class;
// it owns the class. KvCSmbClassId is the handle of a symbol class as a whole: it owns its
// KvCSmbClass and stands for a variable class (KvCVarClassId) and a function class
// (KvCFcnClassId), either of which may be missing. All are made and owned by
// KvCSmbClassServer (variable classes by KvCVarClassServer).
//
// A symbol's class (KvCSymbol::getSmbClassId) is the symbol class that its variable class
// (a variable) or function class (a function or macro) stands for: the server links a
// variable or function class to the one symbol class made with it. Setting a symbol's
// variable or function class therefore changes its class.
#ifndef HUL_PLATFORM_ICODE_KVCSMBCLASS_H
#define HUL_PLATFORM_ICODE_KVCSMBCLASS_H

#include "platform/support/HulPlatformExport.h"
#include "platform/support/WmCXString.h"

#include <utility>

class KvCIcFileId;
class KvCSmbClassId;
class KvCVarClassId;

// Where the symbols of a class live and how far their names reach.
enum tagKvESmbClassKind : int {
  KV_SMBCLASS_GLOBAL = 0,        // file scope, external linkage (defined here)
  KV_SMBCLASS_STATIC_GLOBAL = 1, // file scope, internal linkage
  KV_SMBCLASS_STATIC_LOCAL = 2,  // a function's scope, static storage
  KV_SMBCLASS_LOCAL = 3,         // the scope of the block that declares it, automatic storage
  KV_SMBCLASS_EXTERN = 4         // file scope, external linkage, defined outside
};

// The extended state of a symbol's class (KvCSymbol::setExtSmbClassState). The value 0
// (none) is the state of a symbol whose own class says all.
enum tagKvESmbClassState : int {
  KV_SMBCLASS_STATE_NONE = 0,
  // The symbol is also declared through its extern class (KvCSymbol::getExternSmbClass) in
  // files other than its own.
  KV_SMBCLASS_STATE_EXTERN_DECLARED = 1,
  // The symbol's definition comes from outside the generated code (its class is kept for
  // the declarations only).
  KV_SMBCLASS_STATE_IMPORTED = 2
};

class HUL_PLATFORM_API KvCSmbClass {
public:
  KvCSmbClass(WmCXString className, KvCIcFileId* classFile,
              tagKvESmbClassKind classKind = KV_SMBCLASS_GLOBAL)
      : name(std::move(className)), file(classFile), kind(classKind) {}
  KvCSmbClass(const KvCSmbClass&) = delete;
  KvCSmbClass& operator=(const KvCSmbClass&) = delete;

  const WmCXString& getName() const { return name; }
  // The file the class puts its symbols into, or null when the class names none.
  KvCIcFileId* getFile() const { return file; }
  tagKvESmbClassKind getKind() const { return kind; }
  // Whether the class's symbols live in the scope of the block that declares them (local
  // variables with automatic storage; KV_SMBCLASS_LOCAL).
  bool isScopeLocal() const { return kind == KV_SMBCLASS_LOCAL; }

private:
  WmCXString name;
  KvCIcFileId* file;
  tagKvESmbClassKind kind;
};

class HUL_PLATFORM_API KvCFcnClassId {
public:
  KvCFcnClassId(WmCXString className, KvCIcFileId* classFile)
      : fcnClass(std::move(className), classFile) {}
  KvCFcnClassId(const KvCFcnClassId&) = delete;
  KvCFcnClassId& operator=(const KvCFcnClassId&) = delete;

  KvCSmbClass* getFcnClass() { return &fcnClass; }
  // The symbol class this function class stands for, or null (a function class made
  // without one).
  KvCSmbClassId* getSmbClassId() const { return smbClassId; }

private:
  friend class KvCSmbClassServer; // links the class to its symbol class

  KvCSmbClass fcnClass;
  KvCSmbClassId* smbClassId = nullptr;
};

class HUL_PLATFORM_API KvCSmbClassId {
public:
  KvCSmbClassId(WmCXString className, tagKvESmbClassKind kind, KvCVarClassId* varClassId,
                KvCFcnClassId* fcnClassId)
      : smbClass(std::move(className), nullptr, kind), varClass(varClassId), fcnClass(fcnClassId) {}
  virtual ~KvCSmbClassId() = default;
  KvCSmbClassId(const KvCSmbClassId&) = delete;
  KvCSmbClassId& operator=(const KvCSmbClassId&) = delete;

  // The class itself (name, kind); owned by this handle.
  virtual KvCSmbClass* getSmbClass() { return &smbClass; }
  // The variable class and the function class this class stands for; either may be null.
  virtual KvCVarClassId* getVarClassId() const { return varClass; }
  virtual KvCFcnClassId* getFcnClassId() const { return fcnClass; }

private:
  KvCSmbClass smbClass;
  KvCVarClassId* varClass;
  KvCFcnClassId* fcnClass;
};

#endif
