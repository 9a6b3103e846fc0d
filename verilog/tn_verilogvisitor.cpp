#include "verilog/tn_verilogvisitor.h"

#include "verilog/tn_verilognodes.h"

Tn_VerilogVisitor::~Tn_VerilogVisitor() {}

void Tn_VerilogVisitor::visitNode(Tn_VerilogNode*) {}

#define TN_SKIP_VISIT_Node TN_PROBE
#define TN_DEFAULT_VISIT(Name, Base) \
    void Tn_VerilogVisitor::visit##Name(Tn_Verilog##Name* n) { visit##Base(n); }
#define TN_NODE(Name, Base, Kind, Fields) \
    BOOST_PP_IIF(TN_IS_PROBE(TN_SKIP_VISIT_##Name), TN_NOTHING, TN_DEFAULT_VISIT)(Name, Base)
#include "verilog/tn_verilognodes.def"
#undef TN_NODE
