// Conditional compilation: chains, nesting, skipped text, the errors of
// unbalanced directives, conditionals spanning files, Verilog-1995 mode.
#include <gtest/gtest.h>

#include "tests/support/scan.h"

namespace {

class Conditionals : public ScanTest {};

const char* const kChain =
    "`ifdef A\n first\n`elsif B\n second\n`else\n third\n`endif\n"
    "`ifndef A\n notA\n`else\n isA\n`endif\n";

TEST_F(Conditionals, AChainSelectsTheFirstTrueBranch) {
    EXPECT_EQ(scanText(kChain, {"+define+B"}), "second notA");
    EXPECT_EQ(scanText(kChain, {"+define+A+B"}), "first isA");
    EXPECT_EQ(scanText(kChain), "third notA");
    EXPECT_EQ(scanText("`ifdef A a `elsif B b `elsif C c `endif", {"+define+C"}), "c");
}

TEST_F(Conditionals, NestedConditionalsInSkippedTextAreTrackedButInactive) {
    const char* text =
        "`ifdef A\n"
        "  `ifdef B b `else notB `endif\n"
        "  `ifndef B nb `elsif C c `endif\n"
        "`else\n"
        "  `ifdef B inner `endif outer\n"
        "`endif\n";
    EXPECT_EQ(scanText(text, {"+define+B"}), "inner outer");
    EXPECT_EQ(scanText(text, {"+define+A+C"}), "notB nb");
    EXPECT_EQ(scanText(text, {"+define+A+B+C"}), "b c");
}

TEST_F(Conditionals, SkippedTextPerformsNothing) {
    const char* text =
        "`ifdef NEVER\n"
        "  `define X 1\n"
        "  `include \"no_such_file.vh\"\n"
        "  `undef Y\n"
        "  `timescale bogus\n"
        "  \"a string with `endif inside\" // a comment with `endif\n"
        "  /* `else */ `elsewhere `endiff 8'dx\n"
        "`endif\n"
        "`ifdef X x `endif `ifdef Y y `endif\n";
    EXPECT_EQ(scanText(text, {"+define+Y"}), "y");
    EXPECT_TRUE(sink.errors().empty());
    EXPECT_TRUE(sink.warnings().empty());
}

TEST_F(Conditionals, UnbalancedDirectivesAreScannerErrors) {
    ScanResult r = scanFailing("`ifdef A\n`else\n`else\n`endif\n");
    EXPECT_EQ(r.error, "Illegal `else directive");
    EXPECT_EQ(r.errorLine, 3);
    EXPECT_EQ(scanFailing("`ifdef A `else `elsif B `endif").error, "Illegal `elsif directive");
    EXPECT_EQ(scanFailing("x\n`endif").error, "Illegal `endif directive");
    EXPECT_EQ(scanFailing("`else").error, "Illegal `else directive");
    EXPECT_EQ(scanFailing("`elsif A").error, "Illegal `elsif directive");
    r = scanFailing("`ifdef A\n`ifdef B\n`endif\n");
    EXPECT_EQ(r.error, "End of source reached before all `ifdefs have been closed");
    EXPECT_EQ(r.errorFile, dir / "t.v");
}

TEST_F(Conditionals, OneStreamAcrossSourceFiles) {
    const std::string a = dir.write("a.v", "`ifdef A\nfromA\n");
    const std::string b = dir.write("b.v", "fromB\n`else\nnotA\n`endif\nafter\n");
    ScanResult r = scanArgs({a, b, "+define+A"});
    EXPECT_FALSE(r.failed) << r.error;
    EXPECT_EQ(r.text(), "fromA fromB after");
    r = scanArgs({a, b});
    EXPECT_EQ(r.text(), "notA after");
    // Left open at the end of the last file.
    r = scanArgs({b, a});
    EXPECT_TRUE(r.failed);
    EXPECT_EQ(r.error, "Illegal `else directive");
    r = scanArgs({a});
    EXPECT_EQ(r.error, "End of source reached before all `ifdefs have been closed");
    EXPECT_EQ(r.errorFile, a);
}

TEST_F(Conditionals, Verilog1995HasNoIfndefElsifOrLine) {
    ScanResult r = scanFailing("`ifndef A\nx\n`endif\n", {"-95"});
    EXPECT_EQ(r.error, "Macro reference `ifndef is not defined");
    EXPECT_EQ(r.errorLine, 1);
    // In skipped text they are just text, so the first `endif closes the frame.
    r = scanFailing("`ifdef NEVER `ifndef B `endif `endif", {"-95"});
    EXPECT_EQ(r.error, "Illegal `endif directive");
    // A macro of that name is referenced as usual.
    EXPECT_EQ(scanText("`define elsif ok\n`elsif X\n", {"-95"}), "ok X");
}

TEST_F(Conditionals, ConditionalsInterleavedWithEdgeListsDoNotEndTheProcess) {
    // `endif pops a start condition that "]" already popped: the scanner
    // goes back to the text instead of failing on an empty stack.
    EXPECT_EQ(scanText("`ifdef A edge [ ] ] `endif x", {"+define+A"}), "edge [ ] ] x");
    EXPECT_EQ(scanText("edge [ `ifdef A ] `endif 01 ]", {"+define+A"}), "edge [ ] 01 ]");
}

}  // namespace
