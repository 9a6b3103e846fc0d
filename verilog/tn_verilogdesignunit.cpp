#include "verilog/tn_verilogdesignunit.h"

#include "util/tn_ostream.h"
#include "verilog/tn_verilognodes.h"

void Tn_VerilogDesignUnit::print(Tn_OStream& out) const {
    if (root()) root()->dump(out, "Root", 0);
}

