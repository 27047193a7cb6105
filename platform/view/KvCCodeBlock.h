// KvCCodeBlock: the generated code of one function of the model: its function symbol,
// the call ids of the partitions that run it (in the order added) and, for each, the
// actual interface of that use.
#ifndef HUL_PLATFORM_VIEW_KVCCODEBLOCK_H
#define HUL_PLATFORM_VIEW_KVCCODEBLOCK_H

#include "platform/support/HulPlatformExport.h"

#include <utility>
#include <vector>

class KvCCbActualInterface;
class KvCIvCallId;
class KvCParamSymbol;

// Made and owned by KvCIvData; not copied.
class HUL_PLATFORM_API KvCCodeBlock {
public:
  explicit KvCCodeBlock(KvCParamSymbol* function) : symbol(function) {}
  KvCCodeBlock(const KvCCodeBlock&) = delete;
  KvCCodeBlock& operator=(const KvCCodeBlock&) = delete;

  KvCParamSymbol* getSymbol() const { return symbol; }
  const std::vector<KvCIvCallId*>& getCallIds() const { return callIds; }
  // The actual interface for the call id, or null when the block has no such use.
  // O(call ids).
  KvCCbActualInterface* getActualInterface(const KvCIvCallId* callId) const {
    for (const auto& [id, actual] : uses)
      if (id == callId)
        return actual;
    return nullptr;
  }
  void addUse(KvCIvCallId* callId, KvCCbActualInterface* actual) {
    callIds.push_back(callId);
    uses.emplace_back(callId, actual);
  }

private:
  KvCParamSymbol* symbol;
  std::vector<KvCIvCallId*> callIds;
  std::vector<std::pair<KvCIvCallId*, KvCCbActualInterface*>> uses;
};

#endif
