// The application tree of the ICode: the application, its sub-applications, their code
// units and the files of each code unit. The three classes form one family and are kept
// together here. All are owned by the code view data; the lists keep creation order.
#ifndef HUL_PLATFORM_ICODE_KVCICAPPLICATION_H
#define HUL_PLATFORM_ICODE_KVCICAPPLICATION_H

#include "platform/support/HulPlatformExport.h"
#include "platform/support/WmCXString.h"

#include <vector>

class KvCIcFileId;

class HUL_PLATFORM_API KvCIcCodeUnit {
public:
  explicit KvCIcCodeUnit(WmCXString unitName) : name(std::move(unitName)) {}
  const WmCXString& getName() const { return name; }
  const std::vector<KvCIcFileId*>& getFiles() const { return files; }
  // A file belongs to one code unit; false if it is listed here already.
  bool addFile(KvCIcFileId* file);

private:
  WmCXString name;
  std::vector<KvCIcFileId*> files;
};

class HUL_PLATFORM_API KvCIcSubAppl {
public:
  explicit KvCIcSubAppl(WmCXString subName) : name(std::move(subName)) {}
  const WmCXString& getName() const { return name; }
  const std::vector<KvCIcCodeUnit*>& getCodeUnits() const { return codeUnits; }
  void addCodeUnit(KvCIcCodeUnit* unit) { codeUnits.push_back(unit); }

private:
  WmCXString name;
  std::vector<KvCIcCodeUnit*> codeUnits;
};

class HUL_PLATFORM_API KvCIcApplication {
public:
  explicit KvCIcApplication(WmCXString appName) : name(std::move(appName)) {}
  const WmCXString& getName() const { return name; }
  const std::vector<KvCIcSubAppl*>& getSubApplications() const { return subApplications; }
  void addSubApplication(KvCIcSubAppl* sub) { subApplications.push_back(sub); }

private:
  WmCXString name;
  std::vector<KvCIcSubAppl*> subApplications;
};

#endif
