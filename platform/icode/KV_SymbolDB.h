// KV_SymbolDB: all symbols of the code view data, in creation order. It makes and owns
// them, numbers them (debug index 1, 2, ...) and finds a symbol by name in O(1) (the
// first one made with that name, when names repeat across scopes).
#ifndef HUL_PLATFORM_ICODE_KV_SYMBOLDB_H
#define HUL_PLATFORM_ICODE_KV_SYMBOLDB_H

#include "platform/icode/KV_SmbDBObjVisitor.h"
#include "platform/support/HulPlatformExport.h"
#include "platform/support/WmCXString.h"

#include <memory>
#include <unordered_map>
#include <vector>

class KV_DataType;
class KV_StructType;

class HUL_PLATFORM_API KV_SymbolDB {
public:
  KV_SymbolDB();
  ~KV_SymbolDB();
  KV_SymbolDB(const KV_SymbolDB&) = delete;
  KV_SymbolDB& operator=(const KV_SymbolDB&) = delete;

  KvCParamSymbol* createParamSymbol(const WmCXString& name, KV_DataType* returnType, bool macro);
  KvCUnparamSymbol* createUnparamSymbol(const WmCXString& name, KV_DataType* type, bool component);
  // The component symbol of slot `i` of the structure instance (or array of structures)
  // `structSymbol`, named and typed after component i of its structure type (the array's
  // element structure); made (and joined to the instance) when missing. Null when the
  // symbol has no slots or no slot i. Such components are numbered like every symbol but
  // not found by name (findSymbol).
  KvCUnparamSymbol* demandComponentSymbol(KvCUnparamSymbol* structSymbol, int i);
  // The symbol that declares component `componentName` of `structType` (a free component
  // symbol named and typed after the component, held by the type's component
  // declaration), made when missing. Null when the type has no such component. Numbered
  // like every symbol, not found by name.
  KvCUnparamSymbol* demandComponentDeclSymbol(KV_StructType* structType,
                                              const WmCXString& componentName);

  KvCSymbol* findSymbol(const WmCXString& name) const;
  int getNumberOfSymbols() const { return static_cast<int>(symbols.size()); }
  KvCSymbol* getSymbol(int i) const { return symbols[static_cast<std::size_t>(i)].get(); }

  // Calls the visitor once per function or macro symbol, in creation order.
  void forallParametrizedSymbols(KV_SmbDBObjVisitor* visitor);

private:
  void enter(std::unique_ptr<KvCSymbol> symbol);

  std::vector<std::unique_ptr<KvCSymbol>> symbols;
  std::vector<KV_ParamSmbDBObj> paramEntries;
  std::unordered_map<WmCXString, KvCSymbol*> byName;
};

#endif
