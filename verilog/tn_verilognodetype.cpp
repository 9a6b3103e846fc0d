#include "verilog/tn_verilognodetype.h"

#include "verilog/tn_verilognodedef.h"

namespace Tn_Verilog {

namespace {

struct TypeInfo {
    const char* name;
    const char* className;
    int32_t base;
    bool concrete;
};

const TypeInfo kTypes[] = {
#define TN_NODE(Name, Base, Kind, Fields) {#Name, "Tn_Verilog" #Name, Base, TN_IS_CONCRETE(Kind) == 1},
#include "verilog/tn_verilognodes.def"
#undef TN_NODE
};

bool valid(int32_t t) { return t >= 0 && t < NodeTypeCount; }

}  // namespace

const char* nodeTypeName(int32_t type) { return valid(type) ? kTypes[type].name : "NoNodeType"; }

const char* nodeClassName(int32_t type) { return valid(type) ? kTypes[type].className : "NoNodeType"; }

int32_t nodeBaseType(int32_t type) { return valid(type) ? kTypes[type].base : -1; }

bool isConcreteNodeType(int32_t type) { return valid(type) && kTypes[type].concrete; }

bool nodeTypeIsA(int32_t type, int32_t ancestor) {
    if (!valid(type) || !valid(ancestor)) return false;
    for (;;) {
        if (type == ancestor) return true;
        if (type == Node) return false;
        type = kTypes[type].base;
    }
}

}  // namespace Tn_Verilog
