// Names: resolution by upward search, hierarchical and indexed names, the
// checks of a reference, and the properties of what a name denotes.
#include <algorithm>

#include "util/tn_message.h"
#include "verilog/tn_verilogelabcontext.h"
#include "verilog/tn_verilognodes.h"

using namespace Tn_Verilog;

namespace {

// Forgets what a fresh copy had resolved to: it resolves again where it lives.
class ResolutionClearer : public Tn_VerilogFieldVisitor {
public:
    void reference(const Tn_FieldInfo&, Tn_VerilogNode*& n) override { n = nullptr; }
};


// The index of an indexed name; false when it is not a defined constant.
bool indexOf(const Tn_VerilogExpression* e, int32_t& index) {
    if (!e) return false;
    Tn_VerilogValuePtr v = e->evaluate(Tn_VerilogEvalContext::quiet());
    if (v->isNull() || v->isReal() || v->hasUnknown()) return false;
    index = v->toInt();
    return true;
}

// Scope indices along a hierarchical name must be constant.
bool checkScopeIndices(Tn_VerilogElabContext& ctx, Tn_VerilogNode* n) {
    bool ok = true;
    while (n) {
        if (Tn_VerilogIndexedName* in = Tn_VerilogNode::cast<Tn_VerilogIndexedName>(n)) {
            Tn_VerilogTypePtr t = in->Index ? in->Index->typeAs(ctx, Value) : Tn_VerilogType::createError();
            if (t->isError()) {
                ok = false;
            } else if (!in->Index->isConstant()) {
                TN_MSG().issueError("%sScope index must be constant\n", in->locationText().c_str());
                ok = false;
            }
            n = in->Prefix;
        } else if (Tn_VerilogSelectedName* sn = Tn_VerilogNode::cast<Tn_VerilogSelectedName>(n)) {
            n = sn->Prefix;
        } else {
            n = nullptr;
        }
    }
    return ok;
}

}  // namespace

// ------------------------------------------------------------------ any name

Tn_VerilogTypePtr Tn_VerilogName::typeAs(Tn_VerilogElabContext& ctx, ValueType use) {
    if (!checkAttributes(ctx)) return Tn_VerilogType::createError();
    if (!checkScopeIndices(ctx, this)) return Tn_VerilogType::createError();
    Tn_VerilogDeclaration* d = resolve(ctx.scope());
    if (!d) {
        TN_MSG().issueError("%sName '%s' could not be resolved\n", locationText().c_str(), nameText().c_str());
        return Tn_VerilogType::createError();
    }
    // A genvar has a value only while its loop is unrolled (or in the loop's elements).
    if (Tn_VerilogGenVar* g = Tn_VerilogNode::cast<Tn_VerilogGenVar>(d)) {
        if (!g->ValidFlag && !ctx.isActiveGenVar(g)) {
            TN_MSG().issueError("%sIllegal reference to genvar '%s'\n", locationText().c_str(), g->Name.c_str());
            return Tn_VerilogType::createError();
        }
    }
    const char* problem = nullptr;
    switch (use) {
    case LValue:
    case PortLValue:
        if (!isLValue()) problem = "%sReference to %s is not a legal lvalue\n";
        break;
    case NetLValue:
        if (!isNetLValue()) problem = "%sReference to %s is not a legal net lvalue\n";
        break;
    case VarLValue:
        if (!isVarLValue()) problem = "%sReference to %s is not a legal reg or variable lvalue\n";
        break;
    default: break;
    }
    if (problem) {
        TN_MSG().issueError(problem, locationText().c_str(), describe().c_str());
        return Tn_VerilogType::createError();
    }
    // Inside a function its name is the result variable.
    if (isFunctionResult(d)) return static_cast<Tn_VerilogFunction*>(d)->resultType();
    return d->type();
}

// Plain copies resolve again where they are checked; parameter and specparam
// values must name constants, resolved from the scope being elaborated.
Tn_VerilogExpression* Tn_VerilogName::copyAs(Tn_VerilogElabContext& ctx, Tn_VerilogCopyMode mode) {
    Tn_VerilogName* copy = static_cast<Tn_VerilogName*>(copyWithOperands(ctx, mode));
    if (!copy) return nullptr;
    ResolutionClearer clearer;
    copy->visitFields(clearer);
    if (mode == TN_COPY_PLAIN) return copy;
    Tn_VerilogDeclaration* d = copy->resolve(ctx.scope());
    if (!d) {
        TN_MSG().issueError("%sName '%s' could not be resolved\n", locationText().c_str(), nameText().c_str());
        return nullptr;
    }
    const bool allowed = d->isA(Tn_Verilog::Parameter) || d->isA(Tn_Verilog::GenVar) ||
                         (mode == TN_COPY_SPECPARAM && d->isA(Tn_Verilog::SpecParam));
    if (allowed) return copy;
    TN_MSG().issueError(mode == TN_COPY_PARAMETER ? "%sIllegal reference to %s in parameter expression\n"
                                                  : "%sIllegal reference to %s in specparam expression\n",
                        locationText().c_str(), d->describe().c_str());
    return nullptr;
}

Tn_VerilogDeclaration* Tn_VerilogName::resolve(const Tn_VerilogScope*) { return declaration(); }

Tn_VerilogValuePtr Tn_VerilogName::evaluate(const Tn_VerilogEvalContext& ctx) const {
    Tn_VerilogDeclaration* d = declaration();
    if (!d || !d->isConstant()) return Tn_VerilogValue::createNull();
    return Tn_VerilogValue::fit(d->value(), ctx);
}

uint32_t Tn_VerilogName::contextWidth(uint32_t width) const {
    Tn_VerilogDeclaration* d = declaration();
    return d ? std::max<uint32_t>(d->width(), width) : width;
}

bool Tn_VerilogName::isReal() const {
    Tn_VerilogDeclaration* d = declaration();
    return d && d->isReal();
}

bool Tn_VerilogName::isSigned(bool contextSigned) const {
    Tn_VerilogDeclaration* d = declaration();
    return contextSigned && d && d->isSigned();
}

bool Tn_VerilogName::isConstant() const {
    Tn_VerilogDeclaration* d = declaration();
    return d && d->isConstant();
}

bool Tn_VerilogName::isNetLValue() const {
    Tn_VerilogDeclaration* d = declaration();
    return d && d->isNetLValue();
}

bool Tn_VerilogName::isVarLValue() const {
    Tn_VerilogDeclaration* d = declaration();
    return d && (d->isVarLValue() || isFunctionResult(d));
}

Port_String Tn_VerilogName::describe() const { return "name '" + nameText() + "'"; }

bool Tn_VerilogName::bounds(int32_t& msb, int32_t& lsb) const {
    Tn_VerilogDeclaration* d = declaration();
    return d && d->bounds(msb, lsb);
}

// --------------------------------------------------------------- simple names

// A module's own name denotes the module.
Tn_VerilogDeclaration* Tn_VerilogSimpleName::declaration() const {
    if (!Scope) return nullptr;
    if (Tn_VerilogDeclaration* d = Scope->findDeclaration(Name)) return d;
    return Scope->isA(Module) && Scope->hasOwnName(Name) ? Scope.get() : nullptr;
}

Tn_VerilogDeclaration* Tn_VerilogSimpleName::resolve(const Tn_VerilogScope* start) {
    if (Scope) return declaration();
    if (!start) return nullptr;
    const Tn_VerilogScope* where = nullptr;
    Tn_VerilogDeclaration* d = start->lookup(Name, &where);
    if (d) Scope = const_cast<Tn_VerilogScope*>(where);
    return d;
}

// ------------------------------------------------------------ hierarchical names

Tn_VerilogCopyMode Tn_VerilogHierarchicalName::operandCopyMode(const Tn_VerilogNode* child, Tn_VerilogCopyMode mode) const {
    return child && child->isA(HierarchicalName) ? TN_COPY_PLAIN : mode;
}

Tn_VerilogScope* Tn_VerilogHierarchicalName::resolveScope(const Tn_VerilogScope* start) {
    Tn_VerilogDeclaration* d = resolve(start);
    return d ? d->denotedScope() : nullptr;
}

Tn_VerilogScope* Tn_VerilogHierarchicalName::scope() const {
    Tn_VerilogDeclaration* d = declaration();
    return d ? d->denotedScope() : nullptr;
}

Tn_VerilogScope* Tn_VerilogScopeName::resolveScope(const Tn_VerilogScope* start) {
    Tn_VerilogDeclaration* d = start ? start->lookupScope(Name) : nullptr;
    Tn_VerilogScope* s = d ? d->denotedScope() : nullptr;
    if (s) Scope = s;
    return s;
}

Tn_VerilogDeclaration* Tn_VerilogScopeName::declaration() const { return Scope; }

Tn_VerilogDeclaration* Tn_VerilogScopeName::resolve(const Tn_VerilogScope* start) {
    if (Scope) return Scope;
    return resolveScope(start);
}

// prefix.suffix: the prefix is resolved relative to the starting scope, then
// to each enclosing scope in turn, until the scope it denotes declares suffix.
Tn_VerilogDeclaration* Tn_VerilogSelectedName::resolve(const Tn_VerilogScope* start) {
    if (Tn_VerilogDeclaration* d = declaration()) return d;
    if (!Prefix) return nullptr;
    for (const Tn_VerilogScope* s = start; s; s = s->Parent) {
        Tn_VerilogScope* p = Prefix->resolveScope(s);
        if (Tn_VerilogDeclaration* d = p ? p->findDeclaration(Suffix) : nullptr) return d;
    }
    return nullptr;
}

Tn_VerilogDeclaration* Tn_VerilogSelectedName::declaration() const {
    Tn_VerilogScope* p = Prefix ? Prefix->scope() : nullptr;
    return p ? p->findDeclaration(Suffix) : nullptr;
}

Port_String Tn_VerilogSelectedName::nameText() const {
    return (Prefix ? Prefix->nameText() : Port_String()) + "." + Suffix.str();
}

Tn_VerilogDeclaration* Tn_VerilogIndexedName::elementOf(const Tn_VerilogScope* array) const {
    int32_t index;
    return array && indexOf(Index, index) ? array->element(index) : nullptr;
}

Tn_VerilogDeclaration* Tn_VerilogIndexedName::resolve(const Tn_VerilogScope* start) {
    if (Index) Index->resolveNames(start);
    if (Tn_VerilogDeclaration* d = declaration()) return d;
    if (!Prefix) return nullptr;
    for (const Tn_VerilogScope* s = start; s; s = s->Parent)
        if (Tn_VerilogDeclaration* d = elementOf(Prefix->resolveScope(s))) return d;
    return nullptr;
}

Tn_VerilogDeclaration* Tn_VerilogIndexedName::declaration() const { return elementOf(Prefix ? Prefix->scope() : nullptr); }

Port_String Tn_VerilogIndexedName::nameText() const {
    int32_t index;
    Port_String prefix = Prefix ? Prefix->nameText() : Port_String();
    return indexOf(Index, index) ? prefix + Port_String::doFormat("[%d]", index) : prefix + "[?]";
}
