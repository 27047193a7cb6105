// KvCIvAUTOSARTool: the AUTOSAR classification of partitions: runnables and operation
// calls of a software component, which the component's frame calls.
#ifndef HUL_PLATFORM_VIEW_KVCIVAUTOSARTOOL_H
#define HUL_PLATFORM_VIEW_KVCIVAUTOSARTOOL_H

#include "platform/support/HulPlatformExport.h"
#include "platform/view/KV_BdPartition.h"

class HUL_PLATFORM_API KvCIvAUTOSARTool {
public:
  static bool isRunnable(const KV_BdPartition* partition) {
    return partition && partition->getAutosarKind() == KV_AUTOSAR_RUNNABLE;
  }
  static bool isOperationCall(const KV_BdPartition* partition) {
    return partition && partition->getAutosarKind() == KV_AUTOSAR_OPERATION_CALL;
  }

private:
  KvCIvAUTOSARTool() = delete;
};

#endif
