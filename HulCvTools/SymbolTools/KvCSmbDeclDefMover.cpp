#include "HulCvTools/SymbolTools/KvCSmbDeclDefMover.h"

#include "HulCvTools/ElocQuery/KvCElocQuery.h"
#include "HulCvTools/ModelInterfaces/ICodeModel.h"
#include "platform/support/KvCNameSpace.h"

HULCV_DEFINE_HEAP_OPERATORS(KvCSmbDeclDefMover)

namespace {

// The potential-globals name space of the sub-application of `table`'s file; null at the
// first missing link.
KvCNameSpace* potentialGlobalsOf(KvCCStmTable* table) {
  KvCIcFileId* fileId = table ? table->getFile() : nullptr;
  KvCIcFile* file = fileId ? fileId->getFile() : nullptr;
  KvCIcCodeUnit* unit = file ? file->getCodeUnit() : nullptr;
  KvCIcSubAppl* subAppl = unit ? unit->getSubAppl() : nullptr;
  return subAppl ? subAppl->getPotentialGlobalsNameSpace() : nullptr;
}

// The top-level table of the complementary file of `table`'s file; null at the first
// missing link.
KvCCStmTable* complementaryTableOf(KvCCStmTable* table) {
  KvCIcFileId* fileId = table->getFile();
  KvCIcFile* file = fileId ? fileId->getFile() : nullptr;
  KvCIcFileId* otherId = file ? file->getComplementaryFile() : nullptr;
  KvCIcFile* other = otherId ? otherId->getFile() : nullptr;
  return other ? other->getStt() : nullptr;
}

// A symbol the entries can be cleared for: a variable, or a function or macro.
bool isVariableOrFunction(KvCSymbol* symbol) {
  return symbol->asUnparamSymbol() || symbol->asParamSymbol();
}

} // namespace

KvCSmbDeclDefMover::~KvCSmbDeclDefMover() = default;

bool KvCSmbDeclDefMover::moveSymbol(KvCSymbol* symbol, KvCCStmTable* from, KvCCStmTable* to,
                                    KvCSmbClassId* smbClass, bool asDeclaration, bool& moved) {
  moved = false;
  if (!symbol || !from || !to || !smbClass || !isVariableOrFunction(symbol))
    return true;
  from->removeSymbol(symbol);
  clearSymbolEntries(symbol, smbClass);
  KvCSymbol* entered = symbol;
  if (asDeclaration)
    to->enterDeclaration(entered);
  else
    to->enterSymbol(entered);
  moved = true;
  return true;
}

bool KvCSmbDeclDefMover::moveLocalVar(KvCSymbol* symbol, KvCCStmTable* from, KvCCStmTable* to,
                                      bool& moved) {
  // The symbol's own class, read before the move: the move keeps it.
  return moveSymbol(symbol, from, to, symbol ? symbol->getSmbClassId() : nullptr, false, moved);
}

bool KvCSmbDeclDefMover::moveLocalVar(KvCSymbol* symbol, KvCCStmTable* from, KvCCStmTable* to) {
  bool moved = false;
  return moveLocalVar(symbol, from, to, moved);
}

bool KvCSmbDeclDefMover::moveLocalVarToFcnBaseScope(KV_QualifiedSymbolOp* access, bool& moved) {
  moved = false;
  KvCSymbol* symbol = access ? access->getSymbol() : nullptr;
  if (!symbol)
    return true;
  KvCSmbClassId* classId = symbol->getSmbClassId();
  KvCSmbClass* smbClass = classId ? classId->getSmbClass() : nullptr;
  if (!smbClass || !smbClass->isScopeLocal())
    return true;
  KV_ExprLocation* declaration = nullptr;
  KV_ExprLocation* definition = nullptr;
  elocDbQuery.getQsoStaticDeclDef(symbol, declaration, definition);
  if (!declaration && !definition)
    return true;
  KV_ExprLocation* place = definition ? definition : declaration;
  KvCParamSymbol* codeBlock = KvCElocQuery::getCodeBlockSymbol(place);
  KV_Statement* statement = place->getStatement();
  KvCCStmTable* table = statement ? statement->getParentCTable() : nullptr;
  if (!codeBlock || !table)
    return true;
  table->removeSymbol(symbol);
  clearSymbolEntries(symbol);
  KvCSymbol* entered = symbol;
  table->enterSymbol(entered);
  moved = true;
  return true;
}

bool KvCSmbDeclDefMover::removeSymbol(KvCSymbol* symbol, KvCCStmTable* table) {
  if (!symbol || !table || !symbol->getSmbClassId() || !isVariableOrFunction(symbol))
    return true;
  table->removeSymbol(symbol);
  return clearSymbolEntries(symbol);
}

bool KvCSmbDeclDefMover::enterSymbol(KvCSymbol*& symbol, KvCCStmTable* table) {
  if (symbol && table)
    table->enterSymbol(symbol);
  return true;
}

bool KvCSmbDeclDefMover::enterSymbol(KvCUnparamSymbol*& symbol, KvCCStmTable* table) {
  KvCSymbol* entered = symbol;
  enterSymbol(entered, table);
  symbol = entered ? entered->asUnparamSymbol() : nullptr;
  return true;
}

bool KvCSmbDeclDefMover::enterSymbol(KvCParamSymbol*& symbol, KvCCStmTable* table) {
  KvCSymbol* entered = symbol;
  enterSymbol(entered, table);
  symbol = entered ? entered->asParamSymbol() : nullptr;
  return true;
}

bool KvCSmbDeclDefMover::clearSymbolEntries(KvCSymbol* symbol) {
  return clearSymbolEntries(symbol, symbol ? symbol->getSmbClassId() : nullptr);
}

bool KvCSmbDeclDefMover::clearSymbolEntries(KvCSymbol* symbol, KvCSmbClassId* smbClass) {
  if (!symbol || !smbClass || !isVariableOrFunction(symbol))
    return true;
  symbol->setExtSmbClassState(static_cast<tagKvESmbClassState>(0));
  if (KvCUnparamSymbol* variable = symbol->asUnparamSymbol())
    variable->setVarClassId(smbClass->getVarClassId());
  else
    symbol->asParamSymbol()->setFcnClassId(smbClass->getFcnClassId());
  symbol->setExternSmbClass(nullptr);
  KvCCStmTable* table = symbol->getStt();
  if (KvCNameSpace* names = table ? table->getNameSpace() : nullptr)
    names->remove(symbol->getName());
  if (KvCSymbolQuery::isPotentialGlobalSymbol(symbol, table))
    if (KvCNameSpace* globals = potentialGlobalsOf(table))
      globals->remove(symbol->getName());
  symbol->setStt(nullptr);
  return true;
}

bool KvCSmbDeclDefMover::clearFromFileSyT(KvCSymbol* symbol, KvCCStmTable* oldTable,
                                          bool toStaticGlobal) {
  if (!symbol || !oldTable)
    return true;
  if (!oldTable->isPrimaryScopeTable() && (toStaticGlobal || !oldTable->isSecondaryScopeTable()))
    return true;
  KvCCStmTable* otherTable = complementaryTableOf(oldTable);
  KvCNameSpace* names = otherTable ? otherTable->getNameSpace() : nullptr;
  if (!names)
    return true;
  KvCCStmTable* table = symbol->getStt();
  // A symbol just entered into the complementary file's table keeps its name there.
  if (otherTable != table)
    names->remove(symbol->getName());
  if (!table || !KvCSymbolQuery::isPotentialGlobalSymbol(symbol, table))
    return true;
  if (KvCNameSpace* globals = potentialGlobalsOf(table))
    globals->remove(symbol->getName());
  return true;
}

bool KvCSmbDeclDefMover::changeClass(KvCSymbol* symbol, KvCCStmTable* newTable,
                                     KvCSmbClassId* newClass, bool asDeclaration, bool clearFile,
                                     bool toStaticGlobal, bool& moved) {
  KvCCStmTable* oldTable = KvCSymbolQuery::getDestinationStt(symbol);
  moveSymbol(symbol, oldTable, newTable, newClass, asDeclaration, moved);
  if (clearFile && moved)
    clearFromFileSyT(symbol, oldTable, toStaticGlobal);
  return true;
}

bool KvCSmbDeclDefMover::clearGlobalDeclareStaticGlobal(KvCSymbol* symbol, KvCCStmTable* newTable,
                                                        KvCSmbClassId* newClass, bool& moved) {
  return changeClass(symbol, newTable, newClass, true, false, false, moved);
}

bool KvCSmbDeclDefMover::clearGlobalDefineStaticGlobal(KvCSymbol* symbol, KvCCStmTable* newTable,
                                                       KvCSmbClassId* newClass, bool& moved) {
  return changeClass(symbol, newTable, newClass, false, true, true, moved);
}

bool KvCSmbDeclDefMover::clearGlobalDefineStaticLocal(KvCSymbol* symbol, KvCCStmTable* newTable,
                                                      KvCSmbClassId* newClass, bool& moved) {
  return changeClass(symbol, newTable, newClass, false, true, false, moved);
}

bool KvCSmbDeclDefMover::clearGlobalDefineLocal(KvCSymbol* symbol, KvCCStmTable* newTable,
                                                KvCSmbClassId* newClass, bool& moved) {
  return changeClass(symbol, newTable, newClass, false, true, false, moved);
}

bool KvCSmbDeclDefMover::clearStaticGlobalDefineStaticLocal(KvCSymbol* symbol,
                                                            KvCCStmTable* newTable,
                                                            KvCSmbClassId* newClass, bool& moved) {
  return changeClass(symbol, newTable, newClass, false, true, false, moved);
}

bool KvCSmbDeclDefMover::clearStaticGlobalDefineLocal(KvCSymbol* symbol, KvCCStmTable* newTable,
                                                      KvCSmbClassId* newClass, bool& moved) {
  return changeClass(symbol, newTable, newClass, false, true, false, moved);
}

bool KvCSmbDeclDefMover::clearStaticLocalDefineLocal(KvCSymbol* symbol, KvCCStmTable* newTable,
                                                     KvCSmbClassId* newClass, bool& moved) {
  return changeClass(symbol, newTable, newClass, false, false, false, moved);
}

bool KvCSmbDeclDefMover::clearInitialValue(KvCSymbol* symbol, KvCCStmTable* newTable,
                                           KvCSmbClassId* newClass, bool& moved) {
  return clearStaticLocalDefineLocal(symbol, newTable, newClass, moved);
}
