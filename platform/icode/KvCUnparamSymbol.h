// KvCUnparamSymbol: a variable or a structure component.
//
// Structure instances and their components: a variable (or component) whose data type is
// a structure (KV_StructType) is a structure instance; it has one component slot per
// component of its type, in the type's order. The component symbols of an instance are
// made by the symbol database (KV_SymbolDB::demandComponentSymbol), one per slot at most;
// a slot may stay without a symbol. A component made that way knows its structure
// symbol; a component made as a free symbol (createUnparamSymbol with `component`) has
// none. KvCCompSymbolIterator walks the slots.
#ifndef HUL_PLATFORM_ICODE_KVCUNPARAMSYMBOL_H
#define HUL_PLATFORM_ICODE_KVCUNPARAMSYMBOL_H

#include "platform/icode/KvCSymbol.h"

#include <vector>

class KvCVarClassId;

class HUL_PLATFORM_API KvCUnparamSymbol : public KvCSymbol {
public:
  KvCUnparamSymbol(int index, WmCXString symbolName, KV_DataType* type, bool component)
      : KvCSymbol(index, std::move(symbolName), type), isComponentSymbol(component) {}

  KvCUnparamSymbol* asUnparamSymbol() override { return this; }

  virtual bool isComponent() const { return isComponentSymbol; }
  // Whether the symbol's data type is a structure (the symbol has component slots).
  virtual bool isStructInstance() const;
  // For a component made for a structure instance, that instance; otherwise null.
  virtual KvCUnparamSymbol* getStructSymbol() const { return structSymbol; }
  // The component symbol in slot `i` of a structure instance, or null (no such slot, or no
  // symbol made for it).
  KvCUnparamSymbol* getComponentSymbol(int i) const;
  // The slot of this component in its structure symbol, or -1.
  int getComponentIndex() const { return componentIndex; }
  bool definesVectorWidth() const { return hasRole(KV_ROLE_DEFINES_VECTOR_WIDTH); }
  bool isFormalParameter() const { return hasRole(KV_ROLE_FORMAL_PARAMETER); }
  // A formal parameter through which the actual argument is passed by reference: the
  // formal aliases the caller's object, so it never stands for a copy of the actual.
  bool isReferenceFormal() const { return hasRole(KV_ROLE_REFERENCE_FORMAL); }
  // The variable class the variable was made with, or null (not owned; the variable
  // class server owns it).
  KvCVarClassId* getVarClass() const { return varClass; }
  void setVarClass(KvCVarClassId* cls) { varClass = cls; }

private:
  friend class KV_SymbolDB; // joins components to their structure instance

  bool isComponentSymbol;
  KvCVarClassId* varClass = nullptr;
  KvCUnparamSymbol* structSymbol = nullptr;
  int componentIndex = -1;
  // Indexed by slot; null where no component symbol was made. Sized on the first
  // component made.
  std::vector<KvCUnparamSymbol*> componentSymbols;
};

#endif
