// Modules as the parser builds them: ports in both styles, declarations,
// module items, instances and gates, with the declaration rules and their
// messages, implicit nets, design units in the library and top-level units.
#include <gtest/gtest.h>

#include "tests/support/parse.h"

namespace {

using namespace Tn_Verilog;

class ParserModules : public ParseTest {};

Tn_VerilogVariable* variable(Tn_VerilogRegion* r, const char* name) { return r->Variable.find(Tn_Symbol(name)); }

template <class T>
T* typeOf(Tn_VerilogRegion* r, const char* name) {
    Tn_VerilogVariable* v = variable(r, name);
    return v ? Tn_VerilogNode::cast<T>(v->TypeDef.get()) : nullptr;
}

TEST_F(ParserModules, UnitsGoToTheLibraryWithTheirSettings) {
    result = parse(
        "`timescale 1ns/10ps\n"
        "`celldefine\n"
        "`unconnected_drive pull1\n"
        "(* keep *) module a; endmodule\n"
        "`resetall\n"
        "macromodule b(); endmodule\n"
        "primitive p(o, i); output o; input i; table 0 : 1; 1 : 0; endtable endprimitive\n");
    EXPECT_EQ(errors(), Texts{});
    EXPECT_EQ(result.compiled, (Tn_StringList{"a", "b", "p"}));
    Tn_VerilogModule* a = result.module("a");
    ASSERT_NE(a, nullptr);
    EXPECT_EQ(result.unit("a")->unitKind(), 0);
    EXPECT_EQ(result.unit("p")->unitKind(), 1);
    EXPECT_EQ(a->DefName.str().str(), "a");
    EXPECT_TRUE(a->Parent->isA(Root));
    EXPECT_TRUE(a->CellFlag);
    EXPECT_TRUE(a->HasTimescale);
    EXPECT_EQ(a->TimeUnit, -9);
    EXPECT_EQ(a->TimePrecision, -11);
    EXPECT_EQ(a->UnconnectedDrive, UnconnectedPull1);
    ASSERT_NE(a->Attributes.get(), nullptr);
    EXPECT_TRUE(a->Attributes->Attribute[0]->OnDefinitionFlag);
    EXPECT_GT(a->Weight, 0);
    Tn_VerilogModule* b = result.module("b");
    EXPECT_FALSE(b->CellFlag);
    EXPECT_FALSE(b->HasTimescale);
    EXPECT_EQ(b->UnconnectedDrive, UnconnectedNone);
    EXPECT_EQ(sink.statuses().back(), "UDP <p> compiled\n");
    EXPECT_EQ(sink.statuses()[sink.statuses().size() - 2], "Module <b> compiled\n");
}

TEST_F(ParserModules, RedeclaredModulesAreReportedAndBothParsed) {
    const std::string other = dir.write("o.v", "module m(input x); endmodule\n");
    result = parse("module m; endmodule\nmodule n; endmodule\n", {other});
    EXPECT_EQ(errors(), Texts{"\"" + other + "\" line 1 Illegal redeclaration of 'm'"});
    EXPECT_EQ(result.compiled, (Tn_StringList{"m", "n"}));
    // The later one takes the library's place.
    EXPECT_EQ(result.module("m")->Port.size(), 1u);
}

TEST_F(ParserModules, Verilog1995Ports) {
    Tn_VerilogModule* m = clean(
        "module m(a, b[3:0], {c, d}, .e(f), , g);\n"
        "input a; input [7:0] b; output c, d; inout f; output reg [1:0] g;\n"
        "wire d;\n"
        "endmodule\n");
    ASSERT_NE(m, nullptr);
    ASSERT_EQ(m->Port.size(), 6u);
    EXPECT_EQ(m->Port[0]->EffectiveName.str().str(), "a");
    EXPECT_EQ(m->Port[0]->Direction, InputPort);
    EXPECT_TRUE(m->Port[0]->LoConn->isA(SimpleName));
    EXPECT_TRUE(m->Port[1]->EffectiveName.IsEmpty());
    EXPECT_TRUE(m->Port[1]->LoConn->isA(PartSelect));
    EXPECT_TRUE(m->Port[2]->LoConn->isA(ConcatOp));
    EXPECT_EQ(m->Port[2]->Direction, OutputPort);
    EXPECT_EQ(m->Port[3]->EffectiveName.str().str(), "e");
    EXPECT_TRUE(m->Port[3]->NamedPortConnectionFlag);
    EXPECT_EQ(m->Port[3]->Direction, InoutPort);
    EXPECT_EQ(m->Port[4]->LoConn.get(), nullptr);
    EXPECT_EQ(m->Port[5]->Index, 5);
    // Ports without a net or variable get a net of the default type; the
    // direction declarations take the type of theirs.
    ASSERT_EQ(m->IODeclaration.size(), 6u);
    Tn_VerilogNet* a = typeOf<Tn_VerilogNet>(m, "a");
    ASSERT_NE(a, nullptr);
    EXPECT_EQ(a->NetType, Wire);
    Tn_VerilogNet* b = typeOf<Tn_VerilogNet>(m, "b");
    ASSERT_NE(b, nullptr);
    EXPECT_NE(b->Range.get(), nullptr);
    EXPECT_NE(typeOf<Tn_VerilogReg>(m, "g"), nullptr);
    for (Tn_VerilogIODeclaration* io : m->IODeclaration) EXPECT_NE(io->TypeDef.get(), nullptr) << io->Name.c_str();
}

TEST_F(ParserModules, PortListChecks) {
    result = parse(
        "module m(a, b, c);\n"
        "input a;\n"
        "input x;\n"
        "output c;\n"
        "endmodule\n");
    EXPECT_EQ(errors(), (Texts{loc(3) + "Signal 'x' is not referenced in the module port list",
                               loc(1) + "Port reference 'b' was not declared as input, inout or output"}));
    ASSERT_NE(result.module("m"), nullptr);
}

TEST_F(ParserModules, AnsiPortsAndParameterPortList) {
    Tn_VerilogModule* m = clean(
        "module m #(parameter W = 8, D = 2, parameter integer N = 3, localparam L = W * 2)\n"
        "  (input wire [W-1:0] a, b, (* pad *) output reg signed [3:0] q = 0,\n"
        "   inout c, output integer n);\n"
        "endmodule\n");
    ASSERT_NE(m, nullptr);
    ASSERT_EQ(m->Parameter.size(), 4u);
    EXPECT_EQ(m->Parameter[1]->Name.str().str(), "D");
    EXPECT_EQ(m->Parameter[2]->DeclType, IntegerParam);
    EXPECT_TRUE(m->Parameter[3]->LocalFlag);
    ASSERT_EQ(m->Port.size(), 5u);
    EXPECT_EQ(m->Port[1]->EffectiveName.str().str(), "b");
    EXPECT_EQ(m->Port[1]->Direction, InputPort);
    EXPECT_EQ(m->Port[2]->Direction, OutputPort);
    EXPECT_EQ(m->Port[3]->Direction, InoutPort);
    Tn_VerilogReg* q = typeOf<Tn_VerilogReg>(m, "q");
    ASSERT_NE(q, nullptr);
    EXPECT_TRUE(q->SignedFlag);
    EXPECT_NE(variable(m, "q")->Attributes.get(), nullptr);
    // The initial value is performed by an initial process.
    ASSERT_EQ(m->Process.size(), 1u);
    EXPECT_TRUE(m->Process[0]->isA(Initial));
    EXPECT_NE(typeOf<Tn_VerilogIntegerVar>(m, "n"), nullptr);
    EXPECT_EQ(typeOf<Tn_VerilogNet>(m, "c")->NetType, Wire);
    // a and b share the declaration's type.
    EXPECT_EQ(variable(m, "a")->TypeDef.get(), variable(m, "b")->TypeDef.get());
}

TEST_F(ParserModules, NetDeclarations) {
    Tn_VerilogModule* m = clean(
        "module m;\n"
        "wire w;\n"
        "tri1 vectored signed [7:0] #(1, 2) t;\n"
        "trireg (large) tr;\n"
        "trireg tm;\n"
        "wand (strong0, weak1) #3 wa = w, wb = w;\n"
        "supply0 gnd; supply1 vdd;\n"
        "wire [3:0] arr [0:7][0:1];\n"
        "endmodule\n");
    ASSERT_NE(m, nullptr);
    Tn_VerilogNet* t = typeOf<Tn_VerilogNet>(m, "t");
    ASSERT_NE(t, nullptr);
    EXPECT_EQ(t->NetType, Tri1);
    EXPECT_EQ(t->Grouping, Vectored);
    EXPECT_TRUE(t->SignedFlag);
    ASSERT_NE(t->Delay.get(), nullptr);
    EXPECT_NE(t->Delay->Delay2.get(), nullptr);
    EXPECT_EQ(t->Delay->Delay3.get(), nullptr);
    EXPECT_EQ(typeOf<Tn_VerilogNet>(m, "tr")->ChargeStrength, Large);
    EXPECT_EQ(typeOf<Tn_VerilogNet>(m, "tm")->ChargeStrength, Medium);
    EXPECT_EQ(typeOf<Tn_VerilogNet>(m, "gnd")->NetType, Supply0);
    EXPECT_EQ(typeOf<Tn_VerilogNet>(m, "vdd")->NetType, Supply1);
    // Net assignments are continuous assignments with the declaration's strength.
    ASSERT_EQ(m->ContAssign.size(), 2u);
    ASSERT_NE(m->ContAssign[0]->DriveStrength.get(), nullptr);
    EXPECT_EQ(m->ContAssign[0]->DriveStrength->DriveStrength0, Strong);
    EXPECT_EQ(m->ContAssign[0]->DriveStrength->DriveStrength1, Weak);
    EXPECT_EQ(shape(m->ContAssign[1]->Target), "wb");
    Tn_VerilogArrayVar* arr = Tn_VerilogNode::cast<Tn_VerilogArrayVar>(variable(m, "arr"));
    ASSERT_NE(arr, nullptr);
    EXPECT_EQ(arr->Range.size(), 2u);
    EXPECT_TRUE(arr->TypeDef->isA(Net));
}

TEST_F(ParserModules, VariableEventGenvarAndParameterDeclarations) {
    Tn_VerilogModule* m = clean(
        "module m;\n"
        "reg r = 1'b0; reg signed [3:0] s; reg [7:0] mem [0:255];\n"
        "integer i = 3, j [0:1]; time t; real x; realtime y;\n"
        "event e, ev [1:0];\n"
        "genvar g, h;\n"
        "parameter P = 1; parameter signed Q = -1; parameter [3:0] R = 2; parameter signed [3:0] S = 3;\n"
        "parameter real F = 1.5; parameter time T = 10; localparam L = P;\n"
        "specparam tpd = 1.2;\n"
        "defparam u.P = 3, u.v.Q = 4;\n"
        "endmodule\n");
    ASSERT_NE(m, nullptr);
    Tn_VerilogScalarVar* r = Tn_VerilogNode::cast<Tn_VerilogScalarVar>(variable(m, "r"));
    ASSERT_NE(r, nullptr);
    EXPECT_EQ(shape(r->InitExpr), "based constant 1'b0");
    ASSERT_EQ(m->Process.size(), 2u);  // r and i are set by initial processes
    Tn_VerilogBlockingAssign* set = Tn_VerilogNode::cast<Tn_VerilogBlockingAssign>(m->Process[0]->Statement.get());
    ASSERT_NE(set, nullptr);
    EXPECT_EQ(shape(set->Target), "r");
    EXPECT_EQ(shape(set->Source), "based constant 1'b0");
    EXPECT_NE(set->Source.get(), r->InitExpr.get());
    EXPECT_TRUE(typeOf<Tn_VerilogReg>(m, "s")->SignedFlag);
    EXPECT_NE(Tn_VerilogNode::cast<Tn_VerilogArrayVar>(variable(m, "mem")), nullptr);
    EXPECT_NE(typeOf<Tn_VerilogIntegerVar>(m, "j"), nullptr);
    EXPECT_NE(typeOf<Tn_VerilogTimeVar>(m, "t"), nullptr);
    EXPECT_NE(typeOf<Tn_VerilogRealVar>(m, "x"), nullptr);
    EXPECT_NE(typeOf<Tn_VerilogRealVar>(m, "y"), nullptr);
    EXPECT_NE(typeOf<Tn_VerilogEvent>(m, "e"), nullptr);
    EXPECT_NE(Tn_VerilogNode::cast<Tn_VerilogArrayVar>(variable(m, "ev")), nullptr);
    EXPECT_EQ(m->GenVar.size(), 2u);
    ASSERT_EQ(m->Parameter.size(), 7u);
    EXPECT_EQ(m->Parameter[0]->DeclType, NoTypeNoRangeParam);
    EXPECT_EQ(m->Parameter[1]->DeclType, SignedNoRangeParam);
    EXPECT_EQ(m->Parameter[2]->DeclType, UnsignedParam);
    EXPECT_EQ(m->Parameter[3]->DeclType, SignedParam);
    EXPECT_EQ(m->Parameter[4]->DeclType, RealParam);
    EXPECT_EQ(m->Parameter[5]->DeclType, TimeParam);
    EXPECT_TRUE(m->Parameter[6]->LocalFlag);
    ASSERT_EQ(m->SpecParam.size(), 1u);
    ASSERT_EQ(m->DefParam.size(), 2u);
    EXPECT_TRUE(m->DefParam[1]->Target->isA(SelectedName));
    EXPECT_EQ(m->DefParam[1]->Scope.get(), m);
}

TEST_F(ParserModules, Verilog1995ParameterRangesAreIgnored) {
    result = parse("module m; parameter [7:0] W = 8, V = 2; endmodule\n", {"-1995"});
    EXPECT_EQ(warnings(), Texts{loc(1) + "Range specification in parameter declaration ignored"});
    ASSERT_EQ(result.module("m")->Parameter.size(), 2u);
    EXPECT_EQ(result.module("m")->Parameter[0]->Range.get(), nullptr);
}

TEST_F(ParserModules, Redeclarations) {
    result = parse(
        "module m(a, b);\n"
        "input a; wire a;\n"   // a direction and its net
        "output b; reg b;\n"
        "input a;\n"
        "wire w; reg w;\n"
        "m2 u1(); m2 u1();\n"
        "task t; ; endtask\n"
        "function t; input x; t = x; endfunction\n"
        "initial begin : blk end\n"
        "integer blk;\n"
        "endmodule\n"
        "module n(input wire x); wire x; endmodule\n");
    EXPECT_EQ(errors(), (Texts{loc(4) + "Illegal redeclaration of 'a'", loc(5) + "Illegal redeclaration of 'w'",
                               loc(6) + "Illegal redeclaration of 'u1'", loc(8) + "Illegal redeclaration of 't'",
                               loc(10) + "Illegal redeclaration of 'blk'", loc(12) + "Illegal redeclaration of 'x'"}));
    // The first declaration stays.
    EXPECT_NE(typeOf<Tn_VerilogNet>(result.module("m"), "w"), nullptr);
}

TEST_F(ParserModules, ImplicitNets) {
    Tn_VerilogModule* m = clean(
        "module m;\n"
        "child c(.a(x), .b({y, z[1]}), .c(late));\n"
        "and g(o, i1, i2);\n"
        "assign sum = carry;\n"
        "wire [3:0] late;\n"
        "endmodule\n");
    ASSERT_NE(m, nullptr);
    for (const char* n : {"x", "y", "o", "i1", "i2", "sum"}) {
        Tn_VerilogNet* net = typeOf<Tn_VerilogNet>(m, n);
        ASSERT_NE(net, nullptr) << n;
        EXPECT_EQ(net->NetType, Wire) << n;
        EXPECT_EQ(net->Range.get(), nullptr) << n;
    }
    EXPECT_EQ(variable(m, "z"), nullptr);      // a select declares nothing
    EXPECT_EQ(variable(m, "carry"), nullptr);  // nor does a right-hand side
    EXPECT_NE(typeOf<Tn_VerilogNet>(m, "late")->Range.get(), nullptr);  // declared after its use

    result = parse("`default_nettype tri0\nmodule m; child c(x); endmodule\n");
    EXPECT_EQ(typeOf<Tn_VerilogNet>(result.module("m"), "x")->NetType, Tri0);
    result = parse("`default_nettype none\nmodule m(input p); child c(x, x); assign q = p; endmodule\n");
    EXPECT_EQ(errors(), (Texts{loc(2) + "'x' has not been declared", loc(2) + "'q' has not been declared"}));
    // A port without a net gets a wire even then.
    EXPECT_EQ(typeOf<Tn_VerilogNet>(result.module("m"), "p")->NetType, Wire);
}

TEST_F(ParserModules, ContinuousAssignmentsAndProcesses) {
    Tn_VerilogModule* m = clean(
        "module m;\n"
        "wire a, b, c;\n"
        "assign (pull0, pull1) #(1:2:3) a = b, {c} = ~b;\n"
        "(* run *) initial a_reg = 0;\n"
        "always @(posedge b) a_reg <= ~a_reg;\n"
        "reg a_reg;\n"
        "endmodule\n");
    ASSERT_NE(m, nullptr);
    ASSERT_EQ(m->ContAssign.size(), 2u);
    EXPECT_EQ(m->ContAssign[0]->DriveStrength->DriveStrength0, Pull);
    EXPECT_TRUE(m->ContAssign[0]->Delay->Delay1->isA(MinTypMaxOp));
    EXPECT_EQ(m->ContAssign[0]->Delay.get(), m->ContAssign[1]->Delay.get());
    EXPECT_TRUE(m->ContAssign[1]->Target->isA(ConcatOp));
    ASSERT_EQ(m->Process.size(), 2u);
    EXPECT_TRUE(m->Process[0]->isA(Initial));
    EXPECT_NE(m->Process[0]->Attributes.get(), nullptr);
    EXPECT_TRUE(m->Process[1]->isA(Always));
    EXPECT_TRUE(m->Process[1]->Statement->isA(EventControl));
}

TEST_F(ParserModules, ModuleInstancesAndArrays) {
    Tn_VerilogModule* m = clean(
        "`uselib lib=cells dir=/lib/cells\n"
        "module m;\n"
        "child #(4, .W(8)) u1(.a(x), .b(), .c(y[0])), u2(x, , y);\n"
        "child #7 u3();\n"
        "udp_and (strong0, weak1) #(2, 3) (o, a, b);\n"
        "(* src = \"m.v:5\" *) child #(.W(2)) arr [3:0] (.a(bus));\n"
        "endmodule\n");
    ASSERT_NE(m, nullptr);
    ASSERT_EQ(m->ModuleInstance.size(), 4u);
    Tn_VerilogModuleInstance* u1 = m->ModuleInstance[0];
    EXPECT_EQ(u1->Name.str().str(), "u1");
    EXPECT_EQ(u1->DefName.str().str(), "child");
    ASSERT_EQ(u1->ParamAssignment.size(), 2u);
    EXPECT_FALSE(u1->ParamAssignment[0]->NamedParamAssignmentFlag);
    EXPECT_TRUE(u1->ParamAssignment[1]->NamedParamAssignmentFlag);
    EXPECT_EQ(u1->ParamAssignment[1]->Name.str().str(), "W");
    ASSERT_EQ(u1->PortConnection.size(), 3u);
    EXPECT_TRUE(u1->PortConnection[0]->NamedPortConnectionFlag);
    EXPECT_EQ(u1->PortConnection[1]->Value.get(), nullptr);
    ASSERT_EQ(u1->CurrentUseLib.size(), 2u);
    EXPECT_EQ(u1->CurrentUseLib[0]->RefType, UselibLib);
    EXPECT_EQ(u1->CurrentUseLib[0]->Value.str().str(), "cells");
    EXPECT_EQ(u1->CurrentUseLib[1]->RefType, UselibDir);
    // The second instance of the statement has its own copies.
    Tn_VerilogModuleInstance* u2 = m->ModuleInstance[1];
    ASSERT_EQ(u2->ParamAssignment.size(), 2u);
    EXPECT_NE(u2->ParamAssignment[0], u1->ParamAssignment[0]);
    ASSERT_EQ(u2->PortConnection.size(), 3u);
    EXPECT_FALSE(u2->PortConnection[0]->NamedPortConnectionFlag);
    EXPECT_EQ(u2->PortConnection[1]->Value.get(), nullptr);
    EXPECT_EQ(shape(m->ModuleInstance[2]->ParamAssignment[0]->Value), "7");
    EXPECT_TRUE(m->ModuleInstance[2]->PortConnection.empty());
    // A UDP instance without a name, with strength and delays.
    Tn_VerilogModuleInstance* udp = m->ModuleInstance[3];
    EXPECT_TRUE(udp->Name.IsEmpty());
    ASSERT_NE(udp->DriveStrength.get(), nullptr);
    EXPECT_EQ(udp->DriveStrength->DriveStrength1, Weak);
    EXPECT_EQ(udp->ParamAssignment.size(), 2u);
    // An array keeps the instance it repeats, so its definition is seen.
    ASSERT_EQ(m->ModuleArray.size(), 1u);
    Tn_VerilogModuleArray* a = m->ModuleArray[0];
    EXPECT_EQ(a->Name.str().str(), "arr");
    ASSERT_NE(a->Range.get(), nullptr);
    ASSERT_EQ(a->ModuleInstance.size(), 1u);
    EXPECT_EQ(a->ModuleInstance[0]->DefName.str().str(), "child");
    EXPECT_EQ(a->ModuleInstance[0]->ParamAssignment.size(), 1u);
    EXPECT_EQ(a->PortConnection.size(), 1u);
    EXPECT_NE(a->Attributes.get(), nullptr);
}

TEST_F(ParserModules, GateInstances) {
    Tn_VerilogModule* m = clean(
        "module m;\n"
        "and (strong0, strong1) #(1, 2) g1(o, a, b, c), g2(p, a, b);\n"
        "buf b1(x, y, z);\n"
        "bufif1 (w, a, en);\n"
        "cmos c1(o2, i, n, p);\n"
        "tranif0 t1(io1, io2, ctl);\n"
        "pullup (pull1) (vdd_w);\n"
        "nand #3 arr [0:3] (q, a, b);\n"
        "endmodule\n");
    ASSERT_NE(m, nullptr);
    ASSERT_EQ(m->Primitive.size(), 7u);
    Tn_VerilogPrimitive* g1 = m->Primitive[0];
    EXPECT_EQ(g1->PrimitiveType, And);
    EXPECT_EQ(g1->Name.str().str(), "g1");
    EXPECT_EQ(g1->DriveStrength.get(), m->Primitive[1]->DriveStrength.get());
    ASSERT_EQ(g1->Terminal.size(), 4u);
    EXPECT_EQ(g1->Terminal[0]->Direction, OutputPort);
    EXPECT_EQ(g1->Terminal[3]->Direction, InputPort);
    EXPECT_EQ(g1->Terminal[3]->Index, 3);
    Tn_VerilogPrimitive* b1 = m->Primitive[2];
    EXPECT_EQ(b1->Terminal[1]->Direction, OutputPort);  // buf: outputs, then the input
    EXPECT_EQ(b1->Terminal[2]->Direction, InputPort);
    EXPECT_TRUE(m->Primitive[3]->Name.IsEmpty());
    EXPECT_EQ(m->Primitive[5]->Terminal[1]->Direction, InoutPort);
    EXPECT_EQ(m->Primitive[5]->Terminal[2]->Direction, InputPort);
    EXPECT_EQ(m->Primitive[6]->PrimitiveType, Pullup);
    EXPECT_EQ(m->Primitive[6]->DriveStrength->DriveStrength1, Pull);
    ASSERT_EQ(m->PrimitiveArray.size(), 1u);
    Tn_VerilogPrimitiveArray* arr = m->PrimitiveArray[0];
    EXPECT_EQ(arr->Terminal.size(), 3u);
    ASSERT_EQ(arr->Primitive.size(), 1u);
    EXPECT_EQ(arr->Primitive[0]->PrimitiveType, Nand);
    EXPECT_NE(arr->Primitive[0]->Delay.get(), nullptr);
}

TEST_F(ParserModules, GateTerminalCounts) {
    result = parse(
        "module m;\n"
        "and a1(o);\n"
        "bufif1 b1(o, i);\n"
        "cmos c1(o, i, n);\n"
        "tran t1(a, b, c);\n"
        "pullup p1(a, b);\n"
        "nmos n1(o, i, g);\n"
        "not x1(o, i), x2(o);\n"
        "endmodule\n");
    EXPECT_EQ(errors(), (Texts{loc(2) + "and primitive requires at least 2 connections",
                               loc(3) + "bufif1 primitive requires 3 connections",
                               loc(4) + "cmos primitive requires 4 connections",
                               loc(5) + "tran primitive requires 2 connections",
                               loc(6) + "pullup primitive requires 1 connection",
                               loc(8) + "not primitive requires at least 2 connections"}));
}

TEST_F(ParserModules, TasksAndFunctions) {
    Tn_VerilogModule* m = clean(
        "module m;\n"
        "task automatic t; input [3:0] a; output b; inout integer c; reg r; b = a[0]; endtask\n"
        "task t2(input a, output reg [1:0] b); b = a; endtask\n"
        "function signed [7:0] f; input x; f = x; endfunction\n"
        "function integer g(input [3:0] a, b); g = a + b; endfunction\n"
        "function real h; input x; h = x; endfunction\n"
        "function k; input x; begin : named reg y; y = x; k = y; end endfunction\n"
        "endmodule\n");
    ASSERT_NE(m, nullptr);
    ASSERT_EQ(m->Task.size(), 2u);
    Tn_VerilogTask* t = m->Task[0];
    EXPECT_TRUE(t->AutomaticFlag);
    ASSERT_EQ(t->IODeclaration.size(), 3u);
    EXPECT_TRUE(t->IODeclaration[0]->TfFlag);
    EXPECT_TRUE(t->IODeclaration[0]->TypeDef->isA(Reg));
    EXPECT_TRUE(t->IODeclaration[2]->TypeDef->isA(IntegerVar));
    EXPECT_NE(variable(t, "r"), nullptr);
    EXPECT_TRUE(t->Statement->isA(BlockingAssign));
    EXPECT_EQ(m->Task[1]->IODeclaration.size(), 2u);
    ASSERT_EQ(m->Function.size(), 4u);
    Tn_VerilogReg* fr = Tn_VerilogNode::cast<Tn_VerilogReg>(m->Function[0]->ReturnType.get());
    ASSERT_NE(fr, nullptr);
    EXPECT_TRUE(fr->SignedFlag);
    EXPECT_TRUE(m->Function[1]->ReturnType->isA(IntegerVar));
    EXPECT_EQ(m->Function[1]->IODeclaration.size(), 2u);
    EXPECT_TRUE(m->Function[2]->ReturnType->isA(RealVar));
    EXPECT_EQ(m->Function[3]->ReturnType.get(), nullptr);
    // A named block inside a function is a scope of the function.
    ASSERT_EQ(m->Function[3]->Block.size(), 1u);
    EXPECT_NE(variable(m->Function[3]->Block[0], "y"), nullptr);
}

TEST_F(ParserModules, FunctionRestrictions) {
    result = parse(
        "module m;\n"
        "event e;\n"
        "function f;\n"
        "input x;\n"
        "begin : b\n"
        "#1 f = x;\n"
        "@(x) f = x;\n"
        "wait (x) f = x;\n"
        "f <= x;\n"
        "-> e;\n"
        "t(x);\n"
        "f = #2 x;\n"
        "$display(x);\n"
        "end\n"
        "endfunction\n"
        "function g; reg r; g = 0; endfunction\n"
        "task t; input x; begin #1; @(x); -> e; end endtask\n"
        "endmodule\n");
    EXPECT_EQ(errors(), (Texts{loc(6) + "Illegal delay control statement within function",
                               loc(7) + "Illegal event control statement within function",
                               loc(8) + "Illegal wait statement within function",
                               loc(9) + "Illegal nonblocking assignment within function",
                               loc(10) + "Illegal event trigger within function",
                               loc(11) + "Illegal task call within function",
                               loc(12) + "Illegal delay control statement within function",
                               loc(16) + "Function 'g' must contain at least one input declaration"}));
    // The functions are still built.
    EXPECT_EQ(result.module("m")->Function.size(), 2u);
}

TEST_F(ParserModules, ConstantFunctions) {
    Tn_VerilogModule* m = clean(
        "module m #(parameter N = 16) (input [clog(N)-1:0] a);\n"
        "localparam L = twice(N);\n"
        "function integer clog; input integer v; for (clog = 0; v > 1; clog = clog + 1) v = v / 2; endfunction\n"
        "function integer twice; input integer v; twice = helper(v) * 2; endfunction\n"
        "function integer helper; input integer v; helper = v; endfunction\n"
        "function integer plain; input integer v; plain = v; endfunction\n"
        "wire [7:0] w = plain(a);\n"
        "endmodule\n");
    ASSERT_NE(m, nullptr);
    std::vector<std::string> calls;
    for (Tn_VerilogName* n : m->ConstFuncCall) calls.push_back(shape(n));
    EXPECT_EQ(calls, (Texts{"clog", "twice", "helper"}));
    for (Tn_VerilogFunction* f : m->Function)
        EXPECT_EQ(f->ConstantFlag, f->Name.str().str() != "plain") << f->Name.c_str();
}

TEST_F(ParserModules, AttributesAttachToTheFollowingItem) {
    Tn_VerilogModule* m = clean(
        "module m((* a1 *) input x);\n"
        "(* keep = 1, mark *) wire w1, w2;\n"
        "(* full_case *) always @* case (x) default: ; endcase\n"
        "child u((* c2 *) .a(w1), (* c3 *) .b());\n"
        "endmodule\n");
    ASSERT_NE(m, nullptr);
    Tn_VerilogVariable* w1 = variable(m, "w1");
    ASSERT_NE(w1->Attributes.get(), nullptr);
    ASSERT_EQ(w1->Attributes->Attribute.size(), 2u);
    EXPECT_EQ(w1->Attributes->Attribute[0]->Name.str().str(), "keep");
    EXPECT_EQ(shape(w1->Attributes->Attribute[0]->Expr), "1");
    EXPECT_EQ(w1->Attributes->Attribute[1]->Expr.get(), nullptr);
    EXPECT_EQ(w1->Attributes.get(), variable(m, "w2")->Attributes.get());
    EXPECT_NE(m->Process[0]->Attributes.get(), nullptr);
    EXPECT_NE(m->IODeclaration[0]->Attributes.get(), nullptr);
    Tn_VerilogModuleInstance* u = m->ModuleInstance[0];
    ASSERT_EQ(u->PortConnection.size(), 2u);
    EXPECT_NE(u->PortConnection[1]->Attributes.get(), nullptr);
}

TEST_F(ParserModules, Verilog1995ModeRejectsVerilog2001Syntax) {
    result = parse("module m; (* keep *) wire w; endmodule\n", {"-1995"});
    ASSERT_EQ(errors().size(), 1u);
    EXPECT_EQ(errors()[0].substr(0, loc(1).size()), loc(1));
    result = parse("module m(input a); endmodule\n", {"-1995"});
    EXPECT_EQ(errors().size(), 1u);
    result = parse("module m; wire [7:0] w; wire x = w[0 +: 2]; endmodule\n", {"-1995"});
    EXPECT_EQ(errors().size(), 1u);
    // Operators and signed constants that Verilog-1995 does not have.
    for (const char* e : {"w ** 2", "w <<< 1", "w >>> 1", "4'sd3", "4'Sh3", "4'sb1"}) {
        const std::string text = std::string("module m; wire [7:0] w; wire [7:0] x = ") + e + "; endmodule\n";
        result = parse(text, {"-1995"});
        EXPECT_EQ(errors().size(), 1u) << e;
        result = parse(text);
        EXPECT_EQ(errors(), Texts{}) << e;
    }
    // In Verilog-1995 mode generate is a name like any other.
    result = parse("module m; wire generate; endmodule\n", {"-1995"});
    EXPECT_EQ(errors(), Texts{});
    EXPECT_EQ(warnings(), Texts{loc(1) + "'generate' is a reserved word in Verilog-2001"});
    EXPECT_NE(variable(result.module("m"), "generate"), nullptr);
}

TEST_F(ParserModules, ConfigurationsAreReadPast) {
    result = parse(
        "config cfg;\n"
        "  design lib.top;\n"
        "  default liblist lib;\n"
        "  instance top.u1 use lib.child;\n"
        "endconfig\n"
        "module top; endmodule\n");
    EXPECT_EQ(errors(), Texts{});
    EXPECT_EQ(result.compiled, Tn_StringList{"top"});
    result = parse("config cfg; design top;\n");
    EXPECT_EQ(errors().size(), 1u);
}

TEST_F(ParserModules, PragmaAttributes) {
    Tn_VerilogModule* m = clean(
        "module m(a, b);\n"
        "input a; output b;\n"
        "wire n1; // synthesis attribute keep of n1 is \"true\";\n"
        "child u1(); // synopsys attribute dont_touch u1\n"
        "// exemplar attribute b pin_number 7\n"
        "endmodule\n",
        {"+pls_client"});
    ASSERT_NE(m, nullptr);
    Tn_VerilogVariable* n1 = variable(m, "n1");
    ASSERT_NE(n1->Attributes.get(), nullptr);
    EXPECT_EQ(n1->Attributes->Attribute[0]->Name.str().str(), "keep");
    EXPECT_EQ(shape(n1->Attributes->Attribute[0]->Expr), "string constant \"true\"");
    Tn_VerilogModuleInstance* u1 = m->ModuleInstance[0];
    ASSERT_NE(u1->Attributes.get(), nullptr);
    EXPECT_EQ(u1->Attributes->Attribute[0]->Name.str().str(), "dont_touch");
    EXPECT_EQ(shape(u1->Attributes->Attribute[0]->Expr), "1");
    Tn_VerilogVariable* b = variable(m, "b");
    ASSERT_NE(b->Attributes.get(), nullptr);
    EXPECT_EQ(b->Attributes->Attribute[0]->Name.str().str(), "pin_number");
    EXPECT_EQ(shape(b->Attributes->Attribute[0]->Expr), "string constant \"7\"");
    // Without +pls_client the comments are comments.
    m = clean("module m; wire n1; // synthesis attribute keep of n1 is true\nendmodule\n");
    EXPECT_EQ(variable(m, "n1")->Attributes.get(), nullptr);
}

TEST_F(ParserModules, TopLevelUnits) {
    result = parse(
        "module z; a u(); endmodule\n"
        "module a; generate b ub(); endgenerate endmodule\n"
        "module b; c arr [1:0] (); endmodule\n"
        "module c; endmodule\n"
        "module g; generate if (1) begin : x d u(); end endgenerate endmodule\n"
        "module d; endmodule\n"
        "module f; for (genvar i = 0; i < 2; i = i + 1) begin : l e u(); end endmodule\n"
        "module e; endmodule\n"
        "module A; endmodule\n"
        "primitive u(o, i); output o; input i; table 0 : 0; endtable endprimitive\n");
    EXPECT_EQ(errors(), Texts{});
    // Instances inside generate statements do not count; byte order.
    EXPECT_EQ(result.tops(), (Texts{"A", "d", "e", "f", "g", "u", "z"}));
    EXPECT_EQ(result.tops(false).size(), 10u);
}

}  // namespace

namespace {

TEST(ParserDump, PrintsEachUnitItCompletes) {
    TempDir dir;
    const std::string file = dir.write("d.v", "module m(input a); wire w = a; endmodule\nprimitive p(o, i); output o; input i; table 0 : 1; endtable endprimitive\n");
    const CommandResult r = runTarn("compile " + file + " +tarn+parser+dump");
    EXPECT_EQ(r.status, 0) << r.err;
    EXPECT_NE(r.out.find("Root:Tn_VerilogRoot = 0 {"), std::string::npos) << r.out;
    EXPECT_NE(r.out.find("Module:Tn_VerilogModule = "), std::string::npos) << r.out;
    EXPECT_NE(r.out.find("  Name:Port_String = \"m\""), std::string::npos) << r.out;
    EXPECT_NE(r.out.find("UdpDefn:Tn_VerilogUdpDefn = "), std::string::npos) << r.out;
    EXPECT_NE(r.out.find("TableRow:Port_String = \"0:1\""), std::string::npos) << r.out;
    EXPECT_EQ(runTarn("compile " + file).out, "");
}

}  // namespace
