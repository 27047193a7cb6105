// KV_BdPartition: a partition of the model's block diagram, a part that becomes functions
// of its own in generated code: its step, init, term and restart functions, listed in its
// partition-database entry. It knows its parent and children (the partition hierarchy),
// whether it is reused (its generated functions shared with other partitions), its call
// id (which instance of the shared code it is), its control-flow object and its AUTOSAR
// kind.
#ifndef HUL_PLATFORM_VIEW_KV_BDPARTITION_H
#define HUL_PLATFORM_VIEW_KV_BDPARTITION_H

#include "platform/support/HulPlatformExport.h"
#include "platform/support/WmCXString.h"
#include "platform/view/KV_BdBlock.h"
#include "platform/view/KvCIvPdbEntryId.h"
#include "platform/view/KvCPartitionControlFlow.h"

#include <utility>
#include <vector>

class KvCIvCallId;

enum tagKvEAutosarPartitionKind : int {
  KV_AUTOSAR_NONE,
  KV_AUTOSAR_RUNNABLE,
  KV_AUTOSAR_OPERATION_CALL,
};

// Made and owned by KvCIvData (the root with the data); an identity (the ICode records
// partitions in what it makes for them), so it is not copied. Its database entry and
// control-flow object live and die with it.
class HUL_PLATFORM_API KV_BdPartition : public KV_BdBlock {
public:
  explicit KV_BdPartition(WmCXString partitionName, KV_BdPartition* parent = nullptr)
      : KV_BdBlock(std::move(partitionName), KV_BLOCK_PARTITION, parent), controlFlow(this) {}

  KV_BdPartition* getPartition() const override { return const_cast<KV_BdPartition*>(this); }
  KV_BdPartition* getParent() const { return getOwnerPartition(); }
  // Child partitions in creation order.
  const std::vector<KV_BdPartition*>& getChildren() const { return children; }
  void addChild(KV_BdPartition* child) { children.push_back(child); }

  bool isReused() const { return reused; }
  void setReused(bool value) { reused = value; }
  // The partition's call id; null until the view gives it one.
  KvCIvCallId* getCallId() const { return callId; }
  void setCallId(KvCIvCallId* id) { callId = id; }

  KvCIvPdbEntryId* getPdbEntryId() { return &pdbEntryId; }
  KvCPartitionControlFlow* getControlFlowObj() { return &controlFlow; }

  // Extern partitions: generated as functions that the application's frame calls.
  bool isExtern() const { return externPartition; }
  void setExtern(bool value) { externPartition = value; }
  tagKvEAutosarPartitionKind getAutosarKind() const { return autosarKind; }
  void setAutosarKind(tagKvEAutosarPartitionKind value) { autosarKind = value; }

private:
  std::vector<KV_BdPartition*> children;
  bool reused = false;
  KvCIvCallId* callId = nullptr;
  KvCIvPdbEntryId pdbEntryId;
  KvCPartitionControlFlow controlFlow;
  bool externPartition = false;
  tagKvEAutosarPartitionKind autosarKind = KV_AUTOSAR_NONE;
};

#endif
