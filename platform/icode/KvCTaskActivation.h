// KvCTaskActivation: what makes a call operation a task activation: the RTOS service
// used and the task it activates. Owned by the code view data.
#ifndef HUL_PLATFORM_ICODE_KVCTASKACTIVATION_H
#define HUL_PLATFORM_ICODE_KVCTASKACTIVATION_H

#include "platform/support/HulPlatformExport.h"
#include "platform/support/WmCXString.h"

enum tagKvETaskActivationKind { KV_TASK_ACTIVATE, KV_TASK_CHAIN, KV_TASK_SET_EVENT };

class HUL_PLATFORM_API KvCTaskActivation {
public:
  KvCTaskActivation(tagKvETaskActivationKind kind, WmCXString task)
      : kind(kind), taskName(std::move(task)) {}

  tagKvETaskActivationKind getKind() const { return kind; }
  const WmCXString& getTaskName() const { return taskName; }

private:
  tagKvETaskActivationKind kind;
  WmCXString taskName;
};

#endif
