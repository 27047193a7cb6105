#include "platform/support/KvCInternalSrcRef.h"

void KvCInternalSrcRef::setLocation(const char* fileName, int lineNumber) {
  file = fileName;
  line = lineNumber;
}

WmCXString KvCInternalSrcRef::getText() const {
  return file + ":" + WmCXString(line, false, false) + " (" + cause + ")";
}
