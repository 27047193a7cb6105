// KV_ICodeElemVisitor: what KvCICodeIterator calls for each element it walks. Every
// visit does nothing by default; a visitor overrides the ones it needs. stopIteration is
// asked before each visit; once it answers true the walk ends.
//
// The order of the virtual operations is fixed; derived classes of other libraries rely
// on it.
#ifndef HUL_PLATFORM_ICODE_KV_ICODEELEMVISITOR_H
#define HUL_PLATFORM_ICODE_KV_ICODEELEMVISITOR_H

#include "platform/support/HulPlatformExport.h"

class KV_Constant;
class KV_DataType;
class KV_ExprLocation;
class KV_Operation;
class KV_QualifiedSymbolOp;
class KV_Statement;
class KV_StatementTable;
class KvCCodeBlockOperation;
class KvCIcApplication;
class KvCIcCodeUnit;
class KvCIcFileId;
class KvCIcSubAppl;
class KvCSmbInitValExpr;
class KvCStringExpr;
class KvCSymbol;

class HUL_PLATFORM_API KV_ICodeElemVisitor {
public:
  virtual ~KV_ICodeElemVisitor();
  virtual void visitOperation(KV_Operation* op);
  virtual void visitConstant(KV_Constant* constant);
  virtual void visitSymbol(KvCSymbol* symbol);
  virtual void visitExprLocation(KV_ExprLocation* loc);
  virtual void visitStatement(KV_Statement* statement);
  virtual void visitStatementTable(KV_StatementTable* table);
  virtual void visitStringExpr(KvCStringExpr* string);
  virtual void visitEmptyExpr(KV_ExprLocation* loc);
  virtual void visitSmbInitValExpr(KvCSmbInitValExpr* initValue);
  virtual void visitCodeBlockOperation(KvCCodeBlockOperation* op);
  virtual void visitDataType(KV_DataType* type);
  virtual void visitQSO(KV_QualifiedSymbolOp* qso);
  virtual void visitIcApplication(KvCIcApplication* app);
  virtual void visitIcSubApplication(KvCIcSubAppl* sub);
  virtual void visitIcCodeUnit(KvCIcCodeUnit* unit);
  virtual void visitIcFileId(KvCIcFileId* file);
  virtual bool stopIteration();
};

#endif
