#include "verilog/tn_verilogtokenstreamfilter.h"

#include "verilog/tn_veriloglexer.h"
#include "verilog/tn_verilogtokentypes.h"

Tn_VerilogTokenStreamFilter::Tn_VerilogTokenStreamFilter(Tn_VerilogLexer& lexer)
    : antlr::TokenStreamHiddenTokenFilter(lexer) {
    hide(Tn_VerilogTokenTypes::METACOMMENT);
}
