// A program outside the project: boots the installed library against an option value
// storage and checks that the options were registered.
#include "HulCvTools/Control/KvCCvToolsControl.h"
#include "HulCvTools/Control/KvCCvToolsEnv.h"
#include "HulCvTools/Control/KvCCvToolsOptionsInterface.h"
#include "platform/support/KvCOptionValueStorage.h"

#include <cstdio>

int main() {
  KvCOptionValueStorage storage;
  KvCCvToolsControl control;
  if (!control.boot(&storage) || !control.shutdown())
    return 1;
  const KvCCvToolsOptionsInterface* options = control.getEnv()->getOptionsInterface();
  const int id = options->getInterfaceId();
  const std::size_t count = storage.getNumberOfOptions(id);
  std::printf("consumer: %zu options under interface id %d\n", count, id);
  return count == KvCCvToolsOptionsInterface::kNumberOfOptions ? 0 : 1;
}
