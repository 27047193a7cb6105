// KvCIcFileServer: makes and owns the file ids, one per name, each with its top-level
// statement table (a C statement table whose file is the new file). Files keep creation
// order.
#ifndef HUL_PLATFORM_ICODE_KVCICFILESERVER_H
#define HUL_PLATFORM_ICODE_KVCICFILESERVER_H

#include "platform/icode/KvCIcFileId.h"

#include <memory>
#include <unordered_map>
#include <vector>

class KvCCodeViewData;

class HUL_PLATFORM_API KvCIcFileServer {
public:
  explicit KvCIcFileServer(KvCCodeViewData* owner) : codeViewData(owner) {}
  ~KvCIcFileServer();
  KvCIcFileServer(const KvCIcFileServer&) = delete;
  KvCIcFileServer& operator=(const KvCIcFileServer&) = delete;

  KvCIcFileId* demandFile(const WmCXString& name);
  KvCIcFileId* findFile(const WmCXString& name) const;
  int getNumberOfFiles() const { return static_cast<int>(files.size()); }
  KvCIcFileId* getFile(int i) const { return files[static_cast<std::size_t>(i)].get(); }

private:
  KvCCodeViewData* codeViewData;
  std::vector<std::unique_ptr<KvCIcFileId>> files;
  std::unordered_map<WmCXString, KvCIcFileId*> byName;
};

#endif
