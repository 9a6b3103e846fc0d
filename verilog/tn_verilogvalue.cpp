#include "verilog/tn_verilogvalue.h"

#include <cmath>

#include "verilog/tn_verilogintegervalue.h"
#include "verilog/tn_verilognullvalue.h"
#include "verilog/tn_verilogrealvalue.h"
#include "verilog/tn_verilogvectorvalue.h"

Tn_VerilogValue::~Tn_VerilogValue() {}

Tn_VerilogValuePtr Tn_VerilogValue::createInteger(int32_t value) { return new Tn_VerilogIntegerValue(value); }
Tn_VerilogValuePtr Tn_VerilogValue::createReal(double value) { return new Tn_VerilogRealValue(value); }
Tn_VerilogValuePtr Tn_VerilogValue::createNull() { return new Tn_VerilogNullValue(); }
Tn_VerilogValuePtr Tn_VerilogValue::createVector(const Tn_VerilogVector& value) { return new Tn_VerilogVectorValue(value); }
Tn_VerilogValuePtr Tn_VerilogValue::createVector(Tn_VerilogVector&& value) {
    return new Tn_VerilogVectorValue(std::move(value));
}

namespace {

typedef Tn_VerilogValue V;
typedef Tn_VerilogVector Vec;
typedef Tn_VerilogEvalContext Ctx;

// The vector of a value: borrowed from a vector value, converted otherwise.
class VectorOf {
public:
    explicit VectorOf(const Tn_VerilogValue& v) : p_(v.vector()) {
        if (!p_) {
            tmp_ = v.toVector();
            p_ = &tmp_;
        }
    }
    VectorOf(const VectorOf&) = delete;
    VectorOf& operator=(const VectorOf&) = delete;
    const Vec& operator*() const { return *p_; }
    const Vec* operator->() const { return p_; }

private:
    const Vec* p_;
    Vec tmp_;
};

// Target sign and width of fitting: signed only when both are, never narrower.
bool targetSigned(bool valueSigned, const Ctx& ctx) { return valueSigned && ctx.isSigned; }
uint32_t targetWidth(uint32_t valueWidth, const Ctx& ctx) { return valueWidth > ctx.width ? valueWidth : ctx.width; }

// Fitting happens before the value is made, so a result costs one allocation.
Tn_VerilogValuePtr fitVector(Vec&& v, const Ctx& ctx) {
    bool s = targetSigned(v.isSigned(), ctx);
    uint32_t w = targetWidth(v.width(), ctx);
    if (s != v.isSigned() || w > v.width()) v = v.resized(s, w);
    return V::createVector(std::move(v));
}

Tn_VerilogValuePtr fitInteger(int32_t value, const Ctx& ctx) {
    if (ctx.isSigned && ctx.width <= 32) return V::createInteger(value);
    return fitVector(Vec(value), ctx);
}

Tn_VerilogValuePtr oneBit(bool set, const Ctx& ctx) {
    Vec bit(false, 1u);
    bit.setBit(0, set ? 1u : 0u);
    return fitVector(std::move(bit), ctx);
}

// How one binary operator behaves on each kind of operand.
struct BinaryRule {
    enum RealKind { RealNull, RealArith, RealCompare, RealLogical };
    RealKind realKind;
    double (*realArith)(double, double);
    bool (*realTest)(double, double);
    // 32-bit integer form; false means the result is x (zero divisor). Null:
    // integers take the vector path.
    bool (*integer)(int32_t, int32_t, int32_t&);
    Vec (Vec::*vector)(const Vec&) const;
    Vec (Vec::*shift)(uint32_t) const;
};

Tn_VerilogValuePtr applyBinary(const BinaryRule& rule, const Tn_VerilogValuePtr& l, const Tn_VerilogValuePtr& r,
                               const Ctx& ctx) {
    if (!l || !r || l->isNull() || r->isNull()) return V::createNull();
    if (l->isReal() || r->isReal()) {
        double a = l->toReal(), b = r->toReal();
        switch (rule.realKind) {
        case BinaryRule::RealArith: return V::createReal(rule.realArith(a, b));
        case BinaryRule::RealCompare: return oneBit(rule.realTest(a, b), ctx);
        case BinaryRule::RealLogical: return oneBit(rule.realTest(a != 0.0, b != 0.0), ctx);
        default: return V::createNull();
        }
    }
    if (rule.integer && l->isInteger() && r->isInteger()) {
        int32_t out = 0;
        if (rule.integer(l->toInt(), r->toInt(), out)) return fitInteger(out, ctx);
        return fitVector(Vec(false, 32u), ctx);
    }
    VectorOf a(*l), b(*r);
    if (rule.shift) {
        if (b->hasUnknown()) {
            Vec x(a->isSigned(), a->width());
            x.setBase(a->base());
            x.setUnsized(a->isUnsized());
            x.setBounds(a->msb(), a->lsb());
            return fitVector(std::move(x), ctx);
        }
        return fitVector(((*a).*rule.shift)(b->toCount()), ctx);
    }
    return fitVector(((*a).*rule.vector)(*b), ctx);
}

// 32-bit two's complement forms (computed unsigned: wrapping is defined).
uint32_t u(int32_t v) { return static_cast<uint32_t>(v); }
int32_t s(uint32_t v) { return static_cast<int32_t>(v); }

bool intAdd(int32_t a, int32_t b, int32_t& o) { o = s(u(a) + u(b)); return true; }
bool intSub(int32_t a, int32_t b, int32_t& o) { o = s(u(a) - u(b)); return true; }
bool intMul(int32_t a, int32_t b, int32_t& o) { o = s(u(a) * u(b)); return true; }
bool intAnd(int32_t a, int32_t b, int32_t& o) { o = a & b; return true; }
bool intOr(int32_t a, int32_t b, int32_t& o) { o = a | b; return true; }
bool intXor(int32_t a, int32_t b, int32_t& o) { o = a ^ b; return true; }
bool intXnor(int32_t a, int32_t b, int32_t& o) { o = ~(a ^ b); return true; }
// The most negative integer by -1 wraps: quotient itself, remainder 0.
bool intDiv(int32_t a, int32_t b, int32_t& o) {
    if (b == 0) return false;
    o = b == -1 ? s(0u - u(a)) : a / b;
    return true;
}
bool intMod(int32_t a, int32_t b, int32_t& o) {
    if (b == 0) return false;
    o = b == -1 ? 0 : a % b;
    return true;
}
bool intShl(int32_t a, int32_t b, int32_t& o) { o = u(b) >= 32 ? 0 : s(u(a) << u(b)); return true; }
bool intShr(int32_t a, int32_t b, int32_t& o) { o = u(b) >= 32 ? 0 : s(u(a) >> u(b)); return true; }
bool intAshr(int32_t a, int32_t b, int32_t& o) {
    uint32_t fill = a < 0 ? 0xFFFFFFFFu : 0u;
    o = u(b) >= 32 ? s(fill) : u(b) == 0 ? a : s((u(a) >> u(b)) | (fill << (32 - u(b))));
    return true;
}

double realAdd(double a, double b) { return a + b; }
double realSub(double a, double b) { return a - b; }
double realMul(double a, double b) { return a * b; }
double realDiv(double a, double b) { return a / b; }
double realPow(double a, double b) { return std::pow(a, b); }
bool realEq(double a, double b) { return a == b; }
bool realNe(double a, double b) { return a != b; }
bool realLt(double a, double b) { return a < b; }
bool realLe(double a, double b) { return a <= b; }
bool realGt(double a, double b) { return a > b; }
bool realGe(double a, double b) { return a >= b; }
bool realAndTest(double a, double b) { return a != 0.0 && b != 0.0; }
bool realOrTest(double a, double b) { return a != 0.0 || b != 0.0; }

typedef BinaryRule R;
const R kLogicalOr = {R::RealLogical, nullptr, realOrTest, nullptr, &Vec::logicalOr, nullptr};
const R kLogicalAnd = {R::RealLogical, nullptr, realAndTest, nullptr, &Vec::logicalAnd, nullptr};
const R kBitwiseOr = {R::RealNull, nullptr, nullptr, intOr, &Vec::bitOr, nullptr};
const R kBitwiseXor = {R::RealNull, nullptr, nullptr, intXor, &Vec::bitXor, nullptr};
const R kBitwiseXnor = {R::RealNull, nullptr, nullptr, intXnor, &Vec::bitXnor, nullptr};
const R kBitwiseAnd = {R::RealNull, nullptr, nullptr, intAnd, &Vec::bitAnd, nullptr};
const R kEqual = {R::RealCompare, nullptr, realEq, nullptr, &Vec::equal, nullptr};
const R kNotEqual = {R::RealCompare, nullptr, realNe, nullptr, &Vec::notEqual, nullptr};
const R kCaseEqual = {R::RealCompare, nullptr, realEq, nullptr, &Vec::caseEqual, nullptr};
const R kCaseNotEqual = {R::RealCompare, nullptr, realNe, nullptr, &Vec::caseNotEqual, nullptr};
const R kLessThan = {R::RealCompare, nullptr, realLt, nullptr, &Vec::lessThan, nullptr};
const R kLessEqual = {R::RealCompare, nullptr, realLe, nullptr, &Vec::lessEqual, nullptr};
const R kGreaterThan = {R::RealCompare, nullptr, realGt, nullptr, &Vec::greaterThan, nullptr};
const R kGreaterEqual = {R::RealCompare, nullptr, realGe, nullptr, &Vec::greaterEqual, nullptr};
const R kLeftShift = {R::RealNull, nullptr, nullptr, intShl, nullptr, &Vec::shiftLeft};
const R kRightShift = {R::RealNull, nullptr, nullptr, intShr, nullptr, &Vec::shiftRight};
const R kArithLeftShift = {R::RealNull, nullptr, nullptr, intShl, nullptr, &Vec::arithShiftLeft};
const R kArithRightShift = {R::RealNull, nullptr, nullptr, intAshr, nullptr, &Vec::arithShiftRight};
const R kAddition = {R::RealArith, realAdd, nullptr, intAdd, &Vec::add, nullptr};
const R kSubtraction = {R::RealArith, realSub, nullptr, intSub, &Vec::subtract, nullptr};
const R kMultiplication = {R::RealArith, realMul, nullptr, intMul, &Vec::multiply, nullptr};
const R kDivision = {R::RealArith, realDiv, nullptr, intDiv, &Vec::divide, nullptr};
const R kModulus = {R::RealNull, nullptr, nullptr, intMod, &Vec::modulus, nullptr};
const R kExponentiation = {R::RealArith, realPow, nullptr, nullptr, &Vec::power, nullptr};

// How one unary operator behaves on each kind of operand.
struct UnaryRule {
    enum RealKind { RealNull, RealNegate, RealNot };
    RealKind realKind;
    int32_t (*integer)(int32_t);  // null: integers take the vector path
    Vec (Vec::*vector)() const;
};

Tn_VerilogValuePtr applyUnary(const UnaryRule& rule, const Tn_VerilogValuePtr& v, const Ctx& ctx) {
    if (!v || v->isNull()) return V::createNull();
    if (v->isReal()) {
        switch (rule.realKind) {
        case UnaryRule::RealNegate: return V::createReal(-v->toReal());
        case UnaryRule::RealNot: return oneBit(v->toReal() == 0.0, ctx);
        default: return V::createNull();
        }
    }
    if (rule.integer && v->isInteger()) return fitInteger(rule.integer(v->toInt()), ctx);
    VectorOf a(*v);
    return fitVector(((*a).*rule.vector)(), ctx);
}

int32_t intNeg(int32_t a) { return s(0u - u(a)); }
int32_t intNot(int32_t a) { return ~a; }

typedef UnaryRule U;
const U kNegation = {U::RealNegate, intNeg, &Vec::negate};
const U kLogicalNegation = {U::RealNot, nullptr, &Vec::logicalNot};
const U kBitwiseNegation = {U::RealNull, intNot, &Vec::bitNot};
const U kReductionAnd = {U::RealNull, nullptr, &Vec::reduceAnd};
const U kReductionNand = {U::RealNull, nullptr, &Vec::reduceNand};
const U kReductionXor = {U::RealNull, nullptr, &Vec::reduceXor};
const U kReductionXnor = {U::RealNull, nullptr, &Vec::reduceXnor};
const U kReductionOr = {U::RealNull, nullptr, &Vec::reduceOr};
const U kReductionNor = {U::RealNull, nullptr, &Vec::reduceNor};

}  // namespace

Port_String Tn_VerilogValue::evalText(const Tn_VerilogValuePtr& v) {
    if (!v || v->isNull()) return "null";
    if (v->isReal()) return Port_String::doFormat("real %.17g", v->toReal());
    return Port_String::doFormat("%u %s %s %s", v->width(), v->isSigned() ? "s" : "u", v->toBinaryText().c_str(),
                                 v->toDecimalText().c_str());
}

Tn_VerilogValuePtr Tn_VerilogValue::fit(const Tn_VerilogValuePtr& v, const Tn_VerilogEvalContext& ctx) {
    if (!v || v->isNull() || v->isReal()) return v;
    bool s = targetSigned(v->isSigned(), ctx);
    uint32_t w = targetWidth(v->width(), ctx);
    if (s == v->isSigned() && w == v->width()) return v;
    return fitVector(v->toVector(), ctx);
}

#define TN_BINARY(name, rule)                                                                            \
    Tn_VerilogValuePtr Tn_VerilogValue::name(const Tn_VerilogValuePtr& l, const Tn_VerilogValuePtr& r, \
                                             const Tn_VerilogEvalContext& ctx) {                       \
        return applyBinary(rule, l, r, ctx);                                                           \
    }
TN_BINARY(logicalOr, kLogicalOr)
TN_BINARY(logicalAnd, kLogicalAnd)
TN_BINARY(bitwiseOr, kBitwiseOr)
TN_BINARY(bitwiseXor, kBitwiseXor)
TN_BINARY(bitwiseXnor, kBitwiseXnor)
TN_BINARY(bitwiseAnd, kBitwiseAnd)
TN_BINARY(equal, kEqual)
TN_BINARY(notEqual, kNotEqual)
TN_BINARY(caseEqual, kCaseEqual)
TN_BINARY(caseNotEqual, kCaseNotEqual)
TN_BINARY(lessThan, kLessThan)
TN_BINARY(lessEqual, kLessEqual)
TN_BINARY(greaterThan, kGreaterThan)
TN_BINARY(greaterEqual, kGreaterEqual)
TN_BINARY(leftShift, kLeftShift)
TN_BINARY(rightShift, kRightShift)
TN_BINARY(arithLeftShift, kArithLeftShift)
TN_BINARY(arithRightShift, kArithRightShift)
TN_BINARY(addition, kAddition)
TN_BINARY(subtraction, kSubtraction)
TN_BINARY(multiplication, kMultiplication)
TN_BINARY(division, kDivision)
TN_BINARY(modulus, kModulus)
TN_BINARY(exponentiation, kExponentiation)
#undef TN_BINARY

Tn_VerilogValuePtr Tn_VerilogValue::identity(const Tn_VerilogValuePtr& v, const Tn_VerilogEvalContext& ctx) {
    if (!v) return createNull();
    return fit(v, ctx);
}

#define TN_UNARY(name, rule)                                                                                   \
    Tn_VerilogValuePtr Tn_VerilogValue::name(const Tn_VerilogValuePtr& v, const Tn_VerilogEvalContext& ctx) { \
        return applyUnary(rule, v, ctx);                                                                       \
    }
TN_UNARY(negation, kNegation)
TN_UNARY(logicalNegation, kLogicalNegation)
TN_UNARY(bitwiseNegation, kBitwiseNegation)
TN_UNARY(reductionAnd, kReductionAnd)
TN_UNARY(reductionNand, kReductionNand)
TN_UNARY(reductionXor, kReductionXor)
TN_UNARY(reductionXnor, kReductionXnor)
TN_UNARY(reductionOr, kReductionOr)
TN_UNARY(reductionNor, kReductionNor)
#undef TN_UNARY

Tn_VerilogValue::BinaryOperation Tn_VerilogValue::binaryOperation(uint32_t opType) {
    static const BinaryOperation table[] = {
        logicalOr,      logicalAnd,    bitwiseOr,  bitwiseXor,     bitwiseXnor, bitwiseAnd,
        equal,          notEqual,      caseEqual,  caseNotEqual,   lessThan,    lessEqual,
        greaterThan,    greaterEqual,  leftShift,  rightShift,     arithLeftShift, arithRightShift,
        addition,       subtraction,   multiplication, division,   modulus,     exponentiation};
    return opType < sizeof table / sizeof table[0] ? table[opType] : nullptr;
}

Tn_VerilogValue::UnaryOperation Tn_VerilogValue::unaryOperation(uint32_t opType) {
    static const UnaryOperation table[] = {identity,     negation,      logicalNegation, bitwiseNegation,
                                           reductionAnd, reductionNand, reductionXor,    reductionXnor,
                                           reductionOr,  reductionNor};
    return opType < sizeof table / sizeof table[0] ? table[opType] : nullptr;
}

Tn_VerilogValuePtr Tn_VerilogValue::merge(const Tn_VerilogValuePtr& l, const Tn_VerilogValuePtr& r,
                                          const Tn_VerilogEvalContext& ctx) {
    if (!l || !r || l->isNull() || r->isNull()) return createNull();
    if (l->isReal() || r->isReal()) {
        double a = l->toReal();
        return createReal(a == r->toReal() ? a : 0.0);
    }
    VectorOf a(*l), b(*r);
    return fitVector(a->merge(*b), ctx);
}

Tn_VerilogValuePtr Tn_VerilogValue::concatenation(const std::vector<Tn_VerilogValuePtr>& operands,
                                                  const Tn_VerilogEvalContext& ctx) {
    if (operands.empty()) return createNull();
    for (const Tn_VerilogValuePtr& v : operands)
        if (!v || v->isNull() || v->isReal()) return createNull();
    // A slice of the whole first operand: its bits as an unsigned, sized, Binary vector.
    Vec result = VectorOf(*operands[0])->slice(0, operands[0]->width());
    for (size_t i = 1; i < operands.size(); ++i) result = result.concat(*VectorOf(*operands[i]));
    return fitVector(std::move(result), ctx);
}

namespace {

template <class Compare>
bool caseCompare(const Tn_VerilogValuePtr& l, const Tn_VerilogValuePtr& r, Compare compare) {
    if (!l || !r || l->isNull() || r->isNull()) return false;
    if (l->isReal() || r->isReal()) return l->toReal() == r->toReal();
    VectorOf a(*l), b(*r);
    return compare(*a, *b);
}

}  // namespace

bool Tn_VerilogValue::caseZEqual(const Tn_VerilogValuePtr& l, const Tn_VerilogValuePtr& r) {
    return caseCompare(l, r, [](const Vec& a, const Vec& b) { return a.caseZEqual(b); });
}

bool Tn_VerilogValue::caseXEqual(const Tn_VerilogValuePtr& l, const Tn_VerilogValuePtr& r) {
    return caseCompare(l, r, [](const Vec& a, const Vec& b) { return a.caseXEqual(b); });
}
