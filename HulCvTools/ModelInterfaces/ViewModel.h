// The intermediate view as the library's sources see it.
#ifndef HULCVTOOLS_MODELINTERFACES_VIEWMODEL_H
#define HULCVTOOLS_MODELINTERFACES_VIEWMODEL_H

#include "HulCvTools/ModelInterfaces/ViewFwd.h"
#include "platform/view/KV_BdPartition.h"
#include "platform/view/KvCIvData.h"
#include "platform/view/KvCRoAlarm.h"
#include "platform/view/KvCRoCounter.h"
#include "platform/view/KvCRoCounterAPI.h"
#include "platform/view/KvCRoCounterAPIFcn.h"
#include "platform/view/KvCRoDataTypes.h"
#include "platform/view/KvCRoDatabase.h"
#include "platform/view/KvCRoEvent.h"
#include "platform/view/KvCRoMessage.h"
#include "platform/view/KvCRoRTOSInfo.h"
#include "platform/view/KvCRoResource.h"

#endif
