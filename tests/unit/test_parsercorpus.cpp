// The parser corpus itself: the manifest reads and every faulty variant
// applies to its clean file.
#include <gtest/gtest.h>

#include "tests/support/parsercorpus.h"

TEST(ParserCorpus, ManifestNamesFilesThatExist) {
    const std::vector<CorpusCase> cases = readParserCorpus();
    ASSERT_GE(cases.size(), 30u);
    TempDir dir;
    materializeParserCorpus(dir);
    for (const CorpusCase& c : cases) {
        SCOPED_TRACE(c.name);
        EXPECT_FALSE(c.files.empty());
        EXPECT_TRUE(c.mode == "2001" || c.mode == "1995");
        EXPECT_EQ(c.faultLevels.size(), c.faultMessages.size());
        for (const std::string& f : c.faultFiles) EXPECT_FALSE(readFile(dir / f).empty()) << f;
    }
}

TEST(ParserCorpus, UnifiedDiffsApplyLikePatch) {
    const std::string original = "a\nb\nc\nd\ne\nf\n";
    const std::string diff =
        "--- clean/x.v\n+++ faulty/x-y.v\n@@ -2,3 +2,3 @@\n b\n-c\n+C\n+CC\n d\n@@ -6 +7,0 @@\n-f\n";
    EXPECT_EQ(applyUnifiedDiff(original, diff), "a\nb\nC\nCC\nd\ne\n");
    EXPECT_THROW(applyUnifiedDiff("a\nz\n", diff), std::runtime_error);
}
