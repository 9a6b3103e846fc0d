// Checking expressions: the operand rules of every operator class with their
// messages, silence after an operand's error, system and user function calls,
// and the elaborated copies with the parameter and specparam restrictions.
#include <gtest/gtest.h>

#include <cctype>

#include "tests/support/checkfixture.h"
#include "tests/support/parse.h"
#include "util/tn_ostream.h"
#include "verilog/tn_verilogcallchecker.h"
#include "verilog/tn_verilogsystf.h"

namespace {

using namespace Tn_Verilog;

struct Check : CheckFixture {
    Tn_VerilogTask* t = nullptr;

    void SetUp() override {
        b.var(m, "r", b.reg("7:0"));
        b.var(m, "w", b.wire("3:0"));
        b.var(m, "x", b.real());
        b.var(m, "ev", b.event());
        b.array(m, "mem", b.reg("7:0"), {"0:3"});
        b.param(m, "P", "4");
        t = b.task(m, "t");
    }
    // The type the expression checks to (as text), with the errors reported.
    std::string check(const std::string& e, ValueType use = Value) {
        sink.clear();
        return b.expr(e)->typeAs(b.context(m), use)->text().str();
    }
    Texts errors() const { return sink.errors(); }
};

}  // namespace

TEST_F(Check, OperatorTypes) {
    EXPECT_EQ(check("8'sd3 + 4'd1"), "unsigned scalar");
    EXPECT_EQ(check("8'sd3 + 4'sd1"), "signed scalar");
    EXPECT_EQ(check("8'sd3 >>> 4'd1"), "signed scalar");
    EXPECT_EQ(check("8'sd3 == 4'sd1"), "unsigned scalar");
    EXPECT_EQ(check("x * 2"), "real");
    EXPECT_EQ(check("2 ** x"), "real");
    EXPECT_EQ(check("-x"), "real");
    EXPECT_EQ(check("!x"), "unsigned scalar");
    EXPECT_EQ(check("x && r"), "unsigned scalar");
    EXPECT_EQ(check("{r, w}"), "unsigned scalar");
    EXPECT_EQ(check("r ? x : 1"), "real");
    EXPECT_EQ(check("r"), "unsigned [7:0]");
    EXPECT_EQ(check("7"), "signed scalar");
    EXPECT_EQ(check("1.5"), "real");
    EXPECT_TRUE(errors().empty());
}

TEST_F(Check, IllegalOperandsOfOperators) {
    const std::string L = "\"t.v\" line 1 ";
    expectMessages({
        {"~x", Value, L + "Illegal operand of unary operator '~'\n"},
        {"&x", Value, L + "Illegal operand of unary operator '&'\n"},
        {"-ev", Value, L + "Illegal operand of unary operator '-'\n"},
        {"x % 2", Value, L + "Illegal operand(s) of binary operator '%'\n"},
        {"x << 1", Value, L + "Illegal operand(s) of binary operator '<<'\n"},
        {"x & r", Value, L + "Illegal operand(s) of binary operator '&'\n"},
        {"x === 1.0", Value, L + "Illegal operand(s) of binary operator '==='\n"},
        {"r + ev", Value, L + "Illegal operand(s) of binary operator '+'\n"},
        {"mem + 1", Value, L + "Illegal operand(s) of binary operator '+'\n"},
        {"t < 1", Value, L + "Illegal operand(s) of binary operator '<'\n"},
        {"{r, x}", Value, L + "Illegal operand(s) of concatenation operator\n"},
        {"{2{x}}", Value, L + "Illegal operand(s) of multiple concatenation operator\n"},
        {"{x{r}}", Value, L + "Illegal count operand of multiple concatenation operator\n"},
        {"{r{1'b1}}", Value, L + "Repetition multiplier of multiple concatenation operator should be constant\n"},
        {"{-1{1'b1}}", Value, L + "Count operand of multiple concatenation operator is negative\n"},
        {"{2'bx1{1'b1}}", Value, L + "Count operand of multiple concatenation operator is undefined\n"},
        {"{(1:2:3){1'b1}}", Value, L + "Count operand of multiple concatenation operator could not be evaluated\n"},
        {"ev ? 1 : 2", Value, L + "Illegal condition operand of conditional operator '?:'\n"},
        {"r ? ev : 2", Value, L + "Illegal operand of conditional operator '?:'\n"},
    });
    // Reals are fine where values of any kind are.
    for (const char* ok : {"x + 1", "x == r", "x || 0", "-x", "+x", "x ? x : r", "{3{r}}", "{(P - 1){w}}"}) {
        EXPECT_NE(check(ok), "error") << ok;
        EXPECT_TRUE(errors().empty()) << ok;
    }
}

TEST_F(Check, AnErrorInAnOperandKeepsEnclosingChecksSilent) {
    EXPECT_EQ(check("((~x) + 1) * {r, nothing}"), "error");
    EXPECT_EQ(errors(), (Texts{"\"t.v\" line 1 Illegal operand of unary operator '~'\n",
                               "\"t.v\" line 1 Name 'nothing' could not be resolved\n"}));
    EXPECT_EQ(check("-(x % 2) ? {x} : ~x"), "error");
    EXPECT_EQ(errors().size(), 3u);  // each operand once, the operator not at all
    EXPECT_EQ(check("{(x % 2){r}}"), "error");
    EXPECT_EQ(errors(), Texts{"\"t.v\" line 1 Illegal operand(s) of binary operator '%'\n"});
}

TEST_F(Check, EventOperations) {
    Tn_VerilogElabContext& ctx = b.context(m);
    auto edge = [&](UnaryEventOpType op, const char* operand) {
        Tn_VerilogUnaryEventOp* e = b.factory().createUnaryEventOp(Tn_Location("t.v", 2));
        e->OpType = op;
        e->Operand = b.expr(operand);
        return e;
    };
    EXPECT_TRUE(edge(PosedgeOp, "w")->check(ctx)->isEvent());
    EXPECT_TRUE(edge(NegedgeOp, "x")->check(ctx)->isError());
    EXPECT_TRUE(edge(PosedgeOp, "ev")->check(ctx)->isError());
    Tn_VerilogEventOrOp* any = b.factory().createEventOrOp(Tn_Location("t.v", 3));
    any->Operand.push_back(b.expr("ev"));
    any->Operand.push_back(edge(PosedgeOp, "r"));
    any->Operand.push_back(b.expr("x"));
    EXPECT_TRUE(any->check(ctx)->isEvent());
    any->Operand.push_back(b.expr("t"));
    EXPECT_TRUE(any->check(ctx)->isError());
    EXPECT_EQ(errors(), (Texts{"\"t.v\" line 2 Illegal operand in negedge event operation\n",
                               "\"t.v\" line 2 Illegal operand in posedge event operation\n",
                               "\"t.v\" line 3 Illegal operand in event-or operation\n"}));
}

TEST_F(Check, SystemFunctionCalls) {
    const std::string L = "\"t.v\" line 1 ";
    expectMessages({
        {"$time", Value, ""},
        {"$random", Value, ""},
        {"$random(r)", Value, ""},
        {"$fopen(\"f\")", Value, ""},
        {"$fopen(\"f\", \"r\")", Value, ""},
        {"$dist_uniform(r, 0, 10)", Value, ""},
        {"$signed(r) + 1", Value, ""},
        {"$fscanf(r, \"%d\", r, mem[0])", Value, ""},
        {"$fread(mem, r)", Value, ""},
        {"$realtobits(x)", Value, ""},
        {"$foo(1)", Value, L + "Illegal call to unknown system function '$foo'\n"},
        {"$display(r)", Value, L + "Call to system function '$display' is unsupported\n"},
        {"$time(1)", Value, L + "Too many parameters passed to system function '$time'\n"},
        {"$fopen(\"a\", \"b\", \"c\")", Value, L + "Too many parameters passed to system function '$fopen'\n"},
        {"$dist_normal(r, 1)", Value, L + "Too few parameters passed to system function '$dist_normal'\n"},
        {"$fgetc()", Value, L + "Too few parameters passed to system function '$fgetc'\n"},
        {"$random(3)", Value, L + "Argument 1 (inout) passed to system function '$random' is illegal\n"},
        {"$ferror(r, 4'd1)", Value, L + "Argument 2 (output) passed to system function '$ferror' is illegal\n"},
        {"$itor(ev)", Value, L + "Argument 1 (input) passed to system function '$itor' is illegal\n"},
        {"$ungetc(, r)", Value, L + "Argument 1 (input) passed to system function '$ungetc' is illegal\n"},
        {"$fscanf(r, \"%d\", 5)", Value, L + "Argument 3 (output) passed to system function '$fscanf' is illegal\n"},
        {"$random(P)", Value, L + "Reference to name 'P' is not a legal reg or variable lvalue\n"},
    });
    EXPECT_EQ(check("$realtime"), "real");
    EXPECT_EQ(check("$rtoi(x)"), "signed scalar");
}

TEST_F(Check, SystemFunctionsOfVerilog2001AreUnknownInVerilog1995) {
    DesignBuilder b95(false);
    Tn_VerilogModule* m95 = b95.module("m");
    EXPECT_TRUE(b95.expr("$signed(1)")->typeAs(b95.context(m95), Value)->isError());
    EXPECT_TRUE(b95.expr("$time")->typeAs(b95.context(m95), Value)->isIntegral());
    EXPECT_EQ(sink.errors(), Texts{"\"t.v\" line 1 Illegal call to unknown system function '$signed'\n"});
}

TEST_F(Check, SystemFunctionSizesSignsAndResultKinds) {
    auto call = [&](const char* e) { return static_cast<Tn_VerilogSystemFunctionCall*>(b.expr(e)); };
    EXPECT_EQ(call("$time")->resultKind(), 2);
    EXPECT_EQ(call("$REALTOBITS(x)")->resultKind(), 2);
    EXPECT_EQ(call("$realtime")->resultKind(), 1);
    EXPECT_EQ(call("$bitstoreal(r)")->resultKind(), 1);
    EXPECT_EQ(call("$itor(r)")->resultKind(), 1);
    EXPECT_EQ(call("$random")->resultKind(), 0);
    EXPECT_EQ(call("$random")->contextWidth(0), 32u);
    EXPECT_EQ(call("$time")->contextWidth(0), 64u);
    EXPECT_EQ(call("$random")->contextWidth(40), 40u);
    EXPECT_EQ(call("$signed(12'd1)")->contextWidth(0), 12u);
    EXPECT_EQ(call("$unsigned(12'd1)")->contextWidth(16), 16u);
    EXPECT_TRUE(call("$signed(12'd1)")->isSigned(true));
    EXPECT_FALSE(call("$signed(12'd1)")->isSigned(false));
    EXPECT_FALSE(call("$unsigned(-1)")->isSigned(true));
    EXPECT_TRUE(call("$random")->isSigned(true));
    EXPECT_FALSE(call("$time")->isSigned(true));
    EXPECT_TRUE(call("$realtime")->isReal());
    EXPECT_EQ(call("$time")->describe(), "call to '$time'");
}

TEST_F(Check, ArgumentsWithoutDirectionAreReported) {
    // The tables give every parameter a direction; a signature without one
    // is a fault in a table, reported at the call.
    Tn_VerilogTypePtr broken = Tn_VerilogSysTf::signature("(u opt) u");
    Tn_VerilogExpression* call = b.expr("$f(r)");
    std::vector<Tn_VerilogExpression*> args{b.expr("r")};
    args[0]->typeAs(b.context(m), Value);
    Tn_VerilogCallChecker checker(b.context(m), Tn_VerilogCallChecker::kSystemFunction);
    EXPECT_FALSE(checker.check(*call, "$f", args, *broken));
    EXPECT_EQ(errors(), Texts{"\"t.v\" line 1 Argument 1 of system function '$f' has no direction\n"});
}

TEST_F(Check, UserFunctionCalls) {
    Tn_VerilogFunction* f = b.function(m, "f", b.reg("15:0", true));
    b.port(f, Input, "a", b.reg("7:0"), "7:0");
    b.port(f, Input, "c", b.real());
    EXPECT_EQ(check("f(r, 1.5) + 1"), "signed scalar");
    EXPECT_TRUE(errors().empty());
    Tn_VerilogExpression* call = b.expr("f(r, x)");
    call->typeAs(b.context(m), Value);
    EXPECT_EQ(call->contextWidth(0), 16u);
    EXPECT_TRUE(call->isSigned(true));
    EXPECT_TRUE(call->isConstant() == false);
    EXPECT_TRUE(b.expr("f(1, 2)")->isConstant());
    EXPECT_FALSE(b.expr("f(1, r)")->isConstant());

    const std::string L = "\"t.v\" line 1 ";
    expectMessages({
        {"g(1)", Value, L + "Illegal function call to 'g'\n"},
        {"r(1)", Value, L + "Illegal function call to 'r'\n"},
        {"t(1)", Value, L + "Illegal function call to 't'\n"},
        {"f(1)", Value, L + "Too few parameters passed to function 'f'\n"},
        {"f(1, 2, 3)", Value, L + "Too many parameters passed to function 'f'\n"},
        {"f(ev, 2)", Value, L + "Illegal argument passed to port 1 (input) of function 'f'\n"},
        {"f(1, mem)", Value, L + "Illegal argument passed to port 2 (input) of function 'f'\n"},
    });
    // Constant calls are evaluated by the procedural code's interpreter; until
    // then they have no value, and asking says so.
    Tn_VerilogExpression* constant = b.expr("f(1, 2)");
    constant->typeAs(b.context(m), Value);
    sink.clear();
    EXPECT_TRUE(constant->value()->isNull());
    EXPECT_EQ(errors(), Texts{"\"t.v\" line 1 Function 'f' is not a valid constant function.\n"});
    f->ConstantFlag = true;
    sink.clear();
    EXPECT_TRUE(constant->value()->isNull());
    EXPECT_EQ(errors(), Texts{"\"t.v\" line 1  Unable to evaluate constant function 'f'\n"});
    sink.clear();
    EXPECT_TRUE(constant->evaluate(Tn_VerilogEvalContext::quiet())->isNull());
    EXPECT_TRUE(errors().empty());
}

TEST_F(Check, OperatorNumbersOutOfRangeAreInternalErrors) {
    Tn_VerilogBinaryOp* bin = static_cast<Tn_VerilogBinaryOp*>(b.expr("1 + 2"));
    bin->OpType.raw() = 24;
    EXPECT_TRUE(bin->value()->isNull());
    Tn_VerilogUnaryOp* un = static_cast<Tn_VerilogUnaryOp*>(b.expr("-2"));
    un->OpType.raw() = -1;
    EXPECT_TRUE(un->value()->isNull());
    EXPECT_EQ(sink.texts(PORT_MSG_INTERNAL), (Texts{"\"t.v\" line 1 Unsupported binary operation type '24'\n",
                                                    "\"t.v\" line 1 Unsupported unary operation type '-1'\n"}));
}

// ------------------------------------------------------------ elaborated copies

namespace {

struct Copies : Check {
    DesignBuilder target;  // the design the copies are made in
    Tn_VerilogElabContext& ctx() {
        Tn_VerilogElabContext& c = target.context(m);
        return c;
    }
};

}  // namespace

TEST_F(Copies, PlainCopiesRecreateEveryOperatorInTheTargetUnit) {
    b.specparam(m, "S", "1");
    Tn_VerilogExpression* e = b.expr("{2{r[P -: 2], w}} + (x ? $time : f(-S, mem[1])) ** 2");
    Tn_VerilogExpression* c = e->elaborateCopy(ctx());
    ASSERT_TRUE(c);
    EXPECT_NE(c, e);
    // Same tree, except that the copies' ids are those of the target unit and
    // the names are not resolved there yet.
    auto shape = [&](const Tn_VerilogNode* n) {
        std::string s = dumpOf(n, "E"), r;
        for (size_t i = 0; i < s.size(); ++i) {
            if (s.compare(i, 3, " = ") == 0 && i + 3 < s.size() && std::isdigit(static_cast<unsigned char>(s[i + 3]))) {
                r += " = #";
                i += 3;
                while (i + 1 < s.size() && std::isdigit(static_cast<unsigned char>(s[i + 1]))) ++i;
                continue;
            }
            r += s[i];
        }
        return r;
    };
    EXPECT_EQ(shape(c), shape(e));
    EXPECT_TRUE(errors().empty());
    EXPECT_EQ(c->elaborate(ctx())->nodeType(), c->nodeType());
}

TEST_F(Copies, PlainCopiesOfNamesResolveWhereTheyAreChecked) {
    Tn_VerilogBinaryOp* e = static_cast<Tn_VerilogBinaryOp*>(b.expr("r + P"));
    e->typeAs(b.context(m), Value);
    EXPECT_EQ(static_cast<Tn_VerilogSimpleName*>(e->LOperand.get())->Scope.get(), m);
    Tn_VerilogBinaryOp* c = static_cast<Tn_VerilogBinaryOp*>(e->elaborateCopy(ctx()));
    ASSERT_TRUE(c);
    EXPECT_EQ(static_cast<Tn_VerilogSimpleName*>(c->LOperand.get())->Scope.get(), nullptr);
    EXPECT_FALSE(c->typeAs(ctx(), Value)->isError());
    EXPECT_EQ(static_cast<Tn_VerilogSimpleName*>(c->LOperand.get())->Scope.get(), m);
}

TEST_F(Copies, ParameterValuesMayNameOnlyParametersAndGenvars) {
    Tn_VerilogGenVar* g = b.genvar(m, "i");
    (void)g;
    b.specparam(m, "S", "1");
    ASSERT_TRUE(b.expr("P * 2 + i")->elaborateInParameter(ctx()));
    EXPECT_TRUE(errors().empty());
    EXPECT_FALSE(b.expr("P + r + S")->elaborateInParameter(ctx()));
    EXPECT_FALSE(b.expr("$random + 1")->elaborateInParameter(ctx()));
    EXPECT_FALSE(b.expr("nothing")->elaborateInParameter(ctx()));
    EXPECT_EQ(errors(), (Texts{"\"t.v\" line 1 Illegal reference to vector reg 'r' in parameter expression\n",
                               "\"t.v\" line 1 Illegal reference to specparam 'S' in parameter expression\n",
                               "\"t.v\" line 1 Illegal system function call to $random in parameter expression\n",
                               "\"t.v\" line 1 Name 'nothing' could not be resolved\n"}));
    // The copy is resolved in the scope being elaborated.
    Tn_VerilogSimpleName* n = static_cast<Tn_VerilogSimpleName*>(b.expr("P")->elaborateInParameter(ctx()));
    ASSERT_TRUE(n);
    EXPECT_EQ(n->declaration()->describe(), "parameter 'P'");
}

TEST_F(Copies, SpecparamValuesMayAlsoNameSpecparams) {
    b.specparam(m, "S", "1");
    EXPECT_TRUE(b.expr("S + P")->elaborateInSpecparam(ctx()));
    EXPECT_FALSE(b.expr("S + w")->elaborateInSpecparam(ctx()));
    EXPECT_FALSE(b.expr("$time")->elaborateInSpecparam(ctx()));
    EXPECT_EQ(errors(), (Texts{"\"t.v\" line 1 Illegal reference to vector wire 'w' in specparam expression\n",
                               "\"t.v\" line 1 Illegal system function call to $time in specparam expression\n"}));
}

TEST_F(Copies, HierarchicalPrefixesAndFunctionNamesAreNotValueReferences) {
    b.function(m, "f", b.integer());
    Tn_VerilogModule* child = b.module("child");
    b.instance(m, "u", child);
    b.param(child, "Q", "3");
    EXPECT_TRUE(b.expr("u.Q + f(P)")->elaborateInParameter(ctx()));
    EXPECT_TRUE(errors().empty()) << (errors().empty() ? "" : errors()[0]);
}
