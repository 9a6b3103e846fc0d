// The scanner's tokens: keywords by language mode, identifiers, numbers and
// their messages, strings, operators, invalid characters, edge lists, UDP
// tables, positions, the token objects and the meta-comment filter.
#include <gtest/gtest.h>

#include <algorithm>

#include "tests/support/capturesink.h"
#include "tests/support/scan.h"
#include "verilog/tn_verilogcompiler.h"
#include "verilog/tn_veriloglexer.h"
#include "verilog/tn_verilogtoken.h"
#include "verilog/tn_verilogtokenstreamfilter.h"
#include "verilog/tn_verilogtokentypes.h"

namespace {

typedef Tn_VerilogTokenTypes T;
typedef std::vector<std::string> Strings;
typedef std::vector<int> Types;

class ScannerTokens : public ScanTest {
protected:
    ScanResult scan(const std::string& source, const std::vector<std::string>& args = {}) {
        ScanResult r = scanSource(dir, source, args);
        EXPECT_FALSE(r.failed) << r.error;
        return r;
    }
};

TEST_F(ScannerTokens, KeywordsDependOnTheLanguageMode) {
    ScanResult r = scan("module generate always none -incdir\n");
    EXPECT_EQ(r.types(), (Types{T::K_MODULE, T::K_GENERATE, T::K_ALWAYS, T::IDENTIFIER, T::MINUS_INCDIR}));
    EXPECT_TRUE(sink.warnings().empty());

    r = scan("module generate localparam\n", {"-95"});
    EXPECT_EQ(r.types(), (Types{T::K_MODULE, T::IDENTIFIER, T::IDENTIFIER}));
    EXPECT_EQ(r.text(), "module generate localparam");
    EXPECT_EQ(sink.warnings(), (Strings{loc(1) + "'generate' is a reserved word in Verilog-2001\n",
                                        loc(1) + "'localparam' is a reserved word in Verilog-2001\n"}));
}

TEST_F(ScannerTokens, TheVocabularyIsNumberedAsTheGrammarsExpect) {
    ScanResult r = scan("always if tri xor $setup $nochange");
    EXPECT_EQ(r.types(), (Types{4, 45, 112, 127, 128, 139}));
    EXPECT_EQ(T::METACOMMENT, 222);
}

// The ANTLR import vocabulary the build writes from the token list.
TEST(ScannerVocabulary, TheGrammarVocabularyMatchesTheEnumeration) {
    std::string bin = TARN_BIN;
    const std::string text = readFile(bin.substr(0, bin.rfind('/')) + "/generated/Tn_VerilogTokenTypes.txt");
    ASSERT_FALSE(text.empty());
    EXPECT_EQ(text.find("Tn_Verilog    // output token vocab name\n"), text.find('\n') + 1);
    for (const char* line :
         {"K_ALWAYS=\"always\"=4\n", "MINUS_INCDIR=\"-incdir\"=47\n", "S_SETUP=\"$setup\"=128\n",
          "LBRACKET=\"[\"=157\n", "RBRACKET=\"]\"=180\n", "SEMI=\";\"=184\n", "BASE_SD=\"'sd\"=208\n",
          "DECIMAL_NUMBER(\"DECIMAL NUMBER\")=214\n", "METACOMMENT(\"METACOMMENT\")=222\n"})
        EXPECT_NE(text.find(line), std::string::npos) << line;
    EXPECT_EQ(std::count(text.begin(), text.end(), '\n'), 2 + T::METACOMMENT - 3);
    static_assert(T::MINUS_INCDIR == 47 && T::SEMI == 184 && T::BASE_SD == 208 && T::DECIMAL_NUMBER == 214,
                  "the lines above");
}

TEST_F(ScannerTokens, EscapedAndSystemIdentifiers) {
    ScanResult r = scan("\\module \\a+b;c\t\\bus[0]\r\n$display $setuphold $ x");
    EXPECT_EQ(r.types(), (Types{T::IDENTIFIER, T::IDENTIFIER, T::IDENTIFIER, T::SYSTEM_IDENTIFIER, T::S_SETUPHOLD, 0,
                                T::IDENTIFIER}));
    EXPECT_EQ(r.text(), "module a+b;c bus[0] $display $setuphold $ x");
    // A backslash followed by white space names nothing.
    r = scan("a \\ b");
    EXPECT_EQ(r.types(), (Types{T::IDENTIFIER, 0, T::IDENTIFIER}));
    EXPECT_EQ(r.tokens[1].text, "\\\\");
}

TEST_F(ScannerTokens, SizedAndBasedNumbers) {
    ScanResult r = scan("8'hFF 8 'h FF 'd1_000 4'b10?1 'sh7f 'SD3 'O17 12_");
    EXPECT_EQ(r.types(), (Types{T::INTEGER, T::BASE_H, T::HEX_NUMBER, T::INTEGER, T::BASE_H, T::HEX_NUMBER, T::BASE_D,
                                T::DECIMAL_NUMBER, T::INTEGER, T::BASE_B, T::BINARY_NUMBER, T::BASE_SH, T::HEX_NUMBER,
                                T::BASE_SD, T::DECIMAL_NUMBER, T::BASE_O, T::OCTAL_NUMBER, T::INTEGER}));
    EXPECT_EQ(r.text(), "8 'h FF 8 'h FF 'd 1000 4 'b 10?1 'sh 7f 'SD 3 'O 17 12");
    EXPECT_TRUE(sink.errors().empty());

    // Digits may follow on the next line; without digits the text goes on as usual.
    r = scan("'h\n  FF 8'h;");
    EXPECT_EQ(r.tokens[1].line, 2);
    EXPECT_EQ(r.types(), (Types{T::BASE_H, T::HEX_NUMBER, T::INTEGER, T::BASE_H, T::SEMI}));

    // An apostrophe without a base is an invalid character.
    r = scan("8' hFF");
    EXPECT_EQ(r.types(), (Types{T::INTEGER, 0, T::IDENTIFIER}));
}

TEST_F(ScannerTokens, IllegalDigitsAreReportedAndReadAsZero) {
    ScanResult r = scan("'dxz 4'b12 8'o19 'hfg _1 'b_1");
    EXPECT_EQ(r.text(), "'d 0 4 'b 0 8 'o 0 'h 0 _1 'b 0");
    EXPECT_EQ(sink.errors(), (Strings{loc(1) + "Illegal digit(s) in decimal constant 'xz'\n",
                                      loc(1) + "Illegal digit(s) in binary constant '12'\n",
                                      loc(1) + "Illegal digit(s) in octal constant '19'\n",
                                      loc(1) + "Illegal digit(s) in hex constant 'fg'\n",
                                      loc(1) + "Illegal digit(s) in binary constant '_1'\n"}));
}

TEST_F(ScannerTokens, DecimalConstantsMayBeOneUnknownDigit) {
    ScanResult r = scan("8'dx 4'sdZ 'd? 2'dx__ 'dx1");
    EXPECT_EQ(r.text(), "8 'd x 4 'sd Z 'd ? 2 'd x 'd 0");
    EXPECT_EQ(sink.errors(), Strings{loc(1) + "Illegal digit(s) in decimal constant 'x1'\n"});
}

TEST_F(ScannerTokens, RealsAndTheirNearMisses) {
    ScanResult r = scan("1.5e+10 1_0.5_0 2E3 3. 1.5e 0.25");
    EXPECT_EQ(r.types(),
              (Types{T::REAL, T::REAL, T::REAL, T::INTEGER, T::DOT, T::REAL, T::IDENTIFIER, T::REAL}));
    EXPECT_EQ(r.text(), "1.5e+10 10.50 2E3 3 . 1.5 e 0.25");
}

TEST_F(ScannerTokens, StringsDecodeTheirEscapes) {
    ScanResult r = scan("\"a\\nb\\t\\\\\\\"\\101\\7x\\q\" \"\"");
    ASSERT_EQ(r.types(), (Types{T::STRING, T::STRING}));
    EXPECT_EQ(r.tokens[0].text, std::string("a\nb\t\\\"A\7x\\q"));
    EXPECT_EQ(r.tokens[1].text, "");
    EXPECT_EQ(r.tokens[0].column, 22);
}

TEST_F(ScannerTokens, UnterminatedStringsAreScannerErrors) {
    ScanResult r = scanSource(dir, "x\n\"abc\ny\n");
    EXPECT_TRUE(r.failed);
    EXPECT_EQ(r.error, "Closing quote missing in string literal");
    EXPECT_EQ(r.errorLine, 2);
    EXPECT_EQ(r.errorFile, dir / "t.v");

    r = scanSource(dir, "\"abc\\\ndef\"\n");
    EXPECT_EQ(r.error, "Closing quote missing in string literal");

    r = scanSource(dir, "\"abc");
    EXPECT_EQ(r.error, "Unterminated string literal");
}

TEST_F(ScannerTokens, OperatorsInVocabularyOrder) {
    ScanResult r = scan(
        "& && &&& @ ! : , / . = == === *> >= > (* { [ <= ( << <<< < - % ~& != !== ~| -: | || => + # ** +: ? *) } ] ) "
        ">> >>> ; * ~ -> ~^ ^");
    Types expected;
    for (int t = T::AMPERSAND; t <= T::CARET; ++t) expected.push_back(t);
    EXPECT_EQ(r.types(), expected);

    r = scan("a^~b @(*) a<=b");
    EXPECT_EQ(r.types(), (Types{T::IDENTIFIER, T::XNOR, T::IDENTIFIER, T::AT, T::ATTR_OPEN, T::RPAREN, T::IDENTIFIER,
                                T::LE, T::IDENTIFIER}));
}

TEST_F(ScannerTokens, InvalidCharactersInPrintableForm) {
    static const char bytes[] = "` ' $ \x80 \xff \x01 \x7f \0 ~";
    ScanResult r = scan(std::string(bytes, sizeof bytes - 1));
    EXPECT_EQ(r.types(), (Types{0, 0, 0, 0, 0, 0, 0, 0, T::TILDE}));
    Strings texts;
    for (size_t i = 0; i + 1 < r.tokens.size(); ++i) texts.push_back(r.tokens[i].text);
    EXPECT_EQ(texts, (Strings{"`", "'", "$", "\\200", "\\377", "\\001", "\\177", "\\000", "~"}));
}

TEST_F(ScannerTokens, EdgeListsScanEdgePairs) {
    ScanResult r = scan("$setup(edge [01, 0x, 10, 1X, x0, z1, 0z] d, clk); x0");
    EXPECT_EQ(r.types(),
              (Types{T::S_SETUP, T::LPAREN, T::K_EDGE, T::LBRACKET, T::EDGE_01, T::COMMA, T::EDGE_0X, T::COMMA, T::EDGE_10,
                     T::COMMA, T::EDGE_1X, T::COMMA, T::EDGE_X0, T::COMMA, T::EDGE_X1, T::COMMA, T::EDGE_0X, T::RBRACKET,
                     T::IDENTIFIER, T::COMMA, T::IDENTIFIER, T::RPAREN, T::SEMI, T::IDENTIFIER}));
}

TEST_F(ScannerTokens, UdpTablesScanTableSymbols) {
    ScanResult r = scan(
        "table\n"
        "  0 1 : 1 ; // comment\n"
        "  x X ? b B - ( ) * r R f F p P n N : ;\n"
        "endtable 0 x");
    EXPECT_EQ(r.types(),
              (Types{T::K_TABLE, T::UDP_0, T::UDP_1, T::COLON, T::UDP_1, T::SEMI, T::UDP_X, T::UDP_X, T::QUESTION,
                     T::UDP_B, T::UDP_B, T::MINUS, T::LPAREN, T::RPAREN, T::STAR, T::UDP_R, T::UDP_R, T::UDP_F, T::UDP_F,
                     T::UDP_P, T::UDP_P, T::UDP_N, T::UDP_N, T::COLON, T::SEMI, T::K_ENDTABLE, T::INTEGER,
                     T::IDENTIFIER}));
    // Anything else inside a table is an invalid character.
    r = scan("table 0 g endtable");
    EXPECT_EQ(r.types(), (Types{T::K_TABLE, T::UDP_0, 0, T::K_ENDTABLE}));
}

TEST_F(ScannerTokens, PositionsAreLineAndColumnAfterTheToken) {
    ScanResult r = scan("module m;\n\t wire  w;\r\n/* a\nb */ x // y\nz");
    ASSERT_EQ(r.tokens.size(), 9u);
    auto at = [&](size_t i) { return std::to_string(r.tokens[i].line) + ":" + std::to_string(r.tokens[i].column); };
    EXPECT_EQ(at(0), "1:7");   // module
    EXPECT_EQ(at(2), "1:10");  // ;
    EXPECT_EQ(at(3), "2:7");   // wire (tab and blank count one each)
    EXPECT_EQ(at(5), "2:11");  // ;
    EXPECT_EQ(at(6), "4:7");   // x after a two-line comment
    EXPECT_EQ(at(7), "5:2");   // z
    EXPECT_EQ(r.tokens[8].type, T::EOF_);
    EXPECT_EQ(r.tokens[8].text, "EOF");
    EXPECT_EQ(r.tokens[8].file, dir / "t.v");
}

TEST(ScannerTokenObjects, StringFormAndPooledStorage) {
    std::string text = "w";
    Tn_VerilogToken* t = new Tn_VerilogToken(T::IDENTIFIER, text, Tn_RCString::create("a.v"), 3, 9);
    EXPECT_EQ(t->toString(), "[\"w\",<220>,<a.v>,<3>,<9>]");
    EXPECT_EQ(t->getFilename(), "a.v");
    t->setFilename("b.v");
    EXPECT_EQ(t->getFilename(), "b.v");
    const size_t before = Tn_VerilogToken::pooled();
    delete t;
#if !defined(__SANITIZE_ADDRESS__)
    EXPECT_EQ(Tn_VerilogToken::pooled(), before + 1);
    Tn_VerilogToken* again = new Tn_VerilogToken(T::INTEGER, text, Tn_RCStringPtr(), 1, 2);
    EXPECT_EQ(Tn_VerilogToken::pooled(), before);
    EXPECT_EQ(again->getFilename(), "");
    delete again;
#else
    (void)before;
#endif
}

TEST(ScannerFilter, MetaCommentsBecomeHiddenTokensOfTheirNeighbours) {
    CaptureSink sink;
    TempDir dir;
    Tn_VerilogCompiler driver;
    const std::string file = dir.write("t.v", "// synopsys one\na // synopsys two\n/* synopsys three */ b c");
    ASSERT_TRUE(driver.scanSources({"tarn", file.c_str(), "+pls_client"}));
    Tn_VerilogTokenStreamFilter filter(driver.lexer());
    antlr::RefToken a = filter.nextToken();
    antlr::RefToken b = filter.nextToken();
    antlr::RefToken c = filter.nextToken();
    EXPECT_EQ(a->getText() + b->getText() + c->getText(), "abc");
    EXPECT_EQ(filter.nextToken()->getType(), T::EOF_);
    EXPECT_EQ(filter.nextToken()->getType(), T::EOF_);

    auto hidden = [](antlr::RefToken t) { return static_cast<antlr::CommonHiddenStreamToken*>(t.get()); };
    ASSERT_TRUE(filter.initialHiddenToken());
    EXPECT_EQ(filter.initialHiddenToken()->getText(), " synopsys one");
    EXPECT_EQ(hidden(a)->getHiddenBefore().get(), filter.initialHiddenToken().get());
    antlr::RefToken two = hidden(a)->getHiddenAfter();
    ASSERT_TRUE(two);
    EXPECT_EQ(two->getType(), T::METACOMMENT);
    EXPECT_EQ(two->getText(), " synopsys two");
    antlr::RefToken three = hidden(two)->getHiddenAfter();
    ASSERT_TRUE(three);
    EXPECT_EQ(three->getText(), " synopsys three ");
    EXPECT_EQ(hidden(three)->getHiddenBefore().get(), two.get());
    EXPECT_FALSE(hidden(two)->getHiddenBefore());  // hidden tokens do not point at visible ones
    EXPECT_EQ(hidden(b)->getHiddenBefore().get(), three.get());
    EXPECT_FALSE(hidden(c)->getHiddenBefore());
}

TEST(ScannerFilter, AScannerErrorComesAfterTheTokensBeforeIt) {
    CaptureSink sink;
    TempDir dir;
    Tn_VerilogCompiler driver;
    const std::string file = dir.write("t.v", "a b\n`else\n");
    ASSERT_TRUE(driver.scanSources({"tarn", file.c_str()}));
    Tn_VerilogTokenStreamFilter filter(driver.lexer());
    EXPECT_EQ(filter.nextToken()->getText(), "a");
    EXPECT_EQ(filter.nextToken()->getText(), "b");
    EXPECT_THROW(filter.nextToken(), antlr::TokenStreamRecognitionException);
    EXPECT_EQ(filter.nextToken()->getType(), T::EOF_);
    // Started again, the filter reads the new stream from its beginning.
    ASSERT_TRUE(driver.scanSources({"tarn", dir.write("u.v", "x").c_str()}));
    filter.reset();
    EXPECT_EQ(filter.nextToken()->getText(), "x");
    EXPECT_EQ(filter.nextToken()->getType(), T::EOF_);
}

}  // namespace
