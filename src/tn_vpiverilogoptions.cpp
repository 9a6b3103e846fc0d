#include "src/tn_vpiverilogoptions.h"

#include "src/tn_verilogoptions.h"

Tn_VpiOptions::~Tn_VpiOptions() {}

bool Tn_VpiVerilogOptions::has_plusarg(const Port_String& prefix) const {
    return options_ && options_->hasPlusArg(prefix);
}

Port_String Tn_VpiVerilogOptions::plusarg_value(const Port_String& prefix) const {
    return options_ ? options_->plusArgValue(prefix) : Port_String();
}
