// Ranges and delays: the small nodes declarations and items share.
#include <cstdint>
#include <initializer_list>

#include "util/tn_message.h"
#include "util/tn_messagecheckpoint.h"
#include "verilog/tn_verilogelabcontext.h"
#include "verilog/tn_verilognodes.h"

namespace {

// A defined integral value of a bound, or null.
Tn_VerilogValuePtr boundValue(const Tn_VerilogExpression* e) {
    if (!e) return Tn_VerilogValuePtr();
    Tn_VerilogValuePtr v = e->evaluate(Tn_VerilogEvalContext::quiet());
    if (v->isNull() || v->isReal() || v->hasUnknown()) return Tn_VerilogValuePtr();
    return v;
}

// Checks one bound; false after a message (or when the bound's own check failed).
bool checkBound(Tn_VerilogElabContext& ctx, Tn_VerilogExpression* e, const char* which, const Tn_VerilogNode& range) {
    if (!e) return true;
    Tn_VerilogTypePtr t = e->typeAs(ctx, Tn_Verilog::Value);
    if (t->isError()) return false;
    const char* problem = nullptr;
    Tn_VerilogValuePtr v;
    if (t->isRealType()) {
        problem = "must be an integer";
    } else if (!e->isConstant()) {
        problem = "must be constant";
    } else if ((v = e->evaluate(Tn_VerilogEvalContext::quiet()))->isNull()) {
        // A constant that cannot be computed: evaluating again says why (a
        // constant function that fails, say), or else it is not constant.
        Tn_MessageCheckpoint checkpoint;
        e->value();
        if (checkpoint.errorsIssued()) return false;
        problem = "must be constant";
    } else if (v->isReal()) {
        problem = "must be an integer";
    } else if (v->hasUnknown()) {
        problem = "is undefined";
    }
    if (!problem) return true;
    TN_MSG().issueError("%s%s of range specification %s\n", range.locationText().c_str(), which, problem);
    return false;
}

}  // namespace

Tn_VerilogTypePtr Tn_VerilogRange::check(Tn_VerilogElabContext& ctx) {
    bool ok = checkBound(ctx, Msb, "Most significant bit", *this);
    if (!checkBound(ctx, Lsb, "Least significant bit", *this)) ok = false;
    return ok ? Tn_VerilogType::createVoid() : Tn_VerilogType::createError();
}

bool Tn_VerilogRange::bounds(int32_t& msb, int32_t& lsb) const {
    Tn_VerilogValuePtr m = boundValue(Msb), l = boundValue(Lsb);
    if (!m || !l) return false;
    msb = m->toInt();
    lsb = l->toInt();
    return true;
}

uint32_t Tn_VerilogRange::width() const {
    int32_t msb, lsb;
    if (!bounds(msb, lsb)) return 1;
    int64_t d = static_cast<int64_t>(msb) - lsb;
    uint64_t w = static_cast<uint64_t>(d < 0 ? -d : d) + 1;
    return w > UINT32_MAX ? UINT32_MAX : static_cast<uint32_t>(w);
}

void Tn_VerilogRange::resolveNames(const Tn_VerilogScope* scope) {
    if (Msb) Msb->resolveNames(scope);
    if (Lsb) Lsb->resolveNames(scope);
}

bool Tn_VerilogRange::isLiteral() const { return Msb && Lsb && Msb->isLiteral() && Lsb->isLiteral(); }

Tn_VerilogTypePtr Tn_VerilogDelay::check(Tn_VerilogElabContext& ctx) {
    bool ok = true;
    for (Tn_VerilogExpression* e : {Delay1.get(), Delay2.get(), Delay3.get()}) {
        if (!e) continue;
        Tn_VerilogTypePtr t = e->typeAs(ctx, Tn_Verilog::Value);
        if (t->isError()) {
            ok = false;
        } else if (!t->isValueType()) {
            TN_MSG().issueError("%sIllegal delay value\n", e->locationText().c_str());
            ok = false;
        }
    }
    return ok ? Tn_VerilogType::createVoid() : Tn_VerilogType::createError();
}
