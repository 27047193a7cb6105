// Forward declarations of the intermediate view's classes (partitions, RTOS database).
// The library reaches the view only through this folder.
#ifndef HULCVTOOLS_MODELINTERFACES_VIEWFWD_H
#define HULCVTOOLS_MODELINTERFACES_VIEWFWD_H

class KV_BdBlock;
class KV_BdPartition;
class KV_BdVisitor;
class KvCCbActualInterface;
class KvCCodeBlock;
class KvCCodeBlockId;
class KvCIvCallId;
class KvCIvData;
class KvCIvFcnReuseTools;
class KvCIvPartitionDbEntry;
class KvCIvPdbEntryId;
class KvCPartitionControlFlow;
class KvCPartitionIterator;
class KvCRoAlarm;
class KvCRoCounter;
class KvCRoDatabase;
class KvCRoDataTypes;
class KvCRoEvent;
class KvCRoMessage;
class KvCRoRTOSInfo;
class KvCRoResource;
class KvCSignal;

#endif
