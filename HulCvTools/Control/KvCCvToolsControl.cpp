#include "HulCvTools/Control/KvCCvToolsControl.h"

#include "HulCvTools/Control/KvCCvToolsEnv.h"
#include "platform/support/WmCXString.h"

HULCV_DEFINE_HEAP_OPERATORS(KvCCvToolsControl)

namespace {
// Touches the string class once at boot: an empty string and its C string. It keeps no
// state and changes nothing.
class KvCDebugWmCXString {
public:
  KvCDebugWmCXString() { (void)text.c_str(); }

private:
  WmCXString text;
};
} // namespace

KvCCvToolsControl::KvCCvToolsControl() : env(new KvCCvToolsEnv) {}

KvCCvToolsControl::~KvCCvToolsControl() { delete env; }

bool KvCCvToolsControl::boot(KvCOptionValueStorage* storage) {
  const KvCDebugWmCXString debugString;
  if (env)
    env->boot(storage);
  return true;
}

bool KvCCvToolsControl::shutdown() { return true; }
