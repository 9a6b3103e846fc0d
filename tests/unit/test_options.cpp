// Command-line options and -f option files.
#include <gtest/gtest.h>

#include "src/tn_optionstream.h"
#include "src/tn_verilogoptions.h"
#include "tests/support/capturesink.h"
#include "tests/support/testfiles.h"

namespace {

typedef std::vector<std::string> Strings;

Strings strings(const Tn_StringList& l) {
    Strings r;
    for (const Port_String& s : l) r.push_back(s.str());
    return r;
}

class Options : public testing::Test {
protected:
    // Parses tarn followed by args; returns the parse's own count.
    int parse(const Strings& args) {
        Tn_StringList l{Port_String("tarn")};
        for (const std::string& a : args) l.push_back(Port_String(a));
        return opts.parse(l);
    }

    CaptureSink sink;
    TempDir dir;
    Tn_VerilogOptions opts;
};

}  // namespace

TEST_F(Options, DefaultsAreReappliedOnEveryParse) {
    const std::string v = dir.write("a.v", "module a; endmodule\n");
    EXPECT_EQ(parse({"-95", "-work", "lib", "-norecursive", "-compact", "+maxdelays", "-top", "a", v, "+foo"}), 0);
    EXPECT_EQ(opts.verilog2001(), 0);
    EXPECT_EQ(opts.workLibrary().str(), "lib");
    EXPECT_FALSE(opts.recursive());
    EXPECT_TRUE(opts.compact());
    EXPECT_EQ(opts.delaySelection(), 2);
    EXPECT_EQ(strings(opts.sourceFiles()), Strings{v});
    EXPECT_EQ(opts.programName().str(), "tarn");

    EXPECT_EQ(parse({}), 0);
    EXPECT_EQ(opts.verilog2001(), 1);
    EXPECT_EQ(opts.workLibrary().str(), "work");
    EXPECT_TRUE(opts.recursive());
    EXPECT_FALSE(opts.compact());
    EXPECT_EQ(opts.delaySelection(), 1);
    EXPECT_EQ(opts.iterationLimit(), 1024);
    EXPECT_EQ(opts.recursionLimit(), 1024);
    EXPECT_EQ(opts.timestamp(), 0);
    EXPECT_TRUE(opts.strictPreprocessing());
    EXPECT_TRUE(opts.sourceFiles().empty());
    EXPECT_TRUE(opts.topUnits().empty());
    EXPECT_TRUE(opts.plusArgs().empty());
    EXPECT_TRUE(sink.messages.empty());
}

TEST_F(Options, EmptyArgumentListHasAnEmptyProgramName) {
    EXPECT_EQ(opts.parse(Tn_StringList()), 0);
    EXPECT_EQ(opts.programName().str(), "");
}

TEST_F(Options, ParameterOverrideForms) {
    parse({"-Gwidth=8", "-G", "width=8", "-G8", "-Ga=b=c", "--Gx=", "-G"});
    const auto& o = opts.paramOverrides();
    ASSERT_EQ(o.size(), 6u);
    EXPECT_EQ(o[0].first.str(), "width");
    EXPECT_EQ(o[0].second.str(), "8");
    EXPECT_EQ(o[1].first.str(), "width");
    EXPECT_EQ(o[1].second.str(), "8");
    EXPECT_EQ(o[2].first.str(), "");
    EXPECT_EQ(o[2].second.str(), "8");
    EXPECT_EQ(o[3].first.str(), "a");
    EXPECT_EQ(o[3].second.str(), "b=c");
    EXPECT_EQ(o[4].first.str(), "x");
    EXPECT_EQ(o[4].second.str(), "");
    EXPECT_EQ(o[5].first.str(), "");  // -G with nothing after it
    EXPECT_EQ(o[5].second.str(), "");
    EXPECT_TRUE(sink.messages.empty());
}

TEST_F(Options, PlusArgumentsDefinesIncdirsAndLibext) {
    const std::string inc = dir.mkdir("inc");
    dir.mkdir("inc2");
    parse({"+define+A=1+B", "+incdir+" + inc + "/", "+incdir+" + dir.path() + "/inc2//+" + dir.path() + "/nope",
           "+libext+.v+.vh+", "++tarn+dump=vpi", "+tarn+memoryreport", "+", "+++", "+pls_client", "+mindelays"});
    EXPECT_EQ(strings(opts.macroDefinitions()), (Strings{"A=1", "B"}));
    EXPECT_EQ(strings(opts.includeDirectories()), (Strings{inc, dir.path() + "/inc2"}));
    EXPECT_EQ(strings(opts.libraryExtensions()), (Strings{".v", ".vh"}));
    EXPECT_EQ(strings(opts.plusArgs()), (Strings{"tarn+dump=vpi", "tarn+memoryreport", "pls_client"}));
    EXPECT_EQ(opts.delaySelection(), 0);
    EXPECT_EQ(sink.warnings(), Strings{"Include directory " + dir.path() + "/nope does not exist\n"});
    EXPECT_EQ(sink.count(PORT_MSG_ERROR), 0u);

    EXPECT_TRUE(opts.hasPlusArg("tarn+dump="));
    EXPECT_EQ(opts.plusArgValue("tarn+dump=").str(), "vpi");
    EXPECT_TRUE(opts.hasPlusArg("tarn+memory"));
    EXPECT_TRUE(opts.hasPlusArg(""));
    EXPECT_FALSE(opts.hasPlusArg("dump"));  // a prefix, not a substring
    EXPECT_EQ(opts.plusArgValue("tarn+").str(), "dump=vpi");  // the first match wins
    EXPECT_EQ(opts.plusArgValue("nothing").str(), "");
}

TEST_F(Options, DashOptionsAndTheirMessages) {
    const std::string lib = dir.mkdir("lib");
    const std::string cells = dir.write("cells.v", "");
    EXPECT_EQ(parse({"--top", "x", "-top", "y", "-top", "x", "-y", lib + "/", "-v", cells, "-y", dir / "nolib", "-v",
                     dir / "nocells.v", "-L", "ieee", "-ini", "my.ini", "-root", "r", "-timestamp", "12abc",
                     "-iteration_limit", "x", "-recursion_limit", "-5", "-bogus", "-", "missing.v"}),
              4);
    EXPECT_EQ(strings(opts.topUnits()), (Strings{"x", "y"}));
    EXPECT_EQ(strings(opts.librarySearchList()), (Strings{"dir:" + lib, "file:" + cells}));
    EXPECT_EQ(strings(opts.searchLibraries()), Strings{"ieee"});
    EXPECT_EQ(opts.iniFile().str(), "my.ini");
    EXPECT_EQ(opts.rootDirectory().str(), "r");
    EXPECT_EQ(opts.timestamp(), 12);
    EXPECT_EQ(opts.iterationLimit(), 0);
    EXPECT_EQ(opts.recursionLimit(), -5);
    EXPECT_EQ(sink.errors(), (Strings{"Top level design unit x specified more than once\n",
                                      "Unrecognized option 'bogus'\n", "Unrecognized option ''\n",
                                      "Source file missing.v does not exist\n"}));
    EXPECT_EQ(sink.warnings(), (Strings{"Library directory " + dir.path() + "/nolib does not exist\n",
                                        "Library file " + dir.path() + "/nocells.v does not exist\n"}));
}

TEST_F(Options, MissingSourceFilesAreErrors) {
    EXPECT_EQ(parse({"missing.v", dir.path()}), 2);
    EXPECT_EQ(sink.errors(), (Strings{"Source file missing.v does not exist\n",
                                      "Source file " + dir.path() + " does not exist\n"}));
    EXPECT_TRUE(opts.sourceFiles().empty());
}

TEST_F(Options, TopAsTheLastArgumentAddsAnEmptyName) {
    parse({"-top"});
    EXPECT_EQ(strings(opts.topUnits()), Strings{""});
}

TEST_F(Options, Verilog2001Values) {
    for (const char* yes : {"y", "Y", "ye", "yES", "YeS"}) {
        parse({"-95", "-verilog2001", yes});
        EXPECT_EQ(opts.verilog2001(), 1) << yes;
    }
    for (const char* no : {"on", "no", "yess", "", "1"}) {
        parse({"-verilog2001", no});
        EXPECT_EQ(opts.verilog2001(), 0) << no;
    }
    parse({"-1995", "-2001"});
    EXPECT_EQ(opts.verilog2001(), 1);
}

TEST_F(Options, HelpPrintsTheUsageAndTheRunGoesOn) {
    EXPECT_EQ(parse({"-h", "-?", "-top", "t"}), 2);
    EXPECT_EQ(strings(opts.topUnits()), Strings{"t"});
    const Strings lines = sink.statuses();
    ASSERT_EQ(lines.size(), 2u * 24u);
    EXPECT_EQ(lines[0], "\n");
    EXPECT_EQ(lines[1], "Usage: tarn [-?|h|help]\n");
    EXPECT_EQ(lines[2], "          [-verilog2001 yes|no]\n");
    EXPECT_EQ(lines[13], "          [-[no]recursive\n");
    EXPECT_EQ(lines[22], "          <file> {<file>}\n");
    EXPECT_EQ(lines[23], "\n");
    EXPECT_EQ(sink.count(PORT_MSG_ERROR), 0u);
}

TEST_F(Options, CopiesAreDeep) {
    parse({"-top", "a"});
    Tn_VerilogOptions copy(opts);
    parse({"-top", "b"});
    EXPECT_EQ(strings(copy.topUnits()), Strings{"a"});
    copy = opts;
    EXPECT_EQ(strings(copy.topUnits()), Strings{"b"});
}

TEST_F(Options, OptionFilesSpliceInPlaceWithQuotesAndComments) {
    const std::string v = dir.write("my top.v", "");
    const std::string inner = dir.write("inner.f", "-top inner # comment\n-G 'w=1 2' -G'x y'\n");
    const std::string outer =
        dir.write("outer.f", "-top 'my top' // comment here\n\"" + v + "\"\n-f " + inner + "\n-top a#b\n'' -top last\n");
    parse({"-top", "first", "-f", outer, "-top", "after"});
    EXPECT_EQ(strings(opts.topUnits()), (Strings{"first", "my top", "inner", "a#b", "last", "after"}));
    EXPECT_EQ(strings(opts.sourceFiles()), Strings{v});
    ASSERT_EQ(opts.paramOverrides().size(), 2u);
    EXPECT_EQ(opts.paramOverrides()[0].second.str(), "1 2");
    // Quotes count only at the start of a token.
    EXPECT_EQ(opts.paramOverrides()[1].second.str(), "'x");
    // y' and the empty quoted token are arguments of their own: missing source files.
    EXPECT_EQ(sink.errors(), (Strings{"Source file y' does not exist\n", "Source file  does not exist\n"}));
}

TEST_F(Options, OptionFileLinesMayEndInCarriageReturns) {
    const std::string f = dir.write("crlf.f", "-top a\r\n-top 'b c'\r\n-work w\r\n-top d");
    parse({"-f", f});
    EXPECT_EQ(strings(opts.topUnits()), (Strings{"a", "b c", "d"}));
    EXPECT_EQ(opts.workLibrary().str(), "w");
    EXPECT_TRUE(sink.messages.empty());
}

TEST_F(Options, RecursiveOptionFilesAreReportedAndReadingGoesOn) {
    const std::string a = dir / "a.f";
    dir.write("a.f", "-top x\n-f " + a + "\n-top y\n");
    EXPECT_EQ(parse({"-f", a}), 1);
    EXPECT_EQ(sink.errors(), Strings{"Recursive specification of -f option file '" + a + "'\n"});
    EXPECT_EQ(strings(opts.topUnits()), (Strings{"x", "y"}));

    // Indirect recursion through a second file; the same file twice in a row is fine.
    sink.clear();
    const std::string b = dir / "b.f", c = dir / "c.f";
    dir.write("b.f", "-f " + c + "\n");
    dir.write("c.f", "-f " + b + "\n-top c\n");
    dir.write("d.f", "-L l\n");
    EXPECT_EQ(parse({"-f", b, "-f", dir / "d.f", "-f", dir / "d.f"}), 1);
    EXPECT_EQ(sink.errors(), Strings{"Recursive specification of -f option file '" + b + "'\n"});
    EXPECT_EQ(strings(opts.topUnits()), Strings{"c"});
    EXPECT_EQ(strings(opts.searchLibraries()), (Strings{"l", "l"}));
}

TEST_F(Options, MissingOptionFilesAreErrors) {
    const std::string nested = dir.write("n.f", "-f " + dir / "gone.f" + "\n-top n\n");
    EXPECT_EQ(parse({"-f", dir / "none.f", "-f", nested, "-top", "t"}), 2);
    EXPECT_EQ(sink.errors(), (Strings{"Could not open -f option file '" + dir / "none.f" + "'\n",
                                      "Could not open -f option file '" + dir / "gone.f" + "'\n"}));
    EXPECT_EQ(strings(opts.topUnits()), (Strings{"n", "t"}));
}

TEST_F(Options, DeeplyNestedOptionFiles) {
    const int depth = 200;
    for (int i = 0; i < depth; ++i)
        dir.write("f" + std::to_string(i) + ".f",
                  "-L l" + std::to_string(i) + "\n" +
                      (i + 1 < depth ? "-f " + dir / ("f" + std::to_string(i + 1) + ".f") + "\n" : std::string()));
    parse({"-f", dir / "f0.f", "-L", "end"});
    ASSERT_EQ(opts.searchLibraries().size(), size_t(depth + 1));
    EXPECT_EQ(opts.searchLibraries()[depth - 1].str(), "l" + std::to_string(depth - 1));
    EXPECT_EQ(opts.searchLibraries().back().str(), "end");
    EXPECT_TRUE(sink.messages.empty());
}

TEST(OptionStream, TokenizeLine) {
    std::deque<Port_String> out;
    Tn_OptionStream::tokenizeLine("a 'b c' \"d e\" f//g h", out);
    Tn_OptionStream::tokenizeLine("\t x\t#y", out);
    Tn_OptionStream::tokenizeLine("'unterminated z", out);
    std::vector<std::string> got;
    for (const auto& s : out) got.push_back(s.str());
    EXPECT_EQ(got, (std::vector<std::string>{"a", "b c", "d e", "f//g", "h", "x", "'unterminated", "z"}));
}

TEST(OptionStream, EndOfTokensGivesEmptyStrings) {
    Tn_OptionStream ts(Tn_StringList{Port_String("only")});
    EXPECT_TRUE(ts.moreTokens());
    EXPECT_EQ(ts.nextToken().str(), "only");
    EXPECT_FALSE(ts.moreTokens());
    EXPECT_EQ(ts.nextToken().str(), "");
}
