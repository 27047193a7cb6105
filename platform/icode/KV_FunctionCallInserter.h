// KV_FunctionCallInserter: finds or makes the function symbols that generated calls need,
// from a signature given as C arrays (accesses, types, scalings) and the file whose top
// level declares the function. It works through the run's function symbol server: the
// same name in the same file is the same function, with the server's rule for a
// signature that conflicts (see KV_FunctionSymbolServer). Parameters are named "p0",
// "p1", ...; their flag words are the accesses' flag words; the symbol flag word is 0 and
// the function class the run's default function class, or the class the caller gives.
//
// A light object over the factory container (see KV_CallInserter), made on the stack for a
// demand or kept by a server; it keeps nothing between demands (the caller keeps and
// deletes the access objects).
#ifndef HUL_PLATFORM_ICODE_KV_FUNCTIONCALLINSERTER_H
#define HUL_PLATFORM_ICODE_KV_FUNCTIONCALLINSERTER_H

#include "platform/icode/KV_CallInserter.h"
#include "platform/icode/KV_ParamAccess.h"
#include "platform/support/WmCXString.h"

class KV_DataType;
class KV_Scaling;
class KvCFcnClassId;
class KvCIcFileId;
class KvCParamSymbol;
class KvCSrcRef;

class HUL_PLATFORM_API KV_FunctionCallInserter : public KV_CallInserter {
public:
  explicit KV_FunctionCallInserter(KV_ICodeFactoryContainer* container)
      : KV_CallInserter(container) {}

  // The function `name` declared in `file`, made when missing, with `n` parameters described
  // by accesses[i], types[i], scalings[i]. `mustBeNew`: answer null when the file has the
  // function already. Null for a null container or file, an empty name, a null return type,
  // n < 0, missing arrays or entries, or a signature that conflicts with the existing
  // function. `srcRef` is the caller's and is not kept.
  KvCParamSymbol* demandFunctionSymbol(const WmCXString& name, KV_DataType* returnType,
                                       KV_Scaling* returnScaling, int n,
                                       KV_ParamAccess** accesses, KV_DataType** types,
                                       KV_Scaling** scalings, KvCIcFileId* file,
                                       const KvCSrcRef* srcRef, bool mustBeNew);
  // The same with the function class `fcnClass` (null: the run's default class) for a
  // function that is made.
  KvCParamSymbol* demandFunctionSymbol(const WmCXString& name, KV_DataType* returnType,
                                       KV_Scaling* returnScaling, int n, KV_ParamAccess** accesses,
                                       KV_DataType** types, KV_Scaling** scalings,
                                       KvCFcnClassId* fcnClass, KvCIcFileId* file,
                                       const KvCSrcRef* srcRef, bool mustBeNew);
};

#endif
