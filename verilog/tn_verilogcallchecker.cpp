#include "verilog/tn_verilogcallchecker.h"

#include "util/tn_message.h"
#include "verilog/tn_verilognodes.h"

const Tn_VerilogCallChecker::Messages Tn_VerilogCallChecker::kSystemFunction = {
    "%sToo many parameters passed to system function '%s'\n",
    "%sToo few parameters passed to system function '%s'\n",
    "%sArgument %d (%s) passed to system function '%s' is illegal\n",
    "%sArgument %d passed to system function '%s' is illegal\n",
    "%sArgument %d of system function '%s' has no direction\n",
};

const Tn_VerilogCallChecker::Messages Tn_VerilogCallChecker::kUserFunction = {
    "%sToo many parameters passed to function '%s'\n",
    "%sToo few parameters passed to function '%s'\n",
    "%sIllegal argument passed to port %d (%s) of function '%s'\n",
    "%sIllegal argument passed to port %d of function '%s'\n",
    "%sPort %d of function '%s' has no direction\n",
};

const Tn_VerilogCallChecker::Messages Tn_VerilogCallChecker::kSystemTask = {
    "%sToo many parameters passed to system task '%s'\n",
    "%sToo few parameters passed to system task '%s'\n",
    "%sArgument %d (%s) passed to system task '%s' is illegal\n",
    "%sArgument %d passed to system task '%s' is illegal\n",
    "%sArgument %d of system task '%s' has no direction\n",
};

const Tn_VerilogCallChecker::Messages Tn_VerilogCallChecker::kUserTask = {
    "%sToo many parameters passed to task '%s'\n",
    "%sToo few parameters passed to task '%s'\n",
    "%sIllegal argument passed to port %d (%s) of task '%s'\n",
    "%sIllegal argument passed to port %d of task '%s'\n",
    "%sPort %d of task '%s' has no direction\n",
};

bool Tn_VerilogCallChecker::check(const Tn_VerilogNode& call, const Port_String& name,
                                  const std::vector<Tn_VerilogExpression*>& arguments, const Tn_VerilogType& callee) {
    const Tn_VerilogTypeList& params = callee.parameterTypes();
    const Tn_VerilogType* tail = !params.empty() && params.back()->isEllipses() ? params.back().get() : nullptr;
    const size_t fixed = tail ? params.size() - 1 : params.size();
    // Arguments may stop after the last parameter that must be given.
    size_t required = 0;
    for (size_t i = 0; i < fixed; ++i)
        if (!params[i]->isOptional()) required = i + 1;

    bool ok = true;
    for (size_t i = 0; i < arguments.size(); ++i) {
        const Tn_VerilogType* param = i < fixed ? params[i].get() : tail;
        if (!param) {
            TN_MSG().issueError(messages_.tooMany, call.locationText().c_str(), name.c_str());
            return false;
        }
        if (!checkArgument(call, name, arguments[i], *param, static_cast<int>(i + 1))) ok = false;
    }
    if (arguments.size() < required) {
        TN_MSG().issueError(messages_.tooFew, call.locationText().c_str(), name.c_str());
        return false;
    }
    return ok;
}

bool Tn_VerilogCallChecker::checkArgument(const Tn_VerilogNode& call, const Port_String& name,
                                          Tn_VerilogExpression* argument, const Tn_VerilogType& param, int number) {
    const bool empty = !argument || argument->isA(Tn_Verilog::NullOp);
    if (param.direction() == Tn_VerilogType::NoDirection) {
        // An ellipses without a direction takes any value or declared object.
        if (!param.isEllipses()) {
            TN_MSG().issueError(messages_.noDirection, call.locationText().c_str(), number, name.c_str());
            return false;
        }
        if (empty) return true;
        Tn_VerilogTypePtr t = argument->typeAs(ctx_, Tn_Verilog::Value);
        if (t->isError()) return false;
        if (!t->isValueType() && !argument->object()) {
            TN_MSG().issueError(messages_.illegal, call.locationText().c_str(), number, name.c_str());
            return false;
        }
        return true;
    }
    const char* direction = param.directionText();
    if (empty) {
        if (param.isOptional() || param.acceptsAny()) return true;
        TN_MSG().issueError(messages_.illegalDirected, call.locationText().c_str(), number, direction, name.c_str());
        return false;
    }
    if (param.isInput()) {
        Tn_VerilogTypePtr t = argument->typeAs(ctx_, Tn_Verilog::Value);
        if (t->isError()) return false;
        if (param.acceptsAny() || param.matches(*t)) return true;
        TN_MSG().issueError(messages_.illegalDirected, call.locationText().c_str(), number, direction, name.c_str());
        return false;
    }
    // Outputs and inouts receive a value: a variable, or for a parameter that
    // takes any expression, any declared object (a whole memory).
    if (param.acceptsAny()) {
        Tn_VerilogTypePtr t = argument->typeAs(ctx_, Tn_Verilog::Value);
        if (t->isError()) return false;
        if (argument->isVarLValue() || argument->object()) return true;
    } else {
        Tn_VerilogTypePtr t = argument->typeAs(ctx_, Tn_Verilog::VarLValue);
        if (t->isError()) return false;
        if (argument->isVarLValue() && param.matches(*t)) return true;
    }
    TN_MSG().issueError(messages_.illegalDirected, call.locationText().c_str(), number, direction, name.c_str());
    return false;
}
