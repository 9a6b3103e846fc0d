// Interned text: one process-wide copy of each distinct string. Names and
// file names of the design model are symbols, so nodes stay small and equal
// names compare by pointer.
#ifndef TARN_TN_SYMBOL_H
#define TARN_TN_SYMBOL_H

#include <cstddef>
#include <functional>

#include "tarn/port_stringbase.h"

class Tn_Symbol {
public:
    // The empty text (cheap: parsers make many empty symbols).
    Tn_Symbol() : s_(&s_empty) {}
    Tn_Symbol(const Port_String& text) : s_(intern(text.c_str(), static_cast<size_t>(text.GetLength()))) {}
    Tn_Symbol(const char* text);
    Tn_Symbol(const char* text, size_t length) : s_(intern(text, length)) {}

    const Port_String& str() const { return *s_; }
    const char* c_str() const { return s_->c_str(); }
    int GetLength() const { return s_->GetLength(); }
    bool IsEmpty() const { return s_->IsEmpty(); }
    operator const Port_String&() const { return *s_; }

    bool operator==(const Tn_Symbol& o) const { return s_ == o.s_; }
    bool operator!=(const Tn_Symbol& o) const { return s_ != o.s_; }
    // Orders by text, so sorted symbols come in byte order.
    bool operator<(const Tn_Symbol& o) const { return *s_ < *o.s_; }
    size_t hash() const { return std::hash<const void*>()(s_); }

    // Number of distinct texts interned so far.
    static size_t internedCount();

private:
    static const Port_String* intern(const char* text, size_t length);
    static const Port_String s_empty;
    const Port_String* s_;
};

namespace std {
template <>
struct hash<Tn_Symbol> {
    size_t operator()(const Tn_Symbol& s) const noexcept { return s.hash(); }
};
}  // namespace std

#endif
