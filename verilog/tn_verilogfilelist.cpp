#include "verilog/tn_verilogfilelist.h"

#include <algorithm>

void Tn_VerilogFileList::add(const Port_String& file, const Port_String& includer) {
    entries_.push_back(Entry{file, includer});
    (includer.IsEmpty() ? sources_ : included_).insert(file);
}

std::vector<Port_String> Tn_VerilogFileList::includedBy(const Port_String& file) const {
    std::vector<Port_String> r;
    for (const Entry& e : entries_)
        if (e.includer == file && std::find(r.begin(), r.end(), e.file) == r.end()) r.push_back(e.file);
    return r;
}
