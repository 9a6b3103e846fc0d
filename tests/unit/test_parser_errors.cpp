// Syntax errors and how far parsing goes after them; nesting and tree depth
// bounds that keep any input from exhausting the stack.
#include <gtest/gtest.h>

#include "tests/support/parse.h"
#include "util/tn_ostream.h"
#include "verilog/tn_verilogparser.h"

namespace {

using namespace Tn_Verilog;

class ParserErrors : public ParseTest {
protected:
    // The one error of a parse, which must start with loc(line).
    void expectOneErrorAt(int line) {
        ASSERT_EQ(errors().size(), 1u) << ::testing::PrintToString(errors());
        EXPECT_EQ(errors()[0].substr(0, loc(line).size()), loc(line)) << errors()[0];
    }
    static std::string repeat(const std::string& s, int n) {
        std::string r;
        r.reserve(s.size() * static_cast<size_t>(n));
        for (int i = 0; i < n; ++i) r += s;
        return r;
    }
};

TEST_F(ParserErrors, ASyntaxErrorEndsTheCompilation) {
    const std::string second = dir.write("second.v", "module s; endmodule\n");
    result = parse("module a; endmodule\nmodule b;\nwire w\nwire v;\nendmodule\nmodule c; endmodule\n", {second});
    ASSERT_EQ(errors().size(), 1u);
    EXPECT_EQ(errors()[0], loc(4) + "unexpected token: wire");
    // The units before the error stay; nothing after it is read.
    EXPECT_EQ(result.compiled, Tn_StringList{"a"});
    EXPECT_NE(result.unit("a"), nullptr);
    EXPECT_EQ(result.unit("b"), nullptr);
    for (const std::string& s : sink.statuses()) EXPECT_EQ(s.find("second.v"), std::string::npos) << s;
}

TEST_F(ParserErrors, RecognitionMessagesNameTokens) {
    result = parse("module m;\ninitial begin a = 1;\ncase (a) 1: b = 2; endmodule\n");
    EXPECT_EQ(errors(), Texts{loc(3) + "expecting \"endcase\", found 'endmodule'"});
    result = parse("module m(a b); endmodule\n");
    EXPECT_EQ(errors(), Texts{loc(1) + "unexpected token: b"});
    result = parse("module m; assign w = ;\nendmodule\n");
    EXPECT_EQ(errors(), Texts{loc(1) + "unexpected token: ;"});
    result = parse("module m; wire 8'h1; endmodule\n");
    EXPECT_EQ(errors(), Texts{loc(1) + "unexpected token: 8"});
    // A stray character is a token of its own that no rule takes.
    result = parse("module m;\nwire ` w;\nendmodule\n");
    expectOneErrorAt(2);
}

TEST_F(ParserErrors, ScannerErrorsEndTheCompilationToo) {
    result = parse("module a; endmodule\nmodule b;\nwire w = `UNDEFINED;\nendmodule\n");
    EXPECT_EQ(errors(), Texts{loc(3) + "Macro reference `UNDEFINED is not defined"});
    EXPECT_EQ(result.compiled, Tn_StringList{"a"});
}

TEST_F(ParserErrors, NamedParameterValuesRecover) {
    result = parse(
        "module m;\n"
        "child #(.A(1 +), .B(2)) u1(.x(y));\n"
        "child #(.C(2 -)) u2();\n"
        "child u3();\n"
        "endmodule\n");
    EXPECT_EQ(errors(), (Texts{loc(2) + "unexpected token: )", loc(3) + "unexpected token: )"}));
    Tn_VerilogModule* m = result.module("m");
    ASSERT_NE(m, nullptr);
    ASSERT_EQ(m->ModuleInstance.size(), 3u);
    ASSERT_EQ(m->ModuleInstance[0]->ParamAssignment.size(), 1u);
    EXPECT_EQ(m->ModuleInstance[0]->ParamAssignment[0]->Name.str().str(), "B");
    EXPECT_EQ(m->ModuleInstance[0]->PortConnection.size(), 1u);
}

TEST_F(ParserErrors, ParameterAssignmentListsRecover) {
    result = parse(
        "module m;\n"
        "parameter A = 1 +, B = 2;\n"
        "parameter C = 3;\n"
        "endmodule\n");
    EXPECT_EQ(errors(), Texts{loc(2) + "unexpected token: ,"});
    Tn_VerilogModule* m = result.module("m");
    ASSERT_NE(m, nullptr);
    ASSERT_EQ(m->Parameter.size(), 1u);
    EXPECT_EQ(m->Parameter[0]->Name.str().str(), "C");
}

TEST_F(ParserErrors, DeepNestingIsRefusedWithOneLocatedError) {
    const int n = 100000;
    const std::string deep[] = {
        "wire w = " + repeat("(", n) + "a" + repeat(")", n) + ";",
        "wire w = " + repeat("{", n) + "a" + repeat("}", n) + ";",
        "wire w = " + repeat("a ? ", n) + "b" + repeat(" : c", n) + ";",
        "wire w = a[" + repeat("b[", n) + "c" + repeat("]", n) + "];",
        "initial " + repeat("begin ", n) + repeat("end ", n),
        "initial " + repeat("if (a) ", n) + ";",
        "initial " + repeat("#1 ", n) + ";",
        "generate " + repeat("if (1) begin ", n) + repeat("end ", n) + "endgenerate",
        "generate " + repeat("begin ", n) + repeat("end ", n) + "endgenerate",
    };
    for (const std::string& body : deep) {
        result = parse("module ok; endmodule\nmodule m;\n" + body + "\nendmodule\n");
        EXPECT_EQ(errors(), Texts{loc(3) + "Constructs nested more than 1000 levels deep"}) << body.substr(0, 40);
        EXPECT_EQ(result.compiled, Tn_StringList{"ok"});
    }
}

TEST_F(ParserErrors, LongChainsAreBuiltOrRefused) {
    const int n = 100000;
    // Items of a concatenation are a list: any number works.
    Tn_VerilogModule* m = clean("module m;\nwire w = {" + repeat("a, ", n) + "a};\nendmodule\n");
    ASSERT_NE(m, nullptr);
    EXPECT_EQ(Tn_VerilogNode::cast<Tn_VerilogConcatOp>(m->ContAssign[0]->Source.get())->Operand.size(),
              static_cast<size_t>(n + 1));
    m = clean("module m;\ninitial begin\n" + repeat("a = 1;\n", n) + "end\nendmodule\n");
    ASSERT_NE(m, nullptr);
    // Operator chains build trees as deep as they are long: too deep ones
    // are refused, so that no later walk of the tree runs out of stack.
    const std::string tooDeep[] = {
        "wire w = " + repeat("a + ", n) + "a;",
        "wire w = " + repeat("a ? b : ", n) + "c;",
        "wire w = " + repeat("~", n) + "a;",
        "initial " + repeat("if (a) b = 1; else ", n) + "b = 0;",
    };
    for (const std::string& body : tooDeep) {
        result = parse("module m;\n" + body + "\nendmodule\n");
        EXPECT_EQ(errors(), Texts{loc(2) + "Expression or statement more than 10000 levels deep"}) << body.substr(0, 40);
    }
}

TEST_F(ParserErrors, TreesAsDeepAsAllowedCanBeWalked) {
    // Just within the bound: the trees are built, and copying and marking
    // them (recursive walks of every node) work.
    const int n = Tn_VerilogParser::kMaxTreeDepth - 10;
    Tn_VerilogModule* m = clean("module m;\nwire w = (" + repeat("a - ", n) + "a) + " + repeat("b * ", 100) + "b;\n" +
                                "initial " + repeat("if (a) b = 1; else ", n) + "b = 0;\nendmodule\n");
    ASSERT_NE(m, nullptr);
    Tn_VerilogNode* copy = m->clone(result.unit("m")->factory());
    EXPECT_TRUE(copy->isA(Module));
    result.unit("m")->mark();
    // Dumps indent by depth, so a deep tree makes a long dump; one of a
    // thousand levels.
    m = clean("module m;\nwire w = " + repeat("a - ", 1000) + "a;\nendmodule\n");
    EXPECT_GT(dumpOf(m, "Module").size(), 1000u * 100);
}

}  // namespace
