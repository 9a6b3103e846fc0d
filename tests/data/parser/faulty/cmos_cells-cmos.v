// Switch-level CMOS cells (Verilog-1995): inverter, NAND2, NOR2, a
// transmission-gate multiplexer, a clocked latch and a weak keeper.
module inv_sw (y, a);
    output y;
    input  a;
    supply1 vdd;
    supply0 gnd;

    pmos p1 (y, vdd, a);
    nmos n1 (y, gnd, a);
endmodule

module nand2_sw (y, a, b);
    output y;
    input  a, b;
    supply1 vdd;
    supply0 gnd;
    wire    mid;

    pmos #(1) p1 (y, vdd, a);
    pmos #(1) p2 (y, vdd, b);
    nmos #(1) n1 (y, mid, a);
    nmos #(1) n2 (mid, gnd, b);
endmodule

module nor2_sw (y, a, b);
    output y;
    input  a, b;
    supply1 vdd;
    supply0 gnd;
    wire    mid;

    pmos #(2, 2, 1) p1 (mid, vdd, a);
    pmos #(2, 2, 1) p2 (y, mid, b);
    nmos #(1, 1, 1) n1 (y, gnd, a);
    nmos #(1, 1, 1) n2 (y, gnd, b);
endmodule

module tgmux2_sw (y, a, b, s);
    output y;
    input  a, b, s;
    wire   sn;

    inv_sw  i0 (sn, s);
    // cmos (out, in, ncontrol, pcontrol)
    cmos    t0 (y, a, sn, s);
    cmos    t1 (y, b, s);
endmodule

module latch_sw (q, d, clk);
    output q;
    input  d, clk;
    wire   clkn, x, qn;

    inv_sw   ic (clkn, clk);
    cmos     pass (x, d, clk, clkn);
    inv_sw   i1 (qn, x);
    inv_sw   i2 (q, qn);
    // feedback through a resistive transmission gate when the clock is low
    rcmos    hold (x, q, clkn, clk);
endmodule

module keeper_sw (bus, en_n, drive);
    inout bus;
    input en_n, drive;
    supply1 vdd;
    supply0 gnd;
    wire    fb, busn;

    // weak pull-up keeper, strong pull-down when enabled
    rpmos   keep (bus, vdd, fb);
    inv_sw  sense (busn, bus);
    buf     (fb, busn);
    nmos    pd (bus, gnd, drive);
    rnmos   leak (bus, gnd, en_n);
endmodule

module cells_sw_top (y_nand, y_nor, y_mux, q, bus, a, b, s, d, clk);
    output y_nand, y_nor, y_mux, q;
    inout  bus;
    input  a, b, s, d, clk;

    nand2_sw  g1 (y_nand, a, b);
    nor2_sw   g2 (y_nor, a, b);
    tgmux2_sw g3 (y_mux, a, b, s);
    latch_sw  g4 (q, d, clk);
    keeper_sw g5 (bus, s, d);
endmodule
