// KvCCompSymbolIterator: walks the component slots of a structure instance
// (KvCUnparamSymbol), in the order of the components of its structure type.
//
// Three flags choose what the walk stands on:
// - allSlots: also the slots for which the instance has no component symbol (there
//   isValidComponent() is false and getComponent() null); without it such slots are
//   skipped.
// - nested: descend, depth first, into the slots of components that are structure
//   instances themselves (after standing on the nested instance when structComponents
//   holds); without it the walk stays on the instance's own slots.
// - structComponents: stand on components whose type is a structure; without it they are
//   passed over (with `nested`, only their own components are seen).
// A walk over a symbol that is not a structure instance (or over null) is finished at once.
//
// The iterator reads the symbols as they are when it reaches a slot; it owns nothing. Cost:
// O(1) amortised per next(); the nested walk keeps one stack entry per level.
#ifndef HUL_PLATFORM_ICODE_KVCCOMPSYMBOLITERATOR_H
#define HUL_PLATFORM_ICODE_KVCCOMPSYMBOLITERATOR_H

#include "platform/support/HulPlatformExport.h"

#include <vector>

class KvCSymbol;
class KvCUnparamSymbol;

class HUL_PLATFORM_API KvCCompSymbolIterator {
public:
  KvCCompSymbolIterator(KvCSymbol* structSymbol, bool allSlots, bool nested,
                        bool structComponents);

  bool finished() const { return levels.empty(); }
  // Whether the iterator stands on a slot that has a component symbol; false when finished.
  bool isValidComponent() const { return getComponent() != nullptr; }
  // The component symbol of the current slot; null when finished or when the slot has none.
  KvCUnparamSymbol* getComponent() const;
  // Moves to the next slot the flags admit; no-op when finished.
  void next();

private:
  struct Level {
    KvCUnparamSymbol* instance;
    int slot;
    int slotCount;
  };

  // Pushes a level for `instance` when it is a structure instance with slots.
  void enter(KvCUnparamSymbol* instance);
  // Whether the walk may stand on the current slot.
  bool admits() const;
  // From the current slot on (itself included), moves to the first admitted slot.
  void settle();
  // Leaves the current slot: into a nested instance, else to the following slot.
  void advance();

  std::vector<Level> levels;
  bool allSlots;
  bool nested;
  bool structComponents;
};

#endif
