// Vectors written as Verilog literals in tests: "8'sb1000_0000", "'hx", "4'd1",
// "-8'sd5" (negative decimal). A plain number is a 32-bit integer vector.
#ifndef TARN_TESTS_VALUELITERAL_H
#define TARN_TESTS_VALUELITERAL_H

#include <cstdlib>
#include <string>

#include "verilog/tn_verilogvector.h"

inline Tn_VerilogVector vec(const std::string& literal) {
    std::string text = literal;
    bool minus = !text.empty() && text[0] == '-';
    if (minus) text.erase(0, 1);
    size_t tick = text.find('\'');
    if (tick == std::string::npos) return Tn_VerilogVector(static_cast<int32_t>(std::strtol(literal.c_str(), nullptr, 10)));
    uint32_t width = tick == 0 ? 0 : static_cast<uint32_t>(std::strtoul(text.substr(0, tick).c_str(), nullptr, 10));
    size_t pos = tick + 1;
    bool isSigned = text[pos] == 's' || text[pos] == 'S';
    if (isSigned) ++pos;
    char b = static_cast<char>(text[pos] | 0x20);
    Tn_Verilog::BaseType base = b == 'd' ? Tn_Verilog::Decimal : b == 'o' ? Tn_Verilog::Octal : b == 'h' ? Tn_Verilog::Hex : Tn_Verilog::Binary;
    std::string digits = (minus ? "-" : "") + text.substr(pos + 1);
    return Tn_VerilogVector(base, isSigned, width, digits.c_str());
}

#endif
