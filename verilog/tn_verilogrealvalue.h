// A double-precision real value.
#ifndef TARN_TN_VERILOGREALVALUE_H
#define TARN_TN_VERILOGREALVALUE_H

#include "verilog/tn_verilogvalue.h"

class Tn_VerilogRealValue : public Tn_VerilogValue {
public:
    double value() const { return value_; }

    bool toBool() const override { return value_ != 0.0; }
    // Rounded half away from zero; wraps to the low 32 bits, NaN gives 0.
    int32_t toInt() const override { return toVector().toInt(); }
    double toReal() const override { return value_; }
    Tn_VerilogVector toVector() const override { return Tn_VerilogVector(value_); }
    Port_String toText() const override { return "\t"; }
    uint32_t width() const override { return 64; }
    bool isSigned() const override { return true; }
    bool isReal() const override { return true; }
    Port_String toBaseText() const override;
    Port_String toDecimalText() const override { return toVector().toDecimalText(); }
    Port_String toBinaryText() const override { return toVector().toBinaryText(); }
    Port_String toOctalText() const override { return toVector().toOctalText(); }
    Port_String toHexText() const override { return toVector().toHexText(); }
    Port_String describe() const override;

private:
    friend class Tn_VerilogValue;
    explicit Tn_VerilogRealValue(double value) : value_(value) {}

    double value_;
};

#endif
