// Node type numbers of the design model, in the order of tn_verilognodes.def,
// and what is known of each type without its class: name, base, concreteness.
#ifndef TARN_TN_VERILOGNODETYPE_H
#define TARN_TN_VERILOGNODETYPE_H

#include <cstdint>

namespace Tn_Verilog {

enum NodeType : int32_t {
#define TN_NODE(Name, Base, Kind, Fields) Name,
#include "verilog/tn_verilognodes.def"
#undef TN_NODE
    NodeTypeCount
};

// "BinaryOp"; "NoNodeType" for a number outside the table.
const char* nodeTypeName(int32_t type);
// "Tn_VerilogBinaryOp"; "NoNodeType" outside the table.
const char* nodeClassName(int32_t type);
// The direct base's type (Node for Node); -1 outside the table.
int32_t nodeBaseType(int32_t type);
bool isConcreteNodeType(int32_t type);
// True when type is ancestor or type itself derives from it.
bool nodeTypeIsA(int32_t type, int32_t ancestor);

}  // namespace Tn_Verilog

#define TN_NODE(Name, Base, Kind, Fields) class Tn_Verilog##Name;
#include "verilog/tn_verilognodes.def"
#undef TN_NODE

#endif
