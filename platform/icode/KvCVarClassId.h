// KvCVarClassId: a variable class of the ICode: how generated code stores and declares
// the variables of that class. An extern class's variables are only declared by the code
// generator (their definition lives outside the generated code); a global class's
// variables have file scope and external linkage.
//
// Classes are made and owned by KvCVarClassServer, one per name; they never change, except
// that the symbol class server links a class to the one symbol class (KvCSmbClassId) that
// stands for it.
#ifndef HUL_PLATFORM_ICODE_KVCVARCLASSID_H
#define HUL_PLATFORM_ICODE_KVCVARCLASSID_H

#include "platform/support/HulPlatformExport.h"
#include "platform/support/WmCXString.h"

#include <utility>

class KvCSmbClassId;

class HUL_PLATFORM_API KvCVarClassId {
public:
  KvCVarClassId(WmCXString className, bool externClass, bool globalClass)
      : name(std::move(className)), isExternClass(externClass), isGlobalClass(globalClass) {}
  KvCVarClassId(const KvCVarClassId&) = delete;
  KvCVarClassId& operator=(const KvCVarClassId&) = delete;

  const WmCXString& getName() const { return name; }
  bool isExtern() const { return isExternClass; }
  bool isGlobal() const { return isGlobalClass; }
  // The symbol class this variable class stands for, or null.
  KvCSmbClassId* getSmbClassId() const { return smbClassId; }

private:
  friend class KvCSmbClassServer; // links the class to its symbol class

  KvCSmbClassId* smbClassId = nullptr;
  WmCXString name;
  bool isExternClass;
  bool isGlobalClass;
};

#endif
