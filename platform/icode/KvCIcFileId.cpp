#include "platform/icode/KvCIcFileId.h"

#include "platform/icode/KvCExprLocDB.h"
#include "platform/icode/KvCIcApplication.h"

#include <algorithm>

KvCIcFileId::KvCIcFileId(int id, WmCXString fileName)
    : fileNumber(id), name(std::move(fileName)), file(this) {}

KvCIcFileId::~KvCIcFileId() = default;

KvCExprLocDB* KvCIcFileId::getExprLocDB() {
  if (!db)
    db = std::make_unique<KvCExprLocDB>();
  return db.get();
}

bool KvCIcCodeUnit::addFile(KvCIcFileId* file) {
  if (!file || std::find(files.begin(), files.end(), file) != files.end())
    return false;
  files.push_back(file);
  file->getFile()->codeUnit = this;
  return true;
}
