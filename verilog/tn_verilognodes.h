// Every node class of the design model, generated from tn_verilognodes.def:
// its place in the class tree, its fields, and the per-class operations the
// generic machinery of Tn_VerilogNode needs.
#ifndef TARN_TN_VERILOGNODES_H
#define TARN_TN_VERILOGNODES_H

#include "verilog/tn_verilognode.h"
#include "verilog/tn_verilognodedef.h"
#include "verilog/tn_verilognodefactory.h"
#include "verilog/tn_verilognodemembers.h"
#include "verilog/tn_verilogvector.h"
#include "verilog/tn_verilogvisitor.h"

#define TN_MEMBERS_OF(Name) TN_MEMBERS_##Name
#define TN_CLASS_MEMBERS(Name) BOOST_PP_IIF(TN_IS_PROBE(TN_HAS_MEMBERS_##Name), TN_MEMBERS_OF, TN_NOTHING)(Name)

#define TN_NODE_CLASS(Name, Base, Kind, Fields)                                                \
    class Tn_Verilog##Name : public Tn_Verilog##Base {                                          \
    public:                                                                                     \
        typedef Tn_Verilog##Base Super;                                                         \
        static const Tn_Verilog::NodeType TYPE = Tn_Verilog::Name;                              \
        int32_t nodeType() const override { return TYPE; }                                      \
        uint32_t objectSize() const override { return sizeof(*this); }                          \
        void accept(Tn_VerilogVisitor& v) override { v.visit##Name(this); }                     \
        void visitFields(Tn_VerilogFieldVisitor& v) override {                                  \
            Super::visitFields(v);                                                              \
            TN_FOR_FIELDS(TN_VISIT_FIELD, Fields)                                               \
        }                                                                                       \
        TN_FOR_FIELDS(TN_DECLARE_FIELD, Fields)                                                 \
        TN_CLASS_MEMBERS(Name)                                                                  \
    protected:                                                                                  \
        friend class Tn_VerilogNodeFactory;                                                     \
        Tn_Verilog##Name() {}                                                                   \
        Tn_Verilog##Name(const Tn_Verilog##Name&) = default;                                    \
        Tn_VerilogNode* newCopy(Tn_VerilogNodeFactory& f) const override { return f.copyOf(*this); } \
    };

// Tn_VerilogNode itself is written by hand.
#define TN_SKIP_CLASS_Node TN_PROBE
#define TN_NODE(Name, Base, Kind, Fields) \
    BOOST_PP_IIF(TN_IS_PROBE(TN_SKIP_CLASS_##Name), TN_NOTHING, TN_NODE_CLASS)(Name, Base, Kind, Fields)
#include "verilog/tn_verilognodes.def"
#undef TN_NODE

#endif
