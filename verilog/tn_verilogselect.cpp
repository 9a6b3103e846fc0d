// Bit-, part-, indexed part- and word-selects: their checks and, for the
// first three, constant evaluation by the declared bit numbering.
#include <algorithm>
#include <cstdint>

#include "util/tn_message.h"
#include "verilog/tn_verilogelabcontext.h"
#include "verilog/tn_verilognodes.h"

using namespace Tn_Verilog;

namespace {


// Declared bounds of a select's operand: its own, else those of its value.
struct Bounds {
    int32_t msb = 0, lsb = 0;
    bool known = false;

    Bounds() {}
    explicit Bounds(const Tn_VerilogOperand* operand) {
        if (operand) known = operand->bounds(msb, lsb);
    }
    Bounds(const Tn_VerilogOperand* operand, const Tn_VerilogValuePtr& v) : Bounds(operand) {
        if (!known) known = Tn_VerilogExpression::boundsOf(v, msb, lsb);
    }
    bool contains(int64_t index) const {
        return msb >= lsb ? index >= lsb && index <= msb : index >= msb && index <= lsb;
    }
    // The bit offset of an index (offset 0 is the least significant bit).
    int64_t offset(int64_t index) const { return msb >= lsb ? index - lsb : static_cast<int64_t>(lsb) - index; }
    bool descending() const { return msb >= lsb; }
};

// What a constant index operand holds.
struct IndexValue {
    enum State { Absent, NotConstant, Unknown, Defined } state = Absent;
    int64_t value = 0;
};

IndexValue indexValue(const Tn_VerilogExpression* e) {
    IndexValue r;
    if (!e) return r;
    Tn_VerilogValuePtr v = e->evaluate(Tn_VerilogEvalContext::quiet());
    if (v->isNull() || v->isReal()) {
        r.state = IndexValue::NotConstant;
    } else if (v->hasUnknown()) {
        r.state = IndexValue::Unknown;
    } else {
        r.state = IndexValue::Defined;
        const Tn_VerilogVector vec = v->toVector();
        r.value = vec.width() > 64 ? vec.slice(0, 64).toInt64() : vec.toInt64();
    }
    return r;
}

// width bits of v from offset low upward; bits outside v read as x.
Tn_VerilogValuePtr bitsAt(const Tn_VerilogVector& v, int64_t low, uint64_t width) {
    if (width == 0 || width > Tn_VerilogEvalContext::kMaxWidth) return Tn_VerilogValue::createNull();
    const uint32_t w = static_cast<uint32_t>(width);
    if (low >= 0 && static_cast<uint64_t>(low) + width <= v.width())
        return Tn_VerilogValue::createVector(v.slice(static_cast<uint32_t>(low), w));
    Tn_VerilogVector r(false, w);
    for (uint32_t i = 0; i < w; ++i) {
        const int64_t at = low + i;
        if (at >= 0 && at < static_cast<int64_t>(v.width())) r.setBit(i, v.bit(static_cast<uint32_t>(at)));
    }
    return Tn_VerilogValue::createVector(std::move(r));
}

Tn_VerilogValuePtr allX(uint64_t width) {
    if (width == 0 || width > Tn_VerilogEvalContext::kMaxWidth) return Tn_VerilogValue::createNull();
    return Tn_VerilogValue::createVector(Tn_VerilogVector(false, static_cast<uint32_t>(width)));
}

// The operand's self-determined value when it can be selected from.
Tn_VerilogValuePtr selectable(const Tn_VerilogExpression* operand, const Tn_VerilogEvalContext& ctx) {
    if (!operand) return Tn_VerilogValuePtr();
    Tn_VerilogValuePtr v = operand->evaluate(ctx.selfDetermined());
    return v->isNull() || v->isReal() ? Tn_VerilogValuePtr() : v;
}

// The bits between two indices (in either order) of a constant operand.
Tn_VerilogValuePtr selectRange(const Tn_VerilogOperand* operand, const Tn_VerilogValuePtr& v, int64_t i1, int64_t i2) {
    Bounds b(operand, v);
    const int64_t o1 = b.offset(i1), o2 = b.offset(i2);
    return bitsAt(v->toVector(), o1 < o2 ? o1 : o2, static_cast<uint64_t>(o1 < o2 ? o2 - o1 : o1 - o2) + 1);
}

// Checks the operand of a select for a use; it must be integral. False after
// a message (or when its own check failed).
bool checkSelected(Tn_VerilogElabContext& ctx, Tn_VerilogOperand* operand, ValueType use, const Tn_VerilogNode& select,
                   const char* illegal) {
    Tn_VerilogTypePtr t = Tn_VerilogExpression::typeOf(operand, ctx, use);
    if (t->isError()) return false;
    if (!t->isIntegral()) {
        TN_MSG().issueError(illegal, select.locationText().c_str(), operand->describe().c_str());
        return false;
    }
    return true;
}

// The checks of one index operand. Messages are made of the prefix (the
// operand's part in the select, "Index in bit-select of %s"), the selected
// operand's description and the problem; they are formatted only when
// issued. False after a message.
class IndexCheck {
public:
    IndexCheck(Tn_VerilogElabContext& ctx, const Tn_VerilogNode& select, const Tn_VerilogOperand& target)
        : ctx_(ctx), select_(select), target_(target) {}

    // An integral operand; constant when required. Sets index.
    bool check(Tn_VerilogExpression* e, const char* prefix, bool mustBeConstant, bool constantOnly, IndexValue& index) {
        Tn_VerilogTypePtr t = e ? e->typeAs(ctx_, Value) : Tn_VerilogType::createError();
        if (t->isError()) return false;
        if (!t->isIntegral() || (constantOnly && !e->isConstant())) return report(prefix, "is illegal");
        if (!e->isConstant()) {
            index.state = IndexValue::NotConstant;
            return mustBeConstant ? report(prefix, "must be constant") : true;
        }
        index = indexValue(e);
        if (index.state == IndexValue::Unknown) return report(prefix, "is undefined");
        return true;
    }
    bool report(const char* prefix, const char* problem) {
        TN_MSG().issueError("%s%s %s\n", select_.locationText().c_str(),
                            Port_String::doFormat(prefix, target_.describe().c_str()).c_str(), problem);
        return false;
    }

private:
    Tn_VerilogElabContext& ctx_;
    const Tn_VerilogNode& select_;
    const Tn_VerilogOperand& target_;
};

}  // namespace

// ------------------------------------------------------------------ bit-select

Tn_VerilogTypePtr Tn_VerilogBitSelect::typeAs(Tn_VerilogElabContext& ctx, ValueType use) {
    if (!checkAttributes(ctx)) return Tn_VerilogType::createError();
    if (!checkSelected(ctx, Operand, use, *this, "%sBit-select of %s is illegal\n")) return Tn_VerilogType::createError();
    IndexCheck c(ctx, *this, *Operand);
    IndexValue index;
    if (!c.check(Index, "Index in bit-select of %s", use == NetLValue, false, index)) return Tn_VerilogType::createError();
    Bounds b(Operand);
    if (index.state == IndexValue::Defined && b.known && !b.contains(index.value)) {
        c.report("Index in bit-select of %s", "is out of range");
        return Tn_VerilogType::createError();
    }
    return Tn_VerilogType::createScalar(false);
}

Tn_VerilogValuePtr Tn_VerilogBitSelect::evaluate(const Tn_VerilogEvalContext& ctx) const {
    Tn_VerilogValuePtr v = selectable(Operand, ctx);
    if (!v) return Tn_VerilogValue::createNull();
    const IndexValue index = indexValue(Index);
    if (index.state == IndexValue::NotConstant) return Tn_VerilogValue::createNull();
    if (index.state == IndexValue::Unknown) return Tn_VerilogValue::fit(allX(1), ctx);
    Bounds b(Operand, v);
    if (!b.contains(index.value)) return Tn_VerilogValue::fit(allX(1), ctx);
    return Tn_VerilogValue::fit(bitsAt(v->toVector(), b.offset(index.value), 1), ctx);
}

uint32_t Tn_VerilogBitSelect::contextWidth(uint32_t width) const { return std::max<uint32_t>(1, width); }

bool Tn_VerilogBitSelect::isConstant() const { return Operand && Index && Operand->isConstant() && Index->isConstant(); }
bool Tn_VerilogBitSelect::isNetLValue() const { return Operand && Operand->isNetLValue(); }
bool Tn_VerilogBitSelect::isVarLValue() const { return Operand && Operand->isVarLValue(); }
Port_String Tn_VerilogBitSelect::describe() const { return "bit-select of " + (Operand ? Operand->describe() : Port_String()); }

// ----------------------------------------------------------------- part-select

Tn_VerilogTypePtr Tn_VerilogPartSelect::typeAs(Tn_VerilogElabContext& ctx, ValueType use) {
    if (!checkAttributes(ctx)) return Tn_VerilogType::createError();
    if (!checkSelected(ctx, Operand, use, *this, "%sPart-select of %s is illegal\n")) return Tn_VerilogType::createError();
    IndexCheck c(ctx, *this, *Operand);
    const char* const msbPrefix = "Most significant bit operand in part-select of %s";
    const char* const lsbPrefix = "Least significant bit operand in part-select of %s";
    IndexValue m, l;
    bool ok = c.check(Msb, msbPrefix, true, true, m);
    if (!c.check(Lsb, lsbPrefix, true, true, l)) ok = false;
    if (!ok) return Tn_VerilogType::createError();
    Bounds b(Operand);
    if (b.known && m.state == IndexValue::Defined && !b.contains(m.value)) ok = c.report(msbPrefix, "is out of range");
    if (b.known && l.state == IndexValue::Defined && !b.contains(l.value)) ok = c.report(lsbPrefix, "is out of range");
    if (ok && b.known && m.state == IndexValue::Defined && l.state == IndexValue::Defined && m.value != l.value &&
        (m.value > l.value) != b.descending()) {
        TN_MSG().issueError("%sIndices in part-select of %s are reversed\n", locationText().c_str(),
                            Operand->describe().c_str());
        ok = false;
    }
    return ok ? Tn_VerilogType::createScalar(false) : Tn_VerilogType::createError();
}

Tn_VerilogValuePtr Tn_VerilogPartSelect::evaluate(const Tn_VerilogEvalContext& ctx) const {
    Tn_VerilogValuePtr v = selectable(Operand, ctx);
    if (!v) return Tn_VerilogValue::createNull();
    const IndexValue m = indexValue(Msb), l = indexValue(Lsb);
    if (m.state == IndexValue::NotConstant || l.state == IndexValue::NotConstant) return Tn_VerilogValue::createNull();
    if (m.state == IndexValue::Unknown || l.state == IndexValue::Unknown) return Tn_VerilogValue::fit(allX(contextWidth(0)), ctx);
    Bounds b(Operand, v);
    if (m.value != l.value && (m.value > l.value) != b.descending()) return Tn_VerilogValue::createNull();
    return Tn_VerilogValue::fit(selectRange(Operand, v, m.value, l.value), ctx);
}

uint32_t Tn_VerilogPartSelect::contextWidth(uint32_t width) const {
    const IndexValue m = indexValue(Msb), l = indexValue(Lsb);
    if (m.state != IndexValue::Defined || l.state != IndexValue::Defined) return std::max<uint32_t>(1, width);
    const uint64_t own = static_cast<uint64_t>(m.value > l.value ? m.value - l.value : l.value - m.value) + 1;
    return own > width ? static_cast<uint32_t>(own > UINT32_MAX ? UINT32_MAX : own) : width;
}

bool Tn_VerilogPartSelect::isConstant() const {
    return Operand && Msb && Lsb && Operand->isConstant() && Msb->isConstant() && Lsb->isConstant();
}
bool Tn_VerilogPartSelect::isNetLValue() const { return Operand && Operand->isNetLValue(); }
bool Tn_VerilogPartSelect::isVarLValue() const { return Operand && Operand->isVarLValue(); }
Port_String Tn_VerilogPartSelect::describe() const { return "part-select of " + (Operand ? Operand->describe() : Port_String()); }

// --------------------------------------------------------- indexed part-select

Tn_VerilogTypePtr Tn_VerilogIndexedPartSelect::typeAs(Tn_VerilogElabContext& ctx, ValueType use) {
    if (!checkAttributes(ctx)) return Tn_VerilogType::createError();
    if (!checkSelected(ctx, Operand, use, *this, "%sIndexed part-select of %s is illegal\n"))
        return Tn_VerilogType::createError();
    IndexCheck c(ctx, *this, *Operand);
    const char* const basePrefix = "Base operand in indexed part-select of %s";
    const char* const widthPrefix = "Width operand in indexed part-select of %s";
    IndexValue base, width;
    bool ok = c.check(Base, basePrefix, use == NetLValue, false, base);
    if (!c.check(Width, widthPrefix, true, true, width)) ok = false;
    if (!ok) return Tn_VerilogType::createError();
    Bounds b(Operand);
    const bool baseDefined = base.state == IndexValue::Defined;
    if (baseDefined && b.known && !b.contains(base.value)) {
        ok = c.report(basePrefix, "is out of range");
    } else if (width.state == IndexValue::Defined) {
        // The width runs out of range when the selection leaves the declared
        // bits: from a known base, or wider than the operand from any base.
        const int64_t span = static_cast<int64_t>(b.msb) - b.lsb;
        const int64_t end = NegativeFlag ? base.value - width.value + 1 : base.value + width.value - 1;
        if (width.value <= 0) ok = c.report(widthPrefix, "must be > 0");
        else if (b.known && (baseDefined ? !b.contains(end) : width.value > (span < 0 ? -span : span) + 1))
            ok = c.report(widthPrefix, "is out of range");
    }
    return ok ? Tn_VerilogType::createScalar(false) : Tn_VerilogType::createError();
}

Tn_VerilogValuePtr Tn_VerilogIndexedPartSelect::evaluate(const Tn_VerilogEvalContext& ctx) const {
    Tn_VerilogValuePtr v = selectable(Operand, ctx);
    if (!v) return Tn_VerilogValue::createNull();
    const IndexValue base = indexValue(Base), width = indexValue(Width);
    if (width.state != IndexValue::Defined || width.value <= 0 || base.state == IndexValue::NotConstant)
        return Tn_VerilogValue::createNull();
    if (base.state == IndexValue::Unknown) return Tn_VerilogValue::fit(allX(static_cast<uint64_t>(width.value)), ctx);
    // +: counts up from the base, -: down from it, in index values.
    const int64_t other = NegativeFlag ? base.value - width.value + 1 : base.value + width.value - 1;
    return Tn_VerilogValue::fit(selectRange(Operand, v, base.value, other), ctx);
}

uint32_t Tn_VerilogIndexedPartSelect::contextWidth(uint32_t width) const {
    const IndexValue w = indexValue(Width);
    if (w.state != IndexValue::Defined || w.value <= 0) return std::max<uint32_t>(1, width);
    return std::max<uint32_t>(w.value > UINT32_MAX ? UINT32_MAX : static_cast<uint32_t>(w.value), width);
}

bool Tn_VerilogIndexedPartSelect::isConstant() const {
    return Operand && Base && Width && Operand->isConstant() && Base->isConstant() && Width->isConstant();
}
bool Tn_VerilogIndexedPartSelect::isNetLValue() const { return Operand && Operand->isNetLValue(); }
bool Tn_VerilogIndexedPartSelect::isVarLValue() const { return Operand && Operand->isVarLValue(); }
Port_String Tn_VerilogIndexedPartSelect::describe() const {
    return "indexed part-select of " + (Operand ? Operand->describe() : Port_String());
}

// ----------------------------------------------------------------- word-select

Tn_VerilogTypePtr Tn_VerilogWordSelect::typeAs(Tn_VerilogElabContext& ctx, ValueType use) {
    if (!checkAttributes(ctx)) return Tn_VerilogType::createError();
    Tn_VerilogTypePtr t = typeOf(Operand, ctx);
    if (t->isError()) return t;
    if (Operand->declarationAs<Tn_VerilogParameter>()) {
        TN_MSG().issueError("%sParameters cannot be indexed as an array\n", locationText().c_str());
        return Tn_VerilogType::createError();
    }
    // One index per dimension.
    std::vector<Tn_VerilogTypePtr> dimensions;
    for (Tn_VerilogTypePtr a = t; a && a->isArray(); a = a->elementType()) dimensions.push_back(a);
    if (dimensions.empty() || dimensions.size() != Index.size()) {
        TN_MSG().issueError("%sWord-select of %s is illegal\n", locationText().c_str(), Operand->describe().c_str());
        return Tn_VerilogType::createError();
    }
    bool ok = true;
    for (size_t i = 0; i < Index.size(); ++i) {
        const Port_String prefix = Port_String::doFormat("Index %d in word-select of %%s", static_cast<int>(i + 1));
        IndexCheck c(ctx, *this, *Operand);
        IndexValue index;
        if (!c.check(Index[i], prefix.c_str(), use == NetLValue, false, index)) {
            ok = false;
            continue;
        }
        Bounds b;
        b.msb = dimensions[i]->msb();
        b.lsb = dimensions[i]->lsb();
        if (index.state == IndexValue::Defined && !b.contains(index.value)) ok = c.report(prefix.c_str(), "is out of range");
    }
    if (!ok) return Tn_VerilogType::createError();
    const char* problem = nullptr;
    if ((use == LValue || use == PortLValue) && !isLValue()) problem = "%sReference to %s is not a legal lvalue\n";
    else if (use == NetLValue && !isNetLValue()) problem = "%sReference to %s is not a legal net lvalue\n";
    else if (use == VarLValue && !isVarLValue()) problem = "%sReference to %s is not a legal reg or variable lvalue\n";
    if (problem) {
        TN_MSG().issueError(problem, locationText().c_str(), describe().c_str());
        return Tn_VerilogType::createError();
    }
    return dimensions.back()->elementType();
}

// Arrays hold no constants; asking anyway is reported.
Tn_VerilogValuePtr Tn_VerilogWordSelect::evaluate(const Tn_VerilogEvalContext& ctx) const {
    if (ctx.report)
        TN_MSG().issueError("%sEvaluation of word-select operation not implemented\n", locationText().c_str());
    return Tn_VerilogValue::createNull();
}

uint32_t Tn_VerilogWordSelect::contextWidth(uint32_t width) const {
    Tn_VerilogDeclaration* d = Operand ? Operand->declaration() : nullptr;
    return d ? std::max<uint32_t>(d->width(), width) : width;
}

bool Tn_VerilogWordSelect::isSigned(bool contextSigned) const {
    Tn_VerilogDeclaration* d = Operand ? Operand->declaration() : nullptr;
    return contextSigned && d && d->isSigned();
}

bool Tn_VerilogWordSelect::isReal() const {
    Tn_VerilogDeclaration* d = Operand ? Operand->declaration() : nullptr;
    return d && d->isReal();
}

bool Tn_VerilogWordSelect::bounds(int32_t& msb, int32_t& lsb) const {
    Tn_VerilogDeclaration* d = Operand ? Operand->declaration() : nullptr;
    return d && d->bounds(msb, lsb);
}

bool Tn_VerilogWordSelect::isConstant() const { return false; }

bool Tn_VerilogWordSelect::isNetLValue() const {
    Tn_VerilogArrayVar* a = Operand ? Operand->declarationAs<Tn_VerilogArrayVar>() : nullptr;
    return a && a->isNet();
}

bool Tn_VerilogWordSelect::isVarLValue() const {
    Tn_VerilogArrayVar* a = Operand ? Operand->declarationAs<Tn_VerilogArrayVar>() : nullptr;
    return a && a->isVariable();
}

Port_String Tn_VerilogWordSelect::describe() const { return "word-select of " + (Operand ? Operand->describe() : Port_String()); }
