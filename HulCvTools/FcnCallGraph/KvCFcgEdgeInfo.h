// KvCFcgEdgeInfo: the payload of a call-graph edge (one ordered pair of functions): how
// many call operations the edge stands for, whether any of them activates a task, and,
// in the reuse call graph, the instances of the calling and the called reused function.
//
// Each default construction takes the next value of the class-wide counter s_DebugIndex
// (0 for the first edge info of the process) as its debug index. Assignment copies every
// field, the debug index included.
#ifndef HULCVTOOLS_FCNCALLGRAPH_KVCFCGEDGEINFO_H
#define HULCVTOOLS_FCNCALLGRAPH_KVCFCGEDGEINFO_H

#include "HulCvTools/Control/KvCHeapObject.h"
#include "HulCvTools/HulCvToolsExport.h"
#include "HulCvTools/ModelInterfaces/ViewFwd.h"

#include <cstddef>

class KvCObjectPool;

class HULCV_API KvCFcgEdgeInfo {
public:
  // Serial number of the next edge info; a plain counter (one pass at a time).
  static int s_DebugIndex;

  KvCFcgEdgeInfo() : debugIndex(s_DebugIndex++) {}
  KvCFcgEdgeInfo(const KvCFcgEdgeInfo&) = default;
  KvCFcgEdgeInfo& operator=(const KvCFcgEdgeInfo&) = default;
  ~KvCFcgEdgeInfo() {}

  int getCardinality() const { return cardinality; }
  void setCardinality(int value) { cardinality = value; }
  void incCardinality() { ++cardinality; }
  void decCardinality() { --cardinality; }
  bool isTaskCall() const { return taskCall; }
  void setIsTaskCall(bool value) { taskCall = value; }
  KvCCbActualInterface* getCalledInstanceId() const { return calledInstanceId; }
  void setCalledInstanceId(KvCCbActualInterface* id) { calledInstanceId = id; }
  KvCCbActualInterface* getCallingInstanceId() const { return callingInstanceId; }
  void setCallingInstanceId(KvCCbActualInterface* id) { callingInstanceId = id; }
  int getDebugIndex() const { return debugIndex; }

  HULCV_HEAP_OPERATORS
  // Storage from a pool; such an info is still released by a plain delete.
  static void* operator new(std::size_t size, KvCObjectPool& pool) noexcept;
  static void operator delete(void* object, KvCObjectPool& pool) noexcept;

private:
  bool taskCall = false;
  int cardinality = 0;
  int debugIndex;
  KvCCbActualInterface* calledInstanceId = nullptr;
  KvCCbActualInterface* callingInstanceId = nullptr;
};

#endif
