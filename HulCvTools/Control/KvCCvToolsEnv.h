// KvCCvToolsEnv: the library's environment, owned by the control object. It owns the
// options interface (created in the constructor, deleted in the destructor).
#ifndef HULCVTOOLS_CONTROL_KVCCVTOOLSENV_H
#define HULCVTOOLS_CONTROL_KVCCVTOOLSENV_H

#include "HulCvTools/Control/KvCHeapObject.h"
#include "HulCvTools/HulCvToolsExport.h"

class KvCCvToolsOptionsInterface;
class KvCOptionValueStorage;

class HULCV_API KvCCvToolsEnv {
public:
  KvCCvToolsEnv();
  virtual ~KvCCvToolsEnv();
  // Copies would share, and then delete twice, the owned options interface.
  KvCCvToolsEnv(const KvCCvToolsEnv&) = delete;
  KvCCvToolsEnv& operator=(const KvCCvToolsEnv&) = delete;

  // Boots the options interface with `storage`; its answer is not used.
  void boot(KvCOptionValueStorage* storage);

  // Null only when memory ran out while constructing.
  KvCCvToolsOptionsInterface* getOptionsInterface() const { return optionsInterface; }

  HULCV_HEAP_OPERATORS

private:
  KvCCvToolsOptionsInterface* optionsInterface;
};

#endif
