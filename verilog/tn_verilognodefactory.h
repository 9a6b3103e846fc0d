// The only way nodes are made: through the factory of the library unit that
// will own them. One creation operation per concrete class.
#ifndef TARN_TN_VERILOGNODEFACTORY_H
#define TARN_TN_VERILOGNODEFACTORY_H

#include "library/tn_node.h"
#include "library/tn_nodetable.h"
#include "verilog/tn_verilognodetype.h"

class Tn_VerilogNode;

class Tn_VerilogNodeFactory {
public:
    explicit Tn_VerilogNodeFactory(Tn_NodeTable& table) : table_(table) {}

    // A new node of a concrete type; null for an abstract or unknown type.
    Tn_VerilogNode* create(int32_t type, const Tn_Location& location = Tn_Location());

#define TN_NODE(Name, Base, Kind, Fields) Tn_Verilog##Name* create##Name(const Tn_Location& location = Tn_Location());
#include "verilog/tn_verilognodes.def"
#undef TN_NODE

    // A member-wise copy of node owned by this factory's unit.
    template <class T>
    T* copyOf(const T& node) {
        T* n = new T(node);
        table_.add(n);
        return n;
    }

    Tn_NodeTable& table() { return table_; }

private:
    template <class T>
    T* make(const Tn_Location& location);
    Tn_NodeTable& table_;
};

#endif
