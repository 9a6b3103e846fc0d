// tarn eval: constant expressions as Tarn evaluates them, one line each.
#include <cstdio>
#include <cstring>

#include "src/tn_verilogoptions.h"
#include "util/tn_message.h"
#include "tools/tarn_commands.h"
#include "verilog/tn_verilogdesignunit.h"
#include "verilog/tn_verilogdirectivestate.h"
#include "verilog/tn_verilogelabcontext.h"
#include "verilog/tn_verilognodes.h"
#include "verilog/tn_verilogparser.h"

namespace {

const char kUsage[] = "Usage: tarn eval [-95|-2001] [+define+<name>[=<value>]...] EXPR...\n";

bool isOption(const Port_String& a) {
    return a == "-95" || a == "-2001" || std::strncmp(a.c_str(), "+define+", 8) == 0;
}

}  // namespace

int tarnEval(const TarnArgs& args) {
    Tn_StringList options{args.empty() ? Port_String("tarn") : args[0]};
    std::vector<Port_String> texts;
    for (size_t i = 1; i < args.size(); ++i) (isOption(args[i]) ? options.push_back(args[i]) : texts.push_back(args[i]));
    if (texts.empty()) {
        std::fputs(kUsage, stderr);
        return 2;
    }
    Tn_VerilogOptions o;
    if (o.parse(options)) return 1;
    Tn_VerilogDirectiveState directives;
    directives.reset(o.macroDefinitions());
    // An empty scope: names resolve to nothing there, so only literals and
    // system calls can appear.
    Tn_VerilogDesignUnit unit(o.workLibrary(), "eval", o);
    Tn_VerilogRoot* root = unit.factory().createRoot();
    unit.setRoot(root);
    Tn_VerilogElabContext ctx(true, &o, nullptr, &unit);
    ctx.pushScope(root, root);
    for (const Port_String& text : texts) {
        Tn_VerilogExpression* e = nullptr;
        try {
            e = Tn_VerilogParser::parseExpression(text, unit.factory(), o, &directives);
        } catch (const Tn_VerilogExpressionSyntaxError& x) {
            TN_MSG().issueError("Syntax error in expression '%s': %s\n", text.c_str(), x.message().c_str());
        }
        const bool ok = e && !e->typeAs(ctx, Tn_Verilog::Value)->isError();
        std::printf("%s\n", Tn_VerilogValue::evalText(ok ? e->value() : Tn_VerilogValuePtr()).c_str());
    }
    return 0;
}
