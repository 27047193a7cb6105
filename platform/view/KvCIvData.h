// KvCIvData: the root of the intermediate view (the model's partitions and the RTOS
// database). The partitions come with the subsystems that walk them.
//
// It does not own the RTOS database: whoever makes the database (a fixture) keeps it and
// sets it here; it must outlive every use through this object.
#ifndef HUL_PLATFORM_VIEW_KVCIVDATA_H
#define HUL_PLATFORM_VIEW_KVCIVDATA_H

#include "platform/support/HulPlatformExport.h"

class KV_BdPartition;
class KvCRoDatabase;

class HUL_PLATFORM_API KvCIvData {
public:
  KvCIvData() = default;
  KvCIvData(const KvCIvData&) = delete;
  KvCIvData& operator=(const KvCIvData&) = delete;

  // The root partition of the view; none yet.
  KV_BdPartition* getIvRootPartition() const { return nullptr; }
  // The RTOS database of the view, or null when none was set.
  KvCRoDatabase* getRtosDatabase() const { return rtosDatabase; }
  void setRtosDatabase(KvCRoDatabase* database) { rtosDatabase = database; }

private:
  KvCRoDatabase* rtosDatabase = nullptr;
};

#endif
