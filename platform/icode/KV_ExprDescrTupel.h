// KV_ExprDescrTupel: the expression descriptors that stand for one object of the model in
// the ICode (one for a scalar variable, one per element of a split object), with the
// partition the object was made for.
//
// Tuples are made and owned by KV_CgsSupporter and live as long as the code view data;
// others (the RTOS objects of the view, for one) keep plain pointers to them.
#ifndef HUL_PLATFORM_ICODE_KV_EXPRDESCRTUPEL_H
#define HUL_PLATFORM_ICODE_KV_EXPRDESCRTUPEL_H

#include "platform/icode/KV_ExprDescr.h"

#include <vector>

class KV_BdPartition;

class HUL_PLATFORM_API KV_ExprDescrTupel {
public:
  explicit KV_ExprDescrTupel(KV_BdPartition* owner) : partition(owner) {}
  KV_ExprDescrTupel(const KV_ExprDescrTupel&) = delete;
  KV_ExprDescrTupel& operator=(const KV_ExprDescrTupel&) = delete;

  void append(const KV_ExprDescr& descr) { elements.push_back(descr); }
  int getNumberOfElements() const { return static_cast<int>(elements.size()); }
  // The i-th descriptor, or null outside [0, getNumberOfElements()).
  const KV_ExprDescr* getElement(int i) const {
    return i >= 0 && i < getNumberOfElements() ? &elements[static_cast<std::size_t>(i)] : nullptr;
  }
  // The symbol of the first descriptor (the variable of a scalar), or null when empty.
  KvCSymbol* getSymbol() const { return elements.empty() ? nullptr : elements.front().getSymbol(); }
  // The partition the object was made for, or null.
  KV_BdPartition* getPartition() const { return partition; }

private:
  std::vector<KV_ExprDescr> elements;
  KV_BdPartition* partition;
};

#endif
