// Expressions as the parser builds them: operator precedence and
// associativity, names and selects, numbers with their messages, and the
// single-expression entry of -G values.
#include <gtest/gtest.h>

#include "tests/support/parse.h"
#include "verilog/tn_verilogcompiler.h"
#include "verilog/tn_verilogdesign.h"
#include "verilog/tn_verilogparser.h"

namespace {

class ParserExpressions : public ParseTest {
protected:
    // The value of parameter p in "module m; parameter p = <text>; endmodule".
    Tn_VerilogExpression* value(const std::string& text, const std::vector<std::string>& args = {}) {
        result = parse("module m;\nparameter p = " + text + ";\nendmodule\n", args);
        Tn_VerilogModule* m = result.module("m");
        if (!m || m->Parameter.empty()) return nullptr;
        return m->Parameter[0]->Expr;
    }
    std::string shapeOf(const std::string& text) {
        Tn_VerilogExpression* e = value(text);
        EXPECT_EQ(errors(), Texts{}) << text;
        return shape(e);
    }
};

TEST_F(ParserExpressions, BinaryOperatorsAreLeftAssociativeByPrecedence) {
    EXPECT_EQ(shapeOf("x - y - z"), "(- (- x y) z)");
    EXPECT_EQ(shapeOf("x ** y ** z"), "(** (** x y) z)");
    EXPECT_EQ(shapeOf("x || y && z"), "(|| x (&& y z))");
    EXPECT_EQ(shapeOf("x == y & z"), "(& (== x y) z)");
    EXPECT_EQ(shapeOf("a + b * c - d / e % f"), "(- (+ a (* b c)) (% (/ d e) f))");
    EXPECT_EQ(shapeOf("a | b ^ c & d"), "(| a (^ b (& c d)))");
    EXPECT_EQ(shapeOf("a ^~ b ~^ c"), "(~^ (~^ a b) c)");
    EXPECT_EQ(shapeOf("a << 1 < b >>> 2"), "(< (<< a 1) (>>> b 2))");
    EXPECT_EQ(shapeOf("a != b === c !== d"), "(!== (=== (!= a b) c) d)");
    EXPECT_EQ(shapeOf("(a + b) * c"), "(* (+ a b) c)");
}

TEST_F(ParserExpressions, ConditionalOperatorIsRightAssociative) {
    EXPECT_EQ(shapeOf("p ? x : q ? y : z"), "(?: p x (?: q y z))");
    EXPECT_EQ(shapeOf("p ? q ? a : b : c"), "(?: p (?: q a b) c)");
    EXPECT_EQ(shapeOf("a || b ? c + d : e"), "(?: (|| a b) (+ c d) e)");
}

TEST_F(ParserExpressions, UnaryOperatorsBindTighterThanBinaryOnes) {
    EXPECT_EQ(shapeOf("-a + ~b"), "(+ (- a) (~ b))");
    EXPECT_EQ(shapeOf("&a | ~&b ^ ~|c"), "(| (& a) (^ (~& b) (~| c)))");
    EXPECT_EQ(shapeOf("!!a"), "(! (! a))");
    EXPECT_EQ(shapeOf("^~a"), "(~^ a)");
}

TEST_F(ParserExpressions, AttributesOnOperatorsAndCalls) {
    Tn_VerilogBinaryOp* b = Tn_VerilogNode::cast<Tn_VerilogBinaryOp>(value("a + (* mult = 2 *) b"));
    ASSERT_NE(b, nullptr);
    ASSERT_NE(b->Attributes.get(), nullptr);
    EXPECT_EQ(b->Attributes->Attribute[0]->Name.str().str(), "mult");
    EXPECT_EQ(shape(b->Attributes->Attribute[0]->Expr), "2");
    Tn_VerilogUserFunctionCall* c = Tn_VerilogNode::cast<Tn_VerilogUserFunctionCall>(value("f (* inline *) (1, 2)"));
    ASSERT_NE(c, nullptr);
    EXPECT_NE(c->Attributes.get(), nullptr);
    EXPECT_EQ(c->Param.size(), 2u);
}

TEST_F(ParserExpressions, PrimariesConcatenationsCallsAndMinTypMax) {
    Tn_VerilogConcatOp* c = Tn_VerilogNode::cast<Tn_VerilogConcatOp>(value("{a, b[1], 2'b10}"));
    ASSERT_NE(c, nullptr);
    EXPECT_EQ(c->Operand.size(), 3u);
    Tn_VerilogMultipleConcatOp* m = Tn_VerilogNode::cast<Tn_VerilogMultipleConcatOp>(value("{4{a, b}}"));
    ASSERT_NE(m, nullptr);
    EXPECT_EQ(shape(m->Count), "4");
    EXPECT_EQ(m->Operand.size(), 2u);
    Tn_VerilogSystemFunctionCall* s = Tn_VerilogNode::cast<Tn_VerilogSystemFunctionCall>(value("$clog2(16)"));
    ASSERT_NE(s, nullptr);
    EXPECT_EQ(s->Name.str().str(), "$clog2");
    Tn_VerilogSystemFunctionCall* t = Tn_VerilogNode::cast<Tn_VerilogSystemFunctionCall>(value("$time"));
    ASSERT_NE(t, nullptr);
    EXPECT_TRUE(t->Param.empty());
    Tn_VerilogMinTypMaxOp* mtm = Tn_VerilogNode::cast<Tn_VerilogMinTypMaxOp>(value("(1:2:3)"));
    ASSERT_NE(mtm, nullptr);
    EXPECT_EQ(shape(mtm->MaxOperand), "3");
    Tn_VerilogVectorConst* str = Tn_VerilogNode::cast<Tn_VerilogVectorConst>(value("\"ab\""));
    ASSERT_NE(str, nullptr);
    EXPECT_EQ(str->Value.base(), Tn_Verilog::String);
    EXPECT_EQ(str->Value.width(), 16u);
}

TEST_F(ParserExpressions, SystemCallArgumentsMayBeEmpty) {
    result = parse("module m; initial begin $display(\"a\",, b,); $finish(); end endmodule\n");
    EXPECT_EQ(errors(), Texts{});
    Tn_VerilogBlockStatement* b =
        Tn_VerilogNode::cast<Tn_VerilogBlockStatement>(result.module("m")->Process[0]->Statement.get());
    ASSERT_NE(b, nullptr);
    Tn_VerilogSystemTaskCall* display = Tn_VerilogNode::cast<Tn_VerilogSystemTaskCall>(b->Statement[0]);
    ASSERT_NE(display, nullptr);
    ASSERT_EQ(display->Param.size(), 4u);
    EXPECT_TRUE(display->Param[1]->isA(Tn_Verilog::NullOp));
    EXPECT_TRUE(display->Param[3]->isA(Tn_Verilog::NullOp));
    Tn_VerilogSystemTaskCall* finish = Tn_VerilogNode::cast<Tn_VerilogSystemTaskCall>(b->Statement[1]);
    ASSERT_NE(finish, nullptr);
    EXPECT_TRUE(finish->Param.empty());
}

TEST_F(ParserExpressions, NamesAndSelects) {
    result = parse(
        "module m;\n"
        "reg [7:0] mem [0:3][0:1];\n"
        "reg [7:0] v;\n"
        "wire a = v[3] ^ v[7:4] ^ v[2+:2] ^ v[5-:2] ^ mem[1][0] ^ mem[1][0][3] ^ top.u[2].w ^ later[1][2];\n"
        "endmodule\n");
    EXPECT_EQ(errors(), Texts{});
    Tn_VerilogModule* m = result.module("m");
    ASSERT_EQ(m->ContAssign.size(), 1u);
    std::vector<Tn_VerilogExpression*> terms;
    Tn_VerilogExpression* e = m->ContAssign[0]->Source;
    while (Tn_VerilogBinaryOp* b = Tn_VerilogNode::cast<Tn_VerilogBinaryOp>(e)) {
        terms.insert(terms.begin(), b->ROperand.get());
        e = b->LOperand;
    }
    terms.insert(terms.begin(), e);
    ASSERT_EQ(terms.size(), 8u);
    EXPECT_TRUE(terms[0]->isA(Tn_Verilog::BitSelect));
    EXPECT_TRUE(terms[1]->isA(Tn_Verilog::PartSelect));
    Tn_VerilogIndexedPartSelect* up = Tn_VerilogNode::cast<Tn_VerilogIndexedPartSelect>(terms[2]);
    ASSERT_NE(up, nullptr);
    EXPECT_FALSE(up->NegativeFlag);
    Tn_VerilogIndexedPartSelect* down = Tn_VerilogNode::cast<Tn_VerilogIndexedPartSelect>(terms[3]);
    ASSERT_NE(down, nullptr);
    EXPECT_TRUE(down->NegativeFlag);
    // A two-dimensional memory: both indices select the word.
    Tn_VerilogWordSelect* w = Tn_VerilogNode::cast<Tn_VerilogWordSelect>(terms[4]);
    ASSERT_NE(w, nullptr);
    EXPECT_EQ(w->Index.size(), 2u);
    Tn_VerilogBitSelect* bit = Tn_VerilogNode::cast<Tn_VerilogBitSelect>(terms[5]);
    ASSERT_NE(bit, nullptr);
    EXPECT_TRUE(bit->Operand->isA(Tn_Verilog::WordSelect));
    // top.u[2].w: a scope name, an indexed scope and the selected name.
    Tn_VerilogSelectedName* sel = Tn_VerilogNode::cast<Tn_VerilogSelectedName>(terms[6]);
    ASSERT_NE(sel, nullptr);
    EXPECT_EQ(sel->Suffix.str().str(), "w");
    Tn_VerilogIndexedName* in = Tn_VerilogNode::cast<Tn_VerilogIndexedName>(sel->Prefix.get());
    ASSERT_NE(in, nullptr);
    Tn_VerilogSelectedName* u = Tn_VerilogNode::cast<Tn_VerilogSelectedName>(in->Prefix.get());
    ASSERT_NE(u, nullptr);
    EXPECT_EQ(u->Suffix.str().str(), "u");
    EXPECT_TRUE(u->Prefix->isA(Tn_Verilog::ScopeName));
    // A name not declared yet with two selects: a word select, then a bit.
    Tn_VerilogBitSelect* later = Tn_VerilogNode::cast<Tn_VerilogBitSelect>(terms[7]);
    ASSERT_NE(later, nullptr);
    EXPECT_TRUE(later->Operand->isA(Tn_Verilog::WordSelect));
}

TEST_F(ParserExpressions, IntegerConstants) {
    Tn_VerilogIntegerConst* i = Tn_VerilogNode::cast<Tn_VerilogIntegerConst>(value("2147483647"));
    ASSERT_NE(i, nullptr);
    EXPECT_EQ(i->Value, 2147483647);
    // Fits in 32 bits but not in an integer: kept as a 32-bit vector.
    Tn_VerilogVectorConst* u = Tn_VerilogNode::cast<Tn_VerilogVectorConst>(value("4294967295"));
    ASSERT_NE(u, nullptr);
    EXPECT_EQ(u->Value.width(), 32u);
    EXPECT_EQ(warnings(), Texts{});
    Tn_VerilogVectorConst* big = Tn_VerilogNode::cast<Tn_VerilogVectorConst>(value("4294967296"));
    ASSERT_NE(big, nullptr);
    EXPECT_EQ(warnings(), Texts{loc(2) + "Integer constant '4294967296' is too large to represent in 32 bits"});
    EXPECT_TRUE(big->Value.isZero());
    value("123456789012345678901234567890");
    EXPECT_EQ(warnings().size(), 1u);
    Tn_VerilogRealConst* r = Tn_VerilogNode::cast<Tn_VerilogRealConst>(value("1.5e3"));
    ASSERT_NE(r, nullptr);
    EXPECT_DOUBLE_EQ(r->Value, 1500.0);
}

TEST_F(ParserExpressions, BasedConstants) {
    Tn_VerilogVectorConst* h = Tn_VerilogNode::cast<Tn_VerilogVectorConst>(value("8'shF0"));
    ASSERT_NE(h, nullptr);
    EXPECT_TRUE(h->Value.isSigned());
    EXPECT_FALSE(h->Value.isUnsized());
    EXPECT_EQ(h->Value.width(), 8u);
    EXPECT_EQ(h->Value.toHexText().str(), "f0");
    Tn_VerilogVectorConst* unsized = Tn_VerilogNode::cast<Tn_VerilogVectorConst>(value("'b1x"));
    ASSERT_NE(unsized, nullptr);
    EXPECT_TRUE(unsized->Value.isUnsized());
    Tn_VerilogVectorConst* wide = Tn_VerilogNode::cast<Tn_VerilogVectorConst>(value("100'd1267650600228229401496703205375"));
    ASSERT_NE(wide, nullptr);
    EXPECT_EQ(wide->Value.base(), Tn_Verilog::Decimal);
    EXPECT_EQ(wide->Value.toDecimalText().str(), "1267650600228229401496703205375");
    EXPECT_EQ(errors(), Texts{});
    EXPECT_EQ(warnings(), Texts{});
}

TEST_F(ParserExpressions, NumberMessages) {
    value("0'h5");
    EXPECT_EQ(warnings(), Texts{loc(2) + "Zero width on based number ignored"});
    Tn_VerilogVectorConst* zero = Tn_VerilogNode::cast<Tn_VerilogVectorConst>(value("0'h5"));
    ASSERT_NE(zero, nullptr);
    EXPECT_TRUE(zero->Value.isUnsized());

    value("4'hF");
    EXPECT_EQ(warnings(), Texts{});
    value("4'hFFF");
    EXPECT_EQ(warnings(), Texts{loc(2) + "Too many digits specified in hex constant"});
    value("6'o777");
    EXPECT_EQ(warnings(), Texts{loc(2) + "Too many digits specified in octal constant"});
    value("3'b1010");
    EXPECT_EQ(warnings(), Texts{loc(2) + "Too many digits specified in binary constant"});

    Tn_VerilogVectorConst* x = Tn_VerilogNode::cast<Tn_VerilogVectorConst>(value("4294967296'h1"));
    EXPECT_EQ(errors(), Texts{loc(2) + "Width on based number exceeds maximum of 4294967295 bits"});
    ASSERT_NE(x, nullptr);
    EXPECT_EQ(x->Value.width(), 1u);
    EXPECT_TRUE(x->Value.isAllX());
    // Widths that fit the format but not memory are refused as well.
    value("4000000000'h1");
    EXPECT_EQ(errors(), Texts{loc(2) + "Width on based number exceeds the supported maximum of 1048576 bits"});
}

// The decimal digit limit is the number of digits of the largest value the
// width holds: 8'd255 is the natural way to write it and draws nothing.
TEST_F(ParserExpressions, DecimalDigitLimitIsTheDigitsOfTheLargestValue) {
    for (const char* fine : {"8'd255", "7'd127", "1'd1", "32'd4294967295", "64'd18446744073709551615", "10'd1023"}) {
        value(fine);
        EXPECT_EQ(warnings(), Texts{}) << fine;
    }
    for (const char* wide : {"7'd1000", "8'd0255", "1'd10", "32'd40000000000"}) {
        value(wide);
        EXPECT_EQ(warnings(), Texts{loc(2) + "Too many digits specified in decimal constant"}) << wide;
    }
}

TEST_F(ParserExpressions, ExpressionTextEntry) {
    Tn_VerilogOptions options;
    Tn_VerilogDesign design("work", "DESIGN", options);
    Tn_VerilogExpression* e = Tn_VerilogParser::parseExpression("8'hff + WIDTH * 2", design.factory(), options);
    EXPECT_EQ(shape(e), "(+ based constant 8'hff (* WIDTH 2))");
    EXPECT_EQ(errors(), Texts{});
    for (const char* bad : {"8+", "", "1 2", "(a", "a;", "module"}) {
        EXPECT_THROW(Tn_VerilogParser::parseExpression(bad, design.factory(), options), Tn_VerilogExpressionSyntaxError)
            << bad;
    }
    try {
        Tn_VerilogParser::parseExpression("1 2", design.factory(), options);
    } catch (const Tn_VerilogExpressionSyntaxError& x) {
        EXPECT_EQ(x.message().str(), "expecting EOF, found '2'");
    }
}

TEST_F(ParserExpressions, DriverParsesOverridesAndReportsInvalidOnes) {
    Tn_VerilogCompiler driver;
    driver.compile({"tarn", "-top", "a", "-Gw=8'hf0+1", "-Gd=8+"});
    EXPECT_EQ(sink.errors(), (std::vector<std::string>{"Invalid value '8+' specified for parameter 'd'\n"}));
    std::unique_ptr<Tn_VerilogDesign> d = driver.buildDesign({"a"});
    ASSERT_EQ(d->root()->ModuleInstance.size(), 1u);
    Tn_VerilogModuleInstance* top = d->root()->ModuleInstance[0];
    ASSERT_EQ(top->ParamAssignment.size(), 1u);
    EXPECT_EQ(shape(top->ParamAssignment[0]->Value), "(+ based constant 8'hf0 1)");
    EXPECT_TRUE(top->ParamAssignment[0]->CmdLineParamAssignmentFlag);
    sink.clear();
    driver.compile({"tarn", "-top", "a", "-G(1", "-G2"});
    EXPECT_EQ(sink.errors(), (std::vector<std::string>{"Invalid value '(1' specified for parameter\n"}));
}

}  // namespace
