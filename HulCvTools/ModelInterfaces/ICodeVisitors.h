// The ICode's visitor bases, which library classes derive from.
#ifndef HULCVTOOLS_MODELINTERFACES_ICODEVISITORS_H
#define HULCVTOOLS_MODELINTERFACES_ICODEVISITORS_H

#include "HulCvTools/ModelInterfaces/ICodeFwd.h"
#include "platform/icode/KV_ICodeElemVisitor.h"
#include "platform/icode/KV_SmbDBObjVisitor.h"

#endif
