#include "verilog/tn_verilogrealvalue.h"

Port_String Tn_VerilogRealValue::toBaseText() const { return Port_String::doFormat("%f", value_); }
Port_String Tn_VerilogRealValue::describe() const { return Port_String::doFormat("real constant '%g'", value_); }
