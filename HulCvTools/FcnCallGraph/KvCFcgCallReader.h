// KvCFcgCallReader (internal to the call graphs, not exported): reads, for one construction
// run, the call operation above every use of the function and macro symbols that the run
// visits, together with the call's calling and called function.
//
// Why: the uses of one function lie scattered over the bodies of all its callers, so
// reading them symbol by symbol jumps through the whole ICode once per use. readAhead
// lists the uses of every visited symbol first and reads them in ascending key order (the
// keys of the use listing, the ICode's creation order), which walks the ICode front to
// back; the graph then enters the calls symbol by symbol, in the order and with the hooks
// of a plain walk, taking what was read from here. Only model reads move ahead: nothing of
// the graph is touched, so hooks see the graph exactly as entering each use in turn leaves
// it. The ICode's calls must not change while a run lasts (hooks must not add or remove
// call operations).
//
// A symbol that readAhead did not list (made during the run, or visited out of order) is
// read when asked for. Memory: about 60 bytes per listed use while a run lasts; clear()
// gives it back.
#ifndef HULCVTOOLS_FCNCALLGRAPH_KVCFCGCALLREADER_H
#define HULCVTOOLS_FCNCALLGRAPH_KVCFCGCALLREADER_H

#include "HulCvTools/ModelInterfaces/ICodeFwd.h"

#include <cstddef>
#include <cstdint>
#include <utility>
#include <vector>

class KV_ParamSmbDBObj;

// Whether the symbol visitor of a construction treats `entry`: every entry when
// `visitAll`, else those whose symbol is selected.
bool kvFcgVisitsEntry(KV_ParamSmbDBObj* entry, bool visitAll);

class KvCFcgCallReader {
public:
  // What stands above one use: `call` is null when the use is no operand of a call
  // operation; `hasOperation` is false when the use has no operation at all.
  struct UseCall {
    KvCCallOperation* call;
    KvCParamSymbol* calling;
    KvCParamSymbol* called;
    bool hasOperation;
  };
  using Range = std::pair<const UseCall*, const UseCall*>;

  // Lists the uses of every entry of `symbols` that the visitor would treat, in the
  // database's order, and reads the call above each in ascending key order.
  void readAhead(KV_SymbolDB* symbols, bool visitAll);
  // The calls above the uses of `function`, in ascending key order of the uses: those read
  // ahead when `function` is the next symbol listed, else read now. Valid until the next
  // call of callsOf, readAhead or clear.
  Range callsOf(KvCParamSymbol* function);
  // Forgets everything read and gives the memory back.
  void clear();

private:
  static UseCall readUse(KV_ExprLocation* use);
  // Fills `order` with the indices of `keys`, ascending by key to within a bucket of
  // nearby keys (one counting pass). O(n + buckets).
  static void orderByKey(const std::vector<int>& keys, std::vector<std::uint32_t>& order);

  std::vector<KvCParamSymbol*> symbols; // listed, in visiting order
  std::vector<std::uint32_t> firstUse;  // per listed symbol, and one past the last
  std::vector<UseCall> calls;           // per listed use, grouped by symbol
  std::size_t nextSymbol = 0;           // the next listed symbol callsOf expects
  std::vector<UseCall> late;            // the calls of a symbol read when asked for
};

#endif
