// Standard-cell timing models: combinational cells with module path delays
// of every form (parallel and full connections, polarity, state-dependent
// and ifnone paths, edge-sensitive paths, 1/2/3/6/12 delay values).
`timescale 1ns / 1ps
`celldefine

module INVX1 (Y, A);
    output Y;
    input  A;
    not (Y, A);
    specify
        specparam tPLH = 0.045, tPHL = 0.032;
        (A -=> Y) = (tPLH, tPHL);
    endspecify
endmodule

module BUFX2 (Y, A);
    output Y;
    input  A;
    buf (Y, A);
    specify
        (A +=> Y) = (0.060:0.071:0.090, 0.055:0.064:0.081);
    endspecify
endmodule

module AND2X1 (Y, A, B);
    output Y;
    input  A, B;
    specparam tLoad = 0.004;      // module-level specparam
    and (Y, A, B);
    specify
        specparam tA = 0.081, tB = 0.085;
        (A => Y) = (tA + tLoad);
        (B => Y) = (tB + tLoad);
    endspecify
endmodule

module NAND3X1 (Y, A, B, C);
    output Y;
    input  A, B, C;
    nand (Y, A, B, C);
    specify
        // rise, fall, turn-off
        (A, B, C *> Y) = (0.040, 0.052, 0.010);
    endspecify
endmodule

module XOR2X1 (Y, A, B);
    output Y;
    input  A, B;
    xor (Y, A, B);
    specify
        if (B == 1'b0) (A +=> Y) = (0.090, 0.080);
        if (B == 1'b1) (A -=> Y) = (0.095, 0.085);
        if (A == 1'b0) (B +=> Y) = (0.091, 0.081);
        if (A == 1'b1) (B -=> Y) = (0.096, 0.086);
        ifnone (A => Y) = 0.1;
        ifnone (B => Y) = 0.1;
    endspecify
endmodule

module MUX2X1 (Y, A, B, S);
    output Y;
    input  A, B, S;
    wire   Sn, ta, tb;
    not  (Sn, S);
    and  (ta, A, Sn);
    and  (tb, B, S);
    or   (Y, ta, tb);
    specify
        specparam tAY = 0.11, tBY = 0.12, tSY_r = 0.15, tSY_f = 0.14;
        if (~S) (A => Y) = tAY;
        if (S)  (B => Y) = tBY;
        // select polarity follows the data inputs; approximated on A alone
        if (A == 1'b0) (S +=> Y) = (tSY_r, tSY_f);
        if (A == 1'b1) (S -=> Y) = (tSY_r, tSY_f);
        ifnone (S => Y) = (tSY_r, tSY_f);
    endspecify
endmodule

// Tristate buffer: six delay values (01, 10, 0z, z1, 1z, z0).
module TBUFX2 (Y, A, OE);
    output Y;
    input  A, OE;
    bufif1 (Y, A, OE);
    specify
        (A => Y)  = (0.07, 0.06, 0.08, 0.07, 0.09, 0.08);
        (OE => Y) = (0.10, 0.09, 0.11, 0.10, 0.05, 0.05);
    endspecify
endmodule

// Full adder with the complete twelve-value form on the carry path
// (01, 10, 0z, z1, 1z, z0, 0x, x1, 1x, x0, xz, zx).
module FAX1 (S, CO, A, B, CI);
    output S, CO;
    input  A, B, CI;
    xor (S, A, B, CI);
    wire ab, ac, bc;
    and (ab, A, B);
    and (ac, A, CI);
    and (bc, B, CI);
    or  (CO, ab, ac, bc);
    specify
        specparam d = 0.1;
        (A, B, CI *> S) = (0.21, 0.19);
        (CI => CO) = (d, d, d, d, d, d, 0.12, 0.12, 0.11, 0.11, d, d);
        (A, B *> CO) = (0.15, 0.14, 0.15, 0.14, 0.15, 0.14);
    endspecify
endmodule

// Rising-edge flip-flop: edge-sensitive paths with data source expressions.
module DFFX1 (Q, QN, D, CK);
    output Q, QN;
    input  D, CK;
    reg    Q;
    assign QN = ~Q;
    always @(posedge CK)
        Q <= D;
    specify
        specparam tCQ_r = 0.18, tCQ_f = 0.16;
        specparam PATHPULSE$CK$Q = (0.02, 0.04);
        pulsestyle_ondetect Q;
        showcancelled Q, QN;
        (posedge CK => (Q +: D))  = (tCQ_r, tCQ_f);
        (posedge CK => (QN -: D)) = (tCQ_r + 0.02, tCQ_f + 0.02);
    endspecify
endmodule

// Latch with an enable-sensitive path and a data path.
module LATX1 (Q, D, G);
    output Q;
    input  D, G;
    reg    Q;
    always @(D or G)
        if (G) Q = D;
    specify
        pulsestyle_onevent Q;
        noshowcancelled Q;
        (D => Q) = (0.12, 0.11);
        (posedge G *> (Q : D)) = (0.14, 0.13);
    endspecify
endmodule

`endcelldefine

module cells_demo (
    input  wire a, b, c, s, oe, clk,
    output wire y_inv, y_buf, y_and, y_nand, y_xor, y_mux, y_t,
    output wire sum, carry, q, qn, lq
);
    INVX1   u0 (y_inv, a);
    BUFX2   u1 (y_buf, a);
    AND2X1  u2 (y_and, a, b);
    NAND3X1 u3 (y_nand, a, b, c);
    XOR2X1  u4 (y_xor, a, b);
    MUX2X1  u5 (y_mux, a, b, s);
    TBUFX2  u6 (y_t, a, oe);
    FAX1    u7 (sum, carry, a, b, c);
    DFFX1   u8 (q, qn, y_mux, clk);
    LATX1   u9 (lq, y_xor, clk);
endmodule
