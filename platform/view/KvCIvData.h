// KvCIvData: the root of the intermediate view (the model's partitions and the RTOS
// database). Today it holds the root partition alone; the partition hierarchy comes with
// the subsystems that walk it.
//
// It owns the root partition (made with the object, named "root", alive as long as it).
// It does not own the RTOS database: whoever makes the database (a fixture) keeps it and
// sets it here; it must outlive every use through this object.
#ifndef HUL_PLATFORM_VIEW_KVCIVDATA_H
#define HUL_PLATFORM_VIEW_KVCIVDATA_H

#include "platform/support/HulPlatformExport.h"
#include "platform/view/KV_BdPartition.h"

#include <memory>

class KvCRoDatabase;

class HUL_PLATFORM_API KvCIvData {
public:
  KvCIvData() : rootPartition(std::make_unique<KV_BdPartition>("root")) {}
  KvCIvData(const KvCIvData&) = delete;
  KvCIvData& operator=(const KvCIvData&) = delete;

  // The root partition of the view; never null, the same object on every call.
  KV_BdPartition* getIvRootPartition() const { return rootPartition.get(); }
  // The RTOS database of the view, or null when none was set.
  KvCRoDatabase* getRtosDatabase() const { return rtosDatabase; }
  void setRtosDatabase(KvCRoDatabase* database) { rtosDatabase = database; }

private:
  std::unique_ptr<KV_BdPartition> rootPartition;
  KvCRoDatabase* rtosDatabase = nullptr;
};

#endif
