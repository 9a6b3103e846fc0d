// Sizing, signing and constant evaluation of expressions: the operator
// groups, context-determined operands, replication, the conditional operator,
// names of constants, selects, and what is not constant.
#include <gtest/gtest.h>

#include <chrono>

#include "tests/support/checkfixture.h"

namespace {

using namespace Tn_Verilog;

std::string text(const Tn_VerilogValuePtr& v) { return Tn_VerilogValue::evalText(v).str(); }

struct Eval : CheckFixture {
    // The expression checked in m, then evaluated self-determined.
    std::string eval(const std::string& e) {
        Tn_VerilogExpression* x = b.expr(e);
        x->typeAs(b.context(m), Value);
        return text(x->value());
    }
    std::string evalIn(const std::string& e, bool isSigned, uint32_t width) {
        Tn_VerilogExpression* x = b.expr(e);
        x->typeAs(b.context(m), Value);
        return text(x->evaluate(Tn_VerilogEvalContext(true, isSigned, true, width)));
    }
    Tn_VerilogExpression* checked(const std::string& e) {
        Tn_VerilogExpression* x = b.expr(e);
        x->typeAs(b.context(m), Value);
        return x;
    }
};

}  // namespace

TEST_F(Eval, OneUnsignedOperandMakesTheArithmeticGroupUnsigned) {
    Tn_VerilogExpression* e = checked("8'sd3 + 4'd1");
    EXPECT_EQ(e->contextWidth(0), 8u);
    EXPECT_FALSE(e->isSigned(true));
    EXPECT_EQ(text(e->value()), "8 u 00000100 4");
    // Operands are extended in the context's sign before the operation.
    EXPECT_EQ(eval("-4'sd1 + 8'd0"), "8 u 11111111 255");
    EXPECT_EQ(eval("-4'sd1 + 8'sd0"), "8 s 11111111 -1");
    EXPECT_EQ(eval("4'sd7 * 4'sd2"), "4 s 1110 -2");
}

TEST_F(Eval, ShiftsAndPowersFollowTheirLeftOperand) {
    Tn_VerilogExpression* e = checked("8'sd3 >>> 1");
    EXPECT_TRUE(e->isSigned(true));
    EXPECT_EQ(e->contextWidth(0), 8u);
    EXPECT_EQ(text(e->value()), "8 s 00000001 1");
    EXPECT_EQ(eval("8'sh80 >>> 4'd3"), "8 s 11110000 -16");
    // The shift count and the exponent are self-determined.
    EXPECT_EQ(checked("4'd1 << 32'd2")->contextWidth(0), 4u);
    EXPECT_EQ(eval("4'd3 ** 8'd2"), "4 u 1001 9");
    EXPECT_FALSE(checked("4'd3 ** 8'sd2")->isSigned(true));
    EXPECT_EQ(eval("8'sd2 ** -8'sd1"), "8 s xxxxxxxx x");
}

TEST_F(Eval, WidePowersOfLongExponentsStopEarlyOrHaveNoValue) {
    // An odd base reaches 1 and an even one 0 long before a 128-bit exponent
    // runs out (3 ** (2**128 - 1) mod 2**128 as Python's pow computes it).
    EXPECT_EQ(eval("(128'd3 ** {4{32'hffffffff}}) == 128'd226854911280625642308916404954512140971"), "1 u 1 1");
    EXPECT_EQ(eval("(128'd6 ** 200) == 0"), "1 u 1 1");
    EXPECT_EQ(eval("(100'd7 ** 3) == 343"), "1 u 1 1");
    // Wide products for every bit of a wide exponent would take hours.
    EXPECT_EQ(eval("65536'd3 ** {2048{32'hffffffff}}"), "null");
    EXPECT_EQ(checked("(65536'd3 ** 20) == 65536'd3486784401")->value()->toBool(), true);
}

TEST_F(Eval, ComparisonsSizeTheirOperandsToEachOther) {
    // In a 16-bit context a == b is 16 bits wide, but it compares in its own
    // operands' width and then widens a one-bit result.
    Tn_VerilogExpression* e = checked("4'd15 == 4'd15");
    EXPECT_EQ(e->contextWidth(16), 16u);
    EXPECT_EQ(e->contextWidth(0), 1u);
    EXPECT_FALSE(e->isSigned(true));
    EXPECT_EQ(text(e->evaluate(Tn_VerilogEvalContext(true, true, true, 16))), "16 u 0000000000000001 1");
    EXPECT_EQ(eval("(4'd1 + 4'd15) == 5'd16"), "1 u 1 1");
    EXPECT_EQ(eval("-4'sd1 < 4'sd0"), "1 u 1 1");
    EXPECT_EQ(eval("-4'sd1 < 4'd0"), "1 u 0 0");
    EXPECT_EQ(eval("4'b1x00 == 4'b0x00"), "1 u 0 0");
    EXPECT_EQ(eval("4'b1x00 === 4'b1x00"), "1 u 1 1");
    // Logical operands are self-determined each.
    EXPECT_EQ(eval("2'b10 && 8'd0"), "1 u 0 0");
}

TEST_F(Eval, ReductionsAndLogicalNegationSeeTheirOperandAlone) {
    EXPECT_EQ(evalIn("&4'hf", true, 8), "8 u 00000001 1");
    EXPECT_EQ(evalIn("!4'h0", true, 8), "8 u 00000001 1");
    EXPECT_EQ(evalIn("~4'h0", false, 8), "8 u 11111111 255");
    Tn_VerilogExpression* e = checked("^8'hff");
    EXPECT_EQ(e->contextWidth(0), 1u);
    EXPECT_FALSE(e->isSigned(true));
}

TEST_F(Eval, ConcatenationAndReplication) {
    EXPECT_EQ(eval("{2'b10, 4'sd1}"), "6 u 100001 33");
    EXPECT_EQ(checked("{2'b10, 4'sd1}")->contextWidth(3), 6u);
    EXPECT_EQ(eval("{3{2'b10}}"), "6 u 101010 42");
    EXPECT_EQ(eval("{2{1'b1, 1'bz}}"), "4 u 1z1z Z");
    EXPECT_EQ(checked("{3{2'b10}}")->contextWidth(0), 6u);
    // A replication of nothing adds nothing to a concatenation; alone it has no value.
    EXPECT_EQ(eval("{2'b11, {0{1'b1}}}"), "2 u 11 3");
    EXPECT_EQ(eval("{0{1'b1}}"), "null");
    EXPECT_EQ(eval("{(-1){1'b1}}"), "null");
    EXPECT_EQ(eval("{1'bx{1'b1}}"), "null");
    // Counts are built by doubling; beyond 1M bits there is no value.
    EXPECT_EQ(text(checked("{1000{8'h5a}}")->value()).substr(0, 14), "8000 u 0101101");
    EXPECT_EQ(eval("{1048577{1'b1}}"), "null");
    EXPECT_EQ(checked("{1048576{1'b1}}")->value()->width(), 1048576u);
    EXPECT_EQ(eval("{32'hffffffff{1'b1}}"), "null");
}

TEST_F(Eval, ConditionalTakesABranchOrMergesBoth) {
    EXPECT_EQ(eval("1'b1 ? 4'd3 : 4'd5"), "4 u 0011 3");
    EXPECT_EQ(eval("1'b0 ? 4'd3 : 4'd5"), "4 u 0101 5");
    // A condition with a 1 bit is true even with unknown bits beside it.
    EXPECT_EQ(eval("4'b1x00 ? 4'd3 : 4'd5"), "4 u 0011 3");
    EXPECT_EQ(eval("4'b0x00 ? 4'b1100 : 4'b1010"), "4 u 1xx0 X");
    EXPECT_EQ(eval("1'bz ? 8'sd1 : 4'sd1"), "8 s 00000001 1");
    // A real branch makes the result real, whichever branch is taken.
    EXPECT_EQ(eval("1'b1 ? 2 : 0.5"), "real 2");
    EXPECT_TRUE(checked("1'b1 ? 2 : 0.5")->isReal());
    EXPECT_EQ(eval("1'bx ? 1.5 : 1.5"), "real 1.5");
}

TEST_F(Eval, RealsAndMixedOperands) {
    EXPECT_EQ(eval("1.5 + 2"), "real 3.5");
    EXPECT_EQ(eval("2 ** 0.5 > 1.4"), "1 u 1 1");
    EXPECT_EQ(eval("-2.5"), "real -2.5");
    EXPECT_EQ(eval("!0.0"), "1 u 1 1");
    EXPECT_TRUE(checked("2 + 0.5")->isReal());
    EXPECT_FALSE(checked("2 < 0.5")->isReal());
    EXPECT_EQ(checked("1.0")->contextWidth(0), 64u);
}

TEST_F(Eval, LongOperatorChains) {
    std::string sum = "8'd1", nested = "4'sd1";
    for (int i = 1; i < 3000; ++i) sum += " + 8'd1";
    // As deep as the parser takes (it bounds nesting at 1000).
    for (int i = 0; i < 900; ++i) nested = "-(" + nested + ")";
    Tn_VerilogExpression* e = checked(sum);
    EXPECT_EQ(e->contextWidth(0), 8u);
    EXPECT_EQ(text(e->value()), "8 u 10111000 184");  // 3000 mod 256
    EXPECT_EQ(eval(nested), "4 s 0001 1");
    EXPECT_TRUE(sink.errors().empty());
}

TEST_F(Eval, WhatIsNotConstantHasNoValue) {
    EXPECT_EQ(eval("(1:2:3)"), "null");
    EXPECT_EQ(eval("$signed(4'b1111)"), "null");
    EXPECT_EQ(eval("$time + 1"), "null");
    EXPECT_EQ(eval("undeclared + 1"), "null");
    EXPECT_FALSE(checked("$random")->isConstant());
    EXPECT_TRUE(checked("(1:2:3)")->isConstant());
}

TEST_F(Eval, ChainsOfParametersEvaluateInLinearTime) {
    // Each name asks for the width, sign and value of the parameter it
    // names: computed afresh, a chain of n would cost 3^n evaluations.
    const auto start = std::chrono::steady_clock::now();
    b.param(m, "C0", "1");
    for (int i = 1; i <= 300; ++i) b.param(m, "C" + std::to_string(i), "C" + std::to_string(i - 1) + " + 1");
    EXPECT_EQ(eval("C300"), "32 s 00000000000000000000000100101101 301");
    b.param(m, "F0", "1");
    b.param(m, "F1", "1");
    for (int i = 2; i <= 40; ++i)
        b.param(m, "F" + std::to_string(i), "F" + std::to_string(i - 1) + " + F" + std::to_string(i - 2));
    EXPECT_EQ(eval("F40"), "32 s 00001001110111101000110101101101 165580141");
    EXPECT_LT(std::chrono::steady_clock::now() - start, std::chrono::seconds(10));
}

TEST_F(Eval, NamesOfConstantsEvaluateToTheirValues) {
    b.param(m, "W", "8");
    b.param(m, "P", "W * 2 + 1");
    b.param(m, "R", "4'sb1111", SignedParam, "7:0");
    b.param(m, "U", "-1", UnsignedParam, "0:3");
    b.param(m, "I", "3'b111", IntegerParam);
    b.param(m, "T", "-1", TimeParam);
    b.param(m, "F", "3", RealParam);
    b.param(m, "S", "4'b1010", SignedNoRangeParam);
    EXPECT_EQ(eval("P"), "32 s 00000000000000000000000000010001 17");
    EXPECT_EQ(eval("R"), "8 s 11111111 -1");
    EXPECT_EQ(eval("U"), "4 u 1111 15");
    EXPECT_EQ(eval("I"), "32 s 00000000000000000000000000000111 7");
    EXPECT_EQ(eval("T").substr(0, 5), "64 u ");
    EXPECT_EQ(eval("F + 0.5"), "real 3.5");
    EXPECT_EQ(eval("S"), "4 s 1010 -6");
    EXPECT_TRUE(checked("P + 1")->isConstant());
    EXPECT_FALSE(checked("P + 1")->isLiteral());
    EXPECT_EQ(checked("U")->contextWidth(0), 4u);
    EXPECT_TRUE(checked("R")->isSigned(true));
}

TEST_F(Eval, ParametersDefinedThroughThemselvesHaveNoValue) {
    b.param(m, "A", "B + 1");
    b.param(m, "B", "A + 1");
    EXPECT_EQ(eval("A"), "null");
    EXPECT_EQ(eval("B"), "null");
    EXPECT_TRUE(sink.errors().empty());
}

TEST_F(Eval, OverridesReplaceTheDeclaredValue) {
    Tn_VerilogParameter* w = b.param(m, "W", "8");
    w->OverrideExpr = b.expr("16");
    EXPECT_EQ(eval("W"), "32 s 00000000000000000000000000010000 16");
}

TEST_F(Eval, SelectsOfConstantsFollowTheDeclaredBitNumbering) {
    b.param(m, "D", "8'b1000_0001", UnsignedParam, "7:0");
    b.param(m, "A", "8'b1000_0001", UnsignedParam, "0:7");
    b.param(m, "N", "16'habcd");
    EXPECT_EQ(eval("D[7]"), "1 u 1 1");
    EXPECT_EQ(eval("D[6]"), "1 u 0 0");
    // With [0:7], index 0 is the most significant bit.
    EXPECT_EQ(eval("A[0]"), "1 u 1 1");
    EXPECT_EQ(eval("A[1]"), "1 u 0 0");
    EXPECT_EQ(eval("D[8]"), "1 u x x");
    EXPECT_EQ(eval("D[1'bx]"), "1 u x x");
    EXPECT_EQ(eval("N[15:12]"), "4 u 1010 10");
    EXPECT_EQ(eval("A[0:3]"), "4 u 1000 8");
    EXPECT_EQ(eval("D[9:6]"), "4 u xx10 X");
    EXPECT_EQ(eval("N[4 +: 8]"), "8 u 10111100 188");
    EXPECT_EQ(eval("N[11 -: 8]"), "8 u 10111100 188");
    EXPECT_EQ(eval("A[1 +: 2]"), "2 u 00 0");
    EXPECT_EQ(eval("A[7 -: 2]"), "2 u 01 1");
    EXPECT_EQ(checked("N[11 -: 8]")->contextWidth(0), 8u);
    EXPECT_EQ(checked("N[3:0]")->contextWidth(2), 4u);
    EXPECT_FALSE(checked("N[3:0]")->isSigned(true));
}

TEST_F(Eval, GenvarsHaveValuesOnlyWhileValid) {
    Tn_VerilogGenVar* g = b.genvar(m, "i");
    g->Value = 5;
    Tn_VerilogExpression* e = b.expr("i + 1");
    EXPECT_EQ(text(e->value()), "null");
    g->ValidFlag = true;
    Tn_VerilogElabContext& ctx = b.context(m);
    EXPECT_FALSE(e->typeAs(ctx, Value)->isError());
    EXPECT_EQ(text(e->value()), "32 s 00000000000000000000000000000110 6");
}

TEST_F(Eval, OperandBounds) {
    EXPECT_EQ(static_cast<Tn_VerilogOperand*>(checked("7"))->msb()->toInt(), 31);
    EXPECT_EQ(static_cast<Tn_VerilogOperand*>(checked("7"))->lsb()->toInt(), 0);
    b.param(m, "A", "0", UnsignedParam, "2:9");
    Tn_VerilogOperand* a = static_cast<Tn_VerilogOperand*>(checked("A"));
    EXPECT_EQ(a->msb()->toInt(), 2);
    EXPECT_EQ(a->lsb()->toInt(), 9);
    EXPECT_FALSE(static_cast<Tn_VerilogOperand*>(b.expr("nothing"))->msb());
}
