// The operations that never have a constant value: min:typ:max (the delay
// selection is made later), lists and the empty operand.
#include <initializer_list>

#include "verilog/tn_verilogelabcontext.h"
#include "verilog/tn_verilognodes.h"

using namespace Tn_Verilog;

namespace {

// The type of a list of operands checked as values: the last one's, or the
// error type when any reported.
template <class Operands>
Tn_VerilogTypePtr checkValues(Tn_VerilogElabContext& ctx, const Operands& operands) {
    Tn_VerilogTypePtr last = Tn_VerilogType::createVoid();
    bool failed = false;
    for (Tn_VerilogExpression* e : operands) {
        if (!e) continue;
        last = e->typeAs(ctx, Value);
        if (last->isError()) failed = true;
    }
    return failed ? Tn_VerilogType::createError() : last;
}

}  // namespace

// The typical value stands for the expression in sizing and typing.
Tn_VerilogTypePtr Tn_VerilogMinTypMaxOp::typeAs(Tn_VerilogElabContext& ctx, ValueType) {
    if (!checkAttributes(ctx)) return Tn_VerilogType::createError();
    typedef std::initializer_list<Tn_VerilogExpression*> List;
    Tn_VerilogTypePtr t = checkValues(ctx, List{MinOperand, MaxOperand});
    Tn_VerilogTypePtr typ = checkValues(ctx, List{TypOperand});
    return t->isError() ? t : typ;
}

Tn_VerilogValuePtr Tn_VerilogMinTypMaxOp::evaluate(const Tn_VerilogEvalContext&) const {
    return Tn_VerilogValue::createNull();
}

uint32_t Tn_VerilogMinTypMaxOp::contextWidth(uint32_t width) const {
    return TypOperand ? TypOperand->contextWidth(width) : width;
}

bool Tn_VerilogMinTypMaxOp::isReal() const { return TypOperand && TypOperand->isReal(); }

bool Tn_VerilogMinTypMaxOp::isSigned(bool contextSigned) const {
    return TypOperand && TypOperand->isSigned(contextSigned);
}

Tn_VerilogTypePtr Tn_VerilogListOp::typeAs(Tn_VerilogElabContext& ctx, ValueType) {
    if (!checkAttributes(ctx)) return Tn_VerilogType::createError();
    return checkValues(ctx, Operand);
}

Tn_VerilogValuePtr Tn_VerilogListOp::evaluate(const Tn_VerilogEvalContext&) const { return Tn_VerilogValue::createNull(); }

uint32_t Tn_VerilogListOp::contextWidth(uint32_t width) const { return width; }
bool Tn_VerilogListOp::isReal() const { return false; }
bool Tn_VerilogListOp::isSigned(bool) const { return false; }

Tn_VerilogTypePtr Tn_VerilogNullOp::typeAs(Tn_VerilogElabContext& ctx, ValueType) {
    return checkAttributes(ctx) ? Tn_VerilogType::createVoid() : Tn_VerilogType::createError();
}
