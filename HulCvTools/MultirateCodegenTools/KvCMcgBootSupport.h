// What the second boot phases of the RTOS and the Ecp servers share (internal to the
// library, not exported): the internal source reference each server makes for its model
// calls, and the header file of a file pair.
#ifndef HULCVTOOLS_MULTIRATECODEGENTOOLS_KVCMCGBOOTSUPPORT_H
#define HULCVTOOLS_MULTIRATECODEGENTOOLS_KVCMCGBOOTSUPPORT_H

#include "HulCvTools/ModelInterfaces/ICodeFwd.h"

class KvCInternalSrcRef;
class KvCSrcRef;

// A new internal source reference from the code view's source reference server, located at
// the calling server's `file` and `line`, with `cause`; null when the server gives none.
KvCInternalSrcRef* kvMcgInternalSrcRef(KvCCodeViewData* codeView, const char* file, int line,
                                       const char* cause);

// The header file of the root or the Acme file pair, demanded from `files` with `srcRef`;
// null when the pair cannot be had.
KvCIcFile* kvMcgRootHeader(KvCIcFileServer* files, const KvCSrcRef* srcRef);
KvCIcFile* kvMcgAcmeHeader(KvCIcFileServer* files, const KvCSrcRef* srcRef);

#endif
