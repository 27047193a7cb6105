#include "platform/icode/KvCCDeclPrinter.h"

#include "platform/icode/KV_Constant.h"
#include "platform/icode/KV_DataType.h"
#include "platform/icode/KV_ExprLocation.h"
#include "platform/icode/KV_Operation.h"
#include "platform/icode/KV_QualifiedSymbolOp.h"
#include "platform/icode/KV_Statement.h"
#include "platform/icode/KvCCStmTable.h"
#include "platform/icode/KvCIcFileId.h"
#include "platform/icode/KvCParamSymbol.h"
#include "platform/icode/KvCStringExpr.h"
#include "platform/icode/KvCSymbol.h"
#include "platform/icode/KvCUnparamSymbol.h"

#include <cctype>
#include <cstdint>
#include <sstream>

namespace {
std::string dimensionSuffix(const KV_DimensionDescriptor& dims) {
  std::string suffix;
  for (int i = 0; i < dims.getNumberOfDimensions(); ++i)
    suffix += "[" + std::to_string(dims.getDimension(i)) + "]";
  return suffix;
}

// The declaration specifier and the declarator joined, leading stars on the specifier's
// side: "void" and "*p" give "void* p", "int" and "(*q)[3]" give "int (*q)[3]".
std::string join(const std::string& specifier, const std::string& inner) {
  std::size_t stars = inner.find_first_not_of('*');
  if (stars == std::string::npos)
    return specifier + inner;
  std::string rest = inner.substr(stars);
  return specifier + inner.substr(0, stars) + " " + rest;
}

bool isIdentifierChar(char c) {
  auto u = static_cast<unsigned char>(c);
  return std::isalnum(u) || c == '_';
}

// The two pieces of a preprocessor concatenation: pasted with `##` where both meet with
// identifier characters, side by side otherwise.
std::string concatenation(const std::string& left, const std::string& right) {
  if (!left.empty() && !right.empty() && isIdentifierChar(left.back()) &&
      isIdentifierChar(right.front()))
    return left + "##" + right;
  return left + right;
}

// The symbol a location accesses, or null.
KvCSymbol* accessedSymbol(const KV_ExprLocation* location) {
  KvCIcExpression* access = location ? location->getExpression() : nullptr;
  KV_QualifiedSymbolOp* qso = access ? access->asQualifiedSymbolOp() : nullptr;
  return qso ? qso->getSymbol() : nullptr;
}

std::string constantText(KV_Constant* constant) {
  if (constant->getConstantType() == KV_CONST_DOUBLE) {
    std::ostringstream text;
    text << constant->getDoubleValue();
    return text.str();
  }
  if (constant->getConstantType() == KV_CONST_UNSIGNED)
    return std::to_string(static_cast<std::uint64_t>(constant->getIntValue())) + "u";
  return std::to_string(constant->getIntValue());
}
} // namespace

const char* KvCCDeclPrinter::getCTypeName(int bits, bool isSigned, bool isFloat) {
  if (isFloat)
    return bits <= 32 ? "float" : "double";
  if (bits <= 8)
    return isSigned ? "signed char" : "unsigned char";
  if (bits <= 16)
    return isSigned ? "short" : "unsigned short";
  if (bits <= 32)
    return isSigned ? "int" : "unsigned int";
  return isSigned ? "long long" : "unsigned long long";
}

WmCXString KvCCDeclPrinter::getIncludeGuard(const WmCXString& fileName) {
  std::string guard;
  for (char c : fileName.str()) {
    auto u = static_cast<unsigned char>(c);
    guard += std::isalnum(u) ? static_cast<char>(std::toupper(u)) : '_';
  }
  if (guard.empty() || !std::isalpha(static_cast<unsigned char>(guard[0])))
    guard = "FILE_" + guard;
  return guard;
}

bool KvCCDeclPrinter::appendsSuffix(const KV_DataType* type) const {
  for (; type && !isVisible(type); type = type->getBaseType())
    if (type->getTypeKind() == KV_TYPE_ARRAY || !type->getDimensions().isScalar())
      return true;
  return false;
}

std::string KvCCDeclPrinter::declarator(const KV_DataType* type, std::string inner,
                                        bool isConst) const {
  if (type && isVisible(type))
    return join((isConst ? "const " : "") + type->getName().str(), inner);
  if (type && type->getBaseType())
    return declarator(type->getBaseType(), inner + dimensionSuffix(type->getDimensions()), isConst);
  return structuralDeclarator(type, std::move(inner), isConst);
}

std::string KvCCDeclPrinter::structuralDeclarator(const KV_DataType* type, std::string inner,
                                                  bool isConst) const {
  const std::string qualifier = isConst ? "const " : "";
  switch (type ? type->getTypeKind() : KV_TYPE_VOID) {
  case KV_TYPE_NUMERICAL: {
    const auto* n = static_cast<const KV_NumericalType*>(type);
    return join(qualifier + getCTypeName(n->getBits(), n->isSigned(), n->isFloat()), inner);
  }
  case KV_TYPE_POINTER: {
    const auto* p = static_cast<const KV_PointerType*>(type);
    std::string pointer = "*" + (isConst ? "const " + inner : inner);
    if (appendsSuffix(p->getTargetType()))
      pointer = "(" + pointer + ")";
    return declarator(p->getTargetType(), pointer, p->isPointerToConst());
  }
  case KV_TYPE_ARRAY: {
    const auto* a = static_cast<const KV_ArrayType*>(type);
    return declarator(a->getElementType(), inner + "[" + std::to_string(a->getSize()) + "]",
                      isConst);
  }
  case KV_TYPE_STRUCT:
    return join(qualifier + "struct " + type->getName().str(), inner);
  case KV_TYPE_VOID:
    break;
  }
  return join(qualifier + "void", inner);
}

WmCXString KvCCDeclPrinter::declare(KV_DataType* type, const WmCXString& name) const {
  return declarator(type, name.str(), false);
}

WmCXString KvCCDeclPrinter::printTypeDefinition(KV_DataType* type) {
  if (!type || !type->isCreateTypedef())
    return {};
  std::string inner = type->getName().str() + dimensionSuffix(type->getDimensions());
  std::string definition = type->getBaseType() ? declarator(type->getBaseType(), inner, false)
                                               : structuralDeclarator(type, inner, false);
  visible.insert(type);
  return "typedef " + definition + ";\n";
}

WmCXString KvCCDeclPrinter::printStatement(const KV_Statement* statement) const {
  KV_ExprLocation* root = statement ? statement->getExprLoc() : nullptr;
  KV_Operation* op = root ? root->getOperation() : nullptr;
  if (!op)
    return {};
  switch (op->getOperator()->getKind()) {
  case KV_OP_VARIABLE_DECLARATION: {
    // (object, type, file)
    KV_ExprLocation* object = op->getOperand(0);
    KvCIcExpression* access = object ? object->getExpression() : nullptr;
    KV_QualifiedSymbolOp* qso = access ? access->asQualifiedSymbolOp() : nullptr;
    KvCSymbol* symbol = qso ? qso->getSymbol() : nullptr;
    if (!symbol)
      return {};
    KV_ExprLocation* typeLoc = op->getOperand(1);
    KV_DataType* type =
        typeLoc && typeLoc->getDataTypeRef() ? typeLoc->getDataTypeRef() : symbol->getDataType();
    return "extern " + declare(type, symbol->getName()) + ";\n";
  }
  case KV_OP_FUNCTION_DECLARATION:
    return printPrototype(op);
  case KV_OP_MACRO_DEFINITION:
    return printMacroDefinition(op);
  default:
    return {};
  }
}

bool KvCCDeclPrinter::isPreIncludeDefinition(const KV_Statement* statement) {
  KV_ExprLocation* root = statement ? statement->getExprLoc() : nullptr;
  KV_Operation* op = root ? root->getOperation() : nullptr;
  if (!op || op->getOperator()->getKind() != KV_OP_MACRO_DEFINITION)
    return false;
  KvCSymbol* symbol = accessedSymbol(op->getOperand(0));
  KvCParamSymbol* macro = symbol ? symbol->asParamSymbol() : nullptr;
  return macro && macro->isPreIncludeMacro();
}

WmCXString KvCCDeclPrinter::printMacroDefinition(const KV_Operation* definition) const {
  KvCSymbol* symbol = accessedSymbol(definition->getOperand(0));
  if (!symbol)
    return {};
  if (KvCParamSymbol* macro = symbol->asParamSymbol()) {
    // (macro, body, file)
    if (!macro->isMacro())
      return {};
    std::string parameters;
    for (int i = 0; i < macro->getNumberOfFormalParams(); ++i)
      parameters += (i > 0 ? ", " : "") + macro->getFormalParam(i).name.str();
    const std::string body = expressionText(definition->getOperand(1));
    return "#define " + macro->getName().str() + "(" + parameters + ")" +
           (body.empty() ? "" : " " + body) + "\n";
  }
  // A global macro: (macro, type, file, value).
  KvCUnparamSymbol* global = symbol->asUnparamSymbol();
  if (!global || !global->isGlobalMacro())
    return {};
  const std::string value = expressionText(definition->getOperand(3));
  if (value.empty())
    return "#define " + global->getName().str() + "\n";
  KV_ExprLocation* typeLoc = definition->getOperand(1);
  KV_DataType* type =
      typeLoc && typeLoc->getDataTypeRef() ? typeLoc->getDataTypeRef() : global->getDataType();
  const bool byName = type && type->isUseNameForCasts() && isVisible(type);
  const std::string cast = byName ? type->getName().str() : declarator(type, "", false);
  return "#define " + global->getName().str() + " ((" + cast + ")" + value + ")\n";
}

WmCXString KvCCDeclPrinter::printExpression(const KV_ExprLocation* location) const {
  return expressionText(location);
}

std::string KvCCDeclPrinter::expressionText(const KV_ExprLocation* location) const {
  KvCIcExpression* expression = location ? location->getExpression() : nullptr;
  if (!expression)
    return {};
  if (KvCStringExpr* string = expression->asStringExpr())
    return string->applyQuotes() ? "\"" + string->getString().str() + "\""
                                 : string->getString().str();
  if (KV_Constant* constant = expression->asConstant())
    return constantText(constant);
  KV_Operation* op = expression->asOperation();
  if (!op)
    return {};
  if (KV_QualifiedSymbolOp* qso = op->asQualifiedSymbolOp())
    return (qso->isDereferenced() ? "*" : "") + qso->getSymbol()->getName().str();
  switch (op->getOperator()->getKind()) {
  case KV_OP_CALL: {
    // (called, parameters...): the actual of each parameter operation.
    std::string text = expressionText(op->getOperand(0)) + "(";
    for (int i = 1; i < op->getNumberOfOperands(); ++i) {
      KV_ExprLocation* argument = op->getOperand(i);
      KV_Operation* parameter = argument ? argument->getOperation() : nullptr;
      if (parameter && parameter->getOperator()->isParameter())
        argument = parameter->getOperand(1);
      text += (i > 1 ? ", " : "") + expressionText(argument);
    }
    return text + ")";
  }
  case KV_OP_PREPROC_CONCAT:
    return concatenation(expressionText(op->getOperand(0)), expressionText(op->getOperand(1)));
  case KV_OP_STRING_APPEND:
    return expressionText(op->getOperand(0)) + expressionText(op->getOperand(1));
  default:
    return {};
  }
}

WmCXString KvCCDeclPrinter::printPrototype(const KV_Operation* declaration) const {
  // (function, return type, file)
  KV_ExprLocation* object = declaration->getOperand(0);
  KvCIcExpression* access = object ? object->getExpression() : nullptr;
  KV_QualifiedSymbolOp* qso = access ? access->asQualifiedSymbolOp() : nullptr;
  KvCSymbol* symbol = qso ? qso->getSymbol() : nullptr;
  KvCParamSymbol* function = symbol ? symbol->asParamSymbol() : nullptr;
  if (!function || function->isMacro() || !function->hasSignature())
    return {};
  std::string parameters;
  for (int i = 0; i < function->getNumberOfFormalParams(); ++i) {
    const KvCParamSymbol::FormalParam& param = function->getFormalParam(i);
    if (i > 0)
      parameters += ", ";
    parameters += declarator(param.type, param.name.str(), false);
  }
  if (parameters.empty())
    parameters = "void";
  const std::string inner = function->getName().str() + "(" + parameters + ")";
  return declarator(function->getDataType(), inner, false) + ";\n";
}

WmCXString KvCCDeclPrinter::printFile(const KvCIcFileId* file) {
  if (!file)
    return {};
  KvCCDeclPrinter printer;
  WmCXString guard = getIncludeGuard(file->getName());
  WmCXString text = "#ifndef " + guard + "\n#define " + guard + "\n";
  const KvCCStmTable* table = file->getFile()->getStatementTable();
  const int nStatements = table ? table->getNumberOfStatements() : 0;
  WmCXString preIncludes;
  for (int i = 0; i < nStatements; ++i)
    if (isPreIncludeDefinition(table->getStatement(i)))
      preIncludes += printer.printStatement(table->getStatement(i));
  if (!preIncludes.isEmpty())
    text += "\n" + preIncludes;
  WmCXString typedefs;
  for (KV_DataType* type : file->getFile()->getDefinedTypes())
    typedefs += printer.printTypeDefinition(type);
  if (!typedefs.isEmpty())
    text += "\n" + typedefs;
  WmCXString declarations;
  for (int i = 0; i < nStatements; ++i)
    if (!isPreIncludeDefinition(table->getStatement(i)))
      declarations += printer.printStatement(table->getStatement(i));
  if (!declarations.isEmpty())
    text += "\n" + declarations;
  return text + "\n#endif\n";
}
