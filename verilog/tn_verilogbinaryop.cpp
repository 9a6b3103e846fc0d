#include <algorithm>

#include "util/tn_message.h"
#include "verilog/tn_verilogelabcontext.h"
#include "verilog/tn_verilognodes.h"

using namespace Tn_Verilog;

namespace {

// The sizing groups: comparisons give one unsigned bit from operands sized
// to each other; the arithmetic group sizes both operands to the context;
// shifts and ** size only their left operand.
enum Group { Comparison, Arithmetic, LeftOperand };

Group groupOf(int32_t op) {
    if (op == LogicalOr || op == LogicalAnd || (op >= Equal && op <= GreaterEqual)) return Comparison;
    if ((op >= LeftShift && op <= ArithRightShift) || op == Exponentiation) return LeftOperand;
    return Arithmetic;
}

// A power of a wide base costs one or two wide products per exponent bit
// (fewer for even bases, which reach 0, and odd ones, which reach 1). Beyond
// this many limb products there is no value, as for values wider than
// kMaxWidth, so that no constant stalls evaluation.
bool tooCostlyPower(uint32_t width, const Tn_VerilogValuePtr& exponent) {
    if (width <= 64 || !exponent || exponent->isNull() || exponent->isReal() || exponent->hasUnknown()) return false;
    const Tn_VerilogVector e = exponent->toVector();
    uint32_t bits = e.width();
    while (bits > 0 && e.bit(bits - 1) == 0) --bits;
    const double limbs = (width + 31) / 32;
    return limbs * limbs * 2.0 * std::min(bits, width) > 4.0e9;
}

// Operators whose operands may be real.
bool acceptsReal(int32_t op) {
    switch (op) {
    case LogicalOr: case LogicalAnd: case Equal: case NotEqual: case LessThan: case LessEqual:
    case GreaterThan: case GreaterEqual: case Addition: case Subtraction: case Multiplication:
    case Division: case Exponentiation: return true;
    default: return false;
    }
}


}  // namespace

Tn_VerilogTypePtr Tn_VerilogBinaryOp::typeAs(Tn_VerilogElabContext& ctx, ValueType) {
    if (!checkAttributes(ctx)) return Tn_VerilogType::createError();
    Tn_VerilogTypePtr l = typeOf(LOperand, ctx);
    Tn_VerilogTypePtr r = typeOf(ROperand, ctx);
    if (l->isError() || r->isError()) return Tn_VerilogType::createError();
    const bool real = l->isRealType() || r->isRealType();
    if (!l->isValueType() || !r->isValueType() || (real && !acceptsReal(OpType))) {
        TN_MSG().issueError("%sIllegal operand(s) of binary operator '%s'\n", locationText().c_str(),
                            BinaryOpTypeInfo.text(OpType));
        return Tn_VerilogType::createError();
    }
    // From the operand types, so that a long operator chain is typed in one pass.
    switch (groupOf(OpType)) {
    case Comparison: return Tn_VerilogType::createScalar(false);
    case LeftOperand:
        if (l->isRealType() || (OpType == Exponentiation && r->isRealType())) return Tn_VerilogType::createReal();
        return Tn_VerilogType::createScalar(l->isSignedType());
    default:
        if (real) return Tn_VerilogType::createReal();
        return Tn_VerilogType::createScalar(l->isSignedType() && r->isSignedType());
    }
}

Tn_VerilogValuePtr Tn_VerilogBinaryOp::evaluate(const Tn_VerilogEvalContext& ctx) const {
    Tn_VerilogValue::BinaryOperation op = Tn_VerilogValue::binaryOperation(static_cast<uint32_t>(OpType));
    if (!op) {
        TN_MSG().issueInternal("%sUnsupported binary operation type '%d'\n", locationText().c_str(),
                               static_cast<int>(OpType));
        return Tn_VerilogValue::createNull();
    }
    if (!LOperand || !ROperand) return Tn_VerilogValue::createNull();
    const Tn_VerilogEvalContext self = ctx.selfDetermined();
    switch (groupOf(OpType)) {
    case Comparison: {
        if (OpType == LogicalOr || OpType == LogicalAnd)
            return op(LOperand->evaluate(self), ROperand->evaluate(self), ctx);
        // Operands sized to each other, signed only when both are.
        const Tn_VerilogEvalContext inner = ctx.sized(LOperand->isSigned(true) && ROperand->isSigned(true),
                                                      std::max<uint32_t>(LOperand->contextWidth(0), ROperand->contextWidth(0)));
        if (inner.tooWide()) return Tn_VerilogValue::createNull();
        return op(LOperand->evaluate(inner), ROperand->evaluate(inner), ctx);
    }
    case LeftOperand: {
        const Tn_VerilogEvalContext inner = operandContext(ctx);
        if (inner.tooWide()) return Tn_VerilogValue::createNull();
        const Tn_VerilogValuePtr l = LOperand->evaluate(inner), r = ROperand->evaluate(self);
        if (OpType == Exponentiation && !isReal() && tooCostlyPower(inner.width, r)) return Tn_VerilogValue::createNull();
        return op(l, r, inner);
    }
    default: {
        const Tn_VerilogEvalContext inner = operandContext(ctx);
        if (inner.tooWide()) return Tn_VerilogValue::createNull();
        return op(LOperand->evaluate(inner), ROperand->evaluate(inner), inner);
    }
    }
}

uint32_t Tn_VerilogBinaryOp::contextWidth(uint32_t width) const {
    if (!LOperand || !ROperand) return width;
    switch (groupOf(OpType)) {
    case Comparison: return std::max<uint32_t>(width, 1);
    case LeftOperand: return LOperand->contextWidth(width);
    default: return std::max<uint32_t>(LOperand->contextWidth(width), ROperand->contextWidth(width));
    }
}

bool Tn_VerilogBinaryOp::isReal() const {
    if (!LOperand || !ROperand) return false;
    switch (groupOf(OpType)) {
    case Comparison: return false;
    case LeftOperand: return OpType == Exponentiation ? LOperand->isReal() || ROperand->isReal() : LOperand->isReal();
    default: return LOperand->isReal() || ROperand->isReal();
    }
}

bool Tn_VerilogBinaryOp::isSigned(bool contextSigned) const {
    if (!LOperand || !ROperand) return false;
    switch (groupOf(OpType)) {
    case Comparison: return false;
    case LeftOperand: return LOperand->isSigned(contextSigned);
    default: return LOperand->isSigned(contextSigned) && ROperand->isSigned(contextSigned);
    }
}
