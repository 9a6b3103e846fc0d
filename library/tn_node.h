// Root of every node of the design model (Verilog and VHDL alike): its id in
// the owning unit's node table, a visit mark and its source location.
#ifndef TARN_TN_NODE_H
#define TARN_TN_NODE_H

#include <cstddef>
#include <cstdint>

#include "util/tn_symbol.h"

class Tn_OStream;

struct Tn_Location {
    Tn_Symbol file;
    int32_t line = 0;

    Tn_Location() {}
    Tn_Location(const Tn_Symbol& f, int32_t l) : file(f), line(l) {}
    // The prefix of every message about this place: "\"f\" line 3 ", "\"f\" "
    // without a line, "line 3 " without a file, empty without either.
    Port_String text() const;
    bool operator==(const Tn_Location& o) const { return file == o.file && line == o.line; }
};

class Tn_Node {
public:
    virtual ~Tn_Node();
    // Prints the node and its owned children under label at indent.
    virtual void dump(Tn_OStream& out, const char* label, int indent) const = 0;
    virtual int32_t nodeType() const = 0;
    virtual bool isA(int32_t type) const = 0;
    virtual uint32_t objectSize() const = 0;
    // Name of the node's class as dumps and reports print it.
    virtual const char* typeName() const = 0;

    uint32_t id() const { return id_; }
    void setId(uint32_t id) { id_ = id; }
    const Tn_Location& location() const { return location_; }
    Tn_Location& location() { return location_; }
    void setLocation(const Tn_Location& l) { location_ = l; }
    Port_String locationText() const { return location_.text(); }

    // Visit marks: a node is marked when its mark equals the current
    // generation; nextGeneration() unmarks every node at once.
    void mark() { mark_ = s_generation; }
    bool isMarked() const { return mark_ == s_generation; }
    static void nextGeneration() { ++s_generation; }

    // Node storage: units make millions of small nodes, so they come from
    // per-size free lists carved out of large blocks (process-wide, reused
    // when nodes are destroyed, like the scanner's token pool).
    static void* operator new(std::size_t size);
    static void operator delete(void* p, std::size_t size);

protected:
    Tn_Node() : id_(0), mark_(-1) {}
    Tn_Node(const Tn_Node& o) : id_(0), mark_(-1), location_(o.location_) {}
    Tn_Node& operator=(const Tn_Node&) = delete;

private:
    uint32_t id_;
    int32_t mark_;
    Tn_Location location_;
    static int32_t s_generation;
};

#endif
