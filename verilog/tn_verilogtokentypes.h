// The token types shared by the scanner and the grammars, made from the one
// list in verilog/tn_verilogtokens.def. A generated grammar derives from them
// through the alias header the build puts in place of its own token-type
// header (cmake/TarnGenerated.cmake).
#ifndef TARN_TN_VERILOGTOKENTYPES_H
#define TARN_TN_VERILOGTOKENTYPES_H

struct Tn_VerilogTokenTypes {
    enum {
        EOF_ = 1,
        NULL_TREE_LOOKAHEAD = 3,
        TN_BEFORE_FIRST_TOKEN_ = 3,
#define TN_TOKEN(name, text, kind) name,
#include "verilog/tn_verilogtokens.def"
#undef TN_TOKEN
        TN_TOKEN_LIMIT_
    };
};

// The numbering is an external interface: the grammars and stored files use it.
static_assert(Tn_VerilogTokenTypes::K_ALWAYS == 4, "token numbering");
static_assert(Tn_VerilogTokenTypes::K_IF == 45, "token numbering");
static_assert(Tn_VerilogTokenTypes::K_TRI == 112, "token numbering");
static_assert(Tn_VerilogTokenTypes::K_XOR == 127, "token numbering");
static_assert(Tn_VerilogTokenTypes::S_SETUP == 128 && Tn_VerilogTokenTypes::S_NOCHANGE == 139, "token numbering");
static_assert(Tn_VerilogTokenTypes::AMPERSAND == 140 && Tn_VerilogTokenTypes::CARET == 189, "token numbering");
static_assert(Tn_VerilogTokenTypes::UDP_0 == 190 && Tn_VerilogTokenTypes::EDGE_X1 == 203, "token numbering");
static_assert(Tn_VerilogTokenTypes::BASE_D == 204 && Tn_VerilogTokenTypes::BASE_SH == 211, "token numbering");
static_assert(Tn_VerilogTokenTypes::INTEGER == 212 && Tn_VerilogTokenTypes::METACOMMENT == 222, "token numbering");

#endif
