// The files read by one compilation, in reading order, each with the file
// that included it (empty for a source file named on the command line).
#ifndef TARN_TN_VERILOGFILELIST_H
#define TARN_TN_VERILOGFILELIST_H

#include <unordered_set>
#include <vector>

#include "tarn/port_stringbase.h"

class Tn_VerilogFileList {
public:
    struct Entry {
        Port_String file;
        Port_String includer;
    };

    void addSource(const Port_String& file) { add(file, Port_String()); }
    void addInclude(const Port_String& file, const Port_String& includer) { add(file, includer); }
    void clear() {
        entries_.clear();
        sources_.clear();
        included_.clear();
    }

    const std::vector<Entry>& entries() const { return entries_; }
    bool isSource(const Port_String& f) const { return sources_.count(f) != 0; }
    bool isIncluded(const Port_String& f) const { return included_.count(f) != 0; }
    // Files that file includes, in reading order (each once).
    std::vector<Port_String> includedBy(const Port_String& file) const;

private:
    void add(const Port_String& file, const Port_String& includer);
    std::vector<Entry> entries_;
    std::unordered_set<Port_String> sources_;
    std::unordered_set<Port_String> included_;
};

#endif
