#include "platform/builder/PartitionBuilder.h"

#include "platform/icode/KvCFcgFunctionInfo.h"
#include "platform/icode/KvCParamSymbol.h"
#include "platform/view/KvCCodeBlockId.h"

#include <string>

PartitionedAppBuilder::PartitionedAppBuilder(AppBuilder& application)
    : appBuilder(application), ivData(std::make_unique<KvCIvData>()) {
  builders.emplace_back(*this, ivData->getIvRootPartition(), nullptr);
  withOwnCode(builders.back());
}

PartitionBuilder& PartitionedAppBuilder::withOwnCode(PartitionBuilder& builder) {
  builder.functions[0] =
      &builder.addFunction("step", KV_ROLE_STEP_FUNCTION, KV_FROLE_PARTITION_STEP);
  builder.functions[1] =
      &builder.addFunction("init", KV_ROLE_INIT_FUNCTION, KV_FROLE_PARTITION_INIT);
  return builder;
}

PartitionBuilder& PartitionedAppBuilder::partition(const char* name, PartitionBuilder* parent) {
  KV_BdPartition* bd = ivData->createPartition(name, parent ? parent->partition() : nullptr);
  builders.emplace_back(*this, bd, nullptr);
  return withOwnCode(builders.back());
}

PartitionBuilder& PartitionedAppBuilder::instance(const char* name, PartitionBuilder& master,
                                                  PartitionBuilder* parent) {
  if (master.masterBuilder)
    appBuilder.fail(std::string("an instance of an instance: ") + name);
  KV_BdPartition* bd = ivData->createPartition(name, parent ? parent->partition() : nullptr);
  builders.emplace_back(*this, bd, &master);
  PartitionBuilder& result = builders.back();
  ivData->setReuse(bd, master.partition());
  master.instances.push_back(&result);
  for (FunctionBuilder* function : master.functions)
    if (function)
      ivData->addUse(function->symbol()->getCodeBlockId(), bd, name);
  return result;
}

FunctionBuilder& PartitionedAppBuilder::auxFunction(const char* name, tagKvEFunctionRole role) {
  FunctionBuilder& function = appBuilder.function(name);
  function.symbol()->setFunctionRole(role, true);
  return function;
}

FunctionBuilder& PartitionBuilder::addFunction(const char* suffix, tagKvESymbolRole role,
                                               tagKvEFunctionRole partitionRole) {
  const std::string name = std::string(bd->getName().c_str()) + "_" + suffix;
  FunctionBuilder& function = model.appBuilder.function(name.c_str());
  function.role(role);
  function.symbol()->setFunctionRole(partitionRole, true);
  KvCCodeBlockId* codeBlock = model.ivData->createCodeBlock(function.symbol());
  addUses(codeBlock);
  KvCIvPartitionDbEntry* entry = bd->getPdbEntryId()->getPdbEntry();
  switch (role) {
  case KV_ROLE_STEP_FUNCTION:
    entry->setStepFunction(codeBlock);
    break;
  case KV_ROLE_INIT_FUNCTION:
    entry->setInitFunction(codeBlock);
    break;
  case KV_ROLE_TERM_FUNCTION:
    entry->setTermFunction(codeBlock);
    break;
  default:
    entry->setRestartFunction(codeBlock);
    break;
  }
  return function;
}

void PartitionBuilder::addUses(KvCCodeBlockId* codeBlock) {
  model.ivData->addUse(codeBlock, bd, bd->getName());
  for (PartitionBuilder* instance : instances)
    model.ivData->addUse(codeBlock, instance->bd, instance->bd->getName());
}

FunctionBuilder& PartitionBuilder::term() {
  if (!master().functions[2])
    model.appBuilder.fail("partition without term function");
  return *master().functions[2];
}

FunctionBuilder& PartitionBuilder::restart() {
  if (!master().functions[3])
    model.appBuilder.fail("partition without restart function");
  return *master().functions[3];
}

KvCCbActualInterface* PartitionBuilder::instanceOf(FunctionBuilder& function) const {
  return function.symbol()->getCodeBlockId()->getCodeBlock()->getActualInterface(bd->getCallId());
}

PartitionBuilder& PartitionBuilder::withTerm() {
  if (masterBuilder)
    model.appBuilder.fail("an instance runs its master's code");
  if (!functions[2])
    functions[2] = &addFunction("term", KV_ROLE_TERM_FUNCTION, KV_FROLE_PARTITION_TERM);
  return *this;
}

PartitionBuilder& PartitionBuilder::withRestart() {
  if (masterBuilder)
    model.appBuilder.fail("an instance runs its master's code");
  if (!functions[3])
    functions[3] = &addFunction("restart", KV_ROLE_RESTART_FUNCTION, KV_FROLE_PARTITION_RESTART);
  return *this;
}

PartitionBuilder& PartitionBuilder::calledBy(PartitionBuilder& caller) {
  bd->addTrigger(caller.bd);
  caller.step().body().call(step().symbol(), {});
  return *this;
}

PartitionBuilder& PartitionBuilder::triggeredBy(KV_BdBlock* block) {
  bd->addTrigger(block);
  return *this;
}

PartitionBuilder& PartitionBuilder::externPartition() {
  bd->setExtern(true);
  return *this;
}

PartitionBuilder& PartitionBuilder::runnable() {
  bd->setAutosarKind(KV_AUTOSAR_RUNNABLE);
  return *this;
}

PartitionBuilder& PartitionBuilder::operationCall() {
  bd->setAutosarKind(KV_AUTOSAR_OPERATION_CALL);
  return *this;
}

PartitionBuilder& PartitionBuilder::stepInlined(bool removed) {
  KvCFcgFunctionInfo* info = step().symbol()->getFunctionInfo();
  info->setInlined(true);
  info->setRemoved(removed);
  return *this;
}

PartitionBuilder& PartitionBuilder::stepInlinedAtomically() {
  step().symbol()->setFunctionRole(KV_FROLE_ATOMIC_INLINE, true);
  return stepInlined(true);
}
