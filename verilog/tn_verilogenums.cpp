#include "verilog/tn_verilogenums.h"

namespace Tn_Verilog {

// One pass over the list builds each enumeration's name and text tables.
#define TN_ENUM(T, noName, noText)                \
    namespace T##Tables {                          \
    static const char* const noNameText = noName;  \
    static const char* const noTextText = noText;  \
    static const char* const names[] = {
#define TN_VALUE(E, text) #E,
#define TN_VALUE_AS(E, name, text) name,
#define TN_END(T) \
    }             \
    ;             \
    }
#include "verilog/tn_verilogenums.def"
#undef TN_ENUM
#undef TN_VALUE
#undef TN_VALUE_AS
#undef TN_END

#define TN_ENUM(T, noName, noText) namespace T##Tables { static const char* const texts[] = {
#define TN_VALUE(E, text) text,
#define TN_VALUE_AS(E, name, text) text,
#define TN_END(T)                                                                                   \
    }                                                                                               \
    ;                                                                                               \
    }                                                                                               \
    const Tn_EnumInfo T##Info = {"Tn_Verilog::" #T, T##Tables::names, T##Tables::texts,             \
                                 static_cast<int32_t>(sizeof T##Tables::names / sizeof(const char*)), \
                                 T##Tables::noNameText, T##Tables::noTextText};
#include "verilog/tn_verilogenums.def"
#undef TN_ENUM
#undef TN_VALUE
#undef TN_VALUE_AS
#undef TN_END

}  // namespace Tn_Verilog
