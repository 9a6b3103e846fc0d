// Declarations: the properties of type definitions and parameters, their
// descriptions, the checks of ranges, delays, attributes and initial values,
// and port redeclarations.
#include <gtest/gtest.h>

#include "tests/support/checkfixture.h"

namespace {

using namespace Tn_Verilog;

struct Decls : CheckFixture {
    Texts check(Tn_VerilogAttributedNode* n, Tn_VerilogScope* scope = nullptr) {
        sink.clear();
        n->check(b.context(scope ? scope : m));
        return sink.errors();
    }
};

struct Props {
    uint32_t width;
    bool isSigned, isReal, fixed, net, variable;
    const char* description;
};

void expectProps(const Tn_VerilogTypeDef* t, const Props& p) {
    EXPECT_EQ(t->width(), p.width);
    EXPECT_EQ(t->isSigned(), p.isSigned);
    EXPECT_EQ(t->isReal(), p.isReal);
    EXPECT_EQ(t->hasFixedSize(), p.fixed);
    EXPECT_EQ(t->isNet(), p.net);
    EXPECT_EQ(t->isVariable(), p.variable);
    EXPECT_EQ(t->describe().str(), p.description);
}

}  // namespace

TEST_F(Decls, PropertiesOfTypeDefinitions) {
    b.param(m, "W", "8");
    expectProps(b.reg(), {1, false, false, true, false, true, "scalar reg"});
    expectProps(b.reg("7:0", true), {8, true, false, true, false, true, "vector reg"});
    expectProps(b.reg("0:15"), {16, false, false, true, false, true, "vector reg"});
    expectProps(b.wire(), {1, false, false, true, true, false, "wire"});
    expectProps(b.wire("3:0", false, Tri1), {4, false, false, true, true, false, "vector tri1"});
    expectProps(b.wire("", false, Supply0), {1, false, false, true, true, false, "supply0"});
    expectProps(b.integer(), {32, true, false, true, false, true, "integer variable"});
    expectProps(b.time(), {64, false, false, true, false, true, "time variable"});
    expectProps(b.real(), {64, true, true, true, false, true, "real variable"});
    expectProps(b.event(), {1, false, false, true, false, false, "event"});
    // A range is fixed only when both bounds are literals.
    Tn_VerilogReg* sized = b.reg("W-1:0");
    EXPECT_FALSE(sized->hasFixedSize());
    Tn_VerilogNet* net = b.wire();
    net->NetType.raw() = 42;
    EXPECT_EQ(net->describe().str(), "net");
}

TEST_F(Decls, ObjectsForwardToTheirTypeDefinition) {
    b.param(m, "W", "8");
    Tn_VerilogScalarVar* v = b.var(m, "v", b.reg("W-1:0", true));
    EXPECT_EQ(v->width(), 8u);  // the range's names resolve from the object's scope
    EXPECT_TRUE(v->isSigned());
    EXPECT_TRUE(v->isVariable());
    EXPECT_FALSE(v->isNet());
    EXPECT_EQ(v->type()->text().str(), "signed [7:0]");
    EXPECT_EQ(v->describe().str(), "vector reg 'v'");
    Tn_VerilogArrayVar* mem = b.array(m, "mem", b.wire("1:0"), {"0:W", "3:0"});
    EXPECT_EQ(mem->describe().str(), "vector wire array 'mem'");
    EXPECT_EQ(mem->type()->text().str(), "array [0:8] of array [3:0] of unsigned [1:0]");
    EXPECT_EQ(b.var(m, "e", b.event())->describe().str(), "event 'e'");
    EXPECT_EQ(b.var(m, "k", b.integer())->type()->text().str(), "signed [31:0]");
    EXPECT_EQ(b.var(m, "t", b.time())->type()->text().str(), "unsigned [63:0]");
    EXPECT_EQ(b.var(m, "x", b.real())->type()->text().str(), "real");
}

TEST_F(Decls, ParametersAndTheirFixedSize) {
    struct Case {
        ParamDeclType type;
        const char* range;
        const char* value;
        bool fixed;
        uint32_t width;
        bool isSigned, isReal;
        const char* typeText;
    };
    b.param(m, "N", "4");
    const Case cases[] = {
        {NoTypeNoRangeParam, "", "12'hfff", false, 12, false, false, "unsigned [11:0]"},
        {NoTypeNoRangeParam, "", "-3", false, 32, true, false, "signed [31:0]"},
        {NoTypeNoRangeParam, "", "2.5", false, 64, true, true, "real"},
        {SignedNoRangeParam, "", "4'b1111", false, 4, true, false, "signed [3:0]"},
        {UnsignedParam, "7:0", "-1", true, 8, false, false, "unsigned [7:0]"},
        {UnsignedParam, "N:0", "1", false, 5, false, false, "unsigned [4:0]"},
        {SignedParam, "0:3", "1", true, 4, true, false, "signed [0:3]"},
        {IntegerParam, "", "1", true, 32, true, false, "signed [31:0]"},
        {RealParam, "", "1", true, 64, true, true, "real"},
        {TimeParam, "", "1", true, 64, false, false, "unsigned [63:0]"},
    };
    int k = 0;
    for (const Case& c : cases) {
        Tn_VerilogParameter* p = b.param(m, "p" + std::to_string(k++), c.value, c.type, c.range);
        SCOPED_TRACE(c.value);
        EXPECT_EQ(p->hasFixedSize(), c.fixed);
        EXPECT_EQ(p->width(), c.width);
        EXPECT_EQ(p->isSigned(), c.isSigned);
        EXPECT_EQ(p->isReal(), c.isReal);
        EXPECT_EQ(p->type()->text().str(), c.typeText);
        EXPECT_TRUE(p->isConstant());
        EXPECT_FALSE(p->isNetLValue() || p->isVarLValue());
    }
    EXPECT_EQ(b.param(m, "L", "1", NoTypeNoRangeParam, "", true)->describe().str(), "localparam 'L'");
    EXPECT_EQ(b.param(m, "Q", "1")->describe().str(), "parameter 'Q'");
    Tn_VerilogSpecParam* s = b.specparam(m, "tpd", "3");
    EXPECT_EQ(s->describe().str(), "specparam 'tpd'");
    EXPECT_EQ(s->value()->toInt(), 3);
    EXPECT_TRUE(s->isConstant());
    EXPECT_FALSE(b.var(m, "r", b.reg())->isConstant());
}

TEST_F(Decls, RangeChecks) {
    b.var(m, "v", b.reg());
    b.param(m, "F", "1.5");
    const std::string L = "\"t.v\" line 1 ";
    const struct {
        const char* range;
        std::string message;
    } cases[] = {
        {"7:0", ""},
        {"F:0", L + "Most significant bit of range specification must be an integer\n"},
        {"0:2.0", L + "Least significant bit of range specification must be an integer\n"},
        {"4'bx00:0", L + "Most significant bit of range specification is undefined\n"},
        {"7:1'bz", L + "Least significant bit of range specification is undefined\n"},
        {"v:0", L + "Most significant bit of range specification must be constant\n"},
        {"nothing:0", L + "Name 'nothing' could not be resolved\n"},
    };
    for (const auto& c : cases) {
        Tn_VerilogScalarVar* x = b.var(m, "x", b.reg(c.range));
        Texts expected;
        if (!c.message.empty()) expected.push_back(c.message);
        EXPECT_EQ(check(x), expected) << c.range;
    }
    // A constant that cannot be computed says why.
    Tn_VerilogFunction* f = b.function(m, "f", b.integer());
    f->ConstantFlag = true;
    b.port(f, Input, "n", b.integer());
    EXPECT_EQ(check(b.var(m, "y", b.reg("f(3):0"))), Texts{L + " Unable to evaluate constant function 'f'\n"});
    EXPECT_EQ(check(b.var(m, "z", b.reg("(1:2:3):0"))), Texts{L + "Most significant bit of range specification must be constant\n"});
    // A type definition shared by several objects is checked once.
    Tn_VerilogReg* shared = b.reg("4'bx00:0");
    Tn_VerilogScalarVar* a = b.var(m, "a", shared);
    Tn_VerilogScalarVar* c = b.var(m, "c", shared);
    Tn_VerilogElabContext& ctx = b.context(m);
    sink.clear();
    a->check(ctx);
    c->check(ctx);
    EXPECT_EQ(sink.errors().size(), 1u);
}

TEST_F(Decls, DelaysAndAttributes) {
    b.var(m, "ev", b.event());
    b.var(m, "r", b.reg());
    Tn_VerilogNet* n = b.wire();
    n->Delay = b.factory().createDelay(Tn_Location("t.v", 4));
    n->Delay->Delay1 = b.expr("2");
    n->Delay->Delay2 = b.expr("1.5");
    n->Delay->Delay3 = b.expr("(1:2:3)");
    Tn_VerilogScalarVar* w = b.var(m, "w", n);
    EXPECT_TRUE(check(w).empty());
    n->Delay->Delay2 = b.expr("ev");
    Tn_VerilogScalarVar* w2 = b.var(m, "w2", n);
    EXPECT_EQ(check(w2), Texts{"\"t.v\" line 1 Illegal delay value\n"});

    Tn_VerilogAttributes* attrs = b.factory().createAttributes();
    Tn_VerilogAttribute* good = b.factory().createAttribute();
    good->Name = "keep";
    good->Expr = b.expr("1 + 1");
    Tn_VerilogAttribute* bad = b.factory().createAttribute();
    bad->Name = "init";
    bad->Expr = b.expr("r");
    Tn_VerilogAttribute* plain = b.factory().createAttribute();
    plain->Name = "flag";
    attrs->Attribute.push_back(good);
    attrs->Attribute.push_back(plain);
    Tn_VerilogScalarVar* v = b.var(m, "v", b.reg());
    v->Attributes = attrs;
    EXPECT_TRUE(check(v).empty());
    attrs->Attribute.push_back(bad);
    EXPECT_EQ(check(v), Texts{"\"t.v\" line 1 Attribute value must be constant\n"});
    // An expression with a failing attribute fails without further messages.
    Tn_VerilogExpression* e = b.expr("r + 1");
    e->Attributes = attrs;
    EXPECT_EQ(check(e), Texts{"\"t.v\" line 1 Attribute value must be constant\n"});
}

TEST_F(Decls, VariableInitialisation) {
    b.var(m, "r", b.reg());
    b.param(m, "P", "3");
    EXPECT_TRUE(check(b.var(m, "a", b.reg("3:0"), "P + 1")).empty());
    EXPECT_TRUE(check(b.var(m, "k", b.integer(), "-1")).empty());
    EXPECT_TRUE(check(b.var(m, "x", b.real(), "2.5")).empty());
    EXPECT_EQ(check(b.var(m, "c", b.reg(), "r")), Texts{"\"t.v\" line 1 Initialization value must be constant\n"});
    EXPECT_EQ(check(b.var(m, "n", b.wire(), "1")), Texts{"\"t.v\" line 1 Illegal variable initialization.\n"});
    EXPECT_EQ(check(b.var(m, "e", b.event(), "1")), Texts{"\"t.v\" line 1 Illegal variable initialization.\n"});
    Tn_VerilogTask* t = b.task(m, "t");
    EXPECT_EQ(check(b.var(t, "local", b.reg(), "1"), t), Texts{"\"t.v\" line 1 Illegal variable initialization.\n"});
    Tn_VerilogGenerate* g = b.generate(m, "g");
    EXPECT_TRUE(check(b.var(g, "ok", b.reg(), "1"), g).empty());
    EXPECT_EQ(check(b.var(m, "bad", b.reg(), "1.5 % 2")),
              Texts{"\"t.v\" line 1 Illegal operand(s) of binary operator '%'\n"});
}

TEST_F(Decls, APortIsTypedByItsRedeclaration) {
    // An argument declared with a direction gets an implicit reg; declared
    // again as an integer it is an integer.
    Tn_VerilogTask* t = b.task(m, "t");
    Tn_VerilogIODeclaration* x = b.port(t, Input, "x", b.reg());
    b.var(t, "x", b.integer());
    EXPECT_EQ(x->typeDef()->describe().str(), "integer variable");
    EXPECT_EQ(x->width(), 32u);
    EXPECT_TRUE(x->isSigned());
    EXPECT_TRUE(check(x, t).empty());
    Tn_VerilogIODeclaration* y = b.port(t, Input, "y", b.reg(), "7:0");
    b.var(t, "y", b.integer());
    EXPECT_EQ(check(y, t), Texts{"\"t.v\" line 1 Illegal redeclaration of vector input 'y' as an integer variable\n"});
}

TEST_F(Decls, PortDescriptionsAndTypes) {
    Tn_VerilogIODeclaration* in = b.port(m, Input, "a", b.wire(), "7:0", true);
    EXPECT_EQ(in->describe().str(), "wire input 'a'");
    EXPECT_EQ(in->width(), 8u);
    EXPECT_TRUE(in->isSigned());
    EXPECT_EQ(in->type()->text().str(), "signed [7:0]");
    EXPECT_TRUE(in->isNetLValue());
    Tn_VerilogIODeclaration* out = b.port(m, Output, "q", b.reg("3:0"), "3:0");
    EXPECT_EQ(out->describe().str(), "vector reg output 'q'");
    EXPECT_TRUE(out->isVarLValue());
    EXPECT_EQ(b.port(m, Inout, "io", b.wire())->describe().str(), "wire inout 'io'");
}

namespace {

struct Redeclaration {
    NodeType direction;
    bool tf;
    const char* kind;  // net reg integer time real event array
    const char* range;
    bool isSigned;
    const char* message;  // the text after "Illegal redeclaration of ", null when allowed
};

}  // namespace

TEST_F(Decls, PortRedeclarations) {
    const Redeclaration cases[] = {
        // Module ports are nets; outputs may also be reg, integer or time variables.
        {Input, false, "net", "", false, nullptr},
        {Input, false, "reg", "", false, "input 'p' as a reg"},
        {Input, false, "integer", "", false, "input 'p' as an integer variable"},
        {Input, false, "time", "", false, "input 'p' as a time variable"},
        {Input, false, "real", "", false, "input 'p' as a real variable"},
        {Input, false, "event", "", false, "input 'p' as an event"},
        {Input, false, "array", "", false, "input 'p' as an array"},
        {Inout, false, "net", "", false, nullptr},
        {Inout, false, "reg", "", false, "inout 'p' as a reg"},
        {Inout, false, "real", "3:0", false, "vector inout 'p' as a real variable"},
        {Output, false, "net", "", false, nullptr},
        {Output, false, "reg", "7:0", true, nullptr},
        {Output, false, "integer", "", false, nullptr},
        {Output, false, "time", "", false, nullptr},
        {Output, false, "time", "", true, "signed output 'p' as a time variable"},
        {Output, false, "real", "", false, "output 'p' as a real variable"},
        {Output, false, "real", "1:0", false, "vector output 'p' as a real variable"},
        {Output, false, "event", "", false, "output 'p' as an event"},
        {Output, false, "array", "", false, "output 'p' as an array"},
        // Task and function arguments are variables of any kind.
        {Input, true, "net", "", false, "input 'p' as a net"},
        {Input, true, "reg", "", false, nullptr},
        {Input, true, "integer", "", false, nullptr},
        {Input, true, "integer", "7:0", false, "vector input 'p' as an integer variable"},
        {Input, true, "time", "", false, nullptr},
        {Input, true, "time", "", true, "signed input 'p' as a time variable"},
        {Input, true, "time", "7:0", false, "vector input 'p' as a time variable"},
        {Input, true, "real", "", false, nullptr},
        {Input, true, "real", "7:0", false, "vector input 'p' as a real variable"},
        {Inout, true, "integer", "7:0", false, "vector inout 'p' as an integer variable"},
        {Inout, true, "event", "", false, "inout 'p' as an event"},
        {Output, true, "net", "", false, "output 'p' as a net"},
        {Output, true, "integer", "7:0", false, nullptr},
        {Output, true, "time", "", true, "signed output 'p' as a time variable"},
        {Output, true, "real", "7:0", false, "vector output 'p' as a real variable"},
        {Output, true, "array", "", false, "output 'p' as an array"},
    };
    for (const Redeclaration& c : cases) {
        Tn_VerilogModule* mod = b.module("mod");
        Tn_VerilogRegion* scope = mod;
        if (c.tf) scope = b.task(mod, "t");
        const std::string kind = c.kind;
        Tn_VerilogTypeDef* def = b.reg();
        if (kind == "net") def = b.wire();
        if (kind == "integer") def = b.integer();
        if (kind == "time") def = b.time();
        if (kind == "real") def = b.real();
        if (kind == "event") def = b.event();
        b.at(5);
        Tn_VerilogIODeclaration* port = b.port(scope, c.direction, "p", def, c.range, c.isSigned);
        b.at(6);
        if (kind == "array") b.array(scope, "p", def, {"0:3"});
        else b.var(scope, "p", def);
        b.at(1);
        Texts expected;
        if (c.message) expected.push_back(std::string("\"t.v\" line 6 Illegal redeclaration of ") + c.message + "\n");
        EXPECT_EQ(check(port, scope), expected) << nodeTypeName(c.direction) << (c.tf ? " tf " : " ") << c.kind
                                                << " [" << c.range << "]" << (c.isSigned ? " signed" : "");
    }
}

TEST_F(Decls, ARedeclaredRangeOverridesThePorts) {
    b.at(3);
    Tn_VerilogReg* def = b.reg("15:0");
    Tn_VerilogIODeclaration* port = b.port(m, Output, "q", def, "7:0");
    b.at(4);
    b.var(m, "q", def);
    sink.clear();
    port->check(b.context(m));
    EXPECT_TRUE(sink.errors().empty());
    EXPECT_EQ(sink.warnings(),
              Texts{"\"t.v\" line 4 Range on redeclaration of 'q' overrides range on output declaration at \"t.v\" line 3 \n"});
    EXPECT_EQ(port->width(), 16u);
    // One declaration that made both port and net shares the range: nothing
    // overrides, and the range is checked once.
    Tn_VerilogNet* net = b.wire("1'bx:0");
    Tn_VerilogIODeclaration* ansi = b.port(m, Input, "i", net);
    ansi->Range = net->Range;
    b.var(m, "i", net);
    sink.clear();
    ansi->check(b.context(m));
    EXPECT_EQ(sink.errors(), Texts{"\"t.v\" line 4 Most significant bit of range specification is undefined\n"});
    EXPECT_TRUE(sink.warnings().empty());
    // No range on the redeclaration: the port's range stands.
    Tn_VerilogIODeclaration* plain = b.port(m, Inout, "b", b.wire(), "0:3");
    EXPECT_TRUE(check(plain).empty());
    EXPECT_TRUE(sink.warnings().empty());
    EXPECT_EQ(plain->type()->text().str(), "unsigned [0:3]");
}
