// Gate-level adders in Verilog-1995 style: a full adder, a 4-bit carry
// look-ahead block and an 8-bit adder built from two of them.
`timescale 1ns / 10ps

module full_adder (a, b, ci, s, co);
    input  a, b, ci;
    output s, co;
    wire   p, g, t;

    xor #(2, 2)   x1 (p, a, b);
    xor #(2, 2)   x2 (s, p, ci);
    and #1        a1 (g, a, b);
    and #1        a2 (t);
    or  #(1, 2)   o1 (co, g, t);
endmodule

module cla4 (a, b, ci, s, co, pg, gg);
    input  [3:0] a, b;
    input        ci;
    output [3:0] s;
    output       co, pg, gg;

    wire [3:0] p, g;
    wire [4:1] c;
    wire t10, t20, t21, t30, t31, t32;
    wire u0, u1, u2, u3;

    // propagate and generate per bit
    xor #1 px0 (p[0], a[0], b[0]);
    xor #1 px1 (p[1], a[1], b[1]);
    xor #1 px2 (p[2], a[2], b[2]);
    xor #1 px3 (p[3], a[3], b[3]);
    and #1 gx0 (g[0], a[0], b[0]);
    and #1 gx1 (g[1], a[1], b[1]);
    and #1 gx2 (g[2], a[2], b[2]);
    and #1 gx3 (g[3], a[3], b[3]);

    // c1 = g0 | p0 ci
    and #1 (t10, p[0], ci);
    or  #1 (c[1], g[0], t10);
    // c2 = g1 | p1 g0 | p1 p0 ci
    and #1 (t20, p[1], g[0]);
    and #1 (t21, p[1], p[0], ci);
    or  #1 (c[2], g[1], t20, t21);
    // c3 = g2 | p2 g1 | p2 p1 g0 | p2 p1 p0 ci
    and #1 (t30, p[2], g[1]);
    and #1 (t31, p[2], p[1], g[0]);
    and #1 (t32, p[2], p[1], p[0], ci);
    or  #1 (c[3], g[2], t30, t31, t32);
    // group signals
    and #1 (pg, p[3], p[2], p[1], p[0]);
    and #1 (u0, p[3], g[2]);
    and #1 (u1, p[3], p[2], g[1]);
    and #1 (u2, p[3], p[2], p[1], g[0]);
    or  #1 (gg, g[3], u0, u1, u2);
    and #1 (u3, pg, ci);
    or  #1 (c[4], gg, u3);
    buf #0 (co, c[4]);

    // sum bits
    xor #1 sx0 (s[0], p[0], ci);
    xor #1 sx1 (s[1], p[1], c[1]);
    xor #1 sx2 (s[2], p[2], c[2]);
    xor #1 sx3 (s[3], p[3], c[3]);
endmodule

module add8 (a, b, ci, s, co);
    input  [7:0] a, b;
    input        ci;
    output [7:0] s;
    output       co;
    wire         c4, pg0, gg0, pg1, gg1;

    cla4 lo (a[3:0], b[3:0], ci, s[3:0], c4, pg0, gg0);
    cla4 hi (.a(a[7:4]), .b(b[7:4]), .ci(c4), .s(s[7:4]), .co(co),
             .pg(pg1), .gg(gg1));
endmodule

// Port expressions: operand a arrives as two nibble ports, b as one port
// made of two nets.
module add8_nibbles (.a_lo(a[3:0]), .a_hi(a[7:4]), .b({b_hi, b_lo}), s, co);
    input  [7:0] a;
    input  [3:0] b_hi, b_lo;
    output [7:0] s;
    output       co;

    add8 core (a, {b_hi, b_lo}, 1'b0, s, co);
endmodule

module add8_check (ok);
    output ok;
    reg  [7:0] a, b;
    reg        ci;
    wire [7:0] s, s_ref;
    wire       co, co_ref;
    wire       fs, fco;
    reg        ok;
    integer    i, errors;

    add8       dut (a, b, ci, s, co);
    full_adder lone (a[0], b[0], ci, fs, fco);
    assign {co_ref, s_ref} = a + b + ci;

    initial begin
        errors = 0;
        for (i = 0; i < 512; i = i + 1) begin
            {ci, a} = i;
            b = i * 7;
            #20;
            if ({co, s} !== {co_ref, s_ref} || fs !== s_ref[0])
                errors = errors + 1;
        end
        ok = (errors == 0);
        $display("add8: %0d errors", errors);
    end
endmodule
