// FunctionBuilder: a function or macro of a fixture: its symbol, its formal parameters
// and the builder of its body. Owned by its AppBuilder.
#ifndef HUL_PLATFORM_BUILDER_FUNCTIONBUILDER_H
#define HUL_PLATFORM_BUILDER_FUNCTIONBUILDER_H

#include "platform/icode/KvCParamSymbol.h"

#include <vector>

class AppBuilder;
class BlockBuilder;
class KV_DataType;
class KV_Statement;
class KvCParamSymbol;
class KvCUnparamSymbol;

class FunctionBuilder {
public:
  FunctionBuilder(AppBuilder& owner, KvCParamSymbol* function, BlockBuilder* bodyBuilder)
      : app(owner), fn(function), bodyBlock(bodyBuilder) {}

  KvCParamSymbol* symbol() const { return fn; }
  BlockBuilder& body() const { return *bodyBlock; }
  // The statement that defines (or, for a declared-only function, declares) the function.
  KV_Statement* declaration() const { return declStatement; }

  // Adds a formal parameter (a variable marked as formal). `byReference` marks it as a
  // reference formal.
  KvCUnparamSymbol* addFormal(const char* name, KV_DataType* type, bool byReference = false);
  // Formal i, made on demand (named <function>_p<i>, of type Int16) when calls need more
  // formals than were declared.
  KvCUnparamSymbol* formal(int i);
  int getNumberOfFormals() const { return static_cast<int>(formals.size()); }

  FunctionBuilder& role(tagKvESymbolRole r) {
    fn->setRole(r, true);
    return *this;
  }

private:
  friend class AppBuilder;
  AppBuilder& app;
  KvCParamSymbol* fn;
  BlockBuilder* bodyBlock;
  KV_Statement* declStatement = nullptr;
  std::vector<KvCUnparamSymbol*> formals;
};

#endif
