// Between the scanner and the parser: METACOMMENT tokens (synthesis meta
// comments) never reach the parser's lookahead. Hidden tokens met after a
// visible token hang off it (getHiddenAfter, then from hidden to hidden), and
// the next visible token gets the last of them as getHiddenBefore, as the
// ANTLR hidden-token filter links them.
#ifndef TARN_TN_VERILOGTOKENSTREAMFILTER_H
#define TARN_TN_VERILOGTOKENSTREAMFILTER_H

#include <antlr/CommonHiddenStreamToken.hpp>
#include <antlr/TokenStream.hpp>
#include <exception>
#include <vector>

class Tn_VerilogLexer;

class Tn_VerilogTokenStreamFilter : public antlr::TokenStream {
public:
    explicit Tn_VerilogTokenStreamFilter(Tn_VerilogLexer& lexer);
    ~Tn_VerilogTokenStreamFilter() override;
    Tn_VerilogTokenStreamFilter(const Tn_VerilogTokenStreamFilter&) = delete;
    Tn_VerilogTokenStreamFilter& operator=(const Tn_VerilogTokenStreamFilter&) = delete;

    // The next visible token (end of file again and again at the end). A
    // scanner error met while looking past a visible token is thrown by the
    // call after the one that returns that token.
    antlr::RefToken nextToken() override;
    // The hidden tokens before the first visible one (chained by getHiddenAfter).
    antlr::RefToken initialHiddenToken() const { return firstHidden_; }
    // Forgets the stream read so far; for a lexer that was started again.
    void reset();
    Tn_VerilogLexer& lexer() const { return lexer_; }

private:
    void readNext();
    bool isHidden(const antlr::RefToken& t) const;
    static antlr::CommonHiddenStreamToken* linkable(const antlr::RefToken& t) {
        return static_cast<antlr::CommonHiddenStreamToken*>(t.get());
    }
    // Backward links between hidden tokens are reference cycles: they are
    // cut when the stream is dropped.
    void unlink();

    Tn_VerilogLexer& lexer_;
    antlr::RefToken next_;
    antlr::RefToken lastHidden_;
    antlr::RefToken firstHidden_;
    std::exception_ptr pending_;
    bool started_ = false;
    std::vector<antlr::RefToken> backLinked_;
};

#endif
