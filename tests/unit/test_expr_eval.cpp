// Constant evaluation of expressions: sizing and signing of operands by the
// context, the operator groups, replication, the conditional operator.
#include <gtest/gtest.h>

#include "tests/support/capturesink.h"
#include "tests/support/designbuilder.h"

namespace {

// "<width> <s|u> <binary> <decimal>", "real <%.17g>" or "null".
std::string text(const Tn_VerilogValuePtr& v) {
    if (!v || v->isNull()) return "null";
    if (v->isReal()) return Port_String::doFormat("real %.17g", v->toReal()).str();
    return Port_String::doFormat("%u %s %s %s", v->width(), v->isSigned() ? "s" : "u", v->toBinaryText().c_str(),
                                 v->toDecimalText().c_str())
        .str();
}

struct Eval : ::testing::Test {
    DesignBuilder b;
    CaptureSink sink;
    std::string eval(const std::string& e) { return text(b.expr(e)->value()); }
};

}  // namespace

TEST_F(Eval, Smoke) {
    EXPECT_EQ(eval("8'sd3 + 4'd1"), "8 u 00000100 4");
    EXPECT_EQ(eval("8'sd3 >>> 1"), "8 s 00000001 1");
    EXPECT_EQ(eval("(4'd1 + 4'd15) == 5'd16"), "1 u 1 1");
    EXPECT_EQ(eval("&4'hF"), "1 u 1 1");
    EXPECT_EQ(eval("{3{2'b10}}"), "6 u 101010 42");
    EXPECT_EQ(eval("4'b1x00 ? 4'd3 : 4'd5"), "4 u 0011 3");
    EXPECT_EQ(eval("4'b0x00 ? 4'b1100 : 4'b1010"), "4 u 1xx0 X");
    EXPECT_EQ(eval("1.5 + 2"), "real 3.5");
    EXPECT_EQ(eval("-4'sd1 + 8'd0"), "8 u 11111111 255");
}
