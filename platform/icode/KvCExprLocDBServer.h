// KvCExprLocDBServer: hands out the expression-location databases of data types and
// files, and empties every database of the code view data at once. The databases
// themselves live in their symbols, types and files.
#ifndef HUL_PLATFORM_ICODE_KVCEXPRLOCDBSERVER_H
#define HUL_PLATFORM_ICODE_KVCEXPRLOCDBSERVER_H

#include "platform/support/HulPlatformExport.h"

class KV_DataType;
class KvCCodeViewData;
class KvCExprLocDB;
class KvCIcFileId;

class HUL_PLATFORM_API KvCExprLocDBServer {
public:
  explicit KvCExprLocDBServer(KvCCodeViewData* owner) : codeViewData(owner) {}
  KvCExprLocDBServer(const KvCExprLocDBServer&) = delete;
  KvCExprLocDBServer& operator=(const KvCExprLocDBServer&) = delete;

  // The database of the type or file, made when missing; null for null.
  KvCExprLocDB* demandExprLocDB(KV_DataType* type);
  KvCExprLocDB* demandExprLocDB(KvCIcFileId* file);
  // Empties the databases of every symbol, data type and file. O(symbols + types +
  // files + entries).
  void clearExprLocDBs();

private:
  KvCCodeViewData* codeViewData;
};

#endif
