#include "platform/support/KvCCIdentifier.h"

#include "platform/support/KvCNames.h"

WmCXString KvCCIdentifier::getCookedName() const { return KvCNames::cookName(rawName); }
