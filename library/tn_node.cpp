#include "library/tn_node.h"

int32_t Tn_Node::s_generation = 0;

Tn_Node::~Tn_Node() {}

Port_String Tn_Location::text() const {
    if (!file.IsEmpty()) {
        if (line < 1) return Port_String::doFormat("\"%s\" ", file.c_str());
        return Port_String::doFormat("\"%s\" line %d ", file.c_str(), line);
    }
    if (line >= 1) return Port_String::doFormat("line %d ", line);
    return Port_String();
}
