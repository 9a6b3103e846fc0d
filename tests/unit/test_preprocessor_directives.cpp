// Directives other than conditionals and macros: include files, timescale,
// net type and drive settings, uselib, line, the ignored and warned
// directives, and pragma comments.
#include <gtest/gtest.h>

#include "tests/support/capturesink.h"
#include "tests/support/scan.h"
#include "verilog/tn_verilogcompiler.h"
#include "verilog/tn_verilogdirectivestate.h"
#include "verilog/tn_verilogflexlexer.h"
#include "verilog/tn_veriloglexer.h"
#include "verilog/tn_verilogtokentypes.h"

namespace {

typedef std::vector<std::string> Strings;
typedef Tn_VerilogTokenTypes T;

class Directives : public ScanTest {
protected:
    // Starts scanning source (with further arguments); the driver is kept
    // for its state.
    void start(const std::string& source, std::vector<std::string> args = {}) {
        args.insert(args.begin(), dir.write("t.v", source));
        Tn_StringList list{Port_String("tarn")};
        for (const std::string& a : args) list.push_back(Port_String(a));
        driver.reset(new Tn_VerilogCompiler());
        EXPECT_TRUE(driver->scanSources(list));
    }
    ScanResult run(const std::string& source, const std::vector<std::string>& args = {}) {
        start(source, args);
        return drainTokens(driver->lexer());
    }
    std::string text(const std::string& source, const std::vector<std::string>& args = {}) {
        ScanResult r = run(source, args);
        EXPECT_FALSE(r.failed) << r.error;
        return r.text();
    }
    std::string error(const std::string& source, const std::vector<std::string>& args = {}) {
        ScanResult r = run(source, args);
        EXPECT_TRUE(r.failed) << source;
        return r.error;
    }
    Tn_VerilogDirectiveState& state() { return driver->lexer().directives(); }

    std::unique_ptr<Tn_VerilogCompiler> driver;
};

TEST_F(Directives, TimescaleAcceptedForms) {
    struct Case {
        const char* text;
        int unit, precision;
    } cases[] = {{"`timescale 1ns/1ps", -9, -12},
                 {"`timescale 10 ns / 1 ns // a comment", -8, -9},
                 {"`timescale\t100s/1fs", 2, -15},
                 {"`timescale 1us / 1us /* comment */", -6, -6},
                 {"`define TS 100us/10ns\n`timescale `TS", -4, -8}};
    for (const Case& c : cases) {
        EXPECT_EQ(text(std::string(c.text) + "\nx"), "x") << c.text;
        EXPECT_TRUE(state().timescaleGiven()) << c.text;
        EXPECT_EQ(state().timeUnit(), c.unit) << c.text;
        EXPECT_EQ(state().timePrecision(), c.precision) << c.text;
    }
}

TEST_F(Directives, TimescaleRejectedForms) {
    for (const char* t : {"`timescale 1ns/10ns", "`timescale 2ns/1ns", "`timescale 1ns", "`timescale 1 ns / 1 xs",
                          "`timescale", "`timescale 1ns/1ps/1fs"}) {
        ScanResult r = run(std::string("\n") + t + "\n");
        EXPECT_EQ(r.error, "Invalid `timescale directive") << t;
        EXPECT_EQ(r.errorLine, 2) << t;
    }
}

TEST_F(Directives, NetTypeAndDriveSettings) {
    text("`default_nettype tri0 `unconnected_drive pull1 `celldefine");
    EXPECT_EQ(state().defaultNetType().str(), "tri0");
    EXPECT_EQ(state().unconnectedDrive().str(), "pull1");
    EXPECT_TRUE(state().cellDefine());
    text("`default_nettype none `unconnected_drive pull0 `nounconnected_drive `celldefine `endcelldefine");
    EXPECT_EQ(state().defaultNetType().str(), "none");
    EXPECT_EQ(state().unconnectedDrive().str(), "none");
    EXPECT_FALSE(state().cellDefine());

    EXPECT_EQ(error("`default_nettype none", {"-95"}), "Invalid `default_nettype directive");
    EXPECT_EQ(error("`default_nettype reg"), "Invalid `default_nettype directive");
    EXPECT_EQ(error("`unconnected_drive strong1"), "Invalid `unconnected_drive directive");
}

TEST_F(Directives, ResetallRestoresSettingsButKeepsMacros) {
    text(
        "`celldefine `timescale 1ns/1ps\n`default_nettype none `unconnected_drive pull0 `define K 1\n"
        "`uselib lib=a\n`resetall");
    EXPECT_EQ(state().defaultNetType().str(), "wire");
    EXPECT_FALSE(state().cellDefine());
    EXPECT_FALSE(state().timescaleGiven());
    EXPECT_EQ(state().timeUnit(), 0);
    EXPECT_EQ(state().timePrecision(), 0);
    EXPECT_EQ(state().unconnectedDrive().str(), "none");
    EXPECT_TRUE(state().isDefined("K"));
    EXPECT_EQ(state().uselib().size(), 1u);
}

TEST_F(Directives, UselibKeepsItsArguments) {
    auto list = [&]() {
        Strings r;
        for (const Port_String& s : state().uselib()) r.push_back(s.str());
        return r;
    };
    EXPECT_EQ(text("`uselib lib=a libext=.v file=f.v dir=/d \t\r\nx"), "x");
    EXPECT_EQ(list(), (Strings{"lib=a", "libext=.v", "file=f.v", "dir=/d"}));
    EXPECT_TRUE(sink.errors().empty());
    text("`define LIBS lib=x lib=y\n`uselib `LIBS\n");
    EXPECT_EQ(list(), (Strings{"lib=x", "lib=y"}));
    text("`uselib lib=a\n`uselib\n");
    EXPECT_EQ(list(), Strings{});

    text("`uselib lib=a foo=b lib=c\n");
    EXPECT_EQ(list(), (Strings{"lib=a"}));
    const std::string message =
        "A `uselib argument beginning other than lib, libext, file, or dir was found.  (Note: only the lib argument "
        "is currently supported.)\n";
    EXPECT_EQ(sink.errors(), (Strings{loc(1) + message}));
    sink.clear();
    ScanResult r = scanSource(dir, "`uselib lib=a foo=b\n", {}, "t.v", false);
    EXPECT_EQ(sink.warnings(), (Strings{loc(1) + message}));
}

TEST_F(Directives, LineRenamesAndRenumbers) {
    ScanResult r = run("a\n`line 10 \"foo.v\" 0\nb\nc");
    ASSERT_EQ(r.text(), "a b c");
    EXPECT_EQ(r.tokens[1].file, "foo.v");
    EXPECT_EQ(r.tokens[1].line, 10);
    EXPECT_EQ(r.tokens[2].line, 11);
    EXPECT_EQ(error("`line 10 foo.v 0\n"), "Invalid `line directive");
    EXPECT_EQ(error("`line 10 \"foo.v\" 0\n", {"-95"}), "Macro reference `line is not defined");
}

TEST_F(Directives, IgnoredAndWarnedDirectives) {
    EXPECT_EQ(text("`protect x `endprotect `accelerate `noremove_netnames y `suppress_faults"), "x y");
    EXPECT_TRUE(sink.warnings().empty());
    EXPECT_EQ(text("`delay_mode_zero\n`default_decay_time 10 z\n`default_trireg_strength 30\n`unsigned\n"), "z");
    const std::string tail =
        "Verilog-XL specific compiler directive is not implemented and hence any code containing this directive may "
        "behave differently compared Verilog-XL\n";
    EXPECT_EQ(sink.warnings(),
              (Strings{loc(1) + "`delay_mode_zero, a " + tail, loc(2) + "`default_decay_time, a " + tail,
                       loc(3) + "`default_trireg_strength, a " + tail, loc(4) + "`unsigned, a  " + tail}));
}

TEST_F(Directives, IncludeSearchOrderAndFileList) {
    dir.write("d1/x.vh", "one\n");
    dir.write("d2/x.vh", "two\n");
    dir.write("d2/y.vh", "why\n`include \"z.vh\"\nafter_z\n");
    dir.write("d1/z.vh", "zed");
    ScanResult r = run("`include \"x.vh\"\n`include \"y.vh\" tail\nend\n",
                       {"+incdir+" + (dir / "d1"), "+incdir+" + (dir / "d2")});
    ASSERT_FALSE(r.failed) << r.error;
    EXPECT_EQ(r.text(), "one why zed after_z tail end");
    // Tokens carry the file they come from; lines and columns resume after the directive.
    EXPECT_EQ(r.tokens[0].file, dir / "d1/x.vh");
    EXPECT_EQ(r.tokens[2].file, dir / "d1/z.vh");
    EXPECT_EQ(r.tokens[3].file, dir / "d2/y.vh");
    EXPECT_EQ(r.tokens[3].line, 3);
    EXPECT_EQ(r.tokens[4].file, dir / "t.v");
    EXPECT_EQ(r.tokens[4].line, 2);
    EXPECT_EQ(r.tokens[4].column, 21);
    EXPECT_EQ(r.tokens[5].line, 3);

    EXPECT_EQ(sink.statuses(), (Strings{"Compiling verilog file \"" + (dir / "t.v") + "\"\n",
                                        "Compiling verilog include file \"" + (dir / "d1/x.vh") + "\"\n",
                                        "Compiling verilog include file \"" + (dir / "d2/y.vh") + "\"\n",
                                        "Compiling verilog include file \"" + (dir / "d1/z.vh") + "\"\n"}));
    Strings entries;
    for (const auto& e : driver->sourceFiles().entries()) entries.push_back(e.file.str() + "<" + e.includer.str());
    EXPECT_EQ(entries, (Strings{dir / "t.v<", (dir / "d1/x.vh") + "<" + (dir / "t.v"),
                                (dir / "d2/y.vh") + "<" + (dir / "t.v"), (dir / "d1/z.vh") + "<" + (dir / "d2/y.vh")}));
}

TEST_F(Directives, IncludeIsNotSearchedNextToTheIncluder) {
    dir.write("sub/a.vh", "`include \"b.vh\"\n");
    dir.write("sub/b.vh", "b\n");
    ScanResult r = run("`include \"a.vh\"\n", {"+incdir+" + (dir / "sub") + "/"});
    EXPECT_FALSE(r.failed) << r.error;
    r = run("`include \"" + (dir / "sub/a.vh") + "\"\n");
    EXPECT_EQ(r.error, "Could not find verilog include file 'b.vh'");
    EXPECT_EQ(r.errorFile, dir / "sub/a.vh");
    EXPECT_EQ(r.errorLine, 1);
    // A directory of that name is no include file.
    dir.mkdir("d/x.vh");
    EXPECT_EQ(error("`include \"x.vh\"", {"+incdir+" + (dir / "d")}), "Could not find verilog include file 'x.vh'");

    r = scanSource(dir, "a\n`include \"nope.vh\" b\n", {}, "t.v", false);
    EXPECT_EQ(r.text(), "a b");
    EXPECT_EQ(sink.warnings(), (Strings{loc(2) + "Could not find include file 'nope.vh'\n"}));
}

TEST_F(Directives, RecursiveIncludesAreScannerErrors) {
    dir.write("self.vh", "x\n`include \"self.vh\"\n");
    dir.write("a.vh", "`include \"b.vh\"\n");
    dir.write("b.vh", "`include \"sub/../a.vh\"\n");
    dir.mkdir("sub");
    const std::string inc = "+incdir+" + dir.path();
    ScanResult r = run("`include \"self.vh\"\n", {inc});
    EXPECT_EQ(r.error, "Recursive include of verilog include file '" + dir.path() + "/self.vh'");
    EXPECT_EQ(r.errorFile, dir / "self.vh");
    EXPECT_EQ(r.errorLine, 2);
    r = run("`include \"a.vh\"\n", {inc});
    EXPECT_EQ(r.error, "Recursive include of verilog include file '" + dir.path() + "/sub/../a.vh'");
    // Including the same file twice, one after the other, is fine.
    dir.write("t.vh", "t\n");
    EXPECT_EQ(text("`include \"t.vh\"\n`include \"t.vh\"\n", {inc}), "t t");
    dir.write("g.vh", "`ifndef G\n`define G\ng\n`endif\n");
    EXPECT_EQ(text("`include \"g.vh\"\n`include \"g.vh\"\n", {inc}), "g");
}

TEST_F(Directives, IncludeFilesOpenedInACompilationAreBounded) {
    // Each file includes the next one twice: 2^10 - 1 openings from 10
    // files, none recursive; real bounds are far higher, the test lowers it.
    for (int i = 0; i < 9; ++i) {
        const std::string next = "`include \"b" + std::to_string(i + 1) + ".vh\"\n";
        dir.write("b" + std::to_string(i) + ".vh", next + next);
    }
    dir.write("b9.vh", "x\n");
    auto scan = [&](size_t limit) {
        start("`include \"b0.vh\"\n", {"+incdir+" + dir.path()});
        driver->lexer().state().includeLimit = limit;
        return drainTokens(driver->lexer());
    };
    ScanResult r = scan(1023);
    EXPECT_FALSE(r.failed) << r.error;
    EXPECT_EQ(r.tokens.size(), 512u + 1);  // 512 x and the end
    r = scan(1022);
    EXPECT_EQ(r.error, "More than 1022 include files opened at '" + dir.path() + "/b9.vh'");
    EXPECT_EQ(Tn_VerilogScannerState::kMaxIncludes, 1000000u);
}

TEST_F(Directives, IncludeNestingIsBounded) {
    const int depth = Tn_VerilogFlexLexer::kMaxIncludeDepth;
    for (int i = 0; i <= depth; ++i)
        dir.write("n" + std::to_string(i) + ".vh", "`include \"n" + std::to_string(i + 1) + ".vh\"\n");
    dir.write("n" + std::to_string(depth + 1) + ".vh", "deep\n");
    ScanResult r = run("`include \"n0.vh\"\n", {"+incdir+" + dir.path()});
    EXPECT_EQ(r.error, "Verilog include files nested more than " + std::to_string(depth) + " deep at '" + dir.path() +
                           "/n" + std::to_string(depth) + ".vh'");
    // One level less is fine.
    dir.write("n" + std::to_string(depth) + ".vh", "deep\n");
    EXPECT_EQ(text("`include \"n1.vh\"\n", {"+incdir+" + dir.path()}), "deep");
}

TEST_F(Directives, PragmaCommentsNeedPlsClient) {
    const char* source =
        "a // synopsys translate_off\r\n"
        "b `define HIDDEN\n"
        "/* synthesis translate_on */ c // synopsys full_case\r\n"
        "// pls translate_off\n"
        "d // synthesis attribute keep of sig is true\n"
        "// exemplar attribute sig keep true\n"
        "`ifdef NEVER // synopsys translate_off\n`endif e\n";
    ScanResult r = run(source);
    EXPECT_EQ(r.text(), "a b c d e");
    EXPECT_TRUE(driver->lexer().pragmaComments().empty());

    r = run(source, {"+pls_client"});
    EXPECT_EQ(r.text(), "a c  synopsys full_case  pls translate_off d e");
    EXPECT_EQ(r.types(), (std::vector<int>{T::IDENTIFIER, T::IDENTIFIER, T::METACOMMENT, T::METACOMMENT, T::IDENTIFIER,
                                           T::IDENTIFIER}));
    EXPECT_FALSE(state().isDefined("HIDDEN"));
    Strings pragmas;
    for (const Port_String& p : driver->lexer().pragmaComments()) pragmas.push_back(p.str());
    EXPECT_EQ(pragmas, (Strings{" synthesis attribute keep of sig is true", " exemplar attribute sig keep true"}));
}

TEST_F(Directives, TranslateOffToTheEnd) {
    ScanResult r = run("a\n// synopsys translate_off\nb\n", {"+pls_client"});
    EXPECT_FALSE(r.failed);
    EXPECT_EQ(r.text(), "a");
    EXPECT_EQ(sink.warnings(), (Strings{loc(4) + "End of source reached with 'translate_off' active\n"}));
}

TEST_F(Directives, WithoutStrictSourceMetaCommentsAreKeptAsPragmas) {
    ScanResult r = scanSource(dir, "a // synopsys full_case\nb", {"+pls_client"}, "t.v", false);
    EXPECT_EQ(r.text(), "a b");
}

}  // namespace
