#include "platform/view/KV_BdVisitor.h"
#include "platform/view/KvCIvBorderCrossing.h"
#include "platform/view/KvCIvCallId.h"
#include "platform/view/KvCIvData.h"
#include "platform/view/KvCIvFcnReuseTools.h"
#include "platform/view/KvCIvTools.h"
#include "platform/view/KvCPartitionIterator.h"

#include <gtest/gtest.h>

#include <string>

namespace {

class NameRecorder : public KV_BdVisitor {
public:
  void visitPartition(KV_BdPartition* partition) override {
    names += partition->getName().c_str();
    names += ' ';
  }
  std::string names;
};

class SkipChildrenOf : public KvCIvBorderCrossing {
public:
  explicit SkipChildrenOf(KV_BdPartition* p) : closed(p) {}
  bool mayEnter(KV_BdPartition* from, KV_BdPartition* /*child*/) override { return from != closed; }
  KV_BdPartition* closed;
};

TEST(IvPartitionsTest, HierarchyIsWalkedDepthFirstInCreationOrder) {
  KvCIvData view;
  KV_BdPartition* a = view.createPartition("A");
  view.createPartition("A1", a);
  KV_BdPartition* a2 = view.createPartition("A2", a);
  view.createPartition("A21", a2);
  view.createPartition("B");
  NameRecorder first;
  NameRecorder second;
  KvCPartitionIterator iterator;
  ASSERT_TRUE(
      iterator.iterHierarchyDepthFirst(view.getIvRootPartition(), &first, &second, nullptr));
  EXPECT_EQ(first.names, "root A A1 A2 A21 B ");
  EXPECT_EQ(second.names, first.names);
  SkipChildrenOf border(a2);
  NameRecorder bounded;
  iterator.iterHierarchyDepthFirst(view.getIvRootPartition(), &bounded, nullptr, &border);
  EXPECT_EQ(bounded.names, "root A A1 A2 B ");
  EXPECT_FALSE(iterator.iterHierarchyDepthFirst(nullptr, &first, nullptr, nullptr));
}

TEST(IvPartitionsTest, OnlyAnExternPartitionWithoutExternAncestorIsTopmost) {
  KvCIvData view;
  KV_BdPartition* outer = view.createPartition("Outer");
  KV_BdPartition* middle = view.createPartition("Middle", outer);
  KV_BdPartition* inner = view.createPartition("Inner", middle);
  outer->setExtern(true);
  inner->setExtern(true);
  EXPECT_TRUE(outer->getControlFlowObj()->isTopmostExternPartition());
  EXPECT_FALSE(middle->getControlFlowObj()->isExternPartition());
  EXPECT_TRUE(inner->getControlFlowObj()->isExternPartition());
  EXPECT_FALSE(inner->getControlFlowObj()->isTopmostExternPartition());
  EXPECT_TRUE(view.getIvRootPartition()->isRoot());
  EXPECT_FALSE(outer->isRoot());
}

TEST(IvPartitionsTest, CallersPassOverCountersAlarmsAndEventsAndEndOnTheirCycles) {
  KvCIvData view;
  KV_BdPartition* p = view.createPartition("P");
  KV_BdPartition* c1 = view.createPartition("C1");
  KV_BdPartition* c2 = view.createPartition("C2");
  KV_BdBlock* counter = view.createBlock("Ctr", KV_BLOCK_COUNTER);
  KV_BdBlock* alarm = view.createBlock("Alm", KV_BLOCK_ALARM);
  KV_BdBlock* event = view.createBlock("Ev", KV_BLOCK_OSEK_EVENT);
  p->addTrigger(c1);
  p->addTrigger(alarm);
  p->addTrigger(event);
  alarm->addTrigger(counter);
  counter->addTrigger(alarm);
  counter->addTrigger(c2);
  event->addTrigger(c1);
  leda::list<KV_BdPartition*> callers;
  KvCIvTools::getCallersSkipCounterAlarmConsiderOsekEvents(p, callers);
  std::string names;
  for (KV_BdPartition* caller : callers)
    names += std::string(caller->getName().c_str()) + " ";
  EXPECT_EQ(names, "C1 C2 C1 ");
}

TEST(IvPartitionsTest, ReuseGroupsAnswerTheirMasterForEveryMember) {
  KvCIvData view;
  KV_BdPartition* master = view.createPartition("R");
  KV_BdPartition* instance = view.createPartition("R2");
  KV_BdPartition* alone = view.createPartition("S");
  view.setReuse(instance, master);
  KvCIvFcnReuseTools tools;
  EXPECT_EQ(tools.getReusedPartition(instance), master);
  EXPECT_EQ(tools.getReusedMasterBlock(master), master);
  EXPECT_EQ(tools.getReusedPartition(alone), nullptr);
  EXPECT_TRUE(master->isReused() && instance->isReused() && !alone->isReused());
  EXPECT_NE(master->getCallId(), instance->getCallId());
  EXPECT_EQ(instance->getCallId()->getPartition(), instance);
}

} // namespace
