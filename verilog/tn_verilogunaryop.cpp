#include "util/tn_message.h"
#include "verilog/tn_verilogelabcontext.h"
#include "verilog/tn_verilognodes.h"

using namespace Tn_Verilog;

bool Tn_VerilogUnaryOp::isBitResult() const { return OpType != Identity && OpType != Negation && OpType != BitwiseNegation; }

Tn_VerilogTypePtr Tn_VerilogUnaryOp::typeAs(Tn_VerilogElabContext& ctx, ValueType) {
    if (!checkAttributes(ctx)) return Tn_VerilogType::createError();
    Tn_VerilogTypePtr t = typeOf(Operand, ctx);
    if (t->isError()) return t;
    const bool realAllowed = OpType == Identity || OpType == Negation || OpType == LogicalNegation;
    if (!t->isValueType() || (t->isRealType() && !realAllowed)) {
        TN_MSG().issueError("%sIllegal operand of unary operator '%s'\n", locationText().c_str(),
                            UnaryOpTypeInfo.text(OpType));
        return Tn_VerilogType::createError();
    }
    if (isBitResult()) return Tn_VerilogType::createScalar(false);
    if (t->isRealType()) return Tn_VerilogType::createReal();
    return Tn_VerilogType::createScalar(t->isSignedType());
}

Tn_VerilogValuePtr Tn_VerilogUnaryOp::evaluate(const Tn_VerilogEvalContext& ctx) const {
    Tn_VerilogValue::UnaryOperation op = Tn_VerilogValue::unaryOperation(static_cast<uint32_t>(OpType));
    if (!op) {
        TN_MSG().issueInternal("%sUnsupported unary operation type '%d'\n", locationText().c_str(),
                               static_cast<int>(OpType));
        return Tn_VerilogValue::createNull();
    }
    if (!Operand) return Tn_VerilogValue::createNull();
    // The operand of ! and of the reductions is self-determined.
    if (isBitResult()) return op(Operand->evaluate(ctx.selfDetermined()), ctx);
    Tn_VerilogEvalContext inner = operandContext(ctx);
    if (inner.tooWide()) return Tn_VerilogValue::createNull();
    return op(Operand->evaluate(inner), inner);
}

uint32_t Tn_VerilogUnaryOp::contextWidth(uint32_t width) const {
    if (isBitResult() || !Operand) return width > 1 ? width : 1;
    return Operand->contextWidth(width);
}

bool Tn_VerilogUnaryOp::isReal() const {
    return (OpType == Identity || OpType == Negation) && Operand && Operand->isReal();
}

bool Tn_VerilogUnaryOp::isSigned(bool contextSigned) const {
    return !isBitResult() && Operand && Operand->isSigned(contextSigned);
}
