// KV_BdPartition: a partition of the model's block diagram, a part that becomes functions
// of its own in generated code. Today it carries its name and whether it is reused (its
// generated functions shared with other partitions); the hierarchy, the partition
// database entry and the control flow come with the subsystems that walk partitions.
#ifndef HUL_PLATFORM_VIEW_KV_BDPARTITION_H
#define HUL_PLATFORM_VIEW_KV_BDPARTITION_H

#include "platform/support/HulPlatformExport.h"
#include "platform/support/WmCXString.h"

#include <utility>

// Made and owned by KvCIvData; an identity (the ICode records partitions in what it makes
// for them), so it is not copied.
class HUL_PLATFORM_API KV_BdPartition {
public:
  explicit KV_BdPartition(WmCXString partitionName) : name(std::move(partitionName)) {}
  KV_BdPartition(const KV_BdPartition&) = delete;
  KV_BdPartition& operator=(const KV_BdPartition&) = delete;

  const WmCXString& getName() const { return name; }
  bool isReused() const { return reused; }
  void setReused(bool value) { reused = value; }

private:
  WmCXString name;
  bool reused = false;
};

#endif
