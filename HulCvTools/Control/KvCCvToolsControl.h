// KvCCvToolsControl: the one object through which a caller starts and ends the library
// as a whole. Construct it, boot it with the run's option value storage (which
// registers the library's options), use the services, shut it down, destroy it.
//
// It owns the environment (and through it the options interface). Copying is deleted: a
// copy would share the owned environment and delete it twice.
#ifndef HULCVTOOLS_CONTROL_KVCCVTOOLSCONTROL_H
#define HULCVTOOLS_CONTROL_KVCCVTOOLSCONTROL_H

#include "HulCvTools/Control/KvCHeapObject.h"
#include "HulCvTools/HulCvToolsExport.h"

class KvCCvToolsEnv;
class KvCOptionValueStorage;

class HULCV_API KvCCvToolsControl {
public:
  KvCCvToolsControl();
  ~KvCCvToolsControl();
  KvCCvToolsControl(const KvCCvToolsControl&) = delete;
  KvCCvToolsControl& operator=(const KvCCvToolsControl&) = delete;

  // Registers the options with `storage` (not owned; it must outlive the library's use).
  // Answers true, also when the storage refuses the registration.
  bool boot(KvCOptionValueStorage* storage);
  // Changes nothing (the registration is never withdrawn); answers true.
  bool shutdown();

  // Null only when memory ran out while constructing.
  KvCCvToolsEnv* getEnv() const { return env; }

  HULCV_HEAP_OPERATORS

private:
  KvCCvToolsEnv* env;
};

#endif
