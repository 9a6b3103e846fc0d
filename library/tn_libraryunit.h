// A unit stored in a library: a parsed module or UDP, an elaborated design,
// or a VHDL unit. Identified by its name and secondary key.
#ifndef TARN_TN_LIBRARYUNIT_H
#define TARN_TN_LIBRARYUNIT_H

#include <cstdint>

#include "tarn/port_stringbase.h"

class Tn_OStream;
class Tn_LibraryUnitVisitor;
class Tn_VerilogDesignUnit;
class Tn_VerilogDesign;

class Tn_LibraryUnit {
public:
    enum Kind { VERILOG_DESIGN_UNIT = 0, VERILOG_DESIGN_UNIT_2 = 1, VERILOG_DESIGN = 2, VHDL_DESIGN_UNIT = 3 };

    Tn_LibraryUnit(const Port_String& libraryName, const Port_String& name, const Port_String& secondaryName = Port_String(),
                   int32_t secondaryNumber = 0)
        : name_(name), libraryName_(libraryName), secondaryName_(secondaryName), secondaryNumber_(secondaryNumber) {}
    virtual ~Tn_LibraryUnit();
    Tn_LibraryUnit(const Tn_LibraryUnit&) = delete;
    Tn_LibraryUnit& operator=(const Tn_LibraryUnit&) = delete;

    virtual int32_t unitKind() const = 0;
    virtual void print(Tn_OStream& out) const = 0;
    virtual void accept(Tn_LibraryUnitVisitor& v) = 0;
    // Status messages: per node type, size, count and memory of the unit's nodes.
    virtual void memoryReport() const = 0;
    // Marks every node reachable from the unit's root.
    virtual void mark() = 0;
    // Destroys the nodes the last mark did not reach.
    virtual void sweep() = 0;

    const Port_String& name() const { return name_; }
    const Port_String& libraryName() const { return libraryName_; }
    const Port_String& secondaryName() const { return secondaryName_; }
    int32_t secondaryNumber() const { return secondaryNumber_; }

private:
    Port_String name_;
    Port_String libraryName_;
    Port_String secondaryName_;
    int32_t secondaryNumber_;
};

class Tn_LibraryUnitVisitor {
public:
    virtual ~Tn_LibraryUnitVisitor();
    virtual void visit(Tn_VerilogDesignUnit* unit) = 0;
    virtual void visit(Tn_VerilogDesign* unit) = 0;
};

#endif
