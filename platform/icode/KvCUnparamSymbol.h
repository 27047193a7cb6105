// KvCUnparamSymbol: a variable or a structure component.
#ifndef HUL_PLATFORM_ICODE_KVCUNPARAMSYMBOL_H
#define HUL_PLATFORM_ICODE_KVCUNPARAMSYMBOL_H

#include "platform/icode/KvCSymbol.h"

class KvCVarClassId;

class HUL_PLATFORM_API KvCUnparamSymbol : public KvCSymbol {
public:
  KvCUnparamSymbol(int index, WmCXString symbolName, KV_DataType* type, bool component)
      : KvCSymbol(index, std::move(symbolName), type), isComponentSymbol(component) {}

  KvCUnparamSymbol* asUnparamSymbol() override { return this; }

  bool isComponent() const { return isComponentSymbol; }
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
  bool isComponentSymbol;
  KvCVarClassId* varClass = nullptr;
};

#endif
