// What checking an expression or a call yields: the kind of thing it denotes
// and, for the parameters of tasks and functions, the direction it is passed
// in. Types are small, shared by counted handles and made fresh on demand;
// the error type tells enclosing checks that a message was already issued.
#ifndef TARN_TN_VERILOGTYPE_H
#define TARN_TN_VERILOGTYPE_H

#include <cstdint>
#include <vector>

#include "tarn/port_stringbase.h"
#include "tarn/tn_rcobject.h"
#include "tarn/tn_rcptr.h"

class Tn_VerilogType;
typedef Tn::RCPtr<Tn_VerilogType> Tn_VerilogTypePtr;
typedef std::vector<Tn_VerilogTypePtr> Tn_VerilogTypeList;

class Tn_VerilogType : public Tn::RCObject {
public:
    enum Direction : int32_t { NoDirection = -1, Input = 0, Inout = 1, Output = 2 };

    ~Tn_VerilogType() override;

    virtual bool isError() const { return false; }
    virtual bool isUnknown() const { return false; }
    virtual bool isVoid() const { return false; }
    virtual bool isUnsignedType() const { return false; }
    virtual bool isSignedType() const { return false; }
    virtual bool isScalar() const { return false; }
    virtual bool isVector() const { return false; }
    virtual bool isIntegral() const { return false; }
    virtual bool isRealType() const { return false; }
    virtual bool isValueType() const { return false; }
    virtual bool isEvent() const { return false; }
    virtual bool isEllipses() const { return false; }
    virtual bool isArray() const { return false; }
    virtual bool isFunction() const { return false; }
    virtual bool isTask() const { return false; }
    virtual bool isBlock() const { return false; }
    // Second mark: an argument in this place may be any expression (scopes,
    // whole memories, strings), not just a value of this type.
    bool acceptsAny() const { return acceptsAny_; }
    // Whether a value of type other fits this type. The error and unknown
    // types fit everywhere, so that nothing is reported twice.
    virtual bool matches(const Tn_VerilogType& other) const = 0;
    bool isInput() const { return direction_ == Input; }
    bool isInout() const { return direction_ == Inout; }
    bool isOutput() const { return direction_ == Output; }
    // First mark: the argument in this place may be left out or empty.
    bool isOptional() const { return optional_; }
    virtual Tn_VerilogTypePtr elementType() const { return Tn_VerilogTypePtr(); }
    virtual Tn_VerilogTypePtr returnType() const { return Tn_VerilogTypePtr(); }
    virtual const Tn_VerilogTypeList& parameterTypes() const;
    // Entry i of parameterTypes(); null past the end.
    Tn_VerilogTypePtr parameterType(size_t i) const;
    virtual int32_t msb() const { return 0; }
    virtual int32_t lsb() const { return 0; }
    void setInput() { direction_ = Input; }
    void setInout() { direction_ = Inout; }
    void setOutput() { direction_ = Output; }
    void setOptional(bool v = true) { optional_ = v; }
    void setAcceptsAny(bool v = true) { acceptsAny_ = v; }

    int32_t direction() const { return direction_; }
    // "input", "inout", "output"; empty without a direction.
    const char* directionText() const;
    // Short text for diagnostics and tests: "error", "signed scalar",
    // "unsigned [7:0]", "real", "array [0:3] of ...", "input ...".
    virtual Port_String text() const = 0;

    static Tn_VerilogTypePtr createError();
    static Tn_VerilogTypePtr createUnknown();
    static Tn_VerilogTypePtr createVoid();
    static Tn_VerilogTypePtr createReal();
    static Tn_VerilogTypePtr createEvent();
    static Tn_VerilogTypePtr createEllipses();
    static Tn_VerilogTypePtr createBlock();
    static Tn_VerilogTypePtr createScalar(bool isSigned);
    static Tn_VerilogTypePtr createVector(bool isSigned, int32_t msb, int32_t lsb);
    static Tn_VerilogTypePtr createArray(const Tn_VerilogTypePtr& element, int32_t msb, int32_t lsb);
    static Tn_VerilogTypePtr createFunction(const Tn_VerilogTypePtr& result, const Tn_VerilogTypeList& parameters);
    static Tn_VerilogTypePtr createTask(const Tn_VerilogTypeList& parameters);
    // The given type with its direction set (for parameter types).
    static Tn_VerilogTypePtr asInput(const Tn_VerilogTypePtr& t);
    static Tn_VerilogTypePtr asInout(const Tn_VerilogTypePtr& t);
    static Tn_VerilogTypePtr asOutput(const Tn_VerilogTypePtr& t);

protected:
    Tn_VerilogType() {}
    // The fit every class shares: error and unknown fit anything.
    static bool alwaysFits(const Tn_VerilogType& other) { return other.isError() || other.isUnknown(); }

private:
    int32_t direction_ = NoDirection;
    bool optional_ = false;
    bool acceptsAny_ = false;
};

class Tn_VerilogBaseType : public Tn_VerilogType {};

// The kinds without fields of their own share one class template: Kind
// selects the predicate that answers true and what fits.
template <int Kind>
class Tn_VerilogSimpleType;

enum Tn_VerilogSimpleKind { TN_ERROR_TYPE, TN_UNKNOWN_TYPE, TN_VOID_TYPE, TN_EVENT_TYPE, TN_ELLIPSES_TYPE, TN_BLOCK_TYPE };

typedef Tn_VerilogSimpleType<TN_ERROR_TYPE> Tn_VerilogErrorType;
typedef Tn_VerilogSimpleType<TN_UNKNOWN_TYPE> Tn_VerilogUnknownType;
typedef Tn_VerilogSimpleType<TN_VOID_TYPE> Tn_VerilogVoidType;
typedef Tn_VerilogSimpleType<TN_EVENT_TYPE> Tn_VerilogEventType;
typedef Tn_VerilogSimpleType<TN_ELLIPSES_TYPE> Tn_VerilogEllipsesType;
typedef Tn_VerilogSimpleType<TN_BLOCK_TYPE> Tn_VerilogBlockType;

template <int Kind>
class Tn_VerilogSimpleType : public Tn_VerilogBaseType {
public:
    bool isError() const override { return Kind == TN_ERROR_TYPE; }
    bool isUnknown() const override { return Kind == TN_UNKNOWN_TYPE; }
    bool isVoid() const override { return Kind == TN_VOID_TYPE; }
    bool isEvent() const override { return Kind == TN_EVENT_TYPE; }
    bool isEllipses() const override { return Kind == TN_ELLIPSES_TYPE; }
    bool isBlock() const override { return Kind == TN_BLOCK_TYPE; }
    bool matches(const Tn_VerilogType& other) const override;
    Port_String text() const override;
};

class Tn_VerilogArrayType : public Tn_VerilogBaseType {
public:
    Tn_VerilogArrayType(const Tn_VerilogTypePtr& element, int32_t msb, int32_t lsb)
        : element_(element), msb_(msb), lsb_(lsb) {}
    bool isArray() const override { return true; }
    bool matches(const Tn_VerilogType& other) const override;
    Tn_VerilogTypePtr elementType() const override { return element_; }
    int32_t msb() const override { return msb_; }
    int32_t lsb() const override { return lsb_; }
    Port_String text() const override;

private:
    Tn_VerilogTypePtr element_;
    int32_t msb_, lsb_;
};

class Tn_VerilogTaskType : public Tn_VerilogBaseType {
public:
    explicit Tn_VerilogTaskType(const Tn_VerilogTypeList& parameters) : parameters_(parameters) {}
    bool isTask() const override { return true; }
    bool matches(const Tn_VerilogType& other) const override;
    const Tn_VerilogTypeList& parameterTypes() const override { return parameters_; }
    Port_String text() const override;

protected:
    Port_String parameterText() const;

private:
    Tn_VerilogTypeList parameters_;
};

class Tn_VerilogFunctionType : public Tn_VerilogTaskType {
public:
    Tn_VerilogFunctionType(const Tn_VerilogTypePtr& result, const Tn_VerilogTypeList& parameters)
        : Tn_VerilogTaskType(parameters), result_(result) {}
    bool isTask() const override { return false; }
    bool isFunction() const override { return true; }
    bool matches(const Tn_VerilogType& other) const override;
    Tn_VerilogTypePtr returnType() const override { return result_; }
    Port_String text() const override;

private:
    Tn_VerilogTypePtr result_;
};

// Real, scalar and vector types: a value of any of them converts to any
// other when assigned or passed, so they all fit one another.
class Tn_VerilogValueType : public Tn_VerilogBaseType {
public:
    bool isValueType() const override { return true; }
    bool matches(const Tn_VerilogType& other) const override;
};

class Tn_VerilogRealType : public Tn_VerilogValueType {
public:
    bool isRealType() const override { return true; }
    Port_String text() const override;
};

class Tn_VerilogIntegerType : public Tn_VerilogValueType {
public:
    explicit Tn_VerilogIntegerType(bool isSigned) : signed_(isSigned) {}
    bool isIntegral() const override { return true; }
    bool isSignedType() const override { return signed_; }
    bool isUnsignedType() const override { return !signed_; }

private:
    bool signed_;
};

class Tn_VerilogScalarType : public Tn_VerilogIntegerType {
public:
    explicit Tn_VerilogScalarType(bool isSigned) : Tn_VerilogIntegerType(isSigned) {}
    bool isScalar() const override { return true; }
    Port_String text() const override;
};

class Tn_VerilogVectorType : public Tn_VerilogIntegerType {
public:
    Tn_VerilogVectorType(bool isSigned, int32_t msb, int32_t lsb) : Tn_VerilogIntegerType(isSigned), msb_(msb), lsb_(lsb) {}
    bool isVector() const override { return true; }
    int32_t msb() const override { return msb_; }
    int32_t lsb() const override { return lsb_; }
    Port_String text() const override;

private:
    int32_t msb_, lsb_;
};

#endif
