#include "tests/support/checkfixture.h"

Texts CheckFixture::errorsOf(const std::string& e, Tn_VerilogScope* scope, Tn_Verilog::ValueType use) {
    sink.clear();
    checked = b.expr(e)->typeAs(b.context(scope ? scope : m), use);
    return sink.errors();
}

void CheckFixture::expectMessages(const std::vector<MessageCase>& cases, Tn_VerilogScope* scope) {
    for (const MessageCase& c : cases) {
        Texts expected;
        if (!c.message.empty()) expected.push_back(c.message);
        EXPECT_EQ(errorsOf(c.expr, scope, c.use), expected) << c.expr << " as " << Tn_Verilog::ValueTypeInfo.name(c.use);
        EXPECT_EQ(checked->isError(), !c.message.empty()) << c.expr << " checks to " << checked->text().str();
    }
}
