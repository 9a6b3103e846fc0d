// Radix in which a four-state constant was written and is printed. The
// numbers are stored in binary libraries: never renumber.
#ifndef TARN_TN_VERILOGBASETYPE_H
#define TARN_TN_VERILOGBASETYPE_H

#include <cstdint>

namespace Tn_Verilog {

enum BaseType : uint32_t { Decimal = 0, Binary = 1, Octal = 2, Hex = 3, String = 4 };

// Enumerator name as the dumps print it; "NoBaseType" when out of range.
inline const char* baseTypeName(uint32_t base) {
    static const char* const names[] = {"Decimal", "Binary", "Octal", "Hex", "String"};
    return base <= String ? names[base] : "NoBaseType";
}

// Letter of a based constant ("d", "b", "o", "h"); empty for String and out of range.
inline const char* baseTypeLetter(uint32_t base) {
    static const char* const letters[] = {"d", "b", "o", "h"};
    return base < String ? letters[base] : "";
}

}  // namespace Tn_Verilog

#endif
