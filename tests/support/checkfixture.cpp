#include "tests/support/checkfixture.h"

std::string valueText(const Tn_VerilogValuePtr& v) {
    if (!v || v->isNull()) return "null";
    if (v->isReal()) return Port_String::doFormat("real %.17g", v->toReal()).str();
    return Port_String::doFormat("%u %s %s %s", v->width(), v->isSigned() ? "s" : "u", v->toBinaryText().c_str(),
                                 v->toDecimalText().c_str())
        .str();
}

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
