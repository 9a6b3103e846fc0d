#include "verilog/tn_verilogflexexception.h"

Tn_VerilogFlexException::~Tn_VerilogFlexException() throw() {}
