// What every expression shares: the defaults of the expression interface, the
// operand-wise elaborated copy, and the attribute checks of attributed nodes.
#include "util/tn_message.h"
#include "verilog/tn_verilogelabcontext.h"
#include "verilog/tn_veriloglibraryunit.h"
#include "verilog/tn_verilognodes.h"

// ------------------------------------------------------------ attributed nodes

bool Tn_VerilogAttributedNode::checkAttributes(Tn_VerilogElabContext& ctx) {
    return !Attributes || !Attributes->check(ctx)->isError();
}

Tn_VerilogTypePtr Tn_VerilogAttributedNode::check(Tn_VerilogElabContext& ctx) {
    return checkAttributes(ctx) ? Tn_VerilogType::createVoid() : Tn_VerilogType::createError();
}

Tn_VerilogTypePtr Tn_VerilogAttributes::check(Tn_VerilogElabContext& ctx) {
    bool ok = true;
    for (Tn_VerilogAttribute* a : Attribute)
        if (a && a->check(ctx)->isError()) ok = false;
    return ok ? Tn_VerilogType::createVoid() : Tn_VerilogType::createError();
}

Tn_VerilogTypePtr Tn_VerilogAttribute::check(Tn_VerilogElabContext& ctx) {
    if (!Expr) return Tn_VerilogType::createVoid();
    Tn_VerilogTypePtr t = Expr->typeAs(ctx, Tn_Verilog::Value);
    if (t->isError()) return t;
    if (!Expr->isConstant()) {
        TN_MSG().issueError("%sAttribute value must be constant\n", Expr->locationText().c_str());
        return Tn_VerilogType::createError();
    }
    return Tn_VerilogType::createVoid();
}

// ---------------------------------------------------------- event expressions

Tn_VerilogTypePtr Tn_VerilogEventExpression::check(Tn_VerilogElabContext& ctx) { return typeAs(ctx, Tn_Verilog::Value); }

Tn_VerilogTypePtr Tn_VerilogEventExpression::typeAs(Tn_VerilogElabContext& ctx, Tn_Verilog::ValueType) {
    return checkAttributes(ctx) ? Tn_VerilogType::createUnknown() : Tn_VerilogType::createError();
}

// ---------------------------------------------------------------- expressions

Tn_VerilogValuePtr Tn_VerilogExpression::evaluate(const Tn_VerilogEvalContext&) const {
    return Tn_VerilogValue::createNull();
}

uint32_t Tn_VerilogExpression::contextWidth(uint32_t width) const { return width; }

bool Tn_VerilogExpression::isSigned(bool) const { return false; }

bool Tn_VerilogExpression::boundsOf(const Tn_VerilogValuePtr& v, int32_t& msb, int32_t& lsb) {
    if (!v || v->isNull() || v->isReal()) return false;
    if (const Tn_VerilogVector* vec = v->vector()) {
        msb = vec->msb();
        lsb = vec->lsb();
    } else {
        msb = static_cast<int32_t>(v->width()) - 1;
        lsb = 0;
    }
    return true;
}

Tn_VerilogExpression* Tn_VerilogExpression::copyAs(Tn_VerilogElabContext& ctx, Tn_VerilogCopyMode mode) {
    return copyWithOperands(ctx, mode);
}

namespace {

// Replaces the children of a fresh member-wise copy: expressions by their
// copies in the mode their parent asks for, anything else by a clone.
class OperandCopier : public Tn_VerilogChildVisitor {
public:
    OperandCopier(const Tn_VerilogExpression& source, Tn_VerilogElabContext& ctx, Tn_VerilogCopyMode mode)
        : source_(source), ctx_(ctx), mode_(mode) {}
    void eachChild(const Tn_FieldInfo&, Tn_VerilogNode*& child) override {
        if (!child) return;
        if (Tn_VerilogExpression* e = Tn_VerilogNode::cast<Tn_VerilogExpression>(child)) {
            child = e->copyAs(ctx_, source_.operandCopyMode(e, mode_));
            if (!child) failed = true;
        } else {
            child = child->clone(ctx_.factory());
        }
    }
    bool failed = false;

private:
    const Tn_VerilogExpression& source_;
    Tn_VerilogElabContext& ctx_;
    Tn_VerilogCopyMode mode_;
};

class OperandTest : public Tn_VerilogChildVisitor {
public:
    explicit OperandTest(bool (*test)(const Tn_VerilogExpression&)) : test_(test) {}
    void eachChild(const Tn_FieldInfo&, Tn_VerilogNode*& child) override {
        if (const Tn_VerilogExpression* e = Tn_VerilogNode::cast<Tn_VerilogExpression>(child))
            if (!test_(*e)) holds = false;
    }
    bool holds = true;

private:
    bool (*test_)(const Tn_VerilogExpression&);
};

class NameResolver : public Tn_VerilogChildVisitor {
public:
    explicit NameResolver(const Tn_VerilogScope* scope) : scope_(scope) {}
    void eachChild(const Tn_FieldInfo&, Tn_VerilogNode*& child) override {
        if (Tn_VerilogExpression* e = Tn_VerilogNode::cast<Tn_VerilogExpression>(child)) e->resolveNames(scope_);
    }

private:
    const Tn_VerilogScope* scope_;
};

}  // namespace

// Operands first: the index of an indexed name must have its value before
// the name can be resolved.
void Tn_VerilogExpression::resolveNames(const Tn_VerilogScope* scope) {
    if (!scope) return;
    NameResolver resolver(scope);
    visitFields(resolver);
    if (Tn_VerilogName* n = Tn_VerilogNode::cast<Tn_VerilogName>(this))
        if (!n->declaration()) n->resolve(scope);
}

Tn_VerilogExpression* Tn_VerilogExpression::copyWithOperands(Tn_VerilogElabContext& ctx, Tn_VerilogCopyMode mode) {
    Tn_VerilogExpression* copy = static_cast<Tn_VerilogExpression*>(newCopy(ctx.factory()));
    // Every operand is copied, so each one reports what it must.
    OperandCopier copier(*this, ctx, mode);
    copy->visitFields(copier);
    return copier.failed ? nullptr : copy;
}

bool Tn_VerilogExpression::allOperands(bool (*test)(const Tn_VerilogExpression&)) const {
    OperandTest t(test);
    // The visitor only reads; visitFields hands out references for the writers.
    const_cast<Tn_VerilogExpression*>(this)->visitFields(t);
    return t.holds;
}

// ------------------------------------------------------------------- operands

Port_String Tn_VerilogOperand::describe() const { return Port_String(); }

bool Tn_VerilogOperand::bounds(int32_t& msb, int32_t& lsb) const {
    uint32_t w = contextWidth(0);
    if (w == 0) return false;
    msb = static_cast<int32_t>(w - 1);
    lsb = 0;
    return true;
}

Tn_VerilogValuePtr Tn_VerilogOperand::msb() const {
    int32_t m, l;
    return bounds(m, l) ? Tn_VerilogValue::createInteger(m) : Tn_VerilogValuePtr();
}

Tn_VerilogValuePtr Tn_VerilogOperand::lsb() const {
    int32_t m, l;
    return bounds(m, l) ? Tn_VerilogValue::createInteger(l) : Tn_VerilogValuePtr();
}

// ----------------------------------------------------------------- operations

bool Tn_VerilogOperation::isLiteral() const {
    return allOperands([](const Tn_VerilogExpression& e) { return e.isLiteral(); });
}

bool Tn_VerilogOperation::isConstant() const {
    return allOperands([](const Tn_VerilogExpression& e) { return e.isConstant(); });
}
