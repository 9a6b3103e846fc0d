// Operations added to the node classes from outside: one visit operation per
// node class, whose default calls the visit of the class's direct base.
#ifndef TARN_TN_VERILOGVISITOR_H
#define TARN_TN_VERILOGVISITOR_H

#include "verilog/tn_verilognodetype.h"

class Tn_VerilogVisitor {
public:
    virtual ~Tn_VerilogVisitor() = 0;
#define TN_NODE(Name, Base, Kind, Fields) virtual void visit##Name(Tn_Verilog##Name* n);
#include "verilog/tn_verilognodes.def"
#undef TN_NODE
};

#endif
