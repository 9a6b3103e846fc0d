// One 32-bit slice of a four-state vector, coded as the VPI vector value:
// bit code = aval bit + 2 * bval bit (0, 1, z = 2, x = 3). Bits at and above
// size are always 0 in both aval and bval.
#ifndef TARN_TN_VERILOGVECTORWORD_H
#define TARN_TN_VERILOGVECTORWORD_H

#include <cstdint>

#include "tarn/port_stringbase.h"

class Tn_VerilogVectorWord {
public:
    enum BitCode : unsigned { Bit0 = 0, Bit1 = 1, BitZ = 2, BitX = 3 };

    Tn_VerilogVectorWord() : size_(32), aval_(0), bval_(0) {}
    // size 1 to 32 (others are taken as 32); bits above size are dropped.
    Tn_VerilogVectorWord(uint32_t size, uint32_t aval, uint32_t bval)
        : size_(size - 1 < 32 ? size : 32), aval_(aval & maskOf(size_)), bval_(bval & maskOf(size_)) {}

    uint32_t size() const { return size_; }
    uint32_t aval() const { return aval_; }
    uint32_t bval() const { return bval_; }
    uint32_t mask() const { return maskOf(size_); }
    static uint32_t maskOf(uint32_t size) { return size >= 32 ? 0xFFFFFFFFu : (1u << size) - 1u; }

    // Code of one bit; an offset of 32 or more reads as x.
    unsigned bit(uint32_t offset) const {
        return offset >= 32 ? BitX : ((aval_ >> offset) & 1u) | (((bval_ >> offset) & 1u) << 1);
    }
    bool hasUnknown() const { return bval_ != 0; }

    // Word-level logic; two operands are taken at the larger size.
    static Tn_VerilogVectorWord bitAnd(const Tn_VerilogVectorWord& a, const Tn_VerilogVectorWord& b);
    static Tn_VerilogVectorWord bitOr(const Tn_VerilogVectorWord& a, const Tn_VerilogVectorWord& b);
    static Tn_VerilogVectorWord bitXor(const Tn_VerilogVectorWord& a, const Tn_VerilogVectorWord& b);
    static Tn_VerilogVectorWord bitXnor(const Tn_VerilogVectorWord& a, const Tn_VerilogVectorWord& b);
    // Equal known bits stay, every other bit becomes x (conditional operator).
    static Tn_VerilogVectorWord merge(const Tn_VerilogVectorWord& a, const Tn_VerilogVectorWord& b);
    Tn_VerilogVectorWord bitNot() const;
    // a + b + carry; carry is a bit code in and out (0, 1 or x).
    static Tn_VerilogVectorWord addWithCarry(const Tn_VerilogVectorWord& a, const Tn_VerilogVectorWord& b,
                                             unsigned& carry);

    // Reductions over the valid bits, as bit codes (0, 1 or x).
    unsigned reduceAnd() const;
    unsigned reduceOr() const;
    unsigned reduceXor() const;

    // Exact compare: size, aval and bval all equal.
    bool operator==(const Tn_VerilogVectorWord& o) const {
        return size_ == o.size_ && aval_ == o.aval_ && bval_ == o.bval_;
    }
    bool operator!=(const Tn_VerilogVectorWord& o) const { return !(*this == o); }

    // "[size=%d,aval=%08x,bval=%08x]"
    Port_String debugText() const;

    // Logic tables on bit codes.
    static unsigned andCode(unsigned a, unsigned b) { return (a == Bit0 || b == Bit0) ? Bit0 : (a == Bit1 && b == Bit1) ? Bit1 : BitX; }
    static unsigned orCode(unsigned a, unsigned b) { return (a == Bit1 || b == Bit1) ? Bit1 : (a == Bit0 && b == Bit0) ? Bit0 : BitX; }
    static unsigned xorCode(unsigned a, unsigned b) { return (a > Bit1 || b > Bit1) ? BitX : a ^ b; }
    static unsigned notCode(unsigned a) { return a > Bit1 ? BitX : a ^ 1u; }

private:
    uint32_t size_;
    uint32_t aval_;
    uint32_t bval_;
};

#endif
