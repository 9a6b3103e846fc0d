// Macros: plain and parameterised definitions, argument collection and
// substitution, redefinition, command-line macros, undefined and runaway
// macros, and the positions of what follows a reference.
#include <gtest/gtest.h>

#include <chrono>

#include "tests/support/scan.h"
#include "verilog/tn_verilogdirectivestate.h"
#include "verilog/tn_verilogtokentypes.h"

namespace {

typedef std::vector<std::string> Strings;

class Macros : public ScanTest {};

TEST_F(Macros, PlainMacrosExpandAndRescan) {
    EXPECT_EQ(scanText("`define W 8\nreg [`W-1:0] r;"), "reg [ 8 - 1 : 0 ] r ;");
    // A line comment in the body ends with the body.
    EXPECT_EQ(scanText("`define W 8 // the width\nreg [`W-1:0] r;"), "reg [ 8 - 1 : 0 ] r ;");
    // Parentheses after a plain macro belong to the text after it.
    EXPECT_EQ(scanText("`define W 8\n`W(3)"), "8 ( 3 )");
    EXPECT_EQ(scanText("`define F() z\n`F()"), "z ( )");
    // Bodies are rescanned, so references inside them expand when used.
    EXPECT_EQ(scanText("`define A `B + 1\n`define B 2\n`A"), "2 + 1");
    EXPECT_EQ(scanText("`define E\n[`E]"), "[ ]");
    EXPECT_TRUE(sink.warnings().empty());
}

TEST_F(Macros, ParameterisedMacrosSubstituteTheirActuals) {
    const std::string max = "`define MAX(a, b) ((a) > (b) ? (a) : (b))\n";
    EXPECT_EQ(scanText(max + "`MAX(x, f(y,z))"), "( ( x ) > ( f ( y , z ) ) ? ( x ) : ( f ( y , z ) ) )");
    // Commas inside strings, brackets and braces do not split actuals.
    EXPECT_EQ(scanText("`define F(a, b) a + b\n`F(\"x,y\", {c, d[1,2]})"), "x,y + { c , d [ 1 , 2 ] }");
    // A formal inside a string of the body stays as written; a longer word is no formal.
    EXPECT_EQ(scanText("`define S(a) $display(\"a=%d\", a, ab, a_1)\n`S(v)"),
              "$display ( a=%d , v , ab , a_1 )");
    // Actuals may be macro references themselves.
    EXPECT_EQ(scanText("`define W 4\n`define SQ(x) x*x\n`SQ(`W)"), "4 * 4");
}

TEST_F(Macros, WrongArgumentCountsAreScannerErrors) {
    const std::string max = "`define MAX(a, b) ((a) > (b) ? (a) : (b))\n";
    for (const char* use : {"`MAX(x)", "`MAX()", "`MAX( )", "`MAX", "`MAX(x, y, z)"}) {
        ScanResult r = scanFailing(max + use);
        EXPECT_EQ(r.error, "Invalid number of arguments passed to macro reference MAX") << use;
        EXPECT_EQ(r.errorLine, 2) << use;
    }
}

TEST_F(Macros, MultiLineArgumentsKeepTheLinesThatFollow) {
    ScanResult r = scanSource(dir, "`define F(a, b) a b\n`F(x,\n  y)\nz\n");
    ASSERT_FALSE(r.failed) << r.error;
    ASSERT_EQ(r.text(), "x y z");
    EXPECT_EQ(r.tokens[0].line, 2);
    EXPECT_EQ(r.tokens[2].line, 4);
    EXPECT_EQ(r.tokens[2].column, 2);
}

TEST_F(Macros, ContinuationLinesJoinTheBody) {
    ScanResult r = scanSource(dir, "`define M a \\\n b \\\r\n c\nafter `M\nlast\n");
    ASSERT_FALSE(r.failed) << r.error;
    EXPECT_EQ(r.text(), "after a b c last");
    EXPECT_EQ(r.tokens[0].line, 4);
    EXPECT_EQ(r.tokens[0].column, 6);
    EXPECT_EQ(r.tokens[1].line, 4);  // expansion tokens carry the reference's line
    EXPECT_EQ(r.tokens[4].line, 5);
    EXPECT_EQ(r.tokens[4].column, 5);
}

TEST_F(Macros, RedefinitionWarnsOnlyWhenTheDefinitionChanges) {
    scanText(
        "`define W 8\n`define W 8  \n`define W 16\n"
        "`define F(a) a\n`define F(b) b\n`define F(a) a+1\n"
        "`define G 1\n`define G(x) x\n"
        "`define H(x) x\n`define H\n");
    EXPECT_EQ(sink.warnings(), (Strings{loc(3) + "Macro 'W' redefined\n", loc(6) + "Macro 'F' redefined\n",
                                        loc(8) + "Macro 'G' redefined\n"}));
}

TEST_F(Macros, CommandLineMacrosWin) {
    EXPECT_EQ(scanText("`define W 8\n`W\n`undef W\n`W", {"+define+W=16"}), "16 16");
    EXPECT_EQ(sink.warnings(),
              (Strings{loc(1) +
                           "Attempt to redefine macro 'W' ignored because the initial command line definition takes "
                           "precedence.\n",
                       loc(3) +
                           "Attempt to undefine macro 'W' ignored because the initial command line definition takes "
                           "precedence.\n"}));
    // NAME alone is defined empty; the value is everything after the first '='.
    EXPECT_EQ(scanText("`ifdef B b `endif [`B] `E", {"+define+A=1+B", "+define+E=x==y"}), "b [ ] x == y");
}

TEST_F(Macros, DirectiveNamesCannotBeMacros) {
    EXPECT_EQ(scanFailing("`define ifdef 1\n").error, "Cannot redefine `ifdef directive with `define");
    EXPECT_EQ(scanFailing("\n`define elsif 1\n").error, "Cannot redefine `elsif directive with `define");
    EXPECT_EQ(scanText("`define elsif 1\n`elsif", {"-95"}), "1");
    EXPECT_EQ(sink.warnings(), (Strings{loc(1) + "`elsif is a compiler directive in Verilog-2001\n"}));
    EXPECT_EQ(scanFailing("`include\n").error, "Illegal use of `include directive");
    EXPECT_EQ(scanFailing("`define\n").error, "Illegal use of `define directive");
    EXPECT_EQ(scanFailing("`ifdef (x)").error, "Illegal use of `ifdef directive");
}

TEST_F(Macros, UndefinedMacrosAreErrorsOnlyInStrictMode) {
    ScanResult r = scanFailing("a\n`FOO b");
    EXPECT_EQ(r.error, "Macro reference `FOO is not defined");
    EXPECT_EQ(r.errorLine, 2);

    r = scanSource(dir, "a\n`FOO(1, 2) b\n`define X 1\n`undef X\n`undef NEVER\n`X", {}, "t.v", false);
    EXPECT_FALSE(r.failed) << r.error;
    EXPECT_EQ(r.text(), "a b");
    EXPECT_EQ(sink.warnings(), (Strings{loc(2) + "Macro reference `FOO is not defined\n",
                                        loc(6) + "Macro reference `X is not defined\n"}));
}

TEST_F(Macros, RunawayExpansionsStopWithAnError) {
    const auto start = std::chrono::steady_clock::now();
    EXPECT_EQ(scanFailing("`define A x `A\n`A").error, "Recursive expansion of macro `A");
    ScanResult r = scanFailing("`define A `B\n`define B (`A)\n\n`A");
    EXPECT_TRUE(r.error == "Recursive expansion of macro `A" || r.error == "Recursive expansion of macro `B") << r.error;
    EXPECT_EQ(r.errorLine, 4);
    // Each expansion doubles its argument: stopped by the size bound long before memory runs out.
    EXPECT_EQ(scanFailing("`define G(x) `G(x x)\n`G(y)").error, "Recursive expansion of macro `G");
    // Macros that double at each level, none recursive: 2^40 tokens asked
    // for by 42 lines. All expansion text of a compilation is bounded.
    std::string doubling = "`define A0 abcdefghijklmnopqrstuvwxyz0123456789\n";
    for (int i = 1; i <= 40; ++i)
        doubling += "`define A" + std::to_string(i) + " `A" + std::to_string(i - 1) + " `A" + std::to_string(i - 1) + "\n";
    r = scanFailing(doubling + "`A40\n");
    EXPECT_EQ(r.error.rfind("Macro expansions exceed their limit at `A", 0), 0u) << r.error;
    EXPECT_EQ(r.errorLine, 42);
    EXPECT_LT(std::chrono::steady_clock::now() - start, std::chrono::seconds(20));
    // Deep but finite nesting is fine.
    std::string chain;
    for (int i = 0; i < 200; ++i) chain += "`define M" + std::to_string(i) + " `M" + std::to_string(i + 1) + "\n";
    EXPECT_EQ(scanText(chain + "`define M200 end\n`M0"), "end");
}

TEST(MacroPreparation, FormalsBecomeMarkersOutsideStrings) {
    const char m = Tn_VerilogDirectiveState::kFormalMarker;
    Tn_VerilogDirectiveState::ParamMacro p =
        Tn_VerilogDirectiveState::prepare(" a ,\tb", "a+b \"a\" ab 1a _a `a " + std::string(1, m));
    EXPECT_EQ(p.formals, 2);
    EXPECT_EQ(p.body.str(), std::string(1, m) + "0+" + m + "1 \"a\" ab 1a _a `" + m + "0 " + m + m);
}

TEST_F(Macros, RawControlBytesInBodiesSurviveSubstitution) {
    ScanResult r = scanSource(dir, "`define F(a) \x01 a \x01" "0\n`F(x)");
    ASSERT_FALSE(r.failed) << r.error;
    EXPECT_EQ(r.text(), "\\001 x \\001 0");
}

}  // namespace
