#include "DemoSampleApp.h"

#include "platform/icode/KV_Constant.h"
#include "platform/icode/KV_ExprLocation.h"
#include "platform/icode/KV_Operation.h"
#include "platform/icode/KV_QualifiedSymbolOp.h"
#include "platform/icode/KvCCallOperation.h"
#include "platform/icode/KvCIcFileId.h"
#include "platform/icode/KvCParamSymbol.h"

#include <cstdint>

namespace {
using L = KV_ExprLocation*;
L c(AppBuilder& app, std::int64_t v) { return app.constant(v, app.int16()); }
} // namespace

DemoSampleApp::DemoSampleApp() : app("DemoController") {
  app.file("data.c");
  speed = app.variable("speed", app.int16());
  limit = app.variable("limit", app.int16());
  idx = app.variable("idx", app.int16());
  buf = app.variable("buf", app.arrayOf(app.int16(), 8));

  app.file("tasks.c");
  FunctionBuilder& filter = app.function("Filter");
  KvCUnparamSymbol* in = filter.addFormal("in", app.pointerTo(app.int16(), true));
  filter.body().assign(app.access(limit), app.access(in));

  FunctionBuilder& taskA = app.function("TaskA");
  L speedLhs = app.access(speed);
  L speedRhs = app.access(speed);
  taskA.body().assign(speedLhs, app.add(speedRhs, c(app, 1)));
  L idxInCondition = app.access(idx);
  L condition = app.less(idxInCondition, c(app, 8));
  L indexExpr = app.add(app.access(idx), c(app, 1));
  L castOperand = app.access(speed);
  BlockBuilder& loop = taskA.body().forLoop(app.assignExpr(app.access(idx), c(app, 0)), condition,
                                            app.op(KV_OP_POST_INCREMENT, {app.access(idx)}));
  loop.assign(app.element(buf, {indexExpr}), app.cast(app.int16(), castOperand));
  taskA.body()
      .ifThen(app.greater(app.access(speed), app.access(limit)))
      .assign(app.access(speed), app.access(limit));

  FunctionBuilder& taskB = app.function("TaskB");
  L speedInAddress = app.access(speed);
  L addressOfSpeed = app.addressOf(speedInAddress);
  taskB.body().call(filter.symbol(), {addressOfSpeed});

  FunctionBuilder& taskC = app.function("TaskC");
  taskC.body().assign(app.element(buf, {app.add(app.access(idx), c(app, 1))}), c(app, 0));

  FunctionBuilder& rec1 = app.function("Rec1");
  FunctionBuilder& rec2 = app.function("Rec2");
  rec1.body().ifThen(app.greater(app.access(idx), c(app, 0))).call(rec2.symbol(), {});
  rec2.body().assign(app.access(idx), app.sub(app.access(idx), c(app, 1)));
  rec2.body().call(rec1.symbol(), {});

  app.file("sched.c");
  FunctionBuilder& init = app.function("Init").role(KV_ROLE_RESTART_FUNCTION);
  L restartDef = app.access(speed);
  init.body().assign(restartDef, c(app, 0));
  FunctionBuilder& sched = app.function("Sched");
  sched.symbol()->markAsRtosScheduleFcn();
  sched.body().call(taskA.symbol(), {});
  sched.body().call(taskB.symbol(), {});
  sched.body().activateTask(taskC.symbol());
  sched.body().call(rec1.symbol(), {});

  spots = {{"speed (left side in TaskA)", speedLhs},
           {"speed (right side in TaskA)", speedRhs},
           {"idx < 8 (loop condition)", condition},
           {"idx (inside the loop condition)", idxInCondition},
           {"idx + 1 (index of buf)", indexExpr},
           {"speed (operand of a cast)", castOperand},
           {"&speed (actual of Filter)", addressOfSpeed},
           {"speed (inside &speed)", speedInAddress},
           {"speed (left side in Init)", restartDef}};
}

namespace {

const char* infix(tagKvEOperatorKind kind) {
  switch (kind) {
  case KV_OP_ADD:
    return " + ";
  case KV_OP_SUB:
    return " - ";
  case KV_OP_MUL:
    return " * ";
  case KV_OP_LESS:
    return " < ";
  case KV_OP_GREATER:
    return " > ";
  case KV_OP_ASSIGN:
    return " = ";
  case KV_OP_BIT_AND:
    return " & ";
  case KV_OP_LOG_AND:
    return " && ";
  default:
    return nullptr;
  }
}

std::string renderAccess(KV_QualifiedSymbolOp* qso) {
  std::string text = qso->getSymbol()->getName().str();
  for (int d = 0; d < qso->getResolvedNumberOfDims(); ++d) {
    KV_ExprLocation* index = qso->getIndexElocForDim(d);
    text.append("[")
        .append(index ? renderExpression(index) : std::to_string(qso->getIndexForDim(d)))
        .append("]");
  }
  return text;
}

std::string renderOperation(KV_Operation* op) {
  tagKvEOperatorKind kind = op->getOperator()->getKind();
  if (const char* symbol = infix(kind))
    return renderExpression(op->getOperand(0)) + symbol + renderExpression(op->getOperand(1));
  switch (kind) {
  case KV_OP_CAST:
    return std::string("(")
        .append(op->getDataType()->getName().str())
        .append(")")
        .append(renderExpression(op->getOperand(0)));
  case KV_OP_ADDRESS_OF:
    return std::string("&").append(renderExpression(op->getOperand(0)));
  case KV_OP_POST_INCREMENT:
    return renderExpression(op->getOperand(0)) + "++";
  case KV_OP_PARAMETER:
    return renderExpression(op->getOperand(1));
  default:
    break;
  }
  if (KvCCallOperation* call = op->asCallOperation()) {
    std::string text = call->getCalledSymbol()->getName().str() + "(";
    for (int i = 1; i < call->getNumberOfOperands(); ++i)
      text += (i > 1 ? ", " : "") + renderExpression(call->getOperand(i));
    return text + ")";
  }
  return std::string(op->getOperator()->getName()) + "(...)";
}

} // namespace

std::string renderExpression(KV_ExprLocation* loc) {
  if (!loc)
    return "?";
  if (KV_QualifiedSymbolOp* qso = loc->getQualifiedSymbolOp())
    return renderAccess(qso);
  if (KV_Operation* op = loc->getOperation())
    return renderOperation(op);
  if (KV_Constant* constant = loc->getConstant())
    return std::to_string(constant->getIntValue());
  if (KV_DataType* type = loc->getDataTypeRef())
    return type->getName().str();
  if (KvCIcFileId* file = loc->getFileIdRef())
    return file->getName().str();
  return "?";
}
