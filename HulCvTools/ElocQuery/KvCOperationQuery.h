// KvCOperationQuery: whether the code generator may still have to express an operation
// through a call of a function or macro that is not free of side effects (a library
// helper such as a saturation, division or shift routine, or code taken over as it is).
// Passes that move or duplicate expressions ask it before they treat an operation as
// free of side effects. The answer depends on the operation's conversion level, whether
// it is a symbol access, its operator kind and, for code blocks, the block's kind; the
// operands are not looked at (each operation of a tree is asked on its own).
//
// The decision, in the order the tests are made (the first test that applies answers):
//
//   test                                        false for                    true for
//   -------------------------------------------------------------------------------------
//   conversion level is C code                  every kind                   -
//   symbol access (qualified-symbol operation)  every kind                   -
//   family 1: logical                           and, or, not                 -
//   family 2: relational                        <, <=, >, >=, ==, !=         -
//   family 3: arithmetic                        -                            add, sub,
//                                                                            mul, div,
//                                                                            mod, neg,
//                                                                            abs, saturate
//   family 4: bit operations                    and, or, xor, not            shifts
//   family 5: assignments, increments and       plain assign, and-assign,    add-, sub-,
//             decrements                        or-assign                    mul-assign,
//                                                                            ++, --
//   family 6: control flow                      return, if, loops, loop      -
//                                               condition, switch, break,
//                                               continue, preprocessor if
//   code block                                  assembler block              custom code;
//                                                                            no code block
//                                                                            operation
//   declarations and definitions                all, static declaration or   -
//                                               definition included
//   remaining kinds                             cast, address-of, deref,     every kind
//                                               conditional, comma, call,    not named
//                                               parameter, symbol access
//
// Arithmetic, shifts and the compound assignments that carry them may be emitted as calls
// of library helpers (fixed-point rescaling, saturation, division and shift routines);
// custom code may call anything. The other kinds are emitted as plain C or hold only
// operands, which are asked on their own.
//
// An operation without conversion level is judged as one that is not C code yet. A null
// operation answers false.
#ifndef HULCVTOOLS_ELOCQUERY_KVCOPERATIONQUERY_H
#define HULCVTOOLS_ELOCQUERY_KVCOPERATIONQUERY_H

#include "HulCvTools/HulCvToolsExport.h"
#include "HulCvTools/ModelInterfaces/ICodeFwd.h"

class HULCV_API KvCOperationQuery {
public:
  KvCOperationQuery() = default;
  KvCOperationQuery(const KvCOperationQuery&) = default;
  KvCOperationQuery& operator=(const KvCOperationQuery& other);

  static bool canOperationExpandToNotSideEffectFreeParamSymbol(KV_Operation* op);
};

#endif
