// Constant values: immutable, reference counted, one of four kinds (32-bit
// integer, four-state vector, real, null = not computable at compile time).
// The operators take value handles and the evaluation context and never
// issue messages: what cannot be computed is null, what is undefined is x.
#ifndef TARN_TN_VERILOGVALUE_H
#define TARN_TN_VERILOGVALUE_H

#include <cstdint>
#include <vector>

#include "tarn/port_stringbase.h"
#include "tarn/tn_rcobject.h"
#include "tarn/tn_rcptr.h"
#include "verilog/tn_verilogevalcontext.h"
#include "verilog/tn_verilogvector.h"

class Tn_VerilogValue;
typedef Tn::RCPtr<Tn_VerilogValue> Tn_VerilogValuePtr;

class Tn_VerilogValue : public Tn::RCObject {
public:
    ~Tn_VerilogValue() override;
    virtual bool toBool() const = 0;
    virtual int32_t toInt() const = 0;
    virtual double toReal() const = 0;
    virtual Tn_VerilogVector toVector() const = 0;
    virtual Port_String toText() const = 0;
    virtual uint32_t width() const = 0;
    virtual bool hasUnknown() const { return false; }
    virtual bool isSigned() const = 0;
    virtual bool isNull() const { return false; }
    virtual bool isInteger() const { return false; }
    virtual bool isReal() const { return false; }
    virtual bool isVector() const { return false; }
    virtual bool isDecimal() const { return false; }
    virtual bool isBinary() const { return false; }
    virtual bool isOctal() const { return false; }
    virtual bool isHex() const { return false; }
    virtual bool isString() const { return false; }
    virtual Port_String toBaseText() const = 0;
    virtual Port_String toDecimalText() const = 0;
    virtual Port_String toBinaryText() const = 0;
    virtual Port_String toOctalText() const = 0;
    virtual Port_String toHexText() const = 0;
    // Text for messages: "integer constant '%d'", "based constant ...".
    virtual Port_String describe() const = 0;
    // The vector of a vector value (no copy); null for the other kinds.
    virtual const Tn_VerilogVector* vector() const { return nullptr; }

    static Tn_VerilogValuePtr createInteger(int32_t value);
    static Tn_VerilogValuePtr createReal(double value);
    static Tn_VerilogValuePtr createNull();
    static Tn_VerilogValuePtr createVector(const Tn_VerilogVector& value);
    static Tn_VerilogValuePtr createVector(Tn_VerilogVector&& value);

    // What `tarn eval` prints for a value: "<width> <s|u> <binary> <decimal>",
    // "real <%.17g>", or "null" (no value, or a null one).
    static Port_String evalText(const Tn_VerilogValuePtr& v);

    // The value fitted to the context: never narrowed; widened and re-signed
    // (signed only when both are) when it differs. Null and real unchanged.
    static Tn_VerilogValuePtr fit(const Tn_VerilogValuePtr& v, const Tn_VerilogEvalContext& ctx);

    typedef Tn_VerilogValuePtr (*BinaryOperation)(const Tn_VerilogValuePtr&, const Tn_VerilogValuePtr&,
                                                  const Tn_VerilogEvalContext&);
    typedef Tn_VerilogValuePtr (*UnaryOperation)(const Tn_VerilogValuePtr&, const Tn_VerilogEvalContext&);

    // Binary operators, in the order of their persistent operator numbers
    // 0 to 23; each result is fitted to the context.
    static Tn_VerilogValuePtr logicalOr(const Tn_VerilogValuePtr& l, const Tn_VerilogValuePtr& r, const Tn_VerilogEvalContext& ctx);
    static Tn_VerilogValuePtr logicalAnd(const Tn_VerilogValuePtr& l, const Tn_VerilogValuePtr& r, const Tn_VerilogEvalContext& ctx);
    static Tn_VerilogValuePtr bitwiseOr(const Tn_VerilogValuePtr& l, const Tn_VerilogValuePtr& r, const Tn_VerilogEvalContext& ctx);
    static Tn_VerilogValuePtr bitwiseXor(const Tn_VerilogValuePtr& l, const Tn_VerilogValuePtr& r, const Tn_VerilogEvalContext& ctx);
    static Tn_VerilogValuePtr bitwiseXnor(const Tn_VerilogValuePtr& l, const Tn_VerilogValuePtr& r, const Tn_VerilogEvalContext& ctx);
    static Tn_VerilogValuePtr bitwiseAnd(const Tn_VerilogValuePtr& l, const Tn_VerilogValuePtr& r, const Tn_VerilogEvalContext& ctx);
    static Tn_VerilogValuePtr equal(const Tn_VerilogValuePtr& l, const Tn_VerilogValuePtr& r, const Tn_VerilogEvalContext& ctx);
    static Tn_VerilogValuePtr notEqual(const Tn_VerilogValuePtr& l, const Tn_VerilogValuePtr& r, const Tn_VerilogEvalContext& ctx);
    static Tn_VerilogValuePtr caseEqual(const Tn_VerilogValuePtr& l, const Tn_VerilogValuePtr& r, const Tn_VerilogEvalContext& ctx);
    static Tn_VerilogValuePtr caseNotEqual(const Tn_VerilogValuePtr& l, const Tn_VerilogValuePtr& r, const Tn_VerilogEvalContext& ctx);
    static Tn_VerilogValuePtr lessThan(const Tn_VerilogValuePtr& l, const Tn_VerilogValuePtr& r, const Tn_VerilogEvalContext& ctx);
    static Tn_VerilogValuePtr lessEqual(const Tn_VerilogValuePtr& l, const Tn_VerilogValuePtr& r, const Tn_VerilogEvalContext& ctx);
    static Tn_VerilogValuePtr greaterThan(const Tn_VerilogValuePtr& l, const Tn_VerilogValuePtr& r, const Tn_VerilogEvalContext& ctx);
    static Tn_VerilogValuePtr greaterEqual(const Tn_VerilogValuePtr& l, const Tn_VerilogValuePtr& r, const Tn_VerilogEvalContext& ctx);
    static Tn_VerilogValuePtr leftShift(const Tn_VerilogValuePtr& l, const Tn_VerilogValuePtr& r, const Tn_VerilogEvalContext& ctx);
    static Tn_VerilogValuePtr rightShift(const Tn_VerilogValuePtr& l, const Tn_VerilogValuePtr& r, const Tn_VerilogEvalContext& ctx);
    static Tn_VerilogValuePtr arithLeftShift(const Tn_VerilogValuePtr& l, const Tn_VerilogValuePtr& r, const Tn_VerilogEvalContext& ctx);
    static Tn_VerilogValuePtr arithRightShift(const Tn_VerilogValuePtr& l, const Tn_VerilogValuePtr& r, const Tn_VerilogEvalContext& ctx);
    static Tn_VerilogValuePtr addition(const Tn_VerilogValuePtr& l, const Tn_VerilogValuePtr& r, const Tn_VerilogEvalContext& ctx);
    static Tn_VerilogValuePtr subtraction(const Tn_VerilogValuePtr& l, const Tn_VerilogValuePtr& r, const Tn_VerilogEvalContext& ctx);
    static Tn_VerilogValuePtr multiplication(const Tn_VerilogValuePtr& l, const Tn_VerilogValuePtr& r, const Tn_VerilogEvalContext& ctx);
    static Tn_VerilogValuePtr division(const Tn_VerilogValuePtr& l, const Tn_VerilogValuePtr& r, const Tn_VerilogEvalContext& ctx);
    static Tn_VerilogValuePtr modulus(const Tn_VerilogValuePtr& l, const Tn_VerilogValuePtr& r, const Tn_VerilogEvalContext& ctx);
    static Tn_VerilogValuePtr exponentiation(const Tn_VerilogValuePtr& l, const Tn_VerilogValuePtr& r, const Tn_VerilogEvalContext& ctx);

    // Unary operators, in the order of their persistent numbers 0 to 9
    // (identity only fits the operand to the context).
    static Tn_VerilogValuePtr identity(const Tn_VerilogValuePtr& v, const Tn_VerilogEvalContext& ctx);
    static Tn_VerilogValuePtr negation(const Tn_VerilogValuePtr& v, const Tn_VerilogEvalContext& ctx);
    static Tn_VerilogValuePtr logicalNegation(const Tn_VerilogValuePtr& v, const Tn_VerilogEvalContext& ctx);
    static Tn_VerilogValuePtr bitwiseNegation(const Tn_VerilogValuePtr& v, const Tn_VerilogEvalContext& ctx);
    static Tn_VerilogValuePtr reductionAnd(const Tn_VerilogValuePtr& v, const Tn_VerilogEvalContext& ctx);
    static Tn_VerilogValuePtr reductionNand(const Tn_VerilogValuePtr& v, const Tn_VerilogEvalContext& ctx);
    static Tn_VerilogValuePtr reductionXor(const Tn_VerilogValuePtr& v, const Tn_VerilogEvalContext& ctx);
    static Tn_VerilogValuePtr reductionXnor(const Tn_VerilogValuePtr& v, const Tn_VerilogEvalContext& ctx);
    static Tn_VerilogValuePtr reductionOr(const Tn_VerilogValuePtr& v, const Tn_VerilogEvalContext& ctx);
    static Tn_VerilogValuePtr reductionNor(const Tn_VerilogValuePtr& v, const Tn_VerilogEvalContext& ctx);

    // The operation of a binary (0 to 23) or unary (0 to 9) operator number;
    // null when out of range.
    static BinaryOperation binaryOperation(uint32_t opType);
    static UnaryOperation unaryOperation(uint32_t opType);

    // Conditional operator with an unknown condition: equal known bits stay,
    // the others are x (two reals: the real when equal, else 0.0).
    static Tn_VerilogValuePtr merge(const Tn_VerilogValuePtr& l, const Tn_VerilogValuePtr& r, const Tn_VerilogEvalContext& ctx);
    // Concatenation, first operand most significant; null when any operand is
    // null or real.
    static Tn_VerilogValuePtr concatenation(const std::vector<Tn_VerilogValuePtr>& operands, const Tn_VerilogEvalContext& ctx);
    // Case item compares (casez, casex); false when either is null.
    static bool caseZEqual(const Tn_VerilogValuePtr& l, const Tn_VerilogValuePtr& r);
    static bool caseXEqual(const Tn_VerilogValuePtr& l, const Tn_VerilogValuePtr& r);

protected:
    Tn_VerilogValue() {}
};

#endif
