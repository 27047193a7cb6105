// KvCApplicationServer: the application tree's server: it hands out the sub-application
// that holds the user's code (demandUserSubAppl) and the C files the code generator owns
// in a sub-application (demandCgOwnedCFile). Owned by the code view data.
//
// A C file demanded here is made by the file server under the given name and put into a
// code unit of the sub-application named like the file; a name ending in ".c" also gets
// its header (the same name ending in ".h") as complementary file. The file remembers the
// source reference of its first demand. Fixtures can make the file demand fail
// (setCgOwnedCFileFails); the server counts the file demands.
#ifndef HUL_PLATFORM_ICODE_KVCAPPLICATIONSERVER_H
#define HUL_PLATFORM_ICODE_KVCAPPLICATIONSERVER_H

#include "platform/support/HulPlatformExport.h"
#include "platform/support/WmCXString.h"

#include <unordered_map>

class KvCCodeViewData;
class KvCIcCodeUnit;
class KvCIcFileId;
class KvCIcSubAppl;
class KvCSrcRef;

class HUL_PLATFORM_API KvCApplicationServer {
public:
  explicit KvCApplicationServer(KvCCodeViewData* owner) : codeViewData(owner) {}
  KvCApplicationServer(const KvCApplicationServer&) = delete;
  KvCApplicationServer& operator=(const KvCApplicationServer&) = delete;

  // The user sub-application ("user"), made on first demand; never null.
  KvCIcSubAppl* demandUserSubAppl(const KvCSrcRef* srcRef);
  // Sets `file` (reset first) to the C file `fileName` of `subAppl`, made on first demand,
  // and answers true. False, `file` null, for a null sub-application, an empty name, or
  // while the fixture makes the demand fail.
  bool demandCgOwnedCFile(KvCIcSubAppl* subAppl, const WmCXString& fileName,
                          const KvCSrcRef* srcRef, KvCIcFileId*& file);

  void setCgOwnedCFileFails(bool fails) { cFileFails = fails; }
  // The number of demandCgOwnedCFile calls so far, failed ones included.
  int getNumberOfCgOwnedCFileDemands() const { return cFileDemands; }

private:
  KvCCodeViewData* codeViewData;
  KvCIcSubAppl* userSubAppl = nullptr;
  std::unordered_map<WmCXString, KvCIcCodeUnit*> unitsByFile;
  bool cFileFails = false;
  int cFileDemands = 0;
};

#endif
