// tarn tokens end to end: the listing, its errors, -count and tracing.
#include <gtest/gtest.h>

#include "tests/support/testfiles.h"

namespace {

TEST(TarnTokens, ListsEveryTokenUpToEndOfFile) {
    TempDir dir;
    dir.write("inc/w.vh", "`define W 8\n");
    const std::string top = dir.write("top.v", "`include \"w.vh\"\nwire [`W:0] \\a ; // c\n");
    CommandResult r = runTarn("tokens +incdir+" + (dir / "inc") + " " + top);
    EXPECT_EQ(r.status, 0) << r.err;
    const std::string f = "<" + top + ">";
    EXPECT_EQ(r.out, "[\"wire\",<124>," + f + ",<2>,<5>]\n" +
                         "[\"[\",<157>," + f + ",<2>,<7>]\n" +
                         "[\"8\",<212>," + f + ",<2>,<10>]\n" +
                         "[\":\",<145>," + f + ",<2>,<10>]\n" +
                         "[\"0\",<212>," + f + ",<2>,<11>]\n" +
                         "[\"]\",<180>," + f + ",<2>,<12>]\n" +
                         "[\"a\",<220>," + f + ",<2>,<15>]\n" +
                         "[\";\",<184>," + f + ",<2>,<17>]\n" +
                         "[\"EOF\",<1>," + f + ",<3>,<1>]\n");
    EXPECT_EQ(r.err, "Compiling verilog file \"" + top + "\"\nCompiling verilog include file \"" + (dir / "inc/w.vh") +
                         "\"\ntarn: 0 errors, 0 warnings\n");
}

TEST(TarnTokens, AScannerErrorEndsTheListing) {
    TempDir dir;
    const std::string top = dir.write("top.v", "a\n`else\nb\n");
    CommandResult r = runTarn("tokens " + top);
    EXPECT_EQ(r.status, 1);
    EXPECT_EQ(r.out, "[\"a\",<220>,<" + top + ">,<1>,<2>]\n");
    EXPECT_EQ(r.err, "Compiling verilog file \"" + top + "\"\nError: \"" + top +
                         "\" line 2 Illegal `else directive\ntarn: 1 error, 0 warnings\n");

    r = runTarn("tokens nothere.v");
    EXPECT_EQ(r.status, 1);
    EXPECT_EQ(r.out, "");
    EXPECT_EQ(r.err, "Error: Source file nothere.v does not exist\ntarn: 1 error, 0 warnings\n");
}

TEST(TarnTokens, CountsAndTraces) {
    TempDir dir;
    const std::string top = dir.write("top.v", "`define W 8\nx = `W;\n");
    CommandResult r = runTarn("tokens -count " + top);
    EXPECT_EQ(r.status, 0);
    EXPECT_EQ(r.out, "5 tokens, 20 bytes\n");

    r = runTarn("tokens " + top + " +tarn+lexer+debug");
    EXPECT_EQ(r.status, 0);
    EXPECT_NE(r.out.find("Macro substitution expanded to:\n  8\n[\"8\",<212>"), std::string::npos) << r.out;
    EXPECT_NE(r.err.find("--accepting rule at line"), std::string::npos);
}

}  // namespace
