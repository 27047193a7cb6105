#include "platform/icode/KvCIcFile.h"

#include "platform/icode/KV_DataType.h"
#include "platform/icode/KvCIcFileId.h"

bool KvCIcFile::defineType(KV_DataType* type, const KvCSrcRef* /*srcRef*/, bool append) {
  if (defineTypeFails || !type)
    return false;
  if (isTypeDefined(type))
    return true;
  KvCIcFileId* module = type->getModuleFileId();
  if (module && module != fileId && module->getFile()->isTypeDefined(type))
    return false;
  if (append)
    definedTypes.push_back(type);
  else
    definedTypes.insert(definedTypes.begin(), type);
  definedSet.insert(type);
  type->moduleFile = fileId;
  return true;
}

bool KvCIcFile::isHeaderFile() const {
  const std::string& name = fileId->getName().str();
  return name.size() >= 2 && name.compare(name.size() - 2, 2, ".h") == 0;
}
