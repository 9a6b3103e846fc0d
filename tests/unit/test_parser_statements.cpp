// Statements and timing controls as the parser builds them.
#include <gtest/gtest.h>

#include "tests/support/parse.h"

namespace {

using namespace Tn_Verilog;

class ParserStatements : public ParseTest {
protected:
    // The statement of the one initial process of "module m; <decls> initial <text> endmodule".
    Tn_VerilogStatement* statement(const std::string& text, const std::string& decls = "reg a, b, c; event e;") {
        Tn_VerilogModule* m = clean("module m;\n" + decls + "\ninitial\n" + text + "\nendmodule\n");
        if (!m || m->Process.empty()) return nullptr;
        return m->Process.back()->Statement;
    }
    template <class T>
    T* as(const std::string& text) {
        T* s = Tn_VerilogNode::cast<T>(statement(text));
        EXPECT_NE(s, nullptr) << text;
        return s;
    }
};

TEST_F(ParserStatements, Assignments) {
    Tn_VerilogBlockingAssign* b = as<Tn_VerilogBlockingAssign>("a = b & c;");
    ASSERT_NE(b, nullptr);
    EXPECT_EQ(shape(b->Target), "a");
    EXPECT_EQ(shape(b->Source), "(& b c)");
    EXPECT_EQ(b->TimingControl.get(), nullptr);
    Tn_VerilogNonBlockingAssign* nb = as<Tn_VerilogNonBlockingAssign>("{a, b} <= #2 c;");
    ASSERT_NE(nb, nullptr);
    EXPECT_TRUE(nb->Target->isA(ConcatOp));
    Tn_VerilogDelayControl* d = Tn_VerilogNode::cast<Tn_VerilogDelayControl>(nb->TimingControl.get());
    ASSERT_NE(d, nullptr);
    EXPECT_EQ(d->Statement.get(), nullptr);
    Tn_VerilogBlockingAssign* ev = as<Tn_VerilogBlockingAssign>("a = @(posedge b) c;");
    ASSERT_NE(ev, nullptr);
    EXPECT_TRUE(ev->TimingControl->isA(EventControl));
    Tn_VerilogBlockingAssign* rep = as<Tn_VerilogBlockingAssign>("a = repeat (3) @(negedge b) c;");
    ASSERT_NE(rep, nullptr);
    Tn_VerilogRepeatControl* r = Tn_VerilogNode::cast<Tn_VerilogRepeatControl>(rep->TimingControl.get());
    ASSERT_NE(r, nullptr);
    EXPECT_EQ(shape(r->Count), "3");
    EXPECT_TRUE(r->Event->isA(UnaryEventOp));
    EXPECT_NE(as<Tn_VerilogAssign>("assign a = b;"), nullptr);
    EXPECT_NE(as<Tn_VerilogForce>("force a = b;"), nullptr);
    EXPECT_NE(as<Tn_VerilogDeassign>("deassign a;"), nullptr);
    EXPECT_NE(as<Tn_VerilogRelease>("release a;"), nullptr);
}

TEST_F(ParserStatements, IfChainsAndCases) {
    Tn_VerilogIf* i = as<Tn_VerilogIf>("if (a) b = 1; else if (b) c = 1; else if (c) ; else a = 0;");
    ASSERT_NE(i, nullptr);
    Tn_VerilogIf* i2 = Tn_VerilogNode::cast<Tn_VerilogIf>(i->FalseStatement.get());
    ASSERT_NE(i2, nullptr);
    Tn_VerilogIf* i3 = Tn_VerilogNode::cast<Tn_VerilogIf>(i2->FalseStatement.get());
    ASSERT_NE(i3, nullptr);
    EXPECT_TRUE(i3->TrueStatement->isA(NullStatement));
    EXPECT_TRUE(i3->FalseStatement->isA(BlockingAssign));
    // The else belongs to the nearest if.
    Tn_VerilogIf* outer = as<Tn_VerilogIf>("if (a) if (b) c = 1; else c = 0;");
    ASSERT_NE(outer, nullptr);
    EXPECT_EQ(outer->FalseStatement.get(), nullptr);
    EXPECT_NE(Tn_VerilogNode::cast<Tn_VerilogIf>(outer->TrueStatement.get())->FalseStatement.get(), nullptr);

    Tn_VerilogCase* c = as<Tn_VerilogCase>("casez (a) 1'b0, 1'b1: b = 1; default c = 0; endcase");
    ASSERT_NE(c, nullptr);
    EXPECT_EQ(c->CaseType, CaseZ);
    ASSERT_EQ(c->CaseItem.size(), 2u);
    EXPECT_EQ(c->CaseItem[0]->Expression.size(), 2u);
    EXPECT_TRUE(c->CaseItem[1]->Expression.empty());
    EXPECT_EQ(as<Tn_VerilogCase>("casex (a) default: ; endcase")->CaseType, CaseX);
    EXPECT_EQ(as<Tn_VerilogCase>("case (a) 0: ; endcase")->CaseType, PlainCase);
}

TEST_F(ParserStatements, LoopsAndWait) {
    Tn_VerilogFor* f = as<Tn_VerilogFor>("for (a = 0; a < 4; a = a + 1) b = a;");
    ASSERT_NE(f, nullptr);
    EXPECT_TRUE(f->Initializer->isA(BlockingAssign));
    EXPECT_EQ(shape(f->Condition), "(< a 4)");
    EXPECT_TRUE(f->Incrementor->isA(BlockingAssign));
    EXPECT_TRUE(f->Statement->isA(BlockingAssign));
    EXPECT_NE(as<Tn_VerilogWhile>("while (a) a = a - 1;"), nullptr);
    EXPECT_NE(as<Tn_VerilogRepeat>("repeat (4) a = ~a;"), nullptr);
    EXPECT_NE(as<Tn_VerilogForever>("forever #5 a = ~a;"), nullptr);
    Tn_VerilogWait* w = as<Tn_VerilogWait>("wait (a) ;");
    ASSERT_NE(w, nullptr);
    EXPECT_TRUE(w->Statement->isA(NullStatement));
}

TEST_F(ParserStatements, BlocksAndNamedBlocks) {
    Tn_VerilogModule* m = clean(
        "module m;\n"
        "initial begin : outer\n"
        "  integer i; reg [3:0] r; parameter P = 2;\n"
        "  fork : inner\n"
        "    reg x;\n"
        "    x = 1;\n"
        "    disable outer;\n"
        "  join\n"
        "  begin r = P; end\n"
        "end\n"
        "endmodule\n");
    ASSERT_NE(m, nullptr);
    Tn_VerilogNamedBlockStatement* s = Tn_VerilogNode::cast<Tn_VerilogNamedBlockStatement>(m->Process[0]->Statement.get());
    ASSERT_NE(s, nullptr);
    EXPECT_EQ(s->Name.str().str(), "outer");
    // The block is a scope of the module; the statement refers to it.
    ASSERT_EQ(m->Block.size(), 1u);
    Tn_VerilogBlock* outer = m->Block[0];
    EXPECT_EQ(s->Block.get(), outer);
    EXPECT_EQ(outer->BlockType, SequentialBlock);
    EXPECT_EQ(outer->Parent.get(), m);
    EXPECT_EQ(outer->Variable.size(), 2u);
    EXPECT_EQ(outer->Parameter.size(), 1u);
    ASSERT_EQ(outer->Statement.size(), 2u);
    ASSERT_EQ(outer->Block.size(), 1u);
    Tn_VerilogBlock* inner = outer->Block[0];
    EXPECT_EQ(inner->BlockType, ParallelBlock);
    EXPECT_EQ(inner->Statement.size(), 2u);
    EXPECT_TRUE(inner->Statement[1]->isA(Disable));
    Tn_VerilogBlockStatement* plain = Tn_VerilogNode::cast<Tn_VerilogBlockStatement>(outer->Statement[1]);
    ASSERT_NE(plain, nullptr);
    EXPECT_EQ(plain->Statement.size(), 1u);
}

TEST_F(ParserStatements, TimingControls) {
    Tn_VerilogDelayControl* d = as<Tn_VerilogDelayControl>("#(1:2:3) a = 1;");
    ASSERT_NE(d, nullptr);
    EXPECT_TRUE(d->Delay->isA(MinTypMaxOp));
    EXPECT_TRUE(d->Statement->isA(BlockingAssign));
    Tn_VerilogEventControl* e = as<Tn_VerilogEventControl>("@(posedge a or negedge b, c) ;");
    ASSERT_NE(e, nullptr);
    Tn_VerilogEventOrOp* o = Tn_VerilogNode::cast<Tn_VerilogEventOrOp>(e->Event.get());
    ASSERT_NE(o, nullptr);
    ASSERT_EQ(o->Operand.size(), 3u);
    EXPECT_EQ(Tn_VerilogNode::cast<Tn_VerilogUnaryEventOp>(o->Operand[0])->OpType, PosedgeOp);
    EXPECT_EQ(Tn_VerilogNode::cast<Tn_VerilogUnaryEventOp>(o->Operand[1])->OpType, NegedgeOp);
    EXPECT_TRUE(o->Operand[2]->isA(SimpleName));
    EXPECT_TRUE(as<Tn_VerilogEventControl>("@e ;")->Event->isA(SimpleName));
    // A star, with or without parentheses, leaves the event list to elaboration.
    for (const char* star : {"@* a = b;", "@(*) a = b;", "@( * ) a = b;"}) {
        Tn_VerilogEventControl* s = as<Tn_VerilogEventControl>(star);
        ASSERT_NE(s, nullptr);
        EXPECT_EQ(s->Event.get(), nullptr) << star;
    }
    result = parse("module m; reg a; initial @() a = 1; endmodule\n");
    EXPECT_EQ(errors(), Texts{loc(1) + "Empty sensitivity list"});
    ASSERT_NE(result.module("m"), nullptr);
}

TEST_F(ParserStatements, CallsAndTriggers) {
    Tn_VerilogModule* m = clean(
        "module m;\n"
        "event e;\n"
        "task t; input a, b; ; endtask\n"
        "initial begin\n"
        "  t(1, 2);\n"
        "  top.u.t(3, 4);\n"
        "  t;\n"
        "  $display(\"%d\", 1);\n"
        "  $stop;\n"
        "  -> e;\n"
        "end\n"
        "endmodule\n");
    ASSERT_NE(m, nullptr);
    Tn_VerilogBlockStatement* b = Tn_VerilogNode::cast<Tn_VerilogBlockStatement>(m->Process[0]->Statement.get());
    ASSERT_EQ(b->Statement.size(), 6u);
    Tn_VerilogUserTaskCall* t = Tn_VerilogNode::cast<Tn_VerilogUserTaskCall>(b->Statement[0]);
    ASSERT_NE(t, nullptr);
    EXPECT_EQ(t->Param.size(), 2u);
    EXPECT_TRUE(Tn_VerilogNode::cast<Tn_VerilogUserTaskCall>(b->Statement[1])->Name->isA(SelectedName));
    EXPECT_TRUE(Tn_VerilogNode::cast<Tn_VerilogUserTaskCall>(b->Statement[2])->Param.empty());
    Tn_VerilogSystemTaskCall* s = Tn_VerilogNode::cast<Tn_VerilogSystemTaskCall>(b->Statement[3]);
    ASSERT_NE(s, nullptr);
    EXPECT_EQ(s->Name.str().str(), "$display");
    EXPECT_EQ(s->Param.size(), 2u);
    EXPECT_TRUE(b->Statement[5]->isA(EventTrigger));
    // A select is no task.
    result = parse("module m; reg [1:0] r; initial r[0]; endmodule\n");
    EXPECT_EQ(errors().size(), 1u);
}

TEST_F(ParserStatements, StatementAttributes) {
    Tn_VerilogStatement* s = statement("(* parallel_case *) case (a) default: ; endcase");
    ASSERT_NE(s, nullptr);
    ASSERT_NE(s->Attributes.get(), nullptr);
    EXPECT_EQ(s->Attributes->Attribute[0]->Name.str().str(), "parallel_case");
}

TEST_F(ParserStatements, DumpOfAStatement) {
    Tn_VerilogStatement* s = statement("if (a) b = 1'b1;");
    ASSERT_NE(s, nullptr);
    const std::string d = dumpOf(s);
    EXPECT_NE(d.find("Node:Tn_VerilogIf = "), std::string::npos) << d;
    EXPECT_NE(d.find("  Location = " + (dir / "t.v") + ":4\n"), std::string::npos) << d;
    EXPECT_NE(d.find("  Condition:Tn_VerilogSimpleName = "), std::string::npos) << d;
    EXPECT_NE(d.find("    Name:Port_String = \"a\""), std::string::npos) << d;
    EXPECT_NE(d.find("  TrueStatement:Tn_VerilogBlockingAssign = "), std::string::npos) << d;
    EXPECT_NE(d.find("    Source:Tn_VerilogVectorConst = "), std::string::npos) << d;
    EXPECT_NE(d.find("  FalseStatement:Tn_VerilogStatement = nil"), std::string::npos) << d;
}

}  // namespace
