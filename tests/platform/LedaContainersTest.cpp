#include "platform/leda/array.h"
#include "platform/leda/dictionary.h"
#include "platform/leda/list.h"
#include "platform/leda/map.h"
#include "platform/leda/set.h"
#include "platform/leda/stack.h"

#include <gtest/gtest.h>

#include <string>
#include <utility>
#include <vector>

// A global class with a global compare overload, found by argument-dependent
// lookup from the leda containers.
struct LedaTestSymbol {
  std::string name;
  int tag = 0;
};

int compare(LedaTestSymbol* const& a, LedaTestSymbol* const& b);
int compare(LedaTestSymbol* const& a, LedaTestSymbol* const& b) { return a->name.compare(b->name); }

namespace {

template <class Container> auto contents(const Container& c) {
  std::vector<std::decay_t<decltype(*c.begin())>> result;
  for (const auto& x : c)
    result.push_back(x);
  return result;
}

struct Keyed {
  int key;
  char label;
};

int byKey(const Keyed& a, const Keyed& b) { return a.key - b.key; }
int descending(const int& a, const int& b) { return b - a; }

std::vector<std::pair<int, char>> keysAndLabels(const leda::set<Keyed>& s) {
  std::vector<std::pair<int, char>> result;
  for (const Keyed& k : s)
    result.emplace_back(k.key, k.label);
  return result;
}

TEST(LedaSet, CustomCompareKeepsStoredElementAndOrders) {
  leda::set<Keyed> s(&byKey);
  EXPECT_TRUE(s.insert({3, 'a'}));
  EXPECT_TRUE(s.insert({1, 'b'}));
  EXPECT_FALSE(s.insert({3, 'c'}));
  s.insert({2, 'd'});
  EXPECT_EQ(keysAndLabels(s), (std::vector<std::pair<int, char>>{{1, 'b'}, {2, 'd'}, {3, 'a'}}));
  EXPECT_TRUE(s.member({3, 'z'}));
  EXPECT_EQ(s.min().key, 1);
  EXPECT_EQ(s.max().label, 'a');
  EXPECT_TRUE(s.del({1, '?'}));
  EXPECT_FALSE(s.del({1, '?'}));
  EXPECT_EQ(s.size(), 2);
}

TEST(LedaSet, SetAlgebraAndCopiesKeepTheOrderFunction) {
  leda::set<int> a(&descending);
  for (int x : {1, 2, 3, 4, 5})
    a.insert(x);
  leda::set<int> b;
  for (int x : {4, 5, 6})
    b.insert(x);

  EXPECT_EQ(contents(a - b), (std::vector<int>{3, 2, 1}));
  EXPECT_EQ(contents(a.diff(b)), (std::vector<int>{3, 2, 1}));
  EXPECT_EQ(contents(b - a), (std::vector<int>{6}));
  EXPECT_EQ(contents(a.intersect(b)), (std::vector<int>{5, 4}));
  EXPECT_EQ(contents(a.join(b)), (std::vector<int>{6, 5, 4, 3, 2, 1}));

  leda::set<int> copy = a;
  copy.insert(9);
  copy.del(1);
  EXPECT_EQ(contents(copy), (std::vector<int>{9, 5, 4, 3, 2}));
  EXPECT_EQ(a.size(), 5);
  copy.clear();
  EXPECT_TRUE(copy.empty());
  EXPECT_TRUE(a.contains(1));
}

TEST(LedaSet, DefaultOrderUsesUserCompareOverloadBeforeAddressOrder) {
  std::vector<LedaTestSymbol> symbols{{"c", 0}, {"a", 1}, {"b", 2}, {"a", 3}};
  leda::set<LedaTestSymbol*> byName;
  for (LedaTestSymbol& sym : symbols)
    byName.insert(&sym);
  std::vector<int> tags;
  for (LedaTestSymbol* sym : byName)
    tags.push_back(sym->tag);
  EXPECT_EQ(tags, (std::vector<int>{1, 2, 0}));

  leda::set<int*> byAddress;
  std::vector<int> values(3);
  byAddress.insert(&values[2]);
  byAddress.insert(&values[0]);
  byAddress.insert(&values[1]);
  EXPECT_EQ(contents(byAddress), (std::vector<int*>{&values[0], &values[1], &values[2]}));
}

TEST(LedaMap, IteratesInInsertionOrderAndRedefinedKeysMoveToTheEnd) {
  leda::map<std::string, int> m;
  m["x"] = 1;
  m["y"] = 2;
  m["z"] = 3;
  m["y"] += 10;
  EXPECT_TRUE(m.undefine("x"));
  EXPECT_FALSE(m.undefine("x"));
  EXPECT_FALSE(m.defined("x"));
  m["x"] = 4;
  using Entries = std::vector<std::pair<std::string, int>>;
  Entries seen;
  for (const auto& [k, v] : m)
    seen.emplace_back(k, v);
  EXPECT_EQ(seen, (Entries{{"y", 12}, {"z", 3}, {"x", 4}}));

  leda::map<std::string, int> copy = m;
  copy.undefine("z");
  copy["w"];
  EXPECT_EQ(m.size(), 3);
  seen.clear();
  for (const auto& [k, v] : copy)
    seen.emplace_back(k, v);
  EXPECT_EQ(seen, (Entries{{"y", 12}, {"x", 4}, {"w", 0}}));
}

TEST(LedaMap, DefaultValueAndConstReadsDoNotDefine) {
  leda::map<int, int> m(-1);
  const auto& cm = m;
  EXPECT_EQ(cm[5], -1);
  EXPECT_FALSE(m.defined(5));
  EXPECT_EQ(m[5], -1);
  EXPECT_TRUE(m.defined(5));
  m.clear();
  EXPECT_EQ(m.size(), 0);
  EXPECT_EQ(m[6], -1);
}

TEST(LedaDictionary, InsertReplacesInfoAndItemsStayValid) {
  leda::dictionary<std::string, int> d;
  auto b = d.insert("b", 1);
  d.insert("c", 3);
  d.insert("a", 0);
  EXPECT_EQ(d.insert("b", 2), b);
  EXPECT_EQ(d.inf(b), 2);
  EXPECT_EQ(d.key(b), "b");
  EXPECT_EQ(d.lookup("b"), b);
  EXPECT_EQ(d.lookup("q"), nullptr);
  EXPECT_EQ(d.size(), 3);

  std::vector<std::string> keys;
  for (const auto& [k, i] : d)
    keys.push_back(k);
  EXPECT_EQ(keys, (std::vector<std::string>{"a", "b", "c"}));

  d.access("c") = 30;
  EXPECT_EQ(d.inf(d.lookup("c")), 30);
  d.del_item(d.lookup("a"));
  EXPECT_TRUE(d.del("c"));
  EXPECT_FALSE(d.defined("c"));
  EXPECT_EQ(d.inf(b), 2);
  EXPECT_EQ(d.size(), 1);
}

TEST(LedaDictionary, CustomCompare) {
  leda::dictionary<int, char> d(&descending);
  d.insert(1, 'a');
  d.insert(3, 'c');
  d.insert(2, 'b');
  std::string infos;
  for (const auto& [k, i] : d)
    infos += i;
  EXPECT_EQ(infos, "cba");
}

TEST(LedaArray, IndexRangesResizeAndCopy) {
  leda::array<int> a(-2, 2);
  EXPECT_EQ(a.low(), -2);
  EXPECT_EQ(a.high(), 2);
  EXPECT_EQ(a.size(), 5);
  for (int i = a.low(); i <= a.high(); ++i) {
    EXPECT_EQ(a[i], 0);
    a[i] = i * 10;
  }
  leda::array<int> copy = a;
  a.resize(0, 4);
  EXPECT_EQ(a[0], 0);
  EXPECT_EQ(a[2], 20);
  EXPECT_EQ(a[3], 0);
  EXPECT_EQ(a[4], 0);
  EXPECT_EQ(copy[-2], -20);

  copy.resize(2);
  EXPECT_EQ(copy.low(), 0);
  EXPECT_EQ(copy.high(), 1);
  EXPECT_EQ(copy[1], 10);

  leda::array<bool> flags(3);
  flags[1] = true;
  EXPECT_FALSE(flags[0]);
  EXPECT_TRUE(flags[1]);

  leda::array<int> none(0);
  EXPECT_TRUE(none.empty());
  EXPECT_EQ(none.high(), -1);
  leda::array<const char*> pointers(1, 2);
  EXPECT_EQ(pointers[2], nullptr);
}

TEST(LedaList, SequenceOperations) {
  leda::list<int> l;
  l.append(2);
  l.append(3);
  l.push(1);
  l.append(2);
  EXPECT_EQ(l, (leda::list<int>{1, 2, 3, 2}));
  EXPECT_EQ(l.head(), 1);
  EXPECT_EQ(l.tail(), 2);
  EXPECT_EQ(l.remove(2), 2);
  EXPECT_EQ(l.length(), 2);
  EXPECT_TRUE(l.contains(3));
  EXPECT_EQ(l.search(2), nullptr);
  l.append(0);
  l.sort();
  EXPECT_EQ(l, (leda::list<int>{0, 1, 3}));
  EXPECT_EQ(l.pop(), 0);
  EXPECT_EQ(l.pop_back(), 3);
  EXPECT_EQ(l.size(), 1);
}

TEST(LedaStack, LastInFirstOut) {
  leda::stack<bool> s;
  s.push(true);
  s.push(false);
  s.top() = true;
  EXPECT_TRUE(s.pop());
  EXPECT_EQ(s.size(), 1);
  EXPECT_TRUE(s.pop());
  EXPECT_TRUE(s.empty());
}

} // namespace
