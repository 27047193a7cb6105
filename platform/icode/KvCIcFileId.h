// KvCIcFileId: the handle by which the ICode names a file. It owns the file's properties
// and the file's expression-location database (made on first demand). File ids are made
// and owned by KvCIcFileServer, one per name.
#ifndef HUL_PLATFORM_ICODE_KVCICFILEID_H
#define HUL_PLATFORM_ICODE_KVCICFILEID_H

#include "platform/icode/KvCIcFile.h"
#include "platform/support/WmCXString.h"

#include <memory>

class KvCExprLocDB;

class HUL_PLATFORM_API KvCIcFileId {
public:
  KvCIcFileId(int id, WmCXString fileName);
  ~KvCIcFileId();
  KvCIcFileId(const KvCIcFileId&) = delete;
  KvCIcFileId& operator=(const KvCIcFileId&) = delete;

  const WmCXString& getName() const { return name; }
  int getFileNumber() const { return fileNumber; }
  KvCIcFile* getFile() { return &file; }
  const KvCIcFile* getFile() const { return &file; }

  KvCExprLocDB* getExprLocDB();
  KvCExprLocDB* findExprLocDB() const { return db.get(); }

private:
  int fileNumber;
  WmCXString name;
  KvCIcFile file;
  std::unique_ptr<KvCExprLocDB> db;
};

#endif
