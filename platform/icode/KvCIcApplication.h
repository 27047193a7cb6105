// The application tree of the ICode: the application, its sub-applications, their code
// units and the files of each code unit. The three classes form one family and are kept
// together here. All are owned by the code view data; the lists keep creation order.
//
// Upward links: a file knows its code unit (KvCIcFile::getCodeUnit, set by addFile) and a
// code unit its sub-application (getSubAppl, set by addCodeUnit); both are null until the
// file or unit is added. A sub-application owns its potential-globals name space: the
// names that are or may become global in its link, which no file scope symbol of its
// files may take for another object.
#ifndef HUL_PLATFORM_ICODE_KVCICAPPLICATION_H
#define HUL_PLATFORM_ICODE_KVCICAPPLICATION_H

#include "platform/support/HulPlatformExport.h"
#include "platform/support/KvCNameSpace.h"
#include "platform/support/WmCXString.h"

#include <vector>

class KvCIcFileId;
class KvCIcSubAppl;

class HUL_PLATFORM_API KvCIcCodeUnit {
public:
  explicit KvCIcCodeUnit(WmCXString unitName) : name(std::move(unitName)) {}
  const WmCXString& getName() const { return name; }
  const std::vector<KvCIcFileId*>& getFiles() const { return files; }
  // A file belongs to one code unit; false if it is listed here already. The file's code
  // unit becomes this one.
  bool addFile(KvCIcFileId* file);
  // The sub-application the unit was added to, or null.
  KvCIcSubAppl* getSubAppl() const { return subAppl; }

private:
  friend class KvCIcSubAppl; // sets the upward link

  WmCXString name;
  std::vector<KvCIcFileId*> files;
  KvCIcSubAppl* subAppl = nullptr;
};

class HUL_PLATFORM_API KvCIcSubAppl {
public:
  explicit KvCIcSubAppl(WmCXString subName) : name(std::move(subName)) {}
  const WmCXString& getName() const { return name; }
  const std::vector<KvCIcCodeUnit*>& getCodeUnits() const { return codeUnits; }
  // The unit's sub-application becomes this one.
  void addCodeUnit(KvCIcCodeUnit* unit) {
    codeUnits.push_back(unit);
    if (unit)
      unit->subAppl = this;
  }
  // The names that are or may become global in the sub-application's link; never null.
  KvCNameSpace* getPotentialGlobalsNameSpace() { return &potentialGlobals; }

private:
  WmCXString name;
  std::vector<KvCIcCodeUnit*> codeUnits;
  KvCNameSpace potentialGlobals;
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
