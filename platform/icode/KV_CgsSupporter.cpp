#include "platform/icode/KV_CgsSupporter.h"

#include "platform/icode/KV_DataType.h"
#include "platform/icode/KV_DataTypeServer.h"
#include "platform/icode/KV_ExprLocation.h"
#include "platform/icode/KV_ICodeFactoryContainer.h"
#include "platform/icode/KV_Operation.h"
#include "platform/icode/KV_Statement.h"
#include "platform/icode/KV_SymbolDB.h"
#include "platform/icode/KV_SymbolServer.h"
#include "platform/icode/KV_VariableSymbolServer.h"
#include "platform/icode/KvCCStmTable.h"
#include "platform/icode/KvCCodeViewData.h"
#include "platform/icode/KvCParamSymbol.h"
#include "platform/icode/KvCUnparamSymbol.h"
#include "platform/icode/KvCVarClassId.h"
#include "platform/support/KvCCIdentifier.h"
#include "platform/support/KvCNameSpace.h"
#include "platform/support/KvCNames.h"

#include <cstdint>
#include <cstring>
#include <string>

namespace {
bool isCKeyword(const WmCXString& name) {
  static const char* const kKeywords[] = {
      "auto",     "break",  "case",   "char",     "const",     "continue", "default",  "do",
      "double",   "else",   "enum",   "extern",   "float",     "for",      "goto",     "if",
      "inline",   "int",    "long",   "register", "restrict",  "return",   "short",    "signed",
      "sizeof",   "static", "struct", "switch",   "typedef",   "union",    "unsigned", "void",
      "volatile", "while",  "_Bool",  "_Complex", "_Imaginary"};
  for (const char* keyword : kKeywords)
    if (std::strcmp(keyword, name.c_str()) == 0)
      return true;
  return false;
}

bool isFileScope(const KvCCStmTable* table) { return table && table->isFileScopeTable(); }
} // namespace

KV_CgsSupporter::~KV_CgsSupporter() = default;

bool KV_CgsSupporter::isNameFree(const KvCCStmTable* table, const WmCXString& name) const {
  if (!table || !KvCNames::isValidCIdentifier(name) || isCKeyword(name))
    return false;
  if (table->getNameSpace() && table->getNameSpace()->contains(name))
    return false;
  KvCSymbol* symbol = codeViewData->getSymbolDB()->findSymbol(name);
  if (symbol && symbol->asParamSymbol())
    return false;
  return codeViewData->getDataTypeServer()->findType(name) == nullptr;
}

KvCUnparamSymbol* KV_CgsSupporter::createGlobalVariable(const WmCXString& name, KV_DataType* type,
                                                        KV_Scaling* scaling, double initialValue,
                                                        KvCVarClassId* varClass,
                                                        KvCCStmTable* table, unsigned int roles) {
  if (!type || !varClass || !varClass->isGlobal() || !isFileScope(table) ||
      !isNameFree(table, name))
    return nullptr;
  KV_ICodeFactoryContainer* factories = codeViewData->getFactoryContainer();
  KV_ExprLocFactory* locations = factories->getExprLocFactory();
  KvCUnparamSymbol* variable = factories->getSymbolServer()->getVariable()->create(
      name, roles, type, scaling, varClass, nullptr);
  if (!variable)
    return nullptr;

  // (object, type, file) and, for a definition, the initial value. Fresh locations and a
  // fresh statement: the factories cannot refuse them.
  KV_Operation* declaration = factories->getOperationFactory()->createOperation(
      varClass->isExtern() ? KV_OP_VARIABLE_DECLARATION : KV_OP_VARIABLE_DEFINITION,
      {locations->createFromSymbol(variable), locations->createFromDataType(type),
       locations->createFromFileId(table->getFile())});
  if (!declaration)
    return nullptr;
  if (!varClass->isExtern()) {
    KV_ExprLocation* init =
        type->isFloat() ? locations->createFromValue(initialValue, type)
                        : locations->createFromValue(static_cast<std::int64_t>(initialValue), type);
    declaration->appendOperand(init);
  }
  KV_Statement* statement = factories->getStatementFactory()->createStatement(
      locations->createFromOperation(declaration));
  table->appendStatement(statement);

  if (!table->getNameSpace())
    table->setNameSpace(codeViewData->createNameSpace());
  table->getNameSpace()->add(name);
  return variable;
}

KV_ExprDescrTupel* KV_CgsSupporter::createScalarVariable(KvCCIdentifier& name, KV_DataType* type,
                                                         KV_Scaling* scaling, double initialValue,
                                                         bool makeUnique, KvCVarClassId* varClass,
                                                         const KvCSrcRef* /*srcRef*/,
                                                         KV_BdPartition* partition,
                                                         KvCCStmTable* table, unsigned int roles) {
  WmCXString given = name.getCookedName();
  if (makeUnique && isFileScope(table)) {
    const WmCXString base = given;
    for (int n = 1; !isNameFree(table, given) && KvCNames::isValidCIdentifier(base); ++n)
      given = base + WmCXString("_" + std::to_string(n));
  }
  KvCUnparamSymbol* variable =
      createGlobalVariable(given, type, scaling, initialValue, varClass, table, roles);
  if (!variable)
    return nullptr;
  name = given;
  tuples.push_back(std::make_unique<KV_ExprDescrTupel>(partition));
  tuples.back()->append(KV_ExprDescr(variable, type, scaling));
  return tuples.back().get();
}
