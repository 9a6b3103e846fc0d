// Constant evaluation against Icarus Verilog. tests/data/eval/expected.tsv
// holds generated expressions with the value iverilog -g2001 computes; where
// Tarn's rules differ on purpose, Tarn's value and the class of difference
// follow (see crosscheck.py there). Every expression must give the value
// Tarn is expected to give.
#include <gtest/gtest.h>

#include <cstdlib>
#include <fstream>
#include <map>

#include "tests/support/checkfixture.h"
#include "tests/support/testfiles.h"

TEST(EvalCrossCheck, AgreesWithIcarusVerilogWhereTheRulesAgree) {
    std::ifstream in(TARN_TEST_DATA "/eval/expected.tsv");
    ASSERT_TRUE(in) << "missing tests/data/eval/expected.tsv";
    // TARN_EVAL_RECORD=file writes what Tarn computes, for crosscheck.py classify.
    const char* record = std::getenv("TARN_EVAL_RECORD");
    std::ofstream out;
    if (record) out.open(record);
    CaptureSink sink;
    DesignBuilder b;
    Tn_VerilogElabContext& ctx = b.context(b.root());
    std::map<std::string, int> classes;
    int count = 0, agree = 0;
    std::string line;
    while (std::getline(in, line)) {
        const std::vector<std::string> f = split(line, '\t');
        ASSERT_TRUE(f.size() == 2 || f.size() == 4) << line;
        ++count;
        Tn_VerilogExpression* e = b.expr(f[0]);
        EXPECT_FALSE(e->typeAs(ctx, Tn_Verilog::Value)->isError()) << f[0];
        const std::string got = Tn_VerilogValue::evalText(e->value()).str();
        if (record) out << f[0] << '\t' << got << '\n';
        const std::string& expected = f.size() == 4 ? f[2] : f[1];
        EXPECT_EQ(got, expected) << f[0] << "\n  iverilog: " << f[1];
        if (f.size() == 4) {
            EXPECT_NE(f[3], "?") << "unclassified difference: " << f[0];
            ++classes[f[3]];
        } else if (got == expected) {
            ++agree;
        }
    }
    EXPECT_GE(count, 500);
    EXPECT_TRUE(sink.errors().empty());
    std::cout << "[          ] " << count << " expressions, " << agree << " agree with iverilog";
    for (const auto& c : classes) std::cout << ", " << c.second << " " << c.first;
    std::cout << "\n";
}
