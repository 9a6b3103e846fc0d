// The tarn command end to end: exit statuses, the summary line, the usage.
#include <gtest/gtest.h>

#include "tests/support/testfiles.h"

TEST(TarnCli, NoCommandIsAUsageMistake) {
    CommandResult r = runTarn("");
    EXPECT_EQ(r.status, 2);
    EXPECT_NE(r.err.find("Usage: tarn <command> ARGS..."), std::string::npos);
    EXPECT_EQ(r.out, "");
}

TEST(TarnCli, HelpGoesToStandardOutput) {
    for (const char* h : {"-h", "--help"}) {
        CommandResult r = runTarn(h);
        EXPECT_EQ(r.status, 0) << h;
        EXPECT_EQ(r.out.rfind("Usage: tarn <command> ARGS...\n", 0), 0u) << h;
        EXPECT_NE(r.out.find("  compile "), std::string::npos);
        EXPECT_NE(r.out.find("  data "), std::string::npos);
    }
}

TEST(TarnCli, UnknownCommandIsAUsageMistake) {
    CommandResult r = runTarn("frobnicate x.v");
    EXPECT_EQ(r.status, 2);
    EXPECT_EQ(r.err.rfind("tarn: unknown command 'frobnicate'\n", 0), 0u);
}

TEST(TarnCli, ErrorsGiveStatusOneAndTheSummary) {
    CommandResult r = runTarn("compile");
    EXPECT_EQ(r.status, 1);
    EXPECT_EQ(r.err, "Error: No top level design units found for elaboration\ntarn: 1 error, 0 warnings\n");

    r = runTarn("compile -bogus nothere.v +incdir+/no/such/dir");
    EXPECT_EQ(r.status, 1);
    EXPECT_EQ(r.err,
              "Error: Unrecognized option 'bogus'\n"
              "Error: Source file nothere.v does not exist\n"
              "Warning: Include directory /no/such/dir does not exist\n"
              "tarn: 2 errors, 1 warning\n");
}

TEST(TarnCli, CleanRunGivesStatusZero) {
    CommandResult r = runTarn("compile -top t");
    EXPECT_EQ(r.status, 0);
    EXPECT_EQ(r.err, "tarn: 0 errors, 0 warnings\n");
    r = runTarn("data");
    EXPECT_EQ(r.status, 0);
}

TEST(TarnCli, VerilogUsageTextNamesTarn) {
    CommandResult r = runTarn("compile -help -top t");
    EXPECT_EQ(r.status, 0);
    EXPECT_NE(r.err.find("\nUsage: tarn [-?|h|help]\n          [-verilog2001 yes|no]\n"), std::string::npos);
    EXPECT_NE(r.err.find("          <file> {<file>}\n\ntarn: 0 errors, 0 warnings\n"), std::string::npos);
}

TEST(TarnCli, ElaborateNeedsTopUnits) {
    CommandResult r = runTarn("elaborate");
    EXPECT_EQ(r.status, 1);
    EXPECT_EQ(r.err, "Error: No top level design units found for elaboration\ntarn: 1 error, 0 warnings\n");
}

TEST(TarnCli, EvalPrintsOneLinePerExpression) {
    CommandResult r = runTarn("eval \"8'sd3 + 4'd1\" \"-8'sd1\" \"1'bx ? 4'b1100 : 4'b1010\" \"2.0 ** 0.5\" "
                              "'$time' \"{2{3'b1z0}}\" +define+W=4 '`W'\\''d9 << 1'");
    EXPECT_EQ(r.status, 0) << r.err;
    EXPECT_EQ(r.out,
              "8 u 00000100 4\n"
              "8 s 11111111 -1\n"
              "4 u 1xx0 X\n"
              "real 1.4142135623730951\n"
              "null\n"
              "6 u 1z01z0 Z\n"
              "4 u 0010 2\n");
    EXPECT_EQ(r.err, "tarn: 0 errors, 0 warnings\n");
}

TEST(TarnCli, EvalErrorsGiveNullAndStatusOne) {
    CommandResult r = runTarn("eval \"1 +\" \"3'd5\" \"a + 1\"");
    EXPECT_EQ(r.status, 1);
    EXPECT_EQ(r.out, "null\n3 u 101 5\nnull\n");
    EXPECT_NE(r.err.find("Error: Syntax error in expression '1 +': "), std::string::npos) << r.err;
    EXPECT_NE(r.err.find("Name 'a' could not be resolved"), std::string::npos) << r.err;
    EXPECT_NE(r.err.find("tarn: 2 errors, 0 warnings\n"), std::string::npos) << r.err;
    // Verilog-1995 has no power operator.
    r = runTarn("eval -95 \"2 ** 3\"");
    EXPECT_EQ(r.status, 1);
    EXPECT_EQ(r.out, "null\n");
    r = runTarn("eval");
    EXPECT_EQ(r.status, 2);
    EXPECT_NE(r.err.find("Usage: tarn eval"), std::string::npos);
}
