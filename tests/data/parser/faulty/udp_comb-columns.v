// Combinational UDP library (Verilog-1995) and a small netlist using it.
primitive udp_mux2 (y, s, a, b);
    output y;
    input  s, a, b;
    table
    //  s  a  b : y
        0  0  ? : 0;
        0  1  ? : 1;
        1  0 : 0;
        1  ?  1 : 1;
        x  0  0 : 0;    // select unknown, both inputs agree
        x  1  1 : 1;
    endtable
endprimitive

primitive udp_maj3 (y, a, b, c);
    output y;
    input  a, b, c;
    table
        0 0 ? : 0;
        0 ? 0 : 0;
        ? 0 0 : 0;
        1 1 ? : 1;
        1 ? 1 : 1;
        ? 1 1 : 1;
    endtable
endprimitive

// y = ~((a & b) | c)
primitive udp_aoi21 (y, a, b, c);
    output y;
    input  a, b, c;
    table
        ? ? 1 : 0;
        1 1 ? : 0;
        0 ? 0 : 1;
        ? 0 0 : 1;
    endtable
endprimitive

primitive udp_xor3 (y, a, b, c);
    output y;
    input  a, b, c;
    table
        0 0 0 : 0;   0 0 1 : 1;   0 1 0 : 1;   0 1 1 : 0;
        1 0 0 : 1;   1 0 1 : 0;   1 1 0 : 0;   1 1 1 : 1;
    endtable
endprimitive

// Output is 1 when any input is a known 1, 0 when all are 0, x otherwise.
primitive udp_or4 (y, a, b, c, d);
    output y;
    input  a, b, c, d;
    table
        1 ? ? ? : 1;
        ? 1 ? ? : 1;
        ? ? 1 ? : 1;
        ? ? ? 1 : 1;
        0 0 0 0 : 0;
    endtable
endprimitive

module full_adder_udp (s, co, a, b, ci);
    output s, co;
    input  a, b, ci;

    udp_xor3 #(2) sum (s, a, b, ci);
    udp_maj3 #(1, 2) carry (co, a, b, ci);
endmodule

module comb_block (y, z, any, sum, cout, d, sel);
    output [1:0] y;
    output       z, any, sum, cout;
    input  [3:0] d;
    input        sel;

    udp_mux2  m0 (y[0], sel, d[0], d[1]);
    udp_mux2  m1 (y[1], sel, d[2], d[3]);
    udp_aoi21 g0 (z, d[0], d[1], sel);
    udp_or4   g1 (any, d[0], d[1], d[2], d[3]);
    full_adder_udp fa (sum, cout, d[0], d[1], sel);
endmodule
