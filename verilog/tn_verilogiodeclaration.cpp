// Port and argument declarations: typed by the net or variable declaration
// that completes them, whose range wins over their own.
#include "util/tn_message.h"
#include "verilog/tn_verilogelabcontext.h"
#include "verilog/tn_verilognodes.h"

Tn_VerilogRange* Tn_VerilogIODeclaration::effectiveRange() const {
    if (TypeDef && TypeDef->range()) return TypeDef->range();
    return Range;
}

Port_String Tn_VerilogIODeclaration::describe() const {
    if (!TypeDef) return Port_String::doFormat("%s '%s'", directionWord(), Name.c_str());
    return Port_String::doFormat("%s %s '%s'", TypeDef->describe().c_str(), directionWord(), Name.c_str());
}

Tn_VerilogTypePtr Tn_VerilogIODeclaration::type() const {
    prepare();
    if (TypeDef && (TypeDef->range() || !Range)) return TypeDef->type();
    if (TypeDef && TypeDef->isReal()) return TypeDef->type();
    int32_t msb, lsb;
    if (Range && Range->bounds(msb, lsb)) return Tn_VerilogType::createVector(isSigned(), msb, lsb);
    return Tn_VerilogType::createScalar(isSigned());
}

uint32_t Tn_VerilogIODeclaration::width() const {
    prepare();
    if (Tn_VerilogRange* r = effectiveRange()) return r->width();
    return TypeDef ? TypeDef->width() : 1;
}

bool Tn_VerilogIODeclaration::isSigned() const { return SignedFlag || (TypeDef && TypeDef->isSigned()); }

bool Tn_VerilogIODeclaration::bounds(int32_t& msb, int32_t& lsb) const {
    prepare();
    if (Tn_VerilogRange* r = effectiveRange()) return r->bounds(msb, lsb);
    return TypeDef ? TypeDef->bounds(msb, lsb) : (msb = lsb = 0, true);
}

// The port's own range, the redeclaration its type definition stands for,
// and the range the redeclaration overrides.
Tn_VerilogTypePtr Tn_VerilogIODeclaration::check(Tn_VerilogElabContext& ctx) {
    bool ok = checkAttributes(ctx);
    // A range shared with the type definition is checked with it.
    const bool ownRange = Range && (!TypeDef || TypeDef->range() != Range.get());
    if (ownRange && ctx.firstCheck(Range) && Range->check(ctx)->isError()) ok = false;
    if (!TypeDef) return ok ? Tn_VerilogType::createVoid() : Tn_VerilogType::createError();
    if (ctx.firstCheck(TypeDef) && TypeDef->check(ctx)->isError()) ok = false;

    const Tn_VerilogRegion* region = Tn_VerilogNode::cast<Tn_VerilogRegion>(Parent.get());
    Tn_VerilogVariable* redeclaration = region ? region->Variable.find(Name) : nullptr;
    const bool asArray = redeclaration && redeclaration->isA(Tn_Verilog::ArrayVar);
    bool allowed = true;
    if (isA(Tn_Verilog::Output)) allowed = TypeDef->checkOutputRedeclaration(*this, asArray);
    else if (isA(Tn_Verilog::Inout)) allowed = TypeDef->checkInoutRedeclaration(*this, asArray);
    else allowed = TypeDef->checkInputRedeclaration(*this, asArray);
    if (!allowed) return Tn_VerilogType::createError();

    // A range shared with the port (one declaration made both) overrides nothing.
    Tn_VerilogRange* redeclared = TypeDef->range();
    if (Range && redeclared && redeclared != Range.get()) {
        const Tn_VerilogNode* at = redeclaration ? static_cast<const Tn_VerilogNode*>(redeclaration) : redeclared;
        TN_MSG().issueWarning("%sRange on redeclaration of '%s' overrides range on %s declaration at %s\n",
                              at->locationText().c_str(), Name.c_str(), directionWord(), locationText().c_str());
    }
    return ok ? Tn_VerilogType::createVoid() : Tn_VerilogType::createError();
}
