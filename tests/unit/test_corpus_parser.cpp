// The parser over the parser corpus (clean compilations without a message,
// their top-level units, every faulty variant with exactly its messages) and
// over the shared corpus of real designs.
#include <gtest/gtest.h>

#include <algorithm>

#include "tests/support/parse.h"
#include "tests/support/parsercorpus.h"

namespace {

struct Outcome {
    std::vector<std::string> levels, messages;
    std::vector<std::string> tops;
};

Outcome parseCase(const CorpusCase& c, const std::vector<std::string>& files) {
    CaptureSink sink;
    ParseResult r = parseArgs(c.args(files));
    Outcome o;
    for (const CaptureSink::Message& m : sink.messages) {
        if (m.level == PORT_MSG_STATUS) continue;
        o.levels.push_back(m.level == PORT_MSG_ERROR ? "error" : m.level == PORT_MSG_WARNING ? "warning" : "other");
        o.messages.push_back(m.text.substr(0, m.text.size() - 1));
    }
    o.tops = r.tops();
    return o;
}


TEST_F(ParserCorpusTest, CleanCompilationsParseWithoutMessagesToTheirTops) {
    int compilations = 0;
    for (const CorpusCase& c : readParserCompilations()) {
        ++compilations;
        const Outcome o = parseCase(c, c.files);
        EXPECT_EQ(o.messages, std::vector<std::string>{}) << c.compilation();
        EXPECT_EQ(o.tops, c.tops) << c.compilation();
    }
    EXPECT_GE(compilations, 30);
}

TEST_F(ParserCorpusTest, EachFaultGivesExactlyItsMessages) {
    int faults = 0;
    for (const CorpusCase& c : readParserCorpus()) {
        ++faults;
        const Outcome o = parseCase(c, c.faultFiles);
        EXPECT_EQ(o.levels, c.faultLevels) << c.name;
        ASSERT_EQ(o.messages.size(), c.faultMessages.size()) << c.name << ": " << ::testing::PrintToString(o.messages);
        for (size_t i = 0; i < o.messages.size(); ++i) {
            const std::string& expected = c.faultMessages[i];
            if (expected.compare(0, 7, "syntax@") == 0) {
                // A syntax error: its wording is the runtime's, its place is fixed.
                const size_t colon = expected.rfind(':');
                const std::string prefix =
                    "\"" + expected.substr(7, colon - 7) + "\" line " + expected.substr(colon + 1) + " ";
                EXPECT_EQ(o.messages[i].substr(0, prefix.size()), prefix) << c.name << ": " << o.messages[i];
            } else {
                EXPECT_EQ(o.messages[i], expected) << c.name;
            }
        }
    }
    EXPECT_GE(faults, 60);
}

// The shared corpus of real designs: each compiles without an error or a
// warning, and its manifest's top modules are among the top-level units.
TEST(SharedCorpus, RealDesignsParseToTheirTops) {
    std::vector<SharedDesign> designs;
    if (!readSharedDesigns(designs)) GTEST_SKIP() << "the shared design corpus is not at " << sharedCorpusDir();
    for (const SharedDesign& d : designs) {
        CaptureSink sink;
        ParseResult r = parseArgs(d.args);
        EXPECT_FALSE(r.compiled.empty()) << d.name;
        EXPECT_EQ(sink.errors(), std::vector<std::string>{}) << d.name;
        EXPECT_EQ(sink.warnings(), std::vector<std::string>{}) << d.name;
        const std::vector<std::string> found = r.tops();
        for (const std::string& top : d.tops) {
            if (std::find(found.begin(), found.end(), top) != found.end()) continue;
            // A manifest top that a chosen top instantiates (tate_pairing:
            // pairing instantiates tiny) is elaborated below that top.
            bool below = false;
            for (const std::string& t : found)
                if (Tn_VerilogModule* m = r.module(t))
                    for (Tn_VerilogModuleInstance* i : m->ModuleInstance) below = below || i->DefName.str().str() == top;
            EXPECT_TRUE(below) << d.name << ": " << top << " among " << ::testing::PrintToString(found);
        }
    }
    EXPECT_GE(designs.size(), 13u);
}

}  // namespace
