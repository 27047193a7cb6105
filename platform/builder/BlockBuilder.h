// BlockBuilder: appends statements to one statement table of a fixture. Compound
// statements (loops, ifs, nested and protected blocks) answer the builder of their body.
// Builders are owned by their AppBuilder and stay valid as long as it lives.
#ifndef HUL_PLATFORM_BUILDER_BLOCKBUILDER_H
#define HUL_PLATFORM_BUILDER_BLOCKBUILDER_H

#include "platform/icode/KvCTaskActivation.h"

#include <initializer_list>

class AppBuilder;
class KV_ExprLocation;
class KV_Statement;
class KvCCStmTable;
class KvCParamSymbol;

class BlockBuilder {
public:
  BlockBuilder(AppBuilder& owner, KvCCStmTable* table) : app(owner), stmTable(table) {}

  KvCCStmTable* table() const { return stmTable; }
  KV_Statement* lastStatement() const { return last; }

  // A statement whose root is `root` (may be null).
  KV_Statement* stmt(KV_ExprLocation* root);
  KV_Statement* assign(KV_ExprLocation* lhs, KV_ExprLocation* rhs);
  KV_Statement* call(KvCParamSymbol* function, std::initializer_list<KV_ExprLocation*> actuals);
  KV_Statement* activateTask(KvCParamSymbol* task,
                             tagKvETaskActivationKind kind = KV_TASK_ACTIVATE);
  KV_Statement* ret(KV_ExprLocation* value = nullptr);

  // for (init; cond; incr) { body }: the root is ForLoop(init, LoopCondition(cond), incr).
  BlockBuilder& forLoop(KV_ExprLocation* init, KV_ExprLocation* cond, KV_ExprLocation* incr);
  // while (cond) { body }: WhileLoop(LoopCondition(cond)).
  BlockBuilder& whileLoop(KV_ExprLocation* cond);
  BlockBuilder& ifThen(KV_ExprLocation* cond);
  // A nested block without a root expression.
  BlockBuilder& block();
  // A nested block that forms an RTOS protected area for `resource`.
  BlockBuilder& protectedBlock(const char* resource);

private:
  BlockBuilder& nested(KV_ExprLocation* root);

  AppBuilder& app;
  KvCCStmTable* stmTable;
  KV_Statement* last = nullptr;
};

#endif
