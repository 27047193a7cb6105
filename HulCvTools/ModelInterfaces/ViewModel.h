// The intermediate view as the library's sources see it.
//
// What the reuse call graph relies on beyond the operations it names:
// - KvCCodeBlockId::getCodeBlock() is never null; KvCCodeBlock::getCallIds() lists the
//   code block's call ids (its size tells a code block with a single use), and
//   getActualInterface(callId) is null for a call id the block has no use for.
// - KvCParamSymbol::getCodeBlockId(): the function's own code block in the view (null for a
//   function without one); a partition function's symbol answers the same object the
//   partition-database entry names.
// - KvCCbActualInterface::getCallId() and KvCIvCallId::getPartition(): the partition that an
//   instance belongs to.
// - KV_BdBlock::getPartition(): the partition a block makes or lies in (a partition: itself).
// - KvCIvFcnReuseTools answers from the view alone (a default-constructed object suffices);
//   getReusedMasterBlock is non-null for every block of a reuse group, the master included.
// - KvCIvTools::getCallersSkipCounterAlarmConsiderOsekEvents appends to the given list.
// - KV_BdVisitor::visitPartition is the visit of a partition that the partition iterator
//   calls; the third argument of iterHierarchyDepthFirst (a KvCIvBorderCrossing*) may be
//   null.
#ifndef HULCVTOOLS_MODELINTERFACES_VIEWMODEL_H
#define HULCVTOOLS_MODELINTERFACES_VIEWMODEL_H

#include "HulCvTools/ModelInterfaces/ViewFwd.h"
#include "platform/view/KV_BdBlock.h"
#include "platform/view/KV_BdPartition.h"
#include "platform/view/KV_BdVisitor.h"
#include "platform/view/KvCCbActualInterface.h"
#include "platform/view/KvCCodeBlock.h"
#include "platform/view/KvCCodeBlockId.h"
#include "platform/view/KvCIvAUTOSARTool.h"
#include "platform/view/KvCIvBorderCrossing.h"
#include "platform/view/KvCIvCallId.h"
#include "platform/view/KvCIvData.h"
#include "platform/view/KvCIvFcnReuseTools.h"
#include "platform/view/KvCIvPartitionDbEntry.h"
#include "platform/view/KvCIvPdbEntryId.h"
#include "platform/view/KvCIvTools.h"
#include "platform/view/KvCPartitionControlFlow.h"
#include "platform/view/KvCPartitionIterator.h"
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
#include "platform/view/KvCSignal.h"

#endif
