// Event expressions: edges of integral values, and or-lists of events and values.
#include "util/tn_message.h"
#include "verilog/tn_verilogelabcontext.h"
#include "verilog/tn_verilognodes.h"

using namespace Tn_Verilog;

Tn_VerilogTypePtr Tn_VerilogUnaryEventOp::typeAs(Tn_VerilogElabContext& ctx, ValueType) {
    if (!checkAttributes(ctx)) return Tn_VerilogType::createError();
    Tn_VerilogTypePtr t = Operand ? Operand->typeAs(ctx, Value) : Tn_VerilogType::createError();
    if (t->isError()) return t;
    if (!t->isIntegral()) {
        TN_MSG().issueError("%sIllegal operand in %s event operation\n", locationText().c_str(),
                            UnaryEventOpTypeInfo.text(OpType));
        return Tn_VerilogType::createError();
    }
    return Tn_VerilogType::createEvent();
}

Tn_VerilogTypePtr Tn_VerilogEventOrOp::typeAs(Tn_VerilogElabContext& ctx, ValueType) {
    if (!checkAttributes(ctx)) return Tn_VerilogType::createError();
    bool failed = false, illegal = Operand.empty();
    for (Tn_VerilogEventExpression* e : Operand) {
        Tn_VerilogTypePtr t = e ? e->typeAs(ctx, Value) : Tn_VerilogType::createError();
        if (t->isError()) failed = true;
        else if (!t->isEvent() && !t->isValueType()) illegal = true;
    }
    if (failed) return Tn_VerilogType::createError();
    if (illegal) {
        TN_MSG().issueError("%sIllegal operand in event-or operation\n", locationText().c_str());
        return Tn_VerilogType::createError();
    }
    return Tn_VerilogType::createEvent();
}
