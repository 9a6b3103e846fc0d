// Port and argument declarations: typed by the net or variable declaration
// that completes them, whose range wins over their own.
#include "util/tn_message.h"
#include "verilog/tn_verilogelabcontext.h"
#include "verilog/tn_verilognodes.h"

Tn_VerilogVariable* Tn_VerilogIODeclaration::redeclaration() const {
    const Tn_VerilogRegion* region = Tn_VerilogNode::cast<Tn_VerilogRegion>(Parent.get());
    return region ? region->Variable.find(Name) : nullptr;
}

// The declaration of the net or variable completes the port: its type
// definition is the port's (the port's own may be an implicit default).
Tn_VerilogTypeDef* Tn_VerilogIODeclaration::typeDef() const {
    Tn_VerilogVariable* v = redeclaration();
    return v && v->TypeDef ? v->TypeDef.get() : TypeDef.get();
}

Tn_VerilogRange* Tn_VerilogIODeclaration::effectiveRange() const {
    Tn_VerilogTypeDef* t = typeDef();
    if (t && t->range()) return t->range();
    return Range;
}

Port_String Tn_VerilogIODeclaration::describe() const {
    Tn_VerilogTypeDef* def = typeDef();
    if (!def) return Port_String::doFormat("%s '%s'", directionWord(), Name.c_str());
    return Port_String::doFormat("%s %s '%s'", def->describe().c_str(), directionWord(), Name.c_str());
}

Tn_VerilogTypePtr Tn_VerilogIODeclaration::type() const {
    prepare();
    Tn_VerilogTypeDef* def = typeDef();
    if (def && (def->range() || !Range)) return def->type();
    if (def && def->isReal()) return def->type();
    int32_t msb, lsb;
    if (Range && Range->bounds(msb, lsb)) return Tn_VerilogType::createVector(isSigned(), msb, lsb);
    return Tn_VerilogType::createScalar(isSigned());
}

uint32_t Tn_VerilogIODeclaration::width() const {
    prepare();
    Tn_VerilogTypeDef* def = typeDef();
    if (Tn_VerilogRange* r = effectiveRange()) return r->width();
    return def ? def->width() : 1;
}

bool Tn_VerilogIODeclaration::isSigned() const { return SignedFlag || (typeDef() && typeDef()->isSigned()); }

bool Tn_VerilogIODeclaration::bounds(int32_t& msb, int32_t& lsb) const {
    prepare();
    Tn_VerilogTypeDef* def = typeDef();
    if (Tn_VerilogRange* r = effectiveRange()) return r->bounds(msb, lsb);
    return def ? def->bounds(msb, lsb) : (msb = lsb = 0, true);
}

// The port's own range, the redeclaration its type definition stands for,
// and the range the redeclaration overrides.
Tn_VerilogTypePtr Tn_VerilogIODeclaration::check(Tn_VerilogElabContext& ctx) {
    bool ok = checkAttributes(ctx);
    Tn_VerilogTypeDef* def = typeDef();
    // A range shared with the type definition is checked with it.
    const bool ownRange = Range && (!def || def->range() != Range.get());
    if (ownRange && ctx.firstCheck(Range) && Range->check(ctx)->isError()) ok = false;
    if (!def) return ok ? Tn_VerilogType::createVoid() : Tn_VerilogType::createError();
    if (ctx.firstCheck(def) && def->check(ctx)->isError()) ok = false;

    Tn_VerilogVariable* redeclared = redeclaration();
    const bool asArray = redeclared && redeclared->isA(Tn_Verilog::ArrayVar);
    bool allowed = true;
    if (isA(Tn_Verilog::Output)) allowed = def->checkOutputRedeclaration(*this, asArray);
    else if (isA(Tn_Verilog::Inout)) allowed = def->checkInoutRedeclaration(*this, asArray);
    else allowed = def->checkInputRedeclaration(*this, asArray);
    if (!allowed) return Tn_VerilogType::createError();

    // A range shared with the port (one declaration made both) overrides nothing.
    Tn_VerilogRange* range = def->range();
    if (Range && range && range != Range.get()) {
        const Tn_VerilogNode* at = redeclared ? static_cast<const Tn_VerilogNode*>(redeclared) : range;
        TN_MSG().issueWarning("%sRange on redeclaration of '%s' overrides range on %s declaration at %s\n",
                              at->locationText().c_str(), Name.c_str(), directionWord(), locationText().c_str());
    }
    return ok ? Tn_VerilogType::createVoid() : Tn_VerilogType::createError();
}
