// Declarations: paths and descriptions, objects typed by their type
// definitions, the constants (parameters, specparams, genvars) and their
// values, and the checks of variables.
#include <initializer_list>

#include "util/tn_message.h"
#include "verilog/tn_verilogelabcontext.h"
#include "verilog/tn_verilognodes.h"

using namespace Tn_Verilog;

// --------------------------------------------------------------- declarations

Port_String Tn_VerilogDeclaration::localPath() const {
    if (Parent && Parent->isExpandedScope()) return Parent->localPath() + "." + Name.str();
    return Name.str();
}

Port_String Tn_VerilogDeclaration::fullPath() const {
    if (!Parent || Parent->isRoot()) return Name.str();
    return Parent->fullPath() + "." + Name.str();
}

Port_String Tn_VerilogDeclaration::describe() const { return Port_String::doFormat("'%s'", Name.c_str()); }

Tn_VerilogTypePtr Tn_VerilogDeclaration::type() const { return Tn_VerilogType::createUnknown(); }

Tn_VerilogValuePtr Tn_VerilogDeclaration::value() const { return Tn_VerilogValue::createNull(); }

bool Tn_VerilogDeclaration::bounds(int32_t&, int32_t&) const { return false; }

Port_String Tn_VerilogPort::describe() const { return Port_String::doFormat("port '%s'", Name.c_str()); }

// -------------------------------------------------------------------- objects

namespace {

void resolveRangeNames(Tn_VerilogRange* r, const Tn_VerilogScope* scope) {
    if (r) r->resolveNames(scope);
}

}  // namespace

void Tn_VerilogObject::prepare() const {
    if (Tn_VerilogTypeDef* t = typeDef()) resolveRangeNames(t->range(), Parent);
    if (const Tn_VerilogIODeclaration* io = Tn_VerilogNode::cast<Tn_VerilogIODeclaration>(const_cast<Tn_VerilogObject*>(this)))
        resolveRangeNames(io->Range, Parent);
}

Tn_VerilogTypePtr Tn_VerilogObject::check(Tn_VerilogElabContext& ctx) {
    bool ok = checkAttributes(ctx);
    // One type definition may serve several objects: checked once.
    if (typeDef() && ctx.firstCheck(typeDef()) && typeDef()->check(ctx)->isError()) ok = false;
    return ok ? Tn_VerilogType::createVoid() : Tn_VerilogType::createError();
}

Port_String Tn_VerilogObject::describe() const {
    if (!typeDef()) return Tn_VerilogDeclaration::describe();
    return Port_String::doFormat("%s '%s'", typeDef()->describe().c_str(), Name.c_str());
}

Tn_VerilogTypePtr Tn_VerilogObject::type() const {
    prepare();
    return typeDef() ? typeDef()->type() : Tn_VerilogType::createUnknown();
}
uint32_t Tn_VerilogObject::width() const {
    prepare();
    return typeDef() ? typeDef()->width() : 1;
}
bool Tn_VerilogObject::isSigned() const { return typeDef() && typeDef()->isSigned(); }
bool Tn_VerilogObject::isReal() const { return typeDef() && typeDef()->isReal(); }
bool Tn_VerilogObject::hasFixedSize() const { return !typeDef() || typeDef()->hasFixedSize(); }
bool Tn_VerilogObject::isNet() const { return typeDef() && typeDef()->isNet(); }
bool Tn_VerilogObject::isVariable() const { return typeDef() && typeDef()->isVariable(); }
bool Tn_VerilogObject::bounds(int32_t& msb, int32_t& lsb) const {
    prepare();
    return typeDef() && typeDef()->bounds(msb, lsb);
}

// Variable declaration assignments belong to module items: a reg, integer,
// time or real variable declared in a module or one of its generate scopes.
Tn_VerilogTypePtr Tn_VerilogScalarVar::check(Tn_VerilogElabContext& ctx) {
    bool ok = !Tn_VerilogObject::check(ctx)->isError();
    if (!InitExpr) return ok ? Tn_VerilogType::createVoid() : Tn_VerilogType::createError();
    Tn_VerilogTypePtr t = InitExpr->typeAs(ctx, Value);
    if (t->isError()) return t;
    const bool moduleItem = Parent && (Parent->isA(Module) || Parent->isA(Generate));
    if (!isVariable() || !moduleItem) {
        TN_MSG().issueError("%sIllegal variable initialization.\n", locationText().c_str());
        return Tn_VerilogType::createError();
    }
    if (!InitExpr->isConstant()) {
        TN_MSG().issueError("%sInitialization value must be constant\n", InitExpr->locationText().c_str());
        return Tn_VerilogType::createError();
    }
    return ok ? Tn_VerilogType::createVoid() : Tn_VerilogType::createError();
}

Tn_VerilogTypePtr Tn_VerilogArrayVar::check(Tn_VerilogElabContext& ctx) {
    bool ok = !Tn_VerilogObject::check(ctx)->isError();
    for (Tn_VerilogRange* r : Range)
        if (r && r->check(ctx)->isError()) ok = false;
    return ok ? Tn_VerilogType::createVoid() : Tn_VerilogType::createError();
}

Port_String Tn_VerilogArrayVar::describe() const {
    return Port_String::doFormat("%s array '%s'", typeDef() ? typeDef()->describe().c_str() : "", Name.c_str());
}

// The first dimension outermost: mem[0:3][1:2] is an array of arrays.
Tn_VerilogTypePtr Tn_VerilogArrayVar::type() const {
    Tn_VerilogTypePtr t = Tn_VerilogObject::type();
    for (Tn_VerilogRange* r : Range) resolveRangeNames(r, Parent);
    for (size_t i = Range.size(); i-- > 0;) {
        int32_t msb = 0, lsb = 0;
        if (Range[i]) Range[i]->bounds(msb, lsb);
        t = Tn_VerilogType::createArray(t, msb, lsb);
    }
    return t;
}

// ------------------------------------------------------------------- genvars

Port_String Tn_VerilogGenVar::describe() const { return Port_String::doFormat("genvar '%s'", Name.c_str()); }

Tn_VerilogTypePtr Tn_VerilogGenVar::type() const { return Tn_VerilogType::createVector(true, 31, 0); }

Tn_VerilogValuePtr Tn_VerilogGenVar::value() const {
    return ValidFlag ? Tn_VerilogValue::createInteger(Tn_VerilogGenVar::Value) : Tn_VerilogValue::createNull();
}

bool Tn_VerilogGenVar::bounds(int32_t& msb, int32_t& lsb) const {
    msb = 31;
    lsb = 0;
    return true;
}

// -------------------------------------------------------- parameters, specparams

namespace {

bool declaredSigned(const Tn_VerilogParameter& p) {
    return p.SignedFlag || p.DeclType == SignedNoRangeParam || p.DeclType == SignedParam || p.DeclType == IntegerParam;
}
bool declaredSigned(const Tn_VerilogSpecParam& p) {
    return p.DeclType == SignedNoRangeParam || p.DeclType == SignedParam || p.DeclType == IntegerParam;
}

// Declared bounds of a parameter that has a fixed size; false otherwise.
template <class P>
bool declaredBounds(const P& p, int32_t& msb, int32_t& lsb) {
    switch (static_cast<int32_t>(p.DeclType)) {
    case IntegerParam: msb = 31, lsb = 0; return true;
    case TimeParam: msb = 63, lsb = 0; return true;
    case UnsignedParam:
    case SignedParam: return p.Range && p.Range->bounds(msb, lsb);
    default: return false;
    }
}

bool typeFixesSize(int32_t declType) {
    return declType == IntegerParam || declType == RealParam || declType == TimeParam;
}

template <class P>
bool parameterHasFixedSize(const P& p) {
    if (typeFixesSize(p.DeclType)) return true;
    if (p.DeclType == UnsignedParam || p.DeclType == SignedParam) return !p.Range || p.Range->isLiteral();
    return false;
}

// The value of the expression in force converted to the declared type: an
// assignment to an object of that type (evaluated at least as wide, then
// truncated or extended by the value's own sign, then given the declared sign
// and bounds). Without type and range the value stays as it is (made signed
// by a signed declaration).
template <class P>
Tn_VerilogValuePtr parameterValue(const P& p, const Tn_VerilogExpression* e) {
    if (!e) return Tn_VerilogValue::createNull();
    const Tn_VerilogEvalContext quiet = Tn_VerilogEvalContext::quiet();
    if (p.DeclType == RealParam) {
        Tn_VerilogValuePtr v = e->evaluate(quiet);
        return v->isNull() || v->isReal() ? v : Tn_VerilogValue::createReal(v->toReal());
    }
    const bool isSigned = declaredSigned(p);
    int32_t msb, lsb;
    if (!declaredBounds(p, msb, lsb)) {
        if (p.DeclType == UnsignedParam || p.DeclType == SignedParam) return Tn_VerilogValue::createNull();
        Tn_VerilogValuePtr v = e->evaluate(quiet);
        if (!isSigned || v->isNull() || v->isReal() || v->isSigned()) return v;
        Tn_VerilogVector vec = v->toVector();
        vec.setSigned(true);
        return Tn_VerilogValue::createVector(std::move(vec));
    }
    const int64_t span = static_cast<int64_t>(msb) - lsb;
    const uint64_t width = static_cast<uint64_t>(span < 0 ? -span : span) + 1;
    if (width > Tn_VerilogEvalContext::kMaxWidth) return Tn_VerilogValue::createNull();
    Tn_VerilogValuePtr v = e->evaluate(Tn_VerilogEvalContext(false, true, true, static_cast<uint32_t>(width)));
    if (v->isNull()) return v;
    Tn_VerilogVector vec = v->isReal() ? Tn_VerilogVector(v->toReal()) : v->toVector();
    vec = vec.resized(static_cast<uint32_t>(width));
    vec.setSigned(isSigned);
    vec.setBounds(msb, lsb);
    return Tn_VerilogValue::createVector(std::move(vec));
}

// Guards the computation of a parameter's value against its own recursion.
class Evaluating {
public:
    explicit Evaluating(bool& flag) : flag_(flag), entered_(!flag) { flag_ = true; }
    ~Evaluating() {
        if (entered_) flag_ = false;
    }
    bool entered() const { return entered_; }

private:
    bool& flag_;
    bool entered_;
};

// The outermost value computation running: overrides and genvar values do
// not change while it runs, so a parameter's value is computed once in it.
class EvaluationSession {
public:
    EvaluationSession() {
        if (depth_++ == 0) ++current_;
    }
    ~EvaluationSession() { --depth_; }
    static uint32_t current() { return current_; }

private:
    static int depth_;
    static uint32_t current_;
};
int EvaluationSession::depth_ = 0;
uint32_t EvaluationSession::current_ = 0;

template <class P>
Tn_VerilogValuePtr guardedValue(const P& p, Tn_VerilogParamValueState& state) {
    EvaluationSession session;
    if (state.value && state.session == EvaluationSession::current()) return state.value;
    Evaluating guard(state.evaluating);
    if (!guard.entered()) return Tn_VerilogValue::createNull();
    Tn_VerilogExpression* e = p.valueExpression();
    // The value may be asked for before anything checked the declaration.
    if (e) e->resolveNames(p.Parent);
    if (p.Range) resolveRangeNames(p.Range, p.Parent);
    state.value = parameterValue(p, e);
    state.session = EvaluationSession::current();
    return state.value;
}

template <class P>
uint32_t parameterWidth(const P& p) {
    if (p.DeclType == RealParam) return 64;
    int32_t msb, lsb;
    if (declaredBounds(p, msb, lsb)) {
        const int64_t span = static_cast<int64_t>(msb) - lsb;
        return static_cast<uint32_t>(span < 0 ? -span : span) + 1;
    }
    Tn_VerilogValuePtr v = p.value();
    return v->isNull() ? 1 : v->width();
}

template <class P>
bool parameterBounds(const P& p, int32_t& msb, int32_t& lsb) {
    if (declaredBounds(p, msb, lsb)) return true;
    if (p.DeclType != NoTypeNoRangeParam && p.DeclType != SignedNoRangeParam) return false;
    return Tn_VerilogExpression::boundsOf(p.value(), msb, lsb);
}

template <class P>
Tn_VerilogTypePtr parameterType(const P& p) {
    if (p.isReal()) return Tn_VerilogType::createReal();
    int32_t msb, lsb;
    if (parameterBounds(p, msb, lsb)) return Tn_VerilogType::createVector(p.isSigned(), msb, lsb);
    return Tn_VerilogType::createScalar(p.isSigned());
}

template <class P>
bool parameterIsSigned(const P& p) {
    if (declaredSigned(p)) return true;
    if (p.DeclType != NoTypeNoRangeParam) return p.DeclType == RealParam;
    Tn_VerilogValuePtr v = p.value();
    return !v->isNull() && v->isSigned();
}

template <class P>
bool parameterIsReal(const P& p) {
    if (p.DeclType == RealParam) return true;
    if (p.DeclType != NoTypeNoRangeParam && p.DeclType != SignedNoRangeParam) return false;
    return p.value()->isReal();
}

// Attributes, range and value expressions; void or the error type.
template <class P>
Tn_VerilogTypePtr checkParameter(P& p, Tn_VerilogElabContext& ctx, std::initializer_list<Tn_VerilogExpression*> values) {
    bool ok = p.checkAttributes(ctx);
    if (p.Range && p.Range->check(ctx)->isError()) ok = false;
    for (Tn_VerilogExpression* e : values)
        if (e && e->typeAs(ctx, Value)->isError()) ok = false;
    return ok ? Tn_VerilogType::createVoid() : Tn_VerilogType::createError();
}

}  // namespace

#define TN_PARAMETER_FORWARDS(Class)                                                                     \
    Tn_VerilogValuePtr Class::value() const { return guardedValue(*this, valueState_); }                \
    Tn_VerilogTypePtr Class::type() const { return parameterType(*this); }                               \
    uint32_t Class::width() const { return parameterWidth(*this); }                                      \
    bool Class::isSigned() const { return parameterIsSigned(*this); }                                    \
    bool Class::isReal() const { return parameterIsReal(*this); }                                        \
    bool Class::hasFixedSize() const { return parameterHasFixedSize(*this); }                            \
    bool Class::bounds(int32_t& msb, int32_t& lsb) const { return parameterBounds(*this, msb, lsb); }
TN_PARAMETER_FORWARDS(Tn_VerilogParameter)
TN_PARAMETER_FORWARDS(Tn_VerilogSpecParam)
#undef TN_PARAMETER_FORWARDS

Tn_VerilogExpression* Tn_VerilogParameter::valueExpression() const { return OverrideExpr ? OverrideExpr.get() : Expr.get(); }
Tn_VerilogExpression* Tn_VerilogSpecParam::valueExpression() const { return Expr; }

Port_String Tn_VerilogParameter::describe() const {
    return Port_String::doFormat(LocalFlag ? "localparam '%s'" : "parameter '%s'", Name.c_str());
}
Port_String Tn_VerilogSpecParam::describe() const { return Port_String::doFormat("specparam '%s'", Name.c_str()); }

Tn_VerilogTypePtr Tn_VerilogParameter::check(Tn_VerilogElabContext& ctx) {
    return checkParameter(*this, ctx, {Expr.get(), OverrideExpr.get()});
}
Tn_VerilogTypePtr Tn_VerilogSpecParam::check(Tn_VerilogElabContext& ctx) { return checkParameter(*this, ctx, {Expr.get()}); }
