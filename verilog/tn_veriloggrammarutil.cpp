#include "verilog/tn_veriloggrammarutil.h"

#include <cstring>
#include <vector>

#include "verilog/tn_verilogtoken.h"
#include "verilog/tn_verilogtokentypes.h"

typedef Tn_VerilogTokenTypes T;

namespace {

// Tokens whose text is their own: every other token's text is fixed.
bool ownTextOf(int type) {
    return type >= T::INTEGER || type == 0 || (type >= T::BASE_D && type <= T::BASE_SH);
}

const char* fixedText(int type) {
    static const char* const texts[] = {"", "EOF", "", "",
#define TN_TOKEN(name, text, kind) text,
#include "verilog/tn_verilogtokens.def"
#undef TN_TOKEN
    };
    return type >= 0 && type < static_cast<int>(sizeof texts / sizeof texts[0]) ? texts[type] : "";
}

// The fixed texts as symbols, interned once.
const Tn_Symbol& fixedSymbol(int type) {
    static std::vector<Tn_Symbol> symbols;
    static const Tn_Symbol none;
    if (symbols.empty())
        for (int k = 0; k < T::TN_TOKEN_LIMIT_; ++k) symbols.push_back(Tn_Symbol(fixedText(k)));
    return type >= 0 && type < T::TN_TOKEN_LIMIT_ ? symbols[static_cast<size_t>(type)] : none;
}

}  // namespace

bool Tn_VerilogGrammarUtil::ownText(int type) { return ownTextOf(type); }

TokenRef Tn_VerilogGrammarUtil::lookaheadToken(unsigned int i) {
    if (i > ahead_.count) fillLookahead(i);
    Slot& s = ahead_.at(i);
    if (!s.token) {
        if (!s.hasText) s.text.assign(fixedText(s.type));
        s.token = TokenRef(new Tn_VerilogToken(s.type, s.text, s.file, s.line, s.column));
    }
    return s.token;
}

void Tn_VerilogGrammarUtil::clearLookahead() {
    for (Slot& s : ahead_.slots) s.token = TokenRef();
    ahead_.head = ahead_.count = 0;
}

Tn_VerilogTok Tn_VerilogGrammarUtil::tok() {
    if (ahead_.count == 0) fillLookahead(1);
    const Slot& s = ahead_.at(1);
    Tn_VerilogTok t;
    t.type = s.type;
    t.text = s.hasText ? Tn_Symbol(s.text.data(), s.text.size()) : fixedSymbol(s.type);
    if (s.file.get() != lastFile_.get()) {
        lastFile_ = s.file;
        lastFileSymbol_ = s.file ? Tn_Symbol(s.file->str().data(), s.file->str().size()) : Tn_Symbol();
    }
    t.location = Tn_Location(lastFileSymbol_, s.line);
    t.column = s.column;
    return t;
}

Tn_VerilogGrammarUtil::~Tn_VerilogGrammarUtil() {}

bool Tn_VerilogGrammarUtil::isStrength(int type) {
    switch (type) {
    case T::K_SUPPLY0:
    case T::K_STRONG0:
    case T::K_PULL0:
    case T::K_WEAK0:
    case T::K_HIGHZ0:
    case T::K_SUPPLY1:
    case T::K_STRONG1:
    case T::K_PULL1:
    case T::K_WEAK1:
    case T::K_HIGHZ1: return true;
    default: return false;
    }
}

bool Tn_VerilogGrammarUtil::isChargeStrength(int type) {
    return type == T::K_SMALL || type == T::K_MEDIUM || type == T::K_LARGE;
}

bool Tn_VerilogGrammarUtil::isAnsiPortStart(int type) {
    return type == T::K_INPUT || type == T::K_OUTPUT || type == T::K_INOUT || type == T::ATTR_OPEN;
}

bool Tn_VerilogGrammarUtil::isBlockDeclaration(int type, bool ports) {
    switch (type) {
    case T::K_REG:
    case T::K_INTEGER:
    case T::K_TIME:
    case T::K_REAL:
    case T::K_REALTIME:
    case T::K_EVENT:
    case T::K_PARAMETER:
    case T::K_LOCALPARAM: return true;
    case T::K_INPUT:
    case T::K_OUTPUT:
    case T::K_INOUT: return ports;
    default: return false;
    }
}

// PATHPULSE$ specparams take a pulse limit pair.
bool Tn_VerilogGrammarUtil::isPulseControlName(const Tn_VerilogTok& id) {
    return std::strncmp(id.text.c_str(), "PATHPULSE$", 10) == 0;
}

unsigned Tn_VerilogGrammarUtil::edgeDescriptorBit(int type) {
    switch (type) {
    case T::EDGE_01: return 1u << 0;
    case T::EDGE_0X: return 1u << 1;
    case T::EDGE_10: return 1u << 2;
    case T::EDGE_1X: return 1u << 3;
    case T::EDGE_X0: return 1u << 4;
    default: return 1u << 5;
    }
}
