// KvCIvCallId: the call id of a partition: which use of a code block the partition is.
// A code block has one call id per partition that runs it (several for reused code).
#ifndef HUL_PLATFORM_VIEW_KVCIVCALLID_H
#define HUL_PLATFORM_VIEW_KVCIVCALLID_H

#include "platform/support/HulPlatformExport.h"

class KV_BdPartition;

// Made and owned by KvCIvData; not copied.
class HUL_PLATFORM_API KvCIvCallId {
public:
  KvCIvCallId(KV_BdPartition* owner, int number) : partition(owner), id(number) {}
  KvCIvCallId(const KvCIvCallId&) = delete;
  KvCIvCallId& operator=(const KvCIvCallId&) = delete;

  KV_BdPartition* getPartition() const { return partition; }
  // Serial number in the view, from 1.
  int getNumber() const { return id; }

private:
  KV_BdPartition* partition;
  int id;
};

#endif
