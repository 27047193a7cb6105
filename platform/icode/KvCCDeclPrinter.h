// KvCCDeclPrinter: writes what a file of the ICode declares as C99 text: an include guard,
// the typedefs of the types the file defines (in definition order) and the declarations
// its top-level statement table holds: the variable declarations
// (`extern StatusType status;`) and the prototypes of the functions declared there that
// carry a signature (`StatusType SetEvent(TaskType taskId, EventMaskType mask);`, `void
// Schedule(void);`). Functions without a signature (made other than by the function symbol
// server or the call inserter) print nothing.
//
// Macros: the macro definitions of the table print as `#define` lines. A function-like
// macro prints with its parameter names and its body, `#define AP_CONCAT(name1, name2)
// AP_EXPAND_CONCAT(name1, name2)`; the pre-include macros among them come first, right
// after the include guard, before the typedefs. A global (object-like) macro prints with
// its value cast to its type, `#define CID_Engine ((signed char)1)`, in statement order.
// Bodies print as preprocessor text: a symbol access as the symbol's name, a code string as
// its text, a constant as its value, a macro or function call as `NAME(arg1, arg2)` (the
// actual of each parameter operation), a string append as its expression followed by its
// text, and a preprocessor concatenation as its two pieces joined by `##` where both meet
// with identifier characters (so the preprocessor pastes two names) and side by side
// elsewhere (a bracket and a name: `(name)`).
//
// Every printed file is valid C99 on its own: it includes nothing. A type is written by
// its name only where the name is visible, that is after its typedef in the same file;
// anywhere else it is spelled out (a named type as its base type, base types as the C type
// of their width and signedness: 8, 16, 32 and 64 bits are char, short, int and long long,
// so the target's int has 32 bits; Float32 is float, Float64 double). A type whose typedef
// is not created (isCreateTypedef false) prints no typedef and is always spelled out.
//
// The printer reads the model and changes nothing; an object lives for one printing.
#ifndef HUL_PLATFORM_ICODE_KVCCDECLPRINTER_H
#define HUL_PLATFORM_ICODE_KVCCDECLPRINTER_H

#include "platform/support/HulPlatformExport.h"
#include "platform/support/WmCXString.h"

#include <string>
#include <unordered_set>

class KV_DataType;
class KV_ExprLocation;
class KV_Operation;
class KV_Statement;
class KvCIcFileId;

class HUL_PLATFORM_API KvCCDeclPrinter {
public:
  // The C text of `file` (empty for a null file).
  static WmCXString printFile(const KvCIcFileId* file);
  // The include guard macro of a file name: letters and digits upper-cased, every other
  // character '_', and "FILE_" in front of a name that would not start with a letter
  // ("osek.h" gives "OSEK_H").
  static WmCXString getIncludeGuard(const WmCXString& fileName);
  // The C type of a base type of that width and signedness.
  static const char* getCTypeName(int bits, bool isSigned, bool isFloat);

  KvCCDeclPrinter() = default;
  // The declaration of `name` with `type`, without the semicolon: "unsigned char x[2]",
  // "void* p", "int (*q)[3]". With an empty name, the type alone ("StatusType*"). Uses the
  // names of the typedefs written so far by this printer.
  WmCXString declare(KV_DataType* type, const WmCXString& name) const;
  // `typedef <base> Name;` and the name becomes visible; empty for a type whose typedef
  // is not created.
  WmCXString printTypeDefinition(KV_DataType* type);
  // The C text of a statement of a file's top-level table, ending with a newline; empty
  // for a statement that declares nothing this printer writes.
  WmCXString printStatement(const KV_Statement* statement) const;
  // The preprocessor text of an expression (see above); empty for a null or empty
  // location and for operations this printer does not write.
  WmCXString printExpression(const KV_ExprLocation* location) const;
  // Whether the statement defines a pre-include macro (printed before the typedefs).
  static bool isPreIncludeDefinition(const KV_Statement* statement);

private:
  // `#define` line of a macro definition; empty when it defines no macro.
  WmCXString printMacroDefinition(const KV_Operation* definition) const;
  std::string expressionText(const KV_ExprLocation* location) const;
  // The prototype of a function declaration; empty when it has no signature.
  WmCXString printPrototype(const KV_Operation* declaration) const;
  bool isVisible(const KV_DataType* type) const { return visible.count(type) != 0; }
  // The declarator of `type` around `inner`; `isConst` qualifies the declared object.
  std::string declarator(const KV_DataType* type, std::string inner, bool isConst) const;
  std::string structuralDeclarator(const KV_DataType* type, std::string inner, bool isConst) const;
  // Whether the type, spelled here, adds array brackets after the declared name.
  bool appendsSuffix(const KV_DataType* type) const;

  std::unordered_set<const KV_DataType*> visible;
};

#endif
