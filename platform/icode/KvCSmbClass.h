// Symbol classes of the ICode: a class says how the code generator places and writes the
// symbols that have it (the function class of a function, for example). KvCSmbClass holds
// what the servers of this library read: the class name and the file into which the
// class puts its symbols, if it names one. KvCFcnClassId is the handle by which the ICode
// names a function class; it owns the class. Both are made and owned by
// KvCSmbClassServer.
#ifndef HUL_PLATFORM_ICODE_KVCSMBCLASS_H
#define HUL_PLATFORM_ICODE_KVCSMBCLASS_H

#include "platform/support/HulPlatformExport.h"
#include "platform/support/WmCXString.h"

#include <utility>

class KvCIcFileId;

class HUL_PLATFORM_API KvCSmbClass {
public:
  KvCSmbClass(WmCXString className, KvCIcFileId* classFile)
      : name(std::move(className)), file(classFile) {}
  KvCSmbClass(const KvCSmbClass&) = delete;
  KvCSmbClass& operator=(const KvCSmbClass&) = delete;

  const WmCXString& getName() const { return name; }
  // The file the class puts its symbols into, or null when the class names none.
  KvCIcFileId* getFile() const { return file; }

private:
  WmCXString name;
  KvCIcFileId* file;
};

class HUL_PLATFORM_API KvCFcnClassId {
public:
  KvCFcnClassId(WmCXString className, KvCIcFileId* classFile)
      : fcnClass(std::move(className), classFile) {}
  KvCFcnClassId(const KvCFcnClassId&) = delete;
  KvCFcnClassId& operator=(const KvCFcnClassId&) = delete;

  KvCSmbClass* getFcnClass() { return &fcnClass; }

private:
  KvCSmbClass fcnClass;
};

#endif
