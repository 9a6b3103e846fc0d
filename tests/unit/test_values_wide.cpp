// Wide operands (65 to 1000 bits) cross-checked against a reference written
// another way: 16-bit limbs, bit-serial division and shifts, decimal text by
// repeated division by ten, and unsigned __int128 up to 128 bits. Also a
// bit-by-bit four-state reference for the word-level logic.
#include <gtest/gtest.h>

#include <algorithm>
#include <random>
#include <string>
#include <vector>

#include "verilog/tn_verilogvector.h"

namespace {

typedef Tn_VerilogVector Vec;

// A known w-bit pattern on 16-bit limbs.
struct Ref {
    uint32_t w;
    std::vector<uint16_t> d;

    explicit Ref(uint32_t width) : w(width), d((width + 15) / 16, 0) {}

    bool bit(uint32_t i) const { return i < w && ((d[i / 16] >> (i % 16)) & 1); }
    void set(uint32_t i, bool v) {
        if (v) d[i / 16] = static_cast<uint16_t>(d[i / 16] | (1u << (i % 16)));
        else d[i / 16] = static_cast<uint16_t>(d[i / 16] & ~(1u << (i % 16)));
    }
    void trim() {
        if (w % 16) d.back() = static_cast<uint16_t>(d.back() & ((1u << (w % 16)) - 1));
    }
    bool zero() const {
        return std::all_of(d.begin(), d.end(), [](uint16_t x) { return x == 0; });
    }
    bool negative() const { return bit(w - 1); }

    // The vector's bits extended to width (sign or zeros).
    static Ref of(const Vec& v, uint32_t width, bool isSigned) {
        Ref r(width);
        bool fill = isSigned && v.bit(v.width() - 1) == 1;
        for (uint32_t i = 0; i < width; ++i) r.set(i, i < v.width() ? v.bit(i) == 1 : fill);
        return r;
    }

    Ref plus(const Ref& o) const {
        Ref r(w);
        uint32_t carry = 0;
        for (size_t i = 0; i < d.size(); ++i) {
            uint32_t t = uint32_t(d[i]) + o.d[i] + carry;
            r.d[i] = static_cast<uint16_t>(t);
            carry = t >> 16;
        }
        r.trim();
        return r;
    }
    Ref inverted() const {
        Ref r(w);
        for (size_t i = 0; i < d.size(); ++i) r.d[i] = static_cast<uint16_t>(~d[i]);
        r.trim();
        return r;
    }
    static Ref one(uint32_t width) {
        Ref r(width);
        r.d[0] = 1;
        return r;
    }
    Ref negated() const { return inverted().plus(one(w)); }
    Ref minus(const Ref& o) const { return plus(o.negated()); }
    Ref times(const Ref& o) const {
        Ref r(w);
        size_t n = d.size();
        for (size_t i = 0; i < n; ++i) {
            uint32_t carry = 0;
            for (size_t j = 0; i + j < n; ++j) {
                uint32_t t = uint32_t(d[i]) * o.d[j] + r.d[i + j] + carry;
                r.d[i + j] = static_cast<uint16_t>(t);
                carry = t >> 16;
            }
        }
        r.trim();
        return r;
    }
    int compareUnsigned(const Ref& o) const {
        for (size_t i = d.size(); i-- > 0;)
            if (d[i] != o.d[i]) return d[i] < o.d[i] ? -1 : 1;
        return 0;
    }
    int compare(const Ref& o, bool isSigned) const {
        if (isSigned && negative() != o.negative()) return negative() ? -1 : 1;
        return compareUnsigned(o);
    }
    // Restoring division, one bit at a time.
    static void divmod(const Ref& a, const Ref& b, Ref& q, Ref& r) {
        q = Ref(a.w);
        r = Ref(a.w);
        for (uint32_t i = a.w; i-- > 0;) {
            uint32_t carry = a.bit(i) ? 1 : 0;
            for (size_t k = 0; k < r.d.size(); ++k) {
                uint32_t t = (uint32_t(r.d[k]) << 1) | carry;
                r.d[k] = static_cast<uint16_t>(t);
                carry = t >> 16;
            }
            r.trim();
            if (r.compareUnsigned(b) >= 0) {
                r = r.minus(b);
                q.set(i, true);
            }
        }
    }
    Ref shiftedUp(uint32_t n) const {
        Ref r(w);
        for (uint32_t i = n; i < w; ++i) r.set(i, bit(i - n));
        return r;
    }
    Ref shiftedDown(uint32_t n, bool fill) const {
        Ref r(w);
        for (uint32_t i = 0; i < w; ++i) r.set(i, uint64_t(i) + n < w ? bit(i + n) : fill);
        return r;
    }
    std::string hex() const {
        std::string s;
        for (uint32_t g = (w + 3) / 4; g-- > 0;) {
            unsigned v = 0;
            for (uint32_t k = 4; k-- > 0;) v = v * 2 + (bit(g * 4 + k) ? 1 : 0);
            s += "0123456789abcdef"[v];
        }
        return s;
    }
    std::string decimal(bool isSigned) const {
        Ref m = isSigned && negative() ? negated() : *this;
        std::string digits;
        do {
            uint32_t rem = 0;
            for (size_t i = m.d.size(); i-- > 0;) {
                uint32_t cur = (rem << 16) | m.d[i];
                m.d[i] = static_cast<uint16_t>(cur / 10);
                rem = cur % 10;
            }
            digits += static_cast<char>('0' + rem);
        } while (!m.zero());
        if (isSigned && negative()) digits += '-';
        std::reverse(digits.begin(), digits.end());
        return digits;
    }
};

// Operands with the shapes that reach the different paths: random bits, small
// and negative small magnitudes, powers of two, zero, one, all ones.
Vec randomVector(std::mt19937& rng, uint32_t width, bool isSigned) {
    Vec v(isSigned, width);
    uint32_t kind = rng() % 8;
    uint32_t significant = width;
    if (kind == 1 || kind == 2) significant = 1 + rng() % width;
    if (kind == 3) significant = std::min<uint32_t>(width, 1 + rng() % 64);
    for (uint32_t i = 0; i < width; ++i) {
        bool b;
        if (kind == 4) b = false;
        else if (kind == 5) b = i == 0;
        else if (kind == 6) b = true;
        else if (kind == 7) b = i == significant - 1 || i == rng() % width;
        else b = i < significant ? (rng() & 1) != 0 : kind == 2;
        v.setBit(i, b ? 1 : 0);
    }
    return v;
}

uint32_t randomWide(std::mt19937& rng) {
    // Favour the narrower wide widths to keep the reference affordable.
    uint32_t r = rng() % 100;
    if (r < 60) return 65 + rng() % 100;
    if (r < 90) return 165 + rng() % 300;
    return 465 + rng() % 536;
}

}  // namespace

TEST(VectorWide, ArithmeticComparisonsShiftsAndDecimalAgainstReference) {
    std::mt19937 rng(20240611u);
    const int kPairs = 10000;
    for (int iter = 0; iter < kPairs; ++iter) {
        uint32_t wl = randomWide(rng);
        uint32_t wr = rng() % 4 == 0 ? 1 + rng() % 200 : (rng() % 2 ? wl : randomWide(rng));
        bool sl = rng() % 2, sr = rng() % 3 != 0;
        Vec l = randomVector(rng, wl, sl), r = randomVector(rng, wr, sr);
        uint32_t w = std::max(wl, wr);
        bool s = sl && sr;
        Ref a = Ref::of(l, w, s), b = Ref::of(r, w, s);
        SCOPED_TRACE(testing::Message() << "pair " << iter << " l=" << wl << (sl ? "s'h" : "'h") << l.toHexText().str()
                                        << " r=" << wr << (sr ? "s'h" : "'h") << r.toHexText().str());

        ASSERT_EQ(l.add(r).toHexText().str(), a.plus(b).hex());
        ASSERT_EQ(l.subtract(r).toHexText().str(), a.minus(b).hex());
        ASSERT_EQ(l.multiply(r).toHexText().str(), a.times(b).hex());
        if (b.zero()) {
            ASSERT_TRUE(l.divide(r).isAllX());
            ASSERT_TRUE(l.modulus(r).isAllX());
        } else {
            bool na = s && a.negative(), nb = s && b.negative();
            Ref q(w), m(w);
            Ref::divmod(na ? a.negated() : a, nb ? b.negated() : b, q, m);
            ASSERT_EQ(l.divide(r).toHexText().str(), (na != nb ? q.negated() : q).hex());
            ASSERT_EQ(l.modulus(r).toHexText().str(), (na ? m.negated() : m).hex());
        }
        int c = a.compare(b, s);
        ASSERT_EQ(l.lessThan(r).toInt(), c < 0 ? 1 : 0);
        ASSERT_EQ(l.lessEqual(r).toInt(), c <= 0 ? 1 : 0);
        ASSERT_EQ(l.greaterThan(r).toInt(), c > 0 ? 1 : 0);
        ASSERT_EQ(l.greaterEqual(r).toInt(), c >= 0 ? 1 : 0);
        ASSERT_EQ(l.equal(r).toInt(), c == 0 ? 1 : 0);
        ASSERT_EQ(l.caseNotEqual(r).toInt(), c == 0 ? 0 : 1);

        uint32_t count = rng() % (wl + 40);
        Ref own = Ref::of(l, wl, sl);
        ASSERT_EQ(l.shiftLeft(count).toHexText().str(), own.shiftedUp(count).hex());
        ASSERT_EQ(l.shiftRight(count).toHexText().str(), own.shiftedDown(count, false).hex());
        ASSERT_EQ(l.arithShiftRight(count).toHexText().str(), own.shiftedDown(count, sl && own.negative()).hex());
        ASSERT_EQ(l.toDecimalText().str(), own.decimal(sl));

        if (iter % 8 == 0) {
            uint32_t e = rng() % 6;
            Ref p = Ref::one(wl);
            for (uint32_t k = 0; k < e; ++k) p = p.times(own);
            ASSERT_EQ(l.power(Vec(static_cast<int32_t>(e))).toHexText().str(), p.hex()) << "exponent " << e;
        }
    }
}

TEST(VectorWide, NativeWidthsAgainstInt128) {
    std::mt19937 rng(7u);
    typedef unsigned __int128 U;
    for (int iter = 0; iter < 3000; ++iter) {
        uint32_t w = 65 + rng() % 64;
        Vec l = randomVector(rng, w, false), r = randomVector(rng, w, false);
        U mask = w == 128 ? ~U(0) : (U(1) << w) - 1;
        auto value = [](const Vec& v) {
            U x = 0;
            for (uint32_t i = v.width(); i-- > 0;) x = (x << 1) | (v.bit(i) == 1 ? 1 : 0);
            return x;
        };
        auto text = [](U x) {
            std::string s;
            do {
                s += static_cast<char>('0' + static_cast<int>(x % 10));
                x /= 10;
            } while (x);
            std::reverse(s.begin(), s.end());
            return s;
        };
        U a = value(l), b = value(r);
        SCOPED_TRACE(testing::Message() << "iteration " << iter << " width " << w);
        ASSERT_EQ(value(l.add(r)), (a + b) & mask);
        ASSERT_EQ(value(l.subtract(r)), (a - b) & mask);
        ASSERT_EQ(value(l.multiply(r)), (a * b) & mask);
        if (b != 0) {
            ASSERT_EQ(value(l.divide(r)), a / b);
            ASSERT_EQ(value(l.modulus(r)), a % b);
        }
        ASSERT_EQ(l.lessThan(r).toInt(), a < b ? 1 : 0);
        ASSERT_EQ(l.toDecimalText().str(), text(a));
    }
}

TEST(VectorWide, FourStateLogicAgainstBitTables) {
    std::mt19937 rng(99u);
    auto codeAnd = [](unsigned a, unsigned b) { return a == 0 || b == 0 ? 0u : a == 1 && b == 1 ? 1u : 3u; };
    auto codeOr = [](unsigned a, unsigned b) { return a == 1 || b == 1 ? 1u : a == 0 && b == 0 ? 0u : 3u; };
    auto codeXor = [](unsigned a, unsigned b) { return a > 1 || b > 1 ? 3u : a ^ b; };
    for (int iter = 0; iter < 2000; ++iter) {
        uint32_t w = 1 + rng() % 150;
        Vec l(false, w), r(false, w);
        // Mostly known bits so that equality and the sums are not always x.
        for (uint32_t i = 0; i < w; ++i) {
            l.setBit(i, rng() % 10 == 0 ? 2 + rng() % 2 : rng() % 2);
            r.setBit(i, rng() % 10 == 0 ? 2 + rng() % 2 : rng() % 2);
        }
        if (rng() % 3 == 0) r = l;
        SCOPED_TRACE(testing::Message() << "l=" << l.toBinaryText().str() << " r=" << r.toBinaryText().str());
        Vec vAnd = l.bitAnd(r), vOr = l.bitOr(r), vXor = l.bitXor(r), vXnor = l.bitXnor(r), vMerge = l.merge(r);
        unsigned eq = 1, redAnd = 1, redOr = 0, redXor = 0;
        bool caseEq = true, zEq = true, xEq = true;
        int lowestUnknown = -1;
        for (uint32_t i = 0; i < w; ++i) {
            unsigned a = l.bit(i), b = r.bit(i);
            ASSERT_EQ(vAnd.bit(i), codeAnd(a, b));
            ASSERT_EQ(vOr.bit(i), codeOr(a, b));
            ASSERT_EQ(vXor.bit(i), codeXor(a, b));
            ASSERT_EQ(vXnor.bit(i), codeXor(a, b) == 3 ? 3u : codeXor(a, b) ^ 1u);
            ASSERT_EQ(vMerge.bit(i), a == b && a < 2 ? a : 3u);
            eq = codeAnd(eq, codeXor(a, b) == 3 ? 3u : codeXor(a, b) ^ 1u);
            redAnd = codeAnd(redAnd, a);
            redOr = codeOr(redOr, a);
            redXor = codeXor(redXor, a);
            caseEq = caseEq && a == b;
            if (a != 2 && b != 2) zEq = zEq && a == b;
            if (a < 2 && b < 2) xEq = xEq && a == b;
            if (lowestUnknown < 0 && (a > 1 || b > 1)) lowestUnknown = static_cast<int>(i);
        }
        ASSERT_EQ(l.equal(r).bit(0), eq);
        ASSERT_EQ(l.caseEqual(r).bit(0), caseEq ? 1u : 0u);
        ASSERT_EQ(l.caseZEqual(r), zEq);
        ASSERT_EQ(l.caseXEqual(r), xEq);
        ASSERT_EQ(l.reduceAnd().bit(0), redAnd);
        ASSERT_EQ(l.reduceOr().bit(0), redOr);
        ASSERT_EQ(l.reduceXor().bit(0), redXor);
        // The sum keeps bits below the lowest unknown one and is x from there.
        Vec sum = l.add(r);
        uint32_t known = lowestUnknown < 0 ? w : static_cast<uint32_t>(lowestUnknown);
        Vec kl = l.slice(0, known), kr = r.slice(0, known);
        if (known > 0) {
            ASSERT_EQ(sum.slice(0, known).toBinaryText(), kl.add(kr).toBinaryText());
        }
        for (uint32_t i = known; i < w; ++i) ASSERT_EQ(sum.bit(i), 3u);
    }
}
