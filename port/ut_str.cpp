#include "port/ut_str.h"

#include <cstdlib>

namespace {

int digitValue(char c) {
    if (c >= '0' && c <= '9') return c - '0';
    if (c >= 'a' && c <= 'z') return c - 'a' + 10;
    if (c >= 'A' && c <= 'Z') return c - 'A' + 10;
    return 99;
}

const char* skipBlanks(const char* p) {
    while (*p == ' ' || *p == '\t') ++p;
    return p;
}

uint64_t digits(const char* p, const char** end, int base) {
    uint64_t v = 0;
    for (int d; (d = digitValue(*p)) < base; ++p) v = v * static_cast<uint64_t>(base) + static_cast<uint64_t>(d);
    if (end) *end = p;
    return v;
}

}  // namespace

uint32_t UT_STR::StrToUINT32(const char* text, const char** end, int base) {
    return static_cast<uint32_t>(digits(skipBlanks(text), end, base));
}

uint64_t UT_STR::StrToUINT64(const char* text, const char** end, int base) { return digits(skipBlanks(text), end, base); }

int32_t UT_STR::StrToINT32(const char* text, const char** end, int base) {
    const char* p = skipBlanks(text);
    bool neg = false;
    if (*p == '-' || *p == '+') neg = (*p++ == '-');
    uint32_t v = static_cast<uint32_t>(digits(p, end, base));
    return static_cast<int32_t>(neg ? 0u - v : v);
}

double UT_STR::StrToD(const char* text, const char** end) {
    char* e = nullptr;
    double d = std::strtod(text, &e);
    if (end) *end = e;
    return d;
}
