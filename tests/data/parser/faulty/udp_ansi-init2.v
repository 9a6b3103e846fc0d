// UDPs with Verilog-2001 port declarations in the header (a scan flip-flop,
// a clock-gating latch, a combinational and-or cell) next to an SR latch
// written the old way so that it can carry its power-up value.
primitive udp_sdff (output reg q, input d, input si, input se, input clk);
    table
    //  d  si  se  clk  : q : q+
        0   ?   0   r   : ? : 0;
        1   ?   0   r   : ? : 1;
        ?   0   1   r   : ? : 0;
        ?   1   1   r   : ? : 1;
        0   0   x   r   : ? : 0;
        1   1   x   r   : ? : 1;
        0   ?   0   p   : 0 : 0;
        1   ?   0   p   : 1 : 1;
        ?   ?   ?   n   : ? : -;
        *   ?   ?   ?   : ? : -;
        ?   *   ?   ?   : ? : -;
        ?   ?   *   ?   : ? : -;
    endtable
endprimitive

// Latch transparent while the clock is low; the AND that follows it gates
// the clock glitch-free.
primitive udp_cg_latch (output reg en_l, input en, input clk);
    table
    //  en clk : q : q+
        0   0  : ? : 0;
        1   0  : ? : 1;
        ?   1  : ? : -;
        0   x  : 0 : 0;
        1   x  : 1 : 1;
    endtable
endprimitive

primitive udp_srlatch (output reg q = 1'b0, input s_n, input r_n);
    initial q = 1'b1;
    table
    //  s_n r_n : q : q+
        0    1  : ? : 1;
        1    0  : ? : 0;
        1    1  : ? : -;
        0    0  : ? : x;
    endtable
endprimitive

primitive udp_ao22 (output y, input a1, input a2, input b1, input b2);
    table
        1 1 ? ? : 1;
        ? ? 1 1 : 1;
        0 ? 0 ? : 0;
        0 ? ? 0 : 0;
        ? 0 0 ? : 0;
        ? 0 ? 0 : 0;
    endtable
endprimitive

(* cell_type = "clock_gate", dont_touch *)
module clock_gate (output wire gclk, input wire clk, input wire en, input wire test_en);
    wire en_any = en | test_en;
    wire en_l;
    udp_cg_latch lat (en_l, en_any, clk);
    and          g   (gclk, en_l, clk);
endmodule

module scan_chain #(parameter N = 4) (
    input  wire         clk,
    input  wire         scan_en,
    input  wire         scan_in,
    input  wire [N-1:0] d,
    output wire [N-1:0] q,
    output wire         scan_out
);
    udp_sdff ff0 (q[0], d[0], scan_in, scan_en, clk);
    udp_sdff ff1 (q[1], d[1], q[0],    scan_en, clk);
    udp_sdff ff2 (q[2], d[2], q[1],    scan_en, clk);
    udp_sdff ff3 (q[3], d[3], q[2],    scan_en, clk);
    assign scan_out = q[N-1];
endmodule

module udp_ansi_top (
    input  wire       clk,
    input  wire       en,
    input  wire       se,
    input  wire       si,
    input  wire [3:0] d,
    input  wire       set_n,
    input  wire       rst_n,
    output wire [3:0] q,
    output wire       so,
    output wire       flag,
    output wire       sel
);
    wire gclk;
    clock_gate cg (.gclk(gclk), .clk(clk), .en(en), .test_en(se));
    scan_chain #(.N(4)) sc (.clk(gclk), .scan_en(se), .scan_in(si), .d(d), .q(q), .scan_out(so));
    udp_srlatch #1 sr (flag, set_n, rst_n);
    udp_ao22 #(1, 1) ao (sel, q[0], q[1], q[2], q[3]);
endmodule
