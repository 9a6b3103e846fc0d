#include "util/tn_symbol.h"

#include <cstring>
#include <deque>
#include <string_view>
#include <unordered_map>

namespace {

// Interned texts never move or die: the deque keeps element addresses, and
// the map's keys view the stored texts.
struct SymbolTable {
    std::deque<Port_String> texts;
    std::unordered_map<std::string_view, const Port_String*> index;
};

SymbolTable& table() {
    static SymbolTable t;
    return t;
}

}  // namespace

Tn_Symbol::Tn_Symbol(const char* text) : s_(intern(text ? text : "", text ? std::strlen(text) : 0)) {}

const Port_String Tn_Symbol::s_empty;

const Port_String* Tn_Symbol::intern(const char* text, size_t length) {
    if (length == 0) return &s_empty;
    SymbolTable& t = table();
    auto it = t.index.find(std::string_view(text, length));
    if (it != t.index.end()) return it->second;
    t.texts.emplace_back(text, static_cast<int>(length));
    const Port_String* s = &t.texts.back();
    t.index.emplace(std::string_view(s->c_str(), length), s);
    return s;
}

size_t Tn_Symbol::internedCount() { return table().texts.size(); }
