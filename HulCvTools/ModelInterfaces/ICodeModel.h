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
//
// What the RTOS symbol server relies on beyond the operations it names:
// - KV_CgsSupporter::createScalarVariable's flag and word: `false` asks for exactly the
//   given name (a name taken in the table's scope fails the creation, null, nothing made);
//   `0` gives the variable no symbol roles. A variable of an extern variable class gets a
//   declaration statement in the table (a file's top-level table), which the file's
//   header then declares; null means that nothing was made.
// - KV_MacroSymbolServer::demandExternGlobal: one extern global per name in the run; null
//   (nothing made) when the name cannot be had in the file (not a C identifier, taken
//   otherwise) or a global of the name exists with another file, type or scaling.
// - KvCSrcRefServer::getSrcRef() of KvCCodeViewData::getSrcRefServer(): a new internal
//   source reference owned by the run.
//
// What the RTOS function server relies on beyond the operations it names:
// - KV_FunctionSymbolServer::demand answers the function of that name in that table, made
//   when missing; for a name the table has with another signature (parameter count,
//   parameter or return types) it answers null, and find(table, name) gives the function
//   that is there. The call inserter's demandFunctionSymbol follows the same rule.
// - KvCParamSymbol::getNumberOfFormalParams(): the parameter count of a function made by
//   those servers (used to tell a parameter-count conflict from other failures).
// - KV_ParamAccess objects are made with new and deleted by the caller after the call
//   inserter's demand; new may answer null when memory runs out.
// - KvCFunctionTemplateDescr::getFunctionClass() may be null (a template without class).
// - KvCApplicationServer::demandUserSubAppl(const KvCSrcRef*): the user sub-application;
//   null when there is none.
// - KvCIcFileId::getFile() of a complementary file id; KvCIcFile::getFileId().
// - The container's pointer type server is KV_ICodeFactoryContainer::getDataTypeServer()->
//   getPointerServer(); KV_ScaleServer's adaptive, default and default void scalings are
//   three distinct objects, each the same for the whole run.
// - KvCNames::replaceMultirateCtrName replaces the counter name macro of a name form
//   (KvCNames::kMultirateCtrNameMacro) by the counter's name; createNameFromForm completes
//   the form; KvCCIdentifier::getCookedName(0) makes the result a C identifier.
// - KV_ExprLocFactory::createFromName(name, true, srcRef): a location naming the counter's
//   identifier; createFromValue(0, srcRef): the constant 0; KV_RefFactory::createRef: the
//   address of a symbol (an operation without location, which createFromOperation takes).
//
// What the inline symbol database relies on beyond the operations it names:
// - KvCUnparamSymbol::isStructInstance(): the variable has component slots (its type is a
//   structure); isComponent(): it is a component of a structure; getStructSymbol(): for a
//   component made for a structure instance, that instance, else null (a free component).
// - KvCCompSymbolIterator(symbol, true, false, true): walks the instance's own component
//   slots in the order of its type, each slot once, not descending into nested instances
//   and standing also on slots that are structures or have no symbol; finished() ends the
//   walk, isValidComponent() says that the slot has a component symbol (false once
//   finished), getComponent() gives it, next() moves on. A walk over a symbol that is not a
//   structure instance is finished at once.
//
// What the reuse call graph relies on beyond the operations it names:
// - KvCParamSymbol's function roles (isAuxFunction, isPartitionStepFunction, ...,
//   isRteApiFuncCall, isRteApiMacroCall, isCalledBySimFrame) are fixed while it is built.
// - KvCFcgFunctionInfo::isInlinedAtomic() reads the mark the transformation library's
//   functor sets; isInlined() and isRemoved() are the inlining passes' marks.
// - KvCFcgFunctionInfo::getSymbol(): the function the info belongs to.
#ifndef HULCVTOOLS_MODELINTERFACES_ICODEMODEL_H
#define HULCVTOOLS_MODELINTERFACES_ICODEMODEL_H

#include "HulCvTools/ModelInterfaces/ICodeFwd.h"
#include "platform/icode/KV_BaseTypeServer.h"
#include "platform/icode/KV_CgsSupporter.h"
#include "platform/icode/KV_Constant.h"
#include "platform/icode/KV_DataType.h"
#include "platform/icode/KV_DataTypeServer.h"
#include "platform/icode/KV_DimensionDescriptor.h"
#include "platform/icode/KV_ExprDescr.h"
#include "platform/icode/KV_ExprDescrTupel.h"
#include "platform/icode/KV_ExprLocation.h"
#include "platform/icode/KV_FunctionCallInserter.h"
#include "platform/icode/KV_FunctionSymbolServer.h"
#include "platform/icode/KV_ICodeElemVisitor.h"
#include "platform/icode/KV_ICodeFactoryContainer.h"
#include "platform/icode/KV_LogObj.h"
#include "platform/icode/KV_MacroSymbolServer.h"
#include "platform/icode/KV_OpConversionInfo.h"
#include "platform/icode/KV_OpConversionLevel.h"
#include "platform/icode/KV_OpSaturationInfo.h"
#include "platform/icode/KV_OpOperator.h"
#include "platform/icode/KV_NumericalTypeServer.h"
#include "platform/icode/KV_Operation.h"
#include "platform/icode/KV_ParamAccess.h"
#include "platform/icode/KV_PointerTypeServer.h"
#include "platform/icode/KV_QSOFactories.h"
#include "platform/icode/KV_QualifiedSymbolOp.h"
#include "platform/icode/KV_Range.h"
#include "platform/icode/KV_RangeLimiter.h"
#include "platform/icode/KV_ScaleServer.h"
#include "platform/icode/KV_Scaling.h"
#include "platform/icode/KV_Statement.h"
#include "platform/icode/KV_StatementTable.h"
#include "platform/icode/KV_SymbolDB.h"
#include "platform/icode/KV_SymbolServer.h"
#include "platform/icode/KvCAccessQsoQuery.h"
#include "platform/icode/KvCApplicationServer.h"
#include "platform/icode/KvCCStmTable.h"
#include "platform/icode/KvCCallOperation.h"
#include "platform/icode/KvCCodeBlockOperation.h"
#include "platform/icode/KvCCodeViewData.h"
#include "platform/icode/KvCCompSymbolIterator.h"
#include "platform/icode/KvCExprLocDB.h"
#include "platform/icode/KvCExprLocDBServer.h"
#include "platform/icode/KvCFcgFunctionInfo.h"
#include "platform/icode/KvCFunctionTemplate.h"
#include "platform/icode/KvCICodeIterator.h"
#include "platform/icode/KvCIcApplication.h"
#include "platform/icode/KvCIcExprEqualitySpec.h"
#include "platform/icode/KvCIcFile.h"
#include "platform/icode/KvCIcFileId.h"
#include "platform/icode/KvCIcFileServer.h"
#include "platform/icode/KvCParamSymbol.h"
#include "platform/icode/KvCQsoExprLocDB.h"
#include "platform/icode/KvCRangeConverter.h"
#include "platform/icode/KvCScaleTool.h"
#include "platform/icode/KvCSmbClass.h"
#include "platform/icode/KvCSmbClassServer.h"
#include "platform/icode/KvCSmbInitValExpr.h"
#include "platform/icode/KvCStringExpr.h"
#include "platform/icode/KvCSymbolQuery.h"
#include "platform/icode/KvCTemplateServer.h"
#include "platform/icode/KvCUnparamSymbol.h"
#include "platform/icode/KvCVarClassId.h"
#include "platform/icode/KvCVarClassServer.h"

#endif
