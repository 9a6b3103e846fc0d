// Number conversions and character helpers of the portability layer.
#ifndef TARN_UT_STR_H
#define TARN_UT_STR_H

#include <cstdint>

class UT_STR {
public:
    // Digits of the given base from text (leading blanks and, for the signed
    // form, a sign allowed); *end (when given) points past the last digit used.
    // Out-of-range values wrap modulo the result width instead of saturating.
    static uint32_t StrToUINT32(const char* text, const char** end, int base);
    static uint64_t StrToUINT64(const char* text, const char** end, int base);
    static int32_t StrToINT32(const char* text, const char** end, int base);
    static double StrToD(const char* text, const char** end);

    static bool IsDigit(int c) { return c >= '0' && c <= '9'; }
    static bool IsAlpha(int c) { return (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z'); }
    static bool IsSpace(int c) { return c == ' ' || c == '\t' || c == '\n' || c == '\r' || c == '\f' || c == '\v'; }
    static bool IsXDigit(int c) { return IsDigit(c) || ((c | 0x20) >= 'a' && (c | 0x20) <= 'f'); }
    static int ToLower(int c) { return (c >= 'A' && c <= 'Z') ? c + 32 : c; }
    static int ToUpper(int c) { return (c >= 'a' && c <= 'z') ? c - 32 : c; }
};

#endif
