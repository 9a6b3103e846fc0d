// Values: the slots of each kind, the order in which operators treat null,
// real, integer and vector operands, and fitting to the evaluation context.
#include <gtest/gtest.h>

#include <cmath>
#include <limits>

#include "tests/support/valueliteral.h"
#include "verilog/tn_verilogvalue.h"

namespace {

typedef Tn_VerilogValue V;
typedef Tn_VerilogValuePtr P;

P integer(int32_t v) { return V::createInteger(v); }
P real(double v) { return V::createReal(v); }
P null() { return V::createNull(); }
P vector(const char* literal) { return V::createVector(vec(literal)); }

const Tn_VerilogEvalContext self;  // self-determined: signed, width 0

Tn_VerilogEvalContext context(bool isSigned, uint32_t width) { return Tn_VerilogEvalContext(true, isSigned, true, width); }

std::string bin(const P& v) { return v->toBinaryText().str(); }

}  // namespace

TEST(ValueSlots, IntegerValue) {
    P v = integer(-5);
    EXPECT_TRUE(v->toBool());
    EXPECT_FALSE(integer(0)->toBool());
    EXPECT_EQ(v->toInt(), -5);
    EXPECT_DOUBLE_EQ(v->toReal(), -5.0);
    EXPECT_EQ(v->toVector(), Tn_VerilogVector(-5));
    EXPECT_EQ(v->width(), 32u);
    EXPECT_FALSE(v->hasUnknown());
    EXPECT_TRUE(v->isSigned());
    EXPECT_TRUE(v->isInteger());
    EXPECT_FALSE(v->isVector() || v->isReal() || v->isNull() || v->isDecimal() || v->isString());
    EXPECT_EQ(v->toText().str(), "-5");
    EXPECT_EQ(v->toBaseText().str(), "-5");
    EXPECT_EQ(v->toDecimalText().str(), "-5");
    EXPECT_EQ(v->toBinaryText().str(), "11111111111111111111111111111011");
    EXPECT_EQ(v->toOctalText().str(), "37777777773");
    EXPECT_EQ(integer(8)->toOctalText().str(), "00000000010");
    EXPECT_EQ(v->toHexText().str(), "fffffffb");
    EXPECT_EQ(v->describe().str(), "integer constant '-5'");
    EXPECT_EQ(v->vector(), nullptr);
}

TEST(ValueSlots, RealValue) {
    P v = real(-2.5);
    EXPECT_TRUE(v->toBool());
    EXPECT_FALSE(real(0.0)->toBool());
    EXPECT_EQ(v->toInt(), -3);  // half away from zero
    EXPECT_EQ(real(2.5)->toInt(), 3);
    EXPECT_EQ(real(2.4)->toInt(), 2);
    EXPECT_EQ(real(std::nan(""))->toInt(), 0);
    EXPECT_EQ(real(4294967301.0)->toInt(), 5);  // wraps to 32 bits without trapping
    EXPECT_DOUBLE_EQ(v->toReal(), -2.5);
    EXPECT_EQ(v->toVector().width(), 64u);
    EXPECT_EQ(v->toVector().toInt64(), -3);
    EXPECT_EQ(v->toText().str(), "\t");
    EXPECT_EQ(v->width(), 64u);
    EXPECT_TRUE(v->isSigned());
    EXPECT_TRUE(v->isReal());
    EXPECT_FALSE(v->isInteger() || v->isVector() || v->hasUnknown());
    EXPECT_EQ(v->toBaseText().str(), "-2.500000");
    EXPECT_EQ(v->toDecimalText().str(), "-3");
    EXPECT_EQ(real(3.0)->toHexText().str(), "0000000000000003");
    EXPECT_EQ(real(3.0)->toOctalText().str(), "0000000000000000000003");
    EXPECT_EQ(real(3.0)->toBinaryText().str(), std::string(62, '0') + "11");
}

TEST(ValueSlots, NullValue) {
    P v = null();
    EXPECT_FALSE(v->toBool());
    EXPECT_EQ(v->toInt(), 0);
    EXPECT_DOUBLE_EQ(v->toReal(), 0.0);
    EXPECT_EQ(v->toVector().width(), 1u);
    EXPECT_TRUE(v->toVector().isAllX());
    EXPECT_EQ(v->width(), 0u);
    EXPECT_FALSE(v->isSigned());
    EXPECT_TRUE(v->isNull());
    EXPECT_FALSE(v->isInteger() || v->isReal() || v->isVector());
    EXPECT_TRUE(v->toText().IsEmpty());
    EXPECT_TRUE(v->toBaseText().IsEmpty());
    EXPECT_TRUE(v->toDecimalText().IsEmpty());
    EXPECT_TRUE(v->toBinaryText().IsEmpty());
    EXPECT_TRUE(v->toOctalText().IsEmpty());
    EXPECT_TRUE(v->toHexText().IsEmpty());
}

TEST(ValueSlots, VectorValue) {
    P v = vector("12'sh4x1");
    EXPECT_FALSE(vector("4'b0x00")->toBool());
    EXPECT_TRUE(v->toBool());
    EXPECT_EQ(v->toInt(), 0);  // unknown bits
    EXPECT_EQ(vector("12'sh841")->toInt(), -1983);
    EXPECT_EQ(v->width(), 12u);
    EXPECT_TRUE(v->hasUnknown());
    EXPECT_TRUE(v->isSigned());
    EXPECT_TRUE(v->isVector());
    EXPECT_TRUE(v->isHex());
    EXPECT_FALSE(v->isBinary() || v->isDecimal() || v->isOctal() || v->isString());
    EXPECT_TRUE(vector("3'o7")->isOctal());
    EXPECT_TRUE(vector("3'd7")->isDecimal());
    EXPECT_TRUE(vector("3'b1")->isBinary());
    EXPECT_TRUE(V::createVector(Tn_VerilogVector(Tn_Verilog::String, false, 0, "hi"))->isString());
    EXPECT_EQ(v->toBaseText().str(), "4x1");
    EXPECT_EQ(v->toDecimalText().str(), "X");
    EXPECT_EQ(v->toText().str(), std::string("\x04", 1) + "\xf1");
    EXPECT_EQ(V::createVector(Tn_VerilogVector(Tn_Verilog::String, false, 0, "hi"))->toText().str(), "hi");
    EXPECT_EQ(v->describe().str(), "based constant 12'sh4x1");
    ASSERT_NE(v->vector(), nullptr);
    EXPECT_EQ(*v->vector(), vec("12'sh4x1"));
}

TEST(ValueOperators, TablesFollowThePersistentOperatorNumbers) {
    // 6 op 3 with integer operands, one distinguishing result per operator.
    const int32_t binary[] = {1, 1, 7, 5, -6, 2, 0, 1, 0, 1, 0, 0, 1, 1, 48, 0, 48, 0, 9, 3, 18, 2, 0, 216};
    for (uint32_t op = 0; op < 24; ++op) {
        V::BinaryOperation f = V::binaryOperation(op);
        ASSERT_NE(f, nullptr) << op;
        EXPECT_EQ(f(integer(6), integer(3), self)->toInt(), binary[op]) << op;
    }
    EXPECT_EQ(V::binaryOperation(24), nullptr);
    const int32_t unary[] = {6, -6, 0, -7, 0, 1, 0, 1, 1, 0};
    for (uint32_t op = 0; op < 10; ++op) {
        V::UnaryOperation f = V::unaryOperation(op);
        ASSERT_NE(f, nullptr) << op;
        EXPECT_EQ(f(integer(6), self)->toInt(), unary[op]) << op;
    }
    EXPECT_EQ(V::unaryOperation(10), nullptr);
}

TEST(ValueOperators, NullOperandGivesNull) {
    for (uint32_t op = 0; op < 24; ++op) {
        EXPECT_TRUE(V::binaryOperation(op)(null(), integer(1), self)->isNull()) << op;
        EXPECT_TRUE(V::binaryOperation(op)(real(1.0), null(), self)->isNull()) << op;
        EXPECT_TRUE(V::binaryOperation(op)(P(), vector("1'b1"), self)->isNull()) << op;
    }
    for (uint32_t op = 0; op < 10; ++op) EXPECT_TRUE(V::unaryOperation(op)(null(), self)->isNull()) << op;
    EXPECT_TRUE(V::merge(null(), integer(1), self)->isNull());
    EXPECT_TRUE(V::concatenation({vector("1'b1"), null()}, self)->isNull());
    EXPECT_FALSE(V::caseXEqual(null(), null()));
}

TEST(ValueOperators, RealOperands) {
    P sum = V::addition(real(1.5), integer(2), context(false, 100));
    ASSERT_TRUE(sum->isReal());
    EXPECT_DOUBLE_EQ(sum->toReal(), 3.5);  // reals are not fitted
    EXPECT_DOUBLE_EQ(V::subtraction(vector("4'd1"), real(0.25), self)->toReal(), 0.75);
    EXPECT_DOUBLE_EQ(V::multiplication(real(1.5), real(-2), self)->toReal(), -3.0);
    EXPECT_TRUE(std::isinf(V::division(real(1.0), integer(0), self)->toReal()));
    EXPECT_DOUBLE_EQ(V::exponentiation(real(2.0), real(0.5), self)->toReal(), std::sqrt(2.0));
    EXPECT_DOUBLE_EQ(V::addition(real(1.0), vector("4'b1x"), self)->toReal(), 1.0);  // x converts to 0.0

    P lt = V::lessThan(real(2.0), integer(3), self);
    EXPECT_TRUE(lt->isVector());
    EXPECT_EQ(bin(lt), "1");
    EXPECT_EQ(bin(V::greaterEqual(real(2.0), integer(3), self)), "0");
    EXPECT_EQ(bin(V::equal(real(3.0), integer(3), self)), "1");
    EXPECT_EQ(bin(V::caseNotEqual(real(3.0), integer(3), self)), "0");
    EXPECT_EQ(bin(V::logicalAnd(real(0.0), integer(1), self)), "0");
    EXPECT_EQ(bin(V::logicalOr(real(0.5), integer(0), self)), "1");
    EXPECT_EQ(bin(V::equal(real(3.0), integer(3), context(false, 4))), "0001");

    EXPECT_TRUE(V::modulus(real(7.0), integer(2), self)->isNull());
    EXPECT_TRUE(V::bitwiseAnd(real(1.0), integer(1), self)->isNull());
    EXPECT_TRUE(V::leftShift(integer(1), real(1.0), self)->isNull());
    EXPECT_TRUE(V::arithRightShift(real(8.0), integer(1), self)->isNull());

    EXPECT_DOUBLE_EQ(V::negation(real(1.5), self)->toReal(), -1.5);
    EXPECT_EQ(bin(V::logicalNegation(real(0.0), self)), "1");
    EXPECT_EQ(bin(V::logicalNegation(real(0.1), self)), "0");
    EXPECT_TRUE(V::bitwiseNegation(real(1.0), self)->isNull());
    EXPECT_TRUE(V::reductionOr(real(1.0), self)->isNull());
    EXPECT_DOUBLE_EQ(V::identity(real(1.5), context(false, 8))->toReal(), 1.5);
}

TEST(ValueOperators, IntegerOperandsStayIntegers) {
    P p = V::addition(integer(std::numeric_limits<int32_t>::max()), integer(1), self);
    ASSERT_TRUE(p->isInteger());
    EXPECT_EQ(p->toInt(), std::numeric_limits<int32_t>::min());
    EXPECT_EQ(V::multiplication(integer(65536), integer(65536), self)->toInt(), 0);
    EXPECT_EQ(V::subtraction(integer(std::numeric_limits<int32_t>::min()), integer(1), self)->toInt(),
              std::numeric_limits<int32_t>::max());
    EXPECT_EQ(V::division(integer(-7), integer(2), self)->toInt(), -3);
    EXPECT_EQ(V::modulus(integer(-7), integer(2), self)->toInt(), -1);
    EXPECT_EQ(V::modulus(integer(7), integer(-2), self)->toInt(), 1);
    // The most negative integer by -1 wraps: quotient itself, remainder 0.
    P q = V::division(integer(std::numeric_limits<int32_t>::min()), integer(-1), self);
    ASSERT_TRUE(q->isInteger());
    EXPECT_EQ(q->toInt(), std::numeric_limits<int32_t>::min());
    EXPECT_EQ(V::modulus(integer(std::numeric_limits<int32_t>::min()), integer(-1), self)->toInt(), 0);
    // A zero divisor gives 32 unsigned x bits.
    for (P z : {V::division(integer(1), integer(0), self), V::modulus(integer(1), integer(0), self)}) {
        ASSERT_TRUE(z->isVector());
        EXPECT_EQ(z->width(), 32u);
        EXPECT_FALSE(z->isSigned());
        EXPECT_TRUE(z->vector()->isAllX());
    }
    EXPECT_TRUE(V::division(vector("4'd1"), vector("4'd0"), self)->vector()->isAllX());
    EXPECT_EQ(V::division(vector("4'd1"), vector("4'd0"), self)->width(), 4u);

    EXPECT_EQ(V::leftShift(integer(1), integer(31), self)->toInt(), std::numeric_limits<int32_t>::min());
    EXPECT_EQ(V::leftShift(integer(1), integer(32), self)->toInt(), 0);
    EXPECT_EQ(V::leftShift(integer(1), integer(-1), self)->toInt(), 0);  // count taken unsigned
    EXPECT_EQ(V::arithLeftShift(integer(3), integer(0), self)->toInt(), 3);
    EXPECT_EQ(V::rightShift(integer(-8), integer(1), self)->toInt(), 0x7FFFFFFC);
    EXPECT_EQ(V::arithRightShift(integer(-8), integer(1), self)->toInt(), -4);
    EXPECT_EQ(V::arithRightShift(integer(-8), integer(0), self)->toInt(), -8);
    EXPECT_EQ(V::arithRightShift(integer(-8), integer(40), self)->toInt(), -1);
    EXPECT_EQ(V::arithRightShift(integer(8), integer(40), self)->toInt(), 0);
    EXPECT_EQ(V::rightShift(integer(-8), integer(32), self)->toInt(), 0);
    EXPECT_TRUE(V::bitwiseXnor(integer(6), integer(3), self)->isInteger());
    EXPECT_EQ(V::negation(integer(std::numeric_limits<int32_t>::min()), self)->toInt(),
              std::numeric_limits<int32_t>::min());
    EXPECT_TRUE(V::bitwiseNegation(integer(0), self)->isInteger());

    // Comparisons, **, logical operators and reductions take the vector path.
    P eq = V::equal(integer(2), integer(2), self);
    EXPECT_TRUE(eq->isVector());
    EXPECT_EQ(eq->width(), 1u);
    EXPECT_TRUE(V::exponentiation(integer(2), integer(10), self)->isVector());
    EXPECT_EQ(V::exponentiation(integer(2), integer(10), self)->toInt(), 1024);
    EXPECT_TRUE(V::exponentiation(integer(2), integer(-1), self)->vector()->isAllX());
    EXPECT_EQ(V::exponentiation(integer(-2), integer(3), self)->toInt(), -8);
    EXPECT_EQ(V::exponentiation(integer(0), integer(0), self)->toInt(), 1);
    EXPECT_EQ(V::exponentiation(integer(0), integer(5), self)->toInt(), 0);
    EXPECT_EQ(V::exponentiation(integer(-1), integer(5), self)->toInt(), -1);
    EXPECT_EQ(bin(V::lessThan(integer(-1), integer(0), self)), "1");
    EXPECT_EQ(bin(V::lessThan(integer(-1), vector("1'b0"), self)), "0");  // mixed: unsigned
    EXPECT_TRUE(V::logicalAnd(integer(2), integer(3), self)->isVector());
    EXPECT_EQ(bin(V::reductionXor(integer(7), self)), "1");
}

TEST(ValueOperators, VectorShiftCounts) {
    P l = vector("8'sb1001_0110");
    P x = V::leftShift(l, vector("4'b1x"), self);
    EXPECT_EQ(x->width(), 8u);
    EXPECT_TRUE(x->isSigned());
    EXPECT_TRUE(x->vector()->isAllX());
    EXPECT_TRUE(V::arithRightShift(integer(8), vector("4'bz"), self)->vector()->isAllX());
    EXPECT_EQ(V::arithRightShift(integer(8), vector("4'bz"), self)->width(), 32u);
    EXPECT_EQ(bin(V::arithRightShift(l, integer(2), self)), "11100101");
    EXPECT_EQ(bin(V::rightShift(l, integer(2), self)), "00100101");
    EXPECT_EQ(bin(V::leftShift(l, integer(-1), self)), "00000000");
    // A count is its whole unsigned value: high words and a signed count's top bit count.
    EXPECT_EQ(bin(V::leftShift(vector("40'h1"), vector("33'h1_0000_0000"), self)), std::string(40, '0'));
    EXPECT_EQ(V::leftShift(vector("40'h1"), vector("4'sb1111"), self)->vector()->toInt64(), 1 << 15);
    EXPECT_EQ(V::leftShift(vector("40'h1"), vector("100'd35"), self)->vector()->toInt64(), int64_t(1) << 35);
    EXPECT_EQ(bin(V::leftShift(vector("4'b1011"), integer(0), self)), "1011");
}

TEST(ValueFitting, ContextSignAndWidth) {
    // Self-determined integers stay integers; an unsigned or wider context makes a vector.
    P i = integer(-1);
    EXPECT_EQ(V::fit(i, self), i);
    EXPECT_EQ(V::fit(i, context(true, 32)), i);
    P u = V::fit(i, context(false, 0));
    EXPECT_TRUE(u->isVector());
    EXPECT_FALSE(u->isSigned());
    EXPECT_EQ(u->width(), 32u);
    P w = V::fit(i, context(true, 40));
    EXPECT_EQ(w->vector()->toHexText().str(), "ffffffffff");
    EXPECT_EQ(V::fit(i, context(false, 40))->vector()->toHexText().str(), "00ffffffff");
    // Never narrowed.
    P v = vector("8'sh80");
    EXPECT_EQ(V::fit(v, context(true, 4)), v);
    EXPECT_EQ(V::fit(v, context(true, 16))->toHexText().str(), "ff80");
    EXPECT_EQ(V::fit(v, context(false, 16))->toHexText().str(), "0080");
    P uv = V::fit(v, context(false, 8));
    EXPECT_FALSE(uv->isSigned());
    EXPECT_EQ(uv->width(), 8u);
    P unsignedVec = vector("8'h80");
    EXPECT_EQ(V::fit(unsignedVec, context(true, 16))->toHexText().str(), "0080");  // stays unsigned
    EXPECT_TRUE(V::fit(null(), context(true, 16))->isNull());
    EXPECT_EQ(V::identity(vector("4'b1x01"), context(false, 6))->toBinaryText().str(), "001x01");
    EXPECT_TRUE(V::identity(P(), self)->isNull());

    // In a 16-bit context a == b is a 1-bit result widened to 16 bits.
    EXPECT_EQ(bin(V::equal(vector("4'd3"), vector("4'd3"), context(true, 16))), "0000000000000001");
    // 8'sd3 + 4'd1: one operand unsigned, so the sum is unsigned, 8 bits.
    P sum = V::addition(vector("8'sd3"), vector("4'd1"), self);
    EXPECT_FALSE(sum->isSigned());
    EXPECT_EQ(sum->width(), 8u);
    EXPECT_EQ(sum->toInt(), 4);
    // A signed result in an unsigned context is re-signed, then widened with zeros.
    P neg = V::negation(vector("4'sd1"), context(false, 8));
    EXPECT_FALSE(neg->isSigned());
    EXPECT_EQ(bin(neg), "00001111");
}

TEST(ValueOperators, MergeConcatenationAndCaseCompares) {
    EXPECT_EQ(bin(V::merge(vector("4'b1100"), vector("4'b1010"), self)), "1xx0");
    EXPECT_EQ(bin(V::merge(integer(5), integer(5), context(false, 34))), std::string(31, '0') + "101");
    EXPECT_DOUBLE_EQ(V::merge(real(1.5), real(1.5), self)->toReal(), 1.5);
    EXPECT_DOUBLE_EQ(V::merge(real(1.5), integer(2), self)->toReal(), 0.0);

    P c = V::concatenation({vector("2'sb10"), vector("3'b1x0"), integer(1)}, self);
    EXPECT_EQ(c->width(), 37u);
    EXPECT_FALSE(c->isSigned());
    EXPECT_EQ(c->toBinaryText().str().substr(0, 6), "101x00");
    EXPECT_EQ(bin(V::concatenation({vector("4'sb1000")}, context(true, 6))), "001000");
    EXPECT_TRUE(V::concatenation({vector("1'b1"), real(1.0)}, self)->isNull());
    EXPECT_TRUE(V::concatenation({}, self)->isNull());

    EXPECT_TRUE(V::caseZEqual(vector("4'b1z01"), vector("4'b1101")));
    EXPECT_FALSE(V::caseZEqual(vector("4'b1x01"), vector("4'b1101")));
    EXPECT_TRUE(V::caseXEqual(vector("4'b1x01"), vector("4'b1101")));
    EXPECT_TRUE(V::caseXEqual(integer(3), vector("2'b11")));
    EXPECT_TRUE(V::caseZEqual(real(2.0), integer(2)));
}
