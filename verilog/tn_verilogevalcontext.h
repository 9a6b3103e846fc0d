// What an expression is evaluated for: passed by value down the operand tree.
// Values read only the signed flag and the width; the other two flags belong
// to expression evaluation.
#ifndef TARN_TN_VERILOGEVALCONTEXT_H
#define TARN_TN_VERILOGEVALCONTEXT_H

#include <cstdint>

struct Tn_VerilogEvalContext {
    bool first;
    bool isSigned;  // the enclosing context is signed
    bool third;
    uint32_t width;  // width the context requires

    // The default context: self-determined evaluation.
    Tn_VerilogEvalContext() : first(true), isSigned(true), third(true), width(0) {}
    Tn_VerilogEvalContext(bool first_, bool isSigned_, bool third_, uint32_t width_)
        : first(first_), isSigned(isSigned_), third(third_), width(width_) {}
};

#endif
