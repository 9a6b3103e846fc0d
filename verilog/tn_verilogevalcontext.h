// What an expression is evaluated for: passed by value down the operand tree.
// Values read only the signed flag and the width; the other two flags belong
// to expression evaluation.
#ifndef TARN_TN_VERILOGEVALCONTEXT_H
#define TARN_TN_VERILOGEVALCONTEXT_H

#include <cstdint>

struct Tn_VerilogEvalContext {
    // Evaluation may issue messages about what it cannot compute (a word-select,
    // a constant function that fails). Queries that evaluate only to size or
    // type something (widths of parameters) clear it, so that nothing is
    // reported once per query.
    bool report;
    bool isSigned;  // the enclosing context is signed
    // The expression sizes itself (computes its own width and sign in this
    // context): true for the root and for self-determined operands. An
    // operator that has sized a context-determined operand already passes
    // false, so that a deep expression is not sized again at every level.
    bool sizeItself;
    uint32_t width;  // width the context requires

    // The default context: self-determined evaluation.
    Tn_VerilogEvalContext() : report(true), isSigned(true), sizeItself(true), width(0) {}
    Tn_VerilogEvalContext(bool report_, bool isSigned_, bool sizeItself_, uint32_t width_)
        : report(report_), isSigned(isSigned_), sizeItself(sizeItself_), width(width_) {}

    // The context of a self-determined operand.
    Tn_VerilogEvalContext selfDetermined() const { return Tn_VerilogEvalContext(report, true, true, 0); }
    // The context of an operand sized by its operator.
    Tn_VerilogEvalContext sized(bool isSigned_, uint32_t width_) const {
        return Tn_VerilogEvalContext(report, isSigned_, false, width_);
    }

    // Constant evaluation stops (the value is null) where a context or a
    // result would be wider than this: 1M bits, the widest literal the
    // parser takes. Products, quotients and decimal texts cost the square of
    // the width; at this bound each still takes well under a second.
    static const uint32_t kMaxWidth = 1u << 20;
    bool tooWide() const { return width > kMaxWidth; }

    // Self-determined, without messages.
    static Tn_VerilogEvalContext quiet() { return Tn_VerilogEvalContext(false, true, true, 0); }
};

#endif
