#include "verilog/tn_veriloglibraryunit.h"

#include <vector>

#include "util/tn_message.h"
#include "verilog/tn_verilognodes.h"

Tn_VerilogLibraryUnit::Tn_VerilogLibraryUnit(const Port_String& libraryName, const Port_String& name,
                                             const Tn_VerilogOptions& options)
    : Tn_LibraryUnit(libraryName, name), options_(options), factory_(nodes_) {}

Tn_VerilogLibraryUnit::~Tn_VerilogLibraryUnit() {}

void Tn_VerilogLibraryUnit::memoryReport() const {
    std::vector<unsigned long> count(Tn_Verilog::NodeTypeCount, 0), size(Tn_Verilog::NodeTypeCount, 0);
    for (const Tn_Node* n : nodes_.nodes()) {
        if (!n || n->nodeType() < 0 || n->nodeType() >= Tn_Verilog::NodeTypeCount) continue;
        ++count[static_cast<size_t>(n->nodeType())];
        size[static_cast<size_t>(n->nodeType())] = n->objectSize();
    }
    const char* const rule = "---------------------------------------------------------------";
    const Port_MsgManData msg = TN_MSG();
    msg.issueStatus("\n");
    msg.issueStatus("Unit:%s Memory Report\n", name().c_str());
    msg.issueStatus("\n");
    msg.issueStatus("%-30s %10s %10s %10s\n", "NodeType", "Size", "Number", "Memory");
    msg.issueStatus("%s\n", rule);
    unsigned long totalNumber = 0, totalMemory = 0;
    for (size_t t = 0; t < count.size(); ++t) {
        if (!count[t]) continue;
        msg.issueStatus("%-30s %10lu %10lu %10lu\n", Tn_Verilog::nodeTypeName(static_cast<int32_t>(t)), size[t], count[t],
                        size[t] * count[t]);
        totalNumber += count[t];
        totalMemory += size[t] * count[t];
    }
    msg.issueStatus("%s\n", rule);
    msg.issueStatus("%-30s %10s %10lu %10lu\n", "Totals", "", totalNumber, totalMemory);
}

void Tn_VerilogLibraryUnit::mark() {
    Tn_Node::nextGeneration();
    Tn_VerilogMarker marker;
    if (root_) root_->accept(marker);
}

void Tn_VerilogLibraryUnit::sweep() {
    nodes_.sweep([](const Tn_Node* n) { return n->isMarked(); });
}

namespace {

// Collects the owned children of a node, so that marking needs no recursion
// however deep the tree is.
class ChildCollector : public Tn_VerilogChildVisitor {
public:
    explicit ChildCollector(std::vector<Tn_VerilogNode*>& out) : out_(out) {}
    void eachChild(const Tn_FieldInfo&, Tn_VerilogNode*& c) override {
        if (c && !c->isMarked()) out_.push_back(c);
    }

private:
    std::vector<Tn_VerilogNode*>& out_;
};

}  // namespace

void Tn_VerilogMarker::visitNode(Tn_VerilogNode* root) {
    std::vector<Tn_VerilogNode*> pending;
    ChildCollector collect(pending);
    if (root) pending.push_back(root);
    while (!pending.empty()) {
        Tn_VerilogNode* n = pending.back();
        pending.pop_back();
        if (n->isMarked()) continue;
        n->mark();
        n->visitFields(collect);
    }
}
