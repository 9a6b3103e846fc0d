// Verilog expression texts made into expression nodes for tests, so that a
// test writes "8'sd3 + 4'd1" instead of building the tree by hand. Covers
// constants (integer, based, real, string), every operator with the
// Verilog-2001 precedence, concatenation, replication, the conditional
// operator, min:typ:max, names (simple, hierarchical, indexed), bit-, part-,
// indexed part- and word-selects, and system and user function calls.
#ifndef TARN_TESTS_EXPRPARSER_H
#define TARN_TESTS_EXPRPARSER_H

#include <functional>
#include <string>

#include "library/tn_node.h"

class Tn_VerilogExpression;
class Tn_VerilogNodeFactory;

class TestExprParser {
public:
    // dimensions(name): how many array dimensions the name has (0 for a
    // plain object); its first indices make a word-select.
    TestExprParser(Tn_VerilogNodeFactory& factory, const Tn_Location& location,
                   std::function<int(const std::string&)> dimensions = nullptr);

    // The expression of the whole text; null (and error() says why) when the
    // text is not one expression.
    Tn_VerilogExpression* parse(const std::string& text);
    const std::string& error() const { return error_; }

private:
    struct Token {
        enum Kind { End, Number, Real, String, Ident, SysIdent, Op } kind = End;
        std::string text;
    };
    void next();
    bool is(const char* op) const { return tok_.kind == Token::Op && tok_.text == op; }
    bool accept(const char* op);
    bool expect(const char* op);
    Tn_VerilogExpression* fail(const std::string& why);

    Tn_VerilogExpression* expression();
    Tn_VerilogExpression* binary(int level);
    Tn_VerilogExpression* unary();
    Tn_VerilogExpression* primary();
    Tn_VerilogExpression* number(const std::string& text);
    Tn_VerilogExpression* braces();
    Tn_VerilogExpression* nameOrCall();
    Tn_VerilogExpression* selects(Tn_VerilogExpression* operand, int dimensions);
    template <class T>
    T* make();

    Tn_VerilogNodeFactory& f_;
    Tn_Location location_;
    std::function<int(const std::string&)> dimensions_;
    std::string text_;
    size_t pos_ = 0;
    Token tok_;
    std::string error_;
};

#endif
