#include "verilog/tn_verilogdesign.h"

#include "util/tn_ostream.h"
#include "verilog/tn_verilognodes.h"

void Tn_VerilogDesign::print(Tn_OStream& out) const {
    const char* const dots = ".......................................";
    out.write(dots);
    out.write("\n\n");
    if (root()) root()->dump(out, "Root", 0);
    out.write("\n");
    out.write(dots);
    out.write("\n");
}
