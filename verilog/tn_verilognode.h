// Base of every Verilog node class. The per-class operations (dump, copy,
// remap, traverse) are written once here over the fields each class
// declares in tn_verilognodes.def.
#ifndef TARN_TN_VERILOGNODE_H
#define TARN_TN_VERILOGNODE_H

#include "library/tn_node.h"
#include "verilog/tn_verilogfields.h"
#include "verilog/tn_verilognodetype.h"

class Tn_VerilogVisitor;
class Tn_VerilogNodeFactory;
class Tn_VerilogNodeMap;

class Tn_VerilogNode : public Tn_Node {
public:
    typedef Tn_Node Super;
    static const Tn_Verilog::NodeType TYPE = Tn_Verilog::Node;

    void dump(Tn_OStream& out, const char* label, int indent) const override;
    int32_t nodeType() const override { return TYPE; }
    bool isA(int32_t type) const override { return Tn_Verilog::nodeTypeIsA(nodeType(), type); }
    uint32_t objectSize() const override { return sizeof(*this); }
    const char* typeName() const override { return Tn_Verilog::nodeClassName(nodeType()); }

    // Deep copy of the subtree into factory's unit: internal references are
    // redirected to the copies, references out of the subtree kept.
    virtual Tn_VerilogNode* clone(Tn_VerilogNodeFactory& factory) const;
    // Copies this node and its owned children (once each, however often
    // shared), recording old -> new in map; references are left as they are.
    virtual Tn_VerilogNode* copy(Tn_VerilogNodeFactory& factory, Tn_VerilogNodeMap& map) const;
    // Redirects references that map knows, here and in the owned children.
    virtual void remap(const Tn_VerilogNodeMap& map);
    virtual void accept(Tn_VerilogVisitor& v);
    // accept() on each owned child, attributes first, then in field order.
    virtual void traverse(Tn_VerilogVisitor& v);
    Tn_VerilogNode* node() { return this; }

    // Every field of the node, from the root class down, in record order.
    virtual void visitFields(Tn_VerilogFieldVisitor& v);
    // n as a T when its class is T or derives from it; null otherwise.
    template <class T>
    static T* cast(Tn_VerilogNode* n) {
        return (n && n->isA(T::TYPE)) ? static_cast<T*>(n) : nullptr;
    }

    static Tn_VerilogNode* clone(const Tn_VerilogNode* n, Tn_VerilogNodeFactory& factory) {
        return n ? n->clone(factory) : nullptr;
    }

protected:
    friend class Tn_VerilogNodeFactory;
    Tn_VerilogNode() {}
    Tn_VerilogNode(const Tn_VerilogNode& o) : Tn_Node(o) {}
    // A member-wise copy of this node made through factory.
    virtual Tn_VerilogNode* newCopy(Tn_VerilogNodeFactory& factory) const;
};

#endif
