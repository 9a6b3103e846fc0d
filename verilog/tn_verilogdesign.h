// A design: the container the driver builds (one instance per top-level
// unit) and the elaborated hierarchy that elaboration makes from it.
#ifndef TARN_TN_VERILOGDESIGN_H
#define TARN_TN_VERILOGDESIGN_H

#include "verilog/tn_veriloglibraryunit.h"

class Tn_VerilogDesign : public Tn_VerilogLibraryUnit {
public:
    Tn_VerilogDesign(const Port_String& libraryName, const Port_String& name, const Tn_VerilogOptions& options)
        : Tn_VerilogLibraryUnit(libraryName, name, options) {}

    int32_t unitKind() const override { return VERILOG_DESIGN; }
    // A dotted line, the root under "Root", the dotted line again.
    void print(Tn_OStream& out) const override;
    void accept(Tn_LibraryUnitVisitor& v) override { v.visit(this); }

private:
};

#endif
