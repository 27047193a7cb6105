// The library's order of symbols in ordered containers: by debug index, a null symbol
// first; two symbols with the same debug index count as the same element. leda::set and
// leda::dictionary of KvCSymbol* find it by argument-dependent lookup.
#ifndef HULCVTOOLS_EXPRLOCDBBUILDER_KVCSYMBOLORDER_H
#define HULCVTOOLS_EXPRLOCDBBUILDER_KVCSYMBOLORDER_H

#include "HulCvTools/HulCvToolsExport.h"
#include "HulCvTools/ModelInterfaces/ICodeFwd.h"

// Negative, zero or positive as `a` orders before, with or after `b`.
HULCV_API int compare(KvCSymbol* const& a, KvCSymbol* const& b);

#endif
