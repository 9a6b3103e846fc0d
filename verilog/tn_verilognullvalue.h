// The value of an expression not computable at compile time.
#ifndef TARN_TN_VERILOGNULLVALUE_H
#define TARN_TN_VERILOGNULLVALUE_H

#include "verilog/tn_verilogvalue.h"

class Tn_VerilogNullValue : public Tn_VerilogValue {
public:
    bool toBool() const override { return false; }
    int32_t toInt() const override { return 0; }
    double toReal() const override { return 0.0; }
    Tn_VerilogVector toVector() const override { return Tn_VerilogVector(); }
    Port_String toText() const override { return Port_String(); }
    uint32_t width() const override { return 0; }
    bool isSigned() const override { return false; }
    bool isNull() const override { return true; }
    Port_String toBaseText() const override { return Port_String(); }
    Port_String toDecimalText() const override { return Port_String(); }
    Port_String toBinaryText() const override { return Port_String(); }
    Port_String toOctalText() const override { return Port_String(); }
    Port_String toHexText() const override { return Port_String(); }
    Port_String describe() const override { return Port_String(); }

private:
    friend class Tn_VerilogValue;
    Tn_VerilogNullValue() {}
};

#endif
