// KvCIvPdbEntryId: the handle of a partition's entry in the partition database.
#ifndef HUL_PLATFORM_VIEW_KVCIVPDBENTRYID_H
#define HUL_PLATFORM_VIEW_KVCIVPDBENTRYID_H

#include "platform/support/HulPlatformExport.h"
#include "platform/view/KvCIvPartitionDbEntry.h"

// Part of its partition, together with the entry; not copied.
class HUL_PLATFORM_API KvCIvPdbEntryId {
public:
  KvCIvPdbEntryId() = default;
  KvCIvPdbEntryId(const KvCIvPdbEntryId&) = delete;
  KvCIvPdbEntryId& operator=(const KvCIvPdbEntryId&) = delete;

  // Never null.
  KvCIvPartitionDbEntry* getPdbEntry() { return &entry; }

private:
  KvCIvPartitionDbEntry entry;
};

#endif
