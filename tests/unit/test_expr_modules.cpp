// Checks run on the nodes of parsed modules: widths and signs in context,
// select checks for both range directions, name resolution from named blocks,
// port redeclarations, and silence on clean sources.
#include <gtest/gtest.h>

#include "tests/support/parse.h"
#include "tests/support/parsercorpus.h"
#include "verilog/tn_verilogelabcontext.h"
#include "verilog/tn_verilogparser.h"

namespace {

using namespace Tn_Verilog;

// Checks what the final check of an elaborated design would reach that this
// layer owns: declarations, and every expression standing alone (assignment
// sides, conditions, arguments, connections), in the scope it belongs to.
// Generate constructs are left out: they are checked once unrolled.
class CheckAll : public Tn_VerilogChildVisitor {
public:
    explicit CheckAll(Tn_VerilogElabContext& ctx) : ctx_(ctx) {}

    void scope(Tn_VerilogScope* s) {
        ctx_.pushScope(s, s);
        Tn_VerilogNode* parent = parent_;
        parent_ = s;
        s->visitFields(*this);
        parent_ = parent;
        ctx_.popScope();
    }

    void eachChild(const Tn_FieldInfo& f, Tn_VerilogNode*& child) override {
        if (!child || child->isA(GenerateStatement) || child->isA(Generate) || child->isA(GenerateArray) ||
            child->isA(DefParam) || child->isA(TypeDef) || child->isA(Range) || child->isA(TableEntry))
            return;
        if (child->isA(Scope)) return scope(static_cast<Tn_VerilogScope*>(child));
        if (child->isA(Object)) {
            static_cast<Tn_VerilogObject*>(child)->check(ctx_);
            return;
        }
        if (child->isA(Delay)) {
            static_cast<Tn_VerilogDelay*>(child)->check(ctx_);
            return;
        }
        if (child->isA(EventExpression)) {
            static_cast<Tn_VerilogEventExpression*>(child)->typeAs(ctx_, useOf(f.label));
            return;
        }
        Tn_VerilogNode* parent = parent_;
        parent_ = child;
        child->visitFields(*this);
        parent_ = parent;
    }

private:
    ValueType useOf(const std::string& label) const {
        if (label == "LoConn") return PortLValue;
        if (label != "Target") return Value;
        if (parent_->isA(ContAssign)) return NetLValue;
        if (parent_->isA(BlockingAssign) || parent_->isA(NonBlockingAssign)) return VarLValue;
        return LValue;
    }

    Tn_VerilogElabContext& ctx_;
    Tn_VerilogNode* parent_ = nullptr;
};

struct Modules : ParseTest {
    std::unique_ptr<Tn_VerilogElabContext> ctx;

    Tn_VerilogElabContext& context(Tn_VerilogScope* scope, const std::string& unit) {
        ctx.reset(new Tn_VerilogElabContext(true, nullptr, nullptr, result.unit(unit)));
        ctx->pushScope(scope, scope);
        return *ctx;
    }
    // The errors but those about hierarchical names, which reach into
    // instances only in an elaborated design.
    Texts unexpectedErrors() const {
        Texts r;
        for (const std::string& e : sink.errors()) {
            const size_t from = e.find("Name '"), to = e.find("' could not be resolved");
            const bool hierarchical = from != std::string::npos && to != std::string::npos &&
                                      e.substr(from, to - from).find('.') != std::string::npos;
            if (!hierarchical) r.push_back(e);
        }
        return r;
    }
    // The source side of the module's continuous assignment number i.
    Tn_VerilogExpression* assigned(Tn_VerilogModule* m, size_t i) { return m->ContAssign[i]->Source; }
    // Parses a clean compilation and checks each module that needs no
    // elaboration: its constant functions run with the procedural code,
    // later. Returns how many modules were checked.
    int checkCompilation(const std::vector<std::string>& args, const std::string& name) {
        sink.clear();
        result = parseArgs(args);
        EXPECT_EQ(sink.errors(), Texts{}) << name;
        int checked = 0;
        for (const Port_String& unit : result.compiled) {
            Tn_VerilogModule* m = result.module(unit.c_str());
            if (!m || !m->ConstFuncCall.empty()) continue;
            Tn_VerilogElabContext& ctx = context(m, unit.c_str());
            ctx.popScope();
            CheckAll(ctx).scope(m);
            ++checked;
        }
        EXPECT_EQ(unexpectedErrors(), Texts{}) << name;
        return checked;
    }
};

}  // namespace

TEST_F(Modules, WidthsAndSignsOfMixedExpressions) {
    Tn_VerilogModule* m = clean(
        "module m;\n"
        "  wire [7:0] a, b;\n"
        "  wire signed [7:0] s;\n"
        "  wire [15:0] y;\n"
        "  assign y = a == b;\n"
        "  assign y = 8'sd3 + 4'd1;\n"
        "  assign y = 8'sd3 >>> 1;\n"
        "  assign y = s + a;\n"
        "  assign y = s + 4'sd1;\n"
        "  assign y = {a, s};\n"
        "endmodule\n");
    ASSERT_TRUE(m);
    Tn_VerilogElabContext& c = context(m, "m");
    for (size_t i = 0; i < m->ContAssign.size(); ++i) EXPECT_FALSE(assigned(m, i)->check(c)->isError());
    Tn_VerilogExpression* eq = assigned(m, 0);
    EXPECT_EQ(eq->contextWidth(16), 16u);
    EXPECT_EQ(eq->contextWidth(0), 1u);
    EXPECT_FALSE(eq->isSigned(true));
    EXPECT_EQ(assigned(m, 1)->contextWidth(0), 8u);
    EXPECT_FALSE(assigned(m, 1)->isSigned(true));
    EXPECT_EQ(assigned(m, 1)->value()->toInt(), 4);
    EXPECT_TRUE(assigned(m, 2)->isSigned(true));
    EXPECT_FALSE(assigned(m, 3)->isSigned(true));
    EXPECT_TRUE(assigned(m, 4)->isSigned(true));
    EXPECT_EQ(assigned(m, 5)->contextWidth(0), 16u);
    EXPECT_TRUE(errors().empty() && warnings().empty());
}

TEST_F(Modules, SelectsForBothRangeDirections) {
    Tn_VerilogModule* m = clean(
        "module m;\n"
        "  reg [7:0] d;\n"
        "  reg [0:7] a;\n"
        "  wire y;\n"
        "  wire [3:0] z;\n"
        "  assign y = d[7] ^ a[0];\n"
        "  assign z = d[7:4] ^ a[0:3];\n"
        "  assign y = d[8];\n"
        "  assign z = d[4:7];\n"
        "  assign z = a[7:4];\n"
        "  assign z = d[9:6];\n"
        "  assign z = a[6 +: 4];\n"
        "endmodule\n");
    ASSERT_TRUE(m);
    Tn_VerilogElabContext& c = context(m, "m");
    sink.clear();
    for (size_t i = 0; i < m->ContAssign.size(); ++i) assigned(m, i)->check(c);
    EXPECT_EQ(errors(), (Texts{loc(8) + "Index in bit-select of name 'd' is out of range",
                               loc(9) + "Indices in part-select of name 'd' are reversed",
                               loc(10) + "Indices in part-select of name 'a' are reversed",
                               loc(11) + "Most significant bit operand in part-select of name 'd' is out of range",
                               loc(12) + "Width operand in indexed part-select of name 'a' is out of range"}));
}

TEST_F(Modules, NamesFromNamedBlocksAndTheModulesOwnName) {
    Tn_VerilogModule* m = clean(
        "module m;\n"
        "  reg [3:0] r;\n"
        "  reg q;\n"
        "  always begin : outer\n"
        "    reg [1:0] local;\n"
        "    begin : inner\n"
        "      q = r[0] ^ local[1] ^ m.r[1] ^ outer.local[0];\n"
        "    end\n"
        "  end\n"
        "endmodule\n"
        "module other;\n"
        "  always begin : b\n"
        "    r = 1;\n"
        "  end\n"
        "endmodule\n");
    ASSERT_TRUE(m);
    ASSERT_EQ(m->Block.size(), 1u);
    Tn_VerilogBlock* outer = m->Block[0];
    ASSERT_EQ(outer->Block.size(), 1u);
    Tn_VerilogBlock* inner = outer->Block[0];
    Tn_VerilogAssignment* a = Tn_VerilogNode::cast<Tn_VerilogAssignment>(inner->Statement[0]);
    ASSERT_TRUE(a);
    Tn_VerilogElabContext& c = context(inner, "m");
    EXPECT_FALSE(a->Target->typeAs(c, VarLValue)->isError());
    EXPECT_FALSE(static_cast<Tn_VerilogSourcedAssign*>(a)->Source->check(c)->isError());
    EXPECT_TRUE(sink.errors().empty());
    // A module's own name denotes the module.
    Tn_VerilogSimpleName* own = static_cast<Tn_VerilogSimpleName*>(Tn_VerilogParser::parseExpression(
        "m", result.unit("m")->factory(), Tn_VerilogOptions()));
    EXPECT_EQ(own->resolve(inner), m);
    // Names of another module are not found.
    Tn_VerilogModule* o = result.module("other");
    Tn_VerilogBlock* b = o->Block[0];
    Tn_VerilogAssignment* other = Tn_VerilogNode::cast<Tn_VerilogAssignment>(b->Statement[0]);
    ASSERT_TRUE(other);
    EXPECT_TRUE(other->Target->typeAs(context(b, "other"), VarLValue)->isError());
    EXPECT_EQ(errors(), Texts{loc(13) + "Name 'r' could not be resolved"});
}

TEST_F(Modules, PortRedeclarations) {
    Tn_VerilogModule* m = clean(
        "module m(a, b, c, d, e);\n"
        "  input a;\n"
        "  reg a;\n"
        "  output [3:0] b;\n"
        "  reg [7:0] b;\n"
        "  inout c;\n"
        "  real c;\n"
        "  output d;\n"
        "  integer d;\n"
        "  input [1:0] e;\n"
        "  wire [1:0] e;\n"
        "  task t;\n"
        "    input [7:0] x;\n"
        "    integer x;\n"
        "    output y;\n"
        "    real y;\n"
        "    begin end\n"
        "  endtask\n"
        "endmodule\n");
    ASSERT_TRUE(m);
    Tn_VerilogElabContext& c = context(m, "m");
    sink.clear();
    for (Tn_VerilogIODeclaration* io : m->IODeclaration) io->check(c);
    Tn_VerilogTask* t = m->Task[0];
    c.pushScope(t, t);
    for (Tn_VerilogIODeclaration* io : t->IODeclaration) io->check(c);
    EXPECT_EQ(errors(), (Texts{loc(3) + "Illegal redeclaration of input 'a' as a reg",
                               loc(7) + "Illegal redeclaration of inout 'c' as a real variable",
                               loc(14) + "Illegal redeclaration of vector input 'x' as an integer variable"}));
    EXPECT_EQ(warnings(), (Texts{loc(5) + "Range on redeclaration of 'b' overrides range on output declaration at " +
                                     loc(4),
                                 loc(11) + "Range on redeclaration of 'e' overrides range on input declaration at " +
                                     loc(10)}));
}

TEST_F(Modules, CleanSourcesCheckWithoutMessages) {
    // Compilations of the parser corpus (each row names a fault of one
    // compilation; its files are the clean ones).
    int checked = 0;
    for (const CorpusCase& c : readParserCompilations()) checked += checkCompilation(c.args(c.files, parserCorpusDir()), c.name);
    EXPECT_GT(checked, 40);
}

// The designs of the shared corpus (real open-source cores), when present.
TEST_F(Modules, SharedCorpusDesignsCheckWithoutMessages) {
    std::vector<SharedDesign> designs;
    if (!readSharedDesigns(designs)) GTEST_SKIP() << "the shared design corpus is not at " << sharedCorpusDir();
    int checked = 0;
    for (const SharedDesign& d : designs) checked += checkCompilation(d.args, d.name);
    EXPECT_GT(checked, 0);
    std::cout << "[          ] " << checked << " modules checked\n";
}
