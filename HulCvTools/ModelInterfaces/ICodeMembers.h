// The ICode's classes that library classes hold by value.
#ifndef HULCVTOOLS_MODELINTERFACES_ICODEMEMBERS_H
#define HULCVTOOLS_MODELINTERFACES_ICODEMEMBERS_H

#include "HulCvTools/ModelInterfaces/ICodeFwd.h"
#include "platform/icode/KvCElocDbQuery.h"

#endif
