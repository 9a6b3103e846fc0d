// Type definitions: the kind, width and sign of the objects that share them,
// and which port redeclarations each kind allows.
#include "util/tn_message.h"
#include "verilog/tn_verilogelabcontext.h"
#include "verilog/tn_verilognodes.h"

Tn_VerilogTypePtr Tn_VerilogTypeDef::check(Tn_VerilogElabContext&) { return Tn_VerilogType::createVoid(); }

bool Tn_VerilogTypeDef::bounds(int32_t&, int32_t&) const { return false; }

// ------------------------------------------------------------ nets and regs

Tn_VerilogTypePtr Tn_VerilogSignal::check(Tn_VerilogElabContext& ctx) {
    return Range ? Range->check(ctx) : Tn_VerilogType::createVoid();
}

uint32_t Tn_VerilogSignal::width() const { return Range ? Range->width() : 1; }

bool Tn_VerilogSignal::hasFixedSize() const { return !Range || Range->isLiteral(); }

Tn_VerilogTypePtr Tn_VerilogSignal::type() const {
    int32_t msb, lsb;
    if (Range && Range->bounds(msb, lsb)) return Tn_VerilogType::createVector(SignedFlag, msb, lsb);
    return Tn_VerilogType::createScalar(SignedFlag);
}

Tn_VerilogTypePtr Tn_VerilogNet::check(Tn_VerilogElabContext& ctx) {
    bool ok = !Tn_VerilogSignal::check(ctx)->isError();
    if (Delay && Delay->check(ctx)->isError()) ok = false;
    return ok ? Tn_VerilogType::createVoid() : Tn_VerilogType::createError();
}

Port_String Tn_VerilogNet::describe() const {
    const char* word = Tn_Verilog::NetTypeInfo.text(NetType);
    return Range ? Port_String::doFormat("vector %s", word) : Port_String(word);
}

Port_String Tn_VerilogReg::describe() const { return Range ? "vector reg" : "scalar reg"; }

// A scalar signal has the one bit 0.
bool Tn_VerilogSignal::bounds(int32_t& msb, int32_t& lsb) const {
    if (!Range) {
        msb = lsb = 0;
        return true;
    }
    return Range->bounds(msb, lsb);
}

// ------------------------------------------------ integer, time and real

Tn_VerilogTypePtr Tn_VerilogVarType::type() const {
    if (isReal()) return Tn_VerilogType::createReal();
    return Tn_VerilogType::createVector(isSigned(), static_cast<int32_t>(width()) - 1, 0);
}

bool Tn_VerilogVarType::bounds(int32_t& msb, int32_t& lsb) const {
    if (isReal()) return false;
    msb = static_cast<int32_t>(width()) - 1;
    lsb = 0;
    return true;
}

// -------------------------------------------------------- port redeclaration

namespace {

enum Direction { Output, Inout, Input };

// The message for a port of direction d redeclared as kind, or null when
// IEEE 1364 allows it. Module ports are nets, and outputs may also be reg,
// integer or time variables; task and function arguments are variables of
// any kind. A vector (or signed) port cannot become an integer, time or real
// variable whose shape differs from it.
const char* redeclarationProblem(Direction d, Tn_VerilogTypeDef::RedeclarationKind kind, bool tf, bool vector,
                                 bool isSigned, const char** qualifier) {
    typedef Tn_VerilogTypeDef K;
    *qualifier = "";
    switch (kind) {
    case K::AsEvent: return "an event";
    case K::AsNet: return tf ? "a net" : nullptr;
    case K::AsReg: return tf || d == Output ? nullptr : "a reg";
    case K::AsInteger:
        if (!tf) return d == Output ? nullptr : "an integer variable";
        if (vector && d != Output) {
            *qualifier = "vector ";
            return "an integer variable";
        }
        return nullptr;
    case K::AsTime:
        if (!tf && d != Output) return "a time variable";
        if (isSigned || (vector && d != Output)) {
            *qualifier = isSigned ? "signed " : "vector ";
            return "a time variable";
        }
        return nullptr;
    case K::AsReal:
        if (vector) {
            *qualifier = "vector ";
            return "a real variable";
        }
        return tf ? nullptr : "a real variable";
    }
    return nullptr;
}

bool checkRedeclaration(const Tn_VerilogTypeDef& def, Tn_VerilogIODeclaration& port, bool asArray, Direction d) {
    const char* qualifier = "";
    const char* kind = asArray ? "an array"
                               : redeclarationProblem(d, def.redeclarationKind(), port.TfFlag, port.Range.get() != nullptr,
                                                      port.SignedFlag, &qualifier);
    if (!kind) return true;
    // Reported where the offending declaration is, when there is one.
    const Tn_VerilogRegion* region = Tn_VerilogNode::cast<Tn_VerilogRegion>(port.Parent.get());
    const Tn_VerilogNode* redeclaration = region ? region->Variable.find(port.Name) : nullptr;
    const Tn_VerilogNode* at = redeclaration ? redeclaration : &port;
    TN_MSG().issueError("%sIllegal redeclaration of %s%s '%s' as %s\n", at->locationText().c_str(), qualifier,
                        port.directionWord(), port.Name.c_str(), kind);
    return false;
}

}  // namespace

bool Tn_VerilogTypeDef::checkOutputRedeclaration(Tn_VerilogIODeclaration& port, bool asArray) {
    return checkRedeclaration(*this, port, asArray, Output);
}

bool Tn_VerilogTypeDef::checkInoutRedeclaration(Tn_VerilogIODeclaration& port, bool asArray) {
    return checkRedeclaration(*this, port, asArray, Inout);
}

bool Tn_VerilogTypeDef::checkInputRedeclaration(Tn_VerilogIODeclaration& port, bool asArray) {
    return checkRedeclaration(*this, port, asArray, Input);
}
