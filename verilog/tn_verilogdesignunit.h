// One parsed module or UDP as a library unit: its root and its kind.
#ifndef TARN_TN_VERILOGDESIGNUNIT_H
#define TARN_TN_VERILOGDESIGNUNIT_H

#include "verilog/tn_veriloglibraryunit.h"

class Tn_VerilogDesignUnit : public Tn_VerilogLibraryUnit {
public:
    Tn_VerilogDesignUnit(const Port_String& libraryName, const Port_String& name, const Tn_VerilogOptions& options,
                         int32_t kind = VERILOG_DESIGN_UNIT)
        : Tn_VerilogLibraryUnit(libraryName, name, options), kind_(kind) {}

    int32_t unitKind() const override { return kind_; }
    void print(Tn_OStream& out) const override;
    void accept(Tn_LibraryUnitVisitor& v) override { v.visit(this); }

private:
    int32_t kind_;
};

#endif
