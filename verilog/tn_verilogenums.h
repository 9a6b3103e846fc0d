// The enumerations of the design model (declared in tn_verilogenums.def) and
// their name and text tables.
#ifndef TARN_TN_VERILOGENUMS_H
#define TARN_TN_VERILOGENUMS_H

#include <cstdint>

// What dumps, messages and the binary format need to know of an enumeration.
struct Tn_EnumInfo {
    const char* qualifiedName;  // "Tn_Verilog::BinaryOpType"
    const char* const* names;   // printed names, by value
    const char* const* texts;   // operator or keyword texts, by value
    int32_t count;
    const char* noName;  // printed name of a value out of range
    const char* noText;

    const char* name(int32_t v) const { return v >= 0 && v < count ? names[v] : noName; }
    const char* text(int32_t v) const { return v >= 0 && v < count ? texts[v] : noText; }
};

namespace Tn_Verilog {

#define TN_ENUM(T, noName, noText) enum T : int32_t {
#define TN_VALUE(E, text) E,
#define TN_VALUE_AS(E, name, text) E,
#define TN_END(T) \
    }             \
    ;             \
    extern const Tn_EnumInfo T##Info;
#include "verilog/tn_verilogenums.def"
#undef TN_ENUM
#undef TN_VALUE
#undef TN_VALUE_AS
#undef TN_END

}  // namespace Tn_Verilog

// The info of an enumeration type, for generic code (dump, binary format).
template <class E>
struct Tn_EnumInfoOf;
#define TN_ENUM(T, noName, noText)
#define TN_VALUE(E, text)
#define TN_VALUE_AS(E, name, text)
#define TN_END(T)                                                        \
    template <>                                                          \
    struct Tn_EnumInfoOf<Tn_Verilog::T> {                                \
        static const Tn_EnumInfo& get() { return Tn_Verilog::T##Info; } \
    };
#include "verilog/tn_verilogenums.def"
#undef TN_ENUM
#undef TN_VALUE
#undef TN_VALUE_AS
#undef TN_END

#endif
