// Four-state vectors: construction, resizing, every operator family with
// unknown bits, shifts, division and power corner cases, text forms.
#include <gtest/gtest.h>

#include <cmath>
#include <limits>

#include "tests/support/valueliteral.h"
#include "verilog/tn_verilogvector.h"

namespace {

typedef Tn_VerilogVector Vec;

std::string bin(const Vec& v) { return v.toBinaryText().str(); }
std::string hex(const Vec& v) { return v.toHexText().str(); }
std::string bin(const std::string& literal) { return bin(vec(literal)); }

}  // namespace

TEST(VectorWord, LogicTablesOnEveryCodePair) {
    // Codes 0, 1, z, x in bits 0..3 of one operand against each code of the other.
    const uint32_t a = 0x2 | 0x8, b = 0x4 | 0x8;  // bits: 0, 1, z, x
    Tn_VerilogVectorWord w(4, a, b);
    const char* andRows[] = {"0000", "xx10", "xxx0", "xxx0"};  // per other code, printed bit 3..0
    const char* orRows[] = {"xx10", "1111", "xx1x", "xx1x"};
    const char* xorRows[] = {"xx10", "xx01", "xxxx", "xxxx"};
    for (unsigned code = 0; code < 4; ++code) {
        Tn_VerilogVectorWord o(4, (code & 1) ? 0xF : 0, (code & 2) ? 0xF : 0);
        auto text = [](const Tn_VerilogVectorWord& r) {
            std::string s;
            for (int i = 3; i >= 0; --i) s += "01zx"[r.bit(static_cast<uint32_t>(i))];
            return s;
        };
        EXPECT_EQ(text(Tn_VerilogVectorWord::bitAnd(w, o)), andRows[code]) << code;
        EXPECT_EQ(text(Tn_VerilogVectorWord::bitAnd(o, w)), andRows[code]) << code;
        EXPECT_EQ(text(Tn_VerilogVectorWord::bitOr(w, o)), orRows[code]) << code;
        EXPECT_EQ(text(Tn_VerilogVectorWord::bitXor(w, o)), xorRows[code]) << code;
    }
    EXPECT_EQ(w.bitNot().bit(2), 3u);  // z becomes x
    EXPECT_EQ(w.bit(32), 3u);          // beyond the word reads x
    EXPECT_EQ(w.debugText().str(), "[size=4,aval=0000000a,bval=0000000c]");
    EXPECT_EQ(Tn_VerilogVectorWord(5, 0xFF, 0xFF).aval(), 0x1Fu);  // bits above size dropped
}

TEST(VectorWord, AddWithCarryKeepsBitsBelowTheLowestUnknown) {
    unsigned carry = 0;
    Tn_VerilogVectorWord s = Tn_VerilogVectorWord::addWithCarry(Tn_VerilogVectorWord(32, 0xFFFFFFFF, 0),
                                                                Tn_VerilogVectorWord(32, 1, 0), carry);
    EXPECT_EQ(s.aval(), 0u);
    EXPECT_EQ(carry, 1u);
    carry = 0;
    s = Tn_VerilogVectorWord::addWithCarry(Tn_VerilogVectorWord(32, 0x3, 0x10), Tn_VerilogVectorWord(32, 0x1, 0),
                                           carry);
    EXPECT_EQ(s.aval() & 0xF, 0x4u);
    EXPECT_EQ(s.bval(), 0xFFFFFFF0u);
    EXPECT_EQ(carry, 3u);
    s = Tn_VerilogVectorWord::addWithCarry(Tn_VerilogVectorWord(32, 0, 0), Tn_VerilogVectorWord(32, 0, 0), carry);
    EXPECT_EQ(s.bval(), 0xFFFFFFFFu);  // unknown carry in: all x
}

TEST(VectorConstruction, WidthBoundsAndIntegers) {
    Vec x(true, 0u);
    EXPECT_TRUE(x.isUnsized());
    EXPECT_EQ(x.width(), 32u);
    EXPECT_TRUE(x.isAllX());
    EXPECT_EQ(Vec().width(), 1u);
    EXPECT_TRUE(Vec().isAllX());

    Vec down(false, 3, 10);
    EXPECT_EQ(down.width(), 8u);
    EXPECT_EQ(down.msb(), 3);
    EXPECT_EQ(down.lsb(), 10);
    uint32_t off = 99;
    EXPECT_TRUE(down.offsetOf(10, off));
    EXPECT_EQ(off, 0u);
    EXPECT_TRUE(down.offsetOf(3, off));
    EXPECT_EQ(off, 7u);
    EXPECT_FALSE(down.offsetOf(2, off));
    EXPECT_EQ(Vec(false, -4, 4).width(), 9u);

    Vec i(-2);
    EXPECT_EQ(i.width(), 32u);
    EXPECT_TRUE(i.isSigned());
    EXPECT_EQ(i.base(), Tn_Verilog::Decimal);
    EXPECT_EQ(hex(i), "fffffffe");
    EXPECT_EQ(i.toInt(), -2);
    EXPECT_EQ(Vec(std::numeric_limits<int32_t>::min()).toDecimalText().str(), "-2147483648");
}

TEST(VectorConstruction, BasedDigitsExpandAndExtend) {
    EXPECT_EQ(bin("8'b1010"), "00001010");
    EXPECT_EQ(bin("8'bx"), "xxxxxxxx");      // a leading x extends itself
    EXPECT_EQ(bin("8'bz1"), "zzzzzzz1");
    EXPECT_EQ(bin("8'b?"), "zzzzzzzz");
    EXPECT_EQ(bin("6'o7x"), "111xxx");
    EXPECT_EQ(bin(vec("10'hzA")), "zzzzzz1010");
    EXPECT_EQ(bin("4'hAB"), "1011");         // excess high digits dropped
    EXPECT_EQ(bin("5'o77"), "11111");
    EXPECT_EQ(bin("12'h_F_0"), "000011110000");
    Vec u = vec("'hx");
    EXPECT_TRUE(u.isUnsized());
    EXPECT_TRUE(u.isAllX());
    EXPECT_EQ(u.width(), 32u);
    EXPECT_EQ(vec("'h1_0000_0001").toDecimalText().str(), "1");  // unsized is 32 bits
    EXPECT_EQ(vec("3'sb101").toInt(), -3);
    EXPECT_EQ(vec("70'h3f_ffff_ffff_ffff_ffff").toHexText().str(), "3fffffffffffffffff");
}

TEST(VectorConstruction, DecimalTextFollowsTheShiftAndAddAlgorithm) {
    EXPECT_EQ(vec("8'd300").toDecimalText().str(), "44");  // wraps in the width
    EXPECT_EQ(vec("-8'sd5").toDecimalText().str(), "-5");
    EXPECT_EQ(hex(vec("-8'd5")), "fb");
    EXPECT_TRUE(vec("8'dx").isAllX());
    EXPECT_TRUE(vec("8'dX5").isAllX());
    EXPECT_TRUE(vec("'dz").isAllZ());
    EXPECT_TRUE(vec("'d?").isAllZ());
    EXPECT_TRUE(vec("-8'dz").isAllX());  // negating z gives x
    EXPECT_EQ(vec("4'd1a2").toDecimalText().str(), "6");  // 1*100 + 0*10 + 2 = 102 mod 16
    EXPECT_EQ(vec("'d4294967297").toDecimalText().str(), "1");
    EXPECT_EQ(vec("100'd1267650600228229401496703205375").toDecimalText().str(),
              "1267650600228229401496703205375");  // 2^100 - 1
    EXPECT_EQ(vec("100'd1267650600228229401496703205376").toDecimalText().str(), "0");
    EXPECT_EQ(vec("-100'sd1").toHexText().str(), "fffffffffffffffffffffffff");
}

TEST(VectorConstruction, StringsAndReals) {
    Vec s(Tn_Verilog::String, false, 0, "AB");
    EXPECT_EQ(s.width(), 16u);
    EXPECT_EQ(hex(s), "4142");
    EXPECT_EQ(s.toCharText().str(), "AB");
    EXPECT_EQ(s.toBaseText().str(), "AB");
    EXPECT_EQ(s.describe().str(), "string constant \"AB\"");
    EXPECT_EQ(Vec(Tn_Verilog::String, false, 0, "").width(), 8u);
    EXPECT_EQ(hex(Vec(Tn_Verilog::String, false, 12, "ABC")), "243");  // low 12 bits kept

    EXPECT_EQ(Vec(2.5).toInt64(), 3);
    EXPECT_EQ(Vec(-2.5).toInt64(), -3);
    EXPECT_EQ(Vec(2.49).toInt64(), 2);
    EXPECT_EQ(Vec(0.49999999999999994).toInt64(), 0);
    EXPECT_EQ(Vec(-9.2233720368547758e18).toInt64(), std::numeric_limits<int64_t>::min());
    EXPECT_EQ(Vec(18446744073709551616.0 + 8192.0).toInt64(), 8192);  // wraps modulo 2^64
    EXPECT_EQ(Vec(-1e30).toInt64(), Vec(1e30).negate().toInt64());
    EXPECT_TRUE(Vec(std::nan("")).isAllX());
    EXPECT_TRUE(Vec(HUGE_VAL).isAllX());
    EXPECT_EQ(Vec(1.0).width(), 64u);
}

TEST(VectorValueSemantics, CopiesAreIndependentAndCompareByEveryField) {
    Vec wide = vec("200'h1");
    Vec copy = wide;
    EXPECT_EQ(copy, wide);
    copy.setBit(100, 1);
    EXPECT_NE(copy, wide);
    Vec moved = std::move(copy);
    EXPECT_EQ(moved.bit(100), 1u);
    EXPECT_EQ(copy.width(), 1u);  // moved-from is a valid one-bit x
    EXPECT_EQ(bin(copy.bitOr(vec("2'b00"))), "0x");
    copy = moved;
    EXPECT_EQ(copy, moved);
    copy = copy;
    EXPECT_EQ(copy, moved);
    Vec narrow = vec("8'h1");
    narrow = wide;
    EXPECT_EQ(narrow, wide);
    EXPECT_NE(vec("8'h1"), vec("8'sh1"));
    EXPECT_NE(vec("8'h1"), vec("8'd1"));  // base differs
    Vec b = vec("8'h1");
    EXPECT_TRUE(b.setBounds(0, 7));
    EXPECT_FALSE(b.setBounds(0, 8));
    EXPECT_NE(b, vec("8'h1"));
    EXPECT_EQ(b.word(0).debugText().str(), "[size=8,aval=00000001,bval=00000000]");
    EXPECT_EQ(vec("40'hx").debugText().str(),
              "[size=32,aval=ffffffff,bval=ffffffff][size=8,aval=000000ff,bval=000000ff]");
}

TEST(VectorResize, FillRulesBySignAndSize) {
    EXPECT_EQ(hex(vec("8'sb1000_0000").resized(16)), "ff80");
    EXPECT_EQ(hex(vec("8'b1000_0000").resized(16)), "0080");
    EXPECT_TRUE(vec("'bx").resized(64).isAllX());
    EXPECT_EQ(bin(vec("4'bx").resized(8)), "0000xxxx");
    EXPECT_EQ(bin(vec("4'sbz").resized(8)), "zzzzzzzz");
    EXPECT_EQ(bin(vec("'bz").resized(40)), std::string(40, 'z'));
    EXPECT_EQ(bin(vec("4'sb0111").resized(6)), "000111");
    EXPECT_EQ(bin(vec("8'sb1111_0101").resized(4)), "0101");  // narrowing keeps low bits
    // Resizing with a sign first sets the sign.
    EXPECT_EQ(hex(vec("8'sh80").resized(false, 16)), "0080");
    EXPECT_EQ(hex(vec("8'h80").resized(true, 16)), "ff80");
    // lsb stays, msb moves with the direction.
    Vec up(false, 7, 0), down(false, 0, 7);
    EXPECT_EQ(up.resized(16).msb(), 15);
    EXPECT_EQ(down.resized(16).msb(), -8);
    EXPECT_EQ(down.resized(16).lsb(), 7);
    EXPECT_EQ(vec("40'sh80_0000_0000").resized(100).toHexText().str(), "fffffffffffffff8000000000");
}

TEST(VectorOperators, ResultWidthSignAndBase) {
    Vec r = vec("8'sd3").add(vec("4'd1"));
    EXPECT_EQ(r.width(), 8u);
    EXPECT_FALSE(r.isSigned());
    EXPECT_EQ(r.base(), Tn_Verilog::Decimal);
    EXPECT_TRUE(vec("8'sd3").add(vec("4'sd1")).isSigned());
    EXPECT_EQ(vec("8'hff").add(vec("4'd1")).base(), Tn_Verilog::Binary);  // bases differ
    EXPECT_EQ(vec("4'hf").bitAnd(vec("4'h1")).base(), Tn_Verilog::Hex);
    Vec s(Tn_Verilog::String, false, 0, "A");
    EXPECT_EQ(s.bitOr(s).base(), Tn_Verilog::Binary);
    EXPECT_EQ(vec("4'hf").bitNot().base(), Tn_Verilog::Hex);
    EXPECT_EQ(vec("4'hf").equal(vec("4'hf")).base(), Tn_Verilog::Binary);
    EXPECT_EQ(vec("8'sd3").shiftRight(1).base(), Tn_Verilog::Decimal);
    EXPECT_TRUE(vec("8'sd3").arithShiftRight(1).isSigned());
    EXPECT_TRUE(vec("'d3").add(vec("'d4")).isUnsized());
    EXPECT_FALSE(vec("'d3").add(vec("4'd4")).isUnsized());
    // Mixed signed/unsigned: the signed operand is extended as unsigned.
    EXPECT_EQ(hex(vec("4'sb1111").add(vec("8'd0"))), "0f");
    EXPECT_EQ(hex(vec("4'sb1111").add(vec("8'sd0"))), "ff");
    // Unsized x extends even into an unsigned operation; a sized one does not.
    EXPECT_EQ(bin(vec("'bx").bitOr(vec("40'b0")).slice(32, 8)), "xxxxxxxx");
    EXPECT_EQ(bin(vec("4'bx").bitOr(vec("8'b0"))), "0000xxxx");
}

TEST(VectorOperators, BitwiseAndMerge) {
    EXPECT_EQ(bin(vec("4'b01xz").bitAnd(vec("4'b1111"))), "01xx");
    EXPECT_EQ(bin(vec("4'b01xz").bitAnd(vec("4'b0000"))), "0000");
    EXPECT_EQ(bin(vec("4'b01xz").bitOr(vec("4'b1111"))), "1111");
    EXPECT_EQ(bin(vec("4'b01xz").bitXor(vec("4'b1010"))), "11xx");
    EXPECT_EQ(bin(vec("4'b01xz").bitXnor(vec("4'b1010"))), "00xx");
    EXPECT_EQ(bin(vec("4'b01xz").bitNot()), "10xx");
    EXPECT_EQ(bin(vec("6'b0101zx").merge(vec("6'b0110zx"))), "01xxxx");
    EXPECT_EQ(bin(vec("70'h0").bitNot().slice(66, 4)), "1111");
    EXPECT_EQ(vec("70'h0").bitNot().word(2).aval(), 0x3Fu);  // bits above the width stay 0
}

TEST(VectorOperators, AdditionAndSubtractionWithUnknownBits) {
    EXPECT_EQ(bin(vec("4'b10x1").add(vec("4'b0001"))), "xxx0");
    EXPECT_EQ(bin(vec("4'b1111").add(vec("4'b0001"))), "0000");
    EXPECT_EQ(bin(vec("8'b0000_0z00").subtract(vec("8'd1"))), "xxxxxx11");
    EXPECT_EQ(bin(vec("4'd3").subtract(vec("4'd5"))), "1110");
    EXPECT_EQ(hex(vec("96'hffffffff_ffffffff").add(vec("96'h1"))), "000000010000000000000000");
    EXPECT_EQ(hex(vec("96'h1_00000000_00000000").subtract(vec("96'h1"))), "00000000ffffffffffffffff");
    Vec unknownHigh = vec("96'h0");
    unknownHigh.setBit(40, 3);
    EXPECT_EQ(bin(unknownHigh.add(vec("96'h3"))).substr(96 - 41), "x" + std::string(38, '0') + "11");
    EXPECT_TRUE(vec("96'h0").add(vec("96'hx")).isAllX());
    EXPECT_EQ(bin(vec("4'b00x0").negate()), "xxx0");
    EXPECT_EQ(vec("8'sd5").negate().toInt(), -5);
    EXPECT_EQ(vec("8'sh80").negate().toInt(), -128);
    EXPECT_TRUE(vec("8'sd5").negate().isSigned());
}

TEST(VectorOperators, MultiplicationDivisionModulus) {
    EXPECT_TRUE(vec("8'd3").multiply(vec("8'b1x")).isAllX());
    EXPECT_EQ(vec("8'd0").multiply(vec("8'd7")).toInt(), 0);
    EXPECT_EQ(vec("8'sd-3").multiply(vec("8'sd5")).toInt(), -15);
    EXPECT_EQ(vec("8'd200").multiply(vec("8'd2")).toInt(), 144);  // truncated to the width
    EXPECT_EQ(vec("40'sd-3").multiply(vec("40'sd1000000000000")).toInt64() & ((int64_t(1) << 40) - 1),
              (-3000000000000LL) & ((int64_t(1) << 40) - 1));
    EXPECT_EQ(vec("100'sd-7").multiply(vec("100'sd3")).toDecimalText().str(), "-21");
    EXPECT_EQ(vec("200'd18446744073709551615").multiply(vec("200'd18446744073709551615")).toDecimalText().str(),
              "340282366920938463426481119284349108225");

    EXPECT_TRUE(vec("4'd1").divide(vec("4'd0")).isAllX());
    EXPECT_EQ(vec("4'd1").divide(vec("4'd0")).width(), 4u);
    EXPECT_TRUE(vec("4'd1").modulus(vec("4'd0")).isAllX());
    EXPECT_TRUE(vec("4'd1").divide(vec("4'bz")).isAllX());
    EXPECT_TRUE(vec("4'bx").modulus(vec("4'd3")).isAllX());
    EXPECT_EQ(vec("8'sd-7").divide(vec("8'sd2")).toInt(), -3);   // toward zero
    EXPECT_EQ(vec("8'sd-7").modulus(vec("8'sd2")).toInt(), -1);  // sign of the dividend
    EXPECT_EQ(vec("8'sd7").modulus(vec("8'sd-2")).toInt(), 1);
    EXPECT_EQ(vec("8'sd-7").divide(vec("8'd2")).toInt(), 124);   // unsigned: 249 / 2
    // The most negative value by -1 wraps to itself, remainder 0.
    EXPECT_EQ(vec("8'sh80").divide(vec("8'sd-1")).toInt(), -128);
    EXPECT_EQ(vec("8'sh80").modulus(vec("8'sd-1")).toInt(), 0);
    EXPECT_EQ(vec("32'sh8000_0000").divide(vec("32'sd-1")).toInt(), std::numeric_limits<int32_t>::min());
    EXPECT_EQ(vec("64'sh8000_0000_0000_0000").divide(vec("64'sd-1")).toInt64(), std::numeric_limits<int64_t>::min());
    EXPECT_EQ(vec("64'sh8000_0000_0000_0000").modulus(vec("64'sd-1")).toInt64(), 0);
    EXPECT_EQ(hex(vec("100'sh8_0000_0000_0000_0000_0000_0000").divide(vec("100'sd-1"))), "8000000000000000000000000");
    // -2^63 in 100 bits by -1 is +2^63: the native path must not wrap it.
    EXPECT_EQ(vec("100'sd-9223372036854775808").divide(vec("100'sd-1")).toDecimalText().str(), "9223372036854775808");
    EXPECT_EQ(vec("200'd1").shiftLeft(150).divide(vec("200'd1").shiftLeft(149).add(vec("200'd1"))).toInt(), 1);
    EXPECT_EQ(vec("200'sd-1").shiftLeft(150).modulus(vec("200'sd7")).toDecimalText().str(), "-1");
}

TEST(VectorOperators, Power) {
    EXPECT_EQ(vec("8'd3").power(vec("8'd4")).toInt(), 81);
    EXPECT_EQ(vec("8'd3").power(vec("8'd5")).toInt(), 243);
    EXPECT_EQ(vec("8'd3").power(vec("8'd6")).toInt(), 729 % 256);
    EXPECT_EQ(vec("8'd0").power(vec("8'd0")).toInt(), 1);
    EXPECT_EQ(vec("8'd0").power(vec("8'd3")).toInt(), 0);
    EXPECT_EQ(vec("8'd5").power(vec("8'd0")).toInt(), 1);
    EXPECT_EQ(vec("8'sd-2").power(vec("8'd3")).toInt(), -8);
    EXPECT_TRUE(vec("8'sd-2").power(vec("8'd3")).isSigned());
    EXPECT_TRUE(vec("8'd2").power(vec("4'sb1111")).isAllX());  // negative signed exponent
    EXPECT_EQ(vec("8'd2").power(vec("4'b1111")).toInt(), 0);   // unsigned: 2^15 mod 256
    EXPECT_TRUE(vec("8'd2").power(vec("8'bx")).isAllX());
    EXPECT_TRUE(vec("8'bz").power(vec("8'd1")).isAllX());
    // The result takes the base's width; the exponent is not truncated to it.
    Vec p = vec("4'd2").power(vec("8'd16"));
    EXPECT_EQ(p.width(), 4u);
    EXPECT_EQ(p.toInt(), 0);
    EXPECT_EQ(vec("4'd3").power(vec("64'd1").shiftLeft(63)).toInt(), 1);  // 3^(2^63) mod 16
    EXPECT_EQ(vec("100'd10").power(vec("8'd20")).toDecimalText().str(), "100000000000000000000");
    EXPECT_EQ(vec("100'd2").power(vec("8'd100")).toInt(), 0);
    EXPECT_EQ(vec("100'd2").power(vec("8'd99")).toHexText().str(), "8000000000000000000000000");
    EXPECT_EQ(vec("100'd2").power(vec("200'd1").shiftLeft(150)).toInt(), 0);
}

TEST(VectorOperators, EqualityAndCaseCompares) {
    EXPECT_EQ(bin(vec("4'b1x00").equal(vec("4'b0x00"))), "0");
    EXPECT_EQ(bin(vec("4'b1x00").equal(vec("4'b1000"))), "x");
    EXPECT_EQ(bin(vec("4'b1x00").notEqual(vec("4'b1000"))), "x");
    EXPECT_EQ(bin(vec("4'b1x00").caseEqual(vec("4'b1x00"))), "1");
    EXPECT_EQ(bin(vec("4'b1x00").caseEqual(vec("4'b1z00"))), "0");
    EXPECT_EQ(bin(vec("4'b1x00").caseNotEqual(vec("4'b1000"))), "1");
    EXPECT_EQ(bin(vec("4'd5").equal(vec("8'd5"))), "1");
    EXPECT_EQ(bin(vec("4'sb1111").equal(vec("8'sd-1"))), "1");
    EXPECT_EQ(bin(vec("4'sb1111").equal(vec("8'd255"))), "0");  // unsigned compare zero-extends
    EXPECT_EQ(bin(vec("'bx").caseEqual(vec("40'bx"))), "1");  // unsized x extends
    EXPECT_EQ(bin(vec("4'bx").caseEqual(vec("8'bx"))), "0");
    Vec a = vec("100'h0"), b = vec("100'h0");
    a.setBit(99, 1);
    b.setBit(3, 3);
    EXPECT_EQ(bin(a.equal(b)), "0");  // a known difference in a high word wins over x
    EXPECT_EQ(bin(vec("100'h0").equal(b)), "x");

    EXPECT_TRUE(vec("4'b1z0x").caseZEqual(vec("4'b1100")) == false);
    EXPECT_TRUE(vec("4'b1z0x").caseZEqual(vec("4'b110x")));
    EXPECT_TRUE(vec("4'b1z01").caseZEqual(vec("4'bz0z1")));
    EXPECT_FALSE(vec("4'b1x01").caseZEqual(vec("4'b1001")));
    EXPECT_TRUE(vec("4'b1x01").caseXEqual(vec("4'b1001")));
    EXPECT_TRUE(vec("4'b1x01").caseXEqual(vec("4'bz1z1")));
    EXPECT_FALSE(vec("4'b1x01").caseXEqual(vec("4'b1x00")));
}

TEST(VectorOperators, RelationalAndLogical) {
    EXPECT_EQ(bin(vec("4'd3").lessThan(vec("4'd5"))), "1");
    EXPECT_EQ(bin(vec("4'd5").lessThan(vec("4'd5"))), "0");
    EXPECT_EQ(bin(vec("4'd5").lessEqual(vec("4'd5"))), "1");
    EXPECT_EQ(bin(vec("4'd5").greaterThan(vec("4'd3"))), "1");
    EXPECT_EQ(bin(vec("4'd3").greaterEqual(vec("4'd5"))), "0");
    EXPECT_EQ(bin(vec("4'sd-1").lessThan(vec("4'sd1"))), "1");
    EXPECT_EQ(bin(vec("4'sd-1").lessThan(vec("4'd1"))), "0");  // unsigned: 15 < 1
    EXPECT_EQ(bin(vec("8'sd-1").lessThan(vec("4'sd1"))), "1");
    EXPECT_EQ(bin(vec("4'b1x00").lessThan(vec("4'd15"))), "x");
    EXPECT_EQ(bin(vec("4'b1x00").greaterEqual(vec("4'd0"))), "x");
    EXPECT_EQ(bin(vec("100'sd-5").lessThan(vec("100'sd-4"))), "1");
    EXPECT_EQ(bin(vec("100'sd-5").greaterThan(vec("70'sd3"))), "0");
    EXPECT_EQ(bin(vec("100'd1").shiftLeft(99).greaterThan(vec("100'd5"))), "1");

    EXPECT_EQ(bin(vec("4'b0010").logicalAnd(vec("4'bx001"))), "1");
    EXPECT_EQ(bin(vec("4'b0010").logicalAnd(vec("4'b0x00"))), "x");
    EXPECT_EQ(bin(vec("4'b0000").logicalAnd(vec("4'bxxxx"))), "0");
    EXPECT_EQ(bin(vec("4'b0000").logicalOr(vec("4'b0x00"))), "x");
    EXPECT_EQ(bin(vec("4'b0000").logicalOr(vec("4'bz100"))), "1");
    EXPECT_EQ(bin(vec("4'b0000").logicalNot()), "1");
    EXPECT_EQ(bin(vec("4'b00x0").logicalNot()), "x");
    EXPECT_EQ(bin(vec("4'b01x0").logicalNot()), "0");
}

TEST(VectorOperators, Reductions) {
    struct Case {
        const char* v;
        const char *a, *o, *x;
    } cases[] = {
        {"4'b1111", "1", "1", "0"}, {"4'b0000", "0", "0", "0"}, {"4'b1101", "0", "1", "1"},
        {"4'b11x1", "x", "1", "x"}, {"4'b00z0", "0", "x", "x"}, {"4'b1z11", "x", "1", "x"},
    };
    for (const Case& c : cases) {
        Vec v = vec(c.v);
        EXPECT_EQ(bin(v.reduceAnd()), c.a) << c.v;
        EXPECT_EQ(bin(v.reduceOr()), c.o) << c.v;
        EXPECT_EQ(bin(v.reduceXor()), c.x) << c.v;
        EXPECT_EQ(bin(v.reduceNand()), bin(v.reduceAnd().bitNot())) << c.v;
        EXPECT_EQ(bin(v.reduceNor()), bin(v.reduceOr().bitNot())) << c.v;
        EXPECT_EQ(bin(v.reduceXnor()), bin(v.reduceXor().bitNot())) << c.v;
    }
    Vec wide = vec("100'h0").bitNot();
    EXPECT_EQ(bin(wide.reduceAnd()), "1");
    EXPECT_EQ(bin(wide.reduceXor()), "0");
    wide.setBit(64, 0);
    wide.setBit(3, 3);
    EXPECT_EQ(bin(wide.reduceAnd()), "0");  // a 0 anywhere beats x
    EXPECT_EQ(bin(wide.reduceXor()), "x");
    EXPECT_FALSE(vec("4'sd1").reduceOr().isSigned());
}

TEST(VectorOperators, Shifts) {
    Vec v = vec("8'sb1001_x01z");
    EXPECT_EQ(bin(v.shiftLeft(0)), "1001x01z");
    EXPECT_EQ(bin(v.shiftLeft(3)), "1x01z000");
    EXPECT_EQ(bin(v.arithShiftLeft(3)), "1x01z000");
    EXPECT_EQ(bin(v.shiftRight(3)), "0001001x");
    EXPECT_EQ(bin(v.arithShiftRight(3)), "1111001x");
    EXPECT_EQ(bin(v.shiftLeft(8)), "00000000");
    EXPECT_EQ(bin(v.shiftRight(8)), "00000000");
    EXPECT_EQ(bin(v.arithShiftRight(8)), "11111111");
    EXPECT_EQ(bin(v.arithShiftRight(0xFFFFFFFFu)), "11111111");
    EXPECT_EQ(bin(vec("8'b1001_0000").arithShiftRight(2)), "00100100");  // unsigned: zeros
    EXPECT_EQ(bin(vec("4'sbx010").arithShiftRight(2)), "xxx0");          // the msb repeats, x too
    EXPECT_TRUE(v.shiftLeft(3).isSigned());
    Vec w = vec("100'h1");
    EXPECT_EQ(w.shiftLeft(99).toHexText().str(), "8000000000000000000000000");
    EXPECT_EQ(w.shiftLeft(99).shiftRight(99).toInt(), 1);
    EXPECT_EQ(w.shiftLeft(64).shiftRight(32).toHexText().str(), "0000000000000000100000000");
    EXPECT_EQ(vec("100'sh8_0000_0000_0000_0000_0000_0000").arithShiftRight(68).toHexText().str(),
              "fffffffffffffffff80000000");
    EXPECT_TRUE(w.shiftLeft(100).isZero());
}

TEST(VectorRanges, ConcatAndSlice) {
    Vec c = vec("4'sb10x1").concat(vec("3'b01z"));
    EXPECT_EQ(bin(c), "10x101z");
    EXPECT_FALSE(c.isSigned());
    Vec wide = vec("40'hff_0000_0001").concat(vec("40'h80_0000_0000"));
    EXPECT_EQ(wide.width(), 80u);
    EXPECT_EQ(hex(wide), "ff000000018000000000");
    EXPECT_EQ(hex(wide.slice(36, 12)), "018");
    EXPECT_EQ(bin(vec("4'b1010").slice(2, 4)), "xx10");
}

TEST(VectorConversions, IntRealBool) {
    EXPECT_EQ(vec("4'sb1000").toInt(), -8);
    EXPECT_EQ(vec("4'b1000").toInt(), 8);
    EXPECT_EQ(vec("4'b1x00").toInt(), 0);
    EXPECT_EQ(vec("40'sh80_0000_0001").toInt(), 1);  // word 0 only
    EXPECT_EQ(vec("40'sh80_0000_0001").toInt64(), -549755813887LL);
    EXPECT_EQ(vec("40'h80_0000_0001").toInt64(), 549755813889LL);
    EXPECT_EQ(vec("40'h80_0000_0001").toCount(), 0xFFFFFFFFu);
    EXPECT_EQ(vec("4'sb1111").toCount(), 15u);
    EXPECT_FALSE(Vec(false, 1u).toBool());  // x as a condition is false
    EXPECT_FALSE(vec("4'b0x00").toBool());
    EXPECT_TRUE(vec("4'b0x10").toBool());
    EXPECT_DOUBLE_EQ(vec("8'sd-3").toReal(), -3.0);
    EXPECT_DOUBLE_EQ(vec("8'd253").toReal(), 253.0);
    EXPECT_DOUBLE_EQ(vec("8'b1x").toReal(), 0.0);
    EXPECT_DOUBLE_EQ(vec("64'hffff_ffff_ffff_ffff").toReal(), 18446744073709551615.0);
    EXPECT_DOUBLE_EQ(vec("100'd1").shiftLeft(99).toReal(), std::ldexp(1.0, 99));
    EXPECT_DOUBLE_EQ(vec("100'sd1").shiftLeft(99).toReal(), -std::ldexp(1.0, 99));
    // Rounds to nearest even exactly: 2^70 + 2^17 + 1 is just above a halfway point.
    Vec h = vec("100'd1").shiftLeft(70).add(vec("100'd1").shiftLeft(17)).add(vec("100'd1"));
    EXPECT_DOUBLE_EQ(h.toReal(), std::ldexp(1.0, 70) + std::ldexp(1.0, 18));
    EXPECT_TRUE(std::isinf(vec("2000'd1").shiftLeft(1500).toReal()));
}

TEST(VectorText, GroupedDigitsOfPartlyUnknownValues) {
    EXPECT_EQ(vec("8'b0000_1x01").toOctalText().str(), "01X");
    EXPECT_EQ(vec("4'bxxxx").toOctalText().str(), "xx");
    EXPECT_EQ(vec("4'bzzzz").toOctalText().str(), "zz");
    EXPECT_EQ(vec("7'b0zz_z1x0").toOctalText().str(), "0zX");
    EXPECT_EQ(vec("6'b0z1_zzz").toOctalText().str(), "Zz");
    EXPECT_EQ(vec("12'b10zz_xxxx_0101").toHexText().str(), "Zx5");
    EXPECT_EQ(vec("12'bxxzz_zzzz_1111").toHexText().str(), "Xzf");
    EXPECT_EQ(vec("5'h1f").toHexText().str(), "1f");
    EXPECT_EQ(vec("1'b1").toOctalText().str(), "1");
    EXPECT_EQ(vec("8'hA5").toHexText().str(), "a5");

    EXPECT_EQ(vec("8'bxxxx_xxxx").toDecimalText().str(), "x");
    EXPECT_EQ(vec("8'b0000_xxxx").toDecimalText().str(), "X");
    EXPECT_EQ(vec("8'bzzzz_xxxx").toDecimalText().str(), "X");
    EXPECT_EQ(vec("8'bzzzz_zzzz").toDecimalText().str(), "z");
    EXPECT_EQ(vec("8'b1zzz_zzzz").toDecimalText().str(), "Z");
    EXPECT_EQ(vec("8'sd-128").toDecimalText().str(), "-128");
    EXPECT_EQ(vec("8'd200").toDecimalText().str(), "200");
    EXPECT_EQ(vec("64'hffff_ffff_ffff_ffff").toDecimalText().str(), "18446744073709551615");
    EXPECT_EQ(vec("64'shffff_ffff_ffff_ffff").toDecimalText().str(), "-1");
    EXPECT_EQ(vec("64'sh8000_0000_0000_0000").toDecimalText().str(), "-9223372036854775808");
    EXPECT_EQ(vec("128'shffff_ffff_ffff_ffff_ffff_ffff_ffff_ffff").toDecimalText().str(), "-1");
    EXPECT_EQ(vec("128'sh8000_0000_0000_0000_0000_0000_0000_0000").toDecimalText().str(),
              "-170141183460469231731687303715884105728");
    EXPECT_EQ(vec("200'd1000000000000000000000000000000000000").toDecimalText().str(),
              "1000000000000000000000000000000000000");
}

TEST(VectorText, BaseTextAndDescription) {
    EXPECT_EQ(vec("8'shf0").describe().str(), "based constant 8'shf0");
    EXPECT_EQ(vec("'o17").describe().str(), "based constant 'o00000000017");
    EXPECT_EQ(vec("3'b1x0").describe().str(), "based constant 3'b1x0");
    EXPECT_EQ(vec("-8'sd5").describe().str(), "based constant 8'sd-5");
    EXPECT_EQ(vec("16'hx").toBaseText().str(), "xxxx");
    EXPECT_EQ(vec("16'dx").toBaseText().str(), "x");
    EXPECT_EQ(Tn_Verilog::baseTypeName(Tn_Verilog::Hex), std::string("Hex"));
    EXPECT_EQ(Tn_Verilog::baseTypeName(7), std::string("NoBaseType"));
    Vec s(Tn_Verilog::String, false, 0, "a\"b");
    EXPECT_EQ(s.describe().str(), "string constant \"a\"b\"");
    EXPECT_EQ(vec("12'h41").toCharText().str(), std::string("\0A", 2));
}

TEST(VectorText, BaseTextRoundTripsThroughDigitConstruction) {
    // Known values written in their base and read back with base, sign and width.
    const char* literals[] = {"8'shf0", "'o17", "3'b1x0", "-8'sd5", "100'hdead_beef_0123_4567_89ab_cdef",
                              "-100'sd123456789012345678901234567", "12'o7z1", "70'hx1", "'sd-2147483648"};
    for (const char* l : literals) {
        Vec v = vec(l);
        Vec back(v.base(), v.isSigned(), v.isUnsized() ? 0 : v.width(), v.toBaseText());
        EXPECT_EQ(back, v) << l;
    }
}
