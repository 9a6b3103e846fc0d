// A Verilog library unit: owns every node made through its factory and keeps
// its own copy of the options of the run that made it.
#ifndef TARN_TN_VERILOGLIBRARYUNIT_H
#define TARN_TN_VERILOGLIBRARYUNIT_H

#include "library/tn_libraryunit.h"
#include "library/tn_nodetable.h"
#include "src/tn_verilogoptions.h"
#include "verilog/tn_verilognodefactory.h"
#include "verilog/tn_verilogvisitor.h"

class Tn_VerilogNode;
class Tn_VerilogRoot;

class Tn_VerilogLibraryUnit : public Tn_LibraryUnit {
public:
    Tn_VerilogLibraryUnit(const Port_String& libraryName, const Port_String& name, const Tn_VerilogOptions& options);
    ~Tn_VerilogLibraryUnit() override;

    void memoryReport() const override;
    void mark() override;
    void sweep() override;

    Tn_VerilogRoot* root() const { return root_; }
    void setRoot(Tn_VerilogRoot* root) { root_ = root; }

    const Tn_VerilogOptions& options() const { return options_; }
    Tn_VerilogNodeFactory& factory() { return factory_; }
    Tn_NodeTable& nodes() { return nodes_; }
    const Tn_NodeTable& nodes() const { return nodes_; }

private:
    Tn_VerilogOptions options_;
    Tn_NodeTable nodes_;
    Tn_VerilogNodeFactory factory_;
    Tn_VerilogRoot* root_ = nullptr;
};

// Marks every node reachable from the node it is accepted by that is not
// marked yet. Iterative, so tree depth does not matter.
class Tn_VerilogMarker : public Tn_VerilogVisitor {
public:
    void visitNode(Tn_VerilogNode* root) override;
};

typedef Tn_VerilogMarker Tn_VerilogDesignUnit_Marker;
typedef Tn_VerilogMarker Tn_VerilogDesign_Marker;

#endif
