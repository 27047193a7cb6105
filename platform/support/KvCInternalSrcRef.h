// KvCInternalSrcRef: a source reference that names a place inside the code generator
// itself (source file and line) and the cause for which an object was made there.
#ifndef HUL_PLATFORM_SUPPORT_KVCINTERNALSRCREF_H
#define HUL_PLATFORM_SUPPORT_KVCINTERNALSRCREF_H

#include "platform/support/KvCSrcRef.h"

class HUL_PLATFORM_API KvCInternalSrcRef : public KvCSrcRef {
public:
  KvCInternalSrcRef() = default;

  void setLocation(const char* file, int line);
  void setCause(const char* text) { cause = text; }

  const WmCXString& getFile() const { return file; }
  int getLine() const { return line; }
  const WmCXString& getCause() const { return cause; }

  // "file:line (cause)".
  WmCXString getText() const override;

private:
  WmCXString file;
  int line = 0;
  WmCXString cause;
};

#endif
