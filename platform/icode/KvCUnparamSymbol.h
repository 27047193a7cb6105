// KvCUnparamSymbol: a variable or a structure component.
//
// Structure instances and their components: a variable (or component) whose data type is
// a structure (KV_StructType) is a structure instance; it has one component slot per
// component of its type, in the type's order. The component symbols of an instance are
// made by the symbol database (KV_SymbolDB::demandComponentSymbol), one per slot at most;
// a slot may stay without a symbol. A component made that way knows its structure
// symbol; a component made as a free symbol (createUnparamSymbol with `component`) has
// none. KvCCompSymbolIterator walks the slots.
//
// An array of structures (an array type whose element type is a structure) has component
// slots too, one per component of the element structure: such a component stands for
// that component in every element (a[i].c). The array is not a structure instance
// (isStructInstance answers false; the iterator does not walk it), but
// getComponentInstance and getParentStructInstance join it like one.
//
// Type specifiers: a variable or component symbol carries the const and volatile
// specifiers and the address qualifier (KvCAddressQualifier, not owned; null when none) of
// its own declaration. For a component declaration's symbol (KV_ComponentDeclaration) they
// are those written in the structure type's declaration of the component.
#ifndef HUL_PLATFORM_ICODE_KVCUNPARAMSYMBOL_H
#define HUL_PLATFORM_ICODE_KVCUNPARAMSYMBOL_H

#include "platform/icode/KvCSymbol.h"

#include <vector>

class KV_StructType;
class KvCAddressQualifier;
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
  // For a component made for a structure instance (or an array of structures), that
  // instance; null for a variable that is not such a component.
  virtual KvCUnparamSymbol* getParentStructInstance() const { return structSymbol; }
  // The component symbol of this instance (or array of structures) for the component
  // `name` of its structure type; null when the type has no such component or no symbol
  // was made for its slot. O(components).
  virtual KvCUnparamSymbol* getComponentInstance(const WmCXString& componentName) const;
  // The structure type whose components are this symbol's slots: the data type when it is
  // a structure, the element structure of an array of structures; else null.
  KV_StructType* getSlotStructType() const;
  bool definesVectorWidth() const { return hasRole(KV_ROLE_DEFINES_VECTOR_WIDTH); }
  bool isFormalParameter() const { return hasRole(KV_ROLE_FORMAL_PARAMETER); }
  // An object-like macro of file scope (KV_MacroSymbolServer::demandGlobal), not a variable.
  bool isGlobalMacro() const { return hasRole(KV_ROLE_GLOBAL_MACRO); }
  // A formal parameter through which the actual argument is passed by reference: the
  // formal aliases the caller's object, so it never stands for a copy of the actual.
  bool isReferenceFormal() const { return hasRole(KV_ROLE_REFERENCE_FORMAL); }
  // The variable class the variable was made with, or null (not owned; the variable
  // class server owns it).
  KvCVarClassId* getVarClass() const { return varClass; }
  void setVarClass(KvCVarClassId* cls) { varClass = cls; }
  // The same variable class, under the names the declaration/definition mover uses.
  virtual KvCVarClassId* getVarClassId() const { return varClass; }
  virtual void setVarClassId(KvCVarClassId* cls) { varClass = cls; }
  // The symbol class of the variable class, or null.
  KvCSmbClassId* getSmbClassId() const override;

  // The specifiers of the symbol's own declaration.
  bool isConst() const { return constSpecifier; }
  void setConst(bool value) { constSpecifier = value; }
  bool isVolatile() const { return volatileSpecifier; }
  void setVolatile(bool value) { volatileSpecifier = value; }
  KvCAddressQualifier* getAddressQualifier() const { return addressQualifier; }
  void setAddressQualifier(KvCAddressQualifier* qualifier) { addressQualifier = qualifier; }

private:
  friend class KV_SymbolDB; // joins components to their structure instance

  bool isComponentSymbol;
  KvCVarClassId* varClass = nullptr;
  KvCUnparamSymbol* structSymbol = nullptr;
  int componentIndex = -1;
  bool constSpecifier = false;
  bool volatileSpecifier = false;
  KvCAddressQualifier* addressQualifier = nullptr;
  // Indexed by slot; null where no component symbol was made. Sized on the first
  // component made.
  std::vector<KvCUnparamSymbol*> componentSymbols;
};

#endif
