// KV_ICodeFactoryContainer: where the passes get the ICode's factories and servers. Each
// getter returns the one instance of the run; the code view data owns them all.
#ifndef HUL_PLATFORM_ICODE_KV_ICODEFACTORYCONTAINER_H
#define HUL_PLATFORM_ICODE_KV_ICODEFACTORYCONTAINER_H

#include "platform/icode/KV_CgsSupporter.h"
#include "platform/icode/KV_ExprLocFactory.h"
#include "platform/icode/KV_MacroSymbolServer.h"
#include "platform/icode/KV_OperationFactories.h"
#include "platform/icode/KV_OperationFactory.h"
#include "platform/icode/KV_QSOFactories.h"
#include "platform/icode/KV_QSOFactory.h"
#include "platform/icode/KV_RangeServer.h"
#include "platform/icode/KV_StatementFactory.h"
#include "platform/icode/KvCVarClassServer.h"

class KV_BaseTypeServer;
class KV_DataTypeServer;
class KV_NumericalTypeServer;
class KV_ScaleServer;
class KV_SymbolServer;
class KvCSmbClassServer;
class KV_SymbolDB;
class KvCIcFileServer;

class HUL_PLATFORM_API KV_ICodeFactoryContainer {
public:
  explicit KV_ICodeFactoryContainer(KvCCodeViewData* owner);
  KV_ICodeFactoryContainer(const KV_ICodeFactoryContainer&) = delete;
  KV_ICodeFactoryContainer& operator=(const KV_ICodeFactoryContainer&) = delete;

  KV_ExprLocFactory* getExprLocFactory() { return &locations; }
  KV_OperationFactory* getOperationFactory() { return &operations; }
  KV_QSOFactory* getQSOFactory() { return &qsos; }
  KV_StatementFactory* getStatementFactory() { return &statements; }
  KV_DataTypeServer* getDataTypeServer() const;
  KV_BaseTypeServer* getBaseTypeServer() const;
  KV_NumericalTypeServer* getNumTypeServer() const;
  KV_ScaleServer* getScalingServer() const;
  KvCIcFileServer* getFileServer() const;
  KV_SymbolDB* getSymbolDB() const;
  // The servers of variable classes and extern globals, and the code generation support.
  KvCVarClassServer* getVarClassServer() { return &varClasses; }
  KV_MacroSymbolServer* getMacroSymbolServer() { return &macroSymbols; }
  KV_CgsSupporter* getCgsSupporter() { return &cgsSupporter; }
  // The symbol servers (function symbols), the symbol class server and the reference
  // factory; the symbol and symbol class servers are the code view data's.
  KV_SymbolServer* getSymbolServer() const;
  KvCSmbClassServer* getSmbClassServer() const;
  KV_QSOFactories* getQSOFactories() { return &qsoFactories; }
  // The factories of preprocessor concatenations and string appends, and the range server.
  KV_OperationFactories* getOperationFactories() { return &operationFactories; }
  KV_RangeServer* getRangeServer() { return &ranges; }

private:
  KvCCodeViewData* codeViewData;
  KV_ExprLocFactory locations;
  KV_OperationFactory operations;
  KV_QSOFactory qsos;
  KV_StatementFactory statements;
  KV_QSOFactories qsoFactories;
  KV_OperationFactories operationFactories;
  KV_RangeServer ranges;
  KvCVarClassServer varClasses;
  KV_CgsSupporter cgsSupporter;
  KV_MacroSymbolServer macroSymbols; // after the two it uses
};

#endif
