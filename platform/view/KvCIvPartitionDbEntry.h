// KvCIvPartitionDbEntry: a partition's entry in the partition database: the code blocks
// of its step, init, term and restart functions, each null when the partition has none.
#ifndef HUL_PLATFORM_VIEW_KVCIVPARTITIONDBENTRY_H
#define HUL_PLATFORM_VIEW_KVCIVPARTITIONDBENTRY_H

#include "platform/support/HulPlatformExport.h"

class KvCCodeBlockId;

// Part of its partition (through KvCIvPdbEntryId); the code blocks belong to KvCIvData.
class HUL_PLATFORM_API KvCIvPartitionDbEntry {
public:
  KvCIvPartitionDbEntry() = default;
  KvCIvPartitionDbEntry(const KvCIvPartitionDbEntry&) = delete;
  KvCIvPartitionDbEntry& operator=(const KvCIvPartitionDbEntry&) = delete;

  KvCCodeBlockId* getStepFunction() const { return step; }
  KvCCodeBlockId* getInitFunction() const { return init; }
  KvCCodeBlockId* getTermFunction() const { return term; }
  KvCCodeBlockId* getRestartFunction() const { return restart; }
  void setStepFunction(KvCCodeBlockId* id) { step = id; }
  void setInitFunction(KvCCodeBlockId* id) { init = id; }
  void setTermFunction(KvCCodeBlockId* id) { term = id; }
  void setRestartFunction(KvCCodeBlockId* id) { restart = id; }

private:
  KvCCodeBlockId* step = nullptr;
  KvCCodeBlockId* init = nullptr;
  KvCCodeBlockId* term = nullptr;
  KvCCodeBlockId* restart = nullptr;
};

#endif
