#include "verilog/tn_verilogvector.h"

#include <cmath>
#include <cstring>
#include <new>
#include <string>
#include <vector>

#include "port/kor_memory.h"

namespace {

typedef Tn_VerilogVectorWord Word;
const unsigned kBit0 = Word::Bit0;
const unsigned kBit1 = Word::Bit1;
const unsigned kBitZ = Word::BitZ;
const unsigned kBitX = Word::BitX;

inline uint32_t ones(bool set) { return set ? 0xFFFFFFFFu : 0u; }
inline uint64_t mask64(uint32_t width) { return width >= 64 ? ~uint64_t(0) : (uint64_t(1) << width) - 1; }
// Bits in the top word of a width (1 to 32).
inline uint32_t topBits(uint32_t width) { return (width - 1) % 32 + 1; }

// Limbs of one plane for arithmetic on known values; small ones stay on the stack.
class Limbs {
public:
    explicit Limbs(uint32_t n) : n_(n), p_(small_) {
        if (n > kSmall) {
            big_.resize(n);
            p_ = big_.data();
        }
        std::memset(p_, 0, n * sizeof(uint32_t));
    }
    Limbs(const Limbs&) = delete;
    Limbs& operator=(const Limbs&) = delete;
    uint32_t* data() { return p_; }
    const uint32_t* data() const { return p_; }
    uint32_t size() const { return n_; }
    uint32_t& operator[](uint32_t i) { return p_[i]; }
    uint32_t operator[](uint32_t i) const { return p_[i]; }

private:
    // Up to 1152 bits (with a spare limb for division) without the heap.
    static const uint32_t kSmall = 37;
    uint32_t n_;
    uint32_t small_[kSmall];
    std::vector<uint32_t> big_;
    uint32_t* p_;
};

// Number of limbs up to and including the most significant non-zero one.
uint32_t significant(const uint32_t* x, uint32_t n) {
    while (n > 0 && x[n - 1] == 0) --n;
    return n;
}

void negateLimbs(uint32_t* x, uint32_t n) {
    uint64_t carry = 1;
    for (uint32_t i = 0; i < n; ++i) {
        uint64_t t = uint64_t(~x[i]) + carry;
        x[i] = static_cast<uint32_t>(t);
        carry = t >> 32;
    }
}

// out (n limbs, not aliasing x or y) = x * y modulo 2^(32 n).
void mulLimbs(const uint32_t* x, uint32_t nx, const uint32_t* y, uint32_t ny, uint32_t* out, uint32_t n) {
    std::memset(out, 0, n * sizeof(uint32_t));
    nx = significant(x, nx < n ? nx : n);
    ny = significant(y, ny < n ? ny : n);
    for (uint32_t i = 0; i < nx; ++i) {
        if (x[i] == 0) continue;
        uint64_t carry = 0;
        uint32_t jEnd = n - i < ny ? n - i : ny;
        for (uint32_t j = 0; j < jEnd; ++j) {
            uint64_t t = uint64_t(x[i]) * y[j] + out[i + j] + carry;
            out[i + j] = static_cast<uint32_t>(t);
            carry = t >> 32;
        }
        for (uint32_t k = i + jEnd; carry && k < n; ++k) {
            uint64_t t = uint64_t(out[k]) + carry;
            out[k] = static_cast<uint32_t>(t);
            carry = t >> 32;
        }
    }
}

// x (n limbs) /= d in place; returns the remainder.
uint32_t divSmall(uint32_t* x, uint32_t n, uint32_t d) {
    uint64_t rem = 0;
    for (uint32_t i = n; i-- > 0;) {
        uint64_t cur = (rem << 32) | x[i];
        x[i] = static_cast<uint32_t>(cur / d);
        rem = cur % d;
    }
    return static_cast<uint32_t>(rem);
}

// Long division of magnitudes, one 32-bit quotient digit a step with a
// two-digit estimate corrected at most twice: u (m limbs) by v (nv limbs, top
// limb non-zero, nv >= 2, m >= nv). q gets m - nv + 1 limbs, r nv limbs.
void divLimbs(const uint32_t* u, uint32_t m, const uint32_t* v, uint32_t nv, uint32_t* q, uint32_t* r) {
    const uint64_t base = uint64_t(1) << 32;
    // Normalise so that the divisor's top bit is set; the estimate is then close.
    unsigned s = static_cast<unsigned>(__builtin_clz(v[nv - 1]));
    Limbs vn(nv), un(m + 1);
    for (uint32_t i = nv - 1; i > 0; --i)
        vn[i] = static_cast<uint32_t>((uint64_t(v[i]) << s) | (uint64_t(v[i - 1]) >> (32 - s)));
    vn[0] = v[0] << s;
    un[m] = static_cast<uint32_t>(uint64_t(u[m - 1]) >> (32 - s));
    for (uint32_t i = m - 1; i > 0; --i)
        un[i] = static_cast<uint32_t>((uint64_t(u[i]) << s) | (uint64_t(u[i - 1]) >> (32 - s)));
    un[0] = u[0] << s;

    for (uint32_t j = m - nv + 1; j-- > 0;) {
        uint64_t top = (uint64_t(un[j + nv]) << 32) | un[j + nv - 1];
        uint64_t qhat = top / vn[nv - 1];
        uint64_t rhat = top % vn[nv - 1];
        while (qhat >= base || qhat * vn[nv - 2] > ((rhat << 32) | un[j + nv - 2])) {
            --qhat;
            rhat += vn[nv - 1];
            if (rhat >= base) break;
        }
        // un[j .. j+nv] -= qhat * vn
        uint64_t borrow = 0, carry = 0;
        for (uint32_t i = 0; i < nv; ++i) {
            uint64_t p = qhat * vn[i] + carry;
            carry = p >> 32;
            uint64_t sub = uint64_t(un[i + j]) - static_cast<uint32_t>(p) - borrow;
            un[i + j] = static_cast<uint32_t>(sub);
            borrow = (sub >> 32) & 1;
        }
        uint64_t sub = uint64_t(un[j + nv]) - carry - borrow;
        un[j + nv] = static_cast<uint32_t>(sub);
        bool negative = (sub >> 32) & 1;
        q[j] = static_cast<uint32_t>(qhat);
        if (negative) {
            // The estimate was one too large: add the divisor back.
            --q[j];
            uint64_t c = 0;
            for (uint32_t i = 0; i < nv; ++i) {
                uint64_t t = uint64_t(un[i + j]) + vn[i] + c;
                un[i + j] = static_cast<uint32_t>(t);
                c = t >> 32;
            }
            un[j + nv] += static_cast<uint32_t>(c);
        }
    }
    for (uint32_t i = 0; i + 1 < nv; ++i)
        r[i] = static_cast<uint32_t>((uint64_t(un[i]) >> s) | (uint64_t(un[i + 1]) << (32 - s)));
    r[nv - 1] = un[nv - 1] >> s;
}

// Decimal digits of a magnitude (destroyed), most significant first: nine
// digits a division by 10^9, written from the end of one buffer.
std::string magnitudeText(uint32_t* x, uint32_t n) {
    n = significant(x, n);
    std::string text(size_t(n) * 10 + 10, '0');
    size_t end = text.size();
    while (n > 0) {
        uint32_t chunk = divSmall(x, n, 1000000000u);
        n = significant(x, n);
        for (int k = 0; k < 9; ++k, chunk /= 10) text[--end] = static_cast<char>('0' + chunk % 10);
    }
    size_t first = text.find_first_not_of('0');
    if (first == std::string::npos) return "0";
    text.erase(0, first);
    return text;
}

// "-" (when negative) and the digits of a 64-bit magnitude.
Port_String decimalText(uint64_t magnitude, bool negative) {
    char buf[24];
    char* p = buf + sizeof buf;
    do {
        *--p = static_cast<char>('0' + magnitude % 10);
        magnitude /= 10;
    } while (magnitude);
    if (negative) *--p = '-';
    return Port_String(p, static_cast<int>(buf + sizeof buf - p));
}

int digitValue(char c) {
    if (c >= '0' && c <= '9') return c - '0';
    if (c >= 'a' && c <= 'f') return c - 'a' + 10;
    if (c >= 'A' && c <= 'F') return c - 'A' + 10;
    return 0;
}

}  // namespace

// Operand reading and result making shared by the operators.
class Tn_VerilogVectorOps {
public:
    typedef Tn_VerilogVector V;
    typedef V::Limb Limb;

    // An operand read as if resized to any wider width with a given sign:
    // words past its own read as the fill word.
    struct Ext {
        const Limb* w;
        uint32_t n;
        uint32_t hi;  // bits of the top word above the operand's width
        uint32_t fa, fb;

        struct Fill {
            unsigned code;
        };
        // Filled as widening with the given sign fills.
        Ext(const V& v, bool isSigned) : Ext(v, Fill{fillCode(v, isSigned)}) {}
        Ext(const V& v, Fill fill)
            : w(v.words()), n(v.wordCount()), hi(~Word::maskOf(topBits(v.width_))), fa(ones(fill.code & 1u)),
              fb(ones(fill.code & 2u)) {}
        Limb at(uint32_t i) const {
            if (i + 1 < n) return w[i];
            if (i + 1 == n) return Limb{w[i].a | (fa & hi), w[i].b | (fb & hi)};
            return Limb{fa, fb};
        }
    };

    // An operand of at most 64 bits as two 64-bit planes, extended as widening
    // with the given sign fills. The inline words above the width are 0.
    struct Small {
        uint64_t a, b;
        Small(const V& v, bool isSigned)
            : a(uint64_t(v.inline_[0].a) | (uint64_t(v.inline_[1].a) << 32)),
              b(uint64_t(v.inline_[0].b) | (uint64_t(v.inline_[1].b) << 32)) {
            uint32_t top = v.width_ - 1;
            if (top == 63) return;
            unsigned fill = fillFor(static_cast<unsigned>(((a >> top) & 1u) | (((b >> top) & 1u) << 1)), isSigned,
                                    v.unsized_);
            uint64_t high = ~mask64(top + 1);
            if (fill & 1u) a |= high;
            if (fill & 2u) b |= high;
        }
    };

    // Fill bit of widening: 0 stays 0, 1 repeats when signed, z and x repeat
    // when signed or unsized.
    static unsigned fillFor(unsigned top, bool isSigned, bool unsized) {
        if (top == kBit0) return kBit0;
        if (top == kBit1) return isSigned ? kBit1 : kBit0;
        return (isSigned || unsized) ? top : kBit0;
    }
    static unsigned fillCode(const V& v, bool isSigned) { return fillFor(v.bit(v.width_ - 1), isSigned, v.unsized_); }

    static Tn_Verilog::BaseType commonBase(const V& l, const V& r) {
        return (l.base_ == r.base_ && l.base_ != Tn_Verilog::String) ? l.base() : Tn_Verilog::Binary;
    }

    // msb of a vector resized to width, lsb kept.
    static int32_t movedMsb(const V& v, uint32_t width) {
        uint32_t span = width - 1;
        return static_cast<int32_t>(v.msb_ >= v.lsb_ ? static_cast<uint32_t>(v.lsb_) + span
                                                      : static_cast<uint32_t>(v.lsb_) - span);
    }

    // Result of a binary operator at width w: the left operand's bounds moved
    // to w, unsized only when both are.
    static V binaryResult(const V& l, const V& r, uint32_t w, bool isSigned) {
        V res(V::UninitTag(), w);
        res.signed_ = isSigned;
        res.unsized_ = l.unsized_ && r.unsized_;
        res.base_ = static_cast<uint8_t>(commonBase(l, r));
        res.lsb_ = l.lsb_;
        res.msb_ = movedMsb(l, w);
        return res;
    }

    // Same shape as v (width, sign, bounds, base), words unset.
    static V sameShape(const V& v) {
        V res(V::UninitTag(), v.width_);
        res.signed_ = v.signed_;
        res.unsized_ = v.unsized_;
        res.base_ = v.base_;
        res.msb_ = v.msb_;
        res.lsb_ = v.lsb_;
        return res;
    }

    static V bitResult(unsigned code) {
        V res(V::UninitTag(), 1);
        res.inline_[0] = Limb{code & 1u, (code >> 1) & 1u};
        return res;
    }

    static V allX(V res) {
        res.fill(kBitX);
        return res;
    }

    static uint32_t widthOf(const V& l, const V& r) { return l.width_ > r.width_ ? l.width_ : r.width_; }
    static bool signOf(const V& l, const V& r) { return l.signed_ && r.signed_; }

    // Word-level logic over both operands.
    template <class Op>
    static V bitwise(const V& l, const V& r, Op op) {
        uint32_t w = widthOf(l, r);
        bool s = signOf(l, r);
        V res = binaryResult(l, r, w, s);
        Ext x(l, s), y(r, s);
        Limb* out = res.words();
        for (uint32_t i = 0, n = res.wordCount(); i < n; ++i) {
            Limb a = x.at(i), b = y.at(i);
            Word word = op(Word(32, a.a, a.b), Word(32, b.a, b.b));
            out[i] = Limb{word.aval(), word.bval()};
        }
        res.maskTop();
        return res;
    }

    // l + r, or l - r (l + ~r + 1); unknown bits make their offset and
    // everything above x.
    static V addSub(const V& l, const V& r, bool subtract) {
        uint32_t w = widthOf(l, r);
        bool s = signOf(l, r);
        V res = binaryResult(l, r, w, s);
        Limb* out = res.words();
        if (w <= 64) {
            Small x(l, s), y(r, s);
            uint64_t unknown = x.b | y.b;
            uint64_t sum = subtract ? x.a - y.a : x.a + y.a;
            uint64_t a = sum, b = 0;
            if (unknown) {
                uint64_t known = (unknown & (0 - unknown)) - 1;
                a = (sum & known) | ~known;
                b = ~known;
            }
            out[0] = Limb{static_cast<uint32_t>(a), static_cast<uint32_t>(b)};
            if (w > 32) out[1] = Limb{static_cast<uint32_t>(a >> 32), static_cast<uint32_t>(b >> 32)};
        } else {
            Ext x(l, s), y(r, s);
            unsigned carry = subtract ? kBit1 : kBit0;
            for (uint32_t i = 0, n = res.wordCount(); i < n; ++i) {
                Limb a = x.at(i), b = y.at(i);
                if (subtract) b = Limb{~b.a | b.b, b.b};
                if ((a.b | b.b) == 0 && carry <= kBit1) {
                    uint64_t t = uint64_t(a.a) + b.a + carry;
                    out[i] = Limb{static_cast<uint32_t>(t), 0};
                    carry = static_cast<unsigned>(t >> 32);
                    continue;
                }
                Word sum = Word::addWithCarry(Word(32, a.a, a.b), Word(32, b.a, b.b), carry);
                out[i] = Limb{sum.aval(), sum.bval()};
            }
        }
        res.maskTop();
        return res;
    }

    // The aval plane of an operand extended and cut to w bits (known values).
    static void plane(const Ext& e, uint32_t w, uint32_t* out) {
        uint32_t n = V::wordsFor(w);
        for (uint32_t i = 0; i < n; ++i) out[i] = e.at(i).a;
        out[n - 1] &= Word::maskOf(topBits(w));
    }

    static void store(V& res, const uint32_t* x) {
        Limb* out = res.words();
        for (uint32_t i = 0, n = res.wordCount(); i < n; ++i) out[i] = Limb{x[i], 0};
        res.maskTop();
    }

    // Stores a 64-bit pattern extended by its sign (or zeros) to the result width.
    static void store64(V& res, uint64_t value, bool extendSign) {
        Limb* out = res.words();
        uint32_t fill = ones(extendSign && (value >> 63));
        for (uint32_t i = 0, n = res.wordCount(); i < n; ++i) {
            uint32_t a = i == 0 ? static_cast<uint32_t>(value) : i == 1 ? static_cast<uint32_t>(value >> 32) : fill;
            out[i] = Limb{a, 0};
        }
        res.maskTop();
    }

    static bool topBitSet(const uint32_t* x, uint32_t w) { return (x[(w - 1) / 32] >> ((w - 1) % 32)) & 1u; }

    // The aval plane of a known vector into mag (wordCount limbs), negated when
    // the vector is signed and negative; true in that case.
    static bool magnitude(const V& v, Limbs& mag) {
        for (uint32_t i = 0, n = v.wordCount(); i < n; ++i) mag[i] = v.words()[i].a;
        bool negative = v.isNegative();
        if (negative) negate(mag.data(), v.width_);
        return negative;
    }

    // Keeps the low w bits of a two's complement negation.
    static void negate(uint32_t* x, uint32_t w) {
        uint32_t n = V::wordsFor(w);
        negateLimbs(x, n);
        x[n - 1] &= Word::maskOf(topBits(w));
    }

    static V multiply(const V& l, const V& r) {
        uint32_t w = widthOf(l, r);
        bool s = signOf(l, r);
        V res = binaryResult(l, r, w, s);
        if (l.hasUnknown() || r.hasUnknown()) return allX(std::move(res));
        if (w <= 64) {
            store64(res, Small(l, s).a * Small(r, s).a, false);
            return res;
        }
        Ext x(l, s), y(r, s);
        uint32_t n = V::wordsFor(w);
        Limbs a(n), b(n), p(n);
        plane(x, w, a.data());
        plane(y, w, b.data());
        bool negA = s && topBitSet(a.data(), w), negB = s && topBitSet(b.data(), w);
        if (negA) negate(a.data(), w);
        if (negB) negate(b.data(), w);
        if (significant(a.data(), n) <= 1 && significant(b.data(), n) <= 1) {
            uint64_t prod = uint64_t(a[0]) * b[0];
            p[0] = static_cast<uint32_t>(prod);
            p[1] = static_cast<uint32_t>(prod >> 32);
        } else {
            mulLimbs(a.data(), n, b.data(), n, p.data(), n);
        }
        if (negA != negB) negate(p.data(), w);
        store(res, p.data());
        return res;
    }

    // Quotient or remainder; the most negative value by -1 wraps (quotient
    // itself, remainder 0) instead of trapping.
    static V divide(const V& l, const V& r, bool remainder) {
        uint32_t w = widthOf(l, r);
        bool s = signOf(l, r);
        V res = binaryResult(l, r, w, s);
        if (l.hasUnknown() || r.hasUnknown() || r.isZero()) return allX(std::move(res));
        if (w <= 64) {
            uint64_t a = Small(l, s).a, b = Small(r, s).a;
            uint64_t q, m;
            if (s) {
                int64_t sa = static_cast<int64_t>(a), sb = static_cast<int64_t>(b);
                if (sb == -1) {
                    q = 0 - a;  // wraps for the most negative value
                    m = 0;
                } else {
                    q = static_cast<uint64_t>(sa / sb);
                    m = static_cast<uint64_t>(sa % sb);
                }
            } else {
                a &= mask64(w);
                b &= mask64(w);
                q = a / b;
                m = a % b;
            }
            store64(res, remainder ? m : q, false);
            return res;
        }
        Ext x(l, s), y(r, s);
        uint32_t n = V::wordsFor(w);
        Limbs a(n), b(n), q(n), m(n);
        plane(x, w, a.data());
        plane(y, w, b.data());
        bool negA = s && topBitSet(a.data(), w), negB = s && topBitSet(b.data(), w);
        if (negA) negate(a.data(), w);
        if (negB) negate(b.data(), w);
        uint32_t na = significant(a.data(), n), nb = significant(b.data(), n);
        if (na <= 2 && nb <= 2) {
            uint64_t ua = uint64_t(a[0]) | (na > 1 ? uint64_t(a[1]) << 32 : 0);
            uint64_t ub = uint64_t(b[0]) | (nb > 1 ? uint64_t(b[1]) << 32 : 0);
            uint64_t uq = ua / ub, um = ua % ub;
            q[0] = static_cast<uint32_t>(uq);
            q[1] = static_cast<uint32_t>(uq >> 32);
            m[0] = static_cast<uint32_t>(um);
            m[1] = static_cast<uint32_t>(um >> 32);
        } else if (na < nb) {
            std::memcpy(m.data(), a.data(), n * sizeof(uint32_t));
        } else if (nb == 1) {
            std::memcpy(q.data(), a.data(), n * sizeof(uint32_t));
            m[0] = divSmall(q.data(), na, b[0]);
        } else {
            divLimbs(a.data(), na, b.data(), nb, q.data(), m.data());
        }
        if (remainder) {
            if (negA) negate(m.data(), w);
            store(res, m.data());
        } else {
            if (negA != negB) negate(q.data(), w);
            store(res, q.data());
        }
        return res;
    }

    // Square and multiply over the exponent's bits, products at the base's width.
    static V power(const V& base, const V& exp) {
        V res = binaryResult(base, exp, base.width_, base.signed_);
        res.unsized_ = base.unsized_;
        if (base.hasUnknown() || exp.hasUnknown() || exp.isNegative()) return allX(std::move(res));
        uint32_t w = base.width_;
        uint32_t ne = exp.wordCount();
        const Limb* e = exp.words();
        uint32_t expTop = ne;
        while (expTop > 0 && e[expTop - 1].a == 0) --expTop;
        if (w <= 64) {
            uint64_t m = mask64(w);
            uint64_t result = 1, running = Small(base, false).a & m;
            for (uint32_t i = 0; i < expTop; ++i) {
                uint32_t bits = e[i].a;
                for (int k = 0; k < 32; ++k) {
                    if (i + 1 == expTop && (bits >> k) == 0) break;
                    if ((bits >> k) & 1u) result = (result * running) & m;
                    running = (running * running) & m;
                }
            }
            store64(res, result & m, false);
            return res;
        }
        uint32_t n = V::wordsFor(w);
        Limbs result(n), running(n), tmp(n);
        result[0] = 1;
        plane(Ext(base, false), w, running.data());
        for (uint32_t i = 0; i < expTop; ++i) {
            uint32_t bits = e[i].a;
            for (int k = 0; k < 32; ++k) {
                if (i + 1 == expTop && (bits >> k) == 0) break;
                if ((bits >> k) & 1u) {
                    mulLimbs(result.data(), n, running.data(), n, tmp.data(), n);
                    std::memcpy(result.data(), tmp.data(), n * sizeof(uint32_t));
                }
                if (significant(running.data(), n) == 0) {
                    // 0 from here on: any further exponent bit zeroes the result.
                    bool more = ((bits >> k) >> 1) != 0;
                    for (uint32_t j = i + 1; j < expTop && !more; ++j) more = e[j].a != 0;
                    if (more) std::memset(result.data(), 0, n * sizeof(uint32_t));
                    i = expTop;
                    break;
                }
                mulLimbs(running.data(), n, running.data(), n, tmp.data(), n);
                std::memcpy(running.data(), tmp.data(), n * sizeof(uint32_t));
                result[n - 1] &= Word::maskOf(topBits(w));
                running[n - 1] &= Word::maskOf(topBits(w));
                // An odd base reaches 1 within w squarings: the rest multiply by 1.
                if (running[0] == 1 && significant(running.data(), n) == 1) {
                    i = expTop;
                    break;
                }
            }
        }
        result[n - 1] &= Word::maskOf(topBits(w));
        store(res, result.data());
        return res;
    }

    // -1, 0 or 1 comparing known operands at the common sign.
    static int compare(const V& l, const V& r) {
        bool s = signOf(l, r);
        Ext x(l, s), y(r, s);
        uint32_t n = V::wordsFor(widthOf(l, r));
        for (uint32_t i = n; i-- > 0;) {
            uint32_t a = x.at(i).a, b = y.at(i).a;
            if (a == b) continue;
            if (s && i + 1 == n) return static_cast<int32_t>(a) < static_cast<int32_t>(b) ? -1 : 1;
            return a < b ? -1 : 1;
        }
        return 0;
    }

    // 1-bit result of a relational operator: x with any unknown bit.
    template <class Pred>
    static V relation(const V& l, const V& r, Pred pred) {
        if (l.width_ <= 64 && r.width_ <= 64) {
            bool s = signOf(l, r);
            Small x(l, s), y(r, s);
            if (x.b | y.b) return bitResult(kBitX);
            int c = s ? (static_cast<int64_t>(x.a) < static_cast<int64_t>(y.a) ? -1 : x.a != y.a)
                      : (x.a < y.a ? -1 : x.a != y.a);
            return bitResult(pred(c) ? kBit1 : kBit0);
        }
        if (l.hasUnknown() || r.hasUnknown()) return bitResult(kBitX);
        return bitResult(pred(compare(l, r)) ? kBit1 : kBit0);
    }

    // Logic equality code: 0 when a known bit differs, else x with an unknown bit, else 1.
    static unsigned equalCode(const V& l, const V& r) {
        bool s = signOf(l, r);
        uint32_t w = widthOf(l, r);
        if (w <= 64) {
            Small x(l, s), y(r, s);
            uint64_t m = mask64(w);
            uint64_t u = (x.b | y.b) & m;
            if ((x.a ^ y.a) & ~u & m) return kBit0;
            return u ? kBitX : kBit1;
        }
        Ext x(l, s), y(r, s);
        uint32_t n = V::wordsFor(widthOf(l, r));
        uint32_t top = Word::maskOf(topBits(widthOf(l, r)));
        bool unknown = false;
        for (uint32_t i = 0; i < n; ++i) {
            Limb a = x.at(i), b = y.at(i);
            uint32_t m = i + 1 == n ? top : 0xFFFFFFFFu;
            uint32_t u = (a.b | b.b) & m;
            if ((a.a ^ b.a) & ~u & m) return kBit0;
            unknown = unknown || u;
        }
        return unknown ? kBitX : kBit1;
    }

    // Bits where ignore(a, b) is set are not compared; the rest must match exactly.
    template <class Ignore>
    static bool maskedEqual(const V& l, const V& r, Ignore ignore) {
        bool s = signOf(l, r);
        Ext x(l, s), y(r, s);
        uint32_t w = widthOf(l, r);
        uint32_t n = V::wordsFor(w);
        uint32_t top = Word::maskOf(topBits(w));
        for (uint32_t i = 0; i < n; ++i) {
            Limb a = x.at(i), b = y.at(i);
            uint32_t m = (i + 1 == n ? top : 0xFFFFFFFFu) & ~ignore(a, b);
            if (((a.a ^ b.a) | (a.b ^ b.b)) & m) return false;
        }
        return true;
    }

    // Word reductions combined with the same table, stopping at the deciding code.
    static unsigned reduce(const V& v, unsigned start, unsigned decided, unsigned (Word::*wordReduce)() const,
                           unsigned (*combine)(unsigned, unsigned)) {
        unsigned code = start;
        for (uint32_t i = 0, n = v.wordCount(); i < n && code != decided; ++i)
            code = combine(code, (v.word(i).*wordReduce)());
        return code;
    }
    static unsigned reduceOrCode(const V& v) { return reduce(v, kBit0, kBit1, &Word::reduceOr, Word::orCode); }
    static unsigned reduceAndCode(const V& v) { return reduce(v, kBit1, kBit0, &Word::reduceAnd, Word::andCode); }
    static unsigned reduceXorCode(const V& v) { return reduce(v, kBit0, kBitX, &Word::reduceXor, Word::xorCode); }

    // Bits move up by count; vacated bits are 0.
    static V shiftUp(const V& v, uint32_t count) {
        if (count == 0) return v;
        V res = sameShape(v);
        Limb* out = res.words();
        uint32_t n = res.wordCount();
        if (count >= v.width_) {
            for (uint32_t i = 0; i < n; ++i) out[i] = Limb{0, 0};
            return res;
        }
        const Limb* in = v.words();
        uint32_t ws = count / 32, bs = count % 32;
        for (uint32_t i = n; i-- > 0;) {
            if (i < ws) {
                out[i] = Limb{0, 0};
                continue;
            }
            Limb hi = in[i - ws];
            Limb lo = i > ws ? in[i - ws - 1] : Limb{0, 0};
            out[i] = bs == 0 ? hi
                             : Limb{(hi.a << bs) | (lo.a >> (32 - bs)), (hi.b << bs) | (lo.b >> (32 - bs))};
        }
        res.maskTop();
        return res;
    }

    // Bits move down by count; vacated bits take the fill code.
    static V shiftDown(const V& v, uint32_t count, unsigned fill) {
        if (count == 0) return v;
        V res = sameShape(v);
        Ext e(v, Ext::Fill{fill});
        Limb* out = res.words();
        uint32_t n = res.wordCount();
        if (count >= v.width_) {
            for (uint32_t i = 0; i < n; ++i) out[i] = Limb{e.fa, e.fb};
            res.maskTop();
            return res;
        }
        uint32_t ws = count / 32, bs = count % 32;
        for (uint32_t i = 0; i < n; ++i) {
            Limb lo = e.at(i + ws);
            Limb hi = e.at(i + ws + 1);
            out[i] = bs == 0 ? lo
                             : Limb{(lo.a >> bs) | (hi.a << (32 - bs)), (lo.b >> bs) | (hi.b << (32 - bs))};
        }
        res.maskTop();
        return res;
    }

    // Up to 32 bits of src from offset (both planes), low-aligned.
    static Limb readBits(const Limb* src, uint32_t offset, uint32_t count) {
        uint32_t si = offset / 32, sb = offset % 32;
        Limb f{src[si].a >> sb, src[si].b >> sb};
        if (sb && sb + count > 32) {
            f.a |= src[si + 1].a << (32 - sb);
            f.b |= src[si + 1].b << (32 - sb);
        }
        uint32_t m = Word::maskOf(count);
        return Limb{f.a & m, f.b & m};
    }

    // Up to 32 low bits of value into dst at offset.
    static void writeBits(Limb* dst, uint32_t offset, uint32_t count, Limb value) {
        uint32_t m = Word::maskOf(count);
        uint32_t di = offset / 32, db = offset % 32;
        dst[di].a = (dst[di].a & ~(m << db)) | ((value.a & m) << db);
        dst[di].b = (dst[di].b & ~(m << db)) | ((value.b & m) << db);
        if (db && db + count > 32) {
            uint32_t m2 = m >> (32 - db);
            dst[di + 1].a = (dst[di + 1].a & ~m2) | ((value.a & m) >> (32 - db));
            dst[di + 1].b = (dst[di + 1].b & ~m2) | ((value.b & m) >> (32 - db));
        }
    }

    // count bits of src from srcOff into dst at dstOff.
    static void copyBits(Limb* dst, uint32_t dstOff, const Limb* src, uint32_t srcOff, uint32_t count) {
        while (count > 0) {
            uint32_t chunk = count < 32 ? count : 32;
            writeBits(dst, dstOff, chunk, readBits(src, srcOff, chunk));
            count -= chunk;
            srcOff += chunk;
            dstOff += chunk;
        }
    }

    static Limb field(const V& v, uint32_t offset, uint32_t count) { return readBits(v.words(), offset, count); }

    // Digits of a group text (octal, hex): x/X, z/Z rules per group.
    static Port_String groupText(const V& v, uint32_t bitsPerDigit) {
        static const char digits[] = "0123456789abcdef";
        uint32_t count = (v.width_ + bitsPerDigit - 1) / bitsPerDigit;
        std::string text(count, '0');
        for (uint32_t d = 0; d < count; ++d) {
            uint32_t off = d * bitsPerDigit;
            uint32_t len = v.width_ - off < bitsPerDigit ? v.width_ - off : bitsPerDigit;
            Limb f = field(v, off, len);
            uint32_t m = Word::maskOf(len);
            uint32_t x = f.a & f.b, z = ~f.a & f.b & m;
            char c;
            if (x) c = x == m ? 'x' : 'X';
            else if (z) c = z == m ? 'z' : 'Z';
            else c = digits[f.a];
            text[count - 1 - d] = c;
        }
        return Port_String(std::move(text));
    }
};

typedef Tn_VerilogVectorOps Ops;

// ---- construction and storage ----

Tn_VerilogVector::Tn_VerilogVector(UninitTag, uint32_t width)
    : width_(0), msb_(0), lsb_(0), base_(Tn_Verilog::Binary), signed_(false), unsized_(false) {
    allocate(width);
    boundsFromWidth();
}

Tn_VerilogVector::Tn_VerilogVector() : Tn_VerilogVector(false, 1u) {}

Tn_VerilogVector::Tn_VerilogVector(bool isSigned, uint32_t width)
    : width_(0), msb_(0), lsb_(0), base_(Tn_Verilog::Binary), signed_(isSigned), unsized_(width == 0) {
    allocate(width == 0 ? 32 : width);
    boundsFromWidth();
    fill(kBitX);
}

Tn_VerilogVector::Tn_VerilogVector(bool isSigned, int32_t msb, int32_t lsb)
    : width_(0), msb_(msb), lsb_(lsb), base_(Tn_Verilog::Binary), signed_(isSigned), unsized_(false) {
    int64_t span = int64_t(msb) - lsb;
    if (span < 0) span = -span;
    allocate(span >= 0xFFFFFFFFll ? 0xFFFFFFFFu : static_cast<uint32_t>(span + 1));
    fill(kBitX);
}

Tn_VerilogVector::Tn_VerilogVector(int32_t value)
    : width_(0), msb_(0), lsb_(0), base_(Tn_Verilog::Decimal), signed_(true), unsized_(false) {
    allocate(32);
    boundsFromWidth();
    inline_[0] = Limb{static_cast<uint32_t>(value), 0};
}

Tn_VerilogVector::Tn_VerilogVector(double value)
    : width_(0), msb_(0), lsb_(0), base_(Tn_Verilog::Decimal), signed_(true), unsized_(false) {
    allocate(64);
    boundsFromWidth();
    if (!std::isfinite(value)) {
        fill(kBitX);
        return;
    }
    double r = std::round(value);
    // Integral doubles beyond 64 bits keep their low 64 bits (two's complement wrap).
    double mag = std::fmod(std::fabs(r), 18446744073709551616.0);
    uint64_t bits = static_cast<uint64_t>(mag);
    if (r < 0) bits = 0 - bits;
    inline_[0] = Limb{static_cast<uint32_t>(bits), 0};
    inline_[1] = Limb{static_cast<uint32_t>(bits >> 32), 0};
}

Tn_VerilogVector::Tn_VerilogVector(Tn_Verilog::BaseType base, bool isSigned, uint32_t width, const char* digits,
                                   size_t length)
    : width_(0), msb_(0), lsb_(0), base_(static_cast<uint8_t>(base)), signed_(isSigned), unsized_(false) {
    if (!digits) length = 0;
    if (base == Tn_Verilog::String) {
        if (width == 0) width = length == 0 ? 8 : static_cast<uint32_t>(length * 8 > 0xFFFFFFFFull ? 0xFFFFFFF8u : length * 8);
        allocate(width);
        boundsFromWidth();
        fill(kBit0);
        Limb* w = words();
        // Last character lowest; characters that do not fit are dropped.
        for (uint64_t i = 0; i < length && i * 8 < width; ++i) {
            uint32_t off = static_cast<uint32_t>(i * 8);
            uint32_t ch = static_cast<unsigned char>(digits[length - 1 - i]);
            uint32_t take = width - off < 8 ? width - off : 8;
            Limb one{ch & Word::maskOf(take), 0};
            Ops::writeBits(w, off, take, one);
        }
        return;
    }
    unsized_ = width == 0;
    allocate(width == 0 ? 32 : width);
    boundsFromWidth();
    fill(kBit0);
    Limb* w = words();
    uint32_t n = wordCount();
    if (base == Tn_Verilog::Decimal) {
        size_t i = 0;
        bool minus = length > 0 && digits[0] == '-';
        if (minus) ++i;
        while (i < length && digits[i] == '_') ++i;
        char first = i < length ? digits[i] : '0';
        if (first == 'x' || first == 'X') {
            fill(kBitX);
        } else if (first == 'z' || first == 'Z' || first == '?') {
            fill(kBitZ);
        } else if (width_ <= 64) {
            uint64_t v = 0;
            for (; i < length; ++i) {
                char c = digits[i];
                if (c == '_') continue;
                v = v * 10 + static_cast<uint64_t>(c >= '0' && c <= '9' ? c - '0' : 0);
            }
            v &= mask64(width_);
            w[0].a = static_cast<uint32_t>(v);
            if (n > 1) w[1].a = static_cast<uint32_t>(v >> 32);
        } else {
            // Digits above the lowest `width` do not change the value modulo
            // 2^width (10^k is a multiple of 2^k), so they are skipped, and
            // the rest are taken nine at a time: the work is bounded by the
            // width, not by the length of the text.
            size_t count = 0;
            for (size_t j = i; j < length; ++j) count += digits[j] != '_';
            for (; count > width_ && i < length; ++i) count -= digits[i] != '_';
            while (i < length) {
                uint32_t chunk = 0, scale = 1;
                for (int k = 0; k < 9 && i < length; ++i) {
                    const char c = digits[i];
                    if (c == '_') continue;
                    chunk = chunk * 10 + static_cast<uint32_t>(c >= '0' && c <= '9' ? c - '0' : 0);
                    scale *= 10;
                    ++k;
                }
                uint64_t carry = chunk;
                for (uint32_t k = 0; k < n; ++k) {
                    const uint64_t t = uint64_t(w[k].a) * scale + carry;
                    w[k].a = static_cast<uint32_t>(t);
                    carry = t >> 32;
                }
            }
            maskTop();
        }
        if (minus) *this = negate();
        return;
    }
    uint32_t bitsPerDigit = base == Tn_Verilog::Binary ? 1 : base == Tn_Verilog::Octal ? 3 : 4;
    uint64_t off = 0;
    unsigned lead = kBit0;
    for (size_t i = length; i-- > 0;) {
        char c = digits[i];
        if (c == '_') continue;
        unsigned code = kBit0;
        uint32_t value = 0;
        if (c == 'x' || c == 'X') code = kBitX;
        else if (c == 'z' || c == 'Z' || c == '?') code = kBitZ;
        else value = static_cast<uint32_t>(digitValue(c)) & Word::maskOf(bitsPerDigit);
        lead = code;
        if (off >= width_) continue;
        uint32_t take = width_ - off < bitsPerDigit ? static_cast<uint32_t>(width_ - off) : bitsPerDigit;
        uint32_t m = Word::maskOf(take);
        Limb d{code == kBit0 ? value & m : ones(code & 1u) & m, ones(code & 2u) & m};
        Ops::writeBits(w, static_cast<uint32_t>(off), take, d);
        off += bitsPerDigit;
    }
    // Fewer digits than bits: an x or z leading digit extends itself.
    if (lead != kBit0 && off < width_) {
        for (uint32_t b = static_cast<uint32_t>(off); b < width_; ++b) setBit(b, lead);
    }
}

Tn_VerilogVector::Tn_VerilogVector(Tn_Verilog::BaseType base, bool isSigned, uint32_t width, const char* digits)
    : Tn_VerilogVector(base, isSigned, width, digits, digits ? std::strlen(digits) : 0) {}

Tn_VerilogVector::Tn_VerilogVector(Tn_Verilog::BaseType base, bool isSigned, uint32_t width, const Port_String& digits)
    : Tn_VerilogVector(base, isSigned, width, digits.c_str(), digits.str().size()) {}

Tn_VerilogVector::Tn_VerilogVector(const Tn_VerilogVector& o) : width_(0) { copyFrom(o); }

Tn_VerilogVector::Tn_VerilogVector(Tn_VerilogVector&& o) noexcept : width_(1) { takeFrom(o); }

Tn_VerilogVector& Tn_VerilogVector::operator=(const Tn_VerilogVector& o) {
    if (this != &o) {
        release();
        copyFrom(o);
    }
    return *this;
}

Tn_VerilogVector& Tn_VerilogVector::operator=(Tn_VerilogVector&& o) noexcept {
    if (this != &o) {
        release();
        takeFrom(o);
    }
    return *this;
}

Tn_VerilogVector::~Tn_VerilogVector() { release(); }

namespace {

// Word arrays of wide vectors come from free lists by power-of-two size, so
// a wide result value costs no allocation beyond the value object once the
// lists are warm. Small and bounded; off under AddressSanitizer, which must
// see every allocation.
#if defined(__SANITIZE_ADDRESS__)
void* getWords(size_t bytes) { return kor_malloc(bytes); }
void putWords(void* p, size_t) { kor_free(p); }
#else
class WordPool {
public:
    WordPool() { alive = true; }
    ~WordPool() {
        alive = false;  // vectors that outlive the pool free their words directly
        for (auto& list : free_)
            for (void* p : list) kor_free(p);
    }
    static bool alive;
    void* get(size_t bytes) {
        const size_t c = sizeClass(bytes);
        if (c < kClasses && !free_[c].empty()) {
            void* p = free_[c].back();
            free_[c].pop_back();
            return p;
        }
        return kor_malloc(c < kClasses ? kMinBytes << c : bytes);
    }
    void put(void* p, size_t bytes) {
        const size_t c = sizeClass(bytes);
        if (c < kClasses && free_[c].size() < kPerClass)
            free_[c].push_back(p);
        else
            kor_free(p);
    }

private:
    static const size_t kMinBytes = 32;
    static const size_t kClasses = 12;   // up to 64 KiB of words
    static const size_t kPerClass = 64;
    static size_t sizeClass(size_t bytes) {
        size_t c = 0;
        while ((kMinBytes << c) < bytes) ++c;
        return c;
    }
    std::vector<void*> free_[kClasses];
};

bool WordPool::alive = false;
WordPool& pool() {
    static WordPool p;
    return p;
}
void* getWords(size_t bytes) { return pool().get(bytes); }
void putWords(void* p, size_t bytes) {
    if (WordPool::alive)
        pool().put(p, bytes);
    else
        kor_free(p);
}
#endif

}  // namespace

void Tn_VerilogVector::allocate(uint32_t width) {
    width_ = width == 0 ? 1 : width;
    if (isInline()) {
        inline_[0] = inline_[1] = Limb{0, 0};
    } else {
        heap_ = static_cast<Limb*>(getWords(size_t(wordsFor(width_)) * sizeof(Limb)));
        if (!heap_) {
            width_ = 1;
            throw std::bad_alloc();
        }
    }
}

void Tn_VerilogVector::release() {
    if (!isInline()) putWords(heap_, size_t(wordsFor(width_)) * sizeof(Limb));
    width_ = 1;
}

void Tn_VerilogVector::takeFrom(Tn_VerilogVector& o) {
    width_ = o.width_;
    msb_ = o.msb_;
    lsb_ = o.lsb_;
    base_ = o.base_;
    signed_ = o.signed_;
    unsized_ = o.unsized_;
    if (o.isInline()) {
        inline_[0] = o.inline_[0];
        inline_[1] = o.inline_[1];
        return;
    }
    heap_ = o.heap_;
    // The source stays a valid vector: one bit x.
    o.width_ = 1;
    o.msb_ = o.lsb_ = 0;
    o.inline_[0] = Limb{1, 1};
    o.inline_[1] = Limb{0, 0};
}

void Tn_VerilogVector::copyFrom(const Tn_VerilogVector& o) {
    allocate(o.width_);
    msb_ = o.msb_;
    lsb_ = o.lsb_;
    base_ = o.base_;
    signed_ = o.signed_;
    unsized_ = o.unsized_;
    std::memcpy(words(), o.words(), wordCount() * sizeof(Limb));
}

void Tn_VerilogVector::fill(unsigned code) {
    Limb f{ones(code & 1u), ones(code & 2u)};
    Limb* w = words();
    for (uint32_t i = 0, n = wordCount(); i < n; ++i) w[i] = f;
    maskTop();
}

void Tn_VerilogVector::maskTop() {
    Limb& top = words()[wordCount() - 1];
    uint32_t m = topMask();
    top.a &= m;
    top.b &= m;
}

void Tn_VerilogVector::boundsFromWidth() {
    lsb_ = 0;
    msb_ = static_cast<int32_t>(width_ - 1);
}

bool Tn_VerilogVector::operator==(const Tn_VerilogVector& o) const {
    if (width_ != o.width_ || msb_ != o.msb_ || lsb_ != o.lsb_ || base_ != o.base_ || signed_ != o.signed_ ||
        unsized_ != o.unsized_)
        return false;
    return std::memcmp(words(), o.words(), wordCount() * sizeof(Limb)) == 0;
}

bool Tn_VerilogVector::setBounds(int32_t msb, int32_t lsb) {
    int64_t span = int64_t(msb) - lsb;
    if ((span < 0 ? -span : span) + 1 != int64_t(width_)) return false;
    msb_ = msb;
    lsb_ = lsb;
    return true;
}

bool Tn_VerilogVector::offsetOf(int32_t index, uint32_t& offset) const {
    int64_t off = msb_ >= lsb_ ? int64_t(index) - lsb_ : int64_t(lsb_) - index;
    if (off < 0 || off >= int64_t(width_)) return false;
    offset = static_cast<uint32_t>(off);
    return true;
}

Tn_VerilogVectorWord Tn_VerilogVector::word(uint32_t index) const {
    if (index >= wordCount()) return Tn_VerilogVectorWord(32, 0, 0);
    const Limb& l = words()[index];
    return Tn_VerilogVectorWord(index + 1 == wordCount() ? topBits(width_) : 32, l.a, l.b);
}

void Tn_VerilogVector::setWord(uint32_t index, const Tn_VerilogVectorWord& w) {
    if (index >= wordCount()) return;
    uint32_t m = index + 1 == wordCount() ? topMask() : 0xFFFFFFFFu;
    words()[index] = Limb{w.aval() & m, w.bval() & m};
}

unsigned Tn_VerilogVector::bit(uint32_t offset) const {
    if (offset >= width_) return kBitX;
    const Limb& l = words()[offset / 32];
    uint32_t s = offset % 32;
    return ((l.a >> s) & 1u) | (((l.b >> s) & 1u) << 1);
}

void Tn_VerilogVector::setBit(uint32_t offset, unsigned code) {
    if (offset >= width_) return;
    Limb& l = words()[offset / 32];
    uint32_t m = 1u << (offset % 32);
    l.a = (code & 1u) ? l.a | m : l.a & ~m;
    l.b = (code & 2u) ? l.b | m : l.b & ~m;
}

bool Tn_VerilogVector::hasUnknown() const {
    const Limb* w = words();
    for (uint32_t i = 0, n = wordCount(); i < n; ++i)
        if (w[i].b) return true;
    return false;
}

bool Tn_VerilogVector::isAllX() const {
    const Limb* w = words();
    uint32_t n = wordCount();
    for (uint32_t i = 0; i + 1 < n; ++i)
        if (w[i].a != 0xFFFFFFFFu || w[i].b != 0xFFFFFFFFu) return false;
    return w[n - 1].a == topMask() && w[n - 1].b == topMask();
}

bool Tn_VerilogVector::isAllZ() const {
    const Limb* w = words();
    uint32_t n = wordCount();
    for (uint32_t i = 0; i + 1 < n; ++i)
        if (w[i].a != 0 || w[i].b != 0xFFFFFFFFu) return false;
    return w[n - 1].a == 0 && w[n - 1].b == topMask();
}

bool Tn_VerilogVector::isZero() const {
    const Limb* w = words();
    for (uint32_t i = 0, n = wordCount(); i < n; ++i)
        if (w[i].a | w[i].b) return false;
    return true;
}

bool Tn_VerilogVector::isNegative() const { return signed_ && bit(width_ - 1) == kBit1; }

// ---- resizing ----

Tn_VerilogVector Tn_VerilogVector::resized(uint32_t width) const {
    if (width == 0) width = 1;
    if (width == width_) return *this;
    Tn_VerilogVector res(UninitTag(), width);
    res.signed_ = signed_;
    res.unsized_ = unsized_;
    res.base_ = base_;
    res.lsb_ = lsb_;
    res.msb_ = Ops::movedMsb(*this, width);
    Ops::Ext e(*this, signed_);
    Limb* out = res.words();
    for (uint32_t i = 0, n = res.wordCount(); i < n; ++i) out[i] = e.at(i);
    res.maskTop();
    return res;
}

Tn_VerilogVector Tn_VerilogVector::resized(bool isSigned, uint32_t width) const {
    Tn_VerilogVector res = *this;
    res.signed_ = isSigned;
    return res.resized(width);
}

// ---- binary operators ----

Tn_VerilogVector Tn_VerilogVector::bitAnd(const Tn_VerilogVector& r) const { return Ops::bitwise(*this, r, Word::bitAnd); }
Tn_VerilogVector Tn_VerilogVector::bitOr(const Tn_VerilogVector& r) const { return Ops::bitwise(*this, r, Word::bitOr); }
Tn_VerilogVector Tn_VerilogVector::bitXor(const Tn_VerilogVector& r) const { return Ops::bitwise(*this, r, Word::bitXor); }
Tn_VerilogVector Tn_VerilogVector::bitXnor(const Tn_VerilogVector& r) const { return Ops::bitwise(*this, r, Word::bitXnor); }
Tn_VerilogVector Tn_VerilogVector::merge(const Tn_VerilogVector& r) const { return Ops::bitwise(*this, r, Word::merge); }
Tn_VerilogVector Tn_VerilogVector::add(const Tn_VerilogVector& r) const { return Ops::addSub(*this, r, false); }
Tn_VerilogVector Tn_VerilogVector::subtract(const Tn_VerilogVector& r) const { return Ops::addSub(*this, r, true); }
Tn_VerilogVector Tn_VerilogVector::multiply(const Tn_VerilogVector& r) const { return Ops::multiply(*this, r); }
Tn_VerilogVector Tn_VerilogVector::divide(const Tn_VerilogVector& r) const { return Ops::divide(*this, r, false); }
Tn_VerilogVector Tn_VerilogVector::modulus(const Tn_VerilogVector& r) const { return Ops::divide(*this, r, true); }
Tn_VerilogVector Tn_VerilogVector::power(const Tn_VerilogVector& exponent) const { return Ops::power(*this, exponent); }

Tn_VerilogVector Tn_VerilogVector::equal(const Tn_VerilogVector& r) const { return Ops::bitResult(Ops::equalCode(*this, r)); }
Tn_VerilogVector Tn_VerilogVector::notEqual(const Tn_VerilogVector& r) const {
    return Ops::bitResult(Word::notCode(Ops::equalCode(*this, r)));
}

Tn_VerilogVector Tn_VerilogVector::caseEqual(const Tn_VerilogVector& r) const {
    return Ops::bitResult(Ops::maskedEqual(*this, r, [](Limb, Limb) { return 0u; }) ? kBit1 : kBit0);
}

Tn_VerilogVector Tn_VerilogVector::caseNotEqual(const Tn_VerilogVector& r) const {
    return Ops::bitResult(Ops::maskedEqual(*this, r, [](Limb, Limb) { return 0u; }) ? kBit0 : kBit1);
}

bool Tn_VerilogVector::caseZEqual(const Tn_VerilogVector& r) const {
    return Ops::maskedEqual(*this, r, [](Limb x, Limb y) { return (~x.a & x.b) | (~y.a & y.b); });
}

bool Tn_VerilogVector::caseXEqual(const Tn_VerilogVector& r) const {
    return Ops::maskedEqual(*this, r, [](Limb x, Limb y) { return x.b | y.b; });
}

Tn_VerilogVector Tn_VerilogVector::lessThan(const Tn_VerilogVector& r) const {
    return Ops::relation(*this, r, [](int c) { return c < 0; });
}
Tn_VerilogVector Tn_VerilogVector::lessEqual(const Tn_VerilogVector& r) const {
    return Ops::relation(*this, r, [](int c) { return c <= 0; });
}
Tn_VerilogVector Tn_VerilogVector::greaterThan(const Tn_VerilogVector& r) const {
    return Ops::relation(*this, r, [](int c) { return c > 0; });
}
Tn_VerilogVector Tn_VerilogVector::greaterEqual(const Tn_VerilogVector& r) const {
    return Ops::relation(*this, r, [](int c) { return c >= 0; });
}

Tn_VerilogVector Tn_VerilogVector::logicalAnd(const Tn_VerilogVector& r) const {
    return Ops::bitResult(Word::andCode(Ops::reduceOrCode(*this), Ops::reduceOrCode(r)));
}
Tn_VerilogVector Tn_VerilogVector::logicalOr(const Tn_VerilogVector& r) const {
    return Ops::bitResult(Word::orCode(Ops::reduceOrCode(*this), Ops::reduceOrCode(r)));
}

// ---- shifts ----

Tn_VerilogVector Tn_VerilogVector::shiftLeft(uint32_t count) const { return Ops::shiftUp(*this, count); }
Tn_VerilogVector Tn_VerilogVector::arithShiftLeft(uint32_t count) const { return Ops::shiftUp(*this, count); }
Tn_VerilogVector Tn_VerilogVector::shiftRight(uint32_t count) const { return Ops::shiftDown(*this, count, kBit0); }
Tn_VerilogVector Tn_VerilogVector::arithShiftRight(uint32_t count) const {
    return Ops::shiftDown(*this, count, signed_ ? bit(width_ - 1) : kBit0);
}

// ---- unary operators ----

Tn_VerilogVector Tn_VerilogVector::bitNot() const {
    Tn_VerilogVector res = Ops::sameShape(*this);
    const Limb* in = words();
    Limb* out = res.words();
    for (uint32_t i = 0, n = wordCount(); i < n; ++i) out[i] = Limb{~in[i].a | in[i].b, in[i].b};
    res.maskTop();
    return res;
}

Tn_VerilogVector Tn_VerilogVector::negate() const {
    Tn_VerilogVector zero = Ops::sameShape(*this);
    zero.fill(kBit0);
    Tn_VerilogVector res = Ops::addSub(zero, *this, true);
    res.signed_ = signed_;
    res.unsized_ = unsized_;
    res.base_ = base_;
    return res;
}

Tn_VerilogVector Tn_VerilogVector::logicalNot() const { return Ops::bitResult(Word::notCode(Ops::reduceOrCode(*this))); }
Tn_VerilogVector Tn_VerilogVector::reduceAnd() const { return Ops::bitResult(Ops::reduceAndCode(*this)); }
Tn_VerilogVector Tn_VerilogVector::reduceNand() const { return Ops::bitResult(Word::notCode(Ops::reduceAndCode(*this))); }
Tn_VerilogVector Tn_VerilogVector::reduceOr() const { return Ops::bitResult(Ops::reduceOrCode(*this)); }
Tn_VerilogVector Tn_VerilogVector::reduceNor() const { return Ops::bitResult(Word::notCode(Ops::reduceOrCode(*this))); }
Tn_VerilogVector Tn_VerilogVector::reduceXor() const { return Ops::bitResult(Ops::reduceXorCode(*this)); }
Tn_VerilogVector Tn_VerilogVector::reduceXnor() const { return Ops::bitResult(Word::notCode(Ops::reduceXorCode(*this))); }

// ---- bit ranges ----

Tn_VerilogVector Tn_VerilogVector::concat(const Tn_VerilogVector& low) const {
    uint64_t total = uint64_t(width_) + low.width_;
    Tn_VerilogVector res(UninitTag(), total > 0xFFFFFFFFull ? 0xFFFFFFFFu : static_cast<uint32_t>(total));
    res.fill(kBit0);
    Ops::copyBits(res.words(), 0, low.words(), 0, low.width_);
    if (low.width_ < res.width_) Ops::copyBits(res.words(), low.width_, words(), 0, res.width_ - low.width_);
    return res;
}

Tn_VerilogVector Tn_VerilogVector::slice(uint32_t offset, uint32_t width) const {
    Tn_VerilogVector res(UninitTag(), width == 0 ? 1 : width);
    res.fill(kBitX);
    if (offset < width_) {
        uint32_t count = width_ - offset < res.width_ ? width_ - offset : res.width_;
        Ops::copyBits(res.words(), 0, words(), offset, count);
    }
    return res;
}

// ---- conversions ----

bool Tn_VerilogVector::toBool() const { return Ops::reduceOrCode(*this) == kBit1; }

int32_t Tn_VerilogVector::toInt() const {
    if (hasUnknown()) return 0;
    uint32_t a = words()[0].a;
    if (signed_ && width_ < 32 && ((a >> (width_ - 1)) & 1u)) a |= ~Word::maskOf(width_);
    return static_cast<int32_t>(a);
}

int64_t Tn_VerilogVector::toInt64() const {
    if (hasUnknown()) return 0;
    uint64_t a = width_ <= 64 ? Ops::Small(*this, signed_).a
                              : uint64_t(words()[0].a) | (uint64_t(words()[1].a) << 32);
    return static_cast<int64_t>(a);
}

uint32_t Tn_VerilogVector::toCount() const {
    if (hasUnknown()) return 0;
    const Limb* w = words();
    for (uint32_t i = 1, n = wordCount(); i < n; ++i)
        if (w[i].a) return 0xFFFFFFFFu;
    return w[0].a;
}

double Tn_VerilogVector::toReal() const {
    if (hasUnknown()) return 0.0;
    if (width_ <= 64) {
        int64_t v = toInt64();
        return signed_ ? static_cast<double>(v) : static_cast<double>(static_cast<uint64_t>(v));
    }
    uint32_t n = wordCount();
    Limbs mag(n);
    bool negative = Ops::magnitude(*this, mag);
    uint32_t top = significant(mag.data(), n);
    if (top == 0) return 0.0;
    // The 64 bits below the top set bit, with the rest folded into a sticky
    // bit, round exactly as the whole number would.
    unsigned lead = 31u - static_cast<unsigned>(__builtin_clz(mag[top - 1]));
    int64_t msbPos = int64_t(top - 1) * 32 + lead;
    uint64_t chunk = 0;
    bool sticky = false;
    for (int64_t b = msbPos, k = 0; b >= 0; --b, ++k) {
        uint32_t bitv = (mag[static_cast<uint32_t>(b / 32)] >> (b % 32)) & 1u;
        if (k < 64) chunk = (chunk << 1) | bitv;
        else if (bitv) { sticky = true; break; }
    }
    int64_t used = msbPos + 1 < 64 ? msbPos + 1 : 64;
    if (sticky) chunk |= 1;
    double d = std::ldexp(static_cast<double>(chunk), static_cast<int>(msbPos + 1 - used));
    return negative ? -d : d;
}

// ---- text forms ----

Port_String Tn_VerilogVector::toBinaryText() const {
    static const char codes[] = {'0', '1', 'z', 'x'};
    std::string text(width_, '0');
    for (uint32_t i = 0; i < width_; ++i) text[width_ - 1 - i] = codes[bit(i)];
    return Port_String(std::move(text));
}

Port_String Tn_VerilogVector::toOctalText() const { return Ops::groupText(*this, 3); }
Port_String Tn_VerilogVector::toHexText() const { return Ops::groupText(*this, 4); }

Port_String Tn_VerilogVector::toDecimalText() const {
    if (hasUnknown()) {
        const Limb* w = words();
        uint32_t n = wordCount();
        bool anyX = false, anyZ = false;
        for (uint32_t i = 0; i < n; ++i) {
            anyX = anyX || (w[i].a & w[i].b);
            anyZ = anyZ || (~w[i].a & w[i].b);
        }
        if (anyX) return isAllX() ? "x" : "X";
        if (anyZ) return isAllZ() ? "z" : "Z";
    }
    if (width_ <= 64) {
        uint64_t v = static_cast<uint64_t>(toInt64());
        bool negative = signed_ && (v >> 63);
        return decimalText(negative ? 0 - v : v, negative);
    }
    uint32_t n = wordCount();
    Limbs mag(n);
    bool negative = Ops::magnitude(*this, mag);
    uint32_t top = significant(mag.data(), n);
    if (top <= 2) return decimalText(uint64_t(mag[0]) | (top > 1 ? uint64_t(mag[1]) << 32 : 0), negative);
    std::string text = magnitudeText(mag.data(), top);
    if (negative) text.insert(text.begin(), '-');
    return Port_String(std::move(text));
}

Port_String Tn_VerilogVector::toCharText() const {
    uint32_t count = (width_ + 7) / 8;
    std::string text(count, '\0');
    for (uint32_t c = 0; c < count; ++c) {
        uint32_t off = c * 8;
        uint32_t len = width_ - off < 8 ? width_ - off : 8;
        text[count - 1 - c] = static_cast<char>(Ops::field(*this, off, len).a);
    }
    return Port_String(std::move(text));
}

Port_String Tn_VerilogVector::toBaseText() const {
    switch (base_) {
    case Tn_Verilog::Decimal: return toDecimalText();
    case Tn_Verilog::Octal: return toOctalText();
    case Tn_Verilog::Hex: return toHexText();
    case Tn_Verilog::String: return toCharText();
    default: return toBinaryText();
    }
}

Port_String Tn_VerilogVector::describe() const {
    if (base_ == Tn_Verilog::String) return "string constant \"" + toCharText() + "\"";
    Port_String text("based constant ");
    if (!unsized_) text += Port_String::doFormat("%u", width_);
    text += "'";
    if (signed_) text += "s";
    text += Tn_Verilog::baseTypeLetter(base_ <= Tn_Verilog::Hex ? base_ : uint32_t(Tn_Verilog::Binary));
    return text + toBaseText();
}

Port_String Tn_VerilogVector::debugText() const {
    Port_String text;
    for (uint32_t i = 0, n = wordCount(); i < n; ++i) text += word(i).debugText();
    return text;
}
