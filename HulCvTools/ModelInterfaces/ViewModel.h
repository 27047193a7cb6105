// The intermediate view as the library's sources see it.
#ifndef HULCVTOOLS_MODELINTERFACES_VIEWMODEL_H
#define HULCVTOOLS_MODELINTERFACES_VIEWMODEL_H

#include "HulCvTools/ModelInterfaces/ViewFwd.h"
#include "platform/view/KvCIvData.h"

#endif
