#include "verilog/tn_veriloggrammarutil.h"

#include <cstring>

#include "verilog/tn_verilogtokentypes.h"

typedef Tn_VerilogTokenTypes T;

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
bool Tn_VerilogGrammarUtil::isPulseControlName(const TokenRef& id) {
    return id && std::strncmp(id->getText().c_str(), "PATHPULSE$", 10) == 0;
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
