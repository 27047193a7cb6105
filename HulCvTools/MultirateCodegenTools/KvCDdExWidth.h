// KvCDdExWidth: a width object of the Data Dictionary (a named width that vectors of
// generated code take) and the macro that carries the width in generated code. The
// library only reads it: the object is filled outside the library, and every getter
// answers a copy of the stored value or the stored pointer, with no other effect.
//
// Ownership: it does not own the width macro's expression descriptor or the source
// reference (the ICode and the run's source reference server do). Copies are member-wise
// and share both.
#ifndef HULCVTOOLS_MULTIRATECODEGENTOOLS_KVCDDEXWIDTH_H
#define HULCVTOOLS_MULTIRATECODEGENTOOLS_KVCDDEXWIDTH_H

#include "HulCvTools/HulCvToolsExport.h"
#include "HulCvTools/ModelInterfaces/ICodeFwd.h"
#include "platform/leda/array.h"
#include "platform/support/WmCXString.h"

class KvCSrcRef;

class HULCV_API KvCDdExWidth {
public:
  // An empty width object: empty texts, width 0, no possible widths, both flags false,
  // no macro expression, no source reference.
  KvCDdExWidth() = default;

  WmCXString getDdPath() const { return ddPath; }
  WmCXString getName() const { return name; }
  WmCXString getDescription() const { return description; }
  int getActualWidth() const { return actualWidth; }
  // A copy with the stored index range.
  leda::array<int> getPossibleWidths() const { return possibleWidths; }
  bool getPropagateWidth() const { return propagateWidth; }
  bool getConsiderThreshold() const { return considerThreshold; }
  WmCXString getWidthMacroEdDdPath() const { return widthMacroEdDdPath; }
  KV_ExprDescr* getWidthMacroEd() const { return widthMacroEd; }
  KvCSrcRef* getSrcRef() const { return srcRef; }

private:
  void setWidthMacroEd(KV_ExprDescr* expression) { widthMacroEd = expression; }

  WmCXString ddPath;
  WmCXString name;
  WmCXString description;
  int actualWidth = 0;
  leda::array<int> possibleWidths;
  bool propagateWidth = false;
  bool considerThreshold = false;
  WmCXString widthMacroEdDdPath;
  KV_ExprDescr* widthMacroEd = nullptr;
  KvCSrcRef* srcRef = nullptr;
};

#endif
