#include "platform/icode/KvCParamSymbol.h"
#include "platform/view/KV_BdVisitor.h"
#include "platform/view/KvCCbActualInterface.h"
#include "platform/view/KvCCodeBlockId.h"
#include "platform/view/KvCIvBorderCrossing.h"
#include "platform/view/KvCIvCallId.h"
#include "platform/view/KvCIvData.h"
#include "platform/view/KvCIvTools.h"
#include "platform/view/KvCPartitionIterator.h"

#include <algorithm>
#include <unordered_set>

KvCIvData::KvCIvData() : rootPartition(std::make_unique<KV_BdPartition>("root")) {
  newCallId(rootPartition.get());
}

KvCIvData::~KvCIvData() = default;

KvCIvCallId* KvCIvData::newCallId(KV_BdPartition* partition) {
  callIds.push_back(std::make_unique<KvCIvCallId>(partition, static_cast<int>(callIds.size()) + 1));
  partition->setCallId(callIds.back().get());
  return callIds.back().get();
}

KV_BdPartition* KvCIvData::createPartition(const WmCXString& name, KV_BdPartition* parent) {
  if (!parent)
    parent = rootPartition.get();
  auto partition = std::make_unique<KV_BdPartition>(name, parent);
  KV_BdPartition* result = partition.get();
  blocks.push_back(std::move(partition));
  parent->addChild(result);
  newCallId(result);
  return result;
}

KV_BdBlock* KvCIvData::createBlock(const WmCXString& name, tagKvEBdBlockKind kind,
                                   KV_BdPartition* owner) {
  if (kind == KV_BLOCK_PARTITION)
    return createPartition(name, owner);
  blocks.push_back(std::make_unique<KV_BdBlock>(name, kind, owner ? owner : rootPartition.get()));
  return blocks.back().get();
}

KvCCodeBlockId* KvCIvData::createCodeBlock(KvCParamSymbol* function) {
  codeBlocks.push_back(std::make_unique<KvCCodeBlockId>(function));
  if (function)
    function->setCodeBlockId(codeBlocks.back().get());
  return codeBlocks.back().get();
}

KvCCbActualInterface* KvCIvData::addUse(KvCCodeBlockId* codeBlock, KV_BdPartition* partition,
                                        const WmCXString& instanceName) {
  KvCCodeBlock* block = codeBlock->getCodeBlock();
  actuals.push_back(
      std::make_unique<KvCCbActualInterface>(block, partition->getCallId(), instanceName));
  block->addUse(partition->getCallId(), actuals.back().get());
  return actuals.back().get();
}

void KvCIvData::setReuse(KV_BdPartition* instance, KV_BdPartition* master) {
  master->setReused(true);
  master->setReuseMaster(master);
  instance->setReused(true);
  instance->setReuseMaster(master);
}

// --- control flow

bool KvCPartitionControlFlow::isExternPartition() const { return partition->isExtern(); }

bool KvCPartitionControlFlow::isTopmostExternPartition() const {
  if (!partition->isExtern())
    return false;
  for (KV_BdPartition* p = partition->getParent(); p; p = p->getParent())
    if (p->isExtern())
      return false;
  return true;
}

// --- searches and walks

void KvCIvTools::getCallersSkipCounterAlarmConsiderOsekEvents(
    KV_BdPartition* partition, leda::list<KV_BdPartition*>& callers) {
  if (!partition)
    return;
  // Depth-first over the triggers, in order; a passed-over block is expanded once, so a
  // cycle of counters and alarms ends. The common case, partitions called by partitions
  // only, needs no scratch storage.
  std::unordered_set<const KV_BdBlock*> expanded;
  std::vector<std::pair<const KV_BdBlock*, std::size_t>> stack;
  const KV_BdBlock* block = partition;
  std::size_t next = 0;
  for (;;) {
    const std::vector<KV_BdBlock*>& triggers = block->getTriggers();
    if (next == triggers.size()) {
      if (stack.empty())
        return;
      block = stack.back().first;
      next = stack.back().second;
      stack.pop_back();
      continue;
    }
    KV_BdBlock* trigger = triggers[next++];
    switch (trigger->getKind()) {
    case KV_BLOCK_PARTITION:
      callers.append(trigger->getPartition());
      break;
    case KV_BLOCK_COUNTER:
    case KV_BLOCK_ALARM:
    case KV_BLOCK_OSEK_EVENT:
      if (expanded.insert(trigger).second) {
        stack.emplace_back(block, next);
        block = trigger;
        next = 0;
      }
      break;
    case KV_BLOCK_PLAIN:
      break;
    }
  }
}

bool KvCPartitionIterator::iterHierarchyDepthFirst(KV_BdPartition* start, KV_BdVisitor* first,
                                                   KV_BdVisitor* second,
                                                   KvCIvBorderCrossing* border) {
  if (!start)
    return false;
  std::vector<KV_BdPartition*> stack{start};
  while (!stack.empty()) {
    KV_BdPartition* p = stack.back();
    stack.pop_back();
    if (first)
      first->visitPartition(p);
    if (second)
      second->visitPartition(p);
    const std::vector<KV_BdPartition*>& children = p->getChildren();
    for (auto it = children.rbegin(); it != children.rend(); ++it)
      if (!border || border->mayEnter(p, *it))
        stack.push_back(*it);
  }
  return true;
}
