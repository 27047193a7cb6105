// KvCStringExpr: a string in the ICode, emitted as code or in quotes.
#ifndef HUL_PLATFORM_ICODE_KVCSTRINGEXPR_H
#define HUL_PLATFORM_ICODE_KVCSTRINGEXPR_H

#include "platform/icode/KvCIcExpression.h"
#include "platform/support/WmCXString.h"

class HUL_PLATFORM_API KvCStringExpr : public KvCIcExpression {
public:
  KvCStringExpr(int serialNumber, WmCXString text, bool asCode, bool quoted)
      : KvCIcExpression(serialNumber), string(std::move(text)), code(asCode), quotes(quoted) {}

  KvCStringExpr* asStringExpr() override { return this; }
  KV_DataType* getDataType() const override { return nullptr; }

  const WmCXString& getString() const { return string; }
  bool treatAsCode() const { return code; }
  bool applyQuotes() const { return quotes; }

private:
  WmCXString string;
  bool code;
  bool quotes;
};

#endif
