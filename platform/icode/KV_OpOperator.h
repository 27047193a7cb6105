// KV_OpOperator: which operation an operation is. The model keeps exactly one operator
// object per kind (KV_OpOperator::get), so two operations have the same operator exactly
// when their operator pointers are equal.
//
// The kinds, their families and which operand positions each kind reads (uses) and
// writes (defines) are decided here, in one table (KV_OpOperator.cpp):
//   - an assignment defines operand 0 and uses operand 1; a compound assignment and an
//     increment or decrement use and define operand 0;
//   - a parameter operation pairs the formal (operand 0, defined) with the actual
//     (operand 1, used);
//   - a declaration or definition defines its declared object (operand 0) and uses the
//     rest: a variable definition holds (object, type, file, initial values...), a type
//     definition (defined type, used types...);
//   - every other kind uses all its operands and defines none.
#ifndef HUL_PLATFORM_ICODE_KV_OPOPERATOR_H
#define HUL_PLATFORM_ICODE_KV_OPOPERATOR_H

#include "platform/support/HulPlatformExport.h"

enum tagKvEOperatorKind {
  KV_OP_QUALIFIED_SYMBOL, // a symbol access; its operands are the index expressions
  // arithmetic
  KV_OP_ADD,
  KV_OP_SUB,
  KV_OP_MUL,
  KV_OP_DIV,
  KV_OP_MOD,
  KV_OP_NEG,
  KV_OP_ABS,
  KV_OP_SATURATE,
  // bit operations
  KV_OP_SHIFT_LEFT,
  KV_OP_SHIFT_RIGHT,
  KV_OP_BIT_AND,
  KV_OP_BIT_OR,
  KV_OP_BIT_XOR,
  KV_OP_BIT_NOT,
  // logical and relational
  KV_OP_LOG_AND,
  KV_OP_LOG_OR,
  KV_OP_LOG_NOT,
  KV_OP_LESS,
  KV_OP_LESS_EQUAL,
  KV_OP_GREATER,
  KV_OP_GREATER_EQUAL,
  KV_OP_EQUAL,
  KV_OP_NOT_EQUAL,
  // assignments
  KV_OP_ASSIGN,
  KV_OP_ADD_ASSIGN,
  KV_OP_SUB_ASSIGN,
  KV_OP_MUL_ASSIGN,
  KV_OP_BIT_AND_ASSIGN,
  KV_OP_BIT_OR_ASSIGN,
  KV_OP_PRE_INCREMENT,
  KV_OP_POST_INCREMENT,
  KV_OP_PRE_DECREMENT,
  KV_OP_POST_DECREMENT,
  // other expressions
  KV_OP_CAST,
  KV_OP_ADDRESS_OF,
  KV_OP_DEREFERENCE,
  KV_OP_CONDITIONAL,
  KV_OP_COMMA,
  KV_OP_CALL,
  KV_OP_PARAMETER,
  // control flow
  KV_OP_RETURN,
  KV_OP_IF,
  KV_OP_FOR_LOOP,
  KV_OP_WHILE_LOOP,
  KV_OP_DO_WHILE_LOOP,
  KV_OP_LOOP_CONDITION,
  KV_OP_SWITCH,
  KV_OP_BREAK,
  KV_OP_CONTINUE,
  KV_OP_PREPROC_IF,
  // declarations and definitions
  KV_OP_FUNCTION_DECLARATION,
  KV_OP_FUNCTION_DEFINITION,
  KV_OP_VARIABLE_DECLARATION,
  KV_OP_VARIABLE_DEFINITION,
  KV_OP_COMPONENT_DEFINITION,
  KV_OP_MACRO_DEFINITION,
  KV_OP_STRUCT_DECLDEF,
  KV_OP_ENUM_DECLDEF,
  KV_OP_TYPE_DEFINITION,
  KV_OP_STATIC_DECLDEF,
  // code blocks (custom code, assembler)
  KV_OP_CODE_BLOCK,
  // preprocessor text of macro bodies: the concatenation of two pieces (`##` where it pastes
  // names, KvCPreProcOpFactory) and an expression followed by a text (KvCAppendOpFactory)
  KV_OP_PREPROC_CONCAT,
  KV_OP_STRING_APPEND,
  KV_OP_NUMBER_OF_KINDS
};

class HUL_PLATFORM_API KV_OpOperator {
public:
  // The one operator of `kind`; null for a value outside the enumeration.
  static KV_OpOperator* get(tagKvEOperatorKind kind);

  KV_OpOperator(const KV_OpOperator&) = delete;
  KV_OpOperator& operator=(const KV_OpOperator&) = delete;

  tagKvEOperatorKind getKind() const { return kind; }
  const char* getName() const;
  // The number of operands the kind takes, or -1 when it takes any number.
  int getArity() const;

  bool operator==(const KV_OpOperator& other) const { return kind == other.kind; }

  // Whether an operation of this kind with `count` operands reads / writes operand `i`.
  bool usesOperand(int i, int count) const;
  bool definesOperand(int i, int count) const;

  bool isQualifiedSymbol() const { return kind == KV_OP_QUALIFIED_SYMBOL; }
  bool isUnary() const { return getArity() == 1; }
  bool isBinary() const { return getArity() == 2; }
  // Assign and the compound assignments (left side operand 0, right side operand 1).
  bool isAssign() const;
  bool isPlainAssign() const { return kind == KV_OP_ASSIGN; }
  bool isCompoundAssign() const;
  bool isIncrementOrDecrement() const;
  bool isCall() const { return kind == KV_OP_CALL; }
  bool isParameter() const { return kind == KV_OP_PARAMETER; }
  bool isCast() const { return kind == KV_OP_CAST; }
  bool isAbs() const { return kind == KV_OP_ABS; }
  bool isSaturate() const { return kind == KV_OP_SATURATE; }
  bool isArithmetic() const;
  bool isForLoop() const { return kind == KV_OP_FOR_LOOP; }
  bool isLoop() const;
  bool isLoopCondition() const { return kind == KV_OP_LOOP_CONDITION; }
  bool isControlFlow() const;
  bool isLogical() const;
  bool isUnaryLogical() const { return kind == KV_OP_LOG_NOT; }
  bool isRelational() const;
  bool isLess() const { return kind == KV_OP_LESS; }
  bool isLessEqual() const { return kind == KV_OP_LESS_EQUAL; }
  bool isGreater() const { return kind == KV_OP_GREATER; }
  bool isGreaterEqual() const { return kind == KV_OP_GREATER_EQUAL; }
  bool isBitOperation() const;
  bool isUnaryBitOperation() const { return kind == KV_OP_BIT_NOT; }
  // The one unary and the six binary arithmetic kinds allowed in index expressions.
  bool isUnaryIndexOperator() const { return kind == KV_OP_NEG; }
  bool isBinaryIndexOperator() const;
  bool isPreProcControlFlow() const { return kind == KV_OP_PREPROC_IF; }
  bool isCodeBlock() const { return kind == KV_OP_CODE_BLOCK; }
  bool isPreProcConcat() const { return kind == KV_OP_PREPROC_CONCAT; }
  bool isStringAppend() const { return kind == KV_OP_STRING_APPEND; }
  // Any declaration or definition kind (operand 0 is the declared object).
  bool isDeclOrDef() const;
  bool isStaticDeclDef() const { return kind == KV_OP_STATIC_DECLDEF; }
  bool isTypeDefinition() const { return kind == KV_OP_TYPE_DEFINITION; }
  bool isFunctionDeclaration() const { return kind == KV_OP_FUNCTION_DECLARATION; }
  bool isFunctionDefinition() const { return kind == KV_OP_FUNCTION_DEFINITION; }
  bool isVariableDeclaration() const { return kind == KV_OP_VARIABLE_DECLARATION; }
  bool isVariableDefinition() const { return kind == KV_OP_VARIABLE_DEFINITION; }
  // A structure component definition and a macro definition.
  bool isFurtherDefinition1() const { return kind == KV_OP_COMPONENT_DEFINITION; }
  bool isFurtherDefinition2() const { return kind == KV_OP_MACRO_DEFINITION; }
  // A structure and an enumeration declaration-or-definition.
  bool isFurtherDeclDef1() const { return kind == KV_OP_STRUCT_DECLDEF; }
  bool isFurtherDeclDef2() const { return kind == KV_OP_ENUM_DECLDEF; }

private:
  explicit KV_OpOperator(tagKvEOperatorKind k) : kind(k) {}
  friend struct KvOperatorTable;

  tagKvEOperatorKind kind;
};

#endif
