#include "verilog/tn_verilogdesign.h"

Tn_VerilogDesign::Tn_VerilogDesign(const Port_String& name, const Port_String& secondaryKey, const Tn_VerilogOptions& options)
    : name_(name), secondaryKey_(secondaryKey), options_(options) {}

Tn_VerilogDesign::~Tn_VerilogDesign() {}
