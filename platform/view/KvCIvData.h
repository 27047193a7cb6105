// KvCIvData: the root of the intermediate view: the model's partition hierarchy (the root
// partition, named "root", and the partitions below it), the other blocks of the diagram
// that call partitions (counters, alarms, OSEK events), the code blocks of the partitions'
// functions with their call ids and actual interfaces, and the RTOS database.
//
// It owns every block, code block, call id and actual interface it makes (alive as long
// as it). It does not own the RTOS database: whoever makes the database (a fixture) keeps
// it and sets it here; it must outlive every use through this object.
#ifndef HUL_PLATFORM_VIEW_KVCIVDATA_H
#define HUL_PLATFORM_VIEW_KVCIVDATA_H

#include "platform/support/HulPlatformExport.h"
#include "platform/view/KV_BdPartition.h"

#include <memory>
#include <vector>

class KvCCbActualInterface;
class KvCCodeBlockId;
class KvCIvCallId;
class KvCParamSymbol;
class KvCRoDatabase;

class HUL_PLATFORM_API KvCIvData {
public:
  KvCIvData();
  ~KvCIvData();
  KvCIvData(const KvCIvData&) = delete;
  KvCIvData& operator=(const KvCIvData&) = delete;

  // The root partition of the view; never null, the same object on every call.
  KV_BdPartition* getIvRootPartition() const { return rootPartition.get(); }
  // The RTOS database of the view, or null when none was set.
  KvCRoDatabase* getRtosDatabase() const { return rtosDatabase; }
  void setRtosDatabase(KvCRoDatabase* database) { rtosDatabase = database; }

  // A new partition below `parent` (the root when null), with a call id of its own.
  KV_BdPartition* createPartition(const WmCXString& name, KV_BdPartition* parent = nullptr);
  // A block of another kind lying in `owner` (the root when null).
  KV_BdBlock* createBlock(const WmCXString& name, tagKvEBdBlockKind kind,
                          KV_BdPartition* owner = nullptr);
  // The code block of a function; the symbol's code block accessor answers it from now on.
  KvCCodeBlockId* createCodeBlock(KvCParamSymbol* function);
  // A use of the code block by the partition's call id, with its actual interface.
  KvCCbActualInterface* addUse(KvCCodeBlockId* codeBlock, KV_BdPartition* partition,
                               const WmCXString& instanceName);
  // Makes `instance` share the generated code of `master`: both become reused, with
  // `master` as their group's master block.
  void setReuse(KV_BdPartition* instance, KV_BdPartition* master);

private:
  KvCIvCallId* newCallId(KV_BdPartition* partition);

  std::unique_ptr<KV_BdPartition> rootPartition;
  KvCRoDatabase* rtosDatabase = nullptr;
  std::vector<std::unique_ptr<KV_BdBlock>> blocks;
  std::vector<std::unique_ptr<KvCCodeBlockId>> codeBlocks;
  std::vector<std::unique_ptr<KvCIvCallId>> callIds;
  std::vector<std::unique_ptr<KvCCbActualInterface>> actuals;
};

#endif
