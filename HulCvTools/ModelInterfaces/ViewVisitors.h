// The intermediate view's visitor base, for the library's classes that derive from it.
#ifndef HULCVTOOLS_MODELINTERFACES_VIEWVISITORS_H
#define HULCVTOOLS_MODELINTERFACES_VIEWVISITORS_H

#include "platform/view/KV_BdVisitor.h"

#endif
