// What an expression is evaluated for: passed by value down the operand tree.
// Values read only the signed flag and the width; report and the reserved
// third flag belong to expression evaluation.
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
    // Reserved: no evaluation reads it yet; operations pass it on unchanged.
    bool third;
    uint32_t width;  // width the context requires

    // The default context: self-determined evaluation.
    Tn_VerilogEvalContext() : report(true), isSigned(true), third(true), width(0) {}
    Tn_VerilogEvalContext(bool report_, bool isSigned_, bool third_, uint32_t width_)
        : report(report_), isSigned(isSigned_), third(third_), width(width_) {}

    // Constant evaluation stops (the value is null) where a context or a
    // result would be wider than this: 16M bits, 2 MB a vector.
    static const uint32_t kMaxWidth = 1u << 24;
    bool tooWide() const { return width > kMaxWidth; }

    // Self-determined, without messages.
    static Tn_VerilogEvalContext quiet() { return Tn_VerilogEvalContext(false, true, true, 0); }
};

#endif
