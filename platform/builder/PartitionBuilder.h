// PartitionedAppBuilder and PartitionBuilder: fixtures of partitioned applications that
// read like the scenario they check:
//
//   AppBuilder app;
//   PartitionedAppBuilder model(app);
//   auto& caller = model.partition("C");
//   auto& master = model.partition("R");
//   auto& second = model.instance("R2", master);      // reuses R's code
//   master.calledBy(caller);
//   second.calledBy(caller);
//   model.auxFunction("helper");
//   master.step().body().call(app.function("helper").symbol(), {});
//
// A partition made by partition() has code of its own: step and init functions named
// "<name>_step" and "<name>_init" (withTerm(), withRestart() add "<name>_term" and
// "<name>_restart"), each with a code block used by the partition's call id. An instance
// runs its master's code: every code block of the master gets a use for the instance's
// call id (also blocks added later), with the instance's name as actual interface name.
//
// calledBy(caller) records the caller as a trigger of the partition in the view and puts a
// call of the partition's step function into the caller's step function (so the real call
// graph sees it too). The view is owned here; builders live as long as this object.
#ifndef HUL_PLATFORM_BUILDER_PARTITIONBUILDER_H
#define HUL_PLATFORM_BUILDER_PARTITIONBUILDER_H

#include "platform/builder/AppBuilder.h"
#include "platform/view/KvCIvData.h"

#include <deque>
#include <memory>
#include <vector>

class KvCCbActualInterface;
class KvCCodeBlockId;
class PartitionedAppBuilder;

class PartitionBuilder {
public:
  PartitionBuilder(PartitionedAppBuilder& owner, KV_BdPartition* partition,
                   PartitionBuilder* master)
      : model(owner), bd(partition), masterBuilder(master) {}

  KV_BdPartition* partition() const { return bd; }
  // The partition whose code this one runs (itself unless an instance).
  PartitionBuilder& master() { return masterBuilder ? *masterBuilder : *this; }

  // The partition's functions (the master's for an instance); term() and restart() fail
  // when the master has none.
  FunctionBuilder& step() { return *master().functions[0]; }
  FunctionBuilder& init() { return *master().functions[1]; }
  FunctionBuilder& term();
  FunctionBuilder& restart();
  // The actual interface of one of the partition's functions for its call id.
  KvCCbActualInterface* instanceOf(FunctionBuilder& function) const;

  PartitionBuilder& withTerm();
  PartitionBuilder& withRestart();
  PartitionBuilder& calledBy(PartitionBuilder& caller);
  // The partition is triggered by a counter, alarm or event block (or another partition).
  PartitionBuilder& triggeredBy(KV_BdBlock* block);
  PartitionBuilder& externPartition();
  PartitionBuilder& runnable();
  PartitionBuilder& operationCall();
  // Inlining state of the step function (as the inlining passes leave it).
  PartitionBuilder& stepInlined(bool removed = false);
  PartitionBuilder& stepInlinedAtomically();

private:
  friend class PartitionedAppBuilder;
  FunctionBuilder& addFunction(const char* suffix, tagKvESymbolRole role,
                               tagKvEFunctionRole partitionRole);
  void addUses(KvCCodeBlockId* codeBlock);

  PartitionedAppBuilder& model;
  KV_BdPartition* bd;
  PartitionBuilder* masterBuilder;
  // Own code: step, init, then term and restart when added (null until then).
  std::vector<FunctionBuilder*> functions{nullptr, nullptr, nullptr, nullptr};
  std::vector<PartitionBuilder*> instances;
};

class PartitionedAppBuilder {
public:
  explicit PartitionedAppBuilder(AppBuilder& application);
  PartitionedAppBuilder(const PartitionedAppBuilder&) = delete;
  PartitionedAppBuilder& operator=(const PartitionedAppBuilder&) = delete;

  AppBuilder& app() { return appBuilder; }
  KvCIvData& view() { return *ivData; }
  // The root partition, with step and init functions "root_step", "root_init".
  PartitionBuilder& root() { return builders.front(); }
  // A partition with code of its own below `parent` (the root when null).
  PartitionBuilder& partition(const char* name, PartitionBuilder* parent = nullptr);
  // A partition that runs the code of `master` (both become reused).
  PartitionBuilder& instance(const char* name, PartitionBuilder& master,
                             PartitionBuilder* parent = nullptr);
  // A counter, alarm or OSEK event block; it calls what it is a trigger of.
  KV_BdBlock* counter(const char* name) { return ivData->createBlock(name, KV_BLOCK_COUNTER); }
  KV_BdBlock* alarm(const char* name) { return ivData->createBlock(name, KV_BLOCK_ALARM); }
  KV_BdBlock* event(const char* name) { return ivData->createBlock(name, KV_BLOCK_OSEK_EVENT); }
  // A function with the given function role (auxiliary by default).
  FunctionBuilder& auxFunction(const char* name, tagKvEFunctionRole role = KV_FROLE_AUX_FUNCTION);

private:
  friend class PartitionBuilder;
  PartitionBuilder& withOwnCode(PartitionBuilder& builder);

  AppBuilder& appBuilder;
  std::unique_ptr<KvCIvData> ivData;
  std::deque<PartitionBuilder> builders;
};

#endif
