// Four-state bit vector of any width: the value of every based constant and
// the operand of constant evaluation. Value semantics; vectors of up to 64
// bits keep their words inline (no heap).
#ifndef TARN_TN_VERILOGVECTOR_H
#define TARN_TN_VERILOGVECTOR_H

#include <cstddef>
#include <cstdint>

#include "tarn/port_stringbase.h"
#include "verilog/tn_verilogbasetype.h"
#include "verilog/tn_verilogvectorword.h"

class Tn_VerilogVector {
public:
    typedef Tn_VerilogVectorWord::BitCode BitCode;

    // One bit x, unsigned, Binary.
    Tn_VerilogVector();
    // All bits x. Width 0 makes an unsized vector of 32 bits.
    Tn_VerilogVector(bool isSigned, uint32_t width);
    // All bits x; width |msb - lsb| + 1.
    Tn_VerilogVector(bool isSigned, int32_t msb, int32_t lsb);
    // 32-bit signed, Decimal.
    explicit Tn_VerilogVector(int32_t value);
    // Rounded half away from zero to 64-bit signed (wrapping modulo 2^64);
    // NaN and infinities give all x.
    explicit Tn_VerilogVector(double value);
    // Digits in a base as the scanner delivers them (underscores are skipped);
    // width 0 makes an unsized vector. Binary, octal and hex digits give 1, 3
    // or 4 bits each ('x', 'z' and '?' as many x or z bits); when the digits
    // give fewer bits than the width, an x or z leading digit extends itself,
    // else zeros. Decimal text may start with '-', and a leading x or z/? makes
    // every bit x or z; excess digits wrap in the width. String text is
    // characters, 8 bits each; width 0 then means 8 bits a character.
    Tn_VerilogVector(Tn_Verilog::BaseType base, bool isSigned, uint32_t width, const char* digits, size_t length);
    Tn_VerilogVector(Tn_Verilog::BaseType base, bool isSigned, uint32_t width, const char* digits);
    Tn_VerilogVector(Tn_Verilog::BaseType base, bool isSigned, uint32_t width, const Port_String& digits);

    Tn_VerilogVector(const Tn_VerilogVector& o);
    Tn_VerilogVector(Tn_VerilogVector&& o) noexcept;
    Tn_VerilogVector& operator=(const Tn_VerilogVector& o);
    Tn_VerilogVector& operator=(Tn_VerilogVector&& o) noexcept;
    ~Tn_VerilogVector();

    // Every field and every bit equal.
    bool operator==(const Tn_VerilogVector& o) const;
    bool operator!=(const Tn_VerilogVector& o) const { return !(*this == o); }

    Tn_Verilog::BaseType base() const { return static_cast<Tn_Verilog::BaseType>(base_); }
    bool isSigned() const { return signed_; }
    bool isUnsized() const { return unsized_; }
    uint32_t width() const { return width_; }
    int32_t msb() const { return msb_; }
    int32_t lsb() const { return lsb_; }
    void setBase(Tn_Verilog::BaseType base) { base_ = static_cast<uint8_t>(base); }
    void setSigned(bool isSigned) { signed_ = isSigned; }
    void setUnsized(bool unsized) { unsized_ = unsized; }
    // New declared bounds; false (and nothing changed) when they do not span the width.
    bool setBounds(int32_t msb, int32_t lsb);
    // Bit offset of a declared bit index; false when outside msb..lsb.
    bool offsetOf(int32_t index, uint32_t& offset) const;

    // (width - 1) / 32 + 1 words, word 0 least significant.
    uint32_t wordCount() const { return wordsFor(width_); }
    Tn_VerilogVectorWord word(uint32_t index) const;
    // Bits above the word's valid size are dropped.
    void setWord(uint32_t index, const Tn_VerilogVectorWord& w);
    uint32_t aval(uint32_t index) const { return words()[index].a; }
    uint32_t bval(uint32_t index) const { return words()[index].b; }
    // Bit code at an offset; offsets at or above the width read as x.
    unsigned bit(uint32_t offset) const;
    void setBit(uint32_t offset, unsigned code);

    bool hasUnknown() const;
    bool isAllX() const;
    bool isAllZ() const;
    bool isZero() const;            // every bit 0
    bool isNegative() const;        // signed and the top bit is 1

    // Resizing: widening fills from the top bit (0 stays 0; 1 repeats when
    // signed; z and x repeat when signed or unsized, else 0); narrowing keeps
    // the low bits; lsb stays and msb moves.
    Tn_VerilogVector resized(uint32_t width) const;
    Tn_VerilogVector resized(bool isSigned, uint32_t width) const;

    // Binary operators: both operands widened to the wider width, signed only
    // when both are. Comparisons give one unsigned bit.
    Tn_VerilogVector bitAnd(const Tn_VerilogVector& r) const;
    Tn_VerilogVector bitOr(const Tn_VerilogVector& r) const;
    Tn_VerilogVector bitXor(const Tn_VerilogVector& r) const;
    Tn_VerilogVector bitXnor(const Tn_VerilogVector& r) const;
    Tn_VerilogVector add(const Tn_VerilogVector& r) const;
    Tn_VerilogVector subtract(const Tn_VerilogVector& r) const;
    Tn_VerilogVector multiply(const Tn_VerilogVector& r) const;
    // x or z in an operand, or a zero divisor: all x. Truncates toward zero;
    // the remainder takes the dividend's sign. The most negative value divided
    // by -1 wraps to itself, remainder 0.
    Tn_VerilogVector divide(const Tn_VerilogVector& r) const;
    Tn_VerilogVector modulus(const Tn_VerilogVector& r) const;
    // Width and sign of this operand; unknown bits or a negative signed
    // exponent give all x.
    Tn_VerilogVector power(const Tn_VerilogVector& exponent) const;
    Tn_VerilogVector equal(const Tn_VerilogVector& r) const;
    Tn_VerilogVector notEqual(const Tn_VerilogVector& r) const;
    Tn_VerilogVector caseEqual(const Tn_VerilogVector& r) const;
    Tn_VerilogVector caseNotEqual(const Tn_VerilogVector& r) const;
    Tn_VerilogVector lessThan(const Tn_VerilogVector& r) const;
    Tn_VerilogVector lessEqual(const Tn_VerilogVector& r) const;
    Tn_VerilogVector greaterThan(const Tn_VerilogVector& r) const;
    Tn_VerilogVector greaterEqual(const Tn_VerilogVector& r) const;
    Tn_VerilogVector logicalAnd(const Tn_VerilogVector& r) const;
    Tn_VerilogVector logicalOr(const Tn_VerilogVector& r) const;
    // Case item compares: bits where either side is z (casez), or x or z
    // (casex), are not compared.
    bool caseZEqual(const Tn_VerilogVector& r) const;
    bool caseXEqual(const Tn_VerilogVector& r) const;
    // Conditional operator with an unknown condition.
    Tn_VerilogVector merge(const Tn_VerilogVector& r) const;

    // Shifts keep this operand's width, sign and base.
    Tn_VerilogVector shiftLeft(uint32_t count) const;
    Tn_VerilogVector arithShiftLeft(uint32_t count) const;
    Tn_VerilogVector shiftRight(uint32_t count) const;
    Tn_VerilogVector arithShiftRight(uint32_t count) const;

    // Unary operators.
    Tn_VerilogVector bitNot() const;
    Tn_VerilogVector negate() const;
    Tn_VerilogVector logicalNot() const;
    Tn_VerilogVector reduceAnd() const;
    Tn_VerilogVector reduceNand() const;
    Tn_VerilogVector reduceOr() const;
    Tn_VerilogVector reduceNor() const;
    Tn_VerilogVector reduceXor() const;
    Tn_VerilogVector reduceXnor() const;

    // {this, low}: this operand most significant; unsigned, sized, Binary.
    Tn_VerilogVector concat(const Tn_VerilogVector& low) const;
    // width bits from offset upward; bits beyond this vector read as x.
    Tn_VerilogVector slice(uint32_t offset, uint32_t width) const;

    // Conversions. toBool: the OR reduction is 1. toInt/toInt64: 0 with an
    // unknown bit; else the low 32/64 bits, sign-extended when signed.
    bool toBool() const;
    int32_t toInt() const;
    int64_t toInt64() const;
    // The low 32 bits unsigned, or UINT32_MAX when a higher bit is 1 (shift
    // counts); 0 with an unknown bit.
    uint32_t toCount() const;
    double toReal() const;

    // Text forms.
    Port_String toBinaryText() const;
    Port_String toOctalText() const;
    Port_String toHexText() const;
    Port_String toDecimalText() const;
    Port_String toCharText() const;     // 8 bits a character, most significant first
    Port_String toBaseText() const;     // in the vector's own base (characters for String)
    Port_String describe() const;       // "based constant 8'sh7f", "string constant \"ab\""
    Port_String debugText() const;      // the words' debug texts, word 0 first

private:
    struct Limb {
        uint32_t a, b;
    };
    struct UninitTag {};
    // Words to be written by the caller (inline ones start 0); unsigned, sized, Binary, [width-1:0].
    Tn_VerilogVector(UninitTag, uint32_t width);
    static uint32_t wordsFor(uint32_t width) { return (width - 1) / 32 + 1; }
    bool isInline() const { return width_ <= 64; }
    Limb* words() { return isInline() ? inline_ : heap_; }
    const Limb* words() const { return isInline() ? inline_ : heap_; }
    void allocate(uint32_t width);
    void release();
    void copyFrom(const Tn_VerilogVector& o);
    void takeFrom(Tn_VerilogVector& o);
    uint32_t topMask() const { return Tn_VerilogVectorWord::maskOf((width_ - 1) % 32 + 1); }
    void fill(unsigned code);
    void maskTop();
    void boundsFromWidth();

    friend class Tn_VerilogVectorOps;

    union {
        Limb inline_[2];
        Limb* heap_;
    };
    uint32_t width_;
    int32_t msb_;
    int32_t lsb_;
    uint8_t base_;
    bool signed_;
    bool unsized_;
};

#endif
