// KvCFcgSortedSet: the same answers as an ordered reference set through random updates that
// move sets between the array and the tree form, and ascending refills after clear().
#include "platform/icode/KvCFcgSortedSet.h"

#include <gtest/gtest.h>

#include <functional>
#include <random>
#include <set>
#include <vector>

namespace {

using IntSet = KvCFcgSortedSet<int, std::less<int>>;

std::vector<int> contents(const IntSet& s) { return {s.begin(), s.end()}; }

void expectSame(const IntSet& s, const std::set<int>& reference) {
  ASSERT_EQ(contents(s), std::vector<int>(reference.begin(), reference.end()));
  ASSERT_EQ(s.size(), static_cast<int>(reference.size()));
  ASSERT_EQ(s.empty(), reference.empty());
}

TEST(FcgSortedSetTest, RandomUpdatesAgreeWithReferenceAcrossBothForms) {
  std::mt19937 rng(77);
  IntSet s;
  std::set<int> reference;
  // Growing phases pass the array limit; shrinking ones and clear() come back.
  for (int round = 0; round < 6; ++round) {
    const int range = round % 2 == 0 ? 1000 : 60;
    for (int step = 0; step < 1500; ++step) {
      const int x = static_cast<int>(rng() % static_cast<unsigned>(range));
      switch (rng() % 4) {
      case 0:
      case 1:
        ASSERT_EQ(s.insert(x), reference.insert(x).second) << "insert " << x;
        break;
      case 2:
        ASSERT_EQ(s.del(x), reference.erase(x) == 1) << "del " << x;
        break;
      default:
        ASSERT_EQ(s.member(x), reference.count(x) == 1) << "member " << x;
        break;
      }
      if (step % 97 == 0)
        expectSame(s, reference);
    }
    expectSame(s, reference);
    if (round == 3) {
      s.clear();
      reference.clear();
      expectSame(s, reference);
    }
  }
}

TEST(FcgSortedSetTest, RefillsInAnyOrderAfterClearAndKeepsStoredElements) {
  // Elements equal under the order keep the stored one.
  struct ByKey {
    bool operator()(const std::pair<int, int>& a, const std::pair<int, int>& b) const {
      return a.first < b.first;
    }
  };
  KvCFcgSortedSet<std::pair<int, int>, ByKey> s;
  for (int size : {10, 300}) {
    s.clear();
    for (int i = 0; i < size; ++i)
      ASSERT_TRUE(s.insert({i, 1}));
    // An ascending pass over present elements changes nothing (the hinted path).
    for (int i = 0; i < size; ++i)
      ASSERT_FALSE(s.insert({i, 2}));
    // Descending and interleaved insertions of new elements.
    for (int i = 2 * size - 1; i >= size; i -= 2)
      ASSERT_TRUE(s.insert({i, 3}));
    for (int i = size; i < 2 * size; i += 2)
      ASSERT_TRUE(s.insert({i, 3}));
    ASSERT_EQ(s.size(), 2 * size);
    int expected = 0;
    for (const auto& [key, tag] : s) {
      EXPECT_EQ(key, expected++);
      EXPECT_EQ(tag, key < size ? 1 : 3);
    }
  }
}

} // namespace

namespace {

TEST(FcgSortedSetTest, AscendingInsertionsPassTheArrayLimitAndKeepOrder) {
  IntSet s;
  std::set<int> reference;
  std::vector<int> run;
  // Runs of 50 ascending values above everything stored: the array, then the tree form.
  for (int k = 0; k < 8; ++k) {
    run.clear();
    for (int i = 0; i < 50; ++i)
      run.push_back(k * 100 + i * 2);
    for (int x : run)
      ASSERT_TRUE(s.insert(x));
    reference.insert(run.begin(), run.end());
    expectSame(s, reference);
    ASSERT_EQ(s.back(), *reference.rbegin());
    // Later insertions and deletions still find their places.
    ASSERT_EQ(s.insert(k * 100 + 1), reference.insert(k * 100 + 1).second);
    ASSERT_EQ(s.del(k * 100), reference.erase(k * 100) == 1);
    expectSame(s, reference);
  }
}

} // namespace
