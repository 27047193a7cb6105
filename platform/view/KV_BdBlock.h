// KV_BdBlock: a block of the model's block diagram. Partitions (KV_BdPartition) are blocks
// that become functions of their own; counters, alarms and OSEK events are blocks that
// pass a trigger on from their callers to the partitions they drive.
//
// A block records the blocks that call (trigger) it, in the order they were added, and,
// when it belongs to a group of reused blocks, the group's master block (the block whose
// generated code the group shares; the master's own master is itself).
//
// Made and owned by KvCIvData; an identity, so it is not copied.
#ifndef HUL_PLATFORM_VIEW_KV_BDBLOCK_H
#define HUL_PLATFORM_VIEW_KV_BDBLOCK_H

#include "platform/support/HulPlatformExport.h"
#include "platform/support/WmCXString.h"

#include <utility>
#include <vector>

class KV_BdPartition;

enum tagKvEBdBlockKind : int {
  KV_BLOCK_PARTITION,
  KV_BLOCK_PLAIN,
  KV_BLOCK_COUNTER,
  KV_BLOCK_ALARM,
  KV_BLOCK_OSEK_EVENT,
};

class HUL_PLATFORM_API KV_BdBlock {
public:
  // `owner`: the partition the block lies in (for a partition: its parent, null for the
  // root).
  KV_BdBlock(WmCXString blockName, tagKvEBdBlockKind blockKind, KV_BdPartition* owner)
      : name(std::move(blockName)), kind(blockKind), ownerPartition(owner) {}
  virtual ~KV_BdBlock() = default;
  KV_BdBlock(const KV_BdBlock&) = delete;
  KV_BdBlock& operator=(const KV_BdBlock&) = delete;

  const WmCXString& getName() const { return name; }
  tagKvEBdBlockKind getKind() const { return kind; }
  // The root of the diagram: the partition without parent.
  bool isRoot() const { return kind == KV_BLOCK_PARTITION && ownerPartition == nullptr; }
  // The partition the block makes (a partition: itself) or lies in.
  virtual KV_BdPartition* getPartition() const { return ownerPartition; }
  KV_BdPartition* getOwnerPartition() const { return ownerPartition; }

  // The blocks that call or trigger this one, in the order added; a block added twice
  // calls twice.
  const std::vector<KV_BdBlock*>& getTriggers() const { return triggers; }
  void addTrigger(KV_BdBlock* caller) { triggers.push_back(caller); }

  // The master block of the block's reuse group, or null when the block is not reused.
  KV_BdBlock* getReuseMaster() const { return reuseMaster; }
  void setReuseMaster(KV_BdBlock* master) { reuseMaster = master; }

private:
  WmCXString name;
  tagKvEBdBlockKind kind;
  KV_BdPartition* ownerPartition;
  std::vector<KV_BdBlock*> triggers;
  KV_BdBlock* reuseMaster = nullptr;
};

#endif
