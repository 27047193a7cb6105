// KvCRoDatabase: the RTOS database of the intermediate view: the RTOS information of the
// target (OS name, data types, counter API), the RTOS objects (alarms, counters, events,
// resources, messages), and the ICode file of the OSEK header in which the RTOS interface
// is declared.
//
// It does not read an RTOS configuration: fixtures describe the RTOS through
// demandRTOSInfo() and the create operations.
#ifndef HUL_PLATFORM_VIEW_KVCRODATABASE_H
#define HUL_PLATFORM_VIEW_KVCRODATABASE_H

#include "platform/support/HulPlatformExport.h"
#include "platform/support/WmCXString.h"

#include <memory>
#include <vector>

class KvCCodeViewData;
class KvCIcFile;
class KvCRoAlarm;
class KvCRoCounter;
class KvCRoEvent;
class KvCRoMessage;
class KvCRoRTOSInfo;
class KvCRoResource;
class KvCSrcRef;

// The database owns its RTOS information and every RTOS object it creates; they live as
// long as the database and nobody else frees them. It does not own the code view data,
// which must outlive every demand of the OSEK header. Neither the code view data nor the
// intermediate view data owns the database: whoever makes it (a fixture) keeps it and
// hands it to them with their setRtosDatabase.
//
// The OSEK header is the file of the code view's file server that has the header's name
// ("osek.h" unless set otherwise); the file server makes it on the first successful
// demand and gives the same file every time after. A fixture can take the header away
// (setOsekHFileAvailable(false)) to see how callers cope, and give it back later. The
// database counts every demand of the header, answered or not, so that tests can check
// that a caller asks only once.
class HUL_PLATFORM_API KvCRoDatabase {
public:
  explicit KvCRoDatabase(KvCCodeViewData* codeView);
  ~KvCRoDatabase();
  KvCRoDatabase(const KvCRoDatabase&) = delete;
  KvCRoDatabase& operator=(const KvCRoDatabase&) = delete;

  // The RTOS information of the target; never null, the same object on every call.
  KvCRoRTOSInfo* demandRTOSInfo();

  // Sets `file` to the ICode file of the OSEK header and answers true. Answers false when
  // the header is not available (or the database has no code view data); `file` is then
  // null (it is reset first in both cases).
  // `srcRef` is the caller's source reference; the file server takes none, so the
  // database does not use it.
  bool demandOsekHFile(KvCIcFile*& file, const KvCSrcRef* srcRef);

  void setOsekHFileAvailable(bool available) { osekHFileAvailable = available; }
  bool isOsekHFileAvailable() const { return osekHFileAvailable; }
  // Later demands give the file of this name (an earlier header file stays in the ICode).
  void setOsekHFileName(const WmCXString& name) { osekHFileName = name; }
  const WmCXString& getOsekHFileName() const { return osekHFileName; }
  // The number of demandOsekHFile calls so far, failed ones included.
  int getNumberOfOsekHFileDemands() const { return osekHFileDemands; }

  // Each call makes a new object of that name (names are not checked for uniqueness).
  KvCRoAlarm* createAlarm(const WmCXString& name);
  KvCRoResource* createResource(const WmCXString& name);
  KvCRoEvent* createEvent(const WmCXString& name);
  KvCRoMessage* createMessage(const WmCXString& name);
  // `tickDuration` in seconds per tick; 0.0 when the configuration does not give it.
  KvCRoCounter* createCounter(const WmCXString& name, double tickDuration);

private:
  KvCCodeViewData* codeView;
  std::unique_ptr<KvCRoRTOSInfo> rtosInfo;
  WmCXString osekHFileName = "osek.h";
  bool osekHFileAvailable = true;
  int osekHFileDemands = 0;
  std::vector<std::unique_ptr<KvCRoAlarm>> alarms;
  std::vector<std::unique_ptr<KvCRoResource>> resources;
  std::vector<std::unique_ptr<KvCRoEvent>> events;
  std::vector<std::unique_ptr<KvCRoMessage>> messages;
  std::vector<std::unique_ptr<KvCRoCounter>> counters;
};

#endif
