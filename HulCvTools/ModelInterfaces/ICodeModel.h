// The ICode model as the library's sources see it. The library includes the model only
// through this header (and ICodeFwd.h in its own headers).
//
// Model operations the call graphs rely on, with the meaning a model plugged in here must
// give them:
// - KvCCodeViewData::getCurrent(): the code view data of the run (null before one exists);
//   construct walks its symbol database (getSymbolDB()->forallParametrizedSymbols), which
//   also visits symbols made during the walk.
// - KvCSymbol::getExprLocDB()->listUses(std::vector<KvCExprLocDB::KeyedLocation>&): the
//   symbol's uses with their integer keys, all use categories, in ascending key order, into
//   the caller's buffer, which it clears first: the items of the dictionary form, without
//   a tree node per use. Keys are comparable across databases (the ICode's creation order).
// - KV_ExprLocation::getOperation(): the operation standing at the location, or null;
//   KV_Operation::getParentOperation(): the operation that has the operation's location as
//   an operand, or null; KV_Operation::asCallOperation(): the call-operation view or null.
// - KvCCallOperation::getCallingSymbol() / getCalledSymbol(): the function whose body
//   holds the call (null outside every function) and the called function or macro;
//   isTaskActivation(): whether the call's task-activation descriptor is present;
//   getParent() and KV_ExprLocation::getSmbInitValExpr(): the walk up to a symbol's
//   initial-value expression.
// - KvCParamSymbol::getFunctionInfo(): the symbol's own function info, the same object for
//   the symbol's whole life; KvCFcgFunctionInfo's call-operation set (addCallOperation,
//   delCallOperation, getCallOperationsSet().clear()) and called-function set
//   (addCalledFcn), each ignoring a repeated element.
#ifndef HULCVTOOLS_MODELINTERFACES_ICODEMODEL_H
#define HULCVTOOLS_MODELINTERFACES_ICODEMODEL_H

#include "HulCvTools/ModelInterfaces/ICodeFwd.h"
#include "platform/icode/KV_BaseTypeServer.h"
#include "platform/icode/KV_Constant.h"
#include "platform/icode/KV_DataType.h"
#include "platform/icode/KV_DataTypeServer.h"
#include "platform/icode/KV_DimensionDescriptor.h"
#include "platform/icode/KV_ExprLocation.h"
#include "platform/icode/KV_ICodeElemVisitor.h"
#include "platform/icode/KV_ICodeFactoryContainer.h"
#include "platform/icode/KV_OpConversionInfo.h"
#include "platform/icode/KV_OpConversionLevel.h"
#include "platform/icode/KV_OpSaturationInfo.h"
#include "platform/icode/KV_OpOperator.h"
#include "platform/icode/KV_NumericalTypeServer.h"
#include "platform/icode/KV_Operation.h"
#include "platform/icode/KV_PointerTypeServer.h"
#include "platform/icode/KV_QualifiedSymbolOp.h"
#include "platform/icode/KV_Range.h"
#include "platform/icode/KV_RangeLimiter.h"
#include "platform/icode/KV_ScaleServer.h"
#include "platform/icode/KV_Scaling.h"
#include "platform/icode/KV_Statement.h"
#include "platform/icode/KV_StatementTable.h"
#include "platform/icode/KV_SymbolDB.h"
#include "platform/icode/KvCAccessQsoQuery.h"
#include "platform/icode/KvCCStmTable.h"
#include "platform/icode/KvCCallOperation.h"
#include "platform/icode/KvCCodeBlockOperation.h"
#include "platform/icode/KvCCodeViewData.h"
#include "platform/icode/KvCExprLocDB.h"
#include "platform/icode/KvCExprLocDBServer.h"
#include "platform/icode/KvCFcgFunctionInfo.h"
#include "platform/icode/KvCICodeIterator.h"
#include "platform/icode/KvCIcExprEqualitySpec.h"
#include "platform/icode/KvCIcFile.h"
#include "platform/icode/KvCIcFileId.h"
#include "platform/icode/KvCIcFileServer.h"
#include "platform/icode/KvCParamSymbol.h"
#include "platform/icode/KvCQsoExprLocDB.h"
#include "platform/icode/KvCRangeConverter.h"
#include "platform/icode/KvCScaleTool.h"
#include "platform/icode/KvCSmbInitValExpr.h"
#include "platform/icode/KvCStringExpr.h"
#include "platform/icode/KvCSymbolQuery.h"
#include "platform/icode/KvCUnparamSymbol.h"

#endif
