// Integer, vector and real constants: everything follows from their value.
#include "verilog/tn_verilogelabcontext.h"
#include "verilog/tn_verilognodes.h"

Tn_VerilogValuePtr Tn_VerilogConstant::constantValue() const { return Tn_VerilogValue::createNull(); }

Tn_VerilogValuePtr Tn_VerilogIntegerConst::constantValue() const { return Tn_VerilogValue::createInteger(Value); }

Tn_VerilogValuePtr Tn_VerilogVectorConst::constantValue() const { return Tn_VerilogValue::createVector(Value); }

Tn_VerilogValuePtr Tn_VerilogRealConst::constantValue() const { return Tn_VerilogValue::createReal(Value); }

Tn_VerilogTypePtr Tn_VerilogConstant::typeAs(Tn_VerilogElabContext& ctx, Tn_Verilog::ValueType) {
    if (!checkAttributes(ctx)) return Tn_VerilogType::createError();
    const Shape s = shape();
    return s.isReal ? Tn_VerilogType::createReal() : Tn_VerilogType::createScalar(s.isSigned);
}

Tn_VerilogValuePtr Tn_VerilogConstant::evaluate(const Tn_VerilogEvalContext& ctx) const {
    return Tn_VerilogValue::fit(constantValue(), ctx);
}

uint32_t Tn_VerilogConstant::contextWidth(uint32_t width) const {
    const uint32_t own = shape().width;
    return own > width ? own : width;
}

bool Tn_VerilogConstant::isReal() const { return shape().isReal; }

bool Tn_VerilogConstant::isSigned(bool contextSigned) const { return contextSigned && shape().isSigned; }

Port_String Tn_VerilogConstant::describe() const { return constantValue()->describe(); }

bool Tn_VerilogConstant::bounds(int32_t& msb, int32_t& lsb) const {
    const Shape s = shape();
    if (s.isReal) return false;
    msb = static_cast<int32_t>(s.width) - 1;
    lsb = 0;
    return true;
}

bool Tn_VerilogVectorConst::bounds(int32_t& msb, int32_t& lsb) const {
    msb = Value.msb();
    lsb = Value.lsb();
    return true;
}
