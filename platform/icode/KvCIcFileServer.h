// KvCIcFileServer: makes and owns the file ids, one per name, each with its top-level
// statement table (a C statement table whose file is the new file). Files keep creation
// order.
//
// Two file pairs have fixed roles: the root files ("root.h", "root.c") and the Acme files
// ("acme.h", "acme.c"). A pair is a header and a C file that name each other as
// complementary file; it is made on first demand and is the same pair on every demand.
// Fixtures can make either demand fail (setRootFilesUnavailable,
// setAcmeFilesUnavailable).
//
// Two single files serve the Ecp tools: the access-point header ("ecp_ap.h"), which
// defines the access-point macros, and the ECU service file ("wmecu.h"), which declares
// the ECU service function. Each is made on first demand and is the same file on every
// demand; fixtures can make either demand fail (setApHeaderFileUnavailable,
// setEcuServiceFileUnavailable).
#ifndef HUL_PLATFORM_ICODE_KVCICFILESERVER_H
#define HUL_PLATFORM_ICODE_KVCICFILESERVER_H

#include "platform/icode/KvCIcFileId.h"

#include <memory>
#include <unordered_map>
#include <vector>

class KvCCodeViewData;
class KvCSrcRef;

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

  // The root file pair: true with the header and the C file, or false with both null when
  // the pair is not available. `srcRef` is the caller's and is not kept.
  bool demandRootFiles(KvCIcFileId*& headerFile, KvCIcFileId*& cFile, const KvCSrcRef* srcRef);
  // The Acme file pair, as demandRootFiles.
  bool demandAcmeFiles(KvCIcFileId*& headerFile, KvCIcFileId*& cFile, const KvCSrcRef* srcRef);
  // Fixture switches: while set, the demand of that pair fails.
  void setRootFilesUnavailable(bool unavailable) { rootFilesUnavailable = unavailable; }
  void setAcmeFilesUnavailable(bool unavailable) { acmeFilesUnavailable = unavailable; }

  // The access-point header, or null when it is not available. `srcRef` is not kept.
  KvCIcFileId* demandApHeaderFile(const KvCSrcRef* srcRef);
  // The ECU service file: true with the file, or false with null when it is not
  // available. `srcRef` is not kept.
  bool demandEcuServiceFile(KvCIcFileId*& file, const KvCSrcRef* srcRef);
  // Fixture switches: while set, the demand of that file fails.
  void setApHeaderFileUnavailable(bool unavailable) { apHeaderUnavailable = unavailable; }
  void setEcuServiceFileUnavailable(bool unavailable) { ecuServiceUnavailable = unavailable; }

private:
  bool demandPair(const WmCXString& headerName, const WmCXString& cName, bool unavailable,
                  KvCIcFileId*& headerFile, KvCIcFileId*& cFile);

  KvCCodeViewData* codeViewData;
  std::vector<std::unique_ptr<KvCIcFileId>> files;
  std::unordered_map<WmCXString, KvCIcFileId*> byName;
  bool rootFilesUnavailable = false;
  bool acmeFilesUnavailable = false;
  bool apHeaderUnavailable = false;
  bool ecuServiceUnavailable = false;
};

#endif
