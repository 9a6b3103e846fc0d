// Real designs and the parser corpus through the scanner: clean sources scan
// without a message; the faults the scanner is responsible for are reported
// exactly as the corpus expects.
#include <gtest/gtest.h>

#include "tests/support/capturesink.h"
#include "tests/support/parsercorpus.h"
#include "tests/support/scan.h"

namespace {

// The shared corpus of real designs scans without a message of any kind.
TEST(ScannerCorpus, EveryDesignScansCleanly) {
    std::vector<SharedDesign> designs;
    if (!readSharedDesigns(designs)) GTEST_SKIP() << "the shared design corpus is not at " << sharedCorpusDir();
    for (const SharedDesign& d : designs) {
        CaptureSink sink;
        ScanResult r = scanArgs(d.args);
        EXPECT_FALSE(r.failed) << d.name << ": " << r.errorFile << ":" << r.errorLine << " " << r.error;
        EXPECT_EQ(sink.count(PORT_MSG_ERROR) + sink.count(PORT_MSG_WARNING), 0u) << d.name;
        EXPECT_GT(r.tokens.size(), 1000u) << d.name;
    }
    EXPECT_GE(designs.size(), 13u);
}

// Texts of the messages that come from the scanner (the rest of the corpus
// faults belong to the parser).
bool isScannerMessage(const std::string& m) {
    static const char* const texts[] = {"Macro reference `",
                                        "Invalid number of arguments passed to macro reference",
                                        "Could not find verilog include",
                                        "Illegal use of `",
                                        "Illegal `",
                                        "Attempt to redefine macro",
                                        "Attempt to undefine macro",
                                        "redefined",
                                        "Cannot redefine `",
                                        "Illegal digit(s)",
                                        "Invalid `",
                                        "Verilog-XL specific",
                                        "End of source reached",
                                        "Unterminated",
                                        "is a compiler directive in Verilog-2001",
                                        "Closing quote missing",
                                        "reserved word in Verilog-2001"};
    for (const char* t : texts)
        if (m.find(t) != std::string::npos) return true;
    return false;
}

class ParserCorpusScan : public ParserCorpusTest {
protected:
    // The scanner's errors and warnings for a file list, then its error.
    std::vector<std::string> messages(const CorpusCase& c, const std::vector<std::string>& files) {
        CaptureSink sink;
        ScanResult r = scanArgs(c.args(files));
        std::vector<std::string> out;
        for (const CaptureSink::Message& m : sink.messages)
            if (m.level != PORT_MSG_STATUS) out.push_back(m.text.substr(0, m.text.size() - 1));
        if (r.failed) out.push_back("\"" + r.errorFile + "\" line " + std::to_string(r.errorLine) + " " + r.error);
        return out;
    }

};

TEST_F(ParserCorpusScan, CleanCompilationsScanWithoutMessages) {
    for (const CorpusCase& c : readParserCompilations())
        EXPECT_EQ(messages(c, c.files), std::vector<std::string>{}) << c.compilation();
}

TEST_F(ParserCorpusScan, ScannerFaultsAreReportedAsExpected) {
    int checked = 0;
    for (const CorpusCase& c : readParserCorpus()) {
        bool scanner = !c.faultMessages.empty();
        for (const std::string& m : c.faultMessages) scanner = scanner && isScannerMessage(m);
        if (!scanner) continue;
        EXPECT_EQ(messages(c, c.faultFiles), c.faultMessages) << c.name;
        ++checked;
    }
    EXPECT_GE(checked, 15);
}

}  // namespace
