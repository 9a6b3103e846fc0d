#include "util/tn_symbol.h"

#include <cstdint>
#include <cstring>
#include <deque>
#include <functional>
#include <string_view>
#include <vector>

namespace {

// Interned texts never move or die: the deque keeps element addresses. The
// index is open addressing over (hash, text) slots, at most half full, so a
// lookup usually touches one slot and, on a hit, the text it finds. Parsers
// intern every name they read, so this is a hot path.
struct SymbolTable {
    struct Slot {
        uint64_t hash;
        const Port_String* text;  // null: free
    };
    std::deque<Port_String> texts;
    std::vector<Slot> slots = std::vector<Slot>(1024, Slot{0, nullptr});
    size_t used = 0;

    void grow() {
        std::vector<Slot> old(slots.size() * 2, Slot{0, nullptr});
        old.swap(slots);
        const size_t mask = slots.size() - 1;
        for (const Slot& s : old) {
            if (!s.text) continue;
            size_t i = s.hash & mask;
            while (slots[i].text) i = (i + 1) & mask;
            slots[i] = s;
        }
    }
};

// Made once and kept for the life of the process (no teardown at exit).
SymbolTable& table() {
    static SymbolTable* t = new SymbolTable;
    return *t;
}

}  // namespace

Tn_Symbol::Tn_Symbol(const char* text) : s_(intern(text ? text : "", text ? std::strlen(text) : 0)) {}

const Port_String Tn_Symbol::s_empty;

const Port_String* Tn_Symbol::intern(const char* text, size_t length) {
    if (length == 0) return &s_empty;
    SymbolTable& t = table();
    const uint64_t hash = std::hash<std::string_view>()(std::string_view(text, length));
    const size_t mask = t.slots.size() - 1;
    size_t i = hash & mask;
    for (;; i = (i + 1) & mask) {
        const SymbolTable::Slot& s = t.slots[i];
        if (!s.text) break;
        if (s.hash == hash && static_cast<size_t>(s.text->GetLength()) == length &&
            std::memcmp(s.text->c_str(), text, length) == 0)
            return s.text;
    }
    t.texts.emplace_back(text, static_cast<int>(length));
    const Port_String* s = &t.texts.back();
    t.slots[i] = SymbolTable::Slot{hash, s};
    if (++t.used * 2 > t.slots.size()) t.grow();
    return s;
}

size_t Tn_Symbol::internedCount() { return table().texts.size(); }
