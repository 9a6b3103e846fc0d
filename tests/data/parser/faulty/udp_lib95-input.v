// Compact combinational UDP library (Verilog-1995), one primitive per cell,
// port declarations kept on the header line.  The netlist at the end is a
// 4-to-1 multiplexer and a parity tree made from these cells; udp_and2 is
// a spare cell that nothing instantiates.

primitive udp_inv (y, a); output y; input a;
    table
        0 : 1;
        1 : 0;
    endtable
endprimitive

primitive udp_nand3 (y, a, b, c); output y; input a, b; output c;
    table
        0 ? ? : 1;
        ? 0 ? : 1;
        ? ? 0 : 1;
        1 1 1 : 0;
    endtable
endprimitive

primitive udp_xnor2 (y, a, b); output y; input a, b;
    table
        0 0 : 1;
        0 1 : 0;
        1 0 : 0;
        1 1 : 1;
    endtable
endprimitive

primitive udp_mux4 (y, s1, s0, d0, d1, d2, d3); output y; input s1, s0, d0, d1, d2, d3;
    table
    //  s1 s0 d0 d1 d2 d3 : y
        0  0  0  ?  ?  ?  : 0;
        0  0  1  ?  ?  ?  : 1;
        0  1  ?  0  ?  ?  : 0;
        0  1  ?  1  ?  ?  : 1;
        1  0  ?  ?  0  ?  : 0;
        1  0  ?  ?  1  ?  : 1;
        1  1  ?  ?  ?  0  : 0;
        1  1  ?  ?  ?  1  : 1;
        // unknown select with agreeing data
        x  0  0  ?  0  ?  : 0;
        x  0  1  ?  1  ?  : 1;
        0  x  0  0  ?  ?  : 0;
        0  x  1  1  ?  ?  : 1;
        x  x  0  0  0  0  : 0;
        x  x  1  1  1  1  : 1;
    endtable
endprimitive

primitive udp_oai21 (y, a1, a2, b); output y; input a1, a2, b;
    table
        0 0 ? : 1;
        ? ? 0 : 1;
        1 ? 1 : 0;
        ? 1 1 : 0;
    endtable
endprimitive

primitive udp_and2 (y, a, b); output y; input a, b;
    table
        0 ? : 0;
        ? 0 : 0;
        1 1 : 1;
    endtable
endprimitive

module mux4_cell (y, s, d);
    output       y;
    input  [1:0] s;
    input  [3:0] d;

    udp_mux4 #(1, 1) m (y, s[1], s[0], d[0], d[1], d[2], d[3]);
endmodule

module parity8 (odd, even, d);
    output       odd, even;
    input  [7:0] d;
    wire   [3:0] l1;
    wire   [1:0] l2;

    udp_xnor2 x0 (l1[0], d[0], d[1]);
    udp_xnor2 x1 (l1[1], d[2], d[3]);
    udp_xnor2 x2 (l1[2], d[4], d[5]);
    udp_xnor2 x3 (l1[3], d[6], d[7]);
    udp_xnor2 x4 (l2[0], l1[0], l1[1]);
    udp_xnor2 x5 (l2[1], l1[2], l1[3]);
    udp_xnor2 x6 (even, l2[0], l2[1]);
    udp_inv   i0 (odd, even);
endmodule

module lib95_top (y, odd, even, z, s, d, sel_n);
    output       y, odd, even, z;
    input  [1:0] s;
    input  [7:0] d;
    input        sel_n;
    wire         n1;

    mux4_cell mx (y, s, d[3:0]);
    parity8   pt (odd, even, d);
    udp_nand3 g1 (n1, d[4], d[5], sel_n);
    udp_oai21 g2 (z, n1, d[6], d[7]);
endmodule
