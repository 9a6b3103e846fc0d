#include "verilog/tn_verilogdesignunit.h"

#include "util/tn_ostream.h"
#include "verilog/tn_verilognodes.h"

void Tn_VerilogDesignUnit::print(Tn_OStream& out) const {
    if (root()) root()->dump(out, "Root", 0);
    if (node_) node_->dump(out, node_->typeName() + 10, 0);
}

void Tn_VerilogDesignUnit::mark() {
    Tn_VerilogLibraryUnit::mark();
    Tn_VerilogMarker marker;
    if (node_) node_->accept(marker);
}

