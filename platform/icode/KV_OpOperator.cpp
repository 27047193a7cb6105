#include "platform/icode/KV_OpOperator.h"

#include <array>
#include <memory>

namespace {

// How an operator treats its operands.
enum class Access {
  UseAll,         // every operand is read
  AssignLike,     // 0 written, the rest read
  ReadWriteFirst, // 0 read and written, the rest read
  DeclaresFirst,  // 0 declared (written), the rest read
};

struct KindInfo {
  const char* name;
  int arity; // -1: any number
  Access access;
};

constexpr KindInfo kInfo[KV_OP_NUMBER_OF_KINDS] = {
    {"QualifiedSymbol", -1, Access::UseAll},
    {"Add", 2, Access::UseAll},
    {"Sub", 2, Access::UseAll},
    {"Mul", 2, Access::UseAll},
    {"Div", 2, Access::UseAll},
    {"Mod", 2, Access::UseAll},
    {"Neg", 1, Access::UseAll},
    {"Abs", 1, Access::UseAll},
    {"Saturate", 3, Access::UseAll},
    {"ShiftLeft", 2, Access::UseAll},
    {"ShiftRight", 2, Access::UseAll},
    {"BitAnd", 2, Access::UseAll},
    {"BitOr", 2, Access::UseAll},
    {"BitXor", 2, Access::UseAll},
    {"BitNot", 1, Access::UseAll},
    {"LogAnd", 2, Access::UseAll},
    {"LogOr", 2, Access::UseAll},
    {"LogNot", 1, Access::UseAll},
    {"Less", 2, Access::UseAll},
    {"LessEqual", 2, Access::UseAll},
    {"Greater", 2, Access::UseAll},
    {"GreaterEqual", 2, Access::UseAll},
    {"Equal", 2, Access::UseAll},
    {"NotEqual", 2, Access::UseAll},
    {"Assign", 2, Access::AssignLike},
    {"AddAssign", 2, Access::ReadWriteFirst},
    {"SubAssign", 2, Access::ReadWriteFirst},
    {"MulAssign", 2, Access::ReadWriteFirst},
    {"BitAndAssign", 2, Access::ReadWriteFirst},
    {"BitOrAssign", 2, Access::ReadWriteFirst},
    {"PreIncrement", 1, Access::ReadWriteFirst},
    {"PostIncrement", 1, Access::ReadWriteFirst},
    {"PreDecrement", 1, Access::ReadWriteFirst},
    {"PostDecrement", 1, Access::ReadWriteFirst},
    {"Cast", 2, Access::UseAll},
    {"AddressOf", 1, Access::UseAll},
    {"Dereference", 1, Access::UseAll},
    {"Conditional", 3, Access::UseAll},
    {"Comma", -1, Access::UseAll},
    {"Call", -1, Access::UseAll},
    {"Parameter", 2, Access::AssignLike},
    {"Return", -1, Access::UseAll},
    {"If", -1, Access::UseAll},
    {"ForLoop", 3, Access::UseAll},
    {"WhileLoop", 1, Access::UseAll},
    {"DoWhileLoop", 1, Access::UseAll},
    {"LoopCondition", 1, Access::UseAll},
    {"Switch", 1, Access::UseAll},
    {"Break", 0, Access::UseAll},
    {"Continue", 0, Access::UseAll},
    {"PreProcIf", -1, Access::UseAll},
    {"FunctionDeclaration", -1, Access::DeclaresFirst},
    {"FunctionDefinition", -1, Access::DeclaresFirst},
    {"VariableDeclaration", -1, Access::DeclaresFirst},
    {"VariableDefinition", -1, Access::DeclaresFirst},
    {"ComponentDefinition", -1, Access::DeclaresFirst},
    {"MacroDefinition", -1, Access::DeclaresFirst},
    {"StructDeclDef", -1, Access::DeclaresFirst},
    {"EnumDeclDef", -1, Access::DeclaresFirst},
    {"TypeDefinition", -1, Access::DeclaresFirst},
    {"StaticDeclDef", -1, Access::DeclaresFirst},
    {"CodeBlock", -1, Access::UseAll},
    {"PreProcConcat", 2, Access::UseAll},
    {"StringAppend", 2, Access::UseAll},
};

bool inRange(tagKvEOperatorKind kind, tagKvEOperatorKind first, tagKvEOperatorKind last) {
  return kind >= first && kind <= last;
}

} // namespace

// The operators live as long as the process; they are constants.
struct KvOperatorTable {
  KvOperatorTable() {
    for (int k = 0; k < KV_OP_NUMBER_OF_KINDS; ++k)
      operators[static_cast<std::size_t>(k)].reset(
          new KV_OpOperator(static_cast<tagKvEOperatorKind>(k)));
  }

  static KV_OpOperator* get(tagKvEOperatorKind kind) {
    static const KvOperatorTable table;
    if (kind < 0 || kind >= KV_OP_NUMBER_OF_KINDS)
      return nullptr;
    return table.operators[static_cast<std::size_t>(kind)].get();
  }

  std::array<std::unique_ptr<KV_OpOperator>, KV_OP_NUMBER_OF_KINDS> operators;
};

KV_OpOperator* KV_OpOperator::get(tagKvEOperatorKind kind) { return KvOperatorTable::get(kind); }

const char* KV_OpOperator::getName() const { return kInfo[kind].name; }

int KV_OpOperator::getArity() const { return kInfo[kind].arity; }

bool KV_OpOperator::usesOperand(int i, int count) const {
  if (i < 0 || i >= count)
    return false;
  switch (kInfo[kind].access) {
  case Access::AssignLike:
  case Access::DeclaresFirst:
    return i != 0;
  case Access::UseAll:
  case Access::ReadWriteFirst:
    return true;
  }
  return false;
}

bool KV_OpOperator::definesOperand(int i, int count) const {
  if (i != 0 || count < 1)
    return false;
  return kInfo[kind].access != Access::UseAll;
}

bool KV_OpOperator::isAssign() const { return inRange(kind, KV_OP_ASSIGN, KV_OP_BIT_OR_ASSIGN); }

bool KV_OpOperator::isCompoundAssign() const {
  return inRange(kind, KV_OP_ADD_ASSIGN, KV_OP_BIT_OR_ASSIGN);
}

bool KV_OpOperator::isIncrementOrDecrement() const {
  return inRange(kind, KV_OP_PRE_INCREMENT, KV_OP_POST_DECREMENT);
}

bool KV_OpOperator::isArithmetic() const { return inRange(kind, KV_OP_ADD, KV_OP_SATURATE); }

bool KV_OpOperator::isLoop() const { return inRange(kind, KV_OP_FOR_LOOP, KV_OP_DO_WHILE_LOOP); }

bool KV_OpOperator::isControlFlow() const { return inRange(kind, KV_OP_RETURN, KV_OP_PREPROC_IF); }

bool KV_OpOperator::isLogical() const { return inRange(kind, KV_OP_LOG_AND, KV_OP_LOG_NOT); }

bool KV_OpOperator::isRelational() const { return inRange(kind, KV_OP_LESS, KV_OP_NOT_EQUAL); }

bool KV_OpOperator::isBitOperation() const {
  return inRange(kind, KV_OP_SHIFT_LEFT, KV_OP_BIT_NOT);
}

bool KV_OpOperator::isBinaryIndexOperator() const {
  return inRange(kind, KV_OP_ADD, KV_OP_MOD) || kind == KV_OP_SHIFT_LEFT;
}

bool KV_OpOperator::isDeclOrDef() const {
  return inRange(kind, KV_OP_FUNCTION_DECLARATION, KV_OP_STATIC_DECLDEF);
}
