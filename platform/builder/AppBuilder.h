// AppBuilder: builds ICode fixtures that read like the scenario they check:
//
//   AppBuilder app;
//   auto* x = app.variable("x", app.int16());
//   auto& f = app.function("f");
//   f.body().assign(app.access(x), app.add(app.access(x), app.constant(1)));
//   f.body().call(app.function("g").symbol(), {app.access(x)});
//
// It owns its KvCCodeViewData. Every expression maker answers a new location without
// parent, ready to be used once as an operand or statement root. The application has one
// sub-application and one code unit; file() adds files to it and makes the file current:
// variables and functions are defined in the current file ("main.c" at the start).
//
// A malformed fixture (an operand used twice, an unknown function, a wrong operand count)
// fails loudly: the builder prints what went wrong and aborts the program.
#ifndef HUL_PLATFORM_BUILDER_APPBUILDER_H
#define HUL_PLATFORM_BUILDER_APPBUILDER_H

#include "platform/builder/BlockBuilder.h"
#include "platform/builder/FunctionBuilder.h"
#include "platform/icode/KV_DataType.h"
#include "platform/icode/KV_OpOperator.h"
#include "platform/icode/KvCCodeViewData.h"
#include "platform/icode/KvCUnparamSymbol.h"

#include <cstdint>
#include <deque>
#include <initializer_list>
#include <memory>
#include <string>
#include <unordered_map>
#include <utility>
#include <vector>

class KV_Constant;
class KV_Operation;
class KV_ICodeFactoryContainer;
class KV_QualifiedSymbolOp;
class KV_Scaling;
class KvCIcCodeUnit;
class KvCIcExpression;
class KvCAddressQualifier;
class KvCIcFileId;
class KvCNameSpace;
class KvCRtosProtection;
class KvCSmbClassId;

// One index of an array access: a constant or an index expression.
struct BuilderIndex {
  BuilderIndex(int constant) : value(constant) {}                // NOLINT: reads like a[1]
  BuilderIndex(KV_ExprLocation* expression) : loc(expression) {} // NOLINT: reads like a[i]
  int value = 0;
  KV_ExprLocation* loc = nullptr;
};

class AppBuilder {
public:
  explicit AppBuilder(const char* applicationName = "App");
  ~AppBuilder();
  AppBuilder(const AppBuilder&) = delete;
  AppBuilder& operator=(const AppBuilder&) = delete;

  KvCCodeViewData& data() { return *cvd; }
  KV_ICodeFactoryContainer& factories();

  // --- types and scalings
  KV_DataType* int8();
  KV_DataType* uint8();
  KV_DataType* int16();
  KV_DataType* uint16();
  KV_DataType* int32();
  KV_DataType* uint32();
  KV_DataType* float32();
  KV_DataType* float64();
  KV_DataType* boolean();
  KV_DataType* voidType();
  KV_PointerType* pointerTo(KV_DataType* target, bool toConst = false);
  KV_ArrayType* arrayOf(KV_DataType* element, int size);
  KV_StructType* structType(const char* name,
                            std::initializer_list<std::pair<const char*, KV_DataType*>> components);
  KV_Scaling* scaling(double lsb, double offset = 0.0);

  // --- files
  // The file of that name, added to the code unit; it becomes the current file.
  KvCIcFileId* file(const char* name);
  KvCIcFileId* currentFile() const { return current; }
  // The builder of the current file's top-level table.
  BlockBuilder& fileScope();

  // --- scopes and symbol classes
  // The source file `<base>.c` and its header `<base>.h`, added to the code unit and named
  // as each other's complementary file, each top-level table with a name space of its
  // own. The source file becomes the current file; the answer is it.
  KvCIcFileId* filePair(const char* base);
  // The name space of `table`, made when it has none.
  KvCNameSpace* nameSpace(KvCCStmTable* table);
  // The potential-globals name space of the application's sub-application.
  KvCNameSpace* potentialGlobals();
  // The symbol class of that name, made on first use with `kind`, together with a
  // variable class (extern for KV_SMBCLASS_EXTERN, global for it and KV_SMBCLASS_GLOBAL)
  // and a function class of the same name that stand for it.
  KvCSmbClassId* smbClass(const char* name, tagKvESmbClassKind kind);
  // Gives `symbol` the variable or function class of `cls` and enters it into `table` as
  // a definition (or a declaration); a potential global there also takes its name in the
  // potential-globals name space. Fails when the table answers another symbol.
  KvCSymbol* place(KvCSymbol* symbol, KvCSmbClassId* cls, KvCCStmTable* table,
                   bool asDeclaration = false);

  // --- symbols
  // A variable; with `define`, a definition statement (object, type, file) is added to
  // the current file.
  KvCUnparamSymbol* variable(const char* name, KV_DataType* type, bool define = true);
  // A structure component symbol (no statement).
  KvCUnparamSymbol* component(const char* name, KV_DataType* type);
  // A structure instance of `type` with a component symbol for every component, at every
  // level of nesting. (variable() makes an instance without component symbols; member()
  // then adds the ones a fixture names.)
  KvCUnparamSymbol* structVariable(const char* name, KV_StructType* type, bool define = true);
  // The component symbol of a structure instance (or array of structures) named by `path`
  // ("x", or "inner.a" through nested instances), made when missing. Fails for a component
  // the type does not have.
  KvCUnparamSymbol* member(KvCUnparamSymbol* instance, const char* path);
  // The symbol that declares component `name` in `type` (it carries the specifiers the
  // declaration writes), made when missing. Fails for a component the type does not have.
  KvCUnparamSymbol* declaredComponent(KV_StructType* type, const char* name);
  // The address qualifier of that name (made on first use; `isDefault` applies then).
  KvCAddressQualifier* addressQualifier(const char* name, bool isDefault = false);
  // The function of that name, made on first use: a symbol, a body table (top of its code
  // block) and a definition statement in the current file that owns the body.
  FunctionBuilder& function(const char* name, KV_DataType* returnType = nullptr);
  // A function only declared in the current file: its body table exists (the symbol
  // points to it) but hangs in no file.
  FunctionBuilder& declaredFunction(const char* name, KV_DataType* returnType = nullptr);
  KvCParamSymbol* macro(const char* name, KV_DataType* returnType = nullptr);
  // The builder of a function made earlier; fails for an unknown name.
  FunctionBuilder& functionBuilder(const char* name);

  // --- leaves
  KV_ExprLocation* access(KvCSymbol* symbol);
  KV_ExprLocation* element(KvCSymbol* array, std::initializer_list<BuilderIndex> indices);
  KV_ExprLocation* componentAccess(KvCSymbol* base, KvCSymbol* component);
  // *p (or p->... for a structure target).
  KV_ExprLocation* deref(KvCSymbol* pointer);
  KV_ExprLocation* constant(std::int64_t value, KV_DataType* type = nullptr);
  KV_ExprLocation* constant(double value, KV_DataType* type);
  KV_ExprLocation* unsignedConstant(std::uint64_t value, KV_DataType* type = nullptr);
  KV_ExprLocation* string(const char* text, bool asCode = false, bool quoted = true);
  KV_ExprLocation* typeRef(KV_DataType* type);
  KV_ExprLocation* fileRef(KvCIcFileId* file);
  KV_ExprLocation* empty();

  // --- operations
  KV_ExprLocation* op(tagKvEOperatorKind kind, std::initializer_list<KV_ExprLocation*> operands);
  KV_ExprLocation* add(KV_ExprLocation* a, KV_ExprLocation* b) { return op(KV_OP_ADD, {a, b}); }
  KV_ExprLocation* sub(KV_ExprLocation* a, KV_ExprLocation* b) { return op(KV_OP_SUB, {a, b}); }
  KV_ExprLocation* mul(KV_ExprLocation* a, KV_ExprLocation* b) { return op(KV_OP_MUL, {a, b}); }
  KV_ExprLocation* neg(KV_ExprLocation* a) { return op(KV_OP_NEG, {a}); }
  KV_ExprLocation* abs(KV_ExprLocation* a) { return op(KV_OP_ABS, {a}); }
  KV_ExprLocation* logAnd(KV_ExprLocation* a, KV_ExprLocation* b) {
    return op(KV_OP_LOG_AND, {a, b});
  }
  KV_ExprLocation* logOr(KV_ExprLocation* a, KV_ExprLocation* b) {
    return op(KV_OP_LOG_OR, {a, b});
  }
  KV_ExprLocation* logNot(KV_ExprLocation* a) { return op(KV_OP_LOG_NOT, {a}); }
  KV_ExprLocation* bitAnd(KV_ExprLocation* a, KV_ExprLocation* b) {
    return op(KV_OP_BIT_AND, {a, b});
  }
  KV_ExprLocation* bitNot(KV_ExprLocation* a) { return op(KV_OP_BIT_NOT, {a}); }
  KV_ExprLocation* less(KV_ExprLocation* a, KV_ExprLocation* b) { return op(KV_OP_LESS, {a, b}); }
  KV_ExprLocation* greater(KV_ExprLocation* a, KV_ExprLocation* b) {
    return op(KV_OP_GREATER, {a, b});
  }
  KV_ExprLocation* equal(KV_ExprLocation* a, KV_ExprLocation* b) { return op(KV_OP_EQUAL, {a, b}); }
  KV_ExprLocation* addressOf(KV_ExprLocation* a) { return op(KV_OP_ADDRESS_OF, {a}); }
  KV_ExprLocation* assignExpr(KV_ExprLocation* lhs, KV_ExprLocation* rhs) {
    return op(KV_OP_ASSIGN, {lhs, rhs});
  }
  KV_ExprLocation* loopCondition(KV_ExprLocation* cond) { return op(KV_OP_LOOP_CONDITION, {cond}); }
  KV_ExprLocation* cast(KV_DataType* target, KV_ExprLocation* operand);
  // A call operation of `function` with one parameter operation (formal i, actual i) per
  // actual.
  KV_ExprLocation* call(KvCParamSymbol* function, std::initializer_list<KV_ExprLocation*> actuals);
  KV_ExprLocation* call(KvCParamSymbol* function, const std::vector<KV_ExprLocation*>& actuals);
  // A plain operation of the call kind (not a KvCCallOperation): operand 0 `callee`, then
  // the given operands.
  KV_ExprLocation* genericCall(KV_ExprLocation* callee,
                               std::initializer_list<KV_ExprLocation*> operands);
  KV_ExprLocation* parameter(KV_ExprLocation* formal, KV_ExprLocation* actual) {
    return op(KV_OP_PARAMETER, {formal, actual});
  }
  // A call of `task` that activates it as a task.
  KV_ExprLocation* taskActivation(KvCParamSymbol* task,
                                  tagKvETaskActivationKind kind = KV_TASK_ACTIVATE);
  KV_ExprLocation* codeBlock(const char* code, bool assembler);

  // --- declarations and definitions (roots of statements)
  KV_ExprLocation* varDecl(KvCSymbol* variable);
  // (object, type, file, initial values...)
  KV_ExprLocation* varDef(KvCSymbol* variable, std::initializer_list<KV_ExprLocation*> initValues);
  KV_ExprLocation* funcDecl(KvCParamSymbol* function);
  // (defined type, used types...)
  KV_ExprLocation* typeDef(KV_DataType* defined, std::initializer_list<KV_DataType*> used);
  KV_ExprLocation* staticDeclDef(KvCSymbol* variable);
  // An initial value of the given dimension sizes holding `elements`.
  KV_ExprLocation* initValue(const std::vector<int>& dimensionSizes,
                             std::initializer_list<KvCIcExpression*> elements);
  // Expressions to put in initial values.
  KV_Constant* constantExpr(std::int64_t value, KV_DataType* type = nullptr);
  KV_QualifiedSymbolOp* accessExpr(KvCSymbol* symbol);
  KV_Operation* operationExpr(tagKvEOperatorKind kind,
                              std::initializer_list<KV_ExprLocation*> operands);

  KvCRtosProtection* protection(const char* resource);
  BlockBuilder& newBlockBuilder(KvCCStmTable* table);

  // Prints `what` and aborts: the fixture is malformed.
  [[noreturn]] void fail(const std::string& what) const;
  template <class T> T* check(T* result, const char* what) const {
    if (!result)
      fail(what);
    return result;
  }

private:
  FunctionBuilder& makeFunction(const char* name, KV_DataType* returnType, bool defined);
  KV_ExprLocation* declaration(tagKvEOperatorKind kind, std::vector<KV_ExprLocation*> operands);

  std::unique_ptr<KvCCodeViewData> cvd;
  KvCIcCodeUnit* unit = nullptr;
  KvCIcFileId* current = nullptr;
  std::deque<BlockBuilder> blocks;
  std::deque<FunctionBuilder> functions;
  std::unordered_map<std::string, FunctionBuilder*> functionsByName;
  std::unordered_map<KvCIcFileId*, BlockBuilder*> fileScopes;
};

#endif
