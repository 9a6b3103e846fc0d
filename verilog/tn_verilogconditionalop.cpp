#include "util/tn_message.h"
#include "verilog/tn_verilogelabcontext.h"
#include "verilog/tn_verilognodes.h"

using namespace Tn_Verilog;

Tn_VerilogTypePtr Tn_VerilogConditionalOp::typeAs(Tn_VerilogElabContext& ctx, ValueType) {
    if (!checkAttributes(ctx)) return Tn_VerilogType::createError();
    bool failed = false;
    Tn_VerilogTypePtr c = typeOf(Condition, ctx);
    if (c->isError()) {
        failed = true;
    } else if (!c->isValueType()) {
        TN_MSG().issueError("%sIllegal condition operand of conditional operator '?:'\n", locationText().c_str());
        failed = true;
    }
    Tn_VerilogTypePtr t = typeOf(TrueOperand, ctx);
    Tn_VerilogTypePtr f = typeOf(FalseOperand, ctx);
    if (t->isError() || f->isError()) return Tn_VerilogType::createError();
    if (!t->isValueType() || !f->isValueType()) {
        TN_MSG().issueError("%sIllegal operand of conditional operator '?:'\n", locationText().c_str());
        return Tn_VerilogType::createError();
    }
    if (failed) return Tn_VerilogType::createError();
    if (t->isRealType() || f->isRealType()) return Tn_VerilogType::createReal();
    return Tn_VerilogType::createScalar(t->isSignedType() && f->isSignedType());
}

Tn_VerilogValuePtr Tn_VerilogConditionalOp::evaluate(const Tn_VerilogEvalContext& ctx) const {
    if (!Condition || !TrueOperand || !FalseOperand) return Tn_VerilogValue::createNull();
    Tn_VerilogValuePtr c = Condition->evaluate(ctx.selfDetermined());
    if (c->isNull()) return c;
    const Tn_VerilogEvalContext inner = operandContext(ctx);
    if (inner.tooWide()) return Tn_VerilogValue::createNull();
    // A real on either side makes the result real.
    const bool real = isReal();
    auto operand = [&](const Tn_VerilogExpression* e) {
        Tn_VerilogValuePtr v = e->evaluate(inner);
        return real && !v->isNull() && !v->isReal() ? Tn_VerilogValue::createReal(v->toReal()) : v;
    };
    // True when some bit is 1; false only when every bit is 0.
    if (c->toBool()) return operand(TrueOperand);
    if (!c->hasUnknown()) return operand(FalseOperand);
    return Tn_VerilogValue::merge(operand(TrueOperand), operand(FalseOperand), inner);
}

uint32_t Tn_VerilogConditionalOp::contextWidth(uint32_t width) const {
    if (!TrueOperand || !FalseOperand) return width;
    uint32_t t = TrueOperand->contextWidth(width), f = FalseOperand->contextWidth(width);
    return t > f ? t : f;
}

bool Tn_VerilogConditionalOp::isReal() const {
    return (TrueOperand && TrueOperand->isReal()) || (FalseOperand && FalseOperand->isReal());
}

bool Tn_VerilogConditionalOp::isSigned(bool contextSigned) const {
    return TrueOperand && FalseOperand && TrueOperand->isSigned(contextSigned) && FalseOperand->isSigned(contextSigned);
}
