#include "verilog/tn_verilogtype.h"

Tn_VerilogType::~Tn_VerilogType() {}

const Tn_VerilogTypeList& Tn_VerilogType::parameterTypes() const {
    static const Tn_VerilogTypeList none;
    return none;
}

Tn_VerilogTypePtr Tn_VerilogType::parameterType(size_t i) const {
    const Tn_VerilogTypeList& list = parameterTypes();
    return i < list.size() ? list[i] : Tn_VerilogTypePtr();
}

const char* Tn_VerilogType::directionText() const {
    switch (direction_) {
    case Input: return "input";
    case Inout: return "inout";
    case Output: return "output";
    default: return "";
    }
}

Tn_VerilogTypePtr Tn_VerilogType::createError() { return new Tn_VerilogErrorType; }
Tn_VerilogTypePtr Tn_VerilogType::createUnknown() { return new Tn_VerilogUnknownType; }
Tn_VerilogTypePtr Tn_VerilogType::createVoid() { return new Tn_VerilogVoidType; }
Tn_VerilogTypePtr Tn_VerilogType::createReal() { return new Tn_VerilogRealType; }
Tn_VerilogTypePtr Tn_VerilogType::createEvent() { return new Tn_VerilogEventType; }
Tn_VerilogTypePtr Tn_VerilogType::createEllipses() { return new Tn_VerilogEllipsesType; }
Tn_VerilogTypePtr Tn_VerilogType::createBlock() { return new Tn_VerilogBlockType; }
Tn_VerilogTypePtr Tn_VerilogType::createScalar(bool isSigned) { return new Tn_VerilogScalarType(isSigned); }
Tn_VerilogTypePtr Tn_VerilogType::createVector(bool isSigned, int32_t msb, int32_t lsb) {
    return new Tn_VerilogVectorType(isSigned, msb, lsb);
}
Tn_VerilogTypePtr Tn_VerilogType::createArray(const Tn_VerilogTypePtr& element, int32_t msb, int32_t lsb) {
    return new Tn_VerilogArrayType(element, msb, lsb);
}
Tn_VerilogTypePtr Tn_VerilogType::createFunction(const Tn_VerilogTypePtr& result, const Tn_VerilogTypeList& parameters) {
    return new Tn_VerilogFunctionType(result, parameters);
}
Tn_VerilogTypePtr Tn_VerilogType::createTask(const Tn_VerilogTypeList& parameters) {
    return new Tn_VerilogTaskType(parameters);
}

Tn_VerilogTypePtr Tn_VerilogType::asInput(const Tn_VerilogTypePtr& t) {
    if (t) t->setInput();
    return t;
}
Tn_VerilogTypePtr Tn_VerilogType::asInout(const Tn_VerilogTypePtr& t) {
    if (t) t->setInout();
    return t;
}
Tn_VerilogTypePtr Tn_VerilogType::asOutput(const Tn_VerilogTypePtr& t) {
    if (t) t->setOutput();
    return t;
}

namespace {

Port_String withDirection(const Tn_VerilogType& t, const Port_String& text) {
    Port_String r = t.directionText();
    if (!r.IsEmpty()) r += ' ';
    r += text;
    if (t.isOptional()) r += " opt";
    return r;
}

}  // namespace

template <int Kind>
bool Tn_VerilogSimpleType<Kind>::matches(const Tn_VerilogType& other) const {
    switch (Kind) {
    case TN_ERROR_TYPE:
    case TN_UNKNOWN_TYPE:
    case TN_ELLIPSES_TYPE: return true;
    case TN_VOID_TYPE: return other.isVoid();
    case TN_EVENT_TYPE: return other.isEvent() || alwaysFits(other);
    default: return other.isBlock() || alwaysFits(other);
    }
}

template <int Kind>
Port_String Tn_VerilogSimpleType<Kind>::text() const {
    static const char* const names[] = {"error", "unknown", "void", "event", "...", "block"};
    return withDirection(*this, names[Kind]);
}

template class Tn_VerilogSimpleType<TN_ERROR_TYPE>;
template class Tn_VerilogSimpleType<TN_UNKNOWN_TYPE>;
template class Tn_VerilogSimpleType<TN_VOID_TYPE>;
template class Tn_VerilogSimpleType<TN_EVENT_TYPE>;
template class Tn_VerilogSimpleType<TN_ELLIPSES_TYPE>;
template class Tn_VerilogSimpleType<TN_BLOCK_TYPE>;

bool Tn_VerilogArrayType::matches(const Tn_VerilogType& other) const {
    if (alwaysFits(other)) return true;
    return other.isArray() && element_ && other.elementType() && element_->matches(*other.elementType());
}

Port_String Tn_VerilogArrayType::text() const {
    return withDirection(*this, Port_String::doFormat("array [%d:%d] of ", msb_, lsb_) +
                                    (element_ ? element_->text() : Port_String("?")));
}

bool Tn_VerilogTaskType::matches(const Tn_VerilogType& other) const { return other.isTask() || alwaysFits(other); }

Port_String Tn_VerilogTaskType::parameterText() const {
    Port_String r("(");
    for (size_t i = 0; i < parameters_.size(); ++i) {
        if (i) r += ", ";
        r += parameters_[i]->text();
    }
    return r + ")";
}

Port_String Tn_VerilogTaskType::text() const { return withDirection(*this, "task " + parameterText()); }

bool Tn_VerilogFunctionType::matches(const Tn_VerilogType& other) const {
    return other.isFunction() || alwaysFits(other);
}

Port_String Tn_VerilogFunctionType::text() const {
    return withDirection(*this, "function " + parameterText() + " " + (result_ ? result_->text() : Port_String("?")));
}

bool Tn_VerilogValueType::matches(const Tn_VerilogType& other) const {
    return other.isValueType() || alwaysFits(other);
}

Port_String Tn_VerilogRealType::text() const { return withDirection(*this, "real"); }

Port_String Tn_VerilogScalarType::text() const {
    return withDirection(*this, isSignedType() ? "signed scalar" : "unsigned scalar");
}

Port_String Tn_VerilogVectorType::text() const {
    return withDirection(*this, Port_String::doFormat("%s [%d:%d]", isSignedType() ? "signed" : "unsigned", msb_, lsb_));
}
