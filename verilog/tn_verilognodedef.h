// Preprocessor machinery that expands tn_verilognodes.def: iteration over a
// class's field list and the per-kind pieces (member declaration, field visit).
#ifndef TARN_TN_VERILOGNODEDEF_H
#define TARN_TN_VERILOGNODEDEF_H

#include <boost/preprocessor/cat.hpp>
#include <boost/preprocessor/control/iif.hpp>
#include <boost/preprocessor/seq/for_each.hpp>
#include <boost/preprocessor/seq/variadic_seq_to_seq.hpp>
#include <boost/preprocessor/tuple/elem.hpp>

// TN_FOR_FIELDS(M, (K, T, L, P)(K, T, L, P)...) expands M(K, T, L, P) per field.
#define TN_FOR_FIELDS(M, fields) BOOST_PP_SEQ_FOR_EACH(TN_FIELD_APPLY, M, BOOST_PP_VARIADIC_SEQ_TO_SEQ(fields))
#define TN_FIELD_APPLY(r, M, f) \
    M(BOOST_PP_TUPLE_ELEM(4, 0, f), BOOST_PP_TUPLE_ELEM(4, 1, f), BOOST_PP_TUPLE_ELEM(4, 2, f), BOOST_PP_TUPLE_ELEM(4, 3, f))

// Member declaration of a field, by kind.
#define TN_DECLARE_FIELD(K, T, L, P) BOOST_PP_CAT(TN_DECLARE_, K)(T, L)
#define TN_DECLARE_NONE(T, L)
#define TN_DECLARE_CHILD(T, L) Tn_NodePtr<Tn_Verilog##T> L;
#define TN_DECLARE_REF(T, L) Tn_NodePtr<Tn_Verilog##T> L;
#define TN_DECLARE_CHILDLIST(T, L) Tn_NodeList<Tn_Verilog##T> L;
#define TN_DECLARE_REFLIST(T, L) Tn_NodeList<Tn_Verilog##T> L;
#define TN_DECLARE_CHILDMAP(T, L) Tn_NodeMap<Tn_Verilog##T> L;
#define TN_DECLARE_INDEXMAP(T, L) Tn_NodeIndexMap<Tn_Verilog##T> L;
#define TN_DECLARE_STRING(T, L) Tn_Symbol L;
#define TN_DECLARE_BOOL(T, L) bool L = false;
#define TN_DECLARE_INT32(T, L) int32_t L = 0;
#define TN_DECLARE_UINT32(T, L) uint32_t L = 0;
#define TN_DECLARE_INT64(T, L) int64_t L = 0;
#define TN_DECLARE_UINT64(T, L) uint64_t L = 0;
#define TN_DECLARE_DOUBLE(T, L) double L = 0;
#define TN_DECLARE_ENUM(T, L) Tn_EnumField<Tn_Verilog::T> L;
#define TN_DECLARE_VECTOR(T, L) Tn_VerilogVector L;
#define TN_DECLARE_LOCATION(T, L) Tn_Location L;

// The field visitor call of a field, by kind.
#define TN_PERSISTENT_P true
#define TN_PERSISTENT_T false
#define TN_VISIT_FIELD(K, T, L, P) BOOST_PP_CAT(TN_VISIT_, K)(T, L, BOOST_PP_CAT(TN_PERSISTENT_, P))
#define TN_FIELD_INFO(L, type, p) Tn_FieldInfo{#L, type, p}
#define TN_VISIT_NONE(T, L, p)
#define TN_VISIT_CHILD(T, L, p) v.child(TN_FIELD_INFO(L, Tn_Verilog::T, p), L.raw());
#define TN_VISIT_REF(T, L, p) v.reference(TN_FIELD_INFO(L, Tn_Verilog::T, p), L.raw());
#define TN_VISIT_CHILDLIST(T, L, p) v.childList(TN_FIELD_INFO(L, Tn_Verilog::T, p), L.raw());
#define TN_VISIT_REFLIST(T, L, p) v.refList(TN_FIELD_INFO(L, Tn_Verilog::T, p), L.raw());
#define TN_VISIT_CHILDMAP(T, L, p) v.childMap(TN_FIELD_INFO(L, Tn_Verilog::T, p), L);
#define TN_VISIT_INDEXMAP(T, L, p) v.indexMap(TN_FIELD_INFO(L, Tn_Verilog::T, p), L.raw());
#define TN_VISIT_STRING(T, L, p) v.string(TN_FIELD_INFO(L, -1, p), L);
#define TN_VISIT_BOOL(T, L, p) v.boolean(TN_FIELD_INFO(L, -1, p), L);
#define TN_VISIT_INT32(T, L, p) v.int32(TN_FIELD_INFO(L, -1, p), L);
#define TN_VISIT_UINT32(T, L, p) v.uint32(TN_FIELD_INFO(L, -1, p), L);
#define TN_VISIT_INT64(T, L, p) v.int64(TN_FIELD_INFO(L, -1, p), L);
#define TN_VISIT_UINT64(T, L, p) v.uint64(TN_FIELD_INFO(L, -1, p), L);
#define TN_VISIT_DOUBLE(T, L, p) v.float64(TN_FIELD_INFO(L, -1, p), L);
#define TN_VISIT_ENUM(T, L, p) v.enumeration(TN_FIELD_INFO(L, -1, p), Tn_Verilog::T##Info, L.raw());
#define TN_VISIT_VECTOR(T, L, p) v.vector(TN_FIELD_INFO(L, -1, p), L);
#define TN_VISIT_LOCATION(T, L, p) v.location(TN_FIELD_INFO(L, -1, p), L);

// Whether a macro is defined as TN_PROBE: TN_IS_PROBE(X) is 1 then, else 0.
// A class gets hand-written members by defining TN_HAS_MEMBERS_<Name> as
// TN_PROBE and TN_MEMBERS_<Name> as the declarations, in a header that
// tn_verilognodes.h includes before it generates the classes.
#define TN_PROBE ~, 1
#define TN_PROBE_SECOND(a, b, ...) b
#define TN_IS_PROBE_(...) TN_PROBE_SECOND(__VA_ARGS__, 0, ~)
#define TN_IS_PROBE(x) TN_IS_PROBE_(x)

#define TN_IS_CONCRETE_CONCRETE 1
#define TN_IS_CONCRETE_ABSTRACT 0
#define TN_IS_CONCRETE(kind) BOOST_PP_CAT(TN_IS_CONCRETE_, kind)

#define TN_NOTHING(...)

#endif
