// A 32-bit signed integer value (unsized decimal constants, integer arithmetic).
#ifndef TARN_TN_VERILOGINTEGERVALUE_H
#define TARN_TN_VERILOGINTEGERVALUE_H

#include "verilog/tn_verilogvalue.h"

class Tn_VerilogIntegerValue : public Tn_VerilogValue {
public:
    int32_t value() const { return value_; }

    bool toBool() const override { return value_ != 0; }
    int32_t toInt() const override { return value_; }
    double toReal() const override { return value_; }
    Tn_VerilogVector toVector() const override { return Tn_VerilogVector(value_); }
    Port_String toText() const override;
    uint32_t width() const override { return 32; }
    bool isSigned() const override { return true; }
    bool isInteger() const override { return true; }
    Port_String toBaseText() const override;
    Port_String toDecimalText() const override;
    Port_String toBinaryText() const override;
    Port_String toOctalText() const override;
    Port_String toHexText() const override;
    Port_String describe() const override;

private:
    friend class Tn_VerilogValue;
    explicit Tn_VerilogIntegerValue(int32_t value) : value_(value) {}

    int32_t value_;
};

#endif
