// KV_ExprLocFactory: makes expression locations and what they hold. Every location
// is new and without parent; the code view data owns it.
#ifndef HUL_PLATFORM_ICODE_KV_EXPRLOCFACTORY_H
#define HUL_PLATFORM_ICODE_KV_EXPRLOCFACTORY_H

#include "platform/icode/KV_Constant.h"
#include "platform/support/WmCXString.h"

#include <cstdint>
#include <vector>

class KvCCodeViewData;
class KvCIcFileId;
class KvCSrcRef;
class KvCSmbInitValExpr;
class KvCStringExpr;
class KvCSymbol;

// How createSymbolExprLoc accesses its symbol: plainly (0) or through the pointer it holds.
enum tagKvESymbolAccessFlag : unsigned int { KV_ACCESS_PLAIN = 0u, KV_ACCESS_DEREFERENCED = 1u };

class HUL_PLATFORM_API KV_ExprLocFactory {
public:
  explicit KV_ExprLocFactory(KvCCodeViewData* owner) : codeViewData(owner) {}

  KV_ExprLocation* createEmpty();
  // A location holding `expr`; null when `expr` is null or held elsewhere.
  KV_ExprLocation* createFromExpression(KvCIcExpression* expr);
  KV_ExprLocation* createFromOperation(KV_Operation* op);
  // A location holding a new plain access to `symbol` (null for a null symbol).
  KV_ExprLocation* createFromSymbol(KvCSymbol* symbol);
  // A location holding a new constant (integral: signed, or unsigned when `isUnsigned`).
  KV_ExprLocation* createFromValue(std::int64_t value, KV_DataType* type, bool isUnsigned = false);
  KV_ExprLocation* createFromValue(double value, KV_DataType* type);
  KV_ExprLocation* createFromString(const WmCXString& text, bool asCode, bool quoted);
  KV_ExprLocation* createFromDataType(KV_DataType* type);
  KV_ExprLocation* createFromFileId(KvCIcFileId* file);
  // Forms that take the caller's source reference (not kept). createFromName: a location
  // holding the name as code text (an identifier the generated code names), cooked to a
  // valid C identifier with `cook`; null for an empty name. createFromValue: an untyped
  // signed integer constant. createFromOperation: as above.
  KV_ExprLocation* createFromName(const WmCXString& name, bool cook, const KvCSrcRef* srcRef);
  KV_ExprLocation* createFromValue(std::int64_t value, const KvCSrcRef* srcRef);
  KV_ExprLocation* createFromOperation(KV_Operation* op, const KvCSrcRef* srcRef);

  // The forms the servers of generated interfaces use. createSymbolExprLoc: a location
  // holding a new access to `symbol`, with the tagKvESymbolAccessFlag bits `accessFlags`
  // (0: a plain access, printed as the symbol's name); null for a null symbol.
  // createOperationExprLoc: a location holding `op`; null for a null operation or one that
  // a location holds already.
  KV_ExprLocation* createSymbolExprLoc(KvCSymbol* symbol, unsigned int accessFlags);
  KV_ExprLocation* createOperationExprLoc(KV_Operation* op);

  KV_Constant* createConstant(tagKvEConstantType type, std::int64_t value, KV_DataType* dt);
  KV_Constant* createDoubleConstant(double value, KV_DataType* dt);
  KvCStringExpr* createString(const WmCXString& text, bool asCode, bool quoted);
  // An initial value with the given dimension sizes (empty for a scalar); null for more
  // than three dimensions or a size below 1.
  KvCSmbInitValExpr* createInitValue(const std::vector<int>& dimensionSizes);

private:
  KvCCodeViewData* codeViewData;
};

#endif
