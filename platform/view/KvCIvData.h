// KvCIvData: the root of the intermediate view (the model's partitions and the RTOS
// database). Declared so that the library can name it; the view's content comes with
// the subsystems that walk it.
#ifndef HUL_PLATFORM_VIEW_KVCIVDATA_H
#define HUL_PLATFORM_VIEW_KVCIVDATA_H

class KV_BdPartition;
class KvCRoDatabase;

class KvCIvData {
public:
  KvCIvData() = default;
  KvCIvData(const KvCIvData&) = delete;
  KvCIvData& operator=(const KvCIvData&) = delete;

  // The root partition of the view; none yet.
  KV_BdPartition* getIvRootPartition() const { return nullptr; }
  // The RTOS database of the view; none yet.
  KvCRoDatabase* getRtosDatabase() const { return nullptr; }
};

#endif
