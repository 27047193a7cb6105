#include "HulCvTools/Control/KvCCvToolsEnv.h"

#include "HulCvTools/Control/KvCCvToolsOptionsInterface.h"

HULCV_DEFINE_HEAP_OPERATORS(KvCCvToolsEnv)

KvCCvToolsEnv::KvCCvToolsEnv() : optionsInterface(new KvCCvToolsOptionsInterface) {}

KvCCvToolsEnv::~KvCCvToolsEnv() { delete optionsInterface; }

void KvCCvToolsEnv::boot(KvCOptionValueStorage* storage) {
  if (optionsInterface)
    optionsInterface->boot(storage);
}
