// Helpers for the database tests: read a database category, and a snapshot of every
// database of a code view data that two states can be compared by.
#ifndef HULCV_TESTS_EXPRLOCDBBUILDER_DBSNAPSHOT_H
#define HULCV_TESTS_EXPRLOCDBBUILDER_DBSNAPSHOT_H

#include "platform/icode/KV_DataTypeServer.h"
#include "platform/icode/KV_ExprLocation.h"
#include "platform/icode/KV_SymbolDB.h"
#include "platform/icode/KvCCodeViewData.h"
#include "platform/icode/KvCExprLocDB.h"
#include "platform/icode/KvCIcFileServer.h"
#include "platform/icode/KvCSymbol.h"

#include <string>
#include <vector>

inline std::vector<KV_ExprLocation*> entriesOf(KvCExprLocDB* db, tagKvEExprLocDBCategory c) {
  std::vector<KV_ExprLocation*> result;
  if (!db)
    return result;
  leda::dictionary<int, KV_ExprLocation*> entries;
  db->listCategory(c, entries);
  for (const auto& entry : entries)
    result.push_back(entry.second);
  return result;
}

inline std::vector<KV_ExprLocation*> entriesOf(KvCSymbol* s, tagKvEExprLocDBCategory c) {
  return entriesOf(s->getExprLocDB(), c);
}

// One line per non-empty category of every database: owner, category, entry serials.
inline std::vector<std::string> snapshot(KvCCodeViewData& data) {
  std::vector<std::string> lines;
  auto add = [&](const std::string& owner, KvCExprLocDB* db) {
    if (!db)
      return;
    for (int c = 0; c < KV_DB_NUMBER_OF_CATEGORIES; ++c) {
      std::vector<KV_ExprLocation*> e = entriesOf(db, static_cast<tagKvEExprLocDBCategory>(c));
      if (e.empty())
        continue;
      std::string line = owner + " #" + std::to_string(c) + ":";
      for (KV_ExprLocation* loc : e)
        line += " " + std::to_string(loc->getSerial());
      lines.push_back(line);
    }
  };
  KV_SymbolDB* symbols = data.getSymbolDB();
  for (int i = 0; i < symbols->getNumberOfSymbols(); ++i)
    add("symbol " + symbols->getSymbol(i)->getName().str(), symbols->getSymbol(i)->getExprLocDB());
  KV_DataTypeServer* types = data.getDataTypeServer();
  for (int i = 0; i < types->getNumberOfTypes(); ++i)
    add("type " + types->getType(i)->getName().str(), types->getType(i)->findExprLocDB());
  KvCIcFileServer* files = data.getFileServer();
  for (int i = 0; i < files->getNumberOfFiles(); ++i)
    add("file " + files->getFile(i)->getName().str(), files->getFile(i)->findExprLocDB());
  return lines;
}

#endif
