// Generate constructs, user-defined primitives and specify blocks as the
// parser builds them, with their checks.
#include <gtest/gtest.h>

#include "tests/support/parse.h"

namespace {

using namespace Tn_Verilog;

class ParserGenerate : public ParseTest {};
class ParserUdp : public ParseTest {};
class ParserSpecify : public ParseTest {};

// ------------------------------------------------------------------ generate

TEST_F(ParserGenerate, RegionsAndStatements) {
    Tn_VerilogModule* m = clean(
        "module m;\n"
        "genvar i;\n"
        "generate\n"
        "  wire in_region;\n"
        "  child direct();\n"
        "  for (i = 0; i < 4; i = i + 1) begin : loop\n"
        "    wire w;\n"
        "    child c(.a(w));\n"
        "  end\n"
        "  if (W > 2) begin : big child b(); end\n"
        "  else if (W > 1) child sm();\n"
        "  else ;\n"
        "  case (W) 1, 2: begin : one end default: child d(); endcase\n"
        "endgenerate\n"
        "endmodule\n");
    ASSERT_NE(m, nullptr);
    // The region holds its items; its names are the module's.
    ASSERT_EQ(m->Generate.size(), 1u);
    Tn_VerilogGenerate* region = m->Generate[0];
    EXPECT_TRUE(region->Name.IsEmpty());
    EXPECT_EQ(region->ModuleInstance.size(), 1u);
    EXPECT_NE(region->Variable.find(Tn_Symbol("in_region")), nullptr);
    ASSERT_EQ(region->GenerateStatement.size(), 3u);

    Tn_VerilogGenerateFor* f = Tn_VerilogNode::cast<Tn_VerilogGenerateFor>(region->GenerateStatement[0]);
    ASSERT_NE(f, nullptr);
    EXPECT_EQ(shape(f->Index), "i");
    EXPECT_EQ(shape(f->Condition), "(< i 4)");
    EXPECT_TRUE(f->Initializer->isA(BlockingAssign));
    EXPECT_TRUE(f->Incrementor->isA(BlockingAssign));
    ASSERT_NE(f->GenerateArray.get(), nullptr);
    EXPECT_EQ(f->GenerateArray->Name.str().str(), "loop");
    ASSERT_EQ(f->GenerateArray->Generate.size(), 1u);
    Tn_VerilogGenerate* body = f->GenerateArray->Generate.find(0);
    ASSERT_NE(body, nullptr);
    EXPECT_EQ(body->Name.str().str(), "loop");
    EXPECT_EQ(body->Parent.get(), f->GenerateArray.get());
    EXPECT_EQ(body->ModuleInstance.size(), 1u);
    EXPECT_NE(body->Variable.find(Tn_Symbol("w")), nullptr);

    Tn_VerilogGenerateIf* i = Tn_VerilogNode::cast<Tn_VerilogGenerateIf>(region->GenerateStatement[1]);
    ASSERT_NE(i, nullptr);
    Tn_VerilogGenerateBlock* big = Tn_VerilogNode::cast<Tn_VerilogGenerateBlock>(i->TrueStatement.get());
    ASSERT_NE(big, nullptr);
    EXPECT_EQ(big->Generate->Name.str().str(), "big");
    Tn_VerilogGenerateIf* elif = Tn_VerilogNode::cast<Tn_VerilogGenerateIf>(i->FalseStatement.get());
    ASSERT_NE(elif, nullptr);
    Tn_VerilogGenerateBlock* single = Tn_VerilogNode::cast<Tn_VerilogGenerateBlock>(elif->TrueStatement.get());
    ASSERT_NE(single, nullptr);
    EXPECT_TRUE(single->Generate->Name.IsEmpty());
    EXPECT_EQ(single->Generate->ModuleInstance.size(), 1u);
    EXPECT_EQ(elif->FalseStatement.get(), nullptr);

    Tn_VerilogGenerateCase* c = Tn_VerilogNode::cast<Tn_VerilogGenerateCase>(region->GenerateStatement[2]);
    ASSERT_NE(c, nullptr);
    ASSERT_EQ(c->CaseItem.size(), 2u);
    EXPECT_EQ(c->CaseItem[0]->Expression.size(), 2u);
    EXPECT_TRUE(c->CaseItem[1]->Expression.empty());
    EXPECT_NE(c->CaseItem[1]->Statement.get(), nullptr);
}

TEST_F(ParserGenerate, ConstructsOutsideARegionAndInlineGenvars) {
    Tn_VerilogModule* m = clean(
        "module m;\n"
        "for (genvar k = 0; k < 2; k = k + 1) begin : l assign x[k] = 1'b0; end\n"
        "if (1) begin : c end\n"
        "wire [1:0] x;\n"
        "endmodule\n");
    ASSERT_NE(m, nullptr);
    EXPECT_EQ(m->GenerateStatement.size(), 2u);
    EXPECT_EQ(m->GenVar.size(), 1u);
}

TEST_F(ParserGenerate, LoopBodyRules) {
    result = parse(
        "module m;\n"
        "genvar i, j;\n"
        "generate\n"
        "for (i = 0; i < 2; i = i + 1) begin wire a; end\n"
        "for (i = 0; i < 2; i = i + 1) if (i) begin : x end\n"
        "for (i = 0; i < 2; i = i + 1) assign y = 1;\n"
        "for (i = 0; i < 2; j = i + 1) begin : z end\n"
        "for (i = 0; i < 2; i = i + 1) begin : z end\n"
        "endgenerate\n"
        "endmodule\n");
    EXPECT_EQ(errors(), (Texts{loc(4) + "Generated begin-end blocks must be named",
                               loc(5) + "Conditionally generated items must appear with a named begin-end block",
                               loc(6) + "Generated begin-end blocks must be named",
                               loc(7) + "Generate for increment must update 'i'",
                               loc(8) + "Illegal redeclaration of 'z'"}));
    ASSERT_NE(result.module("m"), nullptr);
    EXPECT_EQ(result.module("m")->Generate[0]->GenerateStatement.size(), 5u);
}

TEST_F(ParserGenerate, BranchesMayReuseABlockNameAndBlocksAreScopes) {
    clean(
        "module m;\n"
        "generate\n"
        "if (1) begin : g wire w; end else begin : g wire w; end\n"
        "case (1) 0: begin : h wire w; end default: begin : h reg w; end endcase\n"
        "endgenerate\n"
        "endmodule\n");
    result = parse("module m; generate if (1) begin : g wire w; wire w; end endgenerate endmodule\n");
    EXPECT_EQ(errors(), Texts{loc(1) + "Illegal redeclaration of 'w'"});
}

// ---------------------------------------------------------------------- UDPs

TEST_F(ParserUdp, CombinationalAndSequentialTables) {
    result = parse(
        "primitive mux (y, s, a, b);\n"
        "  output y; input s, a, b;\n"
        "  table\n"
        "    0 0 ? : 0;\n"
        "    0 1 ? : 1;\n"
        "    1 ? 0 : 0;  1 ? 1 : 1;\n"
        "    x 0 0 : 0;\n"
        "  endtable\n"
        "endprimitive\n"
        "primitive dff (q, clk, d, rst);\n"
        "  output q; reg q; input clk, d, rst;\n"
        "  initial q = 1'b0;\n"
        "  table\n"
        "    r 0 0 : ? : 0;\n"
        "    (01) 1 0 : ? : 1;\n"
        "    (0x) ? 0 : ? : -;\n"
        "    f ? 0 : ? : -;\n"
        "    ? * 0 : ? : -;\n"
        "    ? ? 1 : ? : 0;\n"
        "    ? ? (?0) : ? : -;\n"
        "    p 1 0 : 1 : 1;\n"
        "    n ? 0 : ? : -;\n"
        "  endtable\n"
        "endprimitive\n");
    EXPECT_EQ(errors(), Texts{});
    Tn_VerilogUdpDefn* mux = result.udp("mux");
    ASSERT_NE(mux, nullptr);
    EXPECT_EQ(mux->PrimitiveType, Comb);
    EXPECT_EQ(mux->IODeclaration.size(), 4u);
    ASSERT_EQ(mux->TableEntry.size(), 5u);
    EXPECT_EQ(mux->TableEntry[0]->TableRow.str().str(), "00?:0");
    EXPECT_EQ(mux->TableEntry[0]->RowType, CombinationalRow);
    EXPECT_EQ(mux->TableEntry[3]->location().line, 6);
    Tn_VerilogUdpDefn* dff = result.udp("dff");
    ASSERT_NE(dff, nullptr);
    EXPECT_EQ(dff->PrimitiveType, Seq);
    ASSERT_NE(dff->Initial.get(), nullptr);
    Tn_VerilogBlockingAssign* init = Tn_VerilogNode::cast<Tn_VerilogBlockingAssign>(dff->Initial->Statement.get());
    ASSERT_NE(init, nullptr);
    EXPECT_EQ(shape(init->Target), "q");
    ASSERT_EQ(dff->TableEntry.size(), 9u);
    EXPECT_EQ(dff->TableEntry[0]->TableRow.str().str(), "r00:?:0");
    EXPECT_EQ(dff->TableEntry[0]->RowType, EdgeRow);
    EXPECT_EQ(dff->TableEntry[1]->TableRow.str().str(), "(01)10:?:1");
    EXPECT_EQ(dff->TableEntry[5]->RowType, LevelRow);
}

TEST_F(ParserUdp, AnsiHeaderWithInitialValue) {
    result = parse(
        "primitive latch (output reg q = 1'b1, input en, d);\n"
        "  table 1 0 : ? : 0; 1 1 : ? : 1; 0 ? : ? : -; endtable\n"
        "endprimitive\n");
    EXPECT_EQ(errors(), Texts{});
    Tn_VerilogUdpDefn* u = result.udp("latch");
    ASSERT_NE(u, nullptr);
    EXPECT_EQ(u->PrimitiveType, Seq);
    ASSERT_NE(u->Initial.get(), nullptr);
    EXPECT_EQ(u->IODeclaration.size(), 3u);
}

TEST_F(ParserUdp, PortChecks) {
    result = parse(
        "primitive p1 (y, a); input y; input a; table 0 : 1; endtable endprimitive\n"
        "primitive p2 (y, a, b); output y; output b; input a; table 0 0 : 1; endtable endprimitive\n"
        "primitive p3 (y, a, b); output y; input a; table 0 0 : 1; endtable endprimitive\n"
        "primitive p4 (y, a); output y; input a, c; table 0 : 1; endtable endprimitive\n");
    EXPECT_EQ(errors(), (Texts{loc(1) + "First UDP port, 'y', must be an output.",
                               loc(2) + "UDP port 'b' must be an input.",
                               loc(3) + "UDP identifier 'b' must be declared with a port mode.",
                               loc(4) + "UDP declaration 'c' does not appear in the port list."}));
    EXPECT_NE(result.udp("p4"), nullptr);
}

TEST_F(ParserUdp, InitialValueChecks) {
    result = parse(
        "primitive a (output reg q = 0, input d); initial q = 1; table 0 : ? : 0; endtable endprimitive\n"
        "primitive b (q, d); output q; reg q; input d; initial q = 2'b01; table 0 : ? : 0; endtable endprimitive\n"
        "primitive c (q, d); output q; reg q; input d; initial q = d; table 0 : ? : 0; endtable endprimitive\n"
        "primitive e (q, d); output q; reg q; input d; initial q = 1'bx; table 0 : ? : 0; endtable endprimitive\n");
    EXPECT_EQ(errors(), (Texts{loc(1) + "UDP output already has initial value.",
                               loc(2) + "UDP must be initialized to a single bit value."}));
    EXPECT_EQ(warnings(), Texts{loc(3) + "No initializer found.  Defaulting to X."});
    Tn_VerilogBlockingAssign* init = Tn_VerilogNode::cast<Tn_VerilogBlockingAssign>(result.udp("c")->Initial->Statement.get());
    ASSERT_NE(init, nullptr);
    EXPECT_EQ(shape(init->Source), "based constant 1'bx");
}

TEST_F(ParserUdp, RowChecks) {
    result = parse(
        "primitive s (q, c, d);\n"
        "  output q; reg q; input c, d;\n"
        "  table\n"
        "    r 0 : ? : 0;\n"
        "    r : ? : 0;\n"
        "    r f : ? : 0;\n"
        "    (0) 1 : ? : 1;\n"
        "    (0101) 1 : ? : 1;\n"
        "    (01) 1 : ? : 1;\n"
        "    (0?) 1 : ? : 0;\n"
        "    r 0 : 0 : -;\n"
        "    r 0 : 1 : 1;\n"
        "    ? 1 : ? : 1;\n"
        "    ? 1 : ? : 0;\n"
        "  endtable\n"
        "endprimitive\n"
        "primitive k (y, a); output y; input a; table r : 1; 0 : -; endtable endprimitive\n");
    EXPECT_EQ(errors(), (Texts{loc(5) + "Number of input columns in table must match number of inputs.",
                               loc(6) + "Multiple edge symbols not allowed in single table row.",
                               loc(7) + "Invalid edge specification.", loc(8) + "Invalid edge specification.",
                               loc(10) + "UDP table entry conflicts with earlier entry at " + loc(9) + ".",
                               loc(12) + "UDP table entry conflicts with earlier entry at " + loc(4) + ".",
                               loc(14) + "UDP table entry conflicts with earlier entry at " + loc(13) + ".",
                               loc(17) + "Edge symbols are not allowed in a combinational UDP table.",
                               loc(17) + "Output '-' is not allowed in a combinational UDP table."}));
    // Every row is kept.
    EXPECT_EQ(result.udp("s")->TableEntry.size(), 11u);
}

TEST_F(ParserUdp, RowsOfTheWrongShapeAreSyntaxErrors) {
    result = parse("primitive s (q, c); output q; reg q; input c; table r : 0; endtable endprimitive\n");
    EXPECT_EQ(errors().size(), 1u);
    result = parse("primitive s (q, c); output q; input c; table r : 0 : 1; endtable endprimitive\n");
    EXPECT_EQ(errors().size(), 1u);
}

// ----------------------------------------------------------------- specify

TEST_F(ParserSpecify, PathsAndPulseControls) {
    Tn_VerilogModule* m = clean(
        "module m(input a, b, clk, output q, r, inout io);\n"
        "specify\n"
        "  specparam tpd = 1.5, PATHPULSE$a$q = (0.5, 1);\n"
        "  (a => q) = tpd;\n"
        "  (a, b *> q, r) = (1, 2);\n"
        "  (a +=> q) = (1, 2, 3);\n"
        "  (b -*> r) = (1, 2, 3, 4, 5, 6);\n"
        "  if (a == 1'b1 && !b) (b => q) = 1;\n"
        "  ifnone (b => r) = 1;\n"
        "  (posedge clk => (q +: a)) = (1:2:3, 2:3:4);\n"
        "  (negedge clk *> (q, r : b)) = (1,1,1,1,1,1,1,1,1,1,1,1);\n"
        "  pulsestyle_onevent q;\n"
        "  pulsestyle_ondetect q, r;\n"
        "  showcancelled r;\n"
        "  noshowcancelled io;\n"
        "endspecify\n"
        "endmodule\n");
    ASSERT_NE(m, nullptr);
    EXPECT_EQ(m->SpecParam.size(), 2u);
    EXPECT_TRUE(m->SpecParam[1]->Expr->isA(ListOp));
    ASSERT_EQ(m->Path.size(), 8u);
    Tn_VerilogPath* p = m->Path[0];
    EXPECT_EQ(p->PathType, ParallelPath);
    ASSERT_EQ(p->Input.size(), 1u);
    EXPECT_EQ(p->Input[0]->Direction, InputPort);
    EXPECT_EQ(p->Output[0]->Direction, OutputPort);
    EXPECT_EQ(static_cast<Tn_VerilogListOp*>(p->Delay.get())->Operand.size(), 1u);
    EXPECT_EQ(m->Path[1]->PathType, FullPath);
    EXPECT_EQ(m->Path[1]->Input.size(), 2u);
    EXPECT_EQ(m->Path[1]->Output.size(), 2u);
    EXPECT_EQ(m->Path[2]->Polarity, PositivePolarity);
    EXPECT_EQ(m->Path[3]->Polarity, NegativePolarity);
    EXPECT_EQ(shape(m->Path[4]->Condition), "(&& (== a based constant 1'b1) (! b))");
    EXPECT_TRUE(m->Path[5]->IfNoneFlag);
    Tn_VerilogPath* edge = m->Path[6];
    EXPECT_EQ(edge->Input[0]->Edge, Posedge);
    EXPECT_EQ(edge->DataPolarity, PositivePolarity);
    ASSERT_NE(edge->Data.get(), nullptr);
    EXPECT_TRUE(edge->Data->isA(PathTerm));
    EXPECT_EQ(m->PulseControl.size(), 4u);
    EXPECT_EQ(m->PulseControl[1]->PulseControlType, PulseStyleOnDetect);
    EXPECT_EQ(m->PulseControl[1]->Output.size(), 2u);
    EXPECT_EQ(m->PulseControl[3]->PulseControlType, NoShowCancelled);
}

TEST_F(ParserSpecify, PathDelayCounts) {
    result = parse(
        "module m(input a, output q);\n"
        "specify\n"
        "(a => q) = (1, 2, 3, 4);\n"
        "(a => q) = (1, 2, 3, 4, 5);\n"
        "(a => q) = 1, 2;\n"
        "endspecify\n"
        "endmodule\n");
    EXPECT_EQ(errors(), (Texts{loc(3) + "Found 4 path delay values, must have 1, 2, 3, 6 or 12 values",
                               loc(4) + "Found 5 path delay values, must have 1, 2, 3, 6 or 12 values"}));
}

TEST_F(ParserSpecify, TimingChecks) {
    Tn_VerilogModule* m = clean(
        "module m(input clk, d, en, rst, output q);\n"
        "reg nt; wire dclk, dd;\n"
        "specify\n"
        "  $setup(d, posedge clk &&& en, 1.0, nt);\n"
        "  $hold(posedge clk, d, 0.5);\n"
        "  $setuphold(posedge clk, negedge d, 1, 2, nt, , , dclk, dd);\n"
        "  $recovery(posedge rst, posedge clk, 3);\n"
        "  $removal(posedge rst, posedge clk, 3, nt);\n"
        "  $recrem(posedge rst, posedge clk, 1, 2);\n"
        "  $skew(posedge clk, posedge d, 1);\n"
        "  $timeskew(posedge clk, posedge d, 1, nt, 1, 0);\n"
        "  $fullskew(posedge clk, negedge d, 1, 2);\n"
        "  $period(edge [01, x1] clk, 10, nt);\n"
        "  $width(negedge clk, 5, 1, nt);\n"
        "  $nochange(posedge clk, d, 0, 1);\n"
        "endspecify\n"
        "endmodule\n");
    ASSERT_NE(m, nullptr);
    ASSERT_EQ(m->Tchk.size(), 12u);
    Tn_VerilogTchk* setup = m->Tchk[0];
    EXPECT_EQ(setup->TchkType, Tn_Verilog::Setup);
    // $setup names the data event first.
    EXPECT_EQ(shape(setup->Data->Expression), "d");
    EXPECT_EQ(setup->Reference->Edge, Posedge);
    EXPECT_EQ(shape(setup->Reference->Condition), "en");
    EXPECT_EQ(shape(setup->Notifier), "nt");
    EXPECT_EQ(static_cast<Tn_VerilogListOp*>(setup->Delay.get())->Operand.size(), 1u);
    EXPECT_EQ(m->Tchk[1]->TchkType, Hold);
    EXPECT_EQ(m->Tchk[1]->Reference->Edge, Posedge);
    EXPECT_EQ(m->Tchk[1]->Notifier.get(), nullptr);
    Tn_VerilogTchk* sh = m->Tchk[2];
    EXPECT_EQ(sh->TchkType, SetupHold);
    EXPECT_EQ(static_cast<Tn_VerilogListOp*>(sh->Delay.get())->Operand.size(), 2u);
    EXPECT_EQ(sh->Data->Edge, Negedge);
    ASSERT_EQ(sh->Expression.size(), 4u);
    EXPECT_TRUE(sh->Expression[0]->isA(NullOp));
    EXPECT_EQ(shape(sh->Expression[3]), "dd");
    EXPECT_EQ(m->Tchk[7]->Expression.size(), 2u);
    Tn_VerilogTchk* period = m->Tchk[9];
    EXPECT_EQ(period->TchkType, Period);
    EXPECT_EQ(period->Data.get(), nullptr);
    EXPECT_EQ(period->Reference->Edge, Edge);
    EXPECT_EQ(period->Reference->EdgeDescriptors, (1u << 0) | (1u << 5));
    Tn_VerilogTchk* width = m->Tchk[10];
    EXPECT_EQ(width->TchkType, Width);
    ASSERT_EQ(width->Expression.size(), 1u);
    EXPECT_EQ(shape(width->Expression[0]), "1");
    EXPECT_EQ(shape(width->Notifier), "nt");
    EXPECT_EQ(static_cast<Tn_VerilogListOp*>(m->Tchk[11]->Delay.get())->Operand.size(), 2u);
}

TEST_F(ParserSpecify, MalformedTimingChecksAreSyntaxErrors) {
    for (const char* bad : {"$setup(d, clk);", "$hold(posedge clk, d, 1, n, x);", "$width(clk, posedge x);",
                            "$period(, 1);"}) {
        result = parse(std::string("module m; specify ") + bad + " endspecify endmodule\n");
        EXPECT_EQ(errors().size(), 1u) << bad;
    }
}

TEST_F(ParserSpecify, OtherSystemTasksAreSkippedWithAWarning) {
    result = parse(
        "module m(input a, output q);\n"
        "specify\n"
        "  $sdf_check(negedge a, (q), [1:0]);\n"
        "  $other;\n"
        "  (a => q) = 1;\n"
        "endspecify\n"
        "endmodule\n");
    EXPECT_EQ(errors(), Texts{});
    EXPECT_EQ(warnings(), (Texts{loc(3) + "Ignoring invalid system-task inside specify block",
                                 loc(4) + "Ignoring invalid system-task inside specify block"}));
    EXPECT_EQ(result.module("m")->Path.size(), 1u);
}

}  // namespace
