// KvCCvStructTool: the type specifiers a structure component inherits. A component of a
// const structure instance is const, a component reached through a volatile component is
// volatile, and an address qualifier given to an enclosing instance or component applies
// to what it contains. For one component symbol the tool finds the effective const,
// volatile and address-qualifier specifiers that come from the structure instances around
// it, from the component declarations on the path down to it and from its own
// declaration.
//
// Sources, in the order they are read: the enclosing instances from the innermost to the
// outermost, the component declarations on the path from the outermost instance down to
// the component, then the component symbol itself. The walk stops as soon as all three
// specifiers are found. A flag that is true stays true. While no address qualifier counts
// yet, an instance or the component (read through
// KvCSymbolQuery::getUnparamSymbolTypeSpecifiersIgnoreStructs) sets the has-qualifier flag
// and the qualifier to what it reports (false and null included); a component declaration
// that has a qualifier sets the qualifier to it and the flag to whether it is not the
// default one. So the nearest enclosing instance that reports a qualifier wins over those
// further out.
//
// No state: the tool's work is done by an implementation object made for the call. The
// symbols, types and qualifiers belong to the ICode. Cost: linear in the nesting depth,
// times the number of components of each structure type on the path (name look-up).
#ifndef HULCVTOOLS_SYMBOLTOOLS_KVCCVSTRUCTTOOL_H
#define HULCVTOOLS_SYMBOLTOOLS_KVCCVSTRUCTTOOL_H

#include "HulCvTools/HulCvToolsExport.h"
#include "HulCvTools/ModelInterfaces/ICodeFwd.h"

class HULCV_API KvCCvStructTool {
public:
  KvCCvStructTool() = default;
  virtual ~KvCCvStructTool();
  KvCCvStructTool(const KvCCvStructTool&) = default;
  KvCCvStructTool& operator=(const KvCCvStructTool&) = default;

  // The effective specifiers of `component`. `typeServer` and `specifierOption` are passed
  // unchanged to every specifier query. Resets the outputs (false, null) first. True when
  // the specifiers were determined, also for a symbol that is not a component of a
  // structure instance (nothing is inherited then) and for null. False when an instance
  // on the path has neither a structure type nor an array-of-structure type, or a
  // component on the path is not declared in its structure type, has no declaring symbol
  // or has no component symbol in its instance; the flags found before that stay set.
  bool getStructSpecificTypeSpecifiersOfComp(KvCUnparamSymbol* component,
                                             KV_DataTypeServer* typeServer, bool specifierOption,
                                             bool& isConst, bool& isVolatile,
                                             bool& hasAddressQualifier,
                                             KvCAddressQualifier*& addressQualifier);
};

#endif
