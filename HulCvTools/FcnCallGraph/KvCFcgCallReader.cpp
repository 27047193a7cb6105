#include "HulCvTools/FcnCallGraph/KvCFcgCallReader.h"

#include "HulCvTools/ModelInterfaces/ICodeModel.h"
#include "HulCvTools/ModelInterfaces/ICodeVisitors.h"

#include <algorithm>

bool kvFcgVisitsEntry(KV_ParamSmbDBObj* entry, bool visitAll) {
  if (!entry)
    return false;
  if (visitAll)
    return true;
  KvCSymbol* symbol = entry->getSymbol();
  return symbol && symbol->isSelected();
}

namespace {

// Collects the function and macro symbols a construction run treats, in database order.
class KvCFcgSymbolLister : public KV_SmbDBObjVisitor {
public:
  KvCFcgSymbolLister(std::vector<KvCParamSymbol*>& out, bool all) : symbols(out), visitAll(all) {}
  void visitParamSmbDBObj(KV_ParamSmbDBObj* entry) override {
    if (!kvFcgVisitsEntry(entry, visitAll))
      return;
    if (KvCParamSymbol* function = entry->getParamSymbol())
      symbols.push_back(function);
  }

private:
  std::vector<KvCParamSymbol*>& symbols;
  bool visitAll;
};

} // namespace

KvCFcgCallReader::UseCall KvCFcgCallReader::readUse(KV_ExprLocation* use) {
  KV_Operation* op = use ? use->getOperation() : nullptr;
  if (!op)
    return UseCall{nullptr, nullptr, nullptr, false};
  KV_Operation* above = op->getParentOperation();
  KvCCallOperation* call = above ? above->asCallOperation() : nullptr;
  if (!call)
    return UseCall{nullptr, nullptr, nullptr, true};
  return UseCall{call, call->getCallingSymbol(), call->getCalledSymbol(), true};
}

void KvCFcgCallReader::orderByKey(const std::vector<int>& keys, std::vector<std::uint32_t>& order) {
  order.resize(keys.size());
  if (keys.empty())
    return;
  const auto [lowest, highest] = std::minmax_element(keys.begin(), keys.end());
  const auto low = static_cast<std::int64_t>(*lowest);
  const auto span = static_cast<std::uint64_t>(static_cast<std::int64_t>(*highest) - low);
  // Buckets of 2^shift keys, at most about one per key listed and never more than 2^16.
  const std::uint64_t maxBuckets = std::min<std::uint64_t>(keys.size(), std::uint64_t{1} << 16);
  unsigned shift = 0;
  while ((span >> shift) >= maxBuckets)
    ++shift;
  const std::size_t buckets = static_cast<std::size_t>(span >> shift) + 1;
  std::vector<std::uint32_t> start(buckets + 1, 0);
  auto bucketOf = [low, shift](int key) {
    return static_cast<std::size_t>(static_cast<std::uint64_t>(key - low) >> shift);
  };
  for (int key : keys)
    ++start[bucketOf(key) + 1];
  for (std::size_t b = 0; b < buckets; ++b)
    start[b + 1] += start[b];
  for (std::size_t i = 0; i < keys.size(); ++i)
    order[start[bucketOf(keys[i])]++] = static_cast<std::uint32_t>(i);
}

void KvCFcgCallReader::readAhead(KV_SymbolDB* symbolDB, bool visitAll) {
  clear();
  if (!symbolDB)
    return;
  KvCFcgSymbolLister lister(symbols, visitAll);
  symbolDB->forallParametrizedSymbols(&lister);
  std::vector<KV_ExprLocation*> uses;
  std::vector<int> keys;
  std::vector<KvCExprLocDB::KeyedLocation> listed;
  firstUse.reserve(symbols.size() + 1);
  for (KvCParamSymbol* function : symbols) {
    firstUse.push_back(static_cast<std::uint32_t>(uses.size()));
    function->getExprLocDB()->listUses(listed);
    for (const auto& [key, use] : listed) {
      keys.push_back(key);
      uses.push_back(use);
    }
  }
  firstUse.push_back(static_cast<std::uint32_t>(uses.size()));
  std::vector<std::uint32_t> order;
  orderByKey(keys, order);
  calls.resize(uses.size());
  for (std::uint32_t i : order)
    calls[i] = readUse(uses[i]);
}

KvCFcgCallReader::Range KvCFcgCallReader::callsOf(KvCParamSymbol* function) {
  if (nextSymbol < symbols.size() && symbols[nextSymbol] == function) {
    const UseCall* first = calls.data() + firstUse[nextSymbol];
    const UseCall* last = calls.data() + firstUse[nextSymbol + 1];
    ++nextSymbol;
    return Range{first, last};
  }
  std::vector<KvCExprLocDB::KeyedLocation> listed;
  function->getExprLocDB()->listUses(listed);
  late.clear();
  for (const auto& keyed : listed)
    late.push_back(readUse(keyed.second));
  return Range{late.data(), late.data() + late.size()};
}

void KvCFcgCallReader::clear() {
  symbols = std::vector<KvCParamSymbol*>();
  firstUse = std::vector<std::uint32_t>();
  calls = std::vector<UseCall>();
  late = std::vector<UseCall>();
  nextSymbol = 0;
}
