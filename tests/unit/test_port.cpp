// The portability layer: strings, the tokenizer, messages and their counts.
#include <gtest/gtest.h>

#include "port/port_exception.h"
#include "port/port_file.h"
#include "port/ut_str.h"
#include "tests/support/capturesink.h"
#include "tests/support/testfiles.h"
#include "util/tn_message.h"

namespace {

std::vector<std::string> pieces(const char* text, int parseType) {
    Port_String s(text), piece;
    std::vector<std::string> r;
    int pos = 0;
    while (s.NextToken("+", pos, piece, parseType)) r.push_back(piece.str());
    return r;
}

}  // namespace

TEST(PortString, TokenizerDropsEmptyPiecesForBothParseTypes) {
    typedef std::vector<std::string> V;
    EXPECT_EQ(pieces("incdir+a++b+", Port::PARSE_TRIMMED), (V{"incdir", "a", "b"}));
    EXPECT_EQ(pieces("++a", Port::PARSE_VERBATIM), (V{"a"}));
    EXPECT_EQ(pieces("+++", Port::PARSE_VERBATIM), V{});
    EXPECT_EQ(pieces("", Port::PARSE_TRIMMED), V{});
    // Only the trimmed type strips blanks around pieces.
    EXPECT_EQ(pieces(" a + b ", Port::PARSE_TRIMMED), (V{"a", "b"}));
    EXPECT_EQ(pieces(" a + b ", Port::PARSE_VERBATIM), (V{" a ", " b "}));
    EXPECT_EQ(pieces("x+  +y", Port::PARSE_TRIMMED), (V{"x", "y"}));
}

TEST(PortString, SearchCompareAndEdit) {
    Port_String s("tarn+dump=vpi");
    EXPECT_EQ(s.GetIndexOfString("tarn+dump=", Port::COMPARE_EXACT), 0);
    EXPECT_EQ(s.GetIndexOfString("dump"), 5);
    EXPECT_EQ(s.GetIndexOfString("DUMP"), -1);
    EXPECT_EQ(s.GetIndexOfString("DUMP", Port::COMPARE_NOCASE), 5);
    EXPECT_EQ(s.GetIndexOfString("x", 0, 99), -1);
    EXPECT_EQ(s.GetIndexOfFirstChar("=+"), 4);
    EXPECT_EQ(s.GetIndexOfFirstChar("#"), -1);
    EXPECT_EQ(Port_String("abc").Compare("abd"), -1);
    EXPECT_EQ(Port_String("ABC").Compare("abc", Port::COMPARE_NOCASE), 0);
    EXPECT_EQ(Port_String("ab").Compare("abc"), -1);
    EXPECT_EQ(s.Extract(10).str(), "vpi");
    EXPECT_EQ(s.Extract(5, 4).str(), "dump");
    EXPECT_EQ(s.Extract(100).str(), "");
    Port_String t("++x//");
    t.Trim("+", Port::TRIM_LEFT);
    EXPECT_EQ(t.str(), "x//");
    t.Trim("/", Port::TRIM_RIGHT);
    EXPECT_EQ(t.str(), "x");
    Port_String all("----");
    all.Trim("-", Port::TRIM_BOTH);
    EXPECT_TRUE(all.IsEmpty());
    Port_String u("MiXed");
    EXPECT_EQ(u.MakeLower().str(), "mixed");
    EXPECT_EQ(u.MakeUpper().str(), "MIXED");
    u.Remove(1, 2);
    EXPECT_EQ(u.str(), "MED");
    u.SetChar(0, 'R');
    u.SetChar(50, 'Z');  // out of range: ignored
    EXPECT_EQ(u.str(), "RED");
    u.SetLength(1);
    EXPECT_EQ(u.str(), "R");
}

TEST(PortString, FormatAndNumbers) {
    Port_String s;
    s.Format("%s line %d ", "a.v", 7);
    EXPECT_EQ(s.str(), "a.v line 7 ");
    const std::string longText(1000, 'q');
    EXPECT_EQ(Port_String::doFormat("<%s>", longText.c_str()).GetLength(), 1002);
    EXPECT_EQ(Port_String("123abc").GetINT32(), 123);
    EXPECT_EQ(Port_String("-42").GetINT32(), -42);
    EXPECT_EQ(Port_String("abc").GetINT32(), 0);
    EXPECT_EQ(Port_String("ff").GetINT32(16), 255);
    // Wraps rather than trapping on overflow.
    EXPECT_EQ(Port_String("4294967297").GetINT32(), 1);
    const char* end = nullptr;
    EXPECT_EQ(UT_STR::StrToUINT32("  1f+", &end, 16), 31u);
    EXPECT_EQ(*end, '+');
    EXPECT_EQ(UT_STR::StrToINT32("-12x", &end, 10), -12);
    EXPECT_EQ(UT_STR::StrToUINT64("18446744073709551615", nullptr, 10), ~0ull);
    EXPECT_DOUBLE_EQ(UT_STR::StrToD("2.5e3", &end), 2500.0);
}

TEST(PortMessages, SinkReceivesLevelFacilitySourceAndText) {
    CaptureSink sink;
    const int errors = Port_MsgDispatcher::getErrCount(false);
    const int warnings = Port_MsgDispatcher::getWarnCount(false);
    TN_MSG().issueError("bad %d\n", 1);
    TN_MSG().issueWarning("careful\n");
    TN_MSG().issueStatus("reading\n");
    TN_MSG().issueInternal("broken\n");
    ASSERT_EQ(sink.messages.size(), 4u);
    EXPECT_EQ(sink.messages[0].level, PORT_MSG_ERROR);
    EXPECT_EQ(sink.messages[0].facility, "ZORIveravaro");
    EXPECT_EQ(sink.messages[0].file, "tests/unit/test_port");
    EXPECT_GT(sink.messages[0].line, 0);
    EXPECT_EQ(sink.messages[0].text, "bad 1\n");
    EXPECT_EQ(sink.messages[1].level, PORT_MSG_WARNING);
    EXPECT_EQ(sink.messages[2].level, PORT_MSG_STATUS);
    EXPECT_EQ(sink.messages[3].level, PORT_MSG_INTERNAL);
    // Internal errors are errors; status messages count nowhere.
    EXPECT_EQ(Port_MsgDispatcher::getErrCount(false) - errors, 2);
    EXPECT_EQ(Port_MsgDispatcher::getWarnCount(false) - warnings, 1);
}

TEST(PortMessages, DefaultSinkPrefixesLevelOnStandardError) {
    testing::internal::CaptureStderr();
    TN_MSG().issueError("one\n");
    TN_MSG().issueWarning("two");  // a missing newline is supplied
    TN_MSG().issueStatus("three\n");
    EXPECT_EQ(testing::internal::GetCapturedStderr(), "Error: one\nWarning: two\nthree\n");
}

TEST(PortException, ReportsItsTextAsAnErrorFromWhereItWasRaised) {
    CaptureSink sink;
    Port::Exception e("bin/tn_binlibrary", "$Revision: 1 $", 12);
    e.setDescription("Cannot open '%s'\n", "x.bin");
    EXPECT_EQ(e.getLocalized().str(), "Cannot open 'x.bin'\n");
    e.report();
    ASSERT_EQ(sink.errors(), std::vector<std::string>{"Cannot open 'x.bin'\n"});
    EXPECT_EQ(sink.messages[0].file, "bin/tn_binlibrary");
    EXPECT_EQ(sink.messages[0].line, 12);
}

TEST(PortFile, ExistenceAndStreams) {
    TempDir dir;
    const std::string f = dir.write("a.txt", "hello");
    EXPECT_TRUE(Port::File::isfile(f.c_str()));
    EXPECT_FALSE(Port::File::isdir(f.c_str()));
    EXPECT_TRUE(Port::File::isdir(dir.path().c_str()));
    EXPECT_FALSE(Port::File::isfile(dir.path().c_str()));
    EXPECT_FALSE(Port::File::isfile(""));
    EXPECT_FALSE(Port::File::isfile((dir / "missing").c_str()));
    EXPECT_EQ(Port::File::open((dir / "missing").c_str(), Port::File::READ), nullptr);
    EXPECT_EQ(Port::File::open(dir.path().c_str(), Port::File::READ), nullptr);  // a directory never opens
    EXPECT_GT(Port::File::getdatetime(f.c_str()), 0);
    EXPECT_TRUE(Port::File::mkdir((dir / "sub").c_str()));
    EXPECT_TRUE(Port::File::mkdir((dir / "sub").c_str()));  // already there
    EXPECT_FALSE(Port::File::mkdir((dir / "no/such/parent").c_str()));

    Port::Stream* w = Port::File::open((dir / "out.txt").c_str(), Port::File::WRITE);
    ASSERT_NE(w, nullptr);
    *w << "n=" << int32_t(-5) << ' ' << int16_t(7);
    Port::File::close(w);
    EXPECT_EQ(readFile(dir / "out.txt"), "n=-5 7");
}
