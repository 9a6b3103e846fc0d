// What the scanner is given: bytes that are not text, empty and unfinished
// files, several files in one stream, files that cannot be read, texts, and
// the shared corpus of real designs.
#include <gtest/gtest.h>

#include <chrono>

#include "port/port_file.h"
#include "tests/support/capturesink.h"
#include "tests/support/scan.h"
#include "verilog/tn_verilogcompiler.h"
#include "verilog/tn_verilogdirectivestate.h"
#include "verilog/tn_veriloglexer.h"
#include "verilog/tn_verilogtokentypes.h"

namespace {

typedef std::vector<std::string> Strings;
typedef Tn_VerilogTokenTypes T;

class ScannerInputs : public ScanTest {};

TEST_F(ScannerInputs, BytesThatAreNotTextBecomeTokensOrStayInside) {
    static const char bytes[] = "a\0b \x80\xff \"s\0\x80\" /* \0\xff */ // \xff\nc";
    const std::string source(bytes, sizeof bytes - 1);
    ScanResult r = scanSource(dir, source);
    ASSERT_FALSE(r.failed) << r.error;
    EXPECT_EQ(r.types(), (std::vector<int>{T::IDENTIFIER, 0, T::IDENTIFIER, 0, 0, T::STRING, T::IDENTIFIER}));
    EXPECT_EQ(r.tokens[1].text, "\\000");
    EXPECT_EQ(r.tokens[3].text, "\\200");
    EXPECT_EQ(r.tokens[5].text, std::string("s\0\x80", 3));
    EXPECT_EQ(r.tokens[6].line, 2);
}

TEST_F(ScannerInputs, EmptyAndUnfinishedFiles) {
    ScanResult r = scanSource(dir, "");
    ASSERT_EQ(r.tokens.size(), 1u);
    EXPECT_EQ(r.tokens[0].type, T::EOF_);

    r = scanSource(dir, "module m; endmodule");
    EXPECT_EQ(r.text(), "module m ; endmodule");

    EXPECT_EQ(scanSource(dir, "a /* b\n c").error, "Unterminated comment");
    r = scanSource(dir, "`define F(a) a\n`F(x,\ny");
    EXPECT_EQ(r.error, "Unterminated argument list of macro reference `F");
    EXPECT_EQ(r.errorLine, 2);

    // A define ending the file, even after a continuation backslash.
    const std::string a = dir.write("a.v", "`define X 1 \\");
    const std::string b = dir.write("b.v", "`ifdef X yes `endif");
    r = scanArgs({a, b});
    EXPECT_FALSE(r.failed) << r.error;
    EXPECT_EQ(r.text(), "yes");
    // ... or an include file.
    dir.write("d.vh", "`define Y 2");
    r = scanSource(dir, "`include \"" + (dir / "d.vh") + "\"\n`Y");
    EXPECT_EQ(r.text(), "2");
}

TEST_F(ScannerInputs, AHugeLineIsScannedInLinearTime) {
    const auto start = std::chrono::steady_clock::now();
    std::string source = "a // " + std::string(8 << 20, 'x') + "\nb /* " + std::string(8 << 20, '*') + "/ c \"" +
                         std::string(4 << 20, 's') + "\"";
    ScanResult r = scanSource(dir, source);
    ASSERT_FALSE(r.failed) << r.error;
    EXPECT_EQ(r.types(), (std::vector<int>{T::IDENTIFIER, T::IDENTIFIER, T::IDENTIFIER, T::STRING}));
    EXPECT_LT(std::chrono::steady_clock::now() - start, std::chrono::seconds(30));
}

TEST_F(ScannerInputs, SourceFilesFormOneStream) {
    const std::string a = dir.write("a.v", "`define W 4\nmodule a;");
    const std::string b = dir.write("b.v", "wire [`W:0] w; endmodule\n");
    ScanResult r = scanArgs({a, b});
    EXPECT_EQ(r.text(), "module a ; wire [ 4 : 0 ] w ; endmodule");
    EXPECT_EQ(r.tokens[2].file, a);
    EXPECT_EQ(r.tokens[3].file, b);
    EXPECT_EQ(r.tokens[3].line, 1);
    EXPECT_EQ(sink.statuses(), (Strings{"Compiling verilog file \"" + a + "\"\n", "Compiling verilog file \"" + b + "\"\n"}));
}

TEST_F(ScannerInputs, StatusLinesNameTheLibraryWhenUnitsAreNotElaboratedAtOnce) {
    const std::string a = dir.write("a.v", "x\n");
    Tn_VerilogCompiler driver;
    driver.compile({"tarn", a.c_str(), "-top", "x"});
    EXPECT_EQ(sink.statuses(), (Strings{"Compiling verilog file \"" + a + "\"\n"}));
    sink.clear();
    driver.compile({"tarn", a.c_str(), "-top", "x", "-norecursive", "-work", "mylib"});
    EXPECT_EQ(sink.statuses(), (Strings{"Compiling verilog file \"" + a + "\" in library mylib\n"}));
    sink.clear();
    driver.parse({"tarn", a.c_str()});
    EXPECT_EQ(sink.statuses(), (Strings{"Compiling verilog file \"" + a + "\" in library work\n"}));
}

TEST_F(ScannerInputs, EveryCallOfADriverScansItsSourcesAnew) {
    const std::string a = dir.write("a.v", "`define A\n");
    const std::string b = dir.write("b.v", "`ifdef A\n`else\n`else\n`endif\n");
    Tn_VerilogCompiler driver;
    EXPECT_EQ(driver.compile({"tarn", b.c_str(), "-top", "x"}), 1);
    EXPECT_EQ(driver.compile({"tarn", a.c_str(), "-top", "x"}), 0);
    EXPECT_EQ(driver.compile({"tarn", b.c_str(), "-top", "x"}), 1);
    EXPECT_EQ(sink.errors().size(), 2u);
    EXPECT_EQ(driver.sourceFiles().entries().size(), 1u);
}

TEST_F(ScannerInputs, CompileReportsScannerErrorsAsTheParserWill) {
    const std::string a = dir.write("a.v", "module x;\n`else\nendmodule\n");
    Tn_VerilogCompiler driver;
    EXPECT_EQ(driver.compile({"tarn", a.c_str(), "-top", "x"}), 1);
    EXPECT_EQ(sink.errors(), (Strings{"\"" + a + "\" line 2 Illegal `else directive\n"}));
}

TEST_F(ScannerInputs, FilesThatCannotBeOpened) {
    Tn_VerilogOptions options;
    Tn_VerilogDirectiveState directives;
    Tn_VerilogLexer lexer(options, directives);
    lexer.startFiles({Port_String(dir.path()), Port_String(dir.path())});
    try {
        lexer.nextToken();
        ADD_FAILURE() << "a directory was read";
    } catch (const antlr::TokenStreamRecognitionException& e) {
        EXPECT_EQ(e.getMessage(), "Could not open file " + dir.path());
    }
    // After an error the stream has ended.
    EXPECT_EQ(lexer.nextToken()->getType(), T::EOF_);
    EXPECT_EQ(lexer.nextToken()->getType(), T::EOF_);
}

TEST_F(ScannerInputs, ATextIsScannedAsIfItWereAFile) {
    Tn_VerilogOptions options;
    options.parse({"tarn", "+define+W=8"});
    Tn_VerilogDirectiveState directives;
    directives.reset(options.macroDefinitions());
    Tn_VerilogLexer lexer(options, directives);
    lexer.startString("a `W\nb");
    ScanResult r = drainTokens(lexer);
    EXPECT_EQ(r.text(), "a 8 b");
    EXPECT_EQ(r.tokens[2].file, "");
    EXPECT_EQ(r.tokens[2].line, 2);
    EXPECT_TRUE(sink.statuses().empty());
    // The scanner can be started again.
    lexer.startString("c");
    EXPECT_EQ(drainTokens(lexer).text(), "c");
}

}  // namespace
