// Names and scopes: what each scope declares, the upward searches, simple,
// hierarchical and indexed names, the checks of references, and the select
// checks for both directions of a declared range.
#include <gtest/gtest.h>

#include "tests/support/checkfixture.h"

namespace {

using namespace Tn_Verilog;

struct Names : CheckFixture {
    Tn_VerilogDeclaration* resolve(const std::string& e, Tn_VerilogScope* scope) {
        return static_cast<Tn_VerilogName*>(b.expr(e))->resolve(scope);
    }
};

}  // namespace

TEST_F(Names, UpwardSearchFromANamedBlock) {
    Tn_VerilogScalarVar* r = b.var(m, "r", b.reg());
    Tn_VerilogBlock* outer = b.block(m, "outer");
    Tn_VerilogBlock* inner = b.block(outer, "inner");
    Tn_VerilogScalarVar* local = b.var(outer, "r", b.integer());
    Tn_VerilogScalarVar* other = b.var(inner, "q", b.reg());
    EXPECT_EQ(resolve("r", inner), local);  // the nearest declaration wins
    EXPECT_EQ(resolve("r", m), r);
    EXPECT_EQ(resolve("q", inner), other);
    EXPECT_EQ(resolve("q", outer), nullptr);
    // The resolution is recorded: the name's scope is where it was found.
    Tn_VerilogSimpleName* n = static_cast<Tn_VerilogSimpleName*>(b.expr("r"));
    n->resolve(inner);
    EXPECT_EQ(n->Scope.get(), outer);
    EXPECT_EQ(n->declaration(), local);
    EXPECT_TRUE(errorsOf("r + q", inner).empty());
}

TEST_F(Names, NamesOfOtherModulesAreNotFound) {
    Tn_VerilogModule* other = b.module("other");
    b.var(other, "only_there", b.reg());
    Tn_VerilogBlock* blk = b.block(m, "blk");
    EXPECT_EQ(errorsOf("only_there", blk), Texts{"\"t.v\" line 1 Name 'only_there' could not be resolved\n"});
}

TEST_F(Names, AModulesOwnNameDenotesTheModule) {
    Tn_VerilogBlock* blk = b.block(m, "blk");
    EXPECT_EQ(resolve("m", blk), m);
    Tn_VerilogSimpleName* n = static_cast<Tn_VerilogSimpleName*>(b.expr("m"));
    n->resolve(blk);
    EXPECT_EQ(n->declaration(), m);
    // A declaration of that name inside comes first.
    Tn_VerilogScalarVar* shadow = b.var(m, "m", b.reg());
    EXPECT_EQ(resolve("m", blk), shadow);
    EXPECT_TRUE(m->lookupScope("m") == m);
}

TEST_F(Names, AFunctionsNameInsideItIsItsResult) {
    Tn_VerilogFunction* f = b.function(m, "f", b.reg("7:0", true));
    b.port(f, Input, "x", b.reg("7:0"), "7:0");
    Tn_VerilogBlock* body = b.block(f, "body");
    // Assigned and read inside, as a signed 8-bit variable.
    EXPECT_TRUE(errorsOf("f", body, VarLValue).empty());
    EXPECT_EQ(checked->text().str(), "signed [7:0]");
    Tn_VerilogExpression* e = b.expr("f + 8'sd1");
    e->typeAs(b.context(f), Value);
    EXPECT_EQ(e->contextWidth(0), 8u);
    EXPECT_TRUE(e->isSigned(true));
    EXPECT_EQ(errorsOf("f", f, NetLValue), Texts{"\"t.v\" line 1 Reference to name 'f' is not a legal net lvalue\n"});
    // Outside it, the name is the function, not a variable.
    EXPECT_EQ(errorsOf("f", m, VarLValue), Texts{"\"t.v\" line 1 Reference to name 'f' is not a legal reg or variable lvalue\n"});
    EXPECT_EQ(errorsOf("f + 1", m), Texts{"\"t.v\" line 1 Illegal operand(s) of binary operator '+'\n"});
    // A recursive call inside still calls it.
    EXPECT_TRUE(errorsOf("f(x - 1)", body).empty());
}

TEST_F(Names, WhatScopesDeclare) {
    Tn_VerilogIODeclaration* in = b.port(m, Input, "a", b.wire());
    b.var(m, "a", b.reg());  // the redeclaration: the port is found first
    Tn_VerilogParameter* p = b.param(m, "P", "1");
    Tn_VerilogGenVar* g = b.genvar(m, "i");
    Tn_VerilogSpecParam* s = b.specparam(m, "S", "2");
    Tn_VerilogTask* t = b.task(m, "t");
    Tn_VerilogFunction* f = b.function(m, "f");
    Tn_VerilogBlock* blk = b.block(m, "blk");
    Tn_VerilogGenerate* gen = b.generate(m, "gen");
    Tn_VerilogModule* child = b.module("child");
    Tn_VerilogModuleInstance* u = b.instance(m, "u", child);
    EXPECT_EQ(m->findDeclaration("a"), in);
    EXPECT_EQ(m->findDeclaration("P"), p);
    EXPECT_EQ(m->findDeclaration("i"), g);
    EXPECT_EQ(m->findDeclaration("S"), s);
    EXPECT_EQ(m->findDeclaration("t"), t);
    EXPECT_EQ(m->findDeclaration("u"), u);
    EXPECT_EQ(m->findScope("P"), nullptr);
    EXPECT_EQ(m->findScope("f"), f);
    EXPECT_EQ(m->findScope("gen"), gen);
    EXPECT_EQ(m->findTask("t"), t);
    EXPECT_EQ(m->findTask("f"), nullptr);
    EXPECT_EQ(m->findFunction("f"), f);
    EXPECT_EQ(m->findBlock("blk"), blk);
    EXPECT_EQ(m->findModuleInstance("u"), u);
    EXPECT_EQ(m->findGenerate("gen"), gen);
    EXPECT_EQ(u->denotedScope(), child);
    // Tasks and functions are searched up to the module.
    Tn_VerilogBlock* deep = b.block(blk, "deep");
    EXPECT_EQ(deep->lookupTask("t"), t);
    EXPECT_EQ(deep->lookupFunction("f"), f);
    EXPECT_EQ(child->lookupTask("t"), nullptr);
    // Scope names are searched through the whole hierarchy.
    EXPECT_EQ(child->lookupScope("blk"), blk);
    EXPECT_EQ(child->lookup("blk"), nullptr);
}

TEST_F(Names, HierarchicalNames) {
    // root - top (instance of m) - u (instance of child) - w
    b.instance(b.root(), "top", m);
    Tn_VerilogModule* child = b.module("child");
    b.instance(m, "u", child);
    Tn_VerilogScalarVar* w = b.var(child, "w", b.wire("3:0"));
    Tn_VerilogBlock* blk = b.block(child, "blk");
    Tn_VerilogScalarVar* inBlock = b.var(blk, "v", b.reg());
    EXPECT_EQ(resolve("u.w", m), w);
    EXPECT_EQ(resolve("top.u.w", blk), w);
    EXPECT_EQ(resolve("u.blk.v", m), inBlock);
    EXPECT_EQ(resolve("top.u.nothing", blk), nullptr);
    Tn_VerilogName* n = static_cast<Tn_VerilogName*>(b.expr("top.u.w"));
    EXPECT_EQ(n->nameText(), "top.u.w");
    EXPECT_EQ(n->describe(), "name 'top.u.w'");
    EXPECT_TRUE(errorsOf("top.u.w + 1", blk).empty());
    EXPECT_EQ(errorsOf("top.x.w", blk), Texts{"\"t.v\" line 1 Name 'top.x.w' could not be resolved\n"});
    EXPECT_EQ(w->fullPath().str(), "top.u.w");
    EXPECT_EQ(w->localPath().str(), "w");
    EXPECT_EQ(m->fullPath().str(), "top");
}

TEST_F(Names, IndexedNamesSelectElementsOfGenerateArrays) {
    Tn_VerilogGenerateArray* arr = b.factory().createGenerateArray();
    arr->Name = "g";
    arr->Parent = m;
    m->GenerateArray.push_back(arr);
    Tn_VerilogScalarVar* x2 = nullptr;
    for (int i = 0; i < 3; ++i) {
        Tn_VerilogGenerate* e = b.factory().createGenerate();
        e->Name = "g";
        e->Parent = arr;
        arr->Generate.insert(i, e);
        Tn_VerilogScalarVar* x = b.var(e, "x", b.reg());
        if (i == 2) x2 = x;
    }
    b.param(m, "TWO", "2");
    EXPECT_EQ(resolve("g[2].x", m), x2);
    EXPECT_EQ(resolve("g[TWO].x", m), x2);
    EXPECT_EQ(resolve("g[5].x", m), nullptr);
    EXPECT_EQ(static_cast<Tn_VerilogName*>(b.expr("g[1+1].x"))->nameText(), "g[2].x");
    EXPECT_EQ(x2->localPath().str(), "g.g.x");
    b.var(m, "r", b.reg("1:0"));
    EXPECT_EQ(errorsOf("g[r].x", m), (Texts{"\"t.v\" line 1 Scope index must be constant\n"}));
    EXPECT_TRUE(errorsOf("g[TWO - 1].x", m).empty());
}

TEST_F(Names, GenvarsOnlyWhileTheyHaveAValue) {
    Tn_VerilogGenVar* i = b.genvar(m, "i");
    EXPECT_EQ(errorsOf("i + 1", m), Texts{"\"t.v\" line 1 Illegal reference to genvar 'i'\n"});
    Tn_VerilogElabContext& ctx = b.context(m);
    ctx.activeGenVars().push_back(i);
    sink.clear();
    EXPECT_FALSE(b.expr("i + 1")->typeAs(ctx, Value)->isError());
    i->ValidFlag = true;
    EXPECT_TRUE(errorsOf("i + 1", m).empty());
    EXPECT_EQ(i->describe(), "genvar 'i'");
}

TEST_F(Names, LvalueKinds) {
    b.var(m, "r", b.reg("7:0"));
    b.var(m, "n", b.wire());
    b.var(m, "k", b.integer());
    b.var(m, "ev", b.event());
    b.param(m, "P", "1");
    b.port(m, Output, "o", b.reg(), "3:0");
    b.port(m, Input, "in", b.wire());
    expectMessages({
        {"r", VarLValue, ""},
        {"k", VarLValue, ""},
        {"o", VarLValue, ""},
        {"n", NetLValue, ""},
        {"in", NetLValue, ""},
        {"{n, in}", NetLValue, ""},
        {"r", LValue, ""},
        {"n", LValue, ""},
        {"n", VarLValue, "\"t.v\" line 1 Reference to name 'n' is not a legal reg or variable lvalue\n"},
        {"r", NetLValue, "\"t.v\" line 1 Reference to name 'r' is not a legal net lvalue\n"},
        {"P", LValue, "\"t.v\" line 1 Reference to name 'P' is not a legal lvalue\n"},
        {"ev", LValue, "\"t.v\" line 1 Reference to name 'ev' is not a legal lvalue\n"},
        {"m", LValue, "\"t.v\" line 1 Reference to name 'm' is not a legal lvalue\n"},
        {"{r, n}", VarLValue, "\"t.v\" line 1 Reference to name 'n' is not a legal reg or variable lvalue\n"},
    });
    EXPECT_TRUE(b.expr("{r, k}")->isA(ConcatOp));
    Tn_VerilogExpression* both = b.expr("{r, n}");
    both->typeAs(b.context(m), Value);
    // Neither all nets nor all variables: assignable nowhere.
    EXPECT_FALSE(both->isLValue());
    EXPECT_FALSE(b.expr("r + 1")->isLValue());
}

TEST_F(Names, SelectChecksForBothRangeDirections) {
    b.var(m, "d", b.reg("7:0"));
    b.var(m, "a", b.reg("0:7"));
    b.var(m, "n", b.wire("7:0"));
    b.var(m, "x", b.real());
    b.var(m, "i", b.integer());
    b.param(m, "P", "3");
    const std::string L = "\"t.v\" line 1 ";
    expectMessages({
        {"d[7] + a[0] + d[P] + a[i]", Value, ""},
        {"d[8]", Value, L + "Index in bit-select of name 'd' is out of range\n"},
        {"a[-1]", Value, L + "Index in bit-select of name 'a' is out of range\n"},
        {"d[1'bx]", Value, L + "Index in bit-select of name 'd' is undefined\n"},
        {"d[x]", Value, L + "Index in bit-select of name 'd' is illegal\n"},
        {"x[0]", Value, L + "Bit-select of name 'x' is illegal\n"},
        {"n[i]", NetLValue, L + "Index in bit-select of name 'n' must be constant\n"},
        {"d[i]", VarLValue, ""},
        {"d[7:4] + a[0:3] + d[3:3]", Value, ""},
        {"d[4:7]", Value, L + "Indices in part-select of name 'd' are reversed\n"},
        {"a[7:0]", Value, L + "Indices in part-select of name 'a' are reversed\n"},
        {"d[9:0]", Value, L + "Most significant bit operand in part-select of name 'd' is out of range\n"},
        {"d[7:-1]", Value, L + "Least significant bit operand in part-select of name 'd' is out of range\n"},
        {"d[i:0]", Value, L + "Most significant bit operand in part-select of name 'd' is illegal\n"},
        {"d[7:1'bz]", Value, L + "Least significant bit operand in part-select of name 'd' is undefined\n"},
        {"x[1:0]", Value, L + "Part-select of name 'x' is illegal\n"},
        {"d[i +: 4] + a[2 -: 3]", Value, ""},
        {"n[i +: 2]", NetLValue, L + "Base operand in indexed part-select of name 'n' must be constant\n"},
        {"d[8 +: 2]", Value, L + "Base operand in indexed part-select of name 'd' is out of range\n"},
        {"d[2'bx1 +: 2]", Value, L + "Base operand in indexed part-select of name 'd' is undefined\n"},
        {"d[x +: 2]", Value, L + "Base operand in indexed part-select of name 'd' is illegal\n"},
        {"d[0 +: i]", Value, L + "Width operand in indexed part-select of name 'd' is illegal\n"},
        {"d[0 +: 1'bx]", Value, L + "Width operand in indexed part-select of name 'd' is undefined\n"},
        {"d[0 +: 0]", Value, L + "Width operand in indexed part-select of name 'd' must be > 0\n"},
        {"d[0 +: 9]", Value, L + "Width operand in indexed part-select of name 'd' is out of range\n"},
        {"d[6 +: 3]", Value, L + "Width operand in indexed part-select of name 'd' is out of range\n"},
        {"a[1 -: 3]", Value, L + "Width operand in indexed part-select of name 'a' is out of range\n"},
        {"d[i +: 8]", Value, ""},
        {"d[i +: 9]", Value, L + "Width operand in indexed part-select of name 'd' is out of range\n"},
        {"x[0 +: 1]", Value, L + "Indexed part-select of name 'x' is illegal\n"},
    });
    EXPECT_EQ(b.expr("d[0]")->isA(BitSelect), true);
    EXPECT_EQ(static_cast<Tn_VerilogOperand*>(b.expr("a[1 +: 2]"))->describe(), "indexed part-select of name 'a'");
    EXPECT_EQ(static_cast<Tn_VerilogOperand*>(b.expr("a[1]"))->describe(), "bit-select of name 'a'");
}

TEST_F(Names, WordSelectChecks) {
    b.array(m, "mem", b.reg("7:0"), {"0:3"});
    b.array(m, "nets", b.wire("1:0"), {"3:0"});
    b.array(m, "two", b.reg(), {"0:1", "5:2"});
    b.var(m, "i", b.integer());
    b.param(m, "P", "8'hff");
    const std::string L = "\"t.v\" line 1 ";
    expectMessages({
        {"mem[0] + mem[i] + two[1][2] + mem[3][7] + mem[1][3:0]", Value, ""},
        {"mem[i]", VarLValue, ""},
        {"nets[2]", NetLValue, ""},
        {"nets[i]", NetLValue, L + "Index 1 in word-select of name 'nets' must be constant\n"},
        {"mem[4]", Value, L + "Index 1 in word-select of name 'mem' is out of range\n"},
        {"two[0][6]", Value, L + "Index 2 in word-select of name 'two' is out of range\n"},
        {"mem[1'bx]", Value, L + "Index 1 in word-select of name 'mem' is undefined\n"},
        {"mem[1.5]", Value, L + "Index 1 in word-select of name 'mem' is illegal\n"},
        {"mem[0]", NetLValue, L + "Reference to word-select of name 'mem' is not a legal net lvalue\n"},
        {"nets[0]", VarLValue, L + "Reference to word-select of name 'nets' is not a legal reg or variable lvalue\n"},
        {"mem[0][8]", Value, L + "Index in bit-select of word-select of name 'mem' is out of range\n"},
        {"mem", VarLValue, L + "Reference to name 'mem' is not a legal reg or variable lvalue\n"},
    });
    // Word-selects made by hand: on a non-array, on a parameter, with too few indices.
    auto word = [&](const char* name, int indices) {
        Tn_VerilogWordSelect* w = b.factory().createWordSelect(Tn_Location("t.v", 1));
        w->Operand = static_cast<Tn_VerilogName*>(b.expr(name));
        for (int k = 0; k < indices; ++k) w->Index.push_back(b.expr("0"));
        sink.clear();
        w->typeAs(b.context(m), Value);
        return sink.errors();
    };
    EXPECT_EQ(word("i", 1), Texts{L + "Word-select of name 'i' is illegal\n"});
    EXPECT_EQ(word("two", 1), Texts{L + "Word-select of name 'two' is illegal\n"});
    EXPECT_EQ(word("P", 1), Texts{L + "Parameters cannot be indexed as an array\n"});
    // Memories hold no constants.
    Tn_VerilogExpression* w = b.expr("mem[0]");
    w->typeAs(b.context(m), Value);
    EXPECT_EQ(w->contextWidth(0), 8u);
    EXPECT_FALSE(w->isConstant());
    sink.clear();
    EXPECT_TRUE(w->value()->isNull());
    EXPECT_EQ(sink.errors(), Texts{L + "Evaluation of word-select operation not implemented\n"});
}
