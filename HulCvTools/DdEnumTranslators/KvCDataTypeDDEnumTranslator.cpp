#include "HulCvTools/DdEnumTranslators/KvCDataTypeDDEnumTranslator.h"

// Defined here so that the class's virtual table is emitted once, in the library.
KvCDataTypeDDEnumTranslator::~KvCDataTypeDDEnumTranslator() = default;
