// The ICode model as the library's sources see it. The library includes the model only
// through this header (and ICodeFwd.h in its own headers).
#ifndef HULCVTOOLS_MODELINTERFACES_ICODEMODEL_H
#define HULCVTOOLS_MODELINTERFACES_ICODEMODEL_H

#include "HulCvTools/ModelInterfaces/ICodeFwd.h"
#include "platform/icode/KV_Constant.h"
#include "platform/icode/KV_DataType.h"
#include "platform/icode/KV_DataTypeServer.h"
#include "platform/icode/KV_ExprLocation.h"
#include "platform/icode/KV_ICodeElemVisitor.h"
#include "platform/icode/KV_ICodeFactoryContainer.h"
#include "platform/icode/KV_OpConversionLevel.h"
#include "platform/icode/KV_OpOperator.h"
#include "platform/icode/KV_Operation.h"
#include "platform/icode/KV_QualifiedSymbolOp.h"
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
#include "platform/icode/KvCIcFileId.h"
#include "platform/icode/KvCParamSymbol.h"
#include "platform/icode/KvCQsoExprLocDB.h"
#include "platform/icode/KvCSmbInitValExpr.h"
#include "platform/icode/KvCStringExpr.h"
#include "platform/icode/KvCSymbolQuery.h"
#include "platform/icode/KvCUnparamSymbol.h"

#endif
