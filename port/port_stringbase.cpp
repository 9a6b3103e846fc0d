#include "tarn/port_stringbase.h"

#include <algorithm>
#include <cctype>
#include <cstdio>
#include <cstdlib>
#include <cstring>

namespace Port {

namespace {

bool inSet(char ch, const char* set) { return ch != 0 && set && std::strchr(set, ch) != nullptr; }

int foldCase(int ch) { return std::tolower(static_cast<unsigned char>(ch)); }

}  // namespace

template <class C>
StringBase<C>& StringBase<C>::FormatV(const char* fmt, va_list ap) {
    char small[256];
    va_list ap2;
    va_copy(ap2, ap);
    int n = std::vsnprintf(small, sizeof small, fmt, ap);
    if (n < 0) {
        s_.clear();
    } else if (static_cast<size_t>(n) < sizeof small) {
        s_.assign(small, static_cast<size_t>(n));
    } else {
        s_.resize(static_cast<size_t>(n));
        std::vsnprintf(&s_[0], static_cast<size_t>(n) + 1, fmt, ap2);
    }
    va_end(ap2);
    return *this;
}

template <class C>
StringBase<C>& StringBase<C>::Format(const char* fmt, ...) {
    va_list ap;
    va_start(ap, fmt);
    FormatV(fmt, ap);
    va_end(ap);
    return *this;
}

template <class C>
StringBase<C> StringBase<C>::doFormat(const char* fmt, ...) {
    StringBase<C> r;
    va_list ap;
    va_start(ap, fmt);
    r.FormatV(fmt, ap);
    va_end(ap);
    return r;
}

template <class C>
StringBase<C>& StringBase<C>::Trim(const C* chars, int trimType) {
    if (!chars || !*chars) return *this;
    if (trimType & TRIM_RIGHT) {
        size_t e = s_.find_last_not_of(chars);
        s_.erase(e == Std::npos ? 0 : e + 1);
    }
    if (trimType & TRIM_LEFT) {
        size_t b = s_.find_first_not_of(chars);
        s_.erase(0, b == Std::npos ? s_.size() : b);
    }
    return *this;
}

template <class C>
bool StringBase<C>::NextTokenRange(const C* delims, int& pos, int& start, int& end, int parseType) const {
    const int n = GetLength();
    for (;;) {
        while (pos < n && inSet(s_[static_cast<size_t>(pos)], delims)) ++pos;
        if (pos >= n) return false;
        start = pos;
        while (pos < n && !inSet(s_[static_cast<size_t>(pos)], delims)) ++pos;
        end = pos;
        if (parseType == PARSE_TRIMMED) {
            while (start < end && (s_[static_cast<size_t>(start)] == ' ' || s_[static_cast<size_t>(start)] == '\t')) ++start;
            while (end > start && (s_[static_cast<size_t>(end - 1)] == ' ' || s_[static_cast<size_t>(end - 1)] == '\t')) --end;
            if (start == end) continue;  // a piece of blanks only is empty too
        }
        return true;
    }
}

template <class C>
bool StringBase<C>::NextToken(const C* delims, int& pos, StringBase& piece, int parseType) const {
    int start = 0, end = 0;
    if (!NextTokenRange(delims, pos, start, end, parseType)) return false;
    piece = StringBase(s_.substr(static_cast<size_t>(start), static_cast<size_t>(end - start)));
    return true;
}

template <class C>
int StringBase<C>::GetIndexOfString(const StringBase& sub, int compareType, int from) const {
    if (from < 0) from = 0;
    if (from > GetLength()) return -1;
    if (compareType == COMPARE_NOCASE) {
        const size_t m = sub.s_.size();
        for (size_t i = static_cast<size_t>(from); i + m <= s_.size(); ++i) {
            size_t k = 0;
            while (k < m && foldCase(s_[i + k]) == foldCase(sub.s_[k])) ++k;
            if (k == m) return static_cast<int>(i);
        }
        return -1;
    }
    size_t at = s_.find(sub.s_, static_cast<size_t>(from));
    return at == Std::npos ? -1 : static_cast<int>(at);
}

template <class C>
int StringBase<C>::GetIndexOfFirstChar(const C* set, int from) const {
    if (!set || from < 0 || from >= GetLength()) return -1;
    size_t at = s_.find_first_of(set, static_cast<size_t>(from));
    return at == Std::npos ? -1 : static_cast<int>(at);
}

template <class C>
int StringBase<C>::Compare(const StringBase& o, int compareType) const {
    if (compareType != COMPARE_NOCASE) return s_.compare(o.s_) < 0 ? -1 : (s_ == o.s_ ? 0 : 1);
    const size_t n = std::min(s_.size(), o.s_.size());
    for (size_t i = 0; i < n; ++i) {
        int d = foldCase(s_[i]) - foldCase(o.s_[i]);
        if (d) return d < 0 ? -1 : 1;
    }
    return s_.size() == o.s_.size() ? 0 : (s_.size() < o.s_.size() ? -1 : 1);
}

template <class C>
StringBase<C> StringBase<C>::Extract(int start, int count) const {
    if (start < 0) start = 0;
    if (start >= GetLength()) return StringBase();
    return StringBase(s_.substr(static_cast<size_t>(start), count < 0 ? Std::npos : static_cast<size_t>(count)));
}

template <class C>
StringBase<C>& StringBase<C>::Remove(int start, int count) {
    if (start < 0) start = 0;
    if (start < GetLength()) s_.erase(static_cast<size_t>(start), count < 0 ? Std::npos : static_cast<size_t>(count));
    return *this;
}

template <class C>
StringBase<C>& StringBase<C>::MakeLower() {
    for (C& c : s_) c = static_cast<C>(std::tolower(static_cast<unsigned char>(c)));
    return *this;
}

template <class C>
StringBase<C>& StringBase<C>::MakeUpper() {
    for (C& c : s_) c = static_cast<C>(std::toupper(static_cast<unsigned char>(c)));
    return *this;
}

template <class C>
int32_t StringBase<C>::GetINT32(int base) const {
    // Accumulate in 64 bits and wrap, so an over-long digit string never traps.
    const char* p = s_.c_str();
    while (*p == ' ' || *p == '\t') ++p;
    bool neg = false;
    if (*p == '-' || *p == '+') neg = (*p++ == '-');
    uint32_t v = 0;
    for (;; ++p) {
        int d;
        if (*p >= '0' && *p <= '9') d = *p - '0';
        else if (*p >= 'a' && *p <= 'z') d = *p - 'a' + 10;
        else if (*p >= 'A' && *p <= 'Z') d = *p - 'A' + 10;
        else break;
        if (d >= base) break;
        v = v * static_cast<uint32_t>(base) + static_cast<uint32_t>(d);
    }
    return static_cast<int32_t>(neg ? 0u - v : v);
}

template class StringBase<char>;

}  // namespace Port
