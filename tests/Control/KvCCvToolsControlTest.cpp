#include "HulCvTools/Control/KvCCvToolsControl.h"
#include "HulCvTools/Control/KvCCvToolsEnv.h"
#include "HulCvTools/Control/KvCCvToolsOptionsInterface.h"
#include "platform/support/KvCCountingMemController.h"
#include "platform/support/KvCOptionValueStorage.h"
#include "tests/CountingMemory.h"

#include <gtest/gtest.h>

#include <type_traits>

namespace {

static_assert(!std::is_copy_constructible_v<KvCCvToolsControl>);
static_assert(!std::is_copy_assignable_v<KvCCvToolsControl>);
static_assert(!std::is_copy_assignable_v<KvCCvToolsEnv>);

const KvCCvToolsOptionsInterface& optionsOf(const KvCCvToolsControl& control) {
  return *control.getEnv()->getOptionsInterface();
}

TEST(CvToolsControl, ConstructedInterfaceHasNoStorageAndNoId) {
  KvCCvToolsControl control;
  EXPECT_EQ(optionsOf(control).getStorage(), nullptr);
  EXPECT_EQ(optionsOf(control).getInterfaceId(), -1);
  EXPECT_TRUE(control.shutdown());
}

TEST(CvToolsControl, BootRegistersEveryOptionUnderTheAssignedId) {
  KvCOptionValueStorage storage;
  KvCCvToolsControl control;
  EXPECT_TRUE(control.boot(&storage));
  EXPECT_EQ(storage.getNumberOfInterfaces(), 1);
  EXPECT_EQ(optionsOf(control).getInterfaceId(), 1);
  EXPECT_EQ(optionsOf(control).getStorage(), &storage);
  // The storage keeps names by content: 229 entries means 229 distinct encoded names.
  EXPECT_EQ(storage.getNumberOfOptions(1), 229u);
  EXPECT_TRUE(control.shutdown());
  EXPECT_EQ(storage.getNumberOfOptions(1), 229u) << "shutdown withdraws nothing";
}

TEST(CvToolsControl, BootAnswersTrueWhenTheStorageRefusesRegistration) {
  KvCOptionValueStorage storage;
  storage.setRefuseRegistration(true);
  KvCCvToolsControl control;
  EXPECT_TRUE(control.boot(&storage));
  EXPECT_EQ(optionsOf(control).getInterfaceId(), -1);
  EXPECT_EQ(storage.getNumberOfInterfaces(), 0);
  EXPECT_FALSE(control.getEnv()->getOptionsInterface()->setInlineMaxCost(3));
}

TEST(CvToolsControl, BootingTwiceRegistersTheNamesAgainUnderANewId) {
  KvCOptionValueStorage storage;
  KvCCvToolsControl control;
  control.boot(&storage);
  control.boot(&storage);
  EXPECT_EQ(storage.getNumberOfInterfaces(), 2);
  EXPECT_EQ(optionsOf(control).getInterfaceId(), 2);
  EXPECT_EQ(storage.getNumberOfOptions(2), 229u);
}

TEST(CvToolsControl, BootWithoutStorageIsHarmless) {
  KvCCvToolsControl control;
  EXPECT_TRUE(control.boot(nullptr));
  EXPECT_EQ(optionsOf(control).getInterfaceId(), -1);
  EXPECT_FALSE(control.getEnv()->getOptionsInterface()->getInlineSmallFunctions());
}

TEST(CvToolsControl, EveryBlockTakenIsGivenBackAfterDestruction) {
  CountingMemory memory;
  {
    KvCOptionValueStorage storage;
    auto* control = new KvCCvToolsControl;
    ASSERT_NE(control, nullptr);
    control->boot(&storage);
    control->getEnv()->getOptionsInterface()->setRtosName("OSEK");
    control->shutdown();
    EXPECT_EQ(memory.controller.getOutstandingBlocks(), 3u) << "control, env, options";
    delete control;
  }
  EXPECT_EQ(memory.controller.getTotalBlocks(), 3u);
  EXPECT_EQ(memory.controller.getOutstandingBlocks(), 0u);
  EXPECT_EQ(memory.controller.getForeignFrees(), 0u);
}

TEST(CvToolsControl, BlocksGoBackToTheControllerThatGaveThem) {
  KvCCountingMemController first;
  pKVMemory = &first;
  auto* control = new KvCCvToolsControl;
  pKVMemory = nullptr; // the objects outlive the controller's time as the global one
  delete control;
  EXPECT_EQ(first.getTotalBlocks(), 3u);
  EXPECT_EQ(first.getOutstandingBlocks(), 0u);
}

TEST(CvToolsControl, OutOfMemoryWhileConstructingLeavesAUsableObject) {
  for (long granted = 0; granted <= 2; ++granted) {
    SCOPED_TRACE(granted);
    CountingMemory memory;
    memory.controller.failAfter(granted);
    KvCOptionValueStorage storage;
    {
      KvCCvToolsControl control; // on the stack: only env and options come from the heap
      EXPECT_EQ(control.getEnv() == nullptr, granted == 0);
      EXPECT_TRUE(control.boot(&storage));
      EXPECT_TRUE(control.shutdown());
    }
    EXPECT_EQ(storage.getNumberOfInterfaces(), granted == 2 ? 1 : 0);
    EXPECT_EQ(memory.controller.getOutstandingBlocks(), 0u);
  }
}

} // namespace
