// Forward declarations of the ICode model's classes, for the library's headers. The
// library reaches the ICode only through this folder.
#ifndef HULCVTOOLS_MODELINTERFACES_ICODEFWD_H
#define HULCVTOOLS_MODELINTERFACES_ICODEFWD_H

class KV_BaseTypeServer;
class KV_CgsSupporter;
class KV_Constant;
class KV_DataType;
class KV_DataTypeServer;
class KV_DimensionDescriptor;
class KV_ExprDescr;
class KV_ExprDescrTupel;
class KV_ExprLocation;
class KV_FunctionCallInserter;
class KV_FunctionSymbolServer;
class KV_ICodeElem;
class KV_ICodeElemVisitor;
class KV_ICodeFactoryContainer;
class KV_MacroSymbolServer;
class KV_NumericalType;
class KV_NumericalTypeServer;
class KV_OpConversionInfo;
class KV_OpConversionLevel;
class KV_OpSaturationInfo;
class KV_OpOperator;
class KV_Operation;
class KV_ParamAccess;
class KV_PointerType;
class KV_PointerTypeServer;
class KV_QSOFactories;
class KV_QualifiedSymbolOp;
class KV_Range;
class KV_RefFactory;
class KV_ScaleServer;
class KV_Scaling;
class KV_Statement;
class KV_StatementTable;
class KV_SymbolDB;
class KV_SymbolServer;
class KvCApplicationServer;
class KvCCStmTable;
class KvCCallOperation;
class KvCCodeBlockOperation;
class KvCCodeViewData;
class KvCCompSymbolIterator;
class KvCExprLocDB;
class KvCExprLocDBServer;
class KvCFcgFunctionInfo;
class KvCFcnClassId;
class KvCFcnClassServer;
class KvCFunctionTemplate;
class KvCFunctionTemplateDescr;
class KvCFunctionTemplateServer;
class KvCICodeIterator;
class KvCIcExprEqualitySpec;
class KvCIcExpression;
class KvCIcFile;
class KvCIcFileId;
class KvCIcFileServer;
class KvCIcSubAppl;
class KvCParamSymbol;
class KvCQsoExprLocDB;
class KvCSmbClass;
class KvCSmbClassServer;
class KvCSmbInitValExpr;
class KvCStringExpr;
class KvCSymbol;
class KvCTemplateServer;
class KvCUnparamSymbol;
class KvCVarClassId;
class KvCVarClassServer;

// Keys of the ICode's function templates.
enum tagKvEFunctionTplKey : int;

#endif
