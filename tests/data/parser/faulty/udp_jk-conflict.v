// JK flip-flop primitive, negative-edge triggered with asynchronous clear,
// and a D flip-flop built on it.
`timescale 1ns / 1ps
`celldefine
primitive udp_jkff (q, j, k, clk, clr_n);
    output q;
    reg    q;
    input  j, k, clk, clr_n;
    initial q = 1'b0;
    table
    //  j  k  clk   clr_n : q : q+
        ?  ?   ?     0    : ? : 0;     // clear
        0  0   f     1    : ? : -;     // hold
        0  1   f     1    : ? : 0;     // reset
        1  0   f     1    : ? : 1;     // set
        1  1   f     1    : 0 : 1;     // toggle
        1  ?   f     1    : 1 : 0;
        ?  ?  (?1)   1    : ? : -;     // rising or recovering clock
        ?  ?  (0x)   1    : ? : -;
        *  ?   ?     1    : ? : -;     // input changes
        ?  *   ?     1    : ? : -;
        ?  ?   ?    (?1)  : ? : -;     // clear released
    endtable
endprimitive
`endcelldefine

module jk_dff (output wire q, output wire qn, input wire d, input wire clk_n, input wire clr_n);
    wire dn;
    not          inv (dn, d);
    udp_jkff #1  ff  (q, d, dn, clk_n, clr_n);
    not          out (qn, q);
endmodule
