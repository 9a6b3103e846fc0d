// Calls of system and user functions: the call checks, sizes and signs from
// the callee's result, and the copies that parameter values may not hold.
#include <algorithm>
#include <cctype>

#include "util/tn_message.h"
#include "verilog/tn_verilogcallchecker.h"
#include "verilog/tn_verilogelabcontext.h"
#include "verilog/tn_verilognodes.h"
#include "verilog/tn_verilogsystf.h"

using namespace Tn_Verilog;

namespace {


std::vector<Tn_VerilogExpression*> argumentsOf(const Tn_NodeList<Tn_VerilogExpression>& params) {
    std::vector<Tn_VerilogExpression*> list;
    for (Tn_VerilogExpression* e : params) list.push_back(e);
    return list;
}

// A fresh value type like t (the tables' types are shared).
Tn_VerilogTypePtr resultLike(const Tn_VerilogTypePtr& t) {
    if (!t) return Tn_VerilogType::createVoid();
    if (t->isRealType()) return Tn_VerilogType::createReal();
    if (t->isVector()) return Tn_VerilogType::createVector(t->isSignedType(), t->msb(), t->lsb());
    if (t->isIntegral()) return Tn_VerilogType::createScalar(t->isSignedType());
    return t;
}

}  // namespace

// A call with constant arguments (of a constant function) is constant.
bool Tn_VerilogFunctionCall::isConstant() const {
    for (Tn_VerilogExpression* e : Param)
        if (!e || !e->isConstant()) return false;
    return true;
}

Port_String Tn_VerilogFunctionCall::describe() const { return "call to '" + calleeName() + "'"; }

// ------------------------------------------------------------ system functions

int32_t Tn_VerilogSystemFunctionCall::resultKind() const {
    Port_String n;
    for (const char* p = Name.c_str(); *p; ++p)
        if (p != Name.c_str() || *p != '$') n += static_cast<char>(std::tolower(static_cast<unsigned char>(*p)));
    if (n == "time" || n == "realtobits") return 2;
    if (n == "realtime" || n == "bitstoreal" || n == "itor") return 1;
    return 0;
}

Tn_VerilogTypePtr Tn_VerilogSystemFunctionCall::typeAs(Tn_VerilogElabContext& ctx, ValueType) {
    if (!checkAttributes(ctx)) return Tn_VerilogType::createError();
    const Tn_VerilogType* entry = Tn_VerilogSysTf::function(Name, ctx.verilog2001());
    if (!entry) {
        if (Tn_VerilogSysTf::task(Name, ctx.verilog2001()))
            TN_MSG().issueError("%sCall to system function '%s' is unsupported\n", locationText().c_str(), Name.c_str());
        else
            TN_MSG().issueError("%sIllegal call to unknown system function '%s'\n", locationText().c_str(), Name.c_str());
        return Tn_VerilogType::createError();
    }
    Tn_VerilogCallChecker checker(ctx, Tn_VerilogCallChecker::kSystemFunction);
    if (!checker.check(*this, Name, argumentsOf(Param), *entry)) return Tn_VerilogType::createError();
    return resultLike(entry->returnType());
}

Tn_VerilogExpression* Tn_VerilogSystemFunctionCall::copyAs(Tn_VerilogElabContext& ctx, Tn_VerilogCopyMode mode) {
    if (mode == TN_COPY_PLAIN) return copyWithOperands(ctx, mode);
    TN_MSG().issueError(mode == TN_COPY_PARAMETER ? "%sIllegal system function call to %s in parameter expression\n"
                                                  : "%sIllegal system function call to %s in specparam expression\n",
                        locationText().c_str(), Name.c_str());
    return nullptr;
}

uint32_t Tn_VerilogSystemFunctionCall::contextWidth(uint32_t width) const {
    if ((Name == "$signed" || Name == "$unsigned") && Param.size() == 1 && Param[0])
        return std::max<uint32_t>(Param[0]->contextWidth(0), width);
    return std::max<uint32_t>(resultKind() == 0 ? 32 : 64, width);
}

bool Tn_VerilogSystemFunctionCall::isSigned(bool contextSigned) const {
    if (Name == "$signed") return contextSigned;
    const Tn_VerilogType* entry = Tn_VerilogSysTf::function(Name, true);
    return contextSigned && entry && entry->returnType()->isSignedType();
}

// -------------------------------------------------------------- user functions

Tn_VerilogFunction* Tn_VerilogUserFunctionCall::function() const {
    return Name ? Name->declarationAs<Tn_VerilogFunction>() : nullptr;
}

Port_String Tn_VerilogUserFunctionCall::calleeName() const { return Name ? Name->nameText() : Port_String(); }

Tn_VerilogCopyMode Tn_VerilogUserFunctionCall::operandCopyMode(const Tn_VerilogNode* child, Tn_VerilogCopyMode mode) const {
    // The function's name is not a value reference.
    return child == Name.get() ? TN_COPY_PLAIN : mode;
}

Tn_VerilogTypePtr Tn_VerilogUserFunctionCall::typeAs(Tn_VerilogElabContext& ctx, ValueType) {
    if (!checkAttributes(ctx)) return Tn_VerilogType::createError();
    if (Name) Name->resolve(ctx.scope());
    Tn_VerilogFunction* f = function();
    if (!f) {
        TN_MSG().issueError("%sIllegal function call to '%s'\n", locationText().c_str(), calleeName().c_str());
        return Tn_VerilogType::createError();
    }
    Tn_VerilogTypePtr type = f->type();
    Tn_VerilogCallChecker checker(ctx, Tn_VerilogCallChecker::kUserFunction);
    if (!checker.check(*this, calleeName(), argumentsOf(Param), *type)) return Tn_VerilogType::createError();
    return resultLike(type->returnType());
}

Tn_VerilogValuePtr Tn_VerilogUserFunctionCall::evaluate(const Tn_VerilogEvalContext& ctx) const {
    Tn_VerilogFunction* f = function();
    if (!f) return Tn_VerilogValue::createNull();
    // Only functions the front end marked for constant use, and whose checks
    // as constant functions passed, may run here.
    if (!f->ConstantFlag) {
        if (ctx.report)
            TN_MSG().issueError("%sFunction '%s' is not a valid constant function.\n", locationText().c_str(),
                                calleeName().c_str());
        return Tn_VerilogValue::createNull();
    }
    std::vector<Tn_VerilogValuePtr> arguments;
    for (Tn_VerilogExpression* e : Param) {
        Tn_VerilogValuePtr v = e ? e->evaluate(ctx.selfDetermined())
                                 : Tn_VerilogValue::createNull();
        if (v->isNull()) return v;
        arguments.push_back(v);
    }
    Tn_VerilogValuePtr result = f->evaluateConstantCall(arguments, ctx);
    if (result->isNull()) {
        if (ctx.report)
            TN_MSG().issueError("%s Unable to evaluate constant function '%s'\n", locationText().c_str(),
                                calleeName().c_str());
        return result;
    }
    return Tn_VerilogValue::fit(result, ctx);
}

uint32_t Tn_VerilogUserFunctionCall::contextWidth(uint32_t width) const {
    Tn_VerilogFunction* f = function();
    return f ? std::max<uint32_t>(f->width(), width) : width;
}

bool Tn_VerilogUserFunctionCall::isReal() const {
    Tn_VerilogFunction* f = function();
    return f && f->isReal();
}

bool Tn_VerilogUserFunctionCall::isSigned(bool contextSigned) const {
    Tn_VerilogFunction* f = function();
    return contextSigned && f && f->resultType()->isSignedType();
}
