// KV_CallInserter: the base of the ICode's call inserters (KV_FunctionCallInserter,
// KV_MacroCallInserter), which find or make the function and macro symbols that generated
// calls need and build the calls. An inserter works over the run's factory container.
//
// Inserters may be made on the stack for one demand, or with new and kept by a server;
// a kept inserter is deleted through this base (the destructor is virtual). Their storage
// comes from the run's memory controller (pKVMemory) when one is set, from the C heap
// otherwise; each block goes back to the controller that gave it. new answers null when
// memory runs out.
#ifndef HUL_PLATFORM_ICODE_KV_CALLINSERTER_H
#define HUL_PLATFORM_ICODE_KV_CALLINSERTER_H

#include "platform/support/HulPlatformExport.h"

#include <cstddef>

class KV_ICodeFactoryContainer;

class HUL_PLATFORM_API KV_CallInserter {
public:
  explicit KV_CallInserter(KV_ICodeFactoryContainer* container) : factories(container) {}
  virtual ~KV_CallInserter();
  KV_CallInserter(const KV_CallInserter&) = delete;
  KV_CallInserter& operator=(const KV_CallInserter&) = delete;

  KV_ICodeFactoryContainer* getFactoryContainer() const { return factories; }

  static void* operator new(std::size_t size) noexcept;
  static void operator delete(void* object) noexcept;

protected:
  KV_ICodeFactoryContainer* factories;
};

#endif
