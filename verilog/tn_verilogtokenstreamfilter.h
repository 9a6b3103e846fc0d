// Between the scanner and the parser: METACOMMENT tokens (synthesis meta
// comments) never reach the parser's lookahead; they are linked as hidden
// tokens to the visible tokens around them, where the parser finds them.
#ifndef TARN_TN_VERILOGTOKENSTREAMFILTER_H
#define TARN_TN_VERILOGTOKENSTREAMFILTER_H

#include <antlr/TokenStreamHiddenTokenFilter.hpp>

class Tn_VerilogLexer;

class Tn_VerilogTokenStreamFilter : public antlr::TokenStreamHiddenTokenFilter {
public:
    explicit Tn_VerilogTokenStreamFilter(Tn_VerilogLexer& lexer);
};

#endif
