#include "verilog/tn_verilogintegervalue.h"

Port_String Tn_VerilogIntegerValue::toText() const { return toDecimalText(); }
Port_String Tn_VerilogIntegerValue::toBaseText() const { return toDecimalText(); }
Port_String Tn_VerilogIntegerValue::toDecimalText() const { return Port_String::doFormat("%d", value_); }
Port_String Tn_VerilogIntegerValue::toBinaryText() const { return toVector().toBinaryText(); }
Port_String Tn_VerilogIntegerValue::toOctalText() const {
    return Port_String::doFormat("%011o", static_cast<uint32_t>(value_));
}
Port_String Tn_VerilogIntegerValue::toHexText() const {
    return Port_String::doFormat("%08x", static_cast<uint32_t>(value_));
}
Port_String Tn_VerilogIntegerValue::describe() const { return Port_String::doFormat("integer constant '%d'", value_); }
