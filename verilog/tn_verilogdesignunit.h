// One parsed module or UDP as a library unit: its root and its kind.
#ifndef TARN_TN_VERILOGDESIGNUNIT_H
#define TARN_TN_VERILOGDESIGNUNIT_H

#include "verilog/tn_veriloglibraryunit.h"

class Tn_VerilogScope;

class Tn_VerilogDesignUnit : public Tn_VerilogLibraryUnit {
public:
    Tn_VerilogDesignUnit(const Port_String& libraryName, const Port_String& name, const Tn_VerilogOptions& options,
                         int32_t kind = VERILOG_DESIGN_UNIT)
        : Tn_VerilogLibraryUnit(libraryName, name, options), kind_(kind) {}

    int32_t unitKind() const override { return kind_; }
    void print(Tn_OStream& out) const override;
    void accept(Tn_LibraryUnitVisitor& v) override { v.visit(this); }
    // Marks from the root and from the parsed node.
    void mark() override;

    // The parsed module or UDP (declared in the root's scope).
    Tn_VerilogScope* node() const { return node_; }
    void setNode(Tn_VerilogScope* node) { node_ = node; }

private:
    int32_t kind_;
    Tn_VerilogScope* node_ = nullptr;
};

#endif
