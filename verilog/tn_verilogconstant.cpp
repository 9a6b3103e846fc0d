// Integer, vector and real constants: everything follows from their value.
#include "verilog/tn_verilogelabcontext.h"
#include "verilog/tn_verilognodes.h"

Tn_VerilogValuePtr Tn_VerilogConstant::constantValue() const { return Tn_VerilogValue::createNull(); }

Tn_VerilogValuePtr Tn_VerilogIntegerConst::constantValue() const { return Tn_VerilogValue::createInteger(Value); }

Tn_VerilogValuePtr Tn_VerilogVectorConst::constantValue() const { return Tn_VerilogValue::createVector(Value); }

Tn_VerilogValuePtr Tn_VerilogRealConst::constantValue() const { return Tn_VerilogValue::createReal(Value); }

Tn_VerilogTypePtr Tn_VerilogConstant::typeAs(Tn_VerilogElabContext& ctx, Tn_Verilog::ValueType) {
    if (!checkAttributes(ctx)) return Tn_VerilogType::createError();
    Tn_VerilogValuePtr v = constantValue();
    return v->isReal() ? Tn_VerilogType::createReal() : Tn_VerilogType::createScalar(v->isSigned());
}

Tn_VerilogValuePtr Tn_VerilogConstant::evaluate(const Tn_VerilogEvalContext& ctx) const {
    return Tn_VerilogValue::fit(constantValue(), ctx);
}

uint32_t Tn_VerilogConstant::contextWidth(uint32_t width) const {
    uint32_t own = constantValue()->width();
    return own > width ? own : width;
}

bool Tn_VerilogConstant::isReal() const { return constantValue()->isReal(); }

bool Tn_VerilogConstant::isSigned(bool contextSigned) const {
    return contextSigned && constantValue()->isSigned();
}

Port_String Tn_VerilogConstant::describe() const { return constantValue()->describe(); }

bool Tn_VerilogConstant::bounds(int32_t& msb, int32_t& lsb) const { return boundsOf(constantValue(), msb, lsb); }
