// KvCObjectPool: objects made from a pool are released by plain delete, whoever deletes
// them; memory comes from (and goes back to) the run's memory controller; a pool destroyed
// while objects live keeps its chunks until the last one goes; out of memory answers null.
#include "HulCvTools/Control/KvCObjectPool.h"
#include "HulCvTools/FcnCallGraph/KvCFcgEdgeInfo.h"
#include "platform/support/KvCCountingMemController.h"
#include "platform/support/KvCMemController.h"

#include <gtest/gtest.h>

#include <memory>
#include <set>
#include <vector>

namespace {

class PoolTest : public ::testing::Test {
protected:
  void SetUp() override { pKVMemory = &memory; }
  void TearDown() override { pKVMemory = nullptr; }
  KvCCountingMemController memory;
};

TEST_F(PoolTest, PlainDeleteReturnsBlocksAndTheFirstChunkIsReusedInOrder) {
  std::vector<KvCFcgEdgeInfo*> first;
  {
    KvCObjectPool pool(sizeof(KvCFcgEdgeInfo));
    for (int i = 0; i < 1000; ++i) {
      KvCFcgEdgeInfo* info = new (pool) KvCFcgEdgeInfo;
      ASSERT_NE(info, nullptr);
      info->setCardinality(i); // the storage is usable and distinct
      first.push_back(info);
    }
    EXPECT_EQ(pool.live(), 1000u);
    for (int i = 0; i < 1000; ++i)
      EXPECT_EQ(first[static_cast<std::size_t>(i)]->getCardinality(), i);
    EXPECT_EQ(std::set<KvCFcgEdgeInfo*>(first.begin(), first.end()).size(), 1000u);
    const std::size_t chunks = memory.getOutstandingBlocks();
    EXPECT_LT(chunks, 20u); // chunks, not one block per object
    for (KvCFcgEdgeInfo* info : first)
      delete info;
    EXPECT_EQ(pool.live(), 0u);
    // Once everything is released, objects are carved again from the start.
    KvCFcgEdgeInfo* again = new (pool) KvCFcgEdgeInfo;
    EXPECT_EQ(again, first.front());
    KvCFcgEdgeInfo* next = new (pool) KvCFcgEdgeInfo;
    EXPECT_EQ(next, first[1]);
    delete again;
    delete next;
    EXPECT_EQ(memory.getOutstandingBlocks(), chunks); // no chunk was added
  }
  EXPECT_EQ(memory.getOutstandingBlocks(), 0u);
  EXPECT_EQ(memory.getForeignFrees(), 0u);
}

TEST_F(PoolTest, ObjectsMayOutliveThePoolAndFreedBlocksAreReused) {
  std::vector<KvCFcgEdgeInfo*> infos;
  auto pool = std::make_unique<KvCObjectPool>(sizeof(KvCFcgEdgeInfo));
  for (int i = 0; i < 100; ++i)
    infos.push_back(new (*pool) KvCFcgEdgeInfo);
  // A released block is handed out again while others live.
  KvCFcgEdgeInfo* freed = infos[50];
  delete freed;
  infos[50] = new (*pool) KvCFcgEdgeInfo;
  EXPECT_EQ(infos[50], freed);
  pool.reset();
  EXPECT_GT(memory.getOutstandingBlocks(), 0u); // still in use
  for (KvCFcgEdgeInfo* info : infos)
    delete info;
  EXPECT_EQ(memory.getOutstandingBlocks(), 0u);
  EXPECT_EQ(memory.getForeignFrees(), 0u);
}

TEST_F(PoolTest, LargerObjectsAndOutOfMemory) {
  KvCObjectPool pool(8);
  // Larger than the pool's objects: an ordinary heap block, released the ordinary way.
  KvCFcgEdgeInfo* big = new (pool) KvCFcgEdgeInfo;
  ASSERT_NE(big, nullptr);
  EXPECT_EQ(pool.live(), 0u);
  delete big;
  EXPECT_EQ(memory.getOutstandingBlocks(), 0u);
  // No chunk to be had: null, and the pool stays usable.
  KvCObjectPool infos(sizeof(KvCFcgEdgeInfo));
  memory.failAfter(0);
  EXPECT_EQ(new (infos) KvCFcgEdgeInfo, nullptr);
  memory.failAfter(-1);
  KvCFcgEdgeInfo* info = new (infos) KvCFcgEdgeInfo;
  ASSERT_NE(info, nullptr);
  EXPECT_EQ(infos.live(), 1u);
  delete info;
  EXPECT_EQ(infos.live(), 0u);
}

} // namespace
