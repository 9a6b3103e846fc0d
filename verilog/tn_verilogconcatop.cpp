// Concatenation and replication: self-determined integral operands, first
// operand most significant, unsigned result.
#include <limits>

#include "util/tn_message.h"
#include "verilog/tn_verilogelabcontext.h"
#include "verilog/tn_verilognodes.h"

using namespace Tn_Verilog;

namespace {

uint32_t saturatingAdd(uint32_t a, uint32_t b) {
    return a > std::numeric_limits<uint32_t>::max() - b ? std::numeric_limits<uint32_t>::max() : a + b;
}

// A replication whose count is 0 adds nothing to an enclosing concatenation.
bool isEmptyReplication(const Tn_VerilogExpression* e) {
    const Tn_VerilogMultipleConcatOp* m = Tn_VerilogNode::cast<Tn_VerilogMultipleConcatOp>(const_cast<Tn_VerilogExpression*>(e));
    return m && m->countValue() == 0;
}

// Checks each operand for a use; they must be integral. False after a message
// (message names the operator) or when an operand reported.
bool checkOperands(Tn_VerilogElabContext& ctx, const Tn_NodeList<Tn_VerilogExpression>& operands, ValueType use,
                   const Tn_VerilogNode& op, const char* message) {
    bool failed = false, illegal = operands.empty();
    for (Tn_VerilogExpression* e : operands) {
        Tn_VerilogTypePtr t = Tn_VerilogExpression::typeOf(e, ctx, use);
        if (t->isError()) failed = true;
        else if (!t->isIntegral()) illegal = true;
    }
    if (failed) return false;
    if (illegal) {
        TN_MSG().issueError(message, op.locationText().c_str());
        return false;
    }
    return true;
}

uint32_t operandWidth(const Tn_NodeList<Tn_VerilogExpression>& operands) {
    uint32_t sum = 0;
    for (Tn_VerilogExpression* e : operands)
        if (e && !isEmptyReplication(e)) sum = saturatingAdd(sum, e->contextWidth(0));
    return sum;
}

// The operands' self-determined values concatenated, without fitting.
Tn_VerilogValuePtr concatenate(const Tn_NodeList<Tn_VerilogExpression>& operands, const Tn_VerilogEvalContext& ctx) {
    const Tn_VerilogEvalContext self = ctx.selfDetermined();
    std::vector<Tn_VerilogValuePtr> values;
    values.reserve(operands.size());
    for (Tn_VerilogExpression* e : operands) {
        if (!e) return Tn_VerilogValue::createNull();
        if (isEmptyReplication(e)) continue;
        values.push_back(e->evaluate(self));
    }
    return Tn_VerilogValue::concatenation(values, ctx.sized(false, 0));
}

bool allLValues(const Tn_NodeList<Tn_VerilogExpression>& operands, bool (Tn_VerilogExpression::*test)() const) {
    if (operands.empty()) return false;
    for (Tn_VerilogExpression* e : operands)
        if (!e || !(e->*test)()) return false;
    return true;
}

}  // namespace

// ------------------------------------------------------------- concatenation

Tn_VerilogTypePtr Tn_VerilogConcatOp::typeAs(Tn_VerilogElabContext& ctx, ValueType use) {
    if (!checkAttributes(ctx)) return Tn_VerilogType::createError();
    if (!checkOperands(ctx, Operand, use, *this, "%sIllegal operand(s) of concatenation operator\n"))
        return Tn_VerilogType::createError();
    return Tn_VerilogType::createScalar(false);
}

Tn_VerilogValuePtr Tn_VerilogConcatOp::evaluate(const Tn_VerilogEvalContext& ctx) const {
    return Tn_VerilogValue::fit(concatenate(Operand, ctx), ctx);
}

uint32_t Tn_VerilogConcatOp::contextWidth(uint32_t width) const {
    uint32_t own = operandWidth(Operand);
    return own > width ? own : width;
}

bool Tn_VerilogConcatOp::isReal() const { return false; }
bool Tn_VerilogConcatOp::isSigned(bool) const { return false; }
bool Tn_VerilogConcatOp::isNetLValue() const { return allLValues(Operand, &Tn_VerilogExpression::isNetLValue); }
bool Tn_VerilogConcatOp::isVarLValue() const { return allLValues(Operand, &Tn_VerilogExpression::isVarLValue); }

// --------------------------------------------------------------- replication

int64_t Tn_VerilogMultipleConcatOp::countValue() const {
    if (!Count) return -1;
    Tn_VerilogValuePtr v = Count->evaluate(Tn_VerilogEvalContext::quiet());
    if (v->isNull() || v->isReal() || v->hasUnknown()) return -1;
    const Tn_VerilogVector vec = v->toVector();
    if (vec.isNegative()) return -1;
    // Counts of 2^31 and more are far beyond what can be built.
    for (uint32_t offset = 31; offset < vec.width(); ++offset)
        if (vec.bit(offset) != 0) return std::numeric_limits<int32_t>::max();
    return vec.toInt64();
}

Tn_VerilogTypePtr Tn_VerilogMultipleConcatOp::typeAs(Tn_VerilogElabContext& ctx, ValueType) {
    if (!checkAttributes(ctx)) return Tn_VerilogType::createError();
    bool failed = false;
    Tn_VerilogTypePtr t = typeOf(Count, ctx);
    if (t->isError()) {
        failed = true;
    } else if (!t->isIntegral()) {
        TN_MSG().issueError("%sIllegal count operand of multiple concatenation operator\n", locationText().c_str());
        failed = true;
    } else if (!Count->isConstant()) {
        TN_MSG().issueError("%sRepetition multiplier of multiple concatenation operator should be constant\n",
                            locationText().c_str());
        failed = true;
    } else {
        Tn_VerilogValuePtr v = Count->evaluate(Tn_VerilogEvalContext::quiet());
        const char* problem = nullptr;
        if (v->isNull()) problem = "could not be evaluated";
        else if (v->hasUnknown()) problem = "is undefined";
        else if (v->isSigned() && v->toVector().isNegative()) problem = "is negative";
        if (problem) {
            TN_MSG().issueError("%sCount operand of multiple concatenation operator %s\n", locationText().c_str(), problem);
            failed = true;
        }
    }
    // Replications are values only: their operands are checked as such.
    if (!checkOperands(ctx, Operand, Value, *this, "%sIllegal operand(s) of multiple concatenation operator\n"))
        failed = true;
    return failed ? Tn_VerilogType::createError() : Tn_VerilogType::createScalar(false);
}

Tn_VerilogValuePtr Tn_VerilogMultipleConcatOp::evaluate(const Tn_VerilogEvalContext& ctx) const {
    const int64_t count = countValue();
    if (count <= 0) return Tn_VerilogValue::createNull();
    Tn_VerilogValuePtr once = concatenate(Operand, ctx);
    if (once->isNull()) return once;
    const uint64_t total = static_cast<uint64_t>(count) * once->width();
    if (total > Tn_VerilogEvalContext::kMaxWidth) return Tn_VerilogValue::createNull();
    // By the bits of the count: log(count) concatenations instead of count.
    Tn_VerilogVector power = once->toVector(), result;
    bool started = false;
    for (uint64_t n = static_cast<uint64_t>(count);;) {
        if (n & 1) {
            result = started ? result.concat(power) : power;
            started = true;
        }
        n >>= 1;
        if (!n) break;
        power = power.concat(power);
    }
    return Tn_VerilogValue::fit(Tn_VerilogValue::createVector(std::move(result)), ctx);
}

uint32_t Tn_VerilogMultipleConcatOp::contextWidth(uint32_t width) const {
    const int64_t count = countValue();
    uint64_t own = count > 0 ? static_cast<uint64_t>(count) * operandWidth(Operand) : 0;
    if (own > std::numeric_limits<uint32_t>::max()) own = std::numeric_limits<uint32_t>::max();
    return own > width ? static_cast<uint32_t>(own) : width;
}

bool Tn_VerilogMultipleConcatOp::isReal() const { return false; }
bool Tn_VerilogMultipleConcatOp::isSigned(bool) const { return false; }
bool Tn_VerilogMultipleConcatOp::isNetLValue() const { return false; }
bool Tn_VerilogMultipleConcatOp::isVarLValue() const { return false; }
