#include "verilog/tn_verilognodefactory.h"

#include "verilog/tn_verilognodes.h"

template <class T>
T* Tn_VerilogNodeFactory::make(const Tn_Location& location) {
    T* n = new T;
    n->setLocation(location);
    table_.add(n);
    return n;
}

// Abstract classes get no creation operation that works: asking for one is a
// caller's mistake, answered with null.
#define TN_CREATE_1(Name) \
    Tn_Verilog##Name* Tn_VerilogNodeFactory::create##Name(const Tn_Location& l) { return make<Tn_Verilog##Name>(l); }
#define TN_CREATE_0(Name) \
    Tn_Verilog##Name* Tn_VerilogNodeFactory::create##Name(const Tn_Location&) { return nullptr; }
#define TN_NODE(Name, Base, Kind, Fields) BOOST_PP_CAT(TN_CREATE_, TN_IS_CONCRETE(Kind))(Name)
#include "verilog/tn_verilognodes.def"
#undef TN_NODE

Tn_VerilogNode* Tn_VerilogNodeFactory::create(int32_t type, const Tn_Location& location) {
    switch (type) {
#define TN_NODE(Name, Base, Kind, Fields) \
    case Tn_Verilog::Name: return create##Name(location);
#include "verilog/tn_verilognodes.def"
#undef TN_NODE
    default: return nullptr;
    }
}
