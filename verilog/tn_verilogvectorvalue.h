// A four-state vector value.
#ifndef TARN_TN_VERILOGVECTORVALUE_H
#define TARN_TN_VERILOGVECTORVALUE_H

#include <utility>

#include "verilog/tn_verilogvalue.h"

class Tn_VerilogVectorValue : public Tn_VerilogValue {
public:
    const Tn_VerilogVector& value() const { return value_; }

    bool toBool() const override { return value_.toBool(); }
    int32_t toInt() const override { return value_.toInt(); }
    double toReal() const override { return value_.toReal(); }
    Tn_VerilogVector toVector() const override { return value_; }
    Port_String toText() const override { return value_.toCharText(); }
    uint32_t width() const override { return value_.width(); }
    bool hasUnknown() const override { return value_.hasUnknown(); }
    bool isSigned() const override { return value_.isSigned(); }
    bool isVector() const override { return true; }
    bool isDecimal() const override { return value_.base() == Tn_Verilog::Decimal; }
    bool isBinary() const override { return value_.base() == Tn_Verilog::Binary; }
    bool isOctal() const override { return value_.base() == Tn_Verilog::Octal; }
    bool isHex() const override { return value_.base() == Tn_Verilog::Hex; }
    bool isString() const override { return value_.base() == Tn_Verilog::String; }
    Port_String toBaseText() const override { return value_.toBaseText(); }
    Port_String toDecimalText() const override { return value_.toDecimalText(); }
    Port_String toBinaryText() const override { return value_.toBinaryText(); }
    Port_String toOctalText() const override { return value_.toOctalText(); }
    Port_String toHexText() const override { return value_.toHexText(); }
    Port_String describe() const override { return value_.describe(); }
    const Tn_VerilogVector* vector() const override { return &value_; }

private:
    friend class Tn_VerilogValue;
    explicit Tn_VerilogVectorValue(const Tn_VerilogVector& value) : value_(value) {}
    explicit Tn_VerilogVectorValue(Tn_VerilogVector&& value) : value_(std::move(value)) {}

    Tn_VerilogVector value_;
};

#endif
