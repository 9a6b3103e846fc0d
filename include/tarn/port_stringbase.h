// Byte string with value semantics: the string type of every Tarn interface.
#ifndef TARN_PORT_STRINGBASE_H
#define TARN_PORT_STRINGBASE_H

#include <cstdarg>
#include <cstddef>
#include <cstdint>
#include <functional>
#include <string>

namespace Port {

// Which end(s) Trim works on.
enum TrimType { TRIM_LEFT = 1, TRIM_RIGHT = 2, TRIM_BOTH = 3 };

// Compare types: 0 exact (case-sensitive), 1 case-insensitive.
enum CompareType { COMPARE_EXACT = 0, COMPARE_NOCASE = 1 };

// Parse types of NextTokenRange. Both skip empty pieces between adjacent
// delimiters (so "a++b" gives "a", "b" and a trailing delimiter adds nothing);
// type 1 also trims blanks and tabs around each piece.
enum ParseType { PARSE_VERBATIM = 0, PARSE_TRIMMED = 1 };

template <class C>
class StringBase {
public:
    typedef std::basic_string<C> Std;

    StringBase() {}
    StringBase(const C* text) : s_(text ? text : Std()) {}
    StringBase(const C* text, int length) : s_(text, text ? static_cast<size_t>(length) : 0) {}
    StringBase(int count, C ch) : s_(static_cast<size_t>(count < 0 ? 0 : count), ch) {}
    StringBase(const Std& s) : s_(s) {}
    StringBase(Std&& s) : s_(std::move(s)) {}

    StringBase& operator=(const C* text) { s_ = text ? text : Std(); return *this; }
    StringBase& operator=(C ch) { s_.assign(1, ch); return *this; }

    StringBase& operator+=(const StringBase& o) { s_ += o.s_; return *this; }
    StringBase& operator+=(const C* text) { if (text) s_ += text; return *this; }
    StringBase& operator+=(C ch) { s_ += ch; return *this; }
    StringBase& Append(const C* text, int length) { s_.append(text, static_cast<size_t>(length)); return *this; }

    friend StringBase operator+(StringBase a, const StringBase& b) { a += b; return a; }
    friend StringBase operator+(StringBase a, const C* b) { a += b; return a; }
    friend StringBase operator+(const C* a, const StringBase& b) { StringBase r(a); r += b; return r; }
    friend StringBase operator+(StringBase a, C b) { a += b; return a; }

    friend bool operator==(const StringBase& a, const StringBase& b) { return a.s_ == b.s_; }
    friend bool operator!=(const StringBase& a, const StringBase& b) { return a.s_ != b.s_; }
    friend bool operator<(const StringBase& a, const StringBase& b) { return a.s_ < b.s_; }
    friend bool operator==(const StringBase& a, const C* b) { return a.s_ == (b ? b : ""); }
    friend bool operator!=(const StringBase& a, const C* b) { return !(a == b); }
    friend bool operator==(const C* a, const StringBase& b) { return b == a; }
    friend bool operator!=(const C* a, const StringBase& b) { return !(b == a); }

    // The text as a zero-terminated pointer; valid until the string changes.
    const C* c_str() const { return s_.c_str(); }
    const Std& str() const { return s_; }
    Std& str() { return s_; }

    int GetLength() const { return static_cast<int>(s_.size()); }
    bool IsEmpty() const { return s_.empty(); }
    void Empty() { s_.clear(); }
    C operator[](int i) const { return s_[static_cast<size_t>(i)]; }
    C GetAt(int i) const { return (i >= 0 && i < GetLength()) ? s_[static_cast<size_t>(i)] : C(0); }
    void SetChar(int i, C ch) { if (i >= 0 && i < GetLength()) s_[static_cast<size_t>(i)] = ch; }
    void SetLength(int n) { s_.resize(static_cast<size_t>(n < 0 ? 0 : n)); }

    // printf-style formatting into this string (replacing it), and into a new one.
    StringBase& Format(const char* fmt, ...) __attribute__((format(printf, 2, 3)));
    StringBase& FormatV(const char* fmt, va_list ap);
    static StringBase doFormat(const char* fmt, ...) __attribute__((format(printf, 1, 2)));

    StringBase& Trim(const C* chars, int trimType = TRIM_BOTH);

    // Finds the next piece of the string between delimiter characters, starting
    // the search at pos. On success start/end delimit the piece ([start, end)),
    // pos moves past it and the result is true; false when no piece remains.
    bool NextTokenRange(const C* delims, int& pos, int& start, int& end, int parseType) const;
    bool NextToken(const C* delims, int& pos, StringBase& piece, int parseType) const;

    // Index of sub at or after from, or -1.
    int GetIndexOfString(const StringBase& sub, int compareType = COMPARE_EXACT, int from = 0) const;
    // Index of the first character of set at or after from, or -1.
    int GetIndexOfFirstChar(const C* set, int from = 0) const;
    // <0, 0, >0 as strcmp.
    int Compare(const StringBase& o, int compareType = COMPARE_EXACT) const;
    bool StartsWith(const StringBase& prefix) const { return s_.compare(0, prefix.s_.size(), prefix.s_) == 0; }

    StringBase Extract(int start, int count = -1) const;
    StringBase& Remove(int start, int count = -1);
    StringBase& MakeLower();
    StringBase& MakeUpper();
    // Leading (optionally signed) digits in the given base; 0 when there are none.
    int32_t GetINT32(int base = 10) const;

private:
    Std s_;
};

extern template class StringBase<char>;

}  // namespace Port

typedef Port::StringBase<char> Port_String;

namespace std {
template <>
struct hash<Port::StringBase<char>> {
    size_t operator()(const Port::StringBase<char>& s) const noexcept { return hash<std::string>()(s.str()); }
};
}  // namespace std

#endif
