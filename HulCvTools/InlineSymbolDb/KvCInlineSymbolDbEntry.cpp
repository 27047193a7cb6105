#include "HulCvTools/InlineSymbolDb/KvCInlineSymbolDbEntry.h"

HULCV_DEFINE_HEAP_OPERATORS(KvCInlineSymbolDbEntry)
