#include "verilog/tn_verilogvectorword.h"

namespace {

uint32_t largerSize(const Tn_VerilogVectorWord& a, const Tn_VerilogVectorWord& b) {
    return a.size() > b.size() ? a.size() : b.size();
}

}  // namespace

Tn_VerilogVectorWord Tn_VerilogVectorWord::bitAnd(const Tn_VerilogVectorWord& x, const Tn_VerilogVectorWord& y) {
    uint32_t c = ((x.aval_ | x.bval_) & y.bval_) | (y.aval_ & x.bval_);
    return Tn_VerilogVectorWord(largerSize(x, y), (x.aval_ & y.aval_) | c, c);
}

Tn_VerilogVectorWord Tn_VerilogVectorWord::bitOr(const Tn_VerilogVectorWord& x, const Tn_VerilogVectorWord& y) {
    return Tn_VerilogVectorWord(largerSize(x, y), x.aval_ | x.bval_ | y.aval_ | y.bval_,
                                (~x.aval_ & y.bval_) | (~y.aval_ & x.bval_) | (x.bval_ & y.bval_));
}

Tn_VerilogVectorWord Tn_VerilogVectorWord::bitXor(const Tn_VerilogVectorWord& x, const Tn_VerilogVectorWord& y) {
    uint32_t unknown = x.bval_ | y.bval_;
    return Tn_VerilogVectorWord(largerSize(x, y), (x.aval_ ^ y.aval_) | unknown, unknown);
}

Tn_VerilogVectorWord Tn_VerilogVectorWord::bitXnor(const Tn_VerilogVectorWord& x, const Tn_VerilogVectorWord& y) {
    uint32_t unknown = x.bval_ | y.bval_;
    return Tn_VerilogVectorWord(largerSize(x, y), ~(x.aval_ ^ y.aval_) | unknown, unknown);
}

Tn_VerilogVectorWord Tn_VerilogVectorWord::merge(const Tn_VerilogVectorWord& x, const Tn_VerilogVectorWord& y) {
    uint32_t unknown = x.bval_ | y.bval_;
    return Tn_VerilogVectorWord(largerSize(x, y), x.aval_ | y.aval_ | unknown, (x.aval_ ^ y.aval_) | unknown);
}

Tn_VerilogVectorWord Tn_VerilogVectorWord::bitNot() const {
    return Tn_VerilogVectorWord(size_, ~aval_ | bval_, bval_);
}

Tn_VerilogVectorWord Tn_VerilogVectorWord::addWithCarry(const Tn_VerilogVectorWord& x, const Tn_VerilogVectorWord& y,
                                                        unsigned& carry) {
    uint32_t size = largerSize(x, y);
    if (carry > Bit1) return Tn_VerilogVectorWord(size, 0xFFFFFFFFu, 0xFFFFFFFFu);
    uint64_t sum = uint64_t(x.aval_) + y.aval_ + carry;
    uint32_t unknown = x.bval_ | y.bval_;
    if (unknown == 0) {
        carry = static_cast<unsigned>(sum >> 32);
        return Tn_VerilogVectorWord(size, static_cast<uint32_t>(sum), 0);
    }
    // Bits from the lowest unknown one upward are x; the carry out too.
    uint32_t known = (unknown & -unknown) - 1u;
    carry = BitX;
    return Tn_VerilogVectorWord(size, (static_cast<uint32_t>(sum) & known) | ~known, ~known);
}

unsigned Tn_VerilogVectorWord::reduceAnd() const {
    if (~aval_ & ~bval_ & mask()) return Bit0;
    return bval_ ? BitX : Bit1;
}

unsigned Tn_VerilogVectorWord::reduceOr() const {
    if (aval_ & ~bval_) return Bit1;
    return bval_ ? BitX : Bit0;
}

unsigned Tn_VerilogVectorWord::reduceXor() const {
    if (bval_) return BitX;
    return static_cast<unsigned>(__builtin_popcount(aval_) & 1);
}

Port_String Tn_VerilogVectorWord::debugText() const {
    return Port_String::doFormat("[size=%d,aval=%08x,bval=%08x]", static_cast<int>(size_), aval_, bval_);
}
