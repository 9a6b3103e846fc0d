// The system functions and tasks the checker knows, with their signatures:
// four tables (functions and tasks of Verilog-1995, those Verilog-2001 adds)
// built once per process. A function entry is a function type, a task entry
// a task type; their parameter types carry the direction, the optional mark
// (may be left out or empty) and the any-expression mark, and a trailing
// ellipses type stands for any number of further arguments.
#ifndef TARN_TN_VERILOGSYSTF_H
#define TARN_TN_VERILOGSYSTF_H

#include "tarn/port_stringbase.h"
#include "verilog/tn_verilogtype.h"

class Tn_VerilogSysTf {
public:
    // The entry of a system function or task named name (with its "$") in the
    // language mode; null when the tables of that mode do not hold it.
    static const Tn_VerilogType* function(const Port_String& name, bool verilog2001);
    static const Tn_VerilogType* task(const Port_String& name, bool verilog2001);

    // Makes a signature from its text form, as the tables write them:
    // "(u in, u in opt) u", "(s inout opt) s", "(...) u", "(u out, ...)". A
    // parameter is u (unsigned integral), s (signed integral), real, or ...
    // (the ellipses), then its direction (in, out, inout; none for an
    // ellipses that takes any expression), then the marks opt and any; a
    // function's result type follows the list, a task has none. Null when the
    // text is malformed.
    static Tn_VerilogTypePtr signature(const char* text);
};

#endif
