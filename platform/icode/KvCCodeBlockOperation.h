// KvCCodeBlockOperation: a block of code taken over as it is: custom C code or an
// assembler block.
#ifndef HUL_PLATFORM_ICODE_KVCCODEBLOCKOPERATION_H
#define HUL_PLATFORM_ICODE_KVCCODEBLOCKOPERATION_H

#include "platform/icode/KV_Operation.h"
#include "platform/support/WmCXString.h"

class HUL_PLATFORM_API KvCCodeBlockOperation : public KV_Operation {
public:
  KvCCodeBlockOperation(int serialNumber, WmCXString text, bool assembler)
      : KV_Operation(serialNumber, KV_OpOperator::get(KV_OP_CODE_BLOCK)), code(std::move(text)),
        assemblerBlock(assembler) {}

  KvCCodeBlockOperation* asCodeBlockOperation() override { return this; }
  bool isAssemblerBlock() const { return assemblerBlock; }
  const WmCXString& getCode() const { return code; }

private:
  WmCXString code;
  bool assemblerBlock;
};

#endif
