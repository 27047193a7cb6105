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
// - KvCCallOperation::getCallingSymbol() / getCalledSymbol(): the function or macro whose
//   body holds the call (null outside every function and macro body) and the called
//   function or macro;
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
//
// What the Ecp servers rely on beyond the operations they name:
// - KvCIcFileServer::demandApHeaderFile(srcRef): the file id of the access-point header,
//   the same on every demand, null when there is none; demandEcuServiceFile(file, srcRef):
//   true with the file id of the ECU service file, false (file null) when there is none.
// - KV_NumericalTypeServer::getNonDDMappedNumerical and KV_PointerTypeServer::
//   getNonDDMappedPointer answer the type made first for a repeated name, null for a name
//   another type or a symbol has; KvCIcFile::defineType answers false when it cannot
//   define the type (the type is still the model's).
// - KV_MacroSymbolServer::demandGlobal(table, name, type, scaling, srcRef): the object-like
//   macro `name` defined in the table, one per name in the run, made when missing; null
//   (nothing made) for a name that cannot be had there or a global macro of the name with
//   another table, type or scaling.
// - KV_MacroCallInserter::demandPreIncludeMacroSymbol(name, type, scaling, n, accesses,
//   names, fcnClass, body, file, srcRef, mustBeNew): the pre-include macro `name` of the
//   file, made when missing with the parameters, body and class given, else the macro of
//   the name when its parameter count and type agree (the new body is not used); null
//   when it cannot be had. `mustBeNew` false: an existing macro is answered.
// - KV_MacroCallInserter::insertMacroCall(macro, n, args, accesses, asStatement,
//   statement, range, srcRef): builds a call of the macro with the argument locations
//   (false, nothing built, for a count other than the macro's or an argument with a
//   parent); with asStatement false the call stays free and `statement` is not read;
//   getCallOperation() answers that call (null after a refused insert).
// - KV_FunctionCallInserter::demandFunctionSymbol with a function class (the overload that
//   takes KvCFcnClassId* before the file): as the one without, the function made with that
//   class.
// - KV_VariableSymbolServer::create(name, roles, type, scaling, varClass, srcRef): a new
//   variable that no file declares, with the tagKvESymbolRole bits `roles` (0: none).
// - KV_ExprLocFactory::createSymbolExprLoc(symbol, accessFlags): a location holding an
//   access to the symbol, plain for flags 0; createOperationExprLoc(op): a location holding
//   the operation. A location takes an expression only while no other location holds it.
// - KvCPreProcOpFactory::createConcat of two texts, or of a text and an operation, and
//   KvCAppendOpFactory::createStringAppend(op, text): the preprocessor concatenation and the
//   appended text of a macro body, printed as macro text; KV_OperationFactories hands them
//   out (getPreProcessor, getAppend), KV_ICodeFactoryContainer::getOperationFactories the
//   operation factories and getRangeServer the range server.
// - KV_SymbolServer::getParamMacro, getMacro, getVariable: the parameterised macro, macro
//   and variable symbol servers; KvCSmbClassServer::getVarClassServer: the variable class
//   server (KvCVarClassServer::demandSlLocalDefault: the class of local variables, not
//   extern, not global); KvCFcnClassServer::demandApMacroClass: the class of access-point
//   macros.
// - KV_BaseTypeServer::getUndefinedType, KV_ScaleServer::getUndefinedScaling and
//   KV_RangeServer::getUndefinedRange: one object each for the run, the type and scaling of
//   what the preprocessor makes (macros and their arguments) and the range of a macro call.
// - KV_CallInserter: the base of both call inserters, with a virtual destructor; inserters
//   made with new take their storage from the run's memory controller when one is set.
// - KV_ParamAccess(read, written, byReference): the three Booleans say whether the
//   parameter is read, written and passed by reference.
//
// What the symbol tools rely on: no operation beyond those they name, with these meanings
// (decided by this model, relied on by the tools and their tests):
// - KvCCStmTable::enterSymbol / enterDeclaration(KvCSymbol*&): list the symbol in the
//   table (taking it out of the table that listed it before), add its name to the table's
//   name space, set its getStt; the pointer changes only when the table holds another
//   symbol of the same name, which it answers instead (entering nothing). removeSymbol
//   only takes the entry out: name and getStt stay until the caller clears them.
// - KvCCStmTable::isPrimaryScopeTable / isSecondaryScopeTable: the top-level table of a
//   source file / of a header file; every other table answers false to both.
// - KvCSymbolQuery::getDestinationStt: the table that lists the symbol, or null;
//   isPotentialGlobalSymbol(symbol, table): a non-component symbol placed in a file's
//   top-level table, whatever its class.
// - KvCSymbol::getSmbClassId: the symbol class of the symbol's variable or function class,
//   so setVarClassId / setFcnClassId change it; KvCSmbClass::isScopeLocal: automatic
//   local variables.
// - KvCElocDbQuery::getQsoStaticDeclDef: the first static declaration and definition
//   (operand 0 of a declaration or definition operation) among the definition-side
//   symbol-access entries of the symbol's def/use database.
// - KvCSymbolQuery::getUnparamSymbolTypeSpecifiersIgnoreStructs: the option counts the
//   default address qualifier as a qualifier; KV_DataType::getSourceType: the end of the
//   base-type chain (the type itself when it has no base); KvCUnparamSymbol::
//   getComponentInstance also answers the components of an array of structures.
#ifndef HULCVTOOLS_MODELINTERFACES_ICODEMODEL_H
#define HULCVTOOLS_MODELINTERFACES_ICODEMODEL_H

#include "HulCvTools/ModelInterfaces/ICodeFwd.h"
#include "platform/icode/KV_BaseTypeServer.h"
#include "platform/icode/KV_CallInserter.h"
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
#include "platform/icode/KV_MacroCallInserter.h"
#include "platform/icode/KV_MacroSymbolServer.h"
#include "platform/icode/KV_OpConversionInfo.h"
#include "platform/icode/KV_OpConversionLevel.h"
#include "platform/icode/KV_OpSaturationInfo.h"
#include "platform/icode/KV_OpOperator.h"
#include "platform/icode/KV_NumericalTypeServer.h"
#include "platform/icode/KV_Operation.h"
#include "platform/icode/KV_OperationFactories.h"
#include "platform/icode/KV_ParamAccess.h"
#include "platform/icode/KV_ParamMacroSymbolServer.h"
#include "platform/icode/KV_PointerTypeServer.h"
#include "platform/icode/KV_QSOFactories.h"
#include "platform/icode/KV_QualifiedSymbolOp.h"
#include "platform/icode/KV_Range.h"
#include "platform/icode/KV_RangeLimiter.h"
#include "platform/icode/KV_RangeServer.h"
#include "platform/icode/KV_ScaleServer.h"
#include "platform/icode/KV_Scaling.h"
#include "platform/icode/KV_Statement.h"
#include "platform/icode/KV_StatementTable.h"
#include "platform/icode/KV_SymbolDB.h"
#include "platform/icode/KV_SymbolServer.h"
#include "platform/icode/KV_VariableSymbolServer.h"
#include "platform/icode/KvCAccessQsoQuery.h"
#include "platform/icode/KvCAddressQualifier.h"
#include "platform/icode/KvCApplicationServer.h"
#include "platform/icode/KvCCStmTable.h"
#include "platform/icode/KvCCallOperation.h"
#include "platform/icode/KvCCodeBlockOperation.h"
#include "platform/icode/KvCCodeViewData.h"
#include "platform/icode/KvCCompSymbolIterator.h"
#include "platform/icode/KvCElocDbQuery.h"
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
